// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"

#include <chrono>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

/// Values that property-list tests share.

namespace velmora {

[[nodiscard]] inline std::vector<std::uint8_t> bytesOf(std::string_view text) {
    return {text.begin(), text.end()};
}

[[nodiscard]] inline Value dataOf(std::vector<std::uint8_t> bytes) {
    return Data(std::move(bytes));
}

[[nodiscard]] inline Value arrayOf(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

[[nodiscard]] inline Value dictionaryOf(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

/// Arrays in one another, `depth` of them, the innermost empty.
[[nodiscard]] inline Value nestedArrays(std::size_t depth) {
    Value value = makeArray();
    for (std::size_t i = 1; i < depth; ++i)
        value = arrayOf({value});
    return value;
}

/// Every kind, and what is awkward about each.
[[nodiscard]] inline Value everyKind() {
    using namespace std::chrono;
    std::vector<std::uint8_t> allBytes;
    for (int repeat = 0; repeat < 3; ++repeat)
        for (int byte = 0; byte < 256; ++byte)
            allBytes.push_back(static_cast<std::uint8_t>(byte));
    const auto strings = makeArray();
    for (const char* text : {"", " ", "\n", " \t\n ", " led and trailed ", "two\r\nlines\r", "<&>\"']]>",
                             "&amp;", "fourteen chars", "fifteen chars..",
                             ("Zellen\xC3\xBC"
                              "bersicht"),
                             "\xE2\x82\xAC", "\xF0\x9F\x93\xB6 4/5", "\xEF\xBF\xBD", "tab\there"})
        strings->append(text);
    strings->append(std::string(300, 'x'));
    strings->append("repeated");
    strings->append("repeated");
    const auto integers = makeArray();
    for (const std::int64_t integer :
         {std::int64_t{0}, std::int64_t{1}, std::int64_t{-1}, std::int64_t{127}, std::int64_t{128},
          std::int64_t{255}, std::int64_t{256}, std::int64_t{65535}, std::int64_t{65536},
          std::int64_t{4294967295}, std::int64_t{4294967296}, std::int64_t{-4294967296},
          std::numeric_limits<std::int64_t>::max(), std::numeric_limits<std::int64_t>::min()})
        integers->append(integer);
    const auto reals = makeArray();
    for (const double real : {0.0, -0.0, 1.0, -0.1, 1.0 / 3, 1e300, 5e-324, 123456789.125,
                              std::numeric_limits<double>::infinity(),
                              -std::numeric_limits<double>::infinity(), std::numeric_limits<double>::max()})
        reals->append(real);
    const auto sixteen = makeDictionary();
    for (int i = 0; i < 20; ++i)
        sixteen->set("key " + std::to_string(i), i);
    return dictionaryOf(
        {{"strings", strings},
         {"integers", integers},
         {"reals", reals},
         {"booleans", arrayOf({true, false})},
         {"dates", arrayOf({Date(sys_days{year{2026} / 11 / 16} + hours{5}),
                            Date(sys_days{year{2000} / 2 / 29}), Date(sys_days{year{1} / 1 / 1}),
                            Date(sys_days{year{9999} / 12 / 31} + 23h + 59min + 59s)})},
         {"data", arrayOf({Data(), dataOf({0}), dataOf({1, 2}), dataOf({1, 2, 3}), dataOf(allBytes)})},
         {"empty", arrayOf({makeArray(), makeDictionary()})},
         {"", "the empty key"},
         {"<k&y> \xC3\xA9\r", "an awkward key"},
         {"many", sixteen},
         {"nested", arrayOf({nestedArrays(20), dictionaryOf({{"a", dictionaryOf({{"b", 1}})}})})}});
}

/// Limits for lists that are larger than a message.
inline constexpr PropertyListLimits largeLimits{.maximumObjects = 1'000'000,
                                                .maximumMemory = std::size_t{256} << 20};

/// A list of the size of a large snapshot: thousands of entries with text and data.
[[nodiscard]] inline Value manyEntries() {
    const auto entries = makeArray();
    for (int i = 0; i < 20'000; ++i)
        entries->append(
            dictionaryOf({{"Description", "entry " + std::to_string(i)},
                          {"Code", 0xB000 + i % 512},
                          {"Raw", dataOf(std::vector<std::uint8_t>(40, static_cast<std::uint8_t>(i)))}}));
    return entries;
}

} // namespace velmora
