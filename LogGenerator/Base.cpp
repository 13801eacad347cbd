// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Base.h"

#include "LogGenerator/ArrayLock.h"
#include "Platform/SystemLog.h"

#include <iterator>
#include <utility>

namespace velmora {

namespace {

/// One row for each of the entries, which stand side by side and are as long as their layout.
void appendRows(Array& elements, Bytes entries, const Layout& layout) {
    const CountedList list(Record(entries), 0, layout.minimumLength, entries.size() / layout.minimumLength);
    elements.reserve(list.count());
    for (std::size_t i = 0; i < list.count(); ++i)
        writeFields(elements.appendRow(), list[i], layout);
}

} // namespace

Base* Base::initWithDict(ClassDictionary& classDict, CodeDictionary& codeDict) {
    classDict.insert_or_assign(std::string(getSectionName()), this);
    updateLogCodeDict(codeDict);
    return this;
}

void Base::updateSectionRef(const Value& node) {
    _dictionaryRef.refer(node.dictionaryRef());
    _arrayRef.refer(node.arrayRef());
    logLine(LogPriority::Warning, getSectionName());
}

Value Base::node() const {
    if (DictionaryRef dictionary = _dictionaryRef.share())
        return dictionary;
    return _arrayRef.share();
}

void Base::updateLogCodeDict(CodeDictionary& codeDict) {
    const std::vector<std::uint32_t> codes = getLogCodeArray();
    logFormat(LogPriority::Warning, "Array Count: %d", static_cast<int>(codes.size()));
    for (const std::uint32_t code : codes)
        codeDict[std::to_string(code)].push_back(this);
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
    // Entry i is the threshold above which the value is -(i + 1) dB. The last threshold gives -31 like the
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

void Base::setText(std::string_view label, std::string_view text) const {
    if (Dictionary* const node = dictionary())
        node->setText(label, text);
}

bool Base::show(const Record& record, const Layout& layout) const {
    if (record.size() < layout.minimumLength)
        return false;
    if (Dictionary* const node = dictionary())
        writeFieldsLater(*node, record, layout);
    return true;
}

void Base::showList(const ListField& field, const CountedList& list, std::uint32_t logCode) const {
    constexpr auto write = [](Dictionary& node, Bytes bytes, const void* table) {
        const auto& wanted = *static_cast<const ListField*>(table);
        const ArrayRef entries = makeArray();
        appendRows(*entries, bytes, wanted.entry);
        node.set(wanted.label, entries);
    };
    reportMissingEntries(list, logCode);
    if (Dictionary* const node = dictionary())
        node->writeLater({write, &field}, list.entries().bytes());
}

Array Base::rows(const CountedList& list, const Layout& layout, std::uint32_t logCode) {
    reportMissingEntries(list, logCode);
    Array result;
    appendRows(result, list.entries().bytes(), layout);
    return result;
}

void Base::reportMissingEntries(const CountedList& list, std::uint32_t logCode) {
    reportMissingEntries(list.whole(), list.count(), logCode);
}

void Base::reportMissingEntries(std::size_t whole, std::size_t count, std::uint32_t logCode) {
    if (whole < count)
        logFormat(LogPriority::Error, "Record 0x%04X: %d of %d entries", logCode, static_cast<int>(whole),
                  static_cast<int>(count));
}

void Base::clearElements() const {
    if (Array* const node = array())
        clearElementsInArray(*node);
}

void Base::replaceElements(const Array& newElements) const {
    if (Array* const node = array())
        replaceArray(*node, newElements);
}

void Base::showRows(const CountedList& list, const Layout& layout, std::uint32_t logCode) const {
    constexpr auto write = [](Array& elements, Bytes bytes, const void* table) {
        appendRows(elements, bytes, *static_cast<const Layout*>(table));
    };
    reportMissingEntries(list, logCode);
    replaceElementsLater({write, &layout}, list.entries());
}

void Base::replaceElementsLater(const Writing<Array>& writing, const Record& record) const {
    if (Array* const node = array()) {
        ArrayLock::Guard guard;
        node->writeLater(writing, record.bytes());
    }
}

const std::vector<Cell>* Base::cellsOf(const Data& record) const {
    const std::vector<Cell>* cells = readCells(record);
    if (!cells)
        logLine(LogPriority::Error, "Failed to get Cell Array\n");
    return cells;
}

void Base::unknownLogMessage(std::uint32_t logCode) {
    logFormat(LogPriority::Error, "Received an unknown log message: %d", static_cast<int>(logCode));
}

} // namespace velmora
