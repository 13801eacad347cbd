// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Lines/JSONNode.h"

#include <cstdint>
#include <optional>

namespace velmora {

class Base;
class JSONFieldWriter;

/// The JSON of a section's node, which follows the section record by record: what a record names is written
/// as JSON at once, and the display is not needed. After anything else than one more record - messages that
/// were not to be shown, a node of another display - the node itself is read.
class SectionText {
public:
    /// All outlive this; others may use `texts` and `writer` too.
    SectionText(Base& section, JSONTexts& texts, JSONFieldWriter& writer);

    /// Appends its name, a colon and the node as it is now. Precondition: the section has one.
    void append(TextBuffer& out);

private:
    void update();
    /// Writes what the latest record names.
    void follow();

    Base& _section;
    JSONTexts& _texts;
    JSONFieldWriter& _writer;
    TextBuffer _name; ///< with the colon
    std::optional<JSONNode> _node;
    std::optional<std::uint64_t> _changes; ///< the section's, when `_node` was its node
};

} // namespace velmora
