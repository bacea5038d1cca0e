// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/movie_writer/Box.h"

// Small files of kinds that FFmpeg does not write.

// An RGB picture of 16 x 8 that brightens from the left; layers: none.
movies::Bytes PhotoshopPicture();
// One note.
movies::Bytes MidiSong();
movies::Bytes Letter();
