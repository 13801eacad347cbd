// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/ListScalars.h"

#include "PropertyLists/BinaryObjectTable.h"

#include <algorithm>
#include <optional>
#include <string_view>

namespace velmora {

namespace {

bool isDigit(std::uint8_t each) {
    return each >= '0' && each <= '9';
}

bool isLetter(std::uint8_t each) {
    return (each >= 'a' && each <= 'z') || (each >= 'A' && each <= 'Z');
}

/// Another letter or digit.
std::uint8_t other(std::uint8_t each) {
    if (isDigit(each))
        return each ^ 1U;
    return static_cast<std::uint8_t>((each | 0x20) == 'z' ? each - 1 : each + 1);
}

/// The bytes with one of them changed, every `step`-th from the last on: the last letter or digit.
std::optional<ChangedBytes> changedText(Bytes bytes, std::size_t begin, std::size_t end,
                                        std::size_t step = 1) {
    for (std::size_t i = end; i >= begin + step; i -= step) {
        const std::uint8_t each = bytes[i - 1];
        if ((!isDigit(each) && !isLetter(each)) || (step == 2 && bytes[i - 2] != 0))
            continue;
        ChangedBytes changed{begin,
                             end,
                             {bytes.begin() + static_cast<std::ptrdiff_t>(begin),
                              bytes.begin() + static_cast<std::ptrdiff_t>(end)}};
        changed.others[i - 1 - begin] = other(each);
        return changed;
    }
    return std::nullopt;
}

std::optional<ChangedBytes> changedBits(Bytes bytes, std::size_t begin, std::size_t end, std::size_t at,
                                        std::uint8_t bits) {
    if (at >= end - begin)
        return std::nullopt;
    ChangedBytes changed{begin,
                         end,
                         {bytes.begin() + static_cast<std::ptrdiff_t>(begin),
                          bytes.begin() + static_cast<std::ptrdiff_t>(end)}};
    changed.others[at] = static_cast<std::uint8_t>(changed.others[at] ^ bits);
    return changed;
}

/// One after another, without reading the list: what is no property list gives something or nothing.
class XMLScalars {
public:
    explicit XMLScalars(Bytes list)
        : _bytes(list), _text(reinterpret_cast<const char*>(list.data()), list.size()) {}

    /// The next scalar, absent at the end; one that cannot be changed has no other bytes.
    [[nodiscard]] std::optional<ChangedBytes> next() {
        for (std::size_t open = _text.find('<', _at); open != std::string_view::npos;
             open = _text.find('<', _at)) {
            const std::string_view rest = _text.substr(open);
            const std::size_t length = rest.starts_with("<!--") ? rest.find("-->") : rest.find('>');
            if (length == std::string_view::npos)
                return std::nullopt;
            _at = open + length + 1;
            const std::string_view name = rest.substr(1, rest.find_first_of(" \t\r\n/>", 1) - 1);
            if (name == "true" || name == "false")
                return truth(open, name == "true");
            if (name != "key" && name != "integer" && name != "real" && name != "string" && name != "date" &&
                name != "data")
                continue;
            if (rest[length - 1] == '/')
                continue; // an empty one
            const std::size_t begin = _at;
            const std::size_t end = _text.find("</", begin);
            if (end == std::string_view::npos)
                return std::nullopt;
            _at = end;
            if (name != "key")
                return changed(begin, end, name);
        }
        return std::nullopt;
    }

private:
    [[nodiscard]] ChangedBytes truth(std::size_t begin, bool is) const {
        const std::string_view tag = is ? "<false/>" : "<true/>";
        return {begin, _at, {tag.begin(), tag.end()}};
    }
    /// Of base64 the first digit, since the last one may be followed by padding; of a date the last but the
    /// letter of its zone.
    [[nodiscard]] ChangedBytes changed(std::size_t begin, std::size_t end, std::string_view kind) const {
        const auto firstDigit = std::find_if(_text.begin() + static_cast<std::ptrdiff_t>(begin),
                                             _text.begin() + static_cast<std::ptrdiff_t>(end), [](char each) {
                                                 const auto byte = static_cast<std::uint8_t>(each);
                                                 return isDigit(byte) || isLetter(byte);
                                             });
        const auto digitEnd = static_cast<std::size_t>(firstDigit - _text.begin()) + 1;
        std::optional<ChangedBytes> made = changedText(_bytes, begin,
                                                       kind == "data"   ? std::min(digitEnd, end)
                                                       : kind == "date" ? end - 1
                                                                        : end);
        if (!made)
            return {begin, end, {}};
        made->others.insert(made->others.end(), _text.begin() + static_cast<std::ptrdiff_t>(made->end),
                            _text.begin() + static_cast<std::ptrdiff_t>(end));
        made->end = end;
        return *std::move(made);
    }

