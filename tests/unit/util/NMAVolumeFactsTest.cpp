// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What Linux tells of a file system.

#include "host_interfaces/util/NMAVolume.h"

#include <sys/statvfs.h>

#include <set>

#include "tests/unit/util/UtilFixture.h"

class NMAVolumeFacts : public UtilTest {
protected:
    const TestFolder testFolder_;
    const host::Ref<host::String> folder_ = host::ModulePath(testFolder_.path());
};

TEST_F(NMAVolumeFacts, SerialNumberIsTheLowHalfOfTheFileSystemsId) {
    struct statvfs facts {};
    ASSERT_EQ(0, statvfs(testFolder_.path().c_str(), &facts));
    NMAVolume volume(folder_.get());
    EXPECT_EQ(static_cast<ncfUInt32>(facts.f_fsid), volume.GetVolumeSerialNumber());
    EXPECT_EQ(0u, NMAVolume(host::MakeString("/no/such").get()).GetVolumeSerialNumber());
}

TEST_F(NMAVolumeFacts, LabelIsTheNameOfTheMountPoint) {
    NMAVolume root(host::MakeString("\\").get());
    EXPECT_EQ("", Taken(root.GetVolumeLabel()));
    // The kernel's own file system is a volume of its own everywhere.
    NMAVolume proc(host::MakeString("\\proc\\self").get());
    EXPECT_EQ("proc", Taken(proc.GetVolumeLabel()));
    NMAVolume missing(host::MakeString("/no/such").get());
    EXPECT_EQ("", Taken(missing.GetVolumeLabel())) << "never null";
}

TEST_F(NMAVolumeFacts, TypeIsOneOfTheKnownKinds) {
    NMAVolume volume(folder_.get());
    const std::set<ncfUInt32> kinds = {0, 2, 3, 4};
    EXPECT_EQ(1u, kinds.count(volume.GetVolumeType()));
    // A file system without a disk can't be taken out.
    EXPECT_EQ(3u, NMAVolume(host::MakeString("/proc").get()).GetVolumeType());
    EXPECT_EQ(0u, NMAVolume(host::MakeString("/no/such").get()).GetVolumeType());
}
