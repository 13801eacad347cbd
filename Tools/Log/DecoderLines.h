// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace velmora {

/// Counts a decoder's log lines instead of writing each: "1,291 messages of 0xB0C1: unknown log message".
/// Lines that differ in their numbers only are of one kind, and a kind keeps the text of its first line.
/// Lines about objects of the program, made and destroyed, are left out. Memory is bounded for any lines.
/// Main thread only.
class DecoderLines {
public:
    /// Further kinds are counted together.
    static constexpr std::size_t maximumKinds = 200;
    /// Longer texts are cut.
    static constexpr std::size_t maximumLength = 500;

    /// `verbose`: takes no line, so that all of them are written as they arise.
    explicit DecoderLines(bool verbose = false) : _verbose(verbose) {}

    /// Counts a line or leaves it out. False where the caller has to write it.
    [[nodiscard]] bool take(int priority, std::string_view text);

    /// Writes what has been counted to the log, in the order of the first lines, and begins anew. `title` is
    /// put before each line where it is not empty.
    void report(const std::string& title = {});

private:
    struct Kind {
        int priority = 0;
        std::string subject; ///< " of 0xB0C1", or empty
        std::string text;    ///< of the first line, without the log code
        std::uint64_t lines = 0;
        bool varies = false; ///< the lines differ in their numbers
    };

    [[nodiscard]] static std::string sum(const Kind& kind);

    bool _verbose;
    bool _reporting = false;
    std::string _key; ///< kept for its storage
    std::unordered_map<std::string, std::size_t> _indexes;
    std::vector<Kind> _kinds;
    std::uint64_t _otherLines = 0;
};

} // namespace velmora
