#include "Recording/RecordingWriter.h"
#include "Telephony/DriveScenario.h"
#include "Telephony/ScenarioRegistry.h"

#include <charconv>
#include <cstdint>
#include <cstdio>
#include <optional>
#include <string>
#include <string_view>

// Writes a scenario's first messages as a recording, stamped with the scenario's own time and without waiting
// for it. The same arguments give the same file.

namespace velmora {
namespace {

/// The whole of `text` as a number.
std::optional<std::uint64_t> numberOf(std::string_view text) {
    std::uint64_t number = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    return result.ec == std::errc() && result.ptr == text.data() + text.size() ? std::optional(number)
                                                                               : std::nullopt;
}

Result<Done> make(Scenario& scenario, std::uint64_t count, const std::string& path) {
    Result<std::unique_ptr<RecordingWriter>> writer = RecordingWriter::create(path, scenario.technology());
    if (!writer)
        return Failure{writer.reason()};
    for (std::uint64_t i = 0; i < count; ++i) {
        const ScenarioEvent event = scenario.next();
        const Time time = DriveScenario::beginning() + event.offset;
        if (const Result<Done> written = (*writer)->append(time, event.message.bytes()); !written)
            return written;
    }
    return (*writer)->close();
}

int run(int count, char** arguments) {
    const std::optional<std::uint64_t> seed = count == 5 ? numberOf(arguments[2]) : std::nullopt;
    const std::optional<std::uint64_t> messages = count == 5 ? numberOf(arguments[3]) : std::nullopt;
    const ScenarioKind* kind = count == 5 ? scenarioKindNamed(arguments[1]) : nullptr;
    if (!kind || !seed || !messages) {
        std::fprintf(stderr, "usage: make-recording SCENARIO SEED MESSAGES FILE\nscenarios: %s\n",
                     scenarioNames().c_str());
        return 2;
    }
    if (const Result<Done> made = make(*kind->make(*seed), *messages, arguments[4]); !made) {
        std::fprintf(stderr, "make-recording: %s\n", made.reason().c_str());
        return 1;
    }
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}
