// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFEvents.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFPluginDefinitions.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "not_implemented/AAF.h"

// Calls every slot of every interface as a caller does that knows nothing but its
// place, and expects the published answer of an operation without implementation.
namespace {

template <class Interface>
class Probe final : public aaf::NotImplemented<Interface> {
public:
    HRESULT QueryInterface(REFIID, void**) override { return 3; }
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 2; }
};

using Slot = HRESULT (*)(void*, void*, void*, void*, void*, void*);

template <class Interface>
void ExpectNotImplemented(const char* name, std::size_t operations) {
    Probe<Interface> probe;
    Interface* interface = &probe;
    const Slot* table = *reinterpret_cast<const Slot* const*>(interface);
    for (std::size_t slot = 3; slot < 3 + operations; ++slot) {
        EXPECT_EQ(table[slot](interface, nullptr, nullptr, nullptr, nullptr, nullptr),
                  AAFRESULT_NOT_IMPLEMENTED)
            << name << " slot " << slot;
    }
}

TEST(NotImplemented, AnswersInEverySlotOfEveryInterface) {
    ExpectNotImplemented<IAAFAES3PCMDescriptor>("IAAFAES3PCMDescriptor", 1);
    ExpectNotImplemented<IAAFAES3PCMDescriptor2>("IAAFAES3PCMDescriptor2", 15);
    ExpectNotImplemented<IAAFAIFCDescriptor>("IAAFAIFCDescriptor", 4);
    ExpectNotImplemented<IAAFAuxiliaryDescriptor>("IAAFAuxiliaryDescriptor", 7);
    ExpectNotImplemented<IAAFBWFImportDescriptor>("IAAFBWFImportDescriptor", 36);
    ExpectNotImplemented<IAAFCDCIDescriptor>("IAAFCDCIDescriptor", 17);
    ExpectNotImplemented<IAAFCDCIDescriptor2>("IAAFCDCIDescriptor2", 21);
    ExpectNotImplemented<IAAFCachePageAllocator>("IAAFCachePageAllocator", 3);
    ExpectNotImplemented<IAAFClassDef>("IAAFClassDef", 14);
    ExpectNotImplemented<IAAFCodecDef>("IAAFCodecDef", 10);
    ExpectNotImplemented<IAAFCommentMarker>("IAAFCommentMarker", 2);
    ExpectNotImplemented<IAAFComponent>("IAAFComponent", 8);
    ExpectNotImplemented<IAAFComponent2>("IAAFComponent2", 16);
    ExpectNotImplemented<IAAFCompositionMob>("IAAFCompositionMob", 3);
    ExpectNotImplemented<IAAFCompositionMob2>("IAAFCompositionMob2", 5);
    ExpectNotImplemented<IAAFConstantValue>("IAAFConstantValue", 5);
    ExpectNotImplemented<IAAFContainerDef>("IAAFContainerDef", 3);
    ExpectNotImplemented<IAAFContentStorage>("IAAFContentStorage", 11);
    ExpectNotImplemented<IAAFControlPoint>("IAAFControlPoint", 9);
    ExpectNotImplemented<IAAFDataDef>("IAAFDataDef", 8);
    ExpectNotImplemented<IAAFDataDef2>("IAAFDataDef2", 10);
    ExpectNotImplemented<IAAFDataDef3>("IAAFDataDef3", 12);
    ExpectNotImplemented<IAAFDataEssenceDescriptor>("IAAFDataEssenceDescriptor", 3);
    ExpectNotImplemented<IAAFDefObject>("IAAFDefObject", 8);
    ExpectNotImplemented<IAAFDescriptiveClip>("IAAFDescriptiveClip", 6);
    ExpectNotImplemented<IAAFDescriptiveFramework>("IAAFDescriptiveFramework", 0);
    ExpectNotImplemented<IAAFDescriptiveMarker>("IAAFDescriptiveMarker", 6);
    ExpectNotImplemented<IAAFDescriptiveObject>("IAAFDescriptiveObject", 0);
    ExpectNotImplemented<IAAFDiagnosticOutput>("IAAFDiagnosticOutput", 1);
    ExpectNotImplemented<IAAFDictionary>("IAAFDictionary", 45);
    ExpectNotImplemented<IAAFDictionary2>("IAAFDictionary2", 64);
    ExpectNotImplemented<IAAFDigitalImageDescriptor>("IAAFDigitalImageDescriptor", 21);
    ExpectNotImplemented<IAAFDigitalImageDescriptor2>("IAAFDigitalImageDescriptor2", 39);
    ExpectNotImplemented<IAAFEdgecode>("IAAFEdgecode", 2);
    ExpectNotImplemented<IAAFEndian>("IAAFEndian", 2);
    ExpectNotImplemented<IAAFEssenceAccess>("IAAFEssenceAccess", 15);
    ExpectNotImplemented<IAAFEssenceData>("IAAFEssenceData", 9);
    ExpectNotImplemented<IAAFEssenceData2>("IAAFEssenceData2", 15);
    ExpectNotImplemented<IAAFEssenceDataEx>("IAAFEssenceDataEx", 14);
    ExpectNotImplemented<IAAFEssenceDescriptor>("IAAFEssenceDescriptor", 7);
    ExpectNotImplemented<IAAFEssenceFormat>("IAAFEssenceFormat", 4);
    ExpectNotImplemented<IAAFEssenceGroup>("IAAFEssenceGroup", 8);
    ExpectNotImplemented<IAAFEssenceMultiAccess>("IAAFEssenceMultiAccess", 2);
    ExpectNotImplemented<IAAFEvent>("IAAFEvent", 5);
    ExpectNotImplemented<IAAFEventMobSlot>("IAAFEventMobSlot", 2);
    ExpectNotImplemented<IAAFEventMobSlot2>("IAAFEventMobSlot2", 4);
    ExpectNotImplemented<IAAFFile>("IAAFFile", 7);
    ExpectNotImplemented<IAAFFileDescriptor>("IAAFFileDescriptor", 8);
    ExpectNotImplemented<IAAFFileDescriptor2>("IAAFFileDescriptor2", 10);
    ExpectNotImplemented<IAAFFileEncoding>("IAAFFileEncoding", 5);
    ExpectNotImplemented<IAAFFiller>("IAAFFiller", 1);
    ExpectNotImplemented<IAAFFilmDescriptor>("IAAFFilmDescriptor", 14);
    ExpectNotImplemented<IAAFFindSourceInfo>("IAAFFindSourceInfo", 4);
    ExpectNotImplemented<IAAFGPITrigger>("IAAFGPITrigger", 2);
    ExpectNotImplemented<IAAFGetFileBits>("IAAFGetFileBits", 2);
    ExpectNotImplemented<IAAFHeader>("IAAFHeader", 22);
    ExpectNotImplemented<IAAFHeader2>("IAAFHeader2", 35);
    ExpectNotImplemented<IAAFIdentification>("IAAFIdentification", 15);
    ExpectNotImplemented<IAAFImportDescriptor>("IAAFImportDescriptor", 1);
    ExpectNotImplemented<IAAFInterpolationDef>("IAAFInterpolationDef", 1);
    ExpectNotImplemented<IAAFKLVData>("IAAFKLVData", 5);
    ExpectNotImplemented<IAAFKLVDataDefinition>("IAAFKLVDataDefinition", 7);
    ExpectNotImplemented<IAAFKLVEssenceDataParameters>("IAAFKLVEssenceDataParameters", 2);
    ExpectNotImplemented<IAAFKLVStreamParameters>("IAAFKLVStreamParameters", 2);
    ExpectNotImplemented<IAAFLocator>("IAAFLocator", 3);
    ExpectNotImplemented<IAAFMPEGVideoDescriptor>("IAAFMPEGVideoDescriptor", 21);
    ExpectNotImplemented<IAAFMasterMob>("IAAFMasterMob", 14);
    ExpectNotImplemented<IAAFMasterMob2>("IAAFMasterMob2", 18);
    ExpectNotImplemented<IAAFMasterMob3>("IAAFMasterMob3", 19);
    ExpectNotImplemented<IAAFMasterMobEx>("IAAFMasterMobEx", 2);
    ExpectNotImplemented<IAAFMetaDefinition>("IAAFMetaDefinition", 8);
    ExpectNotImplemented<IAAFMob>("IAAFMob", 31);
    ExpectNotImplemented<IAAFMob2>("IAAFMob2", 39);
    ExpectNotImplemented<IAAFMobSlot>("IAAFMobSlot", 10);
    ExpectNotImplemented<IAAFMultipleDescriptor>("IAAFMultipleDescriptor", 8);
    ExpectNotImplemented<IAAFNestedScope>("IAAFNestedScope", 7);
    ExpectNotImplemented<IAAFNetworkLocator>("IAAFNetworkLocator", 1);
    ExpectNotImplemented<IAAFObject>("IAAFObject", 14);
    ExpectNotImplemented<IAAFOperationDef>("IAAFOperationDef", 21);
    ExpectNotImplemented<IAAFOperationGroup>("IAAFOperationGroup", 19);
    ExpectNotImplemented<IAAFPCMDescriptor>("IAAFPCMDescriptor", 31);
    ExpectNotImplemented<IAAFParameter>("IAAFParameter", 2);
    ExpectNotImplemented<IAAFParameterDef>("IAAFParameterDef", 5);
    ExpectNotImplemented<IAAFPhysicalDescriptor>("IAAFPhysicalDescriptor", 0);
    ExpectNotImplemented<IAAFPlainEssenceData>("IAAFPlainEssenceData", 14);
    ExpectNotImplemented<IAAFPlainStreamData>("IAAFPlainStreamData", 14);
    ExpectNotImplemented<IAAFPluginDef>("IAAFPluginDef", 45);
    ExpectNotImplemented<IAAFPluginManager>("IAAFPluginManager", 6);
    ExpectNotImplemented<IAAFProgress>("IAAFProgress", 1);
    ExpectNotImplemented<IAAFProperty>("IAAFProperty", 2);
    ExpectNotImplemented<IAAFPropertyDef>("IAAFPropertyDef", 8);
    ExpectNotImplemented<IAAFPropertyValue>("IAAFPropertyValue", 2);
    ExpectNotImplemented<IAAFPulldown>("IAAFPulldown", 8);
    ExpectNotImplemented<IAAFRGBADescriptor>("IAAFRGBADescriptor", 9);
    ExpectNotImplemented<IAAFRGBADescriptor2>("IAAFRGBADescriptor2", 19);
    ExpectNotImplemented<IAAFRIFFChunk>("IAAFRIFFChunk", 8);
    ExpectNotImplemented<IAAFRandomFile>("IAAFRandomFile", 4);
    ExpectNotImplemented<IAAFRandomRawStorage>("IAAFRandomRawStorage", 6);
    ExpectNotImplemented<IAAFRawStorage>("IAAFRawStorage", 5);
    ExpectNotImplemented<IAAFRecordingDescriptor>("IAAFRecordingDescriptor", 1);
    ExpectNotImplemented<IAAFScopeReference>("IAAFScopeReference", 4);
    ExpectNotImplemented<IAAFSearchSource>("IAAFSearchSource", 1);
    ExpectNotImplemented<IAAFSegment>("IAAFSegment", 2);
    ExpectNotImplemented<IAAFSelector>("IAAFSelector", 6);
    ExpectNotImplemented<IAAFSequence>("IAAFSequence", 8);
    ExpectNotImplemented<IAAFSetFileBits>("IAAFSetFileBits", 2);
    ExpectNotImplemented<IAAFSoundDescriptor>("IAAFSoundDescriptor", 16);
    ExpectNotImplemented<IAAFSourceClip>("IAAFSourceClip", 6);
    ExpectNotImplemented<IAAFSourceMob>("IAAFSourceMob", 10);
    ExpectNotImplemented<IAAFSourceReference>("IAAFSourceReference", 4);
    ExpectNotImplemented<IAAFSourceReference2>("IAAFSourceReference2", 10);
    ExpectNotImplemented<IAAFStaticMobSlot>("IAAFStaticMobSlot", 0);
    ExpectNotImplemented<IAAFStreamAccess>("IAAFStreamAccess", 1);
    ExpectNotImplemented<IAAFTIFFDescriptor>("IAAFTIFFDescriptor", 13);
    ExpectNotImplemented<IAAFTaggedValue>("IAAFTaggedValue", 7);
    ExpectNotImplemented<IAAFTaggedValueDefinition>("IAAFTaggedValueDefinition", 5);
    ExpectNotImplemented<IAAFTapeDescriptor>("IAAFTapeDescriptor", 15);
    ExpectNotImplemented<IAAFTextLocator>("IAAFTextLocator", 4);
    ExpectNotImplemented<IAAFTimecode>("IAAFTimecode", 3);
    ExpectNotImplemented<IAAFTimecodeStream>("IAAFTimecodeStream", 13);
    ExpectNotImplemented<IAAFTimecodeStream12M>("IAAFTimecodeStream12M", 0);
    ExpectNotImplemented<IAAFTimelineMobSlot>("IAAFTimelineMobSlot", 5);
    ExpectNotImplemented<IAAFTimelineMobSlot2>("IAAFTimelineMobSlot2", 11);
    ExpectNotImplemented<IAAFTransition>("IAAFTransition", 5);
    ExpectNotImplemented<IAAFTypeDef>("IAAFTypeDef", 2);
    ExpectNotImplemented<IAAFTypeDefCharacter>("IAAFTypeDefCharacter", 3);
    ExpectNotImplemented<IAAFTypeDefEnum>("IAAFTypeDefEnum", 14);
    ExpectNotImplemented<IAAFTypeDefExtEnum>("IAAFTypeDefExtEnum", 13);
    ExpectNotImplemented<IAAFTypeDefFixedArray>("IAAFTypeDefFixedArray", 10);
    ExpectNotImplemented<IAAFTypeDefIndirect>("IAAFTypeDefIndirect", 6);
    ExpectNotImplemented<IAAFTypeDefInt>("IAAFTypeDefInt", 6);
    ExpectNotImplemented<IAAFTypeDefObjectRef>("IAAFTypeDefObjectRef", 4);
    ExpectNotImplemented<IAAFTypeDefOpaque>("IAAFTypeDefOpaque", 5);
    ExpectNotImplemented<IAAFTypeDefRecord>("IAAFTypeDefRecord", 12);
    ExpectNotImplemented<IAAFTypeDefRename>("IAAFTypeDefRename", 4);
    ExpectNotImplemented<IAAFTypeDefSet>("IAAFTypeDefSet", 10);
    ExpectNotImplemented<IAAFTypeDefStream>("IAAFTypeDefStream", 14);
    ExpectNotImplemented<IAAFTypeDefStream3>("IAAFTypeDefStream3", 16);
    ExpectNotImplemented<IAAFTypeDefStreamEx>("IAAFTypeDefStreamEx", 1);
    ExpectNotImplemented<IAAFTypeDefString>("IAAFTypeDefString", 7);
    ExpectNotImplemented<IAAFTypeDefStrongObjRef>("IAAFTypeDefStrongObjRef", 1);
    ExpectNotImplemented<IAAFTypeDefVariableArray>("IAAFTypeDefVariableArray", 12);
    ExpectNotImplemented<IAAFTypeDefVariableArrayEx>("IAAFTypeDefVariableArrayEx", 3);
    ExpectNotImplemented<IAAFTypeDefWeakObjRef>("IAAFTypeDefWeakObjRef", 1);
    ExpectNotImplemented<IAAFVaryingValue>("IAAFVaryingValue", 9);
    ExpectNotImplemented<IAAFWAVEDescriptor>("IAAFWAVEDescriptor", 4);
    ExpectNotImplemented<IEnumAAFClassDefs>("IEnumAAFClassDefs", 5);
    ExpectNotImplemented<IEnumAAFCodecDefs>("IEnumAAFCodecDefs", 5);
    ExpectNotImplemented<IEnumAAFCodecFlavours>("IEnumAAFCodecFlavours", 5);
    ExpectNotImplemented<IEnumAAFComponents>("IEnumAAFComponents", 5);
    ExpectNotImplemented<IEnumAAFContainerDefs>("IEnumAAFContainerDefs", 5);
    ExpectNotImplemented<IEnumAAFControlPoints>("IEnumAAFControlPoints", 5);
    ExpectNotImplemented<IEnumAAFDataDefs>("IEnumAAFDataDefs", 5);
    ExpectNotImplemented<IEnumAAFEssenceData>("IEnumAAFEssenceData", 5);
    ExpectNotImplemented<IEnumAAFFileDescriptors>("IEnumAAFFileDescriptors", 5);
    ExpectNotImplemented<IEnumAAFFileEncodings>("IEnumAAFFileEncodings", 5);
    ExpectNotImplemented<IEnumAAFIdentifications>("IEnumAAFIdentifications", 5);
    ExpectNotImplemented<IEnumAAFInterpolationDefs>("IEnumAAFInterpolationDefs", 5);
    ExpectNotImplemented<IEnumAAFKLVData>("IEnumAAFKLVData", 5);
    ExpectNotImplemented<IEnumAAFKLVDataDefs>("IEnumAAFKLVDataDefs", 5);
    ExpectNotImplemented<IEnumAAFLoadedPlugins>("IEnumAAFLoadedPlugins", 5);
    ExpectNotImplemented<IEnumAAFLocators>("IEnumAAFLocators", 5);
    ExpectNotImplemented<IEnumAAFMobSlots>("IEnumAAFMobSlots", 5);
    ExpectNotImplemented<IEnumAAFMobs>("IEnumAAFMobs", 5);
    ExpectNotImplemented<IEnumAAFOperationDefs>("IEnumAAFOperationDefs", 5);
    ExpectNotImplemented<IEnumAAFParameterDefs>("IEnumAAFParameterDefs", 5);
    ExpectNotImplemented<IEnumAAFParameters>("IEnumAAFParameters", 5);
    ExpectNotImplemented<IEnumAAFPluginDefs>("IEnumAAFPluginDefs", 5);
    ExpectNotImplemented<IEnumAAFPluginLocators>("IEnumAAFPluginLocators", 5);
    ExpectNotImplemented<IEnumAAFProperties>("IEnumAAFProperties", 5);
    ExpectNotImplemented<IEnumAAFPropertyDefs>("IEnumAAFPropertyDefs", 5);
    ExpectNotImplemented<IEnumAAFPropertyValues>("IEnumAAFPropertyValues", 5);
    ExpectNotImplemented<IEnumAAFRIFFChunks>("IEnumAAFRIFFChunks", 5);
    ExpectNotImplemented<IEnumAAFSegments>("IEnumAAFSegments", 5);
    ExpectNotImplemented<IEnumAAFTaggedValueDefs>("IEnumAAFTaggedValueDefs", 5);
    ExpectNotImplemented<IEnumAAFTaggedValues>("IEnumAAFTaggedValues", 5);
    ExpectNotImplemented<IEnumAAFTypeDefs>("IEnumAAFTypeDefs", 5);
}

}  // namespace
