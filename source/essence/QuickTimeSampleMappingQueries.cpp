// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Questions about the stored samples of a track. The host counts samples from
// zero and the clip from one; each operation adds the one in its own width,
// which the host relies on. Nothing here takes the lock or remembers anything.

#include <cstring>

#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// The number as 32 bits with one added or taken off, widened with its sign.
ncfUInt64 Narrowed(ncfUInt64 sample, ncfUInt32 step) {
    const auto sum = static_cast<ncfUInt32>(static_cast<ncfUInt32>(sample) + step);
    return static_cast<ncfUInt64>(static_cast<ncfSInt64>(static_cast<ncfSInt32>(sum)));
}
ncfUInt64 NarrowedPlusOne(ncfUInt64 sample) {
    return Narrowed(sample, 1);
}
ncfUInt64 NarrowedMinusOne(ncfUInt64 sample) {
    return Narrowed(sample, 0xFFFFFFFFu);
}

// What the host is told about a sample of each kind.
struct SampleKind {
    ncfUInt32 sampleFlags;
    ncfUInt64 flags;
    ncfUInt32 numDependencies;
};
constexpr SampleKind kSampleKinds[] = {
    {QTWrapper::kQTWSampleSync, 1024, 0},
    {QTWrapper::kQTWSampleDisposable, 4096, 2},
    {QTWrapper::kQTWSampleDependent, 2048, 1},
};

NCFRESULT NotImplemented(const char* operation) {
    constexpr ncfUInt32 detail = 8;
    PluginLogger().Write(detail, "QuickTimeSampleMapping::%s: Not Implemented", operation);
    return NCF_E_NOTIMPL;
}

bool IsBelow(ncfUInt64 left, ncfUInt64 right) {
    return static_cast<ncfSInt64>(left) < static_cast<ncfSInt64>(right);
}

}  // namespace

// --- tracks ------------------------------------------------------------------------

// The count is the answer itself; a failure is told from it by its sign.
ncfSInt32 QuickTimeSampleMapping::GetNumberOfTracks() {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfTracks");
    return ResultOf([&]() -> NCFRESULT {
        if (!media_) {
            return NMA_E_NOTINITIALIZED;
        }
        ncfUInt32 trackCount = 0;
        NCF_RETURN(media_->GetTrackCount(&trackCount));
        return static_cast<NCFRESULT>(trackCount);
    });
}

// The number comes from the movie wrapper, also for a clip that was opened by
// its headers.
NCFRESULT QuickTimeSampleMapping::GetNumberOfChannels(ncfUInt32 trackNMA, ncfUInt32* numChannels) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfChannels");
    return ResultOf([&]() -> NCFRESULT {
        CHK_PTR(numChannels);
        *numChannels = 1;
        std::tr1::shared_ptr<MediaTrack> track;
        NCF_RETURN(GetMediaTrack(trackNMA, track));
        if (!IsAudioTrack(*track)) {
            return NCF_OK;
        }
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
        NCF_RETURN(media_->GetQuickTimeInterface(qtWrapper));
        NCF_RETURN_TEXT(
            "qtWrapper->GetAudioInfoForTrack(trackQT, numChannels, NULL, NULL, NULL, NULL, NULL, "
            "NULL, NULL, NULL)",
            qtWrapper->GetAudioInfoForTrack(trackQT, numChannels, nullptr, nullptr, nullptr,
                                            nullptr, nullptr, nullptr, nullptr, nullptr));
        return NCF_OK;
    });
}

// --- samples -------------------------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::GetNumberOfSamples(ncfUInt32 trackNMA, ncfUInt64* numSamples) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfSamples");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(numSamples);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        NCF_RETURN(media_->GetNumSamples(trackQT, numSamples));
        return NCF_OK;
    });
}

// A size has 32 bits; the rest of the caller's variable stays as it is.
NCFRESULT QuickTimeSampleMapping::GetSampleSize(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                ncfUInt64* sizeInBytesPtr) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetSampleSize");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(sizeInBytesPtr);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt32 size = 0;
        NCF_RETURN_TEXT(
            "media_->GetDataSizePerSample(trackQT, (long)sample + 1, (ncfUInt32*)sizeInBytesPtr)",
            media_->GetDataSizePerSample(trackQT, NarrowedPlusOne(sample), &size));
        std::memcpy(sizeInBytesPtr, &size, sizeof size);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeSampleMapping::GetSamplePosition(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                    ncfUInt64* positionInBytes) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetSamplePosition");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(positionInBytes);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt64 tmpPositionInBytes = 0;
        NCF_RETURN(media_->GetDataOffset(trackQT, sample + 1, &tmpPositionInBytes));
        *positionInBytes = tmpPositionInBytes;
        return NCF_OK;
    });
}

NCFRESULT QuickTimeSampleMapping::GetSampleProperties(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                      ncfUInt64* flagsPtr,
                                                      ncfUInt32* numDependenciesPtr) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetSampleProperties");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(flagsPtr);
        CHK_INARG(numDependenciesPtr);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt32 sampleFlags = 0;
        NCF_RETURN_TEXT("media_->GetSampleFlags(trackQT, (long)sample + 1, &sampleFlags)",
                        media_->GetSampleFlags(trackQT, NarrowedPlusOne(sample), &sampleFlags));
        for (const SampleKind& kind : kSampleKinds) {
            if (kind.sampleFlags == sampleFlags) {
                *flagsPtr = kind.flags;
                *numDependenciesPtr = kind.numDependencies;
                return NCF_OK;
            }
        }
        return NCF_E_FAIL;
    });
}

// --- runs of samples -------------------------------------------------------------------

