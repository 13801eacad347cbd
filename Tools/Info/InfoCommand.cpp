// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoCommand.h"

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/RefreshTicks.h"
#include "Tools/ExitStatus.h"
#include "Tools/Info/MessageSummary.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <algorithm>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

namespace {

/// The sections that want the code, each once.
std::string sectionsOf(const ClassIndex& index, std::uint32_t code) {
    const std::vector<Base*>* sections = index.getSubscribers(code);
    std::vector<std::string_view> names;
    if (sections)
        for (const Base* section : *sections)
            if (std::find(names.begin(), names.end(), section->getSectionName()) == names.end())
                names.push_back(section->getSectionName());
    std::string text;
    for (const std::string_view name : names) {
        text += text.empty() ? "" : ", ";
        text += name;
    }
    return text;
}

/// `decoder` may be null; it is used for as long as the names are.
CodeNames codeNames(const LogGenerator* decoder) {
    CodeNames names;
    if (const auto* withSections = dynamic_cast<const OstrelLogGenerator2*>(decoder))
        names.nameOf = [withSections](std::uint32_t code) {
            return sectionsOf(withSections->classIndex(), code);
        };
    if (dynamic_cast<const C2KLogGenerator*>(decoder)) {
        names.heading = "records";
        names.nameOf = [](std::uint32_t code) {
            const C2K::LogCodeParser* parser = C2K::parserOfCode(code);
            return std::string(parser ? parser->name() : std::string_view());
        };
    }
    return names;
}

} // namespace

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
    const std::string technology = options.technology.empty() ? reader.technology() : options.technology;
    MessageSummary summary(technologyConstant(technology) != kVoxLogChannelTechnology_IFX);
    for (; message; message = reader.next())
        summary.add(*message);

    // Only for its sections' names: a recording without a decoder gets its summary as well.
    const MessageClock clock;
    const Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(technology, clock);
    const CodeNames names = codeNames(decoder ? decoder->get() : nullptr);
    output.put(summaryText(summary, technology, names, reader));
    output.flush();

    if (!decoder)
        report(title + ": " + decoder.reason());
    const bool whole = reportLosses(reader, title);
    return whole && decoder && output.state() != Output::State::Failed ? ExitStatus::Done
                                                                       : ExitStatus::BadInput;
}

} // namespace velmora
