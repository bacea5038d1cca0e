// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/media/SampleMapping.h"
#include "source/clips/BaseClip.h"
#include "source/essence/FormatEnums.h"
#include "source/essence/MediaTrack.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// The way to the essence of one movie: sample tables, the formats on offer and
// the samples themselves. A container makes it, hands it the clip, and gives it
// to the host, which owns it; the clip is shared with the container and with
// other mappings. Lists and readers are made when a query first needs them.
//
// One lock of the host guards the picture side of this object. The readers
// belong to the clip, so two mappings of one clip share them unguarded.
//
// Sources by concern: the object and its queries (.cpp), ...Tracks, ...Queries,
// ...TemporalOffset, ...Formats, ...ImageFormats and ...AudioFormats for the
// working formats, ...Delivery.
class QuickTimeSampleMapping : public CNCFComponent<ISampleProvider, IUncompressedImageProvider,
                                                    IUncompressedAudioProvider, ISampleMapping> {
public:
    explicit QuickTimeSampleMapping(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** ppvObj) override;

    // --- for the container and the parameters -----------------------------------

    // Keeps the caller's string and turns it to UTF-16.
    NCFRESULT SetFilePath(NCFSmartPtr<INCFString> path);
    // Takes the clip and makes its tracks. A clip that can't tell its tracks is
    // taken all the same, with those that it told.
    NCFRESULT SetMediaContainer(std::tr1::shared_ptr<BaseClip> media);
    // After a change of the clip's parameters: adds the formats that they
    // bring and lets the clip work out its fields again.
    NCFRESULT RefreshBasedOnUIParams();
    // The clip, null before there is one.
    const std::tr1::shared_ptr<BaseClip>& GetMediaClip() const { return media_; }
    // The movie's id of a host track.
    NCFRESULT AAFTrackToQuickTimeTrack(ncfUInt32 trackNMA, ncfUInt32* trackQTOut);

    // --- ISampleProvider ----------------------------------------------------------

    NCFRESULT Setup(ncfUInt32 trackNMA) override;
    NCFRESULT ProviderUnsupportedOperation(ncfUInt32, ncfUInt64, ncfUInt64) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT ProvideSampleRange(INCFAVBuffer* pAVBuffer, ncfUInt32 flags) override;
    NCFRESULT ProviderNoOperationA(ncfUInt32, ncfUInt64, ncfUInt64) override { return NCF_OK; }
    NCFRESULT ProviderNoOperationB() override { return NCF_OK; }
    NCFRESULT Cleanup(ncfUInt32 trackNMA) override;

    // --- IUncompressedImageProvider -------------------------------------------------

    NCFRESULT GetNumberOfImageFormats(ncfUInt32 trackNMA, ncfUInt32* numFormats) override;
    NCFRESULT GetImageFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex, ncfUInt32* pixelFormat,
                             ncfUInt32* chromaSubSampling, ncfUInt32* componentFormat,
                             ncfUInt32* componentRangeType, ncfUInt32* colorSpace,
                             ncfUInt32* fieldOrder, ncfUInt32* frameLayout,
                             ncfUInt32* orientation) override;
    NCFRESULT ImageProviderUnsupportedOperation(ncfUInt32, ncfUInt32, void*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT SetWorkingImageFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) override;
    NCFRESULT ImageProviderNoOperationA(ncfUInt32, ncfUInt32) override { return NCF_OK; }
    NCFRESULT ImageProviderNoOperationB(ncfUInt32, float) override { return NCF_OK; }
    NCFRESULT GetWorkingImageSize(ncfUInt32 trackNMA, ncfUInt32* width, ncfUInt32* height) override;
    NCFRESULT GetWorkingImageBufferRequirements(ncfUInt32 trackNMA, ncfUInt16* bufferStartAlignment,
                                                ncfUInt64* maxBufferSize) override;

    // --- IUncompressedAudioProvider ---------------------------------------------------

    NCFRESULT GetNumberOfAudioFormats(ncfUInt32 trackNMA, ncfUInt32* numFormats) override;
    NCFRESULT GetAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex, ncfUInt32* sampleFormat,
                             ncfUInt16* bytesPerSample, ncfUInt16* bitsPerSample) override;
    NCFRESULT AudioProviderUnsupportedOperation(ncfUInt32, ncfUInt32, void*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT SetWorkingAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) override;

    // --- ISampleMapping ----------------------------------------------------------------

    ncfSInt32 GetNumberOfTracks() override;
    NCFRESULT GetNumberOfChannels(ncfUInt32 trackNMA, ncfUInt32* numChannels) override;
    NCFRESULT GetNumberOfSamples(ncfUInt32 trackNMA, ncfUInt64* numSamples) override;
    NCFRESULT GetSampleStride(ncfUInt32, ncfUInt64, ncfUInt64*) override;
    NCFRESULT GetSampleSize(ncfUInt32 trackNMA, ncfUInt64 sample,
                            ncfUInt64* sizeInBytesPtr) override;
    NCFRESULT GetSamplePosition(ncfUInt32 trackNMA, ncfUInt64 sample,
                                ncfUInt64* positionInBytes) override;
    NCFRESULT GetSampleTemporalOffset(ncfUInt32 trackNMA, ncfUInt64 sample,
                                      ncfSInt64* offsetInSamples) override;
    NCFRESULT GetSampleProperties(ncfUInt32 trackNMA, ncfUInt64 sample, ncfUInt64* flagsPtr,
                                  ncfUInt32* numDependenciesPtr) override;
    NCFRESULT GetSampleDependency(ncfUInt32, ncfUInt64, ncfUInt32, ncfSInt64*) override;
    NCFRESULT GetNumberOfEncodedUnits(ncfUInt32 trackNMA, ncfUInt64* numUnits) override;
    NCFRESULT GetEncodedUnitStride(ncfUInt32 trackNMA, ncfUInt64 unit, ncfUInt64* stride) override;
    NCFRESULT GetEncodedUnitPosition(ncfUInt32 trackNMA, ncfUInt64 unit,
                                     ncfUInt64* position) override;
    NCFRESULT GetEncodedUnitSize(ncfUInt32 trackNMA, ncfUInt64 unit, ncfUInt64* size) override;
    NCFRESULT GetEncodedUnitSizeInSamples(ncfUInt32, ncfUInt64, ncfUInt64* sizeInSamples) override;
    NCFRESULT GetEncodedUnitFirstSample(ncfUInt32, ncfUInt64 unit, ncfUInt64* sample) override;
    NCFRESULT GetEncodedUnitContainingSample(ncfUInt32, ncfUInt64 sample, ncfUInt64* unit) override;
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32 trackNMA, ncfUInt64 sample,
                                           ncfSInt64* numSamples) override;
    NCFRESULT GetNumberOfContiguousBytes(ncfUInt32 trackNMA, ncfUInt64 sample,
                                         ncfUInt64* numBytes) override;
    NCFRESULT GetNumberOfContiguousEncodedUnits(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                ncfSInt64* numUnits) override;
    NCFRESULT RegisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override;
    NCFRESULT UnregisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override;
    NCFRESULT SetStorageCallback(INCFUnknown*) override;

    // What follows is protected so that tests reach states and steps that no
    // caller of the interfaces can.
