// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <memory>
#include <unordered_map>

namespace velmora {

/// Copies a decoder's state so that another decoder can continue in the copy. Nodes that are shared inside
/// the state are shared inside the copy in the same way, and can be changed there, unlike those of
/// `Value::copy`. What is frozen, and the template, which no decoder changes, is shared with the original.
/// Main thread only.
class StateCopy {
public:
    explicit StateCopy(const Dictionary& state);

    [[nodiscard]] Dictionary take() { return std::move(_copy); }
    /// About how much memory the copy needs by itself, in bytes.
    [[nodiscard]] std::size_t size() const { return _size; }

private:
    [[nodiscard]] Value copyOf(const Value& value);
    [[nodiscard]] DictionaryRef copyOf(const Dictionary& dictionary);
    [[nodiscard]] ArrayRef copyOf(const Array& array);

    std::unordered_map<const void*, Value> _copied;
    Dictionary _copy;
    std::size_t _size = 0;
};

} // namespace velmora
