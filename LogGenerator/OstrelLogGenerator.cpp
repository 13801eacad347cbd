#include "LogGenerator/OstrelLogGenerator.h"

#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <string>

namespace velmora {

namespace {

/// The priority value of this file's failure lines: a facility in the upper bits and the most urgent
/// priority.
constexpr int dlfFailure = 16;

void putLittleEndian(std::span<std::uint8_t> field, std::uint64_t value) {
    for (std::uint8_t& byte : field) {
        byte = static_cast<std::uint8_t>(value);
        value >>= 8;
    }
}

/// Copies at most `limit` bytes, the last of which is the terminating zero.
void putText(std::span<std::uint8_t> field, std::string_view text, std::size_t limit) {
    const std::size_t length = std::min(text.size(), limit - 1);
    std::copy_n(text.begin(), length, field.begin());
}

std::uint64_t packedTime(const Clock& clock) {
    const Time now = clock.now();
    const ZoneState zone = clock.zoneAt(now);
    const auto seconds = std::chrono::floor<std::chrono::seconds>(now).time_since_epoch().count();
    const auto minutes = zone.offset.count() / 60; // toward zero
    return static_cast<std::uint32_t>(seconds) | std::uint64_t{static_cast<std::uint16_t>(minutes)} << 32 |
           std::uint64_t{zone.daylightSaving ? 1u : 0u} << 48;
}

} // namespace

int DLFAddVersionReport(std::span<std::uint8_t> buffer, std::size_t& written, std::uint16_t firstReport,
                        std::uint16_t secondReport, std::string_view version, std::string_view executable,
                        std::string_view build, std::uint64_t packedTime) {
    written = 0;
    if (buffer.size() < dlfVersionReportSize)
        return 3;
    const auto report = buffer.first(dlfVersionReportSize);
    std::fill(report.begin(), report.end(), std::uint8_t{0});
    putLittleEndian(report.subspan(0, 2), dlfVersionReportSize);
    putLittleEndian(report.subspan(2, 2), 0x1FFD);
    putLittleEndian(report.subspan(12, 2), firstReport);
    putLittleEndian(report.subspan(14, 2), secondReport);
    putText(report.subspan(16, 7), version, 7);
    putText(report.subspan(23, 40), executable, 16);
    putText(report.subspan(63, 18), build, 18);
    putLittleEndian(report.subspan(81, 4), packedTime);
    putLittleEndian(report.subspan(85, 2), packedTime >> 32);
    putLittleEndian(report.subspan(87, 1), packedTime >> 48);
    written = dlfVersionReportSize;
    return 0;
}

std::optional<Data> OstrelLogGenerator::generateDlfFromState(const Dictionary& state) const {
    std::array<std::uint8_t, dlfVersionReportSize> header{};
    const std::optional<std::string> bundleVersion = resources().bundleVersion();
    const std::string version = bundleVersion ? "Velmora " + *bundleVersion : "(none)";
    std::size_t written = 0;
    const int result = DLFAddVersionReport(header, written, 1, 1, version, "EXECUTABLE_NAME",
                                           resources().buildStamp(), packedTime(clock()));
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
            // Only the buffer's first byte, a type byte, goes; those of its further messages stay. That is
            // how the file is written, and it is kept.
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

void OstrelLogGenerator::handOverBinData(Dictionary& state) {
    state.set("DisplayState", Data(std::move(_binData)));
    _binData = {};
}

} // namespace velmora
