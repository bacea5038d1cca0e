// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/Tracks.h"

#include <algorithm>

#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/aaf/AAFTrack.h"
#include "source/aaf/AudioDescriptor.h"
#include "source/aaf/EditUnits.h"
#include "source/aaf/RunSteps.h"
#include "source/aaf/Timecode.h"
#include "source/aaf/VideoDescriptor.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::AddTracksToAAF");

// Data files beside the module, read at the first clip with video.
constexpr char fourCharXML[] = "FourCharMapper.xml";
constexpr char AAFInfoXML[] = "AAFInfo.xml";

// The slots of one clip, and how many there are by now.
struct TrackMaker : ClipDescription {
    aafPosition_t* absoluteStartTime;

    ncfUInt32 totalExistingSlots = 0;
    Rational movieEditRate{};
    ncfUInt64 movieLength = 0;
    aafRational_t aaf_rate = {0, 1};

    NCFRESULT ReadTiming();
    NCFRESULT AddTimecodeSlots();
    NCFRESULT AddTimecodeSlot(const TimeCodeTrackMetadata& tcInfo);
    NCFRESULT PrepareRetriever(ncfUInt32 videoTrackCount, ncfUInt32 videoSlots);
    NCFRESULT AddPictureSlots();
    NCFRESULT AddSoundSlots();
};

NCFRESULT TrackMaker::ReadTiming() {
    NCF_RETURN(media->GetEditRate(&movieEditRate));
    NCF_RETURN(media->GetMovieLength(&movieLength));
    aaf_rate = AAFRational(movieEditRate);
    return NCF_OK;
}

// One slot for each timecode track, up to the first that can't be read; a pair
// of made-up slots for such a track and for a movie without any.
NCFRESULT TrackMaker::AddTimecodeSlots() {
    ncfUInt32 tcTrackCount = 0;
    NCF_RETURN(media->GetTimeCodeTrackCount(&tcTrackCount));
    if (tcTrackCount == 0) {
        NCF_RETURN(
            AddSyntheticTimeCode(media, &totalExistingSlots, pConsole, pDictionary, pMobSourceMob));
        return NCF_OK;
    }
    for (ncfUInt32 tc_track = 0; tc_track < tcTrackCount; ++tc_track) {
        ncfUInt32 qtTrack = 0;
        NCF_RETURN(media->GetTimecodeTrackQTId(tc_track, qtTrack));
        TimeCodeTrackMetadata tcInfo;
        if (media->GetTimeCodeTrackMetadata(qtTrack, &tcInfo) < 0) {
            pConsole->Write(2, "TimeCode track metadata incomplete.\n");
            NCF_RETURN(AddSyntheticTimeCode(media, &totalExistingSlots, pConsole, pDictionary,
                                            pMobSourceMob));
            break;
        }
        const NCFRESULT added = AddTimecodeSlot(tcInfo);
        if (added < 0) {
            return added;
        }
    }
    return NCF_OK;
}

// The slot itself begins at zero; where the movie's timecode begins goes into
// the start time, and the last track's wins.
NCFRESULT TrackMaker::AddTimecodeSlot(const TimeCodeTrackMetadata& tcInfo) {
    const ncfUInt32 tcFPS = tcInfo.numFrames & 0xFF;
    const bool drop = (tcInfo.drop & 0xFF) != 0;
    ncfUInt32 tcInFrames = 0;
    NCF_RETURN_TEXT(
        "ConvertTCToFrames(tcInfo.hours, tcInfo.minutes, tcInfo.seconds, tcInfo.frames, tcFPS, "
        "*((bool*)&tcInfo.drop), &tcInFrames)",
        ConvertTCToFrames(tcInfo.hours, tcInfo.minutes, tcInfo.seconds, tcInfo.frames, tcFPS, drop,
                          &tcInFrames));
    const ncfUInt32 fps = WholeRate(movieEditRate);
    *absoluteStartTime =
        fps == tcFPS ? (aafPosition_t)tcInFrames
                     : (aafPosition_t)TruncateToUInt64((double)tcInFrames * fps / tcFPS + 0.5);

    const aafTimecode_t timecode = {0, drop ? kAAFTcDrop : kAAFTcNonDrop, (aafUInt16)fps};
    const ncfUInt32 maxDuration = GetMaxDuration(fps, false);
    const ncfUInt32 startingSlot = totalExistingSlots;
    NCF_RETURN(AddTimecodeAAFTrack(timecode, startingSlot, totalExistingSlots++, aaf_rate,
                                   maxDuration, maxDuration, 0, pDictionary, pMobSourceMob));
    return NCF_OK;
}

// A clip without video never has the data files read. Alpha that it shows all
// the same is a picture, and no descriptor of one is made without the retriever.
NCFRESULT TrackMaker::PrepareRetriever(ncfUInt32 videoTrackCount, ncfUInt32 videoSlots) {
    if (videoTrackCount != 0) {
        NCF_RETURN(QuickTimeToAAFInfoRetriever::Init(pConsole, pComponentFactory, fourCharXML,
                                                     AAFInfoXML));
    }
    if (videoSlots != 0) {
        NCFASSERT(QuickTimeToAAFInfoRetriever::GetInstance());
    }
    return NCF_OK;
}

