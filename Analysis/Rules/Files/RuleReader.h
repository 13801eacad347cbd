// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLNode.h"
#include "Analysis/Rules/Rule.h"

#include <cstddef>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace velmora {

/// Reads the rules of a file.
class RuleReader {
public:
    /// What is passed must outlive it.
    RuleReader(std::span<const Catalogue* const> catalogues, FileErrors& errors)
        : _catalogues(catalogues.begin(), catalogues.end()), _errors(errors) {}

    /// The rules without a mistake.
    [[nodiscard]] std::vector<Rule> read(const TOMLNode& document);

private:
    [[nodiscard]] std::optional<Rule> readRule(const TOMLNode& table);
    void readTechnologies(const TOMLNode& node, std::vector<std::string>& technologies);
    [[nodiscard]] std::optional<Expression> readCondition(const TOMLNode& text, const InputNames& names);

    /// For rules of these technologies; null where the file has too many such choices.
    [[nodiscard]] const InputNames* namesFor(const std::vector<std::string>& technologies);

    static constexpr std::size_t mostChoices = 16;

    std::vector<const Catalogue*> _catalogues;
    FileErrors& _errors;
    std::map<std::vector<std::string>, InputNames> _names; ///< by technologies
};

} // namespace velmora
