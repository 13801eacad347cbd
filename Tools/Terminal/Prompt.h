// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/KeyPress.h"

#include <cstdint>
#include <functional>
#include <string>
#include <utility>

namespace velmora {

/// A line that the user types at the bottom of the screen.
class Prompt {
public:
    /// `done` gets the text when it is finished with Enter.
    Prompt(std::string question, std::string text, std::function<void(const std::string&)> done)
        : _question(std::move(question)), _text(std::move(text)), _done(std::move(done)) {}

    enum class Outcome : std::uint8_t { GoesOn, Cancelled, Finished };
    [[nodiscard]] Outcome take(const KeyPress& press);
    void finish() const { _done(_text); }

    /// Question and text, printable, and a cursor after them.
    [[nodiscard]] std::string line() const;
    /// A longer one is not taken.
    static constexpr std::size_t mostBytes = 1024;

private:
    std::string _question;
    std::string _text;
    std::function<void(const std::string&)> _done;
};

} // namespace velmora
