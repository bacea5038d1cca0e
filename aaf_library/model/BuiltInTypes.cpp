// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/PropertyKeys.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

// Types, in groups by kind.
namespace aaf {

namespace {

// clang-format off
constexpr BuiltInMember kAUIDMembers[] = {
    {"Data1", kAAFTypeID_UInt32, 0},
    {"Data2", kAAFTypeID_UInt16, 0},
    {"Data3", kAAFTypeID_UInt16, 0},
    {"Data4", kAAFTypeID_UInt8Array8, 0},
};
constexpr BuiltInMember kMobIDTypeMembers[] = {
    {"SMPTELabel", kAAFTypeID_UInt8Array12, 0},
    {"length", kAAFTypeID_UInt8, 0},
    {"instanceHigh", kAAFTypeID_UInt8, 0},
    {"instanceMid", kAAFTypeID_UInt8, 0},
    {"instanceLow", kAAFTypeID_UInt8, 0},
    {"material", kAAFTypeID_AUID, 0},
};
constexpr BuiltInMember kRationalMembers[] = {
    {"Numerator", kAAFTypeID_Int32, 0},
    {"Denominator", kAAFTypeID_Int32, 0},
};
constexpr BuiltInMember kProductVersionMembers[] = {
    {"major", kAAFTypeID_UInt16, 0},
    {"minor", kAAFTypeID_UInt16, 0},
    {"tertiary", kAAFTypeID_UInt16, 0},
    {"patchLevel", kAAFTypeID_UInt16, 0},
    {"type", kAAFTypeID_ProductReleaseType, 0},
};
constexpr BuiltInMember kVersionTypeMembers[] = {
    {"major", kAAFTypeID_Int8, 0},
    {"minor", kAAFTypeID_Int8, 0},
};
constexpr BuiltInMember kRGBAComponentMembers[] = {
    {"Code", kAAFTypeID_RGBAComponentKind, 0},
    {"Size", kAAFTypeID_UInt8, 0},
};
constexpr BuiltInMember kDateStructMembers[] = {
    {"year", kAAFTypeID_Int16, 0},
    {"month", kAAFTypeID_UInt8, 0},
    {"day", kAAFTypeID_UInt8, 0},
};
constexpr BuiltInMember kTimeStructMembers[] = {
    {"hour", kAAFTypeID_UInt8, 0},
    {"minute", kAAFTypeID_UInt8, 0},
    {"second", kAAFTypeID_UInt8, 0},
    {"fraction", kAAFTypeID_UInt8, 0},
};
constexpr BuiltInMember kTimeStampMembers[] = {
    {"date", kAAFTypeID_DateStruct, 0},
    {"time", kAAFTypeID_TimeStruct, 0},
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
    {"", prop::MetaDictionary_ClassDefinitions.id, 0},
};
constexpr BuiltInMember kContainerDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_ContainerDefinitions.id, 0},
};
constexpr BuiltInMember kDataDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_DataDefinitions.id, 0},
};
constexpr BuiltInMember kInterpolationDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_InterpolationDefinitions.id, 0},
};
constexpr BuiltInMember kMobWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Content.id, 0},
    {"", prop::ContentStorage_Mobs.id, 0},
};
constexpr BuiltInMember kOperationDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_OperationDefinitions.id, 0},
};
constexpr BuiltInMember kParameterDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_ParameterDefinitions.id, 0},
};
constexpr BuiltInMember kTypeDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0101-0100-060E-2B3401010102"), 0},
    {"", prop::MetaDictionary_TypeDefinitions.id, 0},
};
constexpr BuiltInMember kPluginDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_PluginDefinitions.id, 0},
};
constexpr BuiltInMember kCodecDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0102-0100-060E-2B3401010102"), 0},
    {"", prop::Header_Dictionary.id, 0},
    {"", prop::Dictionary_CodecDefinitions.id, 0},
};
constexpr BuiltInMember kPropertyDefinitionWeakReferenceMembers[] = {
    {"", ncfGuid("0D010301-0101-0100-060E-2B3401010102"), 0},
    {"", prop::MetaDictionary_ClassDefinitions.id, 0},
    {"", prop::ClassDefinition_Properties.id, 0},
};

