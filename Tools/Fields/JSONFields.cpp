// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/JSONFields.h"

#include "LogGenerator/Fields/Role.h"
#include "Tools/Fields/SourceNumber.h"
#include "Tools/Fields/SourceText.h"
#include "Tools/Output.h"
#include "Tools/Text/JSONText.h"

#include <cmath>

namespace velmora {

namespace {

void setUnlessEmpty(Dictionary& object, std::string_view key, std::string_view text) {
    if (!text.empty())
        object.set(key, text);
}

template <class Texts>
void setUnlessNone(Dictionary& object, std::string_view key, const Texts& texts) {
    if (texts.empty())
        return;
    const ArrayRef array = makeArray();
    for (const std::string_view text : texts)
        array->append(text);
    object.set(key, array);
}

/// Without a fraction where there is none.
Value numberValue(double number) {
    if (std::trunc(number) == number)
        return static_cast<std::int64_t>(number);
    return number;
}

Value placeOf(const CatalogueSource& source) {
    const Place& place = source.field->place;
    const DictionaryRef object = makeDictionary();
    object->set("offset", place.offset);
    object->set("bit", place.bit);
    object->set("width", place.width);
    object->set("signed", numberOf(*source.field).isSigned);
    object->set("bigEndian", place.isBigEndian);
    object->set("inEntry", source.list != nullptr);
    if (source.subPacket != 0)
        object->set("subPacket", source.subPacket);
    return object;
}

Value physicalOf(const Field& field) {
    const SourceNumber number = numberOf(field);
    const DictionaryRef object = makeDictionary();
    object->set("scale", numberValue(number.scale));
    object->set("offset", numberValue(number.offset));
    return object;
}

Value textOfValue(std::int64_t value, std::string_view text) {
    const DictionaryRef object = makeDictionary();
    object->set("value", value);
    object->set("text", text);
    return object;
}

void setEnumeration(Dictionary& object, const TextFormat& format) {
    const ArrayRef values = makeArray();
    const DictionaryRef others = makeDictionary();
    if (format.kind == TextFormat::Kind::Flag) {
        values->append(textOfValue(0, format.clear));
        others->set("text", format.set);
    } else {
        for (const EnumText& row : format.texts->rows)
            values->append(textOfValue(row.value, row.text));
        others->set(format.texts->showsOthers ? "before" : "text", format.texts->before);
        if (format.texts->showsOthers)
            others->set("after", format.texts->after);
    }
    object.set("values", values);
    object.set("others", others);
}

Value sourceOf(const CatalogueSource& source) {
    const Field& field = *source.field;
    const TextFormat& format = field.format;
    const DictionaryRef object = makeDictionary();
    object->set("code", source.code);
    if (!field.place.isComputed())
        object->set("place", placeOf(source));
    if (kindOf(field) == ObservedKind::Number)
        object->set("physical", physicalOf(field));
    if (format.kind == TextFormat::Kind::Enumeration || format.kind == TextFormat::Kind::Flag)
        setEnumeration(*object, format);
    if (field.means.digits != 0)
        object->set("digits", field.means.digits);
    if (format.hasSpecial)
        object->set("absent", textOfValue(format.specialValue, format.specialText));
    if (field.means.isAbsence)
        object->set("onlyAbsent", true);
    return object;
}

Value rowOf(std::string_view technology, const CatalogueField& leaf) {
    const DictionaryRef row = makeDictionary();
    row->set("technology", technology);
    row->set("path", leaf.path);
    setUnlessEmpty(*row, "section", leaf.section);
    row->set("kind", nameOf(leaf.kind));
    setUnlessEmpty(*row, "unit", nameOf(leaf.unit));
    setUnlessEmpty(*row, "role", nameOf(leaf.role));
    setUnlessEmpty(*row, "identity", nameOf(leaf.identity));
    setUnlessEmpty(*row, "clause", leaf.clause);
    setUnlessNone(*row, "keys", leaf.keys);
    setUnlessNone(*row, "absent", leaf.absentTexts);
    setUnlessEmpty(*row, "sameAs", leaf.sameAs);
    if (leaf.isReadFromText)
        row->set("readFromText", true);
    const ArrayRef sources = makeArray();
    for (const CatalogueSource& source : leaf.sources)
        if (source.code != noCode)
            sources->append(sourceOf(source));
    row->set("sources", sources);
    return row;
}

} // namespace

void JSONFields::begin() {
    _output.put("{\n\"fields\": [");
}

void JSONFields::write(std::string_view technology, const CatalogueRows& rows) {
    for (const CatalogueField& leaf : rows) {
        _line.clear();
        _line.append(_isFirst ? "\n" : ",\n");
        _isFirst = false;
        appendJson(_line, rowOf(technology, leaf));
        _output.put(_line.view());
    }
}

void JSONFields::end() {
    _output.put("\n]\n}\n");
}

} // namespace velmora
