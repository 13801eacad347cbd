// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"

#include "Fuzz/FuzzCorpora.h"

namespace velmora {

namespace {

constexpr FuzzTargetKind kinds[] = {
    {"property-list", makePropertyListTarget, propertyListCorpus, 2048},
    {"ostrel-gsm", makeOstrelGSMTarget, [] { return decoderCorpus("gsm"); }},
    {"lte", makeLTETarget, [] { return decoderCorpus("lte"); }},
    {"utran", makeUTRANTarget, [] { return decoderCorpus("utran"); }},
    {"c2k", makeC2KTarget, [] { return decoderCorpus("c2k"); }},
    {"modem", makeModemTarget, [] { return decoderCorpus("modem"); }, 4096},
    {"ifx", makeIFXTarget, [] { return decoderCorpus("ifx"); }, 2048},
    {"same-labels", makeSameLabelsTarget, sameLabelsCorpus, 2048},
    {"observations", makeObservationsTarget, sameLabelsCorpus, 2048},
    {"report", makeReportTarget, sameLabelsCorpus, 2048},
    {"template", makeTemplateTarget, templateCorpus, 4096},
    {"frame", makeFrameTarget, frameCorpus},
    {"recording", makeRecordingTarget, recordingCorpus, 1536},
    {"dlf", makeDLFTarget, dlfCorpus},
    {"snapshot", makeSnapshotTarget, snapshotCorpus, 6144},
    {"gzip", makeGzipTarget, gzipCorpus, 512},
    {"position", makePositionTarget, positionCorpus, 1024},
    {"mask", makeMaskTarget, recordingCorpus, 2048},
    {"source-string", makeSourceStringTarget, sourceStringCorpus, 128},
    {"rule-expression", makeRuleExpressionTarget, ruleExpressionCorpus, 512},
    {"rule-file", makeRuleFileTarget, ruleFileCorpus, 10240},
};

} // namespace

std::span<const FuzzTargetKind> fuzzTargets() {
    return kinds;
}

} // namespace velmora
