// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/KeyReader.h"

#include "Platform/UTF8.h"

#include <algorithm>
#include <iterator>

namespace velmora {

namespace {

/// The longest sequence that a key sends, and more.
constexpr std::size_t longestSequence = 16;

struct Sequence {
    std::string_view bytes;
    Key key;
};

// xterm's sequences, and those of the terminals that differ from it (ECMA-48 5.4 has their form).
constexpr Sequence sequences[] = {
    {"\x1b[A", Key::Up},      {"\x1bOA", Key::Up},        {"\x1b[B", Key::Down},    {"\x1bOB", Key::Down},
    {"\x1b[C", Key::Right},   {"\x1bOC", Key::Right},     {"\x1b[D", Key::Left},    {"\x1bOD", Key::Left},
    {"\x1b[5~", Key::PageUp}, {"\x1b[6~", Key::PageDown}, {"\x1b[H", Key::Home},    {"\x1bOH", Key::Home},
    {"\x1b[1~", Key::Home},   {"\x1b[7~", Key::Home},     {"\x1b[F", Key::End},     {"\x1bOF", Key::End},
    {"\x1b[4~", Key::End},    {"\x1b[8~", Key::End},      {"\x1b[Z", Key::BackTab}, {"\x1bOM", Key::Enter},
    {"\x1b", Key::Escape},    {"\r", Key::Enter},         {"\n", Key::Enter},       {"\t", Key::Tab},
    {"\x7f", Key::Backspace}, {"\b", Key::Backspace},     {"\x15", Key::EraseLine}, {"\x0c", Key::Redraw},
    {"\x1a", Key::Suspend},   {"\x03", Key::Interrupt},   {"\x02", Key::PageUp},    {"\x06", Key::PageDown},
};

/// The length of the character that begins with that byte; 1 for what begins none.
std::size_t characterLength(char first) {
    const auto byte = static_cast<unsigned char>(first);
    if (byte >= 0xF0 && byte < 0xF5)
        return 4;
    if (byte >= 0xE0 && byte < 0xF0)
        return 3;
    return byte >= 0xC2 && byte < 0xE0 ? 2 : 1;
}

} // namespace

std::size_t KeyReader::lengthOfFirst() const {
    if (_pending[0] != '\x1b') {
        const std::size_t length = characterLength(_pending[0]);
        return length <= _pending.size() ? length : 0;
    }
    if (_pending.size() == 1)
        return 0;
    if (_pending[1] != '[' && _pending[1] != 'O')
        return 1; // Escape, then another key
    const auto end = std::find_if(_pending.begin() + 2, _pending.end(),
                                  [](char each) { return each >= '@' && each <= '~'; });
    if (end != _pending.end())
        return static_cast<std::size_t>(end - _pending.begin()) + 1;
    return _pending.size() < longestSequence ? 0 : _pending.size();
}

std::optional<KeyPress> KeyReader::keyOf(std::string_view bytes) {
    const auto known = std::find_if(std::begin(sequences), std::end(sequences),
                                    [bytes](const Sequence& each) { return each.bytes == bytes; });
    if (known != std::end(sequences))
        return KeyPress{known->key};
    if (static_cast<unsigned char>(bytes[0]) < ' ' || firstInvalidUTF8(bytes))
        return std::nullopt;
    return KeyPress{Key::Character, std::string(bytes)};
}

std::vector<KeyPress> KeyReader::take(std::string_view bytes) {
    std::vector<KeyPress> keys;
    _pending += bytes;
    while (!_pending.empty()) {
        const std::size_t length = lengthOfFirst();
        if (length == 0)
            break;
        if (std::optional<KeyPress> key = keyOf(std::string_view(_pending).substr(0, length)))
            keys.push_back(*std::move(key));
        _pending.erase(0, length);
    }
    return keys;
}

std::vector<KeyPress> KeyReader::finish() {
    const bool isEscape = _pending == "\x1b";
    _pending.clear();
    return isEscape ? std::vector<KeyPress>{{Key::Escape}} : std::vector<KeyPress>();
}

} // namespace velmora
