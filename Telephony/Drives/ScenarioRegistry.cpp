// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/ScenarioRegistry.h"

#include "Telephony/Drives/C2K/C2KScenario.h"
#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Telephony/Drives/IFX/IFXScenario.h"
#include "Telephony/Drives/LTE/LTEScenario.h"
#include "Telephony/Drives/Modem/ModemScenario.h"
#include "Telephony/Drives/UTRAN/UTRANScenario.h"

namespace velmora {
namespace {

template <class Kind>
std::unique_ptr<Scenario> make(std::uint64_t seed) {
    return std::make_unique<Kind>(seed);
}

constexpr ScenarioKind kinds[] = {
    {"gsm", "a drive through GSM and UMTS (Ostrel GSM)", make<GSMScenario>},
    {"c2k", "a drive through CDMA2000 1x and EV-DO (Ostrel CDMA)", make<C2KScenario>},
    {"lte", "a drive through LTE (Ostrel LTE)", make<LTEScenario>},
    {"utran", "a drive through TD-SCDMA (Ostrel UTRAN2)", make<UTRANScenario>},
    {"ifx", "a drive through GSM, as property lists (IFX)", make<IFXScenario>},
    {"modem", "a live modem through GSM, UMTS, LTE and NR (Modem)", make<ModemScenario>},
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
