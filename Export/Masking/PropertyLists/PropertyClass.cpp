// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyClass.h"

namespace velmora {

std::optional<Masked> classOf(PropertyForm form) {
    using enum PropertyForm;
    switch (form) {
    case ICCID:
    case IMSI:
    case EID:
    case Phone:
    case ShortNumbers:
    case Personal: return Masked::Subscriber;
    case PropertyForm::Equipment: return Masked::Equipment;
    case PropertyForm::Address: return Masked::Address;
    case CountryCode:
    case NetworkCode:
    case Network:
    case NetworkName:
    case AreaText:
    case LocationArea:
    case TrackingArea:
    case RoutingArea:
    case Cell:
    case System:
    case NetworkID:
    case BaseStation: return Masked::Location;
    case PropertyForm::Position: return Masked::Position;
    case ClockTime:
    case PropertyForm::DateValue: return Masked::Times;
    case Number:
    case Text:
    case Inner:
    case Group: break;
    }
    return std::nullopt;
}

} // namespace velmora
