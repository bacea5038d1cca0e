// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SheetPictures.h"

#include <algorithm>
#include <cmath>

#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/PixelsToPicture.h"
#include "reference_host/quicktime/Thumbnails.h"

namespace cliphost {
namespace {

// A movie of no more pictures is decoded whole rather than shown as the same sync samples over
// and over.
constexpr std::size_t kFewPictures = 250;

// Frames of Y'CbCr are made R'G'B' by the matrix that their format declares.
host::ThumbnailForm::Matrix DeclaredMatrix(Essence& essence, const ClipTrack& track) {
    using Matrix = host::ThumbnailForm::Matrix;
    const std::vector<ImageFormat> formats = essence.PictureFormats(track);
    const ImageFormat* const first = ChooseFormat(formats, "");
    return !first || first->pixels != format::kCbYCrY ? Matrix::Own
           : first->colorSpace == format::kRec709     ? Matrix::Rec709
                                                      : Matrix::Rec601;
}

class Small final : public SheetPictures {
public:
    Small(Essence& essence, const ClipTrack& track, bool isExact,
          std::unique_ptr<host::Thumbnails> thumbnails)
        : essence_(essence),
          track_(track),
          isExact_(isExact),
          matrix_(DeclaredMatrix(essence, track)),
          hasAlpha_(essence.First(TrackKind::Alpha) != nullptr),
          thumbnails_(std::move(thumbnails)) {}

    int width() const override { return thumbnails_->Width(); }
    int height() const override { return thumbnails_->Height(); }

    std::uint64_t Count() override {
        const std::uint64_t most = MostFrames(essence_, track_);
        const std::uint64_t there = thumbnails_->Count();
        return there == 0 || (there < most && !essence_.LacksPictures()) ? std::min(most, there)
                                                                         : most;
    }

    void Prepare(int width, int height, std::size_t frames) override {
        thumbnails_->SetForm({width, height, matrix_});
        isExact_ =
            isExact_ || (thumbnails_->SyncCount() < frames && thumbnails_->Count() <= kFewPictures);
    }

    NCFRESULT Read(std::uint64_t frame, Picture& picture) override {
        const auto which =
            isExact_ ? host::Thumbnails::Which::Exact : host::Thumbnails::Which::NearestSync;
        host::Thumbnail small;
        const NCFRESULT result = thumbnails_->Read(static_cast<std::size_t>(frame), which, small);
        picture = result == NCF_OK ? ToPicture(small) : Picture();
        return result;
    }

private:
    Picture ToPicture(const host::Thumbnail& small) const {
        Picture picture{small.width, small.height, hasAlpha_ ? 4 : 3, 8, {}};
        picture.samples.reserve(picture.Pixels() * static_cast<std::size_t>(picture.channels));
        for (std::size_t i = 0; i < picture.Pixels(); ++i) {
            const ncfUInt8* const bgra = &small.bytes[4 * i];
            picture.samples.insert(picture.samples.end(), {bgra[2], bgra[1], bgra[0]});
            if (hasAlpha_) {
                picture.samples.push_back(bgra[3]);
            }
        }
        return picture;
    }

    Essence& essence_;
    const ClipTrack track_;
    bool isExact_;
    host::ThumbnailForm::Matrix matrix_;
    bool hasAlpha_;
    std::unique_ptr<host::Thumbnails> thumbnails_;
};

class Delivered final : public SheetPictures {
public:
    Delivered(Essence& essence, const ClipTrack& track) : reader_(essence, track, "") {
        if (const ClipTrack* const shown = essence.First(TrackKind::Alpha)) {
            alpha_ = std::make_unique<FrameReader>(essence, *shown, "");
        }
    }

    int width() const override { return reader_.width(); }
    int height() const override { return reader_.height(); }
    std::uint64_t Count() override { return reader_.Count(); }
    void Prepare(int, int, std::size_t) override {}

    NCFRESULT Read(std::uint64_t frame, Picture& picture) override {
        NCFRESULT result = reader_.Read(frame);
        picture = result == NCF_OK ? reader_.ToPicture() : Picture();
        if (result == NCF_OK && alpha_) {
            result = alpha_->Read(frame);
            picture = result == NCF_OK ? WithAlpha(picture, alpha_->ToPicture()) : Picture();
        }
        return result;
    }

private:
    FrameReader reader_;
    std::unique_ptr<FrameReader> alpha_;
};

}  // namespace

int ShownHeight(int width, const ClipTrack& track, const SheetPictures& pictures,
                const PictureTurn& turn) {
    const aafRational_t& shape = track.shape;
    const double stored = shape.denominator > 0 && shape.numerator > 0
                              ? static_cast<double>(shape.denominator) / shape.numerator
                              : static_cast<double>(pictures.height()) / pictures.width();
    const double shown = turn.swapsSides ? 1.0 / stored : stored;
    const double height = width * std::clamp(shown, 0.05, 20.0);
    return std::max(1, static_cast<int>(std::lround(height)));
}

std::unique_ptr<SheetPictures> SmallPictures(Essence& essence, const ClipTrack& track,
                                             bool isExact) {
    essence.NeedDelivery(track);
    auto thumbnails = host::OpenThumbnails(essence.movie());
    return thumbnails ? std::make_unique<Small>(essence, track, isExact, std::move(thumbnails))
                      : nullptr;
}

std::unique_ptr<SheetPictures> DeliveredPictures(Essence& essence, const ClipTrack& track) {
    return std::make_unique<Delivered>(essence, track);
}

}  // namespace cliphost
