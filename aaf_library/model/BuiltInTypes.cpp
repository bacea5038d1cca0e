// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"

// Types, in groups by kind.
namespace aaf {

namespace {

// clang-format off
constexpr BuiltInMember kAUIDMembers[] = {
    {"Data1", ncfGuid("01010300-0000-0000-060E-2B3401040101"), 0},
    {"Data2", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"Data3", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"Data4", ncfGuid("04010800-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kMobIDTypeMembers[] = {
    {"SMPTELabel", ncfGuid("04010200-0000-0000-060E-2B3401040101"), 0},
    {"length", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"instanceHigh", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"instanceMid", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"instanceLow", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"material", ncfGuid("01030100-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kRationalMembers[] = {
    {"Numerator", ncfGuid("01010700-0000-0000-060E-2B3401040101"), 0},
    {"Denominator", ncfGuid("01010700-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kProductVersionMembers[] = {
    {"major", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"minor", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"tertiary", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"patchLevel", ncfGuid("01010200-0000-0000-060E-2B3401040101"), 0},
    {"type", ncfGuid("02010101-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kVersionTypeMembers[] = {
    {"major", ncfGuid("01010500-0000-0000-060E-2B3401040101"), 0},
    {"minor", ncfGuid("01010500-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kRGBAComponentMembers[] = {
    {"Code", ncfGuid("0201010E-0000-0000-060E-2B3401040101"), 0},
    {"Size", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kDateStructMembers[] = {
    {"year", ncfGuid("01010600-0000-0000-060E-2B3401040101"), 0},
    {"month", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"day", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kTimeStructMembers[] = {
    {"hour", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"minute", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"second", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
    {"fraction", ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kTimeStampMembers[] = {
    {"date", ncfGuid("03010500-0000-0000-060E-2B3401040101"), 0},
    {"time", ncfGuid("03010600-0000-0000-060E-2B3401040101"), 0},
};
constexpr BuiltInMember kBooleanMembers[] = {
    {"False", GUID{}, 0},
    {"True", GUID{}, 1},
};
constexpr BuiltInMember kProductReleaseTypeMembers[] = {
    {"VersionUnknown", GUID{}, 0},
    {"VersionReleased", GUID{}, 1},
    {"VersionDebug", GUID{}, 2},
    {"VersionPatched", GUID{}, 3},
    {"VersionBeta", GUID{}, 4},
    {"VersionPrivateBuild", GUID{}, 5},
};
constexpr BuiltInMember kTapeFormatTypeMembers[] = {
    {"TapeFormatNull", GUID{}, 0},
    {"TapeFormat1", GUID{}, 1},
    {"TapeFormat2", GUID{}, 2},
    {"TapeFormat3", GUID{}, 3},
    {"TapeFormat4", GUID{}, 4},
    {"8mmFormat", GUID{}, 5},
    {"TapeFormat6", GUID{}, 6},
};
constexpr BuiltInMember kVideoSignalTypeMembers[] = {
    {"VideoSignalNull", GUID{}, 0},
    {"NTSCSignal", GUID{}, 1},
    {"PALSignal", GUID{}, 2},
};
constexpr BuiltInMember kTapeCaseTypeMembers[] = {
    {"TapeCaseNull", GUID{}, 0},
    {"ThreeFourthInchVideoTape", GUID{}, 1},
    {"TapeCase2", GUID{}, 2},
    {"8mmVideoTape", GUID{}, 3},
    {"TapeCase4", GUID{}, 4},
    {"TapeCase5", GUID{}, 5},
    {"TapeCase6", GUID{}, 6},
    {"TapeCase7", GUID{}, 7},
};
constexpr BuiltInMember kColorSitingTypeMembers[] = {
    {"CoSiting", GUID{}, 0},
    {"Averaging", GUID{}, 1},
    {"ThreeTap", GUID{}, 2},
    {"Quincunx", GUID{}, 3},
    {"Rec601", GUID{}, 4},
    {"UnknownSiting", GUID{}, 255},
};
constexpr BuiltInMember kEditHintTypeMembers[] = {
    {"NoEditHint", GUID{}, 0},
    {"Proportional", GUID{}, 1},
    {"RelativeLeft", GUID{}, 2},
    {"RelativeRight", GUID{}, 3},
    {"RelativeFixed", GUID{}, 4},
};
constexpr BuiltInMember kFadeTypeMembers[] = {
    {"FadeNone", GUID{}, 0},
    {"FadeLinearAmp", GUID{}, 1},
    {"FadeLinearPower", GUID{}, 2},
};
constexpr BuiltInMember kLayoutTypeMembers[] = {
    {"FullFrame", GUID{}, 0},
    {"SeparateFields", GUID{}, 1},
    {"OneField", GUID{}, 2},
    {"MixedFields", GUID{}, 3},
    {"SegmentedFrame", GUID{}, 4},
};
constexpr BuiltInMember kTCSourceMembers[] = {
    {"TimecodeLTC", GUID{}, 0},
    {"TimecodeVITC", GUID{}, 1},
};
constexpr BuiltInMember kPulldownDirectionTypeMembers[] = {
    {"TapeToFilmSpeed", GUID{}, 0},
    {"FilmToTapeSpeed", GUID{}, 1},
};
constexpr BuiltInMember kPulldownKindTypeMembers[] = {
    {"TwoThreePD", GUID{}, 0},
    {"PALPD", GUID{}, 1},
    {"OneToOneNTSC", GUID{}, 2},
    {"OneToOnePAL", GUID{}, 3},
    {"VideoTapNTSC", GUID{}, 4},
    {"OneToOneHDSixty", GUID{}, 5},
    {"TwentyFourToSixtyPD", GUID{}, 6},
    {"TwoToOnePD", GUID{}, 7},
};
constexpr BuiltInMember kEdgeTypeMembers[] = {
    {"EtNull", GUID{}, 0},
    {"EtKeycode", GUID{}, 1},
    {"EtEdgenum4", GUID{}, 2},
    {"EtEdgenum5", GUID{}, 3},
    {"EtHeaderSize", GUID{}, 8},
};
constexpr BuiltInMember kFilmTypeMembers[] = {
    {"FtNull", GUID{}, 0},
    {"Ft35MM", GUID{}, 1},
    {"Ft16MM", GUID{}, 2},
    {"Ft8MM", GUID{}, 3},
    {"Ft65MM", GUID{}, 4},
};
constexpr BuiltInMember kRGBAComponentKindMembers[] = {
    {"CompNone", GUID{}, 48},
    {"CompAlpha", GUID{}, 65},
    {"CompBlue", GUID{}, 66},
    {"CompFill", GUID{}, 70},
    {"CompGreen", GUID{}, 71},
    {"CompPalette", GUID{}, 80},
    {"CompRed", GUID{}, 82},
    {"CompNull", GUID{}, 0},
};
constexpr BuiltInMember kReferenceTypeMembers[] = {
    {"RefLimitMinimum", GUID{}, 0},
    {"RefLimitMaximum", GUID{}, 1},
    {"RefMinimum", GUID{}, 2},
    {"RefMaximum", GUID{}, 3},
    {"RefEnumvalue", GUID{}, 4},
};
constexpr BuiltInMember kAlphaTransparencyTypeMembers[] = {
    {"MinValueTransparent", GUID{}, 0},
    {"MaxValueTransparent", GUID{}, 1},
};
constexpr BuiltInMember kFieldNumberMembers[] = {
    {"UnspecifiedField", GUID{}, 0},
    {"FieldOne", GUID{}, 1},
    {"FieldTwo", GUID{}, 2},
};
constexpr BuiltInMember kElectroSpatialFormulationMembers[] = {
    {"ElectroSpatialFormulation_Default", GUID{}, 0},
    {"ElectroSpatialFormulation_TwoChannelMode", GUID{}, 1},
    {"ElectroSpatialFormulation_SingleChannelMode", GUID{}, 2},
    {"ElectroSpatialFormulation_PrimarySecondaryMode", GUID{}, 3},
    {"ElectroSpatialFormulation_StereophonicMode", GUID{}, 4},
    {"ElectroSpatialFormulation_SingleChannelDoubleSamplingFrequencyMode", GUID{}, 7},
    {"ElectroSpatialFormulation_StereoLeftChannelDoubleSamplingFrequencyMode", GUID{}, 8},
    {"ElectroSpatialFormulation_StereoRightChannelDoubleSamplingFrequencyMode", GUID{}, 9},
    {"ElectroSpatialFormulation_MultiChannelMode", GUID{}, 15},
};
constexpr BuiltInMember kEmphasisTypeMembers[] = {
    {"Emphasis_Unknown", GUID{}, 0},
    {"Emphasis_Reserved0", GUID{}, 1},
    {"Emphasis_Reserved1", GUID{}, 2},
    {"Emphasis_Reserved2", GUID{}, 3},
    {"Emphasis_None", GUID{}, 4},
    {"Emphasis_Reserved3", GUID{}, 5},
    {"Emphasis_15and50", GUID{}, 6},
    {"Emphasis_ITU", GUID{}, 7},
};
constexpr BuiltInMember kAuxBitsModeTypeMembers[] = {
    {"AuxBitsMode_NotDefined", GUID{}, 0},
    {"AuxBitsMode_MainAudioSampleData", GUID{}, 1},
    {"AuxBitsMode_SingleCoordinationSignal", GUID{}, 2},
    {"AuxBitsMode_UserDefined", GUID{}, 3},
    {"AuxBitsMode_Reserved0", GUID{}, 4},
    {"AuxBitsMode_Reserved1", GUID{}, 5},
    {"AuxBitsMode_Reserved2", GUID{}, 6},
    {"AuxBitsMode_Reserved3", GUID{}, 7},
};
constexpr BuiltInMember kChannelStatusModeTypeMembers[] = {
    {"ChannelStatusMode_None", GUID{}, 0},
    {"ChannelStatusMode_Minimum", GUID{}, 1},
    {"ChannelStatusMode_Standard", GUID{}, 2},
    {"ChannelStatusMode_Fixed", GUID{}, 3},
    {"ChannelStatusMode_Stream", GUID{}, 4},
    {"ChannelStatusMode_Essence", GUID{}, 5},
};
constexpr BuiltInMember kUserDataModeTypeMembers[] = {
    {"UserDataMode_NotDefined", GUID{}, 0},
    {"UserDataMode_192BitBlockStructure", GUID{}, 1},
    {"UserDataMode_AES18", GUID{}, 2},
    {"UserDataMode_UserDefined", GUID{}, 3},
    {"UserDataMode_IEC", GUID{}, 4},
    {"UserDataMode_Metadata", GUID{}, 5},
    {"UserDataMode_Reserved0", GUID{}, 6},
    {"UserDataMode_Reserved1", GUID{}, 7},
    {"UserDataMode_Reserved2", GUID{}, 8},
    {"UserDataMode_Reserved3", GUID{}, 9},
    {"UserDataMode_Reserved4", GUID{}, 10},
    {"UserDataMode_Reserved5", GUID{}, 11},
    {"UserDataMode_Reserved6", GUID{}, 12},
    {"UserDataMode_Reserved7", GUID{}, 13},
    {"UserDataMode_Reserved8", GUID{}, 14},
    {"UserDataMode_Reserved9", GUID{}, 15},
};
constexpr BuiltInMember kSignalStandardTypeMembers[] = {
    {"SignalStandard_None", GUID{}, 0},
    {"SignalStandard_ITU601", GUID{}, 1},
    {"SignalStandard_ITU1358", GUID{}, 2},
    {"SignalStandard_SMPTE347M", GUID{}, 3},
    {"SignalStandard_SMPTE274M", GUID{}, 4},
    {"SignalStandard_SMPTE296M", GUID{}, 5},
    {"SignalStandard_SMPTE349M", GUID{}, 6},
};
constexpr BuiltInMember kScanningDirectionTypeMembers[] = {
    {"ScanningDirection_LeftToRightTopToBottom", GUID{}, 0},
    {"ScanningDirection_RightToLeftTopToBottom", GUID{}, 1},
    {"ScanningDirection_LeftToRightBottomToTop", GUID{}, 2},
    {"ScanningDirection_RightToLeftBottomToTop", GUID{}, 3},
    {"ScanningDirection_TopToBottomLeftToRight", GUID{}, 4},
    {"ScanningDirection_TopToBottomRightToLeft", GUID{}, 5},
    {"ScanningDirection_BottomToTopLeftToRight", GUID{}, 6},
    {"ScanningDirection_BottomToTopRightToLeft", GUID{}, 7},
};
constexpr BuiltInMember kContentScanningTypeMembers[] = {
    {"ContentScanning_NotKnown", GUID{}, 0},
    {"ContentScanning_Progressive", GUID{}, 1},
    {"ContentScanning_Interlace", GUID{}, 2},
    {"ContentScanning_Mixed", GUID{}, 3},
};
constexpr BuiltInMember kTitleAlignmentTypeMembers[] = {
    {"TitleAlignment_Left", GUID{}, 0},
    {"TitleAlignment_Center", GUID{}, 1},
    {"TitleAlignment_Right", GUID{}, 2},
};
constexpr BuiltInMember kOperationCategoryTypeMembers[] = {
    {"OperationCategory_Effect", ncfGuid("0D010102-0101-0100-060E-2B3404010101"), 0},
};
constexpr BuiltInMember kTransferCharacteristicTypeMembers[] = {
    {"TransferCharacteristic_ITU470_PAL", ncfGuid("04010101-0101-0000-060E-2B3404010101"), 0},
    {"TransferCharacteristic_ITU709", ncfGuid("04010101-0102-0000-060E-2B3404010101"), 0},
    {"TransferCharacteristic_SMPTE240M", ncfGuid("04010101-0103-0000-060E-2B3404010101"), 0},
    {"TransferCharacteristic_274M_296M", ncfGuid("04010101-0104-0000-060E-2B3404010101"), 0},
    {"TransferCharacteristic_ITU1361", ncfGuid("04010101-0105-0000-060E-2B3404010101"), 0},
    {"TransferCharacteristic_linear", ncfGuid("04010101-0106-0000-060E-2B3404010101"), 0},
};
constexpr BuiltInMember kPluginCategoryTypeMembers[] = {
    {"PluginCategory_Effect", ncfGuid("0D010102-0101-0200-060E-2B3404010101"), 0},
    {"PluginCategory_Codec", ncfGuid("0D010102-0101-0300-060E-2B3404010101"), 0},
    {"PluginCategory_Interpolation", ncfGuid("0D010102-0101-0400-060E-2B3404010101"), 0},
};
constexpr BuiltInMember kUsageTypeMembers[] = {
    {"Usage_SubClip", ncfGuid("0D010102-0101-0500-060E-2B3404010101"), 0},
    {"Usage_AdjustedClip", ncfGuid("0D010102-0101-0600-060E-2B3404010101"), 0},
    {"Usage_TopLevel", ncfGuid("0D010102-0101-0700-060E-2B3404010101"), 0},
    {"Usage_LowerLevel", ncfGuid("0D010102-0101-0800-060E-2B3404010101"), 0},
    {"Usage_Template", ncfGuid("0D010102-0101-0900-060E-2B3404010101"), 0},
};
constexpr BuiltInMember kColorPrimariesTypeMembers[] = {
    {"ColorPrimaries_SMPTE170M", ncfGuid("04010101-0301-0000-060E-2B3404010106"), 0},
    {"ColorPrimaries_ITU470_PAL", ncfGuid("04010101-0302-0000-060E-2B3404010106"), 0},
    {"ColorPrimaries_ITU709", ncfGuid("04010101-0303-0000-060E-2B3404010106"), 0},
};
constexpr BuiltInMember kCodingEquationsTypeMembers[] = {
    {"CodingEquations_ITU601", ncfGuid("04010101-0201-0000-060E-2B3404010101"), 0},
    {"CodingEquations_ITU709", ncfGuid("04010101-0202-0000-060E-2B3404010101"), 0},
    {"CodingEquations_SMPTE240M", ncfGuid("04010101-0203-0000-060E-2B3404010101"), 0},
};
constexpr BuiltInMember kClassDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0101-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010107-0700-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kContainerDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0508-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kDataDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0505-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kInterpolationDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0509-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kMobWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0201-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0501-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kOperationDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0503-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kParameterDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0504-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kTypeDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0101-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010107-0800-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kPluginDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0506-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kCodecDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0202-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010104-0507-0000-060E-2B3401010102"), 0},
};
constexpr BuiltInMember kPropertyDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0101-0100-060E-2B3401010102"), 0},
    {"", ncfGuid("06010107-0700-0000-060E-2B3401010102"), 0},
    {"", ncfGuid("06010107-0200-0000-060E-2B3401010102"), 0},
};

constexpr BuiltInType kTypes[] = {
    {"UInt8", "aafUInt8", ncfGuid("01010100-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 1, false, true, {nullptr, 0}},
    {"UInt16", "aafUInt16", ncfGuid("01010200-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 2, false, true, {nullptr, 0}},
    {"UInt32", "aafUInt32", ncfGuid("01010300-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 4, false, true, {nullptr, 0}},
    {"UInt64", "aafUInt64", ncfGuid("01010400-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 8, false, false, {nullptr, 0}},
    {"Int8", "aafInt8", ncfGuid("01010500-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 1, true, true, {nullptr, 0}},
    {"Int16", "aafInt16", ncfGuid("01010600-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 2, true, true, {nullptr, 0}},
    {"Int32", "aafInt32", ncfGuid("01010700-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 4, true, true, {nullptr, 0}},
    {"Int64", "aafInt64", ncfGuid("01010800-0000-0000-060E-2B3401040101"), TypeKind::Integer, GUID{}, 8, true, true, {nullptr, 0}},
    {"PositionType", "aafPositionType", ncfGuid("01012001-0000-0000-060E-2B3401040101"), TypeKind::Rename, ncfGuid("01010800-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"LengthType", "aafLengthType", ncfGuid("01012002-0000-0000-060E-2B3401040101"), TypeKind::Rename, ncfGuid("01010800-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"JPEGTableIDType", "aafJPEGTableIDType", ncfGuid("01012003-0000-0000-060E-2B3401040101"), TypeKind::Rename, ncfGuid("01010700-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"PhaseFrameType", "aafPhaseFrameType", ncfGuid("01012300-0000-0000-060E-2B3401040101"), TypeKind::Rename, ncfGuid("01010700-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"Character", "aafCharacter", ncfGuid("01100100-0000-0000-060E-2B3401040101"), TypeKind::Character, GUID{}, 0, false, true, {nullptr, 0}},
    {"String", "aafString", ncfGuid("01100200-0000-0000-060E-2B3401040101"), TypeKind::String, ncfGuid("01100100-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"Stream", "Stream", ncfGuid("04100200-0000-0000-060E-2B3401040101"), TypeKind::Stream, GUID{}, 0, false, false, {nullptr, 0}},
    {"Indirect", "aafIndirect", ncfGuid("04100300-0000-0000-060E-2B3401040101"), TypeKind::Indirect, GUID{}, 0, false, false, {nullptr, 0}},
    {"Opaque", "aafOpaque", ncfGuid("04100400-0000-0000-060E-2B3401040101"), TypeKind::Opaque, GUID{}, 0, false, false, {nullptr, 0}},
    {"AUID", "AUID", ncfGuid("01030100-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kAUIDMembers, 4}},
    {"MobIDType", "MobIDType", ncfGuid("01030200-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kMobIDTypeMembers, 6}},
    {"Rational", "Rational", ncfGuid("03010100-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, false, {kRationalMembers, 2}},
    {"ProductVersion", "ProductVersion", ncfGuid("03010200-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kProductVersionMembers, 5}},
    {"VersionType", "VersionType", ncfGuid("03010300-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kVersionTypeMembers, 2}},
    {"RGBAComponent", "RGBAComponent", ncfGuid("03010400-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, false, {kRGBAComponentMembers, 2}},
    {"DateStruct", "DateStruct", ncfGuid("03010500-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kDateStructMembers, 3}},
    {"TimeStruct", "TimeStruct", ncfGuid("03010600-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kTimeStructMembers, 4}},
    {"TimeStamp", "TimeStamp", ncfGuid("03010700-0000-0000-060E-2B3401040101"), TypeKind::Record, GUID{}, 0, false, true, {kTimeStampMembers, 2}},
    {"UInt8Array12", "aafUInt8Array12", ncfGuid("04010200-0000-0000-060E-2B3401040101"), TypeKind::FixedArray, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 12, false, true, {nullptr, 0}},
    {"UInt8Array8", "aafUInt8Array8", ncfGuid("04010800-0000-0000-060E-2B3401040101"), TypeKind::FixedArray, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 8, false, true, {nullptr, 0}},
    {"RGBALayout", "aafRGBALayout", ncfGuid("04020100-0000-0000-060E-2B3401040101"), TypeKind::FixedArray, ncfGuid("03010400-0000-0000-060E-2B3401040101"), 8, false, false, {nullptr, 0}},
    {"UInt8Array", "aafUInt8Array", ncfGuid("04010100-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"Int32Array", "aafInt32Array", ncfGuid("04010300-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010700-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"Int64Array", "aafInt64Array", ncfGuid("04010400-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010800-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"StringArray", "aafStringArray", ncfGuid("04010500-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01100100-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"AUIDArray", "aafAUIDArray", ncfGuid("04010600-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01030100-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"PositionArray", "aafPositionArray", ncfGuid("04010700-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"UInt32Array", "aafUInt32Array", ncfGuid("04010900-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010300-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"ChannelStatusModeArray", "aafChannelStatusModeArray", ncfGuid("04010A00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("02010125-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"UserDataModeArray", "aafUserDataModeArray", ncfGuid("04010B00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("02010126-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"DataValue", "aafDataValue", ncfGuid("04100100-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"AUIDSet", "AUIDSet", ncfGuid("04030100-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("01030100-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"UInt32Set", "UInt32Set", ncfGuid("04030200-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("01010300-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"Boolean", "Boolean", ncfGuid("01040100-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, true, {kBooleanMembers, 2}},
    {"ProductReleaseType", "ProductReleaseType", ncfGuid("02010101-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, true, {kProductReleaseTypeMembers, 6}},
    {"TapeFormatType", "TapeFormatType", ncfGuid("02010102-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kTapeFormatTypeMembers, 7}},
    {"VideoSignalType", "VideoSignalType", ncfGuid("02010103-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kVideoSignalTypeMembers, 3}},
    {"TapeCaseType", "TapeCaseType", ncfGuid("02010104-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kTapeCaseTypeMembers, 8}},
    {"ColorSitingType", "ColorSitingType", ncfGuid("02010105-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kColorSitingTypeMembers, 6}},
    {"EditHintType", "EditHintType", ncfGuid("02010106-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kEditHintTypeMembers, 5}},
    {"FadeType", "FadeType", ncfGuid("02010107-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kFadeTypeMembers, 3}},
    {"LayoutType", "LayoutType", ncfGuid("02010108-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kLayoutTypeMembers, 5}},
    {"TCSource", "TCSource", ncfGuid("02010109-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kTCSourceMembers, 2}},
    {"PulldownDirectionType", "PulldownDirectionType", ncfGuid("0201010A-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kPulldownDirectionTypeMembers, 2}},
    {"PulldownKindType", "PulldownKindType", ncfGuid("0201010B-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kPulldownKindTypeMembers, 8}},
    {"EdgeType", "EdgeType", ncfGuid("0201010C-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kEdgeTypeMembers, 5}},
    {"FilmType", "FilmType", ncfGuid("0201010D-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kFilmTypeMembers, 5}},
    {"RGBAComponentKind", "RGBAComponentKind", ncfGuid("0201010E-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kRGBAComponentKindMembers, 8}},
    {"ReferenceType", "ReferenceType", ncfGuid("0201010F-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kReferenceTypeMembers, 5}},
    {"AlphaTransparencyType", "AlphaTransparencyType", ncfGuid("02010120-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kAlphaTransparencyTypeMembers, 2}},
    {"FieldNumber", "FieldNumber", ncfGuid("02010121-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kFieldNumberMembers, 3}},
    {"ElectroSpatialFormulation", "ElectroSpatialFormulation", ncfGuid("02010122-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kElectroSpatialFormulationMembers, 9}},
    {"EmphasisType", "EmphasisType", ncfGuid("02010123-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kEmphasisTypeMembers, 8}},
    {"AuxBitsModeType", "AuxBitsModeType", ncfGuid("02010124-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kAuxBitsModeTypeMembers, 8}},
    {"ChannelStatusModeType", "ChannelStatusModeType", ncfGuid("02010125-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kChannelStatusModeTypeMembers, 6}},
    {"UserDataModeType", "UserDataModeType", ncfGuid("02010126-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kUserDataModeTypeMembers, 16}},
    {"SignalStandardType", "SignalStandardType", ncfGuid("02010127-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kSignalStandardTypeMembers, 7}},
    {"ScanningDirectionType", "ScanningDirectionType", ncfGuid("02010128-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kScanningDirectionTypeMembers, 8}},
    {"ContentScanningType", "ContentScanningType", ncfGuid("0201012A-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kContentScanningTypeMembers, 4}},
    {"TitleAlignmentType", "TitleAlignmentType", ncfGuid("0201012B-0000-0000-060E-2B3401040101"), TypeKind::Enumeration, ncfGuid("01010100-0000-0000-060E-2B3401040101"), 0, false, false, {kTitleAlignmentTypeMembers, 3}},
    {"OperationCategoryType", "OperationCategoryType", ncfGuid("02020101-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, true, {kOperationCategoryTypeMembers, 1}},
    {"TransferCharacteristicType", "TransferCharacteristicType", ncfGuid("02020102-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, {kTransferCharacteristicTypeMembers, 6}},
    {"PluginCategoryType", "PluginCategoryType", ncfGuid("02020103-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, {kPluginCategoryTypeMembers, 3}},
    {"UsageType", "UsageType", ncfGuid("02020104-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, true, {kUsageTypeMembers, 5}},
    {"ColorPrimariesType", "ColorPrimariesType", ncfGuid("02020105-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, {kColorPrimariesTypeMembers, 3}},
    {"CodingEquationsType", "CodingEquationsType", ncfGuid("02020106-0000-0000-060E-2B3401040101"), TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, {kCodingEquationsTypeMembers, 3}},
    {"ContentStorageStrongReference", "kAAFTypeID_ContentStorageStrongReference", ncfGuid("05020100-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1800-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"DictionaryStrongReference", "kAAFTypeID_DictionaryStrongReference", ncfGuid("05020200-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2200-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"EssenceDescriptorStrongReference", "kAAFTypeID_EssenceDescriptorStrongReference", ncfGuid("05020300-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2400-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"NetworkLocatorStrongReference", "kAAFTypeID_NetworkLocatorStrongReference", ncfGuid("05020400-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3200-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"OperationGroupStrongReference", "kAAFTypeID_OperationGroupStrongReference", ncfGuid("05020500-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-0A00-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"SegmentStrongReference", "kAAFTypeID_SegmentStrongReference", ncfGuid("05020600-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-0300-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"SourceClipStrongReference", "kAAFTypeID_SourceClipStrongReference", ncfGuid("05020700-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1100-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"SourceReferenceStrongReference", "kAAFTypeID_SourceReferenceStrongReference", ncfGuid("05020800-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1000-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"ClassDefinitionStrongReference", "kAAFTypeID_ClassDefinitionStrongReference", ncfGuid("05020900-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0201-0000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"CodecDefinitionStrongReference", "kAAFTypeID_CodecDefinitionStrongReference", ncfGuid("05020A00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1F00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"ComponentStrongReference", "kAAFTypeID_ComponentStrongReference", ncfGuid("05020B00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-0200-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"ContainerDefinitionStrongReference", "kAAFTypeID_ContainerDefinitionStrongReference", ncfGuid("05020C00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"ControlPointStrongReference", "kAAFTypeID_ControlPointStrongReference", ncfGuid("05020D00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1900-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"DataDefinitionStrongReference", "kAAFTypeID_DataDefinitionStrongReference", ncfGuid("05020E00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1B00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"EssenceDataStrongReference", "kAAFTypeID_EssenceDataStrongReference", ncfGuid("05020F00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2300-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"IdentificationStrongReference", "kAAFTypeID_IdentificationStrongReference", ncfGuid("05021000-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"InterpolationDefinitionStrongReference", "kAAFTypeID_InterpolationDefinitionStrongReference", ncfGuid("05021100-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2100-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"LocatorStrongReference", "kAAFTypeID_LocatorStrongReference", ncfGuid("05021200-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3100-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"MobStrongReference", "kAAFTypeID_MobStrongReference", ncfGuid("05021300-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3400-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"MobSlotStrongReference", "kAAFTypeID_MobSlotStrongReference", ncfGuid("05021400-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3800-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"OperationDefinitionStrongReference", "kAAFTypeID_OperationDefinitionStrongReference", ncfGuid("05021500-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1C00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"ParameterStrongReference", "kAAFTypeID_ParameterStrongReference", ncfGuid("05021600-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3C00-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"ParameterDefinitionStrongReference", "kAAFTypeID_ParameterDefinitionStrongReference", ncfGuid("05021700-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1D00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"PluginDefinitionStrongReference", "kAAFTypeID_PluginDefinitionStrongReference", ncfGuid("05021800-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-1E00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"PropertyDefinitionStrongReference", "kAAFTypeID_PropertyDefinitionStrongReference", ncfGuid("05021900-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0202-0000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"TaggedValueStrongReference", "kAAFTypeID_TaggedValueStrongReference", ncfGuid("05021A00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-3F00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"TypeDefinitionStrongReference", "kAAFTypeID_TypeDefinitionStrongReference", ncfGuid("05021B00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0203-0000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"KLVDataStrongReference", "kAAFTypeID_KLVDataStrongReference", ncfGuid("05021C00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-4000-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"FileDescriptorStrongReference", "kAAFTypeID_FileDescriptorStrongReference", ncfGuid("05021D00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-2500-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"RIFFChunkStrongReference", "kAAFTypeID_RIFFChunkStrongReference", ncfGuid("05021E00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-4F00-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"DescriptiveFrameworkStrongReference", "kAAFTypeID_DescriptiveFrameworkStrongReference", ncfGuid("05021F00-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010401-0000-0000-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"KLVDataDefinitionStrongReference", "kAAFTypeID_KLVDataDefinitionStrongReference", ncfGuid("05022000-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-4D00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"TaggedValueDefinitionStrongReference", "kAAFTypeID_TaggedValueDefinitionStrongReference", ncfGuid("05022100-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010101-0101-4C00-060E-2B3402060101"), 0, false, true, {nullptr, 0}},
    {"DescriptiveObjectStrongReference", "kAAFTypeID_DescriptiveObjectStrongReference", ncfGuid("05022200-0000-0000-060E-2B3401040101"), TypeKind::StrongReference, ncfGuid("0D010400-0000-0000-060E-2B3402060101"), 0, false, false, {nullptr, 0}},
    {"ComponentStrongReferenceVector", "kAAFTypeID_ComponentStrongReferenceVector", ncfGuid("05060100-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05020B00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"ControlPointStrongReferenceVector", "kAAFTypeID_ControlPointStrongReferenceVector", ncfGuid("05060200-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05020D00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"IdentificationStrongReferenceVector", "kAAFTypeID_IdentificationStrongReferenceVector", ncfGuid("05060300-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021000-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"LocatorStrongReferenceVector", "kAAFTypeID_LocatorStrongReferenceVector", ncfGuid("05060400-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021200-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"MobSlotStrongReferenceVector", "kAAFTypeID_MobSlotStrongReferenceVector", ncfGuid("05060500-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021400-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"SegmentStrongReferenceVector", "kAAFTypeID_SegmentStrongReferenceVector", ncfGuid("05060600-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05020600-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"SourceReferenceStrongReferenceVector", "kAAFTypeID_SourceReferenceStrongReferenceVector", ncfGuid("05060700-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05020800-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"TaggedValueStrongReferenceVector", "kAAFTypeID_TaggedValueStrongReferenceVector", ncfGuid("05060800-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021A00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"KLVDataStrongReferenceVector", "kAAFTypeID_KLVDataStrongReferenceVector", ncfGuid("05060900-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021C00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"ParameterStrongReferenceVector", "kAAFTypeID_ParameterStrongReferenceVector", ncfGuid("05060A00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021600-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"FileDescriptorStrongReferenceVector", "kAAFTypeID_FileDescriptorStrongReferenceVector", ncfGuid("05060B00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021D00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"RIFFChunkStrongReferenceVector", "kAAFTypeID_RIFFChunkStrongReferenceVector", ncfGuid("05060C00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05021E00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"DescriptiveObjectStrongReferenceVector", "kAAFTypeID_DescriptiveObjectStrongReferenceVector", ncfGuid("05060D00-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05022200-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"ClassDefinitionStrongReferenceSet", "kAAFTypeID_ClassDefinitionStrongReferenceSet", ncfGuid("05050100-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05020900-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"CodecDefinitionStrongReferenceSet", "kAAFTypeID_CodecDefinitionStrongReferenceSet", ncfGuid("05050200-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05020A00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"ContainerDefinitionStrongReferenceSet", "kAAFTypeID_ContainerDefinitionStrongReferenceSet", ncfGuid("05050300-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05020C00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"DataDefinitionStrongReferenceSet", "kAAFTypeID_DataDefinitionStrongReferenceSet", ncfGuid("05050400-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05020E00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"EssenceDataStrongReferenceSet", "kAAFTypeID_EssenceDataStrongReferenceSet", ncfGuid("05050500-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05020F00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"InterpolationDefinitionStrongReferenceSet", "kAAFTypeID_InterpolationDefinitionStrongReferenceSet", ncfGuid("05050600-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021100-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"MobStrongReferenceSet", "kAAFTypeID_MobStrongReferenceSet", ncfGuid("05050700-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021300-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"OperationDefinitionStrongReferenceSet", "kAAFTypeID_OperationDefinitionStrongReferenceSet", ncfGuid("05050800-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021500-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"ParameterDefinitionStrongReferenceSet", "kAAFTypeID_ParameterDefinitionStrongReferenceSet", ncfGuid("05050900-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021700-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"PluginDefinitionStrongReferenceSet", "kAAFTypeID_PluginDefinitionStrongReferenceSet", ncfGuid("05050A00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021800-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"PropertyDefinitionStrongReferenceSet", "kAAFTypeID_PropertyDefinitionStrongReferenceSet", ncfGuid("05050B00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021900-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"TypeDefinitionStrongReferenceSet", "kAAFTypeID_TypeDefinitionStrongReferenceSet", ncfGuid("05050C00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05021B00-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"KLVDataDefinitionStrongReferenceSet", "kAAFTypeID_KLVDataDefinitionStrongReferenceSet", ncfGuid("05050D00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05022000-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"TaggedValueDefinitionStrongReferenceSet", "kAAFTypeID_TaggedValueDefinitionStrongReferenceSet", ncfGuid("05050E00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05022100-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"DescriptiveObjectStrongReferenceSet", "kAAFTypeID_DescriptiveObjectStrongReferenceSet", ncfGuid("05050F00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05022200-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"ClassDefinitionWeakReference", "ClassDefinitionWeakReference", ncfGuid("05010100-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0201-0000-060E-2B3402060101"), 0, false, true, {kClassDefinitionWeakReferenceMembers, 2}},
    {"ContainerDefinitionWeakReference", "ContainerDefinitionWeakReference", ncfGuid("05010200-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-2000-060E-2B3402060101"), 0, false, false, {kContainerDefinitionWeakReferenceMembers, 3}},
    {"DataDefinitionWeakReference", "DataDefinitionWeakReference", ncfGuid("05010300-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-1B00-060E-2B3402060101"), 0, false, true, {kDataDefinitionWeakReferenceMembers, 3}},
    {"InterpolationDefinitionWeakReference", "InterpolationDefinitionWeakReference", ncfGuid("05010500-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-2100-060E-2B3402060101"), 0, false, false, {kInterpolationDefinitionWeakReferenceMembers, 3}},
    {"MobWeakReference", "MobWeakReference", ncfGuid("05010600-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-3400-060E-2B3402060101"), 0, false, false, {kMobWeakReferenceMembers, 3}},
    {"OperationDefinitionWeakReference", "OperationDefinitionWeakReference", ncfGuid("05010700-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-1C00-060E-2B3402060101"), 0, false, true, {kOperationDefinitionWeakReferenceMembers, 3}},
    {"ParameterDefinitionWeakReference", "ParameterDefinitionWeakReference", ncfGuid("05010800-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-1D00-060E-2B3402060101"), 0, false, true, {kParameterDefinitionWeakReferenceMembers, 3}},
    {"TypeDefinitionWeakReference", "TypeDefinitionWeakReference", ncfGuid("05010900-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0203-0000-060E-2B3402060101"), 0, false, true, {kTypeDefinitionWeakReferenceMembers, 2}},
    {"PluginDefinitionWeakReference", "PluginDefinitionWeakReference", ncfGuid("05010A00-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-1E00-060E-2B3402060101"), 0, false, false, {kPluginDefinitionWeakReferenceMembers, 3}},
    {"CodecDefinitionWeakReference", "CodecDefinitionWeakReference", ncfGuid("05010B00-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0101-1F00-060E-2B3402060101"), 0, false, false, {kCodecDefinitionWeakReferenceMembers, 3}},
    {"PropertyDefinitionWeakReference", "PropertyDefinitionWeakReference", ncfGuid("05010C00-0000-0000-060E-2B3401040101"), TypeKind::WeakReference, ncfGuid("0D010101-0202-0000-060E-2B3402060101"), 0, false, false, {kPropertyDefinitionWeakReferenceMembers, 3}},
    {"OperationDefinitionWeakReferenceVector", "kAAFTypeID_OperationDefinitionWeakReferenceVector", ncfGuid("05040100-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05010700-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"TypeDefinitionWeakReferenceVector", "kAAFTypeID_TypeDefinitionWeakReferenceVector", ncfGuid("05040200-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05010900-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"DataDefinitionWeakReferenceVector", "kAAFTypeID_DataDefinitionWeakReferenceVector", ncfGuid("05040300-0000-0000-060E-2B3401040101"), TypeKind::VariableArray, ncfGuid("05010300-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"DataDefinitionWeakReferenceSet", "kAAFTypeID_DataDefinitionWeakReferenceSet", ncfGuid("05030D00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05010300-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"ParameterDefinitionWeakReferenceSet", "kAAFTypeID_ParameterDefinitionWeakReferenceSet", ncfGuid("05030E00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05010800-0000-0000-060E-2B3401040101"), 0, false, true, {nullptr, 0}},
    {"PluginDefinitionWeakReferenceSet", "kAAFTypeID_PluginDefinitionWeakReferenceSet", ncfGuid("05030F00-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05010A00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
    {"PropertyDefinitionWeakReferenceSet", "kAAFTypeID_PropertyDefinitionWeakReferenceSet", ncfGuid("05031000-0000-0000-060E-2B3401040101"), TypeKind::Set, ncfGuid("05010C00-0000-0000-060E-2B3401040101"), 0, false, false, {nullptr, 0}},
};
// clang-format on

}  // namespace

Span<BuiltInType> BuiltInTypes() {
    return {kTypes, sizeof kTypes / sizeof kTypes[0]};
}

}  // namespace aaf
