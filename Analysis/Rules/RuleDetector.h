// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "Analysis/Rules/Evaluation/PathInputs.h"
#include "Analysis/Rules/Evaluation/RoleInputs.h"
#include "Analysis/Rules/Evaluation/RuleRunner.h"
#include "Analysis/Rules/Rule.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <memory>
#include <span>

namespace velmora {

/// Evaluates rules over the messages of one technology. Made by `makeRuleDetector`.
class RuleDetector final : public Detector {
public:
    /// The catalogue must outlive it.
    RuleDetector(std::span<const std::shared_ptr<const Rule>> rules, const Catalogue& catalogue);

    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _paths.reads(leaf); }
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    RuleRunner _runner;
    RoleInputs _roles;
    PathInputs _paths;
};

} // namespace velmora
