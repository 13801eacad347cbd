// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLReader.h"
#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

const std::string start = "[[rule]]\nname = \"weak\"\ntext = \"x\"\n";
const std::string valid = start + "when = \"serving.level < -110\"\n";

std::string repeated(std::size_t count, const std::string& text) {
    std::string all;
    for (std::size_t i = 0; i < count; ++i)
        all += text;
    return all;
}

TEST(RuleFileTest, AnEmptyFileHasNoRules) {
    EXPECT_THAT(mistakesIn(""), IsEmpty());
    EXPECT_THAT(mistakesIn("# nothing but a comment\n"), IsEmpty());
}

TEST(RuleFileTest, NamesTheMissingKeys) {
    EXPECT_THAT(mistakesIn("[[rule]]\n"), ElementsAre("my.toml:1:1: got no name, wanted a text",
                                                      "my.toml:1:1: got no when, wanted a text",
                                                      "my.toml:1:1: got no text, wanted a text"));
}

TEST(RuleFileTest, AnUnknownKeyIsAMistakeAtItsPlace) {
    EXPECT_THAT(mistakesIn(valid + "  hold = \"5s\"\n"),
                ElementsAre("my.toml:5:3: got the key hold, wanted one like for, keep, name"));
    EXPECT_THAT(mistakesIn("rules = 3\n"),
                ElementsAre("my.toml:1:1: got the key rules, wanted one like rule, class"));
}

TEST(RuleFileTest, AMistakeOfAnExpressionIsAtItsPlaceInTheFile) {
    EXPECT_THAT(mistakesIn(start + "when = \"serving.level < -15 dB\"\n"),
                ElementsAre("my.toml:4:23: got a number in dBm and a number in dB, wanted the same unit"));
    EXPECT_THAT(mistakesIn(start + "when = '''\nserving.level < -110\n or serving.quality < -15 dBm'''\n"),
                ElementsAre("my.toml:6:21: got a number in dB and a number in dBm, wanted the same unit"));
    EXPECT_THAT(
        mistakesIn(
            "[[rule]]\nname = \"weak\"\nwhen = \"serving.level < 0\"\ntext = \"\xC3\xA4 {serving.x}\"\n"),
        ElementsAre(HasSubstr("my.toml:4:12: got the name serving.x")));
}

TEST(RuleFileTest, AnExpressionWithEscapesHasItsMistakeAtItsBegin) {
    EXPECT_THAT(mistakesIn(start + "when = \"radio.technology == \\\"LTE\\\" and serving.level < -15 dB\"\n"),
                ElementsAre(HasSubstr("my.toml:4:8: got a number in dBm and")));
}

TEST(RuleFileTest, TheValueOfAKeyIsChecked) {
    const auto mistakes = [](const std::string& line) { return mistakesIn(valid + line); };
    EXPECT_THAT(
        mistakes("for = \"5 dB\""),
        ElementsAre("my.toml:5:7: got 5 dB, wanted a number of seconds or a text as in \"5s\", \"2 min\", "
                    "at most 24 h"));
    EXPECT_THAT(
        mistakes("for = -1"),
        ElementsAre("my.toml:5:7: got -1, wanted a number of seconds or a text as in \"5s\", \"2 min\", "
                    "at most 24 h"));
    EXPECT_THAT(mistakes("for = nan"),
                ElementsAre(HasSubstr("my.toml:5:7: got nan, wanted a number of seconds")));
    EXPECT_THAT(mistakes("keep = \"25 h\""), ElementsAre(HasSubstr("my.toml:5:8: got 25 h, wanted")));
    EXPECT_THAT(mistakes("keep = true"), ElementsAre(HasSubstr("my.toml:5:8: got true or false, wanted")));
    EXPECT_THAT(mistakes("severity = \"fatal\""),
                ElementsAre("my.toml:5:12: got the severity fatal, wanted info, warning or critical"));
    EXPECT_THAT(mistakes("lasts = 1"),
                ElementsAre("my.toml:5:9: got a number for lasts, wanted true or false"));
    EXPECT_THAT(mistakes("clear = \"serving.level\""),
                ElementsAre("my.toml:5:9: got a number in dBm, wanted a condition"));
    EXPECT_THAT(mistakes("technology = \"4G\""),
                ElementsAre("my.toml:5:14: got the technology 4G, wanted one or an array of IFX, Ostrel_GSM, "
                            "Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2, Modem"));
    for (const char* const name : {"LTE", "lte", "Ostrel_LTE", "UTRAN", "Ostrel_UTRAN2", "modem"})
        EXPECT_THAT(mistakes(std::string("technology = \"") + name + "\""), IsEmpty()) << name;
    EXPECT_THAT(mistakes("technology = [\"LTE\", \"GSM\"]"), IsEmpty());
}

