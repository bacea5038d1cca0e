// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
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

    const ClassDef& cdMasterMob();
    const ClassDef& cdSourceMob();
    const ClassDef& cdMultipleDescriptor();
    const ClassDef& cdImportDescriptor();
    const ClassDef& cdMPEGVideoDescriptor();
    const ClassDef& cdRGBADescriptor();
    const ClassDef& cdNetworkLocator();
    const ClassDef& cdTaggedValue();
    const ClassDef& cdSequence();
    const ClassDef& cdTimecode();
    const ClassDef& cdFiller();

    const TypeDef& tdInt32();
    const TypeDef& tdRational();

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
