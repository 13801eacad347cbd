// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/MessageEffects.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"
#include "Tools/Decode/Lines/JSONFieldWriter.h"
#include "Tools/Decode/Lines/SectionText.h"
#include "Tools/Text/JSONText.h"

#include <gtest/gtest.h>

#include <map>
#include <optional>
#include <string>
#include <vector>

// What is written of a record at once is the JSON of what the decoder shows after it, for random messages of
// every code and the drive's among them.

namespace velmora {
namespace {

/// The JSON of the nodes and values that each message concerned.
class NodeLines : public MessageEffects {
public:
    std::string text() const { return std::string(out.view()); }

protected:
    void sections(std::optional<std::uint32_t>) override { out.clear(); }
    void section(std::string_view name, const Value& node) override { add(name, node); }
    void values(std::optional<std::uint32_t>) override { out.clear(); }
    void value(std::string_view key, const Value& value) override { add(key, value); }
    void display(const Value&) override { out.clear(); }

    TextBuffer out;

private:
    void add(std::string_view name, const Value& value) {
        out.append(',');
        appendJsonString(out, name);
        out.append(':');
        appendJson(out, value);
    }
};

/// The same, from the records.
class RecordLines final : public NodeLines {
public:
    std::string endText() {
        if (!_named)
            return text();
        _writer.end();
        _named->append(out);
        _named = nullptr;
        std::string all = text();
        all.front() = ',';
        all.pop_back();
        return all == "," ? "" : all;
    }

private:
    void values(std::optional<std::uint32_t> code) override {
        NodeLines::values(code);
        _named = nullptr;
        _code = code.value_or(0);
    }
    FieldVisitor* valueVisitor() override {
        _named = &_values.try_emplace(_code, false, _texts).first->second;
        _writer.begin(*_named, JSONFieldWriter::Into::Values);
        return &_writer;
    }
    void concerned(Base& section) override {
        if (!section.hasNode())
            return;
        out.append(',');
        _sections.try_emplace(&section, section, _texts, _writer).first->second.append(out);
    }

    JSONTexts _texts;
    JSONFieldWriter _writer;
    std::map<Base*, SectionText> _sections;
    std::map<std::uint32_t, JSONNode> _values;
    std::uint32_t _code = 0;
    JSONNode* _named = nullptr;
};

class RandomLinesTest : public testing::TestWithParam<DecodedTechnology> {};

bool update(TechnologyUnderTest& tested, const Data& message, MessageEffects* effects) {
    try {
        if (effects)
            tested.decoder().updateStateReporting(tested.state, message, *effects);
        else
            tested.decoder().updateState(tested.state, message);
        return true;
    } catch (const LogCode_0xFF0000::UnknownDataException&) {
        return false;
    } catch (const AssertionFailure&) {
        return false;
    }
}

TEST_P(RandomLinesTest, AreThoseOfTheNodes) {
    std::vector<Data> drive(500);
    const auto scenario = scenarioKindNamed(GetParam().scenario)->make(1);
    for (Data& each : drive)
        each = scenario->next().message;
    std::size_t characters = 0;
    for (std::uint64_t seed = 1; seed <= 20; ++seed) {
        TechnologyUnderTest byNodes(GetParam());
        TechnologyUnderTest byRecords(GetParam());
        NodeLines expected;
        RecordLines direct;
        RandomMessages random(byNodes.decoder(), drive, seed);
        for (int i = 0; i < 500; ++i) {
            const Data message = i % 3 == 0 ? drive[static_cast<std::size_t>(i)] : random.next();
            const bool isShown = i % 17 != 0; // as with messages before a range
            const bool isDecoded = update(byNodes, message, isShown ? &expected : nullptr);
            ASSERT_EQ(update(byRecords, message, isShown ? &direct : nullptr), isDecoded);
            if (!isShown || !isDecoded)
                continue;
            ASSERT_EQ(direct.endText(), expected.text()) << "seed " << seed << ", message " << i;
            characters += expected.text().size();
            if (i % 50 == 0)
                static_cast<void>(byRecords.decoder().generateLogUsingState(byRecords.state));
        }
    }
    EXPECT_GT(characters, 100'000u);
}

INSTANTIATE_TEST_SUITE_P(Technologies, RandomLinesTest,
                         testing::Values(decodedTechnologies[0], decodedTechnologies[1],
                                         decodedTechnologies[2], decodedTechnologies[3],
                                         decodedTechnologies[5]),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
