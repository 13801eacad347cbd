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

Failure ReadingBudget::tooManyBytes() const {
    return limitExceeded(_limits, "the list takes more than " + std::to_string(_limits.maximumMemory) +
                                      " bytes of memory, repeated text and data counted");
}

} // namespace velmora
