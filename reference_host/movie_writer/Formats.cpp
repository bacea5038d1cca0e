// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/movie_writer/Formats.h"

namespace movies {

namespace {

Box ColorBox(const char* kind, const std::array<unsigned, 3>& codes) {
    Box box("colr");
    box.Code(kind);
    for (const unsigned code : codes) {
        box.U16(code);
    }
    return box;
}

void AddPictureAtoms(Box& box, const VideoFormat& format) {
    if (format.fields) {
        box.Add(Box("fiel").U8(format.fields->first).U8(format.fields->second));
    }
    if (format.nclc) {
        box.Add(ColorBox("nclc", *format.nclc));
    }
    if (format.nclx) {
        box.Add(ColorBox("nclx", *format.nclx).U8(0));
    }
    if (format.pixelAspect) {
        box.Add(Box("pasp").U32(format.pixelAspect->first).U32(format.pixelAspect->second));
    }
    if (format.cleanAperture) {
        Box clap("clap");
        for (const std::int32_t number : *format.cleanAperture) {
            clap.U32(static_cast<std::uint32_t>(number));
        }
        box.Add(clap);
    }
    if (format.gamma) {
        box.Add(Box("gama").Fixed16(*format.gamma));
    }
}

void AddUserAtoms(Box& box, const VideoFormat& format) {
    if (format.rasterText) {
        box.Add(Box("chRI").Text(*format.rasterText));
    }
    if (format.colorText) {
        box.Add(Box("chCM").Text(*format.colorText));
    }
    if (format.resolutionId) {
        box.Add(Box("chRS").Version(0).U32(*format.resolutionId));
    }
    if (format.alphaCodings) {
        Box codings("chAC");
        codings.Version(0).U32(format.alphaCodings->size());
        for (const std::uint32_t coding : *format.alphaCodings) {
            codings.U32(coding);
        }
        box.Add(codings);
    }
}

}  // namespace

Box VideoFormat::ToBox() const {
    Box box(codec);
    box.Zeros(6).U16(dataReference);
    box.U16(0).U16(0).Code(vendor).U32(512).U32(512);
    box.U16(width).U16(height).Fixed16(72).Fixed16(72);
    box.U32(0).U16(1).Pascal(compressorName, 32).U16(depth).U16(0xFFFF);
    box.Add(extensions);
    AddPictureAtoms(box, *this);
    AddUserAtoms(box, *this);
    if (closingZero) {
        box.U32(0);
    }
    return box;
}

Box SoundFormat::ToBox() const {
    Box box(codec);
    box.Zeros(6).U16(dataReference).U16(version).U16(0).U32(0);
    const unsigned frameBytes = bytesPerFrame ? bytesPerFrame : channels * ((bits + 7) / 8);
    if (version == 2) {
        box.U16(3).U16(16).U16(0xFFFE).U16(0).U32(0x00010000);
        box.U32(72).Double(rate).U32(channels).U32(0x7F000000).U32(bits).U32(linearFlags);
        box.U32(bytesPerPacket ? bytesPerPacket : frameBytes).U32(framesPerPacket);
    } else {
        box.U16(channels).U16(bits).U16(static_cast<unsigned>(compressionId) & 0xFFFF).U16(0);
        box.Fixed16(rate);
    }
    if (version == 1) {
        const unsigned packetBytes = bytesPerPacket ? bytesPerPacket : frameBytes / channels;
        box.U32(framesPerPacket).U32(packetBytes).U32(frameBytes).U32(bytesPerSample);
    }
    std::vector<Box> atoms = extensions;
    if (littleEndian) {
        atoms.push_back(Box("enda").U16(*littleEndian ? 1 : 0));
    }
    if (wave) {
        box.Add(Box("wave").Add(Box("frma").Code(codec)).Add(atoms).U32(8).U32(0));
    } else {
        box.Add(atoms);
    }
    if (channelLayout) {
        box.Add(Box("chan").Version(0).U32((101u << 16) | channels).U32(0).U32(0));
    }
    return box;
}

Box TimecodeFormat::ToBox() const {
    Box box("tmcd");
    box.Zeros(6).U16(dataReference);
    box.U32(0).U32(flags).U32(timeScale).U32(frameDuration).U8(numFrames);
    box.Zeros(wideReserve ? 3 : 1);
    if (!reelName.empty()) {
        box.Add(Box("name").U16(static_cast<unsigned>(reelName.size())).U16(0).Text(reelName));
    }
    return box;
}

}  // namespace movies
