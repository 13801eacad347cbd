// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/TrackConversion.h"

#include "Analysis/Rules/RuleSet.h"
#include "Export/Tracks/TrackCollector.h"
#include "Export/Tracks/TrackFiles.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/TimeSpan.h"
#include "Tools/Analysed/FileMessages.h"
#include "Tools/Convert/TrackSamples.h"
#include "Tools/Events/EventAnalysis.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"

#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

namespace velmora {

namespace {

class CollectedEvents final : public EventSink {
public:
    void happened(const Event& event) override { events.push_back(event); }
    std::vector<Event> events;
};

/// The values and events of a technology.
class TrackAnalysis final : public MessageAnalysis {
public:
    TrackAnalysis(const Catalogue& catalogue, const RuleSet& rules, TrackSamples& samples, EventSink& events)
        : _samples(samples), _leaves(samples.choice()), _events(catalogue, events) {
        _events.add(makeRuleDetector(rules, catalogue));
    }

    void report(const MessageReport& report) override {
        _samples.add(report, _leaves, _texts);
        _events.report(report);
    }
    void reportUndecoded(const UndecodedReport& report) override { _events.reportUndecoded(report); }
    void reportLoss(const InputLoss& loss) override { _events.reportLoss(loss); }
    void finish() override { _events.finish(); }

private:
    TrackSamples& _samples;
    CountedLeaves _leaves;
    ObservedText _texts;
    EventAnalysis _events;
};

TrackData trackOf(const Track& track, const TrackSamples& samples, const Conversion& conversion, Time first) {
    TrackData data;
    data.name = conversion.title;
    data.attributes = samples.attributes();
    const TimeRange& range = conversion.messages.range;
    std::optional<Time> last;
    for (const Fix& fix : track.fixes()) {
        if (!range.contains(fix.time, first))
            continue;
        if (!last || timeSpan(*last, fix.time) > track.maximumGap())
            data.segments.emplace_back();
        data.segments.back().push_back({fix, samples.valuesAt(fix.time)});
        last = fix.time;
    }
    return data;
}

std::string textOf(const TrackData& track, FileForm form) {
    switch (form) {
    case FileForm::GPX: return trackFiles::gpx(track);
    case FileForm::GeoJSON: return trackFiles::geoJSON(track);
    default: return trackFiles::kml(track);
    }
}

} // namespace

Result<bool> convertToTrack(MessageReader& reader, const Conversion& conversion, int descriptor,
                            WorkContext& context) {
    const AllCatalogues catalogues;
    const RuleSet rules = loadRules(catalogues, {});
    TrackSamples samples(conversion.attributes);
    CollectedEvents events;
    TrackCollector collector(reader);
    AnalysisFeed feed(AnalysisClock::Arrival, [&](const Catalogue& catalogue) {
        return std::make_unique<TrackAnalysis>(catalogue, rules, samples, events);
    });
    FileMessages messages(reader, {0, conversion.path, conversion.technology}, feed, context);
    if (const Result<Done> analysed = messages.run({}); !analysed)
        return Failure{conversion.title + ": " + analysed.reason()};
    feed.finish();
    const Track track = collector.takeTrack(conversion.maximumGap);
    if (track.fixes().empty())
        return Failure{conversion.title + ": no positions, of which a track is made"};
    const Time first = feed.first().value_or(track.fixes().front().time);
    TrackData data = trackOf(track, samples, conversion, first);
    std::stable_sort(events.events.begin(), events.events.end(),
                     [](const Event& a, const Event& b) { return a.time < b.time; });
    std::uint64_t withoutPlace = 0;
    for (Event& event : events.events) {
        if (!conversion.messages.range.contains(event.time, first))
            continue;
        const std::optional<Position> position = track.at(event.time);
        withoutPlace += position ? 0 : 1;
        data.events.push_back({std::move(event), position ? std::optional(position->fix) : std::nullopt});
    }
    if (withoutPlace > 0 && conversion.form != FileForm::GeoJSON)
        report(conversion.title + ": left out " + std::to_string(withoutPlace) +
               " events without a position");
    const std::string text = textOf(data, conversion.form);
    const Bytes content(reinterpret_cast<const std::uint8_t*>(text.data()), text.size());
    if (const Result<Done> written = writeAll(descriptor, content); !written)
        return Failure{conversion.name + ": " + written.reason()};
    return messages.undecoded().report(conversion.title);
}

} // namespace velmora
