// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/FinalDisplay.h"

#include "Tools/Output.h"
#include "Tools/Text/JSONText.h"
#include "Tools/Text/TreeText.h"

#include <utility>

namespace velmora {

void FinalDisplay::finish(const Decoded& decoded) {
    if (_options.format == DecodeOptions::Format::Json)
        output().put(json(decoded, _options.selection));
    else
        output().put(heading(decoded) + text(decoded, _options.selection));
    output().flush();
}

std::string FinalDisplay::heading(const Decoded& decoded) {
    std::string name = _title;
    if (decoded.isOneOfSeveral)
        name += (name.empty() ? "" : ": ") + decoded.technology;
    if (name.empty())
        return {};
    const bool isFirst = std::exchange(_isFirst, false);
    return (isFirst ? "== " : "\n== ") + name + " ==\n";
}

std::string FinalDisplay::json(const Decoded& decoded, const NodeSelection& selection) {
    TextBuffer out;
    out.append("{\n  \"technology\": ");
    appendJsonString(out, decoded.technology);
    out.append(",\n  \"messages\": ");
    out.append(std::to_string(decoded.messages));
    out.append(",\n  \"display\": ");
    // Nothing to show is an empty display, so that a reader of the object finds one whatever the file held.
    if (const Value display = selection.restricted(decoded.display); display.isNone())
        out.append("{}");
    else
        appendIndentedJson(out, display, 1);
    out.append("\n}\n");
    return std::string(out.view());
}

std::string FinalDisplay::text(const Decoded& decoded, const NodeSelection& selection) {
    if (decoded.display.isNone())
        return {};
    PathDictionary paths;
    const NodeRef root = selection.restricted(VelmoraModelNode::makeTreeFromObject(decoded.display, paths));
    return root ? treeText(*root) : std::string();
}

} // namespace velmora
