// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Field order and layout of the picture: what the movie says, and the user's
// choice laid over it.

#include "source/clips/BaseClip.h"

namespace {

// The user's choice of a layout.
constexpr ncfUInt32 kUserMerged = 2;
constexpr ncfUInt32 kUserSplit = 3;

const char* InterlacedText(bool topFieldFirst, bool split) {
    if (split) {
        return topFieldFirst
                   ? "QueryVideoDescBufferDetails says we are interlaced, split, and top first \n"
                   : "QueryVideoDescBufferDetails says we are interlaced, split, and bottom first "
                     "\n";
    }
    return topFieldFirst
               ? "QueryVideoDescBufferDetails says we are interlaced, merged, and top first \n"
               : "QueryVideoDescBufferDetails says we are interlaced, merged, and bottom first \n";
}

bool IsLayoutApart(ncfUInt32 layout) {
    return layout == kLayoutSplit || layout == 1024;
}

}  // namespace

void BaseClip::ApplySizeBasedFieldDefault(ncfUInt32 width, ncfUInt32 height) {
    frameBufferLayout_ = kLayoutMerged;
    temporalFieldOrder_ = kProgressive;
    if (width == 720 && height == 486) {
        temporalFieldOrder_ = kBottomFieldFirst;
    }
}

void BaseClip::ApplyFieldDetails(bool interlaced, bool topFieldFirst, bool split) {
    frameBufferLayout_ = kLayoutMerged;
    if (!interlaced) {
        clipParams_.detectedFieldOrder = kProgressive;
        temporalFieldOrder_ = kProgressive;
        bufferLineOrientation_ = 1;
        console_->Write(4,
                        "QueryVideoDescBufferDetails says we are full progressive and merged \n");
    } else {
        temporalFieldOrder_ = topFieldFirst ? kTopFieldFirst : kBottomFieldFirst;
        clipParams_.detectedFieldOrder = temporalFieldOrder_;
        console_->Write(4, "%s", InterlacedText(topFieldFirst, split));
    }
    ApplyUsersFields();
}

void BaseClip::ApplyUsersFields() {
    const ncfUInt32 userOrder = clipParams_.fieldOrderInFile;
    const ncfUInt32 userLayout = clipParams_.fieldLayout;
    if (userOrder == kProgressive) {
        temporalFieldOrder_ = kProgressive;
    } else if (userOrder == kTopFieldFirst || userOrder == kBottomFieldFirst) {
        if (userLayout == kUserMerged) {
            frameBufferLayout_ = kLayoutMerged;
        } else if (userLayout == kUserSplit || IsLayoutApart(frameBufferLayout_)) {
            frameBufferLayout_ = kLayoutSplit;
        }
        temporalFieldOrder_ = userOrder;
    } else if (userLayout == kUserMerged) {
        frameBufferLayout_ = kLayoutMerged;
    } else if (userLayout == kUserSplit) {
        frameBufferLayout_ = kLayoutSplit;
    }
}
