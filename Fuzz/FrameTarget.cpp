// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"
#include "Platform/Linux/Ports/FrameReader.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

/// What a reader returned for a stream.
struct Taken {
    std::vector<std::uint8_t> frames; ///< encoded again, one after another
    std::string failure;
};

/// The input's first byte sets the size of the parts in which the rest arrives.
class FrameTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        if (input.empty())
            return;
        const Bytes stream = input.subspan(1);
        const Taken whole = take(stream, stream.size() + 1);
        const Taken pieces = take(stream, std::size_t{input.front()} + 1);
        require(whole.frames == pieces.frames && whole.failure == pieces.failure,
                "frames do not depend on how the stream was cut");
        require(whole.frames.size() <= stream.size() &&
                    std::equal(whole.frames.begin(), whole.frames.end(), stream.begin()),
                "what was taken is what was sent");
    }

private:
    static Taken take(Bytes stream, std::size_t piece) {
        FrameReader reader;
        Taken taken;
        for (; !stream.empty() && taken.failure.empty();
             stream = stream.subspan(std::min(piece, stream.size()))) {
            reader.append(stream.first(std::min(piece, stream.size())));
            drain(reader, taken);
        }
        return taken;
    }

    static void drain(FrameReader& reader, Taken& taken) {
        for (;;) {
            const std::size_t before = reader.memory();
            const auto frame = reader.next();
            require(reader.memory() <= before, "taking a frame asks for no memory");
            if (!frame) {
                taken.failure = frame.reason();
                const auto again = reader.next();
                require(!again && again.reason() == taken.failure, "a stream that is lost stays lost");
                return;
            }
            if (!*frame)
                return;
            const FrameHeaderBytes header = encodeFrameHeader(**frame);
            const Bytes payload = (*frame)->payload.bytes();
            taken.frames.insert(taken.frames.end(), header.begin(), header.end());
            taken.frames.insert(taken.frames.end(), payload.begin(), payload.end());
        }
    }
};

} // namespace

std::unique_ptr<FuzzTarget> makeFrameTarget() {
    return std::make_unique<FrameTarget>();
}

} // namespace velmora
