// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogMessages/LogMessage.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// The log codes that the decoder asks for, of the baseband's stream or, where it asks for none of these, of
/// the extra one; none of a decoder that asks for no codes.
[[nodiscard]] inline std::vector<std::uint32_t> subscribedCodes(const LogGenerator& decoder) {
    std::vector<std::uint32_t> codes;
    const DictionaryRef command = decoder.getStartCommand();
    const auto add = [&](const char* key, std::uint32_t first) {
        if (const Array* const wanted = (*command)[key].asArray())
            for (const Value& code : *wanted)
                codes.push_back(first + static_cast<std::uint32_t>(*code.asInteger()));
    };
    add("SetOstrelLogCodes", 0);
    if (codes.empty())
        add("SetVoxExtraCodes", LogMessage::firstExtraCode);
    return codes;
}

} // namespace velmora
