// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"
#include "Tests/PropertyLists/PropertyListSamples.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {
namespace {

using Kind = Value::Kind;

std::vector<std::string> keysOf(const Dictionary& dictionary) {
    std::vector<std::string> keys;
    for (const auto& entry : dictionary)
        keys.push_back(entry.key);
    return keys;
}

TEST(Value, HasItsKindAndConvertsNothing) {
    const struct {
        Value value;
        Kind kind;
        std::string name;
    } cases[] = {
        {Value(), Kind::None, "none"},
        {"text", Kind::String, "string"},
        {std::string("text"), Kind::String, "string"},
        {std::string_view("text"), Kind::String, "string"},
        {5, Kind::Integer, "integer"},
        {std::uint8_t{5}, Kind::Integer, "integer"},
        {5.0, Kind::Real, "real"},
        {true, Kind::Boolean, "boolean"},
        {Date(), Kind::Date, "date"},
        {Data(), Kind::Data, "data"},
        {makeArray(), Kind::Array, "array"},
        {makeDictionary(), Kind::Dictionary, "dictionary"},
    };
    for (const auto& [value, kind, name] : cases) {
        EXPECT_EQ(nameOf(value.kind()), name);
        EXPECT_EQ(value.kind(), kind);
        EXPECT_EQ(value.isNone(), kind == Kind::None);
        EXPECT_EQ(value.asString() != nullptr, kind == Kind::String);
        EXPECT_EQ(value.asInteger() != nullptr, kind == Kind::Integer);
        EXPECT_EQ(value.asReal() != nullptr, kind == Kind::Real);
        EXPECT_EQ(value.asBoolean() != nullptr, kind == Kind::Boolean);
        EXPECT_EQ(value.asDate() != nullptr, kind == Kind::Date);
        EXPECT_EQ(value.asData() != nullptr, kind == Kind::Data);
        EXPECT_EQ(value.asArray() != nullptr, kind == Kind::Array);
        EXPECT_EQ(value.asDictionary() != nullptr, kind == Kind::Dictionary);
    }
}

TEST(Value, NullReferencesAreNone) {
    EXPECT_TRUE(Value(ArrayRef()).isNone());
    EXPECT_TRUE(Value(DictionaryRef()).isNone());
}

TEST(Value, CopyingSharesContainersAndCopyDoesNot) {
    const auto inner = makeArray();
    const auto dictionary = makeDictionary();
    dictionary->set("inner", inner);
    const Value original = dictionary;
    const Value shared = original; // NOLINT(performance-unnecessary-copy-initialization) what is tested
    const Value copied = original.copy();

    inner->append(1);
    EXPECT_EQ(shared, dictionaryOf({{"inner", arrayOf({1})}}));
    EXPECT_EQ(copied, dictionaryOf({{"inner", arrayOf({})}}));
    EXPECT_EQ(shared.asDictionary(), dictionary.get());
}

TEST(Value, CopiesAreFrozenThroughout) {
    const Value copied = dictionaryOf({{"list", arrayOf({1})}}).copy();
    Dictionary& dictionary = *copied.asDictionary();
    EXPECT_TRUE(dictionary.isFrozen());
    EXPECT_THROW(dictionary.set("k", 1), std::logic_error);
    EXPECT_THROW(dictionary.setText("list", "x"), std::logic_error);
    EXPECT_THROW(dictionary.remove("list"), std::logic_error);
    Array& array = *dictionary["list"].asArray();
    EXPECT_TRUE(array.isFrozen());
    EXPECT_THROW(array.append(2), std::logic_error);
    EXPECT_THROW(array.clear(), std::logic_error);
    EXPECT_THROW(array.removeFirst(1), std::logic_error);
    EXPECT_EQ(copied.copy().asDictionary(), &dictionary) << "a copy of a frozen value is the value itself";
    EXPECT_EQ(copied, dictionaryOf({{"list", arrayOf({1})}}));
}

TEST(Value, SetTextMakesAString) {
    Value value = 5;
    value.setText("five");
    EXPECT_EQ(value, Value("five"));
    value.setText("six");
    EXPECT_EQ(value, Value("six"));
}

TEST(Value, EqualityIsDeepAndKeepsKindsApart) {
    EXPECT_EQ(arrayOf({1, "a", arrayOf({})}), arrayOf({1, "a", arrayOf({})}));
    EXPECT_NE(arrayOf({1, 2}), arrayOf({2, 1}));
    EXPECT_NE(arrayOf({1}), arrayOf({1, 1}));
    EXPECT_EQ(dictionaryOf({{"a", 1}, {"b", 2}}), dictionaryOf({{"b", 2}, {"a", 1}}));
    EXPECT_NE(dictionaryOf({{"a", 1}}), dictionaryOf({{"a", 1}, {"b", 2}}));
    EXPECT_NE(dictionaryOf({{"a", 1}}), dictionaryOf({{"b", 1}}));
    EXPECT_NE(Value(1), Value(1.0));
    EXPECT_NE(Value(1), Value(true));
    EXPECT_NE(Value(""), Value());
    EXPECT_EQ(dataOf({1, 2}), Value(Data(std::vector<std::uint8_t>{0, 1, 2}).from(1)));
}

TEST(Array, RemovesFromItsFront) {
    Array array{1, 2, 3};
    array.removeFirst(2);
    ASSERT_EQ(array.size(), 1U);
    EXPECT_EQ(array[0], Value(3));
    array.removeFirst(5);
    EXPECT_TRUE(array.empty());
}

TEST(Dictionary, KeepsTheOrderInWhichKeysWereFirstSet) {
    Dictionary dictionary{{"b", 1}, {"a", 2}, {"b", 3}};
    dictionary.set("c", 4);
    dictionary.set("a", 5);
    EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"b", "a", "c"}));
    EXPECT_EQ(dictionary["b"], Value(3));
    EXPECT_EQ(dictionary["a"], Value(5));
    EXPECT_TRUE(dictionary["absent"].isNone());
    EXPECT_EQ(dictionary.find("absent"), nullptr);
}

