// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <filesystem>
#include <limits>
#include <memory>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "host_interfaces/framework/Types.h"

namespace host {

// A small picture: bytes B G R A, in full range, A straight.
struct Thumbnail {
    int width = 0;
    int height = 0;
    std::vector<ncfUInt8> bytes;
};

// How thumbnails are wanted.
struct ThumbnailForm {
    // None is larger than the movie's pictures are; one that can't be made smaller is as large.
    int width = std::numeric_limits<int>::max();
    int height = std::numeric_limits<int>::max();
    // Pictures of one of these matrices are taken for the one that is told, as by those who go by
    // what a format declares.
    enum class Matrix { Own, Rec601, Rec709 };
    Matrix matrix = Matrix::Own;
};

// Small pictures of a movie's first picture track, for people to look at. They cost less than
// those of the wrapper's video reader, from the same samples.
class Thumbnails {
public:
    virtual ~Thumbnails() = default;

    // Of the pictures that the thumbnails are made of.
    virtual int Width() const = 0;
    virtual int Height() const = 0;
    // Pictures that the movie presents.
    virtual std::size_t Count() const = 0;
    // Those of them that decode without any other.
    virtual std::size_t SyncCount() const = 0;

    // For the pictures after that.
    virtual void SetForm(const ThumbnailForm& form) = 0;

    // The picture of that number in display order, or in its place the nearest that decodes
    // without any other. NMA_E_NODATA past the last; NCF_E_FAIL for one that does not decode.
    enum class Which { Exact, NearestSync };
    virtual NCFRESULT Read(std::size_t picture, Which which, Thumbnail& thumbnail) = 0;
};

// Null for a file that can't be opened so, or that has no pictures.
std::unique_ptr<Thumbnails> OpenThumbnails(const std::filesystem::path& movie);

}  // namespace host
