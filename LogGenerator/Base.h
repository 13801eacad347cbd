// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Display/WantedLabels.h"
#include "LogGenerator/Fields/DisplayWriter.h"
#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/KeptRecords.h"
#include "LogGenerator/Observations/Damage.h"
#include "LogGenerator/View.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class Base;
class ContentVisitor;
class FieldMap;
class Observer;

/// Section name to section. The class index owns the sections.
using ClassDictionary = std::map<std::string, Base*, std::less<>>;
/// Log code as a decimal string ("53472") to the sections that subscribe to it, in the order of their
/// registration.
using CodeDictionary = std::map<std::string, std::vector<Base*>, std::less<>>;

/// A section: one block of the measurement screen. Its views are the log codes that it subscribes to with
/// what it reads there, and what it shows of a record is one function, `decode`, which names the fields to a
/// visitor. Its node of the display dictionary is owned by the display; the section only refers to it. Main
/// thread only.
///
/// A record is checked on arrival, and its errors are logged. Its fields are written when the
/// generator hands the display out (`writeNode`) or when the node is requested; see KeptRecords.
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
    /// What the section reads, a constant; empty for a section that is only there to be shown.
    [[nodiscard]] virtual std::span<const View> views() const = 0;
    /// The codes of the views, in their order.
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const;
    /// Takes one record (without the optional prefix) that was routed here under `logCode`. Malformed records
    /// are logged and dropped, and the node keeps its earlier values.
    virtual void updateWithData(const Data& data, std::uint32_t logCode);

    /// Names the fields of a record of the view to the visitor, in the order in which they are shown.
    /// Precondition: the record was accepted by `updateWithData`. The default names the fields of the view's
    /// table.
    virtual void decode(const View& view, const Record& record, FieldVisitor& visitor) const;

    /// Describes everything that `decode` may name of records of the view. The default describes the view's
    /// table or contents.
    virtual void describe(const View& view, ContentVisitor& visitor) const;
    /// From now on the observer gets what `decode` names of each accepted record, by the section's map. Null:
    /// nothing is observed. Both must outlive the section or the next call.
    void observe(Observer* observer, const FieldMap* map) {
        _observer = observer;
        _fieldMap = map;
    }

    /// What is written of the node from now on; null for all, which is the default. Where nothing is, records
    /// are checked and observed and not kept.
    void setWanted(std::unique_ptr<const WantedLabels> wanted) { _wanted = std::move(wanted); }
    [[nodiscard]] bool isWanted() const { return !_wanted || !_wanted->isEmpty(); }
    /// The sections whose nodes are to be written: from now on this section joins them when it keeps a
    /// record. The list must outlive it.
    void setUnwritten(std::vector<Base*>* sections) { _unwritten = sections; }
    /// The section has been taken off that list.
    void leftUnwritten() { _isUnwritten = false; }

    /// What the section needs of earlier records for later ones and has in no node; none for most sections.
    [[nodiscard]] virtual Value memory() const { return {}; }
    /// Continues with what another section of the kind had in memory.
    virtual void setMemory(const Value& /*memory*/) {}

    /// Sets the section's node, a dictionary or an array.
    void updateSectionRef(const Value& node);
    /// The node with all that has arrived; none before the display is built and once it is gone.
    [[nodiscard]] Value node();
    /// Whether that is the section's node.
    [[nodiscard]] bool isNode(const Value& value) const {
        return (value.asDictionary() && value.asDictionary() == _dictionaryRef.get()) ||
               (value.asArray() && value.asArray() == _arrayRef.get());
    }
    /// Writes what has arrived and is not in the node yet.
    void writeNode();
    [[nodiscard]] bool hasNode() const { return _dictionaryRef.get() || _arrayRef.get(); }

    // For those who keep what the node shows in a form of their own, and so need no node.

    /// Whether the node shows nothing but what `decode` has named to a DisplayWriter, and the texts of its
    /// template: it holds no other section.
    [[nodiscard]] bool showsOwnRecordsOnly() const { return _showsOwnRecordsOnly; }
    /// A number that stays while the node shows the same, and is one more after a record was kept. Any other
    /// is that of more records, or of another node.
    [[nodiscard]] const std::uint64_t& changes() const { return _records.changes(); }
    /// Names the fields of the record that was kept last. Precondition: there has been one.
    void nameLatest(FieldVisitor& visitor) const;
    /// Appends this section to the subscribers of each of its codes: a code listed twice is subscribed twice.
    void updateLogCodeDict(CodeDictionary& codeDict);

    /// Both rewrite the array under `ArrayLock`; the array object stays the same, so that the display keeps
    /// pointing at it.
    static void clearElementsInArray(Array& array);
    static void replaceArray(Array& array, const Array& newElements);

    /// Whole dB, 0 down to -31, of an unsigned linear Ec/No on a scale where 524288 (2^19) is 0 dB.
    /// Thresholds of the modem's own table; its last two rows both return -31, and 705 and below return 0, as
    /// intended.
    [[nodiscard]] static std::int16_t lookUpECNO(std::uint32_t value);

