// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/LeafTexts.h"

#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

void LeafTexts::append(TextBuffer& out, const Observation& observation, std::size_t path) {
    const std::size_t leaf = observation.leaf->index;
    while (_pieces.size() <= leaf)
        _pieces.emplace_back();
    while (_pieces[leaf].size() <= path)
        _pieces[leaf].emplace_back();
    Pieces& pieces = _pieces[leaf][path];
    if (pieces.empty())
        pieces = piecesOf(*observation.leaf, path);
    out.append(pieces[0]);
    for (std::size_t i = 1; i < pieces.size(); ++i) {
        appendNumber(out, std::uint64_t{observation.rows[i - 1]});
        out.append(pieces[i]);
    }
}

LeafTexts::Pieces LeafTexts::piecesOf(const CatalogueField& leaf, std::size_t path) const {
    const bool isNamed = !_selection.paths().empty() && _selection.names()[path] != _selection.paths()[path];
    TextBuffer text;
    Pieces pieces;
    if (_form == Form::CSV && isNamed) {
        appendCsvText(text, _selection.names()[path], _guard);
        pieces.emplace_back(text.view());
        return pieces;
    }
    std::string before;
    if (_form == Form::JSON) {
        if (isNamed) {
            text.append(",\"name\":");
            appendJsonString(text, _selection.names()[path]);
        }
        text.append(",\"path\":");
        before = text.view();
        text.clear();
        appendJsonString(text, leaf.path);
    } else {
        appendCsvText(text, leaf.path, _guard);
    }
    // A row's number needs no quoting, so that the path is quoted once.
    std::string_view rest = text.view();
    for (const CatalogueNode* node = leaf.node; node; node = node->parent())
        if (node->isRow()) {
            const std::size_t star = rest.rfind("/*");
            pieces.emplace(pieces.begin(), rest.substr(star + 2));
            rest = rest.substr(0, star + 1);
        }
    pieces.emplace(pieces.begin(), before + std::string(rest));
    return pieces;
}

} // namespace velmora
