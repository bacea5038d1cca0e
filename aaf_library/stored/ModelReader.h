// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/RefPtr.h"
#include "aaf_library/stored/StoredTree.h"

#include <string>
#include <vector>

namespace aaf {
class Model;
class Object;
}  // namespace aaf

namespace aaf::stored {

// Brings the tree of a file into a model, which should be new: definitions
// that the model lacks are registered, those of the file's dictionary join the
// model's, and the header comes back with everything in it; its dictionary is
// the model's. Properties are told by their ids, so the file's own
// numbers do not matter. A property that is no value of its type is kept as it
// stands (PropertyValue::asStored); one that nothing describes is left out.
// Each such place is a sentence in the notes. Throws StoredError; the model
// then is of no further use.
RefPtr<Object> ReadModel(const StoredObject& root, Model& model, std::vector<std::string>& notes);

}  // namespace aaf::stored
