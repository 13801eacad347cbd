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

/// What the readers of files share that hold bare log records and do not name their technology: it is told
/// from the log codes. Opening such a file looks ahead until one technology's decoder wants three messages
/// more than any other's, at most over 1000 messages or 1 MiB of them, which are kept; then the one that
/// wants most of them is it. Where two want as many, or none does, the technology stays unknown. Main thread
/// only.
class RecordChainReader : public MessageReader {
public:
    static constexpr std::size_t maximumLookAhead = 1000;
    static constexpr std::size_t maximumLookAheadBytes = std::size_t{1} << 20;

    [[nodiscard]] std::optional<LoggedMessage> next() final;
    [[nodiscard]] const std::string& technology() const final { return _technology; }

protected:
    /// The next message; none at the end, and ever after.
    [[nodiscard]] virtual std::optional<LoggedMessage> read() = 0;
    /// To be called once, by what opens the file.
    void lookAhead();
    /// What the file's form alone tells.
    void setTechnology(std::string_view technology) { _technology = technology; }

    /// The chain's next record, with its number and offset and without a time. Version reports are passed
    /// over and have numbers. Losses are told with `place` before their reason.
    [[nodiscard]] std::optional<RecordChain::Record> nextRecord(RecordChain& chain, std::string_view place);
    /// The number of the record that was given last.
    [[nodiscard]] std::uint64_t number() const { return _number; }
    /// Something that would have been the next record and gave no message.
    void loseRecord(std::uint64_t bytes, std::string reason);
    /// Counts a record that is none of a chain's.
    void countRecord() { ++_number; }
    /// The time that the record's stamp means; for a stamp of 0, and for one that means none, that of the
    /// last record with a good one.
    [[nodiscard]] Time timeOf(const RecordChain::Record& record);

private:
    std::string _technology;
    std::deque<LoggedMessage> _ahead;
    std::uint64_t _number = 0;
    std::optional<Time> _lastTime;
};

} // namespace velmora
