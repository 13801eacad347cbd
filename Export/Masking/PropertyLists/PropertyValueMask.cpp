// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyValueMask.h"

#include "Export/Masking/PropertyLists/PropertyClass.h"
#include "Export/Masking/PropertyLists/SIMFileBytes.h"
#include "PropertyLists/PropertyListDate.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

namespace {

using enum PropertyForm;

Value dataOf(std::vector<std::uint8_t> bytes) {
    return Value(Data(std::move(bytes)));
}

/// All of the text as a number.
std::optional<std::uint64_t> decimalOf(std::string_view text) {
    std::uint64_t number = 0;
    const auto end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    return result.ec == std::errc() && result.ptr == end ? std::optional(number) : std::nullopt;
}

} // namespace

bool PropertyValueMask::replace(Value& value, Value masked, Masked what) {
    if (masked == value)
        return false;
    _report.add(what);
    value = std::move(masked);
    return true;
}

bool PropertyValueMask::remove(Value& value, Masked what) {
    _report.add(what);
    value = Value();
    return true;
}

bool PropertyValueMask::mask(Value& value, const PropertyContext& context, std::chrono::nanoseconds shift) {
    if (context.form == PropertyForm::Position || context.form == ClockTime)
        return _options.masksTimes() && remove(value, *classOf(context.form));
    switch (value.kind()) {
    case Value::Kind::String: return maskText(value, context);
    case Value::Kind::Integer: return maskInteger(value, context);
    case Value::Kind::Data: return maskData(value, context);
    case Value::Kind::Real: return maskReal(value, context);
    case Value::Kind::Date:
        return context.form == PropertyForm::DateValue || !classOf(context.form)
                   ? maskDate(value, shift)
                   : maskUnexpected(value, context);
    default: return false; // a flag
    }
}

bool PropertyValueMask::maskUnexpected(Value& value, const PropertyContext& context) {
    return classOf(context.form) && !_options.keepsUnknown && remove(value, Masked::UnknownKey);
}

bool PropertyValueMask::maskDate(Value& value, std::chrono::nanoseconds shift) {
    if (!_options.masksTimes())
        return false;
    const Date shifted = *value.asDate() - std::chrono::duration_cast<std::chrono::seconds>(shift);
    return isPropertyListDate(shifted) ? replace(value, Value(shifted), Masked::Times)
                                       : remove(value, Masked::Times);
}

bool PropertyValueMask::maskReal(Value& value, const PropertyContext& context) {
    const double number = *value.asReal();
    if (!classOf(context.form) || number != std::trunc(number) || std::abs(number) >= 1e15)
        return maskUnexpected(value, context);
    Value whole(static_cast<std::int64_t>(number));
    if (!maskInteger(whole, context))
        return false;
    value = whole.isNone() ? Value() : Value(static_cast<double>(*whole.asInteger()));
    return true;
}

bool PropertyValueMask::maskText(Value& value, const PropertyContext& context) {
    const std::string& text = *value.asString();
    const std::optional<Masked> what = classOf(context.form);
    const bool masksIt = !what                       ? _options.masksIdentities()
                         : *what == Masked::Location ? _options.masksAreas()
                                                     : _options.masksIdentities();
    DigitPseudonyms& digits = _pseudonyms.digits;
    const TextPseudonyms& texts = _pseudonyms.texts;
    if (!masksIt && _options.masksAreas()) { // identities have been masked before, the codes in them not
        if (context.form == IMSI)
            return replace(value, digits.networkOfIMSI(text), Masked::Location);
        if (context.form == Personal)
            return replace(value, texts.areas(text), Masked::Location);
    }
    if (!masksIt) {
        // A text may stand for a name or a code at a level that keeps these, but for nothing else.
        return what == Masked::Location && _options.masksIdentities() &&
               replace(value, texts.free(text, false), Masked::NumberInText);
    }
    constexpr std::size_t shortNumber = 6;
    constexpr std::size_t longestGroup = 16;
    switch (context.form) {
    case ICCID: return replace(value, texts.letters(digits.iccid(text)), *what);
    case IMSI: return replace(value, texts.letters(digits.imsi(text)), *what);
    case EID: return replace(value, texts.letters(digits.eid(text)), *what);
    case Phone: return replace(value, texts.letters(digits.phone(text)), *what);
    case ShortNumbers:
        return text.size() > shortNumber && replace(value, texts.letters(digits.phone(text)), *what);
    case PropertyForm::Equipment: return replace(value, texts.otherLetters(digits.equipment(text)), *what);
    case PropertyForm::Address: {
        const std::optional<std::string> address = _pseudonyms.addresses.text(text);
        return replace(value, address ? *address : texts.scrambled(text), *what);
    }
    case Personal: return replace(value, texts.personal(text), *what);
    case Network: return replace(value, texts.network(text), *what);
    case NetworkName: return replace(value, texts.scrambled(text), *what);
    case AreaText: return replace(value, texts.areas(text), *what);
    case Number: return !_options.keepsUnknown && remove(value, Masked::UnknownKey);
    case Group:
        if (text.size() <= longestGroup)
            return false;
        [[fallthrough]];
    case Text:
    case Inner: return replace(value, texts.free(text), Masked::NumberInText);
    default: break;
    }
    // A number as a text.
    const std::optional<std::uint64_t> number = decimalOf(text);
    const std::optional<std::uint64_t> masked = number ? maskedNumber(context, *number) : std::nullopt;
    return replace(value, masked ? std::to_string(*masked) : texts.scrambled(text), *what);
}

