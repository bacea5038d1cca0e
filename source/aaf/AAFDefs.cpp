// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFDefs.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

namespace NMA::Impl {
namespace {

void RequireFound(HRESULT hr) {
    if (hr < 0) {
        throw "AAFRESULT_SUCCEEDED (hr)";
    }
}

}  // namespace

AAFDefs::AAFDefs(IAAFSmartPointer<IAAFDictionary> pDict) : dictionary_(pDict) {
    if (!pDict) {
        throw "pDict";
    }
}

const AAFDefs::ClassDef& AAFDefs::LookupClass(ClassDef& kept, const aafUID_t& id) {
    if (!kept) {
        RequireFound(dictionary_->LookupClassDef(id, &kept));
    }
    return kept;
}

const AAFDefs::TypeDef& AAFDefs::LookupType(TypeDef& kept, const aafUID_t& id) {
    if (!kept) {
        RequireFound(dictionary_->LookupTypeDef(id, &kept));
    }
    return kept;
}

const AAFDefs::ClassDef& AAFDefs::cdMasterMob() {
    return LookupClass(masterMob_, AUID_AAFMasterMob);
}

const AAFDefs::ClassDef& AAFDefs::cdSourceMob() {
    return LookupClass(sourceMob_, AUID_AAFSourceMob);
}

const AAFDefs::ClassDef& AAFDefs::cdMultipleDescriptor() {
    return LookupClass(multipleDescriptor_, AUID_AAFMultipleDescriptor);
}

const AAFDefs::ClassDef& AAFDefs::cdImportDescriptor() {
    return LookupClass(importDescriptor_, AUID_AAFImportDescriptor);
}

const AAFDefs::ClassDef& AAFDefs::cdMPEGVideoDescriptor() {
    return LookupClass(mpegVideoDescriptor_, AUID_AAFMPEGVideoDescriptor);
}

const AAFDefs::ClassDef& AAFDefs::cdRGBADescriptor() {
    return LookupClass(rgbaDescriptor_, AUID_AAFRGBADescriptor);
}

const AAFDefs::ClassDef& AAFDefs::cdNetworkLocator() {
    return LookupClass(networkLocator_, AUID_AAFNetworkLocator);
}

const AAFDefs::ClassDef& AAFDefs::cdTaggedValue() {
    return LookupClass(taggedValue_, AUID_AAFTaggedValue);
}

const AAFDefs::ClassDef& AAFDefs::cdSequence() {
    return LookupClass(sequence_, AUID_AAFSequence);
}

const AAFDefs::ClassDef& AAFDefs::cdTimecode() {
    return LookupClass(timecode_, AUID_AAFTimecode);
}

const AAFDefs::ClassDef& AAFDefs::cdFiller() {
    return LookupClass(filler_, AUID_AAFFiller);
}

const AAFDefs::TypeDef& AAFDefs::tdInt32() {
    return LookupType(int32_, kAAFTypeID_Int32);
}

const AAFDefs::TypeDef& AAFDefs::tdRational() {
    return LookupType(rational_, kAAFTypeID_Rational);
}

const AAFDefs::DataDef& AAFDefs::ddTimecode() {
    if (!timecodeData_) {
        RequireFound(dictionary_->LookupDataDef(kAAFDataDef_LegacyTimecode, &timecodeData_));
    }
    return timecodeData_;
}

}  // namespace NMA::Impl
