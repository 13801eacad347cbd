// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/ReadingBudget.h"

#include "Platform/SystemLog.h"

#include <utility>

namespace velmora {

Failure limitExceeded(const PropertyListLimits& limits, std::string reason) {
    if (limits.logsExcess)
        logLine(LogPriority::Error, "Malformed message: " + reason);
    return Failure{std::move(reason)};
}

Failure ReadingBudget::tooManyObjects() const {
    return limitExceeded(_limits, "the list has more than " + std::to_string(_limits.maximumObjects) +
                                      " objects, repeated ones counted");
}

std::optional<Failure> ReadingBudget::takeObject() {
    if (_objects == 0)
        return tooManyObjects();
    --_objects;
    return takeBytes(bytesAnObject);
}

std::optional<Failure> ReadingBudget::takeBytes(std::size_t size) {
    if (size > _bytes)
        return limitExceeded(_limits, "the list takes more than " + std::to_string(_limits.maximumMemory) +
                                          " bytes of memory, repeated text and data counted");
    _bytes -= size;
    return std::nullopt;
}

} // namespace velmora
