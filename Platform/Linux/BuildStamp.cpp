// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/BuildStamp.h"

namespace velmora {

const char* programBuildStamp() {
#ifdef VELMORA_BUILD_STAMP
    return VELMORA_BUILD_STAMP;
#else
    return __DATE__ " " __TIME__;
#endif
}

} // namespace velmora
