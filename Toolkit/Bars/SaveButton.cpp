// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Bars/SaveButton.h"

#include <utility>

namespace velmora {

SaveButton::SaveButton(std::function<void()> action) : _action(std::move(action)) {}

void SaveButton::press() const {
    const std::function<void()> action = _action; // which may outlive this button
    if (action)
        action();
}

} // namespace velmora
