// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/PictureCheck.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>

#include "reference_host/cliphost/FrameReader.h"
#include "tests/system/codecs/WantedPicture.h"

namespace {

using cliphost::FrameReader;
using cliphost::ImageFormat;
using cliphost::PictureBytes;
using Colours = PlainForm::Colours;

constexpr double kRounded = 0.51;  // single precision
constexpr double kBlended = 1.0 + 1e-3;
// Three words, each rounded, and single precision between.
constexpr double kThroughWords = 0.02;

struct Weights {
    const char* matrix;
    double red;
    double blue;
};

constexpr Weights kWeights[] = {
    {"bt709", 0.2126, 0.0722},   {"bt470bg", 0.299, 0.114}, {"smpte170m", 0.299, 0.114},
    {"smpte240m", 0.212, 0.087}, {"fcc", 0.30, 0.11},       {"bt2020nc", 0.2627, 0.0593},
};

// By the stream's word, else by the picture's size.
Weights WeightsOf(const PlainPictures& plain) {
    const auto* const found =
        std::find_if(std::begin(kWeights), std::end(kWeights),
                     [&plain](const Weights& weights) { return plain.matrix() == weights.matrix; });
    return found != std::end(kWeights)                   ? *found
           : plain.width() < 960 || plain.height() < 720 ? kWeights[1]
                                                         : kWeights[0];
}

// The greatest difference of one kind of samples, and where it is.
class Worst {
public:
    Worst(std::string what, double allowed) : what_(std::move(what)), allowed_(allowed) {}

    void Compare(double got, double wanted, std::size_t frame, int x, int y) {
        const double difference = std::abs(got - wanted);
        count_ += difference > allowed_ ? 1 : 0;
        if (difference > allowed_ && difference > worst_) {
            worst_ = difference;
            text_ = fmt::format("{} is {:.2f}, not {:.2f}, in picture {} at {}, {}", what_, got,
                                wanted, frame, x, y);
        }
    }
    void Tell(const std::string& format, std::vector<std::string>& differences) const {
        if (count_ > 0) {
            differences.push_back(fmt::format("{}: {}; {} samples differ", format, text_, count_));
        }
    }

private:
    std::string what_;
    double allowed_;
    double worst_ = 0;
    std::size_t count_ = 0;
    std::string text_;
};

class Comparison {
public:
    Comparison(const PlainPictures& plain, FrameReader& reader)
        : plain_(plain),
          reader_(reader),
          wanted_(plain),
          weights_(WeightsOf(plain)),
          isExact_(plain.form().bits == 8 && !plain.form().isFullRange) {}

    void Run(const std::string& name, std::vector<std::string>& differences) {
        if (reader_.Count() != plain_.Count()) {
            differences.push_back(fmt::format("{}: {} pictures, ffmpeg gives {}", name,
                                              reader_.Count(), plain_.Count()));
        }
        if (reader_.width() != static_cast<int>(plain_.width()) ||
            reader_.height() != static_cast<int>(plain_.height())) {
            differences.push_back(fmt::format("{}: {} x {}, ffmpeg gives {} x {}", name,
                                              reader_.width(), reader_.height(), plain_.width(),
                                              plain_.height()));
            return;
        }
        const std::size_t count = std::min<std::size_t>(reader_.Count(), plain_.Count());
        for (std::size_t frame = 0; frame < count; ++frame) {
            if (const NCFRESULT result = reader_.Read(frame); result != NCF_OK) {
                differences.push_back(fmt::format("{}: picture {} gave {:#x}", name, frame,
                                                  static_cast<unsigned>(result)));
                return;
            }
            Compare(frame);
        }
        for (const Worst* worst : {&luma_, &chroma_, &colour_, &words_, &alpha_}) {
            worst->Tell(name, differences);
        }
    }

private:
    void Compare(std::size_t frame) {
        for (int y = 0; y < reader_.height(); ++y) {
            for (int x = 0; x < reader_.width(); ++x) {
                ComparePixel(frame, x, y);
            }
        }
    }

    void ComparePixel(std::size_t frame, int x, int y) {
        const unsigned char* const bytes = reader_.bytes();
        switch (reader_.layout().bytes) {
            case PictureBytes::CbYCrY8:
                ComparePair(bytes + PairAt(x, y), frame, x, y);
                break;
            case PictureBytes::Bgra8: {
                const unsigned char* const pixel = bytes + At(x, y) * 4;
                for (int c = 0; c < 3; ++c) {
                    colour_.Compare(pixel[2 - c], wanted_.Rgb(frame, c, x, y) * 255, frame, x, y);
                }
                alpha_.Compare(pixel[3], 255, frame, x, y);
                break;
            }
            case PictureBytes::Argb16:
                CompareWords(bytes + At(x, y) * 8, frame, x, y);
                break;
            case PictureBytes::Alpha8:
                alpha_.Compare(bytes[At(x, y)], wanted_.Alpha(frame, x, y) * 255, frame, x, y);
                break;
            case PictureBytes::Alpha10:
                alpha_.Compare(bytes[At(x, y)] << 2 | bytes[Pixels() + At(x, y)],
                               wanted_.Alpha(frame, x, y) * 1023, frame, x, y);
                break;
            case PictureBytes::Unusable:
                break;
        }
    }

