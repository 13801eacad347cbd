// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemChoice.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <algorithm>
#include <charconv>

namespace velmora {
namespace {

constexpr std::string_view digits = "0123456789";
constexpr std::string_view hexadecimalDigits = "0123456789ABCDEFabcdef";

bool consistsOf(std::string_view text, std::string_view characters) {
    return !text.empty() && text.find_first_not_of(characters) == text.npos;
}

/// An ESN has 8 digits, an MEID 14, and an IMEI 14 to 16.
bool isEquipment(std::string_view text) {
    return consistsOf(text, hexadecimalDigits) &&
           (text.size() == 8 || (text.size() >= 14 && text.size() <= 16));
}

/// An ICCID has 18 to 20 digits; the last may be a filler.
bool isICCID(std::string_view text) {
    return text.size() >= 18 && text.size() <= 20 && consistsOf(text, hexadecimalDigits) &&
           consistsOf(text.substr(0, text.size() - 1), digits);
}

std::optional<std::uint32_t> indexOf(std::string_view text) {
    std::uint32_t index = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, index);
    return error == std::errc() && stop == end ? std::optional(index) : std::nullopt;
}

char upper(char c) {
    return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}

bool same(std::string_view a, std::string_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](char x, char y) { return upper(x) == upper(y); });
}

std::string_view withoutFiller(std::string_view iccid) {
    while (iccid.ends_with('F') || iccid.ends_with('f'))
        iccid.remove_suffix(1);
    return iccid;
}

std::string textOf(const Modem& modem, std::string_view property) {
    const std::string* text = modem[mm::modem][property].asString();
    return text ? *text : std::string();
}

} // namespace

Result<Done> ModemChoice::setModem(std::string_view text) {
    index = indexOf(text);
    if (index)
        return Done{};
    if (text.size() > 1 && text.starts_with('/'))
        path = text;
    else if (isEquipment(text))
        equipment = text;
    else
        return Failure{"wanted the number at the end of its path, its IMEI, or the path of its device"};
    return Done{};
}

Result<Done> ModemChoice::setSIM(std::string_view text) {
    if (!isICCID(text) && !(mm::isObject(text) && text.size() > 1))
        return Failure{"wanted its ICCID of 18 to 20 digits, or the path of its object"};
    sim = text;
    return Done{};
}

std::string ModemChoice::description() const {
    if (!sim.empty())
        return "modem with the chosen SIM";
    if (!equipment.empty())
        return "modem with the chosen identity";
    return index ? "modem " + std::to_string(*index) : "modem at " + path;
}

std::string identityOf(const Modem& modem) {
    std::string equipment = textOf(modem, "EquipmentIdentifier");
    return equipment.empty() ? textOf(modem, "Device") : equipment;
}

bool fits(const ModemChoice& choice, const Modem& modem, std::string_view identity, std::string_view iccid) {
    if (choice.index && (identity.empty() ? modem.index != *choice.index : identityOf(modem) != identity))
        return false;
    if (!choice.equipment.empty() && !same(textOf(modem, "EquipmentIdentifier"), choice.equipment))
        return false;
    if (!choice.path.empty() && choice.path != modem.path && choice.path != textOf(modem, "Device"))
        return false;
    if (choice.sim.empty())
        return true;
    return choice.needsICCID() ? same(withoutFiller(iccid), withoutFiller(choice.sim))
                               : textOf(modem, "Sim") == choice.sim;
}

} // namespace velmora
