// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/ObjectClasses.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/BWFImportDescriptor.h"
#include "aaf_library/objects/CDCIDescriptor.h"
#include "aaf_library/objects/CompositionMob.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/Descriptive.h"
#include "aaf_library/objects/EssenceData.h"
#include "aaf_library/objects/Header.h"
#include "aaf_library/objects/Identification.h"
#include "aaf_library/objects/KLVData.h"
#include "aaf_library/objects/Locator.h"
#include "aaf_library/objects/MPEGVideoDescriptor.h"
#include "aaf_library/objects/MasterMob.h"
#include "aaf_library/objects/MobSlot.h"
#include "aaf_library/objects/MultipleDescriptor.h"
#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/OtherFileDescriptors.h"
#include "aaf_library/objects/PCMDescriptor.h"
#include "aaf_library/objects/PhysicalDescriptors.h"
#include "aaf_library/objects/RGBADescriptor.h"
#include "aaf_library/objects/Sequence.h"
#include "aaf_library/objects/SourceClip.h"
#include "aaf_library/objects/SourceMob.h"
#include "aaf_library/objects/TaggedValue.h"
#include "aaf_library/objects/Timecode.h"
#include "aaf_library/objects/TimecodeStream.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

namespace {

// Abstract classes stand here too: the classes that another program derived
// from them are made with them.
const ClassEntry kObjectClasses[] = {
    {AUID_AAFFiller, &CreateAs<Filler>},
    {AUID_AAFSequence, &CreateAs<Sequence>},
    {AUID_AAFSourceReference, &CreateAs<SourceReference>},
    {AUID_AAFSourceClip, &CreateAs<SourceClip>},
    {AUID_AAFComponent, &CreateAs<Component>},
    {AUID_AAFSegment, &CreateAs<Segment>},
    {AUID_AAFTimecode, &CreateAs<Timecode>},
    {AUID_AAFEdgecode, &CreateAs<Edgecode>},
    {AUID_AAFTransition, &CreateAs<Transition>},
    {AUID_AAFOperationGroup, &CreateAs<OperationGroup>},
    {AUID_AAFNestedScope, &CreateAs<NestedScope>},
    {AUID_AAFScopeReference, &CreateAs<ScopeReference>},
    {AUID_AAFSelector, &CreateAs<Selector>},
    {AUID_AAFEssenceGroup, &CreateAs<EssenceGroup>},
    {AUID_AAFPulldown, &CreateAs<Pulldown>},
    {AUID_AAFEvent, &CreateAs<Event>},
    {AUID_AAFCommentMarker, &CreateAs<CommentMarker>},
    {AUID_AAFGPITrigger, &CreateAs<GPITrigger>},
    {AUID_AAFParameter, &CreateAs<Parameter>},
    {AUID_AAFConstantValue, &CreateAs<ConstantValue>},
    {AUID_AAFVaryingValue, &CreateAs<VaryingValue>},
    {AUID_AAFControlPoint, &CreateAs<ControlPoint>},
    {AUID_AAFMob, &CreateAs<Mob>},
    {AUID_AAFMasterMob, &CreateAs<MasterMob>},
    {AUID_AAFSourceMob, &CreateAs<SourceMob>},
    {AUID_AAFCompositionMob, &CreateAs<CompositionMob>},
    {AUID_AAFMobSlot, &CreateAs<MobSlot>},
    {AUID_AAFTimelineMobSlot, &CreateAs<TimelineMobSlot>},
    {AUID_AAFStaticMobSlot, &CreateAs<StaticMobSlot>},
    {AUID_AAFEventMobSlot, &CreateAs<EventMobSlot>},
    {AUID_AAFEssenceDescriptor, &CreateAs<EssenceDescriptor>},
    {AUID_AAFFileDescriptor, &CreateAs<FileDescriptor>},
    {AUID_AAFMultipleDescriptor, &CreateAs<MultipleDescriptor>},
    {AUID_AAFDigitalImageDescriptor, &CreateAs<DigitalImageDescriptor>},
    {AUID_AAFCDCIDescriptor, &CreateAs<CDCIDescriptor>},
    {AUID_AAFMPEGVideoDescriptor, &CreateAs<MPEGVideoDescriptor>},
    {AUID_AAFRGBADescriptor, &CreateAs<RGBADescriptor>},
    {AUID_AAFSoundDescriptor, &CreateAs<SoundDescriptor>},
    {AUID_AAFPCMDescriptor, &CreateAs<PCMDescriptor>},
    {AUID_AAFAES3PCMDescriptor, &CreateAs<AES3PCMDescriptor>},
    {AUID_AAFAIFCDescriptor, &CreateAs<AIFCDescriptor>},
    {AUID_AAFWAVEDescriptor, &CreateAs<WAVEDescriptor>},
    {AUID_AAFTIFFDescriptor, &CreateAs<TIFFDescriptor>},
    {AUID_AAFDataEssenceDescriptor, &CreateAs<DataEssenceDescriptor>},
    {AUID_AAFPhysicalDescriptor, &CreateAs<PhysicalDescriptor>},
    {AUID_AAFImportDescriptor, &CreateAs<ImportDescriptor>},
    {AUID_AAFRecordingDescriptor, &CreateAs<RecordingDescriptor>},
    {AUID_AAFAuxiliaryDescriptor, &CreateAs<AuxiliaryDescriptor>},
    {AUID_AAFTapeDescriptor, &CreateAs<TapeDescriptor>},
    {AUID_AAFFilmDescriptor, &CreateAs<FilmDescriptor>},
    {AUID_AAFLocator, &CreateAs<Locator>},
    {AUID_AAFNetworkLocator, &CreateAs<NetworkLocator>},
    {AUID_AAFTextLocator, &CreateAs<TextLocator>},
    {AUID_AAFTaggedValue, &CreateAs<TaggedValue>},
    {AUID_AAFKLVData, &CreateAs<KLVData>},
    {AUID_AAFHeader, &CreateAs<Header>},
    {AUID_AAFContentStorage, &CreateAs<ContentStorage>},
    {AUID_AAFIdentification, &CreateAs<Identification>},
    {AUID_AAFEssenceData, &CreateAs<EssenceData>},
    {AUID_AAFTimecodeStream, &CreateAs<TimecodeStream>},
    {AUID_AAFTimecodeStream12M, &CreateAs<TimecodeStream12M>},
    {AUID_AAFDescriptiveObject, &CreateAs<DescriptiveObject>},
    {AUID_AAFDescriptiveFramework, &CreateAs<DescriptiveFramework>},
    {AUID_AAFDescriptiveMarker, &CreateAs<DescriptiveMarker>},
    {AUID_AAFDescriptiveClip, &CreateAs<DescriptiveClip>},
    {AUID_AAFRIFFChunk, &CreateAs<RIFFChunk>},
    {AUID_AAFBWFImportDescriptor, &CreateAs<BWFImportDescriptor>},
};

}  // namespace

const ClassRegistry& ObjectClasses() {
    static const ClassRegistry registry = [] {
        ClassRegistry made;
        made.Add(kObjectClasses);
        return made;
    }();
    return registry;
}

}  // namespace aaf
