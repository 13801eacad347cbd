// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <memory>
#include <string_view>
#include <utility>

namespace velmora {

/// Text whose storage is reused: it grows and is kept, so that a writer of many lines allocates nothing once
/// it has written the longest.
class TextBuffer {
public:
    /// `smallest`: the storage that there is from the first character on.
    explicit TextBuffer(std::size_t smallest = 1024) : _smallest(smallest) {}

    [[nodiscard]] std::string_view view() const { return {_characters.get(), _size}; }
    [[nodiscard]] std::size_t size() const { return _size; }
    void clear() { _size = 0; }
    /// Precondition: `size` is not above size().
    void truncate(std::size_t size) { _size = size; }

    /// The character at that index, to be changed, or the one after all that there is room for.
    [[nodiscard]] char* at(std::size_t index) { return _characters.get() + index; }

    void append(char character) {
        *room(1) = character;
        ++_size;
    }
    void append(std::string_view text) {
        std::memcpy(room(text.size()), text.data(), text.size());
        _size += text.size();
    }

    /// Room for the next `count` characters; `advance` makes them part of the text.
    [[nodiscard]] char* room(std::size_t count) {
        if (_capacity - _size < count || !_characters)
            grow(count);
        return _characters.get() + _size;
    }
    /// Precondition: no more than the latest `room` asked for.
    void advance(std::size_t count) { _size += count; }

private:
    void grow(std::size_t count) {
        const std::size_t capacity = std::max(_smallest, std::max(2 * _capacity, _size + count));
        auto characters = std::make_unique<char[]>(capacity);
        if (_size > 0)
            std::memcpy(characters.get(), _characters.get(), _size);
        _characters = std::move(characters);
        _capacity = capacity;
    }

    std::unique_ptr<char[]> _characters;
    std::size_t _size = 0;
    std::size_t _capacity = 0;
    std::size_t _smallest;
};

} // namespace velmora
