// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/XMLDocument.h"

#include "PropertyLists/PugixmlMemoryBudget.h"
#include "PropertyLists/ReadingBudget.h"
#include "PropertyLists/XMLText.h"

#include <algorithm>
#include <cctype>
#include <cstddef>
#include <limits>
#include <new>

namespace velmora {

namespace {

/// What a document may take: a node for each value or key and one for the white space after it, with room
/// for comments' and sections' pieces, whatever a caller's limit is.
std::size_t documentBytes(std::size_t objects) {
    constexpr std::size_t bytesAnObject = 256;
    constexpr std::size_t anyDocument = std::size_t{256} * 1024;
    constexpr std::size_t most = std::numeric_limits<std::size_t>::max() - anyDocument;
    return (objects > most / bytesAnObject ? most : objects * bytesAnObject) + anyDocument;
}

} // namespace

Failure XMLDocument::failureAt(std::size_t offset, const std::string& reason) {
    return Failure{"offset " + std::to_string(offset) + ": " + reason};
}

std::size_t XMLDocument::offsetOf(pugi::xml_node node) const {
    const bool isElement = node.type() == pugi::node_element;
    return offsetOf(isElement ? node.name() : node.value()) - (isElement ? 1 : 0);
}

Result<Done> XMLDocument::parse(Bytes input, const PropertyListLimits& limits) {
    if (input.size() > limits.maximumBytes)
        return limitExceeded(limits, "the list has " + std::to_string(input.size()) + " bytes, more than " +
                                         std::to_string(limits.maximumBytes));
    _text.resize(input.size());
    std::copy(input.begin(), input.end(), _text.begin());
    // This also keeps zero bytes away from pugixml, which ends there.
    if (const auto offset = firstNotXML(_text))
        return failureAt(*offset, "no character of XML in UTF-8");

    // Text is read unchanged from the document: pugixml would pass unknown references as text and end a
    // string at "&#0;". White space is kept because it may be part of a string that has comments or sections
    // in it.
    constexpr unsigned options = pugi::parse_cdata | pugi::parse_eol | pugi::parse_ws_pcdata |
                                 pugi::parse_embed_pcdata | pugi::parse_fragment;
    const PugixmlMemoryBudget budget(documentBytes(limits.maximumObjects));
    const pugi::xml_parse_result result =
        _document.load_buffer_inplace(_text.data(), _text.size() + 1, options, pugi::encoding_utf8);
    if (result)
        return Done{};
    if (result.status == pugi::status_out_of_memory && !budget.isExhausted())
        throw std::bad_alloc();
    if (result.status == pugi::status_out_of_memory)
        return limitExceeded(limits, "the list has more tags and attributes than " +
                                         std::to_string(limits.maximumObjects) + " objects need");
    std::string description = result.description();
    description[0] = static_cast<char>(std::tolower(static_cast<unsigned char>(description[0])));
    return failureAt(static_cast<std::size_t>(std::max<std::ptrdiff_t>(result.offset, 0)), description);
}

} // namespace velmora
