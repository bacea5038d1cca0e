// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/PictureWriter.h"

#include <algorithm>
#include <cstring>
#include <vector>

#include "reference_host/quicktime/pixels/ChromaRows.h"
#include "reference_host/quicktime/pixels/ColorTransform.h"
#include "reference_host/quicktime/pixels/DirectPaths.h"
#include "reference_host/quicktime/pixels/RowKernels.h"

namespace host {
namespace {

// Lines of plain numbers.
class Rows {
public:
    explicit Rows(int width)
        : stride_((static_cast<std::size_t>(width) + 31) / 16 * 16), values_(stride_ * 8) {}
    float* operator[](std::size_t i) { return values_.data() + i * stride_; }

private:
    std::size_t stride_;
    std::vector<float> values_;
};

class Writer {
public:
    Writer(const AVFrame& frame, const PictureForm& form, PixelLayout layout, std::uint8_t* to)
        : form_(form),
          layout_(layout),
          transform_(TransformFor(form, layout)),
          reader_(frame, form),
          chroma_(reader_, form),
          rows_(form.width),
          to_(to),
          lineBytes_(LineBytes(layout, static_cast<ncfUInt32>(form.width))) {
        std::fill_n(rows_[6], form.width, transform_.opaque);
    }

    void Run() {
        const bool isHalf = layout_ == PixelLayout::Uyvy8 || layout_ == PixelLayout::Yuv10;
        for (int line = 0; line < form_.height; ++line) {
            isHalf ? WriteHalfChroma(line) : WriteFull(line);
            to_ += lineBytes_;
        }
    }

private:
    // All three components at full width into rows 0 to 2, as stored.
    void ReadFull(int line) {
        reader_.Read(0, line, rows_[0]);
        if (form_.isRgb) {
            reader_.Read(1, line, rows_[1]);
            reader_.Read(2, line, rows_[2]);
        } else {
            chroma_.Read(1, line, 0, rows_[1]);
            chroma_.Read(2, line, 0, rows_[2]);
        }
    }

    void Transform() {
        ApplyAffine(transform_.affine, rows_[0], rows_[1], rows_[2], form_.width, rows_[3],
                    rows_[4], rows_[5]);
    }

    const float* Alpha(int line) {
        if (!form_.hasAlpha) {
            return rows_[6];
        }
        reader_.Read(3, line, rows_[7]);
        ScaleRow(rows_[7], transform_.alphaScale, 0.0f, form_.width, rows_[7]);
        return rows_[7];
    }

    void WriteFull(int line) {
        constexpr int kPart = 512;  // its numbers stay in the nearest cache
        ReadFull(line);
        const bool isBgra = layout_ == PixelLayout::Bgra8 || layout_ == PixelLayout::BgraVideo;
        if (isBgra && !form_.isRgb && !form_.hasAlpha) {
            StoreOpaqueBgra(transform_.affine, rows_[0], rows_[1], rows_[2], form_.width, to_);
            return;
        }
        const float* const alpha = Alpha(line);
        const auto store = layout_ == PixelLayout::Argb16      ? StoreArgb16
                           : layout_ == PixelLayout::AyuvFloat ? StoreAyuvFloat
                                                               : StoreBgra;
        const std::size_t pixelBytes = LineBytes(layout_, 1);
        for (int x = 0; x < form_.width; x += kPart) {
            const int count = std::min(kPart, form_.width - x);
            ApplyAffine(transform_.affine, rows_[0] + x, rows_[1] + x, rows_[2] + x, count,
                        rows_[3], rows_[4], rows_[5]);
            store(rows_[3], rows_[4], rows_[5], alpha + x, count,
                  to_ + pixelBytes * static_cast<std::size_t>(x));
        }
    }

