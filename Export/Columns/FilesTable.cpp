// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/FilesTable.h"

#include "Export/Columns/InputColumns.h"
#include "Export/Columns/ValidText.h"

namespace velmora {

namespace {

/// The row, column by column in any order.
class Row {
public:
    explicit Row(std::string_view technology) : _layout(messageTable("files", technology)) {
        _layout.columns.clear();
    }

    void text(std::string_view column, std::string_view value) {
        _layout.add(column, StoredType::Text, ValueMeaning::Text);
        std::string storage;
        _builders.emplace_back(_layout.columns.back()).setText(0, validText(value, storage));
    }
    void integer(std::string_view column, std::uint64_t value) {
        _layout.add(column, StoredType::Integer);
        _builders.emplace_back(_layout.columns.back()).setInteger(0, static_cast<std::int64_t>(value));
    }
    void time(std::string_view column, const std::optional<Time>& value) {
        _layout.add(column, StoredType::Integer, ValueMeaning::Timestamp);
        ColumnBuilder& builder = _builders.emplace_back(_layout.columns.back());
        if (value)
            builder.setInteger(0, value->time_since_epoch().count());
    }
    void flag(std::string_view column, bool value) {
        _layout.add(column, StoredType::Boolean);
        _builders.emplace_back(_layout.columns.back()).setFlag(0, value);
    }

    Result<Done> write(ByteSink& sink, PageCompressor& compressor) {
        ParquetWriter writer(_layout.columns, _layout.properties, sink, compressor);
        static_cast<void>(writer.addRow());
        for (std::size_t i = 0; i < _builders.size(); ++i)
            writer.column(i) = std::move(_builders[i]);
        return writer.finish();
    }

private:
    TableLayout _layout;
    std::vector<ColumnBuilder> _builders;
};

} // namespace

Result<Done> writeFilesTable(const InputFile& file, const TechnologyTables& technology, TableOutputs& outputs,
                             PageCompressor& compressor) {
    const TechnologyTables::Summary& summary = technology.summary();
    Row row(technology.technology());
    row.text("file", file.hash);
    row.text("name", file.name);
    row.text("form", file.form);
    row.integer("size_byte", file.size);
    row.time("first_time", summary.first);
    row.time("last_time", summary.last);
    row.integer("messages", summary.messages);
    row.integer("undecoded", summary.undecoded);
    row.integer("losses", file.losses);
    row.integer("lost_byte", file.lostBytes);
    row.flag("complete_flag", file.isComplete);
    return row.write(outputs.open("files", technology.technology()), compressor);
}

} // namespace velmora
