// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/RefPtr.h"
#include "aaf_library/stored/StoredFile.h"

namespace aaf {
class Model;
class Object;
}  // namespace aaf

// What the file objects of the library call to save and to open.

namespace aaf::stored {

// Writes the header with all that it contains, the model's dictionary and the
// definitions that these need. See ModelWriter.h for what is added, and for the content, which
// makes it a copy of the model's, and StoredFile.h for how the file is replaced.
FileResult SaveModel(Model& model, Object& header, const std::filesystem::path& path,
                     SectorSize sectorSize, const Object* content = nullptr);

// Reads into a new model. The header comes back free; its dictionary is
// model.dictionary(). On failure the model has to be thrown away and the
// header is null.
FileResult LoadModel(const std::filesystem::path& path, Model& model, RefPtr<Object>& header);

}  // namespace aaf::stored
