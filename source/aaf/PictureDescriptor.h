// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <tr1/memory>

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/descriptor_data/AAFInfo.h"

namespace NMA::Impl {

// One picture descriptor in the making: the views of the object that its steps
// set values through. The names are those that the log shows. A step gives 0,
// or the result that ends the description.
//
// The retriever's two flags are asked without regard to the road that the clip
// takes. They are those of the last record that was read, so a clip on the
// sample-provider road after an RGBA clip finds no RGBA object and fails; the
// shipped data files have no RGBA record.
struct PictureDescriptor {
    std::tr1::shared_ptr<BaseClip> media;
    NCFSmartPtr<INCFConsole> pConsole;
    IAAFSmartPointer<IAAFMob> pMobMasterMob;
    IAAFSmartPointer<IAAFHeader> pHeader;
    IAAFSmartPointer<IAAFDictionary> pDictionary;
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor;

    AAFInfo aafInfo;
    bool directAccess = true;  // read from the file, not through the sample provider
    aafRational_t aspectRatio = {4, 3};
    aafUID_t containerFormatUID{};
    ColorDetails colorDetails;

    IAAFSmartPointer<IAAFMPEGVideoDescriptor> pMPEGDescriptor;
    IAAFSmartPointer<IAAFRGBADescriptor2> pRGBADescriptor;
    IAAFSmartPointer<IAAFCDCIDescriptor> pCDCIDescriptor;
    IAAFSmartPointer<IAAFDigitalImageDescriptor> pDigitalImageDescriptor;
    IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2;
    IAAFSmartPointer<IAAFFileDescriptor> pFileDescriptor;

    // In the order in which they run.
    NCFRESULT ChooseRoad();
    NCFRESULT Create();
    NCFRESULT QueryViews();
    NCFRESULT DescribeFromClip();    // sample provider only
    NCFRESULT DescribeFromRecord();  // direct access only
    NCFRESULT SetColorLabels();
    NCFRESULT SetReferenceLevels();
    NCFRESULT SetCoding();
    NCFRESULT SetContainer();
    NCFRESULT SetViews();
    NCFRESULT SetRateAndLength();
    NCFRESULT SetExtendedProperties();
    NCFRESULT Append();

private:
    NCFRESULT CreateMPEG();
    NCFRESULT SetComponents();
    NCFRESULT TakeFrameLayoutFromClip(ncfUInt32 movieWidth, ncfUInt32 movieHeight);

    aafRational_t editRate_ = {0, 1};
};

}  // namespace NMA::Impl
