// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngWriter.h"

#include "Recording/MessageReader.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <chrono>
#include <csignal>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <vector>

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {
namespace {

Time at(std::int64_t nanoseconds) {
    return Time(std::chrono::nanoseconds(nanoseconds));
}

class PcapngWriterFiles : public testing::Test {
protected:
    [[nodiscard]] std::string content() const {
        std::ifstream file(_path, std::ios::binary);
        const std::vector<std::uint8_t> bytes((std::istreambuf_iterator<char>(file)), {});
        return hexText(bytes);
    }
    [[nodiscard]] std::unique_ptr<PcapngWriter> create(std::string_view technology = "Ostrel_GSM") const {
        auto writer = PcapngWriter::create(_path, technology);
        EXPECT_TRUE(writer) << writer.reason();
        return *std::move(writer);
    }

    TemporaryDirectory _directory;
    std::string _path = _directory / "recording.pcapng";
};

/// The section header of a writer whose "Velmora VERSION" has 13 bytes.
const std::string sectionHex = R"(
    0A0D0D0A            # section header
    34000000            # 52 bytes
    4D3C2B1A            # little-endian
    0100 0000           # version 1.0
    FFFFFFFFFFFFFFFF    # of any length
    0400 0D00           # shb_userappl, 13 bytes
    56656C6D6F7261 20 )";
const std::string sectionEndHex = R"(
    000000              # padding
    0000 0000           # end of options
    34000000)";
const std::string interfaceHex = R"(
    01000000            # interface description
    30000000            # 48 bytes
    9300 0000           # link type 147
    00000000            # no snapshot length
    0200 0A00           # if_name, 10 bytes
    4F737472656C5F47534D 0000
    0900 0100           # if_tsresol
    09 000000           # nanoseconds
    0000 0000           # end of options
    30000000)";

/// The complete head, whatever the version's digits.
std::string headHex() {
    const std::string version = VELMORA_TEST_VERSION;
    EXPECT_EQ(version.size(), 5U) << "the lengths in the expected section header are for five characters";
    return sectionHex +
           hexText(Bytes(reinterpret_cast<const std::uint8_t*>(version.data()), version.size())) +
           sectionEndHex + interfaceHex;
}

TEST_F(PcapngWriterFiles, holdTheBytesOfTheFormat) {
    const auto writer = create();
    // 2026-11-16 05:00:00.000000001 is 1794805200000000001 ns, 0x18E86DD1F3062001.
    ASSERT_TRUE(
        writer->append(at(1'794'805'200'000'000'001), hex("01 0D00 E0D0 0000000000000000 AA").bytes()));
    ASSERT_TRUE(writer->append(at(5), {}));
    EXPECT_EQ(writer->messages(), 2U);
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(content(), hexText(hex(headHex() + R"(
        06000000            # enhanced packet
        30000000            # 48 bytes
        00000000            # interface 0
        D16DE818               # time stamp, upper half
        012006F3            # lower half
        0E000000            # 14 bytes in the block
        0E000000            # 14 bytes in all
        01 0D00 E0D0 0000000000000000 AA
        0000                # padding
        30000000
        06000000
        20000000            # 32 bytes
        00000000
        00000000
        05000000
        00000000            # an empty message
        00000000
        20000000)")
                                     .bytes()));
}

TEST_F(PcapngWriterFiles, haveTheirHeadAtOnce) {
    const auto writer = create();
    EXPECT_EQ(content(), hexText(hex(headHex()).bytes()));
}

TEST_F(PcapngWriterFiles, nameATechnologyByItsShortName) {
    ASSERT_TRUE(create("kVoxLogChannelTechnology_Ostrel_GSM")->close());
    EXPECT_EQ(content(), hexText(hex(headHex()).bytes()));
}

TEST_F(PcapngWriterFiles, areEmptiedFirst) {
    std::ofstream(_path) << std::string(1000, 'x');
    ASSERT_TRUE(create()->close());
    EXPECT_EQ(content(), hexText(hex(headHex()).bytes()));
}

TEST_F(PcapngWriterFiles, getEveryMessageByTheEndOfTheWriter) {
    ASSERT_TRUE(create()->append(at(1), hex("AA").bytes()));
    EXPECT_EQ(content().size(), 2 * (100U + 36U));
}

TEST_F(PcapngWriterFiles, growByCompleteBlocks) {
    const auto writer = create();
    const std::vector<std::uint8_t> message(1000, 0x11);
    std::uintmax_t sizes = 0;
    for (int i = 0; i < 1000; ++i) {
        ASSERT_TRUE(writer->append(at(i), message));
        struct stat status {};
        ASSERT_EQ(::stat(_path.c_str(), &status), 0);
        ASSERT_EQ((status.st_size - 100) % 1032, 0) << i;
        sizes = static_cast<std::uintmax_t>(status.st_size);
    }
    // Not all is held back until the end.
    EXPECT_GT(sizes, 900'000U);
}

TEST_F(PcapngWriterFiles, takeAMomentBefore1970ForItsBegin) {
    const auto writer = create();
    ASSERT_TRUE(writer->append(at(-1), hex("AA").bytes()));
    ASSERT_TRUE(writer->close());
    const auto reader = PcapngReader::open(_path);
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->next()->time, at(0));
}

