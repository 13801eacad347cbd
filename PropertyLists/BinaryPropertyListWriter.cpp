// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/UTF8.h"
#include "PropertyLists/PropertyList.h"
#include "PropertyLists/PropertyListDate.h"

#include <algorithm>
#include <bit>
#include <limits>
#include <string_view>
#include <unordered_map>

namespace velmora {

namespace {

constexpr std::size_t maximumDepth = PropertyListLimits{}.maximumDepth;

/// Writes one list in two passes: the first assigns every object its index (a text that occurs several
/// times is one object), the second, when the width of a reference is known, writes the objects in that
/// order.
class Writer {
public:
    Result<std::vector<std::uint8_t>> write(const Value& root) {
        std::size_t index = 0;
        if (!collect(root, 1, index))
            return Failure{_reason};
        _referenceSize = widthOf(_objects.size() - 1);

        append("bplist00");
        std::vector<std::size_t> offsets;
        offsets.reserve(_objects.size());
        for (const Object& object : _objects) {
            offsets.push_back(_output.size());
            writeObject(object);
        }

        const std::size_t table = _output.size();
        const std::size_t offsetSize = widthOf(table);
        for (const std::size_t offset : offsets)
            appendNumber(offset, offsetSize);
        appendNumber(0, 6); // five unused bytes, the version of the keys' sorting
        appendNumber(offsetSize, 1);
        appendNumber(_referenceSize, 1);
        appendNumber(_objects.size(), 8);
        appendNumber(0, 8); // the root is the first object
        appendNumber(table, 8);
        return std::move(_output);
    }

private:
    /// Either a text or another value; a container's references lie in `_references` from `firstReference`
    /// on, a dictionary's keys before its values.
    struct Object {
        const std::string* text = nullptr;
        const Value* value = nullptr;
        std::size_t firstReference = 0;
    };

    /// 1, 2, 4 or 8: the widths that every reader supports.
    static std::size_t widthOf(std::size_t number) {
        if (number <= 0xFF)
            return 1;
        if (number <= 0xFFFF)
            return 2;
        return number <= 0xFFFFFFFF ? 4 : 8;
    }

    bool fail(std::string reason) {
        _reason = std::move(reason);
        return false;
    }

    bool collectText(const std::string& text, std::size_t& index) {
        const auto [entry, added] = _indexOfText.try_emplace(text, _objects.size());
        index = entry->second;
        if (!added)
            return true;
        if (const auto invalid = firstInvalidUTF8(text))
            return fail("a string is not UTF-8 at its offset " + std::to_string(*invalid));
        _objects.push_back({&text, nullptr, 0});
        return true;
    }

    bool collect(const Value& value, std::size_t depth, std::size_t& index) {
        if (const std::string* text = value.asString())
            return collectText(*text, index);
        if (value.isNone())
            return fail("there is no value to write");
        if (const Date* date = value.asDate(); date && !isPropertyListDate(*date))
            return fail("a date lies outside the years 0001 to 9999");
        index = _objects.size();
        _objects.push_back({nullptr, &value, _references.size()});

        const Array* array = value.asArray();
        const Dictionary* dictionary = value.asDictionary();
        if (!array && !dictionary)
            return true;
        if (depth > maximumDepth)
            return fail("the value is nested deeper than " + std::to_string(maximumDepth));
        std::size_t reference = _references.size();
        if (array) {
            _references.resize(reference + array->size());
            for (const Value& element : *array) {
                std::size_t elementIndex = 0;
                if (!collect(element, depth + 1, elementIndex))
                    return false;
                _references[reference++] = elementIndex;
            }
            return true;
        }
        _references.resize(reference + 2 * dictionary->size());
        for (const auto& [key, element] : *dictionary) {
            std::size_t keyIndex = 0;
            std::size_t elementIndex = 0;
            if (!collectText(key, keyIndex) || !collect(element, depth + 1, elementIndex))
                return false;
            _references[reference] = keyIndex;
            _references[reference + dictionary->size()] = elementIndex;
            ++reference;
        }
        return true;
    }

