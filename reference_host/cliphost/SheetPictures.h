// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <memory>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/Picture.h"
#include "reference_host/cliphost/PictureTurn.h"

namespace cliphost {

// The pictures that a contact sheet is made of: frames of a clip's picture track, with the alpha
// of its alpha track where one is shown.
class SheetPictures {
public:
    virtual ~SheetPictures() = default;
    virtual int width() const = 0;
    virtual int height() const = 0;
    // Frames of the clip, as FrameReader counts them.
    virtual std::uint64_t Count() = 0;
    // Before the first read: how large a cell is, in the way up that is stored, and how many
    // frames there will be.
    virtual void Prepare(int width, int height, std::size_t frames) = 0;
    // May give a picture that has the size of a cell already, and one near to the frame.
    virtual NCFRESULT Read(std::uint64_t frame, Picture& picture) = 0;
};

// How high a picture of a width is, in the shape in which the clip is shown, whatever its pixels
// are.
int ShownHeight(int width, const ClipTrack& track, const SheetPictures& pictures,
                const PictureTurn& turn);

// Those that the host's own reader makes small while it decodes; `isExact`: each is the frame that
// was asked for. Null for a movie that it does not open.
std::unique_ptr<SheetPictures> SmallPictures(Essence& essence, const ClipTrack& track,
                                             bool isExact);

// Those that the module delivers, with its levels and formats. Throws a Failure.
std::unique_ptr<SheetPictures> DeliveredPictures(Essence& essence, const ClipTrack& track);

}  // namespace cliphost