// The first video track alone, and its alpha as a second picture. Both get a
// descriptor made from the same state of the clip.
NCFRESULT TrackMaker::AddPictureSlots() {
    ncfUInt32 videoTrackCount = 0;
    NCF_RETURN(media->GetVideoTrackCount(&videoTrackCount));
    const ncfUInt32 videoSlots = std::min(1u, videoTrackCount) + (media->ShowsAlpha() ? 1u : 0u);
    const NCFRESULT prepared = PrepareRetriever(videoTrackCount, videoSlots);
    if (prepared < 0) {
        return prepared;
    }
    const aafUID_t& dataDefUID = kAAFDataDef_LegacyPicture;
    const aafCharacter slotFormatLabel[] = L"V%d";
    for (ncfUInt32 slot = 0; slot < videoSlots; ++slot) {
        NCF_RETURN(AddVideoDescriptor(media, pConsole, pMobMasterMob, pHeader, pDictionary,
                                      pMultiDescriptor));
        const ncfUInt32 slotsToAdd = 1;
        const ncfUInt32 startingSlot = totalExistingSlots;
        NCF_RETURN(AddAAFTrack(dataDefUID, slotFormatLabel, slotsToAdd, startingSlot,
                               totalExistingSlots++, aaf_rate, movieLength, pDictionary,
                               pMobMasterMob, pMasterMob, pMobFileMob, pFileMob, pMobSourceMob,
                               pSourceMob, 0 ));
    }
    return NCF_OK;
}

// One descriptor for each track and one slot for each of its channels.
NCFRESULT TrackMaker::AddSoundSlots() {
    ncfUInt32 audioTrackCount = 0;
    NCF_RETURN(media->GetAudioTrackCount(&audioTrackCount));
    const aafUID_t& dataDefUID = kAAFDataDef_LegacySound;
    const aafCharacter slotFormatLabel[] = L"A%d";
    for (ncfUInt32 audio_track = 0; audio_track < audioTrackCount; ++audio_track) {
        ncfUInt32 slotsToAdd = 1;
        const ncfUInt32 startingSlot = totalExistingSlots;
        NCF_RETURN(AddAudioDescriptor( media, audio_track, pConsole, pMobMasterMob, pDictionary,
                                      pMultiDescriptor, slotsToAdd));
        NCF_RETURN(AddAAFTrack(dataDefUID, slotFormatLabel, slotsToAdd, startingSlot,
                               totalExistingSlots, aaf_rate, movieLength, pDictionary,
                               pMobMasterMob, pMasterMob, pMobFileMob, pFileMob, pMobSourceMob,
                               pSourceMob, 0 ));
        totalExistingSlots += slotsToAdd;
    }
    return NCF_OK;
}

}  // namespace

NCFRESULT AddTracksToAAF(
    std::tr1::shared_ptr<BaseClip> media, NCFSmartPtr<INCFConsole> pConsole,
    IAAFSmartPointer<IAAFHeader> pHeader, IAAFSmartPointer<IAAFDictionary> pDictionary,
    IAAFSmartPointer<IAAFMob> pMobMasterMob, IAAFSmartPointer<IAAFMasterMob> pMasterMob,
    IAAFSmartPointer<IAAFMob> pMobFileMob, IAAFSmartPointer<IAAFSourceMob> pFileMob,
    IAAFSmartPointer<IAAFMob> pMobSourceMob, IAAFSmartPointer<IAAFSourceMob> pSourceMob,
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor,
    INCFComponentFactory* pComponentFactory, aafPosition_t* absoluteStartTime) {
    CHK_PTR(media.get());
    CHK_PTR(pConsole);
    CHK_PTR(pDictionary);
    CHK_PTR(pMobMasterMob);
    CHK_PTR(pMasterMob);
    CHK_PTR(pMobFileMob);
    CHK_PTR(pFileMob);
    CHK_PTR(pMobSourceMob);
    CHK_PTR(pSourceMob);
    CHK_PTR(pMultiDescriptor);
    CHK_PTR(pComponentFactory);
    CHK_PTR(absoluteStartTime);

    *absoluteStartTime = 0;
    TrackMaker maker{{media,
                      pConsole,
                      pComponentFactory,
                      {},
                      pHeader,
                      pDictionary,
                      pMobMasterMob,
                      pMasterMob,
                      pMobFileMob,
                      pFileMob,
                      pMobSourceMob,
                      pSourceMob,
                      pMultiDescriptor},
                     absoluteStartTime};
    return RunSteps(maker, &TrackMaker::ReadTiming, &TrackMaker::AddTimecodeSlots,
                    &TrackMaker::AddPictureSlots, &TrackMaker::AddSoundSlots);
}

}  // namespace NMA::Impl
