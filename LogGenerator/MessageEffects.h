// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

class Base;
class FieldVisitor;

/// Observes what each log message concerned, for tools that show a drive message by message. A decoder calls
/// exactly one of `sections`, `values` and `display` a message, also for a dropped one. Values and nodes are
/// the decoder's own: they change with the next message. Main thread only.
class MessageEffects {
public:
    virtual ~MessageEffects() = default;

    /// The subscribers of the message's code follow, in calling order, each once. The code is the one by
    /// which the record was routed, 0xFF0000 added for the extra stream; absent where the message was
    /// dropped.
    virtual void sections(std::optional<std::uint32_t> code) = 0;
    /// One of them. The default calls `section` with its node, unless it has none.
    virtual void concerned(Base& section);
    /// A section and its node after the message. A section without a node is not reported.
    virtual void section(std::string_view name, const Value& node) = 0;

    /// The values that the message published follow, in publishing order; the code as above.
    virtual void values(std::optional<std::uint32_t> code) = 0;
    /// The visitor to which those values are named, in place of calls of `value`; the default, null, is none.
    [[nodiscard]] virtual FieldVisitor* valueVisitor() { return nullptr; }
    /// A value key and its value, whether or not a label shows it.
    virtual void value(std::string_view key, const Value& value) = 0;

    /// The message concerned the entire display; none where there is none.
    virtual void display(const Value& display) = 0;
};

} // namespace velmora
