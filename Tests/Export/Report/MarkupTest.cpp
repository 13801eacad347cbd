// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/Markup.h"

#include <gtest/gtest.h>

#include <cmath>

namespace velmora {

namespace {

using namespace std::chrono_literals;

std::string written(auto&& write) {
    std::string page;
    {
        Markup out([&page](std::string_view piece) { page += piece; });
        write(out);
    }
    return page;
}

TEST(Markup, EscapesWhatWouldBeMarkup) {
    EXPECT_EQ(written([](Markup& out) { out.text("</b>&\"'"); }), "&lt;/b&gt;&amp;&quot;&#39;");
}

TEST(Markup, ShowsWhatWouldControlTheText) {
    EXPECT_EQ(written([](Markup& out) { out.text(std::string_view("a\0b\x1B\xE2\x80\xAE", 7)); }),
              "a\\x00b\\x1B\\u{202E}");
    EXPECT_EQ(written([](Markup& out) { out.text("\xED\xA0\x80"); }), "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD");
}

TEST(Markup, WritesStringsThatEndNoScript) {
    EXPECT_EQ(written([](Markup& out) { out.string("</script><!--\"\\\n"); }),
              "\"\\u003c/script\\u003e\\u003c!--\\\"\\\\\\\\n\"");
}

TEST(Markup, WritesNumbersAsShortAsTheyAre) {
    EXPECT_EQ(
        written([](Markup& out) { out.number(-97.25).raw(" ").number(3).raw(" ").number(std::nan("")); }),
        "-97.25 3 null");
}

TEST(Markup, WritesTimes) {
    EXPECT_EQ(pageTime(Time(1767600000048ms)), "2026-01-05 08:00:00.048 UTC");
    EXPECT_EQ(pageStamp(Time(-1ms)), "1969-12-31T23:59:59.999Z");
}

TEST(Markup, WritesDurations) {
    EXPECT_EQ(pageDuration(2787ms), "2.787 s");
    EXPECT_EQ(pageDuration(34min + 18s), "34 min 18 s");
    EXPECT_EQ(pageDuration(10h - 1s), "9 h 59 min 59 s");
}

TEST(Markup, WritesFigures) {
    EXPECT_EQ(pageCount(0), "0");
    EXPECT_EQ(pageCount(689709), "689,709");
    EXPECT_EQ(pageCount(1000000), "1,000,000");
    EXPECT_EQ(pageFigure(-97.250), "-97.25");
    EXPECT_EQ(pageFigure(100), "100");
    EXPECT_EQ(pageFigure(-0.0001), "0");
    EXPECT_EQ(pageFigure(1e300), "1e+300");
    EXPECT_EQ(pageShare(1s, 8s), "12.5 %");
    EXPECT_EQ(pageShare(0s, 0s), "–");
}

} // namespace

} // namespace velmora
