// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// Finds the last of `count` rising keys that is not above `value`; the first
// must not be. `keyAt(i)` gives a key. Tables of real movies rise evenly, so
// the search begins where the value would stand then and widens from there: a
// step or two as a rule, logarithmic at worst.
template <typename Value, typename KeyAt>
ncfUInt32 LastNotAbove(ncfUInt32 count, Value value, KeyAt keyAt) {
    const Value first = keyAt(0);
    const Value last = keyAt(count - 1);
    if (value >= last) {
        return count - 1;
    }
    const double share = static_cast<double>(value - first) / static_cast<double>(last - first);
    ncfUInt32 low = static_cast<ncfUInt32>(share * (count - 1));
    ncfUInt32 high = count - 1;  // its key is above the value
    if (keyAt(low) <= value) {
        for (ncfUInt32 step = 1; high - low > step; step *= 2) {
            if (keyAt(low + step) > value) {
                high = low + step;
                break;
            }
            low += step;
        }
    } else {
        high = low;
        low = 0;
        for (ncfUInt32 step = 1; high > step; step *= 2) {
            if (keyAt(high - step) <= value) {
                low = high - step;
                break;
            }
            high -= step;
        }
    }
    while (high - low > 1) {
        const ncfUInt32 middle = low + (high - low) / 2;
        (keyAt(middle) <= value ? low : high) = middle;
    }
    return low;
}

}  // namespace header_parser
