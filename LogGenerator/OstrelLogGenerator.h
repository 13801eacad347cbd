#pragma once

#include "LogGenerator/LogGenerator.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// The common base of the binary families: keeps the raw messages since the last display and writes the
/// history's as a DLF log, the modem maker's diagnostic log file.
class OstrelLogGenerator : public LogGenerator {
public:
    explicit OstrelLogGenerator(const Clock& clock) : LogGenerator(clock) {}

    /// The DLF log of the state's history: a version report, then each entry's raw messages. Absent, with a
    /// log line, when an entry's raw material is not bytes.
    [[nodiscard]] std::optional<Data> generateDlfFromState(const Dictionary& state) const;

    /// The history and, where it can be written, the DLF log.
    [[nodiscard]] ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

protected:
    /// Raw log messages since the last display, one behind the other.
    std::vector<std::uint8_t> _binData;

    /// Moves the raw messages into the state under "DisplayState" and starts collecting anew.
    void handOverBinData(Dictionary& state);
};

/// The size of a DLF log's first record.
inline constexpr std::size_t dlfVersionReportSize = 161;

/// Writes a DLF log's version report into `buffer` and its size into `written`; 0 on success. A buffer that
/// is too short gets nothing, `written` becomes 0 and the result is 3. `packedTime`: seconds since 1970 in
/// the low 32 bits, then the zone's offset in minutes (16), then 1 while daylight-saving time is in effect
/// (8). Texts that do not fit their field are cut, as the format has it.
[[nodiscard]] int DLFAddVersionReport(std::span<std::uint8_t> buffer, std::size_t& written,
                                      std::uint16_t firstReport, std::uint16_t secondReport,
                                      std::string_view version, std::string_view executable,
                                      std::string_view build, std::uint64_t packedTime);

} // namespace velmora
