#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Detected Set": the UMTS searcher's detected set. No cell is ever put into it: the section empties its
/// list, and that is meant.
class DetectedSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Detected Set"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x417A}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
