// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/ShellCommand.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <fstream>

namespace velmora {
namespace {

using testing::HasSubstr;

/// Converts recordings that hold more than we write to recordings.
class RecordingCopyTest : public ToolTest {
protected:
    void put(const std::string& name, const Data& content) const {
        std::ofstream(path(name), std::ios::binary)
            .write(reinterpret_cast<const char*>(content.bytes().data()),
                   static_cast<std::streamsize>(content.size()));
    }
    /// Runs `velmora-log convert in.pcapng out.pcapng` and returns its messages; checks its exit status.
    std::string convert(int status, const std::vector<std::string>& more = {}) const {
        std::vector<std::string> arguments = {"convert", "--force", path("in.pcapng"), path("out.pcapng")};
        arguments.insert(arguments.end(), more.begin(), more.end());
        ToolProcess process(tool(std::move(arguments)));
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        return ownMessages(process.errors());
    }
    void expectOutput(const Data& content) const {
        const std::string out = contentOf("out.pcapng");
        EXPECT_EQ(Data(std::vector<std::uint8_t>(out.begin(), out.end())), content);
    }
};

/// A section of 28 bytes and a comment; its length is said to be 9.
constexpr const char* sectionWithLength = R"(
    0A0D0D0A 28000000 4D3C2B1A 0100 0000 0900000000000000
        0100 0300 736563 00              # comment "sec"
        0000 0000
    28000000)";
/// The same, its length left open.
constexpr const char* sectionWithoutLength = R"(
    0A0D0D0A 28000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF
        0100 0300 736563 00
        0000 0000
    28000000)";
constexpr const char* messageInterface = R"(
    01000000 40000000 9300 0000 00000000
        0300 0400 6D6F64 65              # description "mode"
        0200 0A00 4F737472656C5F47534D 0000
        0900 0100 09 000000
        5000 0400 01020304               # an option that is not known
        0000 0000
    40000000)";
constexpr const char* positionInterface = R"(
    01000000 20000000 9400 0000 00000000
        0200 0400 4E4D4541               # name "NMEA"
        0000 0000
    20000000)";
constexpr const char* message = R"(
    06000000 40000000 00000000 00000000 05000000 11000000 11000000
        01 1100 2C51 0000000000000000 05 00 01 00 000000
        0100 0200 6869 0000              # comment "hi"
        0000 0000
    40000000)";
constexpr const char* position = R"(
    06000000 24000000 01000000 00000000 06000000 04000000 04000000 24474741 24000000)";
constexpr const char* otherBlocks = R"(
    04000000 10000000 00000000 10000000                      # name resolution
    0A000000 14000000 4B534C54 00000000 14000000             # decryption secrets
    AD0B0000 14000000 01000000 DEADBEEF 14000000             # custom
    05000000 18000000 00000000 00000000 01000000 18000000    # interface statistics
    78563412 0C000000 0C000000                               # of no known type)";

TEST_F(RecordingCopyTest, InterfacesOptionsCommentsAndUnknownBlocksAreKept) {
    const Data rest = joined(hex(messageInterface), hex(positionInterface), hex(message), hex(position),
                             hex(otherBlocks), hex(message));
    put("in.pcapng", joined(hex(sectionWithLength), rest));
    EXPECT_EQ(convert(0), "");
    expectOutput(joined(hex(sectionWithoutLength), rest));
}

TEST_F(RecordingCopyTest, CustomBlocksThatMayNotBeCopiedAreLeftOut) {
    const Data head = joined(hex(sectionWithoutLength), hex(messageInterface));
    put("in.pcapng", joined(head, hex("AD0B0040 10000000 01000000 10000000"), hex(message)));
    EXPECT_EQ(convert(0), "");
    expectOutput(joined(head, hex(message)));
}

TEST_F(RecordingCopyTest, BlocksBeforeTheFirstInterfaceAreKept) {
    const Data file =
        joined(hex(sectionWithoutLength), hex(otherBlocks), hex(messageInterface), hex(message));
    put("in.pcapng", file);
    EXPECT_EQ(convert(0), "");
    expectOutput(file);
}

TEST_F(RecordingCopyTest, MuchBeforeTheFirstInterfaceIsKept) {
    // More than is read to open a file.
    const Data secrets(std::vector<std::uint8_t>(1 << 19, 0x5A));
    const Data block = joined(hex("0A000000 0C000800"), secrets, hex("0C000800"));
    const Data file =
        joined(hex(sectionWithoutLength), block, block, block, hex(messageInterface), hex(message));
    put("in.pcapng", file);
    EXPECT_EQ(convert(0), "");
    expectOutput(file);
}

TEST_F(RecordingCopyTest, LostMessagesAndDamagedBlocksAreLeftOut) {
    const Data head = joined(hex(sectionWithoutLength), hex(messageInterface));
    const Data cut = hex("06000000 24000000 00000000 00000000 01000000 01000000 00010000 AA000000 24000000");
    const Data damaged = hex("78563412 10000000 00000000 11000000");
    put("in.pcapng", joined(head, cut, damaged, hex(message)));
    EXPECT_THAT(convert(1), HasSubstr("message cut short when it was captured: 1 of 256 bytes\n"));
    expectOutput(joined(head, hex(message)));
}

