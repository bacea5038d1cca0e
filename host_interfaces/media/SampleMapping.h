// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/AVBuffer.h"

// How the host reaches the essence of one movie. All four interfaces belong to
// one object. Tracks are the host's numbers, `trackNMA`: the picture, its alpha
// if the clip shows one, then the sound tracks, from zero. Samples count from
// zero too. An operation that refuses answers NCF_E_NOTIMPL; one that does nothing
// answers NCF_OK; neither looks at its arguments.
//
// Implemented by the module (QuickTimeSampleMapping), made by
// IMediaContainer2::GetSampleMapping, and called by the host from then on, also when
// the container is gone. The mapping keeps the clip. The order of a delivery:
//   1. Query for IUncompressedImageProvider, IUncompressedAudioProvider: formats.
//   2. SetWorkingImageFormat, SetWorkingAudioFormat for each track.
//   3. Sizes, if the host wants them; Setup.
//   4. ISampleProvider::ProvideSampleRange, any number; then Cleanup.
// A query for INCFParametersXML (ParametersXML.h) makes another object, with the
// parameters of this clip.
//
// Threads. A mapping locks itself, but all mappings of one clip share the clip, its
// parameters and its readers, and nothing locks those across mappings. Before one
// thread has left a mapping of a clip, a host must not, on another,
//   - deliver from a second one, least of all in another format: the reader's format
//     may change between the moment at which a buffer is sized and the moment at
//     which it is filled, and the frame is then written past the end of the buffer;
//   - choose a format, Setup or Cleanup on a second one: this stops and starts the
//     reader that both use. After a Cleanup each of them needs a Setup;
//   - query a second one for its picture or sound formats: the first query makes the
//     clip's readers, and reads its parameters;
//   - set parameters through a second one: the first may be reading them.
// So every call to the mappings of one clip comes under one lock of the host's. A
// host that wants frames on several threads opens a container on each. Containers
// share no clip and no reader; what the whole module shares, its log and the tables
// of its data files, may be used from all of them at once.
namespace NMA {

// Delivers decoded samples in the formats that were chosen before. The host's
// buffers hold them; the module keeps no pointer into one after the call.
struct ISampleProvider : INCFUnknown {
    // 3. Starts the reader of a picture track whose format is chosen; nothing
    // to do for any other.
    virtual NCFRESULT Setup(ncfUInt32 trackNMA) = 0;
    // 4. Refuses.
    virtual NCFRESULT ProviderUnsupportedOperation(ncfUInt32 trackNMA, ncfUInt64 reservedA,
                                                   ncfUInt64 reservedB) = 0;
    // 5. One picture, or frames of sound, one or more. Allocates the request's
    // buffer, fills it and marks it complete. Blocks while it decodes; `flags` is
    // ignored. NMA_E_NOTINITIALIZED before a format is chosen. Sound that can't be
    // read comes as silence with NCF_OK. One positive answer, 0x0AEA0066: the
    // picture may not be read.
    virtual NCFRESULT ProvideSampleRange(INCFAVBuffer* pAVBuffer, ncfUInt32 flags) = 0;
    // 6, 7. Do nothing.
    virtual NCFRESULT ProviderNoOperationA(ncfUInt32 trackNMA, ncfUInt64 reservedA,
                                           ncfUInt64 reservedB) = 0;
    virtual NCFRESULT ProviderNoOperationB() = 0;
    virtual NCFRESULT Cleanup(ncfUInt32 trackNMA) = 0;  // 8. Undoes Setup.

protected:
    ~ISampleProvider() = default;
};

// Formats of picture and alpha tracks. The list of a track only grows, so an
// index stays good. The query for this interface makes the lists; when that
// fails the query gives the failure and a pointer that must be released. Another
// kind of track gives NCF_E_INVALIDARG, and so does a format index beyond the count.
struct IUncompressedImageProvider : INCFUnknown {
    virtual NCFRESULT GetNumberOfImageFormats(ncfUInt32 trackNMA, ncfUInt32* numFormats) = 0;  // 3
    // 4. Format `formatIndex`, from 0, by the host's numbers; 0x7FFFFFFF is "not
    // set". Those that the module gives:
    //   pixelFormat         2 Cb Y Cr Y, 4 A R G B, 8 B G R A, 1024 one component
    //   chromaSubSampling   1 for 4:2:2, 4 for 4:4:4, 128 none
    //   componentFormat     1 for 8 bits, 2 for 10, 1024 'v210', 4096 for 16 bits
    //                       big-endian
    //   componentRangeType  1 video range, 2 full range; not set for alpha
    //   colorSpace          1 one component, 2 RGB, 4 Rec. 601, 8 Rec. 709
    //   fieldOrder          256 progressive, 512 upper first, 4096 lower first,
    //                       8192 not known
    //   frameLayout         256 merged, 512 split
    virtual NCFRESULT GetImageFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex,
                                     ncfUInt32* pixelFormat, ncfUInt32* chromaSubSampling,
                                     ncfUInt32* componentFormat, ncfUInt32* componentRangeType,
                                     ncfUInt32* colorSpace, ncfUInt32* fieldOrder,
                                     ncfUInt32* frameLayout, ncfUInt32* orientation) = 0;
    // 5. Refuses.
    virtual NCFRESULT ImageProviderUnsupportedOperation(ncfUInt32 trackNMA, ncfUInt32 reservedA,
                                                        void* reservedB) = 0;
    // 6. Starts the one reader of all picture tracks anew, unless the format
    // is the one already chosen.
    virtual NCFRESULT SetWorkingImageFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) = 0;
    // 7, 8. Do nothing.
    virtual NCFRESULT ImageProviderNoOperationA(ncfUInt32 trackNMA, ncfUInt32 reserved) = 0;
    virtual NCFRESULT ImageProviderNoOperationB(ncfUInt32 trackNMA, float reserved) = 0;
    // 9. Size of a frame, or of one field of interlaced material, in pixels.
    virtual NCFRESULT GetWorkingImageSize(ncfUInt32 trackNMA, ncfUInt32* width,
                                          ncfUInt32* height) = 0;
    // 10. Bytes of a whole frame in the format chosen, else in the first; the
    // alignment, in bytes, is always 1.
    virtual NCFRESULT GetWorkingImageBufferRequirements(ncfUInt32 trackNMA,
                                                        ncfUInt16* bufferStartAlignment,
                                                        ncfUInt64* maxBufferSize) = 0;

