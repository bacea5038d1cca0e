// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// Ids of the built-in classes, under the names that the published headers use: what a
// dictionary makes objects by. Two names of one id are both published.

inline constexpr aafUID_t AUID_AAFObject = ncfGuid("0D010101-0101-0100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFInterchangeObject =
    ncfGuid("0D010101-0101-0100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFComponent = ncfGuid("0D010101-0101-0200-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSegment = ncfGuid("0D010101-0101-0300-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEdgecode = ncfGuid("0D010101-0101-0400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEdgeCode = ncfGuid("0D010101-0101-0400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEssenceGroup = ncfGuid("0D010101-0101-0500-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEvent = ncfGuid("0D010101-0101-0600-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFGPITrigger = ncfGuid("0D010101-0101-0700-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFCommentMarker = ncfGuid("0D010101-0101-0800-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFFiller = ncfGuid("0D010101-0101-0900-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFOperationGroup = ncfGuid("0D010101-0101-0A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFNestedScope = ncfGuid("0D010101-0101-0B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPulldown = ncfGuid("0D010101-0101-0C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFScopeReference = ncfGuid("0D010101-0101-0D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSelector = ncfGuid("0D010101-0101-0E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSequence = ncfGuid("0D010101-0101-0F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSourceReference = ncfGuid("0D010101-0101-1000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSourceClip = ncfGuid("0D010101-0101-1100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTextClip = ncfGuid("0D010101-0101-1200-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFHTMLClip = ncfGuid("0D010101-0101-1300-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTimecode = ncfGuid("0D010101-0101-1400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTimecodeStream = ncfGuid("0D010101-0101-1500-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTimecodeStream12M =
    ncfGuid("0D010101-0101-1600-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTransition = ncfGuid("0D010101-0101-1700-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFContentStorage = ncfGuid("0D010101-0101-1800-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFControlPoint = ncfGuid("0D010101-0101-1900-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDefObject = ncfGuid("0D010101-0101-1A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDefinitionObject =
    ncfGuid("0D010101-0101-1A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDataDef = ncfGuid("0D010101-0101-1B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDataDefinition = ncfGuid("0D010101-0101-1B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFOperationDef = ncfGuid("0D010101-0101-1C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFOperationDefinition =
    ncfGuid("0D010101-0101-1C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFParameterDef = ncfGuid("0D010101-0101-1D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFParameterDefinition =
    ncfGuid("0D010101-0101-1D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPluginDef = ncfGuid("0D010101-0101-1E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPluginDefinition =
    ncfGuid("0D010101-0101-1E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFCodecDef = ncfGuid("0D010101-0101-1F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFCodecDefinition = ncfGuid("0D010101-0101-1F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFContainerDef = ncfGuid("0D010101-0101-2000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFContainerDefinition =
    ncfGuid("0D010101-0101-2000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFInterpolationDef =
    ncfGuid("0D010101-0101-2100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFInterpolationDefinition =
    ncfGuid("0D010101-0101-2100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDictionary = ncfGuid("0D010101-0101-2200-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEssenceData = ncfGuid("0D010101-0101-2300-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEssenceDescriptor =
    ncfGuid("0D010101-0101-2400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFFileDescriptor = ncfGuid("0D010101-0101-2500-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFAIFCDescriptor = ncfGuid("0D010101-0101-2600-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDigitalImageDescriptor =
    ncfGuid("0D010101-0101-2700-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFCDCIDescriptor = ncfGuid("0D010101-0101-2800-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFRGBADescriptor = ncfGuid("0D010101-0101-2900-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFHTMLDescriptor = ncfGuid("0D010101-0101-2A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTIFFDescriptor = ncfGuid("0D010101-0101-2B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFWAVEDescriptor = ncfGuid("0D010101-0101-2C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFFilmDescriptor = ncfGuid("0D010101-0101-2D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTapeDescriptor = ncfGuid("0D010101-0101-2E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFHeader = ncfGuid("0D010101-0101-2F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFIdentification = ncfGuid("0D010101-0101-3000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFLocator = ncfGuid("0D010101-0101-3100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFNetworkLocator = ncfGuid("0D010101-0101-3200-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTextLocator = ncfGuid("0D010101-0101-3300-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMob = ncfGuid("0D010101-0101-3400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFCompositionMob = ncfGuid("0D010101-0101-3500-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMasterMob = ncfGuid("0D010101-0101-3600-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSourceMob = ncfGuid("0D010101-0101-3700-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMobSlot = ncfGuid("0D010101-0101-3800-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFEventMobSlot = ncfGuid("0D010101-0101-3900-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFStaticMobSlot = ncfGuid("0D010101-0101-3A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTimelineMobSlot = ncfGuid("0D010101-0101-3B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFParameter = ncfGuid("0D010101-0101-3C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFConstantValue = ncfGuid("0D010101-0101-3D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFVaryingValue = ncfGuid("0D010101-0101-3E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTaggedValue = ncfGuid("0D010101-0101-3F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFKLVData = ncfGuid("0D010101-0101-4000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDescriptiveMarker =
    ncfGuid("0D010101-0101-4100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFSoundDescriptor = ncfGuid("0D010101-0101-4200-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDataEssenceDescriptor =
    ncfGuid("0D010101-0101-4300-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMultipleDescriptor =
    ncfGuid("0D010101-0101-4400-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDescriptiveClip = ncfGuid("0D010101-0101-4500-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFAES3PCMDescriptor =
    ncfGuid("0D010101-0101-4700-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPCMDescriptor = ncfGuid("0D010101-0101-4800-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPhysicalDescriptor =
    ncfGuid("0D010101-0101-4900-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFImportDescriptor =
    ncfGuid("0D010101-0101-4A00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFRecordingDescriptor =
    ncfGuid("0D010101-0101-4B00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTaggedValueDefinition =
    ncfGuid("0D010101-0101-4C00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFKLVDataDefinition =
    ncfGuid("0D010101-0101-4D00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFAuxiliaryDescriptor =
    ncfGuid("0D010101-0101-4E00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFRIFFChunk = ncfGuid("0D010101-0101-4F00-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFBWFImportDescriptor =
    ncfGuid("0D010101-0101-5000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMPEGVideoDescriptor =
    ncfGuid("0D010101-0101-5100-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFClassDef = ncfGuid("0D010101-0201-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFClassDefinition = ncfGuid("0D010101-0201-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPropertyDef = ncfGuid("0D010101-0202-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFPropertyDefinition =
    ncfGuid("0D010101-0202-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDef = ncfGuid("0D010101-0203-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinition = ncfGuid("0D010101-0203-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefInt = ncfGuid("0D010101-0204-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionInteger =
    ncfGuid("0D010101-0204-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefStrongObjRef =
    ncfGuid("0D010101-0205-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionStrongObjectReference =
    ncfGuid("0D010101-0205-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefWeakObjRef =
    ncfGuid("0D010101-0206-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionWeakObjectReference =
    ncfGuid("0D010101-0206-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefEnum = ncfGuid("0D010101-0207-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionEnumeration =
    ncfGuid("0D010101-0207-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefFixedArray =
    ncfGuid("0D010101-0208-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionFixedArray =
    ncfGuid("0D010101-0208-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefVariableArray =
    ncfGuid("0D010101-0209-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionVariableArray =
    ncfGuid("0D010101-0209-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefSet = ncfGuid("0D010101-020A-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionSet =
    ncfGuid("0D010101-020A-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefString = ncfGuid("0D010101-020B-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionString =
    ncfGuid("0D010101-020B-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefStream = ncfGuid("0D010101-020C-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionStream =
    ncfGuid("0D010101-020C-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefRecord = ncfGuid("0D010101-020D-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionRecord =
    ncfGuid("0D010101-020D-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefRename = ncfGuid("0D010101-020E-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionRename =
    ncfGuid("0D010101-020E-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefExtEnum = ncfGuid("0D010101-0220-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionExtendibleEnumeration =
    ncfGuid("0D010101-0220-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefIndirect = ncfGuid("0D010101-0221-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionIndirect =
    ncfGuid("0D010101-0221-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefOpaque = ncfGuid("0D010101-0222-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionOpaque =
    ncfGuid("0D010101-0222-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefCharacter =
    ncfGuid("0D010101-0223-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFTypeDefinitionCharacter =
    ncfGuid("0D010101-0223-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMetaDefinition = ncfGuid("0D010101-0224-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFMetaDictionary = ncfGuid("0D010101-0225-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDescriptiveObject =
    ncfGuid("0D010400-0000-0000-060E-2B3402060101");
inline constexpr aafUID_t AUID_AAFDescriptiveFramework =
    ncfGuid("0D010401-0000-0000-060E-2B3402060101");
