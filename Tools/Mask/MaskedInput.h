// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskedReader.h"
#include "Export/Masking/MessageMask.h"

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A file's messages as a command decodes them: masked where that is requested.
class MaskedInput {
public:
    /// `reader` must outlive it. `technology`: as `--technology` has it; `technologies`: those of the file,
    /// as in DecodingRequest. `masking` is absent for messages as they are.
    MaskedInput(MessageReader& reader, const std::string& file, const std::string& technology,
                const std::vector<std::string>& technologies, const std::optional<MaskOptions>& masking);
    MaskedInput(const MaskedInput&) = delete;
    MaskedInput& operator=(const MaskedInput&) = delete;

    [[nodiscard]] MessageReader& reader() { return *_reader; }
    /// What is subtracted from times; absent before the first message, and where times stay.
    [[nodiscard]] std::optional<std::chrono::nanoseconds> shift() const {
        return _mask ? _mask->shift() : std::nullopt;
    }

private:
    MessageReader* _reader;
    std::optional<MessageMask> _mask;
    std::optional<MaskedReader> _masked;
};

} // namespace velmora
