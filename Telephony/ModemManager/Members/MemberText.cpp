// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberText.h"

#include "Platform/DateText.h"
#include "Platform/UTF8.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"

#include <arpa/inet.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <string>

namespace velmora::convert {
namespace {

constexpr std::size_t longestText = 128;
constexpr std::size_t longestList = 100;
/// A value above this in seconds is no plausible date.
constexpr std::int64_t lastDate = 9'000'000'000;

/// A number's text in an enumeration or a mask.
struct Named {
    std::int64_t value;
    std::string_view text;
};

std::string nameIn(const Named* names, std::size_t count, std::int64_t value) {
    const auto* found =
        std::find_if(names, names + count, [value](const Named& each) { return each.value == value; });
    return found == names + count ? std::to_string(value) : std::string(found->text);
}

template <std::size_t count>
Value enumeration(const Named (&names)[count], const Value& member) {
    const std::int64_t* value = member.asInteger();
    return value ? Value(nameIn(names, count, *value)) : Value();
}

/// The names of the bits that are set; none where none of them has a name.
template <std::size_t count>
std::string mask(const Named (&names)[count], std::int64_t bits) {
    std::string text;
    for (const Named& each : names)
        if (bits & each.value) {
            if (!text.empty())
                text += ", ";
            text += each.text;
        }
    return text;
}

constexpr Named modemStates[] = {
    {-1, "Failed"},       {0, "Unknown"},     {1, "Initializing"}, {2, "Locked"},    {3, "Disabled"},
    {4, "Disabling"},     {5, "Enabling"},    {6, "Enabled"},      {7, "Searching"}, {8, "Registered"},
    {9, "Disconnecting"}, {10, "Connecting"}, {11, "Connected"},
};
constexpr Named registrationStates[] = {
    {0, "Idle"},
    {1, "Home"},
    {2, "Searching"},
    {3, "Denied"},
    {4, "Unknown"},
    {5, "Roaming"},
    {6, "Home, SMS only"},
    {7, "Roaming, SMS only"},
    {8, "Emergency only"},
    {9, "Home, CSFB not preferred"},
    {10, "Roaming, CSFB not preferred"},
    {11, "Attached for restricted services"},
};
constexpr Named accessBits[] = {
    {1 << 1, "GSM"},          {1 << 2, "GSM Compact"}, {1 << 3, "GPRS"},         {1 << 4, "EDGE"},
    {1 << 5, "UMTS"},         {1 << 6, "HSDPA"},       {1 << 7, "HSUPA"},        {1 << 8, "HSPA"},
    {1 << 9, "HSPA+"},        {1 << 10, "1xRTT"},      {1 << 11, "EV-DO Rev 0"}, {1 << 12, "EV-DO Rev A"},
    {1 << 13, "EV-DO Rev B"}, {1 << 14, "LTE"},        {1 << 15, "5G NR"},       {1 << 16, "LTE Cat-M"},
    {1 << 17, "NB-IoT"},
};
constexpr Named bearerTypes[] = {{1, "Default"}, {2, "Default, attach"}, {3, "Dedicated"}};
constexpr Named families[] = {{1, "IPv4"}, {2, "IPv6"}, {4, "IPv4v6"}, {8, "Non-IP"}};
constexpr Named methods[] = {{1, "PPP"}, {2, "Static"}, {3, "DHCP"}};

/// With one decimal and a point, whatever the locale says.
Value tenths(const Value& member, double lowest, double highest, std::string_view unit) {
    const auto real = within(member, lowest, highest);
    if (!real)
        return {};
    const long all = std::lround(*real * 10);
    const long size = std::labs(all);
    return (all < 0 ? "-" : "") + std::to_string(size / 10) + '.' + std::to_string(size % 10) +
           std::string(unit);
}

Value withUnit(const Value& member, std::string_view unit, std::int64_t divisor = 1) {
    const std::int64_t* number = member.asInteger();
    return number && *number >= 0 ? Value(std::to_string(*number / divisor) + std::string(unit)) : Value();
}

bool canBeShown(char32_t character) {
    return character >= 0x20 && !(character >= 0x7F && character < 0xA0) && (character & 0xFFFE) != 0xFFFE;
}

} // namespace

Value networkText(const Value& member) {
    const std::string network(networkOf(member));
    return network.empty() ? Value() : Value(network.substr(0, 3) + '-' + network.substr(3));
}

Value preferredNetworks(const Value& member) {
    const Array* entries = member.asArray();
    if (!entries)
        return {};
    std::string list;
    for (std::size_t i = 0; i < std::min(entries->size(), longestList); ++i) {
        const Array* entry = (*entries)[i].asArray();
        if (!entry || entry->size() != 2)
            continue;
        const Value network = networkText((*entry)[0]);
        if (network.isNone())
            continue;
        if (!list.empty())
            list += ", ";
        list += *network.asString();
        const std::int64_t* bits = (*entry)[1].asInteger();
        const std::string technologies = bits ? mask(accessBits, *bits) : std::string();
        if (!technologies.empty())
            list += " (" + technologies + ')';
    }
    return list.empty() ? Value() : Value(list);
}

Value text(const Value& member) {
    const std::string* text = member.asString();
    if (!text || text->empty() || text->size() > longestText)
        return {};
    std::size_t offset = 0;
    while (offset < text->size()) {
        const auto character = nextCharacter(*text, offset);
        if (!character || !canBeShown(*character))
            return {};
    }
    return member;
}

Value textList(const Value& member) {
    const Array* entries = member.asArray();
    if (!entries)
        return {};
    std::string list;
    for (std::size_t i = 0; i < std::min(entries->size(), longestList); ++i)
        if (const Value entry = text((*entries)[i]); !entry.isNone()) {
            if (!list.empty())
                list += ", ";
            list += *entry.asString();
        }
    return list.empty() ? Value() : Value(list);
}

Value digits(const Value& member) {
    const Value shown = text(member);
    return !shown.isNone() && allDigits(*shown.asString()) ? shown : Value();
}

Value internetAddress(const Value& member) {
    const std::string* text = member.asString();
    std::array<unsigned char, sizeof(in6_addr)> bytes{};
    const bool good = text && (::inet_pton(AF_INET, text->c_str(), bytes.data()) == 1 ||
                               ::inet_pton(AF_INET6, text->c_str(), bytes.data()) == 1);
    return good ? member : Value();
}

Value modemState(const Value& member) {
    return enumeration(modemStates, member);
}

Value registrationState(const Value& member) {
    return enumeration(registrationStates, member);
}

Value accessTechnologies(const Value& member) {
    const std::int64_t* bits = member.asInteger();
    const std::string names = bits ? mask(accessBits, *bits) : std::string();
    return names.empty() ? Value() : Value(names);
}

Value bearerState(const Value& member) {
    const bool* connected = member.asBoolean();
    return connected ? Value(*connected ? "Connected" : "Disconnected") : Value();
}

Value bearerType(const Value& member) {
    const std::int64_t* type = member.asInteger();
    return type && *type != 0 ? enumeration(bearerTypes, member) : Value();
}

Value internetFamily(const Value& member) {
    const std::int64_t* bits = member.asInteger();
    const std::string names = bits ? mask(families, *bits) : std::string();
    return names.empty() ? Value() : Value(names);
}

Value configurationMethod(const Value& member) {
    const std::int64_t* method = member.asInteger();
    return method && *method != 0 ? enumeration(methods, member) : Value();
}

Value yesOrNo(const Value& member) {
    const bool* yes = member.asBoolean();
    return yes ? Value(*yes ? "Yes" : "No") : Value();
}

Value numberText(const Value& member) {
    return withUnit(member, "");
}

Value byteCount(const Value& member) {
    return withUnit(member, " bytes");
}

Value seconds(const Value& member) {
    return withUnit(member, " s");
}

Value bitRate(const Value& member) {
    // Where it was not negotiated, ModemManager reports 0.
    const std::int64_t* rate = member.asInteger();
    return rate && *rate > 0 ? withUnit(member, " kbit/s", 1000) : Value();
}

Value dateText(const Value& member) {
    const std::int64_t* date = member.asInteger();
    if (!date || *date <= 0 || *date > lastDate)
        return {};
    return dateDescription(Time(std::chrono::seconds(*date)));
}

Value signalQuality(const Value& member) {
    const Array* pair = member.asArray();
    if (!pair || pair->size() != 2)
        return {};
    const std::int64_t* percent = (*pair)[0].asInteger();
    const bool* recent = (*pair)[1].asBoolean();
    if (!percent || *percent < 0 || *percent > 100 || !recent)
        return {};
    return std::to_string(*percent) + (*recent ? " %" : " % (not recent)");
}

Value powerText(const Value& member) {
    return tenths(member, -200, 50, " dBm");
}

Value ratioText(const Value& member) {
    return tenths(member, -60, 60, " dB");
}

Value percentText(const Value& member) {
    return tenths(member, 0, 100, " %");
}

} // namespace velmora::convert
