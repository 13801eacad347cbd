// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"

namespace velmora {

/// Reports changes of the serving cell: a reselection, a handover, or a change of which the records do not
/// tell whose decision it was; of its radio technology; and a return to a cell that the phone left shortly
/// before.
class ServingCellDetector final : public Detector {
public:
    /// A return within this time is a ping-pong.
    static constexpr std::chrono::seconds pingPongTime{10};

    [[nodiscard]] bool wants(const CatalogueField& /*leaf*/) const override { return false; }
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time, EventSink&) override {}
};

} // namespace velmora
