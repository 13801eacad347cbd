// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/SimInfo.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora {

namespace {

struct SIMFile {
    constexpr SIMFile(std::string_view serviceKey, std::string_view label, Identity identity,
                      std::string_view clause)
        : key(serviceKey), field{label, computed, plainText(), {.identity = identity, .clause = clause}} {}

    std::string_view key;
    Field field;
};

/// Most of them are elementary files of 3GPP TS 31.102 and TS 51.011; which there are, and with which text,
/// is as the telephony service reports it.
constexpr SIMFile simFiles[] = {
    {"kSimFile_ICCID", "EF-ICCID", Identity::Subscriber, "3GPP TS 51.011 10.1.1"},
    {"kSimFile_MSISDN", "EF-MSISDN", Identity::Subscriber, "3GPP TS 31.102 4.2.26"},
    {"kSimFile_MBDN", "EF-3GPP MAIL BOX DIALING NUMBER", Identity::Subscriber, "3GPP TS 31.102 4.2.60"},
    {"kSimFile_HPPLMN", "EF-HPPLMN SEARCH PERIOD", Identity::None, "3GPP TS 31.102 4.2.6"},
    {"kSimFile_LOCI", "EF-LOCI", Identity::Subscriber, "3GPP TS 31.102 4.2.17"}, // holds the TMSI
    {"kSimFile_PSLOCI", "EF-GPRS/PS-LOCI", Identity::Subscriber, "3GPP TS 31.102 4.2.23"},
    {"kSimFile_ACC", "EF-ACCESS CONTROL CLASS", Identity::Subscriber, "3GPP TS 31.102 4.2.15"},
    {"kSimFile_AD", "EF-ADMINISTRATIVE DATA", Identity::None, "3GPP TS 31.102 4.2.18"},
    {"kSimFile_FPLMN", "EF-FPLMN", Identity::Location, "3GPP TS 31.102 4.2.16"},
    {"kSimFile_AHPLMN", "EF-ACTING HPLMN", Identity::None, ""},
    {"kSimFile_RATMODE", "EF-RAT MODE", Identity::None, ""},
    {"kSimFile_PNN", "EF-PLMN NETWORK NAME", Identity::None, "3GPP TS 31.102 4.2.58"},
    {"kSimFile_OPL", "EF-OPERATOR PLMN LIST", Identity::None, "3GPP TS 31.102 4.2.59"},
    {"kSimFile_OPLMNAcT", "EF-OPLMNAcT", Identity::None, "3GPP TS 31.102 4.2.53"},
};

constexpr View simFileViews[] = {{ExtraCode::simFiles, std::size_t{0}}};

} // namespace

std::span<const View> SimInfo::views() const {
    return simFileViews;
}

void SimInfo::trace() const {
    logLine(LogPriority::Warning, "SimInfo");
}

void SimInfo::updateWithData(const Data& data, std::uint32_t logCode) {
    trace();
    const View* const view = viewOf(logCode);
    if (!view)
        return; // without a log line, unlike other sections
    const LogCode_0xFF0000::SIMFileReader reader(data, _payloads);
    KeptRecords::Parts parts = 0;
    for (std::size_t i = 0; i < std::size(simFiles); ++i)
        if (reader.value(simFiles[i].key))
            parts |= KeptRecords::Parts{1} << i;
    keep(*view, Record(Bytes()), parts, [this, &reader] { _files = reader.files(); });
}

void SimInfo::decode(const View&, const Record&, FieldVisitor& visitor) const {
    const Dictionary* const files = _files.asDictionary();
    if (!files)
        return;
    for (const SIMFile& file : simFiles)
        if (const Value* const value = files->find(file.key))
            visitor.supplied(file.field, *value);
}

void SimInfo::describe(const View&, ContentVisitor& visitor) const {
    for (const SIMFile& file : simFiles)
        visitor.keyed(file.field, {file.key});
}

} // namespace velmora
