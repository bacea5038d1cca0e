// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/FileTypes.h"

#include <iterator>

namespace NMA::Impl {
namespace {

using Wide = ncfUTF16LiteralToUTF16;

// Built at module start.
const FileType kFileTypes[] = {
    {Wide(L"MOV"), Wide(L"MOV Files")},   {Wide(L"MP4"), Wide(L"MP4 Files")},
    {Wide(L"M4V"), Wide(L"M4V Files")},   {Wide(L"MPG"), Wide(L"MPG Files")},
    {Wide(L"MPE"), Wide(L"MPE Files")},   {Wide(L"MPEG"), Wide(L"MPEG Files")},
    {Wide(L"M2T"), Wide(L"M2T Files")},   {Wide(L"3GP"), Wide(L"3GP Files")},
    {Wide(L"3G2"), Wide(L"3G2 Files")},   {Wide(L"QT"), Wide(L"QT Files")},
    {Wide(L"MOOV"), Wide(L"MOOV Files")}, {Wide(L"MOVIE"), Wide(L"MOVIE Files")},
    {Wide(L"AVI"), Wide(L"AVI Files")},   {Wide(L"TXT"), Wide(L"TXT Files")},
    {Wide(L"MP2"), Wide(L"MP2 Files")},   {Wide(L"MP3"), Wide(L"MP3 Files")},
    {Wide(L"M4A"), Wide(L"M4A Files")},   {Wide(L"WAV"), Wide(L"WAV Files")},
    {Wide(L"AIFF"), Wide(L"AIFF Files")}, {Wide(L"AIF"), Wide(L"AIF Files")},
    {Wide(L"AU"), Wide(L"AU Files")},     {Wide(L"AAC"), Wide(L"AAC Files")},
    {Wide(L"MID"), Wide(L"MID Files")},   {Wide(L"MPA"), Wide(L"MPA Files")},
    {Wide(L"GIF"), Wide(L"GIF Files")},   {Wide(L"JPG"), Wide(L"JPG Files")},
    {Wide(L"JPEG"), Wide(L"JPEG Files")}, {Wide(L"JFIF"), Wide(L"JFIF Files")},
    {Wide(L"TIF"), Wide(L"TIF Files")},   {Wide(L"TIFF"), Wide(L"TIFF Files")},
    {Wide(L"PNG"), Wide(L"PNG Files")},   {Wide(L"BMP"), Wide(L"BMP Files")},
    {Wide(L"PSD"), Wide(L"PSD Files")},   {Wide(L"DV"), Wide(L"DV Files")},
};
static_assert(std::size(kFileTypes) == kFileTypeCount);

const Wide kGroup(L"QuickTime Media Files");

}  // namespace

const FileType& FileTypeAt(ncfUInt32 index) {
    return kFileTypes[index];
}

const ncfUTF16LiteralToUTF16& FileTypeGroup() {
    return kGroup;
}

}  // namespace NMA::Impl
