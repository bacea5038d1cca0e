// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>

#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/PictureTurn.h"

namespace cliphost {

// A frame that a child process made a file of.
struct MadeFrame {
    std::uint64_t frame = 0;
    std::filesystem::path file;  // gone once it is taken
    int width = 0;
    int height = 0;
    std::uint64_t bytes = 0;  // of a raw frame
};

// Writes a frame as a file: a turned PNG picture, or the bytes as they are delivered. Gives its
// width and height.
MadeFrame WriteFrameFile(const std::filesystem::path& file, std::uint64_t frame,
                         const FrameReader& reader, const FrameReader* alpha,
                         const PictureTurn& turn, bool isRaw);

// Where frames go: each is taken right after it was read.
class FrameSink {
public:
    virtual ~FrameSink() = default;
    // `alpha` holds the same frame of the alpha track, or is null.
    virtual void Take(std::uint64_t frame, const FrameReader& reader, const FrameReader* alpha) = 0;
    // Throws a Failure when it left no file.
    virtual void TakeMade(const MadeFrame& made) = 0;
    virtual std::filesystem::path PlaceOf(std::uint64_t frame) const = 0;
    virtual void Finish() = 0;
    // A line for the user once all is there.
    virtual std::string Summary() const = 0;
    virtual bool IsRaw() const = 0;
};

// Whether a path names a file for raw frames, and no folder.
bool IsRawFile(const std::filesystem::path& output);

// The sink that a path asks for: "-", devices and FILE.raw take the bytes as they
// are delivered, one frame behind the other; FILE.png takes one frame; a folder
// takes a PNG for each, named after the movie and the frame, and is made when
// it is not there. PNG pictures are turned. Throws a Failure for the caller.
std::unique_ptr<FrameSink> MakeFrameSink(const std::filesystem::path& output,
                                         const std::filesystem::path& movie, bool isOneFrame,
                                         const PictureTurn& turn);

// What a program needs to read raw frames: size, layout, rate.
std::string RawWords(const FrameReader& reader, const ClipTrack& track);

}  // namespace cliphost
