// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/report/Page.h"

#include "reference_host/report/PageFiles.h"
#include "reference_host/report/PageText.h"

namespace report {
namespace {

// Where page.html has what is put together here.
constexpr std::string_view kPolicy = "{{policy}}";
constexpr std::string_view kTitle = "{{title}}";
constexpr std::string_view kStyle = "{{style}}";
constexpr std::string_view kData = "{{data}}";
constexpr std::string_view kScript = "{{script}}";

// Nothing but the page's own style and scripts, and pictures that are in it or, where it has a
// folder, beside it.
std::string PolicyOf(const Page::Form& form) {
    return "default-src 'none'; script-src " + HashSource(kPageScriptDigest) + "; style-src " +
           HashSource(kPageStyleDigest) +
           "; img-src data:" + (form.hasFolder ? " 'self' file:" : "") +
           "; base-uri 'none'; form-action 'none'";
}

void Replace(std::string& text, std::string_view mark, std::string_view by) {
    text.replace(text.find(mark), mark.size(), by);
}

std::string_view Html() {
    return kPageHtml;
}

}  // namespace

Page::Page(Write write, const Form& form) : write_(std::move(write)) {
    std::string head(Html().substr(0, Html().find(kData)));
    Replace(head, kPolicy, InHtml(PolicyOf(form)));
    Replace(head, kStyle, kPageStyle);
    Replace(head, kTitle, InHtml(form.title));
    write_(head);
}

void Page::AddJson(std::string_view id, std::string_view json) {
    write_("<script type=\"application/json\" id=\"" + std::string(id) + "\">");
    write_(InScript(json));
    write_("</script>\n");
}

void Page::AddClip(std::size_t number, std::string_view json) {
    AddJson("clip-" + std::to_string(number), json);
}

void Page::End(std::string_view json) {
    AddJson("report", json);
    std::string end(Html().substr(Html().find(kData) + kData.size()));
    Replace(end, kScript, kPageScript);
    write_(end);
}

}  // namespace report
