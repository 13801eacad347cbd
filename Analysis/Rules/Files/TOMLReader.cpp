// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/TOMLReader.h"

// The parser's header is in this source alone, since it takes long to compile. Its own bound on depth is set
// to ours.
#define TOML_HEADER_ONLY 1
#define TOML_EXCEPTIONS 1
#define TOML_ENABLE_FORMATTERS 0
#define TOML_MAX_NESTED_VALUES 16

#include <toml++/toml.h>

#include <utility>

namespace velmora {

namespace {

static_assert(TOML_MAX_NESTED_VALUES == deepestTOML);

TextPosition positionOf(const toml::source_region& source) {
    return {source.begin.line, source.begin.column};
}

TOMLNode nodeOf(const toml::node& parsed) {
    TOMLNode node;
    node.position = positionOf(parsed.source());
    switch (parsed.type()) {
    case toml::node_type::table:
        for (const auto& [key, value] : *parsed.as_table())
            node.entries.push_back({std::string(key.str()), positionOf(key.source()), nodeOf(value)});
        break;
    case toml::node_type::array:
        node.kind = TOMLNode::Kind::Array;
        for (const toml::node& value : *parsed.as_array())
            node.items.push_back(nodeOf(value));
        break;
    case toml::node_type::string:
        node.kind = TOMLNode::Kind::Text;
        node.text = parsed.as_string()->get();
        break;
    case toml::node_type::integer:
        node.kind = TOMLNode::Kind::Number;
        node.number = static_cast<double>(parsed.as_integer()->get());
        break;
    case toml::node_type::floating_point:
        node.kind = TOMLNode::Kind::Number;
        node.number = parsed.as_floating_point()->get();
        break;
    case toml::node_type::boolean:
        node.kind = TOMLNode::Kind::Flag;
        node.flag = parsed.as_boolean()->get();
        break;
    default: node.kind = TOMLNode::Kind::Date; break;
    }
    return node;
}

/// The parser's text without a capital at its front and a full stop at its end.
std::string asReason(std::string_view description) {
    std::string text(description);
    if (!text.empty() && text[0] >= 'A' && text[0] <= 'Z')
        text[0] = static_cast<char>(text[0] - 'A' + 'a');
    return text;
}

} // namespace

std::variant<TOMLNode, TOMLError> readTOML(std::string_view text) {
    if (const std::optional<TextPosition> position = longKey(text))
        return TOMLError{*position, "got a key of more than " + std::to_string(deepestTOML) + " parts"};
    try {
        return nodeOf(toml::parse(text));
    } catch (const toml::parse_error& error) {
        return TOMLError{positionOf(error.source()), asReason(error.description())};
    }
}

} // namespace velmora
