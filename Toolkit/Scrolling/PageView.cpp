// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Scrolling/PageView.h"

#include "Toolkit/Widgets/Scrolling/PageWidget.h"

#include <QScrollBar>

#include <cmath>

namespace velmora {

PageView::PageView() : View(new PageWidget), _page(static_cast<PageWidget*>(widget())) {}

PageView::~PageView() = default;

void PageView::setContentHeight(double height) {
    _page->setContentHeight(static_cast<int>(std::ceil(height)));
}

double PageView::contentWidth() const {
    return bounds().width;
}

double PageView::contentOffset() const {
    return _page->verticalScrollBar()->value();
}

void PageView::setContentOffset(double y) {
    _page->verticalScrollBar()->setValue(static_cast<int>(std::round(y)));
}

QWidget* PageView::subviewWidget() const {
    return _page->widget();
}

} // namespace velmora
