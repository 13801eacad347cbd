// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <stdexcept>
#include <string>

namespace velmora {

/// Something that is fed with hostile input. A fuzzer makes one and calls `run` for every input; the tests
/// feed it what fuzzers once found. What one input leaves behind must not reach the next. Main thread only.
class FuzzTarget {
public:
    FuzzTarget() = default;
    virtual ~FuzzTarget() = default;
    FuzzTarget(const FuzzTarget&) = delete;
    FuzzTarget& operator=(const FuzzTarget&) = delete;

    /// Feeds it one input. It is to return whatever the input holds: an exception that escapes is a finding,
    /// as is a crash, a hang, memory without bound and what the sanitizers report.
    virtual void run(Bytes input) = 0;
};

/// What a target did with an input, though not amiss by itself, is not what it promises.
class BrokenPromise : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Raises BrokenPromise with the promise's words unless it holds.
inline void require(bool holds, const char* promise) {
    if (!holds)
        throw BrokenPromise(promise);
}

} // namespace velmora
