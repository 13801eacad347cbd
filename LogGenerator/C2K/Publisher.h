#pragma once

#include "LogGenerator/NumberFormat.h"
#include "Platform/Bytes.h"
#include "Platform/Value.h"

#include <concepts>
#include <string_view>

namespace velmora {
class MessageEffects;
}

namespace velmora::C2K {

/// Puts a parser's values on the screens. A value goes by its value key ("kChannel"); the lookup tells under
/// which labels it is shown: value key to array of targets, a target being {"key": the label, "dict": the
/// display dictionary that holds it}. Refers to the lookup, which must outlive it.
class Publisher {
public:
    /// Without a lookup nothing is shown anywhere. `effects`, unless null, is told of every value, shown or
    /// not.
    explicit Publisher(const Dictionary* lookup, MessageEffects* effects = nullptr)
        : _lookup(lookup), _effects(effects) {}

    /// Shows the value under every label of the key, in the lookup's order. A target whose "dict" is no
    /// dictionary that can be changed, or whose "key" is no string, ends it: the targets behind it keep what
    /// they show.
    void publish(std::string_view valueKey, const Value& value) const;
    void publish(std::string_view valueKey, const std::convertible_to<std::string_view> auto& text) const {
        publishText(valueKey, text);
    }
    void publish(std::string_view valueKey, const NumberText& number) const {
        publish(valueKey, number.text());
    }

    /// Makes a value of some bytes by a table, which must be a constant.
    using MakeValue = Value (*)(Bytes bytes, const void* table);
    /// As `publish` of `make(bytes, table)`, which is made when somebody looks at the display (see Writing).
    void publishLater(std::string_view valueKey, MakeValue make, const void* table, Bytes bytes) const;

private:
    void publishText(std::string_view valueKey, std::string_view text) const;
    /// Calls `show(display, label)` for each target of the key.
    template <class Show>
    void forEachTarget(std::string_view valueKey, Show show) const;

    const Dictionary* _lookup;
    MessageEffects* _effects;
};

} // namespace velmora::C2K
