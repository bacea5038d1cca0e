// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFNumbers.h"

// Enumerations of the AAF object model as published: each has 32 bits.

// Values of aafBoolean_t.
using aafBoolean_t = aafInt32;
enum : aafInt32 {
    kAAFFalse = 0,
    kAAFTrue = 1,
};

// Values of aafMobKind_t.
using aafMobKind_t = aafInt32;
enum : aafInt32 {
    kAAFCompMob = 0,
    kAAFMasterMob = 1,
    kAAFFileMob = 2,
    kAAFTapeMob = 3,
    kAAFFilmMob = 4,
    kAAFPrimaryMob = 5,
    kAAFAllMob = 6,
    kAAFPhysicalMob = 7,
};

// Values of aafDropType_t.
using aafDropType_t = aafInt32;
enum : aafInt32 {
    kAAFTcNonDrop = 0,
    kAAFTcDrop = 1,
};

// Values of aafProductReleaseType_t.
using aafProductReleaseType_t = aafInt32;
enum : aafInt32 {
    kAAFVersionUnknown = 0,
    kAAFVersionReleased = 1,
    kAAFVersionDebug = 2,
    kAAFVersionPatched = 3,
    kAAFVersionBeta = 4,
    kAAFVersionPrivateBuild = 5,
};

// Values of eAAFTypeCategory_t.
using eAAFTypeCategory_t = aafInt32;
enum : aafInt32 {
    kAAFTypeCatUnknown = 0,
    kAAFTypeCatInt = 1,
    kAAFTypeCatCharacter = 2,
    kAAFTypeCatStrongObjRef = 3,
    kAAFTypeCatWeakObjRef = 4,
    kAAFTypeCatRename = 5,
    kAAFTypeCatEnum = 6,
    kAAFTypeCatFixedArray = 7,
    kAAFTypeCatVariableArray = 8,
    kAAFTypeCatSet = 9,
    kAAFTypeCatRecord = 10,
    kAAFTypeCatStream = 11,
    kAAFTypeCatString = 12,
    kAAFTypeCatExtEnum = 13,
    kAAFTypeCatIndirect = 14,
    kAAFTypeCatOpaque = 15,
    kAAFTypeCatEncrypted = 16,
};

// Values of aafSearchTag_t.
using aafSearchTag_t = aafInt32;
enum : aafInt32 {
    kAAFNoSearch = 0,
    kAAFByMobID = 1,
    kAAFByMobKind = 2,
    kAAFByName = 3,
    kAAFByClass = 4,
    kAAFByDataDef = 5,
    kAAFByMediaCrit = 6,
    kAAFByUsageCode = 7,
    kAAFByMasterMobUsageCode = 8,
    kAAFBySourceMobUsageCode = 9,
    kAAFByCompositionMobUsageCode = 10,
};

// Values of aafCriteriaType_t.
using aafCriteriaType_t = aafInt32;
enum : aafInt32 {
    kAAFAnyRepresentation = 0,
    kAAFFastestRepresentation = 1,
    kAAFBestFidelityRepresentation = 2,
    kAAFSmallestRepresentation = 3,
};

// Values of aafAppendOption_t.
using aafAppendOption_t = aafInt32;
enum : aafInt32 {
    kAAFAppend = 0,
    kAAFForceOverwrite = 1,
};

// Values of aafDepend_t.
using aafDepend_t = aafInt32;
enum : aafInt32 {
    kAAFNoFollowDepend = 0,
    kAAFFollowDepend = 1,
};

// Values of aafIncMedia_t.
using aafIncMedia_t = aafInt32;
enum : aafInt32 {
    kAAFNoIncludeMedia = 0,
    kAAFIncludeMedia = 1,
};

// Values of aafMediaOpenMode_t.
using aafMediaOpenMode_t = aafInt32;
enum : aafInt32 {
    kAAFMediaOpenReadOnly = 0,
    kAAFMediaOpenAppend = 1,
};

// Values of aafCompressEnable_t.
using aafCompressEnable_t = aafInt32;
enum : aafInt32 {
    kAAFCompressionEnable = 0,
    kAAFCompressionDisable = 1,
};

// Values of aafFileFormat_t.
using aafFileFormat_t = aafInt32;
enum : aafInt32 {
    kAAFEssence = 0,
    kAAFForeignMedia = 1,
};

// Values of aafFileRev_t.
using aafFileRev_t = aafInt32;
enum : aafInt32 {
    kAAFRev1 = 0,
    kAAFRev2 = 1,
};

