// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/InterfaceDescription.h"

#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>
#include <limits>

namespace velmora {

namespace {

__extension__ using Wide = __int128;

constexpr Wide nanosecondsPerSecond = 1'000'000'000;
constexpr std::size_t fixedPart = 8;
constexpr std::size_t optionHeader = 4;
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
    std::size_t at = fixedPart;
    while (at < body.size()) {
        const std::uint16_t option = fields.u16(at);
        const std::size_t length = fields.u16(at + 2);
        const std::size_t value = at + optionHeader;
        if (!fields.isGood() || option == pcapng::Option::End)
            break;
        if (length > body.size() - value) // the option's header lies inside
            return std::nullopt;
        if (option == pcapng::Option::InterfaceName) {
            const Bytes name = body.subspan(value, std::min(length, maximumName));
            // Some writers end the text with a zero, which the format does not require.
            description.name.assign(name.begin(), std::find(name.begin(), name.end(), std::uint8_t{0}));
        } else if (option == pcapng::Option::TimeResolution) {
            if (length != 1)
                return std::nullopt;
            description.timeResolution = body[value];
        } else if (option == pcapng::Option::TimeOffset) {
            if (length != 8)
                return std::nullopt;
            description.timeOffset_seconds = static_cast<std::int64_t>(fields.u64(value));
        }
        at = value + pcapng::padded(length);
    }
    if (!fields.isGood())
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
