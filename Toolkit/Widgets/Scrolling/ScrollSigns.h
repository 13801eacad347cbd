// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

namespace velmora {

/// Lies over what scrolls sideways and shows at which edges the content goes on: there the text fades into
/// the ground, with a chevron on it. Takes no input.
class ScrollSigns : public QWidget {
public:
    /// `content` moves below it, in the same parent.
    ScrollSigns(QWidget& parent, const QWidget& content);

    [[nodiscard]] bool goesOnAtLeft() const;
    [[nodiscard]] bool goesOnAtRight() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    [[nodiscard]] QColor ground() const;

    const QWidget& _content;
};

} // namespace velmora
