// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Bars/PlaybackBar.h"

#include "Toolkit/Widgets/Bars/PlaybackBarWidget.h"

#include <utility>

namespace velmora {

PlaybackBar::PlaybackBar(const std::vector<std::string>& speeds)
    : View(new PlaybackBarWidget(speeds)), _bar(static_cast<PlaybackBarWidget*>(widget())) {}

PlaybackBar::~PlaybackBar() {
    _bar->actions = {};
}

void PlaybackBar::setActions(Actions actions) {
    _bar->actions = std::move(actions);
}

void PlaybackBar::show(const Shown& shown) {
    _bar->show(shown);
}

} // namespace velmora
