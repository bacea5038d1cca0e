// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/Picture.h"

namespace cliphost {

// A sheet of thumbnails in rows.
class ContactSheet {
public:
    // Cells of a size, so many in a row.
    ContactSheet(int cells, int columns, int cellWidth, int cellHeight);

    // Puts a picture into the next cell, as large as it fits. Where it is
    // transparent a checkerboard shows through.
    void Add(const Picture& picture);
    const Picture& picture() const { return sheet_; }

private:
    int columns_;
    int cellWidth_;
    int cellHeight_;
    int next_ = 0;
    Picture sheet_;
};

// A picture at another size, 8 bits, R'G'B'; each pixel is the mean of what it
// covers.
Picture Shrunk(const Picture& picture, int width, int height);

}  // namespace cliphost
