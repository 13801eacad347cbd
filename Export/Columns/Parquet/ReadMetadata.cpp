// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/CompactReader.h"
#include "Export/Columns/Parquet/FileMetadata.h"
#include "Export/Columns/Parquet/WrittenBy.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

std::uint64_t count(CompactReader& in) {
    const std::int64_t value = in.longInteger();
    if (value < 0)
        throw MalformedStructure("got a negative count or offset");
    return static_cast<std::uint64_t>(value);
}

ValueMeaning readMeaning(CompactReader& in) {
    ValueMeaning meaning = ValueMeaning::Plain;
    in.structure([&](int number) {
        meaning = number == 1   ? ValueMeaning::Text
                  : number == 5 ? ValueMeaning::Degrees
                                : ValueMeaning::Timestamp;
        return false;
    });
    return meaning;
}

ColumnSchema readColumn(CompactReader& in) {
    ColumnSchema column;
    in.structure([&](int number) {
        switch (number) {
        case 1: column.type = static_cast<StoredType>(in.integer()); return true;
        case 3: column.isNullable = in.integer() == 1; return true;
        case 4: column.name = in.text(); return true;
        case 10: column.meaning = readMeaning(in); return true;
        default: return false;
        }
    });
    return column;
}

ColumnStatistics readStatistics(CompactReader& in) {
    ColumnStatistics statistics;
    std::string greatest;
    in.structure([&](int number) {
        switch (number) {
        case 3: statistics.nulls = count(in); return true;
        case 5: greatest = in.text(); return true;
        case 6: statistics.range = std::pair(in.text(), std::move(greatest)); return true;
        default: return false;
        }
    });
    return statistics;
}

ChunkMetadata readChunkMetadata(CompactReader& in) {
    ChunkMetadata chunk;
    in.structure([&](int number) {
        switch (number) {
        case 2:
            in.list([&] { chunk.encodings.push_back(static_cast<PageEncoding>(in.integer())); });
            return true;
        case 5: chunk.values = count(in); return true;
        case 6: chunk.uncompressedSize = count(in); return true;
        case 7: chunk.size = count(in); return true;
        case 9: chunk.dataOffset = count(in); return true;
        case 11: chunk.dictionaryOffset = count(in); return true;
        case 12: chunk.statistics = readStatistics(in); return true;
        default: return false;
        }
    });
    return chunk;
}

RowGroupMetadata readGroup(CompactReader& in) {
    RowGroupMetadata group;
    in.structure([&](int number) {
        switch (number) {
        case 1:
            in.list([&] {
                in.structure([&](int member) {
                    if (member != 3)
                        return false;
                    group.chunks.push_back(readChunkMetadata(in));
                    return true;
                });
            });
            return true;
        case 3: group.rows = count(in); return true;
        default: return false;
        }
    });
    return group;
}

std::pair<std::string, std::string> readProperty(CompactReader& in) {
    std::pair<std::string, std::string> property;
    in.structure([&](int number) {
        if (number == 1)
            property.first = in.text();
        else if (number == 2)
            property.second = in.text();
        else
            return false;
        return true;
    });
    return property;
}

} // namespace

Result<FileMetadata> parseFileMetadata(Bytes bytes) {
    FileMetadata metadata;
    std::string author;
    try {
        CompactReader in(bytes);
        in.structure([&](int number) {
            switch (number) {
            case 2: in.list([&] { metadata.columns.push_back(readColumn(in)); }); return true;
            case 4: in.list([&] { metadata.groups.push_back(readGroup(in)); }); return true;
            case 5: in.list([&] { metadata.properties.push_back(readProperty(in)); }); return true;
            case 6: author = in.text(); return true;
            default: return false;
            }
        });
    } catch (const MalformedStructure& malformed) {
        return Failure{std::string("its metadata cannot be read: ") + malformed.what()};
    }
    if (author != writtenBy)
        return Failure{"not written by this program"};
    if (metadata.columns.empty())
        return Failure{"its metadata lists no columns"};
    metadata.columns.erase(metadata.columns.begin()); // the table itself
    for (const RowGroupMetadata& group : metadata.groups)
        if (group.chunks.size() != metadata.columns.size())
            return Failure{"its metadata lists " + std::to_string(group.chunks.size()) + " of " +
                           std::to_string(metadata.columns.size()) + " columns in a row group"};
    return metadata;
}

} // namespace velmora
