// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Navigation/HeaderButton.h"

namespace velmora {

/// The way back: a chevron and the title of the screen below, as far as there is room.
class BackButton : public HeaderButton {
public:
    explicit BackButton(QWidget* parent);
    [[nodiscard]] QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace velmora
