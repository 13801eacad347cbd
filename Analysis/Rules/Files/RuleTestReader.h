// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLNode.h"
#include "Analysis/Rules/Rule.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Reads the test cases that a rule carries.
class RuleTestReader {
public:
    /// What is passed must outlive it.
    RuleTestReader(const Rule& rule, const InputNames& names, FileErrors& errors)
        : _rule(rule), _names(names), _errors(errors) {}

    [[nodiscard]] std::vector<RuleTest> read(const TOMLNode& tests);

private:
    [[nodiscard]] RuleTest readTest(const TOMLNode& table);
    [[nodiscard]] const Catalogue* catalogueOf(const TOMLNode& table);
    void readStep(const TOMLNode& table, RuleTest& test);
    /// The values of a table, of which names with a dot may be tables in it.
    void readValues(const TOMLNode& table, const std::string& prefix, RuleTestStep& step);
    void readValue(const std::string& name, TextPosition position, const TOMLNode* value, RuleTestStep& step);
    void readNeighbours(const TOMLNode& node, RuleTestStep& step);
    void readEvent(const TOMLNode& table, RuleTest& test);

    const Rule& _rule;
    const InputNames& _names;
    FileErrors& _errors;
    const Catalogue* _catalogue = nullptr; ///< of the test's technology
};

} // namespace velmora
