// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"

#include <algorithm>
#include <string_view>

namespace velmora {

Result<Value> readPropertyList(Bytes input, const PropertyListLimits& limits) {
    constexpr std::string_view magic = "bplist";
    const bool isBinary =
        input.size() >= magic.size() &&
        std::equal(magic.begin(), magic.end(), input.begin(), [](char wanted, std::uint8_t found) {
            return static_cast<std::uint8_t>(wanted) == found;
        });
    return isBinary ? readBinaryPropertyList(input, limits) : readXMLPropertyList(input, limits);
}

Result<std::string> writePropertyList(const Value& root) {
    if (Result<std::string> xml = writeXMLPropertyList(root))
        return xml;
    const auto binary = writeBinaryPropertyList(root);
    if (!binary)
        return Failure{binary.reason()};
    return std::string(binary->begin(), binary->end());
}

} // namespace velmora
