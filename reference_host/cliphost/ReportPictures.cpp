// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportPictures.h"

#include <algorithm>
#include <cmath>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/ContactSheet.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameRange.h"
#include "reference_host/cliphost/SheetPictures.h"
#include "reference_host/cliphost/TimecodeText.h"
#include "reference_host/cliphost/WebpFile.h"
#include "reference_host/report/PageText.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

constexpr std::uint64_t kFrames = 12;
// Pictures of all shapes have as many pixels, so that they take as many bytes.
constexpr double kPixels = 200.0 * 112.5;
constexpr int kLeastWidth = 24;
constexpr int kMostWidth = 600;
constexpr std::uint16_t kUnread = 64;  // the grey of a frame that can't be read

struct Size {
    int width;
    int height;
};

Size SizeOf(const ClipTrack& track, const SheetPictures& pictures, const PictureTurn& turn) {
    constexpr int kWide = 10'000;
    const double shape = static_cast<double>(kWide) / ShownHeight(kWide, track, pictures, turn);
    const int width = std::clamp(static_cast<int>(std::lround(std::sqrt(kPixels * shape))),
                                 kLeastWidth, kMostWidth);
    return {width, ShownHeight(width, track, pictures, turn)};
}

// The address of a frame of a track, where the movie has timecode.
class FrameTimes {
public:
    FrameTimes(const std::string& start, const ClipTrack& track) {
        const auto time = ReadTimecode(start);
        framesPerSecond_ = std::lround(track.RateAsNumber());
        if (time && framesPerSecond_ > 0) {
            drops_ = time->drops;
            start_ = FramesOf(*time, static_cast<unsigned>(framesPerSecond_));
        }
    }
    std::string Of(std::uint64_t frame) const {
        return start_ ? TimecodeText(*start_ + static_cast<std::int64_t>(frame), framesPerSecond_,
                                     drops_)
                      : std::string();
    }

private:
    std::int64_t framesPerSecond_ = 0;
    bool drops_ = false;
    std::optional<std::int64_t> start_;
};

void PutInto(Picture& strip, const Picture& picture, std::size_t place) {
    const auto line = static_cast<std::size_t>(picture.width) * 3;
    const auto lineOfStrip = static_cast<std::size_t>(strip.width) * 3;
    for (std::size_t y = 0; y < static_cast<std::size_t>(picture.height); ++y) {
        std::copy_n(&picture.samples[y * line], line,
                    &strip.samples[y * lineOfStrip + place * line]);
    }
}

Json PictureJson(const Picture& picture, const Size& size, std::size_t mostBytes) {
    const std::vector<unsigned char> webp = ToWebp(picture, mostBytes);
    return {{"type", kWebp},
            {"width", size.width},
            {"height", size.height},
            {"data", report::Base64(webp.data(), webp.size())}};
}

}  // namespace

ReportPictures ReadReportPictures(Essence& essence, const ClipTrack& track,
                                  const std::string& start) {
    auto pictures = SmallPictures(essence, track, false);
    if (!pictures) {
        pictures = DeliveredPictures(essence, track);
    }
    const std::vector<std::uint64_t> frames = SpreadFrames(pictures->Count(), kFrames);
    if (frames.empty() || pictures->width() == 0) {
        throw Failure(kExitFile, essence.WhyUnread(track, 0, NMA_E_NODATA));
    }
    const PictureTurn turn = TurnOf(host::DisplayMatrixOf(essence.movie()));
    const Size size = SizeOf(track, *pictures, turn);
    pictures->Prepare(turn.swapsSides ? size.height : size.width,
                      turn.swapsSides ? size.width : size.height, frames.size());
    const FrameTimes times(start, track);
    Picture strip{size.width * static_cast<int>(frames.size()), size.height, 3, 8, {}};
    strip.samples.assign(strip.Pixels() * 3, kUnread);
    ReportPictures found;
    Json list = Json::array();
    Problem problem;
    std::size_t read = 0;
    for (std::size_t i = 0; i < frames.size(); ++i) {
        Json frame = {{"frame", frames[i]}, {"timecode", times.Of(frames[i])}};
        Picture picture;
        const NCFRESULT result = pictures->Read(frames[i], picture);
        if (result == NCF_OK) {
            picture = Shrunk(Turned(std::move(picture), turn), size.width, size.height);
            PutInto(strip, picture, i);
            ++read;
            if (found.poster.is_null() || i == frames.size() / 2) {
                found.poster = PictureJson(picture, size, kMostBytesOfPoster);
            }
        } else {
            problem = essence.WhyUnread(track, frames[i], result);
            frame["problem"] = problem.reason;
        }
        list.push_back(std::move(frame));
    }
    if (read == 0) {
        throw Failure(kExitFile, problem);
    }
    found.strip = PictureJson(strip, size, kMostBytesOfStrip);
    found.strip["frames"] = std::move(list);
    return found;
}

}  // namespace cliphost
