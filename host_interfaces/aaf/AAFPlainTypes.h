// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"

// Plain types of the AAF object model as published: structures have natural
// alignment and the same offsets on every platform.

#ifdef _WIN32
using aafInt32 = long;
using aafUInt32 = unsigned long;
#else
using aafInt32 = std::int32_t;
using aafUInt32 = std::uint32_t;
#endif
using aafInt8 = signed char;
using aafUInt8 = unsigned char;
using aafInt16 = std::int16_t;
using aafUInt16 = std::uint16_t;
using aafInt64 = std::int64_t;
using aafUInt64 = std::uint64_t;
using aafCharacter = wchar_t;
using aafWChar = wchar_t;
using aafBool = aafInt32;

// Results and counts of the published interfaces. HRESULT is `long` on
// Windows: convert before it is thrown or compared with an NCFRESULT.
using HRESULT = aafInt32;
using AAFRESULT = aafInt32;
using ULONG = aafUInt32;

#ifndef _WIN32  // the system's header for GUID has these
using IID = GUID;
using CLSID = GUID;
using REFIID = const GUID&;
using REFCLSID = const GUID&;
#endif

using aafUID_t = GUID;
using aafMemPtr_t = aafUInt8*;
using aafMemConstPtr_t = const aafUInt8*;
using aafDataBuffer_t = aafUInt8*;
using aafDataValue_t = aafUInt8*;
using aafString_t = aafCharacter*;
using aafCharacter_constptr = const aafCharacter*;

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

// Values of aafFrameLayout_t.
using aafFrameLayout_t = aafInt32;
enum : aafInt32 {
    kAAFFullFrame = 0,
    kAAFSeparateFields = 1,
    kAAFOneField = 2,
    kAAFMixedFields = 3,
    kAAFSegmentedFrame = 4,
};

// Values of aafColorSiting_t.
using aafColorSiting_t = aafInt32;
enum : aafInt32 {
    kAAFCoSiting = 0,
    kAAFAveraging = 1,
    kAAFThreeTap = 2,
    kAAFQuincunx = 3,
    kAAFRec601 = 4,
    kAAFUnknownSiting = 255,
};

