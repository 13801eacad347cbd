// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ReaderNews.h"

#include <limits>

namespace velmora {

void ReaderNews::passNotes(std::uint64_t message, InputColumns& columns) {
    const std::vector<Comment>& kept = _reader.comments().first();
    for (; _comments < kept.size(); ++_comments) {
        const Comment& comment = kept[_comments];
        if (comment.about != Comment::About::Message)
            continue;
        if (comment.number > message)
            return;
        columns.addNote(comment.number, comment.text);
    }
}

/// Several losses in one place are one gap, with the last one's reason.
void ReaderNews::passLosses(std::uint64_t message, InputColumns& columns) {
    const std::uint64_t losses = _reader.lossTotals().losses;
    if (losses == _losses)
        return;
    const std::vector<Loss>& kept = _reader.losses();
    if (_losses >= kept.size()) { // no reason is kept, nor where they are
        _losses = losses;
        columns.addLoss(message, "damaged");
        return;
    }
    const Loss* latest = nullptr;
    for (; _losses < kept.size() && kept[static_cast<std::size_t>(_losses)].recordNumber <= message;
         ++_losses)
        latest = &kept[static_cast<std::size_t>(_losses)];
    if (latest)
        columns.addLoss(latest->recordNumber, latest->reason);
}

void ReaderNews::passEnd(InputColumns& columns) {
    if (_reader.failure())
        columns.addLoss(0, _reader.failure()->reason);
    else
        passLosses(std::numeric_limits<std::uint64_t>::max(), columns);
}

} // namespace velmora
