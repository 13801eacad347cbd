// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskedReader.h"

#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"

#include <utility>

namespace velmora {

namespace {

/// Whether the length field of a record leads to its end.
bool isInChain(Bytes bytes, std::string_view technology) {
    if (shortTechnologyName(technology) == shortTechnologyName(kVoxLogChannelTechnology_IFX))
        return true;
    const std::optional<LogMessage> message = LogMessage::parse(bytes);
    return message && message->record.size() >= LogMessage::headerLength &&
           message->record.size() - LogMessage::lengthOffset == message->length();
}

} // namespace

std::optional<LoggedMessage> MaskedReader::next() {
    while (std::optional<LoggedMessage> message = _reader.next()) {
        addLosses();
        if (message->technology >= _names.size())
            _names = _reader.technologies();
        // A name may become known with the first message.
        if (_names[message->technology].empty())
            _names = _reader.technologies();
        const std::string& name = _override.empty() ? _names[message->technology] : _override;
        std::optional<LoggedMessage> masked = _mask.mask(*std::move(message), name);
        if (!masked)
            continue;
        if (_isForChain && !masked->refresh && !isInChain(masked->message.bytes(), name)) {
            _mask.leaveOut();
            continue;
        }
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
