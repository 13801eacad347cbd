// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/EventPrograms.h"

#include "Platform/PrintableText.h"
#include "Tools/Events/Programs/EventEnvironment.h"
#include "Tools/Report.h"

#include <algorithm>
#include <utility>

namespace velmora {

void EventPrograms::run(const Event& event, EventState state) {
    Kind& kind = _kinds[event.kind];
    while (kind.program) {
        check(event.kind, kind);
        if (!kind.program || !_setup.waits || isInterrupted())
            break;
        kind.program->wait(ProgramRun::Clock::now());
        check(); // of other kinds, whose time may be over as well
    }
    if (kind.program)
        ++kind.skipped;
    else
        start(event.kind, kind, event, state);
}

void EventPrograms::start(const std::string& name, Kind& kind, const Event& event, EventState state) {
    Result<std::unique_ptr<ProgramRun>> program =
        ProgramRun::start(_setup.arguments, eventEnvironment(event, state, _names), _setup.limit);
    if (program) {
        kind.program = *std::move(program);
        return;
    }
    _hasFailed = true;
    if (!std::exchange(kind.hasReported, true))
        report("--exec: " + printable(name) + ": " + printable(program.reason()));
}

void EventPrograms::check() {
    for (auto& [name, kind] : _kinds)
        check(name, kind);
}

void EventPrograms::check(const std::string& name, Kind& kind) {
    if (!kind.program || !kind.program->check(ProgramRun::Clock::now()))
        return;
    const std::string title = "--exec: " + printable(name) + ": ";
    const std::string problem =
        kind.program->hasTimedOut() ? "was ended after its time limit" : kind.program->problem();
    if (!problem.empty() && !std::exchange(kind.hasReported, true))
        report(title + printable(_setup.arguments.front()) + " " + problem +
               "; the next time is not reported");
    if (const std::uint64_t skipped = std::exchange(kind.skipped, 0); skipped > 0)
        report(title + std::to_string(skipped) + (skipped == 1 ? " event" : " events") +
               " came while the program ran");
    kind.program.reset();
}

bool EventPrograms::isRunning() const {
    return std::any_of(_kinds.begin(), _kinds.end(),
                       [](const auto& each) { return each.second.program != nullptr; });
}

void EventPrograms::finish() {
    for (auto& [name, kind] : _kinds)
        while (kind.program && !isInterrupted()) {
            check();
            if (kind.program)
                kind.program->wait(ProgramRun::Clock::now());
        }
    if (isInterrupted())
        stop();
}

void EventPrograms::stop() {
    const auto now = ProgramRun::Clock::now();
    for (auto& [name, kind] : _kinds)
        if (kind.program)
            kind.program->terminate(now);
    for (auto& [name, kind] : _kinds)
        while (kind.program) {
            check();
            if (kind.program)
                kind.program->wait(ProgramRun::Clock::now());
        }
}

} // namespace velmora
