// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFReader.h"

#include "Recording/Files/InputStart.h"

namespace velmora {

Result<std::unique_ptr<DLFReader>> DLFReader::open(ChunkedInput input, std::string_view wanted) {
    std::unique_ptr<DLFReader> reader(new DLFReader(std::move(input)));
    const bool isLog = reader->_records.looksLikeRecords();
    if (reader->failure() && !isLog)
        return *reader->failure();
    if (!isLog)
        return Failure{unexpectedStart(reader->_records.available(), wanted)};
    reader->lookAhead();
    return reader;
}

std::optional<LoggedMessage> DLFReader::read() {
    std::optional<RecordChain::Record> record = nextRecord(_records, {});
    if (!record)
        return std::nullopt;
    return LoggedMessage{timeOf(*record), std::move(record->message), number(), record->offset};
}

} // namespace velmora
