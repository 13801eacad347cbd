// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyListMask.h"

#include "Export/Masking/PropertyLists/SIMFileBytes.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyListDate.h"

#include <charconv>
#include <cmath>
#include <string>
#include <vector>

namespace velmora {

namespace {

using enum PropertyForm;

/// What stands in a display for an entry that is not known. Without it a dictionary of two entries would
/// become one of a single entry, which is shown otherwise.
constexpr std::string_view removedText = "(removed)";

/// Whom the value identifies; absent where it is no identity.
std::optional<Masked> classOf(PropertyForm form) {
    switch (form) {
    case ICCID:
    case IMSI:
    case EID:
    case Phone:
    case ShortNumbers:
    case Personal: return Masked::Subscriber;
    case PropertyForm::Equipment: return Masked::Equipment;
    case PropertyForm::Address: return Masked::Address;
    case CountryCode:
    case NetworkCode:
    case Network:
    case NetworkName:
    case AreaText:
    case LocationArea:
    case TrackingArea:
    case RoutingArea:
    case Cell:
    case System:
    case NetworkID:
    case BaseStation: return Masked::Location;
    case PropertyForm::Position: return Masked::Position;
    case ClockTime:
    case PropertyForm::DateValue: return Masked::Times;
    case Number:
    case Text:
    case Inner:
    case Group: break;
    }
    return std::nullopt;
}

CellIdentityForm cellFormOf(const Dictionary& cell, CellIdentityForm otherwise) {
    const std::string* const technology = cell[kVoxCellMonitorCellRadioAccessTechnology].asString();
    if (!technology)
        return otherwise;
    if (technology->ends_with("LTE"))
        return CellIdentityForm::LTE;
    if (technology->ends_with("NR"))
        return CellIdentityForm::NR;
    if (technology->ends_with("UMTS") || technology->ends_with("UTRAN"))
        return CellIdentityForm::UMTS;
    return CellIdentityForm::GSM;
}

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

bool PropertyListMask::mask(Value& root, PropertyListKind kind, std::chrono::nanoseconds shift) {
    _kind = kind;
    _shift = shift;
    const bool isExpected = kind == PropertyListKind::Cells || kind == PropertyListKind::Contexts
                                ? root.asArray() != nullptr
                                : root.asDictionary() != nullptr;
    if (!isExpected && !_options.keepsUnknown) {
        _report.add(Masked::UnknownKey);
        root = Value();
        return true;
    }
    return maskValue(root, {});
}

bool PropertyListMask::replace(Value& value, Value masked, Masked what) {
    if (masked == value)
        return false;
    _report.add(what);
    value = std::move(masked);
    return true;
}

bool PropertyListMask::remove(Value& value, Masked what) {
    _report.add(what);
    value = Value();
    return true;
}

bool PropertyListMask::maskValue(Value& value, const Context& context) {
    if (Dictionary* const dictionary = value.asDictionary())
        return _kind == PropertyListKind::Display ? maskDisplay(*dictionary, context)
                                                  : maskDictionary(*dictionary, context);
    if (Array* const array = value.asArray()) {
        bool changed = false;
        std::vector<Value> kept;
        for (std::size_t i = 0; i < array->size(); ++i) {
            Value& element = array->slot(i);
            changed = maskValue(element, context) || changed;
            if (!element.isNone())
                kept.push_back(element);
        }
        if (kept.size() != array->size()) {
            array->clear();
            for (Value& each : kept)
                array->append(std::move(each));
        }
        return changed;
    }
    const bool isPosition = context.form == PropertyForm::Position || context.form == ClockTime;
    if (isPosition)
        return _options.masksTimes() && remove(value, *classOf(context.form));
    switch (value.kind()) {
    case Value::Kind::String: return maskText(value, context);
    case Value::Kind::Integer: return maskInteger(value, context);
    case Value::Kind::Data: return maskData(value, context);
    case Value::Kind::Real:
        if (const double number = *value.asReal();
            classOf(context.form) && number == std::trunc(number) && std::abs(number) < 1e15) {
            Value whole(static_cast<std::int64_t>(number));
            if (!maskInteger(whole, context))
                return false;
            value = whole.isNone() ? Value() : Value(static_cast<double>(*whole.asInteger()));
            return true;
        }
        break;
    case Value::Kind::Date:
        if (context.form == PropertyForm::DateValue || !classOf(context.form)) {
            if (!_options.masksTimes())
                return false;
            const Date shifted = *value.asDate() - std::chrono::duration_cast<std::chrono::seconds>(_shift);
            return isPropertyListDate(shifted) ? replace(value, Value(shifted), Masked::Times)
                                               : remove(value, Masked::Times);
        }
        break;
    default: return false; // a flag
    }
    // A number with a fraction, or a date, where an identity should be.
    return classOf(context.form) && !_options.keepsUnknown && remove(value, Masked::UnknownKey);
}

bool PropertyListMask::maskDictionary(Dictionary& dictionary, const Context& context) {
    bool changed = false;
    std::vector<std::string> removed;
    const CellIdentityForm cell = cellFormOf(dictionary, context.cell);
    for (std::size_t i = 0; i < dictionary.size(); ++i) {
        const std::string& key = (dictionary.begin() + static_cast<std::ptrdiff_t>(i))->key;
        const std::optional<PropertyForm> own = formOf(_kind, key);
        if (!own) {
            if (!_options.keepsUnknown) {
                _report.add(Masked::UnknownKey);
                removed.push_back(key);
            }
            continue;
        }
        // What stands inside an identity is part of it, unless it is one by itself.
        const bool isInherited = *own == Inner || (classOf(context.form) && !classOf(*own));
        Value& value = dictionary.slot(key);
        changed = maskValue(value, {isInherited ? context.form : *own, cell}) || changed;
        if (value.isNone())
            removed.push_back(key);
    }
    for (const std::string& key : removed)
        dictionary.remove(key);
    return changed || !removed.empty();
}

bool PropertyListMask::maskDisplay(Dictionary& dictionary, const Context& context) {
    bool changed = false;
    Dictionary masked;
    std::size_t removed = 0;
    for (const auto& [key, value] : dictionary) {
        const std::optional<PropertyForm> own = formOf(_kind, key);
        if (!own && !_options.keepsUnknown) {
            const std::string name =
                std::string(removedText) + (removed == 0 ? "" : " " + std::to_string(removed + 1));
            ++removed;
            const std::string* const text = value.asString();
            if (key != name || !text || *text != removedText) {
                _report.add(Masked::UnknownKey);
                changed = true;
            }
            masked.set(name, removedText);
            continue;
        }
        const bool isInherited = !own || *own == Inner || (classOf(context.form) && !classOf(*own));
        Value each = value;
        changed = maskValue(each, {isInherited ? context.form : *own, context.cell}) || changed;
        masked.set(key, each.isNone() ? Value(removedText) : std::move(each));
    }
    if (changed)
        dictionary = std::move(masked);
    return changed;
}

bool PropertyListMask::maskText(Value& value, const Context& context) {
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

std::optional<std::uint64_t> PropertyListMask::maskedNumber(const Context& context, std::uint64_t number) {
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

bool PropertyListMask::maskInteger(Value& value, const Context& context) {
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

bool PropertyListMask::maskData(Value& value, const Context& context) {
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
