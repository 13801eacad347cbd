// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"

namespace velmora {

class ScrollWidget;

/// Shows a part of something wider: its subviews lie on a content area that moves sideways under a finger,
/// with Shift and the wheel, and - in a table row - with the left and right arrows. Frames of subviews are in
/// the content's coordinates. A content that is not wider than the frame does not move.
class ScrollView : public View {
public:
    ScrollView();
    ~ScrollView() override;

    [[nodiscard]] Size contentSize() const;
    void setContentSize(const Size& size);

    /// How far the content has moved from where it begins: 0 to `maximumOffset`.
    [[nodiscard]] double contentOffset() const;
    void setContentOffset(double x);
    /// How far the content can move: its width less the frame's, at least 0.
    [[nodiscard]] double maximumOffset() const;

protected:
    [[nodiscard]] QWidget* subviewWidget() const override;

private:
    ScrollWidget* _scroller;
};

} // namespace velmora
