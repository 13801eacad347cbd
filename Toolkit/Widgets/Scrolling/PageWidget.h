// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointer>
#include <QScrollArea>

class QTouchEvent;

namespace velmora {

/// A page that scrolls up and down.
class PageWidget : public QScrollArea {
public:
    PageWidget();
    void setContentHeight(int height);

protected:
    bool viewportEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void touch(const QTouchEvent& event);
    void tap(const QPoint& place);
    void layoutPage();

    int _contentHeight = 0;
    bool _isTap = false;
};

} // namespace velmora
