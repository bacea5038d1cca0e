// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The functions of host_quicktime for a program that does not link it: each loads the library
// when it is first called.

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/quicktime/loading/MovieLibrary.h"
#include "reference_host/system/Paths.h"
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
        loading.problem = system::PathText(file) + " is not the library of this program";
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

const MovieLibrary& Library() {
    if (!Loaded().library) {
        throw MovieLibraryMissing(Loaded().problem);
    }
    return *Loaded().library;
}

}  // namespace

Ref<QTWrapper::IQuickTimeWrapper> MakeQuickTimeWrapper() {
    return Library().makeWrapper();
}

Ref<QuickTime::IQuickTimeProperty> MakeQuickTimeProperty() {
    return Library().makeProperty();
}

std::string OpenProblem(const std::filesystem::path& path) {
    return Library().openProblem(path);
}

CodecProblem DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place) {
    return Library().decoderProblemOfKind(path, ofSound, place);
}

CodecProblem DecoderProblem(const std::filesystem::path& path, std::size_t track) {
    return Library().decoderProblemOfTrack(path, track);
}

std::string RasterProblem(const std::filesystem::path& path) {
    return Library().rasterProblem(path);
}

DisplayMatrix DisplayMatrixOf(const std::filesystem::path& movie) {
    return Library().displayMatrix(movie);
}

std::unique_ptr<Thumbnails> OpenThumbnails(const std::filesystem::path& movie) {
    return Library().openThumbnails(movie);
}

bool AreCodedAlone(const std::filesystem::path& movie) {
    return Library().areCodedAlone(movie);
}

}  // namespace host
