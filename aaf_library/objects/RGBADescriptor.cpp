// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/RGBADescriptor.h"

#include <algorithm>
#include <array>

namespace aaf {

namespace {

constexpr aafUInt32 kPlaces = 8;

// Value-initialised: the padding of the components never reaches a file, but
// comparing whole structures is then harmless too.
using Layout = std::array<aafRGBAComponent_t, kPlaces>;

HRESULT PutLayout(Object& object, const PropertyKey& key, aafUInt32 count,
                  const aafRGBAComponent_t* components) {
    if (components == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (count > kPlaces) {
        return AAFRESULT_SMALLBUF;
    }
    Layout layout{};
    for (aafUInt32 at = 0; at < kPlaces; ++at) {
        layout[at].Code = at < count ? components[at].Code : kAAFCompNone;
        layout[at].Size = at < count ? components[at].Size : aafUInt8{0};
    }
    return object.PutNative(key, layout.data(), sizeof layout);
}

HRESULT ReadLayout(const Object& object, const PropertyKey& key, Layout& layout) {
    layout = Layout{};
    return object.ReadNative(key, layout.data(), sizeof layout);
}

HRESULT CountComponents(const Object& object, const PropertyKey& key, aafUInt32* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Layout layout;
    const HRESULT read = ReadLayout(object, key, layout);
    if (read < 0) {
        return read;
    }
    *result = static_cast<aafUInt32>(
        std::count_if(layout.begin(), layout.end(), [](const aafRGBAComponent_t& component) {
            return component.Code != kAAFCompNone && component.Code != kAAFCompNull;
        }));
    return AAFRESULT_SUCCESS;
}

HRESULT CopyLayout(const Object& object, const PropertyKey& key, aafUInt32 count,
                   aafRGBAComponent_t* components) {
    if (components == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (count > kPlaces) {
        return AAFRESULT_SMALLBUF;
    }
    Layout layout;
    const HRESULT read = ReadLayout(object, key, layout);
    if (read >= 0) {
        std::copy_n(layout.begin(), count, components);
    }
    return read;
}

}  // namespace

void RGBADescriptor::SetDefaults() {
    DigitalImageDescriptor::SetDefaults();
    const aafRGBAComponent_t none{};
    PutLayout(*this, prop::RGBADescriptor_PixelLayout, 0, &none);
}

HRESULT RGBADescriptor::SetPixelLayout(aafUInt32 numberElements, aafRGBAComponent_t* pixelLayout) {
    return PutLayout(*this, prop::RGBADescriptor_PixelLayout, numberElements, pixelLayout);
}

HRESULT RGBADescriptor::CountPixelLayoutElements(aafUInt32* result) {
    return CountComponents(*this, prop::RGBADescriptor_PixelLayout, result);
}

HRESULT RGBADescriptor::GetPixelLayout(aafUInt32 numberElements, aafRGBAComponent_t* pixelLayout) {
    return CopyLayout(*this, prop::RGBADescriptor_PixelLayout, numberElements, pixelLayout);
}

HRESULT RGBADescriptor::SetPaletteLayout(aafUInt32 numberElements,
                                         aafRGBAComponent_t* paletteLayout) {
    return PutLayout(*this, prop::RGBADescriptor_PaletteLayout, numberElements, paletteLayout);
}

HRESULT RGBADescriptor::CountPaletteLayoutElements(aafUInt32* result) {
    return CountComponents(*this, prop::RGBADescriptor_PaletteLayout, result);
}

HRESULT RGBADescriptor::GetPaletteLayout(aafUInt32 numberElements,
                                         aafRGBAComponent_t* paletteLayout) {
    return CopyLayout(*this, prop::RGBADescriptor_PaletteLayout, numberElements, paletteLayout);
}

}  // namespace aaf
