// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QLabel>

class QTextLayout;

namespace velmora {

/// Plain text on as many lines as it needs. A word that is wider than the label, such as a path, is broken.
class WrappedLabel : public QLabel {
public:
    WrappedLabel();

    [[nodiscard]] int heightForWidth(int width) const override;
    [[nodiscard]] bool hasHeightForWidth() const override { return true; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    /// The text as it is broken: never after the dashes of an option in a command.
    [[nodiscard]] QString brokenText() const;
    /// Breaks the lines of `layout`, which has the text, and returns their height.
    double breakLines(QTextLayout& layout, int width) const;
};

} // namespace velmora
