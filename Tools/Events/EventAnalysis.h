// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "Tools/Analysed/MessageAnalysis.h"

namespace velmora {

/// Passes what a technology's messages report to an event engine.
class EventAnalysis final : public MessageAnalysis {
public:
    /// Both must outlive it.
    EventAnalysis(const Catalogue& catalogue, EventSink& sink) : _engine(catalogue, sink) {}

    void add(std::unique_ptr<Detector> detector) { _engine.add(std::move(detector)); }

    void report(const MessageReport& report) override { _engine.report(report); }
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _engine.wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void reportUndecoded(const UndecodedReport& report) override;
    void reportLoss(const InputLoss& loss) override { _engine.damaged(loss.at, loss.reason); }
    void reportNote(const InputNote& note) override { _engine.noted(note.at, note.text); }
    void interrupt() override { _engine.interrupt(); }
    void finish() override { _engine.finish(); }

private:
    EventEngine _engine;
};

} // namespace velmora
