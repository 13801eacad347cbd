#include "Tools/Decoding.h"

#include "Platform/TelephonyService.h"
#include "Tools/RecordedTime.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <optional>
#include <utility>

namespace velmora {

Result<Decoded> decodeMessages(MessageReader& reader, const std::string& technology, WorkContext& context,
                               const RefreshAction& refreshed) {
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> message = reader.next();
    const std::string& named = technology.empty() ? reader.technology() : technology;
    RecordedClock clock;
    const Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(named, clock);
    if (!decoder)
        return Failure{decoder.reason() + (named.empty() ? "; --technology supplies it" : "")};

    Decoded decoded;
    decoded.technology = shortTechnologyName(named);
    Dictionary state;
    RecordedTicks ticks;
    const auto refresh = [&](Time tick) {
        clock.setNow(tick);
        decoded.display = (*decoder)->generateLogUsingState(state);
        if (refreshed)
            refreshed(tick, decoded.display);
    };
    for (; message; message = reader.next()) {
        if (const std::optional<Time> tick = ticks.before(message->time))
            refresh(*tick);
        context.atRecord(message->number, message->offset);
        clock.setNow(message->time);
        (*decoder)->updateState(state, message->message);
        ++decoded.messages;
    }
    if (const std::optional<Time> tick = ticks.last())
        refresh(*tick);
    return decoded;
}

bool reportLosses(const MessageReader& reader, const std::string& title) {
    for (const Loss& loss : reader.losses())
        report(placeInFile(title, loss.recordNumber, loss.offset) + ": " + loss.reason);
    const MessageReader::LossTotals& totals = reader.lossTotals();
    if (totals.losses > reader.losses().size())
        report(title + ": and " + std::to_string(totals.losses - reader.losses().size()) + " more, " +
               std::to_string(totals.bytes) + " bytes left out in all");
    if (reader.failure())
        report(title + ": " + reader.failure()->reason);
    return totals.losses == 0 && !reader.failure();
}

} // namespace velmora
