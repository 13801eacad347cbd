// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/ReuseQueue.h"

#include "Toolkit/Tables/TableCell.h"

#include <QWidget>

#include <utility>

namespace velmora {

void ReuseQueue::add(std::shared_ptr<TableCell> cell) {
    auto& waiting = _waiting[cell->reuseIdentifier()];
    waiting.push_back(std::move(cell));
}

std::shared_ptr<TableCell> ReuseQueue::take(std::string_view identifier) {
    const auto found = _waiting.find(identifier);
    if (found == _waiting.end() || found->second.empty())
        return nullptr;
    std::shared_ptr<TableCell> cell = std::move(found->second.back());
    found->second.pop_back();
    return cell;
}

void ReuseQueue::hideAll() {
    for (const auto& [identifier, waiting] : _waiting)
        for (const auto& cell : waiting)
            cell->setHidden(true);
}

void ReuseQueue::clear() {
    for (const auto& [identifier, waiting] : _waiting)
        for (const auto& cell : waiting)
            cell->widget()->setParent(nullptr);
    _waiting.clear();
}

} // namespace velmora
