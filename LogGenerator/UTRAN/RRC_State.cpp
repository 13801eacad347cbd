// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/RRC_State.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t expectedLength = 15; // 0xD0E0
constexpr Place version = u8At(13);

constexpr std::int64_t knownVersion = 1;
/// What the log shows as the mode of a record that lacks it.
constexpr std::int64_t noMode = 255;

/// RRC states (3GPP TS 25.331 7.1), with the modem's own numbers.
constexpr EnumText stateRows[] = {
    {0, "Disconnected"}, {1, "Connecting"}, {2, "Cell Fach"},
    {3, "Cell DCH"},     {4, "Cell PCH"},   {5, "Cell URA PCH"},
};
constexpr std::string_view unknownMode = "Unknown RRC Mode";
constexpr EnumTexts states(stateRows, unknownMode);
constexpr Field state{"State",
                      u8At(14),
                      text(states),
                      {.role = Role::RadioState, .absent = unknownMode, .clause = "3GPP TS 25.331 7.1"}};
static_assert(state.place.end() <= expectedLength);

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

/// Whether the record is of the known version and reaches to the mode.
bool hasMode(const Record& record) {
    return record.size() >= state.place.end() && version.read(record) == knownVersion;
}

std::int64_t modeOf(const Record& record) {
    return hasMode(record) ? state.place.read(record) : noMode;
}

// A short record is decoded as well, see updateWithData.
constexpr Content contents[] = {state};
constexpr View sectionViews[] = {{0xD0E0, std::size_t{0}, contents}};

} // namespace

std::span<const View> RRC_State::views() const {
    return sectionViews;
}

void RRC_State::trace() const {
    logLine(LogPriority::Warning, "RRC Info");
}

void RRC_State::unknownCode(std::uint32_t) const {}

void RRC_State::updateWithData(const Data& data, std::uint32_t logCode) {
    Base::updateWithData(data, logCode);
    const Record record(data);
    if (!viewOf(logCode) || !isLogged(LogPriority::Warning))
        return;
    const std::int64_t current = modeOf(record);
    logFormat(LogPriority::Warning, "Display Dict = %s, rrc mode = %d %s", description(node()).c_str(),
              static_cast<int>(current), std::string(FormattedText(state.format, current).view()).c_str());
}

void RRC_State::check(const View&, const Record& record) const {
    // The warning does not stop the decoding, on purpose.
    if (record.size() >= expectedLength)
        return;
    observeDamage(Damage::TooShort);
    logFormat(LogPriority::Warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
              static_cast<long>(record.size()), static_cast<long>(expectedLength));
}

void RRC_State::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    if (hasMode(record))
        visitor.number(state, state.place.read(record));
    else
        visitor.text(state, unknownMode);
}

} // namespace velmora
