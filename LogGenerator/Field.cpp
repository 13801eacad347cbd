#include "LogGenerator/Field.h"

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
    if (show.hasException && raw == show.exception) {
        node.setText(label, show.exceptionText);
        return;
    }
    switch (show.kind) {
    case Show::Kind::Integer: {
        const auto value =
            raw * static_cast<std::int64_t>(show.scale) + static_cast<std::int64_t>(show.offset);
        node.setText(label, NumberText(show.format, value).text());
        break;
    }
    case Show::Kind::Real:
        node.setText(label,
                     NumberText(show.format, static_cast<double>(raw) * show.scale + show.offset).text());
        break;
    case Show::Kind::Text: node.setText(label, (*show.texts)[static_cast<std::uint32_t>(raw)]); break;
    case Show::Kind::Flag: node.setText(label, raw != 0 ? show.set : show.clear); break;
    }
}

void writeFields(Dictionary& node, const Record& record, const Layout& layout) {
    for (const Field& field : layout.fields)
        writeValue(node, field.label, field.show, field.where.read(record));
}

void writeFieldsLater(Dictionary& node, const Record& record, const Layout& layout) {
    constexpr auto write = [](Dictionary& target, Bytes bytes, const void* table) {
        writeFields(target, Record(bytes), *static_cast<const Layout*>(table));
    };
    node.writeLater({write, &layout}, record.bytes().first(layout.minimumLength));
}

} // namespace velmora
