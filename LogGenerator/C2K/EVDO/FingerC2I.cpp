// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/FingerC2I.h"

#include "LogGenerator/C2K/PilotFields.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// 0x108A: pilot PN offsets (3GPP2 C.S0024); C/I in units of 1/512, the modem's own.
constexpr std::size_t minimumLength = 23; // the fingers follow
constexpr std::size_t countAt = 22;
constexpr std::size_t fingerLength = 14;
constexpr std::uint16_t unassigned = 0xFFFF;

constexpr Content listContents[] = {pilotEnergy};
constexpr List fingerList{"kFingerC2I", List::Entries::Numbered, "(none)", listContents};

} // namespace

std::optional<Reading> FingerC2I::accept(const Record& record, Dictionary&) const {
    constexpr auto minimum = static_cast<unsigned long>(minimumLength);
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x108a is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), minimum);
        return std::nullopt;
    }
    const std::size_t count = record.u8(countAt);
    if (record.size() != minimumLength + fingerLength * count) {
        // The size shown is always that of the part before the fingers, on purpose.
        logFormat(LogPriority::Error,
                  "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                  lengthOf(record), static_cast<int>(count), minimum);
        return std::nullopt;
    }
    return Reading{record.part(minimumLength, fingerLength * count)};
}

void FingerC2I::decode(const Reading& reading, FieldVisitor& visitor) const {
    const Bytes entries = reading.record.bytes();
    const CountedList fingers(reading.record, 0, fingerLength, entries.size() / fingerLength);
    visitor.beginList(fingerList);
    for (std::size_t i = 0; i < fingers.count(); ++i) {
        const Record finger = fingers[i];
        if (const std::uint16_t pnOffset = finger.u16(0); pnOffset != unassigned) {
            visitor.entryNumber(i, pnOffset);
            visitor.real(pilotEnergy, decibelsOf512ths(finger.u16(6)));
        }
    }
    visitor.endList();
}

void FingerC2I::describe(ContentVisitor& visitor) const {
    visitor.list(fingerList);
}

} // namespace velmora::C2K
