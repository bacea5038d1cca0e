// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every layout from pictures of many kinds, beside the same conversion in double
// precision, pixel by pixel: nothing but the last rounding may differ.
#include "reference_host/quicktime/pixels/PictureWriter.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <limits>
#include <ostream>
#include <random>
#include <vector>

extern "C" {
#include <libavutil/imgutils.h>
}

namespace {

using host::PixelLayout;

constexpr int kWidth = 37, kHeight = 22;

struct Source {
    const char* name;
    AVPixelFormat format;
    AVColorSpace matrix = AVCOL_SPC_BT709;
    bool isInterlaced = false;
    bool isFullRange = false;
    bool isCentred = false;  // chroma, between two pixels
    int width = kWidth;
};

void PrintTo(const Source& source, std::ostream* out) {
    *out << source.name << ", " << source.width << " wide";
}

const Source kSources[] = {
    {"yuv420p", AV_PIX_FMT_YUV420P},
    {"yuv420p interlaced", AV_PIX_FMT_YUV420P, AVCOL_SPC_SMPTE170M, true},
    {"yuv420p in the matrix of Rec. 2020", AV_PIX_FMT_YUV420P, AVCOL_SPC_BT2020_NCL},
    {"yuvj420p centred", AV_PIX_FMT_YUVJ420P, AVCOL_SPC_BT470BG, false, true, true},
    {"yuv422p", AV_PIX_FMT_YUV422P},
    {"yuv420p10 interlaced", AV_PIX_FMT_YUV420P10, AVCOL_SPC_BT709, true},
    {"yuv422p10", AV_PIX_FMT_YUV422P10},
    {"yuv422p10 in the matrix of Rec. 2020", AV_PIX_FMT_YUV422P10, AVCOL_SPC_BT2020_NCL},
    {"yuv444p12", AV_PIX_FMT_YUV444P12},
    {"yuv444p12 in the matrix of Rec. 2020", AV_PIX_FMT_YUV444P12, AVCOL_SPC_BT2020_NCL},
    {"yuva444p10", AV_PIX_FMT_YUVA444P10},
    {"gbrp", AV_PIX_FMT_GBRP, AVCOL_SPC_RGB, false, true},
    {"gbrp12", AV_PIX_FMT_GBRP12, AVCOL_SPC_RGB, false, true},
    {"rgb48", AV_PIX_FMT_RGB48, AVCOL_SPC_RGB, false, true},
};

// Lines of one, two and three samples of chroma, where first and last meet.
std::vector<Source> Narrow() {
    std::vector<Source> narrow;
    for (int width = 1; width <= 6; ++width) {
        narrow.push_back({"yuv420p", AV_PIX_FMT_YUV420P});
        narrow.push_back(
            {"yuvj420p centred", AV_PIX_FMT_YUVJ420P, AVCOL_SPC_BT470BG, false, true, true});
        narrow.push_back({"yuv444p12", AV_PIX_FMT_YUV444P12});
        for (std::size_t i = narrow.size() - 3; i < narrow.size(); ++i) {
            narrow[i].width = width;
        }
    }
    return narrow;
}

// Weights of red, green and blue in luma.
struct Weights {
    double red, green, blue;
};
constexpr Weights kRec601{0.299, 0.587, 0.114};
constexpr Weights kRec2020{0.2627, 0.6780, 0.0593};
constexpr Weights kRec709{0.2126, 0.7152, 0.0722};

Weights WeightsOf(const Source& source) {
    return source.matrix == AVCOL_SPC_BT2020_NCL ? kRec2020
           : source.matrix == AVCOL_SPC_BT709    ? kRec709
                                                 : kRec601;
}

// Y' Cb Cr from 0 and -0.5 on, or R' G' B' from 0 on, to 1 or 0.5.
struct Triple {
    double a, b, c;
};

Triple RgbOf(const Triple& yuv, Weights k) {
    const double red = yuv.a + 2.0 * (1.0 - k.red) * yuv.c;
    const double blue = yuv.a + 2.0 * (1.0 - k.blue) * yuv.b;
    return {red, (yuv.a - k.red * red - k.blue * blue) / k.green, blue};
}

Triple YuvOf(const Triple& rgb, Weights k) {
    const double luma = k.red * rgb.a + k.green * rgb.b + k.blue * rgb.c;
    return {luma, (rgb.c - luma) / (2.0 * (1.0 - k.blue)), (rgb.a - luma) / (2.0 * (1.0 - k.red))};
}

// Random legal numbers in every component.
host::FrameOwner PictureOf(const Source& source, std::minstd_rand& random) {
    host::FrameOwner frame(av_frame_alloc());
    frame->format = source.format;
    frame->width = source.width;
    frame->height = kHeight;
    frame->colorspace = source.matrix;
    frame->interlaced_frame = source.isInterlaced;
    frame->color_range = source.isFullRange ? AVCOL_RANGE_JPEG : AVCOL_RANGE_MPEG;
    frame->chroma_location = source.isCentred ? AVCHROMA_LOC_CENTER : AVCHROMA_LOC_LEFT;
    if (av_frame_get_buffer(frame.get(), 0) < 0) {
        return nullptr;
    }
    const auto& form = *av_pix_fmt_desc_get(source.format);
    const int unit = 1 << (form.comp[0].depth - 8);
    const int least = source.isFullRange ? 0 : unit;
    const int most = 256 * unit - 1 - least;
    for (AVBufferRef* const buffer : frame->buf) {
        if (buffer) {
            std::memset(buffer->data, 0, buffer->size);
        }
    }
    std::vector<std::uint16_t> line(source.width);
    for (int i = 0; i < form.nb_components; ++i) {
        const bool isChroma = i == 1 || i == 2;
        const int height = isChroma ? -(-kHeight >> form.log2_chroma_h) : kHeight;
        for (int y = 0; y < height; ++y) {
            for (std::uint16_t& number : line) {
                number = static_cast<std::uint16_t>(
                    least + static_cast<int>(random() % static_cast<unsigned>(most - least + 1)));
            }
            av_write_image_line2(line.data(), frame->data, frame->linesize, &form, 0, y, i,
                                 isChroma ? -(-source.width >> form.log2_chroma_w) : source.width,
                                 sizeof line[0]);
        }
    }
    return frame;
}

// The model: places and numbers as they are defined, one at a time.
class Model {
public:
    Model(const Source& source, const AVFrame& frame)
        : source_(source), frame_(frame), form_(*av_pix_fmt_desc_get(source.format)) {}

