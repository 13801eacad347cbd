// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"
#include "Recording/DLF/DLFReader.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/RecordingCopy.h"
#include "Recording/Snapshots/SnapshotReader.h"
#include "Tests/Recording/PcapngFile.h"

#include <algorithm>
#include <type_traits>

namespace velmora {

namespace {

/// What was read of a file.
struct Contents {
    std::string failure;
    std::string technology;
    std::vector<LoggedMessage> messages;
    std::vector<Loss> losses;
    MessageReader::LossTotals totals;
};

bool same(const Contents& a, const Contents& b) {
    const auto sameMessage = [](const LoggedMessage& one, const LoggedMessage& other) {
        return one.time == other.time && one.number == other.number && one.offset == other.offset &&
               one.refresh == other.refresh && one.message == other.message;
    };
    const auto sameLoss = [](const Loss& one, const Loss& other) {
        return one.offset == other.offset && one.bytes == other.bytes &&
               one.isTruncation == other.isTruncation && one.recordNumber == other.recordNumber &&
               one.reason == other.reason;
    };
    return a.failure == b.failure && a.technology == b.technology && a.totals.losses == b.totals.losses &&
           a.totals.bytes == b.totals.bytes &&
           std::equal(a.messages.begin(), a.messages.end(), b.messages.begin(), b.messages.end(),
                      sameMessage) &&
           std::equal(a.losses.begin(), a.losses.end(), b.losses.begin(), b.losses.end(), sameLoss);
}

/// A file in memory.
class MemoryFile final : public OutputFile {
public:
    explicit MemoryFile(std::vector<std::uint8_t>& bytes) : _bytes(bytes) {}
    Written write(Bytes bytes) override {
        _bytes.insert(_bytes.end(), bytes.begin(), bytes.end());
        return {bytes.size(), 0};
    }
    [[nodiscard]] bool isRegular() const override { return false; }
    int truncateTo(std::uint64_t) override { return 0; }
    void startSync() override {}
    std::optional<int> takeSyncResult() override { return std::nullopt; }
    int sync() override { return 0; }
    int close() override { return 0; }

private:
    std::vector<std::uint8_t>& _bytes;
};

/// The input's first byte sets the size of the source's reads from the rest, which is a file of the reader's
/// form. `hasOffsets`: offsets are positions in the file, and messages its bytes.
template <class Reader>
class FileTarget final : public FuzzTarget {
public:
    explicit FileTarget(bool hasOffsets) : _hasOffsets(hasOffsets) {}

    void run(Bytes input) override {
        if (input.empty())
            return;
        const Data file = Data::copyOf(input.subspan(1));
        const Contents whole = read(file, SIZE_MAX);
        require(same(whole, read(file, std::size_t{1} + 16 * std::size_t{input.front()})),
                "what is read does not depend on how the file comes");
        expectOrder(whole);
        if (_hasOffsets)
            expectInside(whole, file.bytes());
        if constexpr (std::is_same_v<Reader, PcapngReader>)
            if (whole.failure.empty())
                expectSameInCopy(whole, file);
    }

private:
    static Contents read(const Data& file, std::size_t piece) {
        // Chunks as small as they come, so that messages lie across their ends.
        const auto reader = Reader::open(ChunkedInput(std::make_unique<MemorySource>(file, piece), 1));
        Contents contents;
        if (!reader) {
            contents.failure = reader.reason();
            require(!contents.failure.empty(), "a file that is refused has a reason");
            return contents;
        }
        while (std::optional<LoggedMessage> message = (*reader)->next())
            contents.messages.push_back(*std::move(message));
        require(!(*reader)->next(), "the end stays the end");
        require(!(*reader)->failure(), "nothing but the source fails to read");
        contents.technology = (*reader)->technology();
        contents.losses = (*reader)->losses();
        contents.totals = (*reader)->lossTotals();
        return contents;
    }

    /// A copy of the recording has the same messages, at other offsets.
    static void expectSameInCopy(const Contents& whole, const Data& file) {
        const auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file)));
        std::vector<std::uint8_t> bytes;
        RecordingCopy copy(**reader, std::make_unique<MemoryFile>(bytes), "the copy", {});
        while ((*reader)->next())
            require(bool(copy.addMessage()), "memory can be written");
        require(bool(copy.finish()), "memory can be written");
        Contents copied = read(Data(std::move(bytes)), SIZE_MAX);
        require(copied.failure.empty() && copied.technology == whole.technology &&
                    copied.messages.size() == whole.messages.size(),
                "a copy has the messages of its recording");
        for (std::size_t i = 0; i < whole.messages.size(); ++i)
            require(copied.messages[i].time == whole.messages[i].time &&
                        copied.messages[i].message == whole.messages[i].message,
                    "a copied message is the same");
    }

    static void expectOrder(const Contents& contents) {
        std::uint64_t number = 0;
        for (const LoggedMessage& message : contents.messages) {
            require(message.number > number, "messages have ascending numbers");
            number = message.number;
        }
        require(contents.losses.size() <= MessageReader::maximumLosses &&
                    contents.losses.size() <= contents.totals.losses,
                "the totals count all losses");
        for (const Loss& loss : contents.losses)
            require(!loss.reason.empty(), "a loss has a reason");
    }

    static void expectInside(const Contents& contents, Bytes file) {
        std::uint64_t end = 0;
        std::uint64_t bytes = contents.totals.bytes;
        for (const LoggedMessage& message : contents.messages) {
            require(message.offset >= end && message.offset <= file.size(),
                    "messages come in the file's order");
            const Bytes content = contentIn(message.message.bytes(), file.subspan(message.offset));
            end = message.offset + content.size();
            bytes += content.size();
        }
        require(bytes <= file.size(), "messages and losses share the file");
        for (const Loss& loss : contents.losses)
            require(loss.offset <= file.size() && loss.bytes <= file.size() - loss.offset,
                    "a loss lies in its file");
    }

    /// The message as it is at its offset, or after it. A record of a DLF log gets back the byte that it was
    /// written without.
    static Bytes contentIn(Bytes message, Bytes place) {
        const auto begins = [place](Bytes content) {
            return content.size() <= place.size() &&
                   std::equal(content.begin(), content.end(), place.begin());
        };
        if (std::is_same_v<Reader, DLFReader>) {
            require(!message.empty() && (begins(message) || begins(message.subspan(1))),
                    "a message is what the log holds");
            return begins(message.subspan(1)) ? message.subspan(1) : message;
        }
        require(std::search(place.begin(), place.end(), message.begin(), message.end()) != place.end() ||
                    message.empty(),
                "a message is what the file holds");
        return message;
    }

    bool _hasOffsets;
};

} // namespace

std::unique_ptr<FuzzTarget> makeRecordingTarget() {
    return std::make_unique<FileTarget<PcapngReader>>(true);
}

std::unique_ptr<FuzzTarget> makeDLFTarget() {
    return std::make_unique<FileTarget<DLFReader>>(true);
}

std::unique_ptr<FuzzTarget> makeSnapshotTarget() {
    return std::make_unique<FileTarget<SnapshotReader>>(false);
}

} // namespace velmora
