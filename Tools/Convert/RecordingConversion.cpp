// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/RecordingConversion.h"

#include "Recording/Files/DescriptorFile.h"
#include "Recording/Pcapng/RecordingCopy.h"
#include "Tools/Convert/AddedPositions.h"
#include "Tools/Convert/SelectedMessages.h"
#include "Tools/Messages/TechnologyChoice.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

namespace {

/// `first`: the time of the first message; absent before it has been read, when relative bounds are later.
RangeSide sideOf(Time time, const TimeRange& range, std::optional<Time> first) {
    const auto isReached = [&](const TimeBound& bound) {
        return (first || !bound.afterFirstMessage) &&
               time >= TimeRange::momentOf(bound, first.value_or(Time()));
    };
    if (range.from && !isReached(*range.from))
        return RangeSide::Before;
    return range.to && isReached(*range.to) ? RangeSide::After : RangeSide::Within;
}

} // namespace

Result<bool> convertRecording(PcapngReader& reader, const Conversion& conversion, int descriptor) {
    // The first blocks are copied before the first message is read.
    const std::vector<std::string> technologies = knownTechnologies(conversion.technologies, reader);
    const Result<TechnologyChoice> choice = TechnologyChoice::make(conversion.technology, technologies);
    if (!choice)
        return Failure{conversion.title + ": " + choice.reason()};
    RecordingCopy copy(reader, std::make_unique<DescriptorFile>(descriptor, false), conversion.name,
                       {choice->override, choice->only ? technologies[*choice->only] : std::string()});
    MessageFilter filter(conversion.messages);
    if (const TimeRange& range = conversion.messages.range; range.from || range.to)
        copy.setPositionRange([&](Time time) { return sideOf(time, range, filter.first()); });
    Result<SelectedMessages> messages = SelectedMessages::begin(reader, conversion, filter);
    if (!messages)
        return Failure{messages.reason()};
    AddedPositions positions(conversion.positions);
    const auto add = [&copy](const Fix& fix) { return copy.addFix(fix); };
    for (; messages->next; messages->advance()) {
        if (const auto added = positions.upTo(messages->next->time, add); !added)
            return Failure{conversion.title + ": " + added.reason()};
        if (const auto added = copy.addMessage(); !added)
            return Failure{added.reason()};
    }
    if (const auto added = positions.finish(add); !added)
        return Failure{conversion.title + ": " + added.reason()};
    if (!choice->override.empty() && reader.technologies().size() > 1)
        return Failure{conversion.title + ": " + severalTechnologies(reader.technologies()) +
                       " of a regular file only"};
    if (const auto finished = copy.finish(); !finished)
        return Failure{finished.reason()};
    return true;
}

} // namespace velmora
