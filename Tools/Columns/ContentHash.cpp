// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ContentHash.h"

#include <xxhash.h>

#include <new>
#include <string_view>

namespace velmora {

struct ContentHash::State {
    XXH3_state_t* state = XXH3_createState();

    State() {
        if (!state)
            throw std::bad_alloc();
        XXH3_128bits_reset(state);
    }
    ~State() { XXH3_freeState(state); }
    State(const State&) = delete;
    State& operator=(const State&) = delete;
};

ContentHash::ContentHash() : _state(std::make_unique<State>()) {}

ContentHash::~ContentHash() = default;

void ContentHash::add(Bytes bytes) {
    XXH3_128bits_update(_state->state, bytes.data(), bytes.size());
}

std::string ContentHash::digits() const {
    XXH128_canonical_t canonical;
    XXH128_canonicalFromHash(&canonical, XXH3_128bits_digest(_state->state));
    constexpr std::string_view digits = "0123456789abcdef";
    std::string text;
    for (const unsigned char byte : canonical.digest) {
        text += digits[byte >> 4U];
        text += digits[byte & 0xFU];
    }
    return text;
}

} // namespace velmora
