// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <map>
#include <string>
#include <string_view>

namespace velmora {

/// A modem as ModemManager describes it: the properties of those of its interfaces that are read here.
struct Modem {
    std::string path;
    std::uint32_t index = 0; ///< the number at the end of its path, by which people call it
    std::map<std::string, DictionaryRef, std::less<>> interfaces;

    /// The properties of an interface; an empty dictionary where the modem has none of that name.
    [[nodiscard]] const Dictionary& operator[](std::string_view interface) const;
    [[nodiscard]] bool has(std::string_view interface) const { return interfaces.contains(interface); }
    [[nodiscard]] bool hasSIM() const;
};

/// The modems that ModemManager's object manager lists, kept up to date by its signals. Other objects and
/// malformed signals are ignored. Main thread only.
class ModemObjects {
public:
    static constexpr std::size_t maximumModems = 32;

    void clear() { _modems.clear(); }
    /// Replaces all modems by the answer of GetManagedObjects.
    void reset(const Value& objects);
    /// The arguments of InterfacesAdded: a path, and properties by interface.
    void add(const Array& arguments);
    /// The arguments of InterfacesRemoved: a path, and names of interfaces. A modem without its main
    /// interface is none.
    void remove(const Array& arguments);
    /// The arguments of an object's PropertiesChanged: an interface, properties, names of properties whose
    /// value is not included.
    void change(const std::string& path, const Array& arguments);

    /// The modem of that path; null where there is none. Valid until the next change.
    [[nodiscard]] const Modem* find(std::string_view path) const;
    /// The modem to follow where none is chosen: `current` while it has a SIM or none has, otherwise the
    /// first with a SIM, otherwise the first. Null where there is none.
    [[nodiscard]] const Modem* preferred(std::string_view current) const;
    /// All of them, by index.
    [[nodiscard]] const std::map<std::uint32_t, Modem>& all() const { return _modems; }
    /// "0, 2"; empty where there is no modem.
    [[nodiscard]] std::string indices() const;

private:
    void put(const std::string& path, const Value& interfaces);

    std::map<std::uint32_t, Modem> _modems; ///< by index
};

/// Takes the arguments of PropertiesChanged, but for the interface, into the properties.
void applyChange(Dictionary& properties, const Array& arguments);

} // namespace velmora
