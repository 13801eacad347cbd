// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/FileEvents.h"

#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Tools/Analysed/AnalysedFiles.h"
#include "Tools/Events/EventListing.h"
#include "Tools/Output.h"

#include <chrono>
#include <csignal>
#include <cstdint>
#include <memory>

namespace velmora {

namespace {

/// Signals while programs run, which would otherwise outlive this one without their time limit.
class ProgramSignals {
public:
    ProgramSignals()
        : _watcher(std::make_unique<SignalWatcher>([this](int number) { _received = number; })) {}

    [[nodiscard]] static bool hasSignal() { return SignalWatcher::hasSignal(); }
    /// Ends the process by the signal that has arrived, if one has.
    void raiseReceived() {
        if (hasSignal())
            static_cast<void>(_loop.runUntil([this] { return _received != 0; }, std::chrono::seconds(1)));
        _watcher.reset();
        if (_received != 0)
            static_cast<void>(::raise(_received));
    }

private:
    MainLoop _loop;
    int _received = 0;
    std::unique_ptr<SignalWatcher> _watcher;
};

} // namespace

int listFileEvents(const EventsOptions& options, const RuleSet& rules,
                   const std::optional<MaskOptions>& masking, DecoderLines& lines, Output& output) {
    std::unique_ptr<ProgramSignals> signals;
    if (!options.program.empty())
        signals = std::make_unique<ProgramSignals>();
    EventListing listing(options, rules, output, [] { return ProgramSignals::hasSignal(); });
    AnalysedInput input;
    input.files = options.files;
    input.technology = options.technology;
    input.masking = masking;
    // What is masked has no positions at that level, and the times of the messages differ from those of the
    // fixes.
    const bool hasPlaces = !masking || masking->level < MaskLevel::All;
    if (PlaceHistory* const places = hasPlaces ? listing.places() : nullptr)
        input.fixes = [places](const Fix& fix) { places->add(fix); };
    input.maximumGap = options.maximumGap;
    input.writesAsItGoes = true;
    input.beforeWaiting = [&listing] { listing.flush(); };
    input.cleanUp = [&listing] { listing.flush(); };
    input.isDone = [&listing] { return listing.isDone(); };
    if (EventPrograms* const programs = listing.programs()) {
        input.whileWaiting = [programs] {
            programs->check();
            return !ProgramSignals::hasSignal();
        };
        input.isDone = [programs, messages = std::uint32_t{0}]() mutable {
            // Seldom enough not to slow decoding down.
            if (++messages % 1024 == 0)
                programs->check();
            return ProgramSignals::hasSignal();
        };
    }
    const bool good = analyseFiles(input, listing.feed(), lines);
    listing.finish();
    output.flush();
    const int status = listing.status(good);
    if (signals)
        signals->raiseReceived();
    return status;
}

} // namespace velmora
