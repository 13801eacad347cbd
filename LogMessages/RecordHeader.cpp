// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordHeader.h"

#include "LogMessages/FieldReader.h"

namespace velmora {

std::optional<RecordHeader> recordHeader(Bytes message) {
    if (message.size() < RecordHeader::size)
        return std::nullopt;
    RecordHeader header;
    header.prefixed = message[0] == RecordHeader::prefixMarker;
    header.record = message.subspan(header.prefixed ? RecordHeader::prefixSize : 0);
    FieldReader fields(header.record, false);
    header.type = header.record[0];
    header.length = fields.u16(1);
    header.code = fields.u16(3);
    const std::uint64_t timestamp = fields.u64(5);
    if (fields.isGood())
        header.timestamp = timestamp;
    return header;
}

} // namespace velmora
