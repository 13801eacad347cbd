// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RecordCandidate.h"

#include "LogMessages/DLFVersionReport.h"
#include "LogMessages/LogCodes.h"
#include "LogMessages/Record.h"
#include "LogMessages/RecordTime.h"
#include "Recording/DLF/ImpliedType.h"

#include <algorithm>

namespace velmora {

namespace {

bool isStream(std::uint8_t type) {
    return type == LogMessage::basebandType || type == LogMessage::extraType;
}

/// The score of the framing; absent where the bytes do not have it.
std::optional<int> scoreOfFraming(Bytes bytes, Framing framing, const RecordWeights& weights) {
    if (framing == Framing::Nothing)
        return 0;
    const bool hasType = isStream(bytes[sizeOf(framing) - 1]);
    switch (framing) {
    case Framing::Prefix:
        if (bytes[0] != LogMessage::prefixMarker)
            return std::nullopt;
        return weights.prefix + (hasType ? weights.type : 0);
    case Framing::OtherType:
        if (hasType)
            return std::nullopt;
        return 0;
    default:
        if (!hasType)
            return std::nullopt;
        return weights.type;
    }
}

int timestampScore(std::uint64_t timestamp, std::optional<std::uint64_t> nearby,
                   const RecordWeights& weights) {
    constexpr std::uint64_t day = std::uint64_t{86'400} * 800; // in units of 1.25 ms
    if (timestamp == 0)
        return nearby.value_or(0) == 0 ? weights.zeroAmongZeros : weights.zeroAmongTimes;
    if (!isRecordTime(timestamp))
        return weights.badTimestamp;
    if (nearby.value_or(0) == 0)
        return 0;
    const auto [less, more] = std::minmax({timestamp >> 16, *nearby >> 16}); // by value: both are temporaries
    return more - less <= day ? weights.nearTimestamp : weights.farTimestamp;
}

} // namespace

std::optional<RecordCandidate> RecordCandidate::read(Bytes bytes, Framing framing,
                                                     std::optional<std::uint64_t> nearby,
                                                     const RecordWeights& weights) {
    const std::size_t framingSize = sizeOf(framing);
    if (bytes.size() < framingSize + bareHeaderLength)
        return std::nullopt;
    const std::optional<int> framingScore = scoreOfFraming(bytes, framing, weights);
    if (!framingScore)
        return std::nullopt;
    const Record header(bytes.subspan(framingSize, bareHeaderLength));
    constexpr std::size_t typeSize = 1; // which LogMessage's offsets count and the bare header lacks
    RecordCandidate candidate;
    candidate.framing = framing;
    candidate.length = header.u16(LogMessage::lengthOffset - typeSize);
    if (candidate.length < bareHeaderLength)
        return std::nullopt;
    candidate.size = framingSize + candidate.length;
    candidate.code = header.u16(LogMessage::codeOffset - typeSize);
    candidate.timestamp = header.u64(LogMessage::timestampOffset - typeSize);
    candidate.score = *framingScore + timestampScore(candidate.timestamp, nearby, weights);
    const std::uint8_t type = framingSize != 0 ? bytes[framingSize - 1] : impliedType(candidate.code);
    const bool isExtra = type == LogMessage::extraType;
    const std::uint32_t logCode = (isExtra ? LogMessage::firstExtraCode : 0) + candidate.code;
    if (candidate.isVersionReport())
        candidate.score += weights.versionReport;
    // Zeros that count as no time do not count as a code of the extra stream besides.
    else if (technologiesOfCode(logCode) != 0 && (candidate.code | candidate.timestamp) != 0)
        // Without a type byte small numbers are all that there is of the extra stream's codes.
        candidate.score +=
            framing == Framing::Nothing && isExtra ? weights.wantedCode / 2 : weights.wantedCode;
    return candidate;
}

bool RecordCandidate::hasTime() const {
    return timestamp != 0 && isRecordTime(timestamp);
}

bool RecordCandidate::isVersionReport() const {
    return framing == Framing::Nothing && code == dlfVersionReportCode && length == dlfVersionReportSize;
}

std::optional<std::uint8_t> RecordCandidate::missingByte() const {
    switch (framing) {
    case Framing::Nothing: return impliedType(code);
    case Framing::PartialPrefix: return LogMessage::prefixMarker;
    default: return std::nullopt;
    }
}

} // namespace velmora
