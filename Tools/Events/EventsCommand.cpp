// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventsCommand.h"

#include "Platform/PrintableText.h"
#include "Tools/Events/FileEvents.h"
#include "Tools/Events/KindNames.h"
#include "Tools/Events/LiveEvents.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"
#include "Tools/ServiceClient.h"

#include <algorithm>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

/// Reports the mistakes of rules. Returns whether those that were asked for have none: one among the user's
/// own must not make the command useless.
bool reportErrors(const RuleSet& rules, const std::vector<std::string>& given) {
    bool good = true;
    for (const RuleError& error : rules.errors()) {
        report(error.message());
        good = good && std::find(given.begin(), given.end(), error.file) == given.end();
    }
    return good;
}

} // namespace

int runEvents(const EventsOptions& given, DecoderLines& lines, Output& output) {
    EventsOptions options = given;
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(options.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    std::optional<DecoderLog> log(std::in_place, lines); // of the decoders whose catalogues are made
    const AllCatalogues catalogues;
    log.reset();
    const RuleSet rules = options.usesStandardRules ? loadRules(catalogues, options.rules)
                                                    : loadOnlyRules(catalogues, options.rules);
    if (!reportErrors(rules, options.rules))
        return ExitStatus::BadInput;
    if (const auto problem = unknownKind(options.selection.kinds, kindNames(rules))) {
        report("--kind: " + printable(*problem));
        return ExitStatus::Usage;
    }
    if (!options.files.empty())
        return listFileEvents(options, rules, *masking, lines, output);
    options.isLive = true;
    ServiceClient client;
    std::optional<MessageMask> mask;
    if (*masking)
        mask.emplace(**masking);
    return LiveEvents(options, rules, lines, client, output, mask ? &*mask : nullptr).run();
}

} // namespace velmora
