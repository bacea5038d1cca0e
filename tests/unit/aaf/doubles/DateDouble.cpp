// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/aaf/doubles/DateDouble.h"

DateDouble dateDouble;

namespace os {

bool GetLastWriteTime(const std::u16string&, FileTime* time) {
    *time = 0;
    return dateDouble.isQueried;
}

bool ToDateTime(FileTime, DateTime* date) {
    if (dateDouble.isConverted) {
        *date = dateDouble.date;
    }
    return dateDouble.isConverted;
}

}  // namespace os
