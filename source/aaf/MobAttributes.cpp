// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/MobAttributes.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/PropertyRegistration.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT AddMasterMobAppCode(IAAFSmartPointer<IAAFDictionary> pDictionary,
                              IAAFSmartPointer<IAAFMasterMob> pMasterMob, aafInt32 appCode) {
    return ResultOf([&]() -> NCFRESULT {
        IAAFSmartPointer<IAAFObject> pObject;
        ThrowIfFailed(pMasterMob->QueryInterface(IID_IAAFObject, (void**)&pObject));
        IAAFSmartPointer<IAAFTypeDef> pTypeDef;
        ThrowIfFailed(pDictionary->LookupTypeDef(kAAFTypeID_Int32, &pTypeDef));
        IAAFSmartPointer<IAAFTypeDefInt> pTDInt;
        ThrowIfFailed(pTypeDef->QueryInterface(IID_IAAFTypeDefInt, (void**)&pTDInt));
        aafInt32 value = appCode;
        IAAFSmartPointer<IAAFPropertyValue> pPV;
        ThrowIfFailed(
            pTDInt->CreateValue(reinterpret_cast<aafMemPtr_t>(&value), sizeof(value), &pPV));
        IAAFSmartPointer<IAAFClassDef> pClassDef;
        ThrowIfFailed(pDictionary->LookupClassDef(AUID_AAFMob, &pClassDef));
        const IAAFSmartPointer<IAAFPropertyDef> pPropDef =
            RequireOptionalProperty(pClassDef, kAAFPropID_MobAppCode, L"AppCode", pTypeDef);
        ThrowIfFailed(pObject->SetPropertyValue(pPropDef, pPV));
        return NCF_OK;
    });
}

NCFRESULT AddMasterMobAttributes(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                 IAAFSmartPointer<IAAFMasterMob> pMasterMob) {
    return ResultOf([&]() -> NCFRESULT {
        IAAFSmartPointer<IAAFTypeDef> pTypeDef;
        ThrowIfFailed(
            pDictionary->LookupTypeDef(kAAFTypeID_TaggedValueStrongReferenceVector, &pTypeDef));
        IAAFSmartPointer<IAAFTypeDefVariableArray> pTDVarArray;
        ThrowIfFailed(pTypeDef->QueryInterface(IID_IAAFTypeDefVariableArray, (void**)&pTDVarArray));
        IAAFSmartPointer<IAAFClassDef> pClassDef;
        ThrowIfFailed(pDictionary->LookupClassDef(AUID_AAFMob, &pClassDef));
        const IAAFSmartPointer<IAAFPropertyDef> pPropDef = RequireOptionalProperty(
            pClassDef, kAAFPropID_MobAttributeList, L"MobAttributeList", pTypeDef);
        IAAFSmartPointer<IAAFPropertyValue> pPVArray;
        ThrowIfFailed(pTDVarArray->CreateEmptyValue(&pPVArray));
        IAAFSmartPointer<IAAFObject> pObject;
        ThrowIfFailed(pMasterMob->QueryInterface(IID_IAAFObject, (void**)&pObject));
        // The mob keeps this very value, so what is appended to it now is on
        // the mob.
        ThrowIfFailed(pObject->SetPropertyValue(pPropDef, pPVArray));
        ThrowIfFailed(AddReformattingOption(pDictionary, pTDVarArray, pPVArray));
        return NCF_OK;
    });
}

NCFRESULT AddReformattingOption(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                IAAFSmartPointer<IAAFTypeDefVariableArray> pTDVarArray,
                                IAAFSmartPointer<IAAFPropertyValue> pPVArray) {
    NCF_FUNCTION("NMA::Impl::AddReformattingOption");
    CHK_INARG(pPVArray);
    AAFDefs defs(pDictionary);
    IAAFSmartPointer<IAAFTypeDef> pTypeDefTVSR;
    NCF_RETURN(pDictionary->LookupTypeDef(kAAFTypeID_TaggedValueStrongReference, &pTypeDefTVSR));
    IAAFSmartPointer<IAAFTypeDefObjectRef> pTDObjRef;
    NCF_RETURN(pTypeDefTVSR->QueryInterface (IID_IAAFTypeDefObjectRef, (void **)&pTDObjRef));
    IAAFSmartPointer<IAAFTaggedValue> pTaggedValue;
    NCF_RETURN(
        defs.cdTaggedValue()->CreateInstance(IID_IAAFTaggedValue, (IUnknown **)&pTaggedValue));
    aafUInt8 value[sizeof(aafInt32)] = {};
    NCF_RETURN(pTaggedValue->Initialize(L"_BOUNDS_REFORMATTING_OPTION", defs.tdInt32(),
                                        sizeof(aafInt32), value));
    IAAFSmartPointer<IAAFPropertyValue> pPVObject;
    NCF_RETURN(pTDObjRef->CreateValue(pTaggedValue, &pPVObject));
    NCF_RETURN(pTDVarArray->AppendElement(pPVArray,pPVObject));
    return NCF_OK;
}

}  // namespace NMA::Impl
