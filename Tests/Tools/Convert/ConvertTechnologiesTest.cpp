// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/SeveralTechnologies.h"

#include <gmock/gmock.h>

#include <string>

// What `convert` does with a file of several technologies.

namespace velmora {
namespace {

class ConvertTechnologiesTest : public SeveralTechnologiesTest {};

TEST_F(ConvertTechnologiesTest, OnlySnapshotsAndLogsNeedAChoice) {
    write("both.pcapng", both());
    for (const std::string out : {"out.velmora", "out.dlf"}) {
        run({"convert", path("both.pcapng"), path(out)}, 1);
        EXPECT_EQ(_errors, "velmora-log: " + path("both.pcapng") +
                               ": holds Ostrel_GSM and IFX; --technology chooses one\n");
        EXPECT_FALSE(std::ifstream(path(out)).is_open());
        run({"convert", "--technology", "Ostrel_GSM", path("both.pcapng"), path(out)});
        EXPECT_EQ(run({"decode", "--technology", "Ostrel_GSM", path(out)}),
                  std::string("GSM RR Info\n  RR State      RR_IDLE\n  RR Sub State  0\n  RR Status     1\n  "
                              "RR Mode       Voice\nUMTS RR Info\nSIM Info\n"));
    }
    run({"convert", "--technology", "IFX", path("both.pcapng"), path("ifx.velmora")});
    EXPECT_EQ(run({"decode", path("ifx.velmora")}), "Band   GSM 1800\nState  idle\n");
}

TEST_F(ConvertTechnologiesTest, RecordingKeepsAll) {
    write("both.pcapng", both());
    run({"convert", path("both.pcapng"), path("copy.pcapng")});
    EXPECT_EQ(contentOf("copy.pcapng"), contentOf("both.pcapng"));
    run({"convert", "-", path("piped.pcapng")}, 0, contentOf("both.pcapng"));
    EXPECT_EQ(contentOf("piped.pcapng"), contentOf("both.pcapng"));
    run({"convert", "--to", "+1", path("both.pcapng"), path("part.pcapng")});
    PcapngFile part;
    part.section().messageInterface("Ostrel_GSM").messageInterface("IFX");
    part.message(stamp(0), rrState(4).bytes(), 0);
    part.message(stamp(500), ifxBand("GSM 900").bytes(), 1);
    EXPECT_EQ(contentOf("part.pcapng"), std::string(part.bytes().begin(), part.bytes().end()));
}

TEST_F(ConvertTechnologiesTest, ChosenOneIsAloneInTheRecording) {
    write("both.pcapng", both());
    for (const std::string technology : {"IFX", "Ostrel_GSM"}) {
        run({"convert", "--force", "--technology", technology, path("both.pcapng"), path("one.pcapng")});
        EXPECT_EQ(run({"decode", "--format", "json", path("one.pcapng")}),
                  run({"decode", "--format", "json", "--technology", technology, path("both.pcapng")}));
    }
    run({"convert", "--technology", "Ostrel_LTE", path("both.pcapng"), path("none.pcapng")}, 1);
    EXPECT_EQ(_errors, "velmora-log: " + path("both.pcapng") +
                           ": holds Ostrel_GSM and IFX, wanted one of these and not Ostrel_LTE\n");
    run({"convert", "--technology", "IFX", "-", path("none.pcapng")}, 1, contentOf("both.pcapng"));
    EXPECT_EQ(_errors, "velmora-log: standard input: holds Ostrel_GSM and IFX; --technology chooses one of a "
                       "regular file only\n");
    EXPECT_FALSE(std::ifstream(path("none.pcapng")).is_open());
}

} // namespace
} // namespace velmora
