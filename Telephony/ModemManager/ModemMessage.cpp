// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemMessage.h"

#include "LogMessages/LiveModem.h"
#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>
#include <memory>
#include <stdexcept>
#include <string_view>
#include <vector>

namespace velmora {
namespace {

static_assert(maximumPayload + LogMessage::headerLength - 1 == 0xFFFF, "the length leaves the type byte out");

std::vector<std::uint8_t> written(const Dictionary& root) {
    auto payload = writeBinaryPropertyList(Value(std::make_shared<Dictionary>(root)));
    // Its texts are checked, and it nests a few deep.
    if (!payload)
        throw std::logic_error("payload cannot be written: " + payload.reason());
    return std::move(*payload);
}

Dictionary withFewerCells(const Dictionary& root, std::size_t count) {
    Dictionary fewer = root;
    const Array& all = *root[kVoxCellMonitorCells].asArray();
    const ArrayRef kept = makeArray();
    for (std::size_t i = 0; i < count; ++i)
        kept->append(all[i]);
    fewer.set(kVoxCellMonitorCells, kept);
    fewer.set(kVoxModemCellsLeftOut, all.size() - count);
    return fewer;
}

Dictionary stateOf(const Dictionary& root) {
    Dictionary state;
    for (const std::string_view key : {kVoxModemPresence, kVoxModemReason, kVoxModemState,
                                       kVoxModemFailedReason, kVoxModemLock, kVoxModemCellReport})
        if (const Value* value = root.find(key))
            state.set(key, *value);
    return state;
}

} // namespace

const std::array<std::uint32_t, 8>& liveModemCodes() {
    static constexpr std::array codes = {
        LiveModemCode::cells,   LiveModemCode::registration, LiveModemCode::link,  LiveModemCode::contexts,
        LiveModemCode::traffic, LiveModemCode::sim,          LiveModemCode::modem, LiveModemCode::position};
    return codes;
}

RecordBuilder liveModemRecord(std::uint32_t code, const Dictionary& root) {
    std::vector<std::uint8_t> payload = written(root);
    const Array* cells = root[kVoxCellMonitorCells].asArray();
    std::size_t count = cells ? cells->size() : 0;
    while (payload.size() > maximumPayload && count > 1) {
        // Cells are about equally long, so that one or two attempts are enough.
        count = std::min(count - 1, count * maximumPayload / payload.size());
        payload = written(withFewerCells(root, count));
    }
    if (payload.size() > maximumPayload) {
        logFormat(LogPriority::Error, "modemmanager: message 0x%06X has %zu bytes, at most %zu fit",
                  static_cast<unsigned>(code), payload.size(), maximumPayload);
        payload = written(stateOf(root));
    }
    return {code, Bytes(payload)};
}

} // namespace velmora
