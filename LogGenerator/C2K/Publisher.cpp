// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/Publisher.h"

#include "LogGenerator/MessageEffects.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace velmora::C2K {

namespace {

/// What a label is kept as until it is looked at, before the bytes that its value is made of.
struct LateValue {
    Publisher::MakeValue make;
    const void* table;
    std::size_t labelLength; ///< the label follows
};

/// Longer ones are made at once.
constexpr std::size_t longestLate = 1024;

void writeLateValue(Dictionary& display, Bytes bytes, const void*) {
    LateValue late;
    std::memcpy(&late, bytes.data(), sizeof late);
    const Bytes label = bytes.subspan(sizeof late, late.labelLength);
    display.set({reinterpret_cast<const char*>(label.data()), label.size()},
                late.make(bytes.subspan(sizeof late + late.labelLength), late.table));
}

Value textOf(Bytes bytes, const void*) {
    return std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size());
}

} // namespace

void Publisher::tell(std::string_view valueKey, const Value& value) const {
    if (_effects)
        _effects->value(valueKey, value);
}

void Publisher::show(std::string_view valueKey, const Value& value) const {
    for (const auto& [display, label] : _targets.of(valueKey))
        display->set(*label, value);
}

void Publisher::publish(std::string_view valueKey, std::string_view text) const {
    publishLater(valueKey, textOf, nullptr,
                 {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()});
}

void Publisher::publishLater(std::string_view valueKey, MakeValue make, const void* table,
                             Bytes bytes) const {
    if (_effects)
        _effects->value(valueKey, make(bytes, table));
    for (const auto& [display, label] : _targets.of(valueKey)) {
        const LateValue late{make, table, label->size()};
        const std::size_t length = sizeof late + label->size() + bytes.size();
        if (length > longestLate) {
            display->set(*label, make(bytes, table));
            continue;
        }
        std::array<std::uint8_t, longestLate> buffer;
        std::memcpy(buffer.data(), &late, sizeof late);
        const auto behind = std::copy(label->begin(), label->end(), buffer.begin() + sizeof late);
        std::copy(bytes.begin(), bytes.end(), behind);
        // The label's place in memory stands for the label: display and lookup are made and go together.
        display->writeLater({writeLateValue, label}, Bytes(buffer).first(length));
    }
}

} // namespace velmora::C2K