// Values of aafRGBAComponentKind_t.
using aafRGBAComponentKind_t = aafInt32;
enum : aafInt32 {
    kAAFCompNone = 48,
    kAAFCompAlpha = 65,
    kAAFCompBlue = 66,
    kAAFCompFill = 70,
    kAAFCompGreen = 71,
    kAAFCompPalette = 80,
    kAAFCompRed = 82,
    kAAFCompNull = 0,
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

// Values of aafAlphaTransparency_t.
using aafAlphaTransparency_t = aafInt32;
enum : aafInt32 {
    kAAFMinValueTransparent = 0,
    kAAFMaxValueTransparent = 1,
};

// Values of aafFieldNumber_t.
using aafFieldNumber_t = aafInt32;
enum : aafInt32 {
    kAAFUnspecifiedField = 0,
    kAAFFieldOne = 1,
    kAAFFieldTwo = 2,
};

// Values of aafSignalStandard_t.
using aafSignalStandard_t = aafInt32;
enum : aafInt32 {
    kAAFSignalStandard_None = 0,
    kAAFSignalStandard_ITU601 = 1,
    kAAFSignalStandard_ITU1358 = 2,
    kAAFSignalStandard_SMPTE347M = 3,
    kAAFSignalStandard_SMPTE274M = 4,
    kAAFSignalStandard_SMPTE296M = 5,
    kAAFSignalStandard_SMPTE349M = 6,
};

// Values of aafScanningDirection_t.
using aafScanningDirection_t = aafInt32;
enum : aafInt32 {
    kAAFScanningDirection_LeftToRightTopToBottom = 0,
    kAAFScanningDirection_RightToLeftTopToBottom = 1,
    kAAFScanningDirection_LeftToRightBottomToTop = 2,
    kAAFScanningDirection_RightToLeftBottomToTop = 3,
    kAAFScanningDirection_TopToBottomLeftToRight = 4,
    kAAFScanningDirection_TopToBottomRightToLeft = 5,
    kAAFScanningDirection_BottomToTopLeftToRight = 6,
    kAAFScanningDirection_BottomToTopRightToLeft = 7,
};

// Values of aafContentScanningType_t.
using aafContentScanningType_t = aafInt32;
enum : aafInt32 {
    kAAFContentScanning_NotKnown = 0,
    kAAFContentScanning_Progressive = 1,
    kAAFContentScanning_Interlace = 2,
    kAAFContentScanning_Mixed = 3,
};

// Values of aafElectroSpatialFormulation_t.
using aafElectroSpatialFormulation_t = aafInt32;
enum : aafInt32 {
    kAAFElectroSpatialFormulation_Default = 0,
    kAAFElectroSpatialFormulation_TwoChannelMode = 1,
    kAAFElectroSpatialFormulation_SingleChannelMode = 2,
    kAAFElectroSpatialFormulation_PrimarySecondaryMode = 3,
    kAAFElectroSpatialFormulation_StereophonicMode = 4,
    kAAFElectroSpatialFormulation_SingleChannelDoubleSamplingFrequencyMode = 7,
    kAAFElectroSpatialFormulation_StereoLeftChannelDoubleSamplingFrequencyMode = 8,
    kAAFElectroSpatialFormulation_StereoRightChannelDoubleSamplingFrequencyMode = 9,
    kAAFElectroSpatialFormulation_MultiChannelMode = 15,
};

// Values of aafEmphasisType_t.
using aafEmphasisType_t = aafInt32;
enum : aafInt32 {
    kAAFEmphasis_Unknown = 0,
    kAAFEmphasis_Reserved0 = 1,
    kAAFEmphasis_Reserved1 = 2,
    kAAFEmphasis_Reserved2 = 3,
    kAAFEmphasis_None = 4,
    kAAFEmphasis_Reserved3 = 5,
    kAAFEmphasis_15and50 = 6,
    kAAFEmphasis_ITU = 7,
};

// Values of aafAuxBitsModeType_t.
using aafAuxBitsModeType_t = aafInt32;
enum : aafInt32 {
    kAAFAuxBitsMode_NotDefined = 0,
    kAAFAuxBitsMode_MainAudioSampleData = 1,
    kAAFAuxBitsMode_SingleCoordinationSignal = 2,
    kAAFAuxBitsMode_UserDefined = 3,
    kAAFAuxBitsMode_Reserved0 = 4,
    kAAFAuxBitsMode_Reserved1 = 5,
    kAAFAuxBitsMode_Reserved2 = 6,
    kAAFAuxBitsMode_Reserved3 = 7,
};

// Values of aafChannelStatusModeType_t.
using aafChannelStatusModeType_t = aafInt32;
enum : aafInt32 {
    kAAFChannelStatusMode_None = 0,
    kAAFChannelStatusMode_Minimum = 1,
    kAAFChannelStatusMode_Standard = 2,
    kAAFChannelStatusMode_Fixed = 3,
    kAAFChannelStatusMode_Stream = 4,
    kAAFChannelStatusMode_Essence = 5,
};

// Values of aafUserDataModeType_t.
using aafUserDataModeType_t = aafInt32;
enum : aafInt32 {
    kAAFUserDataMode_NotDefined = 0,
    kAAFUserDataMode_192BitBlockStructure = 1,
    kAAFUserDataMode_AES18 = 2,
    kAAFUserDataMode_UserDefined = 3,
    kAAFUserDataMode_IEC = 4,
    kAAFUserDataMode_Metadata = 5,
    kAAFUserDataMode_Reserved0 = 6,
    kAAFUserDataMode_Reserved1 = 7,
    kAAFUserDataMode_Reserved2 = 8,
    kAAFUserDataMode_Reserved3 = 9,
    kAAFUserDataMode_Reserved4 = 10,
    kAAFUserDataMode_Reserved5 = 11,
    kAAFUserDataMode_Reserved6 = 12,
    kAAFUserDataMode_Reserved7 = 13,
    kAAFUserDataMode_Reserved8 = 14,
    kAAFUserDataMode_Reserved9 = 15,
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

// Values of aafVideoSignalType_t.
using aafVideoSignalType_t = aafInt32;
enum : aafInt32 {
    kAAFVideoSignalNull = 0,
    kAAFNTSCSignal = 1,
    kAAFPALSignal = 2,
    kAAFSECAMSignal = 3,
};

using aafTapeCaseType_t = aafInt32;    // 0 to 7
using aafTapeFormatType_t = aafInt32;  // 0 to 6

using aafLength_t = aafInt64;
using aafPosition_t = aafInt64;
using aafFrameOffset_t = aafInt64;
using aafFrameLength_t = aafInt64;
using aafSlotID_t = aafUInt32;
using aafNumSlots_t = aafUInt32;
using aafClassID_t = aafUID_t;
using aafArgIDType_t = aafUID_t;
using aafHardwarePlatform_t = aafUID_t;
using aafEngine_t = aafUID_t;
using aafPluginAPI_t = aafUID_t;
using aafCodecID_t = aafUID_t;
using aafJPEGTableID_t = aafInt32;
using aafPhaseFrame_t = aafInt32;
using aafVideoLineMap_t = aafInt32[2];
using aafEdgecodeHeader_t = aafUInt8[8];
using aafLayoutType_t = aafFrameLayout_t;
using aafColorSitingType_t = aafColorSiting_t;
using aafTCSource_t = aafTimecodeSourceType_t;
using aafSignalStandardType_t = aafSignalStandard_t;
using aafScanningDirectionType_t = aafScanningDirection_t;
using aafEditHintType_t = aafEditHint_t;
using aafAlphaTransparencyType_t = aafAlphaTransparency_t;
using aafPulldownKindType_t = aafPulldownKind_t;
using aafPulldownDirectionType_t = aafPulldownDir_t;

struct aafMobID_t {
    aafUInt8 SMPTELabel[12];
    aafUInt8 length;
    aafUInt8 instanceHigh;
    aafUInt8 instanceMid;
    aafUInt8 instanceLow;
    aafUID_t material;
};
static_assert(offsetof(aafMobID_t, SMPTELabel) == 0, "published layout");
static_assert(offsetof(aafMobID_t, length) == 12, "published layout");
static_assert(offsetof(aafMobID_t, instanceHigh) == 13, "published layout");
static_assert(offsetof(aafMobID_t, instanceMid) == 14, "published layout");
static_assert(offsetof(aafMobID_t, instanceLow) == 15, "published layout");
static_assert(offsetof(aafMobID_t, material) == 16, "published layout");
static_assert(sizeof(aafMobID_t) == 32, "published layout");

struct aafRational_t {
    aafInt32 numerator;
    aafInt32 denominator;
};
static_assert(offsetof(aafRational_t, numerator) == 0, "published layout");
static_assert(offsetof(aafRational_t, denominator) == 4, "published layout");
static_assert(sizeof(aafRational_t) == 8, "published layout");

struct aafTimecode_t {
    aafFrameOffset_t startFrame;
    aafDropType_t drop;
    aafUInt16 fps;
};
static_assert(offsetof(aafTimecode_t, startFrame) == 0, "published layout");
static_assert(offsetof(aafTimecode_t, drop) == 8, "published layout");
static_assert(offsetof(aafTimecode_t, fps) == 12, "published layout");
static_assert(sizeof(aafTimecode_t) == 16, "published layout");

struct aafSourceRef_t {
    aafMobID_t sourceID;
    aafSlotID_t sourceSlotID;
    aafPosition_t startTime;
};
static_assert(offsetof(aafSourceRef_t, sourceID) == 0, "published layout");
static_assert(offsetof(aafSourceRef_t, sourceSlotID) == 32, "published layout");
static_assert(offsetof(aafSourceRef_t, startTime) == 40, "published layout");
static_assert(sizeof(aafSourceRef_t) == 48, "published layout");

struct aafProductVersion_t {
    aafUInt16 major;
    aafUInt16 minor;
    aafUInt16 tertiary;
    aafUInt16 patchLevel;
    aafProductReleaseType_t type;
};
static_assert(offsetof(aafProductVersion_t, major) == 0, "published layout");
static_assert(offsetof(aafProductVersion_t, minor) == 2, "published layout");
static_assert(offsetof(aafProductVersion_t, tertiary) == 4, "published layout");
static_assert(offsetof(aafProductVersion_t, patchLevel) == 6, "published layout");
static_assert(offsetof(aafProductVersion_t, type) == 8, "published layout");
static_assert(sizeof(aafProductVersion_t) == 12, "published layout");

struct aafProductIdentification_t {
    aafCharacter* companyName;
    aafCharacter* productName;
    aafCharacter* productVersionString;
    aafUID_t productID;
    aafCharacter* platform;
    aafProductVersion_t* productVersion;
};
static_assert(offsetof(aafProductIdentification_t, companyName) == 0, "published layout");
static_assert(offsetof(aafProductIdentification_t, productName) == 8, "published layout");
static_assert(offsetof(aafProductIdentification_t, productVersionString) == 16, "published layout");
static_assert(offsetof(aafProductIdentification_t, productID) == 24, "published layout");
static_assert(offsetof(aafProductIdentification_t, platform) == 40, "published layout");
static_assert(offsetof(aafProductIdentification_t, productVersion) == 48, "published layout");
static_assert(sizeof(aafProductIdentification_t) == 56, "published layout");

struct aafDateStruct_t {
    aafInt16 year;
    aafUInt8 month;
    aafUInt8 day;
};
static_assert(offsetof(aafDateStruct_t, year) == 0, "published layout");
static_assert(offsetof(aafDateStruct_t, month) == 2, "published layout");
static_assert(offsetof(aafDateStruct_t, day) == 3, "published layout");
static_assert(sizeof(aafDateStruct_t) == 4, "published layout");

struct aafTimeStruct_t {
    aafUInt8 hour;
    aafUInt8 minute;
    aafUInt8 second;
    aafUInt8 fraction;
};
static_assert(offsetof(aafTimeStruct_t, hour) == 0, "published layout");
static_assert(offsetof(aafTimeStruct_t, minute) == 1, "published layout");
static_assert(offsetof(aafTimeStruct_t, second) == 2, "published layout");
static_assert(offsetof(aafTimeStruct_t, fraction) == 3, "published layout");
static_assert(sizeof(aafTimeStruct_t) == 4, "published layout");

struct aafTimeStamp_t {
    aafDateStruct_t date;
    aafTimeStruct_t time;
};
static_assert(offsetof(aafTimeStamp_t, date) == 0, "published layout");
static_assert(offsetof(aafTimeStamp_t, time) == 4, "published layout");
static_assert(sizeof(aafTimeStamp_t) == 8, "published layout");

struct aafVersionType_t {
    aafInt8 major;
    aafInt8 minor;
};
static_assert(offsetof(aafVersionType_t, major) == 0, "published layout");
static_assert(offsetof(aafVersionType_t, minor) == 1, "published layout");
static_assert(sizeof(aafVersionType_t) == 2, "published layout");

struct aafRGBAComponent_t {
    aafRGBAComponentKind_t Code;
    aafUInt8 Size;
};
static_assert(offsetof(aafRGBAComponent_t, Code) == 0, "published layout");
static_assert(offsetof(aafRGBAComponent_t, Size) == 4, "published layout");
static_assert(sizeof(aafRGBAComponent_t) == 8, "published layout");

struct aafDefaultFade_t {
    aafLength_t fadeLength;
    aafFadeType_t fadeType;
    aafRational_t fadeEditUnit;
    aafBoolean_t valid;
};
static_assert(offsetof(aafDefaultFade_t, fadeLength) == 0, "published layout");
static_assert(offsetof(aafDefaultFade_t, fadeType) == 8, "published layout");
static_assert(offsetof(aafDefaultFade_t, fadeEditUnit) == 12, "published layout");
static_assert(offsetof(aafDefaultFade_t, valid) == 20, "published layout");
static_assert(sizeof(aafDefaultFade_t) == 24, "published layout");

struct aafMediaCriteria_t {
    aafCriteriaType_t type;
};
static_assert(offsetof(aafMediaCriteria_t, type) == 0, "published layout");
static_assert(sizeof(aafMediaCriteria_t) == 4, "published layout");

struct aafEdgecode_t {
    aafFrameOffset_t startFrame;
    aafFilmType_t filmKind;
    aafEdgeType_t codeFormat;
    aafUInt8 header[8];
};
static_assert(offsetof(aafEdgecode_t, startFrame) == 0, "published layout");
static_assert(offsetof(aafEdgecode_t, filmKind) == 8, "published layout");
static_assert(offsetof(aafEdgecode_t, codeFormat) == 12, "published layout");
static_assert(offsetof(aafEdgecode_t, header) == 16, "published layout");
static_assert(sizeof(aafEdgecode_t) == 24, "published layout");

struct aafmMultiCreate_t {
    aafUID_t const* mediaKind;
    aafInt16 subTrackNum;
    aafInt32 slotID;
    aafRational_t sampleRate;
};
static_assert(offsetof(aafmMultiCreate_t, mediaKind) == 0, "published layout");
static_assert(offsetof(aafmMultiCreate_t, subTrackNum) == 8, "published layout");
static_assert(offsetof(aafmMultiCreate_t, slotID) == 12, "published layout");
static_assert(offsetof(aafmMultiCreate_t, sampleRate) == 16, "published layout");
static_assert(sizeof(aafmMultiCreate_t) == 24, "published layout");

struct aafmMultiXfer_t {
    aafUID_t* mediaKind;
    aafInt16 subTrackNum;
    aafUInt32 numSamples;
    aafUInt32 buflen;
    aafDataBuffer_t buffer;
};
static_assert(offsetof(aafmMultiXfer_t, mediaKind) == 0, "published layout");
static_assert(offsetof(aafmMultiXfer_t, subTrackNum) == 8, "published layout");
static_assert(offsetof(aafmMultiXfer_t, numSamples) == 12, "published layout");
static_assert(offsetof(aafmMultiXfer_t, buflen) == 16, "published layout");
static_assert(offsetof(aafmMultiXfer_t, buffer) == 24, "published layout");
static_assert(sizeof(aafmMultiXfer_t) == 32, "published layout");

struct aafmMultiResult_t {
    aafUInt32 bytesXfered;
    aafUInt32 samplesXfered;
};
static_assert(offsetof(aafmMultiResult_t, bytesXfered) == 0, "published layout");
static_assert(offsetof(aafmMultiResult_t, samplesXfered) == 4, "published layout");
static_assert(sizeof(aafmMultiResult_t) == 8, "published layout");

struct aafRect_t {
    aafInt32 xOffset;
    aafInt32 yOffset;
    aafInt32 xSize;
    aafInt32 ySize;
};
static_assert(offsetof(aafRect_t, xOffset) == 0, "published layout");
static_assert(offsetof(aafRect_t, yOffset) == 4, "published layout");
static_assert(offsetof(aafRect_t, xSize) == 8, "published layout");
static_assert(offsetof(aafRect_t, ySize) == 12, "published layout");
static_assert(sizeof(aafRect_t) == 16, "published layout");

using aafMobIDType_t = aafMobID_t;

// What GetMobs looks for; a null pointer means all mobs.
struct aafSearchCrit_t {
    aafSearchTag_t searchTag;
    union {
        aafMobID_t mobID;
        aafMobKind_t mobKind;
        aafString_t name;
        aafUID_t objClass;
        aafUID_t datadef;
        aafCriteriaType_t mediaCrit;
        aafUID_t usageCode;
    } tags;
};
static_assert(sizeof(aafSearchCrit_t) == 40, "published layout");

using aafUID_constref = const aafUID_t&;
using aafUID_constptr = const aafUID_t*;
using aafMobID_constref = const aafMobID_t&;
using aafRational_constref = const aafRational_t&;
using aafTimeStamp_constref = const aafTimeStamp_t&;
using aafLength_constref = const aafLength_t&;
using aafVersionType_constref = const aafVersionType_t&;
using aafProductVersion_constref = const aafProductVersion_t&;
using aafProductIdentification_constref = const aafProductIdentification_t&;
using aafProductIdentification_constptr = const aafProductIdentification_t*;
using aafPluginAPI_constref = const aafPluginAPI_t&;
using aafHardwarePlatform_constref = const aafHardwarePlatform_t&;
using aafEngine_constref = const aafEngine_t&;
using aafArgIDType_constref = const aafArgIDType_t&;
