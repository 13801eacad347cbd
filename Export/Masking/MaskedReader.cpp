// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskedReader.h"

#include <utility>

namespace velmora {

std::optional<LoggedMessage> MaskedReader::next() {
    while (std::optional<LoggedMessage> message = _reader.next()) {
        addLosses();
        if (message->technology >= _names.size())
            _names = _reader.technologies();
        // A name may become known with the first message.
        if (_names[message->technology].empty())
            _names = _reader.technologies();
        const std::string& name = _override.empty() ? _names[message->technology] : _override;
        if (std::optional<LoggedMessage> masked = _mask.mask(*std::move(message), name))
            return masked;
    }
    addLosses();
    return std::nullopt;
}

void MaskedReader::addLosses() {
    for (; _losses < _reader.losses().size(); ++_losses)
        addLoss(_reader.losses()[_losses]);
}

} // namespace velmora
