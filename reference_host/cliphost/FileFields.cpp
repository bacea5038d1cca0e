// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FileFields.h"

#include <fmt/format.h>

#include "host_interfaces/media/SampleMapping.h"
#include "host_interfaces/parameters/ParameterIds.h"
#include "reference_host/cliphost/ImageFormats.h"

namespace cliphost {
namespace {

struct Words {
    ncfUInt32 value;
    const char* text;
};
constexpr Words kOrders[] = {{format::kProgressive, "progressive"},
                             {format::kTopFirst, "top field first"},
                             {format::kBottomFirst, "bottom field first"}};
constexpr Words kLayouts[] = {{format::kMerged, "merged"}, {format::kSplit, "split"}};

template <std::size_t count>
std::string Find(const Words (&words)[count], ncfUInt32 value) {
    for (const Words& one : words) {
        if (one.value == value) {
            return one.text;
        }
    }
    return {};
}

// Parameters for which the file has a value of its own, and the member that has it.
// A number that is not one of the choices leaves the file's value in force; these
// two numbers mean just that.
struct FilesOwn {
    GUID parameter;
    ncfUInt32 noChoice;
    std::string FileFields::*words;
};
constexpr FilesOwn kFilesOwn[] = {{kParamFieldOrdering, 8192, &FileFields::order},
                                  {kParamFieldLayout, 1, &FileFields::layout}};

}  // namespace

FileFields ReadFileFields(NMA::IMediaContainer3& container) {
    host::Ref<NMA::ISampleMapping> mapping;
    host::Ref<NMA::IUncompressedImageProvider> pictures;
    std::vector<ImageFormat> formats;
    if (container.GetSampleMapping(mapping.Out()) < 0 || host::Query(mapping.get(), pictures) < 0 ||
        ReadImageFormats(*pictures, 0, formats) < 0 || formats.empty()) {
        return {};
    }
    return {Find(kOrders, formats[0].fieldOrder), Find(kLayouts, formats[0].frameLayout)};
}

std::string WordsForValue(const host::ParameterInfo& parameter, std::optional<ncfUInt32> value,
                          const FileFields& file) {
    if (!value) {
        return "no value";
    }
    for (const host::ParameterChoice& choice : parameter.choices) {
        if (choice.value == *value) {
            return choice.text;
        }
    }
    for (const FilesOwn& own : kFilesOwn) {
        if (own.parameter == parameter.id) {
            const std::string& words = file.*own.words;
            return fmt::format("{}as the file says{}",
                               *value == own.noChoice ? "" : fmt::format("{}, so ", *value),
                               words.empty() ? "" : ": " + words);
        }
    }
    return fmt::format("none of these: {}", *value);
}

}  // namespace cliphost