protected:
    Base() = default;

    /// The log line of each record, decoded or not: the section's name at warning priority. It must not be
    /// more urgent than that: where warnings are not logged, it is not called.
    virtual void trace() const;
    /// A record under a code that no view has: an error line.
    virtual void unknownCode(std::uint32_t logCode) const;
    /// Logs what an accepted record lacks, once, on arrival. The default logs nothing.
    virtual void check(const View& view, const Record& record) const;
    /// The parts that `decode` names of this record, where records of the view differ in their labels (see
    /// KeptRecords). The default is that they do not.
    [[nodiscard]] virtual KeptRecords::Parts partsOf(const View& view, const Record& record) const;

    /// Keeps a record to be written into the node. Without a node it is dropped. `store`, called before, may
    /// keep more than bytes in the section: what it replaces has been written by then where it must be.
    template <class Store>
    void keep(const View& view, const Record& record, KeptRecords::Parts parts, Store store) {
        if (!prepareFor(view, parts))
            return;
        store();
        if (isWanted())
            keepPrepared(view, record, parts);
        if (_observer)
            observeRecord(view, record);
    }
    void keep(const View& view, const Record& record, KeptRecords::Parts parts) {
        keep(view, record, parts, [] {});
    }

    /// The view of that code, or null.
    [[nodiscard]] const View* viewOf(std::uint32_t logCode) const {
        for (const View& view : _views.empty() ? views() : _views)
            if (view.code == logCode)
                return &view;
        return nullptr;
    }

    /// "Record 0x5137: 2 of 3 entries", where the record holds fewer than its count.
    void reportMissingEntries(const CountedList& list, std::uint32_t logCode) const;
    /// The same for a list whose entries' lengths differ: `complete` of `count` lie inside the record.
    void reportMissingEntries(std::size_t complete, std::size_t count, std::uint32_t logCode) const;
    /// What is observed of the message includes that it is malformed.
    void observeDamage(Damage damage) const;
    /// The error line for a code that the section does not handle.
    static void unknownLogMessage(std::uint32_t logCode);

private:
    /// Precondition: there has been a node.
    [[nodiscard]] std::size_t indexOf(const View& view) const {
        return static_cast<std::size_t>(&view - _views.data());
    }
    /// Writes what the record would replace and has more to show. Whether there is a node to keep it for.
    [[nodiscard]] bool prepareFor(const View& view, KeptRecords::Parts parts);
    void keepPrepared(const View& view, const Record& record, KeptRecords::Parts parts);
    void observeRecord(const View& view, const Record& record);
    void writeInto(Array& node);

    /// A node that the display owns. On the one thread there is, it cannot be destroyed while a record is
    /// decoded, so that it is used without shared ownership, which would cost more than to write there.
    template <class Node>
    class WatchedNode {
    public:
        void assign(const std::shared_ptr<Node>& node) {
            _watch = node;
            _node = node.get();
        }
        [[nodiscard]] Node* get() const { return _watch.expired() ? nullptr : _node; }
        [[nodiscard]] std::shared_ptr<Node> lock() const { return _watch.lock(); }

    private:
        std::weak_ptr<Node> _watch;
        Node* _node = nullptr;
    };

    /// `sectionRef`: the one of the two that fits the node's kind.
    WatchedNode<Dictionary> _dictionaryRef;
    WatchedNode<Array> _arrayRef;
    std::span<const View> _views; ///< as `views` returns them, since there has been a node
    bool _showsOwnRecordsOnly = false;
    KeptRecords _records;
    DisplayWriter::SpareRows _spareRows;
    std::unique_ptr<const WantedLabels> _wanted; ///< null: all are
    std::vector<Base*>* _unwritten = nullptr;
    bool _isUnwritten = false; ///< in that list
    Observer* _observer = nullptr;
    const FieldMap* _fieldMap = nullptr;
};

} // namespace velmora