std::optional<std::uint64_t> PropertyValueMask::maskedNumber(const PropertyContext& context,
                                                             std::uint64_t number) {
    constexpr unsigned width = 40;
    if (number >> width != 0)
        return std::nullopt;
    NumberPseudonyms& numbers = _pseudonyms.numbers;
    switch (context.form) {
    case CountryCode:
        return numbers.countryCode(static_cast<unsigned>(std::min<std::uint64_t>(number, 1000)));
    case NetworkCode:
        return numbers.networkCode(static_cast<unsigned>(std::min<std::uint64_t>(number, 1000)));
    case LocationArea: return numbers.area(PseudonymKind::LocationArea, number, 16, width);
    case TrackingArea:
        return numbers.area(PseudonymKind::TrackingArea, number, number >> 16 == 0 ? 16 : 24, width);
    case RoutingArea: return numbers.area(PseudonymKind::RoutingArea, number, 8, width);
    case Cell: return numbers.cell(context.cell, number, width);
    case System: return numbers.number(PseudonymKind::System, number, 15, width);
    case NetworkID: return numbers.number(PseudonymKind::Network, number, 16, width);
    case BaseStation: return numbers.number(PseudonymKind::BaseStation, number, 16, width);
    default: return std::nullopt;
    }
}

bool PropertyValueMask::maskInteger(Value& value, const PropertyContext& context) {
    const std::optional<Masked> what = classOf(context.form);
    if (!what || *what == Masked::Times)
        return false;
    const bool isLocation = *what == Masked::Location;
    if (isLocation ? !_options.masksAreas() : !_options.masksIdentities())
        return false;
    const std::int64_t number = *value.asInteger();
    if (number < 0)
        return number != -1 && remove(value, *what); // -1 stands for no value
    if (isLocation) {
        const auto masked = maskedNumber(context, static_cast<std::uint64_t>(number));
        return masked ? replace(value, Value(static_cast<std::int64_t>(*masked)), *what)
                      : remove(value, *what);
    }
    // An identity of digits, without its leading zeros.
    Value digits(std::to_string(number));
    static_cast<void>(maskText(digits, context));
    const auto masked = decimalOf(*digits.asString());
    return masked && *masked < std::uint64_t{1} << 62
               ? replace(value, Value(static_cast<std::int64_t>(*masked)), *what)
               : remove(value, *what);
}

bool PropertyValueMask::maskData(Value& value, const PropertyContext& context) {
    const std::optional<Masked> what = classOf(context.form);
    const Bytes bytes = value.asData()->bytes();
    if (context.form == Group)
        return false;
    if (!what)
        return !_options.keepsUnknown && remove(value, Masked::UnknownKey);
    if (context.form == Personal)
        return replace(value, dataOf(simFileBytes::location(bytes, _options, _pseudonyms)), *what);
    if (*what == Masked::Location ? !_options.masksAreas() : !_options.masksIdentities())
        return false;
    switch (context.form) {
    case ICCID: return replace(value, dataOf(simFileBytes::iccid(bytes, _pseudonyms)), *what);
    case Network: return replace(value, dataOf(simFileBytes::networks(bytes, _pseudonyms)), *what);
    case PropertyForm::Address:
        if (AddressPseudonyms::Version4 four; bytes.size() == four.size()) {
            std::copy(bytes.begin(), bytes.end(), four.begin());
            four = _pseudonyms.addresses.version4(four);
            return replace(value, dataOf({four.begin(), four.end()}), *what);
        }
        if (AddressPseudonyms::Version6 six; bytes.size() == six.size()) {
            std::copy(bytes.begin(), bytes.end(), six.begin());
            six = _pseudonyms.addresses.version6(six);
            return replace(value, dataOf({six.begin(), six.end()}), *what);
        }
        break;
    default: break;
    }
    return replace(value, dataOf(simFileBytes::other(bytes, _pseudonyms)), *what);
}

} // namespace velmora