TEST(RuleFileTest, ANameIsAKindThatNoDetectorMakes) {
    const auto mistakes = [](const std::string& name) {
        return mistakesIn("[[rule]]\nname = \"" + name + "\"\nwhen = \"serving.level < 0\"\ntext = \"\"\n");
    };
    EXPECT_THAT(mistakes("Weak"),
                ElementsAre("my.toml:2:8: got the name Weak, wanted lower-case letters, digits "
                            "and hyphens as in weak-coverage, at most 64"));
    EXPECT_THAT(mistakes("handover"),
                ElementsAre("my.toml:2:8: got the name handover, which events have that no rule makes"));
    EXPECT_THAT(mistakes("weak-coverage"), IsEmpty());
    EXPECT_THAT(mistakes("lte-2-weak"), IsEmpty());
    EXPECT_EQ(mistakes("").size(), 1U);
    EXPECT_EQ(mistakes(std::string(65, 'a')).size(), 1U);
}

TEST(RuleFileTest, ATextHasValuesInBraces) {
    const auto mistakes = [](const std::string& text) {
        return mistakesIn("[[rule]]\nname = \"weak\"\nwhen = \"serving.level < 0\"\ntext = \"" + text +
                          "\"\n");
    };
    EXPECT_THAT(mistakes("{{}} {serving.level} {age(serving.level)} {max(neighbour.level)}"), IsEmpty());
    EXPECT_THAT(mistakes("{serving.level"),
                ElementsAre("my.toml:4:9: got a { without a }, wanted {{ for the character itself"));
    EXPECT_THAT(mistakes("a } b"),
                ElementsAre("my.toml:4:11: got a } without a {, wanted }} for the character itself"));
    EXPECT_THAT(mistakes("{}"), ElementsAre(HasSubstr("my.toml:4:10: got the end, wanted a name")));
    EXPECT_THAT(mistakes("{delta(serving.level, 5 s)}"),
                ElementsAre("my.toml:4:10: got a window of time, which a text cannot have"));
    EXPECT_THAT(mistakes(repeated(17, "{serving.level}")),
                ElementsAre("my.toml:4:249: got more than 16 values"));
}

TEST(RuleFileTest, APathMayDifferBetweenTechnologies) {
    // Context IDs are texts in the telephony service's stream, and numbers in IFX's.
    EXPECT_THAT(mistakesIn(start + "when = \"'/SIM' == 'a'\"\n"), IsEmpty());
    EXPECT_THAT(
        mistakesIn(start + "technology = \"GSM\"\nwhen = \"'/Registration/LAC' == 3\"\n"),
        ElementsAre(HasSubstr("my.toml:5:9: got the path '/Registration/LAC', wanted one of a display")));
}

TEST(RuleFileTest, ATestsValuesAreChecked) {
    const auto mistakes = [](const std::string& lines) {
        return mistakesIn(valid + "[[rule.test]]\ntechnology = \"LTE\"\n" + lines);
    };
    EXPECT_THAT(mistakes("values = [{ at = 1, serving.level = \"a\" }]\nevents = []"),
                ElementsAre("my.toml:7:37: got a text, wanted a number in dBm"));
    EXPECT_THAT(mistakes("values = [{ serving.level = 3 }]\nevents = []"),
                ElementsAre("my.toml:7:11: got values without a time, wanted a table as in { at = 5, ... }"));
    EXPECT_THAT(mistakes("values = [{ at = 2 }, { at = 1 }]\nevents = []"),
                ElementsAre("my.toml:7:23: got a time before the one above, wanted times in order"));
    EXPECT_THAT(
        mistakes("values = [{ at = 2, serving.levl = 3 }]\nevents = []"),
        ElementsAre(HasSubstr("got the name serving.levl, wanted a role; the nearest are serving.level")));
    EXPECT_THAT(mistakes("values = [{ at = 2, neighbour.level = 3 }]\nevents = []"),
                ElementsAre(HasSubstr("got neighbour.level, wanted neighbours = [{ level = ... }, ...]")));
    EXPECT_THAT(mistakes("values = []\nevents = [{ end = 3 }]"),
                ElementsAre("my.toml:8:11: got no begin, wanted an event as in { begin = 5, end = 12 }"));
    EXPECT_THAT(mistakes("values = []"), ElementsAre("my.toml:5:1: got no events, wanted an array"));
    EXPECT_THAT(mistakes("values = [1]\nevents = []"),
                ElementsAre("my.toml:7:11: got values without a time, wanted a table as in { at = 5, ... }"));
    EXPECT_THAT(mistakes("values = [{ at = 1, neighbours = 3, unknown = 4, interruption = 5 }]\nevents = []"),
                ElementsAre("my.toml:7:34: got a number for neighbours, wanted an array",
                            "my.toml:7:65: got a number for interruption, wanted true or false",
                            "my.toml:7:47: got a number for unknown, wanted an array"));
    EXPECT_THAT(mistakesIn(valid + "[[rule.test]]\ntechnology = \"UTRAN\"\nvalues = []\nevents = []"),
                ElementsAre("my.toml:6:14: got a technology that the rule does not concern"));
}

