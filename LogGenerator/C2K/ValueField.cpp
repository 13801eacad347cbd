#include "LogGenerator/C2K/ValueField.h"

#include <array>
#include <cstdio>
#include <cstring>

namespace velmora::C2K {

namespace {

/// `table`: the field; `bytes`: its raw value.
Value shownValue(Bytes bytes, const void* table) {
    const auto& field = *static_cast<const ValueField*>(table);
    std::int64_t raw = 0;
    std::memcpy(&raw, bytes.data(), sizeof raw);
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
        if (!connected && field.when != When::Always) {
            publisher.publish(field.key, "N/A");
            continue;
        }
        const std::int64_t raw = field.where.read(record);
        std::array<std::uint8_t, sizeof raw> bytes;
        std::memcpy(bytes.data(), &raw, sizeof raw);
        publisher.publishLater(field.key, shownValue, &field, bytes);
    }
}

} // namespace velmora::C2K
