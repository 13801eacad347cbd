// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/RecordingSwitch.h"
#include "App/Recording/SizeText.h"
#include "Recording/OpenMessages.h"
#include "Tests/App/PlaybackFixture.h"

#include <QTest>

#include <sys/stat.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;

class RecordingScreenTest : public PlaybackFixture {
protected:
    void control(Qt::Key key) {
        QTest::keyClick(window(), key, Qt::ControlModifier);
        runUntilIdle();
    }
    [[nodiscard]] std::string recorded(long seconds = startSeconds) const {
        return (directory / "logs" / ("VelmoraRecording-" + std::to_string(seconds) + ".pcapng")).string();
    }
    /// "milliseconds after the start: comment" of each message, the comment left out where there is none.
    [[nodiscard]] static std::vector<std::string> messagesOf(const std::string& path) {
        const auto reader = openMessages(path);
        if (!reader)
            return {reader.reason()};
        std::vector<std::string> messages;
        std::uint64_t comments = 0;
        while (const auto message = (*reader)->next()) {
            const auto time =
                std::chrono::floor<std::chrono::milliseconds>(message->time - FakeClock::defaultNow());
            messages.push_back(std::to_string(time.count()));
            for (; comments < (*reader)->comments().count(); ++comments)
                messages.back() += ": " + (*reader)->comments().first()[comments].text;
        }
        EXPECT_EQ((*reader)->technology(), "IFX");
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
        return messages;
    }
    [[nodiscard]] std::string barStatus() const { return app.recording().bar()->status().text(); }
};

TEST_F(RecordingScreenTest, CtrlRRecordsWhatIsReceivedAndStops) {
    launchAndConnect();
    show(band("before")); // 2 s pass
    control(Qt::Key_R);
    ASSERT_NE(app.recording().bar(), nullptr);
    show(band("A"));
    show(band("B"));
    EXPECT_THAT(barStatus(), testing::MatchesRegex("Recording: [0-9]+ bytes, 2 messages, 0:04"));
    control(Qt::Key_R);
    EXPECT_EQ(app.recording().bar(), nullptr);
    show(band("after"));
    const std::string path = recorded(startSeconds + 2);
    EXPECT_THAT(messagesOf(path), ElementsAre("2000", "4000"));
    struct stat status = {};
    ASSERT_EQ(::stat(path.c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 0777, 0600);
    EXPECT_THAT(shownNotice(), HasSubstr("Recorded 2 messages, "));
    EXPECT_THAT(shownNotice(), HasSubstr("VelmoraRecording-"));
}

TEST_F(RecordingScreenTest, SavesTwiceASecondSoThatAKilledApplicationLosesLittle) {
    launchAndConnect();
    control(Qt::Key_R);
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, bytes(band("A"))));
    platform.queue.advance(500ms);
    EXPECT_THAT(messagesOf(recorded()), ElementsAre("0"));
}

TEST_F(RecordingScreenTest, ANoteIsACommentOnTheNextMessage) {
    launchAndConnect();
    control(Qt::Key_R);
    show(band("A"));
    control(Qt::Key_B);
    TextField& field = app.recording().bar()->noteField();
    EXPECT_TRUE(field.isFirstResponder());
    QTest::keyClicks(field.widget(), "the lift, 2nd floor");
    QTest::keyClick(field.widget(), Qt::Key_Return);
    EXPECT_TRUE(field.isHidden());
    show(band("B"));
    show(band("C"));
    control(Qt::Key_R);
    EXPECT_THAT(messagesOf(recorded()), ElementsAre("0", "2000: the lift, 2nd floor", "4000"));
}

TEST_F(RecordingScreenTest, ANoteWithoutAMessageAfterItIsSaid) {
    launchAndConnect();
    control(Qt::Key_B);
    EXPECT_EQ(shownNotice(), "A note goes into a recording. Ctrl-R starts one.");
    control(Qt::Key_R);
    EXPECT_EQ(shownNotice(), "");
    show(band("A"));
    control(Qt::Key_B);
    app.recording().bar()->noteField().setText("lost");
    EXPECT_TRUE(app.recording().bar()->textFieldShouldReturn(app.recording().bar()->noteField()));
    control(Qt::Key_R);
    EXPECT_THAT(shownNotice(), HasSubstr("The last note is not in it, since no message followed."));
    EXPECT_THAT(messagesOf(recorded()), ElementsAre("0"));
}

TEST_F(RecordingScreenTest, RecordsMaskedMessagesWhileIdentitiesAreMaskedAndStopsWhenThatChanges) {
    const auto sim = dictionary({{"ICCID", "8949027500001234568"}, {"State", "Ready"}});
    launchAndConnect();
    app.togglePrivacy();
    platform.queue.runPending();
    runUntilIdle();
    control(Qt::Key_R);
    show(sim);
    app.togglePrivacy();
    EXPECT_EQ(app.recording().bar(), nullptr);
    const auto reader = openMessages(recorded());
    ASSERT_TRUE(reader) << reader.reason();
    const auto message = (*reader)->next();
    ASSERT_TRUE(message);
    const Bytes content = message->message.bytes();
    EXPECT_EQ(std::string(content.begin(), content.end()).find("8949027500001234568"), std::string::npos);
    EXPECT_THAT(
        shownNotice(),
        HasSubstr("The recording has ended: identities are masked otherwise now. Recorded 1 message"));
}

TEST_F(RecordingScreenTest, GoesOnAfterTheConnectionWasLost) {
    launchAndConnect();
    control(Qt::Key_R);
    show(band("A"));
    loseService();
    platform.telephony.available = true;
    platform.queue.advance(5s);
    runUntilIdle();
    ASSERT_TRUE(app.model().isConnected());
    show(band("B"));
    control(Qt::Key_R);
    EXPECT_EQ(messagesOf(recorded()).size(), 2U);
    EXPECT_TRUE(log.contains(LogPriority::Error, "recording: the telephony service is gone; waiting for it"));
    EXPECT_TRUE(log.contains(LogPriority::Error, "recording: the telephony service is back"));
}

TEST_F(RecordingScreenTest, AFolderThatIsNotThereIsSaid) {
    std::filesystem::remove(directory / "logs");
    launchAndConnect();
    control(Qt::Key_R);
    EXPECT_EQ(app.recording().bar(), nullptr);
    EXPECT_THAT(shownNotice(), testing::StartsWith("Nothing is recorded: cannot create "));
    EXPECT_THAT(shownNotice(), HasSubstr("No such file or directory"));
}

TEST_F(RecordingScreenTest, NothingIsLeftWhereTheServiceNeverCame) {
    platform.telephony.available = false;
    launch();
    control(Qt::Key_R);
    EXPECT_TRUE(std::filesystem::exists(recorded()));
    control(Qt::Key_R);
    EXPECT_FALSE(std::filesystem::exists(recorded()));
}

TEST(SizeTextTest, IsForPeople) {
    EXPECT_EQ(sizeText(0), "0 bytes");
    EXPECT_EQ(sizeText(1), "1 byte");
    EXPECT_EQ(sizeText(1023), "1023 bytes");
    EXPECT_EQ(sizeText(1024), "1 KiB");
    EXPECT_EQ(sizeText(3'565'158), "3.4 MiB");
    EXPECT_EQ(sizeText(std::uint64_t{5} << 30), "5.0 GiB");
}

} // namespace
} // namespace velmora
