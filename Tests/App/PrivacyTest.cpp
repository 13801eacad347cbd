// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/PrivacySwitch.h"
#include "Export/Masking/Sealing/SealedFile.h"
#include "Recording/Files/FileSource.h"
#include "Tests/App/SaveScreenFixture.h"

#include <QAbstractButton>
#include <QApplication>
#include <QLabel>
#include <QTest>
#include <QWidget>

#include <fstream>
#include <iterator>

// Ctrl-M: identities do not get on the screen, and not into what is saved.

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

constexpr const char* iccid = "8949027500001234568";
constexpr const char* address = "10.83.161.7";
constexpr const char* notice = "Identities are masked. Ctrl-M shows them.";
constexpr const char* preference = "com.velmora.velmora MaskIdentities";

class PrivacyTest : public SaveScreenFixture {
protected:
    static Value identities() {
        const ArrayRef contexts = makeArray();
        contexts->append(dictionary({{"APN", "internet.test"}, {"Address", address}}));
        return dictionary(
            {{"SIM", dictionary({{"ICCID", iccid}, {"State", "Ready"}})},
             {"Serving Cell", dictionary({{"ARFCN", "18"}, {"RxLev", "-71 dBm"}})},
             {"Packet Data", dictionary({{"Contexts", Value(contexts)}, {"Coding Scheme", "CS-2"}})}});
    }
    void pressCtrlM() {
        QTest::keyClick(window(), Qt::Key_M, Qt::ControlModifier);
        // Not yet what is queued for the event loop: what the screen shows from now on counts.
    }
    void reconnect() {
        platform.queue.runPending();
        runUntilIdle();
        ASSERT_TRUE(app.model().isConnected());
    }
    [[nodiscard]] QWidget* window() const { return app.navController().view().widget()->window(); }
    [[nodiscard]] std::string shownNotice() const {
        const auto* const text = window()->findChild<QWidget*>("velmora.notice");
        return text && text->isVisible() ? text->accessibleName().toStdString() : "";
    }
    /// All texts of the widgets that are seen, and what they are called for screen readers.
    [[nodiscard]] static std::string shownTexts() {
        QString texts;
        for (const QWidget* widget : QApplication::allWidgets()) {
            if (!widget->isVisible())
                continue;
            texts += widget->accessibleName() + "\n" + widget->windowTitle() + "\n";
            if (const auto* label = qobject_cast<const QLabel*>(widget))
                texts += label->text() + "\n";
        }
        return texts.toStdString();
    }
    /// The value of the top pane's row of that name.
    [[nodiscard]] std::string value(const std::string& name) const {
        for (const std::string& row : rows(*topPane()))
            if (row.starts_with(name + ": "))
                return row.substr(name.size() + 2);
        return "(none)";
    }
    void openSIM() {
        clickRow(0);
        ASSERT_TRUE(eventually([this] { return depth() == 2; }));
    }
};

TEST_F(PrivacyTest, IdentitiesDisappearAtOnceAndComeBackMasked) {
    launchAndConnect();
    show(identities());
    openSIM();
    ASSERT_EQ(value("ICCID"), iccid);
    EXPECT_EQ(shownNotice(), "");
    pressCtrlM();
    EXPECT_EQ(depth(), 1U);
    EXPECT_THAT(rows(*topPane()), IsEmpty());
    EXPECT_THAT(shownTexts(), Not(HasSubstr(iccid)));
    EXPECT_EQ(status(*topPane()), "Connecting...");
    EXPECT_EQ(shownNotice(), notice);
    reconnect();
    EXPECT_THAT(rows(*topPane()), IsEmpty());
    show(identities());
    openSIM();
    const std::string masked = value("ICCID");
    EXPECT_NE(masked, iccid);
    EXPECT_THAT(masked, testing::MatchesRegex("89[0-9]{17}"));
    EXPECT_THAT(shownTexts(), Not(HasSubstr(iccid)));
    EXPECT_EQ(shownNotice(), notice);
}

TEST_F(PrivacyTest, TheSameKeyIsUsedUntilTheApplicationEnds) {
    launchAndConnect();
    const auto shownMasked = [this] {
        pressCtrlM();
        reconnect();
        show(identities());
        openSIM();
        return value("ICCID");
    };
    const std::string masked = shownMasked();
    EXPECT_EQ(shownMasked(), iccid) << "switched off again";
    EXPECT_EQ(shownNotice(), "");
    EXPECT_EQ(shownMasked(), masked);
}

TEST_F(PrivacyTest, KeyMayBeGiven) {
    MaskKey key;
    key.bytes.fill(7);
    app.setMaskKey(key);
    platform.fakePreferences.trueOnes = {preference};
    launchAndConnect();
    show(identities());
    openSIM();
    const std::string first = value("ICCID");
    PrivacySwitch other(platform.fakePreferences, key);
    const auto masked = other.shown(bytes(identities()), kVoxLogChannelTechnology_IFX, Time());
    ASSERT_TRUE(masked);
    EXPECT_THAT(std::string(masked->bytes().begin(), masked->bytes().end()), HasSubstr(first));
}