// The clip names the sample behind the run, counted from one. A sample that is
// its own end gives -1, with success.
NCFRESULT QuickTimeSampleMapping::GetNumberOfContiguousSamples(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                               ncfSInt64* numSamples) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfContiguousSamples");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(numSamples);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt32 trackType = 0;
        NCF_RETURN(media_->GetTrackType(trackQT, &trackType));
        if (trackType == kTrackVideo) {
            *numSamples = 1;
            return NCF_OK;
        }
        // A track without such a table has runs of one.
        ncfUInt64 lastSample = 0;
        const NCFRESULT found =
            media_->GetNextDiscontiguousDataAttributeChange(trackQT, sample + 1, &lastSample);
        *numSamples = found == NCF_OK ? static_cast<ncfSInt64>(lastSample - 1 - sample) : 1;
        if (!IsBelow(lastSample, sample)) {
            return NCF_OK;
        }
        if (lastSample == 0) {
            *numSamples = 0;
            return NCF_OK;
        }
        return NCF_E_UNEXPECTED;
    });
}

NCFRESULT QuickTimeSampleMapping::GetNumberOfContiguousBytes(ncfUInt32 trackNMA, ncfUInt64 sample,
                                                             ncfUInt64* numBytes) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetNumberOfContiguousBytes");
    return ResultOf([&]() -> NCFRESULT {
        CHK_INARG(numBytes);
        ncfUInt32 trackQT = 0;
        NCF_RETURN(AAFTrackToQuickTimeTrack(trackNMA, &trackQT));
        ncfUInt64 lastSample = 0;
        NCF_RETURN(
            media_->GetNextDiscontiguousDataAttributeChange(trackQT, sample + 1, &lastSample));
        if (IsBelow(lastSample, sample)) {
            if (lastSample != 0) {
                return NCF_E_UNEXPECTED;
            }
            *numBytes = 0;
            return NCF_OK;
        }
        ncfUInt64 startPosition = 0;
        NCF_RETURN(media_->GetDataOffset(trackQT, sample + 1, &startPosition));
        ncfUInt64 lastPosition = 0;
        NCF_RETURN(media_->GetDataOffset(trackQT, lastSample - 1, &lastPosition));
        ncfUInt32 lastSize = 0;
        NCF_RETURN_TEXT(
            "media_->GetDataSizePerSample(trackQT, (long)lastSample-1, &lastSize)",
            media_->GetDataSizePerSample(trackQT, NarrowedMinusOne(lastSample), &lastSize));
        *numBytes = lastPosition - startPosition + lastSize;
        return NCF_OK;
    });
}

// --- encoded units: one sample each -------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::GetEncodedUnitSizeInSamples(ncfUInt32, ncfUInt64,
                                                              ncfUInt64* sizeInSamples) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetEncodedUnitSizeInSamples");
    CHK_INARG(sizeInSamples);
    *sizeInSamples = 1;
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::GetEncodedUnitFirstSample(ncfUInt32, ncfUInt64 unit,
                                                            ncfUInt64* sample) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetEncodedUnitFirstSample");
    CHK_INARG(sample);
    *sample = unit;
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::GetEncodedUnitContainingSample(ncfUInt32, ncfUInt64 sample,
                                                                 ncfUInt64* unit) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::GetEncodedUnitContainingSample");
    CHK_INARG(unit);
    *unit = sample;
    return NCF_OK;
}

// These go through the interface, so that a class which changes the sample
// operations changes them as well.
NCFRESULT QuickTimeSampleMapping::GetNumberOfEncodedUnits(ncfUInt32 trackNMA, ncfUInt64* numUnits) {
    return static_cast<ISampleMapping*>(this)->GetNumberOfSamples(trackNMA, numUnits);
}
NCFRESULT QuickTimeSampleMapping::GetEncodedUnitStride(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                       ncfUInt64* stride) {
    return static_cast<ISampleMapping*>(this)->GetSampleStride(trackNMA, unit, stride);
}
NCFRESULT QuickTimeSampleMapping::GetEncodedUnitPosition(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                         ncfUInt64* position) {
    return static_cast<ISampleMapping*>(this)->GetSamplePosition(trackNMA, unit, position);
}
NCFRESULT QuickTimeSampleMapping::GetEncodedUnitSize(ncfUInt32 trackNMA, ncfUInt64 unit,
                                                     ncfUInt64* size) {
    return static_cast<ISampleMapping*>(this)->GetSampleSize(trackNMA, unit, size);
}
NCFRESULT QuickTimeSampleMapping::GetNumberOfContiguousEncodedUnits(ncfUInt32 trackNMA,
                                                                    ncfUInt64 unit,
                                                                    ncfSInt64* numUnits) {
    return static_cast<ISampleMapping*>(this)->GetNumberOfContiguousSamples(trackNMA, unit,
                                                                            numUnits);
}

// --- refused, and told ----------------------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::GetSampleStride(ncfUInt32, ncfUInt64, ncfUInt64*) {
    return NotImplemented("GetSampleStride");
}
NCFRESULT QuickTimeSampleMapping::GetSampleDependency(ncfUInt32, ncfUInt64, ncfUInt32, ncfSInt64*) {
    return NotImplemented("GetSampleDependency");
}
NCFRESULT QuickTimeSampleMapping::RegisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) {
    return NotImplemented("RegisterSampleRangeHint");
}
NCFRESULT QuickTimeSampleMapping::UnregisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) {
    return NotImplemented("UnregisterSampleRangeHint");
}
NCFRESULT QuickTimeSampleMapping::SetStorageCallback(INCFUnknown*) {
    return NotImplemented("SetStorageCallback");
}

}  // namespace NMA::Impl
