// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemLogGenerator.h"

#include "LogGenerator/Modem/ModemClassIndex.h"

namespace velmora {

ModemLogGenerator::ModemLogGenerator(const Clock& clock)
    : OstrelLogGenerator2("Modem", std::make_shared<ModemClassIndex>(), clock) {}

std::unique_ptr<ModemLogGenerator> ModemLogGenerator::generator(const Clock& clock) {
    return std::make_unique<ModemLogGenerator>(clock);
}

} // namespace velmora
