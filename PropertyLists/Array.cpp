// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Array.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace velmora {

void Array::append(Value value) {
    expectMutable();
    _values.push_back(std::move(value));
}

Value& Array::slot(std::size_t index) {
    expectMutable();
    if (index == _values.size())
        _values.emplace_back();
    return _values[index];
}

void Array::truncate(std::size_t count) {
    expectMutable();
    if (count < _values.size())
        _values.erase(_values.begin() + static_cast<std::ptrdiff_t>(count), _values.end());
}

void Array::removeFirst(std::size_t count) {
    expectMutable();
    const auto last = static_cast<std::ptrdiff_t>(std::min(count, _values.size()));
    _values.erase(_values.begin(), _values.begin() + last);
}

ArrayRef Array::frozenCopy() const {
    const ArrayRef copy = makeArray();
    copy->_values.reserve(_values.size());
    for (const Value& value : _values)
        copy->_values.push_back(value.copy());
    copy->_frozen = true;
    return copy;
}

void Array::expectMutable() const {
    if (_frozen)
        throw std::logic_error("a frozen array cannot be changed");
}

} // namespace velmora
