// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A module that does to its process what a movie might that breaks a decoder: which harm, the
// movie's name says. Everything else it leaves to the real module.

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <string>
#include <thread>
#include <vector>

#include "host_interfaces/framework/PluginEntry.h"
#include "host_interfaces/media/MediaContainer.h"
#include "reference_host/util/Ref.h"
#include "reference_host/util/text/HostText.h"

namespace {

// The real module, loaded when the host first calls this one.
void* RealModule() {
    static void* const module = [] {
        Dl_info own{};
        dladdr(reinterpret_cast<const void*>(&RealModule), &own);
        const auto folder = std::filesystem::path(own.dli_fname).parent_path();
        return dlopen((folder / CLIPHOST_REAL_MODULE).c_str(), RTLD_NOW | RTLD_LOCAL);
    }();
    return module;
}

template <class Function>
Function Real(const char* name) {
    return reinterpret_cast<Function>(dlsym(RealModule(), name));
}

constexpr int kChannel = 3;  // to the parent

void Send(const void* bytes, std::size_t size) {
    if (write(kChannel, bytes, size) < 0) {
        std::perror("channel");
    }
}

// Each line tells whether the system lets it be done.
void Tell(const char* what, bool done) {
    std::fprintf(stderr, "%s: %s\n", what, done ? "done" : "refused");
}

void TryEverything(const std::filesystem::path& movie) {
    Tell("socket", socket(AF_INET, SOCK_STREAM, 0) >= 0);
    char program[] = "/bin/true";
    char* const line[] = {program, nullptr};
    const pid_t child = fork();
    if (child == 0) {
        _exit(0);
    }
    Tell("process", child > 0);
    Tell("signal", kill(getppid(), 0) == 0);
    Tell("new code", mmap(nullptr, 4096, PROT_READ | PROT_EXEC, MAP_PRIVATE | MAP_ANONYMOUS, -1,
                          0) != MAP_FAILED);
    Tell("rights of a file", chmod(movie.c_str(), 0666) == 0);
    Tell("writing the movie", open(movie.c_str(), O_WRONLY) >= 0);
    const std::filesystem::path beside = movie.parent_path() / "beside";
    Tell("a file beside it", open(beside.c_str(), O_WRONLY | O_CREAT, 0666) >= 0);
    Tell("removing the movie", unlink(movie.c_str()) == 0);
    bool ran = false;
    std::thread([&] { ran = true; }).join();
    Tell("thread", ran);
    Tell("reading", open(movie.c_str(), O_RDONLY) >= 0);
    execv(program, line);
    Tell("program", false);
}

void DoHarm(const std::filesystem::path& movie) {
    const std::string harm = movie.stem();
    if (harm == "crash") {
        std::signal(SIGSEGV, SIG_DFL);  // a sanitizer has its own
        std::raise(SIGSEGV);
    } else if (harm == "leave") {
        _exit(3);
    } else if (harm == "hang") {
        for (;;) {
            pause();
        }
    } else if (harm == "hog") {
        std::vector<char> memory(std::size_t{1} << 30);
        std::memset(memory.data(), 1, memory.size());
        std::fprintf(stderr, "%d\n", memory[std::size_t{1} << 29]);
    } else if (harm == "length") {
        const std::array<unsigned char, 8> length = {0xFF, 0xFF, 0xFF, 0xFF,
                                                     0xFF, 0xFF, 0xFF, 0x7F};
        Send(length.data(), length.size());
        pause();
    } else if (harm == "nonsense") {
        const std::array<unsigned char, 12> answer = {4, 0, 0, 0, 0, 0, 0, 0, 'o', 'd', 'd', '!'};
        Send(answer.data(), answer.size());
        pause();
    } else if (harm == "probe") {
        TryEverything(movie);
    } else if (harm == "controls") {
        std::fputs("\x1B[2Jcleared\n", stderr);
    }
}

class Container final : public NMA::IMediaContainer3 {
public:
    explicit Container(host::Ref<NMA::IMediaContainer3> real) : real_(std::move(real)) {}

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        for (const GUID& own : {IID_INCFUnknown, NMA::IID_IMediaContainer,
                                NMA::IID_IMediaContainer2, NMA::IID_IMediaContainer3}) {
            if (iid == own) {
                AddRef();
                *out = static_cast<NMA::IMediaContainer3*>(this);
                return NCF_OK;
            }
        }
        return real_->QueryInterface(iid, out);
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }

    NCFRESULT IsContainerSupported() override { return real_->IsContainerSupported(); }
    NCFRESULT ContainerFlag() override { return real_->ContainerFlag(); }
    NCFRESULT ContainerUnsupportedA(void* a, void* b, void* c) override {
        return real_->ContainerUnsupportedA(a, b, c);
    }
    NCFRESULT GetAAFMasterClips(NMA::IAAFClips** clips) override {
        DoHarm(movie_);
        return real_->GetAAFMasterClips(clips);
    }
    NCFRESULT SetFilePath(INCFString* path) override {
        std::string name = host::text::ReadUtf8(path);
        for (char& c : name) {
            c = c == '\\' ? '/' : c;
        }
        movie_ = name;
        return real_->SetFilePath(path);
    }
    NCFRESULT GetSampleMapping(NMA::ISampleMapping** mapping) override {
        return real_->GetSampleMapping(mapping);
    }
    NCFRESULT ContainerUnsupportedB(void* reserved) override {
        return real_->ContainerUnsupportedB(reserved);
    }
    NCFRESULT GetCapabilities(ncfUInt32* flags) override { return real_->GetCapabilities(flags); }
    ncfUInt32 GetFileTypeCount() override { return real_->GetFileTypeCount(); }
    NCFRESULT GetFileType(ncfUInt32 index, INCFString** extension, INCFString** description,
                          INCFString** group) override {
        return real_->GetFileType(index, extension, description, group);
    }

private:
    ~Container() = default;

    host::Ref<NMA::IMediaContainer3> real_;
    std::filesystem::path movie_;
    ncfUInt32 references_ = 1;
};

class Factory final : public INCFClassFactory {
public:
    explicit Factory(host::Ref<INCFClassFactory> real) : real_(std::move(real)) {}

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        if (iid != IID_INCFUnknown && iid != IID_INCFClassFactory) {
            return NCF_E_NOINTERFACE;
        }
        AddRef();
        *out = this;
        return NCF_OK;
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }
    NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                             void** out) override {
        *out = nullptr;
        host::Ref<NMA::IMediaContainer3> real;
        real_->CreateInstance(host, outer, NMA::IID_IMediaContainer3,
                              reinterpret_cast<void**>(real.Out()));
        if (!real) {
            return real_->CreateInstance(host, outer, iid, out);  // another class
        }
        auto* const container = new Container(real);
        const NCFRESULT result = container->QueryInterface(iid, out);
        container->Release();
        return result;
    }

private:
    ~Factory() = default;

    host::Ref<INCFClassFactory> real_;
    ncfUInt32 references_ = 1;
};

}  // namespace

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** out) {
    return Real<NCFRegisterPluginFunction>("NCFRegisterPlugin")(host, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** out) {
    return Real<NCFRegisterComponentFunction>("NCFRegisterComponent")(host, index, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** out) {
    *out = nullptr;
    host::Ref<INCFClassFactory> real;
    const NCFRESULT made = Real<NCFGetClassFactoryFunction>("NCFGetClassFactory")(
        host, classId, IID_INCFClassFactory, reinterpret_cast<void**>(real.Out()));
    if (made < 0) {
        return made;
    }
    auto* const factory = new Factory(real);
    const NCFRESULT result = factory->QueryInterface(interfaceId, out);
    factory->Release();
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    return Real<NCFCanUnloadNowFunction>("NCFCanUnloadNow")(host);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown* host) {
    return Real<NCFStartupFunction>("NCFStartup")(host);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown* host) {
    return Real<NCFShutdownFunction>("NCFShutdown")(host);
}
