// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <vector>

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/descriptor_data/GenericXMLDataContainer.h"

struct Rational;

// One row of the built-in table: a picture format that a code covers.
struct FourCharFormat {
    ncfUInt32 width;
    ncfUInt32 height;  // of one field where the layout is separate fields
    ncfUInt8 layout;   // 0 full frame, 1 separate fields
    ncfUInt32 rateNumerator;
    ncfUInt32 rateDenominator;
    ncfUInt32 vcid;

    // Both rate words, where the row serves every rate.
    static constexpr ncfUInt32 kAnyRate = 0xFFFFFFFFu;
    bool HasAnyRate() const { return rateNumerator == kAnyRate && rateDenominator == kAnyRate; }
};

// Turns code, vendor and raster of a picture into a video compression id (the
// "vcid"). The mapper file decides whether a code is supported at all; the
// built-in table tells apart the formats that one code covers.
//
// A code or vendor is a word whose bytes, from the lowest address up, are the
// characters in text order.
class FourCharDataContainerReader : public GenericXMLDataContainer {
public:
    // Loads the file and throws the result when that fails.
    FourCharDataContainerReader(INCFComponentFactory* factory, const NMAString& filePath);

    // 0 with the id, which may be 0: the movie itself must say then.
    // NCF_E_NOTSUPPORTED: the file does not name the code.
    NCFRESULT GetVCID(ncfUInt32 fourCC, ncfUInt32 width, ncfUInt32 height, const Rational* editRate,
                      const ncfUInt8* layout, ncfUInt32 vendor, ncfUInt32* vcid) const;

    // NMA_E_NOTSET when no entry has the vendor.
    NCFRESULT GetVCIDByVendor(const std::vector<XMLDataPropertyValue*>& entries, ncfUInt32 vendor,
                              ncfUInt32* vcid) const;
    // 0 when no row fits.
    ncfUInt32 GetVCIDFromBuiltInTable(const std::vector<XMLDataPropertyValue*>& entries,
                                      ncfUInt32 fourCC, ncfUInt32 width, ncfUInt32 height,
                                      const Rational* editRate, const ncfUInt8* layout) const;
    // The last entry with an id and without a vendor; else `vcid` is untouched.
    void GetVCIDWithoutVendor(const std::vector<XMLDataPropertyValue*>& entries,
                              ncfUInt32* vcid) const;
    ncfUInt32 GetEntryVCID(const XMLDataPropertyValue* entry) const;

    // Looks in the file alone. kAmbiguousCode when several entries have the code.
    NCFRESULT GetVCIDByFourChar(ncfUInt32 fourCC, ncfUInt32* vcid) const;
    static constexpr NCFRESULT kAmbiguousCode = 0x200000C8;

    using BuiltInTable = std::multimap<ncfUInt32, FourCharFormat>;
    const BuiltInTable& Formats() const { return builtInTable_; }

private:
    void LoadFourCharXML();
    void FillBuiltInTable();
    std::vector<XMLDataPropertyValue*> EntriesOf(ncfUInt32 fourCC) const;

    INCFComponentFactory* factory_;  // borrowed
    NMAString filePath_;
    BuiltInTable builtInTable_;
};
