// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Comments.h"

#include <utility>

namespace velmora {

void Comments::add(Comment comment) {
    ++_count;
    const bool isNewKept = _new.size() < maximumKept;
    const bool isFirstKept = _first.size() < maximumKept;
    if (!isNewKept && !isFirstKept)
        return;
    if (comment.text.size() > maximumLength)
        comment.text.resize(maximumLength);
    if (isFirstKept)
        _first.push_back(comment);
    if (isNewKept)
        _new.push_back(std::move(comment));
}

} // namespace velmora
