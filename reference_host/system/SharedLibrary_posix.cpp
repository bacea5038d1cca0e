// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <dlfcn.h>

#include "reference_host/system/SharedLibrary.h"

namespace host::system {

SharedLibrary::~SharedLibrary() {
    Close();
}

bool SharedLibrary::Open(const std::filesystem::path& file, std::string& reason) {
    Close();
    // A bare name would be searched for in the system's folders.
    std::error_code failure;
    const std::filesystem::path whole = std::filesystem::absolute(file, failure);
    handle_ = dlopen(whole.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (handle_ == nullptr) {
        const char* text = dlerror();
        reason = text == nullptr ? "unknown reason" : text;
    }
    return handle_ != nullptr;
}

void SharedLibrary::Close() {
    if (handle_ != nullptr) {
        dlclose(handle_);
        handle_ = nullptr;
    }
}

void* SharedLibrary::Find(const char* name) const {
    return handle_ == nullptr ? nullptr : dlsym(handle_, name);
}

bool SharedLibrary::IsFoundAs(const char* name) const {
    void* const found = dlopen(name, RTLD_NOW | RTLD_NOLOAD);
    if (found != nullptr) {
        dlclose(found);
    }
    return handle_ != nullptr && found == handle_;
}

std::filesystem::path FileOfCode(const void* code) {
    Dl_info info{};
    if (dladdr(code, &info) == 0 || info.dli_fname == nullptr) {
        return {};
    }
    return info.dli_fname;
}

}  // namespace host::system
