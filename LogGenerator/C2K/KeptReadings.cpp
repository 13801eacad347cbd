// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/KeptReadings.h"

#include "LogGenerator/C2K/LookupWriter.h"

namespace velmora::C2K {

KeptReadings::KeptReadings()
    : _records(logCodeParsers().size() * Reading::mostParts),
      _numbers(logCodeParsers().size() * Reading::mostParts), _isKept(logCodeParsers().size(), true),
      _changes(logCodeParsers().size()) {}

void KeptReadings::use(const DictionaryRef& lookup) {
    // A new lookup may have the address of one that was destroyed, so that the address alone does not
    // identify it.
    if (lookup.get() == _used && !_lookup.owner_before(lookup) && !lookup.owner_before(_lookup))
        return;
    write();
    _records.clear();
    _lookup = lookup;
    _used = lookup.get();
}

void KeptReadings::keep(const LogCodeParser& parser, const Reading& reading) {
    const std::size_t index = indexOf(parser);
    if (_lookup.expired() || !_isKept[index])
        return;
    ++_changes[index];
    const std::size_t first = index * Reading::mostParts;
    bool isNew = false;
    for (std::size_t part = 0; part < Reading::mostParts; ++part) {
        if ((reading.parts >> part & 1) == 0)
            continue;
        _numbers[first + part] = reading.number;
        isNew = _records.keep(first + part, reading.record.bytes(), 1) || isNew;
    }
    if (isNew)
        write();
}

void KeptReadings::write() {
    const std::shared_ptr<const Dictionary> lookup = _lookup.lock();
    if (!lookup)
        return;
    LookupWriter writer(*lookup);
    _records.writeAll([this, &writer](std::size_t index, Bytes bytes) {
        const Reading reading{Record(bytes), _numbers[index], 1U << index % Reading::mostParts};
        logCodeParsers()[index / Reading::mostParts]->decode(reading, writer);
    });
}

} // namespace velmora::C2K
