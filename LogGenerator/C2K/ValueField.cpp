#include "LogGenerator/C2K/ValueField.h"

#include <array>
#include <cstdio>

namespace velmora::C2K {

namespace {

Value shownValue(const ValueField& field, std::int64_t raw) {
    switch (field.shown.kind) {
    case Shown::Kind::Texts: return (*field.shown.texts)[static_cast<std::uint32_t>(raw)];
    case Shown::Kind::Hexadecimal: {
        std::array<char, 16> text{};
        std::snprintf(text.data(), text.size(), "0x%06x", static_cast<unsigned>(raw));
        return text.data();
    }
    case Shown::Kind::Plain: break;
    }
    Dictionary node;
    writeValue(node, field.key, field.shown.show, raw);
    return node[field.key];
}

} // namespace

void publishFields(const Publisher& publisher, const Record& record, std::span<const ValueField> fields,
                   bool connected) {
    for (const ValueField& field : fields) {
        if (connected || field.when == When::Always)
            publisher.publish(field.key, shownValue(field, field.where.read(record)));
        else
            publisher.publish(field.key, "N/A");
    }
}

} // namespace velmora::C2K
