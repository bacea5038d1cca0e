// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"
#include "tests/system/codecs/PlainPicture.h"

// What is wrong with the pictures of a movie in each format that they are
// offered in, beside those that FFmpeg decodes: their number, and every sample
// of each. Luma and R'G'B' are FFmpeg's, rounded to the format's depth; so is
// chroma where the format has it at the same places, and elsewhere it is the
// line drawn between its neighbours, within 1.
std::vector<std::string> PictureDifferences(cliphost::Essence& essence, const PlainPictures& plain);
// The same of a clip's alpha track.
std::vector<std::string> AlphaDifferences(cliphost::Essence& essence, const PlainPictures& plain);
