// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Base64.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

std::string base64(std::string_view bytes) {
    std::string text(base64Size(bytes.size()), '?');
    putBase64(text.data(), bytesOf(bytes));
    return text;
}

std::optional<std::string> decoded(std::string_view text) {
    const auto bytes = bytesOfBase64(text);
    return bytes ? std::optional(std::string(bytes->begin(), bytes->end())) : std::nullopt;
}

// The test vectors of RFC 4648, clause 10, and the bytes that use the last two digits.
constexpr struct {
    std::string_view bytes;
    std::string_view text;
} vectors[] = {{"", ""},
               {"f", "Zg=="},
               {"fo", "Zm8="},
               {"foo", "Zm9v"},
               {"foob", "Zm9vYg=="},
               {"fooba", "Zm9vYmE="},
               {"foobar", "Zm9vYmFy"},
               {"\xFB\xEF\xFF", "++//"}};

TEST(Base64, IsWrittenPadded) {
    for (const auto& [bytes, text] : vectors)
        EXPECT_EQ(base64(bytes), text);
}

TEST(Base64, IsReadWithSpacesAnywhere) {
    for (const auto& [bytes, text] : vectors) {
        EXPECT_EQ(decoded(text), bytes);
        std::string spaced = "\n";
        for (const char digit : text)
            spaced += std::string(1, digit) + " \t\r\n";
        EXPECT_EQ(decoded(spaced), bytes);
    }
}

TEST(Base64, NothingElseIsRead) {
    for (const char* const text : {"Zg", "Zg=", "Zg===", "Z===", "====", "=", "Zm9v=", "Zm8=Zm8=", "Zm9vY",
                                   "Zm-_", "Zm8\v=", "Zm9v\x80"})
        EXPECT_EQ(decoded(text), std::nullopt) << text;
}

} // namespace
} // namespace velmora
