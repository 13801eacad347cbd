#include "Telephony/ScenarioRegistry.h"

#include "Telephony/GSMScenario.h"

namespace velmora {
namespace {

template <class Kind>
std::unique_ptr<Scenario> make(std::uint64_t seed) {
    return std::make_unique<Kind>(seed);
}

constexpr ScenarioKind kinds[] = {
    {"gsm", "a drive through GSM and UMTS (Ostrel GSM)", make<GSMScenario>},
};

} // namespace

std::span<const ScenarioKind> scenarioKinds() {
    return kinds;
}

const ScenarioKind* scenarioKindNamed(std::string_view name) {
    for (const ScenarioKind& kind : kinds)
        if (kind.name == name)
            return &kind;
    return nullptr;
}

std::string scenarioNames() {
    std::string names;
    for (const ScenarioKind& kind : kinds)
        names.append(names.empty() ? "" : ", ").append(kind.name);
    return names;
}

} // namespace velmora