// Values of aafFileExistence_t.
using aafFileExistence_t = aafInt32;
enum : aafInt32 {
    kAAFFileExistence_new = 1,
    kAAFFileExistence_existing = 2,
};

// Values of aafFileAccess_t.
using aafFileAccess_t = aafInt32;
enum : aafInt32 {
    kAAFFileAccess_none = 0,
    kAAFFileAccess_read = 1,
    kAAFFileAccess_write = 2,
    kAAFFileAccess_modify = 3,
};

// Values of aafTitleAlignmentType_t.
using aafTitleAlignmentType_t = aafInt32;
enum : aafInt32 {
    kAAFTitleAlignment_Left = 0,
    kAAFTitleAlignment_Center = 1,
    kAAFTitleAlignment_Right = 2,
};

// Values of aafFadeType_t.
using aafFadeType_t = aafInt32;
enum : aafInt32 {
    kAAFFadeNone = 0,
    kAAFFadeLinearAmp = 1,
    kAAFFadeLinearPower = 2,
};

// Values of aafPulldownKind_t.
using aafPulldownKind_t = aafInt32;
enum : aafInt32 {
    kAAFTwoThreePD = 0,
    kAAFPALPD = 1,
    kAAFOneToOneNTSC = 2,
    kAAFOneToOnePAL = 3,
    kAAFVideoTapNTSC = 4,
    kAAFOneToOneHDSixty = 5,
    kAAFTwentyFourToSixtyPD = 6,
    kAAFTwoToOnePD = 7,
};

// Values of aafPulldownDir_t.
using aafPulldownDir_t = aafInt32;
enum : aafInt32 {
    kAAFTapeToFilmSpeed = 0,
    kAAFFilmToTapeSpeed = 1,
};

// Values of aafEdgeType_t.
using aafEdgeType_t = aafInt32;
enum : aafInt32 {
    kAAFEtNull = 0,
    kAAFEtKeycode = 1,
    kAAFEtEdgenum4 = 2,
    kAAFEtEdgenum5 = 3,
    kAAFEtHeaderSize = 8,
};

// Values of aafFilmType_t.
using aafFilmType_t = aafInt32;
enum : aafInt32 {
    kAAFFtNull = 0,
    kAAFFt35MM = 1,
    kAAFFt16MM = 2,
    kAAFFt8MM = 3,
    kAAFFt65MM = 4,
};

// Values of aafReferenceType_t.
using aafReferenceType_t = aafInt32;
enum : aafInt32 {
    kAAFRefLimitMinimum = 0,
    kAAFRefLimitMaximum = 1,
    kAAFRefMinimum = 2,
    kAAFRefMaximum = 3,
    kAAFRefEnumvalue = 4,
};

// Values of eAAFByteOrder_t.
using eAAFByteOrder_t = aafInt32;
enum : aafInt32 {
    kAAFByteOrderLittle = 0,
    kAAFByteOrderBig = 1,
};

// Values of aafOperationChoice_t.
using aafOperationChoice_t = aafInt32;
enum : aafInt32 {
    kAAFFindNull = 0,
    kAAFFindIncoming = 1,
    kAAFFindOutgoing = 2,
    kAAFFindRender = 3,
    kAAFFindOperationSrc1 = 4,
    kAAFFindOperationSrc2 = 5,
    kAAFFindOperationSrc3 = 6,
    kAAFFindOperationSrc4 = 7,
    kAAFFindOperationSrc5 = 8,
    kAAFFindOperationSrc6 = 9,
    kAAFFindOperationSrc7 = 10,
    kAAFFindOperationSrc8 = 11,
};

// Values of aafEditHint_t.
using aafEditHint_t = aafInt32;
enum : aafInt32 {
    kAAFNoEditHint = 0,
    kAAFProportional = 1,
    kAAFRelativeLeft = 2,
    kAAFRelativeRight = 3,
    kAAFRelativeFixed = 4,
};

// Values of aafTimecodeSourceType_t.
using aafTimecodeSourceType_t = aafInt32;
enum : aafInt32 {
    kAAFTimecodeLTC = 0,
    kAAFTimecodeVITC = 1,
};

// Values of aafPropertyOpt_t.
using aafPropertyOpt_t = aafInt32;
enum : aafInt32 {
    kAAFPropRequired = 0,
    kAAFPropOptional = 1,
};

// Values of AAFDataDefinitionMatch_t.
using AAFDataDefinitionMatch_t = aafInt32;
enum : aafInt32 {
    kAAFExactMatch = 0,
    kAAFConvertTo = 1,
    kAAFConvertFrom = 2,
};
