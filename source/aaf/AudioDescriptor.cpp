// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AudioDescriptor.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "source/aaf/BinColumns.h"
#include "source/aaf/EditUnits.h"
#include "source/aaf/RunSteps.h"
#include "source/aaf/UniversalLabels.h"
#include "source/aaf/VideoDescriptor.h"
#include "source/clips/SampleProviderPolicy.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::AddAudioDescriptor");

// One sound descriptor in the making. The names are those that the log shows.
struct SoundDescriptor {
    std::tr1::shared_ptr<BaseClip> media;
    NCFSmartPtr<INCFConsole> pConsole;
    IAAFSmartPointer<IAAFMob> pMobMasterMob;
    IAAFSmartPointer<IAAFDictionary> pDictionary;
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor;
    ncfUInt32 trackNum;
    ncfUInt32& numAudioChannels;

    IAAFSmartPointer<IAAFPCMDescriptor> pPCMDescriptor{};
    IAAFSmartPointer<IUnknown> pGenericDescriptor{};
    IAAFSmartPointer<IAAFFileDescriptor> pFileDesc{};
    IAAFSmartPointer<IAAFSoundDescriptor> pSoundDescriptor{};

    ncfUInt32 qtTrack = 0;
    ncfUInt64 numAudioSamples = 0;
    ncfUInt32 bytesPerPacket = 0;
    ncfUInt32 formatID = 0;
    ncfUInt32 bitsPerFrame = 0;  // in a second, under the name that the log shows
    ncfUInt32 quantizationBits = 24;
    aafRational_t sampleRateRational = {0, 1};

    NCFRESULT Create();
    NCFRESULT ReadTrack();
    NCFRESULT ReadThroughWrapper();
    NCFRESULT ReadFromHeaders();
    NCFRESULT SetValues();
    NCFRESULT Append();

    void SetRate(double sampleRate) { sampleRateRational = WholeSamplingRate(sampleRate); }
    // The low 32 bits of what may be more.
    ncfUInt32 BitsInASecond(double sampleRate) const {
        return (ncfUInt32)TruncateToUInt64(bytesPerPacket * 8.0 * sampleRate + 0.5);
    }
};

NCFRESULT SoundDescriptor::Create() {
    ThrowIfFailed(pDictionary->CreateInstance(AUID_AAFPCMDescriptor, IID_IAAFPCMDescriptor,
                                              (IUnknown**)&pPCMDescriptor));
    NCF_RETURN(pPCMDescriptor->QueryInterface(IID_IUnknown, (void**)&pGenericDescriptor));
    NCF_RETURN(pPCMDescriptor->Initialize());
    NCF_RETURN(pGenericDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDesc));
    NCF_RETURN(pPCMDescriptor->QueryInterface(IID_IAAFSoundDescriptor, (void**)&pSoundDescriptor));
    return NCF_OK;
}

NCFRESULT SoundDescriptor::ReadTrack() {
    NCF_RETURN(media->GetAudioTrackQTId(trackNum, qtTrack));
    const NCFRESULT r =
        MovieRequiresSampleProviderForAudio(pConsole, media, qtTrack, &numAudioSamples);
    NCF_RETURN_TEXT(
        "MovieRequiresSampleProviderForAudio(pConsole, media, qtTrack, &numAudioSamples)", r);
    if (r == 0) {
        return ReadThroughWrapper();
    }
    return r == 1 ? ReadFromHeaders() : NCF_OK;
}

// The sample provider decodes to 24 bits, whatever the track holds.
NCFRESULT SoundDescriptor::ReadThroughWrapper() {
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(media->GetQuickTimeInterface(qtWrapper));
    double sampleRate = 0.0;
    NCF_RETURN(qtWrapper->GetAudioInfoForTrack(qtTrack, &numAudioChannels, &sampleRate, &formatID,
                                               NULL, &bytesPerPacket, NULL, NULL, NULL, NULL));
    SetRate(sampleRate);
    bitsPerFrame = BitsInASecond(sampleRate);
    NCF_RETURN(pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL(CompressedSoundCodingBaseKey)));
    return NCF_OK;
}

NCFRESULT SoundDescriptor::ReadFromHeaders() {
    AudioTrackMetadata audioInfo;
    NCF_RETURN(media->GetAudioTrackMetadata(qtTrack, &audioInfo));
    SetRate(audioInfo.sampleRate);
    formatID = audioInfo.formatID;
    numAudioChannels = audioInfo.channelsPerFrame & 0xFFFF;
    quantizationBits = audioInfo.bitsPerChannel;
    bytesPerPacket = audioInfo.bytesPerPacket;
    if (audioInfo.isConstantBitRate != 0) {
        bitsPerFrame = BitsInASecond(audioInfo.sampleRate);
    }
    if (audioInfo.isBigEndian) {
        NCF_RETURN(pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL(UncompressedPCM_BigEndian_AudioCoding)));
    } else {
        NCF_RETURN(
            pSoundDescriptor->SetCompression(MakeAAFUIDfromMXFUL(UncompressedPCMAudioCoding)));
    }
    return NCF_OK;
}

NCFRESULT SoundDescriptor::SetValues() {
    slog::Progress(ncfFunction) << "qtTrack: " << qtTrack
                                << "; numAudioChannels: " << numAudioChannels;
    slog::Progress(ncfFunction) << "qtTrack: " << qtTrack
                                << "; quantizationBits: " << quantizationBits;
    AddAudioFormatBinColumnEntry(pMobMasterMob, pConsole, formatID);

    NCF_RETURN(pPCMDescriptor->SetAverageBPS(bitsPerFrame ));
    NCF_RETURN(pPCMDescriptor->SetBlockAlign(static_cast<aafUInt16>(bytesPerPacket)));
    NCF_RETURN(pSoundDescriptor->SetChannelCount( numAudioChannels));
    NCF_RETURN(pSoundDescriptor->SetQuantizationBits( quantizationBits));
    NCF_RETURN(pSoundDescriptor->SetAudioSamplingRate(sampleRateRational));
    NCF_RETURN(pFileDesc->SetSampleRate(sampleRateRational));
    return NCF_OK;
}

// The length is in audio samples, unlike that of the slots.
NCFRESULT SoundDescriptor::Append() {
    if (numAudioSamples == 0) {
        NCF_RETURN(media->ObtainAudioTrackLength(qtTrack, &numAudioSamples));
    }
    NCF_RETURN(pFileDesc->SetLength(numAudioSamples));
    NCF_RETURN(FixMultiDescSampleRate(pMultiDescriptor, sampleRateRational));
    NCF_RETURN(pMultiDescriptor->AppendFileDescriptor( pFileDesc ));
    return NCF_OK;
}

}  // namespace

NCFRESULT AddAudioDescriptor(std::tr1::shared_ptr<BaseClip> media, ncfUInt32 trackNum,
                             NCFSmartPtr<INCFConsole> pConsole,
                             IAAFSmartPointer<IAAFMob> pMobMasterMob,
                             IAAFSmartPointer<IAAFDictionary> pDictionary,
                             IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor,
                             ncfUInt32& numAudioChannels) {
    CHK_INARG(media.get());
    CHK_INARG(pConsole);
    CHK_INARG(pDictionary);
    CHK_INARG(pMultiDescriptor);

    SoundDescriptor sound = {
        media, pConsole, pMobMasterMob, pDictionary, pMultiDescriptor, trackNum, numAudioChannels};
    return RunSteps(sound, &SoundDescriptor::Create, &SoundDescriptor::ReadTrack,
                    &SoundDescriptor::SetValues, &SoundDescriptor::Append);
}

}  // namespace NMA::Impl
