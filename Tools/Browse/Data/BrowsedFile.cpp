// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/BrowsedFile.h"

#include "Platform/PrintableText.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<BrowsedFile>> BrowsedFile::open(const std::string& path,
                                                       const std::string& technology) {
    Result<std::unique_ptr<PlayedFile>> file = PlayedFile::open(path);
    if (!file)
        return Failure{file.reason()};
    std::unique_ptr<BrowsedFile> opened(new BrowsedFile);
    opened->_file = *std::move(file);
    Result<std::unique_ptr<RecordingIndex>> index = RecordingIndex::make(*opened->_file, technology, {});
    if (!index)
        return Failure{index.reason()};
    opened->_index = *std::move(index);
    opened->_names = codeNames(&opened->_index->decoder().decoder());
    return opened;
}

std::string BrowsedFile::nameOf(std::uint32_t code) const {
    std::string text;
    if (_names.namesOf)
        for (const std::string& name : _names.namesOf(code))
            text += (text.empty() ? "" : ", ") + printable(name);
    return text;
}

} // namespace velmora
