// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QFont>
#include <QStringList>

namespace velmora {

/// The text as it is drawn in that width: on one line if it fits, else broken, between words where there are
/// some, into at most so many lines, the last of which has an ellipsis where there is still too much.
[[nodiscard]] QStringList linesOfText(const QString& text, const QFont& font, double width, int maximum,
                                      Qt::TextElideMode elideMode);

} // namespace velmora
