// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/PayloadCache.h"

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>

namespace velmora {

namespace {

/// What is kept: a payload of a few bytes may refer to the same object very often.
constexpr PropertyListLimits cachedLimits{
    .maximumObjects = 5'000,
    .maximumBytes = std::size_t{1} << 16,
    .maximumMemory = std::size_t{2} << 20,
};

} // namespace

Result<Value> PayloadCache::read(const Data& record) {
    const Bytes bytes = record.from(LogMessage::headerLength).bytes();
    for (const Payload& known : _payloads)
        if (!known.value.isNone() &&
            std::equal(bytes.begin(), bytes.end(), known.bytes.begin(), known.bytes.end()))
            return known.value;
    Result<Value> payload = readPropertyList(bytes, cachedLimits);
    if (!payload)
        return readPropertyList(bytes, messageLimits);
    _payloads[_next] = {{bytes.begin(), bytes.end()}, *payload};
    _next = (_next + 1) % _payloads.size();
    return payload;
}

} // namespace velmora
