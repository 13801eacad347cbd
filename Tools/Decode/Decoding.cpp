// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Decoding.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Platform/TelephonyService.h"
#include "Tools/Decode/DecodeProgress.h"
#include "Tools/Decode/RefreshTicks.h"
#include "Tools/Decode/Refreshes.h"
#include "Tools/Decode/TrackedResources.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <optional>
#include <utility>

namespace velmora {

namespace {

/// Calls `decode`. Where the message is one that ends the application, returns why.
template <class Decode>
std::optional<std::string> reasonNotDecoded(const Decode& decode) {
    try {
        decode();
        return std::nullopt;
    } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
        return failure.what();
    } catch (const AssertionFailure& failure) {
        return failure.what();
    }
}

} // namespace

Result<Decoded> decodeMessages(MessageReader& reader, const DecodingRequest& request, WorkContext& context,
                               DecodingObserver& observer) {
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> message = reader.next();
    const std::string& named = request.technology.empty() ? reader.technology() : request.technology;
    MessageClock clock;
    const Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(named, clock);
    if (!decoder)
        return Failure{decoder.reason() + (named.empty() ? "; --technology supplies it" : "")};

    bool keepsHistory = observer.wantsHistory(0);
    (*decoder)->setKeepsHistory(keepsHistory);
    const bool wantsEveryRefresh = observer.wantsEveryRefresh();

    const TrackedResources resources;
    Decoded decoded;
    decoded.technology = shortTechnologyName(named);
    Dictionary state;
    MessageFilter filter(request.messages);
    Refreshes refreshes;
    const auto refresh = [&](Time tick) {
        refreshes.done();
        decoded.refreshes = refreshes.count();
        clock.setNow(tick);
        const bool writes = filter.writes(tick);
        // A refresh without a reader is skipped, unless there is no display yet: then it logs the reason.
        if (keepsHistory || (wantsEveryRefresh && writes) || !state.contains("Display"))
            decoded.display = (*decoder)->generateLogUsingState(state);
        if (writes)
            observer.didRefresh(tick, decoded);
        if (observer.wantsHistory(refreshes.count()) != keepsHistory) {
            keepsHistory = !keepsHistory;
            (*decoder)->setKeepsHistory(keepsHistory);
        }
    };
    MessageEffects* const effects = observer.effects();
    const auto decode = [&](const LoggedMessage& logged) {
        if (request.progress)
            request.progress->at(logged.offset);
        if (!filter.passes(logged)) {
            if (const std::optional<Time> tick = refreshes.afterSkipped(logged))
                refresh(*tick);
            return;
        }
        if (const std::optional<Time> tick = refreshes.before(logged))
            refresh(*tick);
        context.atRecord(logged.number, logged.offset);
        clock.setNow(logged.time);
        const bool writes = filter.writes(logged.time);
        if (writes)
            observer.willDecode(logged);
        const auto update = [&] {
            if (effects && writes)
                (*decoder)->updateStateReporting(state, logged.message, *effects);
            else
                (*decoder)->updateState(state, logged.message);
        };
        std::optional<std::string> reason;
        if (request.isStrict)
            update();
        else
            reason = reasonNotDecoded(update);
        ++decoded.messages;
        if (reason)
            decoded.undecoded.add(logged, *reason);
        else if (writes)
            observer.didDecode(logged, **decoder, state);
        if (const std::optional<Time> tick = refreshes.after(logged))
            refresh(*tick);
    };
    bool more = message.has_value();
    if (more && !observer.isDone())
        decode(*message);
    message.reset(); // releases its part of the reader's buffer
    while (more && !observer.isDone()) {
        // Constructed in place: a move of each of millions of messages would show.
        const std::optional<LoggedMessage> next = reader.next();
        more = next.has_value();
        if (more)
            decode(*next);
    }
    if (const std::optional<Time> tick = refreshes.last())
        refresh(*tick);
    if (refreshes.count() != 0 && !keepsHistory)
        decoded.display = (*decoder)->display(state);
    observer.didFinish(**decoder, state);
    if (!resources.failure().empty())
        return Failure{"decoded without its template: " + resources.failure()};
    return decoded;
}

bool reportLosses(const MessageReader& reader, const std::string& title) {
    for (const Loss& loss : reader.losses())
        report(positionInFile(title, loss.recordNumber, loss.offset) + ": " + loss.reason);
    const MessageReader::LossTotals& totals = reader.lossTotals();
    if (totals.losses > reader.losses().size())
        report(title + ": and " + std::to_string(totals.losses - reader.losses().size()) + " more, " +
               std::to_string(totals.bytes) + " bytes left out in all");
    if (reader.failure())
        report(title + ": " + reader.failure()->reason);
    return totals.losses == 0 && !reader.failure();
}

} // namespace velmora
