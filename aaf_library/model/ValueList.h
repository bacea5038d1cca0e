// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <utility>
#include <vector>

#include "aaf_library/model/PropertyKey.h"
#include "aaf_library/model/PropertyValue.h"
#include "aaf_library/model/RefPtr.h"

namespace aaf {

// The values of an object, ordered by their properties' numbers. They are few, and they are read
// far more often than one comes or goes: so they lie side by side.
class ValueList {
public:
    using Entry = std::pair<PropertyId, RefPtr<PropertyValue>>;
    using Iterator = std::vector<Entry>::const_iterator;

    Iterator begin() const { return entries_.begin(); }
    Iterator end() const { return entries_.end(); }
    std::size_t size() const { return entries_.size(); }
    const Entry& At(std::size_t index) const { return entries_[index]; }

    // Null when it is absent.
    PropertyValue* Find(PropertyId pid) const {
        const auto place = PlaceOf(pid);
        return place != end() && place->first == pid ? place->second.get() : nullptr;
    }
    // Gives back the value that stood there before, if any.
    RefPtr<PropertyValue> Put(PropertyId pid, RefPtr<PropertyValue> value) {
        const auto place = entries_.begin() + (PlaceOf(pid) - begin());
        if (place != entries_.end() && place->first == pid) {
            return std::exchange(place->second, std::move(value));
        }
        if (entries_.empty()) {
            entries_.reserve(kUsual);
            entries_.emplace_back(pid, std::move(value));
            return nullptr;
        }
        entries_.emplace(place, pid, std::move(value));
        return nullptr;
    }
    // Gives back the value, null when it is absent.
    RefPtr<PropertyValue> Take(PropertyId pid) {
        const auto place = entries_.begin() + (PlaceOf(pid) - begin());
        if (place == entries_.end() || place->first != pid) {
            return nullptr;
        }
        RefPtr<PropertyValue> taken = std::move(place->second);
        entries_.erase(place);
        return taken;
    }

private:
    static constexpr std::size_t kUsual = 8;  // most objects have no more

    Iterator PlaceOf(PropertyId pid) const {
        return std::lower_bound(begin(), end(), pid, [](const Entry& entry, PropertyId number) {
            return entry.first < number;
        });
    }

    std::vector<Entry> entries_;
};

}  // namespace aaf
