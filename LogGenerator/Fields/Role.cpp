// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Role.h"

namespace velmora {

namespace {

constexpr RoleName names[] = {
    {Role::ServingCountryCode, "serving.mcc"},
    {Role::ServingNetworkCode, "serving.mnc"},
    {Role::ServingArea, "serving.area"},
    {Role::ServingCell, "serving.cell"},
    {Role::ServingChannel, "serving.channel"},
    {Role::ServingPhysicalCell, "serving.physical-cell"},
    {Role::ServingLevel, "serving.level", Unit::DBm},
    {Role::ServingQuality, "serving.quality", Unit::DB},
    {Role::NeighbourChannel, "neighbour.channel"},
    {Role::NeighbourPhysicalCell, "neighbour.physical-cell"},
    {Role::NeighbourLevel, "neighbour.level", Unit::DBm},
    {Role::NeighbourQuality, "neighbour.quality", Unit::DB},
    {Role::RegistrationState, "registration.state"},
    {Role::RadioState, "radio.state"},
    {Role::BlockErrorRate, "block-error-rate", Unit::Percent},
    {Role::DataRate, "data-rate", Unit::KilobitPerSecond},
};

} // namespace

std::span<const RoleName> roleNames() {
    return names;
}

std::string_view nameOf(Role role) {
    for (const RoleName& row : names)
        if (row.role == role)
            return row.name;
    return {};
}

std::optional<Role> roleNamed(std::string_view name) {
    for (const RoleName& row : names)
        if (row.name == name)
            return row.role;
    return std::nullopt;
}

} // namespace velmora
