// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/BuiltInRasters.h"

#include <iterator>

namespace data_check {
namespace {

struct Raster {
    std::uint32_t width;
    std::uint32_t height;
    std::uint32_t layout;
};

// The nine rasters of these codes, and the id of each.
constexpr std::size_t kShared = 9;
constexpr Raster kSharedRasters[kShared] = {{720, 240, 1},  {720, 243, 1},  {720, 288, 1},
                                            {720, 480, 0},  {720, 486, 0},  {720, 576, 0},
                                            {1280, 720, 0}, {1920, 540, 1}, {1920, 1080, 0}};
struct IdsOfCode {
    std::string_view code;
    std::uint32_t ids[kShared];
};
constexpr IdsOfCode kCodesOfShared[] = {
    {"apco", {3800, 3802, 3804, 3801, 3803, 3805, 3807, 3811, 3809}},
    {"apcs", {3732, 3729, 3728, 3733, 3726, 3727, 3721, 3725, 3723}},
    {"apcn", {3744, 3743, 3745, 3741, 3740, 3746, 3748, 3752, 3750}},
    {"apch", {3701, 3700, 3702, 3708, 3709, 3703, 3705, 3712, 3710}},
    {"ap4h", {3783, 3782, 3785, 3780, 3784, 3786, 3788, 3792, 3790}},
};

// One code whose rasters come at several rates.
constexpr std::string_view kCodeOfRates = "NVj2";
constexpr BuiltInRaster kRastersOfRates[] = {
    {720, 248, 1, 553},   {720, 296, 1, 555},   {720, 496, 0, 554},   {720, 496, 0, 565},
    {720, 592, 0, 556},   {720, 592, 0, 566},   {1280, 720, 0, 552},  {1280, 720, 0, 561},
    {1280, 720, 0, 562},  {1280, 720, 0, 563},  {1280, 720, 0, 564},  {1920, 540, 1, 550},
    {1920, 540, 1, 557},  {1920, 1080, 0, 551}, {1920, 1080, 0, 558}, {1920, 1080, 0, 559},
    {1920, 1080, 0, 560},
};

}  // namespace

std::vector<BuiltInRaster> BuiltInRastersOf(std::string_view code) {
    if (code == kCodeOfRates) {
        return {std::begin(kRastersOfRates), std::end(kRastersOfRates)};
    }
    std::vector<BuiltInRaster> rasters;
    for (const IdsOfCode& row : kCodesOfShared) {
        for (std::size_t i = 0; row.code == code && i < kShared; ++i) {
            const Raster& raster = kSharedRasters[i];
            rasters.push_back({raster.width, raster.height, raster.layout, row.ids[i]});
        }
    }
    return rasters;
}

std::vector<std::string_view> CodesWithBuiltInRasters() {
    std::vector<std::string_view> codes = {kCodeOfRates};
    for (const IdsOfCode& row : kCodesOfShared) {
        codes.push_back(row.code);
    }
    return codes;
}

}  // namespace data_check
