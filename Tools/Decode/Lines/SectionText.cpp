// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/SectionText.h"

#include "LogGenerator/Base.h"
#include "Tools/Decode/Lines/JSONFieldWriter.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

SectionText::SectionText(Base& section, JSONTexts& texts, JSONFieldWriter& writer)
    : _section(section), _texts(texts), _writer(writer) {
    appendJsonString(_name, section.getSectionName());
    _name.append(':');
}

void SectionText::append(TextBuffer& out) {
    out.append(_name.view());
    if (!_section.showsOwnRecordsOnly()) {
        appendJson(out, _section.node());
        return;
    }
    update();
    _node->append(out);
}

void SectionText::update() {
    const std::uint64_t changes = _section.changes();
    if (_changes == changes)
        return;
    const bool isNext = _changes && *_changes + 1 == changes;
    _changes.reset(); // where naming fields fails
    if (isNext) {
        follow();
    } else {
        const Value node = _section.node();
        _node.emplace(node.asArray() != nullptr, _texts);
        _node->read(node);
    }
    _changes = changes;
}

void SectionText::follow() {
    _writer.begin(*_node, JSONFieldWriter::Into::Section);
    _section.nameLatest(_writer);
    _writer.end();
}

} // namespace velmora
