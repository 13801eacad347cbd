// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/RecordingSwitch.h"
#include "Recording/OpenMessages.h"
#include "Tests/App/DriveView/DriveFixture.h"

#include <QAbstractButton>

#include <algorithm>

namespace velmora {
namespace {

using testing::Contains;

class DriveButtonsTest : public DriveFixture {
protected:
    [[nodiscard]] QAbstractButton* button(const char* name) const {
        for (auto* const each : view().widget()->findChildren<QAbstractButton*>())
            if (each->accessibleName() == name)
                return each;
        return nullptr;
    }
    [[nodiscard]] QAbstractButton* record() const { return button("Record what is received"); }
    [[nodiscard]] QAbstractButton* bookmark() const {
        return button("Bookmark this moment in the recording");
    }
};

TEST_F(DriveButtonsTest, OneStartsAndStopsTheRecordingAndShowsWhetherThereIsOne) {
    launchIn(360, 640);
    press(Qt::Key_D, Qt::ControlModifier);
    drive(10);
    ASSERT_TRUE(record() && record()->isVisible());
    EXPECT_GE(record()->height(), 44);
    EXPECT_TRUE(record()->isCheckable());
    EXPECT_FALSE(record()->isChecked());
    click(record());
    EXPECT_TRUE(app.recording().isOn());
    EXPECT_TRUE(record()->isChecked());
    drive(4);
    click(record());
    EXPECT_FALSE(app.recording().isOn());
    EXPECT_FALSE(record()->isChecked());
}

TEST_F(DriveButtonsTest, FollowTheKeyToo) {
    launchIn(1280, 800);
    press(Qt::Key_R, Qt::ControlModifier);
    EXPECT_TRUE(record()->isChecked());
    press(Qt::Key_R, Qt::ControlModifier);
    EXPECT_FALSE(record()->isChecked());
}

TEST_F(DriveButtonsTest, OneNotesTheMomentInTheRecordingAndAmongTheEvents) {
    launchIn(360, 640);
    press(Qt::Key_D, Qt::ControlModifier);
    drive(10);
    EXPECT_FALSE(bookmark()->isEnabled()) << "there is nothing that it could be in";
    click(record());
    drive(4);
    ASSERT_TRUE(bookmark()->isEnabled());
    const std::string file = app.recording().file();
    click(bookmark());
    drive(4);
    click(record());
    const auto& events = model().events();
    EXPECT_TRUE(std::any_of(events.begin(), events.end(), [](const Event& each) {
        return each.kind == "note" && each.text == "Bookmark";
    }));
    const auto reader = openMessages(file);
    ASSERT_TRUE(reader) << reader.reason();
    while ((*reader)->next()) {
    }
    ASSERT_EQ((*reader)->comments().count(), 1U);
    EXPECT_EQ((*reader)->comments().first().front().text, "Bookmark");
}

} // namespace
} // namespace velmora
