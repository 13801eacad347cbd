// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/InterfaceDescription.h"

#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>
#include <limits>

namespace velmora {

namespace {

__extension__ using Wide = __int128;

constexpr Wide nanosecondsPerSecond = 1'000'000'000;
constexpr std::size_t fixedPart = 8;
constexpr std::size_t maximumName = 255;
constexpr std::uint8_t powerOfTwo = 0x80;

/// Time stamp units to nanoseconds, rounded down.
Wide nanoseconds(std::uint64_t stamp, std::uint8_t resolution) {
    int exponent = resolution & 0x7F;
    Wide value = stamp;
    if ((resolution & powerOfTwo) != 0)
        return value * nanosecondsPerSecond >> exponent; // below 2^94, and the shift below 128
    for (; exponent < 9; ++exponent)
        value *= 10;
    for (; exponent > 9 && value != 0; --exponent)
        value /= 10;
    return value;
}

} // namespace

std::optional<InterfaceDescription> InterfaceDescription::read(Bytes body, bool bigEndian) {
    ByteReader fields(body, bigEndian);
    InterfaceDescription description;
    description.linkType = fields.u16(0);
    description.snapLength = fields.u32(4);
    if (!fields.isGood())
        return std::nullopt;
    OptionReader options(body.subspan(fixedPart), bigEndian);
    while (const auto option = options.next()) {
        const Bytes value = option->value;
        if (option->code == pcapng::Option::InterfaceName) {
            const Bytes name = value.first(std::min(value.size(), maximumName));
            // Some writers end the text with a zero, which the format does not require.
            description.name.assign(name.begin(), std::find(name.begin(), name.end(), std::uint8_t{0}));
        } else if (option->code == pcapng::Option::TimeResolution) {
            if (value.size() != 1)
                return std::nullopt;
            description.timeResolution = value[0];
        } else if (option->code == pcapng::Option::TimeOffset) {
            if (value.size() != 8)
                return std::nullopt;
            description.timeOffset_seconds = static_cast<std::int64_t>(ByteReader(value, bigEndian).u64(0));
        }
    }
    if (options.isDamaged())
        return std::nullopt;
    return description;
}

std::optional<Time> InterfaceDescription::timeOfAny(std::uint64_t stamp) const {
    const Wide moment = nanoseconds(stamp, timeResolution) + Wide{timeOffset_seconds} * nanosecondsPerSecond;
    if (moment < std::numeric_limits<std::int64_t>::min() ||
        moment > std::numeric_limits<std::int64_t>::max())
        return std::nullopt;
    return Time(std::chrono::nanoseconds(static_cast<std::int64_t>(moment)));
}

} // namespace velmora
