// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/SimInfo.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

struct SIMFile {
    std::string_view key;
    std::string_view label;
};

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

/// The value as it stands: the service supplies what is to be shown.
void put(Dictionary& node, std::string_view label, const Value& value) {
    if (const std::string* text = value.asString())
        node.setText(label, *text);
    else
        node.set(label, value);
}

} // namespace

void SimInfo::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "SimInfo");
    if (logCode != 0xFF0000)
        return;
    const LogCode_0xFF0000::SIMFileReader reader(data, _payloads);
    Dictionary* const node = dictionary();
    if (!node)
        return;
    for (const SIMFile& file : simFiles)
        if (const Value* value = reader.value(file.key))
            put(*node, file.label, *value);
}

} // namespace velmora
