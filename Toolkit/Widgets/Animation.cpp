// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Animation.h"

#include <QApplication>
#include <QEasingCurve>
#include <QStyle>
#include <QVariantAnimation>

#include <utility>

namespace velmora {

namespace {

constexpr int duration_ms = 250;

} // namespace

bool animationsEnabled() {
    const QByteArray asked = qgetenv("VELMORA_REDUCED_MOTION");
    return (asked.isEmpty() || asked == "0") &&
           QApplication::style()->styleHint(QStyle::SH_Widget_Animation_Duration) > 0;
}

Animation::~Animation() {
    if (_animation) {
        _animation->disconnect();
        _animation->stop();
        _animation->deleteLater();
    }
}

void Animation::start(bool animated, Step step, std::function<void()> atEnd) {
    finish();
    _step = std::move(step);
    _atEnd = std::move(atEnd);
    auto* const animation = new QVariantAnimation;
    _animation = animation;
    if (!animated || !animationsEnabled()) {
        finish();
        return;
    }
    _step(0);
    animation->setStartValue(0.0);
    animation->setEndValue(1.0);
    animation->setDuration(duration_ms);
    animation->setEasingCurve(QEasingCurve::OutCubic);
    QObject::connect(animation, &QVariantAnimation::valueChanged, animation,
                     [this](const QVariant& value) { _step(value.toDouble()); });
    QObject::connect(animation, &QVariantAnimation::finished, animation, [this] { finish(); });
    animation->start();
}

void Animation::finish() {
    if (!_animation)
        return;
    QVariantAnimation* const animation = _animation;
    _animation = nullptr;
    animation->disconnect();
    animation->stop();
    animation->deleteLater();
    const Step step = std::exchange(_step, nullptr);
    const std::function<void()> atEnd = std::exchange(_atEnd, nullptr);
    step(1);
    if (atEnd)
        atEnd();
}

bool Animation::isRunning() const {
    return _animation != nullptr;
}

} // namespace velmora
