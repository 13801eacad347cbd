// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/Linux/MachineClock.h"

#include <memory>
#include <span>
#include <string>
#include <vector>

namespace velmora {

/// The catalogues of all technologies, for checking rules.
class AllCatalogues {
public:
    AllCatalogues();

    [[nodiscard]] std::span<const Catalogue* const> all() const { return _catalogues; }

private:
    MachineClock _clock;
    std::vector<std::unique_ptr<LogGenerator>> _decoders;
    std::vector<const Catalogue*> _catalogues;
};

/// A rule file and its layer, as a RuleSet has them.
struct RulePath {
    std::string path;
    int layer;
    bool isBuiltIn = false;
};

/// The files of the built-in rules and of the user's.
[[nodiscard]] std::vector<RulePath> standardRulePaths();
/// Files that the command line names: their rules replace all others.
[[nodiscard]] std::vector<RulePath> rulePaths(std::span<const std::string> files);

/// The rules of the files. A file that cannot be read is among the set's errors. The catalogues must outlive
/// the set.
[[nodiscard]] RuleSet readRules(const AllCatalogues& catalogues, std::span<const RulePath> paths);

/// The built-in rules and the user's, then those of the files.
[[nodiscard]] RuleSet loadRules(const AllCatalogues& catalogues, std::span<const std::string> files);
/// The built-in rules alone, whoever runs the program.
[[nodiscard]] RuleSet loadBuiltInRules(const AllCatalogues& catalogues);
/// Those of the files alone.
[[nodiscard]] RuleSet loadOnlyRules(const AllCatalogues& catalogues, std::span<const std::string> files);

} // namespace velmora
