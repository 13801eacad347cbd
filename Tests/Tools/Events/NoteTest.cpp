// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Comments.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tests/Tools/Events/EventsFixture.h"

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

/// A recording with notes on its second and third message.
class NoteTest : public EventsTest {
protected:
    NoteTest() {
        const auto writer = PcapngWriter::create(path("noted.pcapng"), "Ostrel_GSM");
        const std::vector<std::string> lift{"the lift, 2nd floor"};
        const std::vector<std::string> two{"door\nopens", "door closes"};
        add(**writer, 0, {});
        add(**writer, 1500, lift);
        add(**writer, 2000, two);
        add(**writer, 2500, {});
        EXPECT_TRUE((*writer)->close());
    }
    static void add(PcapngWriter& writer, std::int64_t milliseconds, const std::vector<std::string>& notes) {
        EXPECT_TRUE(writer.append(at(milliseconds), rrState(5).bytes(), notes));
    }
    /// "record: text" of each note.
    [[nodiscard]] std::vector<std::string> notes(const std::string& name) const {
        std::vector<std::string> found;
        for (const nlohmann::json& event : listed({"--kind", "note", path(name)}))
            found.push_back(event.at("evidence").at(0).at("record").dump() + ": " +
                            event.at("text").get<std::string>());
        return found;
    }
    [[nodiscard]] std::string run(std::vector<std::string> arguments) const {
        ToolProcess process(shipped(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
        return process.output();
    }
};

TEST_F(NoteTest, CommentsOnMessagesAreEvents) {
    EXPECT_THAT(notes("noted.pcapng"),
                ElementsAre("2: the lift, 2nd floor", "3: door\nopens", "3: door closes"));
    const auto events = listed({"--kind", "note", path("noted.pcapng")});
    EXPECT_EQ(events.at(0).at("kind"), "note");
    EXPECT_EQ(events.at(0).at("severity"), "info");
    EXPECT_EQ(events.at(0).at("time"), "2026-11-16T05:00:01.500000000Z");
    // As a line of text, nothing of a note moves the cursor.
    EXPECT_THAT(run({"events", "--kind", "note", path("noted.pcapng")}), HasSubstr("door\\nopens"));
}

TEST_F(NoteTest, AreAllListedOfAFileWithMoreThanReadersKeep) {
    constexpr std::size_t many = Comments::maximumKept + 3;
    const auto writer = PcapngWriter::create(path("many.pcapng"), "Ostrel_GSM");
    for (std::size_t i = 1; i <= many; ++i)
        add(**writer, static_cast<std::int64_t>(i) * 100, {"note " + std::to_string(i)});
    EXPECT_TRUE((*writer)->close());
    const std::vector<std::string> found = notes("many.pcapng");
    ASSERT_EQ(found.size(), many);
    EXPECT_EQ(found.back(), "103: note 103");
}

TEST_F(NoteTest, AreKeptByConvertListedByInfoAndRemovedByMask) {
    static_cast<void>(run({"convert", path("noted.pcapng"), path("copy.pcapng")}));
    EXPECT_EQ(notes("copy.pcapng"), notes("noted.pcapng"));
    EXPECT_THAT(run({"info", path("noted.pcapng")}), HasSubstr("the lift, 2nd floor"));
    static_cast<void>(run({"mask", path("noted.pcapng"), path("masked.pcapng")}));
    EXPECT_THAT(notes("masked.pcapng"), testing::IsEmpty());
}

} // namespace
} // namespace velmora
