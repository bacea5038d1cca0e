// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <vector>

// A Windows of one test: it notes each call with its arguments, does as it is told,
// and refuses what the real one refuses of a file that is read past the cache. Link
// the library `windows_calls`, and the module's code calls it by the module's own
// Windows source.
class WindowsCalls {
public:
    static WindowsCalls& Get();
    // Begins a test: no files, no calls, nothing fails.
    static WindowsCalls& Anew();

    // --- what is there ---------------------------------------------------------

    struct File {
        std::vector<std::uint8_t> bytes;
        std::uint64_t length = 0;  // zeros follow the bytes up to here
        std::uint32_t sectorSize = 512;
        std::uint64_t written = 0;  // the last write, in 100 ns from 1601
        std::uint32_t type = 1;     // what GetFileType says
        bool isFolder = false;
        bool isWritten = false;  // another program has it open for writing
    };
    std::map<std::u16string, File> files;
    // Bytes in a sector, as volumes tell them that are asked by these roots.
    std::map<std::u16string, std::uint32_t> roots;
    // Where modules lie, by an address in them.
    std::map<const void*, std::u16string> modules;
    std::map<std::string, std::string> libraries;  // a name, and the one symbol in it
    std::uint32_t wait = 0;                        // how a wait ends
    std::uint32_t thread = 77;
    std::map<std::uint32_t, std::string> errorTexts;
    // Functions that fail, and the error that each leaves.
    std::map<std::string, std::uint32_t> failures;

    // --- what was done ---------------------------------------------------------

    // Each call but those that can't fail and change nothing, such as
    // ReadFile(0x100, memory, 4096, place, null).
    std::vector<std::string> calls;
    std::vector<std::string> TakeCalls();
    // How often a read or a position was refused for its alignment.
    int misaligned = 0;
    int openHandles = 0;
    int liveBlocks = 0;
};
