// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/CellIdentity.h"
#include "Analysis/Picture/Reading.h"

#include <chrono>
#include <optional>
#include <vector>

namespace velmora {

class RadioPicture;

/// Reports reselections that came late, after a neighbour had been better for long, and ones to a cell that
/// was not better. It goes by levels alone, among cells of one radio technology on one channel; on GSM, where
/// every cell has a channel of its own, among all.
class ReselectionsDetector final : public Detector {
public:
    static constexpr double lateMargin_dB = 6;
    static constexpr std::chrono::seconds lateTime{10};
    /// A level that is older is not compared.
    static constexpr std::chrono::seconds oldest{2};

    [[nodiscard]] bool wants(const CatalogueField& /*leaf*/) const override { return false; }
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time, EventSink&) override {
        _seen.clear();
        _early.reset();
    }

private:
    /// A neighbour of the serving cell that it can be compared with.
    struct Seen {
        Neighbour cell;
        double margin_dB = 0;            ///< above the serving cell
        std::optional<Time> betterSince; ///< by the margin, without a break
        MessageNumber firstBetter;
    };

    /// A reselection to a cell that had not been stronger; it was early if the one that the phone left is not
    /// weaker afterwards either.
    struct Early {
        Event event;
        CellIdentity from;
    };

    void compare(const MessageReport& report, const RadioPicture& picture);
    void judge(const MessageReport& report, const RadioPicture& picture, EventSink& sink);

    /// Passes on the early reselection, or forgets it, once both cells have been reported after it.
    void confirm(const MessageReport& report, const RadioPicture& picture, EventSink& sink);

    std::optional<Early> _early;
    std::vector<Seen> _seen;
    std::vector<Seen> _next; ///< storage for `compare`
};

} // namespace velmora
