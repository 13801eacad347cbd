#include "Tools/InfoCommand.h"

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decoding.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/RecordedTime.h"
#include "Tools/RecordingSummary.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <memory>
#include <optional>

namespace velmora {

int runInfo(const InfoOptions& options, Output& output) {
    const std::string title = fileTitle(options.file);
    const Result<std::unique_ptr<MessageReader>> opened = openMessages(options.file);
    if (!opened) {
        report(title + ": " + opened.reason());
        return ExitStatus::BadInput;
    }
    MessageReader& reader = **opened;
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> message = reader.next();
    const std::string technology = reader.technology();
    RecordingSummary summary(technologyConstant(technology) != kVoxLogChannelTechnology_IFX);
    for (; message; message = reader.next())
        summary.add(*message);

    // Only for its sections' names, so that a recording without a decoder is told of all the same.
    const RecordedClock clock;
    const Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(technology, clock);
    const auto* sections = decoder ? dynamic_cast<const OstrelLogGenerator2*>(decoder->get()) : nullptr;
    output.put(summaryText(summary, technology, sections ? &sections->classIndex() : nullptr, reader));
    output.flush();

    if (!decoder)
        report(title + ": " + decoder.reason());
    const bool whole = reportLosses(reader, title);
    return whole && decoder && output.state() != Output::State::Failed ? ExitStatus::Done
                                                                       : ExitStatus::BadInput;
}

} // namespace velmora
