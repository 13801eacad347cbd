// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/SourceNumber.h"

#include "LogGenerator/Observations/Catalogue.h"

namespace velmora {

namespace {

bool isSigned(const Field& field) {
    constexpr std::uint8_t shownWidth = 32; // of integers, whatever the record holds
    if (field.means.sign != Sign::AsShown)
        return field.means.sign == Sign::Signed;
    if (field.format.kind == TextFormat::Kind::Integer && field.place.width == shownWidth)
        return field.format.format.conversion != 'u';
    return field.place.isSigned;
}

} // namespace

SourceNumber numberOf(const Field& field) {
    // The display's number is raw * format.scale + format.offset.
    const double scale = physicalScale(field);
    return {field.format.scale * scale, field.format.offset * scale + field.means.offset, isSigned(field)};
}

} // namespace velmora
