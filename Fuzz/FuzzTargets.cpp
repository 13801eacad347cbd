// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"

#include "Fuzz/FuzzMaterials.h"

namespace velmora {

namespace {

constexpr FuzzTargetKind kinds[] = {
    {"property-list", makePropertyListTarget, propertyListMaterial, 2048},
    {"ostrel-gsm", makeOstrelGSMTarget, [] { return decoderMaterial("gsm"); }},
    {"lte", makeLTETarget, [] { return decoderMaterial("lte"); }},
    {"utran", makeUTRANTarget, [] { return decoderMaterial("utran"); }},
    {"c2k", makeC2KTarget, [] { return decoderMaterial("c2k"); }},
    {"ifx", makeIFXTarget, [] { return decoderMaterial("ifx"); }, 2048},
    {"same-labels", makeSameLabelsTarget, sameLabelsMaterial, 2048},
    {"template", makeTemplateTarget, templateMaterial, 4096},
    {"frame", makeFrameTarget, frameMaterial},
    {"recording", makeRecordingTarget, recordingMaterial, 1536},
    {"dlf", makeDLFTarget, dlfMaterial},
    {"snapshot", makeSnapshotTarget, snapshotMaterial, 6144},
    {"source-string", makeSourceStringTarget, sourceStringMaterial, 128},
};

} // namespace

std::span<const FuzzTargetKind> fuzzTargets() {
    return kinds;
}

} // namespace velmora
