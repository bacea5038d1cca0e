// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/VideoDescriptor.h"

#include "source/aaf/PictureDescriptor.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

constexpr NCFRESULT (PictureDescriptor::*kSteps[])() = {
    &PictureDescriptor::ChooseRoad,
    &PictureDescriptor::Create,
    &PictureDescriptor::QueryViews,
    &PictureDescriptor::DescribeFromClip,
    &PictureDescriptor::DescribeFromRecord,
    &PictureDescriptor::SetColorLabels,
    &PictureDescriptor::SetReferenceLevels,
    &PictureDescriptor::SetCoding,
    &PictureDescriptor::SetContainer,
    &PictureDescriptor::SetViews,
    &PictureDescriptor::SetRateAndLength,
    &PictureDescriptor::SetExtendedProperties,
    &PictureDescriptor::Append,
};

}  // namespace

NCFRESULT AddVideoDescriptor(std::tr1::shared_ptr<BaseClip> media,
                             NCFSmartPtr<INCFConsole> pConsole,
                             IAAFSmartPointer<IAAFMob> pMobMasterMob,
                             IAAFSmartPointer<IAAFHeader> pHeader,
                             IAAFSmartPointer<IAAFDictionary> pDictionary,
                             IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor) {
    NCF_FUNCTION("NMA::Impl::AddVideoDescriptor");
    CHK_PTR(media.get());
    CHK_PTR(pConsole);
    CHK_PTR(pMobMasterMob);
    CHK_PTR(pHeader);
    CHK_PTR(pDictionary);
    CHK_PTR(pMultiDescriptor);

    PictureDescriptor picture;
    picture.media = media;
    picture.pConsole = pConsole;
    picture.pMobMasterMob = pMobMasterMob;
    picture.pHeader = pHeader;
    picture.pDictionary = pDictionary;
    picture.pMultiDescriptor = pMultiDescriptor;
    for (const auto step : kSteps) {
        const NCFRESULT result = (picture.*step)();
        if (result != NCF_OK) {
            return result;
        }
    }
    return NCF_OK;
}

// clang-format off
NCFRESULT FixMultiDescSampleRate(IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDesc,
                                 const aafRational_t& sampleRate) {
    NCF_FUNCTION("NMA::Impl::FixMultiDescSampleRate");
    CHK_INARG(pMultiDesc);
    IAAFSmartPointer<IAAFFileDescriptor> pFileDescriptor;
    NCF_RETURN(pMultiDesc->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDescriptor));
    aafRational_t currentSampleRate{};
    NCF_RETURN(pFileDescriptor->GetSampleRate(&currentSampleRate));
    if (currentSampleRate.numerator == 0 && currentSampleRate.denominator == 0) {
        NCF_RETURN(pFileDescriptor->SetSampleRate(sampleRate));
    }
    return NCF_OK;
}
// clang-format on

}  // namespace NMA::Impl
