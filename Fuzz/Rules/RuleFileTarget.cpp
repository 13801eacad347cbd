// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Rule.h"
#include "Analysis/Rules/RuleSet.h"
#include "Analysis/Rules/RuleTesting.h"
#include "Fuzz/FuzzTargets.h"
#include "Fuzz/Rules/RuleCatalogues.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

/// The input is a rule file. The tests of its rules are run.
class RuleFileTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        const std::string text(input.begin(), input.end());
        const auto lines = static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n')) + 1;
        RuleSet rules(_catalogues.all());
        rules.add({"rules.toml", text, 0});
        for (const RuleError& each : rules.errors()) {
            require(each.line <= lines, "a mistake is in the file");
            require((each.line == 0) == (each.column == 0), "a mistake has a line and a column or neither");
            require(!each.text.empty(), "a mistake has a reason");
        }
        for (const auto& rule : rules.rules()) {
            for (const RuleTest& test : rule->tests)
                static_cast<void>(runRuleTest(*rule, test, catalogueOf(test)));
            for (const Catalogue* const each : _catalogues.all())
                static_cast<void>(makeRuleDetector(rules, *each));
        }
        // The order of rules in one file and the other does not matter, and neither does reading them twice.
        RuleSet again(_catalogues.all());
        again.add({"rules.toml", text, 1});
        const std::size_t mistakes = again.errors().size();
        again.add({"rules.toml", text, 0});
        require(again.rules().size() == rules.rules().size(), "a lower layer adds nothing that is there");
        require(mistakes == rules.errors().size(), "the layer makes no mistake");
    }

private:
    [[nodiscard]] const Catalogue& catalogueOf(const RuleTest& test) const {
        for (const Catalogue* const each : _catalogues.all())
            if (each->technology() == test.technology)
                return *each;
        require(false, "a test has a technology");
        return *_catalogues.all().front();
    }

    const RuleCatalogues _catalogues;
};

} // namespace

std::unique_ptr<FuzzTarget> makeRuleFileTarget() {
    return std::make_unique<RuleFileTarget>();
}

} // namespace velmora