constexpr BuiltInType kTypes[] = {
    {"UInt8", "aafUInt8", kAAFTypeID_UInt8, TypeKind::Integer, GUID{}, 1, false, true, {}},
    {"UInt16", "aafUInt16", kAAFTypeID_UInt16, TypeKind::Integer, GUID{}, 2, false, true, {}},
    {"UInt32", "aafUInt32", kAAFTypeID_UInt32, TypeKind::Integer, GUID{}, 4, false, true, {}},
    {"UInt64", "aafUInt64", kAAFTypeID_UInt64, TypeKind::Integer, GUID{}, 8, false, false, {}},
    {"Int8", "aafInt8", kAAFTypeID_Int8, TypeKind::Integer, GUID{}, 1, true, true, {}},
    {"Int16", "aafInt16", kAAFTypeID_Int16, TypeKind::Integer, GUID{}, 2, true, true, {}},
    {"Int32", "aafInt32", kAAFTypeID_Int32, TypeKind::Integer, GUID{}, 4, true, true, {}},
    {"Int64", "aafInt64", kAAFTypeID_Int64, TypeKind::Integer, GUID{}, 8, true, true, {}},
    {"PositionType", "aafPositionType", kAAFTypeID_PositionType, TypeKind::Rename, kAAFTypeID_Int64, 0, false, false, {}},
    {"LengthType", "aafLengthType", kAAFTypeID_LengthType, TypeKind::Rename, kAAFTypeID_Int64, 0, false, false, {}},
    {"JPEGTableIDType", "aafJPEGTableIDType", kAAFTypeID_JPEGTableIDType, TypeKind::Rename, kAAFTypeID_Int32, 0, false, false, {}},
    {"PhaseFrameType", "aafPhaseFrameType", kAAFTypeID_PhaseFrameType, TypeKind::Rename, kAAFTypeID_Int32, 0, false, false, {}},
    {"Character", "aafCharacter", kAAFTypeID_Character, TypeKind::Character, GUID{}, 0, false, true, {}},
    {"String", "aafString", kAAFTypeID_String, TypeKind::String, kAAFTypeID_Character, 0, false, true, {}},
    {"Stream", "Stream", kAAFTypeID_Stream, TypeKind::Stream, GUID{}, 0, false, false, {}},
    {"Indirect", "aafIndirect", kAAFTypeID_Indirect, TypeKind::Indirect, GUID{}, 0, false, false, {}},
    {"Opaque", "aafOpaque", kAAFTypeID_Opaque, TypeKind::Opaque, GUID{}, 0, false, false, {}},
    {"AUID", "AUID", kAAFTypeID_AUID, TypeKind::Record, GUID{}, 0, false, true, kAUIDMembers},
    {"MobIDType", "MobIDType", kAAFTypeID_MobIDType, TypeKind::Record, GUID{}, 0, false, true, kMobIDTypeMembers},
    {"Rational", "Rational", kAAFTypeID_Rational, TypeKind::Record, GUID{}, 0, false, false, kRationalMembers},
    {"ProductVersion", "ProductVersion", kAAFTypeID_ProductVersion, TypeKind::Record, GUID{}, 0, false, true, kProductVersionMembers},
    {"VersionType", "VersionType", kAAFTypeID_VersionType, TypeKind::Record, GUID{}, 0, false, true, kVersionTypeMembers},
    {"RGBAComponent", "RGBAComponent", kAAFTypeID_RGBAComponent, TypeKind::Record, GUID{}, 0, false, false, kRGBAComponentMembers},
    {"DateStruct", "DateStruct", kAAFTypeID_DateStruct, TypeKind::Record, GUID{}, 0, false, true, kDateStructMembers},
    {"TimeStruct", "TimeStruct", kAAFTypeID_TimeStruct, TypeKind::Record, GUID{}, 0, false, true, kTimeStructMembers},
    {"TimeStamp", "TimeStamp", kAAFTypeID_TimeStamp, TypeKind::Record, GUID{}, 0, false, true, kTimeStampMembers},
    {"UInt8Array12", "aafUInt8Array12", kAAFTypeID_UInt8Array12, TypeKind::FixedArray, kAAFTypeID_UInt8, 12, false, true, {}},
    {"UInt8Array8", "aafUInt8Array8", kAAFTypeID_UInt8Array8, TypeKind::FixedArray, kAAFTypeID_UInt8, 8, false, true, {}},
    {"RGBALayout", "aafRGBALayout", kAAFTypeID_RGBALayout, TypeKind::FixedArray, kAAFTypeID_RGBAComponent, 8, false, false, {}},
    {"UInt8Array", "aafUInt8Array", kAAFTypeID_UInt8Array, TypeKind::VariableArray, kAAFTypeID_UInt8, 0, false, false, {}},
    {"Int32Array", "aafInt32Array", kAAFTypeID_Int32Array, TypeKind::VariableArray, kAAFTypeID_Int32, 0, false, false, {}},
    {"Int64Array", "aafInt64Array", kAAFTypeID_Int64Array, TypeKind::VariableArray, kAAFTypeID_Int64, 0, false, true, {}},
    {"StringArray", "aafStringArray", kAAFTypeID_StringArray, TypeKind::VariableArray, kAAFTypeID_Character, 0, false, false, {}},
    {"AUIDArray", "aafAUIDArray", kAAFTypeID_AUIDArray, TypeKind::VariableArray, kAAFTypeID_AUID, 0, false, true, {}},
    {"PositionArray", "aafPositionArray", kAAFTypeID_PositionArray, TypeKind::VariableArray, kAAFTypeID_UInt8, 0, false, false, {}},
    {"UInt32Array", "aafUInt32Array", kAAFTypeID_UInt32Array, TypeKind::VariableArray, kAAFTypeID_UInt32, 0, false, false, {}},
    {"ChannelStatusModeArray", "aafChannelStatusModeArray", kAAFTypeID_ChannelStatusModeArray, TypeKind::VariableArray, kAAFTypeID_ChannelStatusModeType, 0, false, false, {}},
    {"UserDataModeArray", "aafUserDataModeArray", kAAFTypeID_UserDataModeArray, TypeKind::VariableArray, kAAFTypeID_UserDataModeType, 0, false, false, {}},
    {"DataValue", "aafDataValue", kAAFTypeID_DataValue, TypeKind::VariableArray, kAAFTypeID_UInt8, 0, false, false, {}},
    {"AUIDSet", "AUIDSet", kAAFTypeID_AUIDSet, TypeKind::Set, kAAFTypeID_AUID, 0, false, true, {}},
    {"UInt32Set", "UInt32Set", kAAFTypeID_UInt32Set, TypeKind::Set, kAAFTypeID_UInt32, 0, false, false, {}},
    {"Boolean", "Boolean", kAAFTypeID_Boolean, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, true, kBooleanMembers},
    {"ProductReleaseType", "ProductReleaseType", kAAFTypeID_ProductReleaseType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, true, kProductReleaseTypeMembers},
    {"TapeFormatType", "TapeFormatType", kAAFTypeID_TapeFormatType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kTapeFormatTypeMembers},
    {"VideoSignalType", "VideoSignalType", kAAFTypeID_VideoSignalType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kVideoSignalTypeMembers},
    {"TapeCaseType", "TapeCaseType", kAAFTypeID_TapeCaseType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kTapeCaseTypeMembers},
    {"ColorSitingType", "ColorSitingType", kAAFTypeID_ColorSitingType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kColorSitingTypeMembers},
    {"EditHintType", "EditHintType", kAAFTypeID_EditHintType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kEditHintTypeMembers},
    {"FadeType", "FadeType", kAAFTypeID_FadeType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kFadeTypeMembers},
    {"LayoutType", "LayoutType", kAAFTypeID_LayoutType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kLayoutTypeMembers},
    {"TCSource", "TCSource", kAAFTypeID_TCSource, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kTCSourceMembers},
    {"PulldownDirectionType", "PulldownDirectionType", kAAFTypeID_PulldownDirectionType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kPulldownDirectionTypeMembers},
    {"PulldownKindType", "PulldownKindType", kAAFTypeID_PulldownKindType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kPulldownKindTypeMembers},
    {"EdgeType", "EdgeType", kAAFTypeID_EdgeType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kEdgeTypeMembers},
    {"FilmType", "FilmType", kAAFTypeID_FilmType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kFilmTypeMembers},
    {"RGBAComponentKind", "RGBAComponentKind", kAAFTypeID_RGBAComponentKind, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kRGBAComponentKindMembers},
    {"ReferenceType", "ReferenceType", kAAFTypeID_ReferenceType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kReferenceTypeMembers},
    {"AlphaTransparencyType", "AlphaTransparencyType", kAAFTypeID_AlphaTransparencyType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kAlphaTransparencyTypeMembers},
    {"FieldNumber", "FieldNumber", kAAFTypeID_FieldNumber, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kFieldNumberMembers},
    {"ElectroSpatialFormulation", "ElectroSpatialFormulation", kAAFTypeID_ElectroSpatialFormulation, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kElectroSpatialFormulationMembers},
    {"EmphasisType", "EmphasisType", kAAFTypeID_EmphasisType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kEmphasisTypeMembers},
    {"AuxBitsModeType", "AuxBitsModeType", kAAFTypeID_AuxBitsModeType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kAuxBitsModeTypeMembers},
    {"ChannelStatusModeType", "ChannelStatusModeType", kAAFTypeID_ChannelStatusModeType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kChannelStatusModeTypeMembers},
    {"UserDataModeType", "UserDataModeType", kAAFTypeID_UserDataModeType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kUserDataModeTypeMembers},
    {"SignalStandardType", "SignalStandardType", kAAFTypeID_SignalStandardType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kSignalStandardTypeMembers},
    {"ScanningDirectionType", "ScanningDirectionType", kAAFTypeID_ScanningDirectionType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kScanningDirectionTypeMembers},
    {"ContentScanningType", "ContentScanningType", kAAFTypeID_ContentScanningType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kContentScanningTypeMembers},
    {"TitleAlignmentType", "TitleAlignmentType", kAAFTypeID_TitleAlignmentType, TypeKind::Enumeration, kAAFTypeID_UInt8, 0, false, false, kTitleAlignmentTypeMembers},
    {"OperationCategoryType", "OperationCategoryType", kAAFTypeID_OperationCategoryType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, true, kOperationCategoryTypeMembers},
    {"TransferCharacteristicType", "TransferCharacteristicType", kAAFTypeID_TransferCharacteristicType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, kTransferCharacteristicTypeMembers},
    {"PluginCategoryType", "PluginCategoryType", kAAFTypeID_PluginCategoryType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, kPluginCategoryTypeMembers},
    {"UsageType", "UsageType", kAAFTypeID_UsageType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, true, kUsageTypeMembers},
    {"ColorPrimariesType", "ColorPrimariesType", kAAFTypeID_ColorPrimariesType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, kColorPrimariesTypeMembers},
    {"CodingEquationsType", "CodingEquationsType", kAAFTypeID_CodingEquationsType, TypeKind::ExtendibleEnumeration, GUID{}, 0, false, false, kCodingEquationsTypeMembers},
    {"ContentStorageStrongReference", "kAAFTypeID_ContentStorageStrongReference", kAAFTypeID_ContentStorageStrongReference, TypeKind::StrongReference, AUID_AAFContentStorage, 0, false, true, {}},
    {"DictionaryStrongReference", "kAAFTypeID_DictionaryStrongReference", kAAFTypeID_DictionaryStrongReference, TypeKind::StrongReference, AUID_AAFDictionary, 0, false, true, {}},
    {"EssenceDescriptorStrongReference", "kAAFTypeID_EssenceDescriptorStrongReference", kAAFTypeID_EssenceDescriptorStrongReference, TypeKind::StrongReference, AUID_AAFEssenceDescriptor, 0, false, false, {}},
    {"NetworkLocatorStrongReference", "kAAFTypeID_NetworkLocatorStrongReference", kAAFTypeID_NetworkLocatorStrongReference, TypeKind::StrongReference, AUID_AAFNetworkLocator, 0, false, false, {}},
    {"OperationGroupStrongReference", "kAAFTypeID_OperationGroupStrongReference", kAAFTypeID_OperationGroupStrongReference, TypeKind::StrongReference, AUID_AAFOperationGroup, 0, false, false, {}},
    {"SegmentStrongReference", "kAAFTypeID_SegmentStrongReference", kAAFTypeID_SegmentStrongReference, TypeKind::StrongReference, AUID_AAFSegment, 0, false, false, {}},
    {"SourceClipStrongReference", "kAAFTypeID_SourceClipStrongReference", kAAFTypeID_SourceClipStrongReference, TypeKind::StrongReference, AUID_AAFSourceClip, 0, false, false, {}},
    {"SourceReferenceStrongReference", "kAAFTypeID_SourceReferenceStrongReference", kAAFTypeID_SourceReferenceStrongReference, TypeKind::StrongReference, AUID_AAFSourceReference, 0, false, false, {}},
    {"ClassDefinitionStrongReference", "kAAFTypeID_ClassDefinitionStrongReference", kAAFTypeID_ClassDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFClassDef, 0, false, true, {}},
    {"CodecDefinitionStrongReference", "kAAFTypeID_CodecDefinitionStrongReference", kAAFTypeID_CodecDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFCodecDef, 0, false, true, {}},
    {"ComponentStrongReference", "kAAFTypeID_ComponentStrongReference", kAAFTypeID_ComponentStrongReference, TypeKind::StrongReference, AUID_AAFComponent, 0, false, false, {}},
    {"ContainerDefinitionStrongReference", "kAAFTypeID_ContainerDefinitionStrongReference", kAAFTypeID_ContainerDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFContainerDef, 0, false, true, {}},
    {"ControlPointStrongReference", "kAAFTypeID_ControlPointStrongReference", kAAFTypeID_ControlPointStrongReference, TypeKind::StrongReference, AUID_AAFControlPoint, 0, false, false, {}},
    {"DataDefinitionStrongReference", "kAAFTypeID_DataDefinitionStrongReference", kAAFTypeID_DataDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFDataDef, 0, false, true, {}},
    {"EssenceDataStrongReference", "kAAFTypeID_EssenceDataStrongReference", kAAFTypeID_EssenceDataStrongReference, TypeKind::StrongReference, AUID_AAFEssenceData, 0, false, true, {}},
    {"IdentificationStrongReference", "kAAFTypeID_IdentificationStrongReference", kAAFTypeID_IdentificationStrongReference, TypeKind::StrongReference, AUID_AAFIdentification, 0, false, true, {}},
    {"InterpolationDefinitionStrongReference", "kAAFTypeID_InterpolationDefinitionStrongReference", kAAFTypeID_InterpolationDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFInterpolationDef, 0, false, true, {}},
    {"LocatorStrongReference", "kAAFTypeID_LocatorStrongReference", kAAFTypeID_LocatorStrongReference, TypeKind::StrongReference, AUID_AAFLocator, 0, false, false, {}},
    {"MobStrongReference", "kAAFTypeID_MobStrongReference", kAAFTypeID_MobStrongReference, TypeKind::StrongReference, AUID_AAFMob, 0, false, true, {}},
    {"MobSlotStrongReference", "kAAFTypeID_MobSlotStrongReference", kAAFTypeID_MobSlotStrongReference, TypeKind::StrongReference, AUID_AAFMobSlot, 0, false, true, {}},
    {"OperationDefinitionStrongReference", "kAAFTypeID_OperationDefinitionStrongReference", kAAFTypeID_OperationDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFOperationDef, 0, false, true, {}},
    {"ParameterStrongReference", "kAAFTypeID_ParameterStrongReference", kAAFTypeID_ParameterStrongReference, TypeKind::StrongReference, AUID_AAFParameter, 0, false, false, {}},
    {"ParameterDefinitionStrongReference", "kAAFTypeID_ParameterDefinitionStrongReference", kAAFTypeID_ParameterDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFParameterDef, 0, false, true, {}},
    {"PluginDefinitionStrongReference", "kAAFTypeID_PluginDefinitionStrongReference", kAAFTypeID_PluginDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFPluginDef, 0, false, true, {}},
    {"PropertyDefinitionStrongReference", "kAAFTypeID_PropertyDefinitionStrongReference", kAAFTypeID_PropertyDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFPropertyDef, 0, false, true, {}},
    {"TaggedValueStrongReference", "kAAFTypeID_TaggedValueStrongReference", kAAFTypeID_TaggedValueStrongReference, TypeKind::StrongReference, AUID_AAFTaggedValue, 0, false, true, {}},
    {"TypeDefinitionStrongReference", "kAAFTypeID_TypeDefinitionStrongReference", kAAFTypeID_TypeDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFTypeDef, 0, false, true, {}},
    {"KLVDataStrongReference", "kAAFTypeID_KLVDataStrongReference", kAAFTypeID_KLVDataStrongReference, TypeKind::StrongReference, AUID_AAFKLVData, 0, false, true, {}},
    {"FileDescriptorStrongReference", "kAAFTypeID_FileDescriptorStrongReference", kAAFTypeID_FileDescriptorStrongReference, TypeKind::StrongReference, AUID_AAFFileDescriptor, 0, false, false, {}},
    {"RIFFChunkStrongReference", "kAAFTypeID_RIFFChunkStrongReference", kAAFTypeID_RIFFChunkStrongReference, TypeKind::StrongReference, AUID_AAFRIFFChunk, 0, false, false, {}},
    {"DescriptiveFrameworkStrongReference", "kAAFTypeID_DescriptiveFrameworkStrongReference", kAAFTypeID_DescriptiveFrameworkStrongReference, TypeKind::StrongReference, AUID_AAFDescriptiveFramework, 0, false, false, {}},
    {"KLVDataDefinitionStrongReference", "kAAFTypeID_KLVDataDefinitionStrongReference", kAAFTypeID_KLVDataDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFKLVDataDefinition, 0, false, true, {}},
    {"TaggedValueDefinitionStrongReference", "kAAFTypeID_TaggedValueDefinitionStrongReference", kAAFTypeID_TaggedValueDefinitionStrongReference, TypeKind::StrongReference, AUID_AAFTaggedValueDefinition, 0, false, true, {}},
    {"DescriptiveObjectStrongReference", "kAAFTypeID_DescriptiveObjectStrongReference", kAAFTypeID_DescriptiveObjectStrongReference, TypeKind::StrongReference, AUID_AAFDescriptiveObject, 0, false, false, {}},
    {"ComponentStrongReferenceVector", "kAAFTypeID_ComponentStrongReferenceVector", kAAFTypeID_ComponentStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_ComponentStrongReference, 0, false, false, {}},
    {"ControlPointStrongReferenceVector", "kAAFTypeID_ControlPointStrongReferenceVector", kAAFTypeID_ControlPointStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_ControlPointStrongReference, 0, false, false, {}},
    {"IdentificationStrongReferenceVector", "kAAFTypeID_IdentificationStrongReferenceVector", kAAFTypeID_IdentificationStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_IdentificationStrongReference, 0, false, true, {}},
    {"LocatorStrongReferenceVector", "kAAFTypeID_LocatorStrongReferenceVector", kAAFTypeID_LocatorStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_LocatorStrongReference, 0, false, false, {}},
    {"MobSlotStrongReferenceVector", "kAAFTypeID_MobSlotStrongReferenceVector", kAAFTypeID_MobSlotStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_MobSlotStrongReference, 0, false, true, {}},
    {"SegmentStrongReferenceVector", "kAAFTypeID_SegmentStrongReferenceVector", kAAFTypeID_SegmentStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_SegmentStrongReference, 0, false, false, {}},
    {"SourceReferenceStrongReferenceVector", "kAAFTypeID_SourceReferenceStrongReferenceVector", kAAFTypeID_SourceReferenceStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_SourceReferenceStrongReference, 0, false, false, {}},
    {"TaggedValueStrongReferenceVector", "kAAFTypeID_TaggedValueStrongReferenceVector", kAAFTypeID_TaggedValueStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_TaggedValueStrongReference, 0, false, true, {}},
    {"KLVDataStrongReferenceVector", "kAAFTypeID_KLVDataStrongReferenceVector", kAAFTypeID_KLVDataStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_KLVDataStrongReference, 0, false, true, {}},
    {"ParameterStrongReferenceVector", "kAAFTypeID_ParameterStrongReferenceVector", kAAFTypeID_ParameterStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_ParameterStrongReference, 0, false, false, {}},
    {"FileDescriptorStrongReferenceVector", "kAAFTypeID_FileDescriptorStrongReferenceVector", kAAFTypeID_FileDescriptorStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_FileDescriptorStrongReference, 0, false, false, {}},
    {"RIFFChunkStrongReferenceVector", "kAAFTypeID_RIFFChunkStrongReferenceVector", kAAFTypeID_RIFFChunkStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_RIFFChunkStrongReference, 0, false, false, {}},
    {"DescriptiveObjectStrongReferenceVector", "kAAFTypeID_DescriptiveObjectStrongReferenceVector", kAAFTypeID_DescriptiveObjectStrongReferenceVector, TypeKind::VariableArray, kAAFTypeID_DescriptiveObjectStrongReference, 0, false, false, {}},
    {"ClassDefinitionStrongReferenceSet", "kAAFTypeID_ClassDefinitionStrongReferenceSet", kAAFTypeID_ClassDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_ClassDefinitionStrongReference, 0, false, true, {}},
    {"CodecDefinitionStrongReferenceSet", "kAAFTypeID_CodecDefinitionStrongReferenceSet", kAAFTypeID_CodecDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_CodecDefinitionStrongReference, 0, false, true, {}},
    {"ContainerDefinitionStrongReferenceSet", "kAAFTypeID_ContainerDefinitionStrongReferenceSet", kAAFTypeID_ContainerDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_ContainerDefinitionStrongReference, 0, false, true, {}},
    {"DataDefinitionStrongReferenceSet", "kAAFTypeID_DataDefinitionStrongReferenceSet", kAAFTypeID_DataDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_DataDefinitionStrongReference, 0, false, true, {}},
    {"EssenceDataStrongReferenceSet", "kAAFTypeID_EssenceDataStrongReferenceSet", kAAFTypeID_EssenceDataStrongReferenceSet, TypeKind::Set, kAAFTypeID_EssenceDataStrongReference, 0, false, true, {}},
    {"InterpolationDefinitionStrongReferenceSet", "kAAFTypeID_InterpolationDefinitionStrongReferenceSet", kAAFTypeID_InterpolationDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_InterpolationDefinitionStrongReference, 0, false, true, {}},
    {"MobStrongReferenceSet", "kAAFTypeID_MobStrongReferenceSet", kAAFTypeID_MobStrongReferenceSet, TypeKind::Set, kAAFTypeID_MobStrongReference, 0, false, true, {}},
    {"OperationDefinitionStrongReferenceSet", "kAAFTypeID_OperationDefinitionStrongReferenceSet", kAAFTypeID_OperationDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_OperationDefinitionStrongReference, 0, false, true, {}},
    {"ParameterDefinitionStrongReferenceSet", "kAAFTypeID_ParameterDefinitionStrongReferenceSet", kAAFTypeID_ParameterDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_ParameterDefinitionStrongReference, 0, false, true, {}},
    {"PluginDefinitionStrongReferenceSet", "kAAFTypeID_PluginDefinitionStrongReferenceSet", kAAFTypeID_PluginDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_PluginDefinitionStrongReference, 0, false, true, {}},
    {"PropertyDefinitionStrongReferenceSet", "kAAFTypeID_PropertyDefinitionStrongReferenceSet", kAAFTypeID_PropertyDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_PropertyDefinitionStrongReference, 0, false, true, {}},
    {"TypeDefinitionStrongReferenceSet", "kAAFTypeID_TypeDefinitionStrongReferenceSet", kAAFTypeID_TypeDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_TypeDefinitionStrongReference, 0, false, true, {}},
    {"KLVDataDefinitionStrongReferenceSet", "kAAFTypeID_KLVDataDefinitionStrongReferenceSet", kAAFTypeID_KLVDataDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_KLVDataDefinitionStrongReference, 0, false, true, {}},
    {"TaggedValueDefinitionStrongReferenceSet", "kAAFTypeID_TaggedValueDefinitionStrongReferenceSet", kAAFTypeID_TaggedValueDefinitionStrongReferenceSet, TypeKind::Set, kAAFTypeID_TaggedValueDefinitionStrongReference, 0, false, true, {}},
    {"DescriptiveObjectStrongReferenceSet", "kAAFTypeID_DescriptiveObjectStrongReferenceSet", kAAFTypeID_DescriptiveObjectStrongReferenceSet, TypeKind::Set, kAAFTypeID_DescriptiveObjectStrongReference, 0, false, false, {}},
    {"ClassDefinitionWeakReference", "ClassDefinitionWeakReference", kAAFTypeID_ClassDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFClassDef, 0, false, true, kClassDefinitionWeakReferenceMembers},
    {"ContainerDefinitionWeakReference", "ContainerDefinitionWeakReference", kAAFTypeID_ContainerDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFContainerDef, 0, false, false, kContainerDefinitionWeakReferenceMembers},
    {"DataDefinitionWeakReference", "DataDefinitionWeakReference", kAAFTypeID_DataDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFDataDef, 0, false, true, kDataDefinitionWeakReferenceMembers},
    {"InterpolationDefinitionWeakReference", "InterpolationDefinitionWeakReference", kAAFTypeID_InterpolationDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFInterpolationDef, 0, false, false, kInterpolationDefinitionWeakReferenceMembers},
    {"MobWeakReference", "MobWeakReference", kAAFTypeID_MobWeakReference, TypeKind::WeakReference, AUID_AAFMob, 0, false, false, kMobWeakReferenceMembers},
    {"OperationDefinitionWeakReference", "OperationDefinitionWeakReference", kAAFTypeID_OperationDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFOperationDef, 0, false, true, kOperationDefinitionWeakReferenceMembers},
    {"ParameterDefinitionWeakReference", "ParameterDefinitionWeakReference", kAAFTypeID_ParameterDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFParameterDef, 0, false, true, kParameterDefinitionWeakReferenceMembers},
    {"TypeDefinitionWeakReference", "TypeDefinitionWeakReference", kAAFTypeID_TypeDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFTypeDef, 0, false, true, kTypeDefinitionWeakReferenceMembers},
    {"PluginDefinitionWeakReference", "PluginDefinitionWeakReference", kAAFTypeID_PluginDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFPluginDef, 0, false, false, kPluginDefinitionWeakReferenceMembers},
    {"CodecDefinitionWeakReference", "CodecDefinitionWeakReference", kAAFTypeID_CodecDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFCodecDef, 0, false, false, kCodecDefinitionWeakReferenceMembers},
    {"PropertyDefinitionWeakReference", "PropertyDefinitionWeakReference", kAAFTypeID_PropertyDefinitionWeakReference, TypeKind::WeakReference, AUID_AAFPropertyDef, 0, false, false, kPropertyDefinitionWeakReferenceMembers},
    {"OperationDefinitionWeakReferenceVector", "kAAFTypeID_OperationDefinitionWeakReferenceVector", kAAFTypeID_OperationDefinitionWeakReferenceVector, TypeKind::VariableArray, kAAFTypeID_OperationDefinitionWeakReference, 0, false, true, {}},
    {"TypeDefinitionWeakReferenceVector", "kAAFTypeID_TypeDefinitionWeakReferenceVector", kAAFTypeID_TypeDefinitionWeakReferenceVector, TypeKind::VariableArray, kAAFTypeID_TypeDefinitionWeakReference, 0, false, true, {}},
    {"DataDefinitionWeakReferenceVector", "kAAFTypeID_DataDefinitionWeakReferenceVector", kAAFTypeID_DataDefinitionWeakReferenceVector, TypeKind::VariableArray, kAAFTypeID_DataDefinitionWeakReference, 0, false, true, {}},
    {"DataDefinitionWeakReferenceSet", "kAAFTypeID_DataDefinitionWeakReferenceSet", kAAFTypeID_DataDefinitionWeakReferenceSet, TypeKind::Set, kAAFTypeID_DataDefinitionWeakReference, 0, false, false, {}},
    {"ParameterDefinitionWeakReferenceSet", "kAAFTypeID_ParameterDefinitionWeakReferenceSet", kAAFTypeID_ParameterDefinitionWeakReferenceSet, TypeKind::Set, kAAFTypeID_ParameterDefinitionWeakReference, 0, false, true, {}},
    {"PluginDefinitionWeakReferenceSet", "kAAFTypeID_PluginDefinitionWeakReferenceSet", kAAFTypeID_PluginDefinitionWeakReferenceSet, TypeKind::Set, kAAFTypeID_PluginDefinitionWeakReference, 0, false, false, {}},
    {"PropertyDefinitionWeakReferenceSet", "kAAFTypeID_PropertyDefinitionWeakReferenceSet", kAAFTypeID_PropertyDefinitionWeakReferenceSet, TypeKind::Set, kAAFTypeID_PropertyDefinitionWeakReference, 0, false, false, {}},
};
// clang-format on

}  // namespace

Span<BuiltInType> BuiltInTypes() {
    return kTypes;
}

}  // namespace aaf
