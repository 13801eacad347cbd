// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/SeveralTechnologies.h"

// A path that no display can have is wrong usage.

namespace velmora {
namespace {

class ImpossiblePathTest : public SeveralTechnologiesTest {
protected:
    /// What is reported where `--select` with that path is refused, and nothing is written.
    std::string refusal(const std::string& select, std::vector<std::string> arguments,
                        std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), {"decode", "--select", select});
        EXPECT_EQ(run(arguments, 2, std::move(input)), "");
        return _errors;
    }
};

TEST_F(ImpossiblePathTest, NamesTheNearest) {
    writeRecording("gsm.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    const std::string expected =
        "velmora-log: --select: no display of Ostrel_GSM has \"/GSM RR Info/RR Stat\"; the nearest paths are "
        "\"/GSM RR Info/RR State\", \"/GSM RR Info/RR Status\", \"/GSM RR Info/RR Mode\"\n";
    const std::string path = "/GSM RR Info/RR Stat";
    EXPECT_EQ(refusal(path, {this->path("gsm.pcapng")}), expected);
    EXPECT_EQ(refusal("name=" + path, {this->path("gsm.pcapng")}), expected);
    EXPECT_EQ(refusal(path, {"--format", "json", this->path("gsm.pcapng")}), expected);
    EXPECT_EQ(refusal(path, {"--samples", "--format", "jsonl", this->path("gsm.pcapng")}), expected);
    EXPECT_EQ(refusal(path, {"--format", "csv", this->path("gsm.pcapng")}), expected);
    EXPECT_EQ(refusal(path, {"--samples", "--wide", "--format", "csv", this->path("gsm.pcapng")}), expected);
    // The technology is known from the first message on.
    EXPECT_EQ(refusal(path, {"--format", "jsonl", "-"}, contentOf("gsm.pcapng")), expected);
    // One that is possible does not excuse it.
    EXPECT_EQ(refusal(path, {"--select", "/GSM RR Info", this->path("gsm.pcapng")}), expected);
}

TEST_F(ImpossiblePathTest, APathOfOneOfTheTechnologiesIsPossible) {
    writeRecording("gsm.pcapng", "Ostrel_GSM", {{at(0), rrState(5)}});
    write("both.pcapng", both());
    EXPECT_EQ(run({"decode", "--select", "/Band", path("both.pcapng"), path("gsm.pcapng")}),
              "== " + path("both.pcapng") + ": Ostrel_GSM ==\n\n== " + path("both.pcapng") +
                  ": IFX ==\nBand  GSM 1800\n\n== " + path("gsm.pcapng") + " ==\n");
    // An IFX tree may have any.
    EXPECT_EQ(run({"decode", "--select", "/No/Such", path("both.pcapng"), "--technology", "IFX"}), "");
    EXPECT_NE(refusal("/Band", {path("both.pcapng"), "--technology", "Ostrel_GSM"}), "");
}

} // namespace
} // namespace velmora
