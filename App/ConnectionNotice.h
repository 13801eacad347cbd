// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/ConnectionProblem.h"

#include <string>
#include <utility>

namespace velmora {

class VelmoraModel;

/// The words about the connection beyond its status: the cause of a problem and what its user can do, the
/// same on the screen and in the log.
class ConnectionNotice {
public:
    /// The service that the application was to start did not come up, for this reason; as long as none
    /// answers, that is the cause.
    void setStartFailure(std::string reason) { _startFailure = std::move(reason); }

    /// For the log: "no telephony service answers; the installed one is started by: ..."; empty where there
    /// is no problem, and where the next attempt to connect follows at once.
    [[nodiscard]] std::string line(const ConnectionProblem& problem) const;
    /// For the screen: "No telephony service answers. The installed one is started by: ..."
    [[nodiscard]] std::string sentences(const ConnectionProblem& problem) const;
    /// "Now receiving Ostrel LTE. The panes show Ostrel GSM."; empty where the panes show what is received.
    [[nodiscard]] static std::string ofTechnologies(const VelmoraModel& model);

private:
    struct Words {
        std::string cause;
        std::string wayOut;
    };
    [[nodiscard]] Words words(const ConnectionProblem& problem) const;

    std::string _startFailure;
};

} // namespace velmora
