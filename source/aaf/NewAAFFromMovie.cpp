// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The road from clip to file, in the order of its steps:
//
//   open file, make mobs -> rate and length -> ids and names -> slots and
//   descriptors -> locators -> start of the source clips -> mobs into the
//   file -> columns and attributes of the master mob

#include "source/aaf/NewAAFFromMovie.h"

#include "host_interfaces/Version.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/AAFRunTimeLibrary.h"
#include "source/aaf/BinColumnMapping.h"
#include "source/aaf/ClipDescription.h"
#include "source/aaf/EditorSettingsReader.h"
#include "source/aaf/Locators.h"
#include "source/aaf/MobAttributes.h"
#include "source/aaf/MobIds.h"
#include "source/aaf/RunSteps.h"
#include "source/aaf/Tracks.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::NewAAFFromMovie");

// The file in the making.
struct Description : ClipDescription {
    NMAString theMoviePathW;
    NMAString clipName;
    bool showsAlpha = false;
    aafPosition_t absoluteStartTime = 0;

    NCFRESULT OpenFile();
    NCFRESULT MakeMobs();
    NCFRESULT SetRateAndLength();
    NCFRESULT IdentifyMobs();
    NCFRESULT DescribeFileMob();
    NCFRESULT DescribeSourceMob();
    NCFRESULT AddMobs();
    NCFRESULT FinishMasterMob();
};

NCFRESULT Description::OpenFile() {
    aafCharacter companyName[] = L"Cliphost";
    aafCharacter productName[] = L"QuickTime Plug-In";
    aafCharacter productVersionString[] = L"" PRODUCT_VERSION_TEXT;
    aafCharacter platform[] = L"Win64";
    aafProductVersion_t productVersion = {PRODUCT_VERSION_NUMBERS, 6720, kAAFVersionUnknown};
    aafProductIdentification_t productID = {companyName,
                                            productName,
                                            productVersionString,
                                            ncfGuid("781F84B7-B989-4534-8A07-C595CB9A6FB8"),
                                            platform,
                                            &productVersion};

    NCF_RETURN(AAFFileOpenTransient(&productID, &pTheAAFFile));
    NCF_RETURN(pTheAAFFile->GetHeader(&pHeader));
    NCF_RETURN(pHeader->GetDictionary(&pDictionary));
    return NCF_OK;
}

NCFRESULT Description::MakeMobs() {
    AAFDefs defs(pDictionary);
    NCF_RETURN(defs.cdMasterMob()->CreateInstance(IID_IAAFMob, (IUnknown **)&pMobMasterMob));
    NCF_RETURN(pMobMasterMob->QueryInterface(IID_IAAFMasterMob, (void **)&pMasterMob));
    NCF_RETURN(pMasterMob->Initialize());

    NCF_RETURN(defs.cdSourceMob()->CreateInstance(IID_IAAFMob, (IUnknown **)&pMobFileMob));
    NCF_RETURN(pMobFileMob->QueryInterface(IID_IAAFSourceMob, (void **)&pFileMob));
    NCF_RETURN(pFileMob->Initialize());

    NCF_RETURN(defs.cdSourceMob()->CreateInstance(IID_IAAFMob, (IUnknown **)&pMobSourceMob));
    NCF_RETURN(pMobSourceMob->QueryInterface(IID_IAAFSourceMob, (void **)&pSourceMob));
    NCF_RETURN(pSourceMob->Initialize());

    NCF_RETURN(NMASplitPath(theMoviePathW.InArg(), clipName.OutArg()));
    return NCF_OK;
}

NCFRESULT Description::SetRateAndLength() {
    const EditorSettings editorSettings = ReadEditorSettings(pComponentFactory);
    NCF_RETURN(media->SetEditRate(editorSettings));
    NCF_RETURN(media->SetMovieLength(editorSettings));
    return NCF_OK;
}

NCFRESULT Description::IdentifyMobs() {
    ByteVector pContent;
    NCF_RETURN(media->GetContentForHash(pContent));
    showsAlpha = media->ShowsAlpha();

    const ncfUInt8 nothing = 0;  // content of no bytes still has an address
    const ncfUInt8* const content = pContent.empty() ? &nothing : pContent.data();
    aafMobID_t fileMobID = MobIdTemplate(kFileMobInstance);
    NCF_RETURN_TEXT(
        "GenerateUID(media, &pContent[0], (ncfUInt32)pContent.size(), fileMobID.material)",
        GenerateUID(media, content, (ncfUInt32)pContent.size(), fileMobID.material));
    aafMobID_t masterMobID = fileMobID;
    masterMobID.instanceHigh = kMasterMobInstance;
    aafMobID_t sourceMobID = fileMobID;
    sourceMobID.instanceHigh = kSourceMobInstance;

    NCF_RETURN(pMobMasterMob->SetMobID(masterMobID));
    NCF_RETURN(pMobFileMob->SetMobID(fileMobID));
    NCF_RETURN(pMobSourceMob->SetMobID(sourceMobID));
    NCF_RETURN(pMobMasterMob->SetName(clipName.GetWCHARString()));
    NCF_RETURN(pMobFileMob->SetName(clipName.GetWCHARString()));
    NCF_RETURN(pMobSourceMob->SetName(clipName.GetWCHARString()));
    return NCF_OK;
}

