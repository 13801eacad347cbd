// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/Rules/Evaluation/BoundExpression.h"
#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Expression/ExpressionParser.h"
#include "Analysis/Rules/RuleSet.h"
#include "LogGenerator/LogGenerator.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <chrono>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The catalogues of all technologies with the shipped templates. Main thread only.
class ShippedCatalogues {
public:
    ShippedCatalogues();

    [[nodiscard]] std::span<const Catalogue* const> all() const { return _catalogues; }
    /// By its short name.
    [[nodiscard]] const Catalogue& of(std::string_view technology) const;
    [[nodiscard]] LogGenerator& decoder(std::string_view technology) const;

    /// The same for all tests.
    [[nodiscard]] static const ShippedCatalogues& instance();

private:
    FakeClock _clock;
    std::vector<std::unique_ptr<LogGenerator>> _decoders;
    std::vector<const Catalogue*> _catalogues;
};

/// The time of so many seconds after an arbitrary start.
[[nodiscard]] Time at(double seconds);

/// Keeps what it gets, as texts: "weak-coverage 0 to 12", "5" for one without duration.
class EventTexts final : public EventSink {
public:
    void began(const Event& event) override;
    void happened(const Event& event) override;

    std::vector<std::string> begun;
    std::vector<std::string> texts;
    std::vector<Event> events;
};

/// The set of the rules in the text; the test fails for a mistake in it.
[[nodiscard]] RuleSet ruleSet(const std::string& text);
/// The mistakes in a rule file "my.toml" of that text.
[[nodiscard]] std::vector<std::string> mistakesIn(const std::string& text, int layer = 0);

/// An expression and the values that it reads.
class EvaluatedExpression {
public:
    /// The test fails where the text has a mistake.
    explicit EvaluatedExpression(std::string_view text);

    /// The next message, at that time.
    EvaluatedExpression& turn(double seconds);
    EvaluatedExpression& set(std::string_view name, double number);
    EvaluatedExpression& set(std::string_view name, std::string_view text);
    EvaluatedExpression& setRow(std::string_view path, std::uint32_t row, double number);
    EvaluatedExpression& remove(std::string_view name);
    /// Nothing is known any more.
    EvaluatedExpression& clear();
    EvaluatedExpression& neighbours(const std::vector<Neighbour>& neighbours);

    /// "true", "false", "unknown", a number or a text.
    [[nodiscard]] std::string value();

private:
    [[nodiscard]] std::string evaluate();
    [[nodiscard]] std::uint32_t slot(std::string_view name) const;

    Expression _expression;
    InputStore _inputs;
    std::unique_ptr<BoundExpression> _bound;
    std::uint64_t _messages = 0;
    std::optional<std::string> _value; ///< of this turn, which is evaluated once
};

/// A neighbour of that level.
[[nodiscard]] Neighbour neighbour(double level, bool isDetected = false);

} // namespace velmora
