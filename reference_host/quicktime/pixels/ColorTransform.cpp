// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/ColorTransform.h"

namespace host {
namespace {

// Numbers of one kind of component: value = (number - zero) / span.
struct Scale {
    double zero;
    double span;
};

// How three components are written.
struct Coding {
    bool isRgb;
    Scale first;   // R'G'B', or luma
    Scale chroma;  // -0.5 to 0.5
    LumaWeights weights;
};

Coding StoredCoding(const PictureForm& form) {
    const double unit = 1 << form.depth;
    if (form.isFullRange) {
        return {form.isRgb, {0.0, unit - 1.0}, {unit / 2.0, unit - 1.0}, form.weights};
    }
    const double step = unit / 256.0;
    return {form.isRgb, {16.0 * step, 219.0 * step}, {128.0 * step, 224.0 * step}, form.weights};
}

Coding LayoutCoding(PixelLayout layout, LumaWeights weights) {
    switch (layout) {
        case PixelLayout::Uyvy8:
            return {false, {16.0, 219.0}, {128.0, 224.0}, weights};
        case PixelLayout::Yuv10:
            return {false, {64.0, 876.0}, {512.0, 896.0}, weights};
        case PixelLayout::AyuvFloat:  // luma from zero, chroma not
            return {false, {0.0, 219.0 / 255.0}, {128.0 / 255.0, 224.0 / 255.0}, weights};
        case PixelLayout::BgraVideo:
            return {true, {16.0, 219.0}, {0.0, 1.0}, weights};
        case PixelLayout::Argb16:
            return {true, {4096.0, 56064.0}, {0.0, 1.0}, weights};
        case PixelLayout::Bgra8:
            break;
    }
    return {true, {0.0, 255.0}, {0.0, 1.0}, weights};
}

struct Matrix {
    double m[3][3];
};

Matrix RgbFromYuv(LumaWeights k) {
    const double green = 1.0 - k.red - k.blue;
    return {{{1.0, 0.0, 2.0 * (1.0 - k.red)},
             {1.0, -2.0 * k.blue * (1.0 - k.blue) / green, -2.0 * k.red * (1.0 - k.red) / green},
             {1.0, 2.0 * (1.0 - k.blue), 0.0}}};
}

Matrix YuvFromRgb(LumaWeights k) {
    const double green = 1.0 - k.red - k.blue;
    const double b = 2.0 * (1.0 - k.blue);
    const double r = 2.0 * (1.0 - k.red);
    return {{{k.red, green, k.blue},
             {-k.red / b, -green / b, (1.0 - k.blue) / b},
             {(1.0 - k.red) / r, -green / r, -k.blue / r}}};
}

Matrix Product(const Matrix& a, const Matrix& b) {
    Matrix out{};
    for (int i = 0; i < 3; ++i) {
        for (int j = 0; j < 3; ++j) {
            for (int k = 0; k < 3; ++k) {
                out.m[i][j] += a.m[i][k] * b.m[k][j];
            }
        }
    }
    return out;
}

constexpr Matrix kUnit{{{1.0, 0.0, 0.0}, {0.0, 1.0, 0.0}, {0.0, 0.0, 1.0}}};

Matrix Between(const Coding& from, const Coding& to) {
    if (from.isRgb == to.isRgb && (from.isRgb || from.weights == to.weights)) {
        return kUnit;
    }
    const Matrix toRgb = from.isRgb ? kUnit : RgbFromYuv(from.weights);
    return to.isRgb ? toRgb : Product(YuvFromRgb(to.weights), toRgb);
}

}  // namespace

LumaWeights DeliveredWeights(const PictureForm& form, PixelLayout layout) {
    const bool keeps = !form.isRgb && form.isStandardMatrix && layout != PixelLayout::AyuvFloat;
    return keeps ? form.weights : WeightsForSize(form.width, form.height);
}

ColorTransform TransformFor(const PictureForm& form, PixelLayout layout) {
    const Coding from = StoredCoding(form);
    const Coding to = LayoutCoding(layout, DeliveredWeights(form, layout));
    const Matrix matrix = Between(from, to);
    ColorTransform transform{};
    for (int i = 0; i < 3; ++i) {
        const Scale& out = i == 0 || to.isRgb ? to.first : to.chroma;
        double offset = out.zero;
        for (int j = 0; j < 3; ++j) {
            const Scale& in = j == 0 || from.isRgb ? from.first : from.chroma;
            const double factor = matrix.m[i][j] * out.span / in.span;
            transform.affine.m[i][j] = static_cast<float>(factor);
            offset -= factor * in.zero;
        }
        transform.affine.m[i][3] = static_cast<float>(offset);
    }
    transform.keepsChromaApart = !from.isRgb && !to.isRgb && from.weights == to.weights;
    transform.opaque = layout == PixelLayout::Argb16      ? 65535.0f
                       : layout == PixelLayout::AyuvFloat ? 1.0f
                                                          : 255.0f;
    transform.alphaScale = transform.opaque / static_cast<float>((1 << form.depth) - 1);
    return transform;
}

}  // namespace host
