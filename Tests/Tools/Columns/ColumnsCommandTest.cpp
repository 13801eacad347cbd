// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Dictionary.h"
#include "Tests/Tools/SeveralTechnologies.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <map>
#include <set>

namespace velmora {
namespace {

using testing::EndsWith;
using testing::HasSubstr;

class ColumnsCommandTest : public SeveralTechnologiesTest {
protected:
    std::string columns(std::vector<std::string> files, int status = 0,
                        std::optional<std::string> input = {}) {
        files.insert(files.begin(), {"columns", "--out", path("out")});
        return run(std::move(files), status, std::move(input));
    }
    /// All files of the directory with their contents.
    [[nodiscard]] std::map<std::string, std::string> files() const {
        std::map<std::string, std::string> found;
        if (std::filesystem::exists(path("out")))
            for (const auto& each : std::filesystem::recursive_directory_iterator(path("out")))
                if (each.is_regular_file())
                    found[std::filesystem::relative(each.path(), path("out")).string()] =
                        contentOf("out/" + std::filesystem::relative(each.path(), path("out")).string());
        return found;
    }
    void writeDrive(const std::string& name, std::uint8_t state = 4) const {
        writeRecording(name, "Ostrel_GSM", {{at(0), rrState(state)}, {at(2000), rrState(5)}});
    }
};

TEST_F(ColumnsCommandTest, writesATableADirectory) {
    writeDrive("drive.pcapng");
    const std::string report = columns({path("drive.pcapng")});
    EXPECT_THAT(report, testing::StartsWith(path("drive.pcapng") + ": written: "));
    std::set<std::string> names;
    std::set<std::string> tables;
    for (const auto& [name, content] : files()) {
        const std::string table = name.substr(0, name.find('/'));
        tables.insert(table);
        names.insert(name.substr(name.rfind('/') + 1));
        EXPECT_THAT(name, HasSubstr("/technology=Ostrel_GSM/date=2026-11-16/"));
        EXPECT_EQ(content.substr(0, 4), "PAR1") << name;
        EXPECT_THAT(content, EndsWith("PAR1")) << name;
    }
    EXPECT_THAT(tables, testing::IsSupersetOf({"messages", "files", "other_fields", "events", "positions"}));
    ASSERT_EQ(names.size(), 1U); // the hash of the content
    EXPECT_THAT(*names.begin(), testing::MatchesRegex("[0-9a-f]{32}\\.parquet"));
}

TEST_F(ColumnsCommandTest, leavesAloneWhatIsThere) {
    writeDrive("drive.pcapng");
    static_cast<void>(columns({path("drive.pcapng")}));
    const auto before = files();
    writeDrive("copy.pcapng");
    EXPECT_EQ(columns({path("copy.pcapng")}), path("copy.pcapng") + ": there already\n");
    EXPECT_EQ(files(), before);
}

TEST_F(ColumnsCommandTest, masksWhatItWrites) {
    constexpr const char* card = "8900101000000000017";
    const auto sim = makeDictionary();
    sim->set("kSimFile_ICCID", card);
    writeRecording("anna.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(500), extraRecord(0, Value(sim))}});
    const auto hasCard = [this, card] {
        for (const auto& [name, content] : files())
            if (content.find(card) != content.npos)
                return true;
        return false;
    };
    static_cast<void>(columns({path("anna.pcapng")}));
    ASSERT_TRUE(hasCard());
    std::filesystem::remove_all(path("out"));
    EXPECT_THAT(columns({"--mask", path("anna.pcapng")}), HasSubstr(": written: "));
    EXPECT_FALSE(hasCard());
    for (const auto& [name, content] : files())
        EXPECT_THAT(content, testing::Not(HasSubstr(path("anna.pcapng")))) << name;
}

TEST_F(ColumnsCommandTest, countsMaskedTablesAsOthersThanUnmaskedOnes) {
    writeDrive("drive.pcapng");
    std::ofstream(path("fleet.key")) << std::string(64, '7') << "\n";
    std::filesystem::permissions(path("fleet.key"), std::filesystem::perms::owner_read);
    const auto masked = [this](const std::string& level) {
        return columns({level, "--key", path("fleet.key"), path("drive.pcapng")});
    };
    static_cast<void>(columns({path("drive.pcapng")}));
    const std::size_t unmasked = files().size();
    EXPECT_THAT(masked("--mask"), HasSubstr(": written: "));
    EXPECT_THAT(masked("--mask=all"), HasSubstr(": written: "));
    EXPECT_EQ(files().size(), 3 * unmasked);
    EXPECT_THAT(masked("--mask"), HasSubstr(": there already"));
    EXPECT_THAT(masked("--mask=all"), HasSubstr(": there already"));
    std::size_t moved = 0;
    for (const auto& [name, content] : files())
        moved += name.find("/date=2000-01-01/") != name.npos ? 1 : 0;
    EXPECT_EQ(moved, unmasked);
    EXPECT_EQ(run({"columns", "--mask", "--compact", path("out")}, 2), "");
}

TEST_F(ColumnsCommandTest, completesWhatWasInterrupted) {
    writeDrive("drive.pcapng");
    static_cast<void>(columns({path("drive.pcapng")}));
    const auto complete = files();
    // The last to get its name is the one in "files".
    for (const auto& [name, content] : complete)
        if (name.starts_with("files/") || name.starts_with("messages/"))
            std::filesystem::remove(path("out/" + name));
    EXPECT_THAT(columns({path("drive.pcapng")}), HasSubstr(": written: "));
    EXPECT_EQ(files(), complete);
}

TEST_F(ColumnsCommandTest, makesTheSameOfAPipe) {
    writeDrive("drive.pcapng");
    static_cast<void>(columns({path("drive.pcapng")}));
    auto fromFile = files();
    std::filesystem::remove_all(path("out"));
    EXPECT_THAT(columns({"-"}, 0, contentOf("drive.pcapng")),
                testing::StartsWith("standard input: written: "));
    auto fromPipe = files();
    ASSERT_EQ(fromPipe.size(), fromFile.size());
    for (const auto& [name, content] : fromFile) {
        if (!name.starts_with("files/")) { // which names the input
            EXPECT_EQ(fromPipe[name], content) << name;
        }
    }
}

TEST_F(ColumnsCommandTest, separatesTheTechnologiesOfAFile) {
    write("both.pcapng", both());
    static_cast<void>(columns({path("both.pcapng")}));
    std::set<std::string> partitions;
    for (const auto& [name, content] : files())
        if (name.starts_with("messages/"))
            partitions.insert(name.substr(0, name.rfind('/')));
    EXPECT_EQ(partitions, (std::set<std::string>{"messages/technology=IFX/date=2026-11-16",
                                                 "messages/technology=Ostrel_GSM/date=2026-11-16"}));
}

TEST_F(ColumnsCommandTest, takesTheOtherFilesAfterABadOne) {
    writeDrive("drive.pcapng");
    std::ofstream(path("bad")) << "no recording";
    const std::string report = columns({path("bad"), path("absent"), path("drive.pcapng")}, 1);
    EXPECT_THAT(report, testing::StartsWith(path("bad") + ": failed\n" + path("absent") + ": failed\n"));
    EXPECT_THAT(report, HasSubstr("drive.pcapng: written: "));
    EXPECT_THAT(_errors, HasSubstr("absent: cannot open: No such file or directory"));
}

TEST_F(ColumnsCommandTest, writesWhatIsLeftOfADamagedFile) {
    writeDrive("drive.pcapng");
    const std::string content = contentOf("drive.pcapng");
    std::ofstream(path("cut.pcapng"), std::ios::binary) << content.substr(0, content.size() - 5);
    EXPECT_THAT(columns({path("cut.pcapng")}, 1), HasSubstr(": written with losses: "));
    EXPECT_FALSE(files().empty());
}

TEST_F(ColumnsCommandTest, leavesNothingWhereItFails) {
    writeDrive("drive.pcapng");
    std::filesystem::create_directories(path("out"));
    std::ofstream(path("out/messages")) << "in the way";
    EXPECT_EQ(columns({path("drive.pcapng")}, 1), path("drive.pcapng") + ": failed\n");
    EXPECT_THAT(_errors, HasSubstr("its directory cannot be made"));
    for (const auto& [name, content] : files())
        EXPECT_THAT(name, testing::Not(testing::StartsWith("files/")));
    for (const auto& [name, content] : files())
        EXPECT_THAT(name, testing::Not(HasSubstr("/.")));
}

TEST_F(ColumnsCommandTest, putsAFileWithoutMessagesIntoTheNullDay) {
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    static_cast<void>(columns({path("empty.pcapng")}));
    ASSERT_FALSE(files().empty());
    for (const auto& [name, content] : files())
        EXPECT_THAT(name, HasSubstr("/date=__HIVE_DEFAULT_PARTITION__/"));
}

TEST_F(ColumnsCommandTest, joinsSmallFiles) {
    writeDrive("a.pcapng");
    writeDrive("b.pcapng", 3);
    static_cast<void>(columns({path("a.pcapng"), path("b.pcapng")}));
    const std::size_t before = files().size();
    const std::string report = run({"columns", "--compact", path("out")});
    EXPECT_THAT(report, HasSubstr("messages/technology=Ostrel_GSM/date=2026-11-16: 2 files joined in 1\n"));
    EXPECT_EQ(files().size(), before / 2);
    for (const auto& [name, content] : files())
        EXPECT_THAT(name, HasSubstr("/joined-"));
    const auto joined = files();
    EXPECT_EQ(run({"columns", "--compact", path("out")}), "");
    EXPECT_EQ(columns({path("b.pcapng")}), path("b.pcapng") + ": there already\n");
    EXPECT_EQ(files(), joined);
}

TEST_F(ColumnsCommandTest, removesThePartsOfAJoinedFileThatWereLeft) {
    writeDrive("a.pcapng");
    writeDrive("b.pcapng", 3);
    static_cast<void>(columns({path("a.pcapng"), path("b.pcapng")}));
    const auto parts = files();
    static_cast<void>(run({"columns", "--compact", path("out")}));
    const auto joined = files();
    for (const auto& [name, content] : parts)
        if (name.starts_with("messages/"))
            std::ofstream(path("out/" + name), std::ios::binary) << content;
    static_cast<void>(run({"columns", "--compact", path("out")}));
    EXPECT_EQ(files(), joined);
}

TEST_F(ColumnsCommandTest, removesWhatAKilledProcessLeft) {
    writeDrive("a.pcapng");
    static_cast<void>(columns({path("a.pcapng")}));
    const auto before = files();
    std::ofstream(path("out/messages/technology=Ostrel_GSM/date=2026-11-16/.f00.parquet.a1B2c3")) << "PAR1";
    EXPECT_EQ(run({"columns", "--compact", path("out")}), "");
    EXPECT_EQ(files(), before);
}

TEST_F(ColumnsCommandTest, leavesFilesOfOtherProgramsAlone) {
    writeDrive("a.pcapng");
    static_cast<void>(columns({path("a.pcapng")}));
    const auto before = files();
    const std::string name = "out/messages/technology=Ostrel_GSM/date=2026-11-16/own.parquet";
    std::ofstream(path(name)) << "PAR1 PAR1";
    static_cast<void>(run({"columns", "--compact", path("out")}, 1));
    EXPECT_THAT(_errors, HasSubstr("own.parquet: "));
    EXPECT_EQ(files().size(), before.size() + 1);
}

TEST_F(ColumnsCommandTest, refusesADirectoryThatIsNone) {
    static_cast<void>(run({"columns", "--compact", path("absent")}, 1));
    EXPECT_THAT(_errors, HasSubstr("absent: cannot be read: No such file or directory"));
}

TEST_F(ColumnsCommandTest, wantsFilesOrADirectoryToCompact) {
    static_cast<void>(run({"columns"}, 2));
    EXPECT_THAT(_errors, HasSubstr("got neither --out nor --compact, wanted one of them"));
    static_cast<void>(run({"columns", "--out", path("out")}, 2));
    EXPECT_THAT(_errors, HasSubstr("got no FILE, wanted at least one"));
    static_cast<void>(run({"columns", "--compact", path("out"), "a"}, 2));
    EXPECT_THAT(_errors, HasSubstr("got a, wanted no FILE"));
    static_cast<void>(run({"columns", "--compact", path("out"), "--out", path("out"), "a"}, 2));
    EXPECT_THAT(_errors, HasSubstr("got both --out and --compact, wanted one of them"));
}

} // namespace
} // namespace velmora
