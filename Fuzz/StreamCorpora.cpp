// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/DriveMessages.h"
#include "Fuzz/FuzzCorpora.h"
#include "Platform/Linux/Ports/Frame.h"
#include "Recording/Pcapng/Pcapng.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/Hex.h"

#include <array>

namespace velmora {

namespace {

/// A few messages, short ones, since files and streams do not read their bytes.
std::vector<Data> someMessages() {
    constexpr std::size_t longest = 64;
    std::vector<Data> messages;
    for (const Data& message : driveMessages("gsm", std::chrono::minutes(1), 1))
        if (message.size() <= longest && messages.size() < 6)
            messages.push_back(message);
    return messages;
}

void putFrame(std::vector<std::uint8_t>& stream, const Frame& frame) {
    const FrameHeaderBytes header = encodeFrameHeader(frame);
    const Bytes payload = frame.payload.bytes();
    stream.insert(stream.end(), header.begin(), header.end());
    stream.insert(stream.end(), payload.begin(), payload.end());
}

/// What capture tools leave in a file beside our own messages: names and statistics, obsolete and simple
/// packets, other interfaces.
Data mergedFile(bool bigEndian, const std::vector<Data>& messages) {
    namespace BlockType = pcapng::BlockType;
    PcapngFile file(bigEndian);
    file.head().interface(1).messageInterface("Ostrel_LTE").messageInterface("");
    const Data zero = file.number(0, 4);
    for (std::size_t i = 0; i < messages.size(); ++i) {
        const Data length = file.number(messages[i].size(), 4);
        file.message(1'700'000'000'000'000'000 + i, messages[i].bytes(), static_cast<std::uint32_t>(i % 4));
        file.block(BlockType::Packet, joined(zero, zero, zero, length, length, messages[i]).bytes());
        file.block(BlockType::SimplePacket, joined(length, messages[i]).bytes());
    }
    file.block(BlockType::NameResolution, zero.bytes()).block(BlockType::InterfaceStatistics, zero.bytes());
    file.section().interface(pcapng::logMessageLinkType,
                             file.option(pcapng::Option::TimeResolution, hex("86").bytes()).bytes());
    return file.message(7, messages.front().bytes()).data();
}

} // namespace

FuzzCorpus frameCorpus() {
    FuzzCorpus corpus;
    const std::vector<Data> messages = someMessages();
    std::vector<std::uint8_t> all;
    std::uint32_t serial = 0;
    for (const FrameKind kind : {FrameKind::OneWay, FrameKind::Request, FrameKind::Reply}) {
        for (const Data& message : messages) {
            std::vector<std::uint8_t> one;
            putFrame(one, {kind, true, -1, ++serial, message});
            corpus.seeds.push_back(withFirstByte(3, one));
            all.insert(all.end(), one.begin(), one.end());
        }
    }
    putFrame(all, {FrameKind::Reply, false, 0, 7, {}});
    for (const std::uint8_t piece : std::initializer_list<std::uint8_t>{0, 15, 255})
        corpus.seeds.push_back(withFirstByte(piece, all));
    for (const std::uint8_t flags : std::initializer_list<std::uint8_t>{1, 2, 4, 10})
        corpus.tokens.push_back(withFirstByte(flags, std::array<std::uint8_t, 3>{}));
    return corpus;
}

FuzzCorpus recordingCorpus() {
    FuzzCorpus corpus;
    const std::vector<Data> messages = someMessages();
    for (const bool bigEndian : {false, true}) {
        PcapngFile file(bigEndian);
        corpus.seeds.push_back(withFirstByte(0, file.head().data().bytes()));
        std::uint64_t stamp = 1'700'000'000'000'000'000;
        for (const Data& message : messages)
            file.message(++stamp, message.bytes());
        corpus.seeds.push_back(withFirstByte(1, file.data().bytes()));
        corpus.seeds.push_back(withFirstByte(2, mergedFile(bigEndian, messages).bytes()));
        for (const std::uint32_t type : {0x0A0D0D0Au, 1u, 2u, 3u, 4u, 5u, 6u, 0x1A2B3C4Du})
            corpus.tokens.push_back(file.number(type, 4));
    }
    return corpus;
}

FuzzCorpus sourceStringCorpus() {
    constexpr std::string_view seeds[] = {
        "scenario:gsm",
        "scenario:lte,seed=18446744073709551615,speed=0.25",
        "scenario:utran,speed=1e3,seed=7",
        "scenario:c2k,seed=1",
        "scenario:ifx",
        "scenario:modem,seed=2",
        "replay:drive.pcapng",
        "replay:a,b,loop,speed=4",
        "replay:/tmp/x.dlf,speed=max,loop",
        "replay:x,loop,loop",
        "replay:x.velmora,technology=Ostrel_LTE",
        "modemmanager",
        "modemmanager,modem=4294967295",
        "modemmanager,modem=/sys/devices/x,sim=8900101000000000017",
    };
    constexpr std::string_view words[] = {"scenario:", "replay:", "gsm",    "lte",     "utran",
                                          "c2k",       "ifx",     ",seed=", ",speed=", ",loop",
                                          "max",       "1e-300",  "inf",    "nan",     "-"};
    return {textDatas(seeds), textDatas(words)};
}

} // namespace velmora