    // Of what is rounded, codes 0 and 255 are left to synchronisation.
    void ComparePair(const unsigned char* pair, std::size_t frame, int x, int y) {
        const auto held = [this](double value) {
            return isExact_ ? value : std::clamp(value, 1.0, 254.0);
        };
        luma_.Compare(held(pair[x % 2 == 0 ? 1 : 3]), held(wanted_.Luma(frame, x, y)), frame, x, y);
        if (x % 2 == 0 && x + 1 < reader_.width()) {
            for (int c = 1; c <= 2; ++c) {
                chroma_.Compare(held(pair[2 * c - 2]), held(wanted_.Chroma(frame, c, x, y)), frame,
                                x, y);
            }
        }
    }

    void CompareWords(const unsigned char* pixel, std::size_t frame, int x, int y) {
        std::array<double, 4> words;
        for (std::size_t c = 0; c < 4; ++c) {
            words[c] = pixel[2 * c] << 8 | pixel[2 * c + 1];
        }
        alpha_.Compare(words[0], 65535, frame, x, y);
        if (plain_.form().colours != Colours::YCbCr) {
            for (int c = 0; c < 3; ++c) {
                colour_.Compare(words[static_cast<std::size_t>(c) + 1],
                                4096 + wanted_.Rgb(frame, c, x, y) * 56064, frame, x, y);
            }
            return;
        }
        const bool isCutOff = std::any_of(words.begin() + 1, words.end(),
                                          [](double word) { return word <= 0 || word >= 65535; });
        if (isCutOff) {
            return;
        }
        // Y'CbCr out of R'G'B' again, so that nothing hides in the matrix.
        const double r = (words[1] - 4096) / 56064, g = (words[2] - 4096) / 56064,
                     b = (words[3] - 4096) / 56064;
        const double red = weights_.red, blue = weights_.blue;
        const double luma = red * r + (1 - red - blue) * g + blue * b;
        words_.Compare(16 + 219 * luma, wanted_.Luma(frame, x, y), frame, x, y);
        if (wanted_.HasStoredChroma(x)) {
            words_.Compare(128 + 112 * (b - luma) / (1 - blue),
                           wanted_.StoredChroma(frame, 1, x, y), frame, x, y);
            words_.Compare(128 + 112 * (r - luma) / (1 - red), wanted_.StoredChroma(frame, 2, x, y),
                           frame, x, y);
        }
    }

    std::size_t Width() const { return static_cast<std::size_t>(reader_.width()); }
    std::size_t Pixels() const { return Width() * static_cast<std::size_t>(reader_.height()); }
    std::size_t At(int x, int y) const {
        return static_cast<std::size_t>(y) * Width() + static_cast<std::size_t>(x);
    }
    std::size_t PairAt(int x, int y) const {
        return static_cast<std::size_t>(y) * Width() * 2 + static_cast<std::size_t>(x / 2) * 4;
    }

    const PlainPictures& plain_;
    FrameReader& reader_;
    const WantedPicture wanted_;
    const Weights weights_;
    const bool isExact_;
    Worst luma_{"luma", isExact_ ? 0 : kRounded};
    Worst chroma_{"chroma", !wanted_.HasChromaThere() ? kBlended : isExact_ ? 0 : kRounded};
    Worst colour_{"colour", plain_.form().isCoarse ? kBlended : kRounded};
    Worst words_{"Y'CbCr of the words", kThroughWords};
    Worst alpha_{"alpha", kRounded};
};

std::vector<std::string> TrackDifferences(cliphost::Essence& essence, cliphost::TrackKind kind,
                                          const PlainPictures& plain) {
    const cliphost::ClipTrack* const track = essence.First(kind);
    if (!track) {
        return {fmt::format("there is no {} track", cliphost::NameOf(kind))};
    }
    if (plain.form().name.empty()) {
        return {"there is no plain form of " + plain.decoded()};
    }
    if (plain.Count() == 0) {
        return {"ffmpeg decodes nothing"};
    }
    std::vector<ImageFormat> formats;
    if (cliphost::ReadImageFormats(essence.pictures(), track->number, formats) != NCF_OK ||
        formats.empty()) {
        return {"no format is offered"};
    }
    std::vector<std::string> differences;
    for (const ImageFormat& format : formats) {
        const std::string name = cliphost::NameOf(format);
        FrameReader reader(essence, *track, name);
        Comparison(plain, reader).Run(name, differences);
    }
    return differences;
}

}  // namespace

std::vector<std::string> PictureDifferences(cliphost::Essence& essence,
                                            const PlainPictures& plain) {
    return TrackDifferences(essence, cliphost::TrackKind::Picture, plain);
}

std::vector<std::string> AlphaDifferences(cliphost::Essence& essence, const PlainPictures& plain) {
    return TrackDifferences(essence, cliphost::TrackKind::Alpha, plain);
}
