// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// The codes of the baseband's stream that the decoder asks for; none of one that asks for no codes.
[[nodiscard]] inline std::vector<std::uint16_t> subscribedCodes(const LogGenerator& decoder) {
    std::vector<std::uint16_t> codes;
    const DictionaryRef command = decoder.getStartCommand();
    if (const Array* const wanted = (*command)["SetOstrelLogCodes"].asArray())
        for (const Value& code : *wanted)
            codes.push_back(static_cast<std::uint16_t>(*code.asInteger()));
    return codes;
}

} // namespace velmora
