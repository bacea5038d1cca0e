// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/BinColumnMapping.h"

#include <cstdio>
#include <string>
#include <vector>

#include "source/plugin/PluginLogger.h"

namespace NMA::Impl {
namespace {

constexpr char kSourceName[] = "QuickTimeToAAF";

// A user parameter that the bin shows.
struct ColumnOption {
    GUID id;
    std::wstring name;
    std::wstring value;
};

std::vector<ColumnOption> ColumnOptions() {
    return {
        {ncfGuid("6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A"), L"Field Ordering", L"Default"},
        {ncfGuid("322655D5-0A56-46CA-9260-D006F719B8A4"), L"GFX-Video Level",
         L"Do not modify levels"},
    };
}

// The id in lower case without separators, and a colon.
std::wstring MappingKey(const GUID& id) {
    char text[48];
    std::snprintf(text, sizeof(text),
                  "%08x%04x%04x%02x%02x%02x%02x%02x%02x%02x%02x:", static_cast<unsigned>(id.Data1),
                  id.Data2, id.Data3, id.Data4[0], id.Data4[1], id.Data4[2], id.Data4[3],
                  id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    const std::string narrow(text);
    return std::wstring(narrow.begin(), narrow.end());
}

NCFRESULT AppendComment(const IAAFSmartPointer<IAAFMob>& mob, std::wstring name,
                        const std::wstring& value) {
    const HRESULT hr = mob->AppendComment(name.data(), value.c_str());
    if (hr != 0) {
        PluginLogger().Write(1,
                             "Unable to add bin column mapping comment, AAFResult = 0x%x, %s(%d)",
                             static_cast<unsigned>(hr), kSourceName, __LINE__);
        return NMA_E_AAF_ADD;
    }
    return NCF_OK;
}

}  // namespace

NCFRESULT AddBinColMappingToMob(IAAFSmartPointer<IAAFMob> pMobMasterMob) {
    std::vector<ColumnOption> options;
    try {
        options = ColumnOptions();
    } catch (...) {
        return NCF_E_FAIL;
    }
    std::wstring mapping;
    for (const ColumnOption& option : options) {
        mapping += MappingKey(option.id) + option.name + L":";
        const NCFRESULT appended = AppendComment(pMobMasterMob, option.name, option.value);
        if (appended < 0) {
            return appended;
        }
    }
    return AppendComment(pMobMasterMob, L"_ncfparametersxml.nma.bin.0", mapping);
}

}  // namespace NMA::Impl
