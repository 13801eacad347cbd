// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseSession.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Tools/SeveralTechnologies.h"
#include "Tools/Rules/RuleFiles.h"

#include <gmock/gmock.h>

#include <string>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class BrowseSessionTest : public SeveralTechnologiesTest {
protected:
    BrowseSessionTest() {
        ::setenv("VELMORA_RESOURCES", VELMORA_SOURCE_DIR "/Resources", 1);
        _earlierResources = setResources(&_shipped);
        _catalogues.emplace();
        _rules.emplace(loadBuiltInRules(*_catalogues));
    }
    ~BrowseSessionTest() override { setResources(_earlierResources); }

    [[nodiscard]] std::unique_ptr<BrowseSession> browse(const std::string& name,
                                                        const std::string& technology = {}) {
        Result<std::unique_ptr<BrowseSession>> session =
            BrowseSession::open(path(name), technology, {}, [this]() -> const RuleSet& { return *_rules; });
        EXPECT_TRUE(session) << (session ? std::string() : session.reason());
        return session ? *std::move(session) : nullptr;
    }
    static void finish(BrowseSession& session) {
        while (session.work()) {
        }
    }
    /// The network is listed and idle alternately, 10 times a second.
    void writeDrive(int messages) {
        std::vector<TimedMessage> drive;
        for (int i = 0; i < messages; ++i)
            drive.push_back({at(i * 100), rrState(static_cast<std::uint8_t>(4 + i % 2))});
        writeRecording("drive.pcapng", "Ostrel_GSM", drive);
    }

    CapturedLog _log{LogPriority::Emergency};
    FileResources _shipped;
    Resources* _earlierResources = nullptr;
    std::optional<AllCatalogues> _catalogues;
    std::optional<RuleSet> _rules;
};

TEST_F(BrowseSessionTest, TheEndIsChosenOnceAllHasBeenRead) {
    writeDrive(3000);
    const auto session = browse("drive.pcapng");
    ASSERT_TRUE(session);
    session->chooseLast(); // nothing has been read, and nothing is waited for
    EXPECT_EQ(session->listed(), 0U);
    EXPECT_EQ(session->message(), nullptr);
    finish(*session);
    EXPECT_EQ(session->position(), 2999U);
    ASSERT_NE(session->message(), nullptr);
    EXPECT_EQ(session->message()->message.number, 3000U);
}

TEST_F(BrowseSessionTest, AnotherChoiceReplacesTheEnd) {
    writeDrive(3000);
    const auto session = browse("drive.pcapng");
    ASSERT_TRUE(session);
    session->chooseLast();
    session->work(); // some messages are there, or all
    session->choose(1);
    finish(*session);
    EXPECT_EQ(session->position(), 1U);
}

TEST_F(BrowseSessionTest, ATimeIsGoneToOnceItHasBeenRead) {
    writeDrive(3000);
    const auto session = browse("drive.pcapng");
    ASSERT_TRUE(session);
    session->chooseTime(at(250'000));
    finish(*session);
    EXPECT_EQ(session->position(), 2500U);
}

TEST_F(BrowseSessionTest, AFilterKeepsTheChosenMessageOrTheNextOne) {
    writeDrive(10);
    const auto session = browse("drive.pcapng");
    ASSERT_TRUE(session);
    finish(*session);
    session->choose(4);
    ASSERT_TRUE(session->setFilter("0x512C"));
    finish(*session);
    EXPECT_EQ(session->listed(), 10U);
    EXPECT_EQ(session->position(), 4U);
    EXPECT_FALSE(session->setFilter("serving.level"));
    EXPECT_EQ(session->filter(), "0x512C") << "a mistake leaves the one before";
    ASSERT_TRUE(session->setFilter(""));
    EXPECT_EQ(session->listed(), 10U);
}

TEST_F(BrowseSessionTest, NotesAreUnwrittenUntilTheyAreWrittenOrRemoved) {
    writeDrive(3);
    const auto session = browse("drive.pcapng");
    ASSERT_TRUE(session);
    finish(*session);
    session->setNote("bridge");
    EXPECT_TRUE(session->hasUnwrittenNotes());
    session->setNote("");
    EXPECT_FALSE(session->hasUnwrittenNotes());
    session->setNote("bridge");
    ASSERT_TRUE(session->write(path("copy.pcapng")));
    EXPECT_FALSE(session->hasUnwrittenNotes());
}

TEST_F(BrowseSessionTest, CommentsBeyondThoseThatAReaderKeepsAreShown) {
    writeDrive(250);
    const auto noted = browse("drive.pcapng");
    ASSERT_TRUE(noted);
    finish(*noted);
    for (std::uint64_t i = 0; i < 250; ++i) {
        noted->choose(i);
        noted->setNote("note " + std::to_string(i));
    }
    ASSERT_TRUE(noted->write(path("noted.pcapng")));
    const auto session = browse("noted.pcapng");
    ASSERT_TRUE(session);
    finish(*session);
    for (const std::uint64_t position : {0U, 99U, 100U, 249U, 150U}) {
        const std::vector<MessageRow> rows = session->rows(position, 1);
        ASSERT_EQ(rows.size(), 1U);
        EXPECT_EQ(rows[0].note, "note " + std::to_string(position));
    }
    session->choose(0);
    session->search("note 249", SearchPass::Direction::Forward);
    finish(*session);
    EXPECT_EQ(session->position(), 249U);
}

TEST_F(BrowseSessionTest, EachTechnologyOfAFileHasItsMessages) {
    write("both.pcapng", both());
    const auto first = browse("both.pcapng");
    ASSERT_TRUE(first);
    finish(*first);
    EXPECT_EQ(first->listed(), 2U);
    EXPECT_THAT(first->otherTechnologies(), ElementsAre("IFX"));
    const auto second = browse("both.pcapng", "IFX");
    ASSERT_TRUE(second);
    finish(*second);
    EXPECT_EQ(second->listed(), 2U);
    EXPECT_THAT(second->otherTechnologies(), ElementsAre("Ostrel_GSM"));
    writeDrive(1);
    const auto alone = browse("drive.pcapng");
    ASSERT_TRUE(alone);
    finish(*alone);
    EXPECT_THAT(alone->otherTechnologies(), IsEmpty());
}

} // namespace
} // namespace velmora
