// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// Ids of the built-in types: what a dictionary finds types by.

inline constexpr aafUID_t kAAFTypeID_UInt8 = ncfGuid("01010100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt16 = ncfGuid("01010200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt32 = ncfGuid("01010300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt64 = ncfGuid("01010400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int8 = ncfGuid("01010500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int16 = ncfGuid("01010600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int32 = ncfGuid("01010700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int64 = ncfGuid("01010800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PositionType = ncfGuid("01012001-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_LengthType = ncfGuid("01012002-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_JPEGTableIDType =
    ncfGuid("01012003-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PhaseFrameType =
    ncfGuid("01012300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Character = ncfGuid("01100100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_String = ncfGuid("01100200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Stream = ncfGuid("04100200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Indirect = ncfGuid("04100300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Opaque = ncfGuid("04100400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_AUID = ncfGuid("01030100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobIDType = ncfGuid("01030200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Rational = ncfGuid("03010100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ProductVersion =
    ncfGuid("03010200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_VersionType = ncfGuid("03010300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_RGBAComponent =
    ncfGuid("03010400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DateStruct = ncfGuid("03010500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TimeStruct = ncfGuid("03010600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TimeStamp = ncfGuid("03010700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt8Array12 = ncfGuid("04010200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt8Array8 = ncfGuid("04010800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_RGBALayout = ncfGuid("04020100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt8Array = ncfGuid("04010100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int32Array = ncfGuid("04010300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Int64Array = ncfGuid("04010400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_StringArray = ncfGuid("04010500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_AUIDArray = ncfGuid("04010600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PositionArray =
    ncfGuid("04010700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt32Array = ncfGuid("04010900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ChannelStatusModeArray =
    ncfGuid("04010A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UserDataModeArray =
    ncfGuid("04010B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataValue = ncfGuid("04100100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_AUIDSet = ncfGuid("04030100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UInt32Set = ncfGuid("04030200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_Boolean = ncfGuid("01040100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ProductReleaseType =
    ncfGuid("02010101-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TapeFormatType =
    ncfGuid("02010102-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_VideoSignalType =
    ncfGuid("02010103-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TapeCaseType = ncfGuid("02010104-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ColorSitingType =
    ncfGuid("02010105-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EditHintType = ncfGuid("02010106-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_FadeType = ncfGuid("02010107-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_LayoutType = ncfGuid("02010108-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TCSource = ncfGuid("02010109-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PulldownDirectionType =
    ncfGuid("0201010A-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PulldownKindType =
    ncfGuid("0201010B-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EdgeType = ncfGuid("0201010C-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_FilmType = ncfGuid("0201010D-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_RGBAComponentKind =
    ncfGuid("0201010E-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ReferenceType =
    ncfGuid("0201010F-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_AlphaTransparencyType =
    ncfGuid("02010120-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_FieldNumber = ncfGuid("02010121-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ElectroSpatialFormulation =
    ncfGuid("02010122-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EmphasisType = ncfGuid("02010123-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_AuxBitsModeType =
    ncfGuid("02010124-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ChannelStatusModeType =
    ncfGuid("02010125-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UserDataModeType =
    ncfGuid("02010126-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SignalStandardType =
    ncfGuid("02010127-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ScanningDirectionType =
    ncfGuid("02010128-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ContentScanningType =
    ncfGuid("0201012A-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TitleAlignmentType =
    ncfGuid("0201012B-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationCategoryType =
    ncfGuid("02020101-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TransferCharacteristicType =
    ncfGuid("02020102-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PluginCategoryType =
    ncfGuid("02020103-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_UsageType = ncfGuid("02020104-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ColorPrimariesType =
    ncfGuid("02020105-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_CodingEquationsType =
    ncfGuid("02020106-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ContentStorageStrongReference =
    ncfGuid("05020100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DictionaryStrongReference =
    ncfGuid("05020200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EssenceDescriptorStrongReference =
    ncfGuid("05020300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_NetworkLocatorStrongReference =
    ncfGuid("05020400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationGroupStrongReference =
    ncfGuid("05020500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SegmentStrongReference =
    ncfGuid("05020600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SourceClipStrongReference =
    ncfGuid("05020700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SourceReferenceStrongReference =
    ncfGuid("05020800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ClassDefinitionStrongReference =
    ncfGuid("05020900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_CodecDefinitionStrongReference =
    ncfGuid("05020A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ComponentStrongReference =
    ncfGuid("05020B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ContainerDefinitionStrongReference =
    ncfGuid("05020C00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ControlPointStrongReference =
    ncfGuid("05020D00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataDefinitionStrongReference =
    ncfGuid("05020E00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EssenceDataStrongReference =
    ncfGuid("05020F00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_IdentificationStrongReference =
    ncfGuid("05021000-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_InterpolationDefinitionStrongReference =
    ncfGuid("05021100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_LocatorStrongReference =
    ncfGuid("05021200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobStrongReference =
    ncfGuid("05021300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobSlotStrongReference =
    ncfGuid("05021400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationDefinitionStrongReference =
    ncfGuid("05021500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterStrongReference =
    ncfGuid("05021600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterDefinitionStrongReference =
    ncfGuid("05021700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PluginDefinitionStrongReference =
    ncfGuid("05021800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PropertyDefinitionStrongReference =
    ncfGuid("05021900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TaggedValueStrongReference =
    ncfGuid("05021A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TypeDefinitionStrongReference =
    ncfGuid("05021B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_KLVDataStrongReference =
    ncfGuid("05021C00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_FileDescriptorStrongReference =
    ncfGuid("05021D00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_RIFFChunkStrongReference =
    ncfGuid("05021E00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DescriptiveFrameworkStrongReference =
    ncfGuid("05021F00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_KLVDataDefinitionStrongReference =
    ncfGuid("05022000-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TaggedValueDefinitionStrongReference =
    ncfGuid("05022100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DescriptiveObjectStrongReference =
    ncfGuid("05022200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ComponentStrongReferenceVector =
    ncfGuid("05060100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ControlPointStrongReferenceVector =
    ncfGuid("05060200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_IdentificationStrongReferenceVector =
    ncfGuid("05060300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_LocatorStrongReferenceVector =
    ncfGuid("05060400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobSlotStrongReferenceVector =
    ncfGuid("05060500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SegmentStrongReferenceVector =
    ncfGuid("05060600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_SourceReferenceStrongReferenceVector =
    ncfGuid("05060700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TaggedValueStrongReferenceVector =
    ncfGuid("05060800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_KLVDataStrongReferenceVector =
    ncfGuid("05060900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterStrongReferenceVector =
    ncfGuid("05060A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_FileDescriptorStrongReferenceVector =
    ncfGuid("05060B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_RIFFChunkStrongReferenceVector =
    ncfGuid("05060C00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DescriptiveObjectStrongReferenceVector =
    ncfGuid("05060D00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ClassDefinitionStrongReferenceSet =
    ncfGuid("05050100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_CodecDefinitionStrongReferenceSet =
    ncfGuid("05050200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ContainerDefinitionStrongReferenceSet =
    ncfGuid("05050300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataDefinitionStrongReferenceSet =
    ncfGuid("05050400-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_EssenceDataStrongReferenceSet =
    ncfGuid("05050500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_InterpolationDefinitionStrongReferenceSet =
    ncfGuid("05050600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobStrongReferenceSet =
    ncfGuid("05050700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationDefinitionStrongReferenceSet =
    ncfGuid("05050800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterDefinitionStrongReferenceSet =
    ncfGuid("05050900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PluginDefinitionStrongReferenceSet =
    ncfGuid("05050A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PropertyDefinitionStrongReferenceSet =
    ncfGuid("05050B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TypeDefinitionStrongReferenceSet =
    ncfGuid("05050C00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_KLVDataDefinitionStrongReferenceSet =
    ncfGuid("05050D00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TaggedValueDefinitionStrongReferenceSet =
    ncfGuid("05050E00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DescriptiveObjectStrongReferenceSet =
    ncfGuid("05050F00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ClassDefinitionWeakReference =
    ncfGuid("05010100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ContainerDefinitionWeakReference =
    ncfGuid("05010200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataDefinitionWeakReference =
    ncfGuid("05010300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_InterpolationDefinitionWeakReference =
    ncfGuid("05010500-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_MobWeakReference =
    ncfGuid("05010600-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationDefinitionWeakReference =
    ncfGuid("05010700-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterDefinitionWeakReference =
    ncfGuid("05010800-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TypeDefinitionWeakReference =
    ncfGuid("05010900-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PluginDefinitionWeakReference =
    ncfGuid("05010A00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_CodecDefinitionWeakReference =
    ncfGuid("05010B00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PropertyDefinitionWeakReference =
    ncfGuid("05010C00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_OperationDefinitionWeakReferenceVector =
    ncfGuid("05040100-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_TypeDefinitionWeakReferenceVector =
    ncfGuid("05040200-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataDefinitionWeakReferenceVector =
    ncfGuid("05040300-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_DataDefinitionWeakReferenceSet =
    ncfGuid("05030D00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_ParameterDefinitionWeakReferenceSet =
    ncfGuid("05030E00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PluginDefinitionWeakReferenceSet =
    ncfGuid("05030F00-0000-0000-060E-2B3401040101");
inline constexpr aafUID_t kAAFTypeID_PropertyDefinitionWeakReferenceSet =
    ncfGuid("05031000-0000-0000-060E-2B3401040101");
