// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Engine/Detector.h"
#include "Analysis/Events/Event.h"
#include "Analysis/Rules/RuleError.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <cstddef>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

struct Rule;
struct TOMLNode;

/// A rule file's content and where it is from.
struct RuleFile {
    std::string name; ///< for messages: its path
    std::string text;
    /// A rule replaces all of the same name of a lower layer: built-in rules, the user's, those given on the
    /// command line. Within a layer rules of one name must be for different technologies.
    int layer = 0;
    /// A display template of the user's own may not have the paths of rules that come along. These are left
    /// out then, which is no mistake.
    bool isBuiltIn = false;
};

/// The rules of several files, checked against the catalogues of all technologies. A rule with a mistake is
/// not in it; the others of its file are. The files' classes of levels come with them.
class RuleSet {
public:
    /// What is known of a rule without evaluating it.
    struct Summary {
        std::string_view name; ///< the kind of its events
        Severity severity;
        std::string_view text; ///< with its placeholders
        std::string_view file;
        bool lasts; ///< whether its events have a duration
    };

    /// The catalogues, which may grow, must outlive it.
    explicit RuleSet(std::span<const Catalogue* const> catalogues);
    ~RuleSet();
    RuleSet(RuleSet&&) noexcept;
    RuleSet& operator=(RuleSet&&) noexcept;

    /// Adds the rules and classes of a file.
    void add(const RuleFile& file);
    /// Adds the mistake of a file that could not be read.
    void addError(RuleError error) { _errors.push_back(std::move(error)); }

    /// The mistakes of all files, in the order in which they were added; empty where there are none.
    [[nodiscard]] const std::vector<RuleError>& errors() const { return _errors; }
    /// The rules of built-in files that are left out, with the reason.
    [[nodiscard]] const std::vector<RuleError>& leftOut() const { return _leftOut; }
    /// The same of classes.
    [[nodiscard]] const std::vector<RuleError>& leftOutClasses() const { return _leftOutClasses; }
    [[nodiscard]] const LevelClasses& classes() const { return _classes; }
    /// By name; of several rules of one name that of the first.
    [[nodiscard]] std::vector<Summary> summaries() const;
    /// By name.
    [[nodiscard]] std::span<const std::shared_ptr<const Rule>> rules() const { return _rules; }
    [[nodiscard]] std::span<const Catalogue* const> catalogues() const { return _catalogues; }

    static constexpr std::size_t mostRules = 4096;
    static constexpr std::size_t mostWindows = 2048; ///< of time, of all rules: each keeps values
    static constexpr std::size_t mostBytes = std::size_t{1} << 20; ///< of a file

private:
    /// Why the rule is not added; empty where it is, or where one of a higher layer replaces it.
    std::string insert(Rule rule);
    void addClasses(const RuleFile& file, const TOMLNode& document);

    std::vector<const Catalogue*> _catalogues;
    std::vector<std::shared_ptr<const Rule>> _rules; ///< by name
    std::vector<RuleError> _errors;
    std::vector<RuleError> _leftOut;
    std::vector<RuleError> _leftOutClasses;
    LevelClasses _classes;
};

/// Finds the events of the rules in what the messages of a technology report. Rules that use nothing that the
/// catalogue has, and those for other technologies, are left out. The catalogue must outlive the detector;
/// the set need not.
[[nodiscard]] std::unique_ptr<Detector> makeRuleDetector(const RuleSet& rules, const Catalogue& catalogue);

} // namespace velmora
