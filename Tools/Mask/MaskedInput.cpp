// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskedInput.h"

#include "Tools/Mask/MaskOption.h"
#include "Tools/Messages/TechnologyChoice.h"

namespace velmora {

MaskedInput::MaskedInput(MessageReader& reader, const std::string& file, const std::string& technology,
                         const std::vector<std::string>& technologies,
                         const std::optional<MaskOptions>& masking)
    : _reader(&reader) {
    if (!masking)
        return;
    // A name that does not suit the file is decoding's to refuse, before anything is written.
    const auto choice = TechnologyChoice::make(technology, knownTechnologies(technologies, reader));
    _mask.emplace(maskOptionsFor(file, *masking));
    _masked.emplace(reader, *_mask, choice ? choice->override : std::string());
    _reader = &*_masked;
}

} // namespace velmora
