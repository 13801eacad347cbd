// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Sealing/SealedFile.h"

#include "Export/Masking/MaskKey.h"
#include "Export/Masking/TechnologyName.h"
#include "LogMessages/DLFVersionReport.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/Files/GzipSource.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"
#include "Recording/Pcapng/PcapngReader.h"

#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

namespace velmora {

namespace {

constexpr std::string_view descriptionKey = "Description";

/// The comments of a recording that are about no message, of which there may be one section's alone: other
/// tools join recordings so that a seal is followed by messages that it is not for.
class RecordingSeal {
public:
    explicit RecordingSeal(PcapngReader& reader) {
        reader.setOtherBlocks([this](const PcapngReader::Block& block) { add(block); });
    }

    [[nodiscard]] std::optional<MaskSeal> seal() const { return _sections == 1 ? _seal : std::nullopt; }

private:
    void add(const PcapngReader::Block& block) {
        _sections += block.type == pcapng::BlockType::SectionHeader ? 1 : 0;
        constexpr std::size_t optionsOffset = pcapng::bodyOffset + 12;
        if (block.type != pcapng::BlockType::InterfaceStatistics || block.bytes.size() < optionsOffset + 4)
            return;
        OptionReader options(block.bytes.first(block.bytes.size() - 4).subspan(optionsOffset),
                             block.bigEndian);
        while (const auto option = options.next())
            if (option->code == pcapng::Option::Comment)
                _seal = MaskSeal::read(std::string_view(reinterpret_cast<const char*>(option->value.data()),
                                                        option->value.size()));
    }

    std::size_t _sections = 0;
    std::optional<MaskSeal> _seal;
};

std::optional<MaskSeal> sealOfRecording(ChunkedInput input) {
    const Result<std::unique_ptr<PcapngReader>> reader = PcapngReader::open(std::move(input));
    if (!reader)
        return std::nullopt;
    const RecordingSeal recording(**reader);
    (*reader)->setReadsAllTechnologies(true);
    MessageDigest digest;
    MessageDigest sentences;
    (*reader)->setSentences([&sentences](const PositionSentence& each) { sentences.addSentence(each.text); });
    while (const auto message = (*reader)->next())
        digest.add(technologyOf(*message, **reader), message->message.bytes());
    const std::optional<MaskSeal> seal = recording.seal();
    const bool isWhole = (*reader)->lossTotals().losses == 0 && !(*reader)->failure();
    const bool hasSentences = seal && (seal->positions.empty() || seal->positions == sentences.text());
    return isWhole && hasSentences && seal->digest == digest.text() ? seal : std::nullopt;
}

std::optional<MaskSeal> sealOfSnapshot(ChunkedInput input) {
    constexpr PropertyListLimits limits{.maximumObjects = 2'000'000, .maximumMemory = std::size_t{512} << 20};
    if (input.ensure(limits.maximumBytes + 1))
        return std::nullopt;
    const Result<Value> root = readPropertyList(input.available(), limits);
    const Dictionary* const snapshot = root ? root->asDictionary() : nullptr;
    const std::string* const text = snapshot ? (*snapshot)[descriptionKey].asString() : nullptr;
    const std::optional<MaskSeal> seal = text ? MaskSeal::read(*text) : std::nullopt;
    if (!seal)
        return std::nullopt;
    const Result<std::string> digest = digestOfSnapshot(*root);
    return digest && seal->digest == *digest ? seal : std::nullopt;
}

} // namespace

Result<std::string> digestOfSnapshot(const Value& root) {
    Dictionary content;
    for (const auto& [key, value] : *root.asDictionary())
        if (key != descriptionKey)
            content.set(key, value);
    const Result<std::string> list =
        writePropertyList(Value(std::make_shared<Dictionary>(std::move(content))));
    if (!list)
        return Failure{list.reason()};
    Hash hash;
    hash.add(Bytes(reinterpret_cast<const std::uint8_t*>(list->data()), list->size()));
    return hexadecimalText(hash.digest());
}

Result<Done> sealSnapshot(const Value& root, MaskSeal seal) {
    Result<std::string> digest = digestOfSnapshot(root);
    if (!digest)
        return Failure{digest.reason()};
    seal.digest = *std::move(digest);
    root.asDictionary()->set(descriptionKey, seal.text());
    return Done{};
}

std::string digestOfLog(ChunkedInput input) {
    Hash hash;
    if (!input.ensure(dlfVersionReportSize))
        return hexadecimalText(hash.digest());
    input.skip(dlfVersionReportSize);
    while (input.ensure(1)) {
        hash.add(input.available());
        input.skip(input.available().size());
    }
    return hexadecimalText(hash.digest());
}

std::optional<MaskSeal> readSeal(ChunkedInput input) {
    static_cast<void>(input.ensure(dlfVersionReportSize));
    if (isGzip(input.available()))
        return readSeal(ChunkedInput(std::make_unique<GzipSource>(std::move(input))));
    const Bytes begin = input.available();
    if (begin.size() >= dlfVersionReportSize)
        if (const auto seal = MaskSeal::read(begin.subspan(MaskSeal::reportOffset, MaskSeal::reportLength)))
            return seal->digest == digestOfLog(std::move(input)) ? seal : std::nullopt;
    constexpr std::string_view sectionHeader = "\n\r\r\n";
    const bool isRecording = begin.size() >= sectionHeader.size() &&
                             std::equal(sectionHeader.begin(), sectionHeader.end(), begin.begin());
    return isRecording ? sealOfRecording(std::move(input)) : sealOfSnapshot(std::move(input));
}

} // namespace velmora
