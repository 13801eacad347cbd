// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/TechnologyFeed.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Platform/TelephonyService.h"
#include "Tools/Technologies.h"

#include <utility>

namespace velmora {

namespace {

std::optional<Time> timeOfStamp(std::optional<std::uint64_t> stamp) {
    return stamp && isRecordTime(*stamp) ? timeOfRecord(*stamp) : std::nullopt;
}

} // namespace

Result<std::unique_ptr<TechnologyFeed>> TechnologyFeed::make(const std::string& technology,
                                                             AnalysisClock clock, const MakeAnalysis& make,
                                                             std::optional<Time>& first) {
    std::unique_ptr<TechnologyFeed> made(new TechnologyFeed(technology, clock, first));
    Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(technology, made->_clock);
    if (!decoder)
        return Failure{decoder.reason()};
    made->_decoder = *std::move(decoder);
    made->_decoder->setKeepsHistory(false);
    made->_analysis = make(made->_decoder->catalogue());
    made->_decoder->setObservationSink(made.get());
    return made;
}

TechnologyFeed::TechnologyFeed(std::string technology, AnalysisClock clock, std::optional<Time>& first)
    : _technology(std::move(technology)), _first(first), _times(clock) {}

std::optional<std::string> TechnologyFeed::decode(const LoggedMessage& message, std::uint32_t input) {
    _message = {input, message.number};
    _clock.setNow(message.time);
    const auto reportUndecoded = [&](const char* reason) {
        const std::optional<LogMessage> parsed = LogMessage::parse(message.message.bytes());
        const Time time = timeOf(parsed ? timeOfStamp(parsed->timestamp()) : std::nullopt);
        _analysis->reportUndecoded({_message, time, message.time, reason});
        return std::string(reason);
    };
    try {
        _decoder->updateState(_state, message.message);
    } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
        return reportUndecoded(failure.what());
    } catch (const AssertionFailure& failure) {
        return reportUndecoded(failure.what());
    }
    return std::nullopt;
}

void TechnologyFeed::observed(const ObservedMessage& message) {
    _analysis->report({_message, timeOf(timeOfStamp(message.timestamp)), message});
}

Time TechnologyFeed::timeOf(std::optional<Time> modem) {
    const Time time = _times.of(_clock.now(), modem);
    if (!_first)
        _first = time;
    return time;
}

} // namespace velmora
