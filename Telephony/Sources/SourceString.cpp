// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/SourceString.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Telephony/ModemManager/ModemChoice.h"

#include <charconv>
#include <cmath>
#include <optional>

namespace velmora {
namespace {

constexpr std::string_view seedKey = "seed=";
constexpr std::string_view speedKey = "speed=";
constexpr std::string_view loopKey = "loop";
constexpr std::string_view modemKey = "modem=";
constexpr std::string_view simKey = "sim=";
constexpr std::string_view technologyKey = "technology=";

std::string inQuotes(std::string_view text) {
    return '"' + std::string(text) + '"';
}

/// All of the text as a number.
template <class Number>
std::optional<Number> numberOf(std::string_view text) {
    Number number{};
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return number;
}

Result<Done> parseSpeed(std::string_view text, bool unpacedAllowed, std::optional<double>& speed) {
    if (speed)
        return Failure{"speed is given twice, wanted once"};
    speed = unpacedAllowed && text == "max" ? 0.0 : numberOf<double>(text);
    const bool good = speed && std::isfinite(*speed) && (unpacedAllowed ? *speed >= 0 : *speed > 0);
    if (!good)
        return Failure{"speed is " + inQuotes(text) + ", wanted a number " +
                       (unpacedAllowed ? "from 0 up, or max" : "above 0")};
    return Done{};
}

Result<SourceChoice> parseScenario(std::string_view text) {
    ScenarioChoice choice;
    std::size_t comma = text.find(',');
    choice.name = text.substr(0, comma);
    if (!scenarioKindNamed(choice.name))
        return Failure{"scenario is " + inQuotes(choice.name) + ", wanted one of: " + scenarioNames()};
    std::optional<std::uint64_t> seed;
    std::optional<double> speed;
    while (comma != std::string_view::npos) {
        text.remove_prefix(comma + 1);
        comma = text.find(',');
        const std::string_view option = text.substr(0, comma);
        if (option.starts_with(seedKey)) {
            if (seed)
                return Failure{"seed is given twice, wanted once"};
            const std::string_view number = option.substr(seedKey.size());
            seed = numberOf<std::uint64_t>(number);
            if (!seed)
                return Failure{"seed is " + inQuotes(number) +
                               ", wanted a whole number from 0 to 18446744073709551615"};
        } else if (option.starts_with(speedKey)) {
            const auto taken = parseSpeed(option.substr(speedKey.size()), false, speed);
            if (!taken)
                return Failure{taken.reason()};
        } else {
            return Failure{"option is " + inQuotes(option) + ", wanted seed=N or speed=X"};
        }
    }
    choice.seed = seed.value_or(choice.seed);
    choice.speed = speed.value_or(choice.speed);
    return SourceChoice(choice);
}

Result<SourceChoice> parseReplay(std::string_view text) {
    ReplayChoice choice;
    std::optional<double> speed;
    for (std::size_t comma = text.rfind(','); comma != std::string_view::npos; comma = text.rfind(',')) {
        const std::string_view option = text.substr(comma + 1);
        if (option == loopKey) {
            if (choice.loop)
                return Failure{"loop is given twice, wanted once"};
            choice.loop = true;
        } else if (option.starts_with(speedKey)) {
            const auto taken = parseSpeed(option.substr(speedKey.size()), true, speed);
            if (!taken)
                return Failure{taken.reason()};
        } else if (option.starts_with(technologyKey)) {
            if (!choice.technology.empty())
                return Failure{"technology is given twice, wanted once"};
            const std::string_view name = option.substr(technologyKey.size());
            if (!isTechnology(name))
                return Failure{"technology is " + inQuotes(name) + ", wanted one of: " + technologyNames()};
            choice.technology = shortTechnologyName(name);
        } else {
            break;
        }
        text = text.substr(0, comma);
    }
    if (text.empty() || text == "-")
        return Failure{"file is " + inQuotes(text) +
                       ", wanted the name of a file, which is read anew for each client"};
    choice.file = text;
    choice.speed = speed.value_or(choice.speed);
    return SourceChoice(choice);
}

/// Takes the value of an option that is given once and that `check` accepts.
Result<Done> parseOnce(std::string_view name, std::string_view value, const Result<Done>& check,
                       std::string& taken) {
    if (!taken.empty())
        return Failure{std::string(name) + " is given twice, wanted once"};
    if (!check)
        return Failure{std::string(name) + " is " + inQuotes(value) + ", " + check.reason()};
    taken = value;
    return Done{};
}

/// `text` is what follows the source's name: nothing, or a comma and options.
Result<SourceChoice> parseModemManager(std::string_view text) {
    ModemManagerChoice choice;
    while (!text.empty()) {
        text.remove_prefix(1);
        const std::string_view option = text.substr(0, text.find(','));
        text.remove_prefix(option.size());
        Result<Done> taken = Failure{"option is " + inQuotes(option) + ", wanted modem=MODEM or sim=SIM"};
        if (option.starts_with(modemKey)) {
            const std::string_view modem = option.substr(modemKey.size());
            taken = parseOnce("modem", modem, ModemChoice().setModem(modem), choice.modem);
        } else if (option.starts_with(simKey)) {
            const std::string_view sim = option.substr(simKey.size());
            taken = parseOnce("sim", sim, ModemChoice().setSIM(sim), choice.sim);
        }
        if (!taken)
            return Failure{taken.reason()};
    }
    return SourceChoice(choice);
}

} // namespace

Result<SourceChoice> parseSource(std::string_view text) {
    constexpr std::string_view scenario = "scenario:";
    constexpr std::string_view replay = "replay:";
    constexpr std::string_view modemManager = "modemmanager";
    if (text.starts_with(scenario))
        return parseScenario(text.substr(scenario.size()));
    if (text.starts_with(replay))
        return parseReplay(text.substr(replay.size()));
    if (text == modemManager || text.starts_with(std::string(modemManager) + ','))
        return parseModemManager(text.substr(modemManager.size()));
    return Failure{"source is " + inQuotes(text) + ", wanted " + std::string(sourceForms)};
}

std::string loggedSource(std::string_view text, const SourceChoice& choice) {
    const auto* const modem = std::get_if<ModemManagerChoice>(&choice);
    if (!modem)
        return std::string(text);
    ModemChoice chosen;
    static_cast<void>(chosen.setModem(modem->modem));
    std::string logged = "modemmanager";
    if (!modem->modem.empty())
        logged.append(",").append(modemKey).append(chosen.equipment.empty() ? modem->modem : "...");
    if (!modem->sim.empty())
        logged.append(",").append(simKey).append(modem->sim.starts_with('/') ? modem->sim : "...");
    return logged;
}

} // namespace velmora
