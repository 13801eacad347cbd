// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/LeafTable.h"
#include "Analysis/Picture/RadioTechnology.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// Detectors that few leaves concern each. A message is passed to those whose leaves it reports, so that most
/// messages cost no more than one look at each of their observations.
class TableDetectors final : public Detector {
public:
    explicit TableDetectors(const Catalogue& catalogue) : _concerned(catalogue) {}

    /// The paths of the leaves must be constants. A message after which the radio mode is another one is
    /// passed to all.
    void add(std::unique_ptr<Detector> detector, std::vector<std::string_view> paths);

    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return maskOf(leaf) != 0; }
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;
    void finish(Time last, EventSink& sink) override;

private:
    using Mask = std::uint32_t; ///< a bit a detector

    struct Each {
        std::unique_ptr<Detector> detector;
        std::vector<std::string_view> paths;
    };

    [[nodiscard]] Mask maskOf(const CatalogueField& leaf) const;
    [[nodiscard]] Mask concernedBy(const CatalogueField& leaf);

    std::vector<Each> _detectors;
    LeafTable<Mask> _concerned;
    std::optional<RadioMode> _mode;
};

} // namespace velmora
