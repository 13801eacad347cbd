// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// A text for people that a file holds beside its messages.
struct Comment {
    /// What it is about.
    enum class About : std::uint8_t {
        Snapshot,  ///< the snapshot: its description
        Section,   ///< a section of a recording
        Interface, ///< one of a recording's interfaces
        Message,   ///< a record
    };

    About about = About::Message;
    std::uint64_t number = 0; ///< of the section, interface or record, from 1
    std::uint64_t offset = 0; ///< where in the file its block begins
    std::string text;         ///< as it is in the file: UTF-8 where the file is well-formed
};

/// The first comments of a file, and the latest until they are taken. Memory is bounded for any file.
class Comments {
public:
    static constexpr std::size_t maximumKept = 100;
    /// Longer texts are cut.
    static constexpr std::size_t maximumLength = 4096;

    void add(Comment comment);

    /// In the file's order.
    [[nodiscard]] const std::vector<Comment>& first() const { return _first; }
    /// How many there are in all.
    [[nodiscard]] std::uint64_t count() const { return _count; }
    /// Those that were added since the last call, also ones that `first` has no place for; at most
    /// `maximumKept` of them.
    [[nodiscard]] std::vector<Comment> takeNew() { return std::exchange(_new, {}); }

private:
    std::vector<Comment> _first;
    std::vector<Comment> _new; ///< that have not been taken
    std::uint64_t _count = 0;
};

} // namespace velmora
