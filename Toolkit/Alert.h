// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// A notice with a title, a message and one button. `show` opens it over the program's window and returns
/// immediately; it stays until the user closes it, also after this object's destruction. It closes with its
/// window.
class Alert {
public:
    Alert(std::string title, std::string message, std::string buttonTitle);
    /// Each call shows a notice of its own.
    void show() const;

private:
    std::string _title;
    std::string _message;
    std::string _buttonTitle;
};

} // namespace velmora
