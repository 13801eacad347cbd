// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recordings/ExampleRecording.h"

#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/DriveScenario.h"

#include <chrono>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// Apart from the records' own time stamps, so that no reader takes the one for the other unnoticed.
constexpr auto arrivalDelay = 25ms;

// The excerpts show each procedure of the round, every section that the drive ever fills, and each kind of
// unusual message.

constexpr ExampleRecording::Excerpt gsm[] = {
    {0, 13},        // power-on, network search, location update
    {20, 20.3},     // a wrong type byte
    {25.4, 26.4},   // idle; a record below its least length
    {38.2, 38.5},   // a prefixed record
    {48.7, 49.1},   // a count that is too high
    {60.3, 63.5},   // an unknown code; a packet session begins
    {130.9, 133.6}, // five bytes; a call begins
    {157.3, 159.5}, // its handover to UMTS
    {208, 213},     // a packet session on UMTS
    {273, 279},     // its end by degrees
    {353.9, 356.7}, // detach and power-off
};

constexpr ExampleRecording::Excerpt c2k[] = {
    {0, 36},    // power-on, session negotiation, idle
    {50, 58},   // an EV-DO connection begins
    {99, 105},  // and ends
    {114, 124}, // a call begins
    {159, 170}, // and ends, EV-DO comes back
    {228, 237}, // power-off
};

constexpr ExampleRecording::Excerpt lte[] = {
    {0, 62},    // power-on, registration, idle, a packet session
    {71, 76},   // another carrier each
    {86, 91},   //
    {101, 106}, //
    {116, 121}, //
    {130, 150}, // power-off
};

constexpr ExampleRecording::Excerpt utran[] = {
    {0, 15},      // power-on, registration
    {20, 20.4},   // a wrong type byte
    {32, 32.4},   // a record below its least length
    {39, 44},     // a packet session begins
    {51.7, 52},   // a count that is too high
    {61.8, 62.1}, // an unknown code
    {80.1, 81.5}, // it ends, by degrees
    {85, 86},     //
    {90, 90.6},   //
    {95, 95.6},   //
    {108, 111},   // a call begins
    {133, 134},   // and ends
    {205, 208},   // power-off
};

constexpr ExampleRecording::Excerpt ifx[] = {
    {0, 20},    // search, limited service, registration, idle
    {38, 60},   // a call begins
    {68, 76},   // and ends
    {80, 92},   // a packet session begins
    {104, 128}, // and ends; one of two contexts begins
    {140, 152}, // and ends; search again
};

constexpr ExampleRecording::Excerpt modem[] = {
    {0, 18},    // no manager, no permission, no modem; a locked SIM; GSM
    {29, 31},   // a property list that is cut off
    {38, 41},   // a packet session
    {59.5, 61}, // values that cannot be
    {63, 66},   // UMTS, first without its measurement
    {68, 69},   //
    {89, 90},   // LTE
    {94, 96},   // a second context
    {114, 119}, // another carrier
    {129, 131}, // 5G non-standalone
    {155, 159}, // 5G standalone, a new connection
    {180, 182}, // another carrier
    {196, 199}, // no coverage
    {202, 203}, // its contexts are gone
    {208, 210}, // limited service
    {218, 225}, // the other SIM
    {228, 230}, // a connection after one that failed
    {238, 240}, // unplugged
    {244, 246}, // the return, without a SIM
    {249, 254}, // with it, without permission
    {257, 258}, //
    {261, 262}, // no answer
    {393, 398}, // 5G non-standalone in the next round
};

constexpr ExampleRecording recordings[] = {
    {"gsm", 1, gsm},     {"c2k", 1, c2k}, {"lte", 1, lte},
    {"utran", 1, utran}, {"ifx", 1, ifx}, {"modem", 1, modem},
};

} // namespace

std::span<const ExampleRecording> exampleRecordings() {
    return recordings;
}

std::unique_ptr<Scenario> ExampleRecording::makeScenario() const {
    return scenarioKindNamed(scenario)->make(seed);
}

void ExampleRecording::eachMessage(const std::function<void(Time, const Data&)>& take) const {
    const auto drive = makeScenario();
    ScenarioEvent event = drive->next();
    for (const Excerpt& excerpt : excerpts) {
        using Seconds = std::chrono::duration<double>;
        for (; Seconds(event.offset) < Seconds(excerpt.to_s); event = drive->next())
            if (Seconds(event.offset) >= Seconds(excerpt.from_s))
                take(DriveScenario::startTime() + event.offset + arrivalDelay, event.message);
    }
}

Result<Done> ExampleRecording::write(const std::string& path) const {
    const auto writer = PcapngWriter::create(path, makeScenario()->technology());
    if (!writer)
        return Failure{writer.reason()};
    Result<Done> written = Done{};
    eachMessage([&](Time time, const Data& message) {
        if (written)
            written = (*writer)->append(time, message.bytes());
    });
    return written ? (*writer)->close() : written;
}

} // namespace velmora
