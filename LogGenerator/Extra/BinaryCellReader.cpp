// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/BinaryCellReader.h"

#include "PropertyLists/PropertyList.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::string_view magic = "bplist00";
constexpr std::size_t trailerLength = 32;
/// Such a list is well within every limit of the property-list reader but that of its objects, since a list
/// can refer to the same one several times.
constexpr std::size_t maximumLength = std::size_t{1} << 16;
constexpr std::size_t maximumObjects = messageLimits.maximumObjects;
constexpr std::size_t maximumTextLength = 64;

class Reader {
public:
    explicit Reader(Bytes list) : _list(list) { _keys.fill(unreadKey); }

    bool read(std::vector<Cell>& cells) {
        Object root;
        if (!readTrailer() || !object(_root, root) || root.type != arrayType || !hasReferences(root, 1))
            return false;
        std::size_t objects = 1 + root.count;
        for (std::size_t i = 0; i < root.count; ++i) {
            Object dictionary;
            if (!object(reference(root, i), dictionary) || dictionary.type != dictionaryType ||
                !hasReferences(dictionary, 2))
                return false;
            objects += 2 * dictionary.count;
            if (objects > maximumObjects)
                return false;
            cells.emplace_back();
            for (std::size_t j = 0; j < dictionary.count; ++j)
                if (!readEntry(reference(dictionary, j), reference(dictionary, dictionary.count + j),
                               cells.back()))
                    return false;
        }
        return true;
    }

private:
    static constexpr unsigned integerType = 0x1;
    static constexpr unsigned textType = 0x5;
    static constexpr unsigned arrayType = 0xA;
    static constexpr unsigned dictionaryType = 0xD;

    struct Object {
        unsigned type = 0;
        std::size_t count = 0; ///< the low half of the marker, or the count after it
        std::size_t content = 0;
    };

    /// Precondition: the bytes, of which there are 1, 2, 4 or 8, are there.
    [[nodiscard]] std::uint64_t number(std::size_t offset, std::size_t width) const {
        const std::uint8_t* const bytes = &_list[offset];
        switch (width) {
        case 1: return *bytes;
        case 2: return numberAt<std::uint16_t>(bytes, std::endian::big);
        case 4: return numberAt<std::uint32_t>(bytes, std::endian::big);
        default: return numberAt<std::uint64_t>(bytes, std::endian::big);
        }
    }

    bool readTrailer() {
        if (_list.size() > maximumLength || _list.size() < magic.size() + trailerLength ||
            !std::equal(magic.begin(), magic.end(), _list.begin(),
                        [](char wanted, std::uint8_t found) { return static_cast<char>(found) == wanted; }))
            return false;
        const std::size_t trailer = _list.size() - trailerLength;
        _offsetWidth = _list[trailer + 6];
        _referenceWidth = _list[trailer + 7];
        const std::uint64_t count = number(trailer + 8, 8);
        const std::uint64_t root = number(trailer + 16, 8);
        const std::uint64_t table = number(trailer + 24, 8);
        if (_offsetWidth < 1 || _offsetWidth > 2 || _referenceWidth < 1 || _referenceWidth > 2 ||
            root >= count || table < magic.size() || table > trailer ||
            count > (trailer - table) / _offsetWidth)
            return false;
        _count = static_cast<std::size_t>(count);
        _root = static_cast<std::size_t>(root);
        _table = static_cast<std::size_t>(table);
        return true;
    }

    bool object(std::size_t index, Object& object) const {
        if (index >= _count)
            return false;
        const auto offset = static_cast<std::size_t>(number(_table + index * _offsetWidth, _offsetWidth));
        if (offset < magic.size() || offset >= _table)
            return false;
        object.type = _list[offset] >> 4;
        object.count = _list[offset] & 0xF;
        object.content = offset + 1;
        if (object.count != 0xF || object.type == integerType)
            return true;
        // The count is an integer object of its own.
        const std::size_t width = object.content < _table && _list[object.content] == 0x10   ? 1
                                  : object.content < _table && _list[object.content] == 0x11 ? 2
                                                                                             : 0;
        if (width == 0 || _table - object.content - 1 < width)
            return false;
        object.count = static_cast<std::size_t>(number(object.content + 1, width));
        object.content += 1 + width;
        return true;
    }

