// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Base.h"

#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::Pair;

constexpr Field oneByte[] = {{"Value", u8At(0), integer("%d")}};
constexpr Layout entry = layout(1, oneByte);
constexpr List rows{};

/// A section whose code 1 is a table, whose other codes show the record as a list, and whose records of code
/// 2 have the parts that their first byte says.
class Probe final : public Base {
public:
    Probe(std::string name, const std::vector<std::uint32_t>& codes) : _name(std::move(name)) {
        for (const std::uint32_t code : codes)
            _views.push_back(code == 1 ? View(code, entry) : View(code, std::size_t{0}));
    }
    std::string_view getSectionName() const override { return _name; }
    std::span<const View> views() const override { return _views; }
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const override {
        static constexpr Field low{"Low", computed, integer("%d")};
        static constexpr Field high{"High", computed, integer("%d")};
        if (view.code == 2) {
            if ((record.u8(0) & 1) != 0)
                visitor.number(low, record.u8(1));
            if ((record.u8(0) & 2) != 0)
                visitor.number(high, record.u8(1));
        } else if (view.table) {
            Base::decode(view, record, visitor);
        } else {
            visitor.rows(rows, CountedList(record, 0, 1, record.size()), entry);
        }
    }

    using Base::reportMissingEntries;

private:
    KeptRecords::Parts partsOf(const View& view, const Record& record) const override {
        return view.code == 2 ? record.u8(0) : 1;
    }

    std::string _name;
    std::vector<View> _views;
};

TEST(BaseTest, RegistersUnderItsNameAndEachCode) {
    ClassDictionary classes;
    CodeDictionary codes;
    const CapturedLog log;
    Probe probe("RRC Info", {0xD0E0, 0xFF0000});
    EXPECT_EQ(probe.initWithDict(classes, codes), &probe);
    EXPECT_THAT(classes, ElementsAre(Pair("RRC Info", &probe)));
    EXPECT_THAT(codes,
                ElementsAre(Pair("16711680", ElementsAre(&probe)), Pair("53472", ElementsAre(&probe))));
    EXPECT_THAT(log.lines(), ElementsAre(CapturedLog::Line{LogPriority::Warning, "Array Count: 2"}));
}

TEST(BaseTest, SubscribersAreInOrderOfRegistration) {
    ClassDictionary classes;
    CodeDictionary codes;
    Probe second("B", {7});
    Probe first("A", {7, 7}); // a code listed twice is subscribed twice
    second.initWithDict(classes, codes);
    first.initWithDict(classes, codes);
    EXPECT_THAT(codes["7"], ElementsAre(&second, &first, &first));
}

TEST(BaseTest, SecondSectionOfANameReplacesTheFirst) {
    ClassDictionary classes;
    CodeDictionary codes;
    Probe first("A", {1});
    Probe second("A", {1});
    first.initWithDict(classes, codes);
    second.initWithDict(classes, codes);
    EXPECT_THAT(classes, ElementsAre(Pair("A", &second)));
    EXPECT_THAT(codes["1"], ElementsAre(&first, &second));
}

TEST(BaseTest, NodeIsReferredToNotOwned) {
    Probe probe("RRC Info", {1});
    const CapturedLog log;
    DictionaryRef node = makeDictionary();
    probe.updateSectionRef(node);
    EXPECT_THAT(log.lines(), ElementsAre(CapturedLog::Line{LogPriority::Warning, "RRC Info"}));
    EXPECT_EQ(probe.node().asDictionary(), node.get());
    node.reset();
    EXPECT_TRUE(probe.node().isNone());
    probe.updateWithData(hex("09"), 1); // goes nowhere
    EXPECT_TRUE(probe.node().isNone());
}

TEST(BaseTest, ARecordWithoutANodeIsNotShownLater) {
    Probe probe("X", {1});
    probe.updateWithData(hex("09"), 1);
    probe.updateSectionRef("a string is no node");
    probe.updateWithData(hex("09"), 1);
    const DictionaryRef node = makeDictionary();
    probe.updateSectionRef(node);
    EXPECT_TRUE(probe.node().asDictionary()->empty());
}

TEST(BaseTest, LatestRecordIsWrittenWhenTheNodeIsAskedFor) {
    Probe probe("X", {1});
    const DictionaryRef node = makeDictionary();
    probe.updateSectionRef(node);
    probe.updateWithData(hex("01"), 1); // settles the order of the keys
    EXPECT_EQ((*node)["Value"], Value("1"));
    probe.updateWithData(hex("02"), 1);
    probe.updateWithData(hex("03"), 1);
    EXPECT_EQ((*node)["Value"], Value("1"));
    EXPECT_EQ((*probe.node().asDictionary())["Value"], Value("3"));
    EXPECT_EQ((*node)["Value"], Value("3"));
}

TEST(BaseTest, ANodeGetsItsRecordsBeforeAnotherTakesItsPlace) {
    Probe probe("X", {1});
    const DictionaryRef first = makeDictionary();
    const DictionaryRef second = makeDictionary();
    probe.updateSectionRef(first);
    probe.updateWithData(hex("01"), 1);
    probe.updateWithData(hex("02"), 1);
    probe.updateSectionRef(second);
    EXPECT_EQ((*first)["Value"], Value("2"));
    EXPECT_TRUE(probe.node().asDictionary()->empty());
    probe.updateWithData(hex("03"), 1);
    EXPECT_EQ((*second)["Value"], Value("3"));
}

