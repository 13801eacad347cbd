// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// One of the UMTS searcher's four cell sets: a list that each record of the searcher replaces. A set that
/// does not override `views`, `checkCells` and `visitCells` has no cells, whatever set a cell is of: its list
/// is empty, on purpose.
class SearcherSet : public Base {
public:
    [[nodiscard]] std::span<const View> views() const override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const final;
    void describe(const View& view, ContentVisitor& visitor) const final;

protected:
    /// The set's name in the log.
    [[nodiscard]] virtual std::string_view traceName() const = 0;
    /// Logs what the record lacks.
    virtual void checkCells(const Record& record) const;
    /// What a row may show.
    [[nodiscard]] virtual std::span<const Content> cellContents() const { return {}; }
    /// Names the rows of the list.
    virtual void visitCells(const Record& record, FieldVisitor& visitor) const;

private:
    void trace() const final;
    void check(const View& view, const Record& record) const final;
};

} // namespace velmora
