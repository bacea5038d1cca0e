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

using Ids = std::vector<GUID>;

Ids With(Ids base, const Ids& own) {
    base.insert(base.end(), own.begin(), own.end());
    return base;
}

// What objects of the abstract classes answer.
const Ids kObject = {IID_IAAFObject};
const Ids kComponent = With(kObject, {IID_IAAFComponent, IID_IAAFComponent2});
const Ids kSegment = With(kComponent, {IID_IAAFSegment});
const Ids kEvent = With(kSegment, {IID_IAAFEvent});
const Ids kReference = With(kSegment, {IID_IAAFSourceReference, IID_IAAFSourceReference2});
const Ids kDefinition = With(kObject, {IID_IAAFDefObject});
const Ids kLocator = With(kObject, {IID_IAAFLocator});
const Ids kMob = With(kObject, {IID_IAAFMob, IID_IAAFMob2});
const Ids kSlot = With(kObject, {IID_IAAFMobSlot});
const Ids kParameter = With(kObject, {IID_IAAFParameter});
const Ids kDescriptor = With(kObject, {IID_IAAFEssenceDescriptor});
const Ids kPhysical = With(kDescriptor, {IID_IAAFPhysicalDescriptor});
const Ids kFile = With(kDescriptor, {IID_IAAFFileDescriptor, IID_IAAFFileDescriptor2});
const Ids kImage = With(kFile, {IID_IAAFDigitalImageDescriptor, IID_IAAFDigitalImageDescriptor2});
const Ids kSound = With(kFile, {IID_IAAFSoundDescriptor});

struct ClassInterfaces {
    const char* name;
    aafUID_t id;
    Ids interfaces;
};

