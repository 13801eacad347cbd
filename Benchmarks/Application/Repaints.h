// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QObject>

#include <cstddef>
#include <cstdint>
#include <vector>

class QEvent;

namespace velmora {

/// Notes when the application's windows have been painted. With messages that arrive evenly, the time from
/// one repaint to the next is how long a message waits for the screen: not at all if it arrives last, all of
/// it if it arrives right after a repaint.
class Repaints : public QObject {
public:
    void clear() { _at_us.clear(); }
    /// How long messages have waited, in order, one of them each 10 ms.
    [[nodiscard]] std::vector<double> waits_ms() const;
    [[nodiscard]] std::size_t count() const { return _at_us.size(); }

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    std::vector<std::int64_t> _at_us;
};

} // namespace velmora
