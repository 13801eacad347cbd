// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Members/MemberText.h"

#include "LogMessages/LiveModem.h"
#include "Platform/UTF8.h"
#include "Telephony/ModemManager/Members/MemberNumber.h"

#include <arpa/inet.h>

#include <algorithm>
#include <array>
#include <string>

namespace velmora::convert {
namespace {

constexpr std::size_t longestText = 128;
constexpr std::size_t longestList = 100;

bool canBeShown(char32_t character) {
    return character >= 0x20 && !(character >= 0x7F && character < 0xA0) && (character & 0xFFFE) != 0xFFFE;
}

/// The array of what the entries become; none where all are left out.
Value listOf(const Value& member, Value (*convert)(const Value&)) {
    const Array* entries = member.asArray();
    if (!entries)
        return {};
    const ArrayRef list = makeArray();
    for (std::size_t i = 0; i < std::min(entries->size(), longestList); ++i)
        if (Value entry = convert((*entries)[i]); !entry.isNone())
            list->append(std::move(entry));
    return list->empty() ? Value() : Value(list);
}

Value preferredNetwork(const Value& member) {
    const Array* entry = member.asArray();
    if (!entry || entry->size() != 2)
        return {};
    const Value code = network((*entry)[0]);
    if (code.isNone())
        return {};
    const DictionaryRef result = makeDictionary();
    result->set(kVoxSIMOperatorCode, code);
    if (const Value technologies = mask((*entry)[1]); !technologies.isNone())
        result->set(kVoxLinkAccessTechnologies, technologies);
    return result;
}

} // namespace

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
    return listOf(member, text);
}

Value digits(const Value& member) {
    const Value shown = text(member);
    return !shown.isNone() && allDigits(*shown.asString()) ? shown : Value();
}

Value equipment(const Value& member) {
    const Value shown = text(member);
    return !shown.isNone() &&
                   shown.asString()->find_first_not_of("0123456789ABCDEFabcdef") == std::string::npos
               ? shown
               : Value();
}

Value network(const Value& member) {
    const std::string_view code = networkOf(member);
    return code.empty() ? Value() : Value(code);
}

Value preferredNetworks(const Value& member) {
    return listOf(member, preferredNetwork);
}

Value internetAddress(const Value& member) {
    const std::string* text = member.asString();
    std::array<unsigned char, sizeof(in6_addr)> bytes{};
    const bool good = text && (::inet_pton(AF_INET, text->c_str(), bytes.data()) == 1 ||
                               ::inet_pton(AF_INET6, text->c_str(), bytes.data()) == 1);
    return good ? member : Value();
}

Value error(const Value& member) {
    const Array* pair = member.asArray();
    if (!pair || pair->size() != 2)
        return {};
    const Value name = text((*pair)[0]);
    const Value message = text((*pair)[1]);
    if (name.isNone() || message.isNone())
        return name;
    return *name.asString() + ": " + *message.asString();
}

Value bytes(const Value& member) {
    const Data* data = member.asData();
    return data && data->size() > 0 ? member : Value();
}

} // namespace velmora::convert
