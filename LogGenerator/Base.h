// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/CellList.h"
#include "LogGenerator/Fields/Field.h"
#include "LogMessages/Record.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class Base;

/// Section name to section. The class index owns the sections.
using ClassDictionary = std::map<std::string, Base*, std::less<>>;
/// Log code as a decimal string ("53472") to the sections that want it, in the order of their registration.
using CodeDictionary = std::map<std::string, std::vector<Base*>, std::less<>>;

/// The extra stream's codes start here: 0xFF0000 plus the 16-bit code of the record.
inline constexpr std::uint32_t firstExtraCode = 0xFF0000;

/// A list that stands as a value in a section's dictionary: its label, and the table of its entries.
struct ListField {
    std::string_view label;
    Layout entry;
};

/// A section: one block of the measurement screen. It names itself, lists the log codes that it wants, and
/// writes display strings straight into its node of the display dictionary when one of their records arrives.
/// The node is owned by the display; the section only refers to it. Main thread only.
///
/// What a section shows by its tables is handed to the node as bytes and becomes text when the node is looked
/// at (see Writing); errors in the record are found and told when it arrives. So the tables and functions
/// that are given to show... must be constants.
class Base {
public:
    virtual ~Base() = default;
    Base(const Base&) = delete;
    Base& operator=(const Base&) = delete;

    /// Registers the finished section under its name and with each of its codes; returns the section. A
    /// second section of the same name replaces the first in `classDict`.
    Base* initWithDict(ClassDictionary& classDict, CodeDictionary& codeDict);

    /// The section's display name, which is also the key of its node in the display template.
    [[nodiscard]] virtual std::string_view getSectionName() const = 0;
    /// The codes that the section wants, in the order in which they are registered; none for a section that
    /// is only there to be shown.
    [[nodiscard]] virtual std::vector<std::uint32_t> getLogCodeArray() const = 0;
    /// Decodes one record (without the optional prefix) that was routed here under `logCode`. What is
    /// malformed is logged and dropped, and the node keeps its earlier values.
    virtual void updateWithData(const Data& data, std::uint32_t logCode) = 0;

    /// Hands the section its node, a dictionary or an array.
    void updateSectionRef(const Value& node);
    /// The node; none before the display is built and once it is gone.
    [[nodiscard]] Value node() const;
    /// Appends this section to the subscribers of each of its codes: a code listed twice is subscribed twice.
    void updateLogCodeDict(CodeDictionary& codeDict);

    /// Has the section read the cell information array together with others.
    void shareCellList(std::shared_ptr<CellList> cells) { _cells = std::move(cells); }

    /// Both rewrite the array under `ArrayLock`; the array object stays the same, so that the display keeps
    /// pointing at it.
    static void clearElementsInArray(Array& array);
    static void replaceArray(Array& array, const Array& newElements);

    /// Whole dB, 0 down to -31, of an unsigned linear Ec/No on a scale where 524288 (2^19) is 0 dB.
    /// Thresholds of the modem's own table; its last two rows both give -31, and 705 and below give 0, on
    /// purpose.
    [[nodiscard]] static std::int16_t lookUpECNO(std::uint32_t value);

protected:
    Base() = default;

    /// The node, null before the display is built and where it is of the other kind. A value written to no
    /// node goes nowhere.
    [[nodiscard]] Dictionary* dictionary() const { return _dictionaryRef.get(); }
    [[nodiscard]] Array* array() const { return _arrayRef.get(); }

    /// Writes one value into the dictionary node.
    void setText(std::string_view label, std::string_view text) const;
    void setText(std::string_view label, const NumberText& number) const { setText(label, number.text()); }

    /// Writes all fields of the layout into the dictionary node, unless the record is shorter than its
    /// minimum, which is ignored silently. Whether it was long enough.
    bool show(const Record& record, const Layout& layout) const;
    /// Has `write(node, record)` write into the dictionary node once somebody looks at it (see Writing): what
    /// a layout does not say. It sets the same labels whatever the record.
    template <void (*write)(Dictionary& node, const Record& record)>
    void showWith(const Record& record) const {
        constexpr auto later = [](Dictionary& node, Bytes bytes, const void*) { write(node, Record(bytes)); };
        if (Dictionary* const node = dictionary())
            node->writeLater({later, nullptr}, record.bytes());
    }
    /// Puts a new array of rows (see `rows`) into the dictionary node; one that the display held under the
    /// label stays unchanged.
    void showList(const ListField& field, const CountedList& list, std::uint32_t logCode) const;

    /// A new array of one dictionary per entry, made by `layout`, whose minimum length is the entries' and
    /// their stride. Where the count promises more entries than the record holds, those that lie wholly
    /// inside are shown and one error line says so.
    [[nodiscard]] static Array rows(const CountedList& list, const Layout& layout, std::uint32_t logCode);
    /// That error line, where it is due.
    static void reportMissingEntries(const CountedList& list, std::uint32_t logCode);
    /// The same for a list whose entries' lengths differ: `whole` of `count` lie inside the record.
    static void reportMissingEntries(std::size_t whole, std::size_t count, std::uint32_t logCode);

    /// The array node emptied or refilled as above; nothing without a node.
    void clearElements() const;
    void replaceElements(const Array& newElements) const;
    /// The array node refilled with such rows.
    void showRows(const CountedList& list, const Layout& layout, std::uint32_t logCode) const;
    /// The array node refilled by `fill(elements, record)` once somebody looks at it.
    template <void (*fill)(Array& elements, const Record& record)>
    void showElementsWith(const Record& record) const {
        constexpr auto later = [](Array& elements, Bytes bytes, const void*) {
            fill(elements, Record(bytes));
        };
        replaceElementsLater({later, nullptr}, record);
    }

    /// The cells of a 0xFF0001 record (see CellList). Where there are none to be had, null and the error line
    /// "Failed to get Cell Array".
    [[nodiscard]] const std::vector<Cell>* cellsOf(const Data& record) const;
    /// The same without that line.
    [[nodiscard]] const std::vector<Cell>* readCells(const Data& record) const {
        return _cells->read(record);
    }

    /// The error line for a code that the section does not handle.
    static void unknownLogMessage(std::uint32_t logCode);

private:
    void replaceElementsLater(const Writing<Array>& writing, const Record& record) const;

    /// A node that the display owns. On the one thread there is, nothing takes it away while a record is
    /// decoded, so that it is looked at without a share in it, which would cost more than to write there.
    template <class Node>
    class WatchedNode {
    public:
        void refer(const std::shared_ptr<Node>& node) {
            _watch = node;
            _node = node.get();
        }
        [[nodiscard]] Node* get() const { return _watch.expired() ? nullptr : _node; }
        [[nodiscard]] std::shared_ptr<Node> share() const { return _watch.lock(); }

    private:
        std::weak_ptr<Node> _watch;
        Node* _node = nullptr;
    };

    /// `sectionRef`: the one of the two that fits the node's kind.
    WatchedNode<Dictionary> _dictionaryRef;
    WatchedNode<Array> _arrayRef;
    std::shared_ptr<CellList> _cells = std::make_shared<CellList>();
};

} // namespace velmora