// Every class that a caller can make, with what its objects answer.
const ClassInterfaces kClasses[] = {
    {"Edgecode", AUID_AAFEdgecode, With(kSegment, {IID_IAAFEdgecode})},
    {"EssenceGroup", AUID_AAFEssenceGroup, With(kSegment, {IID_IAAFEssenceGroup})},
    {"GPITrigger", AUID_AAFGPITrigger, With(kEvent, {IID_IAAFGPITrigger})},
    {"CommentMarker", AUID_AAFCommentMarker, With(kEvent, {IID_IAAFCommentMarker})},
    {"Filler", AUID_AAFFiller, With(kSegment, {IID_IAAFFiller})},
    {"OperationGroup", AUID_AAFOperationGroup, With(kSegment, {IID_IAAFOperationGroup})},
    {"NestedScope", AUID_AAFNestedScope, With(kSegment, {IID_IAAFNestedScope})},
    {"Pulldown", AUID_AAFPulldown, With(kSegment, {IID_IAAFPulldown})},
    {"ScopeReference", AUID_AAFScopeReference, With(kSegment, {IID_IAAFScopeReference})},
    {"Selector", AUID_AAFSelector, With(kSegment, {IID_IAAFSelector})},
    {"Sequence", AUID_AAFSequence, With(kSegment, {IID_IAAFSequence})},
    {"SourceClip", AUID_AAFSourceClip, With(kReference, {IID_IAAFSourceClip})},
    {"HTMLClip", AUID_AAFHTMLClip, With(kReference, {})},
    {"Timecode", AUID_AAFTimecode, With(kSegment, {IID_IAAFTimecode})},
    {"TimecodeStream12M", AUID_AAFTimecodeStream12M,
     With(kSegment, {IID_IAAFTimecodeStream12M, IID_IAAFTimecodeStream})},
    {"Transition", AUID_AAFTransition, With(kComponent, {IID_IAAFTransition})},
    {"ControlPoint", AUID_AAFControlPoint, With(kObject, {IID_IAAFControlPoint})},
    {"DataDef", AUID_AAFDataDef,
     With(kDefinition, {IID_IAAFDataDef, IID_IAAFDataDef2, IID_IAAFDataDef3})},
    {"OperationDef", AUID_AAFOperationDef, With(kDefinition, {IID_IAAFOperationDef})},
    {"ParameterDef", AUID_AAFParameterDef, With(kDefinition, {IID_IAAFParameterDef})},
    {"PluginDef", AUID_AAFPluginDef, With(kDefinition, {IID_IAAFPluginDef})},
    {"CodecDef", AUID_AAFCodecDef, With(kDefinition, {IID_IAAFCodecDef})},
    {"ContainerDef", AUID_AAFContainerDef, With(kDefinition, {IID_IAAFContainerDef})},
    {"InterpolationDef", AUID_AAFInterpolationDef, With(kDefinition, {IID_IAAFInterpolationDef})},
    {"EssenceData", AUID_AAFEssenceData,
     With(kObject, {IID_IAAFEssenceData, IID_IAAFEssenceDataEx, IID_IAAFEssenceData2})},
    {"AIFCDescriptor", AUID_AAFAIFCDescriptor, With(kFile, {IID_IAAFAIFCDescriptor})},
    {"CDCIDescriptor", AUID_AAFCDCIDescriptor,
     With(kImage, {IID_IAAFCDCIDescriptor, IID_IAAFCDCIDescriptor2})},
    {"RGBADescriptor", AUID_AAFRGBADescriptor,
     With(kImage, {IID_IAAFRGBADescriptor, IID_IAAFRGBADescriptor2})},
    {"HTMLDescriptor", AUID_AAFHTMLDescriptor, With(kFile, {})},
    {"TIFFDescriptor", AUID_AAFTIFFDescriptor, With(kFile, {IID_IAAFTIFFDescriptor})},
    {"WAVEDescriptor", AUID_AAFWAVEDescriptor, With(kFile, {IID_IAAFWAVEDescriptor})},
    {"FilmDescriptor", AUID_AAFFilmDescriptor, With(kDescriptor, {IID_IAAFFilmDescriptor})},
    {"TapeDescriptor", AUID_AAFTapeDescriptor, With(kDescriptor, {IID_IAAFTapeDescriptor})},
    {"Identification", AUID_AAFIdentification, With(kObject, {IID_IAAFIdentification})},
    {"NetworkLocator", AUID_AAFNetworkLocator, With(kLocator, {IID_IAAFNetworkLocator})},
    {"TextLocator", AUID_AAFTextLocator, With(kLocator, {IID_IAAFTextLocator})},
    {"CompositionMob", AUID_AAFCompositionMob,
     With(kMob, {IID_IAAFCompositionMob, IID_IAAFCompositionMob2})},
    {"MasterMob", AUID_AAFMasterMob,
     With(kMob, {IID_IAAFMasterMob, IID_IAAFSearchSource, IID_IAAFMasterMobEx, IID_IAAFMasterMob2,
                 IID_IAAFMasterMob3})},
    {"SourceMob", AUID_AAFSourceMob, With(kMob, {IID_IAAFSourceMob, IID_IAAFSearchSource})},
    {"EventMobSlot", AUID_AAFEventMobSlot,
     With(kSlot, {IID_IAAFEventMobSlot, IID_IAAFEventMobSlot2})},
    {"StaticMobSlot", AUID_AAFStaticMobSlot, With(kSlot, {IID_IAAFStaticMobSlot})},
    {"TimelineMobSlot", AUID_AAFTimelineMobSlot,
     With(kSlot, {IID_IAAFTimelineMobSlot, IID_IAAFTimelineMobSlot2})},
    {"ConstantValue", AUID_AAFConstantValue, With(kParameter, {IID_IAAFConstantValue})},
    {"VaryingValue", AUID_AAFVaryingValue, With(kParameter, {IID_IAAFVaryingValue})},
    {"TaggedValue", AUID_AAFTaggedValue, With(kObject, {IID_IAAFTaggedValue})},
    {"KLVData", AUID_AAFKLVData, With(kObject, {IID_IAAFKLVData})},
    {"DescriptiveMarker", AUID_AAFDescriptiveMarker,
     With(kEvent, {IID_IAAFDescriptiveMarker, IID_IAAFCommentMarker})},
    {"SoundDescriptor", AUID_AAFSoundDescriptor, With(kSound, {})},
    {"DataEssenceDescriptor", AUID_AAFDataEssenceDescriptor,
     With(kFile, {IID_IAAFDataEssenceDescriptor})},
    {"MultipleDescriptor", AUID_AAFMultipleDescriptor, With(kFile, {IID_IAAFMultipleDescriptor})},
    {"DescriptiveClip", AUID_AAFDescriptiveClip,
     With(kReference, {IID_IAAFDescriptiveClip, IID_IAAFSourceClip})},
    {"AES3PCMDescriptor", AUID_AAFAES3PCMDescriptor,
     With(kSound, {IID_IAAFAES3PCMDescriptor, IID_IAAFAES3PCMDescriptor2, IID_IAAFPCMDescriptor})},
    {"PCMDescriptor", AUID_AAFPCMDescriptor, With(kSound, {IID_IAAFPCMDescriptor})},
    {"ImportDescriptor", AUID_AAFImportDescriptor, With(kPhysical, {IID_IAAFImportDescriptor})},
    {"RecordingDescriptor", AUID_AAFRecordingDescriptor,
     With(kPhysical, {IID_IAAFRecordingDescriptor})},
    {"TaggedValueDefinition", AUID_AAFTaggedValueDefinition,
     With(kDefinition, {IID_IAAFTaggedValueDefinition})},
    {"KLVDataDefinition", AUID_AAFKLVDataDefinition,
     With(kDefinition, {IID_IAAFKLVDataDefinition})},
    {"AuxiliaryDescriptor", AUID_AAFAuxiliaryDescriptor,
     With(kPhysical, {IID_IAAFAuxiliaryDescriptor})},
    {"RIFFChunk", AUID_AAFRIFFChunk, With(kObject, {IID_IAAFRIFFChunk})},
    {"BWFImportDescriptor", AUID_AAFBWFImportDescriptor,
     With(kPhysical, {IID_IAAFBWFImportDescriptor, IID_IAAFImportDescriptor})},
    {"MPEGVideoDescriptor", AUID_AAFMPEGVideoDescriptor,
     With(kImage, {IID_IAAFMPEGVideoDescriptor, IID_IAAFCDCIDescriptor, IID_IAAFCDCIDescriptor2})},
};

const aafUID_t kAbstractClasses[] = {AUID_AAFObject,
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

}  // namespace

TEST_F(Interfaces, OfEachClassAreAnsweredByItsObjects) {
    for (const ClassInterfaces& entry : kClasses) {
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
    for (const ClassInterfaces& entry : kClasses) {
        Ptr<IUnknown> object;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  dictionary_->CreateInstance(entry.id, IID_IUnknown, object.OutUnknown()));
        for (const ClassInterfaces& other : kClasses) {
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
    for (const aafUID_t& id : kAbstractClasses) {
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
