// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "GSM Neighbor Cell List": empty after every record. The rows of the GSM cells that the phone measures are
/// made and then discarded, on purpose: the list is not to show them. (The class keeps the baseband's own
/// spelling.)
class GSMNeighbhorMeasurements final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "GSM Neighbor Cell List"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0xD00E}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;

    /// The rows of a 0xD00E record, one per GSM cell. Entries that its count promises and that it does not
    /// hold are reported. Precondition: the record has 17 bytes.
    [[nodiscard]] static Array neighbours(const Record& record);
};

} // namespace velmora
