// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassRegistry.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/TreeReader.h"
#include "aaf_library/stored/TreeWriter.h"
#include "fuzz/support/RunLimits.h"

#include <cstdlib>

using namespace aaf::stored;

namespace {

// Whatever can be read must come out the same when it is written and read again.
void CheckTree(const StoredObject& tree) {
    Bytes written;
    try {
        written = WriteTree(tree, SectorSize::Bytes512);
    } catch (const StoredError&) {
        return;
    }
    if (WriteTree(ReadTree(written), SectorSize::Bytes512) != written) {
        std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const aaf::ClassRegistry classes;
    const fuzz::TimeLimit limit;
    try {
        const StoredObject tree = ReadTree(Bytes(data, data + size));
        CheckTree(tree);
        const aaf::RefPtr<aaf::Model> model = aaf::Model::Create(classes);
        std::vector<std::string> notes;
        const aaf::RefPtr<aaf::Object> header = ReadModel(tree, *model, notes);
        CheckTree(TreeOfModel(*model, *header));
    } catch (const StoredError&) {
        // Refused, as most of what a fuzzer makes should be.
    }
    return 0;
}
