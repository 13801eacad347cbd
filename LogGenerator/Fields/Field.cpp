// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Field.h"

namespace velmora {

std::int64_t Where::read(const Record& record) const {
    if (isBigEndian)
        return record.u16BigEndian(offset);
    if (bit == 0) {
        switch (width) {
        case 8: return isSigned ? std::int64_t{record.i8(offset)} : record.u8(offset);
        case 16: return isSigned ? std::int64_t{record.i16(offset)} : record.u16(offset);
        case 32: return isSigned ? std::int64_t{record.i32(offset)} : record.u32(offset);
        default: break;
        }
    }
    return record.bits(offset, bit, width);
}

void writeValue(Dictionary& node, std::string_view label, const Show& show, std::int64_t raw) {
    withText(show, raw, [&node, label](std::string_view text) { node.setText(label, text); });
}

void writeFields(Dictionary& node, const Record& record, const Layout& layout) {
    if (!node.empty()) {
        for (const Field& field : layout.fields)
            writeValue(node, field.label, field.show, field.where.read(record));
        return;
    }
    // A row's labels are all new, and no two of a layout's are the same.
    node.reserve(layout.fields.size());
    for (const Field& field : layout.fields)
        withText(field.show, field.where.read(record),
                 [&](std::string_view text) { node.addText(field.label, text); });
}

void writeFieldsLater(Dictionary& node, const Record& record, const Layout& layout) {
    constexpr auto write = [](Dictionary& target, Bytes bytes, const void* table) {
        writeFields(target, Record(bytes), *static_cast<const Layout*>(table));
    };
    node.writeLater({write, &layout}, record.bytes().first(layout.minimumLength));
}

} // namespace velmora
