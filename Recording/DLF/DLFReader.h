// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/DLF/RecordChainReader.h"

#include <memory>
#include <string_view>
#include <utility>

namespace velmora {

/// Reads a DLF log: the version report that Velmora's logs begin with, which is no message, and log records;
/// logs from elsewhere may lack the report. Messages are returned as they arrived at the port, as far as
/// the log keeps that (see RecordChain).
///
/// A log has no arrival times: a message has the time of its record's own stamp. For a stamp that is 0 or
/// invalid, the time of the last message before it that had one is used; without one, the time of writing in
/// the version report; without that, the start of system time, 1980-01-06. Offsets are from the file's start,
/// and records are counted from 1, version reports included. Memory is bounded for any content; copy messages
/// that are kept for long. Main thread only.
class DLFReader final : public RecordChainReader {
public:
    /// Opens an input of which nothing has been skipped, and looks ahead for its technology. Fails when it
    /// cannot be read, or does not begin as a DLF log does. `wanted` is what the failure's reason names as
    /// expected.
    static Result<std::unique_ptr<DLFReader>>
    open(ChunkedInput input, std::string_view wanted = "a DLF log's version report or log records");

    [[nodiscard]] std::string_view form() const override { return "DLF log"; }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _records.failure(); }

protected:
    [[nodiscard]] std::optional<LoggedMessage> read() override;

private:
    explicit DLFReader(ChunkedInput input) : _records(std::move(input), RecordChain::Layout::DLF) {}

    RecordChain _records;
};

} // namespace velmora
