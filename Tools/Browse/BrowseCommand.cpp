// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseCommand.h"

#include "Platform/Linux/Files/LargeAllocations.h"
#include "Playback/QuietDecoding.h"
#include "Tools/Browse/Browser.h"
#include "Tools/Browse/BrowserTerminal.h"
#include "Tools/Browse/LineBrowser.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"
#include "Tools/Terminal/Terminal.h"

#include <memory>
#include <optional>

namespace velmora {

namespace {

/// The rules of events, read when they are first needed: the first screen does not wait for them.
class LazyRules {
public:
    const RuleSet& get() {
        if (!_rules) {
            const QuietDecoding quiet;
            _catalogues.emplace();
            // Mistakes in the user's rules are reported by `events`.
            _rules.emplace(loadRules(*_catalogues, {}));
        }
        return *_rules;
    }

private:
    std::optional<AllCatalogues> _catalogues;
    std::optional<RuleSet> _rules;
};

} // namespace

int runBrowse(const BrowseOptions& options, Output& output) {
    returnLargeAllocations();
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(options.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    LazyRules rules;
    const Browser::Open open = [&](const std::string& path, const std::string& technology) {
        return BrowseSession::open(path, technology.empty() ? options.technology : technology, *masking,
                                   [&rules]() -> const RuleSet& { return rules.get(); });
    };
    if (options.byLine)
        return LineBrowser(options.files, open, output).run();
    if (!Terminal::isThere()) {
        report("standard output is no terminal; --line prints lines of text");
        return ExitStatus::BadInput;
    }
    return browseOnTerminal(options.files, open);
}

} // namespace velmora
