// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Diff/DiffJSON.h"
#include "Tools/Diff/DiffWriter.h"
#include "Tools/Stats/StatisticsValues.h"

namespace velmora {

namespace {

Value valueOf(const ShownValue& value) {
    switch (value.kind) {
    case ObservedKind::Number: return numberValue(value.number);
    case ObservedKind::Enumeration: return Value(value.raw);
    case ObservedKind::Flag: return Value(value.raw != 0);
    case ObservedKind::Text: return Value(value.words);
    case ObservedKind::Binary: {
        TextBuffer digits;
        appendHexadecimal(digits,
                          {reinterpret_cast<const std::uint8_t*>(value.words.data()), value.words.size()});
        return Value(digits.view());
    }
    case ObservedKind::Absent: break;
    }
    return {};
}

Value sideValue(const ShownValue& value) {
    const DictionaryRef side = makeDictionary();
    side->set("value", valueOf(value));
    side->set("text", value.text);
    return side;
}

Value differenceValue(const DisplayDifference& difference) {
    const ShownValue& any = difference.any();
    const DictionaryRef object = makeDictionary();
    object->set("change", std::string(nameOf(difference.change())));
    object->set("path", any.leaf->path);
    if (!any.row.empty())
        object->set("row", any.row);
    if (any.kind == ObservedKind::Number && any.leaf->unit != Unit::None)
        object->set("unit", std::string(nameOf(any.leaf->unit)));
    if (difference.before)
        object->set("a", sideValue(*difference.before));
    if (difference.after)
        object->set("b", sideValue(*difference.after));
    if (const std::optional<double> number = difference.difference())
        object->set("difference", numberValue(number));
    return object;
}

} // namespace

std::string displayDiffJson(const DiffSide& a, const DiffSide& b,
                            const std::vector<TechnologyDifferences>& technologies) {
    const ArrayRef list = makeArray();
    for (const TechnologyDifferences& each : technologies) {
        const DictionaryRef technology = makeDictionary();
        technology->set("technology", each.technology);
        technology->set("inA", each.isInA);
        technology->set("inB", each.isInB);
        const ArrayRef differences = makeArray();
        for (const DisplayDifference& difference : each.differences)
            differences->append(differenceValue(difference));
        technology->set("differences", differences);
        list->append(technology);
    }
    const DictionaryRef object = makeDictionary();
    object->set("compared", "displays");
    object->set("a", a.input().text());
    object->set("b", b.input().text());
    object->set("technologies", list);
    return jsonText(object);
}

} // namespace velmora
