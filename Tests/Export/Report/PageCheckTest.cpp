// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Report/PageCheck.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

std::string pageWith(std::string_view body) {
    return "<!DOCTYPE html>\n<html><body>" + std::string(body) +
           "<script "
           "type=\"application/json\">{\"a\":[1,-2.5e3,null]}</script><script>x()</script></body></html>\n";
}

TEST(PageCheck, TakesAPage) {
    EXPECT_EQ(problemOfPage(pageWith("<p class=\"m\">a &lt; b</p><path d=\"M0 0\"/>")), "");
}

TEST(PageCheck, FindsWhatIsNoPartOfAPage) {
    for (const char* const body : {"<img>", "<p onclick=\"x\">a</p>", "<p>", "</p>", "<p id=a></p>", "a\x1B",
                                   "<!-- -->", "<script>y()</script>"})
        EXPECT_NE(problemOfPage(pageWith(body)), "") << body;
}

TEST(PageCheck, FindsDataThatIsNoJSON) {
    for (const char* const text : {"", "{", "{\"a\":}", "[1,]", "\"\n\"", "nul", "{\"a\":1}x"})
        EXPECT_FALSE(isJSON(text)) << text;
}

} // namespace

} // namespace velmora