// Look-up changes its way as the number of keys grows and shrinks; nothing of that may show.
TEST(Dictionary, FindsEveryKeyAtEverySize) {
    Dictionary dictionary;
    std::vector<std::string> keys;
    for (int i = 0; i < 40; ++i) {
        keys.push_back("key " + std::to_string(i));
        dictionary.set(keys.back(), i);
        for (int j = 0; j <= i; ++j)
            ASSERT_EQ(dictionary["key " + std::to_string(j)], Value(j)) << i;
        ASSERT_FALSE(dictionary.contains("key " + std::to_string(i + 1)));
    }
    for (int i = 0; i < 40; i += 2) {
        ASSERT_TRUE(dictionary.remove("key " + std::to_string(i)));
        ASSERT_FALSE(dictionary.remove("key " + std::to_string(i)));
        keys.erase(std::find(keys.begin(), keys.end(), "key " + std::to_string(i)));
        ASSERT_EQ(keysOf(dictionary), keys);
        for (int j = 0; j < 40; ++j)
            ASSERT_EQ(dictionary.contains("key " + std::to_string(j)), j > i || j % 2 == 1) << i << " " << j;
    }
    dictionary.setText("key 1", "text");
    EXPECT_EQ(dictionary["key 1"], Value("text"));
}

TEST(Data, PartsShareTheBuffer) {
    const Data whole(std::vector<std::uint8_t>{1, 2, 3});
    const Data part = whole.from(1);
    EXPECT_EQ(part.bytes().data(), whole.bytes().data() + 1);
    EXPECT_EQ(part.size(), 2U);
    EXPECT_TRUE(whole.from(3).empty());
    EXPECT_TRUE(whole.from(100).empty());
    EXPECT_EQ(Data::copyOf(part.bytes()), part);
    EXPECT_NE(Data::copyOf(part.bytes()).bytes().data(), part.bytes().data());
}