TEST_F(PcapngWriterFiles, takeMessagesUpTo16MiB) {
    const auto writer = create();
    std::vector<std::uint8_t> longest(16'777'216);
    for (std::size_t i = 0; i < longest.size(); ++i)
        longest[i] = static_cast<std::uint8_t>(i * 7);
    ASSERT_TRUE(writer->append(at(1), hex("AA").bytes()));
    ASSERT_TRUE(writer->append(at(2), longest));
    const std::vector<std::uint8_t> tooLong(16'777'217);
    const auto refused = writer->append(at(3), tooLong);
    ASSERT_FALSE(refused);
    EXPECT_EQ(refused.reason(), "message of 16777217 bytes, wanted at most 16777216");
    ASSERT_TRUE(writer->append(at(4), hex("BB").bytes()));
    EXPECT_EQ(writer->messages(), 3U);
    ASSERT_TRUE(writer->close());

    const auto reader = PcapngReader::open(_path);
    ASSERT_TRUE(reader);
    EXPECT_EQ(hexText((*reader)->next()->message.bytes()), "AA");
    EXPECT_TRUE((*reader)->next()->message == Data::copyOf(longest));
    EXPECT_EQ(hexText((*reader)->next()->message.bytes()), "BB");
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
}

TEST_F(PcapngWriterFiles, giveRandomMessagesBack) {
    std::mt19937 random(20'261'116);
    std::vector<LoggedMessage> written;
    const auto writer = create("Ostrel_UTRAN2");
    for (int i = 0; i < 20'000; ++i) {
        std::vector<std::uint8_t> message(random() % (i % 1000 == 0 ? 300'000 : 300));
        for (std::uint8_t& byte : message)
            byte = static_cast<std::uint8_t>(random());
        const Time time = at(static_cast<std::int64_t>(std::uint64_t{random()} << 31 | random() >> 1));
        ASSERT_TRUE(writer->append(time, message));
        written.push_back({time, Data(std::move(message)), 0, 0});
    }
    ASSERT_TRUE(writer->close());
    const auto reader = PcapngReader::open(_path);
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->technology(), "Ostrel_UTRAN2");
    std::uint64_t number = 0;
    for (const LoggedMessage& expected : written) {
        const auto message = (*reader)->next();
        ASSERT_TRUE(message) << number;
        ASSERT_EQ(message->number, ++number);
        ASSERT_EQ(message->time, expected.time) << number;
        ASSERT_TRUE(message->message == expected.message) << number;
    }
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
}

TEST(PcapngWriter, reportsAnUncreatableFile) {
    const auto writer = PcapngWriter::create("/nonexistent/recording.pcapng", "Ostrel_GSM");
    ASSERT_FALSE(writer);
    EXPECT_EQ(writer.reason(), "cannot create /nonexistent/recording.pcapng: No such file or directory");
}

TEST(PcapngWriter, reportsAFullDisk) {
    const auto writer = PcapngWriter::create("/dev/full", "Ostrel_GSM");
    ASSERT_FALSE(writer);
    EXPECT_EQ(writer.reason(), "cannot write /dev/full: No space left on device");
}

TEST(PcapngWriter, repeatsAWriteError) {
    // The disk becomes full once the header is written.
    TemporaryDirectory directory;
    const std::string path = directory / "recording";
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT, 0600);
    auto writer = PcapngWriter::adopt(descriptor, "the recording", "Ostrel_GSM");
    ASSERT_TRUE(writer);
    const int full = ::open("/dev/full", O_WRONLY);
    ASSERT_EQ(::dup2(full, descriptor), descriptor);
    ::close(full);

    const std::string reason = "cannot write the recording: No space left on device";
    ASSERT_TRUE((*writer)->append(at(1), hex("AA").bytes())) << "one message is only gathered";
    const auto flushed = (*writer)->flush();
    ASSERT_FALSE(flushed);
    EXPECT_EQ(flushed.reason(), reason);

    // There is room again, but the recording would have a gap.
    const int file = ::open(path.c_str(), O_WRONLY | O_APPEND);
    ASSERT_EQ(::dup2(file, descriptor), descriptor);
    ::close(file);
    const auto appended = (*writer)->append(at(2), hex("BB").bytes());
    ASSERT_FALSE(appended);
    EXPECT_EQ(appended.reason(), reason);
    const auto closed = (*writer)->close();
    ASSERT_FALSE(closed);
    EXPECT_EQ(closed.reason(), reason);
    struct stat status {};
    ASSERT_EQ(::stat(path.c_str(), &status), 0);
    EXPECT_EQ(status.st_size, 100);
}

TEST(PcapngWriter, reportsAWriteErrorOfALongMessage) {
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    auto* const earlier = std::signal(SIGPIPE, SIG_IGN);
    auto writer = PcapngWriter::adopt(ends[1], "pipe", "Ostrel_GSM");
    ASSERT_TRUE(writer);
    ::close(ends[0]);
    const std::vector<std::uint8_t> message(100'000);
    const auto appended = (*writer)->append(at(1), message);
    ASSERT_FALSE(appended);
    EXPECT_EQ(appended.reason(), "cannot write pipe: Broken pipe");
    writer->reset();
    std::signal(SIGPIPE, earlier);
}

TEST(PcapngWriter, refusesATechnologyNameThatIsTooLong) {
    const auto writer = PcapngWriter::create("/dev/null", std::string(256, 'x'));
    ASSERT_FALSE(writer);
    EXPECT_EQ(writer.reason(), "technology name of 256 bytes, wanted at most 255");
}

} // namespace
} // namespace velmora
