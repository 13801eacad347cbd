// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <charconv>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <optional>
#include <string>
#include <string_view>

// Writes the beginning of a scenario's drive as a recording, stamped with the drive's own time and without
// waiting for it: so many messages, or with "h" so many hours. The same arguments make the same file; a FILE
// of - is standard output, so that a long drive need not be stored.

namespace velmora {
namespace {

/// All of `text` as a number.
std::optional<std::uint64_t> numberOf(std::string_view text) {
    std::uint64_t number = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    return result.ec == std::errc() && result.ptr == text.data() + text.size() ? std::optional(number)
                                                                               : std::nullopt;
}

/// Where a drive ends, whichever comes first.
struct Length {
    std::uint64_t messages = std::numeric_limits<std::uint64_t>::max();
    std::chrono::hours time = std::chrono::hours(24 * 365 * 100);
};

std::optional<Length> lengthOf(std::string_view text) {
    const bool isHours = text.ends_with('h');
    const std::optional<std::uint64_t> number = numberOf(text.substr(0, text.size() - (isHours ? 1 : 0)));
    Length length;
    if (!number || (isHours && *number > static_cast<std::uint64_t>(length.time.count())))
        return std::nullopt;
    if (isHours)
        length.time = std::chrono::hours(*number);
    else
        length.messages = *number;
    return length;
}

Result<Done> make(Scenario& scenario, const Length& length, const std::string& path) {
    Result<std::unique_ptr<PcapngWriter>> writer = PcapngWriter::create(path, scenario.technology());
    if (!writer)
        return Failure{writer.reason()};
    for (std::uint64_t i = 0; i < length.messages; ++i) {
        const ScenarioEvent event = scenario.next();
        if (event.offset >= length.time)
            break;
        const Time time = DriveScenario::startTime() + event.offset;
        if (Result<Done> written = (*writer)->append(time, event.message.bytes()); !written)
            return written;
    }
    return (*writer)->close();
}

int run(int count, char** arguments) {
    const ScenarioKind* kind = count == 5 ? scenarioKindNamed(arguments[1]) : nullptr;
    const std::optional<std::uint64_t> seed = count == 5 ? numberOf(arguments[2]) : std::nullopt;
    const std::optional<Length> length = count == 5 ? lengthOf(arguments[3]) : std::nullopt;
    if (!kind || !seed || !length) {
        std::fprintf(stderr, "usage: make-drive SCENARIO SEED MESSAGES|HOURSh FILE\nscenarios: %s\n",
                     scenarioNames().c_str());
        return 2;
    }
    if (const Result<Done> made = make(*kind->make(*seed), *length, arguments[4]); !made) {
        std::fprintf(stderr, "make-drive: %s\n", made.reason().c_str());
        return 1;
    }
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}
