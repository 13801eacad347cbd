// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/ServiceLog.h"

#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class ServiceLogTest : public testing::Test {
protected:
    static void write(const std::vector<std::string>& texts) {
        for (const std::string& text : texts)
            logLine(LogPriority::Error, text);
    }

    CapturedLog _log;
    DecoderLines _lines;
    std::vector<std::string> _problems;
    ServiceLog _service{_lines, [this](const std::string& problem) { _problems.push_back(problem); }};
};

TEST_F(ServiceLogTest, AttemptsWithoutAServiceAreOneProblemAndCounted) {
    for (int attempt = 0; attempt < 3; ++attempt)
        write({"Could not create VoxServerConnection", "Could not create the ports necessary"});
    EXPECT_THAT(_problems, ElementsAre("no telephony service answers"));
    EXPECT_EQ(_service.problem(), "no telephony service answers");
    EXPECT_THAT(_log.lines(), IsEmpty());
    _lines.report();
    EXPECT_THAT(_log.textsAt(LogPriority::Error),
                ElementsAre("3 times: Could not create VoxServerConnection",
                            "3 times: Could not create the ports necessary"));
}

TEST_F(ServiceLogTest, TheFirstLineOfAnAttemptHasTheCause) {
    write({"Message port com.velmora.log.7.BasebandStateReport.LogChannel: port directory /p has mode 0777, "
           "wanted 0700",
           "Could not create local message port", "Could not create the ports necessary"});
    EXPECT_THAT(_problems, ElementsAre("port directory /p has mode 0777, wanted 0700"));
    write({"Could not create VoxServerConnection", "Could not create the ports necessary"});
    EXPECT_THAT(_problems,
                ElementsAre("port directory /p has mode 0777, wanted 0700", "no telephony service answers"));
}

TEST_F(ServiceLogTest, ALostConnectionIsAProblemOfItsOwn) {
    write({" ***** Created ports (send=0x1, recv=0x2)", "Got log generated: 0x3",
           "Starting the display update timer"});
    _service.clearProblem();
    EXPECT_EQ(_service.problem(), "");
    write({" ***** INVALIDATED 0x5599ef05f260 *****", "Could not create VoxServerConnection",
           "Could not create the ports necessary"});
    EXPECT_THAT(_problems, ElementsAre("the connection to the telephony service is lost",
                                       "no telephony service answers"));
}

TEST_F(ServiceLogTest, AServiceThatDoesNotAnswerAsItShouldIsAProblem) {
    struct Row {
        const char* line;
        const char* problem;
    };
    const Row rows[] = {
        {" ***** No response to GetTechnology; cannot configure",
         "the telephony service does not name its technology"},
        {" ***** Could not send the START command (got error=-1)",
         "the telephony service does not take the start command"},
        {"Got log generated: (nil)", "the telephony service's technology has no decoder here"},
        {"_VoxServerConnectionNetworkMonitorCreateLogChannel returns error: 5!",
         "the telephony service opens no log channel"},
        {"Could not create a log channel (Vox returned null port)!",
         "the telephony service opens no log channel"},
        {"Could not create the remote port!", "the telephony service's log channel is not there"},
        {"Local messsage port already exists", "this program's port is in use"},
    };
    for (const Row& row : rows) {
        _service.clearProblem();
        write({row.line, "No log generator technology works"});
        EXPECT_EQ(_service.problem(), row.problem) << row.line;
    }
}

TEST_F(ServiceLogTest, OtherLinesAreWrittenAtOnce) {
    write({"the telephony service is gone; waiting for it", "LTE.plist: not a property list"});
    EXPECT_THAT(_log.textsAt(LogPriority::Error), ElementsAre("the telephony service is gone; waiting for it",
                                                              "LTE.plist: not a property list"));
    EXPECT_THAT(_problems, IsEmpty());
}

TEST(VerboseServiceLogTest, AllLinesAreWrittenAtOnce) {
    CapturedLog log;
    DecoderLines lines(true);
    const ServiceLog service(lines);
    logLine(LogPriority::Error, " ***** Created ports (send=0x1, recv=0x2)");
    logLine(LogPriority::Error, "Could not create VoxServerConnection");
    EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre(" ***** Created ports (send=0x1, recv=0x2)",
                                                             "Could not create VoxServerConnection"));
    EXPECT_EQ(service.problem(), "no telephony service answers");
}

} // namespace
} // namespace velmora
