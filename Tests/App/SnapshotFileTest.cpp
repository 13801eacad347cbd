// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/App/SaveScreenFixture.h"
#include "Tests/Support/Hex.h"

#include <QProcess>

#include <chrono>
#include <fstream>
#include <iterator>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

/// The file that the save screen writes.
class SnapshotFileTest : public SaveScreenFixture {
protected:
    [[nodiscard]] static std::vector<std::string> keysOf(const Value& value) {
        std::vector<std::string> keys;
        if (const Dictionary* dictionary = value.asDictionary())
            for (const auto& [key, held] : *dictionary)
                keys.push_back(key);
        return keys;
    }
    [[nodiscard]] std::string text(long seconds) const {
        std::ifstream stream(file(seconds));
        return {std::istreambuf_iterator<char>(stream), {}};
    }
    /// What Python's own reader makes of the file.
    [[nodiscard]] static std::string python(const std::string& expression,
                                            const std::filesystem::path& path) {
        QProcess process;
        process.start("python3", {"-c",
                                  QString::fromStdString("import plistlib, sys\n"
                                                         "p = plistlib.load(open(sys.argv[1], 'rb'))\n"
                                                         "print(" +
                                                         expression + ")"),
                                  QString::fromStdString(path.string())});
        if (!process.waitForFinished())
            return "python3 did not run";
        return (process.readAllStandardOutput() + process.readAllStandardError()).toStdString();
    }
};

TEST_F(SnapshotFileTest, HoldsTimeDataAndDescriptionInThisOrder) {
    launchAndConnect();
    show(display("one"));
    open();
    saveScreen()->saveDescription().setText("gate <4> & \"roof\" \u00fc");
    save();
    const Value list = content(startSeconds + 2);
    EXPECT_THAT(keysOf(list), ElementsAre("Timestamp", "Data", "Description"));
    const Dictionary& snapshot = *list.asDictionary();
    EXPECT_EQ(snapshot["Timestamp"], Value("2026-11-16 05:00:02 +0000"));
    EXPECT_EQ(snapshot["Description"], Value("gate <4> & \"roof\" \u00fc"));
    const Array* data = snapshot["Data"].asArray();
    ASSERT_NE(data, nullptr);
    ASSERT_EQ(data->size(), 1u);
    EXPECT_EQ((*data)[0], dictionary({{"DisplayState", display("one")},
                                      {"Display", display("one")},
                                      {"ExtraInfo", makeDictionary()},
                                      {"Date", "2026-11-16 05:00:02 +0000"},
                                      {"Description", "Snapshot (2026-11-16 05:00:02 +0000)"}}));
    EXPECT_TRUE(text(startSeconds + 2).starts_with("<?xml version=\"1.0\" encoding=\"UTF-8\"?>"));
}

TEST_F(SnapshotFileTest, IsReadByAnotherReaderOfPropertyLists) {
    launchAndConnect();
    show(display("one"));
    show(display("two"));
    open();
    saveScreen()->saveDescription().setText("gate <4> & roof");
    save();
    EXPECT_EQ(python("p['Timestamp'], p['Description'], [e['Display']['State'] for e in p['Data']]",
                     file(startSeconds + 4)),
              "2026-11-16 05:00:04 +0000 gate <4> & roof ['one', 'two']\n");
}

TEST_F(SnapshotFileTest, OfABinaryFamilyHasTheWholeLogToo) {
    technology = kVoxLogChannelTechnology_Ostrel_GSM;
    resources.put("Ostrel_GSM", "plist", dictionary({{"Process CS", makeDictionary()}, {"Other", "1"}}));
    launchAndConnect();
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, record(0x7132, "01 00 00")));
    platform.queue.advance(2s);
    runUntilIdle();
    open();
    // The version report of 161 bytes, and the 16-byte record less its type byte.
    EXPECT_THAT(listed(), ElementsAre("Snapshot (2026-11-16 05:00:02 +0000)", "DLF binary (176 bytes)"));
    save();
    // The record's length (15), its code, eight zeros and the payload close the log; the raw messages of the
    // display are the complete record.
    EXPECT_EQ(python("[type(p['Data'][1]['DLF']).__name__, len(p['Data'][1]['DLF']), "
                     "p['Data'][1]['DLF'][161:].hex(), p['Data'][0]['DisplayState'].hex()]",
                     file(startSeconds + 2)),
              "['bytes', 176, '0f0032710000000000000000010000', '010f0032710000000000000000010000']\n");
}