TEST(BaseTest, ARecordThatLacksPartsDoesNotReplaceOneThatHasThem) {
    Probe probe("X", {2});
    const DictionaryRef node = makeDictionary();
    probe.updateSectionRef(node);
    probe.updateWithData(hex("03 01"), 2);
    probe.updateWithData(hex("03 02"), 2);
    probe.updateWithData(hex("02 03"), 2);
    const Dictionary& shown = *probe.node().asDictionary();
    EXPECT_EQ(shown["Low"], Value("2"));
    EXPECT_EQ(shown["High"], Value("3"));
}

TEST(BaseTest, OfAListTheLatestRecordCountsWhateverItsCode) {
    Probe probe("X", {3, 4});
    const ArrayRef node = makeArray();
    probe.updateSectionRef(node);
    for (const std::uint32_t code : {3U, 4U}) // both have been written once
        probe.updateWithData(hex("00"), code);
    probe.updateWithData(hex("01 02"), 3);
    probe.updateWithData(hex("05"), 4);
    ASSERT_EQ(probe.node().asArray()->size(), 1U);
    EXPECT_EQ((*(*node)[0].asDictionary())["Value"], Value("5"));
}

TEST(BaseTest, ArraysAreRewrittenInPlace) {
    const ArrayRef node = std::make_shared<Array>(std::initializer_list<Value>{"old", "older"});
    Base::replaceArray(*node, Array{"new"});
    EXPECT_EQ(*node->begin(), Value("new"));
    EXPECT_EQ(node->size(), 1u);
    Base::replaceArray(*node, Array());
    EXPECT_TRUE(node->empty());
    Base::replaceArray(*node, Array{"x"});
    Base::clearElementsInArray(*node);
    EXPECT_TRUE(node->empty());
}

TEST(BaseTest, MissingEntriesAreReported) {
    const CapturedLog log;
    const Data data = hex("05 06");
    const Probe probe("X", {1});
    probe.reportMissingEntries(CountedList(Record(data), 0, 1, 2), 0x7150);
    EXPECT_THAT(log.lines(), ElementsAre());
    probe.reportMissingEntries(CountedList(Record(data), 0, 1, 3), 0x7150);
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Error, "Record 0x7150: 2 of 3 entries"}));
}

TEST(BaseTest, ShortRecordsAndUnknownCodesLeaveTheNodeAlone) {
    Probe probe("X", {1});
    const DictionaryRef node = makeDictionary();
    probe.updateSectionRef(node);
    const CapturedLog log;
    probe.updateWithData(Data(), 1);
    probe.updateWithData(hex("09"), 7);
    EXPECT_TRUE(probe.node().asDictionary()->empty());
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Warning, "X"},
                            CapturedLog::Line{LogPriority::Warning, "X"},
                            CapturedLog::Line{LogPriority::Error, "Received an unknown log message: 7"}));
}

struct EcNo {
    std::uint32_t value;
    int dB;
};

class LookUpECNOTest : public testing::TestWithParam<EcNo> {};

TEST_P(LookUpECNOTest, GivesWholeDecibels) {
    EXPECT_EQ(Base::lookUpECNO(GetParam().value), GetParam().dB);
}

// Each row of the table just above its threshold, and the threshold itself, which belongs to the next row.
INSTANTIATE_TEST_SUITE_P(
    Rows, LookUpECNOTest,
    testing::Values(EcNo{0xFFFFFFFF, 0}, EcNo{524289, 0}, EcNo{524288, 0}, EcNo{524287, -1}, EcNo{417648, -1},
                    EcNo{417647, -2}, EcNo{331809, -2}, EcNo{331808, -3}, EcNo{263625, -3}, EcNo{263624, -4},
                    EcNo{209464, -4}, EcNo{209463, -5}, EcNo{166442, -5}, EcNo{166441, -6}, EcNo{132269, -6},
                    EcNo{132268, -7}, EcNo{105124, -7}, EcNo{105123, -8}, EcNo{83563, -8}, EcNo{83562, -9},
                    EcNo{66436, -9}, EcNo{66435, -10}, EcNo{52831, -10}, EcNo{52830, -11}, EcNo{42024, -11},
                    EcNo{42023, -12}, EcNo{33441, -12}, EcNo{33440, -13}, EcNo{26622, -13}, EcNo{26621, -14},
                    EcNo{21206, -14}, EcNo{21205, -15}, EcNo{16904, -15}, EcNo{16903, -16}, EcNo{13487, -16},
                    EcNo{13486, -17}));
INSTANTIATE_TEST_SUITE_P(LowRows, LookUpECNOTest,
                         testing::Values(EcNo{10772, -17}, EcNo{10771, -18}, EcNo{8616, -18}, EcNo{8615, -19},
                                         EcNo{6903, -19}, EcNo{6902, -20}, EcNo{5543, -20}, EcNo{5542, -21},
                                         EcNo{4462, -21}, EcNo{4461, -22}, EcNo{3604, -22}, EcNo{3603, -23},
                                         EcNo{2922, -23}, EcNo{2921, -24}, EcNo{2241, -24}, EcNo{2240, -25},
                                         EcNo{1950, -25}, EcNo{1949, -26}, EcNo{1608, -26}, EcNo{1607, -27},
                                         EcNo{1337, -27}, EcNo{1336, -28}, EcNo{1121, -28}, EcNo{1120, -29},
                                         EcNo{950, -29}, EcNo{949, -30}, EcNo{814, -30}, EcNo{813, -31},
                                         EcNo{757, -31}, EcNo{756, -31}, EcNo{706, -31}, EcNo{705, 0},
                                         EcNo{1, 0}, EcNo{0, 0}));

} // namespace
} // namespace velmora
