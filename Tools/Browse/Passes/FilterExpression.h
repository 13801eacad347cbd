// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Rules/Evaluation/BoundExpression.h"
#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Evaluation/PathInputs.h"
#include "Analysis/Rules/Evaluation/RoleInputs.h"
#include "Analysis/Rules/Expression/Expression.h"
#include "Platform/Result.h"

#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// A condition in the rules' language (Documentation/rules.md) that is evaluated after each message.
class FilterExpression {
public:
    /// The catalogue must outlive it. The reason says where in the text the mistake is.
    static Result<std::unique_ptr<FilterExpression>> make(const std::string& text,
                                                          const Catalogue& catalogue);

    [[nodiscard]] bool wants(const CatalogueField& leaf) const;
    /// To be called for every message.
    void report(const MessageReport& report);
    /// Whether the condition is true after the latest message; false where it is not known.
    [[nodiscard]] bool holds() const { return _holds; }

private:
    FilterExpression(Expression expression, const Catalogue& catalogue);
    [[nodiscard]] bool isDue() const;

    Expression _expression;
    InputStore _inputs;
    BoundExpression _bound;
    RoleInputs _roles;
    PathInputs _paths;
    RadioPicture _picture;
    bool _readsPicture = false;
    bool _readsNeighbours = false;
    Wakeup _wakeup;
    std::optional<Time> _latest;
    bool _holds = false;
};

} // namespace velmora
