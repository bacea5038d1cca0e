// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/PropertyKeys.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

// Classes in the order of their ids, each with its properties in the order in which files number
// them (stored/CreationOrder.h).
namespace aaf {

namespace {

// clang-format off
constexpr BuiltInProperty kInterchangeObjectProperties[] = {
    {"ObjClass", prop::InterchangeObject_ObjClass, kAAFTypeID_ClassDefinitionWeakReference, false, false},
    {"Generation", prop::InterchangeObject_Generation, kAAFTypeID_AUID, true, false},
};
constexpr BuiltInProperty kComponentProperties[] = {
    {"DataDefinition", prop::Component_DataDefinition, kAAFTypeID_DataDefinitionWeakReference, false, false},
    {"Length", prop::Component_Length, kAAFTypeID_LengthType, true, false},
    {"KLVData", prop::Component_KLVData, kAAFTypeID_KLVDataStrongReferenceVector, true, false},
    {"UserComments", prop::Component_UserComments, kAAFTypeID_TaggedValueStrongReferenceVector, true, false},
    {"Attributes", prop::Component_Attributes, kAAFTypeID_TaggedValueStrongReferenceVector, true, false},
};
constexpr BuiltInProperty kEdgeCodeProperties[] = {
    {"Start", prop::EdgeCode_Start, kAAFTypeID_PositionType, false, false},
    {"FilmKind", prop::EdgeCode_FilmKind, kAAFTypeID_FilmType, false, false},
    {"CodeFormat", prop::EdgeCode_CodeFormat, kAAFTypeID_EdgeType, false, false},
    {"Header", prop::EdgeCode_Header, kAAFTypeID_DataValue, true, false},
};
constexpr BuiltInProperty kEssenceGroupProperties[] = {
    {"Choices", prop::EssenceGroup_Choices, kAAFTypeID_SourceReferenceStrongReferenceVector, false, false},
    {"StillFrame", prop::EssenceGroup_StillFrame, kAAFTypeID_SourceReferenceStrongReference, true, false},
};
constexpr BuiltInProperty kEventProperties[] = {
    {"Position", prop::Event_Position, kAAFTypeID_PositionType, false, false},
    {"Comment", prop::Event_Comment, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kGPITriggerProperties[] = {
    {"ActiveState", prop::GPITrigger_ActiveState, kAAFTypeID_Boolean, false, false},
};
constexpr BuiltInProperty kCommentMarkerProperties[] = {
    {"Annotation", prop::CommentMarker_Annotation, kAAFTypeID_SourceReferenceStrongReference, true, false},
};
constexpr BuiltInProperty kOperationGroupProperties[] = {
    {"Operation", prop::OperationGroup_Operation, kAAFTypeID_OperationDefinitionWeakReference, false, false},
    {"InputSegments", prop::OperationGroup_InputSegments, kAAFTypeID_SegmentStrongReferenceVector, true, false},
    {"Parameters", prop::OperationGroup_Parameters, kAAFTypeID_ParameterStrongReferenceVector, true, false},
    {"BypassOverride", prop::OperationGroup_BypassOverride, kAAFTypeID_UInt32, true, false},
    {"Rendering", prop::OperationGroup_Rendering, kAAFTypeID_SourceReferenceStrongReference, true, false},
};
constexpr BuiltInProperty kNestedScopeProperties[] = {
    {"Slots", prop::NestedScope_Slots, kAAFTypeID_SegmentStrongReferenceVector, false, false},
};
constexpr BuiltInProperty kPulldownProperties[] = {
    {"InputSegment", prop::Pulldown_InputSegment, kAAFTypeID_SegmentStrongReference, false, false},
    {"PulldownKind", prop::Pulldown_PulldownKind, kAAFTypeID_PulldownKindType, false, false},
    {"PulldownDirection", prop::Pulldown_PulldownDirection, kAAFTypeID_PulldownDirectionType, false, false},
    {"PhaseFrame", prop::Pulldown_PhaseFrame, kAAFTypeID_PhaseFrameType, false, false},
};
constexpr BuiltInProperty kScopeReferenceProperties[] = {
    {"RelativeScope", prop::ScopeReference_RelativeScope, kAAFTypeID_UInt32, false, false},
    {"RelativeSlot", prop::ScopeReference_RelativeSlot, kAAFTypeID_UInt32, false, false},
};
constexpr BuiltInProperty kSelectorProperties[] = {
    {"Selected", prop::Selector_Selected, kAAFTypeID_SegmentStrongReference, false, false},
    {"Alternates", prop::Selector_Alternates, kAAFTypeID_SegmentStrongReferenceVector, true, false},
};
constexpr BuiltInProperty kSequenceProperties[] = {
    {"Components", prop::Sequence_Components, kAAFTypeID_ComponentStrongReferenceVector, false, false},
};
constexpr BuiltInProperty kSourceReferenceProperties[] = {
    {"SourceID", prop::SourceReference_SourceID, kAAFTypeID_MobIDType, true, false},
    {"SourceMobSlotID", prop::SourceReference_SourceMobSlotID, kAAFTypeID_UInt32, false, false},
    {"ChannelIDs", prop::SourceReference_ChannelIDs, kAAFTypeID_UInt32Array, true, false},
    {"MonoSourceSlotIDs", prop::SourceReference_MonoSourceSlotIDs, kAAFTypeID_UInt32Array, true, false},
};
constexpr BuiltInProperty kSourceClipProperties[] = {
    {"StartTime", prop::SourceClip_StartTime, kAAFTypeID_PositionType, true, false},
    {"FadeInLength", prop::SourceClip_FadeInLength, kAAFTypeID_LengthType, true, false},
    {"FadeInType", prop::SourceClip_FadeInType, kAAFTypeID_FadeType, true, false},
    {"FadeOutLength", prop::SourceClip_FadeOutLength, kAAFTypeID_LengthType, true, false},
    {"FadeOutType", prop::SourceClip_FadeOutType, kAAFTypeID_FadeType, true, false},
};
constexpr BuiltInProperty kHTMLClipProperties[] = {
    {"BeginAnchor", prop::HTMLClip_BeginAnchor, kAAFTypeID_String, true, false},
    {"EndAnchor", prop::HTMLClip_EndAnchor, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kTimecodeProperties[] = {
    {"Start", prop::Timecode_Start, kAAFTypeID_PositionType, false, false},
    {"FPS", prop::Timecode_FPS, kAAFTypeID_UInt16, false, false},
    {"Drop", prop::Timecode_Drop, kAAFTypeID_Boolean, false, false},
};
constexpr BuiltInProperty kTimecodeStreamProperties[] = {
    {"SampleRate", prop::TimecodeStream_SampleRate, kAAFTypeID_Rational, false, false},
    {"Source", prop::TimecodeStream_Source, kAAFTypeID_Stream, false, false},
    {"SourceType", prop::TimecodeStream_SourceType, kAAFTypeID_TCSource, false, false},
};
constexpr BuiltInProperty kTimecodeStream12MProperties[] = {
    {"IncludeSync", prop::TimecodeStream12M_IncludeSync, kAAFTypeID_Boolean, false, false},
};
constexpr BuiltInProperty kTransitionProperties[] = {
    {"OperationGroup", prop::Transition_OperationGroup, kAAFTypeID_OperationGroupStrongReference, false, false},
    {"CutPoint", prop::Transition_CutPoint, kAAFTypeID_PositionType, false, false},
};
constexpr BuiltInProperty kContentStorageProperties[] = {
    {"Mobs", prop::ContentStorage_Mobs, kAAFTypeID_MobStrongReferenceSet, false, false},
    {"EssenceData", prop::ContentStorage_EssenceData, kAAFTypeID_EssenceDataStrongReferenceSet, true, false},
};
constexpr BuiltInProperty kControlPointProperties[] = {
    {"Value", prop::ControlPoint_Value, kAAFTypeID_Indirect, false, false},
    {"Time", prop::ControlPoint_Time, kAAFTypeID_Rational, false, false},
    {"EditHint", prop::ControlPoint_EditHint, kAAFTypeID_EditHintType, true, false},
};
constexpr BuiltInProperty kDefinitionObjectProperties[] = {
    {"Identification", prop::DefinitionObject_Identification, kAAFTypeID_AUID, false, true},
    {"Name", prop::DefinitionObject_Name, kAAFTypeID_String, false, false},
    {"Description", prop::DefinitionObject_Description, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kOperationDefinitionProperties[] = {
    {"DataDefinition", prop::OperationDefinition_DataDefinition, kAAFTypeID_DataDefinitionWeakReference, false, false},
    {"IsTimeWarp", prop::OperationDefinition_IsTimeWarp, kAAFTypeID_Boolean, true, false},
    {"DegradeTo", prop::OperationDefinition_DegradeTo, kAAFTypeID_OperationDefinitionWeakReferenceVector, true, false},
    {"OperationCategory", prop::OperationDefinition_OperationCategory, kAAFTypeID_OperationCategoryType, true, false},
    {"NumberInputs", prop::OperationDefinition_NumberInputs, kAAFTypeID_Int32, false, false},
    {"Bypass", prop::OperationDefinition_Bypass, kAAFTypeID_UInt32, true, false},
    {"ParametersDefined", prop::OperationDefinition_ParametersDefined, kAAFTypeID_ParameterDefinitionWeakReferenceSet, true, false},
};
constexpr BuiltInProperty kParameterDefinitionProperties[] = {
    {"Type", prop::ParameterDefinition_Type, kAAFTypeID_TypeDefinitionWeakReference, false, false},
    {"DisplayUnits", prop::ParameterDefinition_DisplayUnits, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kPluginDefinitionProperties[] = {
    {"PluginCategory", prop::PluginDefinition_PluginCategory, kAAFTypeID_PluginCategoryType, false, false},
    {"VersionNumber", prop::PluginDefinition_VersionNumber, kAAFTypeID_VersionType, false, false},
    {"VersionString", prop::PluginDefinition_VersionString, kAAFTypeID_String, true, false},
    {"Manufacturer", prop::PluginDefinition_Manufacturer, kAAFTypeID_String, true, false},
    {"ManufacturerInfo", prop::PluginDefinition_ManufacturerInfo, kAAFTypeID_NetworkLocatorStrongReference, true, false},
    {"ManufacturerID", prop::PluginDefinition_ManufacturerID, kAAFTypeID_AUID, true, false},
    {"Platform", prop::PluginDefinition_Platform, kAAFTypeID_AUID, true, false},
    {"MinPlatformVersion", prop::PluginDefinition_MinPlatformVersion, kAAFTypeID_VersionType, true, false},
    {"MaxPlatformVersion", prop::PluginDefinition_MaxPlatformVersion, kAAFTypeID_VersionType, true, false},
    {"Engine", prop::PluginDefinition_Engine, kAAFTypeID_AUID, true, false},
    {"MinEngineVersion", prop::PluginDefinition_MinEngineVersion, kAAFTypeID_VersionType, true, false},
    {"MaxEngineVersion", prop::PluginDefinition_MaxEngineVersion, kAAFTypeID_VersionType, true, false},
    {"PluginAPI", prop::PluginDefinition_PluginAPI, kAAFTypeID_AUID, true, false},
    {"MinPluginAPI", prop::PluginDefinition_MinPluginAPI, kAAFTypeID_VersionType, true, false},
    {"MaxPluginAPI", prop::PluginDefinition_MaxPluginAPI, kAAFTypeID_VersionType, true, false},
    {"SoftwareOnly", prop::PluginDefinition_SoftwareOnly, kAAFTypeID_Boolean, true, false},
    {"Accelerator", prop::PluginDefinition_Accelerator, kAAFTypeID_Boolean, true, false},
    {"Locators", prop::PluginDefinition_Locators, kAAFTypeID_LocatorStrongReferenceVector, true, false},
    {"Authentication", prop::PluginDefinition_Authentication, kAAFTypeID_Boolean, true, false},
    {"DefinitionObject", prop::PluginDefinition_DefinitionObject, kAAFTypeID_AUID, true, false},
};
constexpr BuiltInProperty kCodecDefinitionProperties[] = {
    {"FileDescriptorClass", prop::CodecDefinition_FileDescriptorClass, kAAFTypeID_ClassDefinitionWeakReference, false, false},
    {"DataDefinitions", prop::CodecDefinition_DataDefinitions, kAAFTypeID_DataDefinitionWeakReferenceVector, false, false},
};
constexpr BuiltInProperty kContainerDefinitionProperties[] = {
    {"EssenceIsIdentified", prop::ContainerDefinition_EssenceIsIdentified, kAAFTypeID_Boolean, true, false},
};
constexpr BuiltInProperty kDictionaryProperties[] = {
    {"OperationDefinitions", prop::Dictionary_OperationDefinitions, kAAFTypeID_OperationDefinitionStrongReferenceSet, true, false},
    {"ParameterDefinitions", prop::Dictionary_ParameterDefinitions, kAAFTypeID_ParameterDefinitionStrongReferenceSet, true, false},
    {"DataDefinitions", prop::Dictionary_DataDefinitions, kAAFTypeID_DataDefinitionStrongReferenceSet, true, false},
    {"PluginDefinitions", prop::Dictionary_PluginDefinitions, kAAFTypeID_PluginDefinitionStrongReferenceSet, true, false},
    {"CodecDefinitions", prop::Dictionary_CodecDefinitions, kAAFTypeID_CodecDefinitionStrongReferenceSet, true, false},
    {"ContainerDefinitions", prop::Dictionary_ContainerDefinitions, kAAFTypeID_ContainerDefinitionStrongReferenceSet, true, false},
    {"InterpolationDefinitions", prop::Dictionary_InterpolationDefinitions, kAAFTypeID_InterpolationDefinitionStrongReferenceSet, true, false},
    {"KLVDataDefinitions", prop::Dictionary_KLVDataDefinitions, kAAFTypeID_KLVDataDefinitionStrongReferenceSet, true, false},
    {"TaggedValueDefinitions", prop::Dictionary_TaggedValueDefinitions, kAAFTypeID_TaggedValueDefinitionStrongReferenceSet, true, false},
};
constexpr BuiltInProperty kEssenceDataProperties[] = {
    {"MobID", prop::EssenceData_MobID, kAAFTypeID_MobIDType, false, true},
    {"Data", prop::EssenceData_Data, kAAFTypeID_Stream, false, false},
    {"SampleIndex", prop::EssenceData_SampleIndex, kAAFTypeID_Stream, true, false},
};
constexpr BuiltInProperty kEssenceDescriptorProperties[] = {
    {"Locator", prop::EssenceDescriptor_Locator, kAAFTypeID_LocatorStrongReferenceVector, true, false},
};
constexpr BuiltInProperty kFileDescriptorProperties[] = {
    {"SampleRate", prop::FileDescriptor_SampleRate, kAAFTypeID_Rational, false, false},
    {"Length", prop::FileDescriptor_Length, kAAFTypeID_LengthType, false, false},
    {"ContainerFormat", prop::FileDescriptor_ContainerFormat, kAAFTypeID_ContainerDefinitionWeakReference, true, false},
    {"CodecDefinition", prop::FileDescriptor_CodecDefinition, kAAFTypeID_CodecDefinitionWeakReference, true, false},
    {"LinkedSlotID", prop::FileDescriptor_LinkedSlotID, kAAFTypeID_UInt32, true, false},
};
constexpr BuiltInProperty kAIFCDescriptorProperties[] = {
    {"Summary", prop::AIFCDescriptor_Summary, kAAFTypeID_DataValue, false, false},
};
constexpr BuiltInProperty kDigitalImageDescriptorProperties[] = {
    {"Compression", prop::DigitalImageDescriptor_Compression, kAAFTypeID_AUID, true, false},
    {"StoredHeight", prop::DigitalImageDescriptor_StoredHeight, kAAFTypeID_UInt32, false, false},
    {"StoredWidth", prop::DigitalImageDescriptor_StoredWidth, kAAFTypeID_UInt32, false, false},
    {"SampledHeight", prop::DigitalImageDescriptor_SampledHeight, kAAFTypeID_UInt32, true, false},
    {"SampledWidth", prop::DigitalImageDescriptor_SampledWidth, kAAFTypeID_UInt32, true, false},
    {"SampledXOffset", prop::DigitalImageDescriptor_SampledXOffset, kAAFTypeID_Int32, true, false},
    {"SampledYOffset", prop::DigitalImageDescriptor_SampledYOffset, kAAFTypeID_Int32, true, false},
    {"DisplayHeight", prop::DigitalImageDescriptor_DisplayHeight, kAAFTypeID_UInt32, true, false},
    {"DisplayWidth", prop::DigitalImageDescriptor_DisplayWidth, kAAFTypeID_UInt32, true, false},
    {"DisplayXOffset", prop::DigitalImageDescriptor_DisplayXOffset, kAAFTypeID_Int32, true, false},
    {"DisplayYOffset", prop::DigitalImageDescriptor_DisplayYOffset, kAAFTypeID_Int32, true, false},
    {"FrameLayout", prop::DigitalImageDescriptor_FrameLayout, kAAFTypeID_LayoutType, false, false},
    {"VideoLineMap", prop::DigitalImageDescriptor_VideoLineMap, kAAFTypeID_Int32Array, false, false},
    {"ImageAspectRatio", prop::DigitalImageDescriptor_ImageAspectRatio, kAAFTypeID_Rational, false, false},
    {"AlphaTransparency", prop::DigitalImageDescriptor_AlphaTransparency, kAAFTypeID_AlphaTransparencyType, true, false},
    {"TransferCharacteristic", prop::DigitalImageDescriptor_TransferCharacteristic, kAAFTypeID_TransferCharacteristicType, true, false},
    {"ColorPrimaries", prop::DigitalImageDescriptor_ColorPrimaries, kAAFTypeID_ColorPrimariesType, true, false},
    {"CodingEquations", prop::DigitalImageDescriptor_CodingEquations, kAAFTypeID_CodingEquationsType, true, false},
    {"ImageAlignmentFactor", prop::DigitalImageDescriptor_ImageAlignmentFactor, kAAFTypeID_UInt32, true, false},
    {"FieldDominance", prop::DigitalImageDescriptor_FieldDominance, kAAFTypeID_FieldNumber, true, false},
    {"FieldStartOffset", prop::DigitalImageDescriptor_FieldStartOffset, kAAFTypeID_UInt32, true, false},
    {"FieldEndOffset", prop::DigitalImageDescriptor_FieldEndOffset, kAAFTypeID_UInt32, true, false},
    {"SignalStandard", prop::DigitalImageDescriptor_SignalStandard, kAAFTypeID_SignalStandardType, true, false},
    {"StoredF2Offset", prop::DigitalImageDescriptor_StoredF2Offset, kAAFTypeID_Int32, true, false},
    {"DisplayF2Offset", prop::DigitalImageDescriptor_DisplayF2Offset, kAAFTypeID_Int32, true, false},
    {"ActiveFormatDescriptor", prop::DigitalImageDescriptor_ActiveFormatDescriptor, kAAFTypeID_UInt8, true, false},
};
constexpr BuiltInProperty kCDCIDescriptorProperties[] = {
    {"ComponentWidth", prop::CDCIDescriptor_ComponentWidth, kAAFTypeID_UInt32, false, false},
    {"HorizontalSubsampling", prop::CDCIDescriptor_HorizontalSubsampling, kAAFTypeID_UInt32, false, false},
    {"ColorSiting", prop::CDCIDescriptor_ColorSiting, kAAFTypeID_ColorSitingType, true, false},
    {"BlackReferenceLevel", prop::CDCIDescriptor_BlackReferenceLevel, kAAFTypeID_UInt32, true, false},
    {"WhiteReferenceLevel", prop::CDCIDescriptor_WhiteReferenceLevel, kAAFTypeID_UInt32, true, false},
    {"ColorRange", prop::CDCIDescriptor_ColorRange, kAAFTypeID_UInt32, true, false},
    {"PaddingBits", prop::CDCIDescriptor_PaddingBits, kAAFTypeID_Int16, true, false},
    {"VerticalSubsampling", prop::CDCIDescriptor_VerticalSubsampling, kAAFTypeID_UInt32, true, false},
    {"AlphaSamplingWidth", prop::CDCIDescriptor_AlphaSamplingWidth, kAAFTypeID_UInt32, true, false},
    {"ReversedByteOrder", prop::CDCIDescriptor_ReversedByteOrder, kAAFTypeID_Boolean, true, false},
};
constexpr BuiltInProperty kRGBADescriptorProperties[] = {
    {"PixelLayout", prop::RGBADescriptor_PixelLayout, kAAFTypeID_RGBALayout, false, false},
    {"Palette", prop::RGBADescriptor_Palette, kAAFTypeID_DataValue, true, false},
    {"PaletteLayout", prop::RGBADescriptor_PaletteLayout, kAAFTypeID_RGBALayout, true, false},
    {"ScanningDirection", prop::RGBADescriptor_ScanningDirection, kAAFTypeID_ScanningDirectionType, true, false},
    {"ComponentMaxRef", prop::RGBADescriptor_ComponentMaxRef, kAAFTypeID_UInt32, true, false},
    {"ComponentMinRef", prop::RGBADescriptor_ComponentMinRef, kAAFTypeID_UInt32, true, false},
    {"AlphaMaxRef", prop::RGBADescriptor_AlphaMaxRef, kAAFTypeID_UInt32, true, false},
    {"AlphaMinRef", prop::RGBADescriptor_AlphaMinRef, kAAFTypeID_UInt32, true, false},
};
constexpr BuiltInProperty kTIFFDescriptorProperties[] = {
    {"IsUniform", prop::TIFFDescriptor_IsUniform, kAAFTypeID_Boolean, false, false},
    {"IsContiguous", prop::TIFFDescriptor_IsContiguous, kAAFTypeID_Boolean, false, false},
    {"LeadingLines", prop::TIFFDescriptor_LeadingLines, kAAFTypeID_Int32, true, false},
    {"TrailingLines", prop::TIFFDescriptor_TrailingLines, kAAFTypeID_Int32, true, false},
    {"JPEGTableID", prop::TIFFDescriptor_JPEGTableID, kAAFTypeID_JPEGTableIDType, true, false},
    {"Summary", prop::TIFFDescriptor_Summary, kAAFTypeID_DataValue, false, false},
};
constexpr BuiltInProperty kWAVEDescriptorProperties[] = {
    {"Summary", prop::WAVEDescriptor_Summary, kAAFTypeID_DataValue, false, false},
};
constexpr BuiltInProperty kFilmDescriptorProperties[] = {
    {"FilmFormat", prop::FilmDescriptor_FilmFormat, kAAFTypeID_FilmType, true, false},
    {"FrameRate", prop::FilmDescriptor_FrameRate, kAAFTypeID_UInt32, true, false},
    {"PerforationsPerFrame", prop::FilmDescriptor_PerforationsPerFrame, kAAFTypeID_UInt8, true, false},
    {"FilmAspectRatio", prop::FilmDescriptor_FilmAspectRatio, kAAFTypeID_Rational, true, false},
    {"Manufacturer", prop::FilmDescriptor_Manufacturer, kAAFTypeID_String, true, false},
    {"Model", prop::FilmDescriptor_Model, kAAFTypeID_String, true, false},
    {"FilmGaugeFormat", prop::FilmDescriptor_FilmGaugeFormat, kAAFTypeID_String, true, false},
    {"FilmBatchNumber", prop::FilmDescriptor_FilmBatchNumber, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kTapeDescriptorProperties[] = {
    {"FormFactor", prop::TapeDescriptor_FormFactor, kAAFTypeID_TapeCaseType, true, false},
    {"VideoSignal", prop::TapeDescriptor_VideoSignal, kAAFTypeID_VideoSignalType, true, false},
    {"TapeFormat", prop::TapeDescriptor_TapeFormat, kAAFTypeID_TapeFormatType, true, false},
    {"Length", prop::TapeDescriptor_Length, kAAFTypeID_UInt32, true, false},
    {"ManufacturerID", prop::TapeDescriptor_ManufacturerID, kAAFTypeID_String, true, false},
    {"Model", prop::TapeDescriptor_Model, kAAFTypeID_String, true, false},
    {"TapeBatchNumber", prop::TapeDescriptor_TapeBatchNumber, kAAFTypeID_String, true, false},
    {"TapeStock", prop::TapeDescriptor_TapeStock, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kHeaderProperties[] = {
    {"ByteOrder", prop::Header_ByteOrder, kAAFTypeID_Int16, false, false},
    {"LastModified", prop::Header_LastModified, kAAFTypeID_TimeStamp, false, false},
    {"Content", prop::Header_Content, kAAFTypeID_ContentStorageStrongReference, false, false},
    {"Dictionary", prop::Header_Dictionary, kAAFTypeID_DictionaryStrongReference, false, false},
    {"Version", prop::Header_Version, kAAFTypeID_VersionType, false, false},
    {"IdentificationList", prop::Header_IdentificationList, kAAFTypeID_IdentificationStrongReferenceVector, false, false},
    {"ObjectModelVersion", prop::Header_ObjectModelVersion, kAAFTypeID_UInt32, true, false},
    {"OperationalPattern", prop::Header_OperationalPattern, kAAFTypeID_AUID, true, false},
    {"EssenceContainers", prop::Header_EssenceContainers, kAAFTypeID_AUIDSet, true, false},
    {"DescriptiveSchemes", prop::Header_DescriptiveSchemes, kAAFTypeID_AUIDSet, true, false},
};
constexpr BuiltInProperty kIdentificationProperties[] = {
    {"CompanyName", prop::Identification_CompanyName, kAAFTypeID_String, false, false},
    {"ProductName", prop::Identification_ProductName, kAAFTypeID_String, false, false},
    {"ProductVersion", prop::Identification_ProductVersion, kAAFTypeID_ProductVersion, true, false},
    {"ProductVersionString", prop::Identification_ProductVersionString, kAAFTypeID_String, false, false},
    {"ProductID", prop::Identification_ProductID, kAAFTypeID_AUID, false, false},
    {"Date", prop::Identification_Date, kAAFTypeID_TimeStamp, false, false},
    {"ToolkitVersion", prop::Identification_ToolkitVersion, kAAFTypeID_ProductVersion, true, false},
    {"Platform", prop::Identification_Platform, kAAFTypeID_String, true, false},
    {"GenerationAUID", prop::Identification_GenerationAUID, kAAFTypeID_AUID, false, false},
};
constexpr BuiltInProperty kNetworkLocatorProperties[] = {
    {"URLString", prop::NetworkLocator_URLString, kAAFTypeID_String, false, false},
};
constexpr BuiltInProperty kTextLocatorProperties[] = {
    {"Name", prop::TextLocator_Name, kAAFTypeID_String, false, false},
};
constexpr BuiltInProperty kMobProperties[] = {
    {"MobID", prop::Mob_MobID, kAAFTypeID_MobIDType, false, true},
    {"Name", prop::Mob_Name, kAAFTypeID_String, true, false},
    {"Slots", prop::Mob_Slots, kAAFTypeID_MobSlotStrongReferenceVector, false, false},
    {"LastModified", prop::Mob_LastModified, kAAFTypeID_TimeStamp, false, false},
    {"CreationTime", prop::Mob_CreationTime, kAAFTypeID_TimeStamp, false, false},
    {"UserComments", prop::Mob_UserComments, kAAFTypeID_TaggedValueStrongReferenceVector, true, false},
    {"KLVData", prop::Mob_KLVData, kAAFTypeID_KLVDataStrongReferenceVector, true, false},
    {"Attributes", prop::Mob_Attributes, kAAFTypeID_TaggedValueStrongReferenceVector, true, false},
    {"UsageCode", prop::Mob_UsageCode, kAAFTypeID_UsageType, true, false},
};
constexpr BuiltInProperty kCompositionMobProperties[] = {
    {"DefaultFadeLength", prop::CompositionMob_DefaultFadeLength, kAAFTypeID_LengthType, true, false},
    {"DefFadeType", prop::CompositionMob_DefFadeType, kAAFTypeID_FadeType, true, false},
    {"DefFadeEditUnit", prop::CompositionMob_DefFadeEditUnit, kAAFTypeID_Rational, true, false},
    {"Rendering", prop::CompositionMob_Rendering, kAAFTypeID_MobIDType, true, false},
};
constexpr BuiltInProperty kSourceMobProperties[] = {
    {"EssenceDescription", prop::SourceMob_EssenceDescription, kAAFTypeID_EssenceDescriptorStrongReference, false, false},
};
constexpr BuiltInProperty kMobSlotProperties[] = {
    {"SlotID", prop::MobSlot_SlotID, kAAFTypeID_UInt32, false, false},
    {"SlotName", prop::MobSlot_SlotName, kAAFTypeID_String, true, false},
    {"Segment", prop::MobSlot_Segment, kAAFTypeID_SegmentStrongReference, false, false},
    {"PhysicalTrackNumber", prop::MobSlot_PhysicalTrackNumber, kAAFTypeID_UInt32, true, false},
};
constexpr BuiltInProperty kEventMobSlotProperties[] = {
    {"EditRate", prop::EventMobSlot_EditRate, kAAFTypeID_Rational, false, false},
    {"EventSlotOrigin", prop::EventMobSlot_EventSlotOrigin, kAAFTypeID_PositionType, true, false},
};
constexpr BuiltInProperty kTimelineMobSlotProperties[] = {
    {"EditRate", prop::TimelineMobSlot_EditRate, kAAFTypeID_Rational, false, false},
    {"Origin", prop::TimelineMobSlot_Origin, kAAFTypeID_PositionType, false, false},
    {"MarkIn", prop::TimelineMobSlot_MarkIn, kAAFTypeID_PositionType, true, false},
    {"MarkOut", prop::TimelineMobSlot_MarkOut, kAAFTypeID_PositionType, true, false},
    {"UserPos", prop::TimelineMobSlot_UserPos, kAAFTypeID_PositionType, true, false},
};
constexpr BuiltInProperty kParameterProperties[] = {
    {"Definition", prop::Parameter_Definition, kAAFTypeID_AUID, false, false},
};
constexpr BuiltInProperty kConstantValueProperties[] = {
    {"Value", prop::ConstantValue_Value, kAAFTypeID_Indirect, false, false},
};
constexpr BuiltInProperty kVaryingValueProperties[] = {
    {"Interpolation", prop::VaryingValue_Interpolation, kAAFTypeID_InterpolationDefinitionWeakReference, false, false},
    {"PointList", prop::VaryingValue_PointList, kAAFTypeID_ControlPointStrongReferenceVector, false, false},
};
constexpr BuiltInProperty kTaggedValueProperties[] = {
    {"Name", prop::TaggedValue_Name, kAAFTypeID_String, false, false},
    {"Value", prop::TaggedValue_Value, kAAFTypeID_Indirect, false, false},
};
constexpr BuiltInProperty kKLVDataProperties[] = {
    {"Value", prop::KLVData_Value, kAAFTypeID_Opaque, false, false},
};
constexpr BuiltInProperty kDescriptiveMarkerProperties[] = {
    {"DescribedSlots", prop::DescriptiveMarker_DescribedSlots, kAAFTypeID_UInt32Set, true, false},
    {"Description", prop::DescriptiveMarker_Description, kAAFTypeID_DescriptiveFrameworkStrongReference, true, false},
};
constexpr BuiltInProperty kSoundDescriptorProperties[] = {
    {"AudioSamplingRate", prop::SoundDescriptor_AudioSamplingRate, kAAFTypeID_Rational, false, false},
    {"Locked", prop::SoundDescriptor_Locked, kAAFTypeID_Boolean, true, false},
    {"AudioRefLevel", prop::SoundDescriptor_AudioRefLevel, kAAFTypeID_Int8, true, false},
    {"ElectroSpatial", prop::SoundDescriptor_ElectroSpatial, kAAFTypeID_ElectroSpatialFormulation, true, false},
    {"Channels", prop::SoundDescriptor_Channels, kAAFTypeID_UInt32, false, false},
    {"QuantizationBits", prop::SoundDescriptor_QuantizationBits, kAAFTypeID_UInt32, false, false},
    {"DialNorm", prop::SoundDescriptor_DialNorm, kAAFTypeID_Int8, true, false},
    {"Compression", prop::SoundDescriptor_Compression, kAAFTypeID_AUID, true, false},
};
constexpr BuiltInProperty kDataEssenceDescriptorProperties[] = {
    {"DataEssenceCoding", prop::DataEssenceDescriptor_DataEssenceCoding, kAAFTypeID_AUID, true, false},
};
constexpr BuiltInProperty kMultipleDescriptorProperties[] = {
    {"FileDescriptors", prop::MultipleDescriptor_FileDescriptors, kAAFTypeID_FileDescriptorStrongReferenceVector, false, false},
};
constexpr BuiltInProperty kDescriptiveClipProperties[] = {
    {"DescribedSlotIDs", prop::DescriptiveClip_DescribedSlotIDs, kAAFTypeID_UInt32Set, true, false},
};
constexpr BuiltInProperty kAES3PCMDescriptorProperties[] = {
    {"Emphasis", prop::AES3PCMDescriptor_Emphasis, kAAFTypeID_EmphasisType, true, false},
    {"BlockStartOffset", prop::AES3PCMDescriptor_BlockStartOffset, kAAFTypeID_UInt16, true, false},
    {"AuxBitsMode", prop::AES3PCMDescriptor_AuxBitsMode, kAAFTypeID_AuxBitsModeType, true, false},
    {"ChannelStatusMode", prop::AES3PCMDescriptor_ChannelStatusMode, kAAFTypeID_ChannelStatusModeArray, true, false},
    {"FixedChannelStatusData", prop::AES3PCMDescriptor_FixedChannelStatusData, kAAFTypeID_UInt8Array, true, false},
    {"UserDataMode", prop::AES3PCMDescriptor_UserDataMode, kAAFTypeID_UserDataModeArray, true, false},
    {"FixedUserData", prop::AES3PCMDescriptor_FixedUserData, kAAFTypeID_UInt8Array, true, false},
};
constexpr BuiltInProperty kPCMDescriptorProperties[] = {
    {"BlockAlign", prop::PCMDescriptor_BlockAlign, kAAFTypeID_UInt16, false, false},
    {"SequenceOffset", prop::PCMDescriptor_SequenceOffset, kAAFTypeID_UInt8, true, false},
    {"AverageBPS", prop::PCMDescriptor_AverageBPS, kAAFTypeID_UInt32, false, false},
    {"ChannelAssignment", prop::PCMDescriptor_ChannelAssignment, kAAFTypeID_AUID, true, false},
    {"PeakEnvelopeVersion", prop::PCMDescriptor_PeakEnvelopeVersion, kAAFTypeID_UInt32, true, false},
    {"PeakEnvelopeFormat", prop::PCMDescriptor_PeakEnvelopeFormat, kAAFTypeID_UInt32, true, false},
    {"PointsPerPeakValue", prop::PCMDescriptor_PointsPerPeakValue, kAAFTypeID_UInt32, true, false},
    {"PeakEnvelopeBlockSize", prop::PCMDescriptor_PeakEnvelopeBlockSize, kAAFTypeID_UInt32, true, false},
    {"PeakChannels", prop::PCMDescriptor_PeakChannels, kAAFTypeID_UInt32, true, false},
    {"PeakFrames", prop::PCMDescriptor_PeakFrames, kAAFTypeID_UInt32, true, false},
    {"PeakOfPeaksPosition", prop::PCMDescriptor_PeakOfPeaksPosition, kAAFTypeID_PositionType, true, false},
    {"PeakEnvelopeTimestamp", prop::PCMDescriptor_PeakEnvelopeTimestamp, kAAFTypeID_TimeStamp, true, false},
    {"PeakEnvelopeData", prop::PCMDescriptor_PeakEnvelopeData, kAAFTypeID_Stream, true, false},
};
constexpr BuiltInProperty kKLVDataDefinitionProperties[] = {
    {"KLVDataType", prop::KLVDataDefinition_KLVDataType, kAAFTypeID_TypeDefinitionWeakReference, true, false},
};
constexpr BuiltInProperty kAuxiliaryDescriptorProperties[] = {
    {"MimeType", prop::AuxiliaryDescriptor_MimeType, kAAFTypeID_String, false, false},
    {"CharSet", prop::AuxiliaryDescriptor_CharSet, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kRIFFChunkProperties[] = {
    {"ChunkID", prop::RIFFChunk_ChunkID, kAAFTypeID_UInt32, false, false},
    {"ChunkLength", prop::RIFFChunk_ChunkLength, kAAFTypeID_UInt32, false, false},
    {"ChunkData", prop::RIFFChunk_ChunkData, kAAFTypeID_Stream, false, false},
};
constexpr BuiltInProperty kBWFImportDescriptorProperties[] = {
    {"QltyFileSecurityReport", prop::BWFImportDescriptor_QltyFileSecurityReport, kAAFTypeID_UInt32, true, false},
    {"QltyFileSecurityWave", prop::BWFImportDescriptor_QltyFileSecurityWave, kAAFTypeID_UInt32, true, false},
    {"BextCodingHistory", prop::BWFImportDescriptor_BextCodingHistory, kAAFTypeID_String, true, false},
    {"QltyBasicData", prop::BWFImportDescriptor_QltyBasicData, kAAFTypeID_String, true, false},
    {"QltyStartOfModulation", prop::BWFImportDescriptor_QltyStartOfModulation, kAAFTypeID_String, true, false},
    {"QltyQualityEvent", prop::BWFImportDescriptor_QltyQualityEvent, kAAFTypeID_String, true, false},
    {"QltyEndOfModulation", prop::BWFImportDescriptor_QltyEndOfModulation, kAAFTypeID_String, true, false},
    {"QltyQualityParameter", prop::BWFImportDescriptor_QltyQualityParameter, kAAFTypeID_String, true, false},
    {"QltyOperatorComment", prop::BWFImportDescriptor_QltyOperatorComment, kAAFTypeID_String, true, false},
    {"QltyCueSheet", prop::BWFImportDescriptor_QltyCueSheet, kAAFTypeID_String, true, false},
    {"UnknownBWFChunks", prop::BWFImportDescriptor_UnknownBWFChunks, kAAFTypeID_RIFFChunkStrongReferenceVector, true, false},
};
constexpr BuiltInProperty kMPEGVideoDescriptorProperties[] = {
    {"SingleSequence", prop::MPEGVideoDescriptor_SingleSequence, kAAFTypeID_Boolean, true, false},
    {"ConstantBPictureCount", prop::MPEGVideoDescriptor_ConstantBPictureCount, kAAFTypeID_Boolean, true, false},
    {"CodedContentScanning", prop::MPEGVideoDescriptor_CodedContentScanning, kAAFTypeID_ContentScanningType, true, false},
    {"LowDelay", prop::MPEGVideoDescriptor_LowDelay, kAAFTypeID_Boolean, true, false},
    {"ClosedGOP", prop::MPEGVideoDescriptor_ClosedGOP, kAAFTypeID_Boolean, true, false},
    {"IdenticalGOP", prop::MPEGVideoDescriptor_IdenticalGOP, kAAFTypeID_Boolean, true, false},
    {"MaxGOP", prop::MPEGVideoDescriptor_MaxGOP, kAAFTypeID_UInt16, true, false},
    {"MaxBPictureCount", prop::MPEGVideoDescriptor_MaxBPictureCount, kAAFTypeID_UInt16, true, false},
    {"BitRate", prop::MPEGVideoDescriptor_BitRate, kAAFTypeID_UInt32, true, false},
    {"ProfileAndLevel", prop::MPEGVideoDescriptor_ProfileAndLevel, kAAFTypeID_UInt8, true, false},
};
constexpr BuiltInProperty kClassDefinitionProperties[] = {
    {"ParentClass", prop::ClassDefinition_ParentClass, kAAFTypeID_ClassDefinitionWeakReference, false, false},
    {"Properties", prop::ClassDefinition_Properties, kAAFTypeID_PropertyDefinitionStrongReferenceSet, true, false},
    {"IsConcrete", prop::ClassDefinition_IsConcrete, kAAFTypeID_Boolean, false, false},
};
constexpr BuiltInProperty kPropertyDefinitionProperties[] = {
    {"Type", prop::PropertyDefinition_Type, kAAFTypeID_AUID, false, false},
    {"IsOptional", prop::PropertyDefinition_IsOptional, kAAFTypeID_Boolean, false, false},
    {"LocalIdentification", prop::PropertyDefinition_LocalIdentification, kAAFTypeID_UInt16, false, false},
    {"IsUniqueIdentifier", prop::PropertyDefinition_IsUniqueIdentifier, kAAFTypeID_Boolean, true, false},
};
constexpr BuiltInProperty kTypeDefinitionIntegerProperties[] = {
    {"Size", prop::TypeDefinitionInteger_Size, kAAFTypeID_UInt8, false, false},
    {"IsSigned", prop::TypeDefinitionInteger_IsSigned, kAAFTypeID_Boolean, false, false},
};
constexpr BuiltInProperty kTypeDefinitionStrongObjectReferenceProperties[] = {
    {"ReferencedType", prop::TypeDefinitionStrongObjectReference_ReferencedType, kAAFTypeID_ClassDefinitionWeakReference, false, false},
};
constexpr BuiltInProperty kTypeDefinitionWeakObjectReferenceProperties[] = {
    {"ReferencedType", prop::TypeDefinitionWeakObjectReference_ReferencedType, kAAFTypeID_ClassDefinitionWeakReference, false, false},
    {"TargetSet", prop::TypeDefinitionWeakObjectReference_TargetSet, kAAFTypeID_AUIDArray, false, false},
};
constexpr BuiltInProperty kTypeDefinitionEnumerationProperties[] = {
    {"ElementType", prop::TypeDefinitionEnumeration_ElementType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
    {"ElementNames", prop::TypeDefinitionEnumeration_ElementNames, kAAFTypeID_String, false, false},
    {"ElementValues", prop::TypeDefinitionEnumeration_ElementValues, kAAFTypeID_Int64Array, false, false},
};
constexpr BuiltInProperty kTypeDefinitionFixedArrayProperties[] = {
    {"ElementType", prop::TypeDefinitionFixedArray_ElementType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
    {"ElementCount", prop::TypeDefinitionFixedArray_ElementCount, kAAFTypeID_UInt32, false, false},
};
constexpr BuiltInProperty kTypeDefinitionVariableArrayProperties[] = {
    {"ElementType", prop::TypeDefinitionVariableArray_ElementType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
};
constexpr BuiltInProperty kTypeDefinitionSetProperties[] = {
    {"ElementType", prop::TypeDefinitionSet_ElementType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
};
constexpr BuiltInProperty kTypeDefinitionStringProperties[] = {
    {"ElementType", prop::TypeDefinitionString_ElementType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
};
constexpr BuiltInProperty kTypeDefinitionRecordProperties[] = {
    {"MemberTypes", prop::TypeDefinitionRecord_MemberTypes, kAAFTypeID_TypeDefinitionWeakReferenceVector, false, false},
    {"MemberNames", prop::TypeDefinitionRecord_MemberNames, kAAFTypeID_String, false, false},
};
constexpr BuiltInProperty kTypeDefinitionRenameProperties[] = {
    {"RenamedType", prop::TypeDefinitionRename_RenamedType, kAAFTypeID_TypeDefinitionWeakReference, false, false},
};
constexpr BuiltInProperty kTypeDefinitionExtendibleEnumerationProperties[] = {
    {"ElementNames", prop::TypeDefinitionExtendibleEnumeration_ElementNames, kAAFTypeID_String, false, false},
    {"ElementValues", prop::TypeDefinitionExtendibleEnumeration_ElementValues, kAAFTypeID_AUIDArray, false, false},
};
constexpr BuiltInProperty kMetaDefinitionProperties[] = {
    {"Identification", prop::MetaDefinition_Identification, kAAFTypeID_AUID, false, true},
    {"Name", prop::MetaDefinition_Name, kAAFTypeID_String, false, false},
    {"Description", prop::MetaDefinition_Description, kAAFTypeID_String, true, false},
};
constexpr BuiltInProperty kMetaDictionaryProperties[] = {
    {"ClassDefinitions", prop::MetaDictionary_ClassDefinitions, kAAFTypeID_ClassDefinitionStrongReferenceSet, true, false},
    {"TypeDefinitions", prop::MetaDictionary_TypeDefinitions, kAAFTypeID_TypeDefinitionStrongReferenceSet, true, false},
};

constexpr BuiltInClass kClasses[] = {
    {"InterchangeObject", AUID_AAFObject, AUID_AAFObject, false, true, kInterchangeObjectProperties},
    {"Component", AUID_AAFComponent, AUID_AAFObject, false, false, kComponentProperties},
    {"Segment", AUID_AAFSegment, AUID_AAFComponent, false, false, {}},
    {"EdgeCode", AUID_AAFEdgecode, AUID_AAFSegment, true, false, kEdgeCodeProperties},
    {"EssenceGroup", AUID_AAFEssenceGroup, AUID_AAFSegment, true, false, kEssenceGroupProperties},
    {"Event", AUID_AAFEvent, AUID_AAFSegment, false, false, kEventProperties},
    {"GPITrigger", AUID_AAFGPITrigger, AUID_AAFEvent, true, false, kGPITriggerProperties},
    {"CommentMarker", AUID_AAFCommentMarker, AUID_AAFEvent, true, false, kCommentMarkerProperties},
    {"Filler", AUID_AAFFiller, AUID_AAFSegment, true, false, {}},
    {"OperationGroup", AUID_AAFOperationGroup, AUID_AAFSegment, true, false, kOperationGroupProperties},
    {"NestedScope", AUID_AAFNestedScope, AUID_AAFSegment, true, false, kNestedScopeProperties},
    {"Pulldown", AUID_AAFPulldown, AUID_AAFSegment, true, false, kPulldownProperties},
    {"ScopeReference", AUID_AAFScopeReference, AUID_AAFSegment, true, false, kScopeReferenceProperties},
    {"Selector", AUID_AAFSelector, AUID_AAFSegment, true, false, kSelectorProperties},
    {"Sequence", AUID_AAFSequence, AUID_AAFSegment, true, false, kSequenceProperties},
    {"SourceReference", AUID_AAFSourceReference, AUID_AAFSegment, false, false, kSourceReferenceProperties},
    {"SourceClip", AUID_AAFSourceClip, AUID_AAFSourceReference, true, false, kSourceClipProperties},
    {"TextClip", AUID_AAFTextClip, AUID_AAFSourceReference, false, false, {}},
    {"HTMLClip", AUID_AAFHTMLClip, AUID_AAFTextClip, true, false, kHTMLClipProperties},
    {"Timecode", AUID_AAFTimecode, AUID_AAFSegment, true, false, kTimecodeProperties},
    {"TimecodeStream", AUID_AAFTimecodeStream, AUID_AAFSegment, false, false, kTimecodeStreamProperties},
    {"TimecodeStream12M", AUID_AAFTimecodeStream12M, AUID_AAFTimecodeStream, true, false, kTimecodeStream12MProperties},
    {"Transition", AUID_AAFTransition, AUID_AAFComponent, true, false, kTransitionProperties},
    {"ContentStorage", AUID_AAFContentStorage, AUID_AAFObject, true, true, kContentStorageProperties},
    {"ControlPoint", AUID_AAFControlPoint, AUID_AAFObject, true, false, kControlPointProperties},
    {"DefinitionObject", AUID_AAFDefObject, AUID_AAFObject, false, true, kDefinitionObjectProperties},
    {"DataDefinition", AUID_AAFDataDef, AUID_AAFDefObject, true, true, {}},
    {"OperationDefinition", AUID_AAFOperationDef, AUID_AAFDefObject, true, true, kOperationDefinitionProperties},
    {"ParameterDefinition", AUID_AAFParameterDef, AUID_AAFDefObject, true, true, kParameterDefinitionProperties},
    {"PluginDefinition", AUID_AAFPluginDef, AUID_AAFDefObject, true, true, kPluginDefinitionProperties},
    {"CodecDefinition", AUID_AAFCodecDef, AUID_AAFDefObject, true, true, kCodecDefinitionProperties},
    {"ContainerDefinition", AUID_AAFContainerDef, AUID_AAFDefObject, true, true, kContainerDefinitionProperties},
    {"InterpolationDefinition", AUID_AAFInterpolationDef, AUID_AAFDefObject, true, true, {}},
    {"Dictionary", AUID_AAFDictionary, AUID_AAFObject, true, true, kDictionaryProperties},
    {"EssenceData", AUID_AAFEssenceData, AUID_AAFObject, true, true, kEssenceDataProperties},
    {"EssenceDescriptor", AUID_AAFEssenceDescriptor, AUID_AAFObject, false, false, kEssenceDescriptorProperties},
    {"FileDescriptor", AUID_AAFFileDescriptor, AUID_AAFEssenceDescriptor, false, false, kFileDescriptorProperties},
    {"AIFCDescriptor", AUID_AAFAIFCDescriptor, AUID_AAFFileDescriptor, true, false, kAIFCDescriptorProperties},
    {"DigitalImageDescriptor", AUID_AAFDigitalImageDescriptor, AUID_AAFFileDescriptor, false, false, kDigitalImageDescriptorProperties},
    {"CDCIDescriptor", AUID_AAFCDCIDescriptor, AUID_AAFDigitalImageDescriptor, true, false, kCDCIDescriptorProperties},
    {"RGBADescriptor", AUID_AAFRGBADescriptor, AUID_AAFDigitalImageDescriptor, true, false, kRGBADescriptorProperties},
    {"HTMLDescriptor", AUID_AAFHTMLDescriptor, AUID_AAFFileDescriptor, true, false, {}},
    {"TIFFDescriptor", AUID_AAFTIFFDescriptor, AUID_AAFFileDescriptor, true, false, kTIFFDescriptorProperties},
    {"WAVEDescriptor", AUID_AAFWAVEDescriptor, AUID_AAFFileDescriptor, true, false, kWAVEDescriptorProperties},
    {"FilmDescriptor", AUID_AAFFilmDescriptor, AUID_AAFEssenceDescriptor, true, false, kFilmDescriptorProperties},
    {"TapeDescriptor", AUID_AAFTapeDescriptor, AUID_AAFEssenceDescriptor, true, false, kTapeDescriptorProperties},
    {"Header", AUID_AAFHeader, AUID_AAFObject, true, true, kHeaderProperties},
    {"Identification", AUID_AAFIdentification, AUID_AAFObject, true, true, kIdentificationProperties},
    {"Locator", AUID_AAFLocator, AUID_AAFObject, false, false, {}},
    {"NetworkLocator", AUID_AAFNetworkLocator, AUID_AAFLocator, true, false, kNetworkLocatorProperties},
    {"TextLocator", AUID_AAFTextLocator, AUID_AAFLocator, true, false, kTextLocatorProperties},
    {"Mob", AUID_AAFMob, AUID_AAFObject, false, true, kMobProperties},
    {"CompositionMob", AUID_AAFCompositionMob, AUID_AAFMob, true, false, kCompositionMobProperties},
    {"MasterMob", AUID_AAFMasterMob, AUID_AAFMob, true, false, {}},
    {"SourceMob", AUID_AAFSourceMob, AUID_AAFMob, true, false, kSourceMobProperties},
    {"MobSlot", AUID_AAFMobSlot, AUID_AAFObject, false, false, kMobSlotProperties},
    {"EventMobSlot", AUID_AAFEventMobSlot, AUID_AAFMobSlot, true, false, kEventMobSlotProperties},
    {"StaticMobSlot", AUID_AAFStaticMobSlot, AUID_AAFMobSlot, true, false, {}},
    {"TimelineMobSlot", AUID_AAFTimelineMobSlot, AUID_AAFMobSlot, true, false, kTimelineMobSlotProperties},
    {"Parameter", AUID_AAFParameter, AUID_AAFObject, false, false, kParameterProperties},
    {"ConstantValue", AUID_AAFConstantValue, AUID_AAFParameter, true, false, kConstantValueProperties},
    {"VaryingValue", AUID_AAFVaryingValue, AUID_AAFParameter, true, false, kVaryingValueProperties},
    {"TaggedValue", AUID_AAFTaggedValue, AUID_AAFObject, true, false, kTaggedValueProperties},
    {"KLVData", AUID_AAFKLVData, AUID_AAFObject, true, false, kKLVDataProperties},
    {"DescriptiveMarker", AUID_AAFDescriptiveMarker, AUID_AAFCommentMarker, true, false, kDescriptiveMarkerProperties},
    {"SoundDescriptor", AUID_AAFSoundDescriptor, AUID_AAFFileDescriptor, true, false, kSoundDescriptorProperties},
    {"DataEssenceDescriptor", AUID_AAFDataEssenceDescriptor, AUID_AAFFileDescriptor, true, false, kDataEssenceDescriptorProperties},
    {"MultipleDescriptor", AUID_AAFMultipleDescriptor, AUID_AAFFileDescriptor, true, false, kMultipleDescriptorProperties},
    {"DescriptiveClip", AUID_AAFDescriptiveClip, AUID_AAFSourceClip, true, false, kDescriptiveClipProperties},
    {"AES3PCMDescriptor", AUID_AAFAES3PCMDescriptor, AUID_AAFPCMDescriptor, true, false, kAES3PCMDescriptorProperties},
    {"PCMDescriptor", AUID_AAFPCMDescriptor, AUID_AAFSoundDescriptor, true, false, kPCMDescriptorProperties},
    {"PhysicalDescriptor", AUID_AAFPhysicalDescriptor, AUID_AAFEssenceDescriptor, false, false, {}},
    {"ImportDescriptor", AUID_AAFImportDescriptor, AUID_AAFPhysicalDescriptor, true, false, {}},
    {"RecordingDescriptor", AUID_AAFRecordingDescriptor, AUID_AAFPhysicalDescriptor, true, false, {}},
    {"TaggedValueDefinition", AUID_AAFTaggedValueDefinition, AUID_AAFDefObject, true, true, {}},
    {"KLVDataDefinition", AUID_AAFKLVDataDefinition, AUID_AAFDefObject, true, true, kKLVDataDefinitionProperties},
    {"AuxiliaryDescriptor", AUID_AAFAuxiliaryDescriptor, AUID_AAFPhysicalDescriptor, true, false, kAuxiliaryDescriptorProperties},
    {"RIFFChunk", AUID_AAFRIFFChunk, AUID_AAFObject, true, false, kRIFFChunkProperties},
    {"BWFImportDescriptor", AUID_AAFBWFImportDescriptor, AUID_AAFImportDescriptor, true, false, kBWFImportDescriptorProperties},
    {"MPEGVideoDescriptor", AUID_AAFMPEGVideoDescriptor, AUID_AAFCDCIDescriptor, true, false, kMPEGVideoDescriptorProperties},
    {"ClassDefinition", AUID_AAFClassDef, AUID_AAFMetaDefinition, true, true, kClassDefinitionProperties},
    {"PropertyDefinition", AUID_AAFPropertyDef, AUID_AAFMetaDefinition, true, true, kPropertyDefinitionProperties},
    {"TypeDefinition", AUID_AAFTypeDef, AUID_AAFMetaDefinition, false, true, {}},
    {"TypeDefinitionInteger", AUID_AAFTypeDefInt, AUID_AAFTypeDef, true, true, kTypeDefinitionIntegerProperties},
    {"TypeDefinitionStrongObjectReference", AUID_AAFTypeDefStrongObjRef, AUID_AAFTypeDef, true, true, kTypeDefinitionStrongObjectReferenceProperties},
    {"TypeDefinitionWeakObjectReference", AUID_AAFTypeDefWeakObjRef, AUID_AAFTypeDef, true, true, kTypeDefinitionWeakObjectReferenceProperties},
    {"TypeDefinitionEnumeration", AUID_AAFTypeDefEnum, AUID_AAFTypeDef, true, true, kTypeDefinitionEnumerationProperties},
    {"TypeDefinitionFixedArray", AUID_AAFTypeDefFixedArray, AUID_AAFTypeDef, true, true, kTypeDefinitionFixedArrayProperties},
    {"TypeDefinitionVariableArray", AUID_AAFTypeDefVariableArray, AUID_AAFTypeDef, true, true, kTypeDefinitionVariableArrayProperties},
    {"TypeDefinitionSet", AUID_AAFTypeDefSet, AUID_AAFTypeDef, true, true, kTypeDefinitionSetProperties},
    {"TypeDefinitionString", AUID_AAFTypeDefString, AUID_AAFTypeDef, true, true, kTypeDefinitionStringProperties},
    {"TypeDefinitionStream", AUID_AAFTypeDefStream, AUID_AAFTypeDef, true, true, {}},
    {"TypeDefinitionRecord", AUID_AAFTypeDefRecord, AUID_AAFTypeDef, true, true, kTypeDefinitionRecordProperties},
    {"TypeDefinitionRename", AUID_AAFTypeDefRename, AUID_AAFTypeDef, true, true, kTypeDefinitionRenameProperties},
    {"TypeDefinitionExtendibleEnumeration", AUID_AAFTypeDefExtEnum, AUID_AAFTypeDef, true, true, kTypeDefinitionExtendibleEnumerationProperties},
    {"TypeDefinitionIndirect", AUID_AAFTypeDefIndirect, AUID_AAFTypeDef, true, true, {}},
    {"TypeDefinitionOpaque", AUID_AAFTypeDefOpaque, AUID_AAFTypeDefIndirect, true, true, {}},
    {"TypeDefinitionCharacter", AUID_AAFTypeDefCharacter, AUID_AAFTypeDef, true, true, {}},
    {"MetaDefinition", AUID_AAFMetaDefinition, AUID_AAFMetaDefinition, false, true, kMetaDefinitionProperties},
    {"MetaDictionary", AUID_AAFMetaDictionary, AUID_AAFMetaDictionary, true, true, kMetaDictionaryProperties},
    {"DescriptiveObject", AUID_AAFDescriptiveObject, AUID_AAFObject, false, false, {}},
    {"DescriptiveFramework", AUID_AAFDescriptiveFramework, AUID_AAFObject, false, false, {}},
};
// clang-format on

}  // namespace

Span<BuiltInClass> BuiltInClasses() {
    return kClasses;
}

}  // namespace aaf
