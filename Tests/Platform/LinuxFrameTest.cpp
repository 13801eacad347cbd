// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/FrameQueue.h"
#include "Platform/Linux/Ports/FrameReader.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <sys/socket.h>

#include <string>

namespace velmora {

namespace {

using testing::ElementsAreArray;

Data bytesOf(const FrameHeaderBytes& header) {
    return Data::copyOf(header);
}

/// A request "hi" and a one-way message of no bytes with a negative id, as they follow each other in a
/// stream.
Data twoFrames() {
    return hex("02 00 00 00  // length\n"
               "05 00 00 00  // message id\n"
               "01 00 00 00  // request\n"
               "07 01 00 00  // serial\n"
               "68 69        // \"hi\"\n"
               "00 00 00 00  // length\n"
               "FE FF FF FF  // message id -2\n"
               "04 00 00 00  // one-way\n"
               "00 00 00 00  // serial\n");
}

void expectTwoFrames(const std::vector<Frame>& frames) {
    ASSERT_EQ(frames.size(), 2U);
    EXPECT_EQ(frames[0].kind, FrameKind::Request);
    EXPECT_TRUE(frames[0].hasData);
    EXPECT_EQ(frames[0].messageId, 5);
    EXPECT_EQ(frames[0].serial, 0x107U);
    EXPECT_EQ(frames[0].payload, hex("68 69"));
    EXPECT_EQ(frames[1].kind, FrameKind::OneWay);
    EXPECT_EQ(frames[1].messageId, -2);
    EXPECT_EQ(frames[1].serial, 0U);
    EXPECT_TRUE(frames[1].payload.empty());
}

/// Takes every frame that is there.
void takeAll(FrameReader& reader, std::vector<Frame>& frames) {
    for (;;) {
        auto next = reader.next();
        ASSERT_TRUE(next) << next.reason();
        if (!*next)
            return;
        frames.push_back(**next);
    }
}

TEST(LinuxFrame, HeadersAreLittleEndian) {
    const Frame request{FrameKind::Request, true, -3, 0x01020304,
                        Data::copyOf(std::vector<std::uint8_t>(258))};
    EXPECT_EQ(bytesOf(encodeFrameHeader(request)), hex("02 01 00 00  // length 258\n"
                                                       "FD FF FF FF  // message id\n"
                                                       "01 00 00 00  // flags\n"
                                                       "04 03 02 01  // serial\n"));
    const Frame empty{FrameKind::Reply, false, 1, 9, Data()};
    EXPECT_EQ(bytesOf(encodeFrameHeader(empty)), hex("00 00 00 00  01 00 00 00  0A 00 00 00  09 00 00 00"));
}

TEST(LinuxFrame, EverySplitOfAStreamGivesItsFrames) {
    const Data stream = twoFrames();
    for (std::size_t first = 0; first <= stream.size(); ++first)
        for (std::size_t second = first; second <= stream.size(); ++second) {
            SCOPED_TRACE(std::to_string(first) + ", " + std::to_string(second));
            FrameReader reader;
            std::vector<Frame> frames;
            for (const Bytes part :
                 {stream.bytes().first(first), stream.bytes().subspan(first, second - first),
                  stream.bytes().subspan(second)}) {
                reader.append(part);
                takeAll(reader, frames);
            }
            expectTwoFrames(frames);
        }
}

TEST(LinuxFrame, BytesOneByOneGiveTheirFrames) {
    FrameReader reader;
    std::vector<Frame> frames;
    const Data stream = twoFrames();
    for (std::size_t i = 0; i < stream.size(); ++i) {
        EXPECT_EQ(frames.size(), i < 18 ? 0U : 1U) << i;
        reader.append(stream.bytes().subspan(i, 1));
        takeAll(reader, frames);
    }
    expectTwoFrames(frames);
}

TEST(LinuxFrame, TheLongestFrameArrivesCompletely) {
    Frame frame;
    std::vector<std::uint8_t> payload(maximumFramePayload);
    payload.front() = 1;
    payload.back() = 2;
    frame.payload = Data(std::move(payload));
    FrameReader reader;
    reader.append(encodeFrameHeader(frame));
    reader.append(frame.payload.bytes());
    auto next = reader.next();
    ASSERT_TRUE(next && *next);
    EXPECT_TRUE((*next)->payload == frame.payload);
}

TEST(LinuxFrame, MemoryFollowsWhatArrivedNotWhatWasAnnounced) {
    FrameReader reader;
    reader.append(hex("00 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00").bytes()); // 16 MiB to come
    const std::vector<std::uint8_t> mebibyte(std::size_t{1} << 20);
    for (std::size_t arrived = 0; arrived < 16; ++arrived) {
        const auto next = reader.next();
        ASSERT_TRUE(next);
        EXPECT_FALSE(*next);
        EXPECT_LE(reader.memory(), 16 + 2 * (arrived << 20));
        reader.append(mebibyte);
    }
    auto next = reader.next();
    ASSERT_TRUE(next && *next);
    EXPECT_EQ((*next)->payload.size(), std::size_t{16} << 20);
    reader.append(hex("01").bytes());
    EXPECT_LE(reader.memory(), std::size_t{1} << 10); // what the long frame took has been given back
}

TEST(LinuxFrame, HeadersThatCannotBeSayWhy) {
    struct {
        const char* name;
        const char* header;
        const char* reason;
    } const cases[] = {
        {"one byte too long", "01 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00",
         "a frame of 16777217 bytes, wanted at most 16777216"},
        {"as long as can be", "FF FF FF FF  00 00 00 00  01 00 00 00  00 00 00 00",
         "a frame of 4294967295 bytes, wanted at most 16777216"},
        {"no kind", "00 00 00 00  00 00 00 00  00 00 00 00  00 00 00 00",
         "frame flags 0x00000000, wanted 1, 2, 4 or 0xA"},
        {"request and reply", "00 00 00 00  00 00 00 00  03 00 00 00  00 00 00 00",
         "frame flags 0x00000003, wanted 1, 2, 4 or 0xA"},
        {"all three", "00 00 00 00  00 00 00 00  07 00 00 00  00 00 00 00",
         "frame flags 0x00000007, wanted 1, 2, 4 or 0xA"},
        {"request without data", "00 00 00 00  00 00 00 00  09 00 00 00  00 00 00 00",
         "frame flags 0x00000009, wanted 1, 2, 4 or 0xA"},
        {"unknown bit", "00 00 00 00  00 00 00 00  14 00 00 00  00 00 00 00",
         "frame flags 0x00000014, wanted 1, 2, 4 or 0xA"},
        {"highest bit", "00 00 00 00  00 00 00 00  01 00 00 80  00 00 00 00",
         "frame flags 0x80000001, wanted 1, 2, 4 or 0xA"},
        {"no data, but some", "05 00 00 00  00 00 00 00  0A 00 00 00  00 00 00 00",
         "a reply without data of 5 bytes, wanted 0"},
    };
    for (const auto& row : cases) {
        SCOPED_TRACE(row.name);
        FrameReader reader;
        reader.append(hex(row.header).bytes());
        for (int again = 0; again < 2; ++again) {
            const auto next = reader.next();
            ASSERT_FALSE(next);
            EXPECT_EQ(next.reason(), row.reason);
        }
    }
}

Frame frameOf(std::int32_t id, std::size_t size) {
    return {FrameKind::OneWay, true, id, 0, Data(std::vector<std::uint8_t>(size))};
}

class LinuxFrameQueue : public testing::Test {
protected:
    LinuxFrameQueue() {
        int ends[2];
        EXPECT_EQ(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, ends), 0);
        _near = FileDescriptor(ends[0]);
        _far = FileDescriptor(ends[1]);
    }

