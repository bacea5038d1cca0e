// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFEvents.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFPluginDefinitions.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Interfaces = TransientFile;

namespace {

struct ClassInterfaces {
    const char* name;
    aafUID_t id;
    std::vector<GUID> interfaces;
};

// Every class that a caller can make, with what its objects answer.
const std::vector<ClassInterfaces>& Classes() {
    static const std::vector<ClassInterfaces> classes = {
        {"Edgecode",
         AUID_AAFEdgecode,
         {IID_IAAFEdgecode, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"EssenceGroup",
         AUID_AAFEssenceGroup,
         {IID_IAAFEssenceGroup, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"GPITrigger",
         AUID_AAFGPITrigger,
         {IID_IAAFGPITrigger, IID_IAAFEvent, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"CommentMarker",
         AUID_AAFCommentMarker,
         {IID_IAAFCommentMarker, IID_IAAFEvent, IID_IAAFSegment, IID_IAAFComponent,
          IID_IAAFComponent2, IID_IAAFObject}},
        {"Filler",
         AUID_AAFFiller,
         {IID_IAAFFiller, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2, IID_IAAFObject}},
        {"OperationGroup",
         AUID_AAFOperationGroup,
         {IID_IAAFOperationGroup, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"NestedScope",
         AUID_AAFNestedScope,
         {IID_IAAFNestedScope, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"Pulldown",
         AUID_AAFPulldown,
         {IID_IAAFPulldown, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"ScopeReference",
         AUID_AAFScopeReference,
         {IID_IAAFScopeReference, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"Selector",
         AUID_AAFSelector,
         {IID_IAAFSelector, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"Sequence",
         AUID_AAFSequence,
         {IID_IAAFSequence, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"SourceClip",
         AUID_AAFSourceClip,
         {IID_IAAFSourceClip, IID_IAAFSourceReference, IID_IAAFSourceReference2, IID_IAAFSegment,
          IID_IAAFComponent, IID_IAAFComponent2, IID_IAAFObject}},
        {"HTMLClip",
         AUID_AAFHTMLClip,
         {IID_IAAFSourceReference, IID_IAAFSourceReference2, IID_IAAFSegment, IID_IAAFComponent,
          IID_IAAFComponent2, IID_IAAFObject}},
        {"Timecode",
         AUID_AAFTimecode,
         {IID_IAAFTimecode, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"TimecodeStream12M",
         AUID_AAFTimecodeStream12M,
         {IID_IAAFTimecodeStream12M, IID_IAAFTimecodeStream, IID_IAAFSegment, IID_IAAFComponent,
          IID_IAAFComponent2, IID_IAAFObject}},
        {"Transition",
         AUID_AAFTransition,
         {IID_IAAFTransition, IID_IAAFComponent, IID_IAAFComponent2, IID_IAAFObject}},
        {"ControlPoint", AUID_AAFControlPoint, {IID_IAAFControlPoint, IID_IAAFObject}},
        {"DataDef",
         AUID_AAFDataDef,
         {IID_IAAFDataDef, IID_IAAFDataDef2, IID_IAAFDataDef3, IID_IAAFDefObject, IID_IAAFObject}},
        {"OperationDef",
         AUID_AAFOperationDef,
         {IID_IAAFOperationDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"ParameterDef",
         AUID_AAFParameterDef,
         {IID_IAAFParameterDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"PluginDef", AUID_AAFPluginDef, {IID_IAAFPluginDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"CodecDef", AUID_AAFCodecDef, {IID_IAAFCodecDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"ContainerDef",
         AUID_AAFContainerDef,
         {IID_IAAFContainerDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"InterpolationDef",
         AUID_AAFInterpolationDef,
         {IID_IAAFInterpolationDef, IID_IAAFDefObject, IID_IAAFObject}},
        {"EssenceData",
         AUID_AAFEssenceData,
         {IID_IAAFEssenceData, IID_IAAFEssenceDataEx, IID_IAAFEssenceData2, IID_IAAFObject}},
        {"AIFCDescriptor",
         AUID_AAFAIFCDescriptor,
         {IID_IAAFAIFCDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"CDCIDescriptor",
         AUID_AAFCDCIDescriptor,
         {IID_IAAFCDCIDescriptor, IID_IAAFCDCIDescriptor2, IID_IAAFDigitalImageDescriptor,
          IID_IAAFDigitalImageDescriptor2, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"RGBADescriptor",
         AUID_AAFRGBADescriptor,
         {IID_IAAFRGBADescriptor, IID_IAAFRGBADescriptor2, IID_IAAFDigitalImageDescriptor,
          IID_IAAFDigitalImageDescriptor2, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"HTMLDescriptor",
         AUID_AAFHTMLDescriptor,
         {IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2, IID_IAAFEssenceDescriptor,
          IID_IAAFObject}},
        {"TIFFDescriptor",
         AUID_AAFTIFFDescriptor,
         {IID_IAAFTIFFDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"WAVEDescriptor",
         AUID_AAFWAVEDescriptor,
         {IID_IAAFWAVEDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"FilmDescriptor",
         AUID_AAFFilmDescriptor,
         {IID_IAAFFilmDescriptor, IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"TapeDescriptor",
         AUID_AAFTapeDescriptor,
         {IID_IAAFTapeDescriptor, IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"Identification", AUID_AAFIdentification, {IID_IAAFIdentification, IID_IAAFObject}},
        {"NetworkLocator",
         AUID_AAFNetworkLocator,
         {IID_IAAFNetworkLocator, IID_IAAFLocator, IID_IAAFObject}},
        {"TextLocator",
         AUID_AAFTextLocator,
         {IID_IAAFTextLocator, IID_IAAFLocator, IID_IAAFObject}},
        {"CompositionMob",
         AUID_AAFCompositionMob,
         {IID_IAAFCompositionMob, IID_IAAFCompositionMob2, IID_IAAFMob, IID_IAAFMob2,
          IID_IAAFObject}},
        {"MasterMob",
         AUID_AAFMasterMob,
         {IID_IAAFMasterMob, IID_IAAFSearchSource, IID_IAAFMasterMobEx, IID_IAAFMasterMob2,
          IID_IAAFMasterMob3, IID_IAAFMob, IID_IAAFMob2, IID_IAAFObject}},
        {"SourceMob",
         AUID_AAFSourceMob,
         {IID_IAAFSourceMob, IID_IAAFSearchSource, IID_IAAFMob, IID_IAAFMob2, IID_IAAFObject}},
        {"EventMobSlot",
         AUID_AAFEventMobSlot,
         {IID_IAAFEventMobSlot, IID_IAAFEventMobSlot2, IID_IAAFMobSlot, IID_IAAFObject}},
        {"StaticMobSlot",
         AUID_AAFStaticMobSlot,
         {IID_IAAFStaticMobSlot, IID_IAAFMobSlot, IID_IAAFObject}},
        {"TimelineMobSlot",
         AUID_AAFTimelineMobSlot,
         {IID_IAAFTimelineMobSlot, IID_IAAFTimelineMobSlot2, IID_IAAFMobSlot, IID_IAAFObject}},
        {"ConstantValue",
         AUID_AAFConstantValue,
         {IID_IAAFConstantValue, IID_IAAFParameter, IID_IAAFObject}},
        {"VaryingValue",
         AUID_AAFVaryingValue,
         {IID_IAAFVaryingValue, IID_IAAFParameter, IID_IAAFObject}},
        {"TaggedValue", AUID_AAFTaggedValue, {IID_IAAFTaggedValue, IID_IAAFObject}},
        {"KLVData", AUID_AAFKLVData, {IID_IAAFKLVData, IID_IAAFObject}},
        {"DescriptiveMarker",
         AUID_AAFDescriptiveMarker,
         {IID_IAAFDescriptiveMarker, IID_IAAFCommentMarker, IID_IAAFEvent, IID_IAAFSegment,
          IID_IAAFComponent, IID_IAAFComponent2, IID_IAAFObject}},
        {"SoundDescriptor",
         AUID_AAFSoundDescriptor,
         {IID_IAAFSoundDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"DataEssenceDescriptor",
         AUID_AAFDataEssenceDescriptor,
         {IID_IAAFDataEssenceDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"MultipleDescriptor",
         AUID_AAFMultipleDescriptor,
         {IID_IAAFMultipleDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"DescriptiveClip",
         AUID_AAFDescriptiveClip,
         {IID_IAAFDescriptiveClip, IID_IAAFSourceClip, IID_IAAFSourceReference,
          IID_IAAFSourceReference2, IID_IAAFSegment, IID_IAAFComponent, IID_IAAFComponent2,
          IID_IAAFObject}},
        {"AES3PCMDescriptor",
         AUID_AAFAES3PCMDescriptor,
         {IID_IAAFAES3PCMDescriptor, IID_IAAFAES3PCMDescriptor2, IID_IAAFPCMDescriptor,
          IID_IAAFSoundDescriptor, IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"PCMDescriptor",
         AUID_AAFPCMDescriptor,
         {IID_IAAFPCMDescriptor, IID_IAAFSoundDescriptor, IID_IAAFFileDescriptor,
          IID_IAAFFileDescriptor2, IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"ImportDescriptor",
         AUID_AAFImportDescriptor,
         {IID_IAAFImportDescriptor, IID_IAAFPhysicalDescriptor, IID_IAAFEssenceDescriptor,
          IID_IAAFObject}},
        {"RecordingDescriptor",
         AUID_AAFRecordingDescriptor,
         {IID_IAAFRecordingDescriptor, IID_IAAFPhysicalDescriptor, IID_IAAFEssenceDescriptor,
          IID_IAAFObject}},
        {"TaggedValueDefinition",
         AUID_AAFTaggedValueDefinition,
         {IID_IAAFTaggedValueDefinition, IID_IAAFDefObject, IID_IAAFObject}},
        {"KLVDataDefinition",
         AUID_AAFKLVDataDefinition,
         {IID_IAAFKLVDataDefinition, IID_IAAFDefObject, IID_IAAFObject}},
        {"AuxiliaryDescriptor",
         AUID_AAFAuxiliaryDescriptor,
         {IID_IAAFAuxiliaryDescriptor, IID_IAAFPhysicalDescriptor, IID_IAAFEssenceDescriptor,
          IID_IAAFObject}},
        {"RIFFChunk", AUID_AAFRIFFChunk, {IID_IAAFRIFFChunk, IID_IAAFObject}},
        {"BWFImportDescriptor",
         AUID_AAFBWFImportDescriptor,
         {IID_IAAFBWFImportDescriptor, IID_IAAFImportDescriptor, IID_IAAFPhysicalDescriptor,
          IID_IAAFEssenceDescriptor, IID_IAAFObject}},
        {"MPEGVideoDescriptor",
         AUID_AAFMPEGVideoDescriptor,
         {IID_IAAFMPEGVideoDescriptor, IID_IAAFCDCIDescriptor, IID_IAAFCDCIDescriptor2,
          IID_IAAFDigitalImageDescriptor, IID_IAAFDigitalImageDescriptor2, IID_IAAFFileDescriptor,
          IID_IAAFFileDescriptor2, IID_IAAFEssenceDescriptor, IID_IAAFObject}},
    };
    return classes;
}

const std::vector<aafUID_t>& AbstractClasses() {
    static const std::vector<aafUID_t> classes = {AUID_AAFObject,
                                                  AUID_AAFComponent,
                                                  AUID_AAFSegment,
                                                  AUID_AAFEvent,
                                                  AUID_AAFSourceReference,
                                                  AUID_AAFTextClip,
                                                  AUID_AAFTimecodeStream,
                                                  AUID_AAFDefObject,
                                                  AUID_AAFEssenceDescriptor,
                                                  AUID_AAFFileDescriptor,
                                                  AUID_AAFDigitalImageDescriptor,
                                                  AUID_AAFLocator,
                                                  AUID_AAFMob,
                                                  AUID_AAFMobSlot,
                                                  AUID_AAFParameter,
                                                  AUID_AAFPhysicalDescriptor,
                                                  AUID_AAFDescriptiveObject,
                                                  AUID_AAFDescriptiveFramework};
    return classes;
}

}  // namespace

TEST_F(Interfaces, OfEachClassAreAnsweredByItsObjects) {
    for (const ClassInterfaces& entry : Classes()) {
        Ptr<IUnknown> object;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  dictionary_->CreateInstance(entry.id, IID_IUnknown, object.OutUnknown()))
            << entry.name;
        EXPECT_EQ(1u, ReferencesOf(object.get())) << entry.name;
        for (const GUID& id : entry.interfaces) {
            void* found = nullptr;
            ASSERT_EQ(AAFRESULT_SUCCESS, object->QueryInterface(id, &found)) << entry.name;
            EXPECT_NE(static_cast<void*>(object.get()), found) << entry.name;
            // The way back leads to the one identity, under either of its ids.
            auto* view = static_cast<IUnknown*>(found);
            Ptr<IUnknown> identity;
            EXPECT_EQ(
                AAFRESULT_SUCCESS,
                view->QueryInterface(IID_IUnknown_Zero, reinterpret_cast<void**>(identity.Out())));
            EXPECT_EQ(object.get(), identity.get()) << entry.name;
            EXPECT_EQ(
                AAFRESULT_SUCCESS,
                view->QueryInterface(IID_IUnknown_COM, reinterpret_cast<void**>(identity.Out())));
            EXPECT_EQ(object.get(), identity.get()) << entry.name;
            view->Release();
        }
    }
}

TEST_F(Interfaces, OfOtherClassesAreRefused) {
    for (const ClassInterfaces& entry : Classes()) {
        Ptr<IUnknown> object;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  dictionary_->CreateInstance(entry.id, IID_IUnknown, object.OutUnknown()));
        for (const ClassInterfaces& other : Classes()) {
            for (const GUID& id : other.interfaces) {
                bool own = false;
                for (const GUID& answered : entry.interfaces) {
                    own = own || answered == id;
                }
                if (own) {
                    continue;
                }
                void* found = object.get();
                EXPECT_LT(object->QueryInterface(id, &found), 0) << entry.name << other.name;
                EXPECT_EQ(nullptr, found);
            }
        }
    }
}

TEST_F(Interfaces, OfAbstractClassesHaveNoObjects) {
    for (const aafUID_t& id : AbstractClasses()) {
        IUnknown* out = file_;
        EXPECT_EQ(AAFRESULT_ABSTRACT_CLASS, dictionary_->CreateInstance(id, IID_IUnknown, &out));
        EXPECT_EQ(file_.get(), out);
    }
}

TEST_F(Interfaces, OfTheRootObjectsAreNotMadeByCallers) {
    for (const aafUID_t& id : {AUID_AAFHeader, AUID_AAFDictionary, AUID_AAFContentStorage}) {
        Ptr<IUnknown> out;
        EXPECT_EQ(AAFRESULT_INVALID_CLASS_ID,
                  dictionary_->CreateInstance(id, IID_IUnknown, out.OutUnknown()));
    }
}

}  // namespace aaf_test
