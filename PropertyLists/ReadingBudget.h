// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"

#include <cstddef>
#include <optional>
#include <string>

namespace velmora {

/// Counts what a reader makes of one list, before it is made, against the limits. A list is much shorter
/// than what it makes when it refers to the same object several times, so the input's size bounds nothing.
class ReadingBudget {
public:
    /// What a value is counted with beyond its text: a dictionary's entry with its place in the index, or an
    /// empty container, in a vector that has grown to twice its content.
    static constexpr std::size_t bytesAnObject = 256;

    explicit ReadingBudget(const PropertyListLimits& limits)
        : _limits(limits), _objects(limits.maximumObjects), _bytes(limits.maximumMemory) {}

    /// How many values and keys may still be made.
    [[nodiscard]] std::size_t objects() const { return _objects; }

    /// Each of these fails where a limit is exceeded, with the reason, which the log gets too where the
    /// limits say so.
    [[nodiscard]] std::optional<Failure> takeObject() {
        if (_objects == 0)
            return tooManyObjects();
        --_objects;
        return takeBytes(bytesAnObject);
    }
    /// For a text or data; for a key twice, since a dictionary keeps it in the entry and in the index.
    [[nodiscard]] std::optional<Failure> takeBytes(std::size_t size) {
        if (size > _bytes)
            return tooManyBytes();
        _bytes -= size;
        return std::nullopt;
    }

    [[nodiscard]] Failure tooManyObjects() const;
    [[nodiscard]] Failure tooManyBytes() const;

private:
    const PropertyListLimits& _limits;
    std::size_t _objects;
    std::size_t _bytes;
};

/// The failure of a list that exceeds the limits, logged where these say so.
[[nodiscard]] Failure limitExceeded(const PropertyListLimits& limits, std::string reason);

} // namespace velmora
