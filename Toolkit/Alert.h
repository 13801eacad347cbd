// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <vector>

namespace velmora {

/// A notice with a title, a message and one button, or a question with several. `show` opens it over the
/// program's window and returns immediately; it stays until the user closes it, also after this object's
/// destruction. It closes with its window.
class Alert {
public:
    Alert(std::string title, std::string message, std::string buttonTitle);
    /// Makes it a question: another button, which Enter presses if it is the first one added. The button of
    /// the constructor closes it without an answer, as Escape does.
    void addAnswer(std::string title, std::function<void()> answered);
    /// Each call shows a notice of its own.
    void show() const;

private:
    std::string _title;
    std::string _message;
    std::string _buttonTitle;
    struct Answer {
        std::string title;
        std::function<void()> answered;
    };
    std::vector<Answer> _answers;
};

} // namespace velmora
