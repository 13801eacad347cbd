// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Engine/RecordingChecks.h"

#include "Analysis/Events/EventKind.h"
#include "Analysis/Events/NewEvent.h"

#include <array>
#include <cstdio>

namespace velmora {

namespace {

double secondsOf(std::chrono::nanoseconds time) {
    return std::chrono::duration<double>(time).count();
}

std::string textOf(const char* format, double number) {
    std::array<char, 64> text{};
    std::snprintf(text.data(), text.size(), format, number);
    return text.data();
}

} // namespace

bool RecordingChecks::isInterruption(const MessageReport& report) const {
    if (!_last)
        return false;
    const auto passed = report.time - _last->time;
    return passed < -greatestDisorder || passed > longestSilence;
}

Event RecordingChecks::newEvent(std::string_view kind, Time time, MessageNumber message) const {
    const EventKindRow& row = *eventKindNamed(kind);
    Event event;
    event.time = time;
    event.lasts = row.lasts;
    event.kind = row.name;
    event.severity = row.severity;
    event.technology = _technology;
    event.evidence.push_back(message);
    return event;
}

void RecordingChecks::report(const MessageReport& report) {
    if (isInterruption(report)) {
        const auto passed = report.time - _last->time;
        // A clock that leaps ahead is another than the one by which messages arrive.
        const bool isLeap =
            passed > longestSilence && report.observed.arrival - _last->arrival <= longestSilence;
        if (passed < std::chrono::seconds(0) || isLeap)
            jumped(report);
        else
            paused(report);
    }
    // Times go forward but for the disorder, which must not add up.
    const bool isEarlier = _last && report.time < _last->time && !isInterruption(report);
    _last = Last{isEarlier ? _last->time : report.time, report.observed.arrival, report.message};
    if (report.observed.damage != Damage::None)
        malformed(report.time, report.message, nameOf(report.observed.damage), report.observed.code);
}

void RecordingChecks::jumped(const MessageReport& report) {
    Event event = newEvent("clock-jump", report.time, _last->message);
    const double seconds = secondsOf(report.time - _last->time);
    event.text = textOf(seconds < 0 ? "the clock went back by %.3f s" : "the clock leapt ahead by %.3f s",
                        seconds < 0 ? -seconds : seconds);
    addField(event, "value", seconds, Unit::Second);
    addEvidence(event, report.message);
    _sink.happened(event);
}

void RecordingChecks::paused(const MessageReport& report) {
    Event event = newEvent("gap", _last->time, _last->message);
    event.end = report.time;
    event.text = textOf("no message for %.3f s", secondsOf(report.time - _last->time));
    addDuration(event, _last->time, report.time);
    addEvidence(event, report.message);
    _sink.happened(event);
}

void RecordingChecks::malformed(Time time, MessageNumber message, std::string_view reason,
                                std::optional<std::uint32_t> code) {
    Event event = newEvent("malformed", time, message);
    event.text = reason;
    addField(event, "reason", std::string(reason));
    if (code) {
        std::array<char, 16> hexadecimal{};
        std::snprintf(hexadecimal.data(), hexadecimal.size(), "0x%04X", static_cast<unsigned>(*code));
        event.text += std::string(": ") + hexadecimal.data();
        addField(event, "code", std::string(hexadecimal.data()));
    }
    _sink.happened(event);
}

void RecordingChecks::damaged(MessageNumber message, std::string_view reason) {
    malformed(_last ? _last->time : Time(), message, reason, std::nullopt);
}

void RecordingChecks::noted(MessageNumber message, std::string_view text) {
    Event event = newEvent("note", _last ? _last->time : Time(), message);
    event.text = text;
    _sink.happened(event);
}

} // namespace velmora
