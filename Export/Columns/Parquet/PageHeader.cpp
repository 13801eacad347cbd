// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/PageHeader.h"

#include "Export/Columns/Parquet/CompactWriter.h"

namespace velmora {

std::string serialized(const PageHeader& header) {
    CompactWriter out;
    out.beginStructure();
    out.integerMember(1, header.isDictionary ? 2 : 0);
    out.integerMember(2, static_cast<std::int32_t>(header.uncompressedSize));
    out.integerMember(3, static_cast<std::int32_t>(header.size));
    out.structureMember(header.isDictionary ? 7 : 5);
    out.integerMember(1, static_cast<std::int32_t>(header.values));
    out.integerMember(2, static_cast<std::int32_t>(header.encoding));
    if (!header.isDictionary) {
        // Levels of definition and repetition.
        out.integerMember(3, static_cast<std::int32_t>(PageEncoding::Runs));
        out.integerMember(4, static_cast<std::int32_t>(PageEncoding::Runs));
    }
    out.endStructure();
    out.endStructure();
    return out.result();
}

} // namespace velmora
