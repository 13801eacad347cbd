// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/LogCodeText.h"

#include "LogMessages/LogMessage.h"

#include <charconv>
#include <limits>
#include <string>

namespace velmora {

Result<std::uint32_t> readLogCode(std::string_view text) {
    constexpr std::uint32_t largest = std::numeric_limits<std::uint16_t>::max();
    const bool isHexadecimal = text.starts_with("0x") || text.starts_with("0X");
    const std::string_view digits = text.substr(isHexadecimal ? 2 : 0);
    std::uint32_t code = 0;
    const char* const end = digits.data() + digits.size();
    const auto [rest, error] = std::from_chars(digits.data(), end, code, isHexadecimal ? 16 : 10);
    const bool isCode = code <= largest ||
                        (code >= LogMessage::firstExtraCode && code - LogMessage::firstExtraCode <= largest);
    if (error != std::errc() || rest != end || !isCode)
        return Failure{"got " + std::string(text) + ", wanted a log code such as 0x512C or 0xFF0000"};
    return code;
}

} // namespace velmora
