// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/ValueVisitor.h"

#include <string_view>

namespace velmora::C2K {

/// Puts values on the screens. The lookup says under which labels the value of a key is shown: an array of
/// targets, a target being {"key": the label, "dict": the display dictionary that holds it}. A target whose
/// "dict" is no dictionary that can be changed, or whose "key" is no string, ends the array.
class LookupWriter final : public ValueVisitor {
public:
    explicit LookupWriter(const Dictionary& lookup) : _lookup(lookup) {}

private:
    void publishText(std::string_view valueKey, std::string_view text) override;
    void publish(std::string_view valueKey, const Value& value) override;

    /// Calls `put(display, label)` for each target, in the lookup's order.
    template <class Put>
    void forEachTarget(std::string_view valueKey, Put put) const;

    const Dictionary& _lookup;
};

} // namespace velmora::C2K
