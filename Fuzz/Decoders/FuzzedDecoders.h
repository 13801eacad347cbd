// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/Decoders/DecoderSession.h"

#include <array>
#include <cstdint>
#include <iterator>

namespace velmora {

/// Makes decoders of every technology, of which a byte of the input chooses one.
class FuzzedDecoders {
public:
    [[nodiscard]] const DecoderMaker& of(std::uint8_t choice) const {
        return _makers[choice % std::size(fuzzedTechnologies)];
    }

private:
    ShippedTemplates _templates;
    std::array<DecoderMaker, std::size(fuzzedTechnologies)> _makers{
        DecoderMaker(fuzzedTechnologies[0]), DecoderMaker(fuzzedTechnologies[1]),
        DecoderMaker(fuzzedTechnologies[2]), DecoderMaker(fuzzedTechnologies[3]),
        DecoderMaker(fuzzedTechnologies[4]), DecoderMaker(fuzzedTechnologies[5])};
};

} // namespace velmora