TEST(Dictionary, SlotsInOrderReplaceWhatStoodThere) {
    Dictionary dictionary{{"A", 1}, {"B", 2}, {"C", 3}};
    dictionary.slotAt(0, "A").setText("a");
    EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"A", "B", "C"}));
    dictionary.slotAt(1, "C").setText("c");
    EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"A", "C"}));
    dictionary.slotAt(2, "D") = 4;
    EXPECT_EQ(dictionary["A"], Value("a"));
    EXPECT_EQ(dictionary["C"], Value("c"));
    EXPECT_EQ(dictionary["D"], Value(4));
    dictionary.truncate(1);
    EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"A"}));
    dictionary.truncate(5);
    EXPECT_EQ(dictionary.size(), 1u);
    const Value copy = Value(std::make_shared<Dictionary>(dictionary)).copy();
    EXPECT_THROW(static_cast<void>(copy.asDictionary()->slotAt(0, "A")), std::logic_error);
    EXPECT_THROW(copy.asDictionary()->truncate(0), std::logic_error);
}

TEST(Dictionary, ManySlotsInOrderAreFound) {
    Dictionary dictionary;
    for (int round = 0; round < 2; ++round) {
        for (std::size_t i = 0; i < 40; ++i)
            dictionary.slotAt(i, "key " + std::to_string(i)).setText(std::to_string(round));
        for (int i = 0; i < 40; ++i)
            EXPECT_EQ(dictionary["key " + std::to_string(i)], Value(std::to_string(round)));
        EXPECT_FALSE(dictionary.contains("key 40"));
    }
    dictionary.truncate(20);
    EXPECT_TRUE(dictionary.contains("key 19"));
    EXPECT_FALSE(dictionary.contains("key 20"));
}

// A key is looked for first where the one set before it ended; that is no more than a guess.
TEST(Dictionary, KeysAreFoundInWhateverOrderTheyAreSet) {
    Dictionary dictionary{{"A", 1}, {"B", 2}, {"C", 3}};
    for (const char* key : {"C", "A", "B", "B", "A", "C", "C", "B", "A"}) {
        dictionary.setText(key, key);
        EXPECT_EQ(dictionary[key], Value(key));
    }
    EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"A", "B", "C"}));
    dictionary.set("B", 1);
    dictionary.remove("C");
    dictionary.set("C", 2);
    dictionary.set("A", 3);
    EXPECT_EQ(dictionary.size(), 3u);
    EXPECT_EQ(dictionary["C"], Value(2));
}

TEST(Array, SlotsInOrderGrowIt) {
    Array array{1, 2, 3};
    array.slot(1) = "two";
    array.slot(3) = 4;
    ASSERT_EQ(array.size(), 4U);
    EXPECT_EQ(array[1], Value("two"));
    EXPECT_EQ(array[3], Value(4));
    array.truncate(1);
    EXPECT_EQ(array.size(), 1U);
    array.truncate(7);
    EXPECT_EQ(array.size(), 1U);
    const Value copy = Value(std::make_shared<Array>(array)).copy();
    EXPECT_THROW(static_cast<void>(copy.asArray()->slot(0)), std::logic_error);
    EXPECT_THROW(copy.asArray()->truncate(0), std::logic_error);
}

TEST(Value, KnowsWhetherItIsTheOnlyReference) {
    Value list = makeArray();
    EXPECT_TRUE(list.isOnlyReference());
    const Value another = list;
    EXPECT_FALSE(list.isOnlyReference());
    EXPECT_TRUE(Value(makeDictionary()).isOnlyReference());
    EXPECT_FALSE(Value("text").isOnlyReference());
}

} // namespace
} // namespace velmora
