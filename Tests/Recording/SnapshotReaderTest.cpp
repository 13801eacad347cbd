// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Snapshots/SnapshotReader.h"

#include "PropertyLists/PropertyList.h"
#include "Tests/Recording/LogFile.h"

#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// 2026-11-16 05:00:00 UTC, so many seconds and billionths later, as nanoseconds since 1970.
std::string at(int seconds, const char* fraction = "000000000") {
    return std::to_string(1794805200 + seconds) + fraction + " ns";
}

Data idle() {
    return record(0x512C, "05000100"); // 17 bytes
}
Data registered() {
    return record(0x7132, "010000"); // 16 bytes
}
const std::string idleHex = "0110002C51000000000000000005000100";
const std::string registeredHex = "010F0032710000000000000000010000";

TEST(SnapshotReader, givesTheMessagesOfEachRefresh) {
    for (const bool binary : {false, true}) {
        const ReadOut out = readAnyForm(snapshotFile(
            {historyEntry(joined(idle(), registered(), registered()), "2026-11-16 05:00:02 +0000"),
             historyEntry(registered(), "2026-11-16 05:00:04 +0000")},
            binary));
        // Offsets are those in the entry's raw messages, 49 bytes; the times spread over the 2 s before.
        EXPECT_THAT(
            out.messages,
            ElementsAre("1 at 0, " + at(0) + ": " + idleHex,
                        "2 at 17, " + at(0, "693877551") + ": " + registeredHex,
                        "3 at 33, " + at(1, "346938775") + ": " + registeredHex + ", refresh at " + at(2),
                        "4 at 0, " + at(2) + ": " + registeredHex + ", refresh at " + at(4)));
        EXPECT_EQ(out.technology, "Ostrel_GSM");
        EXPECT_THAT(out.losses, IsEmpty());
        EXPECT_EQ(out.failure, "");
    }
}

