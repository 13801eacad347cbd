// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/UTF8.h"
#include "PropertyLists/BinaryObjectTable.h"
#include "PropertyLists/BinaryScalars.h"
#include "PropertyLists/PropertyList.h"
#include "PropertyLists/ReadingBudget.h"

#include <algorithm>
#include <optional>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

/// Reads one list. Objects are looked up by their index in the offset table, again for each reference, so
/// that no two parts of the result share a node. A function that fails returns false and has set the reason.
class Reader {
public:
    Reader(const BinaryObjectTable& table, const PropertyListLimits& limits)
        : _table(table), _limits(limits), _budget(limits) {}

    Result<Value> read() {
        Value root;
        if (!readObject(_table.topObject(), 1, root))
            return Failure{_reason};
        return root;
    }

private:
    bool fail(std::string reason) {
        _reason = std::move(reason);
        return false;
    }
    bool failAt(std::size_t offset, const std::string& reason) {
        return fail(failureAt(offset, reason).reason);
    }
    bool isAllowed(std::optional<Failure> excess) { return !excess || fail(std::move(excess->reason)); }

    bool take(Result<Value> scalar, Value& value) {
        if (!scalar)
            return fail(scalar.reason());
        value = *std::move(scalar);
        return true;
    }

    [[nodiscard]] std::size_t bytesLeft(const BinaryObject& object) const {
        return _table.end() - object.content;
    }

    bool readObject(std::uint64_t index, std::size_t depth, Value& value);
    bool readCount(BinaryObject& object);
    bool readData(const BinaryObject& object, Value& value);
    bool readASCII(const BinaryObject& object, Value& value);
    bool findASCII(const BinaryObject& object, std::string_view& text);
    bool readKey(std::size_t reference, std::size_t depth, Value& value, std::string_view& key);
    bool readUTF16(const BinaryObject& object, Value& value);
    bool readArray(const BinaryObject& object, std::size_t depth, Value& value);
    bool readDictionary(const BinaryObject& object, std::size_t depth, Value& value);
    bool enterContainer(const BinaryObject& object, std::size_t depth, std::size_t referencesAnEntry);

    const BinaryObjectTable& _table;
    const PropertyListLimits& _limits;
    ReadingBudget _budget;
    std::string _reason;
    /// Offsets of the arrays and dictionaries that are being read, outermost first.
    std::vector<std::size_t> _open;
};

bool Reader::readCount(BinaryObject& object) {
    const auto done = _table.readCount(object);
    return done || fail(done.reason());
}

bool Reader::readObject(std::uint64_t index, std::size_t depth, Value& value) {
    if (!isAllowed(_budget.takeObject()))
        return false;
    const auto found = _table.object(index);
    if (!found)
        return fail(found.reason());
    BinaryObject object = *found;
    switch (object.marker >> 4) {
    case 0x0:
        if (object.marker != 0x08 && object.marker != 0x09)
            break;
        value = object.marker == 0x09;
        return true;
    case 0x1: return take(binaryInteger(_table, object), value);
    case 0x2: return take(binaryReal(_table, object), value);
    case 0x3: return take(binaryDate(_table, object), value);
    case 0x4: return readCount(object) && readData(object, value);
    case 0x5: return readCount(object) && readASCII(object, value);
    case 0x6: return readCount(object) && readUTF16(object, value);
    case 0xA: return readCount(object) && readArray(object, depth, value);
    case 0xD: return readCount(object) && readDictionary(object, depth, value);
    default: break;
    }
    return failAt(object.offset, "marker " + hexByte(object.marker) + " stands for no value that is read");
}

bool Reader::readData(const BinaryObject& object, Value& value) {
    if (object.count > bytesLeft(object))
        return failAt(object.offset, "data has " + std::to_string(object.count) + " bytes, " +
                                         std::to_string(bytesLeft(object)) + " are left");
    const auto size = static_cast<std::size_t>(object.count);
    if (!isAllowed(_budget.takeBytes(size)))
        return false;
    value = Data::copyOf(_table.bytesAt(object.content, size));
    return true;
}

