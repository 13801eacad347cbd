// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator.h"

#include "Platform/SystemLog.h"

#include <array>
#include <string>

namespace velmora {

namespace {

/// The priority value of this file's failure lines: a facility in the upper bits and the most urgent
/// priority.
constexpr int dlfFailure = 16;

} // namespace

std::optional<Data> OstrelLogGenerator::generateDlfFromState(const Dictionary& state) const {
    std::array<std::uint8_t, dlfVersionReportSize> header{};
    std::size_t written = 0;
    const int result = addOwnVersionReport(header, written, clock());
    if (result != 0) {
        logFormat(dlfFailure, "Could not write DLF header (result=%d)", result);
        return std::nullopt;
    }

    std::vector<std::uint8_t> dlf(header.begin(), header.begin() + static_cast<std::ptrdiff_t>(written));
    if (const Array* history = state["History"].asArray()) {
        for (const Value& entry : *history) {
            const Dictionary* fields = entry.asDictionary();
            const Value* displayState = fields ? fields->find("DisplayState") : nullptr;
            if (!displayState || displayState->isNone())
                continue;
            const Data* raw = displayState->asData();
            if (!raw) {
                logLine(dlfFailure, "Got wrong class writing history to DLF; aborting writing the DLF file");
                return std::nullopt;
            }
            if (raw->size() < 2)
                continue;
            // Only the buffer's first byte, a type byte, is removed, and not those of its further messages,
            // on purpose.
            const Bytes rest = raw->bytes().subspan(1);
            dlf.insert(dlf.end(), rest.begin(), rest.end());
        }
    }
    return Data(std::move(dlf));
}

ArrayRef OstrelLogGenerator::getSaveContentsFromState(const Dictionary& state) const {
    ArrayRef contents = makeArray();
    if (const Array* history = state["History"].asArray())
        for (const Value& entry : *history)
            contents->append(entry);
    if (std::optional<Data> dlf = generateDlfFromState(state)) {
        const DictionaryRef entry = makeDictionary();
        entry->set("Description", "DLF binary (" + std::to_string(dlf->size()) + " bytes)");
        entry->set("DLF", *std::move(dlf));
        contents->append(entry);
    }
    return contents;
}

void OstrelLogGenerator::endRefresh(Dictionary& state) {
    if (!keepsHistory())
        return;
    const std::size_t usual = _binData.size();
    state.set("DisplayState", Data(std::move(_binData)));
    _binData = {};
    _binData.reserve(usual);
    updateHistoryInState(state, clock());
}

} // namespace velmora
