// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/FreshValues.h"

#include "Model/VelmoraModelNode.h"

namespace velmora {

void FreshValues::observed(const ObservedMessage& message) {
    for (const Observation& observation : message.observations) {
        if (_latest.size() <= observation.leaf->index)
            _latest.resize(observation.leaf->index + 1);
        _latest[observation.leaf->index] = message.arrival;
    }
}

Value FreshValues::of(const Value& display, const Catalogue& catalogue, Time now) const {
    return display.isNone() ? display : part(display, catalogue.root(), now);
}

bool FreshValues::isFresh(const CatalogueField* leaf, Time now) const {
    return leaf && leaf->index < _latest.size() && _latest[leaf->index] &&
           now - *_latest[leaf->index] <= _maximumAge;
}

Value FreshValues::part(const Value& value, const CatalogueNode& node, Time now) const {
    if (const Dictionary* const dictionary = value.asDictionary()) {
        const bool isSorted = dictionary->contains(sortedMarker); // its keys are entries of a list
        const DictionaryRef result = makeDictionary();
        for (const auto& [key, child] : *dictionary) {
            if (key == sortedMarker) {
                result->set(key, child);
                continue;
            }
            const CatalogueNode* const place = node.find(isSorted ? "*" : std::string_view(key));
            if (Value fresh = place ? part(child, *place, now) : Value(); !fresh.isNone())
                result->set(key, std::move(fresh));
        }
        return result;
    }
    if (const Array* const array = value.asArray()) {
        const ArrayRef result = makeArray();
        const CatalogueNode* const rows = node.find("*");
        for (const Value& row : *array) {
            Value fresh = rows ? part(row, *rows, now) : Value();
            const Dictionary* const fields = fresh.asDictionary();
            if (!fresh.isNone() && !(fields && fields->empty()))
                result->append(std::move(fresh));
        }
        return result;
    }
    return isFresh(node.leaf(), now) ? value : Value();
}

void AgeLimit::watch(LogGenerator& decoder) {
    if (!_maximumAge)
        return;
    const Catalogue& catalogue = decoder.catalogue();
    const auto [entry, isNew] =
        _technologies.try_emplace(catalogue.technology(), Technology{FreshValues(*_maximumAge), &catalogue});
    decoder.setObservationSink(&entry->second.values);
}

Value AgeLimit::fresh(const Decoded& decoded, Time now) const {
    const auto found = _technologies.find(decoded.technology);
    return found == _technologies.end()
               ? decoded.display
               : found->second.values.of(decoded.display, *found->second.catalogue, now);
}

} // namespace velmora
