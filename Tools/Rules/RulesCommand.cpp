// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Rules/RulesCommand.h"

#include "Analysis/Rules/Rule.h"
#include "Analysis/Rules/RuleTesting.h"
#include "Platform/PrintableText.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"

#include <cstddef>
#include <map>
#include <string>
#include <vector>

namespace velmora {

namespace {

struct FileCounts {
    std::size_t rules = 0;
    std::size_t tests = 0;
    std::size_t passed = 0;
    std::size_t classes = 0;
};

std::string counted(std::size_t count, const std::string& noun) {
    return std::to_string(count) + " " + noun + (count == 1 ? "" : "s");
}

const Catalogue* catalogueOf(const RuleTest& test, const RuleSet& rules) {
    for (const Catalogue* const each : rules.catalogues())
        if (each->technology() == test.technology)
            return each;
    return nullptr;
}

/// Whether the rule makes the events that the test expects; reports what it makes otherwise.
bool passes(const Rule& rule, const RuleTest& test, const RuleSet& rules) {
    const Catalogue* const catalogue = catalogueOf(test, rules);
    const std::string difference = catalogue ? runRuleTest(rule, test, *catalogue) : "no such technology";
    if (difference.empty())
        return true;
    const std::string name = test.name.empty() ? std::string() : ", \"" + printableLine(test.name) + "\"";
    report(RuleError{printableLine(rule.file), test.line, test.column, rule.name + name + ": " + difference}
               .message());
    return false;
}

std::string lineOf(const std::string& file, const FileCounts& counts, RulesOptions::Action action) {
    std::string line = printableLine(file) + ": " + counted(counts.rules, "rule") + ", ";
    if (action == RulesOptions::Action::Test)
        line += std::to_string(counts.passed) + " of ";
    line += counted(counts.tests, "test");
    if (action == RulesOptions::Action::Test)
        line += " passed";
    if (counts.classes > 0)
        line += ", classes of " + counted(counts.classes, "value");
    return line + "\n";
}

} // namespace

int runRules(const RulesOptions& options, Output& output) {
    const AllCatalogues catalogues;
    const std::vector<RulePath> paths =
        options.files.empty() ? standardRulePaths() : rulePaths(options.files);
    const RuleSet rules = readRules(catalogues, paths);
    for (const RuleError& each : rules.errors())
        report(printableLine(each.message()));
    for (const RuleError& each : rules.leftOut())
        report(printableLine(each.message()) + "; the rule is left out");
    for (const RuleError& each : rules.leftOutClasses())
        report(printableLine(each.message()) + "; the class is left out");
    bool isRight = rules.errors().empty();

    std::map<std::string, FileCounts> counts;
    for (const auto& rule : rules.rules()) {
        FileCounts& file = counts[rule->file];
        ++file.rules;
        file.tests += rule->tests.size();
        if (options.action == RulesOptions::Action::Check)
            continue;
        for (const RuleTest& test : rule->tests) {
            const bool hasPassed = passes(*rule, test, rules);
            file.passed += hasPassed ? 1 : 0;
            isRight = isRight && hasPassed;
        }
    }
    for (const RulePath& each : paths) {
        counts[each.path].classes = rules.classes().countFrom(each.path);
        output.put(lineOf(each.path, counts[each.path], options.action));
    }
    output.flush();
    return isRight && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora
