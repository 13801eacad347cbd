// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// Is told what one log message concerned, by the decoder that has just decoded it: for tools that show a
/// drive message by message. A message gives exactly one of `sections`, `values` and `display`, by the
/// decoder's kind, also where it was dropped. Values and nodes are the decoder's own: they change with the
/// next message. Main thread only.
class MessageEffects {
public:
    virtual ~MessageEffects() = default;

    /// The sections that want the message's code follow, in calling order, each once. The code is the one by
    /// which the record was routed, 0xFF0000 added for the extra stream; absent where the message was
    /// dropped.
    virtual void sections(std::optional<std::uint32_t> code) = 0;
    /// A section and its node as it stands after the message. A section that the display has no node for is
    /// not told of.
    virtual void section(std::string_view name, const Value& node) = 0;

    /// The values that the message published follow, in publishing order; the code as above.
    virtual void values(std::optional<std::uint32_t> code) = 0;
    /// A value key and its value, whether or not a label shows it.
    virtual void value(std::string_view key, const Value& value) = 0;

    /// The message concerned the display as a whole; none where there is none.
    virtual void display(const Value& display) = 0;
};

} // namespace velmora
