// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Scrolling/ScrollView.h"

#include "Toolkit/Widgets/Scrolling/ScrollWidget.h"

namespace velmora {

ScrollView::ScrollView() : View(new ScrollWidget), _scroller(static_cast<ScrollWidget*>(widget())) {}

ScrollView::~ScrollView() = default;

Size ScrollView::contentSize() const {
    return {_scroller->contentSize().width(), _scroller->contentSize().height()};
}

void ScrollView::setContentSize(const Size& size) {
    _scroller->setContentSize({size.width, size.height});
}

double ScrollView::contentOffset() const {
    return _scroller->offset();
}

void ScrollView::setContentOffset(double x) {
    _scroller->setOffset(x);
}

double ScrollView::maximumOffset() const {
    return _scroller->maximumOffset();
}

QWidget* ScrollView::subviewWidget() const {
    return _scroller->content();
}

} // namespace velmora
