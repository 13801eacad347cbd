// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTELogGenerator.h"

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

std::shared_ptr<ClassIndex> createClassIndex() {
    logLine(LogPriority::Error, "Creating LTELogGenerator object");
    return std::make_shared<LTEClassIndex>();
}

} // namespace

LTELogGenerator::LTELogGenerator(const Clock& clock)
    : OstrelLogGenerator2("LTE", createClassIndex(), clock) {}

LTELogGenerator::~LTELogGenerator() {
    // The base class logs another line, with another class's name.
    logFormat(LogPriority::Warning, "LTELogGenerator is destructed %p", static_cast<void*>(this));
}

std::unique_ptr<LTELogGenerator> LTELogGenerator::generator(const Clock& clock) {
    return std::make_unique<LTELogGenerator>(clock);
}

} // namespace velmora
