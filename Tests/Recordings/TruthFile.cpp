// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recordings/TruthFile.h"

#include "Tests/Support/MomentText.h"

#include <algorithm>
#include <fstream>

namespace velmora {
namespace {

/// The texts of truth events are names and numbers: nothing in them needs an escape.
void append(std::string& line, std::string_view name, std::string_view value) {
    line.append(line.size() > 1 ? "," : "")
        .append("\"")
        .append(name)
        .append("\":\"")
        .append(value)
        .append("\"");
}

std::string lineOf(const TruthEvent& event, Time start) {
    std::string line = "{";
    append(line, "time", momentText(start + event.at));
    if (event.end)
        append(line, "end", momentText(start + *event.end));
    append(line, "kind", event.kind);
    if (event.isHidden)
        line += ",\"hidden\":true";
    for (const auto& [name, value] : event.fields)
        append(line, name, value);
    return line + "}\n";
}

} // namespace

Result<Done> TruthFile::write(const std::string& path, Time start, TruthTime last) {
    std::stable_sort(_events.begin(), _events.end(),
                     [](const TruthEvent& a, const TruthEvent& b) { return a.at < b.at; });
    std::ofstream file(path, std::ios::binary);
    for (TruthEvent& event : _events) {
        if (event.at > last)
            break; // the scenario is a step ahead of its messages
        if (event.end && *event.end > last)
            event.end.reset();
        file << lineOf(event, start);
    }
    file.close();
    if (!file)
        return Failure{"cannot write " + path};
    return Done{};
}

} // namespace velmora
