// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/CodedAlone.h"
#include "reference_host/quicktime/DisplayMatrix.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "reference_host/quicktime/OpenProblem.h"
#include "reference_host/quicktime/Thumbnails.h"

namespace host {

// All that needs the multimedia library, as one shared library beside the utility library. The
// program loads it when something first asks for it: mapping the multimedia library takes longer
// than listing a folder or describing a movie of the header route.
//
// Programs that link host_quicktime itself have the same functions without it.
struct MovieLibrary {
    decltype(&MakeQuickTimeWrapper) makeWrapper;
    decltype(&MakeQuickTimeProperty) makeProperty;
    decltype(&OpenProblem) openProblem;
    CodecProblem (*decoderProblemOfKind)(const std::filesystem::path&, bool, std::size_t);
    CodecProblem (*decoderProblemOfTrack)(const std::filesystem::path&, std::size_t);
    decltype(&RasterProblem) rasterProblem;
    decltype(&DisplayMatrixOf) displayMatrix;
    decltype(&OpenThumbnails) openThumbnails;
    decltype(&AreCodedAlone) areCodedAlone;
};

// The one function that it exports, and its name.
using GetMovieLibrary = const MovieLibrary*();
inline constexpr char kGetMovieLibrary[] = "CliphostMovieLibrary";
#ifdef _WIN32
inline constexpr char kMovieLibraryName[] = "cliphost-movies.dll";
#else
inline constexpr char kMovieLibraryName[] = "libcliphost-movies.so";
#endif

}  // namespace host
