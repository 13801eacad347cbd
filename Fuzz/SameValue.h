#pragma once

#include "Platform/PropertyList.h"

namespace velmora {

/// Whether two values show and are saved the same. Unlike ==, it takes a real that is no number for one that
/// is none either.
[[nodiscard]] inline bool sameValue(const Value& a, const Value& b) {
    if (a == b)
        return true;
    const auto binaryA = writeBinaryPropertyList(a);
    const auto binaryB = writeBinaryPropertyList(b);
    return binaryA && binaryB && *binaryA == *binaryB;
}

} // namespace velmora
