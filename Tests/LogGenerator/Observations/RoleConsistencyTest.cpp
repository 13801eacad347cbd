// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observation.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>

// One unit, one sign and one kind a role, whatever the technology.

namespace velmora {
namespace {

Unit unitOfRole(Role role) {
    const std::span<const RoleName> names = roleNames();
    return std::find_if(names.begin(), names.end(), [role](const RoleName& row) { return row.role == role; })
        ->unit;
}

ObservedKind kindOfRole(Role role) {
    switch (role) {
    case Role::ServingCountryCode:
    case Role::ServingNetworkCode: return ObservedKind::Text; // leading zeros count
    case Role::RegistrationState:
    case Role::RadioState: return ObservedKind::Enumeration;
    default: return ObservedKind::Number;
    }
}

/// Whether a value of the role is a text where all values are: a state, or a BSIC as "7-3".
bool mayBeText(Role role) {
    return role == Role::RegistrationState || role == Role::RadioState || role == Role::ServingPhysicalCell ||
           role == Role::NeighbourPhysicalCell;
}

class RoleConsistencyTest : public testing::TestWithParam<DecodedTechnology> {
protected:
    TechnologyUnderTest tested{GetParam()};
    Catalogue& catalogue = tested.decoder().catalogue();
};

TEST_P(RoleConsistencyTest, ItsLeavesHaveItsUnitAndKind) {
    std::set<Role> roles;
    for (const CatalogueField& leaf : catalogue.fields()) {
        if (leaf.role == Role::None)
            continue;
        roles.insert(leaf.role);
        EXPECT_EQ(nameOf(leaf.unit), nameOf(unitOfRole(leaf.role))) << leaf.path;
        if (!(catalogue.readsNumbersFromTexts() && leaf.kind == ObservedKind::Text && mayBeText(leaf.role))) {
            EXPECT_EQ(nameOf(leaf.kind), nameOf(kindOfRole(leaf.role))) << leaf.path;
        }
    }
    // What every radio technology has.
    for (const Role role : {Role::ServingCell, Role::ServingChannel, Role::ServingPhysicalCell})
        EXPECT_TRUE(roles.contains(role)) << nameOf(role);
}

TEST_P(RoleConsistencyTest, TheSourcesOfALeafAgree) {
    for (const CatalogueField& leaf : catalogue.fields())
        for (const CatalogueSource& source : leaf.sources) {
            SCOPED_TRACE(leaf.path);
            const Field& field = *source.field;
            if (kindOf(field) == ObservedKind::Absent)
                continue;
            EXPECT_EQ(nameOf(kindOf(field)), nameOf(leaf.kind)) << std::hex << source.code;
            EXPECT_EQ(nameOf(unitOf(field)), nameOf(leaf.unit)) << std::hex << source.code;
            // Another place of the same value has no role of its own.
            if (leaf.sameAs.empty()) {
                EXPECT_EQ(nameOf(field.means.role), nameOf(leaf.role)) << std::hex << source.code;
            }
            EXPECT_EQ(nameOf(field.means.identity), nameOf(leaf.identity)) << std::hex << source.code;
        }
}

TEST_P(RoleConsistencyTest, EverySuffixHasAUnit) {
    for (const CatalogueField& leaf : catalogue.fields())
        for (const CatalogueSource& source : leaf.sources) {
            const TextFormat& format = source.field->format;
            if (format.kind == TextFormat::Kind::Integer || format.kind == TextFormat::Kind::Real) {
                EXPECT_TRUE(unitOfSuffix(format.format.suffix))
                    << leaf.path << " \"" << format.format.suffix << '"';
            }
        }
}

/// Expects levels and qualities as physics has them: far below a milliwatt, and below what they are compared
/// to.
class SignSink final : public ObservationSink {
public:
    void observed(const ObservedMessage& message) override {
        for (const Observation& each : message.observations) {
            const Role role = each.leaf->role;
            if (each.kind != ObservedKind::Number ||
                (unitOfRoleOrNone(role) != Unit::DBm && unitOfRoleOrNone(role) != Unit::DB))
                continue;
            ++values;
            const bool isLevel = unitOfRole(role) == Unit::DBm;
            if (isLevel ? each.number >= 0 || each.number < -150 : each.number > 0 || each.number < -40)
                ADD_FAILURE() << each.leaf->path << " is " << each.number;
        }
    }
    int values = 0;

private:
    static Unit unitOfRoleOrNone(Role role) { return role == Role::None ? Unit::None : unitOfRole(role); }
};

TEST_P(RoleConsistencyTest, LevelsAreNegativeInEveryDrive) {
    for (const std::uint64_t seed : {1, 2, 3, 99}) {
        SignSink sink;
        tested.decoder().setObservationSink(&sink);
        const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam().scenario)->make(seed);
        for (int i = 0; i < 5000 && !HasFailure(); ++i)
            tested.decoder().updateState(tested.state, scenario->next().message);
        tested.decoder().setObservationSink(nullptr);
        // UTRAN's levels are plain numbers: no source tells their unit.
        EXPECT_EQ(sink.values > 1000, std::string_view(GetParam().scenario) != "utran");
    }
}

INSTANTIATE_TEST_SUITE_P(Technologies, RoleConsistencyTest, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
