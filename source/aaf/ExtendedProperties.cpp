// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/ExtendedProperties.h"

#include <cstddef>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/PropertyRegistration.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

static_assert(offsetof(BoundsBox, positionX) == 0 && offsetof(BoundsBox, positionY) == 8 &&
                  offsetof(BoundsBox, width) == 16 && offsetof(BoundsBox, height) == 24,
              "the rectangle goes to the library as it lies in memory");

// In the order in which they are written.
struct BoxProperty {
    aafUID_t id;
    const aafCharacter* name;
    BoundsBox GeometryDetails::*box;
};
constexpr BoxProperty kBoxProperties[] = {
    {kAAFPropID_DIDEssenceBox, L"EssenceBox", &GeometryDetails::essence},
    {kAAFPropID_DIDSourceBox, L"SourceBox", &GeometryDetails::source},
    {kAAFPropID_DIDValidBox, L"ValidBox", &GeometryDetails::valid},
    {kAAFPropID_DIDBoundsBox, L"BoundsBox", &GeometryDetails::framing},
};

IAAFSmartPointer<IAAFTypeDef> RequireBoundsBoxType(
    const IAAFSmartPointer<IAAFDictionary>& pDictionary) {
    IAAFSmartPointer<IAAFTypeDef> pTypeDef;
    if (pDictionary->LookupTypeDef(kAAFTypeID_NivoBoundsBox, &pTypeDef) < 0) {
        ThrowIfFailed(pDictionary->CreateMetaInstance(AUID_AAFTypeDefRecord, IID_IAAFTypeDef,
                                                      (IUnknown**)&pTypeDef));
        ThrowIfFailed(InitializeNivoBoundsBoxType(pDictionary, pTypeDef));
        ThrowIfFailed(pDictionary->RegisterTypeDef(pTypeDef));
    }
    return pTypeDef;
}

void PutBox(const IAAFSmartPointer<IAAFClassDef>& pClassDef,
            const IAAFSmartPointer<IAAFTypeDef>& pTypeDef,
            const IAAFSmartPointer<IAAFDigitalImageDescriptor>& pDigitalImageDescriptor,
            const BoxProperty& property, BoundsBox box) {
    const IAAFSmartPointer<IAAFPropertyDef> pPropDef =
        RequireOptionalProperty(pClassDef, property.id, property.name, pTypeDef);
    IAAFSmartPointer<IAAFTypeDefRecord> pTDRec;
    ThrowIfFailed(pTypeDef->QueryInterface(IID_IAAFTypeDefRecord, (void**)&pTDRec));
    aafUInt32 offsets[aafBoundsBoxNumMembers] = {0, 8, 16, 24};
    ThrowIfFailed(pTDRec->RegisterMembers(offsets, aafBoundsBoxNumMembers, sizeof(BoundsBox)));
    IAAFSmartPointer<IAAFPropertyValue> pPV;
    ThrowIfFailed(
        pTDRec->CreateValueFromStruct(reinterpret_cast<aafMemPtr_t>(&box), sizeof(box), &pPV));
    IAAFSmartPointer<IAAFObject> pObject;
    ThrowIfFailed(pDigitalImageDescriptor->QueryInterface(IID_IAAFObject, (void**)&pObject));
    ThrowIfFailed(pObject->SetPropertyValue(pPropDef, pPV));
}

}  // namespace

NCFRESULT InitializeNivoBoundsBoxType(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                      IAAFSmartPointer<IAAFTypeDef> pTypeDef) {
    NCF_FUNCTION("NMA::Impl::InitializeNivoBoundsBoxType");
    return ResultOf([&]() -> NCFRESULT {
        AAFDefs defs(pDictionary);
        IAAFSmartPointer<IAAFTypeDefRecord> pTDRec;
        NCF_RETURN(pTypeDef->QueryInterface(IID_IAAFTypeDefRecord, (void**) &pTDRec));
        IAAFTypeDef* const rational = defs.tdRational();
        IAAFTypeDef* memberTypes[aafBoundsBoxNumMembers] = {rational, rational, rational, rational};
        aafCharacter positionX[] = L"PositionX";
        aafCharacter positionY[] = L"PositionY";
        aafCharacter width[] = L"Width";
        aafCharacter height[] = L"Height";
        aafString_t memberNames[aafBoundsBoxNumMembers] = {positionX, positionY, width, height};
        NCF_RETURN(pTDRec->Initialize(kAAFTypeID_NivoBoundsBox, memberTypes, memberNames,
                                      aafBoundsBoxNumMembers, L"BoundsBox"));
        return NCF_OK;
    });
}

NCFRESULT SetAVCISliceCount(IAAFSmartPointer<IAAFHeader> /*pHeader*/,
                            IAAFSmartPointer<IAAFDictionary> pDictionary,
                            IAAFSmartPointer<IAAFCDCIDescriptor> pCDCIDescriptor,
                            ncfUInt32 sliceCount) {
    NCF_FUNCTION("NMA::Impl::SetAVCISliceCount");
    IAAFSmartPointer<IAAFTypeDef> pTDint32;
    IAAFSmartPointer<IAAFTypeDefInt> pTDInt;
    NCF_RETURN(pDictionary->LookupTypeDef(kAAFTypeID_Int32, &pTDint32));
    NCF_RETURN(pTDint32->QueryInterface(IID_IAAFTypeDefInt, (void**)&pTDInt));
    ncfUInt32 localSliceCount = sliceCount;
    IAAFSmartPointer<IAAFPropertyValue> pPVsliceCount;
    NCF_RETURN(pTDInt->CreateValue((aafMemPtr_t)&localSliceCount, sizeof(localSliceCount),
                                   &pPVsliceCount));
    IAAFSmartPointer<IAAFClassDef> pClassDef;
    NCF_RETURN(pDictionary->LookupClassDef(AUID_AAFCDCIDescriptor,& pClassDef));
    IAAFSmartPointer<IAAFPropertyDef> pPropDef;
    if (pClassDef->LookupPropertyDef(kAAFPropID_CDCIAVCISliceCount, &pPropDef) < 0) {
        NCF_RETURN(pClassDef->RegisterOptionalPropertyDef(kAAFPropID_CDCIAVCISliceCount,
                                                          L"AVCISliceCount", pTDint32, &pPropDef));
    }
    IAAFSmartPointer<IAAFObject> pObject;
    NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFObject,(void**)&pObject));
    NCF_RETURN(pObject->SetPropertyValue(pPropDef, pPVsliceCount));
    return NCF_OK;
}

NCFRESULT PutBoxesToAAF(IAAFSmartPointer<IAAFDictionary> pDictionary,
                        IAAFSmartPointer<IAAFDigitalImageDescriptor> pDigitalImageDescriptor,
                        const GeometryDetails& geometryDetails) {
    return ResultOf([&]() -> NCFRESULT {
        IAAFSmartPointer<IAAFClassDef> pClassDef;
        ThrowIfFailed(pDictionary->LookupClassDef(AUID_AAFDigitalImageDescriptor, &pClassDef));
        const IAAFSmartPointer<IAAFTypeDef> pTypeDef = RequireBoundsBoxType(pDictionary);
        for (const BoxProperty& property : kBoxProperties) {
            PutBox(pClassDef, pTypeDef, pDigitalImageDescriptor, property,
                   geometryDetails.*property.box);
        }
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
