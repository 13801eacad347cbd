// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/ConnectionNotice.h"

#include "Model/VelmoraModel.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

using Kind = ConnectionProblem::Kind;

constexpr const char* syntheticDrive = "velmora-telephonyd --source scenario:gsm,seed=1";

/// What begins with a capital or a path stays as it is.
std::string sentence(std::string text) {
    if (!text.empty() && text.front() >= 'a' && text.front() <= 'z')
        text.front() = static_cast<char>(text.front() - 'a' + 'A');
    return text;
}

} // namespace

ConnectionNotice::Words ConnectionNotice::words(const ConnectionProblem& problem) const {
    switch (problem.kind) {
    case Kind::None:
    case Kind::Lost: return {};
    case Kind::PortInUse:
        return {"Velmora is running already", "end the other one, and this one connects within five seconds"};
    case Kind::NoService:
        if (!_startFailure.empty())
            return {"the telephony service could not be started: " + _startFailure,
                    std::string("its own log may say more; one with a synthetic drive is started by: ") +
                        syntheticDrive};
        return {problem.cause,
                std::string("the installed one is started by: velmora --start-service, one with a synthetic "
                            "drive by: ") +
                    syntheticDrive};
    default: return {problem.cause, std::string(wayOutOf(problem.kind))};
    }
}

std::string ConnectionNotice::line(const ConnectionProblem& problem) const {
    const Words said = words(problem);
    return said.cause.empty() ? std::string() : said.cause + "; " + said.wayOut;
}

std::string ConnectionNotice::sentences(const ConnectionProblem& problem) const {
    const Words said = words(problem);
    if (said.cause.empty())
        return {};
    // A command that ends the text has no full stop after it, which would be typed with it.
    const char* const stop = problem.kind == Kind::NoService ? "" : ".";
    return sentence(said.cause) + ". " + sentence(said.wayOut) + stop;
}

std::string ConnectionNotice::ofTechnologies(const VelmoraModel& model) {
    const std::string shown = model.displayTechnology();
    if (!model.isConnected() || shown.empty() || shown == model.technology())
        return {};
    return "Now receiving " + technologyTitle(model.technology()) + ". The panes show " +
           technologyTitle(shown) + ".";
}

} // namespace velmora
