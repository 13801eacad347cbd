// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QObject>
#include <QPointer>

#include <functional>

class QVariantAnimation;

namespace velmora {

/// Whether things may move by themselves: neither the user's style nor the environment
/// (VELMORA_REDUCED_MOTION set to anything but 0) asks for reduced motion.
[[nodiscard]] bool wantsMotion();

/// One movement at a time, from 0 to 1, that can be cut short. Its owner may be destroyed by what it calls.
class Motion {
public:
    using Step = std::function<void(double)>;

    Motion() = default;
    /// Cuts short without calling anything.
    ~Motion();
    Motion(const Motion&) = delete;
    Motion& operator=(const Motion&) = delete;

    /// Ends an earlier movement first. Steps as long as the movement lasts, the last step being 1, then calls
    /// `atEnd`; does both at once when not animated or when no motion is wanted.
    void start(bool animated, Step step, std::function<void()> atEnd);
    /// Jumps to the end.
    void finish();
    [[nodiscard]] bool isRunning() const;

private:
    QPointer<QVariantAnimation> _animation;
    Step _step;
    std::function<void()> _atEnd;
};

} // namespace velmora
