// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/EmptyLabel.h"

#include "Toolkit/Widgets/Conversions.h"

namespace velmora {

namespace {

constexpr int sideMargin = 10;

} // namespace

EmptyLabel::EmptyLabel(QWidget& viewport) {
    setParent(&viewport);
    setObjectName("velmora.empty");
    setFont(toQt(Font::systemFontOfSize(15)));
    setAlignment(Qt::AlignCenter);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
}

void EmptyLabel::setWanted(bool isWanted) {
    setGeometry(parentWidget()->rect().adjusted(sideMargin, 0, -sideMargin, 0));
    setVisible(isWanted && !text().isEmpty());
}

} // namespace velmora
