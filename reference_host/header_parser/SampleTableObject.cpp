// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SampleTableObject.h"

#include "reference_host/framework/Guard.h"

namespace header_parser {

template <typename Value, typename Read>
NCFRESULT SampleTableObject::ForSample(ncfUInt64 sample, Value* out, Read read) const {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    if (sample == 0 || sample > table_->Count()) {
        return NCF_E_INVALIDARG;
    }
    *out = read(static_cast<ncfUInt32>(sample - 1));
    return NCF_OK;
}

NCFRESULT SampleTableObject::GetNumSamples(ncfUInt64* numSamples) {
    return host::Give(table_->Count(), numSamples);
}

NCFRESULT SampleTableObject::GetDataOffset(ncfUInt64 sample, ncfUInt64* position) {
    return ForSample(sample, position, [&](ncfUInt32 i) { return table_->PositionOf(i); });
}

NCFRESULT SampleTableObject::GetSampleFlags(ncfUInt64 sample, ncfUInt32* flags) {
    return ForSample(sample, flags, [&](ncfUInt32 i) -> ncfUInt32 {
        if (table_->IsSync(i)) {
            return kQTSampleSync;
        }
        return table_->IsDisposable(i) ? kQTSampleDisposable : kQTSampleDependent;
    });
}

NCFRESULT SampleTableObject::GetNextDiscontiguousDataAttributeChange(ncfUInt64 sample,
                                                                     ncfUInt64* next) {
    return ForSample(sample, next,
                     [&](ncfUInt32 i) { return ncfUInt64{table_->NextBreak(i)} + 1; });
}

NCFRESULT SampleTableObject::GetDataSizePerSample(ncfUInt64 sample, ncfUInt32* bytes) {
    return ForSample(sample, bytes, [&](ncfUInt32 i) { return table_->Sizes().SizeOf(i); });
}

NCFRESULT SampleTableObject::GetDisplayOffset(ncfUInt64 sample, ncfSInt64* offset) {
    return ForSample(sample, offset,
                     [&](ncfUInt32 i) { return table_->Times().DisplayOffsetOf(i); });
}

NCFRESULT SampleTableObject::GetDecodeDuration(ncfUInt64 sample, ncfSInt64* duration) {
    return ForSample(sample, duration,
                     [&](ncfUInt32 i) { return ncfSInt64{table_->Times().DurationOf(i)}; });
}

NCFRESULT SampleTableObject::GetMaxDataSizeInBytes(ncfUInt32* bytes) {
    return host::Give(table_->Count() == 0 ? 0 : table_->Sizes().Largest(), bytes);
}

NCFRESULT SampleTableObject::GetHasOutOfOrderFrameDependencies(ncfBool* outOfOrder) {
    return host::Give(table_->Times().IsReordered(), outOfOrder);
}

NCFRESULT SampleTableObject::GetChunkFromTheMiddle(ncfUInt64* position, ncfUInt64* size) {
    if (position == nullptr || size == nullptr) {
        return NCF_E_POINTER;
    }
    const ChunkMap& chunks = table_->Chunks();
    if (chunks.Count() == 0) {
        return NMA_E_NODATA;
    }
    const ChunkMap::Place place = chunks.PlaceOfChunk(chunks.Count() / 2);
    *position = chunks.PositionOf(place.chunk);
    *size = table_->Sizes().BytesOf(place.firstSample, place.samples);
    return NCF_OK;
}

NCFRESULT SampleTableObject::DisplayTimeToFrameNum(ncfUInt64 displayTime, ncfUInt64* sample) {
    ncfUInt32 shown = 0;
    const bool isShown = sample != nullptr && table_->Times().SampleShownAt(displayTime, shown);
    return sample != nullptr && !isShown ? NMA_E_NODATA : host::Give(ncfUInt64{shown} + 1, sample);
}

}  // namespace header_parser
