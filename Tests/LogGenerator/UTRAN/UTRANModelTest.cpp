// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/ModelFixture.h"

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;

/// A model whose service speaks the UTRAN technology; the fixture's resources hold no template for it.
class UTRANModel : public ModelFixture {
protected:
    UTRANModel() {
        getTechnology = [](const Data&) { return answers(kVoxLogChannelTechnology_Ostrel_UTRAN2); };
    }
    void putTemplate() {
        resources.put("Ostrel_UTRAN", "plist",
                      Value(std::make_shared<Dictionary>(
                          std::initializer_list<Dictionary::Entry>{{"RRC Info", makeDictionary()}})));
    }
};

TEST_F(UTRANModel, WithoutATemplateItTriesAgainUntilThereIsOne) {
    model->restartMonitor();
    EXPECT_THAT(errors(),
                ElementsAre(HasSubstr("Created ports"),
                            "resources of type plist are Ostrel_GSM, wanted one whose name contains UTRAN",
                            "Got log generated: (nil)", "No log generator technology works"));
    EXPECT_FALSE(model->isConnected());
    EXPECT_FALSE(ports.isTaken(localName));
    EXPECT_EQ(queue.timerCount(), 0u);
    EXPECT_EQ(queue.delayedCount(), 1u);

    queue.advance(5s);
    EXPECT_EQ(count("No log generator technology works"), 2);
    EXPECT_FALSE(model->isConnected());

    putTemplate();
    queue.advance(4999ms);
    EXPECT_FALSE(model->isConnected());
    queue.advance(1ms);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(queue.delayedCount(), 0u);
}

TEST_F(UTRANModel, ShowsWhatIsDecoded) {
    putTemplate();
    model->restartMonitor();
    ASSERT_TRUE(model->isConnected());
    deliver(record(0xD0E0, "01 05"));
    queue.advance(2s);
    const NodeRef node = model->nodeAtPath("/RRC Info/State");
    ASSERT_NE(node, nullptr);
    ASSERT_NE(node->value(), nullptr);
    EXPECT_EQ(*node->value(), "Cell URA PCH");
}

} // namespace
} // namespace velmora
