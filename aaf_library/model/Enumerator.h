// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"

namespace aaf {

// An enumerator with the five operations that all of them share. ElementAt gives the
// element of a list by index, null behind the end. It is asked anew each time,
// so elements that are appended while an enumerator runs are met.
template <class EnumInterface, class ElementInterface, class ElementAt>
class Enumerator : public Implements<Unknown, EnumInterface> {
public:
    Enumerator(ElementAt elementAt, std::size_t position)
        : elementAt_(std::move(elementAt)), position_(position) {}

    HRESULT NextOne(ElementInterface** element) override {
        if (element == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        const auto next = elementAt_(position_);
        if (!next) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        ++position_;
        return GiveOut(next.get(), element);
    }

    HRESULT Next(aafUInt32 count, ElementInterface** elements, aafUInt32* fetched) override {
        if (elements == nullptr || fetched == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        if (count == 0) {
            return AAFRESULT_INVALID_PARAM;
        }
        HRESULT result = AAFRESULT_SUCCESS;
        for (*fetched = 0; *fetched < count; ++*fetched) {
            result = NextOne(&elements[*fetched]);
            if (result < 0) {
                break;
            }
        }
        return result;
    }

    HRESULT Skip(aafUInt32 count) override {
        if (count > 0 && !elementAt_(position_ + count - 1)) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        position_ += count;
        return AAFRESULT_SUCCESS;
    }

    HRESULT Reset() override {
        position_ = 0;
        return AAFRESULT_SUCCESS;
    }

    HRESULT Clone(EnumInterface** enumerator) override {
        if (enumerator == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        RefPtr<Enumerator> copy(new Enumerator(elementAt_, position_));
        *enumerator = copy.Detach();
        return AAFRESULT_SUCCESS;
    }

private:
    ElementAt elementAt_;
    std::size_t position_;
};

template <class ElementInterface, class EnumInterface, class ElementAt>
HRESULT MakeEnumerator(ElementAt elementAt, EnumInterface** out) {
    if (out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    using Made = Enumerator<EnumInterface, ElementInterface, ElementAt>;
    RefPtr<Made> made(new Made(std::move(elementAt), 0));
    *out = made.Detach();
    return AAFRESULT_SUCCESS;
}

// Over the objects in a vector or set property; keeps the object alive.
template <class ElementInterface, class EnumInterface>
HRESULT MakeEnumerator(Object* object, const PropertyKey& key, EnumInterface** out) {
    return MakeEnumerator<ElementInterface>(
        [holder = RefPtr<Object>(object), key](std::size_t index) {
            return RefPtr<Unknown>(holder->ObjectAt(key, index));
        },
        out);
}

}  // namespace aaf
