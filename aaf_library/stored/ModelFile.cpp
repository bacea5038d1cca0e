// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelFile.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/stored/ModelReader.h"
#include "aaf_library/stored/ModelWriter.h"
#include "aaf_library/stored/StoredError.h"

#include <new>

namespace aaf::stored {

FileResult SaveModel(Model& model, Object& header, const std::filesystem::path& path,
                     SectorSize sectorSize, const Object* content) {
    try {
        return SaveTree(TreeToWrite(model, header, content), path, sectorSize);
    } catch (const StoredError& problem) {
        return {FileFailure::NotStorable, path.u8string() + ": " + problem.what()};
    } catch (const std::bad_alloc&) {
        return {FileFailure::NoMemory, path.u8string() + ": not enough memory to write it"};
    }
}

FileResult LoadModel(const std::filesystem::path& path, Model& model, RefPtr<Object>& header) {
    header = nullptr;
    StoredObject root;
    if (FileResult result = LoadTree(path, root); !result) {
        return result;
    }
    try {
        FileResult result;
        header = ReadModel(root, model, result.notes);
        return result;
    } catch (const StoredError& problem) {
        return {FileFailure::Damaged, path.u8string() + ": " + problem.what()};
    } catch (const std::bad_alloc&) {
        return {FileFailure::NoMemory, path.u8string() + ": not enough memory to read it"};
    }
}

}  // namespace aaf::stored