TEST(SnapshotReader, readsAHistoryOfTheLargestMessages) {
    // Five entries, each with an object of 100,000 values and its display.
    std::string array = "<array>";
    for (int i = 0; i < 99'999; ++i)
        array += "<string/>";
    array += "</array>";
    std::string list = "<dict><key>Timestamp</key><string/><key>Data</key><array>";
    for (int i = 0; i < 5; ++i)
        list += "<dict><key>DisplayState</key>" + array + "<key>Display</key>" + array + "</dict>";
    list += "</array></dict>";
    const ReadOut out = readAnyForm(Data(std::vector<std::uint8_t>(list.begin(), list.end())));
    EXPECT_EQ(out.failure, "");
    EXPECT_EQ(out.messages.size(), 5U);
}

TEST(SnapshotReader, splitsRawMessagesUnchanged) {
    // With prefixes, a wrong type, and records of the extra stream.
    const Data raw = hex(R"(02 0F00 3271 0000000000000000 010000
                            01 1000 2C51 0000000000000000 05000100
                            8171 01 0F00 3271 0000000000000000 010000
                            FF 0E00 0200 0000000000000000 3C3E
                            81FF FF 0D00 0000 0000000000000000 3C
                            03 1000 2C51 0000000000000000 05000100)");
    const ReadOut out = readAnyForm(snapshotFile({historyEntry(raw, "2026-11-16 05:00:02 +0000")}));
    std::vector<std::string> messages;
    for (const std::string& message : out.messages)
        messages.push_back(message.substr(message.find(": ") + 2));
    EXPECT_THAT(messages, ElementsAre("020F0032710000000000000000010000", idleHex, "8171" + registeredHex,
                                      "FF0E00020000000000000000003C3E", "81FFFF0D00000000000000000000003C",
                                      "0310002C51000000000000000005000100, refresh at " + at(2)));
    EXPECT_THAT(out.losses, IsEmpty());
}

TEST(SnapshotReader, losesWhatNoLengthLeadsThrough) {
    const Data cutShort = hex("01 1000 2C51");
    const ReadOut out = readAnyForm(snapshotFile({
        historyEntry(joined(idle(), cutShort, registered()), "2026-11-16 05:00:02 +0000"),
        historyEntry(cutShort, "2026-11-16 05:00:04 +0000"),
        historyEntry(joined(idle(), cutShort), "2026-11-16 05:00:06 +0000"),
    }));
    EXPECT_THAT(out.messages,
                ElementsAre("1 at 0, " + at(0) + ": " + idleHex,
                            "2 at 22, " + at(1, "157894736") + ": " + registeredHex + ", refresh at " + at(2),
                            "3 at 0, " + at(4) + ": " + idleHex + ", refresh at " + at(6)));
    // Raw material is never cut off, so that none of them is a tail.
    EXPECT_THAT(
        out.losses,
        ElementsAre("at 17, 5 bytes, record 2: entry 1: record length 16 does not lead to another record",
                    "at 0, 5 bytes, record 3: entry 2: 5 bytes at the end, wanted a record of 13 at least",
                    "at 17, 5 bytes, record 4: entry 3: 5 bytes at the end, wanted a record of 13 at least"));
}

struct DatesCase {
    const char* name;
    std::vector<const char*> dates;
    std::vector<std::pair<int, int>> seconds; ///< of each entry's first message and refresh
};

TEST(SnapshotReader, stampsBetweenTheRefreshes) {
    const DatesCase cases[] = {
        {"2 s apart", {"2026-11-16 05:00:02 +0000", "2026-11-16 05:00:04 +0000"}, {{0, 2}, {2, 4}}},
        {"far apart", {"2026-11-16 05:00:02 +0000", "2026-11-16 05:01:00 +0000"}, {{0, 2}, {58, 60}}},
        {"1 s apart, as truncated",
         {"2026-11-16 05:00:02 +0000", "2026-11-16 05:00:03 +0000"},
         {{0, 2}, {2, 3}}},
        {"at once", {"2026-11-16 05:00:02 +0000", "2026-11-16 05:00:02 +0000"}, {{0, 2}, {2, 2}}},
        {"going back", {"2026-11-16 05:00:12 +0000", "2026-11-16 05:00:02 +0000"}, {{10, 12}, {0, 2}}},
        {"of another zone", {"2026-11-16 06:30:02 +0130", "2026-11-16 00:00:04 -0500"}, {{0, 2}, {2, 4}}},
        {"missing", {"2026-11-16 05:00:02 +0000", "", "yesterday"}, {{0, 2}, {2, 4}, {4, 6}}},
        // The snapshot's own time is 05:10:00.
        {"all missing", {"", "2026-13-16 05:00:02 +0000"}, {{598, 600}, {600, 602}}},
    };
    for (const DatesCase& each : cases) {
        const ArrayRef entries = makeArray();
        for (const char* const date : each.dates)
            entries->append(historyEntry(idle(), date));
        const Value root = snapshotOf({});
        root.asDictionary()->set("Data", entries);
        const auto text = writeXMLPropertyList(root);
        ASSERT_TRUE(text);
        const ReadOut out = readAnyForm(Data(std::vector<std::uint8_t>(text->begin(), text->end())));
        std::vector<std::string> wanted;
        for (const auto& [message, refresh] : each.seconds)
            wanted.push_back(std::to_string(wanted.size() + 1) + " at 0, " + at(message) + ": " + idleHex +
                             ", refresh at " + at(refresh));
        EXPECT_EQ(out.messages, wanted) << each.name;
    }
}

TEST(SnapshotReader, givesTheObjectsOfTheSerializedStream) {
    const DictionaryRef first = makeDictionary();
    first->set("Cell", std::make_shared<Dictionary>(Dictionary{{"ARFCN", "12"}}));
    const DictionaryRef second = makeDictionary();
    second->set("List", std::make_shared<Array>(std::initializer_list<Value>{"a", "b"}));
    auto reader = SnapshotReader::open(ChunkedInput(
        std::make_unique<MemorySource>(snapshotFile({historyEntry(first, "2026-11-16 05:00:02 +0000"),
                                                     historyEntry(second, "2026-11-16 05:00:04 +0000")}))));
    ASSERT_TRUE(reader) << reader.reason();
    EXPECT_EQ((*reader)->technology(), "IFX");
    EXPECT_EQ((*reader)->form(), "snapshot");
    for (const DictionaryRef& object : {first, second}) {
        const auto message = (*reader)->next();
        ASSERT_TRUE(message);
        const Result<Value> again = readPropertyList(message->message.bytes());
        ASSERT_TRUE(again);
        EXPECT_EQ(*again, Value(object));
        EXPECT_TRUE(message->refresh);
    }
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->lossTotals().losses, 0u);
}

TEST(SnapshotReader, objectsWithTextThatXMLCannotCarryComeInTheBinaryForm) {
    const DictionaryRef object = makeDictionary();
    object->set("State", "\x01");
    auto reader = SnapshotReader::open(ChunkedInput(std::make_unique<MemorySource>(
        snapshotFile({historyEntry(object, "2026-11-16 05:00:02 +0000")}, true))));
    ASSERT_TRUE(reader) << reader.reason();
    const auto message = (*reader)->next();
    ASSERT_TRUE(message);
    EXPECT_EQ(*readPropertyList(message->message.bytes()), Value(object));
}

