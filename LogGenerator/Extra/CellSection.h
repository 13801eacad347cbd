// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/CellFields.h"
#include "LogGenerator/Extra/CellList.h"
#include "LogMessages/LogMessage.h"

#include <memory>
#include <span>
#include <vector>

namespace velmora {

/// What a section shows of the cell information array: which cells, and what of each.
struct CellTable {
    enum class Shown : std::uint8_t {
        First, ///< the first cell of the kinds, in the section's dictionary
        Last,  ///< every cell of the kinds, in the section's dictionary: the last one overwrites
        Rows   ///< every cell of the kinds, a row each in the section's list
    };

    std::span<const CellKind> kinds;
    Shown shown;
    std::span<const CellField> fields;
    List list{}; ///< with `Rows`: which of the fields identify a row
};

/// The array among a section's views; its payload is read by CellSection.
inline constexpr View cellInformation{ExtraCode::cellInformation, std::size_t{0}};

/// A section that shows cells of the cell information array, beside its records. The array is read once for
/// all sections of a class index; what is kept until it is written is the section's own cells of it.
class CellSection : public Base {
public:
    /// Reads the array through a list that is shared with other sections.
    void shareCellList(std::shared_ptr<CellList> cells) { _cells = std::move(cells); }

    void updateWithData(const Data& data, std::uint32_t logCode) override;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override;
    void describe(const View& view, ContentVisitor& visitor) const override;

    /// What is shown of the array, a constant.
    [[nodiscard]] virtual const CellTable& cellTable() const = 0;

protected:
    /// The array cannot be read: the error line "Failed to get Cell Array".
    virtual void noCells() const;

private:
    void updateCells(const Data& data);
    /// The cells of the array that the section shows; logs what they lack.
    void select(const std::vector<Cell>& cells);
    [[nodiscard]] KeptRecords::Parts partsOfSelected() const;

    std::shared_ptr<CellList> _cells = std::make_shared<CellList>();
    std::vector<Cell> _selected; ///< of the array that arrived last
    std::vector<Cell> _shown;    ///< of the one that is kept for the display
};

} // namespace velmora
