// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Base.h"

#include "LogGenerator/ArrayLock.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogGenerator/Observations/Observer.h"
#include "Platform/SystemLog.h"

#include <algorithm>
#include <iterator>

namespace velmora {

namespace {

bool isContainer(const Value& value) {
    return value.asDictionary() || value.asArray();
}

/// Whether a node as the template has it, or an earlier decoder left it, holds further nodes.
bool holdsNodes(const Value& node) {
    if (const Dictionary* const dictionary = node.asDictionary())
        return std::any_of(dictionary->begin(), dictionary->end(),
                           [](const Dictionary::Entry& entry) { return isContainer(entry.value); });
    const Array* const array = node.asArray();
    return array && std::any_of(array->begin(), array->end(), isContainer);
}

} // namespace

Base* Base::initWithDict(ClassDictionary& classDict, CodeDictionary& codeDict) {
    classDict.insert_or_assign(std::string(getSectionName()), this);
    updateLogCodeDict(codeDict);
    return this;
}

std::vector<std::uint32_t> Base::getLogCodeArray() const {
    std::vector<std::uint32_t> codes;
    for (const View& view : views())
        codes.push_back(view.code);
    return codes;
}

void Base::updateSectionRef(const Value& node) {
    writeNode();
    _dictionaryRef.assign(node.dictionaryRef());
    _arrayRef.assign(node.arrayRef());
    _views = views();
    _showsOwnRecordsOnly = !holdsNodes(node);
    _records.clear();
    _records.resize(_views.size());
    logLine(LogPriority::Warning, getSectionName());
}

Value Base::node() {
    writeNode();
    if (DictionaryRef dictionary = _dictionaryRef.lock())
        return dictionary;
    return _arrayRef.lock();
}

void Base::updateLogCodeDict(CodeDictionary& codeDict) {
    logFormat(LogPriority::Warning, "Array Count: %d", static_cast<int>(views().size()));
    for (const View& view : views())
        codeDict[std::to_string(view.code)].push_back(this);
}

void Base::updateWithData(const Data& data, std::uint32_t logCode) {
    if (isLogged(LogPriority::Warning)) // saves most records a virtual call
        trace();
    const View* const view = viewOf(logCode);
    if (!view) {
        unknownCode(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < view->minimumLength) {
        observeDamage(Damage::TooShort);
        return;
    }
    check(*view, record);
    keep(*view, record.part(0, std::min(view->readLength, record.size())), partsOf(*view, record));
}

void Base::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.table)
        visitor.fields(record, *view.table);
}

void Base::describe(const View& view, ContentVisitor& visitor) const {
    if (view.table)
        visitor.fields(view.table->fields);
    else
        visitor.contents(view.contents);
}

void Base::trace() const {
    logLine(LogPriority::Warning, getSectionName());
}

void Base::unknownCode(std::uint32_t logCode) const {
    unknownLogMessage(logCode);
}

void Base::check(const View&, const Record&) const {}

KeptRecords::Parts Base::partsOf(const View&, const Record&) const {
    return 1;
}

bool Base::prepareFor(const View& view, KeptRecords::Parts parts) {
    if (_arrayRef.get())
        _records.dropAllBut(indexOf(view)); // a list is replaced completely
    else if (!_dictionaryRef.get())
        return false;
    if (_records.wouldLose(indexOf(view), parts))
        writeNode();
    return true;
}

void Base::keepPrepared(const View& view, const Record& record, KeptRecords::Parts parts) {
    if (_records.keep(indexOf(view), record.bytes(), parts)) {
        writeNode();
    } else if (!_isUnwritten && _unwritten) {
        _unwritten->push_back(this);
        _isUnwritten = true;
    }
}

void Base::observeRecord(const View& view, const Record& record) {
    if (_observer->beginSection(*_fieldMap, view.code) && !_fieldMap->isEmpty())
        decode(view, record, *_observer);
}

void Base::writeNode() {
    if (Array* const list = _arrayRef.get()) {
        writeInto(*list);
    } else if (Dictionary* const node = _dictionaryRef.get()) {
        _records.writeAll([this, node](std::size_t view, Bytes bytes) {
            DisplayWriter writer(*node, _spareRows, _wanted.get());
            decode(_views[view], Record(bytes), writer);
        });
    } else {
        _records.clear();
    }
}

void Base::nameLatest(FieldVisitor& visitor) const {
    const std::size_t view = _records.latest();
    decode(_views[view], Record(Bytes(_records[view].bytes)), visitor);
}

void Base::writeInto(Array& node) {
    _records.writeAll([this, &node](std::size_t view, Bytes bytes) {
        const ArrayLock::Guard guard;
        DisplayWriter writer(node, _spareRows, _wanted.get());
        decode(_views[view], Record(bytes), writer);
    });
}

void Base::clearElementsInArray(Array& array) {
    ArrayLock::Guard guard;
    array.clear();
}

void Base::replaceArray(Array& array, const Array& newElements) {
    ArrayLock::Guard guard;
    array.clear();
    array.reserve(newElements.size());
    for (const Value& element : newElements)
        array.append(element);
}

std::int16_t Base::lookUpECNO(std::uint32_t value) {
    if (value >= 524288)
        return 0;
    // Entry i is the threshold above which the value is -(i + 1) dB. The last threshold means -31 like the
    // one before it: there is no -32.
    static constexpr std::uint32_t thresholds[] = {
        417647, 331808, 263624, 209463, 166441, 132268, 105123, 83562, 66435, 52830, 42023,
        33440,  26621,  21205,  16903,  13486,  10771,  8615,   6902,  5542,  4461,  3603,
        2921,   2240,   1949,   1607,   1336,   1120,   949,    813,   756,   705,
    };
    static_assert(std::size(thresholds) == 32);
    for (std::size_t i = 0; i < std::size(thresholds); ++i)
        if (value > thresholds[i])
            return static_cast<std::int16_t>(i == 31 ? -31 : -1 - static_cast<int>(i));
    return 0; // as for 0 dB and above, on purpose
}

void Base::observeDamage(Damage damage) const {
    if (_observer)
        _observer->damaged(damage);
}

void Base::reportMissingEntries(const CountedList& list, std::uint32_t logCode) const {
    if (!list.isComplete())
        reportMissingEntries(list.completeCount(), list.count(), logCode);
}

void Base::reportMissingEntries(std::size_t complete, std::size_t count, std::uint32_t logCode) const {
    if (complete >= count)
        return;
    observeDamage(Damage::MissingEntries);
    logFormat(LogPriority::Error, "Record 0x%04X: %d of %d entries", logCode, static_cast<int>(complete),
              static_cast<int>(count));
}

void Base::unknownLogMessage(std::uint32_t logCode) {
    logFormat(LogPriority::Error, "Received an unknown log message: %d", static_cast<int>(logCode));
}

} // namespace velmora
