// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/FourCharDataContainerReader.h"

#include <cstring>

#include "source/descriptor_data/XMLParserHelpers.h"
#include "source/plugin/Rational.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/TextToNumber.h"

namespace {

// Up to four characters as a word, in text order; missing ones are zero bytes.
ncfUInt32 WordOf(const char* text) {
    ncfUInt32 word = 0;
    std::memcpy(&word, text, strnlen(text, sizeof word));
    return word;
}

XMLDataPropertyValue* ChildOf(const XMLDataPropertyValue* entry, const char* name) {
    XMLDataPropertyValue* child = nullptr;
    entry->FindPropertyInChildren(name, &child);
    return child;
}

}  // namespace

FourCharDataContainerReader::FourCharDataContainerReader(INCFComponentFactory* factory,
                                                         const NMAString& filePath)
    : factory_(factory), filePath_(filePath) {
    LoadFourCharXML();
    FillBuiltInTable();
}

void FourCharDataContainerReader::LoadFourCharXML() {
    XMLDataPropertyValue* mapping = nullptr;
    XMLDataPropertyValue* fourChar = nullptr;
    XMLDataPropertyValue* vcid = nullptr;
    XMLDataPropertyValue* vendor = nullptr;
    ThrowIfFailed(CreateDescriptionNode("FourCharMapping", DCF_ENTRY_ELEMENT, &mapping));
    ThrowIfFailed(CreateDescriptionNode("FourChar", DCF_KEY_ELEMENT, &fourChar));
    ThrowIfFailed(CreateDescriptionNode("vcid", DCF_ELEMENT, &vcid));
    ThrowIfFailed(CreateDescriptionNode("Vendor", DCF_ELEMENT, &vendor));
    ThrowIfFailed(SetContainerDescription(mapping));
    ThrowIfFailed(mapping->AddChild(fourChar));
    ThrowIfFailed(mapping->AddChild(vendor));
    ThrowIfFailed(mapping->AddChild(vcid));

    NCFSmartPtr<UTIL::INCFSaxDocumentHandler> handler;
    ThrowIfFailed(ParseHelperFunctions::MakeDocHandler(factory_, this, handler));
    ThrowIfFailed(ParseHelperFunctions::ParseXML(filePath_, handler.inArg(), factory_));
}

std::vector<XMLDataPropertyValue*> FourCharDataContainerReader::EntriesOf(ncfUInt32 fourCC) const {
    char key[sizeof fourCC + 1] = {};
    std::memcpy(key, &fourCC, sizeof fourCC);
    std::vector<XMLDataPropertyValue*> entries;
    GetEntries(key, &entries);
    return entries;
}

NCFRESULT FourCharDataContainerReader::GetVCID(ncfUInt32 fourCC, ncfUInt32 width, ncfUInt32 height,
                                               const Rational* editRate, const ncfUInt8* layout,
                                               ncfUInt32 vendor, ncfUInt32* vcid) const {
    if (!vcid) {
        return NCF_E_INVALIDARG;
    }
    const std::vector<XMLDataPropertyValue*> entries = EntriesOf(fourCC);
    if (entries.empty()) {
        return NCF_E_NOTSUPPORTED;
    }
    const NCFRESULT byVendor = GetVCIDByVendor(entries, vendor, vcid);
    if (byVendor != NMA_E_NOTSET) {
        return byVendor;
    }
    *vcid = entries.size() == 1
                ? GetEntryVCID(entries.front())
                : GetVCIDFromBuiltInTable(entries, fourCC, width, height, editRate, layout);
    return NCF_OK;
}

NCFRESULT FourCharDataContainerReader::GetVCIDByVendor(
    const std::vector<XMLDataPropertyValue*>& entries, ncfUInt32 vendor, ncfUInt32* vcid) const {
    NCF_FUNCTION("FourCharDataContainerReader::GetVCIDByVendor");
    CHK_INARG(vcid);
    for (const XMLDataPropertyValue* entry : entries) {
        const XMLDataPropertyValue* const named = ChildOf(entry, "Vendor");
        if (named && WordOf(named->ValueText()) == vendor) {
            *vcid = GetEntryVCID(entry);
            return NCF_OK;
        }
    }
    return NMA_E_NOTSET;
}

// A code with rows is answered by its rows alone: the file is not asked again.
ncfUInt32 FourCharDataContainerReader::GetVCIDFromBuiltInTable(
    const std::vector<XMLDataPropertyValue*>& entries, ncfUInt32 fourCC, ncfUInt32 width,
    ncfUInt32 height, const Rational* editRate, const ncfUInt8* layout) const {
    const auto rows = builtInTable_.equal_range(fourCC);
    if (rows.first == rows.second) {
        ncfUInt32 vcid = 0;
        GetVCIDWithoutVendor(entries, &vcid);
        return vcid;
    }
    for (auto row = rows.first; row != rows.second; ++row) {
        const FourCharFormat& format = row->second;
        const bool rasterFits =
            layout && format.width == width && format.height == height && format.layout == *layout;
        const bool rateFits =
            format.HasAnyRate() ||
            (editRate && format.rateNumerator == static_cast<ncfUInt32>(editRate->numerator) &&
             format.rateDenominator == static_cast<ncfUInt32>(editRate->denominator));
        if (rasterFits && rateFits) {
            return format.vcid;
        }
    }
    return 0;
}

void FourCharDataContainerReader::GetVCIDWithoutVendor(
    const std::vector<XMLDataPropertyValue*>& entries, ncfUInt32* vcid) const {
    for (const XMLDataPropertyValue* entry : entries) {
        const XMLDataPropertyValue* const id = ChildOf(entry, "vcid");
        if (id && !ChildOf(entry, "Vendor")) {
            *vcid = TextToNumber(id->ValueText());
        }
    }
}

ncfUInt32 FourCharDataContainerReader::GetEntryVCID(const XMLDataPropertyValue* entry) const {
    const XMLDataPropertyValue* const id = ChildOf(entry, "vcid");
    return id ? TextToNumber(id->ValueText()) : 0;
}

NCFRESULT FourCharDataContainerReader::GetVCIDByFourChar(ncfUInt32 fourCC, ncfUInt32* vcid) const {
    NCF_FUNCTION("FourCharDataContainerReader::GetVCIDByFourChar");
    CHK_INARG(vcid);
    const std::vector<XMLDataPropertyValue*> entries = EntriesOf(fourCC);
    if (entries.size() > 1) {
        return kAmbiguousCode;
    }
    const ncfUInt32 found = entries.empty() ? 0 : GetEntryVCID(entries.front());
    if (found == 0) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    *vcid = found;
    return NCF_OK;
}
