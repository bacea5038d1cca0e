// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <dlfcn.h>
#include <elf.h>
#include <link.h>

#include <algorithm>

#include "reference_host/system/SharedLibrary.h"

namespace host::system {
namespace {

// What the library says of itself to the system's loader.
class DynamicSection {
public:
    explicit DynamicSection(const link_map& map) : map_(map) {}

    // An address there, null where the library has none of this kind.
    template <class Value>
    const Value* Find(ElfW(Sxword) tag) const {
        for (const ElfW(Dyn)* entry = map_.l_ld; entry->d_tag != DT_NULL; ++entry) {
            if (entry->d_tag == tag) {
                // The loader has put the library's own address in, on some systems.
                const ElfW(Addr) address = entry->d_un.d_ptr;
                return reinterpret_cast<const Value*>(address < map_.l_addr ? address + map_.l_addr
                                                                            : address);
            }
        }
        return nullptr;
    }

private:
    const link_map& map_;
};

struct SymbolRange {
    std::size_t first = 0;
    std::size_t end = 0;
};

// The table by which others look names up holds what is defined, and nothing else.
SymbolRange DefinedSymbols(const std::uint32_t* table) {
    const std::uint32_t buckets = table[0];
    const std::uint32_t first = table[1];
    const std::uint32_t wordsOfFilter = table[2];
    const std::uint32_t* const heads = table + 4 + wordsOfFilter * (sizeof(ElfW(Addr)) / 4);
    const std::uint32_t* const chains = heads + buckets;
    const std::uint32_t last = *std::max_element(heads, heads + buckets);
    if (buckets == 0 || last < first) {
        return {first, first};
    }
    std::size_t end = last;
    while ((chains[end - first] & 1) == 0) {
        ++end;
    }
    return {first, end + 1};
}

}  // namespace

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

std::vector<std::string> SharedLibrary::Exports() const {
    link_map* map = nullptr;
    if (handle_ == nullptr || dlinfo(handle_, RTLD_DI_LINKMAP, &map) != 0) {
        return {};
    }
    const DynamicSection section(*map);
    const auto* const symbols = section.Find<ElfW(Sym)>(DT_SYMTAB);
    const auto* const names = section.Find<char>(DT_STRTAB);
    const auto* const quick = section.Find<std::uint32_t>(DT_GNU_HASH);
    const auto* const plain = section.Find<std::uint32_t>(DT_HASH);
    if (symbols == nullptr || names == nullptr || (quick == nullptr && plain == nullptr)) {
        return {};
    }
    const SymbolRange range = quick != nullptr ? DefinedSymbols(quick) : SymbolRange{1, plain[1]};
    std::vector<std::string> exports;
    for (std::size_t i = range.first; i < range.end; ++i) {
        if (symbols[i].st_shndx != SHN_UNDEF) {
            exports.emplace_back(names + symbols[i].st_name);
        }
    }
    return exports;
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
