// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/report/Page.h"

#include <gtest/gtest.h>

#include "reference_host/report/PageFiles.h"
#include "reference_host/report/PageText.h"
#include "reference_host/system/DigestEngine.h"

namespace {

std::string PageOf(const report::Page::Form& form, const std::string& clip,
                   const std::string& document) {
    std::string text;
    report::Page page([&](std::string_view piece) { text += piece; }, form);
    page.AddClip(0, clip);
    page.End(document);
    return text;
}

std::size_t Count(const std::string& text, const std::string& part) {
    std::size_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
        ++count;
    }
    return count;
}

std::string DigestText(const std::string& text) {
    host::system::DigestEngine engine;
    std::array<unsigned char, host::system::kDigestBytes> digest{};
    EXPECT_TRUE(engine.Add(reinterpret_cast<const unsigned char*>(text.data()), text.size()) &&
                engine.Finish(digest));
    return "&#39;sha256-" + report::Base64(digest.data(), digest.size()) + "&#39;";
}

TEST(Pages, HoldClipsAndDocumentAsTheyAre) {
    const std::string page = PageOf({"A title", false}, R"({"a":1})", R"({"b":2})");
    EXPECT_EQ(Count(page, R"(<script type="application/json" id="clip-0">{"a":1}</script>)"), 1u);
    EXPECT_EQ(Count(page, R"(<script type="application/json" id="report">{"b":2}</script>)"), 1u);
    EXPECT_EQ(Count(page, "<title>A title</title>"), 1u);
    EXPECT_EQ(Count(page, "{{"), 0u);
}

// Else a browser would refuse the page's own script and style.
TEST(Pages, NameTheirScriptAndStyleInTheirPolicy) {
    const std::string page = PageOf({"t", false}, "{}", "{}");
    EXPECT_EQ(Count(page, "script-src " + DigestText(report::kPageScript) + ";"), 1u);
    EXPECT_EQ(Count(page, "style-src " + DigestText(report::kPageStyle) + ";"), 1u);
    EXPECT_EQ(Count(page, std::string("<script>") + report::kPageScript + "</script>"), 1u);
    EXPECT_EQ(Count(page, std::string("<style>") + report::kPageStyle + "</style>"), 1u);
}

TEST(Pages, AllowNothingFromElsewhere) {
    const std::string page = PageOf({"t", false}, "{}", "{}");
    EXPECT_EQ(Count(page, "default-src &#39;none&#39;"), 1u);
    EXPECT_EQ(Count(page, "img-src data:;"), 1u);
    EXPECT_EQ(Count(page, "unsafe"), 0u);
    EXPECT_EQ(Count(page, "src=\"http"), 0u);
}

TEST(Pages, AllowPicturesBesideThemOnlyWhereTheyHaveAFolder) {
    EXPECT_EQ(Count(PageOf({"t", false}, "{}", "{}"), "file:"), 0u);
    EXPECT_EQ(Count(PageOf({"t", true}, "{}", "{}"), "img-src data: &#39;self&#39; file:;"), 1u);
}

TEST(Pages, MakeNoMarkupOfTexts) {
    const std::string evil = "</title></script><script>alert(1)</script><!-- {{data}} {{script}}";
    const std::string page = PageOf({evil, false}, "\"" + evil + "\"", "\"" + evil + "\"");
    EXPECT_EQ(Count(page, "<script>"), 1u);
    EXPECT_EQ(Count(page, "<script>alert"), 0u);
    EXPECT_EQ(Count(page, "</script>"), 3u);
    EXPECT_EQ(Count(page, "</title>"), 1u);
    EXPECT_EQ(Count(page, "<!--"), 0u);
}

}  // namespace
