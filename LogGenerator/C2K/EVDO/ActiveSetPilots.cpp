// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/ActiveSetPilots.h"

#include "LogGenerator/C2K/PilotFields.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// 0x12B6: pilot PN offsets (3GPP2 C.S0024); energies in units of 1/512, the modem's own.
constexpr std::size_t minimumLength = 25; // the pilots follow
constexpr std::size_t countAt = 15;
constexpr std::size_t pilotLength = 12;

constexpr Content listContents[] = {pilotEnergy};
constexpr List pilotList{"kActiveSetPilots", List::Entries::Numbered, "(none)", listContents};

} // namespace

std::optional<Reading> ActiveSetPilots::accept(const Record& record, Dictionary&) const {
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x12b6 is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), static_cast<unsigned long>(minimumLength));
        return std::nullopt;
    }
    const std::size_t count = record.u8(countAt);
    if (record.size() < minimumLength + pilotLength * count) {
        logFormat(LogPriority::Error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
                  lengthOf(record), static_cast<int>(count));
        return std::nullopt;
    }
    return Reading{record.part(minimumLength, pilotLength * count)};
}

void ActiveSetPilots::decode(const Reading& reading, FieldVisitor& visitor) const {
    const Bytes entries = reading.record.bytes();
    const CountedList pilots(reading.record, 0, pilotLength, entries.size() / pilotLength);
    visitor.beginList(pilotList);
    for (std::size_t i = 0; i < pilots.count(); ++i) {
        visitor.entryNumber(i, pilots[i].u16(0));
        visitor.real(pilotEnergy, decibelsOf512ths(pilots[i].u16(2)));
    }
    visitor.endList();
}

void ActiveSetPilots::describe(ContentVisitor& visitor) const {
    visitor.list(pilotList);
}

} // namespace velmora::C2K
