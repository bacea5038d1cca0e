// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Paths.h"
#include "reference_host/system/SharedLibrary.h"

#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

// What a library that is mapped says of itself.
class MappedImage {
public:
    explicit MappedImage(HMODULE module) : begin_(reinterpret_cast<const unsigned char*>(module)) {}

    // Null when it exports nothing.
    const IMAGE_EXPORT_DIRECTORY* Exports() const {
        const auto* const headers =
            At<IMAGE_NT_HEADERS>(static_cast<DWORD>(At<IMAGE_DOS_HEADER>(0)->e_lfanew));
        const IMAGE_DATA_DIRECTORY& place =
            headers->OptionalHeader.DataDirectory[IMAGE_DIRECTORY_ENTRY_EXPORT];
        return place.Size == 0 ? nullptr : At<IMAGE_EXPORT_DIRECTORY>(place.VirtualAddress);
    }

    template <class Value>
    const Value* At(DWORD offset) const {
        return reinterpret_cast<const Value*>(begin_ + offset);
    }

private:
    const unsigned char* begin_;
};

}  // namespace

SharedLibrary::~SharedLibrary() {
    Close();
}

bool SharedLibrary::Open(const std::filesystem::path& file, std::string& reason) {
    Close();
    const std::filesystem::path whole = AbsolutePath(file);
    // What it needs lies beside it, beside the program or with the system.
    handle_ = LoadLibraryExW(whole.c_str(), nullptr,
                             LOAD_LIBRARY_SEARCH_DLL_LOAD_DIR | LOAD_LIBRARY_SEARCH_DEFAULT_DIRS);
    if (handle_ == nullptr) {
        reason = ErrorWords(GetLastError());
    }
    return handle_ != nullptr;
}

void SharedLibrary::Close() {
    if (handle_ != nullptr) {
        FreeLibrary(static_cast<HMODULE>(handle_));
        handle_ = nullptr;
    }
}

void* SharedLibrary::Find(const char* name) const {
    return handle_ == nullptr
               ? nullptr
               : reinterpret_cast<void*>(GetProcAddress(static_cast<HMODULE>(handle_), name));
}

std::vector<std::string> SharedLibrary::Exports() const {
    if (handle_ == nullptr) {
        return {};
    }
    const MappedImage image(static_cast<HMODULE>(handle_));
    const IMAGE_EXPORT_DIRECTORY* const table = image.Exports();
    std::vector<std::string> exports;
    for (DWORD i = 0; table != nullptr && i < table->NumberOfNames; ++i) {
        exports.emplace_back(image.At<char>(image.At<DWORD>(table->AddressOfNames)[i]));
    }
    return exports;
}

bool SharedLibrary::IsFoundAs(const char* name) const {
    const std::wstring wide(name, name + std::char_traits<char>::length(name));
    return handle_ != nullptr && GetModuleHandleW(wide.c_str()) == handle_;
}

std::filesystem::path FileOfCode(const void* code) {
    HMODULE module = nullptr;
    if (!GetModuleHandleExW(
            GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
            static_cast<const wchar_t*>(code), &module)) {
        return {};
    }
    return TextOf(
        [&](wchar_t* text, DWORD size) { return GetModuleFileNameW(module, text, size); });
}

}  // namespace host::system
