// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Snapshots/SnapshotReader.h"

#include "Platform/DateText.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/Files/DataSource.h"

#include <algorithm>
#include <chrono>
#include <vector>

namespace velmora {

namespace {

/// A history has five refreshes, each with the object of one message and its display, which has no more
/// values than that; and a few values about each.
constexpr PropertyListLimits snapshotLimits{
    .maximumObjects = 11 * messageLimits.maximumObjects,
    .maximumMemory = std::size_t{512} << 20,
    .quotesInput = messageLimits.quotesInput,
};

/// How far apart the application's refreshes are.
constexpr std::chrono::seconds refreshInterval(2);

std::optional<Time> timeOf(const Value& value) {
    if (const std::string* text = value.asString())
        return timeOfDateDescription(*text);
    return std::nullopt;
}

/// Whether the serialized-object decoder takes it: any other kind would end the program.
bool isDisplayTree(const Value& value) {
    if (const Dictionary* dictionary = value.asDictionary())
        return std::all_of(dictionary->begin(), dictionary->end(),
                           [](const Dictionary::Entry& entry) { return isDisplayTree(entry.value); });
    if (const Array* array = value.asArray())
        return std::all_of(array->begin(), array->end(), isDisplayTree);
    return value.asString() != nullptr;
}

Result<Value> readAll(ChunkedInput& input) {
    if (input.ensure(snapshotLimits.maximumBytes + 1))
        return Failure{"property list of more than " + std::to_string(snapshotLimits.maximumBytes) +
                       " bytes, wanted a snapshot of at most that"};
    if (input.failure())
        return *input.failure();
    return readPropertyList(input.available(), snapshotLimits);
}

} // namespace

Result<std::unique_ptr<SnapshotReader>> SnapshotReader::open(ChunkedInput input) {
    const Result<Value> root = readAll(input);
    if (!root)
        return Failure{root.reason()};
    const Dictionary* snapshot = root->asDictionary();
    if (!snapshot)
        return Failure{"property list whose root is of kind " + std::string(nameOf(root->kind())) +
                       ", wanted a snapshot's dictionary"};
    // A snapshot that was saved before there was a decoder holds nothing but the time.
    if (!snapshot->contains("Timestamp") && !snapshot->contains("Data"))
        return Failure{"property list without \"Timestamp\" and \"Data\", wanted a snapshot's dictionary"};
    if (const Value& data = (*snapshot)["Data"]; !data.isNone() && !data.asArray())
        return Failure{"snapshot whose \"Data\" is of kind " + std::string(nameOf(data.kind())) +
                       ", wanted an array"};
    std::unique_ptr<SnapshotReader> reader(new SnapshotReader(*snapshot));
    reader->lookAhead();
    return reader;
}

SnapshotReader::SnapshotReader(const Dictionary& snapshot)
    : _entries(snapshot["Data"].arrayRef()),
      _timestamp(velmora::timeOf(snapshot["Timestamp"]).value_or(Time())) {
    if (const std::string* text = snapshot["Description"].asString(); text && !text->empty())
        addComment({Comment::About::Snapshot, 0, 0, *text});
    if (!_entries)
        return;
    for (const Value& entry : *_entries) {
        const Dictionary* fields = entry.asDictionary();
        const Value* raw = fields ? fields->find("DisplayState") : nullptr;
        if (!raw)
            continue;
        _hasRawMessages = true;
        _isBinary = raw->asData() != nullptr;
        if (!_isBinary)
            setTechnology(shortTechnologyName(kVoxLogChannelTechnology_IFX));
        break;
    }
}

std::optional<LoggedMessage> SnapshotReader::read() {
    for (;;) {
        if (std::optional<LoggedMessage> message = nextOfEntry())
            return message;
        if (!_entries || _nextEntry == _entries->size())
            return std::nullopt;
        openEntry((*_entries)[_nextEntry++]);
    }
}

void SnapshotReader::openEntry(const Value& entry) {
    const Dictionary* fields = entry.asDictionary();
    if (!fields) {
        addRecordLoss(0, place() + "of kind " + std::string(nameOf(entry.kind())) + ", wanted dictionary");
        return;
    }
    const Value& raw = (*fields)["DisplayState"];
    const Data* log = (*fields)["DLF"].asData();
    _isLog = !_hasRawMessages && log;
    if (_isLog) {
        openRecords(*log, RecordChain::Layout::DLF);
        return;
    }
    // A display that nothing had been decoded for yet left an empty entry.
    if (raw.isNone())
        return;

    const std::optional<Time> date = velmora::timeOf((*fields)["Date"]);
    const std::optional<Time> earlier = std::exchange(_refresh, date       ? *date
                                                                : _refresh ? *_refresh + refreshInterval
                                                                           : _timestamp);
    _begin = *_refresh - refreshInterval;
    if (earlier && *earlier <= *_refresh)
        _begin = std::max(_begin, *earlier);

    if (const Data* bytes = raw.asData(); bytes && _isBinary) {
        openRecords(*bytes, RecordChain::Layout::RawMessages);
    } else if (_isBinary || bytes) {
        addRecordLoss(bytes ? bytes->size() : 0,
                      place() + "raw material of kind " + std::string(nameOf(raw.kind())) + ", wanted " +
                          (_isBinary ? "data" : "an object") + " as in the entries before");
    } else {
        openObject(raw);
    }
}

void SnapshotReader::openRecords(const Data& bytes, RecordChain::Layout layout) {
    constexpr std::size_t slack = 8192; // more than a chunk needs at its end
    const std::size_t chunk = std::min(bytes.size() + slack, ChunkedInput::defaultChunkSize);
    _records.emplace(ChunkedInput(std::make_unique<DataSource>(bytes), chunk), layout);
    _size = bytes.size();
}

void SnapshotReader::openObject(const Value& object) {
    if (!isDisplayTree(object)) {
        addRecordLoss(0, place() + "object that holds other kinds than string, array and dictionary");
        return;
    }
    const Result<std::string> list = writePropertyList(object);
    if (!list) {
        addRecordLoss(0, place() + list.reason());
    } else if (list->size() > maximumMessageSize) {
        addRecordLoss(list->size(), place() + "object of " + std::to_string(list->size()) +
                                        " bytes, wanted at most " + std::to_string(maximumMessageSize));
    } else {
        countRecord();
        _pending =
            LoggedMessage{_begin, Data(std::vector<std::uint8_t>(list->begin(), list->end())), number(), 0};
    }
}

/// The next message of the current entry; the last one waits until it is known to be that.
std::optional<LoggedMessage> SnapshotReader::nextOfEntry() {
    while (_records) {
        std::optional<RecordChain::Record> record = nextRecord(*_records, place());
        if (!record) {
            _records.reset();
            break;
        }
        LoggedMessage message{{}, std::move(record->message), number(), record->offset};
        if (_isLog) {
            message.time = RecordChainReader::timeOf(*record);
            return message;
        }
        const double part = static_cast<double>(record->offset) / static_cast<double>(_size);
        const auto span = static_cast<double>((*_refresh - _begin).count());
        message.time = _begin + std::chrono::nanoseconds(static_cast<std::int64_t>(span * part));
        if (std::optional<LoggedMessage> earlier = std::exchange(_pending, std::move(message)))
            return earlier;
    }
    if (_pending)
        _pending->refresh = _refresh;
    return std::exchange(_pending, std::nullopt);
}

/// The prefix of a loss's reason.
std::string SnapshotReader::place() const {
    return "entry " + std::to_string(_nextEntry) + ": ";
}

} // namespace velmora