    [[nodiscard]] bool hasReferences(const Object& container, std::size_t anEntry) const {
        return container.count <= (_table - container.content) / (anEntry * _referenceWidth);
    }
    [[nodiscard]] std::size_t reference(const Object& container, std::size_t index) const {
        return static_cast<std::size_t>(number(container.content + index * _referenceWidth, _referenceWidth));
    }

    bool text(const Object& object, std::string_view& text) const {
        if (object.type != textType || object.count > maximumTextLength ||
            object.count > _table - object.content)
            return false;
        const Bytes bytes = _list.subspan(object.content, object.count);
        if (std::any_of(bytes.begin(), bytes.end(), [](std::uint8_t byte) { return byte >= 0x80; }))
            return false;
        text = std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size());
        return true;
    }

    /// What a key means: the index of a number, or one of these.
    static constexpr std::uint8_t technologyKey = cellNumberCount;
    static constexpr std::uint8_t typeKey = cellNumberCount + 1;
    static constexpr std::uint8_t otherKey = cellNumberCount + 2;
    static constexpr std::uint8_t unreadKey = 0xFF;

    /// Each key is read once; the cells share them.
    bool readKey(std::size_t index, std::uint8_t& meaning) {
        const bool remembered = index < _keys.size();
        if (remembered && _keys[index] != unreadKey) {
            meaning = _keys[index];
            return true;
        }
        Object key;
        std::string_view keyText;
        if (!object(index, key) || !text(key, keyText))
            return false;
        meaning = indexOf(keyText, cellNumberKeys);
        if (keyText == kVoxCellMonitorCellRadioAccessTechnology)
            meaning = technologyKey;
        else if (keyText == kVoxCellMonitorCellType)
            meaning = typeKey;
        else if (meaning == cellNumberCount)
            meaning = otherKey;
        if (remembered)
            _keys[index] = meaning;
        return true;
    }

    bool readEntry(std::size_t keyIndex, std::size_t valueIndex, Cell& cell) {
        std::uint8_t key = otherKey;
        Object value;
        std::string_view valueText;
        if (!readKey(keyIndex, key) || !object(valueIndex, value))
            return false;
        if (value.type == integerType) {
            // Numbers of 1, 2 and 4 bytes have no sign, those of 8 have.
            const std::size_t width = std::size_t{1} << value.count;
            if (value.count > 3 || width > _table - value.content)
                return false;
            if (key == technologyKey || key == typeKey)
                return false; // neither is a number
            if (key < cellNumberCount)
                cell.setNumber(key, static_cast<std::int64_t>(number(value.content, width)));
            return true;
        }
        if (key == technologyKey || key == typeKey) {
            // The cells share these as well.
            Kind& kind = _kinds[valueIndex % _kinds.size()];
            if (kind.object != valueIndex) {
                if (!text(value, valueText))
                    return false;
                kind = {valueIndex, indexOf(valueText, cellTechnologies), indexOf(valueText, cellTypes)};
            }
            (key == technologyKey ? cell.kind.technology : cell.kind.type) =
                key == technologyKey ? kind.technology : kind.type;
            return true;
        }
        if (!text(value, valueText))
            return false;
        if (key < cellNumberCount)
            cell.clearNumber(key);
        return true;
    }

    /// A text that names a technology or a type.
    struct Kind {
        std::size_t object = ~std::size_t{0};
        std::uint8_t technology = 0;
        std::uint8_t type = 0;
    };

    Bytes _list;
    std::array<Kind, 8> _kinds{};
    std::size_t _offsetWidth = 0;
    std::size_t _referenceWidth = 0;
    std::size_t _count = 0;
    std::size_t _root = 0;
    std::size_t _table = 0;
    std::array<std::uint8_t, 64> _keys; ///< by object
};

} // namespace

bool readBinaryCells(Bytes list, std::vector<Cell>& cells) {
    return Reader(list).read(cells);
}

} // namespace velmora
