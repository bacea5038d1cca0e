// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/report/PageText.h"

#include <gtest/gtest.h>

using report::Base64;
using report::FromBase64;
using report::InHtml;
using report::InScript;
using report::IsBase64;

namespace {

std::string Of(const std::string& bytes) {
    return Base64(reinterpret_cast<const unsigned char*>(bytes.data()), bytes.size());
}

// The examples of RFC 4648.
TEST(PageTexts, WriteBytesAsBase64) {
    const char* const pairs[][2] = {{"", ""},
                                    {"f", "Zg=="},
                                    {"fo", "Zm8="},
                                    {"foo", "Zm9v"},
                                    {"foob", "Zm9vYg=="},
                                    {"fooba", "Zm9vYmE="},
                                    {"foobar", "Zm9vYmFy"}};
    for (const auto& [bytes, text] : pairs) {
        EXPECT_EQ(Of(bytes), text);
        EXPECT_EQ(FromBase64(text), bytes);
        EXPECT_TRUE(IsBase64(text)) << text;
    }
}

TEST(PageTexts, WriteEachByteAsBase64AndBack) {
    std::string all;
    for (int byte = 0; byte < 256; ++byte) {
        all += static_cast<char>(byte);
    }
    EXPECT_EQ(FromBase64(Of(all)), all);
}

TEST(PageTexts, KnowWhatIsNoBase64) {
    for (const char* const text :
         {"Zg=", "Zg", "Zg==Zg==", "=Zg=", "====", "Zm9v!", "Zm 9", "<svg>", "Zm9v\n", "Z==="}) {
        EXPECT_FALSE(IsBase64(text)) << text;
        EXPECT_EQ(FromBase64(text), "") << text;
    }
}

TEST(PageTexts, MakeMarkupOfHtmlAText) {
    EXPECT_EQ(InHtml("<b a=\"1\" c='2'>&amp;</b>"),
              "&lt;b a=&quot;1&quot; c=&#39;2&#39;&gt;&amp;amp;&lt;/b&gt;");
    EXPECT_EQ(InHtml("plain"), "plain");
    EXPECT_EQ(InHtml(""), "");
}

TEST(PageTexts, LeaveNothingInJsonThatEndsAScript) {
    EXPECT_EQ(InScript(R"({"a":"</script><!--]]>&"})"),
              R"({"a":"\u003c/script\u003e\u003c!--]]\u003e\u0026"})");
}

TEST(PageTexts, LeaveNoLineEndOfScriptsInJson) {
    EXPECT_EQ(InScript("a\xE2\x80\xA8"
                       "b\xE2\x80\xA9"
                       "c"),
              "a\\u2028b\\u2029c");
    // What begins like one of them stays, also at the end.
    EXPECT_EQ(InScript("\xE2\x80\xA7 \xE2\x80"), "\xE2\x80\xA7 \xE2\x80");
}

}  // namespace
