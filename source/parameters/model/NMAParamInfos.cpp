// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamInfos.h"

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

NMAXmlElement* FindExternal(NMAXmlElement& infos, const NMAString& extension) {
    const NMAString key(kParamFileNameExtension);
    const NMAXmlPair pair = {key.GetWCHARString(), extension.GetWCHARString()};
    return infos.FindChildWithChildren(NMAString(kParamExternal), &pair, 1, 0);
}

NMAXmlElement* RequireExternal(NMAXmlElement& infos, const NMAString& extension) {
    NMAXmlElement* const found = FindExternal(infos, extension);
    if (!found) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    return found;
}

void ReadTexts(NMAXmlElement& external, NMAString& outShortName, NMAString& outDescription) {
    NMAString shortName;
    GetParamText(external, kParamShortName, shortName);
    GetParamText(external, kParamDescription, outDescription);
    outShortName = shortName;
}

}  // namespace

NCFRESULT NMAParamInfos::GetVersion(NMAString& out) const {
    GetParamText(Element(), kParamVersion, out);
    return NCF_OK;
}

NCFRESULT NMAParamInfos::GetExternalAt(ncfUInt32 index, NMAString& outExtension,
                                       NMAString& outShortName, NMAString& outDescription) const {
    NMAXmlElement* const external = GetParamItemAt(Element(), kParamExternal, index);
    NMAString extension;
    GetParamText(*external, kParamFileNameExtension, extension);
    ReadTexts(*external, outShortName, outDescription);
    outExtension = extension;
    return NCF_OK;
}

NCFRESULT NMAParamInfos::GetExternal(const NMAString& extension, NMAString& outShortName,
                                     NMAString& outDescription) const {
    ReadTexts(*RequireExternal(Element(), extension), outShortName, outDescription);
    return NCF_OK;
}

NCFRESULT NMAParamInfos::AddExternal(const NMAString& extension, const NMAString& shortName,
                                     const NMAString& description) {
    if (FindExternal(Element(), extension)) {
        ThrowIfFailed(NCF_E_ABORT);
    }
    NMAXmlElement* const external = AddParamElement(Element(), kParamExternal);
    external->AddChildElementWithText(NMAString(kParamFileNameExtension), extension);
    external->AddChildElementWithText(NMAString(kParamShortName), shortName);
    external->AddChildElementWithText(NMAString(kParamDescription), description);
    return NCF_OK;
}

NCFRESULT NMAParamInfos::RemoveExternal(const NMAString& extension) {
    RemoveParamElement(Element(), RequireExternal(Element(), extension));
    return NCF_OK;
}

NCFRESULT NMAParamInfos::GetParameter(const GUID& id, NMAParamInfoParam& out) const {
    const ParamKey key = ParamIdKey(id);
    NMAXmlElement* found = FindParamItem(Element(), kParamItem, key);
    if (!found) {
        std::vector<NMAXmlElement*> groups;
        Element().CollectChildren(NMAString(kParamGroupItem), groups);
        for (std::size_t i = 0; i < groups.size() && !found; ++i) {
            found = FindParamItem(*groups[i], kParamItem, key);
        }
    }
    return found ? FillParam(out, found) : NMA_E_NODATA;
}

}  // namespace NMA::XMLUtils
