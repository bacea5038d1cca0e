// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/aaf/model/PropertyKey.h"

// Keys of the built-in properties, named by class and property.
namespace aaf::prop {

inline constexpr PropertyKey InterchangeObject_ObjClass{
    0x0101, ncfGuid("06010104-0101-0000-060E-2B3401010102")};
inline constexpr PropertyKey InterchangeObject_Generation{
    0x0102, ncfGuid("05200701-0800-0000-060E-2B3401010102")};
inline constexpr PropertyKey Component_DataDefinition{
    0x0201, ncfGuid("04070100-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey Component_Length{0x0202,
                                              ncfGuid("07020201-0103-0000-060E-2B3401010102")};
inline constexpr PropertyKey Component_KLVData{0x0203,
                                               ncfGuid("03010210-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey Component_UserComments{
    0x0204, ncfGuid("03020102-1600-0000-060E-2B3401010107")};
inline constexpr PropertyKey Component_Attributes{0x0205,
                                                  ncfGuid("03010210-0800-0000-060E-2B3401010107")};
inline constexpr PropertyKey EdgeCode_Start{0x0401,
                                            ncfGuid("01040901-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey EdgeCode_FilmKind{0x0402,
                                               ncfGuid("04100103-0109-0000-060E-2B3401010102")};
inline constexpr PropertyKey EdgeCode_CodeFormat{0x0403,
                                                 ncfGuid("04100103-0102-0000-060E-2B3401010101")};
inline constexpr PropertyKey EdgeCode_Header{0x0404,
                                             ncfGuid("01030201-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey EssenceGroup_Choices{0x0501,
                                                  ncfGuid("06010104-0601-0000-060E-2B3401010102")};
inline constexpr PropertyKey EssenceGroup_StillFrame{
    0x0502, ncfGuid("06010104-0208-0000-060E-2B3401010102")};
inline constexpr PropertyKey Event_Position{0x0601,
                                            ncfGuid("07020103-0303-0000-060E-2B3401010102")};
inline constexpr PropertyKey Event_Comment{0x0602, ncfGuid("05300404-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey GPITrigger_ActiveState{
    0x0801, ncfGuid("05300401-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey CommentMarker_Annotation{
    0x0901, ncfGuid("06010104-020A-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationGroup_Operation{
    0x0B01, ncfGuid("05300506-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationGroup_InputSegments{
    0x0B02, ncfGuid("06010104-0602-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationGroup_Parameters{
    0x0B03, ncfGuid("06010104-060A-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationGroup_BypassOverride{
    0x0B04, ncfGuid("0530050C-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationGroup_Rendering{
    0x0B05, ncfGuid("06010104-0206-0000-060E-2B3401010102")};
inline constexpr PropertyKey NestedScope_Slots{0x0C01,
                                               ncfGuid("06010104-0607-0000-060E-2B3401010102")};
inline constexpr PropertyKey Pulldown_InputSegment{0x0D01,
                                                   ncfGuid("06010104-0207-0000-060E-2B3401010102")};
inline constexpr PropertyKey Pulldown_PulldownKind{0x0D02,
                                                   ncfGuid("05401001-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey Pulldown_PulldownDirection{
    0x0D03, ncfGuid("05401001-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey Pulldown_PhaseFrame{0x0D04,
                                                 ncfGuid("05401001-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey ScopeReference_RelativeScope{
    0x0E01, ncfGuid("06010103-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey ScopeReference_RelativeSlot{
    0x0E02, ncfGuid("06010103-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey Selector_Selected{0x0F01,
                                               ncfGuid("06010104-0209-0000-060E-2B3401010102")};
inline constexpr PropertyKey Selector_Alternates{0x0F02,
                                                 ncfGuid("06010104-0608-0000-060E-2B3401010102")};
inline constexpr PropertyKey Sequence_Components{0x1001,
                                                 ncfGuid("06010104-0609-0000-060E-2B3401010102")};
inline constexpr PropertyKey SourceReference_SourceID{
    0x1101, ncfGuid("06010103-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey SourceReference_SourceMobSlotID{
    0x1102, ncfGuid("06010103-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey SourceReference_ChannelIDs{
    0x1103, ncfGuid("06010103-0700-0000-060E-2B3401010107")};
inline constexpr PropertyKey SourceReference_MonoSourceSlotIDs{
    0x1104, ncfGuid("06010103-0800-0000-060E-2B3401010108")};
inline constexpr PropertyKey SourceClip_StartTime{0x1201,
                                                  ncfGuid("07020103-0104-0000-060E-2B3401010102")};
inline constexpr PropertyKey SourceClip_FadeInLength{
    0x1202, ncfGuid("07020201-0105-0200-060E-2B3401010102")};
inline constexpr PropertyKey SourceClip_FadeInType{0x1203,
                                                   ncfGuid("05300501-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey SourceClip_FadeOutLength{
    0x1204, ncfGuid("07020201-0105-0300-060E-2B3401010102")};
inline constexpr PropertyKey SourceClip_FadeOutType{
    0x1205, ncfGuid("05300502-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey HTMLClip_BeginAnchor{0x1401,
                                                  ncfGuid("05300601-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey HTMLClip_EndAnchor{0x1402,
                                                ncfGuid("05300602-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey Timecode_Start{0x1501,
                                            ncfGuid("07020103-0105-0000-060E-2B3401010102")};
inline constexpr PropertyKey Timecode_FPS{0x1502, ncfGuid("04040101-0206-0000-060E-2B3401010102")};
inline constexpr PropertyKey Timecode_Drop{0x1503, ncfGuid("04040101-0500-0000-060E-2B3401010101")};
inline constexpr PropertyKey TimecodeStream_SampleRate{
    0x1601, ncfGuid("04040101-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey TimecodeStream_Source{0x1602,
                                                   ncfGuid("04070300-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey TimecodeStream_SourceType{
    0x1603, ncfGuid("04040201-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey TimecodeStream12M_IncludeSync{
    0x1701, ncfGuid("04040101-0400-0000-060E-2B3401010101")};
inline constexpr PropertyKey Transition_OperationGroup{
    0x1801, ncfGuid("06010104-0205-0000-060E-2B3401010102")};
inline constexpr PropertyKey Transition_CutPoint{0x1802,
                                                 ncfGuid("07020103-0106-0000-060E-2B3401010102")};
inline constexpr PropertyKey ContentStorage_Mobs{0x1901,
                                                 ncfGuid("06010104-0501-0000-060E-2B3401010102")};
inline constexpr PropertyKey ContentStorage_EssenceData{
    0x1902, ncfGuid("06010104-0502-0000-060E-2B3401010102")};
inline constexpr PropertyKey ControlPoint_Value{0x1A02,
                                                ncfGuid("0530050D-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey ControlPoint_Time{0x1A03,
                                               ncfGuid("07020103-1002-0100-060E-2B3401010102")};
inline constexpr PropertyKey ControlPoint_EditHint{0x1A04,
                                                   ncfGuid("05300508-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DefinitionObject_Identification{
    0x1B01, ncfGuid("01011503-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DefinitionObject_Name{0x1B02,
                                                   ncfGuid("01070102-0301-0000-060E-2B3401010102")};
inline constexpr PropertyKey DefinitionObject_Description{
    0x1B03, ncfGuid("03020301-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationDefinition_DataDefinition{
    0x1E01, ncfGuid("05300509-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationDefinition_IsTimeWarp{
    0x1E02, ncfGuid("05300503-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey OperationDefinition_DegradeTo{
    0x1E03, ncfGuid("06010104-0401-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationDefinition_OperationCategory{
    0x1E06, ncfGuid("0530050A-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey OperationDefinition_NumberInputs{
    0x1E07, ncfGuid("05300504-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey OperationDefinition_Bypass{
    0x1E08, ncfGuid("05300505-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey OperationDefinition_ParametersDefined{
    0x1E09, ncfGuid("06010104-0302-0000-060E-2B3401010102")};
inline constexpr PropertyKey ParameterDefinition_Type{
    0x1F01, ncfGuid("06010104-0106-0000-060E-2B3401010102")};
inline constexpr PropertyKey ParameterDefinition_DisplayUnits{
    0x1F03, ncfGuid("0530050B-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_PluginCategory{
    0x2203, ncfGuid("05200901-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_VersionNumber{
    0x2204, ncfGuid("03030301-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_VersionString{
    0x2205, ncfGuid("03030301-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Manufacturer{
    0x2206, ncfGuid("010A0101-0101-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_ManufacturerInfo{
    0x2207, ncfGuid("06010104-020B-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_ManufacturerID{
    0x2208, ncfGuid("010A0101-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Platform{
    0x2209, ncfGuid("05200902-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MinPlatformVersion{
    0x220A, ncfGuid("05200903-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MaxPlatformVersion{
    0x220B, ncfGuid("05200904-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Engine{
    0x220C, ncfGuid("05200905-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MinEngineVersion{
    0x220D, ncfGuid("05200906-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MaxEngineVersion{
    0x220E, ncfGuid("05200907-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_PluginAPI{
    0x220F, ncfGuid("05200908-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MinPluginAPI{
    0x2210, ncfGuid("05200909-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_MaxPluginAPI{
    0x2211, ncfGuid("0520090A-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_SoftwareOnly{
    0x2212, ncfGuid("0520090B-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Accelerator{
    0x2213, ncfGuid("0520090C-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Locators{
    0x2214, ncfGuid("0520090D-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_Authentication{
    0x2215, ncfGuid("0520090E-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey PluginDefinition_DefinitionObject{
    0x2216, ncfGuid("0520090F-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey CodecDefinition_FileDescriptorClass{
    0x2301, ncfGuid("06010104-0107-0000-060E-2B3401010102")};
inline constexpr PropertyKey CodecDefinition_DataDefinitions{
    0x2302, ncfGuid("06010104-0301-0000-060E-2B3401010102")};
inline constexpr PropertyKey ContainerDefinition_EssenceIsIdentified{
    0x2401, ncfGuid("03010201-0300-0000-060E-2B3401010101")};
inline constexpr PropertyKey Dictionary_OperationDefinitions{
    0x2603, ncfGuid("06010104-0503-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_ParameterDefinitions{
    0x2604, ncfGuid("06010104-0504-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_DataDefinitions{
    0x2605, ncfGuid("06010104-0505-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_PluginDefinitions{
    0x2606, ncfGuid("06010104-0506-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_CodecDefinitions{
    0x2607, ncfGuid("06010104-0507-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_ContainerDefinitions{
    0x2608, ncfGuid("06010104-0508-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_InterpolationDefinitions{
    0x2609, ncfGuid("06010104-0509-0000-060E-2B3401010102")};
inline constexpr PropertyKey Dictionary_KLVDataDefinitions{
    0x260A, ncfGuid("06010104-050A-0000-060E-2B3401010107")};
inline constexpr PropertyKey Dictionary_TaggedValueDefinitions{
    0x260B, ncfGuid("06010104-050B-0000-060E-2B3401010107")};
inline constexpr PropertyKey EssenceData_MobID{0x2701,
                                               ncfGuid("06010106-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey EssenceData_Data{0x2702,
                                              ncfGuid("04070200-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey EssenceData_SampleIndex{
    0x2B01, ncfGuid("06010102-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey EssenceDescriptor_Locator{
    0x2F01, ncfGuid("06010104-0603-0000-060E-2B3401010102")};
inline constexpr PropertyKey FileDescriptor_SampleRate{
    0x3001, ncfGuid("04060101-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey FileDescriptor_Length{0x3002,
                                                   ncfGuid("04060102-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey FileDescriptor_ContainerFormat{
    0x3004, ncfGuid("06010104-0102-0000-060E-2B3401010102")};
inline constexpr PropertyKey FileDescriptor_CodecDefinition{
    0x3005, ncfGuid("06010104-0103-0000-060E-2B3401010102")};
inline constexpr PropertyKey FileDescriptor_LinkedSlotID{
    0x3006, ncfGuid("06010103-0500-0000-060E-2B3401010105")};
inline constexpr PropertyKey AIFCDescriptor_Summary{
    0x3101, ncfGuid("03030302-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_Compression{
    0x3201, ncfGuid("04010601-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_StoredHeight{
    0x3202, ncfGuid("04010502-0100-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_StoredWidth{
    0x3203, ncfGuid("04010502-0200-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_SampledHeight{
    0x3204, ncfGuid("04010501-0700-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_SampledWidth{
    0x3205, ncfGuid("04010501-0800-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_SampledXOffset{
    0x3206, ncfGuid("04010501-0900-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_SampledYOffset{
    0x3207, ncfGuid("04010501-0A00-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_DisplayHeight{
    0x3208, ncfGuid("04010501-0B00-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_DisplayWidth{
    0x3209, ncfGuid("04010501-0C00-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_DisplayXOffset{
    0x320A, ncfGuid("04010501-0D00-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_DisplayYOffset{
    0x320B, ncfGuid("04010501-0E00-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_FrameLayout{
    0x320C, ncfGuid("04010301-0400-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_VideoLineMap{
    0x320D, ncfGuid("04010302-0500-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_ImageAspectRatio{
    0x320E, ncfGuid("04010101-0100-0000-060E-2B3401010101")};
inline constexpr PropertyKey DigitalImageDescriptor_AlphaTransparency{
    0x320F, ncfGuid("05200102-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_TransferCharacteristic{
    0x3210, ncfGuid("04010201-0101-0200-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_ColorPrimaries{
    0x3219, ncfGuid("04010201-0106-0100-060E-2B3401010109")};
inline constexpr PropertyKey DigitalImageDescriptor_CodingEquations{
    0x321A, ncfGuid("04010201-0103-0100-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_ImageAlignmentFactor{
    0x3211, ncfGuid("04180101-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_FieldDominance{
    0x3212, ncfGuid("04010301-0600-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_FieldStartOffset{
    0x3213, ncfGuid("04180102-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_FieldEndOffset{
    0x3214, ncfGuid("04180103-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DigitalImageDescriptor_SignalStandard{
    0x3215, ncfGuid("04050113-0000-0000-060E-2B3401010105")};
inline constexpr PropertyKey DigitalImageDescriptor_StoredF2Offset{
    0x3216, ncfGuid("04010302-0800-0000-060E-2B3401010105")};
inline constexpr PropertyKey DigitalImageDescriptor_DisplayF2Offset{
    0x3217, ncfGuid("04010302-0700-0000-060E-2B3401010105")};
inline constexpr PropertyKey DigitalImageDescriptor_ActiveFormatDescriptor{
    0x3218, ncfGuid("04010302-0900-0000-060E-2B3401010105")};
inline constexpr PropertyKey CDCIDescriptor_ComponentWidth{
    0x3301, ncfGuid("04010503-0A00-0000-060E-2B3401010102")};
inline constexpr PropertyKey CDCIDescriptor_HorizontalSubsampling{
    0x3302, ncfGuid("04010501-0500-0000-060E-2B3401010101")};
inline constexpr PropertyKey CDCIDescriptor_ColorSiting{
    0x3303, ncfGuid("04010501-0600-0000-060E-2B3401010101")};
inline constexpr PropertyKey CDCIDescriptor_BlackReferenceLevel{
    0x3304, ncfGuid("04010503-0300-0000-060E-2B3401010101")};
inline constexpr PropertyKey CDCIDescriptor_WhiteReferenceLevel{
    0x3305, ncfGuid("04010503-0400-0000-060E-2B3401010101")};
inline constexpr PropertyKey CDCIDescriptor_ColorRange{
    0x3306, ncfGuid("04010503-0500-0000-060E-2B3401010102")};
inline constexpr PropertyKey CDCIDescriptor_PaddingBits{
    0x3307, ncfGuid("04180104-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey CDCIDescriptor_VerticalSubsampling{
    0x3308, ncfGuid("04010501-1000-0000-060E-2B3401010102")};
inline constexpr PropertyKey CDCIDescriptor_AlphaSamplingWidth{
    0x3309, ncfGuid("04010503-0700-0000-060E-2B3401010102")};
inline constexpr PropertyKey CDCIDescriptor_ReversedByteOrder{
    0x330B, ncfGuid("03010201-0A00-0000-060E-2B3401010105")};
inline constexpr PropertyKey RGBADescriptor_PixelLayout{
    0x3401, ncfGuid("04010503-0600-0000-060E-2B3401010102")};
inline constexpr PropertyKey RGBADescriptor_Palette{
    0x3403, ncfGuid("04010503-0800-0000-060E-2B3401010102")};
inline constexpr PropertyKey RGBADescriptor_PaletteLayout{
    0x3404, ncfGuid("04010503-0900-0000-060E-2B3401010102")};
inline constexpr PropertyKey RGBADescriptor_ScanningDirection{
    0x3405, ncfGuid("04010404-0100-0000-060E-2B3401010105")};
inline constexpr PropertyKey RGBADescriptor_ComponentMaxRef{
    0x3406, ncfGuid("04010503-0B00-0000-060E-2B3401010105")};
inline constexpr PropertyKey RGBADescriptor_ComponentMinRef{
    0x3407, ncfGuid("04010503-0C00-0000-060E-2B3401010105")};
inline constexpr PropertyKey RGBADescriptor_AlphaMaxRef{
    0x3408, ncfGuid("04010503-0D00-0000-060E-2B3401010105")};
inline constexpr PropertyKey RGBADescriptor_AlphaMinRef{
    0x3409, ncfGuid("04010503-0E00-0000-060E-2B3401010105")};
inline constexpr PropertyKey TIFFDescriptor_IsUniform{
    0x3701, ncfGuid("05020103-0101-0000-060E-2B3401010102")};
inline constexpr PropertyKey TIFFDescriptor_IsContiguous{
    0x3702, ncfGuid("06080201-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey TIFFDescriptor_LeadingLines{
    0x3703, ncfGuid("04010302-0300-0000-060E-2B3401010101")};
inline constexpr PropertyKey TIFFDescriptor_TrailingLines{
    0x3704, ncfGuid("04010302-0400-0000-060E-2B3401010101")};
inline constexpr PropertyKey TIFFDescriptor_JPEGTableID{
    0x3705, ncfGuid("05020103-0102-0000-060E-2B3401010102")};
inline constexpr PropertyKey TIFFDescriptor_Summary{
    0x3706, ncfGuid("03030302-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey WAVEDescriptor_Summary{
    0x3801, ncfGuid("03030302-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_FilmFormat{
    0x3901, ncfGuid("04100103-0108-0000-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_FrameRate{
    0x3902, ncfGuid("04010802-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_PerforationsPerFrame{
    0x3903, ncfGuid("04100103-0103-0000-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_FilmAspectRatio{
    0x3904, ncfGuid("04100103-0203-0000-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_Manufacturer{
    0x3905, ncfGuid("04100103-0106-0100-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_Model{0x3906,
                                                  ncfGuid("04100103-0105-0100-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_FilmGaugeFormat{
    0x3907, ncfGuid("04100103-0104-0100-060E-2B3401010102")};
inline constexpr PropertyKey FilmDescriptor_FilmBatchNumber{
    0x3908, ncfGuid("04100103-0107-0100-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_FormFactor{
    0x3A01, ncfGuid("04100101-0101-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_VideoSignal{
    0x3A02, ncfGuid("04010401-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_TapeFormat{
    0x3A03, ncfGuid("0D010101-0101-0100-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_Length{0x3A04,
                                                   ncfGuid("04100101-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_ManufacturerID{
    0x3A05, ncfGuid("04100101-0401-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_Model{0x3A06,
                                                  ncfGuid("04100101-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_TapeBatchNumber{
    0x3A07, ncfGuid("04100101-0601-0000-060E-2B3401010102")};
inline constexpr PropertyKey TapeDescriptor_TapeStock{
    0x3A08, ncfGuid("04100101-0501-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_ByteOrder{0x3B01,
                                              ncfGuid("03010201-0200-0000-060E-2B3401010101")};
inline constexpr PropertyKey Header_LastModified{0x3B02,
                                                 ncfGuid("07020110-0204-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_Content{0x3B03,
                                            ncfGuid("06010104-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_Dictionary{0x3B04,
                                               ncfGuid("06010104-0202-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_Version{0x3B05,
                                            ncfGuid("03010201-0500-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_IdentificationList{
    0x3B06, ncfGuid("06010104-0604-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_ObjectModelVersion{
    0x3B07, ncfGuid("03010201-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey Header_OperationalPattern{
    0x3B09, ncfGuid("01020203-0000-0000-060E-2B3401010105")};
inline constexpr PropertyKey Header_EssenceContainers{
    0x3B0A, ncfGuid("01020210-0201-0000-060E-2B3401010105")};
inline constexpr PropertyKey Header_DescriptiveSchemes{
    0x3B0B, ncfGuid("01020210-0202-0000-060E-2B3401010105")};
inline constexpr PropertyKey Identification_CompanyName{
    0x3C01, ncfGuid("05200701-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_ProductName{
    0x3C02, ncfGuid("05200701-0301-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_ProductVersion{
    0x3C03, ncfGuid("05200701-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_ProductVersionString{
    0x3C04, ncfGuid("05200701-0501-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_ProductID{
    0x3C05, ncfGuid("05200701-0700-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_Date{0x3C06,
                                                 ncfGuid("07020110-0203-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_ToolkitVersion{
    0x3C07, ncfGuid("05200701-0A00-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_Platform{
    0x3C08, ncfGuid("05200701-0601-0000-060E-2B3401010102")};
inline constexpr PropertyKey Identification_GenerationAUID{
    0x3C09, ncfGuid("05200701-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey NetworkLocator_URLString{
    0x4001, ncfGuid("01020101-0100-0000-060E-2B3401010101")};
inline constexpr PropertyKey TextLocator_Name{0x4101,
                                              ncfGuid("01040102-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_MobID{0x4401, ncfGuid("01011510-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey Mob_Name{0x4402, ncfGuid("01030302-0100-0000-060E-2B3401010101")};
inline constexpr PropertyKey Mob_Slots{0x4403, ncfGuid("06010104-0605-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_LastModified{0x4404,
                                              ncfGuid("07020110-0205-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_CreationTime{0x4405,
                                              ncfGuid("07020110-0103-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_UserComments{0x4406,
                                              ncfGuid("03020102-0C00-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_KLVData{0x4407, ncfGuid("03010210-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey Mob_Attributes{0x4409,
                                            ncfGuid("03010210-0700-0000-060E-2B3401010107")};
inline constexpr PropertyKey Mob_UsageCode{0x4408, ncfGuid("05010108-0000-0000-060E-2B3401010107")};
inline constexpr PropertyKey CompositionMob_DefaultFadeLength{
    0x4501, ncfGuid("07020201-0105-0100-060E-2B3401010102")};
inline constexpr PropertyKey CompositionMob_DefFadeType{
    0x4502, ncfGuid("05300201-0000-0000-060E-2B3401010101")};
inline constexpr PropertyKey CompositionMob_DefFadeEditUnit{
    0x4503, ncfGuid("05300403-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey CompositionMob_Rendering{
    0x4504, ncfGuid("06010104-010A-0000-060E-2B3401010108")};
inline constexpr PropertyKey SourceMob_EssenceDescription{
    0x4701, ncfGuid("06010104-0203-0000-060E-2B3401010102")};
inline constexpr PropertyKey MobSlot_SlotID{0x4801,
                                            ncfGuid("01070101-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey MobSlot_SlotName{0x4802,
                                              ncfGuid("01070102-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey MobSlot_Segment{0x4803,
                                             ncfGuid("06010104-0204-0000-060E-2B3401010102")};
inline constexpr PropertyKey MobSlot_PhysicalTrackNumber{
    0x4804, ncfGuid("01040103-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey EventMobSlot_EditRate{0x4901,
                                                   ncfGuid("05300402-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey EventMobSlot_EventSlotOrigin{
    0x4902, ncfGuid("07020103-010B-0000-060E-2B3401010105")};
inline constexpr PropertyKey TimelineMobSlot_EditRate{
    0x4B01, ncfGuid("05300405-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey TimelineMobSlot_Origin{
    0x4B02, ncfGuid("07020103-0103-0000-060E-2B3401010102")};
inline constexpr PropertyKey TimelineMobSlot_MarkIn{
    0x4B03, ncfGuid("07020103-010C-0000-060E-2B3401010107")};
inline constexpr PropertyKey TimelineMobSlot_MarkOut{
    0x4B04, ncfGuid("07020103-0203-0000-060E-2B3401010107")};
inline constexpr PropertyKey TimelineMobSlot_UserPos{
    0x4B05, ncfGuid("07020103-010D-0000-060E-2B3401010107")};
inline constexpr PropertyKey Parameter_Definition{0x4C01,
                                                  ncfGuid("06010104-0104-0000-060E-2B3401010102")};
inline constexpr PropertyKey ConstantValue_Value{0x4D01,
                                                 ncfGuid("05300507-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey VaryingValue_Interpolation{
    0x4E01, ncfGuid("06010104-0105-0000-060E-2B3401010102")};
inline constexpr PropertyKey VaryingValue_PointList{
    0x4E02, ncfGuid("06010104-0606-0000-060E-2B3401010102")};
inline constexpr PropertyKey TaggedValue_Name{0x5001,
                                              ncfGuid("03020102-0901-0000-060E-2B3401010102")};
inline constexpr PropertyKey TaggedValue_Value{0x5003,
                                               ncfGuid("03020102-0A01-0000-060E-2B3401010102")};
inline constexpr PropertyKey KLVData_Value{0x5101, ncfGuid("03010210-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey DescriptiveMarker_DescribedSlots{
    0x6102, ncfGuid("01070105-0000-0000-060E-2B3401010104")};
inline constexpr PropertyKey DescriptiveMarker_Description{
    0x6101, ncfGuid("06010104-020C-0000-060E-2B3401010105")};
inline constexpr PropertyKey SoundDescriptor_AudioSamplingRate{
    0x3D03, ncfGuid("04020301-0101-0000-060E-2B3401010105")};
inline constexpr PropertyKey SoundDescriptor_Locked{
    0x3D02, ncfGuid("04020301-0400-0000-060E-2B3401010104")};
inline constexpr PropertyKey SoundDescriptor_AudioRefLevel{
    0x3D04, ncfGuid("04020101-0300-0000-060E-2B3401010101")};
inline constexpr PropertyKey SoundDescriptor_ElectroSpatial{
    0x3D05, ncfGuid("04020101-0100-0000-060E-2B3401010101")};
inline constexpr PropertyKey SoundDescriptor_Channels{
    0x3D07, ncfGuid("04020101-0400-0000-060E-2B3401010105")};
inline constexpr PropertyKey SoundDescriptor_QuantizationBits{
    0x3D01, ncfGuid("04020303-0400-0000-060E-2B3401010104")};
inline constexpr PropertyKey SoundDescriptor_DialNorm{
    0x3D0C, ncfGuid("04020701-0000-0000-060E-2B3401010105")};
inline constexpr PropertyKey SoundDescriptor_Compression{
    0x3D06, ncfGuid("04020402-0000-0000-060E-2B3401010102")};
inline constexpr PropertyKey DataEssenceDescriptor_DataEssenceCoding{
    0x3E01, ncfGuid("04030302-0000-0000-060E-2B3401010103")};
inline constexpr PropertyKey MultipleDescriptor_FileDescriptors{
    0x3F01, ncfGuid("06010104-060B-0000-060E-2B3401010104")};
inline constexpr PropertyKey DescriptiveClip_DescribedSlotIDs{
    0x6103, ncfGuid("01070106-0000-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_Emphasis{
    0x3D0D, ncfGuid("04020501-0600-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_BlockStartOffset{
    0x3D0F, ncfGuid("04020302-0300-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_AuxBitsMode{
    0x3D08, ncfGuid("04020501-0100-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_ChannelStatusMode{
    0x3D10, ncfGuid("04020501-0200-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_FixedChannelStatusData{
    0x3D11, ncfGuid("04020501-0300-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_UserDataMode{
    0x3D12, ncfGuid("04020501-0400-0000-060E-2B3401010105")};
inline constexpr PropertyKey AES3PCMDescriptor_FixedUserData{
    0x3D13, ncfGuid("04020501-0500-0000-060E-2B3401010105")};
inline constexpr PropertyKey PCMDescriptor_BlockAlign{
    0x3D0A, ncfGuid("04020302-0100-0000-060E-2B3401010105")};
inline constexpr PropertyKey PCMDescriptor_SequenceOffset{
    0x3D0B, ncfGuid("04020302-0200-0000-060E-2B3401010105")};
inline constexpr PropertyKey PCMDescriptor_AverageBPS{
    0x3D09, ncfGuid("04020303-0500-0000-060E-2B3401010105")};
inline constexpr PropertyKey PCMDescriptor_ChannelAssignment{
    0x3D32, ncfGuid("04020101-0500-0000-060E-2B3401010107")};
inline constexpr PropertyKey PCMDescriptor_PeakEnvelopeVersion{
    0x3D29, ncfGuid("04020301-0600-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakEnvelopeFormat{
    0x3D2A, ncfGuid("04020301-0700-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PointsPerPeakValue{
    0x3D2B, ncfGuid("04020301-0800-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakEnvelopeBlockSize{
    0x3D2C, ncfGuid("04020301-0900-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakChannels{
    0x3D2D, ncfGuid("04020301-0A00-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakFrames{
    0x3D2E, ncfGuid("04020301-0B00-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakOfPeaksPosition{
    0x3D2F, ncfGuid("04020301-0C00-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakEnvelopeTimestamp{
    0x3D30, ncfGuid("04020301-0D00-0000-060E-2B3401010108")};
inline constexpr PropertyKey PCMDescriptor_PeakEnvelopeData{
    0x3D31, ncfGuid("04020301-0E00-0000-060E-2B3401010108")};
inline constexpr PropertyKey KLVDataDefinition_KLVDataType{
    0x4D12, ncfGuid("06010104-0109-0000-060E-2B3401010107")};
inline constexpr PropertyKey AuxiliaryDescriptor_MimeType{
    0x4E11, ncfGuid("04090201-0000-0000-060E-2B3401010107")};
inline constexpr PropertyKey AuxiliaryDescriptor_CharSet{
    0x4E12, ncfGuid("04090300-0000-0000-060E-2B3401010108")};
inline constexpr PropertyKey RIFFChunk_ChunkID{0x4F01,
                                               ncfGuid("04060802-0000-0000-060E-2B3401010108")};
inline constexpr PropertyKey RIFFChunk_ChunkLength{0x4F02,
                                                   ncfGuid("04060903-0000-0000-060E-2B3401010108")};
inline constexpr PropertyKey RIFFChunk_ChunkData{0x4F03,
                                                 ncfGuid("04070400-0000-0000-060E-2B3401010108")};
inline constexpr PropertyKey BWFImportDescriptor_QltyFileSecurityReport{
    0x3D15, ncfGuid("04020302-0500-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyFileSecurityWave{
    0x3D16, ncfGuid("04020302-0600-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_BextCodingHistory{
    0x3D21, ncfGuid("04020502-0101-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyBasicData{
    0x3D22, ncfGuid("04020502-0201-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyStartOfModulation{
    0x3D23, ncfGuid("04020502-0301-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyQualityEvent{
    0x3D24, ncfGuid("04020502-0401-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyEndOfModulation{
    0x3D25, ncfGuid("04020502-0501-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyQualityParameter{
    0x3D26, ncfGuid("04020502-0601-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyOperatorComment{
    0x3D27, ncfGuid("04020502-0701-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_QltyCueSheet{
    0x3D28, ncfGuid("04020502-0801-0000-060E-2B3401010105")};
inline constexpr PropertyKey BWFImportDescriptor_UnknownBWFChunks{
    0x3D33, ncfGuid("06010104-060F-0000-060E-2B3401010108")};
inline constexpr PropertyKey MPEGVideoDescriptor_SingleSequence{
    0x0000, ncfGuid("04010602-0102-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_ConstantBPictureCount{
    0x0000, ncfGuid("04010602-0103-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_CodedContentScanning{
    0x0000, ncfGuid("04010602-0104-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_LowDelay{
    0x0000, ncfGuid("04010602-0105-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_ClosedGOP{
    0x0000, ncfGuid("04010602-0106-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_IdenticalGOP{
    0x0000, ncfGuid("04010602-0107-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_MaxGOP{
    0x0000, ncfGuid("04010602-0108-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_MaxBPictureCount{
    0x0000, ncfGuid("04010602-0109-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_BitRate{
    0x0000, ncfGuid("04010602-010B-0000-060E-2B3401010105")};
inline constexpr PropertyKey MPEGVideoDescriptor_ProfileAndLevel{
    0x0000, ncfGuid("04010602-010A-0000-060E-2B3401010105")};
inline constexpr PropertyKey ClassDefinition_ParentClass{
    0x0008, ncfGuid("06010107-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey ClassDefinition_Properties{
    0x0009, ncfGuid("06010107-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey ClassDefinition_IsConcrete{
    0x000A, ncfGuid("06010107-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey PropertyDefinition_Type{
    0x000B, ncfGuid("06010107-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey PropertyDefinition_IsOptional{
    0x000C, ncfGuid("03010202-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey PropertyDefinition_LocalIdentification{
    0x000D, ncfGuid("06010107-0500-0000-060E-2B3401010102")};
inline constexpr PropertyKey PropertyDefinition_IsUniqueIdentifier{
    0x000E, ncfGuid("06010107-0600-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionInteger_Size{
    0x000F, ncfGuid("03010203-0100-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionInteger_IsSigned{
    0x0010, ncfGuid("03010203-0200-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionStrongObjectReference_ReferencedType{
    0x0011, ncfGuid("06010107-0900-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionWeakObjectReference_ReferencedType{
    0x0012, ncfGuid("06010107-0A00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionWeakObjectReference_TargetSet{
    0x0013, ncfGuid("03010203-0B00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionEnumeration_ElementType{
    0x0014, ncfGuid("06010107-0B00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionEnumeration_ElementNames{
    0x0015, ncfGuid("03010203-0400-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionEnumeration_ElementValues{
    0x0016, ncfGuid("03010203-0500-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionFixedArray_ElementType{
    0x0017, ncfGuid("06010107-0C00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionFixedArray_ElementCount{
    0x0018, ncfGuid("03010203-0300-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionVariableArray_ElementType{
    0x0019, ncfGuid("06010107-0D00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionSet_ElementType{
    0x001A, ncfGuid("06010107-0E00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionString_ElementType{
    0x001B, ncfGuid("06010107-0F00-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionRecord_MemberTypes{
    0x001C, ncfGuid("06010107-1100-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionRecord_MemberNames{
    0x001D, ncfGuid("03010203-0600-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionRename_RenamedType{
    0x001E, ncfGuid("06010107-1200-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionExtendibleEnumeration_ElementNames{
    0x001F, ncfGuid("03010203-0700-0000-060E-2B3401010102")};
inline constexpr PropertyKey TypeDefinitionExtendibleEnumeration_ElementValues{
    0x0020, ncfGuid("03010203-0800-0000-060E-2B3401010102")};
inline constexpr PropertyKey MetaDefinition_Identification{
    0x0005, ncfGuid("06010107-1300-0000-060E-2B3401010102")};
inline constexpr PropertyKey MetaDefinition_Name{0x0006,
                                                 ncfGuid("03020401-0201-0000-060E-2B3401010102")};
inline constexpr PropertyKey MetaDefinition_Description{
    0x0007, ncfGuid("06010107-1401-0000-060E-2B3401010102")};
inline constexpr PropertyKey MetaDictionary_ClassDefinitions{
    0x0003, ncfGuid("06010107-0700-0000-060E-2B3401010102")};
inline constexpr PropertyKey MetaDictionary_TypeDefinitions{
    0x0004, ncfGuid("06010107-0800-0000-060E-2B3401010102")};

}  // namespace aaf::prop