protected:
    ~IUncompressedImageProvider() = default;
};

// Formats of sound tracks. The query makes the reader; a failure leaves a
// pointer to release, as above.
struct IUncompressedAudioProvider : INCFUnknown {
    virtual NCFRESULT GetNumberOfAudioFormats(ncfUInt32 trackNMA, ncfUInt32* numFormats) = 0;  // 3
    // 4. Format `formatIndex`, from 0: 'A2CL' little-endian or 'A2CB' big-endian
    // integers, with the first character in the most significant byte; bytes and
    // bits of one sample of one channel, 3 and 24.
    virtual NCFRESULT GetAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex,
                                     ncfUInt32* sampleFormat, ncfUInt16* bytesPerSample,
                                     ncfUInt16* bitsPerSample) = 0;
    // 5. Refuses.
    virtual NCFRESULT AudioProviderUnsupportedOperation(ncfUInt32 trackNMA, ncfUInt32 reservedA,
                                                        void* reservedB) = 0;
    // 6. Tells the reader the format; samples then come with the track's own rate
    // and channels, interleaved.
    virtual NCFRESULT SetWorkingAudioFormat(ncfUInt32 trackNMA, ncfUInt32 formatIndex) = 0;

protected:
    ~IUncompressedAudioProvider() = default;
};

