// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"

#include "Platform/Console.h"

namespace velmora {

LTEClassIndex::~LTEClassIndex() {
    printLine("Deallocing LTEClassIndex");
    releaseSections();
}

} // namespace velmora