TEST_F(RecordingCopyTest, ADamagedHeadIsMadeAgain) {
    // A recording without a message has the head that we write.
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    const std::string head = contentOf("empty.pcapng");
    const Data written(std::vector<std::uint8_t>(head.begin(), head.end()));
    // The interface that we write: 8 + 8 bytes, name 4 + 12, resolution 4 + 4, end 4, length 4.
    const std::size_t interface = written.size() - 48;
    put("in.pcapng", joined(hex("0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1D000000"),
                            hex(messageInterface), hex(message)));
    EXPECT_THAT(convert(1), HasSubstr("trailing block length 29, wanted 28\n"));
    expectOutput(joined(Data::copyOf(written.bytes().first(interface)), hex(messageInterface), hex(message)));
    put("in.pcapng", hex("0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1D000000"));
    EXPECT_THAT(convert(1, {"--technology", "Ostrel_GSM"}),
                HasSubstr("trailing block length 29, wanted 28\n"));
    expectOutput(written);
}

TEST_F(RecordingCopyTest, SectionsKeepTheirByteOrder) {
    const Data file = joined(hex(sectionWithoutLength), hex(messageInterface), hex(message), hex(R"(
        0A0D0D0A 0000001C 1A2B3C4D 0001 0002 FFFFFFFFFFFFFFFF 0000001C
        00000001 00000014 0093 0000 00000000 00000014
        00000006 00000024 00000000 00000000 00000002 00000001 00000001 AA000000 00000024)"));
    put("in.pcapng", file);
    EXPECT_EQ(convert(0), "");
    expectOutput(file);
}

TEST_F(RecordingCopyTest, AnotherTechnologyRenamesTheInterfacesOfTheMessages) {
    put("in.pcapng",
        joined(hex(sectionWithoutLength), hex(messageInterface), hex(positionInterface), hex(message), hex(R"(
        0A0D0D0A 0000001C 1A2B3C4D 0001 0002 FFFFFFFFFFFFFFFF 0000001C
        00000001 0000001C 0093 0000 00000000
            0009 0001 09 000000
        0000001C)")));
    EXPECT_EQ(convert(0, {"--technology", "Ostrel_LTE"}), "");
    expectOutput(joined(hex(sectionWithoutLength), hex(R"(
    01000000 40000000 9300 0000 00000000
        0200 0A00 4F737472656C5F4C5445 0000
        0300 0400 6D6F64 65
        0900 0100 09 000000
        5000 0400 01020304
        0000 0000
    40000000)"),
                        hex(positionInterface), hex(message), hex(R"(
        0A0D0D0A 0000001C 1A2B3C4D 0001 0002 FFFFFFFFFFFFFFFF 0000001C
        00000001 00000030 0093 0000 00000000
            0002 000A 4F737472656C5F4C5445 0000
            0009 0001 09 000000
            0000 0000
        00000030)")));
}

TEST_F(RecordingCopyTest, AFullDiskIsReported) {
    // Longer than what is written at a time.
    const std::vector<TimedMessage> messages(10'000, {at(0), rrState(5)});
    writeRecording("in.pcapng", "Ostrel_GSM", messages);
    ToolProcess process(tool({"-c", "ulimit -f 100; trap '' XFSZ; exec \"$0\" convert \"$1\" \"$2\"",
                              VELMORA_BUILD_DIR "/velmora-log", path("in.pcapng"), path("out.pcapng")}),
                        "/bin/sh");
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()),
              "velmora-log: cannot write " + path("out.pcapng") + ": File too large\n");
    EXPECT_EQ(contentOf("out.pcapng"), "");
}

TEST_F(RecordingCopyTest, CaptureToolsFindTheCommentsThatTheyMade) {
    NEEDS_PROGRAM("editcap");
    NEEDS_PROGRAM("tshark");
    writeRecording("plain.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(500), rrState(5)}});
    ASSERT_EQ(runShell("editcap -a '2:handover here' --capture-comment 'gate 4' " + path("plain.pcapng") +
                       " " + path("in.pcapng"))
                  .status,
              0);
    EXPECT_EQ(convert(0), "");
    const ShellOutcome shown =
        runShell("tshark -r " + path("out.pcapng") +
                 " -T fields -E separator=/s -e frame.number -e frame.interface_name -e frame.comment");
    EXPECT_EQ(shown.output, "1 Ostrel_GSM \n2 Ostrel_GSM handover here\n");
    EXPECT_THAT(runShell("capinfos -k " + path("out.pcapng")).output, HasSubstr("gate 4"));
    ToolProcess info(tool({"info", path("out.pcapng")}));
    EXPECT_EQ(info.exitStatus(), 0);
    EXPECT_THAT(info.output(), HasSubstr("comments:   2\n  section 1: gate 4\n  record 2 at offset "));
    EXPECT_THAT(info.output(), HasSubstr(": handover here\n"));
}

} // namespace
} // namespace velmora