    bool IsRgb() const { return (form_.flags & AV_PIX_FMT_FLAG_RGB) != 0; }
    Weights Delivered(PixelLayout layout) const {
        const bool keeps =
            !IsRgb() && source_.matrix != AVCOL_SPC_BT2020_NCL && layout != PixelLayout::AyuvFloat;
        return keeps ? WeightsOf(source_) : kRec601;  // for so small a picture
    }

    Triple Rgb(int x, int y) const {
        const Triple stored = Full(x, y);
        return IsRgb() ? stored : RgbOf(stored, WeightsOf(source_));
    }
    Triple Yuv(int x, int y, PixelLayout layout) const {
        return IsRgb() ? YuvOf(Rgb(x, y), kRec601) : Rematrixed(Full(x, y), layout);
    }
    // For the even pixel `x`; luma is not used.
    Triple HalfChroma(int x, int y, PixelLayout layout) const {
        if (form_.log2_chroma_w == 1) {
            return Rematrixed(Normal(0.0, Between(1, x / 2, y), Between(2, x / 2, y)), layout);
        }
        const Triple left = Yuv(std::max(x - 1, 0), y, layout);
        const Triple here = Yuv(x, y, layout);
        const Triple right = Yuv(std::min(x + 1, source_.width - 1), y, layout);
        return {0.0, (left.b + 2.0 * here.b + right.b) / 4.0,
                (left.c + 2.0 * here.c + right.c) / 4.0};
    }
    double Alpha(int x, int y) const {
        return form_.nb_components == 4 ? At(3, x, y) / Most() : 1.0;
    }

private:
    double Most() const { return (1 << form_.comp[0].depth) - 1; }

