// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Text/WrappedLabel.h"

namespace velmora {

/// What a table without rows says in the middle of its room.
class EmptyLabel : public WrappedLabel {
public:
    explicit EmptyLabel(QWidget& viewport);
    /// Fills the viewport if it is to be seen and has a text.
    void setWanted(bool isWanted);
};

} // namespace velmora
