// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/PictureCheck.h"

#include <fmt/format.h>

#include <array>
#include <cmath>

#include "reference_host/cliphost/FrameReader.h"
#include "tests/system/codecs/PlainPicture.h"

namespace {

using cliphost::FrameReader;
using cliphost::ImageFormat;
using cliphost::PictureBytes;
using Colours = PlainForm::Colours;
using Pixel = std::array<double, 3>;

constexpr double kRounded = 0.51;  // single precision
constexpr double kBlended = 1.0 + 1e-3;
// Three words, each rounded, and single precision between.
constexpr double kThroughWords = 0.02;

// The numbers of 8 bits that stand for black and white in the layouts of
// Y'CbCr.
double InVideoRange(const PlainForm& form, int component, double value) {
    const double most = (1 << form.bits) - 1;
    if (!form.isFullRange) {
        return value / (1 << (form.bits - 8));
    }
    if (component == 0) {
        return 16 + value / most * 219;
    }
    return 128 + (value - (1 << (form.bits - 1))) / most * 224;
}

// The pictures that a format should deliver.
class Wanted {
public:
    explicit Wanted(const PlainPictures& plain) : plain_(plain) {}

    double Luma(std::size_t frame, int x, int y) const {
        return InVideoRange(plain_.form(), 0, plain_.At(frame, 0, x, y));
    }
    // At an even pixel of a line.
    double Chroma(std::size_t frame, int component, int x, int y) const {
        const PlainForm& form = plain_.form();
        if (form.colours == Colours::Grey) {
            return 128;
        }
        double sum = 0;
        const Place line = LineOf(frame, y);
        for (const auto& [row, share] :
             {std::pair{line.first, 1 - line.share}, std::pair{line.second, line.share}}) {
            sum += share * InLine(frame, component, x, row);
        }
        return InVideoRange(form, component, sum);
    }
    bool HasChromaThere() const {
        return plain_.form().colours == Colours::Grey ||
               (plain_.form().shiftX == 1 && plain_.form().shiftY == 0);
    }
    double Rgb(std::size_t frame, int component, int x, int y) const {
        return plain_.At(frame, component, x, y) /
               static_cast<double>((1 << plain_.form().bits) - 1);
    }

private:
    struct Place {
        int first;
        int second;
        double share;
    };
    // The two chroma lines about a line of the picture, in its own field.
    Place LineOf(std::size_t frame, int y) const {
        const int shift = plain_.form().shiftY;
        if (shift == 0) {
            return {y, y, 0};
        }
        const int step = 1 << shift;
        const int lines = (static_cast<int>(plain_.height()) + step - 1) / step;
        const auto held = [](int line, int count) { return std::clamp(line, 0, count - 1); };
        const double between = plain_.HasChromaOnTop() ? 0 : 1;
        if (!plain_.IsInterlaced(frame)) {
            const double at = (y - between * (step - 1) / 2.0) / step;
            const int above = static_cast<int>(std::floor(at));
            return {held(above, lines), held(above + 1, lines), at - above};
        }
        const int field = y & 1;
        const double at = ((y >> 1) - between * (field == 0 ? 0.25 : 0.75)) / step;
        const int above = static_cast<int>(std::floor(at));
        const int count = (lines + 1 - field) / 2;
        return {held(above, count) * 2 + field, held(above + 1, count) * 2 + field, at - above};
    }
    double InLine(std::size_t frame, int component, int x, int row) const {
        const auto at = [&](int column) { return plain_.At(frame, component, column, row); };
        switch (plain_.form().shiftX) {
            case 0:
                return (at(x - 1) + 2 * at(x) + at(x + 1)) / 4.0;
            case 1:
                return at(x / 2);
            default:
                return (at(x / 4) + at(x % 4 == 0 ? x / 4 : x / 4 + 1)) / 2.0;
        }
    }

