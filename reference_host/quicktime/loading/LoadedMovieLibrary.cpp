// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The functions of host_quicktime for a program that does not link it: each loads the library
// when it is first called.

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/quicktime/loading/MovieLibrary.h"
#include "reference_host/system/SharedLibrary.h"

namespace host {
namespace {

struct Loading {
    const MovieLibrary* library = nullptr;
    std::string problem;
};

Loading Load() {
    const std::filesystem::path utilities =
        system::FileOfCode(reinterpret_cast<const void*>(&GenerateUMIDFromData_Begin));
    const std::filesystem::path file = utilities.parent_path() / kMovieLibraryName;
    system::SharedLibrary shared;
    Loading loading;
    if (!shared.Open(file, loading.problem)) {
        return loading;
    }
    auto* const get = reinterpret_cast<GetMovieLibrary*>(shared.Find(kGetMovieLibrary));
    if (get == nullptr) {
        loading.problem = file.string() + " is not the library of this program";
        return loading;
    }
    loading.library = get();
    shared.Abandon();  // its objects may live to the end of the process
    return loading;
}

const Loading& Loaded() {
    static const Loading loading = Load();
    return loading;
}

const MovieLibrary* Library() {
    return Loaded().library;
}

std::string WhyMissing() {
    return "it can't be loaded: " + Loaded().problem;
}

}  // namespace

Ref<QTWrapper::IQuickTimeWrapper> MakeQuickTimeWrapper() {
    return Library() ? Library()->makeWrapper() : nullptr;
}

Ref<QuickTime::IQuickTimeProperty> MakeQuickTimeProperty() {
    return Library() ? Library()->makeProperty() : nullptr;
}

std::string OpenProblem(const std::filesystem::path& path) {
    return Library() ? Library()->openProblem(path) : WhyMissing();
}

CodecProblem DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place) {
    return Library() ? Library()->decoderProblemOfKind(path, ofSound, place)
                     : CodecProblem{WhyMissing()};
}

CodecProblem DecoderProblem(const std::filesystem::path& path, std::size_t track) {
    return Library() ? Library()->decoderProblemOfTrack(path, track) : CodecProblem{WhyMissing()};
}

std::string RasterProblem(const std::filesystem::path& path) {
    return Library() ? Library()->rasterProblem(path) : WhyMissing();
}

DisplayMatrix DisplayMatrixOf(const std::filesystem::path& movie) {
    return Library() ? Library()->displayMatrix(movie) : DisplayMatrix();
}

}  // namespace host
