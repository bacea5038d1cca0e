// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Arbitrary bytes as an AAF file, compared through the library's interfaces: a file is like itself,
// all of it is other than nothing, and what one has more than a clip of ours, the clip has less.

#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "fuzz/support/RunLimits.h"
#include "host_interfaces/aaf/AAFExports.h"
#include "reference_host/cliphost/AafComparison.h"
#include "reference_host/util/Ref.h"
#include "tests/support/TestFolder.h"
#include "text/Encodings.h"

// The library's function, linked by name.
extern "C" HRESULT AAFFileOpenExistingRead(aafCharacter_constptr fileName, aafUInt32 modeFlags,
                                           IAAFFile** file);

namespace {

// One file for the whole run, deleted at its end.
const std::filesystem::path& TheFile() {
    static const TestFolder folder;
    static const std::filesystem::path path = folder / "input.aaf";
    return path;
}

host::Ref<IAAFFile> Open(const std::filesystem::path& path) {
    const std::wstring name = encodings::ToWideLossy(encodings::FromUtf8(path.string()));
    host::Ref<IAAFFile> file;
    if (AAFFileOpenExistingRead(name.c_str(), 0, file.Out()) < 0) {
        file.Reset();
    }
    return file;
}

void Require(bool isSo) {
    if (!isSo) {
        std::abort();
    }
}

// What both files have besides is paired in either direction.
void CompareWithClip(IAAFFile* file) {
    const host::Ref<IAAFFile> clip = Open(CLIPHOST_FUZZ_CLIP);
    Require(clip.get() != nullptr);
    const auto check = [](const cliphost::ComparedObject& object,
                          const cliphost::TreeDifference& difference) {
        Require(!(InWords(object) + InWords(difference)).empty());
    };
    const cliphost::ComparisonCounts to = cliphost::CompareFiles(clip.get(), file, check);
    const cliphost::ComparisonCounts from = cliphost::CompareFiles(file, clip.get(), check);
    Require(to.gone == from.added && to.added == from.gone &&
            to.alike + to.changed == from.alike + from.changed);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    std::ofstream(TheFile(), std::ios::binary)
        .write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    const host::Ref<IAAFFile> before = Open(TheFile());
    const host::Ref<IAAFFile> after = Open(TheFile());
    if (!before || !after) {
        return 0;
    }
    std::size_t told = 0;
    const auto count = [&](const cliphost::ComparedObject& object,
                           const cliphost::TreeDifference& difference) {
        told += (InWords(object) + InWords(difference)).empty() ? 0 : 1;
    };
    Require(cliphost::CompareFiles(before.get(), after.get(), count).AreEqual() && told == 0);
    const cliphost::ComparisonCounts none = cliphost::CompareFiles(before.get(), nullptr, count);
    Require(none.alike == 0 && none.differences == told);
    CompareWithClip(before.get());
    return 0;
}
