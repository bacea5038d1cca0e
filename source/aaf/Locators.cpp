// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/Locators.h"

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/aaf/AAFDefs.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT AddLocator(const NMAString& theMoviePathW, IAAFSmartPointer<IAAFDictionary> pDictionary,
                     IAAFSmartPointer<IAAFEssenceDescriptor> pEssenceDesc) {
    return ResultOf([&]() -> NCFRESULT {
        NMAString url;
        ThrowIfFailed(MakeURLPathFromFilePath(theMoviePathW.InArg(), url.OutArg()));
        AAFDefs defs(pDictionary);
        IAAFSmartPointer<IAAFNetworkLocator> pNetworkLocator;
        ThrowIfFailed(defs.cdNetworkLocator()->CreateInstance(IID_IAAFNetworkLocator,
                                                              (IUnknown**)&pNetworkLocator));
        IAAFSmartPointer<IAAFLocator> pLocator;
        ThrowIfFailed(pNetworkLocator->QueryInterface(IID_IAAFLocator, (void**)&pLocator));
        ThrowIfFailed(pLocator->SetPath(url.GetWCHARString()));
        ThrowIfFailed(pEssenceDesc->AppendLocator(pLocator));
        return NCF_OK;
    });
}

NCFRESULT AddStartTimeToSourceClip(IAAFSmartPointer<IAAFMob> pMobFileMob,
                                   aafPosition_t absoluteStartTime) {
    return ResultOf([&]() -> NCFRESULT {
        IAAFSmartPointer<IEnumAAFMobSlots> pSlots;
        ThrowIfFailed(pMobFileMob->GetSlots(&pSlots));
        IAAFSmartPointer<IAAFMobSlot> pSlot;
        while (pSlots->NextOne(&pSlot) == 0) {
            IAAFSmartPointer<IAAFSegment> pSegment;
            ThrowIfFailed(pSlot->GetSegment(&pSegment));
            IAAFSmartPointer<IAAFSourceClip> pSourceClip;
            ThrowIfFailed(pSegment->QueryInterface(IID_IAAFSourceClip, (void**)&pSourceClip));
            aafSourceRef_t reference{};
            ThrowIfFailed(pSourceClip->GetSourceReference(&reference));
            reference.startTime += absoluteStartTime;
            ThrowIfFailed(pSourceClip->SetSourceReference(reference));
        }
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
