// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

namespace aaf {
class Model;
class Object;
}  // namespace aaf

namespace aaf::stored {

// The tree of a whole file: the header with everything in it, all definitions of data, the others
// of the dictionary that are referred to or that a caller added, and the
// meta-dictionary with all classes, properties and types that these need, plus
// every extension that is registered. Required collections that are absent are
// stored empty. Throws StoredError when an object lacks one that it must hold,
// such as a slot its segment.
StoredObject TreeOfModel(Model& model, Object& header);
// The same for WriteTree alone: definitions that files have in common are there as they are laid
// out, not as properties. A content of this model, unless null, stands in place of the header's
// own, and the header is that of a new file: then the tree is what that file would hold had it
// taken a copy of the content, with the definitions that it needs and all extensions.
StoredObject TreeToWrite(Model& model, Object& header, const Object* content = nullptr);

}  // namespace aaf::stored
