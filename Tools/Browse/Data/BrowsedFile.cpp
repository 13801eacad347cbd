// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/BrowsedFile.h"

#include "Export/Masking/MaskedReader.h"
#include "Platform/PrintableText.h"
#include "Recording/OpenMessages.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Messages/TechnologyChoice.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<BrowsedFile>> BrowsedFile::open(const std::string& path, const std::string& technology,
                                                       const std::optional<MaskOptions>& masking) {
    std::unique_ptr<BrowsedFile> opened(new BrowsedFile);
    PlayedFile::Wrapping wrapping;
    if (masking) {
        opened->_mask.emplace(maskOptionsFor(path, *masking));
        // A name that does not suit the file is the index's to refuse.
        const auto choice = TechnologyChoice::make(technology, technologiesOf(path));
        wrapping = [mask = &*opened->_mask, override = choice ? choice->override : std::string()](
                       std::unique_ptr<MessageReader> reader) -> std::unique_ptr<MessageReader> {
            return std::make_unique<MaskedReader>(std::move(reader), *mask, override);
        };
    }
    Result<std::unique_ptr<PlayedFile>> file = PlayedFile::open(path, std::move(wrapping));
    if (!file)
        return Failure{file.reason()};
    opened->_file = *std::move(file);
    Result<std::unique_ptr<RecordingIndex>> index = RecordingIndex::make(*opened->_file, technology, {});
    if (!index)
        return Failure{index.reason()};
    opened->_index = *std::move(index);
    opened->_names = codeNames(&opened->_index->decoder().decoder());
    return opened;
}

std::optional<MaskOptions> BrowsedFile::masking() const {
    if (!_mask)
        return std::nullopt;
    MaskOptions options = _mask->options();
    if (options.masksTimes())
        options.shift = _mask->shift();
    return options;
}

std::string BrowsedFile::nameOf(std::uint32_t code) const {
    std::string text;
    if (_names.namesOf)
        for (const std::string& name : _names.namesOf(code))
            text += (text.empty() ? "" : ", ") + printable(name);
    return text;
}

} // namespace velmora
