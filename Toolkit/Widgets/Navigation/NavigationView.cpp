// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/NavigationView.h"

#include <QWidget>

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

namespace {

constexpr double barHeight = 52;

} // namespace

NavigationView::NavigationView() : _header(new HeaderBar), _notice(new NoticeBar), _toolbar(new Toolbar) {
    widget()->setObjectName("velmora.navigation");
    setBackgroundColor(Color::ground);
    _header->setParent(widget());
    _notice->setParent(widget());
    _notice->hide();
    addSubview(_container);
    _toolbar->setParent(widget());
    _toolbar->hide();
}

NavigationView::~NavigationView() = default;

void NavigationView::setToolbarHidden(bool isHidden) {
    _toolbar->setVisible(!isHidden);
    layoutSubviews();
}

void NavigationView::setNotice(const Notice& notice) {
    _notice->setNotice(notice);
    layoutSubviews();
}

void NavigationView::setAccessories(const std::vector<View*>& views) {
    for (View* const gone : _accessories)
        gone->removeFromSuperview();
    _accessories = views;
    for (View* const view : views)
        addSubview(*view);
    layoutSubviews();
}

double NavigationView::heightOf(const View& accessory) const {
    const QWidget& widget = *accessory.widget();
    return widget.hasHeightForWidth() ? widget.heightForWidth(static_cast<int>(std::lround(bounds().width)))
                                      : accessory.frame().height;
}

void NavigationView::fitHeader() {
    if (_header->fitWidth(static_cast<int>(std::lround(bounds().width))) != _header->height())
        layoutSubviews();
}

void NavigationView::showPane(View& pane, View* old, bool isPush, bool animated,
                              std::function<void()> atEnd) {
    finish();
    if (_pane && _pane != &pane && _pane != old)
        _pane->removeFromSuperview();
    _pane = &pane;
    _old = old == &pane ? nullptr : old;
    _isPush = isPush;
    _container.addSubview(pane);
    pane.setFrame(_container.bounds());
    if (_old) {
        (isPush ? pane : *_old).widget()->raise();
        _old->widget()->setAttribute(Qt::WA_TransparentForMouseEvents);
    }
    _animation.start(
        animated && _old, [this](double part) { placePane(part); },
        [this, ended = std::move(atEnd)] {
            if (View* const gone = std::exchange(_old, nullptr)) {
                gone->widget()->setAttribute(Qt::WA_TransparentForMouseEvents, false);
                gone->removeFromSuperview();
            }
            ended();
        });
}

void NavigationView::removePane() {
    finish();
    if (View* const gone = std::exchange(_pane, nullptr))
        gone->removeFromSuperview();
}

void NavigationView::finish() {
    _animation.finish();
}

/// The upper one of the two travels the entire width, the lower one a third of it.
void NavigationView::placePane(double part) const {
    const double width = bounds().width;
    const double side = widget()->isRightToLeft() ? -1 : 1;
    const auto put = [side](const View* view, double x) {
        if (view)
            view->widget()->move(static_cast<int>(std::lround(side * x)), 0);
    };
    put(_pane, _isPush ? width * (1 - part) : width / 3 * (part - 1));
    put(_old, _isPush ? width / 3 * -part : width * part);
}

void NavigationView::layoutSubviews() {
    finish();
    const double below = _toolbar->isHidden() ? 0 : barHeight;
    const auto whole = [](double value) { return static_cast<int>(std::lround(value)); };
    const double header = _header->fitWidth(whole(bounds().width));
    _header->setGeometry(0, 0, whole(bounds().width), whole(header));
    _toolbar->setGeometry(0, whole(bounds().height - below), whole(bounds().width), whole(barHeight));
    double bottom = bounds().height - below;
    for (auto view = _accessories.rbegin(); view != _accessories.rend(); ++view) {
        const double height = heightOf(**view);
        bottom -= height;
        (*view)->setFrame({0, bottom, bounds().width, height});
    }
    const double room = std::max(bottom - header, 0.0);
    // However long its text, the notice leaves half of the room to the pane.
    const double notice =
        _notice->isHidden() ? 0 : std::min<double>(_notice->heightForWidth(whole(bounds().width)), room / 2);
    _notice->setGeometry(0, whole(header), whole(bounds().width), whole(notice));
    _container.setFrame({0, header + notice, bounds().width, room - notice});
    if (_pane)
        _pane->setFrame(_container.bounds());
}

} // namespace velmora
