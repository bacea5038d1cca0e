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
        const NCFRESULT read = PathFrom(path, file);
        if (read < 0) {
            return read;
        }
        std::string reason;
        const auto movie = MovieFile::Open(file, reason);
        if (!movie) {
            return NCF_E_FAIL;
        }
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
    if (!codes || !count) {
        return NCF_E_POINTER;
    }
    *codes = nullptr;
    if (!pixels_) {
        return NMA_E_NOTINITIALIZED;
    }
    return Guarded([&] {
        const std::size_t bytes = pixels_->layouts.size() * sizeof(ncfUInt32);
        const Ref<Buffer> buffer = MakeRef<Buffer>();
        void* start = nullptr;
        NCFRESULT result = buffer->Allocate(bytes, alignof(ncfUInt32));
        result = result < 0 ? result : buffer->GetBufferPointer(&start);
        if (result < 0) {
            return result;
        }
        if (bytes > 0) {
            std::memcpy(start, pixels_->layouts.data(), bytes);
        }
        *count = static_cast<ncfUInt32>(pixels_->layouts.size());
        *codes = Ref<INCFBuffer>(buffer).Detach();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeProperty::GetCodecName(ncfUInt32 codecType, INCFString* name) {
    if (!name) {
        return NCF_E_POINTER;
    }
    std::string text;
    const NCFRESULT result = CodecName(codecType, text);
    if (result < 0) {
        return result;
    }
    return name->AssignUTF8(kNCFUTF8, text.c_str(), static_cast<ncfUInt32>(text.size()));
}

NCFRESULT QuickTimeProperty::GetCodecStorageType(ncfUInt32* type) {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (!type) {
        return NCF_E_POINTER;
    }
    if (!pixels_) {
        return NMA_E_NOTINITIALIZED;
    }
    *type = pixels_->storage;
    return NCF_OK;
}

// 'BGRA' comes in full range always.
NCFRESULT QuickTimeProperty::DoesCodecSupportRGB_CCIR(ncfUInt32* flag) {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (!flag) {
        return NCF_E_POINTER;
    }
    if (!pixels_) {
        return NMA_E_NOTINITIALIZED;
    }
    *flag = 0;
    return NCF_OK;
}

}  // namespace host
