// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/FileMetadata.h"

#include "Export/Columns/Parquet/CompactWriter.h"
#include "Export/Columns/Parquet/WrittenBy.h"

namespace velmora {

namespace {

using Element = CompactWriter::Element;

void writeMeaning(CompactWriter& out, ValueMeaning meaning) {
    constexpr int convertedType = 6;
    constexpr int logicalType = 10;
    constexpr int degreeDigits = 3 + degreePlaces;
    switch (meaning) {
    case ValueMeaning::Plain: return;
    case ValueMeaning::Text:
        out.integerMember(convertedType, 0); // as readers that are older than the logical types know it
        out.structureMember(logicalType);
        out.emptyMember(1);
        break;
    case ValueMeaning::Timestamp:
        out.structureMember(logicalType);
        out.structureMember(8);
        out.flagMember(1, true); // in UTC
        out.structureMember(2);
        out.emptyMember(3); // nanoseconds
        out.endStructure();
        out.endStructure();
        break;
    case ValueMeaning::Degrees:
        out.integerMember(convertedType, 5); // the same for older readers
        out.integerMember(7, degreePlaces);
        out.integerMember(8, degreeDigits);
        out.structureMember(logicalType);
        out.structureMember(5);
        out.integerMember(1, degreePlaces);
        out.integerMember(2, degreeDigits);
        out.endStructure();
        break;
    }
    out.endStructure();
}

void writeSchema(CompactWriter& out, const std::vector<ColumnSchema>& columns) {
    out.listMember(2, Element::Structure, columns.size() + 1);
    out.beginStructure();
    out.textMember(4, "schema");
    out.integerMember(5, static_cast<std::int32_t>(columns.size()));
    out.endStructure();
    for (const ColumnSchema& column : columns) {
        out.beginStructure();
        out.integerMember(1, static_cast<std::int32_t>(column.type));
        out.integerMember(3, column.isNullable ? 1 : 0);
        out.textMember(4, column.name);
        writeMeaning(out, column.meaning);
        out.endStructure();
    }
}

void writeStatistics(CompactWriter& out, const ColumnStatistics& statistics) {
    out.structureMember(12);
    out.longMember(3, static_cast<std::int64_t>(statistics.nulls));
    if (statistics.range) {
        out.textMember(5, statistics.range->second);
        out.textMember(6, statistics.range->first);
    }
    out.endStructure();
}

void writeChunk(CompactWriter& out, const ChunkMetadata& chunk, const ColumnSchema& column) {
    constexpr std::int32_t zstd = 6;
    out.beginStructure();
    // Where the metadata is a second time: nowhere, and it is of no use to readers.
    out.longMember(2, 0);
    out.structureMember(3);
    out.integerMember(1, static_cast<std::int32_t>(column.type));
    out.listMember(2, Element::Integer, chunk.encodings.size());
    for (const PageEncoding encoding : chunk.encodings)
        out.integer(static_cast<std::int32_t>(encoding));
    out.listMember(3, Element::Text, 1);
    out.text(column.name);
    out.integerMember(4, zstd);
    out.longMember(5, static_cast<std::int64_t>(chunk.values));
    out.longMember(6, static_cast<std::int64_t>(chunk.uncompressedSize));
    out.longMember(7, static_cast<std::int64_t>(chunk.size));
    out.longMember(9, static_cast<std::int64_t>(chunk.dataOffset));
    if (chunk.dictionaryOffset)
        out.longMember(11, static_cast<std::int64_t>(*chunk.dictionaryOffset));
    writeStatistics(out, chunk.statistics);
    out.endStructure();
    out.endStructure();
}

void writeGroup(CompactWriter& out, const RowGroupMetadata& group, const std::vector<ColumnSchema>& columns) {
    std::uint64_t uncompressedSize = 0;
    std::uint64_t size = 0;
    out.beginStructure();
    out.listMember(1, Element::Structure, group.chunks.size());
    for (std::size_t i = 0; i < group.chunks.size(); ++i) {
        uncompressedSize += group.chunks[i].uncompressedSize;
        size += group.chunks[i].size;
        writeChunk(out, group.chunks[i], columns[i]);
    }
    out.longMember(2, static_cast<std::int64_t>(uncompressedSize));
    out.longMember(3, static_cast<std::int64_t>(group.rows));
    if (!group.chunks.empty())
        out.longMember(5, static_cast<std::int64_t>(group.chunks.front().begin()));
    out.longMember(6, static_cast<std::int64_t>(size));
    out.endStructure();
}

} // namespace

std::uint64_t FileMetadata::rows() const {
    std::uint64_t sum = 0;
    for (const RowGroupMetadata& group : groups)
        sum += group.rows;
    return sum;
}

std::string serialized(const FileMetadata& metadata) {
    CompactWriter out;
    out.beginStructure();
    out.integerMember(1, 2); // the format's version with the encodings used here
    writeSchema(out, metadata.columns);
    out.longMember(3, static_cast<std::int64_t>(metadata.rows()));
    out.listMember(4, Element::Structure, metadata.groups.size());
    for (const RowGroupMetadata& group : metadata.groups)
        writeGroup(out, group, metadata.columns);
    out.listMember(5, Element::Structure, metadata.properties.size());
    for (const auto& [key, value] : metadata.properties) {
        out.beginStructure();
        out.textMember(1, key);
        out.textMember(2, value);
        out.endStructure();
    }
    out.textMember(6, writtenBy);
    // Ranges are by the order of each type: of text, that of its bytes.
    out.listMember(7, Element::Structure, metadata.columns.size());
    for (std::size_t i = 0; i < metadata.columns.size(); ++i) {
        out.beginStructure();
        out.emptyMember(1);
        out.endStructure();
    }
    out.endStructure();
    return out.result();
}

} // namespace velmora
