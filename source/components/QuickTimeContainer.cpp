// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeContainer.h"

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/util/NMAString.h"
#include "source/aaf/NewAAFFromMovie.h"
#include "source/clips/LoadMedia.h"
#include "source/components/FileTypes.h"
#include "source/components/HostServices.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/PluginLogger.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// What every container can do, and the two ways of access of which the host
// prefers one.
constexpr ncfUInt32 kCapabilities = 16387;
constexpr ncfUInt32 kPreferredAccess = 512;
constexpr ncfUInt32 kOtherAccess = 256;

NCFSmartPtr<INCFString> NewString(const ncfUTF16LiteralToUTF16& text) {
    NCFSmartPtr<INCFString> string;
    ThrowIfFailed(NMAString::CreateString(string.outArg()));
    ThrowIfFailed(string->AssignUTF16(kNCFUTF16, text.GetUTF16(), kNCFZeroTerminated));
    return string;
}

}  // namespace

NCFRESULT QuickTimeContainer::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        TakeComponentFactory(host, componentFactory_);
        TakeConsole(host, console_);
        // A host without it answers GetCapabilities with the default.
        (void)ncfCreate(componentFactory_.inArg(), CompID_Capability, IID_INCFCapability,
                        settings_);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeContainer::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<IMediaContainer, IMediaContainer2, IMediaContainer3, IAAFClips>(
        this, iid, out);
}

// Without a guard: a file that can't be opened is told by
// the exception itself.
NCFRESULT QuickTimeContainer::IsContainerSupported() {
    const NCFSmartPtr<INCFString> filePath = filePath_;
    const NCFSmartPtr<INCFConsole> console = console_;
    const NCFSmartPtr<INCFComponentFactory> componentFactory = componentFactory_;
    return LoadMedia(filePath, console, componentFactory, media_) == NCF_OK ? 1 : 0;
}

NCFRESULT QuickTimeContainer::GetAAFMasterClips(IAAFClips** ppClips) {
    NCF_FUNCTION("NMA::Impl::QuickTimeContainer::GetAAFMasterClips");
    return ResultOf([&]() -> NCFRESULT {
        if (ppClips) {
            *ppClips = nullptr;
        }
        if (filePath_->IsEmpty()) {
            return NMA_E_NOTINITIALIZED;
        }
        if (!media_) {
            NCF_RETURN(LoadMedia(filePath_, console_, componentFactory_, media_));
        }
        IAAFSmartPointer<IAAFFile> described;
        NCF_RETURN_TEXT("NewAAFFromMovie(media_, console_, &aafFile_, componentFactory_)",
                        NewAAFFromMovie(media_, console_, &described, componentFactory_.inArg()));
        aafFile_ = described;
        slog::Progress(ncfFunction) << "NewAAFFromMovie completed successfully!";
        if (!ppClips) {
            return NCF_E_POINTER;
        }
        NCF_RETURN_TEXT("QueryInterface(NMA::IID_IAAFClips, (void**)ppClips)", [&] {
            void* clips = nullptr;
            const NCFRESULT answered = QueryInterface(NMA::IID_IAAFClips, &clips);
            *ppClips = static_cast<IAAFClips*>(clips);
            return answered;
        }());
        return NCF_OK;
    });
}

NCFRESULT QuickTimeContainer::SetFilePath(INCFString* path) {
    NCF_FUNCTION("NMA::Impl::QuickTimeContainer::SetFilePath");
    return ResultOf([&]() -> NCFRESULT {
        if (!filePath_.isNull() && !filePath_->IsEmpty()) {
            ThrowIfFailed(NMA_E_ALREADYSET);
        }
        if (!path) {
            ThrowIfFailed(NCF_E_POINTER);
        }
        ThrowIfFailed(path->ConvertCopy(kNCFWCHAR, filePath_.outArg()));
        NCF_RETURN(ConvertSlashesInPlace(filePath_));
        wchar_t* ppwcharStr = nullptr;
        NCF_RETURN(filePath_->GetRawWCHAR(&ppwcharStr));
        const NMAString utf8Path(filePath_.inArg(), kNCFUTF8);
        slog::Progress(ncfFunction) << utf8Path.GetUTF8String();
        PluginLogger().Write(8, "Container File Path = %s", utf8Path.GetUTF8String());
        return NCF_OK;
    });
}

