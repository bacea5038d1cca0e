// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/aaf/stored/StoredError.h"
#include "reference_host/aaf/stored/TreeReader.h"
#include "reference_host/aaf/stored/TreeWriter.h"

#include <cstdlib>

// Whatever can be read must come out the same when it is written and read again.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    using namespace aaf::stored;
    StoredObject tree;
    Bytes written;
    try {
        tree = readTree(Bytes(data, data + size));
        written = writeTree(tree, SectorSize::Bytes512);
    } catch (const StoredError&) {
        return 0;
    }
    if (writeTree(readTree(written), SectorSize::Bytes512) != written) {
        std::abort();
    }
    return 0;
}