// Where the stored samples of a track lie in the file and how they depend on
// each other: for hosts that read native tracks by themselves. Pictures are numbered
// in decode order here. Positions and sizes are in bytes of the movie file. Nothing
// has to be set up, nothing is kept, and no operation locks. A track that is not
// there gives NCF_E_FAIL.
struct ISampleMapping : INCFUnknown {
    // 3. The number itself, or a negative failure.
    virtual ncfSInt32 GetNumberOfTracks() = 0;
    virtual NCFRESULT GetNumberOfChannels(ncfUInt32 trackNMA,
                                          ncfUInt32* numChannels) = 0;  // 4. 1 for pictures
    virtual NCFRESULT GetNumberOfSamples(ncfUInt32 trackNMA, ncfUInt64* numSamples) = 0;  // 5
    // 6. Refuses.
    virtual NCFRESULT GetSampleStride(ncfUInt32 trackNMA, ncfUInt64 reservedA,
                                      ncfUInt64* reservedB) = 0;
    // 7. Writes 32 bits, the low half: set the variable to zero first. The
    // sample number is taken as 32 bits.
    virtual NCFRESULT GetSampleSize(ncfUInt32 trackNMA, ncfUInt64 sample,
                                    ncfUInt64* sizeInBytesPtr) = 0;
    virtual NCFRESULT GetSamplePosition(ncfUInt32 trackNMA, ncfUInt64 sample,
                                        ncfUInt64* positionInBytes) = 0;  // 8
    // 9. How many samples further on in decode order lies the one that is
    // displayed at this sample's place. NCF_E_FAIL when none does, and where a
    // sample lasts no time at all and yet is displayed elsewhere.
    virtual NCFRESULT GetSampleTemporalOffset(ncfUInt32 trackNMA, ncfUInt64 sample,
                                              ncfSInt64* offsetInSamples) = 0;
    // 10. How many samples this one needs to be decoded, by its kind: 1024 with 0
    // (stands alone), 2048 with 1, or 4096 with 2 (no other needs it).
    virtual NCFRESULT GetSampleProperties(ncfUInt32 trackNMA, ncfUInt64 sample, ncfUInt64* flagsPtr,
                                          ncfUInt32* numDependenciesPtr) = 0;
    // 11. Refuses.
    virtual NCFRESULT GetSampleDependency(ncfUInt32 trackNMA, ncfUInt64 sample, ncfUInt32 reservedA,
                                          ncfSInt64* reservedB) = 0;
    // 12 to 18. A unit is one sample: each answers what the operation for samples
    // does, so 13 refuses, and 16 to 18 take any track.
    virtual NCFRESULT GetNumberOfEncodedUnits(ncfUInt32 trackNMA, ncfUInt64* numUnits) = 0;
    virtual NCFRESULT GetEncodedUnitStride(ncfUInt32 trackNMA, ncfUInt64 unit,
                                           ncfUInt64* stride) = 0;
    virtual NCFRESULT GetEncodedUnitPosition(ncfUInt32 trackNMA, ncfUInt64 unit,
                                             ncfUInt64* position) = 0;
    virtual NCFRESULT GetEncodedUnitSize(ncfUInt32 trackNMA, ncfUInt64 unit, ncfUInt64* size) = 0;
    virtual NCFRESULT GetEncodedUnitSizeInSamples(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                  ncfUInt64* sizeInSamples) = 0;
    virtual NCFRESULT GetEncodedUnitFirstSample(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                ncfUInt64* sample) = 0;
    virtual NCFRESULT GetEncodedUnitContainingSample(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                     ncfUInt64* unit) = 0;
    // 19. Samples from this one on whose bytes follow each other; 1 for every
    // picture. May answer -1 with success.
    virtual NCFRESULT GetNumberOfContiguousSamples(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                   ncfSInt64* numSamples) = 0;
    virtual NCFRESULT GetNumberOfContiguousBytes(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                 ncfUInt64* numBytes) = 0;  // 20
    virtual NCFRESULT GetNumberOfContiguousEncodedUnits(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                        ncfSInt64* numUnits) = 0;  // 21
    // 22 to 24. Refuse.
    virtual NCFRESULT RegisterSampleRangeHint(ncfUInt32 trackNMA, ncfUInt64 reservedA,
                                              ncfUInt64 reservedB) = 0;
    virtual NCFRESULT UnregisterSampleRangeHint(ncfUInt32 trackNMA, ncfUInt64 reservedA,
                                                ncfUInt64 reservedB) = 0;
    virtual NCFRESULT SetStorageCallback(INCFUnknown* callback) = 0;

protected:
    ~ISampleMapping() = default;
};

inline constexpr GUID IID_ISampleProvider = ncfGuid("933EEA30-24C0-4733-B51D-E37A811DFFE5");
inline constexpr GUID IID_IUncompressedImageProvider =
    ncfGuid("1E1675DC-95E7-45CB-A9F0-7D6326273E70");
inline constexpr GUID IID_IUncompressedAudioProvider =
    ncfGuid("6F2EAEF7-2DFD-47B8-AA14-38E4DF57982E");
inline constexpr GUID IID_ISampleMapping = ncfGuid("E0D63190-0469-4807-92CE-5C22152F84EB");
constexpr const GUID& ncfIdOf(const ISampleProvider*) {
    return IID_ISampleProvider;
}
constexpr const GUID& ncfIdOf(const IUncompressedImageProvider*) {
    return IID_IUncompressedImageProvider;
}
constexpr const GUID& ncfIdOf(const IUncompressedAudioProvider*) {
    return IID_IUncompressedAudioProvider;
}
constexpr const GUID& ncfIdOf(const ISampleMapping*) {
    return IID_ISampleMapping;
}

}  // namespace NMA
