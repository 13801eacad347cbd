// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <deque>
#include <optional>
#include <stdexcept>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// Rules over messages that are made of observations.
class RuleDetectorTest : public testing::Test {
public: // the calls of a message are chained
    void use(const std::string& technology, const std::string& rules) {
        _catalogue = &ShippedCatalogues::instance().of(technology);
        _detector = makeRuleDetector(ruleSet(rules), *_catalogue);
        _picture.emplace(*_catalogue);
    }
    static std::string rule(const std::string& name, const std::string& when) {
        return "[[rule]]\nname = \"" + name + "\"\ntext = \"\"\nwhen = \"" + when + "\"\n";
    }

    RuleDetectorTest& number(std::string_view path, double value,
                             const std::vector<std::uint32_t>& rows = {}) {
        Observation& each = observe(path, ObservedKind::Number, rows);
        each.number = value;
        return *this;
    }
    /// A cell of LTE with its level, as a report of its measurement has it.
    RuleDetectorTest& level(double dBm) {
        const std::string section = "/Serving Cell/Serving Cell Measurements/";
        return number(section + "E-ARFCN", 6300)
            .number(section + "Physical Cell ID", 62)
            .number(section + "Measured RSRP", dBm);
    }
    RuleDetectorTest& enumeration(std::string_view path, std::int64_t raw, const char* text) {
        Observation& each = observe(path, ObservedKind::Enumeration, {});
        each.raw = raw;
        each.given = text;
        return *this;
    }
    RuleDetectorTest& flag(std::string_view path, bool value) {
        observe(path, ObservedKind::Flag, {}).raw = value ? 1 : 0;
        return *this;
    }
    RuleDetectorTest& absent(std::string_view path) {
        observe(path, ObservedKind::Absent, {});
        return *this;
    }
    RuleDetectorTest& removed(std::string_view path) {
        _removed.push_back(&leaf(path));
        return *this;
    }
    /// The list that the path is in has been replaced.
    RuleDetectorTest& list(std::string_view path, std::uint32_t rows) {
        _lists.push_back({leaf(path).node->parent()->parent(), rows});
        return *this;
    }
    void send(double seconds) {
        constexpr std::uint32_t code = 0xB17F; // of any record; a message without one is malformed
        const ObservedMessage message{++_number,     at(seconds), code,    std::nullopt,
                                      _observations, _lists,      _removed};
        const MessageReport report{{0, _number}, at(seconds), message};
        _picture->update(report);
        _detector->report(report, *_picture, sink);
        _observations.clear();
        _lists.clear();
        _removed.clear();
    }
    void interrupt(double seconds) {
        _picture->clear();
        _detector->interrupt(at(seconds), sink);
    }

    EventTexts sink;

private:
    const CatalogueField& leaf(std::string_view path) const {
        for (const CatalogueField& each : _catalogue->fields())
            if (each.path == path)
                return each;
        throw std::invalid_argument("no leaf " + std::string(path));
    }
    Observation& observe(std::string_view path, ObservedKind kind, const std::vector<std::uint32_t>& rows) {
        Observation& each = _observations.emplace_back();
        each.leaf = &leaf(path);
        each.kind = kind;
        each.rows = _rows.emplace_back(rows);
        return each;
    }

    const Catalogue* _catalogue = nullptr;
    std::unique_ptr<Detector> _detector;
    std::optional<RadioPicture> _picture;
    std::uint64_t _number = 0;
    std::vector<Observation> _observations;
    std::vector<ObservedList> _lists;
    std::vector<const CatalogueField*> _removed;
    std::deque<std::vector<std::uint32_t>> _rows;
};

constexpr const char* srxlev = "/Serving Cell/Serving Cell Measurements/Srxlev";
constexpr const char* rscp = "/UMTS/Active Set/*/RSCP";

TEST_F(RuleDetectorTest, ReadsAPath) {
    use("Ostrel_LTE", rule("low", "'/Serving Cell/Serving Cell Measurements/Srxlev' < 4 dB"));
    number(srxlev, 10).send(0);
    number(srxlev, 3).send(1);
    send(2);
    number(srxlev, 5).send(3);
    EXPECT_THAT(sink.texts, ElementsAre("low 1 to 3"));
    EXPECT_EQ(sink.events[0].technology, "Ostrel_LTE");
    EXPECT_THAT(sink.events[0].evidence, ElementsAre(MessageNumber{0, 2}));
}

