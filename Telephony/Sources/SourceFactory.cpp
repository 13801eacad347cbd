// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/SourceFactory.h"

#include "Platform/TelephonyService.h"
#include "Recording/OpenMessages.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Telephony/ModemManager/ModemManagerSource.h"
#include "Telephony/Sources/ReplaySource.h"
#include "Telephony/Sources/ScenarioSource.h"

#include <cstdint>
#include <utility>

namespace velmora {
namespace {

using Made = Result<std::unique_ptr<LogSource>>;
using Around = SourceSurroundings;

Made make(const ScenarioChoice& choice, MainQueue& queue, const Clock& clock, const Around&) {
    const ScenarioKind* kind = scenarioKindNamed(choice.name);
    if (!kind)
        return Failure{"scenario is \"" + choice.name + "\", wanted one of: " + scenarioNames()};
    auto makeScenario = [make = kind->make, seed = choice.seed] { return make(seed); };
    return std::unique_ptr<LogSource>(
        std::make_unique<ScenarioSource>(queue, clock, std::move(makeScenario), choice.speed));
}

Made make(const ReplayChoice& choice, MainQueue& queue, const Clock& clock, const Around& around) {
    auto open = [file = choice.file, isStopping = around.isStopping] {
        // What is damaged is read in one call, however long it is.
        FileSource::Hooks hooks;
        hooks.mayRead = [isStopping](std::uint64_t) { return !isStopping || !isStopping(); };
        return openMessages(file, std::move(hooks));
    };
    auto source = ReplaySource::create(queue, clock, choice.file, std::move(open),
                                       {choice.speed, choice.loop, choice.technology});
    if (!source)
        return Failure{source.reason()};
    return std::unique_ptr<LogSource>(*std::move(source));
}

Made make(const ModemManagerChoice& choice, MainQueue& queue, const Clock& clock, const Around& around) {
    ModemChoice modem;
    for (const Result<Done>& taken : {choice.modem.empty() ? Done{} : modem.setModem(choice.modem),
                                      choice.sim.empty() ? Done{} : modem.setSIM(choice.sim)})
        if (!taken)
            return Failure{taken.reason()};
    return std::unique_ptr<LogSource>(std::make_unique<ModemManagerSource>(
        queue, clock, ModemManagerSource::Options{{std::move(modem), {}}, around.directory}));
}

} // namespace

Result<std::unique_ptr<LogSource>> makeSource(const SourceChoice& choice, MainQueue& queue,
                                              const Clock& clock, const SourceSurroundings& around) {
    return std::visit([&](const auto& chosen) { return make(chosen, queue, clock, around); }, choice);
}

std::string sourceHelp(std::string_view program) {
    const std::string call = "  " + std::string(program) + " --source ";
    std::string help = "Sources:\n"
                       "  scenario:NAME[,seed=N][,speed=X]  a synthetic drive, the same for the same seed;"
                       " speed 1 is real time\n";
    for (const ScenarioKind& kind : scenarioKinds())
        help += "    " + std::string(kind.name) + ": " + std::string(kind.description) + "\n";
    help += "  replay:FILE[,speed=X][,loop][,technology=NAME]\n"
            "    a recording, snapshot or DLF log in recorded time; speed max is as fast as clients take it;"
            " technology, for a file that does not name its own, is one of ";
    help += technologyNames() + "\n";
    help += "  modemmanager[,modem=MODEM][,sim=SIM]\n"
            "    the modem that ModemManager manages, live: MODEM is its index, its IMEI or the path of its "
            "device,"
            " SIM the ICCID of its SIM; without them the first that has a SIM\n\n";
    help += "Examples:\n";
    help += call + "scenario:gsm,seed=7,speed=2\n";
    help += call + "replay:drive.pcapng,speed=max,loop\n";
    help += call + "modemmanager";
    return help;
}

} // namespace velmora
