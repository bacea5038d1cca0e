// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/DescriptionObjects.h"

#include <string_view>

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"

namespace header_parser {

using host::Give;
using host::Guarded;
using host::Need;

namespace {

// Zeros behind the text are no part of it.
NCFRESULT GiveText(const Atom& atom, INCFString** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        if (!atom) {
            return NCF_E_PARAMETERNOTAVAILABLE;
        }
        const std::string_view all(reinterpret_cast<const char*>(atom.begin),
                                   static_cast<std::size_t>(atom.Size()));
        return host::GiveString(all.substr(0, all.find('\0')), out);
    });
}

}  // namespace

NCFRESULT VideoDescriptionObject::GetDataFormat(ncfUInt32* dataFormat) {
    return Give(description_->codec, dataFormat);
}

NCFRESULT VideoDescriptionObject::GetEncodedWidthAndHeight(ncfUInt16* width, ncfUInt16* height) {
    if (width == nullptr || height == nullptr) {
        return NCF_E_POINTER;
    }
    *width = description_->width;
    *height = description_->height;
    return NCF_OK;
}

NCFRESULT VideoDescriptionObject::HasAlpha(ncfSInt32* hasAlpha) {
    return Give(description_->hasAlpha, hasAlpha);
}

NCFRESULT VideoDescriptionObject::GetFieldInfo(ncfUInt32* fieldCount, ncfUInt32* topFieldFirst,
                                               ncfUInt32* split) {
    if (fieldCount == nullptr || !description_->fields) {
        return fieldCount == nullptr ? NCF_E_POINTER : NCF_E_PARAMETERNOTAVAILABLE;
    }
    Give(description_->fields->topFirst, topFieldFirst);
    Give(description_->fields->split, split);
    return Give(description_->fields->count, fieldCount);
}

NCFRESULT VideoDescriptionObject::GetVendor(ncfUInt32* vendor) {
    return Give(description_->vendor, vendor);
}

NCFRESULT VideoDescriptionObject::GetImageAspectRatio(ncfUInt32* numerator,
                                                      ncfUInt32* denominator) {
    if (numerator == nullptr || denominator == nullptr) {
        return NCF_E_POINTER;
    }
    if (description_->width == 0 || description_->height == 0) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    const Ratio ratio = ImageAspect(description_->width, description_->height,
                                    description_->cleanAperture, description_->pixelAspect);
    *numerator = ratio.numerator;
    *denominator = ratio.denominator;
    return NCF_OK;
}

NCFRESULT VideoDescriptionObject::GetVideoColorSpaceDetails(ncfUInt32* codes) {
    if (codes == nullptr) {
        return NCF_E_POINTER;
    }
    if (!description_->colors) {
        return NCF_E_PARAMETERNOTAVAILABLE;
    }
    codes[0] = description_->colors->primaries;
    codes[1] = description_->colors->transfer;
    codes[2] = description_->colors->matrix;
    return NCF_OK;
}

NCFRESULT VideoDescriptionObject::GetNivoAlphaCodingCount(ncfUInt32* count) {
    return Give(description_->alphaCodingCount, count);
}

NCFRESULT VideoDescriptionObject::GetNivoAlphaCoding(ncfUInt32 index, ncfUInt32* coding) {
    if (coding == nullptr) {
        return NCF_E_POINTER;
    }
    if (index >= description_->alphaCodingCount) {
        return NCF_E_NOTFOUND;
    }
    *coding = LoadU32(description_->alphaCodings + ncfUInt64{4} * index);
    return NCF_OK;
}

NCFRESULT VideoDescriptionObject::GetNivoResolution(QTNivoResolution* resolution) {
    return resolution == nullptr         ? NCF_E_POINTER
           : !description_->resolutionId ? NCF_E_PARAMETERNOTAVAILABLE
                                         : Give(*description_->resolutionId, &resolution->id);
}

NCFRESULT VideoDescriptionObject::GetRIAttributes(INCFString** text) {
    return GiveText(description_->rasterText, text);
}

NCFRESULT VideoDescriptionObject::GetCMAttributes(INCFString** text) {
    return GiveText(description_->colorText, text);
}

NCFRESULT AudioDescriptionObject::GetChannelsPerFrame(ncfUInt32* channels) {
    return Give(description_->channels, channels);
}

NCFRESULT AudioDescriptionObject::GetBitsPerChannel(ncfUInt32* bits) {
    return Give(description_->bits, bits);
}

NCFRESULT AudioDescriptionObject::GetSampleRate(double* rate) {
    return Give(description_->rate, rate);
}

NCFRESULT AudioDescriptionObject::IsConstantBitRate(ncfBool* constant) {
    return Give(description_->isConstantBitRate, constant);
}

NCFRESULT AudioDescriptionObject::IsLPCM(ncfBool* isLPCM) {
    return Give(description_->isLinear, isLPCM);
}

NCFRESULT AudioDescriptionObject::GetBytesPerPacket(ncfUInt32* bytes) {
    return Give(description_->bytesPerPacket, bytes);
}

NCFRESULT AudioDescriptionObject::IsLittleEndian(ncfBool* littleEndian) {
    return Give(description_->isLittleEndian, littleEndian);
}

}  // namespace header_parser
