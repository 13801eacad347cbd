// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/ModelFixture.h"

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using VelmoraModelStartTest = ModelFixture;

struct Reply {
    const char* odd;
    std::int32_t status;
    const char* data; ///< null for a reply without data
    std::string line;
};

class GetTechnologyTest : public ModelFixture, public testing::WithParamInterface<Reply> {};

TEST_P(GetTechnologyTest, FailsWithItsLineAndIsTriedAgain) {
    getTechnology = [](const Data&) {
        RemotePort::Answer answer;
        answer.status = GetParam().status;
        if (GetParam().data)
            answer.reply = bytes(GetParam().data);
        return answer;
    };
    model->restartMonitor();
    const auto lines = errors();
    ASSERT_EQ(lines.size(), 3u);
    EXPECT_EQ(lines[1], GetParam().line);
    EXPECT_EQ(lines[2], "No log generator technology works");
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(queue.timerCount(), 0u);

    getTechnology = [](const Data&) { return answers(kVoxLogChannelTechnology_Ostrel_GSM); };
    queue.advance(5s);
    EXPECT_TRUE(model->isConnected());
}

INSTANTIATE_TEST_SUITE_P(
    , GetTechnologyTest,
    testing::Values(Reply{"Late", PortStatus::ReceiveTimeout, nullptr,
                          " ***** Could not send the GetTechnology command (got error=-2)"},
                    Reply{"NotTaken", PortStatus::SendTimeout, nullptr,
                          " ***** Could not send the GetTechnology command (got error=-1)"},
                    Reply{"ErrorWithAReply", PortStatus::BecameInvalid, "<plist><dict/></plist>",
                          " ***** Could not send the GetTechnology command (got error=-5)"},
                    Reply{"NoReplyData", PortStatus::Success, nullptr,
                          " ***** No response to GetTechnology; cannot configure"},
                    Reply{"Rubbish", PortStatus::Success, "rubbish",
                          " ***** Could not parse reply to GetTechnology; cannot configure"},
                    Reply{"EmptyData", PortStatus::Success, "",
                          " ***** Could not parse reply to GetTechnology; cannot configure"},
                    Reply{"NoAnswerInIt", PortStatus::Success,
                          "<plist><dict><key>Other</key><string>x</string></dict></plist>",
                          " ***** Reply to GetTechnology had no answer; cannot configure"},
                    Reply{"NoDictionary", PortStatus::Success, "<plist><array/></plist>",
                          " ***** Reply to GetTechnology had no answer; cannot configure"}),
    [](const auto& test) { return std::string(test.param.odd); });

struct Unknown {
    const char* odd;
    Value technology;
};

class UnknownTechnologyTest : public ModelFixture, public testing::WithParamInterface<Unknown> {};

TEST_P(UnknownTechnologyTest, StoresNoDecoderAndIsTriedAgain) {
    getTechnology = [](const Data&) {
        return RemotePort::Answer{
            PortStatus::Success,
            list(Value(std::make_shared<Dictionary>(
                std::initializer_list<Dictionary::Entry>{{"GetTechnology", GetParam().technology}})))};
    };
    model->restartMonitor();
    EXPECT_THAT(errors(), ElementsAre(HasSubstr("Created ports"), "Got log generated: (nil)",
                                      "No log generator technology works"));
    EXPECT_EQ(queue.delayedCount(), 1u);
}

INSTANTIATE_TEST_SUITE_P(, UnknownTechnologyTest,
                         testing::Values(Unknown{"UnknownName", "kVoxLogChannelTechnology_Ostrel_UTRAN"},
                                         Unknown{"EmptyName", ""}, Unknown{"ShortName", "Ostrel_GSM"},
                                         Unknown{"Number", 7}),
                         [](const auto& test) { return std::string(test.param.odd); });

} // namespace
} // namespace velmora
