// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/Application/Repaints.h"

#include "Benchmarks/Application/Figures.h"

#include <QEvent>
#include <QTimer>

#include <algorithm>

namespace velmora {

bool Repaints::eventFilter(QObject* object, QEvent* event) {
    // The request for a window comes before all of its widgets are painted, the timer after that.
    if (event->type() == QEvent::UpdateRequest && object->isWidgetType())
        QTimer::singleShot(0, this, [this] { _at_us.push_back(now_us()); });
    return false;
}

std::vector<double> Repaints::waits_ms() const {
    constexpr std::int64_t step_us = 10'000;
    std::vector<double> waits;
    for (std::size_t i = 1; i < _at_us.size(); ++i)
        for (std::int64_t arrival = _at_us[i - 1]; arrival < _at_us[i]; arrival += step_us)
            waits.push_back(static_cast<double>(_at_us[i] - arrival) / 1000);
    std::sort(waits.begin(), waits.end());
    return waits;
}

} // namespace velmora
