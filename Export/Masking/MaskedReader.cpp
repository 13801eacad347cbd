// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskedReader.h"

#include "Export/Masking/TechnologyName.h"
#include "LogMessages/LogCodes.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <chrono>
#include <utility>

namespace velmora {

namespace {

/// Whether the time stamp is within a day of the arrival.
bool hasNearTime(const LogMessage& message, Time arrival) {
    const std::uint64_t stamp = message.timestamp().value_or(0);
    const std::optional<Time> time = timeOfRecord(stamp);
    if (stamp == 0 || !time)
        return false;
    // Unsigned, since times may be as far apart as there are any.
    const auto [early, late] = std::minmax(*time, arrival);
    return static_cast<std::uint64_t>(late.time_since_epoch().count()) -
               static_cast<std::uint64_t>(early.time_since_epoch().count()) <
           static_cast<std::uint64_t>(std::chrono::nanoseconds(std::chrono::hours(24)).count());
}

/// Whether a reader finds the record among others: its length field leads to its end, and its stream and
/// code, or its time stamp, show that it is one. Of other records nothing is left but zeros.
bool isInChain(const LoggedMessage& logged, std::string_view technology) {
    if (shortTechnologyName(technology) == shortTechnologyName(kVoxLogChannelTechnology_IFX))
        return true;
    const std::optional<LogMessage> message = LogMessage::parse(logged.message.bytes());
    if (!message || message->record.size() < LogMessage::headerLength ||
        message->record.size() - LogMessage::lengthOffset != message->length())
        return false;
    const bool isOfStream =
        message->type == LogMessage::basebandType || message->type == LogMessage::extraType;
    return (isOfStream && technologiesOfCode(message->logCode()) != 0) || hasNearTime(*message, logged.time);
}

} // namespace

std::optional<LoggedMessage> MaskedReader::next() {
    while (std::optional<LoggedMessage> message = _reader.next()) {
        addLosses();
        // A name may become known with the first message.
        if (message->technology >= _names.size() || _names[message->technology].empty()) {
            _names.resize(std::max<std::size_t>(_names.size(), message->technology + std::size_t{1}));
            _names[message->technology] = technologyOf(*message, _reader);
        }
        const std::string& name = _override.empty() ? _names[message->technology] : _override;
        std::optional<LoggedMessage> masked = _mask.mask(*std::move(message), name);
        if (!masked)
            continue;
        if (_isForChain && !masked->refresh && !isInChain(*masked, name)) {
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
    setLossTotals(_reader.lossTotals());
}

} // namespace velmora
