// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/SelectedMessages.h"

#include "Tools/Messages/TechnologyChoice.h"
#include "Tools/Technologies.h"

#include <utility>
#include <vector>

namespace velmora {

Result<SelectedMessages> SelectedMessages::begin(MessageReader& reader, const Conversion& conversion,
                                                 MessageFilter& filter) {
    SelectedMessages messages{reader, filter, {}};
    reader.setReadsAllTechnologies(true);
    std::optional<LoggedMessage> first = reader.next();
    const std::vector<std::string> technologies = knownTechnologies(conversion.technologies, reader);
    const Result<TechnologyChoice> choice = TechnologyChoice::make(conversion.technology, technologies);
    if (!choice)
        return Failure{conversion.title + ": " + choice.reason()};
    const std::string named = choice->nameOf(choice->only.value_or(0), technologies);
    if (const Result<std::string> technology = technologyNamed(named); !technology)
        return Failure{conversion.title + ": " + technology.reason() +
                       (named.empty() ? "; --technology supplies it" : "")};
    messages.technology = named;
    if (choice->only)
        messages.filter.setTechnology(*choice->only);
    else if (!choice->override.empty())
        reader.setReadsAllTechnologies(false);
    messages.isOne = choice->only || !choice->override.empty();
    messages.next = std::move(first);
    if (messages.next && !messages.filter.passes(*messages.next))
        messages.advance();
    return messages;
}

void SelectedMessages::advance() {
    do
        next = reader.next();
    while (next && !filter.passes(*next));
}

} // namespace velmora
