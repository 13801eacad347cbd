// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Bars/NoticeBar.h"

#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Text/WrappedLabel.h"

#include <QPainter>
#include <QPushButton>
#include <QStyle>

#include <algorithm>

namespace velmora {

namespace {

constexpr int margin = 12;
constexpr int marginAbove = 8;
constexpr int gap = 12;
constexpr int buttonHeight = 44;
/// Less room for the text puts the button below it.
constexpr int leastTextWidth = 160;

} // namespace

NoticeBar::NoticeBar() : _text(new WrappedLabel), _button(new QPushButton(this)) {
    setObjectName("velmora.noticeBar");
    setAutoFillBackground(true);
    _text->setParent(this);
    _text->setObjectName("velmora.notice");
    _text->setFont(toQt(Font::systemFontOfSize(14)));
    _button->setObjectName("velmora.noticeButton");
    _button->setAutoDefault(true); // Enter presses it, as Space does
    QObject::connect(_button, &QPushButton::clicked, this, [this] {
        const std::function<void()> action = _action; // the call may set another notice
        if (action)
            action();
    });
    hide();
}

void NoticeBar::setNotice(const Notice& notice) {
    const QString text = toQt(notice.text);
    const bool isNew = !notice.text.empty() && (isHidden() || text != _text->text());
    _text->setText(text);
    _text->setAccessibleName(text);
    _button->setText(toQt(notice.title).replace(u'&', QStringLiteral("&&"))); // no mnemonic
    _button->setVisible(!notice.title.empty());
    _action = notice.action;
    setVisible(!notice.text.empty());
    if (isNew)
        announce(*_text, QAccessible::Alert);
}

bool NoticeBar::isBeside(int width) const {
    return width - 2 * margin - gap - _button->sizeHint().width() >= leastTextWidth;
}

int NoticeBar::textWidth(int width) const {
    const bool sharesRow = !_button->isHidden() && isBeside(width);
    return width - 2 * margin - (sharesRow ? gap + _button->sizeHint().width() : 0);
}

int NoticeBar::heightForWidth(int width) const {
    const int text = _text->heightForWidth(textWidth(width));
    if (_button->isHidden())
        return text + 2 * marginAbove;
    return 2 * marginAbove +
           (isBeside(width) ? std::max(text, buttonHeight) : text + marginAbove + buttonHeight);
}

void NoticeBar::resizeEvent(QResizeEvent* /*event*/) {
    const QRect room = rect().adjusted(margin, marginAbove, -margin, -marginAbove);
    if (_button->isHidden()) {
        _text->setGeometry(room);
    } else if (isBeside(width())) {
        const int button = _button->sizeHint().width();
        _text->setGeometry(room.adjusted(0, 0, -button - gap, 0));
        _button->setGeometry(room.right() + 1 - button, room.center().y() - buttonHeight / 2, button,
                             buttonHeight);
    } else {
        _text->setGeometry(room.adjusted(0, 0, 0, -buttonHeight - marginAbove));
        _button->setGeometry(room.left(), room.bottom() + 1 - buttonHeight, room.width(), buttonHeight);
    }
    for (QWidget* const part : {static_cast<QWidget*>(_text), static_cast<QWidget*>(_button)})
        part->setGeometry(QStyle::visualRect(layoutDirection(), rect(), part->geometry()));
}

void NoticeBar::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    QColor tint = palette().color(QPalette::Highlight);
    tint.setAlphaF(0.18F);
    painter.fillRect(rect(), tint);
    QColor line = palette().color(QPalette::WindowText);
    line.setAlphaF(0.22F);
    const double hair = 1 / devicePixelRatioF();
    painter.fillRect(QRectF(0, height() - hair, width(), hair), line);
}

} // namespace velmora
