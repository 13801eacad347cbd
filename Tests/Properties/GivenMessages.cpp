// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Properties/GivenMessages.h"

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Tests/Properties/GivenValues.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/FakeClock.h"

#include <array>
#include <chrono>
#include <tuple>
#include <utility>

namespace velmora {

namespace {

using Payload = std::vector<std::uint8_t>;

rc::Gen<std::uint16_t> anyCode() {
    // The codes of the extra stream are 0 to 2.
    return rc::gen::weightedOneOf<std::uint16_t>(
        {{1, rc::gen::inRange<std::uint16_t>(0, 4)}, {4, rc::gen::arbitrary<std::uint16_t>()}});
}

rc::Gen<std::uint64_t> anyStamp() {
    constexpr std::int64_t hour_ms = 3'600'000;
    return rc::gen::map(rc::gen::inRange<std::int64_t>(0, hour_ms), [](std::int64_t after) {
        return recordTimestamp(FakeClock::defaultNow() + std::chrono::milliseconds(after));
    });
}

Data recordWith(std::uint8_t type, std::uint16_t code, std::uint64_t stamp, const Payload& payload) {
    const auto header = LogMessage::header(type, code, payload.size(), stamp);
    Payload bytes(header.begin(), header.end());
    bytes.insert(bytes.end(), payload.begin(), payload.end());
    return Data(std::move(bytes));
}

Data prefixed(const Data& record) {
    Payload bytes = {LogMessage::prefixMarker, 0};
    bytes.insert(bytes.end(), record.bytes().begin(), record.bytes().end());
    return Data(std::move(bytes));
}

} // namespace

void showValue(const GivenMessage& given, std::ostream& out) {
    out << given.time.time_since_epoch().count() << " ns: " << hexText(given.message.bytes());
}

rc::Gen<Data> anyBytes() {
    return rc::gen::map(rc::gen::arbitrary<Payload>(), [](Payload bytes) { return Data(std::move(bytes)); });
}

rc::Gen<Data> recordOfCodes(std::vector<std::uint32_t> codes) {
    return rc::gen::map(
        rc::gen::tuple(rc::gen::elementOf(std::move(codes)), anyStamp(), rc::gen::arbitrary<Payload>()),
        [](const auto& parts) {
            const auto& [code, stamp, payload] = parts;
            const bool isExtra = code >= LogMessage::firstExtraCode;
            return recordWith(isExtra ? LogMessage::extraType : LogMessage::basebandType,
                              static_cast<std::uint16_t>(code), stamp, payload);
        });
}

rc::Gen<Data> anyRecord() {
    const auto type = rc::gen::element(LogMessage::basebandType, LogMessage::extraType);
    return rc::gen::map(rc::gen::tuple(type, anyCode(), anyStamp(), rc::gen::arbitrary<Payload>(),
                                       rc::gen::arbitrary<bool>()),
                        [](const auto& parts) {
                            const auto& [stream, code, stamp, payload, hasPrefix] = parts;
                            const Data record = recordWith(stream, code, stamp, payload);
                            return hasPrefix ? prefixed(record) : record;
                        });
}

rc::Gen<Data> anyTextTree() {
    return rc::gen::map(givenTextTree(),
                        [](const Value& tree) { return Data(*writeBinaryPropertyList(tree)); });
}

rc::Gen<std::vector<GivenMessage>> inTime(rc::Gen<Data> message) {
    // Most are some milliseconds apart, so that a refresh has several.
    const auto pause =
        rc::gen::weightedOneOf<std::int64_t>({{6, rc::gen::inRange<std::int64_t>(0, 400'000'000)},
                                              {1, rc::gen::inRange<std::int64_t>(0, 9'000'000'000)}});
    return rc::gen::map(rc::gen::container<std::vector<std::pair<std::int64_t, Data>>>(
                            rc::gen::pair(pause, std::move(message))),
                        [](const auto& given) {
                            std::vector<GivenMessage> messages;
                            Time time = FakeClock::defaultNow();
                            for (const auto& [after, bytes] : given)
                                messages.push_back({time += std::chrono::nanoseconds(after), bytes});
                            return messages;
                        });
}

} // namespace velmora
