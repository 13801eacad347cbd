// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"

namespace velmora {

class PageWidget;

/// Shows a part of something higher: its subviews lie on a page as wide as the view, which moves up and down
/// under a finger, with the wheel, and as far as the subview that gets the keyboard focus needs it.
class PageView : public View {
public:
    PageView();
    ~PageView() override;

    /// At least the view's own height.
    void setContentHeight(double height);
    /// The width that subviews have.
    [[nodiscard]] double contentWidth() const;
    [[nodiscard]] double contentOffset() const;
    void setContentOffset(double y);

protected:
    [[nodiscard]] QWidget* subviewWidget() const override;

private:
    PageWidget* _page;
};

} // namespace velmora