    const PlainPictures& plain_;
};

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
            differences.push_back(fmt::format("{}: {} of {} samples", format, text_, count_));
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
        for (const Worst* worst : {&luma_, &chroma_, &colour_, &words_}) {
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
        const bool isRgb = plain_.form().colours == Colours::Rgb;
        switch (reader_.layout().bytes) {
            case PictureBytes::CbYCrY8: {
                const unsigned char* const pair = reader_.bytes() + PairAt(x, y);
                luma_.Compare(pair[x % 2 == 0 ? 1 : 3], wanted_.Luma(frame, x, y), frame, x, y);
                if (x % 2 == 0 && x + 1 < reader_.width()) {
                    chroma_.Compare(pair[0], wanted_.Chroma(frame, 1, x, y), frame, x, y);
                    chroma_.Compare(pair[2], wanted_.Chroma(frame, 2, x, y), frame, x, y);
                }
                break;
            }
            case PictureBytes::Bgra8: {
                const unsigned char* const pixel = reader_.bytes() + At(x, y) * 4;
                for (int c = 0; c < 3; ++c) {
                    colour_.Compare(pixel[2 - c], wanted_.Rgb(frame, c, x, y) * 255, frame, x, y);
                }
                colour_.Compare(pixel[3], 255, frame, x, y);
                break;
            }
            case PictureBytes::Argb16: {
                const unsigned char* const pixel = reader_.bytes() + At(x, y) * 8;
                Pixel words;
                for (std::size_t c = 0; c < 3; ++c) {
                    words[c] = pixel[2 * c + 2] << 8 | pixel[2 * c + 3];
                }
                colour_.Compare(pixel[0] << 8 | pixel[1], 65535, frame, x, y);
                if (isRgb || plain_.form().colours == Colours::Grey) {
                    for (int c = 0; c < 3; ++c) {
                        colour_.Compare(words[static_cast<std::size_t>(c)],
                                        4096 + wanted_.Rgb(frame, c, x, y) * 56064, frame, x, y);
                    }
                } else {
                    CompareWords(words, frame, x, y);
                }
                break;
            }
            default:
                break;  // bytes that are not what their label says
        }
    }

    // Y'CbCr out of R'G'B' again, so that nothing hides in the matrix.
    void CompareWords(const Pixel& words, std::size_t frame, int x, int y) {
        for (const double word : words) {
            if (word <= 0 || word >= 65535) {
                return;  // cut off
            }
        }
        const bool isSmall = reader_.width() < 960 || reader_.height() < 720;
        const double red = isSmall ? 0.299 : 0.2126, blue = isSmall ? 0.114 : 0.0722;
        const double r = (words[0] - 4096) / 56064, g = (words[1] - 4096) / 56064,
                     b = (words[2] - 4096) / 56064;
        const double luma = red * r + (1 - red - blue) * g + blue * b;
        words_.Compare(16 + 219 * luma, wanted_.Luma(frame, x, y), frame, x, y);
        const PlainForm& form = plain_.form();
        if (form.shiftY == 0 && form.shiftX <= 1 && x % (1 << form.shiftX) == 0) {
            const double cb = 128 + 112 * (b - luma) / (1 - blue);
            const double cr = 128 + 112 * (r - luma) / (1 - red);
            for (const auto& [component, got] : {std::pair{1, cb}, std::pair{2, cr}}) {
                words_.Compare(
                    got,
                    InVideoRange(form, component, plain_.At(frame, component, x >> form.shiftX, y)),
                    frame, x, y);
            }
        }
    }

    std::size_t At(int x, int y) const {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(reader_.width()) +
               static_cast<std::size_t>(x);
    }
    std::size_t PairAt(int x, int y) const {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(reader_.width()) * 2 +
               static_cast<std::size_t>(x / 2) * 4;
    }

    const PlainPictures& plain_;
    FrameReader& reader_;
    const Wanted wanted_;
    const bool isExact_;
    Worst luma_{"luma", isExact_ ? 0 : kRounded};
    Worst chroma_{"chroma", !wanted_.HasChromaThere() ? kBlended : isExact_ ? 0 : kRounded};
    Worst colour_{"colour", plain_.form().isCoarse ? kBlended : kRounded};
    Worst words_{"Y'CbCr of the words", kThroughWords};
};

}  // namespace

std::vector<std::string> PictureDifferences(cliphost::Essence& essence) {
    const cliphost::ClipTrack* const track = essence.First(cliphost::TrackKind::Picture);
    if (!track) {
        return {"there is no picture track"};
    }
    const PlainPictures plain(essence.movie());
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
