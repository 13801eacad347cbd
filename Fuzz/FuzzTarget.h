// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <stdexcept>
#include <string>

namespace velmora {

/// Code under fuzzing. A fuzzer makes one and calls `run` for every input; the tests run former findings.
/// State must not carry over from one input to the next. Main thread only.
class FuzzTarget {
public:
    FuzzTarget() = default;
    virtual ~FuzzTarget() = default;
    FuzzTarget(const FuzzTarget&) = delete;
    FuzzTarget& operator=(const FuzzTarget&) = delete;

    /// Runs one input. It must return for any input: an exception that escapes is a finding, as is a crash, a
    /// hang, memory without bound and what the sanitizers report.
    virtual void run(Bytes input) = 0;
};

/// An invariant of a target is violated.
class BrokenInvariant : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Throws BrokenInvariant with the invariant's text unless it holds.
inline void require(bool holds, const char* invariant) {
    if (!holds)
        throw BrokenInvariant(invariant);
}

} // namespace velmora
