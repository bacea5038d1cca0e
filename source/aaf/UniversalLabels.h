// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace NMA::Impl {

// A universal label in label order, as the tables of MXF print it.
using MXFUL = std::array<aafUInt8, 16>;

inline constexpr MXFUL CompressedSoundCodingBaseKey = {
    0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01, 0x04, 0x02, 0x02, 0x02, 0x00, 0x00, 0x00, 0x00};
inline constexpr MXFUL UncompressedPCM_BigEndian_AudioCoding = {
    0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01, 0x0F, 0x02, 0x02, 0x02, 0x03, 0x01, 0x01, 0x00};
inline constexpr MXFUL UncompressedPCMAudioCoding = {
    0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01, 0x04, 0x02, 0x02, 0x02, 0x03, 0x01, 0x01, 0x00};
// Tells the host that a picture comes from the sample provider.
inline constexpr MXFUL SampleProviderPictureCodingKey = {
    0x06, 0x0E, 0x2B, 0x34, 0x04, 0x01, 0x01, 0x01, 0x0E, 0x04, 0x02, 0x01, 0x02, 0x7F, 0x00, 0x00};

// The label as an identifier: its halves change place, and what is then the
// first half is read as big-endian numbers. Bytes are combined as signed
// values, so a byte above 7Fh fills what stands before it; no label of this
// module has one there.
aafUID_t MakeAAFUIDfromMXFUL(const MXFUL& ul);

}  // namespace NMA::Impl