// Each call makes a mapping of its own; all of them share the clip.
NCFRESULT QuickTimeContainer::GetSampleMapping(ISampleMapping** ppSampleMapping) {
    NCF_FUNCTION("NMA::Impl::QuickTimeContainer::GetSampleMapping");
    return ResultOf([&]() -> NCFRESULT {
        if (ppSampleMapping) {
            *ppSampleMapping = nullptr;
        }
        if (filePath_.isNull() || filePath_->IsEmpty()) {
            return NMA_E_NOTINITIALIZED;
        }
        if (!ppSampleMapping) {
            return NCF_E_POINTER;
        }
        NCFSmartPtr<ISampleMapping> created;
        NCF_RETURN_TEXT(
            "componentFactory_->CreateComponent(NMA::CompID_QuickTimeSampleMapping, NULL, "
            "IID_ISampleMapping, (void**)ppSampleMapping)",
            ncfCreate(componentFactory_.inArg(), NMA::CompID_QuickTimeSampleMapping,
                      IID_ISampleMapping, created));
        auto* const pSampleMapping = dynamic_cast<QuickTimeSampleMapping*>(created.inArg());
        if (!pSampleMapping) {
            if (console_) {
                console_->Write(1, "Failed to create a QuickTimeSampleMapping component.");
            }
            return NCF_E_UNEXPECTED;
        }
        NCF_RETURN(pSampleMapping->SetFilePath(filePath_));
        if (!media_) {
            NCF_RETURN(LoadMedia(filePath_, console_, componentFactory_, media_));
        }
        NCF_RETURN(pSampleMapping->SetMediaContainer(media_));
        *ppSampleMapping = created.detach();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeContainer::GetCapabilities(ncfUInt32* flags) {
    if (!flags) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        ncfUInt32 value = 0;
        if (!settings_.isNull()) {
            settings_->GetValue(&value);
        }
        *flags = kCapabilities + (value != 0 ? kPreferredAccess : kOtherAccess);
        return NCF_OK;
    });
}

ncfUInt32 QuickTimeContainer::GetFileTypeCount() {
    return kFileTypeCount;
}

NCFRESULT QuickTimeContainer::GetFileType(ncfUInt32 index, INCFString** extension,
                                          INCFString** description, INCFString** group) {
    if (index >= kFileTypeCount) {
        return NCF_E_NOTFOUND;
    }
    return ResultOf([&] {
        struct Column {
            INCFString** out;
            const ncfUTF16LiteralToUTF16& text;
            NCFSmartPtr<INCFString> made;
        };
        const FileType& row = FileTypeAt(index);
        Column columns[] = {{extension, row.extension, {}},
                            {description, row.description, {}},
                            {group, FileTypeGroup(), {}}};
        for (Column& column : columns) {
            if (column.out) {
                *column.out = nullptr;
            }
        }
        // All strings are made before one is handed out, so that a failure
        // leaves the caller with none.
        for (Column& column : columns) {
            if (column.out) {
                column.made = NewString(column.text);
            }
        }
        for (Column& column : columns) {
            if (column.out) {
                *column.out = column.made.detach();
            }
        }
        return NCF_OK;
    });
}

NCFRESULT QuickTimeContainer::GetMetadata(ncfSInt32 index, IAAFFile** ppData) {
    return ResultOf([&]() -> NCFRESULT {
        if (ppData) {
            *ppData = nullptr;
        }
        if (index != 0) {
            return NCF_E_NOTFOUND;
        }
        if (!ppData) {
            return NCF_OK;
        }
        if (!aafFile_) {
            return NMA_E_NOTINITIALIZED;
        }
        *ppData = aafFile_;
        (*ppData)->AddRef();
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