    void append(std::string_view text) { _output.insert(_output.end(), text.begin(), text.end()); }

    void appendNumber(std::uint64_t number, std::size_t size) {
        for (std::size_t i = size; i-- > 0;)
            _output.push_back(static_cast<std::uint8_t>(number >> (8 * i) & 0xFF));
    }

    void appendInteger(std::int64_t integer) {
        // Only the form of 8 bytes has a sign.
        const std::size_t size =
            integer < 0 ? 8 : std::min<std::size_t>(8, widthOf(static_cast<std::size_t>(integer)));
        appendNumber(0x10U | static_cast<unsigned>(std::countr_zero(size)), 1);
        appendNumber(static_cast<std::uint64_t>(integer), size);
    }

    void appendMarker(std::uint8_t kind, std::size_t count) {
        appendNumber(static_cast<std::size_t>(kind) << 4 | std::min<std::size_t>(count, 15), 1);
        if (count >= 15)
            appendInteger(static_cast<std::int64_t>(count));
    }

    void appendReferences(const Object& object, std::size_t count) {
        for (std::size_t i = 0; i < count; ++i)
            appendNumber(_references[object.firstReference + i], _referenceSize);
    }

    void writeText(const std::string& text) {
        if (std::all_of(text.begin(), text.end(),
                        [](char c) { return static_cast<unsigned char>(c) < 0x80; })) {
            appendMarker(0x5, text.size());
            append(text);
            return;
        }
        std::u16string units;
        units.reserve(text.size());
        std::size_t offset = 0;
        while (const auto character = nextCharacter(text, offset)) {
            if (*character >= 0x10000) {
                units += static_cast<char16_t>(0xD800 + ((*character - 0x10000) >> 10));
                units += static_cast<char16_t>(0xDC00 + ((*character - 0x10000) & 0x3FF));
            } else {
                units += static_cast<char16_t>(*character);
            }
        }
        appendMarker(0x6, units.size());
        for (const char16_t unit : units)
            appendNumber(unit, 2);
    }

    void writeObject(const Object& object) {
        if (object.text)
            return writeText(*object.text);
        const Value& value = *object.value;
        switch (value.kind()) {
        case Value::Kind::Integer: return appendInteger(*value.asInteger());
        case Value::Kind::Boolean: return appendNumber(*value.asBoolean() ? 0x09 : 0x08, 1);
        case Value::Kind::Real:
            appendNumber(0x23, 1);
            return appendNumber(std::bit_cast<std::uint64_t>(*value.asReal()), 8);
        case Value::Kind::Date:
            appendNumber(0x33, 1);
            return appendNumber(std::bit_cast<std::uint64_t>(
                                    static_cast<double>((*value.asDate() - binaryDateEpoch).count())),
                                8);
        case Value::Kind::Data: {
            const Bytes bytes = value.asData()->bytes();
            appendMarker(0x4, bytes.size());
            _output.insert(_output.end(), bytes.begin(), bytes.end());
            return;
        }
        case Value::Kind::Array:
            appendMarker(0xA, value.asArray()->size());
            return appendReferences(object, value.asArray()->size());
        case Value::Kind::Dictionary:
            appendMarker(0xD, value.asDictionary()->size());
            return appendReferences(object, 2 * value.asDictionary()->size());
        case Value::Kind::None:
        case Value::Kind::String: return; // refused, and written above
        }
    }

    std::vector<Object> _objects;
    std::vector<std::size_t> _references;
    std::unordered_map<std::string_view, std::size_t> _indexOfText;
    std::size_t _referenceSize = 1;
    std::vector<std::uint8_t> _output;
    std::string _reason;
};

} // namespace

Result<std::vector<std::uint8_t>> writeBinaryPropertyList(const Value& root) {
    return Writer().write(root);
}

} // namespace velmora