    Bytes _bytes;
    std::string_view _text;
    std::size_t _at = 0;
};

/// By the marker's upper half.
enum Kind : std::uint8_t {
    Truth = 0,
    Integer = 1,
    Real = 2,
    Date = 3,
    Blob = 4,
    ASCII = 5,
    UTF16 = 6,
    Dictionary = 13
};

std::optional<ChangedBytes> changedObject(Bytes list, const BinaryObjectTable& table, BinaryObject object) {
    const int kind = object.marker >> 4;
    std::size_t size = std::size_t{1} << (object.marker & 3);
    if (kind == Truth) {
        const bool isTruth = object.marker == 8 || object.marker == 9;
        return isTruth ? changedBits(list, object.offset, object.offset + 1, 0, 1) : std::nullopt;
    }
    if (kind == Blob || kind == ASCII || kind == UTF16) {
        if (!table.readCount(object) || object.count > table.end())
            return std::nullopt;
        size = static_cast<std::size_t>(object.count) * (kind == UTF16 ? 2 : 1);
    }
    const std::size_t end = object.content + size;
    if (end > table.end() || size == 0)
        return std::nullopt;
    switch (kind) {
    case Integer: return changedBits(list, object.content, end, size - 1, 1);
    case Real: return changedBits(list, object.content, end, 2, 1); // by less than a hundredth
    case Date: return changedBits(list, object.content, end, 4, 1); // by seconds
    case Blob: return changedBits(list, object.content, end, 0, 1);
    case ASCII: return changedText(list, object.content, end);
    case UTF16: return changedText(list, object.content, end, 2);
    default: return std::nullopt;
    }
}

/// Which objects are keys of dictionaries.
std::vector<bool> keysOf(const BinaryObjectTable& table) {
    std::vector<bool> keys(static_cast<std::size_t>(table.objectCount()));
    for (std::size_t i = 0; i < keys.size(); ++i) {
        Result<BinaryObject> object = table.object(i);
        if (!object || object->marker >> 4 != Dictionary || !table.readCount(*object))
            continue;
        for (std::uint64_t j = 0; j < object->count; ++j) {
            const std::size_t at = object->content + static_cast<std::size_t>(j) * table.referenceSize();
            if (at + table.referenceSize() > table.end())
                break;
            if (const std::uint64_t key = table.numberAt(at, table.referenceSize()); key < keys.size())
                keys[static_cast<std::size_t>(key)] = true;
        }
    }
    return keys;
}

std::vector<ChangedBytes> binaryScalars(Bytes list, std::size_t most) {
    const Result<BinaryObjectTable> table = BinaryObjectTable::open(list);
    // Beside the scalars there are as many keys, and arrays and dictionaries.
    if (!table || table->objectCount() > 4 * most)
        return {};
    const std::vector<bool> keys = keysOf(*table);
    std::vector<ChangedBytes> scalars;
    for (std::size_t i = 0; i < keys.size(); ++i)
        if (const Result<BinaryObject> object = table->object(i); object && !keys[i])
            if (std::optional<ChangedBytes> changed = changedObject(list, *table, *object))
                scalars.push_back(*std::move(changed));
    return scalars.size() > most ? std::vector<ChangedBytes>() : scalars;
}

} // namespace

std::vector<ChangedBytes> listScalars(Bytes list, std::size_t most) {
    constexpr std::string_view mark = "bplist";
    if (list.size() >= mark.size() && std::equal(mark.begin(), mark.end(), list.begin()))
        return binaryScalars(list, most);
    std::vector<ChangedBytes> scalars;
    XMLScalars reading(list);
    while (std::optional<ChangedBytes> each = reading.next()) {
        if (each->others.empty())
            continue;
        if (scalars.size() == most)
            return {};
        scalars.push_back(*std::move(each));
    }
    return scalars;
}

} // namespace velmora
