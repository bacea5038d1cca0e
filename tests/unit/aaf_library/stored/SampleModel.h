// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"

#include <string>
#include <vector>

// A model with a header that has everything a description of a movie file may
// have: mobs of both kinds, slots, a sequence, source clips, a timecode,
// descriptors within one another, locators, comments, a container, an
// extension record type with optional properties on an existing class, and a
// class of its own.

namespace aaf::stored::sample {

inline constexpr GUID kQuadTypeId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E01");
inline constexpr GUID kQuadPropertyId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E02");
inline constexpr GUID kNotePropertyId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E03");
inline constexpr GUID kOwnClassId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E04");
inline constexpr GUID kOwnPropertyId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E05");
inline constexpr GUID kOwnDefinitionId = ncfGuid("9D2C1F10-4F5A-4C77-8A01-5B1E2C3D4E06");

RefPtr<Model> NewModel();

struct SampleModel {
    RefPtr<Model> model;
    RefPtr<Object> header;
    std::vector<std::string> notes = {};  // of reading it
};

SampleModel WholeModel();

// The parts of a model that is known to look like the sample.
Object& mob(Object& header, std::size_t index);
Object& slot(Object& mob, std::size_t index);

// A header with an empty content storage.
SampleModel EmptyModel();

aafMobID_t MobId(std::uint8_t last);

}  // namespace aaf::stored::sample
