// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/CSVFields.h"

#include "LogGenerator/Fields/Role.h"
#include "Tools/Fields/SourceNumber.h"
#include "Tools/Fields/SourceText.h"
#include "Tools/Output.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

constexpr std::string_view separator = ";";

using Leaf = CatalogueField;
using Source = CatalogueSource;

std::string placed(const Source& source, unsigned number) {
    return source.field->place.isComputed() ? std::string() : std::to_string(number);
}

std::string truthText(bool truth) {
    return truth ? "true" : "false";
}

std::string placed(const Source& source, bool truth) {
    return source.field->place.isComputed() ? std::string() : truthText(truth);
}

std::string subPacket(const Source& source) {
    return source.subPacket != 0 ? placed(source, unsigned{source.subPacket}) : std::string();
}

std::string physical(const Source& source, double SourceNumber::*part) {
    const Field& field = *source.field;
    return kindOf(field) == ObservedKind::Number ? numberText(numberOf(field).*part) : std::string();
}

std::string digits(const Field& field) {
    return field.means.digits != 0 ? std::to_string(field.means.digits) : std::string();
}

std::string absentValue(const TextFormat& format) {
    return format.hasSpecial ? std::to_string(format.specialValue) : std::string();
}

struct LeafColumn {
    std::string_view name;
    std::string (*text)(const Leaf& leaf);
};

constexpr LeafColumn leafColumns[] = {
    {"path", [](const Leaf& leaf) { return leaf.path; }},
    {"section", [](const Leaf& leaf) { return leaf.section; }},
    {"kind", [](const Leaf& leaf) { return std::string(nameOf(leaf.kind)); }},
    {"unit", [](const Leaf& leaf) { return std::string(nameOf(leaf.unit)); }},
    {"role", [](const Leaf& leaf) { return std::string(nameOf(leaf.role)); }},
    {"identity", [](const Leaf& leaf) { return std::string(nameOf(leaf.identity)); }},
    {"clause", [](const Leaf& leaf) { return std::string(leaf.clause); }},
    {"keys", [](const Leaf& leaf) { return joinedText(leaf.keys, separator); }},
    {"absent", [](const Leaf& leaf) { return joinedText(leaf.absentTexts, separator); }},
    {"same_as", [](const Leaf& leaf) { return leaf.sameAs; }},
    {"read_from_text", [](const Leaf& leaf) { return truthText(leaf.isReadFromText); }},
};

struct SourceColumn {
    std::string_view name;
    std::string (*text)(const Source& source); ///< empty where there is none
};

constexpr SourceColumn sourceColumns[] = {
    {"code", [](const Source& source) { return codeText(source.code); }},
    {"place_offset",
     [](const Source& source) { return placed(source, unsigned{source.field->place.offset}); }},
    {"place_bit", [](const Source& source) { return placed(source, unsigned{source.field->place.bit}); }},
    {"place_width", [](const Source& source) { return placed(source, unsigned{source.field->place.width}); }},
    {"place_signed", [](const Source& source) { return placed(source, numberOf(*source.field).isSigned); }},
    {"place_big_endian",
     [](const Source& source) { return placed(source, source.field->place.isBigEndian); }},
    {"place_in_entry", [](const Source& source) { return placed(source, source.list != nullptr); }},
    {"place_sub_packet", [](const Source& source) { return subPacket(source); }},
    {"physical_scale", [](const Source& source) { return physical(source, &SourceNumber::scale); }},
    {"physical_offset", [](const Source& source) { return physical(source, &SourceNumber::offset); }},
    {"enumeration", [](const Source& source) { return enumerationText(*source.field); }},
    {"digits", [](const Source& source) { return digits(*source.field); }},
    {"absent_value", [](const Source& source) { return absentValue(source.field->format); }},
    {"only_absent", [](const Source& source) { return truthText(source.field->means.isAbsence); }},
};

std::string textOf(const SourceColumn& column, const Leaf& leaf) {
    std::vector<std::string> texts;
    for (const Source& source : leaf.sources)
        if (source.code != noCode)
            texts.push_back(column.text(source));
    const auto isEmpty = [](const std::string& text) { return text.empty(); };
    return std::all_of(texts.begin(), texts.end(), isEmpty) ? std::string() : joinedText(texts, separator);
}

} // namespace

void CSVFields::appendCell(std::string_view text) {
    _line.append(',');
    if (!text.empty())
        appendCsvText(_line, text, _guard);
}

void CSVFields::begin() {
    _line.append("technology");
    for (const LeafColumn& column : leafColumns)
        appendCell(column.name);
    for (const SourceColumn& column : sourceColumns)
        appendCell(column.name);
    endLine();
}

void CSVFields::write(std::string_view technology, const CatalogueRows& rows) {
    for (const Leaf& leaf : rows) {
        appendCsvText(_line, technology, _guard);
        for (const LeafColumn& column : leafColumns)
            appendCell(column.text(leaf));
        for (const SourceColumn& column : sourceColumns)
            appendCell(textOf(column, leaf));
        endLine();
    }
}

void CSVFields::endLine() {
    _line.append(csvRowEnd);
    _output.put(_line.view());
    _line.clear();
}

} // namespace velmora
