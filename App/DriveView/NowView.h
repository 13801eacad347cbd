// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Drive/DriveNow.h"
#include "Toolkit/Label.h"

#include <array>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The serving cell as it is now: radio technology and state, level and quality large, and which cell it is.
/// What is older than a few seconds is dimmed and says how old it is.
class NowView final : public View {
public:
    NowView();
    ~NowView() override;

    /// `link` says that messages do not arrive any more; empty where they do. `change` is the latest event.
    void show(const DriveNow& now, const LevelClasses& classes, Time time, std::string_view link,
              std::string_view change);
    /// In that width.
    [[nodiscard]] double heightForWidth(double width) const;
    void layoutSubviews() override;

private:
    /// A quantity: its number and what is to be said of it.
    struct Quantity {
        Label caption;
        Label number;
        Label words;
    };
    /// A fact about the cell.
    struct Fact {
        Label caption;
        Label value;
    };
    enum FactIndex : std::size_t { network, area, cell, channel, band, physicalCell, facts };

    void showQuantity(Quantity& quantity, const std::optional<DriveValue>& value,
                      std::optional<LevelClass> levelClass, Time time);
    void showFact(FactIndex fact, std::string_view caption, const std::optional<DriveValue>& value,
                  Time time);
    [[nodiscard]] static std::size_t columnsIn(double width);

    Label _technology;
    Label _state;
    Label _change;
    Quantity _level;
    Quantity _quality;
    std::array<Fact, facts> _facts;
};

} // namespace velmora
