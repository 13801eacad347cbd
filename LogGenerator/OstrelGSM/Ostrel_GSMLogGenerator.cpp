// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

std::shared_ptr<ClassIndex> createClassIndex() {
    logLine(LogPriority::Error, "Creating Ostrel_GSMLogGenerator object");
    return std::make_shared<Ostrel_GSMClassIndex>();
}

} // namespace

Ostrel_GSMLogGenerator::Ostrel_GSMLogGenerator(const Clock& clock)
    : OstrelLogGenerator2("Ostrel_GSM", createClassIndex(), clock) {}

Ostrel_GSMLogGenerator::~Ostrel_GSMLogGenerator() {
    // The base class logs the same line again.
    logFormat(LogPriority::Warning, "Ostrel_GSMLogGenerator is destructed %p", static_cast<void*>(this));
}

std::unique_ptr<Ostrel_GSMLogGenerator> Ostrel_GSMLogGenerator::generator(const Clock& clock) {
    return std::make_unique<Ostrel_GSMLogGenerator>(clock);
}

} // namespace velmora
