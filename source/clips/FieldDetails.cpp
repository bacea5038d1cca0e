// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Field order and layout of the picture: what the movie says, and the user's
// choice laid over it.

#include "source/clips/FieldDetails.h"

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

void ApplyUsersFields(const ClipParams& params, FieldDetails& fields) {
    const ncfUInt32 userOrder = params.fieldOrderInFile;
    const ncfUInt32 userLayout = params.fieldLayout;
    if (userOrder == kProgressive) {
        fields.order = kProgressive;
    } else if (userOrder == kTopFieldFirst || userOrder == kBottomFieldFirst) {
        if (userLayout == kUserMerged) {
            fields.layout = kLayoutMerged;
        } else if (userLayout == kUserSplit || IsLayoutApart(fields.layout)) {
            fields.layout = kLayoutSplit;
        }
        fields.order = userOrder;
    } else if (userLayout == kUserMerged) {
        fields.layout = kLayoutMerged;
    } else if (userLayout == kUserSplit) {
        fields.layout = kLayoutSplit;
    }
}

}  // namespace

void FieldDetails::ApplySize(ncfUInt32 width, ncfUInt32 height) {
    layout = kLayoutMerged;
    order = kProgressive;
    if (width == 720 && height == 486) {
        order = kBottomFieldFirst;
    }
}

void FieldDetails::Apply(bool interlaced, bool topFieldFirst, bool split, ClipParams& params,
                         const NCFSmartPtr<INCFConsole>& console) {
    layout = kLayoutMerged;
    if (!interlaced) {
        params.detectedFieldOrder = kProgressive;
        order = kProgressive;
        lineOrientation = 1;
        console->Write(4, "QueryVideoDescBufferDetails says we are full progressive and merged \n");
    } else {
        order = topFieldFirst ? kTopFieldFirst : kBottomFieldFirst;
        params.detectedFieldOrder = order;
        console->Write(4, "%s", InterlacedText(topFieldFirst, split));
    }
    ApplyUsersFields(params, *this);
}
