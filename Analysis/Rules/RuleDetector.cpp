// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleDetector.h"

#include "Analysis/Rules/RuleSet.h"

#include <vector>

namespace velmora {

RuleDetector::RuleDetector(std::span<const std::shared_ptr<const Rule>> rules, const Catalogue& catalogue)
    : _runner(rules, catalogue.technology()), _roles(_runner.inputs()), _paths(catalogue, _runner.inputs()) {}

void RuleDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    _runner.beginTurn(report.message, report.time);
    _roles.update(picture, _runner.inputs());
    _paths.update(report.observed, _runner.inputs());
    _runner.evaluate(sink);
}

void RuleDetector::interrupt(Time /*last*/, EventSink& sink) {
    _runner.interrupt(sink);
    _roles.clear();
}

std::unique_ptr<Detector> makeRuleDetector(const RuleSet& rules, const Catalogue& catalogue) {
    std::vector<std::shared_ptr<const Rule>> concerned;
    for (const std::shared_ptr<const Rule>& rule : rules.rules())
        if (concerns(*rule, catalogue))
            concerned.push_back(rule);
    return std::make_unique<RuleDetector>(concerned, catalogue);
}

} // namespace velmora
