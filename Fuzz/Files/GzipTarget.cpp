// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/FuzzCorpora.h"
#include "Fuzz/FuzzTargets.h"
#include "Recording/Files/GzipSource.h"
#include "Tests/Recording/PcapngFile.h"

#include <zlib.h>

namespace velmora {

namespace {

/// More is not unpacked: a few bytes may stand for megabytes.
constexpr std::size_t maximumUnpacked = std::size_t{64} << 10;

struct Unpacked {
    std::vector<std::uint8_t> bytes;
    std::string failure; ///< empty where the end has been reached

    friend bool operator==(const Unpacked&, const Unpacked&) = default;
};

/// Unpacks in steps of `room` bytes what comes in pieces.
Unpacked unpack(const Data& file, std::size_t piece, std::size_t room) {
    GzipSource source(ChunkedInput(std::make_unique<MemorySource>(file, piece), 1));
    Unpacked unpacked;
    std::vector<std::uint8_t> buffer(room);
    while (unpacked.bytes.size() < maximumUnpacked) {
        const Result<std::size_t> count = source.read(buffer);
        if (!count) {
            unpacked.failure = count.reason();
            require(!unpacked.failure.empty(), "data that is refused has a reason");
            // Where damage is noticed depends on the sizes.
            if (const std::size_t place = unpacked.failure.find("near byte "); place != std::string::npos)
                unpacked.failure.resize(place);
            break;
        }
        require(*count <= room, "no more is unpacked than there is room for");
        if (*count == 0)
            break;
        unpacked.bytes.insert(unpacked.bytes.end(), buffer.begin(),
                              buffer.begin() + static_cast<std::ptrdiff_t>(*count));
    }
    if (unpacked.bytes.size() >= maximumUnpacked) {
        unpacked.bytes.resize(maximumUnpacked);
        unpacked.failure.clear();
    }
    return unpacked;
}

Data pack(Bytes bytes, int level) {
    z_stream stream = {};
    require(::deflateInit2(&stream, level, Z_DEFLATED, 15 + 16, 8, Z_DEFAULT_STRATEGY) == Z_OK,
            "zlib is there");
    std::vector<std::uint8_t> packed(::deflateBound(&stream, static_cast<uLong>(bytes.size())));
    stream.next_in = const_cast<Bytef*>(bytes.data()); // NOLINT: it is only read
    stream.avail_in = static_cast<uInt>(bytes.size());
    stream.next_out = packed.data();
    stream.avail_out = static_cast<uInt>(packed.size());
    require(::deflate(&stream, Z_FINISH) == Z_STREAM_END, "zlib packs");
    packed.resize(packed.size() - stream.avail_out);
    ::deflateEnd(&stream);
    return Data(std::move(packed));
}

/// The input's first byte sets the sizes in which the rest comes and is unpacked.
class GzipTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        if (input.empty())
            return;
        const std::size_t piece = std::size_t{1} + 16 * std::size_t{input.front()};
        const Bytes rest = input.subspan(1);
        const Data file = Data::copyOf(rest);
        require(unpack(file, SIZE_MAX, 4096) == unpack(file, piece, piece),
                "what is unpacked does not depend on how the file comes");
        const Unpacked again = unpack(pack(rest, input.front() % 10), piece, 4096);
        require(again.failure.empty() && again.bytes == std::vector(rest.begin(), rest.end()),
                "what zlib packs is unpacked");
    }
};

} // namespace

std::unique_ptr<FuzzTarget> makeGzipTarget() {
    return std::make_unique<GzipTarget>();
}

FuzzCorpus gzipCorpus() {
    FuzzCorpus corpus;
    const Data text = textData("no message, no message, no message and so on");
    for (const int level : {0, 1, 9}) {
        const Data packed = pack(text.bytes(), level);
        corpus.seeds.push_back(withFirstByte(static_cast<std::uint8_t>(level), packed.bytes()));
        corpus.seeds.push_back(withFirstByte(7, joined(packed, packed).bytes()));
    }
    corpus.seeds.push_back(withFirstByte(1, pack({}, 1).bytes()));
    // A header with all of its parts: extra bytes, a name, a comment and a check.
    corpus.seeds.push_back(withFirstByte(1, hex(R"(1F 8B 08 1E 00000000 00 03
        0200 4142  6100  6200  0000  0300 00000000 00000000)")
                                                .bytes()));
    corpus.tokens.push_back(hex("1F 8B 08"));
    corpus.tokens.push_back(hex("1F 8B 08 00 00000000 02 03"));
    corpus.tokens.push_back(hex("0300 00000000 00000000"));
    return corpus;
}

} // namespace velmora
