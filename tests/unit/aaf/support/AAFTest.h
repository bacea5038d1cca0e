// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/aaf/AAFSmartPointer.h"
#include "tests/unit/aaf/support/DescriptionHost.h"
#include "tests/unit/aaf/support/FakeAAF.h"

// A described clip's world with a fake AAF library in it.
class AAFTest : public DescriptionHost {
protected:
    // A new object of the fake library; the journal does not show its making.
    template <class Interface>
    IAAFSmartPointer<Interface> Make(const std::string& className) {
        Interface* const object = aaf.make<Interface>(className);
        IAAFSmartPointer<Interface> pointer(object);
        object->Release();
        return pointer;
    }
    template <class Other, class Interface>
    IAAFSmartPointer<Other> As(const IAAFSmartPointer<Interface>& object) {
        IAAFSmartPointer<Other> other;
        EXPECT_EQ(object->QueryInterface(aafIdOf((const Other*)nullptr), (void**)&other), 0);
        return other;
    }
    IAAFSmartPointer<IAAFDictionary> Dictionary() {
        auto* const face = aaf.dictionary<IAAFDictionary>();
        IAAFSmartPointer<IAAFDictionary> pointer(face);
        face->Release();
        return pointer;
    }

    FakeAAF aaf;
};
