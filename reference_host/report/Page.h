// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>

namespace report {

// Writes a page from its beginning to its end, so that no clip need be kept:
//
//     Page page(write, form);          the page's head
//     page.AddClip(0, json);           all of a clip that its own view alone shows
//     page.End(json);                  what the table shows of all, and the scripts
//
// Texts within the JSON are data: nothing in them becomes markup, and nothing that the page shows
// comes from elsewhere.
class Page {
public:
    using Write = std::function<void(std::string_view)>;
    struct Form {
        std::string title;
        bool hasFolder = false;  // pictures lie beside it
    };
    Page(Write write, const Form& form);

    void AddClip(std::size_t number, std::string_view json);
    void End(std::string_view json);

private:
    void AddJson(std::string_view id, std::string_view json);

    Write write_;
};

}  // namespace report
