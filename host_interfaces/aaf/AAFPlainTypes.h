// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFEnumerations.h"
#include "host_interfaces/aaf/AAFEssenceEnumerations.h"

// Plain types of the AAF object model as published: structures have natural
// alignment and the same offsets on every platform.

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
