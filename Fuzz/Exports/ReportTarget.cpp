// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/DriveReport.h"
#include "Fuzz/Decoders/FuzzedDecoders.h"
#include "Fuzz/Decoders/MessageScript.h"
#include "Fuzz/FuzzTargets.h"
#include "Tests/Export/Report/PageCheck.h"

#include <chrono>
#include <string>

namespace velmora {

namespace {

/// Passes what a decoder reports to a report, a message each 300 ms.
class ReportSink final : public ObservationSink {
public:
    explicit ReportSink(DriveReport& report) : _report(report) {}

    void begin(const Catalogue& catalogue) { _technology = &_report.of(catalogue); }
    void observed(const ObservedMessage& message) override {
        _time += std::chrono::milliseconds(300);
        const MessageNumber number{0, ++_number};
        _report.count(number, _time);
        _technology->report({number, _time, message});
    }

private:
    DriveReport& _report;
    TechnologyReport* _technology = nullptr;
    Time _time{std::chrono::hours(24)};
    std::uint64_t _number = 0;
};

/// The input's first byte chooses the technology, the rest is a MessageScript, and the name of the file as
/// well. Whatever its messages are, the report of them is a page.
class ReportTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        if (input.empty())
            return;
        const DecoderMaker& maker = _decoders.of(input.front());
        const DictionaryRef state = maker.newState();
        const std::unique_ptr<LogGenerator> decoder = maker.newDecoder();
        static_cast<void>(decoder->generateLogUsingState(*state)); // builds the display
        DriveReport::Options options;
        options.files.emplace_back(input.begin(), input.end());
        options.hasIdentities = (input.front() & 0x80) != 0;
        DriveReport report(std::move(options));
        ReportSink sink(report);
        sink.begin(decoder->catalogue());
        decoder->setObservationSink(&sink);
        MessageScript script(input.subspan(1));
        while (const auto step = script.next())
            if (step->kind == MessageScript::Kind::Message && !updateDecoder(*decoder, *state, step->message))
                break;
        decoder->setObservationSink(nullptr);
        report.finish();
        std::string page;
        report.write([&page](std::string_view piece) { page += piece; });
        if (const std::string problem = problemOfPage(page); !problem.empty())
            throw BrokenInvariant(problem);
    }

private:
    FuzzedDecoders _decoders;
};

} // namespace

std::unique_ptr<FuzzTarget> makeReportTarget() {
    return std::make_unique<ReportTarget>();
}

} // namespace velmora
