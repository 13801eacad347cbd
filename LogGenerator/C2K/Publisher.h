// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/Targets.h"
#include "Platform/Bytes.h"
#include "PropertyLists/Value.h"

#include <string_view>

namespace velmora {
class MessageEffects;
}

namespace velmora::C2K {

/// Puts a parser's values on the screens. A value goes by its value key ("kChannel"); the lookup tells under
/// which labels it is shown (see Targets, which must outlive this).
class Publisher {
public:
    /// `effects`, unless null, is told of every value, shown or not.
    explicit Publisher(Targets& targets, MessageEffects* effects = nullptr)
        : _targets(targets), _effects(effects) {}

    /// Shows the text under every label of the key, in the lookup's order, and tells of it.
    void publish(std::string_view valueKey, std::string_view text) const;

    /// Makes a value of some bytes by a table, which must be a constant.
    using MakeValue = Value (*)(Bytes bytes, const void* table);
    /// As `publish` of `make(bytes, table)`, which is made when somebody looks at the display (see Writing).
    void publishLater(std::string_view valueKey, MakeValue make, const void* table, Bytes bytes) const;

    /// The two halves of `publish`, for any value, and whether there is somebody to be told.
    void tell(std::string_view valueKey, const Value& value) const;
    void show(std::string_view valueKey, const Value& value) const;
    [[nodiscard]] bool tells() const { return _effects != nullptr; }
    [[nodiscard]] Targets& targets() const { return _targets; }

private:
    Targets& _targets;
    MessageEffects* _effects;
};

} // namespace velmora::C2K
