// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/TableDetectors.h"

#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>
#include <utility>

namespace velmora {

void TableDetectors::add(std::unique_ptr<Detector> detector, std::vector<std::string_view> paths) {
    if (!paths.empty())
        _detectors.push_back({std::move(detector), std::move(paths)});
}

TableDetectors::Mask TableDetectors::maskOf(const CatalogueField& leaf) const {
    Mask mask = 0;
    for (std::size_t i = 0; i < _detectors.size(); ++i) {
        const auto& paths = _detectors[i].paths;
        if (std::find(paths.begin(), paths.end(), leaf.path) != paths.end())
            mask |= Mask{1} << i;
    }
    return mask;
}

TableDetectors::Mask TableDetectors::concernedBy(const CatalogueField& leaf) {
    return _concerned.at(leaf, [this](const CatalogueField& each) { return maskOf(each); });
}

void TableDetectors::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    Mask concerned = 0;
    for (const Observation& each : report.observed.observations)
        concerned |= concernedBy(*each.leaf);
    if (const std::optional<RadioMode> mode = picture.mode(); mode != _mode) {
        _mode = mode;
        concerned = ~Mask{0};
    }
    for (std::size_t i = 0; concerned != 0 && i < _detectors.size(); ++i)
        if ((concerned >> i & 1) != 0)
            _detectors[i].detector->report(report, picture, sink);
}

void TableDetectors::interrupt(Time last, EventSink& sink) {
    for (const Each& each : _detectors)
        each.detector->interrupt(last, sink);
}

void TableDetectors::finish(Time last, EventSink& sink) {
    for (const Each& each : _detectors)
        each.detector->finish(last, sink);
}

} // namespace velmora
