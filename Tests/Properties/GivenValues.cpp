// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Properties/GivenValues.h"

#include <chrono>
#include <cmath>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

constexpr int maximumDepth = 3;

std::string encoded(const std::vector<char32_t>& characters) {
    std::string text;
    const auto add = [&text](char32_t bits) { text += static_cast<char>(bits); };
    const auto follow = [&add](char32_t character, int shift) { add(0x80 | (character >> shift & 0x3F)); };
    for (const char32_t character : characters) {
        if (character < 0x80) {
            add(character);
        } else if (character < 0x800) {
            add(0xC0 | character >> 6);
            follow(character, 0);
        } else if (character < 0x10000) {
            add(0xE0 | character >> 12);
            follow(character, 6);
            follow(character, 0);
        } else {
            add(0xF0 | character >> 18);
            follow(character, 12);
            follow(character, 6);
            follow(character, 0);
        }
    }
    return text;
}

/// Characters of XML 1.0 (clause 2.2, "Char"), those that it writes as references among them.
rc::Gen<std::string> anyText() {
    const auto character = rc::gen::weightedOneOf<char32_t>(
        {{8, rc::gen::inRange<char32_t>(0x20, 0x7F)},
         {2, rc::gen::element<char32_t>(U'&', U'<', U'>', U'"', U'\'', U'\t', U'\n', U'\r', U'/')},
         {1, rc::gen::inRange<char32_t>(0x80, 0xD800)},
         {1, rc::gen::inRange<char32_t>(0xE000, 0xFFFE)},
         {1, rc::gen::inRange<char32_t>(0x10000, 0x110000)}});
    return rc::gen::map(rc::gen::container<std::vector<char32_t>>(character), encoded);
}

rc::Gen<double> anyFiniteReal() {
    return rc::gen::suchThat(rc::gen::arbitrary<double>(), [](double real) { return std::isfinite(real); });
}

rc::Gen<Date> anyDate() {
    using namespace std::chrono;
    const std::int64_t first = Date(sys_days{year{1} / January / 1}).time_since_epoch().count();
    const std::int64_t end = Date(sys_days{year{10000} / January / 1}).time_since_epoch().count();
    return rc::gen::map(rc::gen::inRange(first, end), [](std::int64_t at) { return Date(seconds(at)); });
}

rc::Gen<Value> anyScalar() {
    using Payload = std::vector<std::uint8_t>;
    return rc::gen::oneOf(
        rc::gen::map(anyText(), [](std::string text) { return Value(std::move(text)); }),
        rc::gen::map(rc::gen::arbitrary<std::int64_t>(), [](std::int64_t number) { return Value(number); }),
        rc::gen::map(anyFiniteReal(), [](double real) { return Value(real); }),
        rc::gen::map(rc::gen::arbitrary<bool>(), [](bool boolean) { return Value(boolean); }),
        rc::gen::map(anyDate(), [](Date date) { return Value(date); }),
        rc::gen::map(rc::gen::arbitrary<Payload>(),
                     [](Payload bytes) { return Value(Data(std::move(bytes))); }));
}

rc::Gen<Value> listOf(rc::Gen<Value> element) {
    return rc::gen::scale(0.5, rc::gen::map(rc::gen::container<std::vector<Value>>(std::move(element)),
                                            [](const std::vector<Value>& elements) {
                                                const ArrayRef array = makeArray();
                                                for (const Value& each : elements)
                                                    array->append(each);
                                                return Value(array);
                                            }));
}

rc::Gen<Value> dictionaryOf(rc::Gen<Value> element) {
    using Entries = std::vector<std::pair<std::string, Value>>;
    return rc::gen::scale(
        0.5, rc::gen::map(rc::gen::container<Entries>(rc::gen::pair(anyText(), std::move(element))),
                          [](const Entries& entries) {
                              const DictionaryRef dictionary = makeDictionary();
                              for (const auto& [key, each] : entries)
                                  dictionary->set(key, each);
                              return Value(dictionary);
                          }));
}

/// Scalars, and lists and dictionaries that are at most so deep.
rc::Gen<Value> nested(const rc::Gen<Value>& scalar, int depth) {
    if (depth == 0)
        return scalar;
    const rc::Gen<Value> inner = nested(scalar, depth - 1);
    return rc::gen::weightedOneOf<Value>({{3, scalar}, {1, listOf(inner)}, {1, dictionaryOf(inner)}});
}

} // namespace

void showValue(const Value& value, std::ostream& out) {
    const auto text = writeXMLPropertyList(value);
    out << (text ? *text : text.reason());
}

rc::Gen<Value> givenValue() {
    return nested(anyScalar(), maximumDepth);
}

rc::Gen<Value> givenTextTree() {
    const auto text = rc::gen::map(anyText(), [](std::string words) { return Value(std::move(words)); });
    return dictionaryOf(nested(text, maximumDepth - 1));
}

} // namespace velmora
