#include "Tools/JSONText.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <chrono>
#include <limits>

namespace velmora {
namespace {

TEST(JSONTextTest, EveryKindHasItsForm) {
    using namespace std::chrono;
    struct Case {
        Value value;
        const char* text;
    };
    const Case cases[] = {
        {Value(), "null"},
        {"text", "\"text\""},
        {"", "\"\""},
        {-7, "-7"},
        {std::numeric_limits<std::int64_t>::max(), "9223372036854775807"},
        {0.25, "0.25"},
        {3.0, "3.0"},
        {std::numeric_limits<double>::quiet_NaN(), "null"},
        {std::numeric_limits<double>::infinity(), "null"},
        {true, "true"},
        {false, "false"},
        {Date(sys_days{year{2026} / November / 16} + hours{5} + seconds{9}), "\"2026-11-16T05:00:09Z\""},
        {hex(""), "\"\""},
        {hex("4D"), "\"TQ==\""},
        {hex("4D 61"), "\"TWE=\""},
        {hex("4D 61 6E"), "\"TWFu\""},
        {hex("FB FF FE"), "\"+//+\""},
        {makeArray(), "[]"},
        {makeDictionary(), "{}"},
    };
    for (const Case& row : cases)
        EXPECT_EQ(jsonText(row.value), row.text);
}

TEST(JSONTextTest, ContainersAreIndentedAndKeepTheirOrder) {
    const ArrayRef rows = std::make_shared<Array>(std::initializer_list<Value>{"first", 2, makeArray()});
    const DictionaryRef display = makeDictionary();
    display->set("_sorted", true);
    display->set("b", rows);
    display->set("a", makeDictionary());
    EXPECT_EQ(jsonText(display), R"({
  "_sorted": true,
  "b": [
    "first",
    2,
    []
  ],
  "a": {}
})");
    EXPECT_EQ(jsonText(rows, 2), "[\n      \"first\",\n      2,\n      []\n    ]");
}

TEST(JSONTextTest, StringsAreValidWhateverTheyHold) {
    EXPECT_EQ(jsonString("quote \" backslash \\ feed \n bell \x07"),
              R"("quote \" backslash \\ feed \n bell \u0007")");
    EXPECT_EQ(jsonString("gr\xC3\xBC\xC3\x9F"), "\"gr\xC3\xBC\xC3\x9F\"");
    // A byte of no character, a surrogate's three bytes, and a character that is cut off.
    EXPECT_EQ(jsonString("a\xFF"
                         "b"),
              "\"a\xEF\xBF\xBD"
              "b\"");
    EXPECT_EQ(jsonString("\xC3"), "\"\xEF\xBF\xBD\"");
}

} // namespace
} // namespace velmora
