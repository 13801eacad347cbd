// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleDetector.h"

#include "Analysis/Rules/RuleSet.h"

namespace velmora {

void RuleDetector::report(const MessageReport& /*report*/, const RadioPicture& /*picture*/,
                          EventSink& /*sink*/) {}

void RuleDetector::interrupt(Time /*last*/, EventSink& /*sink*/) {}

std::unique_ptr<Detector> makeRuleDetector(const RuleSet& /*rules*/, const Catalogue& /*catalogue*/) {
    return std::make_unique<RuleDetector>();
}

} // namespace velmora
