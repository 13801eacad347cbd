// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/MessageEffects.h"
#include "LogGenerator/Modem/ModemLogGenerator.h"
#include "LogGenerator/Observations/Observer.h"
#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "Platform/DateText.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

/// The most entries that a history keeps when a new one is about to be added.
constexpr std::int32_t keptBeforeNew = 4;

} // namespace

LogGenerator::LogGenerator(const Clock& clock) : _clock(clock) {
    logFormat(LogPriority::Warning, "Creating Log object: %p", static_cast<void*>(this));
}

void LogGenerator::updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects) {
    updateState(state, data);
    effects.display(display(state));
}

LogGenerator::~LogGenerator() = default;

Catalogue& LogGenerator::catalogue() {
    if (!_catalogue) {
        _catalogue = std::make_unique<Catalogue>(shortTechnologyName(technology()));
        describe(*_catalogue);
    }
    return *_catalogue;
}

void LogGenerator::setObservationSink(ObservationSink* sink) {
    _sink = sink;
    if (sink) {
        static_cast<void>(catalogue());
        if (!_observer)
            _observer = std::make_unique<Observer>();
        _observer->setWanted(WantedLeaves(*sink));
        _observer->assumeAllShown();
    }
    observe(observer());
}

void LogGenerator::passObservations(std::optional<std::uint32_t> code,
                                    std::optional<std::uint64_t> timestamp) {
    _sink->observed(_observer->message(_clock.now(), code, timestamp));
}

Value LogGenerator::display(Dictionary& state) {
    return state["Display"];
}

std::unique_ptr<LogGenerator> LogGenerator::generatorFromTechnology(std::string_view technology,
                                                                    const Clock& clock) {
    if (technology == kVoxLogChannelTechnology_IFX)
        return GSMLogGenerator::generator(clock);
    if (technology == kVoxLogChannelTechnology_Ostrel_GSM)
        return Ostrel_GSMLogGenerator::generator(clock);
    if (technology == kVoxLogChannelTechnology_Ostrel_CDMA)
        return C2KLogGenerator::generator(clock);
    if (technology == kVoxLogChannelTechnology_Ostrel_LTE)
        return LTELogGenerator::generator(clock);
    if (technology == kVoxLogChannelTechnology_Ostrel_UTRAN2)
        return UTRANLogGenerator::generator(clock);
    if (technology == kVoxLogChannelTechnology_Modem)
        return ModemLogGenerator::generator(clock);
    return nullptr;
}

void LogGenerator::updateHistoryInState(Dictionary& state, const Clock& clock) {
    ArrayRef history = state["History"].arrayRef();
    if (!history) {
        history = makeArray();
        state.set("History", history);
    } else if (const auto count = static_cast<std::int32_t>(history->size()); count > keptBeforeNew) {
        history->removeFirst(static_cast<std::size_t>(count - keptBeforeNew));
    }

    const DictionaryRef entry = makeDictionary();
    history->append(entry);
    for (const std::string_view key : {"DisplayState", "Display", "ExtraInfo"}) {
        const Value& value = state[key];
        if (value.isNone())
            return; // the entry ends before the first missing value
        entry->set(key, value.copy());
    }
    const std::string date = dateDescription(clock.now());
    entry->set("Date", date);
    entry->set("Description", "Snapshot (" + date + ")");
}

} // namespace velmora
