// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/TruthSink.h"
#include "Telephony/Drives/UnusualMessages.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

/// Follows the phone of a scenario and passes on what it does, from the phone's own state: no record is ever
/// read. Only the log code of what was sent is used, for when a message could first state it. A technology
/// has one.
class DriveTruth {
public:
    /// The sink must outlive this.
    explicit DriveTruth(TruthSink& sink) : _sink(sink) {}
    virtual ~DriveTruth() = default;
    DriveTruth(const DriveTruth&) = delete;
    DriveTruth& operator=(const DriveTruth&) = delete;

    /// To be called after each step of the drive with the log code of the record that it sent (0xFF0000 added
    /// for the extra stream), absent where it sent none.
    virtual void follow(TruthTime at, std::optional<std::uint32_t> code) = 0;
    /// To be called after each unusual message; `number` counts them from 0.
    virtual void followUnusual(TruthTime at, UnusualMessage kind, std::size_t number);
    /// The drive is over: what still lasts has no end. The default is for what lasts never.
    virtual void finish() {}

protected:
    [[nodiscard]] TruthSink& sink() const { return _sink; }
    /// Passes on something that happened at a moment, with one field; its name must be a constant.
    void tell(TruthTime at, std::string_view kind, std::string_view field, std::string value) const;

private:
    TruthSink& _sink;
};

} // namespace velmora
