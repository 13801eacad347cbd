// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"

#include <set>

namespace velmora {

/// The packet-data contexts that are up, by number, and what messages have stated of them.
class StatedContexts {
public:
    explicit StatedContexts(TruthSink& sink) : _sink(sink) {}

    /// A message of this moment states that these are up.
    void state(TruthTime at, const std::set<int>& up);
    /// The same for those from 1 to `count`.
    void state(TruthTime at, int count);

private:
    void tell(TruthTime at, std::string_view kind, int number);

    TruthSink& _sink;
    std::set<int> _stated;
};

} // namespace velmora
