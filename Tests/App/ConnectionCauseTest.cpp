// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/VelmoraProcessFixture.h"

#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

/// What the log of the built program says where it cannot connect: the model's own lines, which repeat every
/// five seconds, and one line with the cause and the way out.
class ConnectionCauseTest : public VelmoraProcessTest {
protected:
    /// The lines of the first attempt to connect, after time enough for one that only guesses.
    [[nodiscard]] std::vector<std::string> firstLines(const char* last, const char* name = "velmora.err") {
        EXPECT_TRUE(eventually([&] { return text(name).find(last) != std::string::npos; })) << text(name);
        QThread::msleep(4500);
        std::vector<std::string> lines;
        const std::string log = text(name);
        for (std::size_t at = 0; at < log.size();) {
            const std::size_t end = log.find('\n', at);
            if (log[at] == '<') // else it is the toolkit's
                lines.push_back(log.substr(at, end - at));
            at = end + 1;
        }
        return lines;
    }
    [[nodiscard]] std::string ports() const { return path("ports").toStdString(); }
};

TEST_F(ConnectionCauseTest, NoService) {
    const auto app = start("velmora", {"--log", "stderr"});
    EXPECT_THAT(firstLines("seed=1"),
                ElementsAre("<3>Could not create VoxServerConnection",
                            "<3>Could not create the ports necessary",
                            "<3>no telephony service answers; the installed one is started by: velmora "
                            "--start-service, one with a synthetic drive by: velmora-telephonyd --source "
                            "scenario:gsm,seed=1"));
    end(*app);
}

TEST_F(ConnectionCauseTest, ASecondInstance) {
    const auto service = startService();
    const auto first = start("velmora", {"--log", "stderr"}, "first");
    ASSERT_TRUE(eventually(
        [&] { return text("first.err").find("Starting the display update timer") != std::string::npos; }));
    const auto second = start("velmora", {"--log", "stderr"});
    EXPECT_THAT(firstLines("seconds"),
                ElementsAre("<3>Local messsage port already exists",
                            "<3>Could not create the ports necessary",
                            "<3>Velmora is running already; end the other one, and this one connects within "
                            "five seconds"));
    end(*first);
    EXPECT_TRUE(eventually(
        [&] { return text("velmora.err").find("Starting the display update timer") != std::string::npos; }));
    end(*second);
    end(*service);
}

TEST_F(ConnectionCauseTest, AnUnusablePortDirectory) {
    std::filesystem::create_directory(directory / "ports");
    std::filesystem::permissions(directory / "ports", std::filesystem::perms::all);
    const std::string reason = "port directory " + ports() + " has mode 0777, wanted 0700";
    const std::vector<std::string> lines = {
        "<3>Message port com.velmora.BasebandStateReport.LogChannel: " + reason,
        "<3>Could not create local message port", "<3>Could not create the ports necessary",
        "<3>" + reason + "; mend that, or name another directory in VELMORA_PORT_DIR, for the service too"};
    {
        const auto app = start("velmora", {"--log", "stderr"});
        EXPECT_THAT(firstLines("VELMORA_PORT_DIR"), testing::ElementsAreArray(lines));
        end(*app);
    }
    // Nor is a service started that could not be reached either.
    environment.insert("VELMORA_SOURCE", "scenario:gsm,seed=1");
    const auto app = start("velmora", {"--start-service", "--log", "stderr", "--log-level", "5"});
    auto more = firstLines("VELMORA_PORT_DIR");
    ASSERT_FALSE(more.empty());
    EXPECT_EQ(more.front(), "<3>telephony service: " + reason);
    more.erase(more.begin());
    EXPECT_THAT(more, testing::ElementsAreArray(lines));
    end(*app);
}

TEST_F(ConnectionCauseTest, AServiceThatCouldNotBeStarted) {
    environment.insert("VELMORA_SOURCE", "scenario:none");
    const auto app = start("velmora", {"--start-service", "--log", "stderr"});
    EXPECT_THAT(
        firstLines("Could not create the ports necessary"),
        ElementsAre("<3>telephony service: " VELMORA_BUILD_DIR
                    "/velmora-telephonyd --source scenario:none has ended, wanted a service that answers",
                    "<3>Could not create VoxServerConnection", "<3>Could not create the ports necessary"));
    end(*app);
}

} // namespace
} // namespace velmora
