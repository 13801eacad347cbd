// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Navigation/SplitController.h"

#include "Tests/Toolkit/ToolkitTest.h"

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

/// Two lists in a window.
class SplitControllerTest : public ::testing::Test {
protected:
    SplitControllerTest() {
        first->diary = second->diary = &diary;
        split->setOnWidthChanged([this] { widths.push_back(split->isWide()); });
        window.setRootViewController(split);
    }
    void show(int width) {
        window.makeKeyAndVisible();
        resize(width);
    }
    void resize(int width) {
        window.widget()->resize(width, 600);
        runUntilIdle();
    }
    [[nodiscard]] static bool isSeen(const ViewController& controller) {
        auto& view = const_cast<ViewController&>(controller).view();
        return view.widget()->isVisible();
    }

    std::vector<std::string> diary;
    std::vector<bool> widths;
    std::shared_ptr<ListPane> first = std::make_shared<ListPane>(numberedTexts(3), "first");
    std::shared_ptr<ListPane> second = std::make_shared<ListPane>(numberedTexts(3), "second");
    std::shared_ptr<SplitController> split = std::make_shared<SplitController>(first, second);
    Window window{Rect{0, 0, 400, 600}};
};

TEST_F(SplitControllerTest, TheFirstHasAllOfTheWindowUntilTheSecondIsShown) {
    show(1000);
    EXPECT_EQ(first->view().widget()->width(), 1000);
    EXPECT_FALSE(second->isViewLoaded()) << "it is not needed yet";
    split->setSecondShown(true);
    EXPECT_EQ(first->view().widget()->width(), 480);
    EXPECT_EQ(second->view().widget()->width(), 1000 - 480 - 1);
    split->setSecondShown(false);
    EXPECT_EQ(first->view().widget()->width(), 1000);
    EXPECT_FALSE(isSeen(*second));
}

TEST_F(SplitControllerTest, BothNeed720Points) {
    split->setSecondShown(true);
    show(719);
    EXPECT_FALSE(split->isWide());
    EXPECT_FALSE(isSeen(*first));
    EXPECT_TRUE(isSeen(*second));
    EXPECT_EQ(second->view().widget()->width(), 719);
    resize(720);
    EXPECT_TRUE(split->isWide());
    EXPECT_TRUE(isSeen(*first));
    EXPECT_TRUE(isSeen(*second));
    EXPECT_EQ(first->view().widget()->width(), 320) << "the second has at least 400";
}

TEST_F(SplitControllerTest, SaysWhenTheWindowBecomesWideOrNarrow) {
    show(1000);
    widths.clear();
    resize(900);
    EXPECT_THAT(widths, IsEmpty());
    resize(500);
    resize(400);
    resize(1000);
    EXPECT_THAT(widths, ElementsAre(false, true));
}

TEST_F(SplitControllerTest, EachScreenIsToldWhetherItIsSeen) {
    show(400);
    EXPECT_THAT(diary, ElementsAre("first:will appear", "first:did appear"));
    diary.clear();
    split->setSecondShown(true);
    EXPECT_THAT(diary, ElementsAre("first:will disappear", "first:did disappear", "second:will appear",
                                   "second:did appear"));
    diary.clear();
    resize(1000);
    EXPECT_THAT(diary, ElementsAre("first:will appear", "first:did appear"));
}

TEST_F(SplitControllerTest, TheKeyboardStaysWhereItIsWhenTheSecondComesBesideIt) {
    show(1000);
    ASSERT_TRUE(first->tableView().isFirstResponder());
    split->setSecondShown(true);
    EXPECT_TRUE(first->tableView().isFirstResponder());
    ASSERT_TRUE(second->becomeFirstResponder());
    resize(900);
    EXPECT_TRUE(second->tableView().isFirstResponder());
    split->setSecondShown(false);
    EXPECT_TRUE(first->tableView().isFirstResponder()) << "what has it is gone";
}

} // namespace
} // namespace velmora
