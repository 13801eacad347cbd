// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/PositionOptions.h"

#include "Tools/CommandOptions.h"

namespace velmora {

CLI::Option* addMaximumGap(CLI::App& command, std::chrono::nanoseconds& gap) {
    return command
        .add_option_function<double>(
            "--max-gap",
            [&gap](double seconds) {
                gap = std::chrono::duration_cast<std::chrono::nanoseconds>(
                    std::chrono::duration<double>(seconds));
            },
            "Positions lie between two fixes that are at most this far apart; the default is 2")
        ->check(positiveSeconds())
        ->type_name("SECONDS");
}

} // namespace velmora