TEST_F(RuleDetectorTest, ReadsARole) {
    use("Ostrel_LTE", rule("low", "serving.level < -110"));
    level(-111).send(0);
    level(-100).send(4);
    EXPECT_THAT(sink.texts, ElementsAre("low 0 to 4"));
}

TEST_F(RuleDetectorTest, ReadsEnumerationsAndFlags) {
    use("Ostrel_GSM", rule("state", "'/UMTS/UMTS RR Info/RRC State' == 'CELL_DCH'") +
                          rule("open", "not '/UMTS/UMTS RR Info/Ciphering'"));
    enumeration("/UMTS/UMTS RR Info/RRC State", 3, "CELL_DCH")
        .flag("/UMTS/UMTS RR Info/Ciphering", true)
        .send(0);
    EXPECT_THAT(sink.begun, ElementsAre("state 0"));
    flag("/UMTS/UMTS RR Info/Ciphering", false).send(1);
    EXPECT_THAT(sink.begun, ElementsAre("state 0", "open 1"));
}

TEST_F(RuleDetectorTest, AnAbsentOrRemovedValueIsUnknown) {
    use("Ostrel_LTE", rule("known", "known('/Serving Cell/Serving Cell Measurements/Srxlev')"));
    number(srxlev, 3).send(0);
    absent(srxlev).send(1);
    EXPECT_THAT(sink.texts, ElementsAre("known 0 to 1"));
    number(srxlev, 3).send(2);
    removed(srxlev).send(3);
    EXPECT_THAT(sink.texts, ElementsAre("known 0 to 1", "known 2 to 3"));
}

TEST_F(RuleDetectorTest, AReplacedListHasNoneOfItsEarlierRows) {
    use("Ostrel_GSM", rule("many", "count('/UMTS/Active Set/*/RSCP' > -90) >= 2"));
    list(rscp, 2).number(rscp, -80, {0}).number(rscp, -81, {1}).send(0);
    list(rscp, 1).number(rscp, -80, {0}).send(1);
    EXPECT_THAT(sink.texts, ElementsAre("many 0 to 1"));
}

TEST_F(RuleDetectorTest, ReadsOneRowOfAList) {
    use("Ostrel_GSM", rule("second", "'/UMTS/Active Set/1/RSCP' > -90"));
    list(rscp, 2).number(rscp, -80, {0}).number(rscp, -95, {1}).send(0);
    EXPECT_THAT(sink.begun, IsEmpty());
    list(rscp, 2).number(rscp, -95, {0}).number(rscp, -80, {1}).send(1);
    EXPECT_THAT(sink.begun, ElementsAre("second 1"));
}

TEST_F(RuleDetectorTest, AStarMayBeAnyName) {
    use("Ostrel_LTE", rule("low", "'/*/Serving Cell Measurements/Srxlev' < 4 dB"));
    number(srxlev, 3).send(0);
    EXPECT_THAT(sink.begun, ElementsAre("low 0"));
}

TEST_F(RuleDetectorTest, EventsOfOneMessageAreInTheOrderOfNames) {
    use("Ostrel_LTE",
        rule("b", "serving.level < 0") + rule("c", "serving.level < 0") + rule("a", "serving.level < 0"));
    level(-111).send(0);
    EXPECT_THAT(sink.begun, ElementsAre("a 0", "b 0", "c 0"));
}

TEST_F(RuleDetectorTest, AnInterruptionForgetsAllValues) {
    use("Ostrel_LTE", rule("low", "'/Serving Cell/Serving Cell Measurements/Srxlev' < 4 dB"));
    number(srxlev, 3).send(0);
    interrupt(1);
    EXPECT_THAT(sink.texts, ElementsAre("low 0 to ?"));
    send(100);
    EXPECT_THAT(sink.begun, ElementsAre("low 0"));
    number(srxlev, 3).send(101);
    EXPECT_THAT(sink.begun, ElementsAre("low 0", "low 101"));
}

} // namespace
} // namespace velmora
