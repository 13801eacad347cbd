// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Rows/CellWriter.h"

#include "Tools/Text/JSONText.h"

#include <string>

namespace velmora {

void CellWriter::append(TextBuffer& out, const Value& display, std::string_view path) {
    if (!NodeSelection::hasWildcard(path)) {
        append(out, NodeSelection::find(display, path));
        return;
    }
    _found.clear();
    NodeSelection::findAll(display, path, _found);
    appendFound(out);
}

void CellWriter::appendBelow(TextBuffer& out, const Value& place, std::string_view rest, bool hasWildcard) {
    if (!hasWildcard) {
        append(out, NodeSelection::findBelow(place, rest));
        return;
    }
    _found.clear();
    NodeSelection::findAllBelow(place, rest, _found);
    appendFound(out);
}

void CellWriter::append(TextBuffer& out, const Value* value) {
    if (!value || value->isNone())
        return;
    if (const std::string* const text = value->asString()) {
        appendCsvText(out, *text, _guard);
        return;
    }
    _text.clear();
    appendJson(_text, *value);
    appendCsvText(out, _text.view(), _guard);
}

void CellWriter::appendAll(TextBuffer& out, const Value& display, const NodeSelection& selection) {
    for (const std::string& path : selection.paths()) {
        out.append(',');
        append(out, display, path);
    }
}

void CellWriter::appendFound(TextBuffer& out) {
    _text.clear();
    for (const Value* const value : _found) {
        if (_text.size() > 0)
            _text.append("; ");
        if (const std::string* const text = value->asString())
            _text.append(*text);
        else
            appendJson(_text, *value);
    }
    if (!_found.empty())
        appendCsvText(out, _text.view(), _guard);
}

} // namespace velmora
