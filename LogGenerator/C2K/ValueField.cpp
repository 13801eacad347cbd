// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/ValueField.h"

#include "LogGenerator/C2K/Publisher.h"

#include <array>
#include <cstdio>
#include <cstring>

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
    Value value;
    withText(field.shown.show, raw, [&value](std::string_view text) { value = text; });
    return value;
}

Value shownValue(const ValueField& field, const Record& record, bool connected) {
    const bool means = connected || field.when == When::Always;
    return means ? shownValue(field, field.where.read(record)) : Value("N/A");
}

/// What a display keeps until it is looked at: this, the labelled fields, and the record as far as it is
/// needed.
struct LateFields {
    std::size_t labelsLength = 0;
    bool connected = false;
};

/// Of a longer one the fields are published one by one.
constexpr std::size_t longestRecord = 256;

/// `table`: the first of the fields.
void writeLateFields(Dictionary& display, Bytes bytes, const void* table) {
    LateFields late;
    std::memcpy(&late, bytes.data(), sizeof late);
    const Record record(bytes.subspan(sizeof late + late.labelsLength));
    for (LabelledFields labels(bytes.subspan(sizeof late, late.labelsLength)); !labels.atEnd();) {
        const auto [place, label] = labels.next();
        display.set(label, shownValue(static_cast<const ValueField*>(table)[place], record, late.connected));
    }
}

} // namespace

void publishFields(const Publisher& publisher, const Record& record, std::span<const ValueField> fields,
                   bool connected) {
    if (publisher.tells())
        for (const ValueField& field : fields)
            publisher.tell(field.key, shownValue(field, record, connected));
    const Bytes needed = record.bytes().first(endOf(fields, connected));
    const Targets::Screens& screens = publisher.targets().of(fields);
    if (!screens || needed.size() > longestRecord) {
        for (const ValueField& field : fields)
            publisher.show(field.key, shownValue(field, record, connected));
        return;
    }
    for (const auto& [display, labels] : *screens) {
        const LateFields late{labels.size(), connected};
        std::array<std::uint8_t, sizeof late + LabelledFields::longest + longestRecord> buffer;
        std::memcpy(buffer.data(), &late, sizeof late);
        const auto behind = std::copy(labels.begin(), labels.end(), buffer.begin() + sizeof late);
        const auto end = std::copy(needed.begin(), needed.end(), behind);
        display->writeLater({writeLateFields, fields.data()},
                            Bytes(buffer).first(static_cast<std::size_t>(end - buffer.begin())));
    }
}

} // namespace velmora::C2K
