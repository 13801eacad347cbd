// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/DataRate.h"

#include <optional>

namespace velmora::C2K {

namespace {

constexpr double bitsPerKilobit = 1024;

std::optional<std::int64_t> integerOf(const Value& value) {
    const std::int64_t* integer = value.asInteger();
    return integer ? std::optional(*integer) : std::nullopt;
}

} // namespace

std::optional<Reading> updateDataRate(const DataRateKeys& keys, std::uint32_t sequence, std::uint64_t sent,
                                      Dictionary& state) {
    // Absent where the state never had a display; then the copies go nowhere.
    const DictionaryRef extra = state["ExtraInfo"].dictionaryRef();
    const auto note = [&extra](std::string_view key, std::int64_t number) {
        if (extra && !extra->isFrozen())
            extra->set(key, number);
    };

    const std::optional<std::int64_t> earlierSequence = integerOf(state[keys.sequence]);
    const std::optional<std::int64_t> earlierSent = integerOf(state[keys.sent]);
    std::optional<Reading> reading;
    if (earlierSequence && earlierSent) {
        const auto steps = static_cast<std::int32_t>(sequence - static_cast<std::uint32_t>(*earlierSequence));
        const auto bits = static_cast<std::int64_t>(sent - static_cast<std::uint64_t>(*earlierSent));
        if (steps >= 1)
            reading = Reading{Record(Bytes()), static_cast<double>(bits) / (steps * bitsPerKilobit)};
        note(keys.sequence2, *earlierSequence);
        note(keys.sent2, *earlierSent);
    } else {
        reading = Reading{};
    }
    const auto keptSent = static_cast<std::int64_t>(sent);
    state.set(keys.sequence, sequence);
    state.set(keys.sent, keptSent);
    note(keys.sequence1, sequence);
    note(keys.sent1, keptSent);
    return reading;
}

void visitDataRate(const Field& rate, const Reading& reading, FieldVisitor& visitor) {
    if (reading.number)
        visitor.real(rate, *reading.number);
    else
        visitor.text(rate, "");
}

} // namespace velmora::C2K
