// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RecordChainReader.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/LogCodes.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/Record.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <functional>
#include <utility>

namespace velmora {

namespace {

/// Counts the messages whose code each technology's decoder subscribes to.
class Votes {
public:
    void add(Bytes message) {
        const std::optional<LogMessage> header = LogMessage::parse(message);
        const unsigned wanted = header ? technologiesOfCode(header->logCode()) : 0;
        for (unsigned bit = 0; bit < technologyBits; ++bit)
            _votes[bit] += wanted >> bit & 1;
    }
    /// By how many the first is ahead of the second.
    [[nodiscard]] std::size_t lead() const {
        std::array<std::size_t, technologyBits> sorted = _votes;
        std::partial_sort(sorted.begin(), sorted.begin() + 2, sorted.end(), std::greater<>());
        return sorted[0] - sorted[1];
    }
    [[nodiscard]] std::string_view first() const {
        const auto most = std::max_element(_votes.begin(), _votes.end());
        return technologyOfBit(static_cast<unsigned>(most - _votes.begin()));
    }

private:
    std::array<std::size_t, technologyBits> _votes{};
};

} // namespace

std::optional<LoggedMessage> RecordChainReader::next() {
    if (_ahead.empty())
        return read();
    LoggedMessage message = std::move(_ahead.front());
    _ahead.pop_front();
    return message;
}

void RecordChainReader::lookAhead() {
    constexpr std::size_t decisiveLead = 3;
    Votes votes;
    std::size_t bytes = 0;
    while (_technology.empty() && votes.lead() < decisiveLead && _ahead.size() < maximumLookAhead &&
           bytes < maximumLookAheadBytes) {
        std::optional<LoggedMessage> message = read();
        if (!message)
            break;
        votes.add(message->message.bytes());
        bytes += message->message.size();
        _ahead.push_back(*std::move(message));
    }
    if (_technology.empty() && votes.lead() > 0)
        _technology = votes.first();
}

std::optional<RecordChain::Record> RecordChainReader::nextRecord(RecordChain& chain, std::string_view place) {
    for (;;) {
        std::optional<RecordChain::Record> record = chain.next();
        if (std::optional<Loss> loss = chain.takeLoss()) {
            loss->recordNumber = _number + 1;
            loss->reason.insert(0, place);
            addLoss(*std::move(loss));
        }
        if (!record)
            return std::nullopt;
        ++_number;
        if (!record->isVersionReport)
            return record;
        // The message has a type byte before the report.
        const std::uint32_t written = Record(record->message).u32(1 + dlfVersionReportTimeOffset);
        if (!_lastTime && written != 0)
            _lastTime = Time(std::chrono::seconds(written));
    }
}

void RecordChainReader::addRecordLoss(std::uint64_t bytes, std::string reason) {
    addLoss({0, bytes, ++_number, std::move(reason), false});
}

Time RecordChainReader::timeOf(const RecordChain::Record& record) {
    const std::optional<Time> time = timeOfRecord(record.timestamp);
    if (time && record.timestamp != 0)
        _lastTime = time;
    return _lastTime ? *_lastTime : *timeOfRecord(0);
}

} // namespace velmora
