// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

namespace velmora::convert {

/// The E-UTRA band that a downlink EARFCN lies in; none where it lies in no band.
[[nodiscard]] Value bandOfEARFCN(const Value& member);

} // namespace velmora::convert
