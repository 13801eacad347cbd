// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/Road/RoadReceiver.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Recordings/TruthFile.h"

#include <algorithm>
#include <charconv>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <deque>
#include <fstream>
#include <limits>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

// Writes the beginning of a scenario's drive as a recording, stamped with the drive's own time and without
// waiting for it: so many messages, or with "h" or "s" so many hours or seconds. The same arguments make the
// same file; a FILE of - is standard output, so that a long drive need not be stored. With --truth it also
// writes what the drive's phone did, as JSON lines; the recording is the same with and without it.
// With --positions it has a receiver's sentences of the drive's own road as well, a fix a second.
// With --incidents the drive is a short round of what the scenario's other drives never have.
// With --only CODE it has the drive's messages of this log code alone, and MESSAGES counts these.
// With --identities the numbers and addresses are random ones of the seed, which it lists, one a line.

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
    std::chrono::seconds time = std::chrono::hours(24 * 365 * 100);
};

std::optional<Length> lengthOf(std::string_view text) {
    const std::uint64_t unit_s = text.ends_with('h') ? 3600 : text.ends_with('s') ? 1 : 0;
    const std::optional<std::uint64_t> number = numberOf(text.substr(0, text.size() - (unit_s > 0 ? 1 : 0)));
    Length length;
    if (!number || (unit_s > 0 && *number > static_cast<std::uint64_t>(length.time.count()) / unit_s))
        return std::nullopt;
    if (unit_s > 0)
        length.time = std::chrono::seconds(*number * unit_s);
    else
        length.messages = *number;
    return length;
}

/// What of the drive is written.
struct Contents {
    bool hasPositions = false;
    std::optional<std::uint32_t> onlyCode;
};

/// A code as `info` lists it: 0xB17F.
std::optional<std::uint32_t> codeOf(std::string_view text) {
    std::uint32_t code = 0;
    if (!text.starts_with("0x"))
        return std::nullopt;
    const auto result = std::from_chars(text.data() + 2, text.data() + text.size(), code, 16);
    return result.ec == std::errc() && result.ptr == text.data() + text.size() ? std::optional(code)
                                                                               : std::nullopt;
}

/// Writes a drive's messages and, between them, the sentences of its receiver.
class PositionedDrive {
public:
    explicit PositionedDrive(PcapngWriter& writer) : _writer(writer) {}

    /// `place`: that of the scenario after the message.
    Result<Done> append(Time time, Data message, const RoadPlace& place) {
        for (const Fix& fix : _receiver.drivenTo(place)) {
            if (Result<Done> written = writeUntil(fix.time); !written)
                return written;
            if (Result<Done> written = _writer.appendFix(fix); !written)
                return written;
        }
        _waiting.emplace_back(time, std::move(message));
        return writeUntil(DriveScenario::startTime() + place.offset);
    }
    Result<Done> finish() { return writeUntil(Time::max()); }

private:
    Result<Done> writeUntil(Time end) {
        for (; !_waiting.empty() && _waiting.front().first < end; _waiting.pop_front()) {
            const auto& [time, message] = _waiting.front();
            if (Result<Done> written = _writer.append(time, message.bytes()); !written)
                return written;
        }
        return Done{};
    }

    PcapngWriter& _writer;
    RoadReceiver _receiver{DriveScenario::startTime()};
    std::deque<std::pair<Time, Data>> _waiting; ///< of the last step, up to whose end no place is known yet
};

/// The scenario's next message, or the next of the wanted code: none where a day's drive has none.
std::optional<ScenarioEvent> nextOf(Scenario& scenario, const Contents& contents) {
    constexpr int aDaysMessages = 2'000'000;
    for (int i = 0; i < aDaysMessages; ++i) {
        ScenarioEvent event = scenario.next();
        const auto message = LogMessage::parse(event.message.bytes());
        if (!contents.onlyCode || (message && message->logCode() == *contents.onlyCode))
            return event;
    }
    return std::nullopt;
}

