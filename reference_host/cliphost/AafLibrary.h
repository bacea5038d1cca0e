// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <functional>
#include <optional>

#include "host_interfaces/aaf/AAFExports.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "reference_host/cliphost/AafQuery.h"
#include "reference_host/system/SharedLibrary.h"

namespace cliphost {

// The AAF run-time library of this process. It is loaded before the module, so
// that the module, which asks for it by its bare name, gets the same one: the
// system answers that name with the library that is loaded already.
class AafLibrary {
public:
    // Loads a file. Throws a Failure that names it when it can't be used.
    explicit AafLibrary(const std::filesystem::path& file);

    const std::filesystem::path& file() const { return file_; }

    // Makes files reproducible: every time stamp and generation id that the
    // library makes up is this one. false when the library has no such thing.
    bool PinTime(const aafTimeStamp_t& time);

    // Saves a copy of a file with the published calls. An existing file is
    // replaced once the new one is whole; a device is written. Throws a Failure,
    // or ReaderGone.
    void Save(IAAFFile* file, const std::filesystem::path& path) const;
    // Saves a file anew with what `edit` changes in it; all else stays as it is in `source`, which
    // may be the same path. The same Failures, and those of `edit`.
    void SaveEdited(const std::filesystem::path& source, const std::filesystem::path& path,
                    const std::function<void(IAAFFile*)>& edit) const;
    // The bytes of a saved file elsewhere, which may be the same path.
    void SaveAsItIs(const std::filesystem::path& source, const std::filesystem::path& path) const;
    // Throws that Failure early for a path where nothing can be saved, and leaves nothing there.
    void TryToSave(const std::filesystem::path& path) const;
    // A new file in memory. Throws a Failure.
    host::Ref<IAAFFile> OpenTransient() const;
    // Opens a saved file for reading. Throws a Failure, the caller's for one that can't be reached.
    host::Ref<IAAFFile> Open(const std::filesystem::path& path) const;

    // The library's own text for one of its codes, empty when it has none.
    std::string TextOfResult(HRESULT result) const;
    std::string Version() const;

private:
    using Write = std::function<void(const std::filesystem::path&)>;
    void WriteToDevice(const std::filesystem::path& device, const Write& write) const;
    class Steps;
    template <class Function>
    Function find(const char* name) const {
        return reinterpret_cast<Function>(library_.Find(name));
    }

    std::filesystem::path file_;
    host::system::SharedLibrary library_;
};

}  // namespace cliphost