protected:
    // --- the object -----------------------------------------------------------------

    NCFRESULT PrepareImageProvider();
    NCFRESULT PrepareAudioProvider();
    NCFRESULT QueryParametersXML(void** ppvObj);
    NCFRESULT SetupOrCleanup(ncfUInt32 trackNMA, bool setup);

    // --- tracks -----------------------------------------------------------------------

    NCFRESULT InitializeMediaTracks(const std::tr1::shared_ptr<BaseClip>& media);
    // NCF_E_INVALIDARG, without a record, past the end.
    NCFRESULT GetMediaTrack(ncfUInt32 trackNMA, std::tr1::shared_ptr<MediaTrack>& track) const;
    MediaTrack* FirstTrackOf(ncfUInt32 trackType) const;  // or null
    MediaTrack* FirstAlphaTrackShown() const;             // null when the clip shows no alpha

    // --- the picture formats on offer ---------------------------------------------------

    NCFRESULT AddSupportedImageFormatsBasedOnCodec();
    NCFRESULT ReadCodecPixelFormats(QuickTime::IQuickTimeProperty* quickTimeProperty);
    NCFRESULT AddDecompressorPixelFormats(MediaTrack* video_track, MediaTrack* alpha_track);
    // True when a code of the list gave a format; `preferredOnly` passes over
    // codes that the host would rather not have.
    bool AddCodecPixelFormats(MediaTrack* video_track, MediaTrack* alpha_track, bool preferredOnly);
    // NCF_E_FAIL for a code that makes no format of this clip.
    NCFRESULT AddPixelFormat(MediaTrack* video_track, MediaTrack* alpha_track, ncfUInt32 fourCC,
                             ncfUInt32 supportsRGB_CCIR);
    NCFRESULT AddYCbCrPixelFormat(MediaTrack* video_track, ncfUInt32 componentType,
                                  const QTPixelParams& qt_params, const char* line);
    NCFRESULT AddImagePixelFormat(MediaTrack* track, ncfUInt32 pixelFormat,
                                  ncfUInt32 chromaSubSampling, ncfUInt32 colorSpace,
                                  ncfUInt32 componentType, ncfUInt32 componentRange,
                                  const QTPixelParams& qt_params);

    // --- working formats and delivery -----------------------------------------------------

    NCFRESULT RestartVideoReader(const MediaTrack& track);
    void GetAlignedWidth(ncfUInt32 componentType, ncfUInt32 width, ncfUInt32* alignedWidth);
    // Bytes of a frame in the host's buffer, in 32 bits whatever comes out.
    ncfUInt32 OutputFrameSize(const QTImageFormat& format, ncfUInt32 width, ncfUInt32 height);

    NCFRESULT ProvidePicture(MediaTrack& track, ncfUInt64 sample, ncfUInt64 numSamples,
                             const NCFSmartPtr<INCFBuffer>& pBuffer);
    // A frame in the layout and with the levels of the format.
    NCFRESULT ReadPicture(const QTImageFormat& format, ncfUInt64 sample, ncfUInt32 width,
                          ncfUInt32 height, ncfUInt32 nQuickTimeBufSize, ncfUInt8* pOutputBuffer,
                          ncfUInt32 nOutputBufSize);
    NCFRESULT ProvideSound(ncfUInt32 trackNMA, MediaTrack& track, ncfUInt64 sample,
                           ncfUInt64 numSamples, const NCFSmartPtr<INCFBuffer>& pBuffer);

    // Names that begin with an underscore appear in the log.
    NCFSmartPtr<INCFConsole> _pConsole;
    NCFSmartPtr<INCFComponentFactory> _pComponentFactory;
    NCFSmartPtr<INCFString> _filePath;
    std::tr1::shared_ptr<BaseClip> media_;
    ncfUInt32 _codecStorageType = 2;
    ncfUInt32 _codecSupportsRGB_CCIR = 0;
    std::vector<ncfUInt32> codecPixelFormats_;
    std::vector<std::tr1::shared_ptr<MediaTrack>> mediaTracks_;  // by the host's track number
    std::vector<ncfUInt32> _trackRemapVect;                      // likewise; built on first use
    NCFSmartPtr<QTWrapper::IQTVideoReader> _videoReaderHolder;   // from the first chosen format on
    NCFSmartPtr<QTWrapper::IQTAudioReader> _audioReaderHolder;   // from the audio query on
    bool imageFormatsReady_ = false;
    NCFSmartPtr<INCFLock> providerLock_;
    // Where frames are read that don't go straight to the host. Kept, because new
    // memory costs more than the conversion.
    std::vector<ncfUInt8> scratch_;
    ncfUInt32 levelRemap_ = Default_Levels;  // the clip's, as of the last look for formats
};

}  // namespace NMA::Impl
