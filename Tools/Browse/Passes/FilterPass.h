// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Passes/FilePass.h"
#include "Tools/Browse/Passes/FilterExpression.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// Finds the messages of a file that a filter lets through: those of some log codes ("0x5134, 0x5137"), or
/// those after which a condition in the rules' language holds.
class FilterPass final : public FilePass {
public:
    /// The file must outlive it.
    static Result<std::unique_ptr<FilterPass>> make(const BrowsedFile& file, const std::string& text);

    [[nodiscard]] const std::string& text() const { return _filter; }
    /// Their positions so far, in ascending order.
    [[nodiscard]] const std::vector<std::uint32_t>& matches() const { return _matches; }

private:
    FilterPass(const BrowsedFile& file, std::string text, std::vector<std::uint32_t> codes);
    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _expression->wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void took(const LoggedMessage& message) override;

    std::string _filter;
    std::vector<std::uint32_t> _codes; ///< empty where there is an expression
    std::unique_ptr<FilterExpression> _expression;
    std::vector<std::uint32_t> _matches;
};

} // namespace velmora
