// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Drive/KeptSamples.h"
#include "Tests/App/DriveView/PlayedDriveFixture.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/MomentText.h"
#include "Tests/Support/ShellCommand.h"

#include <algorithm>
#include <random>
#include <sstream>

namespace velmora {
namespace {

using testing::ElementsAreArray;

/// All that is known of the serving cell and its neighbours, a line each.
std::vector<std::string> linesOf(const DriveNow& now, std::span<const Neighbour> neighbours) {
    std::vector<std::string> lines;
    const auto add = [&lines](const char* name, const std::optional<DriveValue>& value) {
        lines.push_back(
            std::string(name) + ": " +
            (value ? value->text + " at " + std::to_string(value->time.time_since_epoch().count()) : "none"));
    };
    lines.push_back(now.technology ? std::string(nameOf(*now.technology)) : "no technology");
    lines.push_back(now.mode ? std::string(nameOf(*now.mode)) : "no mode");
    lines.push_back(now.reported ? std::to_string(now.reported->time_since_epoch().count()) : "never");
    add("state", now.state);
    add("network", now.network);
    add("area", now.area);
    add("cell", now.cell);
    add("channel", now.channel);
    add("band", now.band);
    add("physical cell", now.physicalCell);
    add("level", now.level);
    add("quality", now.quality);
    for (const Neighbour& each : neighbours) {
        std::string line = "neighbour";
        for (const auto& number : {each.channel, each.physicalCell, each.level_dBm, each.quality_dB})
            line += number ? ' ' + std::to_string(*number) : std::string(" none");
        line += each.isDetected ? " detected " : " ";
        lines.push_back(line + std::to_string(each.time.time_since_epoch().count()));
    }
    return lines;
}

class PlayedMoment : public PlayedDriveFixture, public testing::WithParamInterface<DecodedTechnology> {
protected:
    static constexpr std::size_t driveLength = 5000; // with checkpoints in it
    static constexpr std::size_t moments = 40;
};

/// The drive decoded once from its front, without a jump.
class WholePass {
public:
    explicit WholePass(const DecodedTechnology& decoded)
        : technology(decoded), drive(kept, technology.clock()) {
        drive.setDecoder(&technology.decoder());
    }
    ~WholePass() { drive.setDecoder(nullptr); }
    void take(Time time, const Data& message) {
        technology.clock().setNow(time);
        technology.decoder().updateState(technology.state, message);
    }

    TechnologyUnderTest technology;
    KeptSamples kept;
    DriveModel drive;
};

TEST_P(PlayedMoment, ShowsWhatTheMessagesBeforeItHaveReported) {
    openIn(1280, 800, record(GetParam().scenario, driveLength));
    std::mt19937 random(3);
    std::uniform_int_distribution<std::size_t> any(1, driveLength);
    std::vector<std::size_t> chosen(moments);
    std::generate(chosen.begin(), chosen.end(), [&] { return any(random); });
    std::map<std::size_t, std::vector<std::string>> expected;
    WholePass pass(GetParam());
    for (std::size_t i = 0; i < driveLength; ++i) {
        pass.take(messages[i].time, messages[i].message);
        if (std::find(chosen.begin(), chosen.end(), i + 1) != chosen.end())
            expected[i + 1] = linesOf(pass.drive.now(), pass.drive.neighbours());
    }
    for (const std::size_t moment : chosen) {
        playback().seekToMessage(moment);
        EXPECT_THAT(linesOf(playback().drive().now(), playback().drive().neighbours()),
                    ElementsAreArray(expected[moment]))
            << "after " << moment << " messages";
    }
    // The charts have every sample of the drive.
    for (std::size_t series = 0; series < firstPinnedSeries; ++series) {
        const SampleRing& ring = *playback().drive().history().ring(series);
        std::vector<std::pair<std::int64_t, double>> drawn;
        for (std::size_t i = 0; i < ring.size(); ++i)
            if (const Sample each = ring.entry(i); each.value == each.value)
                drawn.emplace_back(each.time_ns, each.value);
        std::vector<std::pair<std::int64_t, double>> wanted;
        for (const KeptSamples::Sample& each : pass.kept.samples[series])
            wanted.emplace_back(nanosecondsOf(each.time), each.value);
        EXPECT_EQ(drawn, wanted) << series;
    }
}

TEST_P(PlayedMoment, ListsTheEventsThatTheCommandLists) {
    const std::string path = record(GetParam().scenario, driveLength);
    openIn(1280, 800, path);
    const ShellOutcome listed =
        runShell(shellQuoted(VELMORA_BUILD_DIR "/velmora-log") + " events --format csv " + shellQuoted(path));
    ASSERT_TRUE(listed.status == 0 || listed.status == 1);
    std::vector<std::string> expected;
    std::istringstream lines(listed.output);
    std::string line;
    std::getline(lines, line); // the head
    while (std::getline(lines, line)) {
        std::vector<std::string> cells;
        std::istringstream rest(line);
        for (std::string cell; cells.size() < 5 && std::getline(rest, cell, ',');)
            cells.push_back(cell);
        ASSERT_EQ(cells.size(), 5U);
        expected.push_back(cells[0] + ' ' + cells[3] + ' ' + cells[4]);
    }
    std::vector<std::string> shown;
    const auto& events = playback().drive().model().events();
    for (auto each = events.rbegin(); each != events.rend(); ++each)
        shown.push_back(momentText(each->time) + ' ' + std::string(nameOf(each->severity)) + ' ' +
                        each->kind);
    EXPECT_THAT(shown, ElementsAreArray(expected));
}

INSTANTIATE_TEST_SUITE_P(Technologies, PlayedMoment, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
