// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/SealedFile.h"

#include "LogMessages/DLFVersionReport.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"
#include "Recording/Pcapng/PcapngReader.h"

#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

struct ReadFile {
    std::optional<MaskSeal> seal; ///< as the file has it
    std::string digest;           ///< empty after a loss
};

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

ReadFile readFile(ChunkedInput input) {
    ReadFile result;
    static_cast<void>(input.ensure(dlfVersionReportSize));
    const Bytes begin = input.available();
    if (begin.size() >= dlfVersionReportSize)
        result.seal = MaskSeal::read(begin.subspan(MaskSeal::reportOffset, MaskSeal::reportLength));
    const Result<std::unique_ptr<MessageReader>> opened = openMessages(std::move(input));
    if (!opened)
        return {};
    MessageReader& reader = **opened;
    std::optional<RecordingSeal> recording;
    if (auto* const pcapng = dynamic_cast<PcapngReader*>(&reader))
        recording.emplace(*pcapng);
    reader.setReadsAllTechnologies(true);
    MessageDigest digest;
    while (const auto message = reader.next()) {
        // Other files may be recognised by their messages, or not, and are of one technology anyway.
        digest.add(recording ? reader.technologies()[message->technology] : std::string(),
                   message->message.bytes());
    }
    if (recording)
        result.seal = recording->seal();
    else if (const std::vector<Comment>& comments = reader.comments().first(); !comments.empty())
        result.seal = MaskSeal::read(comments.front().text);
    if (reader.lossTotals().losses == 0 && !reader.failure())
        result.digest = digest.text();
    return result;
}

} // namespace

std::optional<MaskSeal> readSeal(ChunkedInput input) {
    const ReadFile file = readFile(std::move(input));
    return file.seal && !file.digest.empty() && file.seal->digest == file.digest ? file.seal : std::nullopt;
}

std::optional<std::string> digestOfFile(ChunkedInput input) {
    ReadFile file = readFile(std::move(input));
    return file.digest.empty() ? std::nullopt : std::optional(std::move(file.digest));
}

} // namespace velmora
