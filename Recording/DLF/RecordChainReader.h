// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/DLF/RecordChain.h"
#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>
#include <deque>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The base of readers of files that hold bare log records and do not name their technology, which is derived
/// from the log codes. Opening such a file looks ahead until one technology's decoder subscribes to three
/// messages more than any other's, over at most 1000 messages or 1 MiB of them, which are queued; the
/// technology with most of them is chosen. With a tie, or without such messages, it stays unknown. Main
/// thread only.
class RecordChainReader : public MessageReader {
public:
    static constexpr std::size_t maximumLookAhead = 1000;
    static constexpr std::size_t maximumLookAheadBytes = std::size_t{1} << 20;

    [[nodiscard]] std::optional<LoggedMessage> next() final;
    [[nodiscard]] const std::string& technology() const final { return _technology; }

protected:
    /// The next message; none once the end has been reached.
    [[nodiscard]] virtual std::optional<LoggedMessage> read() = 0;
    /// Called once, by the function that opens the file.
    void lookAhead();
    /// For a file whose form alone determines the technology.
    void setTechnology(std::string_view technology) { _technology = technology; }

    /// The chain's next record, with its number and offset and without a time. Version reports are skipped
    /// and have numbers. Losses are reported with `place` before their reason.
    [[nodiscard]] std::optional<RecordChain::Record> nextRecord(RecordChain& chain, std::string_view place);
    /// The number of the record that was returned last.
    [[nodiscard]] std::uint64_t number() const { return _number; }
    /// Adds the loss of the next record.
    void addRecordLoss(std::uint64_t bytes, std::string reason);
    /// Counts a record that is not part of a chain.
    void countRecord() { ++_number; }
    /// The time of the record's stamp; for a stamp of 0 or an invalid one, that of the last record with a
    /// valid one.
    [[nodiscard]] Time timeOf(const RecordChain::Record& record);

private:
    std::string _technology;
    std::deque<LoggedMessage> _ahead;
    std::uint64_t _number = 0;
    std::optional<Time> _lastTime;
};

} // namespace velmora
