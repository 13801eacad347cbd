// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Comments.h"

#include <utility>

namespace velmora {

void Comments::add(Comment comment) {
    ++_count;
    if (_first.size() == maximumKept)
        return;
    if (comment.text.size() > maximumLength)
        comment.text.resize(maximumLength);
    _first.push_back(std::move(comment));
}

} // namespace velmora
