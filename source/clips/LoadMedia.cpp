// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/LoadMedia.h"

#include <cstring>

#include "public_include/SimpleFileIO.h"
#include "source/clips/OtherClip.h"
#include "source/clips/QuickTimeClip.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// Where movies go whose headers the first route doesn't understand. `media`
// keeps the clip of this route, also one that failed.
NCFRESULT LoadMediaBySecondRoute(const char* function, NCFSmartPtr<INCFString> filePath,
                                 NCFSmartPtr<INCFConsole> console,
                                 NCFSmartPtr<INCFComponentFactory> componentFactory,
                                 std::tr1::shared_ptr<BaseClip>& media) {
    slog::Progress(function) << "FAILED!";
    slog::Progress(function) << "try OtherMedia Container... ";
    media.reset(new OtherClip(filePath, console, componentFactory));
    if (media && !media->IsLoaded()) {
        slog::Progress(function) << "FAILED!";
        return NMA_E_NOTINITIALIZED;
    }
    slog::Progress(function) << "succeeded!";
    return NCF_OK;
}

constexpr ncfUInt32 kBufLen = 512;

ncfUInt32 SwappedBytes(ncfUInt32 value) {
    return value >> 24 | (value >> 8 & 0xFF00u) | (value << 8 & 0xFF0000u) | value << 24;
}

}  // namespace

NCFRESULT LoadMedia(NCFSmartPtr<INCFString> filePath, NCFSmartPtr<INCFConsole> console,
                    NCFSmartPtr<INCFComponentFactory> componentFactory,
                    std::tr1::shared_ptr<BaseClip>& media) {
    NCF_FUNCTION("LoadMedia");
    CHK_INARG(filePath.inArg());
    slog::Progress(ncfFunction) << "try QT Container... ";
    media.reset(new QuickTimeClip(filePath, console, componentFactory));
    if (media && !media->IsLoaded()) {
        return LoadMediaBySecondRoute(ncfFunction, filePath, console, componentFactory, media);
    }
    slog::Progress(ncfFunction) << "succeeded!";
    return NCF_OK;
}

NCFRESULT IsQuickTimeContainer(NCFSmartPtr<INCFString> filePath, NCFSmartPtr<INCFConsole> console_,
                               ncfBool* isQTContainer) {
    NCF_FUNCTION("IsQuickTimeContainer");
    CHK_PTR(console_.inArg());
    CHK_PTR(filePath.inArg());
    CHK_PTR(isQTContainer);
    try {
        *isQTContainer = 0;
        if (filePath->IsEmpty()) {
            slog::Error(ncfFunction) << "filePath->IsEmpty() !";
            return NMA_E_NOTINITIALIZED;
        }
        NMA::Impl::SimpleFileIO mediaFile(filePath.inArg());
        ncfUInt8 buffer[kBufLen] = {};
        ncfUInt32 bytesRead = 0;
        // An empty file is answered below.
        const NCFRESULT result = mediaFile.Read(0, buffer, kBufLen, &bytesRead);
        if (result != NMA_E_NODATA) {
            NCF_RETURN_TEXT("mediaFile.Read(0, buffer, kBufLen, &bytesRead)", result);
        }
        if (bytesRead == 0) {
            return NCF_E_FAIL;
        }
        ncfUInt32 fileType = 0;
        ncfUInt32 reversed = 0;
        std::memcpy(&fileType, buffer + 4, sizeof fileType);
        std::memcpy(&reversed, "pytf", sizeof reversed);
        if (fileType == SwappedBytes(reversed)) {
            *isQTContainer = 1;
        }
        return NCF_OK;
    } catch (NCFRESULT result) {
        console_->Write(1, "Throw caught in QuickTimeContainer::IsContainerSupported: %x\n",
                        static_cast<ncfUInt32>(result));
        return result;
    } catch (...) {
        console_->Write(1, "Unknown exception in QuickTimeContainer::IsContainerSupported.\n");
        return NCF_E_UNEXPECTED;
    }
}

// In UTF-32 an element is a character, also beyond the 16-bit range, so that
// the place that is found is the place to write to.
NCFRESULT ConvertSlashesInPlace(NCFSmartPtr<INCFString> filePath) {
    NCF_FUNCTION("ConvertSlashesInPlace");
    constexpr ncfUTF32 rightSlash = 47;
    constexpr ncfUTF32 backslash = 92;
    const ncfUInt32 srcType = filePath->GetEncoding();
    NCF_RETURN(filePath->ConvertTo(kNCFUTF32));
    ncfUTF32* rawUTF32Path = nullptr;
    NCF_RETURN(filePath->GetRawUTF32(&rawUTF32Path));
    ncfSInt32 slashPos = -1;
    while (filePath->FindCharacter(rightSlash, slashPos + 1, 1, &slashPos) >= 0 && slashPos >= 0) {
        NCFASSERT(rawUTF32Path[slashPos] == rightSlash);
        rawUTF32Path[slashPos] = backslash;
    }
    NCF_RETURN(filePath->ConvertTo(srcType));
    return NCF_OK;
}
