// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Navigation/HeaderButton.h"

namespace velmora {

/// A command of the screen, at the trailing edge of the header.
class CommandButton : public HeaderButton {
public:
    explicit CommandButton(QWidget* parent);
    [[nodiscard]] QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace velmora
