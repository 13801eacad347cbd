// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QObject>
#include <QPointer>

#include <functional>

class QVariantAnimation;

namespace velmora {

/// Whether animations are enabled: neither the user's style nor the environment (VELMORA_REDUCED_MOTION set
/// to anything but 0) asks for reduced motion.
[[nodiscard]] bool animationsEnabled();

/// One animation at a time, from 0 to 1, that can be ended early. Its owner may be destroyed in its
/// callbacks.
class Animation {
public:
    using Step = std::function<void(double)>;

    Animation() = default;
    /// Stops without calling anything.
    ~Animation();
    Animation(const Animation&) = delete;
    Animation& operator=(const Animation&) = delete;

    /// Ends an earlier animation first. Calls `step` during the animation, with 1 at last, then `atEnd`; both
    /// immediately when not animated or with reduced motion.
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
