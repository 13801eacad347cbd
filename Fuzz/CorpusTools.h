// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"

#include <span>
#include <stdexcept>
#include <string_view>
#include <vector>

/// Helpers for making seed corpora.

namespace velmora {

[[nodiscard]] inline Data textData(std::string_view text) {
    return Data(std::vector<std::uint8_t>(text.begin(), text.end()));
}

[[nodiscard]] inline std::vector<Data> textDatas(std::span<const std::string_view> texts) {
    std::vector<Data> datas;
    for (const std::string_view text : texts)
        datas.push_back(textData(text));
    return datas;
}

/// The byte, then the bytes: an input whose first byte chooses how the rest is taken.
[[nodiscard]] inline Data withFirstByte(std::uint8_t first, Bytes rest) {
    std::vector<std::uint8_t> bytes{first};
    bytes.insert(bytes.end(), rest.begin(), rest.end());
    return Data(std::move(bytes));
}

/// Adds the list in both forms.
inline void addBothForms(std::vector<Data>& seeds, const Value& list) {
    const auto xml = writeXMLPropertyList(list);
    auto binary = writeBinaryPropertyList(list);
    if (!xml || !binary)
        throw std::logic_error("a seed that cannot be written");
    seeds.push_back(textData(*xml));
    seeds.emplace_back(*std::move(binary));
}

} // namespace velmora
