// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "source/aaf/AAFSmartPointer.h"

namespace NMA::Impl {

// The built-in definitions of one dictionary, each looked up on first use and
// kept. Made on the stack where it is needed. Without a dictionary the
// constructor throws the text "pDict"; a failed look-up throws the text
// "AAFRESULT_SUCCEEDED (hr)".
class AAFDefs {
public:
    explicit AAFDefs(IAAFSmartPointer<IAAFDictionary> pDict);
    AAFDefs(const AAFDefs&) = delete;
    AAFDefs& operator=(const AAFDefs&) = delete;

    using ClassDef = IAAFSmartPointer<IAAFClassDef>;
    using TypeDef = IAAFSmartPointer<IAAFTypeDef>;
    using DataDef = IAAFSmartPointer<IAAFDataDef>;

    const ClassDef& cdMasterMob() { return LookupClass(masterMob_, AUID_AAFMasterMob); }
    const ClassDef& cdSourceMob() { return LookupClass(sourceMob_, AUID_AAFSourceMob); }
    const ClassDef& cdMultipleDescriptor() {
        return LookupClass(multipleDescriptor_, AUID_AAFMultipleDescriptor);
    }
    const ClassDef& cdImportDescriptor() {
        return LookupClass(importDescriptor_, AUID_AAFImportDescriptor);
    }
    const ClassDef& cdMPEGVideoDescriptor() {
        return LookupClass(mpegVideoDescriptor_, AUID_AAFMPEGVideoDescriptor);
    }
    const ClassDef& cdRGBADescriptor() {
        return LookupClass(rgbaDescriptor_, AUID_AAFRGBADescriptor);
    }
    const ClassDef& cdNetworkLocator() {
        return LookupClass(networkLocator_, AUID_AAFNetworkLocator);
    }
    const ClassDef& cdTaggedValue() { return LookupClass(taggedValue_, AUID_AAFTaggedValue); }
    const ClassDef& cdSequence() { return LookupClass(sequence_, AUID_AAFSequence); }
    const ClassDef& cdTimecode() { return LookupClass(timecode_, AUID_AAFTimecode); }
    const ClassDef& cdFiller() { return LookupClass(filler_, AUID_AAFFiller); }

    const TypeDef& tdInt32() { return LookupType(int32_, kAAFTypeID_Int32); }
    const TypeDef& tdRational() { return LookupType(rational_, kAAFTypeID_Rational); }

    const DataDef& ddTimecode();

private:
    const ClassDef& LookupClass(ClassDef& kept, const aafUID_t& id);
    const TypeDef& LookupType(TypeDef& kept, const aafUID_t& id);

    IAAFSmartPointer<IAAFDictionary> dictionary_;
    ClassDef masterMob_;
    ClassDef sourceMob_;
    ClassDef multipleDescriptor_;
    ClassDef importDescriptor_;
    ClassDef mpegVideoDescriptor_;
    ClassDef rgbaDescriptor_;
    ClassDef networkLocator_;
    ClassDef taggedValue_;
    ClassDef sequence_;
    ClassDef timecode_;
    ClassDef filler_;
    TypeDef int32_;
    TypeDef rational_;
    DataDef timecodeData_;
};

}  // namespace NMA::Impl
