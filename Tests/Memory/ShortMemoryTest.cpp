// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Base.h"
#include "LogGenerator/Fields/DisplayWriter.h"
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

constexpr Field label{"A label that is too long to be kept in place", computed, plainText()};
constexpr Field shortLabel{"Short", computed, integer("%d")};
constexpr List rows{};

void visitTexts(FieldVisitor& visitor, int number) {
    visitor.text(label, longText(number));
    visitor.number(shortLabel, number);
}

/// One row of two texts for each number.
void writeRows(Array& list, DisplayWriter::SpareRows& spare, const std::vector<int>& numbers) {
    DisplayWriter writer(list, spare);
    writer.beginList(rows);
    for (const int number : numbers) {
        writer.beginRow();
        visitTexts(writer, number);
        writer.endRow();
    }
    writer.endList();
}

Value rowsOf(const std::vector<int>& numbers) {
    const ArrayRef list = makeArray();
    DisplayWriter::SpareRows spare;
    writeRows(*list, spare, numbers);
    return list;
}

Value textsOf(int number) {
    const DictionaryRef node = makeDictionary();
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*node, spare);
    visitTexts(writer, number);
    return node;
}

/// Runs `operation` on a fresh `make()` with each of its allocations failing, one after another, checks with
/// `expectWhole` what that has left, and runs it once more. Returns how many allocations there are.
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

void expectNothing(const Value&) {}

TEST(ShortMemoryTest, AListIsWrittenByTheNextAttempt) {
    DisplayWriter::SpareRows spare;
    const auto write = [&spare](const Value& node) { writeRows(*node.asArray(), spare, {1, 2, 3, 4, 5}); };
    const auto make = [&spare] {
        spare.clear();
        return Value(makeArray());
    };
    EXPECT_GT(failEach(make, write, expectNothing, rowsOf({1, 2, 3, 4, 5})), 10u);
}

TEST(ShortMemoryTest, AListWhoseRowsAreFilledAgainIsWrittenByTheNextAttempt) {
    DisplayWriter::SpareRows spare;
    const std::vector<int> later = {100, 101, 102, 103, 104};
    const auto make = [&spare] {
        spare.clear();
        const ArrayRef list = makeArray();
        writeRows(*list, spare, {1, 2, 3, 4});
        writeRows(*list, spare, {1, 2});
        return Value(list);
    };
    const auto write = [&spare, &later](const Value& node) { writeRows(*node.asArray(), spare, later); };
    EXPECT_GT(failEach(make, write, expectNothing, rowsOf(later)), 2u);
}

TEST(ShortMemoryTest, RowsThatAreHeldStayWhatTheyAre) {
    std::vector<Value> held;
    DisplayWriter::SpareRows spare;
    const auto make = [&held, &spare] {
        spare.clear();
        const ArrayRef list = makeArray();
        writeRows(*list, spare, {1, 2, 3});
        held.assign(list->begin(), list->end());
        return Value(list);
    };
    const auto write = [&spare](const Value& node) { writeRows(*node.asArray(), spare, {4, 5, 6}); };
    const auto expectHeld = [&held](const Value&) {
        for (std::size_t i = 0; i < held.size(); ++i)
            EXPECT_EQ(held[i], textsOf(static_cast<int>(i + 1)));
    };
    EXPECT_GT(failEach(make, write, expectHeld, rowsOf({4, 5, 6})), 5u);
}

/// A section of one table that is its texts.
class Texts final : public Base {
public:
    std::string_view getSectionName() const override { return "Texts"; }
    std::span<const View> views() const override {
        static constexpr View all[] = {{1, std::size_t{1}}};
        return all;
    }
    void decode(const View&, const Record& record, FieldVisitor& visitor) const override {
        visitTexts(visitor, record.u8(0));
    }
};

TEST(ShortMemoryTest, ARecordThatCannotBeWrittenYetIsWrittenAtTheNextAttempt) {
    std::unique_ptr<Texts> section;
    const auto make = [&section] {
        section = std::make_unique<Texts>();
        const Value node = makeDictionary();
        section->updateSectionRef(node);
        section->updateWithData(Data(std::vector<std::uint8_t>{7}), 1);
        section->updateWithData(Data(std::vector<std::uint8_t>{123}), 1);
        return node;
    };
    const auto write = [&section](const Value&) { section->writeNode(); };
    EXPECT_GT(failEach(make, write, expectNothing, textsOf(123)), 0u);
}

TEST(ShortMemoryTest, ACopyIsCompleteOrNotMade) {
    Value copy;
    const auto make = [&copy] {
        const DictionaryRef node = makeDictionary();
        node->set("List", rowsOf({1, 2}));
        node->set("Texts", textsOf(9));
        copy = Value(node).copy();
        node->set("List", rowsOf({3, 4, 5}));
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
