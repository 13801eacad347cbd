// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/ActiveSetPilots.h"

#include "LogGenerator/C2K/PilotList.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

constexpr std::size_t minimumLength = 25; // the pilots follow
constexpr std::size_t countAt = 15;
constexpr std::size_t pilotLength = 12;

/// Of the entries.
Value pilotsOf(Bytes bytes, const void*) {
    PilotList pilots;
    const CountedList entries(Record(bytes), 0, pilotLength, bytes.size() / pilotLength);
    for (std::size_t i = 0; i < entries.count(); ++i)
        pilots.add(i, entries[i].u16(0), decibelsOf512ths(entries[i].u16(2)));
    return pilots.valueOrNone();
}

} // namespace

void ActiveSetPilots::parse(const Record& record, Dictionary&, const Publisher& publisher) const {
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x12b6 is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), static_cast<unsigned long>(minimumLength));
        return;
    }
    const std::size_t count = record.u8(countAt);
    if (record.size() < minimumLength + pilotLength * count) {
        logFormat(LogPriority::Error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
                  lengthOf(record), static_cast<int>(count));
        return;
    }
    publisher.publishLater("kActiveSetPilots", pilotsOf, nullptr,
                           record.part(minimumLength, pilotLength * count).bytes());
}

} // namespace velmora::C2K
