// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

// What is put into the file, and what it is after saving and opening.
class SavedFile : public TransientFile {
protected:
    // The header of a copy on disk.
    Ptr<IAAFHeader> Reopen() {
        const std::u32string name = (folder_ / "saved.aaf").u32string();
        const std::wstring path{name.begin(), name.end()};
        Ptr<IAAFFile> target;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenNewModifyEx(path.c_str(), &kAAFFileKind_Aaf512Binary, 0,
                                         &product_.ident, target.Out()));
        EXPECT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target));
        EXPECT_EQ(AAFRESULT_SUCCESS, target->Close());
        Ptr<IAAFFile> read;
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, read.Out()));
        return Get(read, &IAAFFile::GetHeader);
    }
    // A composition in the file with that segment in slot 1.
    void AddComposition(IUnknown* segment) {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFCompositionMob);
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(MobId(0xC0)));
        Ptr<IAAFTimelineMobSlot> slot;
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->AppendNewTimelineSlot({25, 1}, As<IAAFSegment>(segment),
                                                                1, L"V1", 0, slot.Out()));
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    }
    // That segment in a copy on disk.
    template <class T>
    Ptr<T> ReopenedSegment() {
        Ptr<IAAFMob> mob = Get(Reopen(), &IAAFHeader::LookupMob, MobId(0xC0));
        Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, aafSlotID_t{1});
        return As<T>(Get(slot, &IAAFMobSlot::GetSegment));
    }

    const TestFolder folder_;
};

}  // namespace aaf_test