/// Returns the offset of the last message.
Result<TruthTime> make(Scenario& scenario, const Length& length, const std::string& path,
                       const Contents& contents) {
    using Positions = PcapngWriter::Positions;
    Result<std::unique_ptr<PcapngWriter>> writer = PcapngWriter::create(
        path, scenario.technology(), contents.hasPositions ? Positions::With : Positions::Without);
    if (!writer)
        return Failure{writer.reason()};
    PositionedDrive positioned(**writer);
    TruthTime last{0};
    for (std::uint64_t i = 0; i < length.messages; ++i) {
        const std::optional<ScenarioEvent> event = nextOf(scenario, contents);
        if (!event)
            return Failure{"the drive has no message of this code"};
        if (event->offset >= length.time)
            break;
        const Time time = DriveScenario::startTime() + event->offset;
        const Result<Done> written = contents.hasPositions
                                         ? positioned.append(time, event->message, scenario.place())
                                         : (*writer)->append(time, event->message.bytes());
        if (!written)
            return Failure{written.reason()};
        last = event->offset;
    }
    if (const Result<Done> written = positioned.finish(); !written)
        return Failure{written.reason()};
    if (const Result<Done> closed = (*writer)->close(); !closed)
        return Failure{closed.reason()};
    return last;
}

/// The same, with the truth beside it.
Result<TruthTime> makeWithTruth(Scenario& scenario, const Length& length, const std::string& path,
                                const Contents& contents, const std::string& truthPath) {
    TruthFile truth;
    scenario.tellTruth(truth);
    Result<TruthTime> last = make(scenario, length, path, contents);
    if (!last)
        return last;
    scenario.finishTruth();
    if (const Result<Done> written = truth.write(truthPath, DriveScenario::startTime(), *last); !written)
        return Failure{written.reason()};
    return last;
}

/// The value of an option, which is removed with it.
std::optional<std::string> takeOption(std::vector<std::string>& arguments, const char* name) {
    const auto option = std::find(arguments.begin(), arguments.end(), name);
    if (arguments.end() - option < 2)
        return std::nullopt;
    std::string value = option[1];
    arguments.erase(option, option + 2);
    return value;
}

/// Gives the drive random identities and lists them, one a line.
bool plantIdentities(Scenario& scenario, std::uint64_t seed, const std::string& path) {
    const DriveIdentities identities = DriveIdentities::random(seed);
    scenario.setIdentities(identities);
    std::ofstream file(path, std::ios::trunc);
    for (const std::string& text : identities.texts())
        file << text << '\n';
    file.close();
    return !file.fail();
}

int run(std::vector<std::string> arguments) {
    const std::optional<std::string> truth = takeOption(arguments, "--truth");
    const std::optional<std::string> only = takeOption(arguments, "--only");
    const Contents contents{.hasPositions = std::erase(arguments, "--positions") > 0,
                            .onlyCode = only ? codeOf(*only) : std::nullopt};
    const bool hasIncidents = std::erase(arguments, "--incidents") > 0;
    const std::optional<std::string> identities = takeOption(arguments, "--identities");
    const bool isComplete = arguments.size() == 4;
    const ScenarioKind* kind = isComplete ? scenarioKindNamed(arguments[0]) : nullptr;
    const std::optional<std::uint64_t> seed = isComplete ? numberOf(arguments[1]) : std::nullopt;
    const std::optional<Length> length = isComplete ? lengthOf(arguments[2]) : std::nullopt;
    if (!kind || !seed || !length || contents.onlyCode.has_value() != only.has_value()) {
        std::fprintf(
            stderr,
            "usage: make-drive SCENARIO SEED MESSAGES|HOURSh|SECONDSs FILE [--truth FILE] [--positions] "
            "[--incidents] [--only CODE] [--identities FILE]\n"
            "scenarios: %s\n",
            scenarioNames().c_str());
        return 2;
    }
    const std::unique_ptr<Scenario> scenario = kind->make(*seed);
    if (hasIncidents)
        scenario->addIncidents();
    if (identities && !plantIdentities(*scenario, *seed, *identities)) {
        std::fprintf(stderr, "make-drive: cannot write %s\n", identities->c_str());
        return 1;
    }
    const Result<TruthTime> made = truth ? makeWithTruth(*scenario, *length, arguments[3], contents, *truth)
                                         : make(*scenario, *length, arguments[3], contents);
    if (!made) {
        std::fprintf(stderr, "make-drive: %s\n", made.reason().c_str());
        return 1;
    }
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run({arguments + 1, arguments + count});
}
