// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Watch/WatchCommandFixture.h"

#include <gmock/gmock.h>

#include <fstream>
#include <string>

// `--mask` of the commands that decode.

namespace velmora {
namespace {

using testing::HasSubstr;
using testing::Not;

constexpr const char* iccid = "8949027500001234568";

class MaskOptionTest : public WatchCommandTest {
protected:
    MaskOptionTest() {
        writeRecording("drive.pcapng", "IFX", {{at(0), display()}});
        std::ofstream(path("fleet.key")) << std::string(64, '7') << "\n";
        std::filesystem::permissions(path("fleet.key"), std::filesystem::perms::owner_read);
    }
    [[nodiscard]] static Data display() {
        const DictionaryRef sim = makeDictionary();
        sim->set("ICCID", iccid);
        sim->set("State", "Ready");
        const DictionaryRef cell = makeDictionary();
        cell->set("Cell ID", "4711");
        cell->set("RxLev", "-71 dBm");
        const DictionaryRef root = makeDictionary();
        root->set("SIM", Value(sim));
        root->set("Serving Cell", Value(cell));
        return serialized(root);
    }
    std::string run(std::vector<std::string> arguments, int status = 0) {
        ToolProcess process(tool(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        _errors = process.errors();
        return process.output();
    }

    std::string _errors;
};

TEST_F(MaskOptionTest, DecodeMasksWhatItDecodes) {
    EXPECT_THAT(run({"decode", path("drive.pcapng")}), HasSubstr(iccid));
    const std::string masked = run({"decode", "--mask", path("drive.pcapng")});
    EXPECT_THAT(masked, Not(HasSubstr(iccid)));
    EXPECT_THAT(masked, testing::ContainsRegex("ICCID +89[0-9]{17}\n"));
    EXPECT_THAT(masked, testing::ContainsRegex("Cell ID +4711\n"));
    EXPECT_THAT(masked, HasSubstr("-71 dBm"));
    EXPECT_THAT(run({"decode", "--mask", "--format", "jsonl", "--every", "message", path("drive.pcapng")}),
                Not(HasSubstr(iccid)));
    EXPECT_THAT(run({"decode", "--mask", "--format", "csv", "--samples", path("drive.pcapng")}),
                Not(HasSubstr(iccid)));
    EXPECT_THAT(run({"decode", "--mask", "--technology", "IFX", path("drive.pcapng")}),
                testing::ContainsRegex("ICCID +89[0-9]{17}\n"));
}

TEST_F(MaskOptionTest, LevelsAreThoseOfMask) {
    const auto cell = [this](const std::string& option) {
        return run({"decode", option, "--select", "/Serving Cell/Cell ID", "--format", "csv", "--every",
                    "message", path("drive.pcapng")});
    };
    EXPECT_THAT(cell("--mask=identity"), testing::EndsWith(",4711\r\n"));
    EXPECT_THAT(cell("--mask=location"), Not(HasSubstr("4711")));
    EXPECT_THAT(cell("--mask=location"), HasSubstr("2026-11-16T05:00:00"));
    EXPECT_THAT(cell("--mask=all"), HasSubstr("2000-01-01T00:00:00"));
}

TEST_F(MaskOptionTest, OfOneKeyAllHaveTheSamePseudonyms) {
    const std::vector<std::string> decode = {"decode", "--mask", "--key", path("fleet.key")};
    const auto decoded = [&](const std::string& file) {
        std::vector<std::string> arguments = decode;
        arguments.push_back(path(file));
        return run(arguments);
    };
    const std::string masked = decoded("drive.pcapng");
    EXPECT_EQ(decoded("drive.pcapng"), masked);
    run({"mask", "--key", path("fleet.key"), path("drive.pcapng"), path("shared.pcapng")});
    EXPECT_EQ(run({"decode", path("shared.pcapng")}), masked);
    EXPECT_EQ(decoded("shared.pcapng"), masked) << "what the key has masked stays";
    EXPECT_NE(run({"decode", "--mask", path("drive.pcapng")}), masked) << "another key";
    // Without a key file the files of one call have one random key.
    const std::string both = run({"decode", "--mask", "--format", "csv", "--every", "message", "--select",
                                  "/SIM/ICCID", path("drive.pcapng"), path("drive.pcapng")});
    const std::size_t first = both.find(",89");
    const std::size_t second = both.find(",89", first + 1);
    ASSERT_NE(second, std::string::npos) << both;
    EXPECT_EQ(both.substr(first, 20), both.substr(second, 20));
}

TEST_F(MaskOptionTest, WrongValuesAreRefused) {
    EXPECT_EQ(run({"decode", "--mask=most", path("drive.pcapng")}, 2), "");
    EXPECT_THAT(_errors, HasSubstr("wanted no value or one of identity, location, all"));
    run({"decode", "--key", path("fleet.key"), path("drive.pcapng")}, 2);
    EXPECT_THAT(_errors, HasSubstr("--mask"));
    EXPECT_EQ(run({"decode", "--mask", "--key", path("none.key"), path("drive.pcapng")}, 1), "");
    std::filesystem::permissions(path("fleet.key"), std::filesystem::perms::group_read,
                                 std::filesystem::perm_options::add);
    EXPECT_EQ(run({"decode", "--mask", "--key", path("fleet.key"), path("drive.pcapng")}, 1), "");
    EXPECT_THAT(_errors, HasSubstr("can be read by other users"));
    EXPECT_EQ(run({"watch", "--once", "--mask", "--key", path("fleet.key")}, 1), "");
}

TEST_F(MaskOptionTest, WatchMasksWhatItShows) {
    startService();
    ToolProcess process(tool({"watch", "--once", "--mask"}));
    ASSERT_TRUE(isStreaming());
    ASSERT_TRUE(isShownFor(display(), process, "ICCID"));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), testing::ContainsRegex("ICCID +89[0-9]{17}\n"));
    EXPECT_THAT(process.output(), Not(HasSubstr(iccid)));
}

TEST_F(MaskOptionTest, BrowseMasksItsScreenAndWhatItWrites) {
    ToolProcess::Setup setup = tool({"browse", "--mask=location", path("drive.pcapng")});
    setup.onTerminal = true;
    setup.environment["LC_ALL"] = "C.UTF-8";
    ToolProcess process(setup);
    process.resize(200, 60);
    auto place = process.waitFor("masked: location");
    ASSERT_TRUE(place);
    process.type("\t\ty"); // the bytes are copied
    place = process.waitFor("copied: ", *place);
    ASSERT_TRUE(place);
    process.type("w" + path("part.pcapng") + "\r");
    place = process.waitFor("1 messages written", *place);
    ASSERT_TRUE(place);
    const std::string screens = process.output();
    process.type("/" + std::string(iccid) + "\r"); // which is on the screen because it was typed
    ASSERT_TRUE(process.waitFor("no later message has", *place));
    process.type("q");
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(screens, HasSubstr("ICCID"));
    EXPECT_THAT(screens, HasSubstr("-71 dBm"));
    EXPECT_THAT(screens, Not(HasSubstr(iccid)));
    EXPECT_THAT(screens, Not(HasSubstr("4711")));
    EXPECT_THAT(contentOf("part.pcapng"), Not(HasSubstr(iccid)));
    EXPECT_THAT(run({"mask", "--check", "--level", "location", path("part.pcapng")}),
                HasSubstr("no identities of level location in clear"));
}

TEST_F(MaskOptionTest, BrowseWithAKeyShowsAndWritesWhatMaskWrites) {
    run({"mask", "--level", "all", "--key", path("fleet.key"), path("drive.pcapng"), path("shared.pcapng")});
    const auto lines = [this](std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"browse", "--line"});
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.input = "d\nx\nh\nw " + path("copy.pcapng") + "\n";
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
        const std::string output = process.output();
        return output.substr(output.find('\n'));
    };
    const std::string masked = lines({"--mask=all", "--key", path("fleet.key"), path("drive.pcapng")});
    EXPECT_THAT(masked, HasSubstr("1 messages written"));
    EXPECT_EQ(contentOf("copy.pcapng"), contentOf("shared.pcapng"));
    std::filesystem::remove(path("copy.pcapng"));
    EXPECT_EQ(lines({path("shared.pcapng")}), masked);
    std::filesystem::remove(path("copy.pcapng"));
    EXPECT_EQ(lines({"--mask=all", "--key", path("fleet.key"), path("shared.pcapng")}), masked);
}

} // namespace
} // namespace velmora
