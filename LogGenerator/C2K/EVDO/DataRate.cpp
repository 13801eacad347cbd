// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/DataRate.h"

#include <array>
#include <cstring>
#include <optional>

namespace velmora::C2K {

namespace {

constexpr double bitsPerKilobit = 1024;

std::optional<std::int64_t> integerOf(const Value& value) {
    const std::int64_t* integer = value.asInteger();
    return integer ? std::optional(*integer) : std::nullopt;
}

/// From one record to a later one.
struct Growth {
    std::int64_t bits = 0;
    std::int64_t steps = 0;
};

Value rateOf(Bytes bytes, const void*) {
    Growth growth;
    std::memcpy(&growth, bytes.data(), sizeof growth);
    return NumberText("%.2f kbps",
                      static_cast<double>(growth.bits) / (static_cast<double>(growth.steps) * bitsPerKilobit))
        .text();
}

} // namespace

void updateDataRate(const DataRateKeys& keys, std::uint32_t sequence, std::uint64_t sent, Dictionary& state,
                    const Publisher& publisher) {
    // Absent where the state never had a display; then the copies go nowhere.
    const DictionaryRef extra = state["ExtraInfo"].dictionaryRef();
    const auto note = [&extra](std::string_view key, std::int64_t number) {
        if (extra && !extra->isFrozen())
            extra->set(key, number);
    };

    const std::optional<std::int64_t> earlierSequence = integerOf(state[keys.sequence]);
    const std::optional<std::int64_t> earlierSent = integerOf(state[keys.sent]);
    if (earlierSequence && earlierSent) {
        const auto steps = static_cast<std::int32_t>(sequence - static_cast<std::uint32_t>(*earlierSequence));
        if (steps >= 1) {
            const Growth growth{static_cast<std::int64_t>(sent - static_cast<std::uint64_t>(*earlierSent)),
                                steps};
            std::array<std::uint8_t, sizeof growth> bytes;
            std::memcpy(bytes.data(), &growth, sizeof growth);
            publisher.publishLater(keys.value, rateOf, nullptr, bytes);
        }
        note(keys.sequence2, *earlierSequence);
        note(keys.sent2, *earlierSent);
    } else {
        publisher.publish(keys.value, "");
    }
    const auto keptSent = static_cast<std::int64_t>(sent);
    state.set(keys.sequence, sequence);
    state.set(keys.sent, keptSent);
    note(keys.sequence1, sequence);
    note(keys.sent1, keptSent);
}

} // namespace velmora::C2K
