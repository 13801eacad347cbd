// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveModel.h"
#include "Recording/OpenMessages.h"
#include "Tests/Analysis/Drive/KeptSamples.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/ShellCommand.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <charconv>
#include <map>
#include <set>
#include <sstream>

namespace velmora {
namespace {

/// A time of velmora-log: "2026-01-05T08:00:00.162000000Z".
Time timeOf(std::string_view text) {
    const auto number = [&text](std::size_t from, std::size_t length) {
        int value = 0;
        std::from_chars(text.data() + from, text.data() + from + length, value);
        return value;
    };
    using namespace std::chrono;
    return sys_days{year{number(0, 4)} / number(5, 2) / number(8, 2)} + hours{number(11, 2)} +
           minutes{number(14, 2)} + seconds{number(17, 2)} + nanoseconds{number(20, 9)};
}

/// What `velmora-log decode --samples` says of a recording: the numbers at each time, by the path of the
/// leaf.
using Samples = std::map<std::pair<Time, std::string>, std::multiset<double>>;

Samples samplesOf(const std::string& recording) {
    const ShellOutcome decoded = runShell(shellQuoted(VELMORA_BUILD_DIR "/velmora-log") +
                                          " decode --samples --format csv " + shellQuoted(recording));
    EXPECT_TRUE(decoded.status == 0 || decoded.status == 1); // 1: the drive has malformed messages
    Samples samples;
    std::istringstream lines(decoded.output);
    std::string line;
    std::getline(lines, line); // the head
    while (std::getline(lines, line)) {
        std::vector<std::string> cells;
        std::istringstream rest(line);
        for (std::string cell; cells.size() < 5 && std::getline(rest, cell, ',');)
            cells.push_back(cell);
        if (cells.size() < 5)
            continue;
        double number = 0;
        const char* const end = cells[4].data() + cells[4].size();
        if (std::from_chars(cells[4].data(), end, number).ptr == end && !cells[4].empty())
            samples[{timeOf(cells[0]), cells[2]}].insert(number);
    }
    return samples;
}

class DriveOfTechnology : public testing::TestWithParam<DecodedTechnology> {
protected:
    DriveOfTechnology() : drive(kept, technology.clock()) { drive.setDecoder(&technology.decoder()); }
    ~DriveOfTechnology() override { drive.setDecoder(nullptr); }

    void play() {
        auto reader = openMessages(recording());
        ASSERT_TRUE(reader) << reader.reason();
        while (const auto message = (*reader)->next()) {
            technology.clock().setNow(message->time);
            technology.decoder().updateState(technology.state, message->message);
        }
    }
    /// Whether a sample of a leaf of that role, in any row, has the number.
    bool isSampled(const Samples& samples, Role role, const KeptSamples::Sample& drawn) {
        for (const CatalogueField& each : technology.decoder().catalogue().fields()) {
            if (each.role != role)
                continue;
            const std::string start = each.path.substr(0, each.path.find('*'));
            const std::string end = each.path.substr(each.path.rfind('/'));
            for (auto at = samples.lower_bound({drawn.time, start});
                 at != samples.end() && at->first.first == drawn.time && at->first.second.starts_with(start);
                 ++at)
                if ((at->first.second == each.path || at->first.second.ends_with(end)) &&
                    at->second.contains(drawn.value))
                    return true;
        }
        return false;
    }
    static std::string recording() {
        return VELMORA_SOURCE_DIR "/Tests/Recordings/" + std::string(GetParam().scenario) + ".pcapng";
    }

    TechnologyUnderTest technology{GetParam()};
    KeptSamples kept;
    DriveModel drive;
};

TEST_P(DriveOfTechnology, ChartsWhatWasSampledAtThatMoment) {
    play();
    const Samples samples = samplesOf(recording());
    const auto& fields = technology.decoder().catalogue().fields();
    if (std::any_of(fields.begin(), fields.end(),
                    [](const CatalogueField& each) { return each.role == Role::ServingLevel; })) {
        EXPECT_GT(kept.samples[servingLevelSeries].size(), 10U);
    }
    for (const auto& [series, drawn] : kept.samples) {
        const Role role = series == servingLevelSeries     ? Role::ServingLevel
                          : series < servingQualitySeries  ? Role::NeighbourLevel
                          : series == servingQualitySeries ? Role::ServingQuality
                                                           : Role::NeighbourQuality;
        for (const KeptSamples::Sample& each : drawn)
            EXPECT_TRUE(isSampled(samples, role, each))
                << nameOf(role) << ' ' << each.value << " at " << each.time.time_since_epoch().count();
    }
}

TEST_P(DriveOfTechnology, ChartsEverySampleOfAPinnedRow) {
    std::string path;
    for (const CatalogueField& each : technology.decoder().catalogue().fields())
        if (each.role == Role::ServingLevel && path.empty())
            path = each.path;
    if (path.empty())
        GTEST_SKIP() << "no level is reported";
    ASSERT_TRUE(drive.togglePin(path));
    play();
    std::multiset<std::pair<Time, double>> expected;
    const std::string start = path.substr(0, path.find('*'));
    for (const auto& [at, numbers] : samplesOf(recording()))
        if (at.second == path || (start != path && at.second.starts_with(start) &&
                                  at.second.ends_with(path.substr(path.rfind('/')))))
            for (const double number : numbers)
                expected.emplace(at.first, number);
    std::multiset<std::pair<Time, double>> drawn;
    for (const KeptSamples::Sample& each : kept.samples[firstPinnedSeries])
        drawn.emplace(each.time, each.value);
    EXPECT_EQ(drawn, expected);
}

TEST_P(DriveOfTechnology, ShowsTheLastSampleAsTheLevelOfNow) {
    play();
    const DriveNow now = drive.now();
    if (now.level) {
        EXPECT_EQ(now.level->number, kept.samples[servingLevelSeries].back().value);
    }
    if (now.quality) {
        EXPECT_EQ(now.quality->number, kept.samples[servingQualitySeries].back().value);
    }
}

INSTANTIATE_TEST_SUITE_P(All, DriveOfTechnology, testing::ValuesIn(decodedTechnologies),
                         [](const auto& technology) { return std::string(technology.param.scenario); });

} // namespace
} // namespace velmora