    double At(int component, int x, int y) const {
        const bool isChroma = component == 1 || component == 2;
        const int width = isChroma ? -(-source_.width >> form_.log2_chroma_w) : source_.width;
        const std::uint8_t* planes[4] = {frame_.data[0], frame_.data[1], frame_.data[2],
                                         frame_.data[3]};
        std::uint16_t number = 0;
        av_read_image_line2(&number, planes, frame_.linesize, &form_, std::clamp(x, 0, width - 1),
                            y, component, 1, 0, sizeof number);
        return number;
    }

    // Chroma of the stored column `x` on line `y` of the picture.
    double Between(int component, int x, int y) const {
        if (form_.log2_chroma_h == 0) {
            return At(component, x, y);
        }
        const int fields = source_.isInterlaced ? 2 : 1;
        const int field = y % fields;
        const double site = fields == 1 ? 0.5 : field == 0 ? 0.25 : 0.75;
        const double place = (y / fields - site) / 2.0;
        const int lines = (-(-kHeight >> 1) + fields - 1 - field) / fields;
        const int above = static_cast<int>(std::floor(place));
        const double weight = place - above;
        const auto line = [&](int i) { return std::clamp(i, 0, lines - 1) * fields + field; };
        return At(component, x, line(above)) * (1.0 - weight) +
               At(component, x, line(above + 1)) * weight;
    }

    double FullChroma(int component, int x, int y) const {
        if (form_.log2_chroma_w == 0) {
            return Between(component, x, y);
        }
        const double place = (x - (source_.isCentred ? 0.5 : 0.0)) / 2.0;
        const int left = static_cast<int>(std::floor(place));
        const double weight = place - left;
        return Between(component, left, y) * (1.0 - weight) +
               Between(component, left + 1, y) * weight;
    }

    Triple Normal(double a, double b, double c) const {
        const double unit = 1 << (form_.comp[0].depth - 8);
        if (IsRgb()) {
            return {a / Most(), b / Most(), c / Most()};
        }
        const double chroma = source_.isFullRange ? Most() : 224.0 * unit;
        return {source_.isFullRange ? a / Most() : (a - 16.0 * unit) / (219.0 * unit),
                (b - 128.0 * unit) / chroma, (c - 128.0 * unit) / chroma};
    }

    Triple Full(int x, int y) const {
        return IsRgb() ? Normal(At(0, x, y), At(1, x, y), At(2, x, y))
                       : Normal(At(0, x, y), FullChroma(1, x, y), FullChroma(2, x, y));
    }

    Triple Rematrixed(const Triple& yuv, PixelLayout layout) const {
        return YuvOf(RgbOf(yuv, WeightsOf(source_)), Delivered(layout));
    }

    const Source& source_;
    const AVFrame& frame_;
    const AVPixFmtDescriptor& form_;
};

// The picture in a layout. Numbers are compared one by one.
class Written {
public:
    Written(const AVFrame& frame, PixelLayout layout)
        : layout_(layout),
          width_(frame.width),
          bytes_(host::PictureBytes(layout, width_, kHeight)) {
        works_ = host::WritePicture(frame, layout, width_, kHeight, bytes_.data());
    }
    bool Works() const { return works_; }

    double Byte(int y, int i) const { return Line(y)[i]; }
    double Word(int y, int i) const { return Line(y)[2 * i] << 8 | Line(y)[2 * i + 1]; }
    double Packed(int y, int i) const {  // three numbers in each little-endian word
        std::uint32_t word = 0;
        std::memcpy(&word, Line(y) + i / 3 * 4, sizeof word);
        return word >> (i % 3 * 10) & 1023u;
    }
    double Float(int y, int i) const {
        float number = 0.0f;
        std::memcpy(&number, Line(y) + i * 4, sizeof number);
        return static_cast<double>(number);
    }

private:
    const std::uint8_t* Line(int y) const {
        return bytes_.data() + host::LineBytes(layout_, width_) * static_cast<std::size_t>(y);
    }
    PixelLayout layout_;
    int width_;
    std::vector<std::uint8_t> bytes_;
    bool works_;
};

class PictureWriter : public testing::TestWithParam<Source> {
protected:
    PictureWriter() : frame_(PictureOf(GetParam(), random_)), model_(GetParam(), *frame_) {}

