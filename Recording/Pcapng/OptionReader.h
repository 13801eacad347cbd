// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// Reads a block's options one after another: a code, a length, and the value, padded.
class OptionReader {
public:
    struct Option {
        std::uint16_t code = 0;
        std::size_t offset = 0; ///< of its header, in the bytes
        Bytes value;
    };

    /// `bytes`: the options alone, of which an end of options need not be there.
    OptionReader(Bytes bytes, bool bigEndian) : _bytes(bytes), _bigEndian(bigEndian) {}

    /// The next one; none at the end, and where one does not fit into the bytes.
    [[nodiscard]] std::optional<Option> next() {
        ByteReader fields(_bytes, _bigEndian);
        if (_at >= _bytes.size())
            return std::nullopt;
        const std::uint16_t code = fields.u16(_at);
        const std::size_t length = fields.u16(_at + 2);
        const std::size_t begin = _at + headerSize;
        if (fields.isGood() && code == pcapng::Option::End)
            return std::nullopt;
        if (!fields.isGood() || length > _bytes.size() - begin) {
            _damaged = true;
            return std::nullopt;
        }
        const Option option{code, _at, _bytes.subspan(begin, length)};
        _at = begin + pcapng::padded(length);
        return option;
    }

    /// Whether the last one did not fit.
    [[nodiscard]] bool isDamaged() const { return _damaged; }

private:
    static constexpr std::size_t headerSize = 4;

    Bytes _bytes;
    bool _bigEndian;
    std::size_t _at = 0;
    bool _damaged = false;
};

} // namespace velmora
