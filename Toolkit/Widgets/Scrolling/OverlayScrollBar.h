// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

class QAbstractScrollArea;

namespace velmora {

/// Takes the place of a scroll area's vertical bar while fingers use the area: a thin bar over the content
/// that shows how much there is and where one is, and takes neither room nor input. A mouse or a wheel brings
/// the ordinary bar back.
class OverlayScrollBar : public QWidget {
public:
    /// Owned by the area. From the start on screens that have nothing but fingers.
    explicit OverlayScrollBar(QAbstractScrollArea& area);

    [[nodiscard]] bool isActive() const { return _isActive; }
    /// The part that stands for what is seen of the content; empty where all is.
    [[nodiscard]] QRect handle() const;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void setActive(bool isActive);
    void follow();

    QAbstractScrollArea& _area;
    bool _isActive = false;
};

} // namespace velmora
