// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Navigation/NavigationControllerDelegate.h"

namespace velmora {

void NavigationControllerDelegate::willShowViewController(NavigationController& /*navigationController*/,
                                                          ViewController& /*viewController*/,
                                                          bool /*animated*/) {}

} // namespace velmora
