// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ReselectionCandidatesList.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora {

using LTE::ReselectionRecord;

namespace {

// As the modem reports them.
constexpr EnumText ratTypeRows[] = {
    {0, "LTE"}, {1, "UTRAN"}, {2, "GERAN"}, {3, "CDMA1XRTT"}, {4, "CDMAHRPD"},
};
constexpr EnumTexts ratTypes(ratTypeRows, "??");
constexpr Place ratType = u16At(2);

// Reselection priority (3GPP TS 36.304 5.2.4.1).
constexpr Field headerFields[] = {
    {"Candidate Priority", u16At(0), integer("%d"), {.clause = "3GPP TS 36.304 5.2.4.1"}},
    {"Candidate RAT Type", ratType, text(ratTypes)},
};
constexpr Layout header = layout(ReselectionRecord::stride, headerFields);

// What belongs to the radio technology; offsets count from the candidate's header, like the header's own.
// Channels and cells: EARFCN (3GPP TS 36.101 5.7.3), physical cell identity (TS 36.211 6.11); UARFCN (TS
// 25.101 5.4.3), primary scrambling code (TS 25.213 5.2.2); ARFCN (TS 45.005 2), BSIC (TS 23.003 4.3.2); band
// class (3GPP2 C.S0057), pilot PN offset (3GPP2 C.S0005). The GERAN band is the modem's number.
constexpr Field lteFields[] = {
    {"E ARFCN",
     u16At(4),
     integer("%d"),
     {.clause = "3GPP TS 36.101 5.7.3"}}, // with a blank, unlike the other sections' "E-ARFCN"
    {"Cell ID", bitsAt(6, 7, 9), integer("%d"), {.clause = "3GPP TS 36.211 6.11"}},
};
constexpr Field utranFields[] = {
    {"U ARFCN", u16At(4), integer("%d"), {.clause = "3GPP TS 25.101 5.4.3"}},
    {"PSC", u16At(6), integer("%d"), {.clause = "3GPP TS 25.213 5.2.2"}},
};
constexpr Field geranFields[] = {
    {"ARFCN", u16At(4), integer("%d"), {.clause = "3GPP TS 45.005 2"}},
    {"Band", u8At(6), integer("%d")},
    {"BSIC ID", u8At(7), integer("%d"), {.clause = "3GPP TS 23.003 4.3.2"}},
};
constexpr Field cdmaFields[] = {
    {"Band", u8At(4), integer("%d")},
    {"Channel", u16At(8), integer("%d"), {.clause = "3GPP2 C.S0057"}},
    {"Pilot", u16At(10), integer("%d"), {.clause = "3GPP2 C.S0005"}},
};
/// By RAT type; the lengths are the candidate's, header included.
constexpr Layout details[] = {
    layout(8, lteFields),   layout(8, utranFields), layout(8, geranFields),
    layout(12, cdmaFields), layout(12, cdmaFields),
};
static_assert(std::size(details) == std::size(ratTypeRows));
constexpr Layout noDetails = {ReselectionRecord::stride, {}};

const Layout& detailsOf(const Record& candidate) {
    const auto type = static_cast<std::size_t>(ratType.read(candidate));
    return type < std::size(details) ? details[type] : noDetails;
}

/// How many candidates, from the first on, lie completely inside the record with what belongs to their type.
std::size_t completeCandidates(const ReselectionRecord& reselection, const CountedList& headers) {
    std::size_t i = 0;
    while (i < headers.completeCount() &&
           i < reselection.candidates(detailsOf(headers[i]).minimumLength).completeCount())
        ++i;
    return i;
}

// Two technologies have a "Band" and two an "ARFCN"; a row has those of one.
constexpr Content candidateContents[] = {header, lteFields, utranFields, geranFields, cdmaFields};
constexpr List rows{.contents = candidateContents};
constexpr Content contents[] = {rows};
constexpr View sectionViews[] = {{ReselectionRecord::code, ReselectionRecord::minimumLength, contents}};

} // namespace

std::span<const View> ReselectionCandidatesList::views() const {
    return sectionViews;
}

void ReselectionCandidatesList::check(const View& view, const Record& record) const {
    const ReselectionRecord reselection(record);
    const CountedList headers = reselection.candidates(header.minimumLength);
    reportMissingEntries(completeCandidates(reselection, headers), headers.count(), view.code);
}

void ReselectionCandidatesList::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    const ReselectionRecord reselection(record);
    const CountedList headers = reselection.candidates(header.minimumLength);
    visitor.beginList(rows);
    for (std::size_t i = 0, count = completeCandidates(reselection, headers); i < count; ++i) {
        const Layout& detail = detailsOf(headers[i]);
        visitor.beginRow();
        visitor.fields(headers[i], header);
        visitor.fields(reselection.candidates(detail.minimumLength)[i], detail);
        visitor.endRow();
    }
    visitor.endList();
}

} // namespace velmora
