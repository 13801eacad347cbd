// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/DriveTruth.h"

#include <utility>

namespace velmora {
namespace {

/// Empty for one that is well-formed.
std::string_view reasonOf(UnusualMessage kind) {
    switch (kind) {
    case UnusualMessage::Truncated: return "truncated";
    case UnusualMessage::WrongType: return "wrong type";
    case UnusualMessage::BelowMinimum: return "below minimum";
    case UnusualMessage::CountOverrun: return "count overrun";
    case UnusualMessage::Prefixed:
    case UnusualMessage::UnknownCode: break;
    }
    return {};
}

} // namespace

void DriveTruth::followUnusual(TruthTime at, UnusualMessage kind, std::size_t) {
    if (const std::string_view reason = reasonOf(kind); !reason.empty())
        tell(at, "malformed", "reason", std::string(reason));
}

void DriveTruth::tell(TruthTime at, std::string_view kind, std::string_view field, std::string value) const {
    _sink.happened({at, std::nullopt, kind, false, {{field, std::move(value)}}});
}

} // namespace velmora