    /// The ids of the frames that have arrived at the other end.
    std::vector<std::int32_t> arrived() {
        std::vector<std::int32_t> ids;
        while (_reader.readFrom(_far.get()).outcome == FrameReader::Outcome::Some) {
            std::vector<Frame> frames;
            takeAll(_reader, frames);
            for (const Frame& frame : frames)
                ids.push_back(frame.messageId);
        }
        return ids;
    }

    FileDescriptor _near;
    FileDescriptor _far;
    FrameReader _reader;
};

TEST_F(LinuxFrameQueue, TooManyMessagesPushOutTheOldest) {
    FrameQueue queue({3, 1'000'000});
    for (std::int32_t id = 1; id <= 3; ++id)
        EXPECT_EQ(queue.push(frameOf(id, 10)), 0U);
    EXPECT_EQ(queue.push(frameOf(4, 10)), 1U);
    EXPECT_EQ(queue.push(frameOf(5, 10)), 1U);
    EXPECT_EQ(queue.size(), 3U);
    EXPECT_EQ(queue.flush(_near.get()), FrameQueue::Flushed::All);
    EXPECT_THAT(arrived(), testing::ElementsAre(3, 4, 5));
    EXPECT_EQ(queue.bytes(), 0U);
}

TEST_F(LinuxFrameQueue, TooManyBytesPushOutAsManyAsNeeded) {
    FrameQueue queue({100, 300}); // headers of 16 bytes included
    EXPECT_EQ(queue.push(frameOf(1, 84)), 0U);
    EXPECT_EQ(queue.push(frameOf(2, 84)), 0U);
    EXPECT_EQ(queue.push(frameOf(3, 84)), 0U);
    EXPECT_EQ(queue.bytes(), 300U);
    EXPECT_EQ(queue.push(frameOf(4, 85)), 2U);
    EXPECT_EQ(queue.bytes(), 201U);
    EXPECT_EQ(queue.push(frameOf(5, 285)), 3U); // which does not fit at all
    EXPECT_TRUE(queue.empty());
}

TEST_F(LinuxFrameQueue, APartlyWrittenFrameIsNeverDropped) {
    FrameQueue queue({2, 8'000'000});
    EXPECT_EQ(queue.push(frameOf(1, 3'000'000)), 0U);
    while (queue.flush(_near.get()) != FrameQueue::Flushed::WouldBlock) {
    }
    EXPECT_EQ(queue.push(frameOf(2, 10)), 0U);
    EXPECT_EQ(queue.push(frameOf(3, 10)), 1U); // 2 goes
    EXPECT_EQ(queue.push(frameOf(4, 10)), 1U); // 3 goes
    EXPECT_TRUE(queue.removeNewest());
    EXPECT_FALSE(queue.removeNewest()); // 1 is on its way
    EXPECT_EQ(queue.push(frameOf(5, 10)), 0U);
    std::vector<std::int32_t> ids;
    while (!queue.empty()) {
        (void)queue.flush(_near.get());
        const auto some = arrived();
        ids.insert(ids.end(), some.begin(), some.end());
    }
    EXPECT_THAT(ids, testing::ElementsAre(1, 5));
}

TEST_F(LinuxFrameQueue, ManyFramesKeepTheirOrder) {
    FrameQueue queue;
    std::vector<std::int32_t> sent;
    for (std::int32_t id = 0; id < 1000; ++id) {
        EXPECT_EQ(queue.push(frameOf(id, static_cast<std::size_t>(id % 7) * 100)), 0U);
        sent.push_back(id);
    }
    std::vector<std::int32_t> ids;
    while (!queue.empty()) {
        (void)queue.flush(_near.get());
        const auto some = arrived();
        ids.insert(ids.end(), some.begin(), some.end());
    }
    EXPECT_THAT(ids, ElementsAreArray(sent));
}

TEST_F(LinuxFrameQueue, AnEndedConnectionIsBroken) {
    FrameQueue queue;
    EXPECT_EQ(queue.push(frameOf(1, 10)), 0U);
    _far.reset();
    EXPECT_EQ(queue.flush(_near.get()), FrameQueue::Flushed::Broken);
}

} // namespace

} // namespace velmora