TEST_F(SnapshotFileTest, TimeIsThatOfOpeningTheNameThatOfSaving) {
    launchAndConnect();
    show(display("one"));
    open();
    platform.queue.advance(10min);
    save();
    EXPECT_THAT(files(), ElementsAre("VelmoraSnapshot-1794805802.velmora"));
    EXPECT_EQ((*content(startSeconds + 602).asDictionary())["Timestamp"], Value("2026-11-16 05:00:02 +0000"));
}

TEST_F(SnapshotFileTest, SecondSaveInTheSameSecondReplacesTheFirst) {
    launchAndConnect();
    show(display("one"));
    open();
    saveScreen()->saveDescription().setText("a description that is longer than the second one's");
    save();
    platform.clock.advance(999ms);
    open();
    saveScreen()->saveDescription().setText("second");
    save();
    EXPECT_THAT(files(), ElementsAre("VelmoraSnapshot-1794805202.velmora"));
    EXPECT_EQ((*content(startSeconds + 2).asDictionary())["Description"], Value("second"));

    platform.clock.advance(1ms);
    open();
    save();
    EXPECT_THAT(files(),
                ElementsAre("VelmoraSnapshot-1794805202.velmora", "VelmoraSnapshot-1794805203.velmora"));
}

TEST_F(SnapshotFileTest, IsWrittenInPlace) {
    launchAndConnect();
    show(display("one"));
    std::ofstream(file(startSeconds + 2)) << "earlier";
    std::filesystem::create_hard_link(file(startSeconds + 2), directory / "same");
    open();
    save();
    // No other file took the name: both names lead to the snapshot.
    EXPECT_EQ(std::filesystem::hard_link_count(directory / "same"), 2u);
    EXPECT_EQ(std::filesystem::file_size(directory / "same"),
              std::filesystem::file_size(file(startSeconds + 2)));
}

TEST_F(SnapshotFileTest, EmptyDescriptionIsAnEmptyString) {
    launchAndConnect();
    show(display("one"));
    open();
    save();
    const Value list = content(startSeconds + 2);
    EXPECT_THAT(keysOf(list), ElementsAre("Timestamp", "Data", "Description"));
    EXPECT_EQ((*list.asDictionary())["Description"], Value(""));
}

TEST_F(SnapshotFileTest, WithoutADecoderHoldsOnlyTheTime) {
    launch();
    open();
    saveScreen()->saveDescription().setText("never written");
    save();
    EXPECT_EQ(content(startSeconds), dictionary({{"Timestamp", "2026-11-16 05:00:00 +0000"}}));
}

TEST_F(SnapshotFileTest, DecoderWithoutDataYetHoldsAnEmptyArray) {
    launchAndConnect();
    open();
    save();
    const Value list = content(startSeconds);
    EXPECT_EQ((*list.asDictionary())["Data"], Value(makeArray()));
    EXPECT_THAT(keysOf(list), ElementsAre("Timestamp", "Data", "Description"));
}

TEST_F(SnapshotFileTest, IsABinaryListWhereXMLCannotCarryAValue) {
    launchAndConnect();
    const Value shown = dictionary({{"State", std::string("a\0b\x01\x1B", 5)}, {"Cell \uFFFE", "12"}});
    const auto message = writeBinaryPropertyList(shown);
    ASSERT_TRUE(message);
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, Data::copyOf(*message)));
    platform.queue.advance(2s);
    runUntilIdle();
    open();
    save();
    EXPECT_TRUE(text(startSeconds + 2).starts_with("bplist00"));
    const Value list = content(startSeconds + 2);
    EXPECT_THAT(keysOf(list), ElementsAre("Timestamp", "Data", "Description"));
    const Array* data = (*list.asDictionary())["Data"].asArray();
    ASSERT_NE(data, nullptr);
    ASSERT_EQ(data->size(), 1u);
    EXPECT_EQ((*(*data)[0].asDictionary())["DisplayState"], shown);
    EXPECT_EQ((*(*data)[0].asDictionary())["Display"], shown);
    EXPECT_EQ(python("ascii(p['Data'][0]['Display']['State'])", file(startSeconds + 2)),
              "'a\\x00b\\x01\\x1b'\n");
    EXPECT_EQ(saveScreen(), nullptr);
}

} // namespace
} // namespace velmora
