// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"
#include "PropertyLists/PropertyList.h"

#include <pugixml.hpp>

#include <cstddef>
#include <string>
#include <string_view>

namespace velmora {

/// An XML document and its text, which pugixml parses in place, so that every node has its offset in the
/// input. It stays where it is made: its nodes point into it.
class XMLDocument {
public:
    XMLDocument() = default;
    XMLDocument(const XMLDocument&) = delete;
    XMLDocument& operator=(const XMLDocument&) = delete;

    /// Parses the input, once. Fails where it is no XML in UTF-8, or exceeds the limits.
    [[nodiscard]] Result<Done> parse(Bytes input, const PropertyListLimits& limits);

    [[nodiscard]] pugi::xml_node root() const { return _document.root(); }
    /// The offset in the input of an element's "<", or of a text.
    [[nodiscard]] std::size_t offsetOf(pugi::xml_node node) const;
    /// As above, for text of this document.
    [[nodiscard]] std::size_t offsetOf(std::string_view text) const {
        return static_cast<std::size_t>(text.data() - _text.data());
    }

    [[nodiscard]] static Failure failureAt(std::size_t offset, const std::string& reason);

private:
    std::string _text; ///< the input and a zero byte; outlives the document
    pugi::xml_document _document;
};

} // namespace velmora
