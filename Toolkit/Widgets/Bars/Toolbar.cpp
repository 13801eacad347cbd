// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Bars/Toolbar.h"

#include "Toolkit/Bars/FlexibleSpace.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/SpinnerWidget.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QHBoxLayout>
#include <QPainter>
#include <QPushButton>

#include <algorithm>
#include <utility>

namespace velmora {

Toolbar::Toolbar() : _layout(new QHBoxLayout(this)) {
    setObjectName("velmora.toolbar");
    setAccessibleName(tr("Status"));
    setAutoFillBackground(true);
    _layout->setContentsMargins(12, 1, 12, 0);
    _layout->setSpacing(8);
}

Toolbar::~Toolbar() {
    for (const Place& place : _places)
        place.item->_onChange = nullptr;
}

void Toolbar::setItems(const std::vector<std::shared_ptr<ToolbarItem>>& items) {
    std::vector<Place> old = std::exchange(_places, {});
    for (const Place& place : old)
        place.item->_onChange = nullptr;
    for (const auto& item : items) {
        if (!item)
            continue;
        const Kind kind = kindOf(*item);
        const auto index = static_cast<int>(_places.size());
        const Place place{kind, item, takeWidget(old, kind)};
        if (const QLayoutItem* const there = _layout->itemAt(index);
            !there || there->widget() != place.widget) {
            _layout->removeWidget(place.widget);
            _layout->insertWidget(index, place.widget, kind == Kind::flexibleSpace ? 1 : 0);
        }
        fill(place);
        item->_onChange = [place] { fill(place); };
        _places.push_back(place);
    }
    for (const Place& place : old) {
        if (!place.widget)
            continue;
        _layout->removeWidget(place.widget);
        place.widget->hide();
        place.widget->deleteLater(); // it may be the button whose click led here
    }
}

void Toolbar::save() {
    for (const Place& place : _places)
        if (place.kind == Kind::saveButton) {
            static_cast<QPushButton*>(place.widget)->click();
            return;
        }
}

Toolbar::Kind Toolbar::kindOf(const ToolbarItem& item) {
    if (dynamic_cast<const BusyIndicator*>(&item))
        return Kind::busyIndicator;
    if (dynamic_cast<const LabelItem*>(&item))
        return Kind::label;
    return dynamic_cast<const SaveButton*>(&item) ? Kind::saveButton : Kind::flexibleSpace;
}

QWidget* Toolbar::takeWidget(std::vector<Place>& places, Kind kind) {
    const auto found = std::find_if(places.begin(), places.end(), [kind](const Place& place) {
        return place.widget && place.kind == kind;
    });
    return found == places.end() ? makeWidget(kind) : std::exchange(found->widget, nullptr);
}

QWidget* Toolbar::makeWidget(Kind kind) {
    switch (kind) {
    case Kind::busyIndicator: return new SpinnerWidget;
    case Kind::label: {
        auto* const label = new LabelWidget;
        label->setObjectName("velmora.status");
        label->setElideMode(Qt::ElideLeft); // the time, at its end, is what changes
        label->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
        return label;
    }
    case Kind::saveButton: {
        auto* const button = new QPushButton(tr("Save"));
        button->setObjectName("velmora.save");
        button->setAutoDefault(true); // Enter presses it, as Space does
        button->setMinimumSize(64, 44);
        button->setToolTip(
            tr("Save (%1)").arg(QKeySequence(QKeySequence::Save).toString(QKeySequence::NativeText)));
        connect(button, &QPushButton::clicked, this, [this, button] {
            for (const Place& place : _places)
                if (place.widget == button) {
                    const auto item = std::static_pointer_cast<SaveButton>(place.item);
                    item->press();
                    return;
                }
        });
        return button;
    }
    case Kind::flexibleSpace: break;
    }
    return new QWidget;
}

void Toolbar::fill(const Place& place) {
    switch (place.kind) {
    case Kind::busyIndicator: {
        const auto& indicator = static_cast<const BusyIndicator&>(*place.item);
        auto* const spinner = static_cast<SpinnerWidget*>(place.widget);
        spinner->setSpinning(indicator.isAnimating());
        spinner->setVisible(indicator.isAnimating() || !indicator.hidesWhenStopped());
        break;
    }
    case Kind::label: {
        const auto& item = static_cast<const LabelItem&>(*place.item);
        auto* const label = static_cast<LabelWidget*>(place.widget);
        label->setText(toQt(item.text()));
        label->setFont(toQt(item.font()));
        label->setTextColor(item.textColor());
        const Color ground = item.backgroundColor();
        label->setAutoFillBackground(ground != Color::clear && ground != Color::automatic);
        label->setBackgroundRole(toQt(ground, QPalette::NoRole));
        break;
    }
    case Kind::saveButton:
    case Kind::flexibleSpace: break;
    }
}

void Toolbar::paintEvent(QPaintEvent* /*event*/) {
    QColor line = palette().color(QPalette::WindowText);
    line.setAlphaF(0.22F);
    QPainter(this).fillRect(QRectF(0, 0, width(), 1 / devicePixelRatioF()), line);
}

} // namespace velmora
