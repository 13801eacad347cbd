// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"
#include "Tests/Memory/Allocations.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <memory>
#include <new>
#include <string>
#include <vector>

// Each allocation of an operation on a node fails once: the node then shows what it showed before, or what it
// shows after the operation, and the operation can be repeated.

namespace velmora {
namespace {

std::string longText(int number) {
    return std::string("a text that is too long to be kept in place, number ") + std::to_string(number);
}

/// One row of two texts for each byte.
void appendRows(Array& list, Bytes bytes, const void*) {
    for (const std::uint8_t byte : bytes) {
        Dictionary& row = list.appendRow();
        row.setText("A label that is too long to be kept in place", longText(byte));
        row.setText("Short", std::to_string(byte));
    }
}

Value rowsOf(const std::vector<std::uint8_t>& bytes) {
    const ArrayRef list = makeArray();
    appendRows(*list, bytes, nullptr);
    return list;
}

void setTexts(Dictionary& node, Bytes bytes, const void*) {
    node.setText("A label that is too long to be kept in place", longText(bytes[0]));
    node.setText("Short", std::to_string(bytes[0]));
}

Value textsOf(std::uint8_t byte) {
    const DictionaryRef node = makeDictionary();
    setTexts(*node, std::vector<std::uint8_t>{byte}, nullptr);
    return node;
}

void later(Array& list, const std::vector<std::uint8_t>& bytes) {
    list.writeLater({appendRows, nullptr}, bytes);
}

void later(Dictionary& node, std::uint8_t byte) {
    node.writeLater({setTexts, nullptr}, std::vector<std::uint8_t>{byte});
}

/// Runs `operation` on a fresh `make()` with each of its allocations failing in turn, looks with
/// `expectWhole` at what that has left, and runs it once more. Returns how many allocations there are.
std::uint64_t failEach(const std::function<Value()>& make, const std::function<void(const Value&)>& operation,
                       const std::function<void(const Value&)>& expectWhole, const Value& result) {
    for (std::uint64_t failing = 1;; ++failing) {
        SCOPED_TRACE(failing);
        const Value node = make();
        bool failed = false;
        try {
            const Allocations failingOne(failing);
            operation(node);
        } catch (const std::bad_alloc&) {
            failed = true;
        }
        if (!failed) {
            EXPECT_EQ(node, result);
            return failing - 1;
        }
        expectWhole(node);
        operation(node);
        EXPECT_EQ(node, result);
    }
}

void look(const Value& node) {
    if (const Array* list = node.asArray())
        static_cast<void>(list->size());
    else
        static_cast<void>(node.asDictionary()->size());
}

void expectNothing(const Value&) {}

TEST(ShortMemoryTest, AListThatCannotBeWrittenYetIsWrittenAtTheNextLook) {
    const auto make = [] {
        const ArrayRef list = makeArray();
        later(*list, {1, 2, 3, 4, 5});
        return Value(list);
    };
    EXPECT_GT(failEach(make, look, expectNothing, rowsOf({1, 2, 3, 4, 5})), 10u);
}

TEST(ShortMemoryTest, AListWhoseRowsAreUsedAgainIsWrittenAtTheNextLook) {
    const auto make = [] {
        const ArrayRef list = makeArray();
        later(*list, {1, 2, 3});
        look(list);
        later(*list, {100, 101, 102, 103, 104});
        return Value(list);
    };
    EXPECT_GT(failEach(make, look, expectNothing, rowsOf({100, 101, 102, 103, 104})), 2u);
}

TEST(ShortMemoryTest, RowsThatSomebodyHoldsStayWhatTheyAre) {
    std::vector<Value> held;
    const auto make = [&held] {
        const ArrayRef list = makeArray();
        later(*list, {1, 2, 3});
        held.assign(list->begin(), list->end());
        later(*list, {4, 5, 6});
        return Value(list);
    };
    const auto expectHeld = [&held](const Value&) {
        for (std::size_t i = 0; i < held.size(); ++i)
            EXPECT_EQ(held[i], textsOf(static_cast<std::uint8_t>(i + 1)));
    };
    EXPECT_GT(failEach(make, look, expectHeld, rowsOf({4, 5, 6})), 5u);
}

TEST(ShortMemoryTest, ADictionaryThatCannotBeWrittenYetIsWrittenAtTheNextLook) {
    const auto make = [] {
        const DictionaryRef node = makeDictionary();
        later(*node, 7);
        look(node);
        later(*node, 123);
        return Value(node);
    };
    EXPECT_GT(failEach(make, look, expectNothing, textsOf(123)), 0u);
}

TEST(ShortMemoryTest, ACopyIsWholeOrNotMade) {
    Value copy;
    const auto make = [&copy] {
        const DictionaryRef node = makeDictionary();
        const ArrayRef list = makeArray();
        later(*list, {1, 2});
        look(list);
        node->set("List", list);
        node->set("Texts", textsOf(9));
        copy = Value(node).copy();
        later(*list, {3, 4, 5});
        return Value(node);
    };
    const auto change = [&copy](const Value& node) { copy = node.copy(); };
    const Value before(
        std::make_shared<Dictionary>(Dictionary{{"List", rowsOf({1, 2})}, {"Texts", textsOf(9)}}));
    const Value after(
        std::make_shared<Dictionary>(Dictionary{{"List", rowsOf({3, 4, 5})}, {"Texts", textsOf(9)}}));
    const auto expectBefore = [&](const Value&) { EXPECT_EQ(copy, before); };
    EXPECT_GT(failEach(make, change, expectBefore, after), 2u);
    EXPECT_EQ(copy, after);
}

} // namespace
} // namespace velmora
