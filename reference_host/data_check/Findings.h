// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "reference_host/xml/EventReader.h"

namespace data_check {

enum class DataFile {
    Mapper,  // from codes to ids
    Info,    // from ids to records
};
inline constexpr const char* kDataFileNames[] = {"FourCharMapper.xml", "AAFInfo.xml"};

// Something that is wrong in a data file.
struct Finding {
    DataFile file;
    host::XmlPlace place;
    std::string what;
    std::string hint;  // what helps
};

// All of a check. A file may be nothing but mistakes, so the first kMost are kept, by their places;
// the rest is counted.
class Findings {
public:
    static constexpr std::size_t kMost = 1000;

    void Tell(DataFile file, host::XmlPlace place, std::string what, std::string hint);
    std::size_t count() const { return count_; }
    // By file, and there by place.
    std::vector<Finding> TakeInOrder();

private:
    void KeepFirst();

    std::vector<Finding> kept_;  // twice as many at most
    std::size_t count_ = 0;
};

}  // namespace data_check
