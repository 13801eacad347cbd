// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/EventEnvironment.h"

#include "Platform/PrintableText.h"
#include "Tools/Events/EventText.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

/// The variable's name of a field's: "to.physical-cell" is TO_PHYSICAL_CELL.
std::string variableOf(std::string_view field) {
    std::string name;
    for (const char character : field) {
        const bool isSmall = character >= 'a' && character <= 'z';
        const bool isOther = (character >= 'A' && character <= 'Z') || (character >= '0' && character <= '9');
        name += isSmall ? static_cast<char>(character - 'a' + 'A') : isOther ? character : '_';
    }
    return name;
}

std::string valueOf(std::string_view text) {
    std::string value = printable(text.substr(0, longestValue));
    if (value.size() <= longestValue)
        return value;
    std::size_t end = longestValue;
    while (end > 0 && (static_cast<unsigned char>(value[end]) & 0xC0U) == 0x80)
        --end; // within a character
    value.resize(end);
    return value;
}

std::string timeOf(Time time) {
    TextBuffer out;
    TimeText().append(out, time);
    return std::string(out.view());
}

} // namespace

std::vector<std::string> eventEnvironment(const Event& event, EventState state, const EvidenceNames& names) {
    std::vector<std::string> variables;
    std::vector<std::string> taken;
    const auto add = [&](std::string name, std::string_view value) {
        if (std::find(taken.begin(), taken.end(), name) != taken.end())
            return; // a field may not replace what the event itself has
        variables.push_back(std::string(eventVariablePrefix) + name + "=" + valueOf(value));
        taken.push_back(std::move(name));
    };
    add("KIND", event.kind);
    add("STATE", nameOf(state));
    add("SEVERITY", nameOf(event.severity));
    add("TIME", timeOf(event.time));
    add("END", event.end ? timeOf(*event.end) : std::string());
    add("TECHNOLOGY", event.technology);
    add("TEXT", event.text);
    add("EVIDENCE", evidenceText(event, names));
    for (const EventField& field : event.fields)
        add(variableOf(field.name), textOf(field.value));
    return variables;
}

} // namespace velmora
