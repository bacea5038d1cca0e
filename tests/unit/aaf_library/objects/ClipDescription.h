// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

// Describes a clip of one picture and one stereo sound with the calls, and in
// their order, that a module for movie files makes.
class ClipDescription : public TransientFile {
protected:
    // The three mobs with their ids and names, and the multiple descriptor.
    void MakeMobs();
    // One essence slot in each of the mobs.
    void AddTrack(const aafUID_t& dataDef, aafSlotID_t slotId);
    // A timecode slot, between fillers when it is not the first.
    void AddTimecode(aafTimecode_t timecode, aafLength_t length, aafLength_t maximum,
                     aafSlotID_t slotId, aafUInt32 number);
    // A picture with labels, boxes and a slice count.
    void AddPicture();
    void SetBoxes(IAAFObject* picture);
    void SetSliceCount(IAAFObject* picture, aafUInt32 count);
    void SetRate(const aafRational_t& rate);
    void AddSound();
    void AddLocator(IAAFEssenceDescriptor* descriptor);
    void MoveFileMobClips(aafPosition_t by);
    void AddMobs();
    void AddColumns();
    void SetAppCode();
    void SetAttributeList();
    // All of it.
    void DescribeClip();

    Ptr<IAAFMob> master_;
    Ptr<IAAFMob> file_mob_;
    Ptr<IAAFMob> source_;
    Ptr<IAAFMultipleDescriptor> multiple_;
    const aafRational_t rate_{30000, 1001};
    const aafLength_t length_ = 300;
};

}  // namespace aaf_test
