// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemObjects.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <algorithm>
#include <charconv>
#include <optional>

namespace velmora {
namespace {

constexpr std::string_view known[] = {mm::modem, mm::modem3gpp, mm::modemCdma, mm::location, mm::signal};

/// More than this many properties no interface has.
constexpr std::size_t maximumProperties = 256;

bool isKnown(std::string_view interface) {
    return std::find(std::begin(known), std::end(known), interface) != std::end(known);
}

std::optional<std::uint32_t> indexOf(std::string_view path) {
    if (!path.starts_with(mm::modemPathPrefix))
        return std::nullopt;
    path.remove_prefix(mm::modemPathPrefix.size());
    std::uint32_t index = 0;
    const char* end = path.data() + path.size();
    const auto [stop, error] = std::from_chars(path.data(), end, index);
    if (error != std::errc() || stop != end)
        return std::nullopt;
    return index;
}

/// The argument, or none where there are fewer.
const Value& argument(const Array& arguments, std::size_t index) {
    static const Value none;
    return index < arguments.size() ? arguments[index] : none;
}

} // namespace

const Dictionary& Modem::operator[](std::string_view interface) const {
    static const Dictionary none;
    const auto found = interfaces.find(interface);
    return found == interfaces.end() ? none : *found->second;
}

bool Modem::hasSIM() const {
    const std::string* sim = (*this)[mm::modem]["Sim"].asString();
    return sim && mm::isObject(*sim);
}

void ModemObjects::reset(const Value& objects) {
    clear();
    if (const Dictionary* byPath = objects.asDictionary())
        for (const auto& [path, interfaces] : *byPath)
            put(path, interfaces);
}

void ModemObjects::add(const Array& arguments) {
    if (const std::string* path = argument(arguments, 0).asString())
        put(*path, argument(arguments, 1));
}

void ModemObjects::put(const std::string& path, const Value& interfaces) {
    const auto index = indexOf(path);
    const Dictionary* byName = interfaces.asDictionary();
    if (!index || !byName)
        return;
    const auto place = _modems.find(*index);
    if (place == _modems.end() && (_modems.size() >= maximumModems || !byName->contains(mm::modem)))
        return;
    Modem& modem = _modems[*index];
    modem.path = path;
    modem.index = *index;
    for (const auto& [name, properties] : *byName)
        if (const DictionaryRef read = properties.dictionaryRef(); read && isKnown(name))
            modem.interfaces.insert_or_assign(name, read);
    if (!modem.has(mm::modem))
        _modems.erase(*index);
}

void ModemObjects::remove(const Array& arguments) {
    const std::string* path = argument(arguments, 0).asString();
    const Array* names = argument(arguments, 1).asArray();
    const auto index = path ? indexOf(*path) : std::nullopt;
    const auto modem = index ? _modems.find(*index) : _modems.end();
    if (modem == _modems.end() || !names)
        return;
    for (const Value& each : *names)
        if (const std::string* name = each.asString())
            modem->second.interfaces.erase(*name);
    if (!modem->second.has(mm::modem))
        _modems.erase(modem);
}

void ModemObjects::change(const std::string& path, const Array& arguments) {
    const auto index = indexOf(path);
    const auto modem = index ? _modems.find(*index) : _modems.end();
    const std::string* interface = argument(arguments, 0).asString();
    if (modem == _modems.end() || !interface)
        return;
    if (const auto found = modem->second.interfaces.find(*interface); found != modem->second.interfaces.end())
        applyChange(*found->second, arguments);
}

const Modem* ModemObjects::find(std::string_view path) const {
    const auto index = indexOf(path);
    const auto modem = index ? _modems.find(*index) : _modems.end();
    return modem == _modems.end() ? nullptr : &modem->second;
}

const Modem* ModemObjects::preferred(std::string_view current) const {
    const auto withSIM =
        std::find_if(_modems.begin(), _modems.end(), [](const auto& each) { return each.second.hasSIM(); });
    const Modem* modem = find(current);
    if (modem && (modem->hasSIM() || withSIM == _modems.end()))
        return modem;
    if (withSIM != _modems.end())
        return &withSIM->second;
    return _modems.empty() ? nullptr : &_modems.begin()->second;
}

std::string ModemObjects::indices() const {
    std::string text;
    for (const auto& [index, modem] : _modems)
        text += (text.empty() ? "" : ", ") + std::to_string(index);
    return text;
}

void applyChange(Dictionary& properties, const Array& arguments) {
    if (const Dictionary* changed = argument(arguments, 1).asDictionary())
        for (const auto& [name, value] : *changed)
            if (properties.size() < maximumProperties || properties.contains(name))
                properties.set(name, value);
    if (const Array* untold = argument(arguments, 2).asArray())
        for (const Value& each : *untold)
            if (const std::string* name = each.asString())
                properties.remove(*name);
}

} // namespace velmora
