#include "LogGenerator/C2K/Publisher.h"

#include "LogGenerator/MessageEffects.h"

namespace velmora::C2K {

void Publisher::publish(std::string_view valueKey, const Value& value) const {
    if (_effects)
        _effects->value(valueKey, value);
    const ArrayRef targets = _lookup ? (*_lookup)[valueKey].arrayRef() : nullptr;
    if (!targets)
        return;
    for (const Value& target : *targets) {
        const Dictionary* fields = target.asDictionary();
        const std::string* label = fields ? (*fields)["key"].asString() : nullptr;
        Dictionary* display = fields ? (*fields)["dict"].asDictionary() : nullptr;
        if (!label || !display || display->isFrozen())
            return;
        display->set(*label, value);
    }
}

} // namespace velmora::C2K