    void WriteHalfChroma(int line) {
        const int half = (form_.width + 1) / 2;
        if (transform_.keepsChromaApart) {
            const Affine& k = transform_.affine;
            reader_.Read(0, line, rows_[0]);
            ScaleRow(rows_[0], k.m[0][0], k.m[0][3], form_.width, rows_[3]);
            for (int i = 1; i <= 2; ++i) {
                chroma_.Read(i, line, 1, rows_[0]);
                ScaleRow(rows_[0], k.m[i][i], k.m[i][3], half, rows_[3 + i]);
            }
            Store(rows_[3], rows_[4], rows_[5]);
            return;
        }
        ReadFull(line);
        Transform();
        if (form_.isRgb) {
            HalveChroma(rows_[4], form_.width, rows_[0]);
            HalveChroma(rows_[5], form_.width, rows_[1]);
            Store(rows_[3], rows_[0], rows_[1]);
            return;
        }
        // Chroma is made of chroma alone, so it is not widened and halved again.
        chroma_.Read(1, line, 1, rows_[1]);
        chroma_.Read(2, line, 1, rows_[2]);
        ApplyAffine(transform_.affine, rows_[0], rows_[1], rows_[2], half, rows_[7], rows_[4],
                    rows_[5]);
        Store(rows_[3], rows_[4], rows_[5]);
    }

    // The codes at both ends are kept for synchronisation.
    void Store(const float* luma, const float* cb, const float* cr) {
        if (layout_ == PixelLayout::Uyvy8) {
            StoreUyvy(luma, cb, cr, form_.width, 1.0f, 254.0f, to_);
            return;
        }
        const auto width = static_cast<std::size_t>(form_.width);
        words_.resize(width * 2 + 2);
        std::uint16_t* const half = words_.data() + width;
        const int count = (form_.width + 1) / 2;
        RoundRow(luma, 4.0f, 1019.0f, form_.width, words_.data());
        RoundRow(cb, 4.0f, 1019.0f, count, half);
        RoundRow(cr, 4.0f, 1019.0f, count, half + count);
        StoreV210(words_.data(), half, half + count, form_.width, to_);
    }

