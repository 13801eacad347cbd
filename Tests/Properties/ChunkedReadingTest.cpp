// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Properties/Conversions.h"
#include "Tests/Recording/LogFile.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

// A file that arrives in pieces of any size is read as if it arrived at once, its damage too.

namespace velmora {
namespace {

/// Bytes that are changed, and how much of the end is missing.
struct Damage {
    std::vector<std::pair<std::uint16_t, std::uint8_t>> changes;
    std::uint16_t missing = 0;
};

rc::Gen<Damage> anyDamage() {
    return rc::gen::map(rc::gen::pair(rc::gen::arbitrary<decltype(Damage::changes)>(),
                                      rc::gen::inRange<std::uint16_t>(0, 200)),
                        [](const auto& parts) {
                            return Damage{parts.first, parts.second};
                        });
}

void showValue(const Damage& damage, std::ostream& out) {
    rc::show(damage.changes, out);
    out << " and " << damage.missing << " bytes missing";
}

Data damaged(const Data& file, const Damage& damage) {
    std::vector<std::uint8_t> bytes(file.bytes().begin(), file.bytes().end());
    for (const auto& [at, byte] : damage.changes)
        bytes[at % bytes.size()] = byte;
    bytes.erase(bytes.end() - std::min<std::ptrdiff_t>(std::ssize(bytes), damage.missing), bytes.end());
    return Data(std::move(bytes));
}

void expectChunkedIsWhole(const Data& file) {
    const std::size_t piece = *rc::gen::inRange<std::size_t>(1, 50).as("bytes a read");
    const ReadOut whole = readAnyForm(file);
    const ReadOut chunked = readAnyForm(file, piece);
    RC_ASSERT(chunked.messages == whole.messages);
    RC_ASSERT(chunked.losses == whole.losses);
    RC_ASSERT(chunked.failure == whole.failure);
    RC_ASSERT(chunked.technology == whole.technology);
}

const std::string gsm = "Ostrel_GSM";

RC_GTEST_PROP(ChunkedReading, OfARecordingIsThatOfTheWhole, ()) {
    expectChunkedIsWhole(damaged(recordingOf(*inTime(anyBytes()), gsm), *anyDamage()));
}

RC_GTEST_PROP(ChunkedReading, OfADLFLogIsThatOfTheWhole, ()) {
    const Data recording = recordingOf(*inTime(anyRecord()), gsm);
    expectChunkedIsWhole(damaged(converted(recording, FileForm::DLFLog, gsm), *anyDamage()));
}

TEST(ChunkedReading, OfASnapshotIsThatOfTheWhole) {
    const TechnologyUnderTest tested(decodedTechnologies[0]);
    rc::detail::checkGTest([] {
        const Data recording = recordingOf(*inTime(recordOfCodes({0x5134, 0x512C, 0x713A})), gsm);
        expectChunkedIsWhole(damaged(converted(recording, FileForm::Snapshot, gsm), *anyDamage()));
    });
}

} // namespace
} // namespace velmora