TEST(SnapshotReader, leavesOutEntriesThatItCannotUse) {
    const DictionaryRef number = makeDictionary();
    number->set("Cell", 12);
    const DictionaryRef text = makeDictionary();
    text->set("Cell", "12");
    const ReadOut objects = readAnyForm(snapshotFile({
        "no entry",
        makeDictionary(), // of a refresh before there was anything: that is how entries are built
        historyEntry(text, "2026-11-16 05:00:02 +0000"),
        historyEntry(number, "2026-11-16 05:00:04 +0000"),
        historyEntry(idle(), "2026-11-16 05:00:06 +0000"),
    }));
    EXPECT_EQ(objects.messages.size(), 1u);
    EXPECT_EQ(objects.technology, "IFX");
    EXPECT_THAT(
        objects.losses,
        ElementsAre("at 0, 0 bytes, record 1: entry 1: of kind string, wanted dictionary",
                    "at 0, 0 bytes, record 3: entry 4: object that holds other kinds than string, array "
                    "and dictionary",
                    "at 0, 17 bytes, record 4: entry 5: raw material of kind data, wanted an object as "
                    "in the entries before"));
    const ReadOut binary = readAnyForm(snapshotFile({
        historyEntry(idle(), "2026-11-16 05:00:02 +0000"), historyEntry(text, "2026-11-16 05:00:04 +0000"),
        historyEntry(Data(),
                     "2026-11-16 05:00:06 +0000"), // messages had come that the decoder keeps nothing of
    }));
    EXPECT_EQ(binary.messages.size(), 1u);
    EXPECT_EQ(binary.technology, "Ostrel_GSM");
    EXPECT_THAT(binary.losses,
                ElementsAre("at 0, 0 bytes, record 2: entry 2: raw material of kind dictionary, "
                            "wanted data as in the entries before"));
}

Value dlfItem(const Data& log) {
    const DictionaryRef item = makeDictionary();
    item->set("Description", "DLF binary (" + std::to_string(log.size()) + " bytes)");
    item->set("DLF", log);
    return item;
}

TEST(SnapshotReader, fallsBackToTheLogWithoutRawMessages) {
    const Data log = joined(versionReport(), bareRecord(0x512C, "05000100", stampAfter(0)),
                            stampedRecord(0x7132, "010000", stampAfter(800)), hex("DEAD"));
    const ReadOut out = readAnyForm(snapshotFile({makeDictionary(), dlfItem(log)}));
    EXPECT_THAT(out.messages, ElementsAre("2 at 161, " + at(0) + ": 0110002C51000040329B74130105000100",
                                          "3 at 177, " + at(1) + ": 010F003271000060359B741301010000"));
    EXPECT_THAT(out.losses,
                ElementsAre("at 193, 2 bytes, record 4, tail: entry 2: 2 bytes at the end, wanted a "
                            "record of 12 at least"));
    EXPECT_EQ(out.technology, "Ostrel_GSM");

    // The entries and the log have the same messages, which are read once.
    const ReadOut both =
        readAnyForm(snapshotFile({historyEntry(idle(), "2026-11-16 05:00:02 +0000"), dlfItem(log)}));
    EXPECT_THAT(both.messages, ElementsAre("1 at 0, " + at(0) + ": " + idleHex + ", refresh at " + at(2)));
    EXPECT_THAT(both.losses, IsEmpty());
}

TEST(SnapshotReader, mayHoldNothing) {
    const DictionaryRef early = makeDictionary();
    early->set("Timestamp", "2026-11-16 05:00:00 +0000");
    for (const Value& root : {Value(early), snapshotOf({})}) {
        const auto text = writeXMLPropertyList(root);
        ASSERT_TRUE(text);
        const ReadOut out = readAnyForm(Data(std::vector<std::uint8_t>(text->begin(), text->end())));
        EXPECT_THAT(out.messages, IsEmpty());
        EXPECT_THAT(out.losses, IsEmpty());
        EXPECT_EQ(out.failure, "");
        EXPECT_EQ(out.technology, "");
    }
}

TEST(SnapshotReader, refusesOtherPropertyLists) {
    const auto reasonFor = [](const std::string& text) {
        return readAnyForm(Data(std::vector<std::uint8_t>(text.begin(), text.end()))).failure;
    };
    EXPECT_EQ(reasonFor("<plist><array/></plist>"),
              "property list whose root is of kind array, wanted a snapshot's dictionary");
    EXPECT_EQ(reasonFor("<plist><dict/></plist>"),
              "property list without \"Timestamp\" and \"Data\", wanted a snapshot's dictionary");
    EXPECT_EQ(reasonFor("<plist><dict><key>Data</key><string/></dict></plist>"),
              "snapshot whose \"Data\" is of kind string, wanted an array");
}

TEST(SnapshotReader, losesObjectsAbove16MiB) {
    const DictionaryRef object = makeDictionary();
    std::string longText;
    longText.resize(16'777'216, 'x');
    object->set("State", longText);
    const DictionaryRef small = makeDictionary();
    small->set("State", "x");
    const ReadOut out = readAnyForm(snapshotFile({historyEntry(object, "2026-11-16 05:00:02 +0000"),
                                                  historyEntry(small, "2026-11-16 05:00:04 +0000")}));
    // 122 bytes of tags about the text.
    EXPECT_THAT(out.losses, ElementsAre("at 0, 16777338 bytes, record 1: entry 1: object of 16777338 bytes, "
                                        "wanted at most 16777216"));
    EXPECT_EQ(out.messages.size(), 1u);
}

TEST(SnapshotReader, aReadErrorIsNoSnapshot) {
    const Data file = snapshotFile({historyEntry(idle(), "2026-11-16 05:00:02 +0000")});
    EXPECT_EQ(readAnyForm(file, SIZE_MAX, 300).failure, "cannot read: Input/output error at offset 300");
}

} // namespace
} // namespace velmora
