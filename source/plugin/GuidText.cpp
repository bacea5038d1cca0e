// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/GuidText.h"

#include <cstdio>
#include <string>

bool StringToGUID(const NMAString& text, GUID* out) {
    std::string upper = text.GetUTF8String();
    for (char& c : upper) {
        if (c >= 'a' && c <= 'z') {
            c = static_cast<char>(c - 'a' + 'A');
        }
    }
    unsigned fields[11] = {};
    const int converted =
        std::sscanf(upper.c_str(), "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X", &fields[0],
                    &fields[1], &fields[2], &fields[3], &fields[4], &fields[5], &fields[6],
                    &fields[7], &fields[8], &fields[9], &fields[10]);
    if (converted != 11) {
        return false;
    }
    out->Data1 = static_cast<ncfUInt32>(fields[0]);
    out->Data2 = static_cast<ncfUInt16>(fields[1]);
    out->Data3 = static_cast<ncfUInt16>(fields[2]);
    for (int i = 0; i < 8; ++i) {
        out->Data4[i] = static_cast<ncfUInt8>(fields[3 + i]);
    }
    return true;
}

NMAString GUIDToString(const GUID& id) {
    char text[37];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return NMAString(text);
}
