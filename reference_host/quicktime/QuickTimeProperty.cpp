// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/QuickTimeProperty.h"

#include <cstring>

#include "reference_host/framework/Buffer.h"
#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/CodecNames.h"
#include "reference_host/quicktime/MovieFile.h"

namespace host {

NCFRESULT QuickTimeProperty::CreateMovie(INCFString* path) {
    const std::lock_guard<std::mutex> lock(mutex_);
    pixels_.reset();
    return Guarded([&] {
        std::filesystem::path file;
        Check(PathFrom(path, file));
        std::string reason;
        const auto movie = MovieFile::Open(file, reason);
        Need(movie, NCF_E_FAIL);
        const ncfUInt32 track = movie->FirstVideo();
        pixels_ = std::make_unique<CodecPixels>();
        if (track != 0) {
            const AVStream* const stream = movie->FindDetailedTrack(track);
            *pixels_ = PixelsOf(static_cast<AVPixelFormat>(stream->codecpar->format));
        }
        return NCF_OK;
    });
}

NCFRESULT QuickTimeProperty::GetCodecPixelFormats(INCFBuffer** codes, ncfUInt32* count) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        Need(codes && count);
        *codes = nullptr;
        Need(pixels_, NMA_E_NOTINITIALIZED);
        const std::size_t bytes = pixels_->layouts.size() * sizeof(ncfUInt32);
        const Ref<Buffer> buffer = MakeRef<Buffer>();
        void* start = nullptr;
        Check(buffer->Allocate(bytes, alignof(ncfUInt32)));
        Check(buffer->GetBufferPointer(&start));
        if (bytes > 0) {
            std::memcpy(start, pixels_->layouts.data(), bytes);
        }
        *count = static_cast<ncfUInt32>(pixels_->layouts.size());
        *codes = Ref<INCFBuffer>(buffer).Detach();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeProperty::GetCodecName(ncfUInt32 codecType, INCFString* name) {
    return Guarded([&] {
        Need(name);
        std::string text;
        Check(CodecName(codecType, text));
        return name->AssignUTF8(kNCFUTF8, text.c_str(), static_cast<ncfUInt32>(text.size()));
    });
}

NCFRESULT QuickTimeProperty::GiveOfCodec(ncfUInt32 CodecPixels::*fact, ncfUInt32* out) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return out && !pixels_ ? NMA_E_NOTINITIALIZED
                           : Give(fact && pixels_ ? (*pixels_).*fact : 0, out);
}

NCFRESULT QuickTimeProperty::GetCodecStorageType(ncfUInt32* type) {
    return GiveOfCodec(&CodecPixels::storage, type);
}

// 'BGRA' comes in full range always.
NCFRESULT QuickTimeProperty::DoesCodecSupportRGB_CCIR(ncfUInt32* flag) {
    return GiveOfCodec(nullptr, flag);
}

}  // namespace host
