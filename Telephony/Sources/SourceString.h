// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>

namespace velmora {

/// "scenario:NAME[,seed=N][,speed=X]"
struct ScenarioChoice {
    std::string name; ///< one in the registry
    std::uint64_t seed = 1;
    double speed = 1; ///< above 0
};

/// "replay:FILE[,speed=X][,loop][,technology=NAME]"
struct ReplayChoice {
    std::string file;
    double speed = 1; ///< 0: as fast as the clients take it
    bool loop = false;
    std::string technology = {}; ///< overrides the file's; a short name, empty for the file's
};

/// "modemmanager[,modem=MODEM][,sim=SIM]"
struct ModemManagerChoice {
    std::string modem; ///< its index, equipment identity or path; empty for any
    std::string sim;   ///< the ICCID or path of its SIM; empty for any
};

using SourceChoice = std::variant<ScenarioChoice, ReplayChoice, ModemManagerChoice>;

/// The forms of a source, as help and messages show them.
inline constexpr std::string_view sourceForms =
    "scenario:NAME[,seed=N][,speed=X], replay:FILE[,speed=X][,loop][,technology=NAME] or "
    "modemmanager[,modem=MODEM][,sim=SIM]";

/// Parses the command line's source. Options may be in any order, each once. A file's name may hold commas:
/// what follows its last one that is no option ("loop", "speed=...", "technology=...") belongs to the name.
/// The reason names the found and the expected value.
Result<SourceChoice> parseSource(std::string_view text);

/// A source that has been parsed, as log lines name it: without the identity of the equipment or SIM that
/// chooses a modem.
[[nodiscard]] std::string loggedSource(std::string_view text, const SourceChoice& choice);

} // namespace velmora