TEST(RuleFileTest, MistakesOfTOMLAreAtTheirPlace) {
    EXPECT_THAT(mistakesIn("[[rule]]\nname = weak\n"), ElementsAre(HasSubstr("my.toml:2:8: ")));
    EXPECT_THAT(mistakesIn("a = \"\xFF\"\n"), ElementsAre(HasSubstr("my.toml:1:")));
    // Assertions of the parser do not hold for this one.
    EXPECT_THAT(mistakesIn("[[rD\u0459[\n"), testing::SizeIs(1));
    EXPECT_THAT(mistakesIn("[[#\n"), ElementsAre("my.toml: got a text that is no TOML document"));
    EXPECT_THAT(mistakesIn("rule = 3\n"), ElementsAre("my.toml:1:8: got a number for rule, wanted an array"));
    EXPECT_THAT(mistakesIn("rule = [3]\n"), ElementsAre("my.toml:1:9: got a number, wanted [[rule]] tables"));
}

TEST(RuleFileTest, AfterTwentyMistakesTheRestIsNotRead) {
    const std::vector<std::string> mistakes = mistakesIn(repeated(100, "[[rule]]\n"));
    EXPECT_EQ(mistakes.size(), 21U);
    EXPECT_EQ(mistakes.back(), "my.toml: got at least 20 mistakes; the rest is not read");
}

TEST(RuleFileTest, DeepDocumentsEndWithAMistake) {
    EXPECT_EQ(mistakesIn("a = " + repeated(100000, "[")).size(), 1U);
    EXPECT_EQ(mistakesIn("a = " + repeated(100000, "{a=")).size(), 1U);
    EXPECT_THAT(mistakesIn("[" + repeated(100000, "a.") + "a]"),
                ElementsAre(HasSubstr("got a key of more than 16 parts")));
    EXPECT_THAT(mistakesIn("x = 1\n" + repeated(400000, "a.") + "a = 1"),
                ElementsAre("my.toml:2:32: got a key of more than 16 parts"));
    EXPECT_THAT(mistakesIn("a = {" + repeated(100000, "a.") + "a = 1}"),
                ElementsAre(HasSubstr("got a key of more than 16 parts")));
}

TEST(RuleFileTest, DotsOfTextsAndCommentsAreNoParts) {
    const std::string dots(40, '.');
    EXPECT_FALSE(longKey("a = \"" + dots + "\" # " + dots));
    EXPECT_FALSE(longKey("a = '''" + dots + "\n'" + dots + "''' \nb = '" + dots + "'"));
    EXPECT_FALSE(longKey("a = \"\"\"" + dots + "\\\"\"" + dots + "\"\"\"\"\"\nb = 1.5"));
    EXPECT_FALSE(longKey("\"" + dots + "\".a = 1"));
    EXPECT_TRUE(longKey("\"" + dots + "\"" + repeated(16, ".'a'") + " = 1"));
}

TEST(RuleFileTest, ARuleWithManyPathsEnds) {
    std::string rules;
    for (int i = 0; i < 1200; ++i)
        rules += "[[rule]]\nname = \"r" + std::to_string(i) +
                 "\"\ntext = \"\"\nwhen = \"'/Packet Data/PDP Context Info/" + std::to_string(i) +
                 "/APN' == 'a'\"\n";
    EXPECT_THAT(mistakesIn(rules).front(), HasSubstr("got more than 1024 different paths"));
}

} // namespace
} // namespace velmora
