// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"

namespace velmora {

/// Evaluates rules. Made by `makeRuleDetector`.
class RuleDetector final : public Detector {
public:
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;
};

} // namespace velmora
