// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/TelephonyService.h"
#include "Recording/OpenMessages.h"
#include "Tests/Recordings/ExampleRecording.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <ostream>
#include <set>
#include <string>
#include <vector>

/// The recordings of this folder against the scenarios that they come from, and velmora-log on them.

namespace velmora {

/// How test reports name a parameter.
static void PrintTo(const ExampleRecording& recording, std::ostream* out) {
    *out << recording.fileName();
}

namespace {

using namespace std::chrono_literals;
using testing::IsEmpty;
using testing::IsSupersetOf;

const std::filesystem::path folder = VELMORA_SOURCE_DIR "/Tests/Recordings";

/// By which a recording stays small enough to be kept with the sources.
constexpr std::uintmax_t sizeLimit = 200'000;

std::string contentOf(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

/// The places of a display that show something, as "/Section/Label". Rows of a list count as one, and of a
/// label with a sort key the key alone counts: what follows it may be a value.
void collectShown(const Value& node, const std::string& path, std::set<std::string>& shown) {
    if (const Dictionary* dictionary = node.asDictionary()) {
        for (const auto& [key, value] : *dictionary)
            collectShown(value, path + "/" + key.substr(0, key.find(';')), shown);
    } else if (const Array* rows = node.asArray()) {
        for (const Value& row : *rows)
            collectShown(row, path + "/*", shown);
    } else if (const std::string* text = node.asString(); text && !text->empty()) {
        shown.insert(path);
    }
}

/// A decoder with the templates that are shipped.
class Screens {
public:
    explicit Screens(std::string_view technology)
        : _decoder(LogGenerator::generatorFromTechnology(technology, _clock)) {}
    ~Screens() { setResources(_earlier); }
    Screens(const Screens&) = delete;
    Screens& operator=(const Screens&) = delete;

    void decode(const Data& message) { _decoder->updateState(_state, message); }
    void look() { collectShown(_decoder->display(_state), "", _shown); }
    [[nodiscard]] const std::set<std::string>& shown() const { return _shown; }

private:
    CapturedLog _log{LogPriority::Emergency};
    FileResources _shipped{{VELMORA_SOURCE_DIR "/Resources"}};
    Resources* _earlier = setResources(&_shipped);
    FakeClock _clock;
    std::unique_ptr<LogGenerator> _decoder;
    Dictionary _state;
    std::set<std::string> _shown;
};

class Recordings : public testing::TestWithParam<ExampleRecording> {};

TEST_P(Recordings, areWhatTheScenariosGive) {
#ifndef __x86_64__
    GTEST_SKIP() << "other machines may round the last bit of a level differently";
#endif
    const ExampleRecording& recording = GetParam();
    const auto reader = openMessages(folder / recording.fileName());
    ASSERT_TRUE(reader) << reader.reason();
    std::uint64_t number = 0;
    // Message by message: the file's head names the version that wrote it.
    recording.eachMessage([&](Time time, const Data& message) {
        const auto read = (*reader)->next();
        ++number;
        ASSERT_TRUE(read) << "the recording ends before message " << number;
        EXPECT_EQ(read->time, time) << "of message " << number;
        EXPECT_EQ(read->message, message) << "message " << number;
    });
    EXPECT_FALSE((*reader)->next()) << "after message " << number;
    EXPECT_EQ(technologyConstant((*reader)->technology()), recording.makeScenario()->technology());
    EXPECT_THAT((*reader)->losses(), IsEmpty());
}

TEST_P(Recordings, areMadeByteForByte) {
    const TemporaryDirectory directory;
    const std::string first = directory / "first.pcapng";
    const std::string second = directory / "second.pcapng";
    ASSERT_TRUE(GetParam().write(first));
    ASSERT_TRUE(GetParam().write(second));
    EXPECT_EQ(contentOf(first), contentOf(second));
    EXPECT_GT(std::filesystem::file_size(first), 10'000U);
}

TEST_P(Recordings, areSmall) {
    EXPECT_LT(std::filesystem::file_size(folder / GetParam().fileName()), sizeLimit);
}

TEST_P(Recordings, fillEveryPlaceThatTheDriveFills) {
    const auto drive = GetParam().makeScenario();
    Screens whole(drive->technology());
    // What is seen at the refreshes of three rounds and more.
    auto tick = 2s;
    for (ScenarioEvent event = drive->next(); event.offset < 15min; event = drive->next()) {
        for (; event.offset >= tick; tick += 2s)
            whole.look();
        whole.decode(event.message);
    }
    Screens excerpts(drive->technology());
    const auto reader = openMessages(folder / GetParam().fileName());
    ASSERT_TRUE(reader) << reader.reason();
    while (const auto message = (*reader)->next()) {
        excerpts.decode(message->message);
        excerpts.look();
    }
    ASSERT_FALSE(whole.shown().empty());
    EXPECT_THAT(excerpts.shown(), IsSupersetOf(whole.shown()));
}

/// What a command of velmora-log says of a recording, held against the reference beside it. Where the two
/// differ, the output is left there too.
void expectReference(const std::string& command, const std::string& recording, const std::string& suffix) {
    const std::filesystem::path reference = folder / (recording + suffix);
    const std::filesystem::path actual = reference.string() + ".actual";
    std::filesystem::remove(actual);
    const ShellOutcome outcome =
        runShell("cd " + shellQuoted(folder) +
                 " && TZ=UTC VELMORA_RESOURCES=" + shellQuoted(VELMORA_SOURCE_DIR "/Resources") + " " +
                 shellQuoted(VELMORA_BUILD_DIR "/velmora-log") + " " + command + " " + recording + ".pcapng");
    EXPECT_EQ(outcome.status, 0);
    if (std::filesystem::exists(reference) && outcome.output == contentOf(reference))
        return;
    std::ofstream(actual, std::ios::binary) << outcome.output;
    if (!std::filesystem::exists(reference))
        FAIL() << "there is no reference " << reference << "; the output is in " << actual;
    FAIL() << runShell("diff -u " + shellQuoted(reference) + " " + shellQuoted(actual)).output;
}

TEST_P(Recordings, decodeAsTheReferenceSays) {
    expectReference("decode --format text", std::string(GetParam().scenario), ".decode.txt");
}

TEST_P(Recordings, haveTheInfoOfTheReference) {
    expectReference("info", std::string(GetParam().scenario), ".info.txt");
}

INSTANTIATE_TEST_SUITE_P(, Recordings, testing::ValuesIn(exampleRecordings()),
                         [](const auto& instance) { return std::string(instance.param.scenario); });

TEST(RecordingsFolder, holdsOneRecordingOfEachScenario) {
    std::set<std::string> wanted;
    for (const ScenarioKind& kind : scenarioKinds())
        wanted.insert(std::string(kind.name) + ".pcapng");
    std::set<std::string> made;
    for (const ExampleRecording& recording : exampleRecordings())
        made.insert(recording.fileName());
    std::set<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator(folder))
        if (entry.path().extension() == ".pcapng")
            found.insert(entry.path().filename());
    EXPECT_EQ(made, wanted);
    EXPECT_EQ(found, wanted);
}

} // namespace
} // namespace velmora
