// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/JSONLines.h"

#include "LogGenerator/Base.h"
#include "Tools/Text/JSONText.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

/// What every object begins with, up to its time.
std::string beginOf(const std::string& file) {
    TextBuffer text;
    text.append('{');
    if (!file.empty()) {
        text.append("\"file\":");
        appendJsonString(text, file);
        text.append(',');
    }
    text.append("\"time\":\"");
    return std::string(text.view());
}

/// Nothing to show is an empty display, so that a reader of the object finds one whatever the file held.
void appendDisplay(TextBuffer& line, const Value& display) {
    line.append(",\"display\":");
    if (display.isNone())
        line.append("{}");
    else
        appendJson(line, display);
}

/// Where a value that has no section is shown: a list's node for its entries.
template <class Places>
void addValue(Places& places, const CatalogueSource& source, const CatalogueNode& leaf) {
    const bool isEntry = source.list && leaf.isRow();
    const std::string_view key = isEntry ? source.list->label : source.field->label;
    const CatalogueNode* const node = isEntry ? leaf.parent() : &leaf;
    auto& nodes = places[std::string(key)];
    if (std::find(nodes.begin(), nodes.end(), node) == nodes.end())
        nodes.push_back(node);
}

} // namespace

RefreshLines::RefreshLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : LineWriter(output, isLive), _selection(options.selection), _ages(options.maximumAge),
      _begin(beginOf(file)) {}

void RefreshLines::didRefresh(Time tick, const Decoded& decoded) {
    line().append(_begin);
    appendTime(tick);
    line().append("\",\"technology\":");
    appendJsonString(line(), decoded.technology);
    line().append(",\"messages\":");
    line().append(std::to_string(decoded.messages));
    appendDisplay(line(), _selection.restricted(_ages.fresh(decoded, tick)));
    endLine("}\n");
    LineWriter::didRefresh(tick, decoded);
}

MessageLines::MessageLines(Output& output, bool isLive, const NodeSelection& selection,
                           const std::string& file)
    : LineWriter(output, isLive), _selection(selection), _begin(beginOf(file)) {}

void MessageLines::didMakeDecoder(LogGenerator& decoder) {
    _sections.clear();
    if (_selection.paths().empty())
        return;
    _selection.limit(decoder);
    const Catalogue& catalogue = decoder.catalogue();
    Places& places = _places[catalogue.technology()];
    for (const CatalogueField& leaf : catalogue.fields()) {
        for (const CatalogueNode* node = leaf.node; node && !leaf.section.empty(); node = node->parent())
            if (node->name() == leaf.section)
                places[leaf.section].assign(1, node);
        if (leaf.section.empty())
            for (const CatalogueSource& source : leaf.sources)
                addValue(places, source, *leaf.node);
    }
}

void MessageLines::willConcern(const Decoded& decoded) {
    const auto places = _places.find(decoded.technology);
    _current = places == _places.end() ? nullptr : &places->second;
    if (decoded.isOneOfSeveral)
        _technology = "\",\"technology\":\"" + decoded.technology;
}

void MessageLines::didDecode(const LoggedMessage&, LogGenerator&, Dictionary&) {
    if (_named)
        endValues();
    if (_current && _first)
        dropLine();
    else
        endLine(_end);
}

void MessageLines::sections(std::optional<std::uint32_t> code) {
    begin();
    appendCode(code);
    line().append(",\"sections\":{");
}

void MessageLines::concerned(Base& section) {
    if (_current) {
        MessageEffects::concerned(section);
        return;
    }
    if (!section.hasNode())
        return;
    if (!_first)
        line().append(',');
    _first = false;
    _sections.try_emplace(&section, section, _texts, _writer).first->second.append(line());
}

void MessageLines::values(std::optional<std::uint32_t> code) {
    begin();
    appendCode(code);
    line().append(",\"values\":{");
    _named = nullptr;
    _code = code.value_or(0);
}

FieldVisitor* MessageLines::valueVisitor() {
    if (_current)
        return nullptr;
    _named = &_values.try_emplace(_code, false, _texts).first->second;
    _writer.begin(*_named, JSONFieldWriter::Into::Values);
    return &_writer;
}

void MessageLines::endValues() {
    _writer.end();
    line().truncate(line().size() - 1); // the node has its own brackets
    _named->append(line());
    _named = nullptr;
    _end = "}\n";
}

void MessageLines::display(const Value& display) {
    begin();
    line().append('"');
    const Value selected = _selection.restricted(display);
    appendDisplay(line(), selected);
    _first = selected.isNone();
    _end = "}\n";
}

void MessageLines::begin() {
    line().append(_begin);
    appendTime(_moment);
    line().append(_technology);
    _end = "}}\n";
    _first = true;
}

void MessageLines::appendCode(std::optional<std::uint32_t> code) {
    line().append("\",\"code\":");
    line().append(code ? std::to_string(*code) : "null");
}

void MessageLines::member(std::string_view name, const Value& value) {
    if (!_first)
        line().append(',');
    _first = false;
    appendJsonString(line(), name);
    line().append(':');
    appendJson(line(), value);
}

void MessageLines::selectedMember(std::string_view name, const Value& value) {
    if (!_current) {
        member(name, value);
        return;
    }
    const auto places = _current->find(name);
    if (places == _current->end())
        return;
    for (const CatalogueNode* const place : places->second)
        if (const Value part = _selection.restrictedAt(*place, value); !part.isNone()) {
            member(name, part);
            return; // a value that is shown twice is one value
        }
}

} // namespace velmora
