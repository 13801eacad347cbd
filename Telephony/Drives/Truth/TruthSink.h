// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthEvent.h"

namespace velmora {

/// Gets what a drive's phone does; what lasts comes when it has ended.
class TruthSink {
public:
    virtual ~TruthSink() = default;
    virtual void happened(const TruthEvent& event) = 0;
};

} // namespace velmora
