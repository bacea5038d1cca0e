// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/GuidText.h"

#include <cctype>
#include <cstdio>

namespace host {

namespace {

constexpr char kForm[] = "xxxxxxxx-xxxx-xxxx-xxxx-xxxxxxxxxxxx";

}  // namespace

std::string GuidText(const GUID& id) {
    char text[sizeof kForm];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return text;
}

bool ReadGuid(std::string_view text, GUID& out) {
    char copy[sizeof kForm] = {};
    if (text.size() != sizeof kForm - 1) {
        return false;
    }
    for (std::size_t i = 0; i < text.size(); ++i) {
        const auto c = static_cast<unsigned char>(text[i]);
        if (kForm[i] == '-' ? c != '-' : std::isxdigit(c) == 0) {
            return false;
        }
        copy[i] = text[i];
    }
    out = ncfGuid(copy);
    return true;
}

}  // namespace host