/// Checks a text of ASCII, which is its bytes in the input.
bool Reader::findASCII(const BinaryObject& object, std::string_view& text) {
    if (object.count > bytesLeft(object))
        return failAt(object.offset, "a string has " + std::to_string(object.count) + " bytes, " +
                                         std::to_string(bytesLeft(object)) + " are left");
    const auto size = static_cast<std::size_t>(object.count);
    if (!isAllowed(_budget.takeBytes(size)))
        return false;
    const Bytes bytes = _table.bytesAt(object.content, size);
    const auto notASCII =
        std::find_if(bytes.begin(), bytes.end(), [](std::uint8_t byte) { return byte >= 0x80; });
    if (notASCII != bytes.end())
        return failAt(object.content + static_cast<std::size_t>(notASCII - bytes.begin()),
                      "an ASCII string holds " + hexByte(*notASCII));
    text = {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
    return true;
}

bool Reader::readASCII(const BinaryObject& object, Value& value) {
    std::string_view text;
    if (!findASCII(object, text))
        return false;
    value = Value(std::string(text));
    return true;
}

/// The key to which there is a reference at that offset: of the input where it is ASCII, since a copy beside
/// the dictionary's would be most of the cost, else of the value.
bool Reader::readKey(std::size_t reference, std::size_t depth, Value& value, std::string_view& key) {
    const std::uint64_t index = _table.numberAt(reference, _table.referenceSize());
    if (const auto found = _table.object(index); found && found->marker >> 4 == 0x5) {
        BinaryObject object = *found;
        return isAllowed(_budget.takeObject()) && readCount(object) && findASCII(object, key);
    }
    if (!readObject(index, depth, value))
        return false;
    const std::string* const text = value.asString();
    if (!text)
        return failAt(reference, "a dictionary's key is of the kind " + std::string(nameOf(value.kind())) +
                                     ", not string");
    key = *text;
    return true;
}

bool Reader::readUTF16(const BinaryObject& object, Value& value) {
    if (object.count > (bytesLeft(object)) / 2)
        return failAt(object.offset, "a string has " + std::to_string(object.count) + " UTF-16 units, " +
                                         std::to_string(bytesLeft(object)) + " bytes are left");
    const auto units = static_cast<std::size_t>(object.count);
    std::string text;
    for (std::size_t i = 0; i < units; ++i) {
        const std::size_t offset = object.content + 2 * i;
        auto character = static_cast<char32_t>(_table.numberAt(offset, 2));
        if (character >= 0xD800 && character <= 0xDBFF && i + 1 < units) {
            const auto low = static_cast<char32_t>(_table.numberAt(offset + 2, 2));
            if (low >= 0xDC00 && low <= 0xDFFF) {
                character = 0x10000 + ((character - 0xD800) << 10) + (low - 0xDC00);
                ++i;
            }
        }
        if (!isUnicodeScalar(character))
            return failAt(offset, "a UTF-16 string holds half a surrogate pair");
        appendUTF8(text, character);
    }
    if (!isAllowed(_budget.takeBytes(text.size())))
        return false;
    value = Value(std::move(text));
    return true;
}

/// Checks that the container may be read at all: all its references are there, and their objects are within
/// the limits.
bool Reader::enterContainer(const BinaryObject& object, std::size_t depth, std::size_t referencesAnEntry) {
    const std::string_view name = referencesAnEntry == 1 ? "an array" : "a dictionary";
    const std::size_t left = bytesLeft(object);
    if (object.count > left / (referencesAnEntry * _table.referenceSize()))
        return failAt(object.offset, std::string(name) + " has " + std::to_string(object.count) +
                                         " entries, " + std::to_string(left) + " bytes are left");
    if (object.count > _budget.objects() / referencesAnEntry)
        return fail(_budget.tooManyObjects().reason);
    if (std::find(_open.begin(), _open.end(), object.offset) != _open.end())
        return failAt(object.offset, std::string(name) + " contains itself");
    if (depth > _limits.maximumDepth)
        return failAt(object.offset,
                      std::string(name) + " is nested deeper than " + std::to_string(_limits.maximumDepth));
    const std::size_t references = static_cast<std::size_t>(object.count) * referencesAnEntry;
    for (std::size_t i = 0; i < references; ++i) {
        const std::size_t offset = object.content + i * _table.referenceSize();
        const std::uint64_t reference = _table.numberAt(offset, _table.referenceSize());
        if (reference >= _table.objectCount())
            return failAt(offset, std::string(name) + " refers to object " + std::to_string(reference) +
                                      " of " + std::to_string(_table.objectCount()));
    }
    _open.push_back(object.offset);
    return true;
}

bool Reader::readArray(const BinaryObject& object, std::size_t depth, Value& value) {
    if (!enterContainer(object, depth, 1))
        return false;
    const auto count = static_cast<std::size_t>(object.count);
    auto array = makeArray();
    array->reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        Value element;
        if (!readObject(_table.numberAt(object.content + i * _table.referenceSize(), _table.referenceSize()),
                        depth + 1, element))
            return false;
        array->append(std::move(element));
    }
    _open.pop_back();
    value = std::move(array);
    return true;
}

bool Reader::readDictionary(const BinaryObject& object, std::size_t depth, Value& value) {
    if (!enterContainer(object, depth, 2))
        return false;
    const auto count = static_cast<std::size_t>(object.count);
    auto dictionary = makeDictionary();
    for (std::size_t i = 0; i < count; ++i) {
        // All keys come first, then all values.
        const std::size_t keyReference = object.content + i * _table.referenceSize();
        const std::size_t valueReference = keyReference + count * _table.referenceSize();
        Value keyValue;
        std::string_view key;
        if (!readKey(keyReference, depth + 1, keyValue, key))
            return false;
        if (!isAllowed(_budget.takeBytes(key.size())))
            return false;
        Value element;
        if (!readObject(_table.numberAt(valueReference, _table.referenceSize()), depth + 1, element))
            return false;
        dictionary->set(key, std::move(element));
    }
    _open.pop_back();
    value = std::move(dictionary);
    return true;
}

} // namespace

Result<Value> readBinaryPropertyList(Bytes input, const PropertyListLimits& limits) {
    if (input.size() > limits.maximumBytes)
        return limitExceeded(limits, "the list has " + std::to_string(input.size()) + " bytes, more than " +
                                         std::to_string(limits.maximumBytes));
    const auto table = BinaryObjectTable::open(input);
    if (!table)
        return Failure{table.reason()};
    return Reader(*table, limits).read();
}

} // namespace velmora
