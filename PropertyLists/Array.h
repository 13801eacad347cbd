// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <initializer_list>
#include <memory>
#include <vector>

namespace velmora {

/// An ordered list of values. A frozen array (one made by `Value::copy`) throws std::logic_error when
/// changed.
class Array {
public:
    Array() = default;
    Array(std::initializer_list<Value> values) : _values(values) {}

    [[nodiscard]] std::size_t size() const { return _values.size(); }
    [[nodiscard]] bool empty() const { return _values.empty(); }
    /// Precondition: index < size().
    [[nodiscard]] const Value& operator[](std::size_t index) const { return _values[index]; }
    [[nodiscard]] auto begin() const { return _values.begin(); }
    [[nodiscard]] auto end() const { return _values.end(); }

    void append(Value value);
    /// The value at `index`, to be changed; for index == size() a new one, which is none.
    [[nodiscard]] Value& slot(std::size_t index);
    void clear() { truncate(0); }
    /// Removes all values from `count` on.
    void truncate(std::size_t count);
    /// Removes the first `count` values (all of them where there are fewer).
    void removeFirst(std::size_t count);
    void reserve(std::size_t count) { _values.reserve(count); }

    /// A deep, frozen copy.
    [[nodiscard]] ArrayRef frozenCopy() const;
    [[nodiscard]] bool isFrozen() const { return _frozen; }

private:
    void expectMutable() const;

    std::vector<Value> _values;
    bool _frozen = false;
};

[[nodiscard]] inline ArrayRef makeArray() {
    return std::make_shared<Array>();
}

} // namespace velmora
