// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/ClipRecords.h"

namespace NMA::Impl {

// Properties of picture descriptors beyond the published model. Each file has a
// dictionary of its own, so they are registered on each file anew, and only
// where a look-up finds nothing: two pictures of one file meet here twice.

// A rectangle of four rationals.
inline constexpr aafUID_t kAAFTypeID_NivoBoundsBox =
    ncfGuid("0E040301-0200-0000-060E-2B3401040101");
inline constexpr aafUInt32 aafBoundsBoxNumMembers = 4;

inline constexpr aafUID_t kAAFPropID_DIDEssenceBox =
    ncfGuid("0E040101-0101-0107-060E-2B3401010101");
inline constexpr aafUID_t kAAFPropID_DIDSourceBox = ncfGuid("0E040101-0101-0108-060E-2B3401010101");
inline constexpr aafUID_t kAAFPropID_DIDValidBox = ncfGuid("0E040101-0101-0106-060E-2B3401010101");
// The same id as that of the type: the two are separate name spaces.
inline constexpr aafUID_t kAAFPropID_DIDBoundsBox = ncfGuid("0E040301-0200-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFPropID_CDCIAVCISliceCount =
    ncfGuid("0E040101-0101-010E-060E-2B3401010101");

// Gives a new record type its id, name and members.
NCFRESULT InitializeNivoBoundsBoxType(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                      IAAFSmartPointer<IAAFTypeDef> pTypeDef);

// Sets the four rectangles on a picture descriptor as they are: a clip without
// bounds carries zeros.
NCFRESULT PutBoxesToAAF(IAAFSmartPointer<IAAFDictionary> pDictionary,
                        IAAFSmartPointer<IAAFDigitalImageDescriptor> pDigitalImageDescriptor,
                        const GeometryDetails& geometryDetails);

// Sets the number of slices of an AVC-Intra picture. `pHeader` is not read.
NCFRESULT SetAVCISliceCount(IAAFSmartPointer<IAAFHeader> pHeader,
                            IAAFSmartPointer<IAAFDictionary> pDictionary,
                            IAAFSmartPointer<IAAFCDCIDescriptor> pCDCIDescriptor,
                            ncfUInt32 sliceCount);

}  // namespace NMA::Impl
