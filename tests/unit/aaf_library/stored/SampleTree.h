// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

#include <string>

// Small trees for the tests of the stored form.

namespace aaf::stored::sample {

StoredAuid auid(std::uint8_t first);
Bytes bytes(const StoredAuid& id);

StoredProperty data(std::uint16_t pid, Bytes value);
StoredProperty text(std::uint16_t pid, const std::u16string& value);
StoredProperty reference(std::uint16_t pid, const std::u16string& name, StoredObject object);
StoredProperty vector(std::uint16_t pid, const std::u16string& name,
                      std::vector<StoredObject> objects);
StoredProperty stream(std::uint16_t pid, const std::u16string& name, Bytes content);

// An object with an identification in property 0005, and a set of such.
StoredObject keyed(std::uint8_t id);
StoredProperty set(std::uint16_t pid, const std::u16string& name,
                   std::vector<StoredObject> objects);

// A root with every stored form in it: reference, vector, set, a nested one,
// streams below and above the limit for small ones, weak references of each
// kind into two different sets, an empty vector and an empty set, an empty
// text, a text with a surrogate pair, a squeezed name.
StoredObject EveryForm();

// A root whose property 0002 holds the object.
StoredObject RootWith(StoredProperty property);

}  // namespace aaf::stored::sample
