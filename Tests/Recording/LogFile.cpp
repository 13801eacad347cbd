// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/LogFile.h"

#include "LogMessages/RecordTime.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Tests/Support/FakeClock.h"

#include <memory>
#include <optional>
#include <stdexcept>

namespace velmora {

Data stampedRecord(std::uint16_t code, std::string_view payloadHex, std::uint64_t timestamp,
                   std::uint8_t type) {
    const Data plain = record(code, payloadHex, type);
    std::vector<std::uint8_t> bytes(plain.bytes().begin(), plain.bytes().end());
    for (std::size_t i = 0; i < 8; ++i)
        bytes[5 + i] = static_cast<std::uint8_t>(timestamp >> 8 * i);
    return Data(std::move(bytes));
}

Data bareRecord(std::uint16_t code, std::string_view payloadHex, std::uint64_t timestamp) {
    return stampedRecord(code, payloadHex, timestamp).from(1);
}

Data versionReport() {
    return joined(hex(R"(A100               // length 161
                         FD1F               // code 0x1FFD
                         0000000000000000   // time stamp
                         0100 0100          // report numbers
                         2856656C6D6F7200)"),          // version "(Velmor"
                  Data(std::vector<std::uint8_t>(57)), // executable and build: to offset 81
                  hex(R"(D08DFA6A              // 2026-11-16 05:00:00 UTC, seconds since 1970
                         0000 0000)"),
                  Data(std::vector<std::uint8_t>(72)));
}

std::uint64_t stampAfter(std::uint64_t units) {
    return recordTimestamp(FakeClock::defaultNow()) + (units << 16);
}

DictionaryRef historyEntry(Value rawMessages, std::string_view date) {
    DictionaryRef entry = makeDictionary();
    entry->set("DisplayState", std::move(rawMessages));
    entry->set("Display", makeDictionary());
    entry->set("ExtraInfo", makeDictionary());
    entry->set("Date", date);
    entry->set("Description", std::string("Snapshot (").append(date).append(")"));
    return entry;
}

Value snapshotOf(std::initializer_list<Value> entries) {
    const DictionaryRef root = makeDictionary();
    root->set("Timestamp", "2026-11-16 05:10:00 +0000");
    root->set("Data", std::make_shared<Array>(entries));
    root->set("Description", "a test");
    return root;
}

Data snapshotFile(std::initializer_list<Value> entries, bool binary) {
    const Value root = snapshotOf(entries);
    if (binary) {
        auto bytes = writeBinaryPropertyList(root);
        if (!bytes)
            throw std::invalid_argument(bytes.reason());
        return Data(*std::move(bytes));
    }
    const auto text = writeXMLPropertyList(root);
    if (!text)
        throw std::invalid_argument(text.reason());
    return Data(std::vector<std::uint8_t>(text->begin(), text->end()));
}

ReadOut readAnyForm(const Data& file, std::size_t piece, std::size_t good) {
    ReadOut out;
    auto reader = openMessages(ChunkedInput(std::make_unique<MemorySource>(file, piece, good)));
    if (!reader) {
        out.failure = reader.reason();
        return out;
    }
    while (const std::optional<LoggedMessage> message = (*reader)->next()) {
        std::string text = describe(*message);
        if (message->refresh)
            text += ", refresh at " + std::to_string(message->refresh->time_since_epoch().count()) + " ns";
        out.messages.push_back(std::move(text));
    }
    for (const Loss& loss : (*reader)->losses())
        out.losses.push_back(describe(loss));
    if ((*reader)->failure())
        out.failure = (*reader)->failure()->reason;
    out.technology = (*reader)->technology();
    return out;
}

} // namespace velmora
