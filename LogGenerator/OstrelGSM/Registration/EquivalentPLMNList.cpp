// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/EquivalentPLMNList.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t minimumLength = 17;
// Entries lie three bytes apart although six are read from each, so that they overlap. That is how the record
// is read, and it is kept.
constexpr std::size_t stride = 3;
constexpr std::size_t entryLength = 6;

std::int64_t threeDigits(unsigned hundreds, unsigned tens, unsigned ones) {
    return hundreds * 100 + tens * 10 + ones;
}

CountedList networks(const Record& record) {
    return CountedList(record, minimumLength, stride, entryLength, record.u8(16));
}

void fill(Array& rows, const Record& record) {
    const CountedList entries = networks(record);
    for (std::size_t i = 0; i < entries.whole(); ++i) {
        const Record e = entries[i];
        Dictionary& row = rows.appendRow();
        row.setText("Mobile Country Code", NumberText("%d", threeDigits(e.u8(0), e.u8(2), e.u8(4))).text());
        row.setText("Mobile Network Code", NumberText("%d", threeDigits(e.u8(1), e.u8(3), e.u8(5))).text());
    }
}

} // namespace

void EquivalentPLMNList::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "Equivalent PLMN List");
    if (logCode != 0x7150) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < minimumLength)
        return;
    const CountedList entries = networks(record);
    // The list ends with the last entry that lies wholly inside the record.
    reportMissingEntries(entries, logCode);
    showElementsWith<fill>(record);
}

} // namespace velmora
