// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace velmora {

/// One log code that a section subscribes to, and what it reads there: a table, or more than a table
/// describes, which the section's `decode` then names. A section's views are its subscriptions, in the order
/// of registration.
struct View {
    /// A table, which must be a constant.
    constexpr View(std::uint32_t logCode, const Layout& layout)
        : code(logCode), minimumLength(layout.minimumLength), readLength(layout.minimumLength),
          table(&layout) {}
    /// `decode` reads a record of at least this length and names these contents, a constant.
    constexpr View(std::uint32_t logCode, std::size_t minimum, std::span<const Content> shown)
        : code(logCode), minimumLength(minimum), readLength(SIZE_MAX), contents(shown) {}
    /// The same where nothing is named, or the section describes it otherwise (Base::describe); nothing past
    /// `read` bytes of the record is read.
    constexpr View(std::uint32_t logCode, std::size_t minimum, std::size_t read = SIZE_MAX)
        : code(logCode), minimumLength(minimum), readLength(read) {}

    std::uint32_t code;
    std::size_t minimumLength; ///< a shorter record is ignored without a log line
    std::size_t readLength;    ///< all that is kept of a longer record
    const Layout* table = nullptr;
    std::span<const Content> contents{}; ///< what `decode` may name; empty with a table
};

} // namespace velmora
