// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Report/DriveReport.h"
#include "Tools/Analysed/MessageAnalysis.h"

namespace velmora {

/// Passes what a technology's messages report to a page.
class ReportAnalysis final : public MessageAnalysis {
public:
    /// Both must outlive it.
    ReportAnalysis(DriveReport& report, const Catalogue& catalogue)
        : _report(report), _technology(report.of(catalogue)) {}

    void report(const MessageReport& report) override {
        _report.count(report.message, report.time);
        _technology.report(report);
    }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void reportUndecoded(const UndecodedReport& report) override {
        _report.count(report.message, report.time);
        _technology.reportUndecoded(report.message, report.time, report.arrival);
    }
    void reportLoss(const InputLoss& loss) override { _technology.damaged(loss.at, loss.reason); }
    void interrupt() override { _technology.interrupt(); }

private:
    DriveReport& _report;
    TechnologyReport& _technology;
};

} // namespace velmora
