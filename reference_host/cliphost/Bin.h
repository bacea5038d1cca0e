// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "reference_host/cliphost/AafLibrary.h"

namespace cliphost {

// One AAF file with the clips of many movies. The ids of mobs come from a movie's content, so
// that copies of a movie are one clip with several places.
class Bin {
public:
    explicit Bin(const AafLibrary& library) : library_(library), file_(library.OpenTransient()) {}

    // Adds the mobs of a description. Throws a Failure when the library refuses. The movie that
    // is there with the same content, where its clip has one more place now. Empty: there is none.
    std::filesystem::path Add(IAAFFile* description, const std::filesystem::path& movie);

    IAAFFile* file() { return file_.get(); }
    // The master mobs in the order in which they came.
    const std::vector<host::Ref<IAAFMob>>& clips() const { return clips_; }

    void Save(const std::filesystem::path& path) const { library_.Save(file_.get(), path); }

private:
    bool AddLocators(IAAFMob& from, IAAFMob& to);

    const AafLibrary& library_;
    host::Ref<IAAFFile> file_;
    std::vector<host::Ref<IAAFMob>> clips_;
    std::map<std::string, std::filesystem::path::string_type> movies_;  // by a mob's id
    std::map<std::string, std::set<std::string>> urls_;  // of mobs with copies, by their ids
};

}  // namespace cliphost
