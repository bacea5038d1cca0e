// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"

// Classes and their properties, in the order of their ids.
namespace aaf {

namespace {

// clang-format off
constexpr BuiltInProperty kInterchangeObjectProperties[] = {
    {"ObjClass", ncfGuid("06010104-0101-0000-060E-2B3401010102"), 0x0101, ncfGuid("05010100-0000-0000-060E-2B3401040101"), false, false},
    {"Generation", ncfGuid("05200701-0800-0000-060E-2B3401010102"), 0x0102, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kComponentProperties[] = {
    {"DataDefinition", ncfGuid("04070100-0000-0000-060E-2B3401010102"), 0x0201, ncfGuid("05010300-0000-0000-060E-2B3401040101"), false, false},
    {"Length", ncfGuid("07020201-0103-0000-060E-2B3401010102"), 0x0202, ncfGuid("01012002-0000-0000-060E-2B3401040101"), true, false},
    {"KLVData", ncfGuid("03010210-0400-0000-060E-2B3401010102"), 0x0203, ncfGuid("05060900-0000-0000-060E-2B3401040101"), true, false},
    {"UserComments", ncfGuid("03020102-1600-0000-060E-2B3401010107"), 0x0204, ncfGuid("05060800-0000-0000-060E-2B3401040101"), true, false},
    {"Attributes", ncfGuid("03010210-0800-0000-060E-2B3401010107"), 0x0205, ncfGuid("05060800-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEdgeCodeProperties[] = {
    {"Start", ncfGuid("01040901-0000-0000-060E-2B3401010102"), 0x0401, ncfGuid("01012001-0000-0000-060E-2B3401040101"), false, false},
    {"FilmKind", ncfGuid("04100103-0109-0000-060E-2B3401010102"), 0x0402, ncfGuid("0201010D-0000-0000-060E-2B3401040101"), false, false},
    {"CodeFormat", ncfGuid("04100103-0102-0000-060E-2B3401010101"), 0x0403, ncfGuid("0201010C-0000-0000-060E-2B3401040101"), false, false},
    {"Header", ncfGuid("01030201-0200-0000-060E-2B3401010102"), 0x0404, ncfGuid("04100100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEssenceGroupProperties[] = {
    {"Choices", ncfGuid("06010104-0601-0000-060E-2B3401010102"), 0x0501, ncfGuid("05060700-0000-0000-060E-2B3401040101"), false, false},
    {"StillFrame", ncfGuid("06010104-0208-0000-060E-2B3401010102"), 0x0502, ncfGuid("05020800-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEventProperties[] = {
    {"Position", ncfGuid("07020103-0303-0000-060E-2B3401010102"), 0x0601, ncfGuid("01012001-0000-0000-060E-2B3401040101"), false, false},
    {"Comment", ncfGuid("05300404-0100-0000-060E-2B3401010102"), 0x0602, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kGPITriggerProperties[] = {
    {"ActiveState", ncfGuid("05300401-0000-0000-060E-2B3401010101"), 0x0801, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kCommentMarkerProperties[] = {
    {"Annotation", ncfGuid("06010104-020A-0000-060E-2B3401010102"), 0x0901, ncfGuid("05020800-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kOperationGroupProperties[] = {
    {"Operation", ncfGuid("05300506-0000-0000-060E-2B3401010102"), 0x0B01, ncfGuid("05010700-0000-0000-060E-2B3401040101"), false, false},
    {"InputSegments", ncfGuid("06010104-0602-0000-060E-2B3401010102"), 0x0B02, ncfGuid("05060600-0000-0000-060E-2B3401040101"), true, false},
    {"Parameters", ncfGuid("06010104-060A-0000-060E-2B3401010102"), 0x0B03, ncfGuid("05060A00-0000-0000-060E-2B3401040101"), true, false},
    {"BypassOverride", ncfGuid("0530050C-0000-0000-060E-2B3401010102"), 0x0B04, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"Rendering", ncfGuid("06010104-0206-0000-060E-2B3401010102"), 0x0B05, ncfGuid("05020800-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kNestedScopeProperties[] = {
    {"Slots", ncfGuid("06010104-0607-0000-060E-2B3401010102"), 0x0C01, ncfGuid("05060600-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kPulldownProperties[] = {
    {"InputSegment", ncfGuid("06010104-0207-0000-060E-2B3401010102"), 0x0D01, ncfGuid("05020600-0000-0000-060E-2B3401040101"), false, false},
    {"PulldownKind", ncfGuid("05401001-0200-0000-060E-2B3401010102"), 0x0D02, ncfGuid("0201010B-0000-0000-060E-2B3401040101"), false, false},
    {"PulldownDirection", ncfGuid("05401001-0100-0000-060E-2B3401010102"), 0x0D03, ncfGuid("0201010A-0000-0000-060E-2B3401040101"), false, false},
    {"PhaseFrame", ncfGuid("05401001-0300-0000-060E-2B3401010102"), 0x0D04, ncfGuid("01012300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kScopeReferenceProperties[] = {
    {"RelativeScope", ncfGuid("06010103-0300-0000-060E-2B3401010102"), 0x0E01, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"RelativeSlot", ncfGuid("06010103-0400-0000-060E-2B3401010102"), 0x0E02, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kSelectorProperties[] = {
    {"Selected", ncfGuid("06010104-0209-0000-060E-2B3401010102"), 0x0F01, ncfGuid("05020600-0000-0000-060E-2B3401040101"), false, false},
    {"Alternates", ncfGuid("06010104-0608-0000-060E-2B3401010102"), 0x0F02, ncfGuid("05060600-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kSequenceProperties[] = {
    {"Components", ncfGuid("06010104-0609-0000-060E-2B3401010102"), 0x1001, ncfGuid("05060100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kSourceReferenceProperties[] = {
    {"SourceID", ncfGuid("06010103-0100-0000-060E-2B3401010102"), 0x1101, ncfGuid("01030200-0000-0000-060E-2B3401040101"), true, false},
    {"SourceMobSlotID", ncfGuid("06010103-0200-0000-060E-2B3401010102"), 0x1102, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"ChannelIDs", ncfGuid("06010103-0700-0000-060E-2B3401010107"), 0x1103, ncfGuid("04010900-0000-0000-060E-2B3401040101"), true, false},
    {"MonoSourceSlotIDs", ncfGuid("06010103-0800-0000-060E-2B3401010108"), 0x1104, ncfGuid("04010900-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kSourceClipProperties[] = {
    {"StartTime", ncfGuid("07020103-0104-0000-060E-2B3401010102"), 0x1201, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
    {"FadeInLength", ncfGuid("07020201-0105-0200-060E-2B3401010102"), 0x1202, ncfGuid("01012002-0000-0000-060E-2B3401040101"), true, false},
    {"FadeInType", ncfGuid("05300501-0000-0000-060E-2B3401010101"), 0x1203, ncfGuid("02010107-0000-0000-060E-2B3401040101"), true, false},
    {"FadeOutLength", ncfGuid("07020201-0105-0300-060E-2B3401010102"), 0x1204, ncfGuid("01012002-0000-0000-060E-2B3401040101"), true, false},
    {"FadeOutType", ncfGuid("05300502-0000-0000-060E-2B3401010101"), 0x1205, ncfGuid("02010107-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kHTMLClipProperties[] = {
    {"BeginAnchor", ncfGuid("05300601-0100-0000-060E-2B3401010102"), 0x1401, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"EndAnchor", ncfGuid("05300602-0100-0000-060E-2B3401010102"), 0x1402, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kTimecodeProperties[] = {
    {"Start", ncfGuid("07020103-0105-0000-060E-2B3401010102"), 0x1501, ncfGuid("01012001-0000-0000-060E-2B3401040101"), false, false},
    {"FPS", ncfGuid("04040101-0206-0000-060E-2B3401010102"), 0x1502, ncfGuid("01010200-0000-0000-060E-2B3401040101"), false, false},
    {"Drop", ncfGuid("04040101-0500-0000-060E-2B3401010101"), 0x1503, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTimecodeStreamProperties[] = {
    {"SampleRate", ncfGuid("04040101-0201-0000-060E-2B3401010102"), 0x1601, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"Source", ncfGuid("04070300-0000-0000-060E-2B3401010102"), 0x1602, ncfGuid("04100200-0000-0000-060E-2B3401040101"), false, false},
    {"SourceType", ncfGuid("04040201-0000-0000-060E-2B3401010101"), 0x1603, ncfGuid("02010109-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTimecodeStream12MProperties[] = {
    {"IncludeSync", ncfGuid("04040101-0400-0000-060E-2B3401010101"), 0x1701, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTransitionProperties[] = {
    {"OperationGroup", ncfGuid("06010104-0205-0000-060E-2B3401010102"), 0x1801, ncfGuid("05020500-0000-0000-060E-2B3401040101"), false, false},
    {"CutPoint", ncfGuid("07020103-0106-0000-060E-2B3401010102"), 0x1802, ncfGuid("01012001-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kContentStorageProperties[] = {
    {"Mobs", ncfGuid("06010104-0501-0000-060E-2B3401010102"), 0x1901, ncfGuid("05050700-0000-0000-060E-2B3401040101"), false, false},
    {"EssenceData", ncfGuid("06010104-0502-0000-060E-2B3401010102"), 0x1902, ncfGuid("05050500-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kControlPointProperties[] = {
    {"Value", ncfGuid("0530050D-0000-0000-060E-2B3401010102"), 0x1A02, ncfGuid("04100300-0000-0000-060E-2B3401040101"), false, false},
    {"Time", ncfGuid("07020103-1002-0100-060E-2B3401010102"), 0x1A03, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"EditHint", ncfGuid("05300508-0000-0000-060E-2B3401010102"), 0x1A04, ncfGuid("02010106-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kDefinitionObjectProperties[] = {
    {"Identification", ncfGuid("01011503-0000-0000-060E-2B3401010102"), 0x1B01, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, true},
    {"Name", ncfGuid("01070102-0301-0000-060E-2B3401010102"), 0x1B02, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"Description", ncfGuid("03020301-0201-0000-060E-2B3401010102"), 0x1B03, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kOperationDefinitionProperties[] = {
    {"DataDefinition", ncfGuid("05300509-0000-0000-060E-2B3401010102"), 0x1E01, ncfGuid("05010300-0000-0000-060E-2B3401040101"), false, false},
    {"IsTimeWarp", ncfGuid("05300503-0000-0000-060E-2B3401010101"), 0x1E02, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"DegradeTo", ncfGuid("06010104-0401-0000-060E-2B3401010102"), 0x1E03, ncfGuid("05040100-0000-0000-060E-2B3401040101"), true, false},
    {"OperationCategory", ncfGuid("0530050A-0000-0000-060E-2B3401010102"), 0x1E06, ncfGuid("02020101-0000-0000-060E-2B3401040101"), true, false},
    {"NumberInputs", ncfGuid("05300504-0000-0000-060E-2B3401010101"), 0x1E07, ncfGuid("01010700-0000-0000-060E-2B3401040101"), false, false},
    {"Bypass", ncfGuid("05300505-0000-0000-060E-2B3401010101"), 0x1E08, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ParametersDefined", ncfGuid("06010104-0302-0000-060E-2B3401010102"), 0x1E09, ncfGuid("05030E00-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kParameterDefinitionProperties[] = {
    {"Type", ncfGuid("06010104-0106-0000-060E-2B3401010102"), 0x1F01, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
    {"DisplayUnits", ncfGuid("0530050B-0100-0000-060E-2B3401010102"), 0x1F03, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kPluginDefinitionProperties[] = {
    {"PluginCategory", ncfGuid("05200901-0000-0000-060E-2B3401010102"), 0x2203, ncfGuid("02020103-0000-0000-060E-2B3401040101"), false, false},
    {"VersionNumber", ncfGuid("03030301-0300-0000-060E-2B3401010102"), 0x2204, ncfGuid("03010300-0000-0000-060E-2B3401040101"), false, false},
    {"VersionString", ncfGuid("03030301-0201-0000-060E-2B3401010102"), 0x2205, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"Manufacturer", ncfGuid("010A0101-0101-0000-060E-2B3401010102"), 0x2206, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"ManufacturerInfo", ncfGuid("06010104-020B-0000-060E-2B3401010102"), 0x2207, ncfGuid("05020400-0000-0000-060E-2B3401040101"), true, false},
    {"ManufacturerID", ncfGuid("010A0101-0300-0000-060E-2B3401010102"), 0x2208, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"Platform", ncfGuid("05200902-0000-0000-060E-2B3401010102"), 0x2209, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"MinPlatformVersion", ncfGuid("05200903-0000-0000-060E-2B3401010102"), 0x220A, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"MaxPlatformVersion", ncfGuid("05200904-0000-0000-060E-2B3401010102"), 0x220B, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"Engine", ncfGuid("05200905-0000-0000-060E-2B3401010102"), 0x220C, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"MinEngineVersion", ncfGuid("05200906-0000-0000-060E-2B3401010102"), 0x220D, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"MaxEngineVersion", ncfGuid("05200907-0000-0000-060E-2B3401010102"), 0x220E, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"PluginAPI", ncfGuid("05200908-0000-0000-060E-2B3401010102"), 0x220F, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"MinPluginAPI", ncfGuid("05200909-0000-0000-060E-2B3401010102"), 0x2210, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"MaxPluginAPI", ncfGuid("0520090A-0000-0000-060E-2B3401010102"), 0x2211, ncfGuid("03010300-0000-0000-060E-2B3401040101"), true, false},
    {"SoftwareOnly", ncfGuid("0520090B-0000-0000-060E-2B3401010102"), 0x2212, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"Accelerator", ncfGuid("0520090C-0000-0000-060E-2B3401010102"), 0x2213, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"Locators", ncfGuid("0520090D-0000-0000-060E-2B3401010102"), 0x2214, ncfGuid("05060400-0000-0000-060E-2B3401040101"), true, false},
    {"Authentication", ncfGuid("0520090E-0000-0000-060E-2B3401010102"), 0x2215, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"DefinitionObject", ncfGuid("0520090F-0000-0000-060E-2B3401010102"), 0x2216, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kCodecDefinitionProperties[] = {
    {"FileDescriptorClass", ncfGuid("06010104-0107-0000-060E-2B3401010102"), 0x2301, ncfGuid("05010100-0000-0000-060E-2B3401040101"), false, false},
    {"DataDefinitions", ncfGuid("06010104-0301-0000-060E-2B3401010102"), 0x2302, ncfGuid("05040300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kContainerDefinitionProperties[] = {
    {"EssenceIsIdentified", ncfGuid("03010201-0300-0000-060E-2B3401010101"), 0x2401, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kDictionaryProperties[] = {
    {"OperationDefinitions", ncfGuid("06010104-0503-0000-060E-2B3401010102"), 0x2603, ncfGuid("05050800-0000-0000-060E-2B3401040101"), true, false},
    {"ParameterDefinitions", ncfGuid("06010104-0504-0000-060E-2B3401010102"), 0x2604, ncfGuid("05050900-0000-0000-060E-2B3401040101"), true, false},
    {"DataDefinitions", ncfGuid("06010104-0505-0000-060E-2B3401010102"), 0x2605, ncfGuid("05050400-0000-0000-060E-2B3401040101"), true, false},
    {"PluginDefinitions", ncfGuid("06010104-0506-0000-060E-2B3401010102"), 0x2606, ncfGuid("05050A00-0000-0000-060E-2B3401040101"), true, false},
    {"CodecDefinitions", ncfGuid("06010104-0507-0000-060E-2B3401010102"), 0x2607, ncfGuid("05050200-0000-0000-060E-2B3401040101"), true, false},
    {"ContainerDefinitions", ncfGuid("06010104-0508-0000-060E-2B3401010102"), 0x2608, ncfGuid("05050300-0000-0000-060E-2B3401040101"), true, false},
    {"InterpolationDefinitions", ncfGuid("06010104-0509-0000-060E-2B3401010102"), 0x2609, ncfGuid("05050600-0000-0000-060E-2B3401040101"), true, false},
    {"KLVDataDefinitions", ncfGuid("06010104-050A-0000-060E-2B3401010107"), 0x260A, ncfGuid("05050D00-0000-0000-060E-2B3401040101"), true, false},
    {"TaggedValueDefinitions", ncfGuid("06010104-050B-0000-060E-2B3401010107"), 0x260B, ncfGuid("05050E00-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEssenceDataProperties[] = {
    {"MobID", ncfGuid("06010106-0100-0000-060E-2B3401010102"), 0x2701, ncfGuid("01030200-0000-0000-060E-2B3401040101"), false, true},
    {"Data", ncfGuid("04070200-0000-0000-060E-2B3401010102"), 0x2702, ncfGuid("04100200-0000-0000-060E-2B3401040101"), false, false},
    {"SampleIndex", ncfGuid("06010102-0100-0000-060E-2B3401010102"), 0x2B01, ncfGuid("04100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEssenceDescriptorProperties[] = {
    {"Locator", ncfGuid("06010104-0603-0000-060E-2B3401010102"), 0x2F01, ncfGuid("05060400-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kFileDescriptorProperties[] = {
    {"SampleRate", ncfGuid("04060101-0000-0000-060E-2B3401010101"), 0x3001, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"Length", ncfGuid("04060102-0000-0000-060E-2B3401010101"), 0x3002, ncfGuid("01012002-0000-0000-060E-2B3401040101"), false, false},
    {"ContainerFormat", ncfGuid("06010104-0102-0000-060E-2B3401010102"), 0x3004, ncfGuid("05010200-0000-0000-060E-2B3401040101"), true, false},
    {"CodecDefinition", ncfGuid("06010104-0103-0000-060E-2B3401010102"), 0x3005, ncfGuid("05010B00-0000-0000-060E-2B3401040101"), true, false},
    {"LinkedSlotID", ncfGuid("06010103-0500-0000-060E-2B3401010105"), 0x3006, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kAIFCDescriptorProperties[] = {
    {"Summary", ncfGuid("03030302-0200-0000-060E-2B3401010102"), 0x3101, ncfGuid("04100100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kDigitalImageDescriptorProperties[] = {
    {"Compression", ncfGuid("04010601-0000-0000-060E-2B3401010102"), 0x3201, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"StoredHeight", ncfGuid("04010502-0100-0000-060E-2B3401010101"), 0x3202, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"StoredWidth", ncfGuid("04010502-0200-0000-060E-2B3401010101"), 0x3203, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"SampledHeight", ncfGuid("04010501-0700-0000-060E-2B3401010101"), 0x3204, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"SampledWidth", ncfGuid("04010501-0800-0000-060E-2B3401010101"), 0x3205, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"SampledXOffset", ncfGuid("04010501-0900-0000-060E-2B3401010101"), 0x3206, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"SampledYOffset", ncfGuid("04010501-0A00-0000-060E-2B3401010101"), 0x3207, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"DisplayHeight", ncfGuid("04010501-0B00-0000-060E-2B3401010101"), 0x3208, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"DisplayWidth", ncfGuid("04010501-0C00-0000-060E-2B3401010101"), 0x3209, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"DisplayXOffset", ncfGuid("04010501-0D00-0000-060E-2B3401010101"), 0x320A, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"DisplayYOffset", ncfGuid("04010501-0E00-0000-060E-2B3401010101"), 0x320B, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"FrameLayout", ncfGuid("04010301-0400-0000-060E-2B3401010101"), 0x320C, ncfGuid("02010108-0000-0000-060E-2B3401040101"), false, false},
    {"VideoLineMap", ncfGuid("04010302-0500-0000-060E-2B3401010102"), 0x320D, ncfGuid("04010300-0000-0000-060E-2B3401040101"), false, false},
    {"ImageAspectRatio", ncfGuid("04010101-0100-0000-060E-2B3401010101"), 0x320E, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"AlphaTransparency", ncfGuid("05200102-0000-0000-060E-2B3401010102"), 0x320F, ncfGuid("02010120-0000-0000-060E-2B3401040101"), true, false},
    {"TransferCharacteristic", ncfGuid("04010201-0101-0200-060E-2B3401010102"), 0x3210, ncfGuid("02020102-0000-0000-060E-2B3401040101"), true, false},
    {"ColorPrimaries", ncfGuid("04010201-0106-0100-060E-2B3401010109"), 0x3219, ncfGuid("02020105-0000-0000-060E-2B3401040101"), true, false},
    {"CodingEquations", ncfGuid("04010201-0103-0100-060E-2B3401010102"), 0x321A, ncfGuid("02020106-0000-0000-060E-2B3401040101"), true, false},
    {"ImageAlignmentFactor", ncfGuid("04180101-0000-0000-060E-2B3401010102"), 0x3211, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"FieldDominance", ncfGuid("04010301-0600-0000-060E-2B3401010102"), 0x3212, ncfGuid("02010121-0000-0000-060E-2B3401040101"), true, false},
    {"FieldStartOffset", ncfGuid("04180102-0000-0000-060E-2B3401010102"), 0x3213, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"FieldEndOffset", ncfGuid("04180103-0000-0000-060E-2B3401010102"), 0x3214, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"SignalStandard", ncfGuid("04050113-0000-0000-060E-2B3401010105"), 0x3215, ncfGuid("02010127-0000-0000-060E-2B3401040101"), true, false},
    {"StoredF2Offset", ncfGuid("04010302-0800-0000-060E-2B3401010105"), 0x3216, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"DisplayF2Offset", ncfGuid("04010302-0700-0000-060E-2B3401010105"), 0x3217, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"ActiveFormatDescriptor", ncfGuid("04010302-0900-0000-060E-2B3401010105"), 0x3218, ncfGuid("01010100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kCDCIDescriptorProperties[] = {
    {"ComponentWidth", ncfGuid("04010503-0A00-0000-060E-2B3401010102"), 0x3301, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"HorizontalSubsampling", ncfGuid("04010501-0500-0000-060E-2B3401010101"), 0x3302, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"ColorSiting", ncfGuid("04010501-0600-0000-060E-2B3401010101"), 0x3303, ncfGuid("02010105-0000-0000-060E-2B3401040101"), true, false},
    {"BlackReferenceLevel", ncfGuid("04010503-0300-0000-060E-2B3401010101"), 0x3304, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"WhiteReferenceLevel", ncfGuid("04010503-0400-0000-060E-2B3401010101"), 0x3305, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ColorRange", ncfGuid("04010503-0500-0000-060E-2B3401010102"), 0x3306, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PaddingBits", ncfGuid("04180104-0000-0000-060E-2B3401010102"), 0x3307, ncfGuid("01010600-0000-0000-060E-2B3401040101"), true, false},
    {"VerticalSubsampling", ncfGuid("04010501-1000-0000-060E-2B3401010102"), 0x3308, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"AlphaSamplingWidth", ncfGuid("04010503-0700-0000-060E-2B3401010102"), 0x3309, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ReversedByteOrder", ncfGuid("03010201-0A00-0000-060E-2B3401010105"), 0x330B, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kRGBADescriptorProperties[] = {
    {"PixelLayout", ncfGuid("04010503-0600-0000-060E-2B3401010102"), 0x3401, ncfGuid("04020100-0000-0000-060E-2B3401040101"), false, false},
    {"Palette", ncfGuid("04010503-0800-0000-060E-2B3401010102"), 0x3403, ncfGuid("04100100-0000-0000-060E-2B3401040101"), true, false},
    {"PaletteLayout", ncfGuid("04010503-0900-0000-060E-2B3401010102"), 0x3404, ncfGuid("04020100-0000-0000-060E-2B3401040101"), true, false},
    {"ScanningDirection", ncfGuid("04010404-0100-0000-060E-2B3401010105"), 0x3405, ncfGuid("02010128-0000-0000-060E-2B3401040101"), true, false},
    {"ComponentMaxRef", ncfGuid("04010503-0B00-0000-060E-2B3401010105"), 0x3406, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ComponentMinRef", ncfGuid("04010503-0C00-0000-060E-2B3401010105"), 0x3407, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"AlphaMaxRef", ncfGuid("04010503-0D00-0000-060E-2B3401010105"), 0x3408, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"AlphaMinRef", ncfGuid("04010503-0E00-0000-060E-2B3401010105"), 0x3409, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kTIFFDescriptorProperties[] = {
    {"IsUniform", ncfGuid("05020103-0101-0000-060E-2B3401010102"), 0x3701, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
    {"IsContiguous", ncfGuid("06080201-0000-0000-060E-2B3401010101"), 0x3702, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
    {"LeadingLines", ncfGuid("04010302-0300-0000-060E-2B3401010101"), 0x3703, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"TrailingLines", ncfGuid("04010302-0400-0000-060E-2B3401010101"), 0x3704, ncfGuid("01010700-0000-0000-060E-2B3401040101"), true, false},
    {"JPEGTableID", ncfGuid("05020103-0102-0000-060E-2B3401010102"), 0x3705, ncfGuid("01012003-0000-0000-060E-2B3401040101"), true, false},
    {"Summary", ncfGuid("03030302-0300-0000-060E-2B3401010102"), 0x3706, ncfGuid("04100100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kWAVEDescriptorProperties[] = {
    {"Summary", ncfGuid("03030302-0100-0000-060E-2B3401010102"), 0x3801, ncfGuid("04100100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kFilmDescriptorProperties[] = {
    {"FilmFormat", ncfGuid("04100103-0108-0000-060E-2B3401010102"), 0x3901, ncfGuid("0201010D-0000-0000-060E-2B3401040101"), true, false},
    {"FrameRate", ncfGuid("04010802-0300-0000-060E-2B3401010102"), 0x3902, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PerforationsPerFrame", ncfGuid("04100103-0103-0000-060E-2B3401010102"), 0x3903, ncfGuid("01010100-0000-0000-060E-2B3401040101"), true, false},
    {"FilmAspectRatio", ncfGuid("04100103-0203-0000-060E-2B3401010102"), 0x3904, ncfGuid("03010100-0000-0000-060E-2B3401040101"), true, false},
    {"Manufacturer", ncfGuid("04100103-0106-0100-060E-2B3401010102"), 0x3905, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"Model", ncfGuid("04100103-0105-0100-060E-2B3401010102"), 0x3906, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"FilmGaugeFormat", ncfGuid("04100103-0104-0100-060E-2B3401010102"), 0x3907, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"FilmBatchNumber", ncfGuid("04100103-0107-0100-060E-2B3401010102"), 0x3908, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kTapeDescriptorProperties[] = {
    {"FormFactor", ncfGuid("04100101-0101-0000-060E-2B3401010102"), 0x3A01, ncfGuid("02010104-0000-0000-060E-2B3401040101"), true, false},
    {"VideoSignal", ncfGuid("04010401-0100-0000-060E-2B3401010102"), 0x3A02, ncfGuid("02010103-0000-0000-060E-2B3401040101"), true, false},
    {"TapeFormat", ncfGuid("0D010101-0101-0100-060E-2B3401010102"), 0x3A03, ncfGuid("02010102-0000-0000-060E-2B3401040101"), true, false},
    {"Length", ncfGuid("04100101-0300-0000-060E-2B3401010102"), 0x3A04, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ManufacturerID", ncfGuid("04100101-0401-0000-060E-2B3401010102"), 0x3A05, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"Model", ncfGuid("04100101-0201-0000-060E-2B3401010102"), 0x3A06, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"TapeBatchNumber", ncfGuid("04100101-0601-0000-060E-2B3401010102"), 0x3A07, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"TapeStock", ncfGuid("04100101-0501-0000-060E-2B3401010102"), 0x3A08, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kHeaderProperties[] = {
    {"ByteOrder", ncfGuid("03010201-0200-0000-060E-2B3401010101"), 0x3B01, ncfGuid("01010600-0000-0000-060E-2B3401040101"), false, false},
    {"LastModified", ncfGuid("07020110-0204-0000-060E-2B3401010102"), 0x3B02, ncfGuid("03010700-0000-0000-060E-2B3401040101"), false, false},
    {"Content", ncfGuid("06010104-0201-0000-060E-2B3401010102"), 0x3B03, ncfGuid("05020100-0000-0000-060E-2B3401040101"), false, false},
    {"Dictionary", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0x3B04, ncfGuid("05020200-0000-0000-060E-2B3401040101"), false, false},
    {"Version", ncfGuid("03010201-0500-0000-060E-2B3401010102"), 0x3B05, ncfGuid("03010300-0000-0000-060E-2B3401040101"), false, false},
    {"IdentificationList", ncfGuid("06010104-0604-0000-060E-2B3401010102"), 0x3B06, ncfGuid("05060300-0000-0000-060E-2B3401040101"), false, false},
    {"ObjectModelVersion", ncfGuid("03010201-0400-0000-060E-2B3401010102"), 0x3B07, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"OperationalPattern", ncfGuid("01020203-0000-0000-060E-2B3401010105"), 0x3B09, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"EssenceContainers", ncfGuid("01020210-0201-0000-060E-2B3401010105"), 0x3B0A, ncfGuid("04030100-0000-0000-060E-2B3401040101"), true, false},
    {"DescriptiveSchemes", ncfGuid("01020210-0202-0000-060E-2B3401010105"), 0x3B0B, ncfGuid("04030100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kIdentificationProperties[] = {
    {"CompanyName", ncfGuid("05200701-0201-0000-060E-2B3401010102"), 0x3C01, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"ProductName", ncfGuid("05200701-0301-0000-060E-2B3401010102"), 0x3C02, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"ProductVersion", ncfGuid("05200701-0400-0000-060E-2B3401010102"), 0x3C03, ncfGuid("03010200-0000-0000-060E-2B3401040101"), true, false},
    {"ProductVersionString", ncfGuid("05200701-0501-0000-060E-2B3401010102"), 0x3C04, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"ProductID", ncfGuid("05200701-0700-0000-060E-2B3401010102"), 0x3C05, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, false},
    {"Date", ncfGuid("07020110-0203-0000-060E-2B3401010102"), 0x3C06, ncfGuid("03010700-0000-0000-060E-2B3401040101"), false, false},
    {"ToolkitVersion", ncfGuid("05200701-0A00-0000-060E-2B3401010102"), 0x3C07, ncfGuid("03010200-0000-0000-060E-2B3401040101"), true, false},
    {"Platform", ncfGuid("05200701-0601-0000-060E-2B3401010102"), 0x3C08, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"GenerationAUID", ncfGuid("05200701-0100-0000-060E-2B3401010102"), 0x3C09, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kNetworkLocatorProperties[] = {
    {"URLString", ncfGuid("01020101-0100-0000-060E-2B3401010101"), 0x4001, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTextLocatorProperties[] = {
    {"Name", ncfGuid("01040102-0100-0000-060E-2B3401010102"), 0x4101, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kMobProperties[] = {
    {"MobID", ncfGuid("01011510-0000-0000-060E-2B3401010101"), 0x4401, ncfGuid("01030200-0000-0000-060E-2B3401040101"), false, true},
    {"Name", ncfGuid("01030302-0100-0000-060E-2B3401010101"), 0x4402, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"Slots", ncfGuid("06010104-0605-0000-060E-2B3401010102"), 0x4403, ncfGuid("05060500-0000-0000-060E-2B3401040101"), false, false},
    {"LastModified", ncfGuid("07020110-0205-0000-060E-2B3401010102"), 0x4404, ncfGuid("03010700-0000-0000-060E-2B3401040101"), false, false},
    {"CreationTime", ncfGuid("07020110-0103-0000-060E-2B3401010102"), 0x4405, ncfGuid("03010700-0000-0000-060E-2B3401040101"), false, false},
    {"UserComments", ncfGuid("03020102-0C00-0000-060E-2B3401010102"), 0x4406, ncfGuid("05060800-0000-0000-060E-2B3401040101"), true, false},
    {"KLVData", ncfGuid("03010210-0300-0000-060E-2B3401010102"), 0x4407, ncfGuid("05060900-0000-0000-060E-2B3401040101"), true, false},
    {"Attributes", ncfGuid("03010210-0700-0000-060E-2B3401010107"), 0x4409, ncfGuid("05060800-0000-0000-060E-2B3401040101"), true, false},
    {"UsageCode", ncfGuid("05010108-0000-0000-060E-2B3401010107"), 0x4408, ncfGuid("02020104-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kCompositionMobProperties[] = {
    {"DefaultFadeLength", ncfGuid("07020201-0105-0100-060E-2B3401010102"), 0x4501, ncfGuid("01012002-0000-0000-060E-2B3401040101"), true, false},
    {"DefFadeType", ncfGuid("05300201-0000-0000-060E-2B3401010101"), 0x4502, ncfGuid("02010107-0000-0000-060E-2B3401040101"), true, false},
    {"DefFadeEditUnit", ncfGuid("05300403-0000-0000-060E-2B3401010102"), 0x4503, ncfGuid("03010100-0000-0000-060E-2B3401040101"), true, false},
    {"Rendering", ncfGuid("06010104-010A-0000-060E-2B3401010108"), 0x4504, ncfGuid("01030200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kSourceMobProperties[] = {
    {"EssenceDescription", ncfGuid("06010104-0203-0000-060E-2B3401010102"), 0x4701, ncfGuid("05020300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kMobSlotProperties[] = {
    {"SlotID", ncfGuid("01070101-0000-0000-060E-2B3401010102"), 0x4801, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"SlotName", ncfGuid("01070102-0100-0000-060E-2B3401010102"), 0x4802, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"Segment", ncfGuid("06010104-0204-0000-060E-2B3401010102"), 0x4803, ncfGuid("05020600-0000-0000-060E-2B3401040101"), false, false},
    {"PhysicalTrackNumber", ncfGuid("01040103-0000-0000-060E-2B3401010102"), 0x4804, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kEventMobSlotProperties[] = {
    {"EditRate", ncfGuid("05300402-0000-0000-060E-2B3401010102"), 0x4901, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"EventSlotOrigin", ncfGuid("07020103-010B-0000-060E-2B3401010105"), 0x4902, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kTimelineMobSlotProperties[] = {
    {"EditRate", ncfGuid("05300405-0000-0000-060E-2B3401010102"), 0x4B01, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"Origin", ncfGuid("07020103-0103-0000-060E-2B3401010102"), 0x4B02, ncfGuid("01012001-0000-0000-060E-2B3401040101"), false, false},
    {"MarkIn", ncfGuid("07020103-010C-0000-060E-2B3401010107"), 0x4B03, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
    {"MarkOut", ncfGuid("07020103-0203-0000-060E-2B3401010107"), 0x4B04, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
    {"UserPos", ncfGuid("07020103-010D-0000-060E-2B3401010107"), 0x4B05, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kParameterProperties[] = {
    {"Definition", ncfGuid("06010104-0104-0000-060E-2B3401010102"), 0x4C01, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kConstantValueProperties[] = {
    {"Value", ncfGuid("05300507-0000-0000-060E-2B3401010102"), 0x4D01, ncfGuid("04100300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kVaryingValueProperties[] = {
    {"Interpolation", ncfGuid("06010104-0105-0000-060E-2B3401010102"), 0x4E01, ncfGuid("05010500-0000-0000-060E-2B3401040101"), false, false},
    {"PointList", ncfGuid("06010104-0606-0000-060E-2B3401010102"), 0x4E02, ncfGuid("05060200-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTaggedValueProperties[] = {
    {"Name", ncfGuid("03020102-0901-0000-060E-2B3401010102"), 0x5001, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"Value", ncfGuid("03020102-0A01-0000-060E-2B3401010102"), 0x5003, ncfGuid("04100300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kKLVDataProperties[] = {
    {"Value", ncfGuid("03010210-0200-0000-060E-2B3401010102"), 0x5101, ncfGuid("04100400-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kDescriptiveMarkerProperties[] = {
    {"DescribedSlots", ncfGuid("01070105-0000-0000-060E-2B3401010104"), 0x6102, ncfGuid("04030200-0000-0000-060E-2B3401040101"), true, false},
    {"Description", ncfGuid("06010104-020C-0000-060E-2B3401010105"), 0x6101, ncfGuid("05021F00-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kSoundDescriptorProperties[] = {
    {"AudioSamplingRate", ncfGuid("04020301-0101-0000-060E-2B3401010105"), 0x3D03, ncfGuid("03010100-0000-0000-060E-2B3401040101"), false, false},
    {"Locked", ncfGuid("04020301-0400-0000-060E-2B3401010104"), 0x3D02, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"AudioRefLevel", ncfGuid("04020101-0300-0000-060E-2B3401010101"), 0x3D04, ncfGuid("01010500-0000-0000-060E-2B3401040101"), true, false},
    {"ElectroSpatial", ncfGuid("04020101-0100-0000-060E-2B3401010101"), 0x3D05, ncfGuid("02010122-0000-0000-060E-2B3401040101"), true, false},
    {"Channels", ncfGuid("04020101-0400-0000-060E-2B3401010105"), 0x3D07, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"QuantizationBits", ncfGuid("04020303-0400-0000-060E-2B3401010104"), 0x3D01, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"DialNorm", ncfGuid("04020701-0000-0000-060E-2B3401010105"), 0x3D0C, ncfGuid("01010500-0000-0000-060E-2B3401040101"), true, false},
    {"Compression", ncfGuid("04020402-0000-0000-060E-2B3401010102"), 0x3D06, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kDataEssenceDescriptorProperties[] = {
    {"DataEssenceCoding", ncfGuid("04030302-0000-0000-060E-2B3401010103"), 0x3E01, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kMultipleDescriptorProperties[] = {
    {"FileDescriptors", ncfGuid("06010104-060B-0000-060E-2B3401010104"), 0x3F01, ncfGuid("05060B00-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kDescriptiveClipProperties[] = {
    {"DescribedSlotIDs", ncfGuid("01070106-0000-0000-060E-2B3401010105"), 0x6103, ncfGuid("04030200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kAES3PCMDescriptorProperties[] = {
    {"Emphasis", ncfGuid("04020501-0600-0000-060E-2B3401010105"), 0x3D0D, ncfGuid("02010123-0000-0000-060E-2B3401040101"), true, false},
    {"BlockStartOffset", ncfGuid("04020302-0300-0000-060E-2B3401010105"), 0x3D0F, ncfGuid("01010200-0000-0000-060E-2B3401040101"), true, false},
    {"AuxBitsMode", ncfGuid("04020501-0100-0000-060E-2B3401010105"), 0x3D08, ncfGuid("02010124-0000-0000-060E-2B3401040101"), true, false},
    {"ChannelStatusMode", ncfGuid("04020501-0200-0000-060E-2B3401010105"), 0x3D10, ncfGuid("04010A00-0000-0000-060E-2B3401040101"), true, false},
    {"FixedChannelStatusData", ncfGuid("04020501-0300-0000-060E-2B3401010105"), 0x3D11, ncfGuid("04010100-0000-0000-060E-2B3401040101"), true, false},
    {"UserDataMode", ncfGuid("04020501-0400-0000-060E-2B3401010105"), 0x3D12, ncfGuid("04010B00-0000-0000-060E-2B3401040101"), true, false},
    {"FixedUserData", ncfGuid("04020501-0500-0000-060E-2B3401010105"), 0x3D13, ncfGuid("04010100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kPCMDescriptorProperties[] = {
    {"BlockAlign", ncfGuid("04020302-0100-0000-060E-2B3401010105"), 0x3D0A, ncfGuid("01010200-0000-0000-060E-2B3401040101"), false, false},
    {"SequenceOffset", ncfGuid("04020302-0200-0000-060E-2B3401010105"), 0x3D0B, ncfGuid("01010100-0000-0000-060E-2B3401040101"), true, false},
    {"AverageBPS", ncfGuid("04020303-0500-0000-060E-2B3401010105"), 0x3D09, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"ChannelAssignment", ncfGuid("04020101-0500-0000-060E-2B3401010107"), 0x3D32, ncfGuid("01030100-0000-0000-060E-2B3401040101"), true, false},
    {"PeakEnvelopeVersion", ncfGuid("04020301-0600-0000-060E-2B3401010108"), 0x3D29, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PeakEnvelopeFormat", ncfGuid("04020301-0700-0000-060E-2B3401010108"), 0x3D2A, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PointsPerPeakValue", ncfGuid("04020301-0800-0000-060E-2B3401010108"), 0x3D2B, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PeakEnvelopeBlockSize", ncfGuid("04020301-0900-0000-060E-2B3401010108"), 0x3D2C, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PeakChannels", ncfGuid("04020301-0A00-0000-060E-2B3401010108"), 0x3D2D, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PeakFrames", ncfGuid("04020301-0B00-0000-060E-2B3401010108"), 0x3D2E, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"PeakOfPeaksPosition", ncfGuid("04020301-0C00-0000-060E-2B3401010108"), 0x3D2F, ncfGuid("01012001-0000-0000-060E-2B3401040101"), true, false},
    {"PeakEnvelopeTimestamp", ncfGuid("04020301-0D00-0000-060E-2B3401010108"), 0x3D30, ncfGuid("03010700-0000-0000-060E-2B3401040101"), true, false},
    {"PeakEnvelopeData", ncfGuid("04020301-0E00-0000-060E-2B3401010108"), 0x3D31, ncfGuid("04100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kKLVDataDefinitionProperties[] = {
    {"KLVDataType", ncfGuid("06010104-0109-0000-060E-2B3401010107"), 0x4D12, ncfGuid("05010900-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kAuxiliaryDescriptorProperties[] = {
    {"MimeType", ncfGuid("04090201-0000-0000-060E-2B3401010107"), 0x4E11, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"CharSet", ncfGuid("04090300-0000-0000-060E-2B3401010108"), 0x4E12, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kRIFFChunkProperties[] = {
    {"ChunkID", ncfGuid("04060802-0000-0000-060E-2B3401010108"), 0x4F01, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"ChunkLength", ncfGuid("04060903-0000-0000-060E-2B3401010108"), 0x4F02, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
    {"ChunkData", ncfGuid("04070400-0000-0000-060E-2B3401010108"), 0x4F03, ncfGuid("04100200-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kBWFImportDescriptorProperties[] = {
    {"QltyFileSecurityReport", ncfGuid("04020302-0500-0000-060E-2B3401010105"), 0x3D15, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"QltyFileSecurityWave", ncfGuid("04020302-0600-0000-060E-2B3401010105"), 0x3D16, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"BextCodingHistory", ncfGuid("04020502-0101-0000-060E-2B3401010105"), 0x3D21, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyBasicData", ncfGuid("04020502-0201-0000-060E-2B3401010105"), 0x3D22, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyStartOfModulation", ncfGuid("04020502-0301-0000-060E-2B3401010105"), 0x3D23, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyQualityEvent", ncfGuid("04020502-0401-0000-060E-2B3401010105"), 0x3D24, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyEndOfModulation", ncfGuid("04020502-0501-0000-060E-2B3401010105"), 0x3D25, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyQualityParameter", ncfGuid("04020502-0601-0000-060E-2B3401010105"), 0x3D26, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyOperatorComment", ncfGuid("04020502-0701-0000-060E-2B3401010105"), 0x3D27, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"QltyCueSheet", ncfGuid("04020502-0801-0000-060E-2B3401010105"), 0x3D28, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
    {"UnknownBWFChunks", ncfGuid("06010104-060F-0000-060E-2B3401010108"), 0x3D33, ncfGuid("05060C00-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kMPEGVideoDescriptorProperties[] = {
    {"SingleSequence", ncfGuid("04010602-0102-0000-060E-2B3401010105"), 0x0000, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"ConstantBPictureCount", ncfGuid("04010602-0103-0000-060E-2B3401010105"), 0x0000, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"CodedContentScanning", ncfGuid("04010602-0104-0000-060E-2B3401010105"), 0x0000, ncfGuid("0201012A-0000-0000-060E-2B3401040101"), true, false},
    {"LowDelay", ncfGuid("04010602-0105-0000-060E-2B3401010105"), 0x0000, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"ClosedGOP", ncfGuid("04010602-0106-0000-060E-2B3401010105"), 0x0000, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"IdenticalGOP", ncfGuid("04010602-0107-0000-060E-2B3401010105"), 0x0000, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
    {"MaxGOP", ncfGuid("04010602-0108-0000-060E-2B3401010105"), 0x0000, ncfGuid("01010200-0000-0000-060E-2B3401040101"), true, false},
    {"MaxBPictureCount", ncfGuid("04010602-0109-0000-060E-2B3401010105"), 0x0000, ncfGuid("01010200-0000-0000-060E-2B3401040101"), true, false},
    {"BitRate", ncfGuid("04010602-010B-0000-060E-2B3401010105"), 0x0000, ncfGuid("01010300-0000-0000-060E-2B3401040101"), true, false},
    {"ProfileAndLevel", ncfGuid("04010602-010A-0000-060E-2B3401010105"), 0x0000, ncfGuid("01010100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kClassDefinitionProperties[] = {
    {"ParentClass", ncfGuid("06010107-0100-0000-060E-2B3401010102"), 0x0008, ncfGuid("05010100-0000-0000-060E-2B3401040101"), false, false},
    {"Properties", ncfGuid("06010107-0200-0000-060E-2B3401010102"), 0x0009, ncfGuid("05050B00-0000-0000-060E-2B3401040101"), true, false},
    {"IsConcrete", ncfGuid("06010107-0300-0000-060E-2B3401010102"), 0x000A, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kPropertyDefinitionProperties[] = {
    {"Type", ncfGuid("06010107-0400-0000-060E-2B3401010102"), 0x000B, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, false},
    {"IsOptional", ncfGuid("03010202-0100-0000-060E-2B3401010102"), 0x000C, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
    {"LocalIdentification", ncfGuid("06010107-0500-0000-060E-2B3401010102"), 0x000D, ncfGuid("01010200-0000-0000-060E-2B3401040101"), false, false},
    {"IsUniqueIdentifier", ncfGuid("06010107-0600-0000-060E-2B3401010102"), 0x000E, ncfGuid("01040100-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kTypeDefinitionIntegerProperties[] = {
    {"Size", ncfGuid("03010203-0100-0000-060E-2B3401010102"), 0x000F, ncfGuid("01010100-0000-0000-060E-2B3401040101"), false, false},
    {"IsSigned", ncfGuid("03010203-0200-0000-060E-2B3401010102"), 0x0010, ncfGuid("01040100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionStrongObjectReferenceProperties[] = {
    {"ReferencedType", ncfGuid("06010107-0900-0000-060E-2B3401010102"), 0x0011, ncfGuid("05010100-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionWeakObjectReferenceProperties[] = {
    {"ReferencedType", ncfGuid("06010107-0A00-0000-060E-2B3401010102"), 0x0012, ncfGuid("05010100-0000-0000-060E-2B3401040101"), false, false},
    {"TargetSet", ncfGuid("03010203-0B00-0000-060E-2B3401010102"), 0x0013, ncfGuid("04010600-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionEnumerationProperties[] = {
    {"ElementType", ncfGuid("06010107-0B00-0000-060E-2B3401010102"), 0x0014, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
    {"ElementNames", ncfGuid("03010203-0400-0000-060E-2B3401010102"), 0x0015, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"ElementValues", ncfGuid("03010203-0500-0000-060E-2B3401010102"), 0x0016, ncfGuid("04010400-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionFixedArrayProperties[] = {
    {"ElementType", ncfGuid("06010107-0C00-0000-060E-2B3401010102"), 0x0017, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
    {"ElementCount", ncfGuid("03010203-0300-0000-060E-2B3401010102"), 0x0018, ncfGuid("01010300-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionVariableArrayProperties[] = {
    {"ElementType", ncfGuid("06010107-0D00-0000-060E-2B3401010102"), 0x0019, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionSetProperties[] = {
    {"ElementType", ncfGuid("06010107-0E00-0000-060E-2B3401010102"), 0x001A, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionStringProperties[] = {
    {"ElementType", ncfGuid("06010107-0F00-0000-060E-2B3401010102"), 0x001B, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionRecordProperties[] = {
    {"MemberTypes", ncfGuid("06010107-1100-0000-060E-2B3401010102"), 0x001C, ncfGuid("05040200-0000-0000-060E-2B3401040101"), false, false},
    {"MemberNames", ncfGuid("03010203-0600-0000-060E-2B3401010102"), 0x001D, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionRenameProperties[] = {
    {"RenamedType", ncfGuid("06010107-1200-0000-060E-2B3401010102"), 0x001E, ncfGuid("05010900-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kTypeDefinitionExtendibleEnumerationProperties[] = {
    {"ElementNames", ncfGuid("03010203-0700-0000-060E-2B3401010102"), 0x001F, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"ElementValues", ncfGuid("03010203-0800-0000-060E-2B3401010102"), 0x0020, ncfGuid("04010600-0000-0000-060E-2B3401040101"), false, false},
};
constexpr BuiltInProperty kMetaDefinitionProperties[] = {
    {"Identification", ncfGuid("06010107-1300-0000-060E-2B3401010102"), 0x0005, ncfGuid("01030100-0000-0000-060E-2B3401040101"), false, true},
    {"Name", ncfGuid("03020401-0201-0000-060E-2B3401010102"), 0x0006, ncfGuid("01100200-0000-0000-060E-2B3401040101"), false, false},
    {"Description", ncfGuid("06010107-1401-0000-060E-2B3401010102"), 0x0007, ncfGuid("01100200-0000-0000-060E-2B3401040101"), true, false},
};
constexpr BuiltInProperty kMetaDictionaryProperties[] = {
    {"ClassDefinitions", ncfGuid("06010107-0700-0000-060E-2B3401010102"), 0x0003, ncfGuid("05050100-0000-0000-060E-2B3401040101"), true, false},
    {"TypeDefinitions", ncfGuid("06010107-0800-0000-060E-2B3401010102"), 0x0004, ncfGuid("05050C00-0000-0000-060E-2B3401040101"), true, false},
};

constexpr BuiltInClass kClasses[] = {
    {"InterchangeObject", ncfGuid("0D010101-0101-0100-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, true, {kInterchangeObjectProperties, 2}},
    {"Component", ncfGuid("0D010101-0101-0200-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {kComponentProperties, 5}},
    {"Segment", ncfGuid("0D010101-0101-0300-060E-2B3402060101"), ncfGuid("0D010101-0101-0200-060E-2B3402060101"), false, false, {nullptr, 0}},
    {"EdgeCode", ncfGuid("0D010101-0101-0400-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kEdgeCodeProperties, 4}},
    {"EssenceGroup", ncfGuid("0D010101-0101-0500-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kEssenceGroupProperties, 2}},
    {"Event", ncfGuid("0D010101-0101-0600-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), false, false, {kEventProperties, 2}},
    {"GPITrigger", ncfGuid("0D010101-0101-0700-060E-2B3402060101"), ncfGuid("0D010101-0101-0600-060E-2B3402060101"), true, false, {kGPITriggerProperties, 1}},
    {"CommentMarker", ncfGuid("0D010101-0101-0800-060E-2B3402060101"), ncfGuid("0D010101-0101-0600-060E-2B3402060101"), true, false, {kCommentMarkerProperties, 1}},
    {"Filler", ncfGuid("0D010101-0101-0900-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"OperationGroup", ncfGuid("0D010101-0101-0A00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kOperationGroupProperties, 5}},
    {"NestedScope", ncfGuid("0D010101-0101-0B00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kNestedScopeProperties, 1}},
    {"Pulldown", ncfGuid("0D010101-0101-0C00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kPulldownProperties, 4}},
    {"ScopeReference", ncfGuid("0D010101-0101-0D00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kScopeReferenceProperties, 2}},
    {"Selector", ncfGuid("0D010101-0101-0E00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kSelectorProperties, 2}},
    {"Sequence", ncfGuid("0D010101-0101-0F00-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kSequenceProperties, 1}},
    {"SourceReference", ncfGuid("0D010101-0101-1000-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), false, false, {kSourceReferenceProperties, 4}},
    {"SourceClip", ncfGuid("0D010101-0101-1100-060E-2B3402060101"), ncfGuid("0D010101-0101-1000-060E-2B3402060101"), true, false, {kSourceClipProperties, 5}},
    {"TextClip", ncfGuid("0D010101-0101-1200-060E-2B3402060101"), ncfGuid("0D010101-0101-1000-060E-2B3402060101"), false, false, {nullptr, 0}},
    {"HTMLClip", ncfGuid("0D010101-0101-1300-060E-2B3402060101"), ncfGuid("0D010101-0101-1200-060E-2B3402060101"), true, false, {kHTMLClipProperties, 2}},
    {"Timecode", ncfGuid("0D010101-0101-1400-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), true, false, {kTimecodeProperties, 3}},
    {"TimecodeStream", ncfGuid("0D010101-0101-1500-060E-2B3402060101"), ncfGuid("0D010101-0101-0300-060E-2B3402060101"), false, false, {kTimecodeStreamProperties, 3}},
    {"TimecodeStream12M", ncfGuid("0D010101-0101-1600-060E-2B3402060101"), ncfGuid("0D010101-0101-1500-060E-2B3402060101"), true, false, {kTimecodeStream12MProperties, 1}},
    {"Transition", ncfGuid("0D010101-0101-1700-060E-2B3402060101"), ncfGuid("0D010101-0101-0200-060E-2B3402060101"), true, false, {kTransitionProperties, 2}},
    {"ContentStorage", ncfGuid("0D010101-0101-1800-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, true, {kContentStorageProperties, 2}},
    {"ControlPoint", ncfGuid("0D010101-0101-1900-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, false, {kControlPointProperties, 3}},
    {"DefinitionObject", ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, true, {kDefinitionObjectProperties, 3}},
    {"DataDefinition", ncfGuid("0D010101-0101-1B00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"OperationDefinition", ncfGuid("0D010101-0101-1C00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kOperationDefinitionProperties, 7}},
    {"ParameterDefinition", ncfGuid("0D010101-0101-1D00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kParameterDefinitionProperties, 2}},
    {"PluginDefinition", ncfGuid("0D010101-0101-1E00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kPluginDefinitionProperties, 20}},
    {"CodecDefinition", ncfGuid("0D010101-0101-1F00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kCodecDefinitionProperties, 2}},
    {"ContainerDefinition", ncfGuid("0D010101-0101-2000-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kContainerDefinitionProperties, 1}},
    {"InterpolationDefinition", ncfGuid("0D010101-0101-2100-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"Dictionary", ncfGuid("0D010101-0101-2200-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, true, {kDictionaryProperties, 9}},
    {"EssenceData", ncfGuid("0D010101-0101-2300-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, true, {kEssenceDataProperties, 3}},
    {"EssenceDescriptor", ncfGuid("0D010101-0101-2400-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {kEssenceDescriptorProperties, 1}},
    {"FileDescriptor", ncfGuid("0D010101-0101-2500-060E-2B3402060101"), ncfGuid("0D010101-0101-2400-060E-2B3402060101"), false, false, {kFileDescriptorProperties, 5}},
    {"AIFCDescriptor", ncfGuid("0D010101-0101-2600-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kAIFCDescriptorProperties, 1}},
    {"DigitalImageDescriptor", ncfGuid("0D010101-0101-2700-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), false, false, {kDigitalImageDescriptorProperties, 26}},
    {"CDCIDescriptor", ncfGuid("0D010101-0101-2800-060E-2B3402060101"), ncfGuid("0D010101-0101-2700-060E-2B3402060101"), true, false, {kCDCIDescriptorProperties, 10}},
    {"RGBADescriptor", ncfGuid("0D010101-0101-2900-060E-2B3402060101"), ncfGuid("0D010101-0101-2700-060E-2B3402060101"), true, false, {kRGBADescriptorProperties, 8}},
    {"HTMLDescriptor", ncfGuid("0D010101-0101-2A00-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"TIFFDescriptor", ncfGuid("0D010101-0101-2B00-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kTIFFDescriptorProperties, 6}},
    {"WAVEDescriptor", ncfGuid("0D010101-0101-2C00-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kWAVEDescriptorProperties, 1}},
    {"FilmDescriptor", ncfGuid("0D010101-0101-2D00-060E-2B3402060101"), ncfGuid("0D010101-0101-2400-060E-2B3402060101"), true, false, {kFilmDescriptorProperties, 8}},
    {"TapeDescriptor", ncfGuid("0D010101-0101-2E00-060E-2B3402060101"), ncfGuid("0D010101-0101-2400-060E-2B3402060101"), true, false, {kTapeDescriptorProperties, 8}},
    {"Header", ncfGuid("0D010101-0101-2F00-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, true, {kHeaderProperties, 10}},
    {"Identification", ncfGuid("0D010101-0101-3000-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, true, {kIdentificationProperties, 9}},
    {"Locator", ncfGuid("0D010101-0101-3100-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {nullptr, 0}},
    {"NetworkLocator", ncfGuid("0D010101-0101-3200-060E-2B3402060101"), ncfGuid("0D010101-0101-3100-060E-2B3402060101"), true, false, {kNetworkLocatorProperties, 1}},
    {"TextLocator", ncfGuid("0D010101-0101-3300-060E-2B3402060101"), ncfGuid("0D010101-0101-3100-060E-2B3402060101"), true, false, {kTextLocatorProperties, 1}},
    {"Mob", ncfGuid("0D010101-0101-3400-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, true, {kMobProperties, 9}},
    {"CompositionMob", ncfGuid("0D010101-0101-3500-060E-2B3402060101"), ncfGuid("0D010101-0101-3400-060E-2B3402060101"), true, false, {kCompositionMobProperties, 4}},
    {"MasterMob", ncfGuid("0D010101-0101-3600-060E-2B3402060101"), ncfGuid("0D010101-0101-3400-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"SourceMob", ncfGuid("0D010101-0101-3700-060E-2B3402060101"), ncfGuid("0D010101-0101-3400-060E-2B3402060101"), true, false, {kSourceMobProperties, 1}},
    {"MobSlot", ncfGuid("0D010101-0101-3800-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {kMobSlotProperties, 4}},
    {"EventMobSlot", ncfGuid("0D010101-0101-3900-060E-2B3402060101"), ncfGuid("0D010101-0101-3800-060E-2B3402060101"), true, false, {kEventMobSlotProperties, 2}},
    {"StaticMobSlot", ncfGuid("0D010101-0101-3A00-060E-2B3402060101"), ncfGuid("0D010101-0101-3800-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"TimelineMobSlot", ncfGuid("0D010101-0101-3B00-060E-2B3402060101"), ncfGuid("0D010101-0101-3800-060E-2B3402060101"), true, false, {kTimelineMobSlotProperties, 5}},
    {"Parameter", ncfGuid("0D010101-0101-3C00-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {kParameterProperties, 1}},
    {"ConstantValue", ncfGuid("0D010101-0101-3D00-060E-2B3402060101"), ncfGuid("0D010101-0101-3C00-060E-2B3402060101"), true, false, {kConstantValueProperties, 1}},
    {"VaryingValue", ncfGuid("0D010101-0101-3E00-060E-2B3402060101"), ncfGuid("0D010101-0101-3C00-060E-2B3402060101"), true, false, {kVaryingValueProperties, 2}},
    {"TaggedValue", ncfGuid("0D010101-0101-3F00-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, false, {kTaggedValueProperties, 2}},
    {"KLVData", ncfGuid("0D010101-0101-4000-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, false, {kKLVDataProperties, 1}},
    {"DescriptiveMarker", ncfGuid("0D010101-0101-4100-060E-2B3402060101"), ncfGuid("0D010101-0101-0800-060E-2B3402060101"), true, false, {kDescriptiveMarkerProperties, 2}},
    {"SoundDescriptor", ncfGuid("0D010101-0101-4200-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kSoundDescriptorProperties, 8}},
    {"DataEssenceDescriptor", ncfGuid("0D010101-0101-4300-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kDataEssenceDescriptorProperties, 1}},
    {"MultipleDescriptor", ncfGuid("0D010101-0101-4400-060E-2B3402060101"), ncfGuid("0D010101-0101-2500-060E-2B3402060101"), true, false, {kMultipleDescriptorProperties, 1}},
    {"DescriptiveClip", ncfGuid("0D010101-0101-4500-060E-2B3402060101"), ncfGuid("0D010101-0101-1100-060E-2B3402060101"), true, false, {kDescriptiveClipProperties, 1}},
    {"AES3PCMDescriptor", ncfGuid("0D010101-0101-4700-060E-2B3402060101"), ncfGuid("0D010101-0101-4800-060E-2B3402060101"), true, false, {kAES3PCMDescriptorProperties, 7}},
    {"PCMDescriptor", ncfGuid("0D010101-0101-4800-060E-2B3402060101"), ncfGuid("0D010101-0101-4200-060E-2B3402060101"), true, false, {kPCMDescriptorProperties, 13}},
    {"PhysicalDescriptor", ncfGuid("0D010101-0101-4900-060E-2B3402060101"), ncfGuid("0D010101-0101-2400-060E-2B3402060101"), false, false, {nullptr, 0}},
    {"ImportDescriptor", ncfGuid("0D010101-0101-4A00-060E-2B3402060101"), ncfGuid("0D010101-0101-4900-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"RecordingDescriptor", ncfGuid("0D010101-0101-4B00-060E-2B3402060101"), ncfGuid("0D010101-0101-4900-060E-2B3402060101"), true, false, {nullptr, 0}},
    {"TaggedValueDefinition", ncfGuid("0D010101-0101-4C00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"KLVDataDefinition", ncfGuid("0D010101-0101-4D00-060E-2B3402060101"), ncfGuid("0D010101-0101-1A00-060E-2B3402060101"), true, true, {kKLVDataDefinitionProperties, 1}},
    {"AuxiliaryDescriptor", ncfGuid("0D010101-0101-4E00-060E-2B3402060101"), ncfGuid("0D010101-0101-4900-060E-2B3402060101"), true, false, {kAuxiliaryDescriptorProperties, 2}},
    {"RIFFChunk", ncfGuid("0D010101-0101-4F00-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), true, false, {kRIFFChunkProperties, 3}},
    {"BWFImportDescriptor", ncfGuid("0D010101-0101-5000-060E-2B3402060101"), ncfGuid("0D010101-0101-4A00-060E-2B3402060101"), true, false, {kBWFImportDescriptorProperties, 11}},
    {"MPEGVideoDescriptor", ncfGuid("0D010101-0101-5100-060E-2B3402060101"), ncfGuid("0D010101-0101-2800-060E-2B3402060101"), true, false, {kMPEGVideoDescriptorProperties, 10}},
    {"ClassDefinition", ncfGuid("0D010101-0201-0000-060E-2B3402060101"), ncfGuid("0D010101-0224-0000-060E-2B3402060101"), true, true, {kClassDefinitionProperties, 3}},
    {"PropertyDefinition", ncfGuid("0D010101-0202-0000-060E-2B3402060101"), ncfGuid("0D010101-0224-0000-060E-2B3402060101"), true, true, {kPropertyDefinitionProperties, 4}},
    {"TypeDefinition", ncfGuid("0D010101-0203-0000-060E-2B3402060101"), ncfGuid("0D010101-0224-0000-060E-2B3402060101"), false, true, {nullptr, 0}},
    {"TypeDefinitionInteger", ncfGuid("0D010101-0204-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionIntegerProperties, 2}},
    {"TypeDefinitionStrongObjectReference", ncfGuid("0D010101-0205-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionStrongObjectReferenceProperties, 1}},
    {"TypeDefinitionWeakObjectReference", ncfGuid("0D010101-0206-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionWeakObjectReferenceProperties, 2}},
    {"TypeDefinitionEnumeration", ncfGuid("0D010101-0207-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionEnumerationProperties, 3}},
    {"TypeDefinitionFixedArray", ncfGuid("0D010101-0208-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionFixedArrayProperties, 2}},
    {"TypeDefinitionVariableArray", ncfGuid("0D010101-0209-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionVariableArrayProperties, 1}},
    {"TypeDefinitionSet", ncfGuid("0D010101-020A-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionSetProperties, 1}},
    {"TypeDefinitionString", ncfGuid("0D010101-020B-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionStringProperties, 1}},
    {"TypeDefinitionStream", ncfGuid("0D010101-020C-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"TypeDefinitionRecord", ncfGuid("0D010101-020D-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionRecordProperties, 2}},
    {"TypeDefinitionRename", ncfGuid("0D010101-020E-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionRenameProperties, 1}},
    {"TypeDefinitionExtendibleEnumeration", ncfGuid("0D010101-0220-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {kTypeDefinitionExtendibleEnumerationProperties, 2}},
    {"TypeDefinitionIndirect", ncfGuid("0D010101-0221-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"TypeDefinitionOpaque", ncfGuid("0D010101-0222-0000-060E-2B3402060101"), ncfGuid("0D010101-0221-0000-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"TypeDefinitionCharacter", ncfGuid("0D010101-0223-0000-060E-2B3402060101"), ncfGuid("0D010101-0203-0000-060E-2B3402060101"), true, true, {nullptr, 0}},
    {"MetaDefinition", ncfGuid("0D010101-0224-0000-060E-2B3402060101"), ncfGuid("0D010101-0224-0000-060E-2B3402060101"), false, true, {kMetaDefinitionProperties, 3}},
    {"MetaDictionary", ncfGuid("0D010101-0225-0000-060E-2B3402060101"), ncfGuid("0D010101-0225-0000-060E-2B3402060101"), true, true, {kMetaDictionaryProperties, 2}},
    {"DescriptiveObject", ncfGuid("0D010400-0000-0000-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {nullptr, 0}},
    {"DescriptiveFramework", ncfGuid("0D010401-0000-0000-060E-2B3402060101"), ncfGuid("0D010101-0101-0100-060E-2B3402060101"), false, false, {nullptr, 0}},
};
// clang-format on

}  // namespace

Span<BuiltInClass> BuiltInClasses() {
    return {kClasses, sizeof kClasses / sizeof kClasses[0]};
}

}  // namespace aaf
