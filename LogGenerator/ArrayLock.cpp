// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/ArrayLock.h"

namespace velmora {

ArrayLock::State& ArrayLock::initialize() {
    static State state;
    return state;
}

void ArrayLock::lockArray() {
    State& state = initialize();
    state.mutex.lock();
    ++state.depth;
}

void ArrayLock::unlockArray() {
    State& state = initialize();
    // Only the outermost unlock releases, and it releases once: see the class comment.
    if (--state.depth == 0)
        state.mutex.unlock();
}

std::uint8_t ArrayLock::depth() {
    return initialize().depth;
}

} // namespace velmora
