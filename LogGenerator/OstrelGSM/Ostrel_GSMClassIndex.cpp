// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"

#include "Platform/Console.h"

namespace velmora {

Ostrel_GSMClassIndex::~Ostrel_GSMClassIndex() {
    printLine("Deallocing Ostrel_GSMClassIndex");
    releaseSections();
}

} // namespace velmora
