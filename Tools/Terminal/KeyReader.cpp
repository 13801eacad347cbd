// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/KeyReader.h"

#include <algorithm>
#include <cstddef>
#include <iterator>

namespace velmora {

namespace {

/// The longest sequence that a key sends, and more.
constexpr std::size_t longestSequence = 16;

} // namespace

std::vector<Key> KeyReader::take(std::string_view bytes) {
    struct Sequence {
        std::string_view bytes;
        Key key;
    };
    static constexpr Sequence sequences[] = {
        {"k", Key::Up},         {"\x1b[A", Key::Up},   {"\x1bOA", Key::Up},      {"j", Key::Down},
        {"\x1b[B", Key::Down},  {"\x1bOB", Key::Down}, {"\x1b[5~", Key::PageUp}, {"\x1b[6~", Key::PageDown},
        {" ", Key::PageDown},   {"\x1b[H", Key::Home}, {"\x1bOH", Key::Home},    {"\x1b[1~", Key::Home},
        {"\x1b[7~", Key::Home}, {"\x1b[F", Key::End},  {"\x1bOF", Key::End},     {"\x1b[4~", Key::End},
        {"\x1b[8~", Key::End},  {"q", Key::Quit},      {"\x03", Key::Quit},
    };
    std::vector<Key> keys;
    _pending += bytes;
    while (!_pending.empty()) {
        const auto whole =
            std::find_if(std::begin(sequences), std::end(sequences),
                         [this](const Sequence& sequence) { return _pending.starts_with(sequence.bytes); });
        if (whole != std::end(sequences)) {
            keys.push_back(whole->key);
            _pending.erase(0, whole->bytes.size());
            continue;
        }
        const bool begun =
            std::any_of(std::begin(sequences), std::end(sequences),
                        [this](const Sequence& sequence) { return sequence.bytes.starts_with(_pending); });
        if (begun)
            break;
        // An unknown key: its sequence is skipped as a whole, so that its last letter is not read as a key.
        std::size_t length = 1;
        if (_pending[0] == '\x1b' && _pending.size() > 1 && (_pending[1] == '[' || _pending[1] == 'O')) {
            const std::size_t end =
                _pending.find_first_of("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz~", 2);
            if (end == std::string::npos && _pending.size() < longestSequence)
                break;
            length = end == std::string::npos ? _pending.size() : end + 1;
        }
        _pending.erase(0, length);
    }
    return keys;
}

} // namespace velmora