// All slots, and the file mob's descriptor with the movie's location.
NCFRESULT Description::DescribeFileMob() {
    AAFDefs defs(pDictionary);
    IAAFSmartPointer<IAAFFileDescriptor> pFileDescriptor;
    NCF_RETURN(defs.cdMultipleDescriptor()->CreateInstance(IID_IAAFMultipleDescriptor,
                                                           (IUnknown **)&pMultiDescriptor));
    NCF_RETURN(pMultiDescriptor->Initialize());
    NCF_RETURN(pMultiDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDescriptor));

    NCF_RETURN(AddTracksToAAF(media, pConsole, pHeader, pDictionary, pMobMasterMob, pMasterMob,
                              pMobFileMob, pFileMob, pMobSourceMob, pSourceMob, pMultiDescriptor,
                              pComponentFactory, &absoluteStartTime));

    IAAFSmartPointer<IAAFEssenceDescriptor> pEssenceDesc;
    NCF_RETURN(
        pMultiDescriptor->QueryInterface (IID_IAAFEssenceDescriptor, (void **)&pEssenceDesc));
    NCF_RETURN(AddLocator(theMoviePathW, pDictionary, pEssenceDesc));
    NCF_RETURN(pFileMob->SetEssenceDescriptor(pEssenceDesc));
    return NCF_OK;
}

// The movie that the clip was imported from; its location is all there is.
NCFRESULT Description::DescribeSourceMob() {
    AAFDefs defs(pDictionary);
    IAAFSmartPointer<IAAFImportDescriptor> pImportDesc;
    IAAFSmartPointer<IAAFEssenceDescriptor> pEssenceDesc;
    NCF_RETURN(defs.cdImportDescriptor()->CreateInstance(IID_IAAFImportDescriptor,
                                                         (IUnknown **)&pImportDesc));
    NCF_RETURN(pImportDesc->QueryInterface(IID_IAAFEssenceDescriptor, (void **)&pEssenceDesc));
    NCF_RETURN(AddLocator(theMoviePathW, pDictionary, pEssenceDesc));
    NCF_RETURN(pSourceMob->SetEssenceDescriptor(pEssenceDesc));
    return NCF_OK;
}

// Only now, when all slots and descriptors stand: a description that failed
// before leaves no mob in its file.
NCFRESULT Description::AddMobs() {
    NCF_RETURN(AddStartTimeToSourceClip(pMobFileMob, absoluteStartTime));
    NCF_RETURN(pHeader->AddMob(pMobMasterMob));
    NCF_RETURN(pHeader->AddMob(pMobFileMob));
    NCF_RETURN(pHeader->AddMob(pMobSourceMob));
    return NCF_OK;
}

NCFRESULT Description::FinishMasterMob() {
    if (showsAlpha) {
        NCF_RETURN(AddMasterMobAppCode( pDictionary, pMasterMob, kPrecomputeMasterMob ));
    }
    NCF_RETURN(AddBinColMappingToMob( pMobMasterMob ));
    NCF_RETURN(AddMasterMobAttributes(pDictionary,pMasterMob));
    return NCF_OK;
}

}  // namespace

NCFRESULT NewAAFFromMovie(std::tr1::shared_ptr<BaseClip> media, NCFSmartPtr<INCFConsole> pConsole,
                          IAAFFile** pOutAAFFile, INCFComponentFactory* pComponentFactory) {
    CHK_INARG(media.get());
    CHK_INARG(pOutAAFFile);
    return ResultOf([&]() -> NCFRESULT {
        const NCFSmartPtr<INCFString> fileName = media->GetFileName();
        if (fileName && fileName->IsEmpty()) {
            throw NCF_E_INVALIDARG;
        }
        Description description;
        description.media = media;
        description.pConsole = pConsole;
        description.pComponentFactory = pComponentFactory;
        description.theMoviePathW = NMAString(fileName.inArg(), kNCFWCHAR);
        const NCFRESULT result =
            RunSteps(description, &Description::OpenFile, &Description::MakeMobs,
                     &Description::SetRateAndLength, &Description::IdentifyMobs,
                     &Description::DescribeFileMob, &Description::DescribeSourceMob,
                     &Description::AddMobs, &Description::FinishMasterMob);
        if (result != NCF_OK) {
            return result;
        }
        *pOutAAFFile = description.pTheAAFFile;
        (*pOutAAFFile)->AddRef();
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
