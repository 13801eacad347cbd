// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/EquivalentPLMNList.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x7150: MCC and MNC (3GPP TS 23.003 2.2), one digit a byte and alternating, as the modem reports them.
constexpr std::size_t minimumLength = 17;
// Entries lie three bytes apart although six are read from each, so that they overlap. That is on
// purpose.
constexpr std::size_t stride = 3;
constexpr std::size_t entryLength = 6;

std::int64_t threeDigits(unsigned hundreds, unsigned tens, unsigned ones) {
    return hundreds * 100 + tens * 10 + ones;
}

CountedList networks(const Record& record) {
    return CountedList(record, minimumLength, stride, entryLength, record.u8(16));
}

constexpr Field countryCode{"Mobile Country Code",
                            computed,
                            integer("%d"),
                            {.digits = 3, .identity = Identity::Location, .clause = "3GPP TS 23.003 2.2"}};
constexpr Field networkCode{"Mobile Network Code",
                            computed,
                            integer("%d"),
                            {.digits = 2, .identity = Identity::Location, .clause = "3GPP TS 23.003 2.2"}};

constexpr Content networkContents[] = {countryCode, networkCode};
constexpr std::string_view networkKeys[] = {"Mobile Country Code", "Mobile Network Code"};
constexpr List rows{.contents = networkContents, .keys = networkKeys};
constexpr Content contents[] = {rows};
constexpr View sectionViews[] = {{0x7150, minimumLength, contents}};

} // namespace

std::span<const View> EquivalentPLMNList::views() const {
    return sectionViews;
}

void EquivalentPLMNList::trace() const {
    logLine(LogPriority::Warning, "Equivalent PLMN List");
}

void EquivalentPLMNList::check(const View& view, const Record& record) const {
    reportMissingEntries(networks(record), view.code);
}

void EquivalentPLMNList::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    // The list ends with the last complete entry.
    const CountedList entries = networks(record);
    visitor.beginList(rows);
    for (std::size_t i = 0; i < entries.completeCount(); ++i) {
        const Record e = entries[i];
        visitor.beginRow();
        visitor.number(countryCode, threeDigits(e.u8(0), e.u8(2), e.u8(4)));
        visitor.number(networkCode, threeDigits(e.u8(1), e.u8(3), e.u8(5)));
        visitor.endRow();
    }
    visitor.endList();
}

} // namespace velmora