    const PictureForm& form_;
    PixelLayout layout_;
    ColorTransform transform_;
    RowReader reader_;
    ChromaRows chroma_;
    Rows rows_;
    std::vector<std::uint16_t> words_;
    std::uint8_t* to_;
    std::size_t lineBytes_;
};

// A palette can't be scaled; everything else that can be read keeps its format.
AVPixelFormat ScalableFormat(AVPixelFormat readable) {
    return readable == AV_PIX_FMT_PAL8 ? AV_PIX_FMT_BGRA : readable;
}

AVPixelFormat ReadableFormat(AVPixelFormat format) {
    if (PictureForm::CanRead(format)) {
        return format;
    }
    const AVPixFmtDescriptor* const found = av_pix_fmt_desc_get(format);
    const bool hasAlpha = found && (found->flags & AV_PIX_FMT_FLAG_ALPHA) != 0;
    return hasAlpha ? AV_PIX_FMT_RGBA64LE : AV_PIX_FMT_RGB48LE;
}

// In which small pictures are scaled: eight bits do, and chroma of a large picture that stands
// for two of its pixels is enough for each of a small one.
AVPixelFormat SmallFormat(AVPixelFormat stored) {
    const AVPixelFormat readable = ReadableFormat(stored);
    const AVPixFmtDescriptor* const found = av_pix_fmt_desc_get(readable);
    const bool isPlain = (found->flags & (AV_PIX_FMT_FLAG_RGB | AV_PIX_FMT_FLAG_PAL)) != 0 ||
                         found->nb_components < 3;
    return isPlain                                       ? ScalableFormat(readable)
           : (found->flags & AV_PIX_FMT_FLAG_ALPHA) != 0 ? AV_PIX_FMT_YUVA444P
           : IsFullRangeByName(readable)                 ? AV_PIX_FMT_YUVJ444P
                                                         : AV_PIX_FMT_YUV444P;
}

// The picture in another format or size by the library's own conversion.
FrameOwner Reformed(const AVFrame& frame, AVPixelFormat format, int width, int height,
                    int method = SWS_BICUBIC) {
    const auto from = static_cast<AVPixelFormat>(frame.format);
    const ScalerOwner scaler(sws_getContext(frame.width, frame.height, from, width, height, format,
                                            method | SWS_ACCURATE_RND | SWS_FULL_CHR_H_INT, nullptr,
                                            nullptr, nullptr));
    FrameOwner out(av_frame_alloc());
    if (!scaler || !out || av_frame_copy_props(out.get(), &frame) < 0) {
        return nullptr;
    }
    out->format = format;
    out->width = width;
    out->height = height;
    if (av_frame_get_buffer(out.get(), 0) < 0 ||
        sws_scale(scaler.get(), frame.data, frame.linesize, 0, frame.height, out->data,
                  out->linesize) < 0) {
        return nullptr;
    }
    return out;
}

// Pictures that begin with the lines of the vertical interval, as those of D-10
// do: their files tell the size of what is behind.
struct IntervalForm {
    int codedHeight;
    int height;
};
constexpr IntervalForm kIntervalForms[] = {{608, 576}, {512, 486}};

// The picture without its vertical interval; null for one that has none.
FrameOwner WithoutInterval(const AVFrame& frame, int width, int height) {
    for (const IntervalForm& form : kIntervalForms) {
        if (frame.width != width || width != 720 || frame.height != form.codedHeight ||
            height != form.height || frame.format != AV_PIX_FMT_YUV422P) {
            continue;
        }
        FrameOwner out(av_frame_clone(&frame));
        if (!out) {
            return nullptr;
        }
        // An even number of lines, so each field keeps its own.
        for (int plane = 0; plane < 3; ++plane) {
            out->data[plane] +=
                std::ptrdiff_t{form.codedHeight - form.height} * out->linesize[plane];
        }
        out->height = form.height;
        return out;
    }
    return nullptr;
}

}  // namespace

bool WritePicture(const AVFrame& frame, PixelLayout layout, ncfUInt32 width, ncfUInt32 height,
                  std::uint8_t* to) {
    const auto stored = static_cast<AVPixelFormat>(frame.format);
    const AVPixelFormat readable = ReadableFormat(stored);
    const int wantedWidth = static_cast<int>(width);
    const int wantedHeight = static_cast<int>(height);
    if (const FrameOwner behind = WithoutInterval(frame, wantedWidth, wantedHeight)) {
        return WritePicture(*behind, layout, width, height, to);
    }
    if (readable != stored || frame.width != wantedWidth || frame.height != wantedHeight) {
        const FrameOwner reformed =
            Reformed(frame, ScalableFormat(readable), wantedWidth, wantedHeight);
        return reformed && WritePicture(*reformed, layout, width, height, to);
    }
    const PictureForm form(frame);
    if (!WriteDirectly(frame, form, layout, to)) {
        Writer(frame, form, layout, to).Run();
    }
    return true;
}

bool WriteSmallPicture(const AVFrame& frame, const SmallPicture& small, std::uint8_t* to) {
    if (const FrameOwner behind = WithoutInterval(frame, small.fullWidth, small.fullHeight)) {
        return WriteSmallPicture(*behind, small, to);
    }
    const bool isWhole = small.width == small.fullWidth && small.height == small.fullHeight;
    const FrameOwner picture =
        isWhole ? FrameOwner(av_frame_clone(&frame))
                : Reformed(frame, SmallFormat(static_cast<AVPixelFormat>(frame.format)),
                           small.width, small.height, SWS_AREA);
    if (!picture) {
        return false;
    }
    // The size of a small one would tell another.
    if (!NamesMatrix(picture->colorspace)) {
        picture->colorspace = WeightsForSize(small.fullWidth, small.fullHeight) == kRec709
                                  ? AVCOL_SPC_BT709
                                  : AVCOL_SPC_SMPTE170M;
    }
    if (small.matrix != AVCOL_SPC_UNSPECIFIED && PictureForm(*picture).isStandardMatrix) {
        picture->colorspace = small.matrix;
    }
    return WritePicture(*picture, PixelLayout::Bgra8, static_cast<ncfUInt32>(small.width),
                        static_cast<ncfUInt32>(small.height), to);
}

}  // namespace host
