// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/SimInfo.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora {

namespace {

struct SIMFile {
    constexpr SIMFile(std::string_view serviceKey, std::string_view label)
        : key(serviceKey), field{label, computed, plainText()} {}

    std::string_view key;
    Field field;
};

/// Most of them are elementary files of 3GPP TS 31.102 and TS 51.011; which there are, and with which text,
/// is as the telephony service reports it.
constexpr SIMFile simFiles[] = {
    {"kSimFile_ICCID", "EF-ICCID"},
    {"kSimFile_MSISDN", "EF-MSISDN"},
    {"kSimFile_MBDN", "EF-3GPP MAIL BOX DIALING NUMBER"},
    {"kSimFile_HPPLMN", "EF-HPPLMN SEARCH PERIOD"},
    {"kSimFile_LOCI", "EF-LOCI"},
    {"kSimFile_PSLOCI", "EF-GPRS/PS-LOCI"},
    {"kSimFile_ACC", "EF-ACCESS CONTROL CLASS"},
    {"kSimFile_AD", "EF-ADMINISTRATIVE DATA"},
    {"kSimFile_FPLMN", "EF-FPLMN"},
    {"kSimFile_AHPLMN", "EF-ACTING HPLMN"},
    {"kSimFile_RATMODE", "EF-RAT MODE"},
    {"kSimFile_PNN", "EF-PLMN NETWORK NAME"},
    {"kSimFile_OPL", "EF-OPERATOR PLMN LIST"},
    {"kSimFile_OPLMNAcT", "EF-OPLMNAcT"},
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

} // namespace velmora
