#pragma once

#include "LogGenerator/NumberFormat.h"
#include "Platform/Value.h"

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
    void publish(std::string_view valueKey, const NumberText& number) const {
        publish(valueKey, Value(number.text()));
    }

private:
    const Dictionary* _lookup;
    MessageEffects* _effects;
};

} // namespace velmora::C2K
