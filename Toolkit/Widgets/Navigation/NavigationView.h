// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"
#include "Toolkit/Widgets/Animation.h"
#include "Toolkit/Widgets/Bars/NoticeBar.h"
#include "Toolkit/Widgets/Bars/Toolbar.h"
#include "Toolkit/Widgets/Navigation/HeaderBar.h"

#include <vector>

namespace velmora {

/// What a navigation stack looks like: header, notice where there is one, pane, accessories
/// where there are any, toolbar.
class NavigationView : public View {
public:
    NavigationView();
    ~NavigationView() override;

    [[nodiscard]] HeaderBar& header() { return *_header; }
    [[nodiscard]] Toolbar& toolbar() { return *_toolbar; }
    void setToolbarHidden(bool isHidden);
    void setNotice(const Notice& notice);
    /// Shows the views between pane and toolbar, the first on top: as high as they are, or as their widgets
    /// want to be at the width.
    void setAccessories(const std::vector<View*>& views);
    /// The header has another title, which may need another height.
    void fitHeader();

    /// Replaces the old pane (there may be none): sliding in from the right for a push, uncovered from the
    /// left otherwise. An earlier animation ends first.
    void showPane(View& pane, View* old, bool isPush, bool animated, std::function<void()> atEnd);
    /// Leaves the pane area empty.
    void removePane();
    /// Ends an animation in progress.
    void finish();

    void layoutSubviews() override;

private:
    void placePane(double part) const;
    [[nodiscard]] double heightOf(const View& accessory) const;

    HeaderBar* _header;
    NoticeBar* _notice;
    Toolbar* _toolbar;
    View _container;
    View* _pane = nullptr;
    View* _old = nullptr;
    std::vector<View*> _accessories;
    bool _isPush = true;
    Animation _animation;
};

} // namespace velmora
