#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Active Set": one row per cell of the UMTS searcher's active set.
class ActiveSet final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Active Set"; }
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const override { return {0x417A}; }
    void updateWithData(const Data& data, std::uint32_t logCode) override;
};

} // namespace velmora
