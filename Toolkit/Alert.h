// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// A notice with a title, a message and one button. `show` puts it over the program's window and returns at
/// once; it then stays until the user closes it, also when this object is gone. It closes with its window.
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