    // Cb Y Cr Y, numbers of so many times eight bits.
    template <class Number>
    void ExpectHalfChroma(PixelLayout layout, double scale, Number number) {
        for (int y = 0; y < kHeight; ++y) {
            for (int x = 0; x < GetParam().width; ++x) {
                const Triple chroma = model_.HalfChroma(x - x % 2, y, layout);
                const double wanted[2] = {128.0 + 224.0 * (x % 2 == 0 ? chroma.b : chroma.c),
                                          16.0 + 219.0 * model_.Yuv(x, y, layout).a};
                for (int i = 0; i < 2; ++i) {
                    const double held = std::clamp(wanted[i] * scale, scale, 255.0 * scale - 1.0);
                    ASSERT_NEAR(number(y, 2 * x + i), held, 0.501) << x << " " << y;
                }
            }
        }
    }

    std::minstd_rand random_{5};
    host::FrameOwner frame_;
    Model model_;
};

TEST_P(PictureWriter, WritesEightBitYuvToTheNearestCode) {
    const Written written(*frame_, PixelLayout::Uyvy8);
    ASSERT_TRUE(written.Works());
    ExpectHalfChroma(PixelLayout::Uyvy8, 1.0, [&](int y, int i) { return written.Byte(y, i); });
}

TEST_P(PictureWriter, WritesTenBitYuvToTheNearestCode) {
    const Written written(*frame_, PixelLayout::Yuv10);
    ASSERT_TRUE(written.Works());
    ExpectHalfChroma(PixelLayout::Yuv10, 4.0, [&](int y, int i) { return written.Packed(y, i); });
}

TEST_P(PictureWriter, WritesRgbToTheNearestCode) {
    const Written full(*frame_, PixelLayout::Bgra8);
    const Written video(*frame_, PixelLayout::BgraVideo);
    const Written deep(*frame_, PixelLayout::Argb16);
    ASSERT_TRUE(full.Works() && video.Works() && deep.Works());
    for (int y = 0; y < kHeight; ++y) {
        for (int x = 0; x < GetParam().width; ++x) {
            const Triple rgb = model_.Rgb(x, y);
            const double wanted[3] = {rgb.a, rgb.b, rgb.c};
            const auto held = [](double value, double most) {
                return std::clamp(value, 0.0, most);
            };
            for (int i = 0; i < 3; ++i) {
                SCOPED_TRACE(testing::Message() << x << " " << y << " " << i);
                const double v = wanted[i];
                ASSERT_NEAR(full.Byte(y, 4 * x + 2 - i), held(255.0 * v, 255.0), 0.501);
                ASSERT_NEAR(video.Byte(y, 4 * x + 2 - i), held(16.0 + 219.0 * v, 255.0), 0.501);
                ASSERT_NEAR(deep.Word(y, 4 * x + 1 + i), held(4096.0 + 56064.0 * v, 65535.0), 0.53);
            }
            ASSERT_NEAR(full.Byte(y, 4 * x + 3), 255.0 * model_.Alpha(x, y), 0.501);
            ASSERT_NEAR(deep.Word(y, 4 * x), 65535.0 * model_.Alpha(x, y), 0.53);
        }
    }
}

TEST_P(PictureWriter, WritesFloatsNearerThanCodesOfSixteenBits) {
    const PixelLayout layout = PixelLayout::AyuvFloat;
    const Written written(*frame_, layout);
    ASSERT_TRUE(written.Works());
    for (int y = 0; y < kHeight; ++y) {
        for (int x = 0; x < GetParam().width; ++x) {
            const Triple yuv = model_.Yuv(x, y, layout);
            const double wanted[4] = {model_.Alpha(x, y), yuv.a * 219.0 / 255.0,
                                      (128.0 + 224.0 * yuv.b) / 255.0,
                                      (128.0 + 224.0 * yuv.c) / 255.0};
            for (int i = 0; i < 4; ++i) {
                ASSERT_NEAR(written.Float(y, 4 * x + i), wanted[i], 0.03 / 65535.0)
                    << x << " " << y;
            }
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Sources, PictureWriter, testing::ValuesIn(kSources));
INSTANTIATE_TEST_SUITE_P(NarrowSources, PictureWriter, testing::ValuesIn(Narrow()));

TEST(PictureWriterOfFloats, WritesWhatIsNoNumberAsBlack) {
    const host::FrameOwner frame(av_frame_alloc());
    frame->format = AV_PIX_FMT_GBRPF32LE;
    frame->width = 16;
    frame->height = 1;
    ASSERT_GE(av_frame_get_buffer(frame.get(), 0), 0);
    const float numbers[] = {std::numeric_limits<float>::quiet_NaN(), -1.0f,
                             std::numeric_limits<float>::infinity(), 1.0f};
    for (int plane = 0; plane < 3; ++plane) {
        std::memset(frame->data[plane], 0, 64);
        std::memcpy(frame->data[plane], numbers, sizeof numbers);
    }
    std::uint8_t pixels[64] = {};
    ASSERT_TRUE(host::WritePicture(*frame, PixelLayout::Bgra8, 16, 1, pixels));
    const std::uint8_t wanted[16] = {0,   0,   0,   255, 0,   0,   0,   255,
                                     255, 255, 255, 255, 255, 255, 255, 255};
    EXPECT_TRUE(std::equal(std::begin(wanted), std::end(wanted), pixels));
}

host::FrameOwner FrameOf(AVPixelFormat format, int width, int height) {
    host::FrameOwner frame(av_frame_alloc());
    frame->format = format;
    frame->width = width;
    frame->height = height;
    return av_frame_get_buffer(frame.get(), 0) < 0 ? nullptr : std::move(frame);
}

TEST(PictureWriterOfUnevenSteps, RefusesAFormatWhoseLumaStandsInUnevenSteps) {
    const host::FrameOwner frame = FrameOf(AV_PIX_FMT_UYYVYY411, 64, 48);
    ASSERT_TRUE(frame);
    std::vector<std::uint8_t> pixels(64 * 48 * 4);
    for (const PixelLayout layout : {PixelLayout::Uyvy8, PixelLayout::Bgra8}) {
        EXPECT_FALSE(host::WritePicture(*frame, layout, 64, 48, pixels.data()));
    }
}

TEST(PictureWriterOfLooseWords, LeavesOutWhatIsAboveTenBits) {
    const host::FrameOwner frame = FrameOf(AV_PIX_FMT_YUV422P10LE, 6, 1);
    ASSERT_TRUE(frame);
    for (int plane = 0; plane < 3; ++plane) {
        const std::uint16_t word = plane == 0 ? 0xFFFF : 0xFC00;
        for (int x = 0; x < (plane == 0 ? 6 : 3); ++x) {
            std::memcpy(frame->data[plane] + 2 * x, &word, 2);
        }
    }
    std::uint8_t pixels[128] = {};
    ASSERT_TRUE(host::WritePicture(*frame, PixelLayout::Yuv10, 6, 1, pixels));
    std::uint32_t words[4] = {};
    std::memcpy(words, pixels, sizeof words);
    EXPECT_EQ(words[0], 0x3FFu << 10);
    EXPECT_EQ(words[1], 0x3FFu | 0x3FFu << 20);
    EXPECT_EQ(words[2], 0x3FFu << 10);
    EXPECT_EQ(words[3], 0x3FFu | 0x3FFu << 20);
}

}  // namespace
