// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Display/ChangingPlace.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// Where a path leads in a display, as far as that does not change: to which of its changing places, and from
/// there on. Found once for each display.
class ColumnPlace {
public:
    /// `path`, `display` and what the places belong to must outlive it.
    ColumnPlace(std::string_view path, const Value& display, std::span<const ChangingPlace> places);

    /// The indices of the places on which the column's cell depends, some perhaps twice.
    [[nodiscard]] const std::vector<std::size_t>& places() const { return _places; }
    /// Whether the path leads nowhere but through one place, at the value that is there now (none: at none).
    [[nodiscard]] bool isSingle() const { return !_isManifold && _starts == 1; }
    /// Precondition: isSingle().
    [[nodiscard]] const Value& start() const {
        const auto entry = _dictionary->begin() + static_cast<std::ptrdiff_t>(_index);
        return _index < _dictionary->size() && entry->key == _key ? entry->value : (*_dictionary)[_key];
    }
    /// What is left of the path from there on; empty for what is there itself.
    [[nodiscard]] std::string_view rest() const { return _rest; }

private:
    void look(const Dictionary& dictionary, std::string_view rest, bool atRoot,
              std::span<const ChangingPlace> places);
    /// Whether there is a changing place; then the column depends on it.
    bool dependOn(const Dictionary& dictionary, std::string_view key, std::span<const ChangingPlace> places);
    void dependOnAllIn(const Value& value, std::span<const ChangingPlace> places);

    std::vector<std::size_t> _places;
    bool _isManifold = false; ///< to be looked up in the whole display
    std::size_t _starts = 0;
    const Dictionary* _dictionary = nullptr; ///< of the start, and its index and key there
    std::size_t _index = 0;
    std::string_view _key;
    std::string_view _rest;
};

} // namespace velmora
