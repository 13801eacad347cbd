// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QApplication>
#include <QEvent>
#include <QObject>

#include <algorithm>
#include <cstdint>
#include <vector>

namespace velmora {

/// Of a clock that is the same in all processes.
[[nodiscard]] std::int64_t now_us();
/// Of this process.
[[nodiscard]] double residentMiB();
[[nodiscard]] double processorTime_ms();
/// Makes the window so wide that the drive view stands beside the panes.
void widen();

/// Notes when the first paint event of the process has been handled.
class FirstPaint : public QObject {
public:
    std::int64_t at_us = 0;

protected:
    bool eventFilter(QObject*, QEvent* event) override {
        if (event->type() == QEvent::Paint && at_us == 0)
            at_us = now_us();
        return false;
    }
};

/// What a process reports of its start.
struct Figures {
    double start_ms = 0;
    double resident_MiB = 0;
    double redraw_ms = 0;
};

/// Redraws that a median is taken of.
inline constexpr int medianOf = 21;

/// Of one redraw, with what follows from it in the event loop.
template <class Redraw>
double medianRedraw_ms(Redraw redraw) {
    std::vector<double> times;
    for (int i = 0; i < medianOf; ++i) {
        const std::int64_t begun = now_us();
        redraw(i);
        QApplication::processEvents();
        times.push_back(static_cast<double>(now_us() - begun) / 1000);
    }
    std::nth_element(times.begin(), times.begin() + medianOf / 2, times.end());
    return times[medianOf / 2];
}

} // namespace velmora