TEST_F(PrivacyTest, IsRememberedInThePreferences) {
    launchAndConnect();
    pressCtrlM();
    EXPECT_THAT(platform.fakePreferences.calls, ElementsAre("set com.velmora.velmora MaskIdentities true",
                                                            "synchronize com.velmora.velmora"));
    platform.fakePreferences.calls.clear();
    pressCtrlM();
    EXPECT_THAT(platform.fakePreferences.calls, ElementsAre("set com.velmora.velmora MaskIdentities false",
                                                            "synchronize com.velmora.velmora"));
}

TEST_F(PrivacyTest, RememberedOneMasksFromTheFirstMessageOn) {
    platform.fakePreferences.trueOnes = {preference};
    launchAndConnect();
    EXPECT_EQ(shownNotice(), notice);
    show(identities());
    openSIM();
    EXPECT_NE(value("ICCID"), iccid);
    EXPECT_NE(value("ICCID"), "(none)");
}

TEST_F(PrivacyTest, SnapshotsHoldNothingThatWasReceivedInClear) {
    launchAndConnect();
    show(identities());
    pressCtrlM();
    reconnect();
    show(identities());
    open();
    save();
    ASSERT_EQ(files().size(), 1U);
    std::ifstream stream(directory / "logs" / files()[0]);
    const std::string text(std::istreambuf_iterator<char>(stream), {});
    EXPECT_THAT(text, HasSubstr("-71 dBm"));
    EXPECT_THAT(text, Not(HasSubstr(iccid)));
    EXPECT_THAT(text, Not(HasSubstr(address)));
}

TEST_F(PrivacyTest, SnapshotsHaveTheSealOfMaskedFilesInsteadOfWhatIsTyped) {
    MaskKey key;
    key.bytes.fill(7);
    app.setMaskKey(key);
    platform.fakePreferences.trueOnes = {preference};
    launchAndConnect();
    show(identities());
    open();
    saveScreen()->saveDescription().setText("Anna's phone");
    save();
    ASSERT_EQ(files().size(), 1U);
    const std::filesystem::path path = directory / "logs" / files()[0];
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(path.string());
    ASSERT_TRUE(source);
    const std::optional<MaskSeal> seal = readSeal(ChunkedInput(*std::move(source)));
    ASSERT_TRUE(seal);
    EXPECT_EQ(seal->level, MaskLevel::Identity);
    EXPECT_EQ(seal->key, key.fingerprint());
    std::ifstream stream(path);
    const std::string text(std::istreambuf_iterator<char>(stream), {});
    EXPECT_THAT(text, Not(HasSubstr("Anna")));
}

TEST_F(PrivacyTest, SnapshotsOfMessagesInClearHaveNoSeal) {
    platform.fakePreferences.trueOnes = {preference};
    launchAndConnect();
    pressCtrlM();
    reconnect();
    show(identities());
    open();
    saveScreen()->saveDescription().setText("Anna's phone");
    save();
    ASSERT_EQ(files().size(), 1U);
    std::ifstream stream(directory / "logs" / files()[0]);
    const std::string text(std::istreambuf_iterator<char>(stream), {});
    EXPECT_THAT(text, HasSubstr("Anna's phone"));
    EXPECT_THAT(text, Not(HasSubstr("velmora-mask")));
}

TEST_F(PrivacyTest, SaveScreenWithWhatWasReceivedInClearIsClosed) {
    launchAndConnect();
    show(identities());
    open();
    saveScreen()->saveDescription().becomeFirstResponder();
    QTest::keyClick(window()->focusWidget(), Qt::Key_M, Qt::ControlModifier);
    EXPECT_TRUE(eventually([this] { return !saveScreen(); }));
    EXPECT_THAT(files(), IsEmpty());
    EXPECT_EQ(shownNotice(), notice);
    reconnect();
    open();
    EXPECT_THAT(listed(), IsEmpty());
}

TEST_F(PrivacyTest, NoticeOfTheConnectionFollows) {
    platform.fakePreferences.trueOnes = {preference};
    platform.telephony.available = false;
    launch();
    platform.queue.runPending();
    runUntilIdle();
    EXPECT_THAT(shownNotice(), testing::StartsWith(std::string(notice) + " No telephony service answers. "));
    pressCtrlM();
    EXPECT_THAT(shownNotice(), testing::StartsWith("No telephony service answers. "));
    // The retry that was due before does not meet the new attempt.
    platform.telephony.available = true;
    platform.queue.advance(std::chrono::seconds(20));
    runUntilIdle();
    EXPECT_TRUE(app.model().isConnected());
    show(identities());
    openSIM();
    EXPECT_EQ(value("ICCID"), iccid);
}

} // namespace
} // namespace velmora
