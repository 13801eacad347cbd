// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/GSM/KnownFields.h"

#include "LogGenerator/Observations/Catalogue.h"

#include <algorithm>
#include <string_view>

namespace velmora {

namespace {

/// A leaf by the names that lead to it, "*" for the rows of a list. Dictionaries with one entry are folded,
/// so that the same value may be shown at a shorter path.
struct KnownField {
    std::string_view path;
    Field field;
};

constexpr TextFormat number = integer("%d");
constexpr TextFormat level = integer("%d dBm");
constexpr Meaning networkCode{.identity = Identity::Location, .clause = "3GPP TS 23.003 2.2"};

constexpr KnownField knownFields[] = {
    {"Registration", {"", computed, plainText(), {.role = Role::RegistrationState}}},
    {"Registration/State", {"", computed, plainText(), {.role = Role::RegistrationState}}},
    {"Registration/PLMN", {"", computed, plainText(), networkCode}},
    {"Registration/LAC",
     {"",
      computed,
      number,
      {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.1"}}},
    {"Registration/RAC",
     {"", computed, number, {.identity = Identity::Location, .clause = "3GPP TS 23.003 4.2"}}},
    {"Registration/Network Name", {"", computed, plainText()}},
    {"Registration/Equivalent PLMNs/*", {"", computed, plainText(), networkCode}},
    {"Serving Cell/ARFCN",
     {"", computed, number, {.role = Role::ServingChannel, .clause = "3GPP TS 45.005 2"}}},
    {"Serving Cell/Band", {"", computed, plainText(), {.clause = "3GPP TS 45.005 2"}}},
    {"Serving Cell/BSIC",
     {"", computed, plainText(), {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 23.003 4.3.2"}}},
    {"Serving Cell/RxLev",
     {"", computed, level, {.role = Role::ServingLevel, .clause = "3GPP TS 45.008 8.1"}}},
    {"Serving Cell/C1", {"", computed, number, {.unit = Unit::DB, .clause = "3GPP TS 45.008 6.4"}}},
    {"Serving Cell/C2", {"", computed, number, {.unit = Unit::DB, .clause = "3GPP TS 45.008 6.4"}}},
    {"Serving Cell/Cell ID",
     {"",
      computed,
      number,
      {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.3.1"}}},
    {"Neighbor Cells/*/ARFCN",
     {"", computed, number, {.role = Role::NeighbourChannel, .clause = "3GPP TS 45.005 2"}}},
    {"Neighbor Cells/*/Band", {"", computed, plainText(), {.clause = "3GPP TS 45.005 2"}}},
    {"Neighbor Cells/*/BSIC",
     {"", computed, plainText(), {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 23.003 4.3.2"}}},
    {"Neighbor Cells/*/RxLev",
     {"", computed, level, {.role = Role::NeighbourLevel, .clause = "3GPP TS 45.008 8.1"}}},
    {"Neighbor Cells/*/C1", {"", computed, number, {.unit = Unit::DB, .clause = "3GPP TS 45.008 6.4"}}},
    {"Dedicated Channel", {"", computed, plainText()}},
    {"Dedicated Channel/Type", {"", computed, plainText(), {.clause = "3GPP TS 45.002"}}},
    {"Dedicated Channel/Codec", {"", computed, plainText()}},
    {"Dedicated Channel/ARFCN", {"", computed, number, {.clause = "3GPP TS 45.005 2"}}},
    {"Dedicated Channel/Timeslot", {"", computed, number, {.clause = "3GPP TS 45.002"}}},
    {"Dedicated Channel/RxQual Full", {"", computed, number, {.clause = "3GPP TS 45.008 8.2"}}},
    {"Dedicated Channel/RxQual Sub", {"", computed, number, {.clause = "3GPP TS 45.008 8.2"}}},
    {"Dedicated Channel/Duration", {"", computed, number}},
    {"Packet Data/Contexts/*/Context ID", {"", computed, number}},
    {"Packet Data/Contexts/*/APN", {"", computed, plainText(), {.clause = "3GPP TS 23.003 9"}}},
    {"Packet Data/Contexts/*/Address", {"", computed, plainText(), {.identity = Identity::Address}}},
    {"Packet Data/Coding Scheme", {"", computed, plainText(), {.clause = "3GPP TS 45.003"}}},
    {"SIM", {"", computed, plainText(), {.identity = Identity::Subscriber}}},
    {"SIM/ICCID", {"", computed, plainText(), {.identity = Identity::Subscriber, .clause = "ITU-T E.118"}}},
};

/// The rows of a list, and the leaves that identify one.
struct KnownRows {
    std::string_view path;
    std::span<const std::string_view> keys;
};
constexpr std::string_view cellKeys[] = {"ARFCN", "BSIC"};
constexpr std::string_view contextKeys[] = {"Context ID"};
constexpr KnownRows knownRows[] = {
    {"Neighbor Cells/*", cellKeys},
    {"Packet Data/Contexts/*", contextKeys},
};

Catalogue::Node& nodeAt(Catalogue& catalogue, std::string_view path) {
    Catalogue::Node* node = &catalogue.root();
    while (!path.empty()) {
        const std::string_view name = path.substr(0, path.find('/'));
        node = &node->child(name);
        path.remove_prefix(std::min(name.size() + 1, path.size()));
    }
    return *node;
}

} // namespace

void describeKnownFields(Catalogue& catalogue) {
    for (const KnownRows& known : knownRows)
        nodeAt(catalogue, known.path).setKeys(known.keys);
    for (const KnownField& known : knownFields) {
        CatalogueField& leaf = catalogue.add(nodeAt(catalogue, known.path), {}, {0, &known.field});
        leaf.isReadFromText = leaf.kind == ObservedKind::Number;
    }
}

} // namespace velmora
