// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MessageMask.h"
#include "Recording/MessageReader.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// A file's messages, masked as they are read. Comments are left out. Main thread only.
class MaskedReader final : public MessageReader {
public:
    /// Both must outlive it. `technology`, a short name, is that of all messages where it is not empty.
    /// `forChain`: messages whose end a reader of records without framing would not find are left out.
    MaskedReader(MessageReader& reader, MessageMask& mask, std::string technology = {}, bool forChain = false)
        : _reader(reader), _mask(mask), _override(std::move(technology)), _isForChain(forChain) {}
    /// The same of a reader that it owns.
    MaskedReader(std::unique_ptr<MessageReader> reader, MessageMask& mask, std::string technology)
        : MaskedReader(*reader, mask, std::move(technology)) {
        _owned = std::move(reader);
    }

    [[nodiscard]] std::optional<LoggedMessage> next() override;
    [[nodiscard]] const std::string& technology() const override { return _reader.technology(); }
    [[nodiscard]] std::vector<std::string> technologies() const override { return _reader.technologies(); }
    void setReadsAllTechnologies(bool all) override { _reader.setReadsAllTechnologies(all); }
    [[nodiscard]] std::string_view form() const override { return _reader.form(); }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _reader.failure(); }

private:
    void addLosses();

    std::unique_ptr<MessageReader> _owned; ///< null where it outlives this
    MessageReader& _reader;
    MessageMask& _mask;
    std::string _override;
    bool _isForChain;
    std::vector<std::string> _names; ///< of the technologies so far
    std::size_t _losses = 0;         ///< so many of the reader's have been added
};

} // namespace velmora
