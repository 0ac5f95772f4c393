#include "html/HtmlText.h"

#include <gtest/gtest.h>

namespace sennetctl {
namespace {

std::string html(std::string_view text) {
    std::string escaped;
    appendHtml(escaped, text);
    return escaped;
}

std::string value(std::string_view text) {
    std::string escaped;
    appendHtmlValue(escaped, text);
    return escaped;
}

TEST(HtmlTextTest, NothingBeginsOrEndsMarkup) {
    EXPECT_EQ(html("</td><script>alert('x' && \"y\")</script>"),
              "&lt;/td&gt;&lt;script&gt;alert(&#39;x&#39; &amp;&amp; "
              "&quot;y&quot;)&lt;/script&gt;");
    EXPECT_EQ(html("&lt;"), "&amp;lt;");
    EXPECT_EQ(html("M\xC3\xBCller"), "M\xC3\xBCller");
    EXPECT_EQ(html(""), "");
}

TEST(HtmlTextTest, LineEndsStayAndOtherControlCharactersGo) {
    EXPECT_EQ(html("a\r\nb\rc\nd\n"), "a\nb\nc\nd\n");
    EXPECT_EQ(html(std::string_view("a\0b\tc\x7F\x1B[1m", 10)), "a b c  [1m");
    EXPECT_EQ(html("a\xC2\x85z"), "a z");
    EXPECT_EQ(html("a\xFFz"), "a\xEF\xBF\xBDz");
}

TEST(HtmlTextTest, MomentsAreShownAsTimes) {
    EXPECT_EQ(value("20261121111347.000000+000"),
              "<time datetime=\"2026-11-21T11:13:47+00:00\">2026-11-21 11:13:47 UTC</time>");
    EXPECT_EQ(value("20261121111347.000000-330"),
              "<time datetime=\"2026-11-21T11:13:47-05:30\">2026-11-21 11:13:47 -05:30</time>");
}

TEST(HtmlTextTest, WhatIsNoMomentStays) {
    EXPECT_EQ(value("20261121******.000000+000"), "20261121******.000000+000");
    EXPECT_EQ(value("20261121111347.000000:000"), "20261121111347.000000:000");
    EXPECT_EQ(value("00000012010203.000000+00"), "00000012010203.000000+00");
    EXPECT_EQ(value("<20261121111347.00000+000"), "&lt;20261121111347.00000+000");
}

}  // namespace
}  // namespace sennetctl
