// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/RRC_State.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t expectedLength = 15; // 0xD0E0
constexpr Where version = u8At(13);
constexpr Where mode = u8At(14);
static_assert(mode.end() <= expectedLength);

constexpr std::int64_t knownVersion = 1;
/// What the mode reads as in a record of another version.
constexpr std::int64_t noMode = 255;

constexpr EnumText stateRows[] = {
    {0, "Disconnected"}, {1, "Connecting"}, {2, "Cell Fach"},
    {3, "Cell DCH"},     {4, "Cell PCH"},   {5, "Cell URA PCH"},
};
constexpr EnumTexts states(stateRows, "Unknown RRC Mode");

/// The field of a record that may be too short for it.
std::int64_t readOr(const Record& record, const Where& where, std::int64_t missing) {
    return record.size() >= where.end() ? where.read(record) : missing;
}

/// A node on one line, as its log line shows it: {State = Cell DCH; Cells = (1, 2)}.
std::string description(const Value& value) {
    if (const std::string* text = value.asString())
        return *text;
    std::string result;
    if (const Dictionary* dictionary = value.asDictionary()) {
        for (const auto& [key, entry] : *dictionary) {
            result += result.empty() ? "" : "; ";
            result += key;
            result += " = ";
            result += description(entry);
        }
        return '{' + result + '}';
    }
    if (const Array* array = value.asArray()) {
        for (const Value& element : *array) {
            result += result.empty() ? "" : ", ";
            result += description(element);
        }
        return '(' + result + ')';
    }
    return "(null)";
}

} // namespace

void RRC_State::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "RRC Info");
    if (logCode != 0xD0E0)
        return;
    const Record record(data);
    // The warning does not stop the decoding, on purpose.
    if (record.size() < expectedLength)
        logFormat(LogPriority::Warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
                  static_cast<long>(record.size()), static_cast<long>(expectedLength));
    const std::int64_t current =
        readOr(record, version, 0) == knownVersion ? readOr(record, mode, noMode) : noMode;
    const std::string_view state = states[static_cast<std::uint32_t>(current)];
    setText("State", state);
    if (systemLogWants(LogPriority::Warning))
        logFormat(LogPriority::Warning, "Display Dict = %s, rrc mode = %d %s", description(node()).c_str(),
                  static_cast<int>(current), std::string(state).c_str());
}

} // namespace velmora
