#pragma once

#include "Platform/Result.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>

namespace velmora {

/// "scenario:NAME[,seed=N][,speed=X]"
struct ScenarioChoice {
    std::string name; ///< one that the registry knows
    std::uint64_t seed = 1;
    double speed = 1; ///< above 0
};

/// "replay:FILE[,speed=X][,loop]"
struct ReplayChoice {
    std::string file;
    double speed = 1; ///< 0: as fast as the clients take it
    bool loop = false;
};

using SourceChoice = std::variant<ScenarioChoice, ReplayChoice>;

/// Reads what the command line says of the source. Options may come in any order, each once. A file's name
/// may hold commas: what follows its last one that is no option ("loop", "speed=...") belongs to the name.
/// The reason gives what was found and what was wanted.
Result<SourceChoice> parseSource(std::string_view text);

} // namespace velmora
