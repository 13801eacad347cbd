// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/ApplicationDelegate.h"

namespace velmora {

void ApplicationDelegate::applicationWillTerminate(Application& /*application*/) {}

} // namespace velmora
