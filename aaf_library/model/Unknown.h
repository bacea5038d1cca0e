// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <type_traits>
#include <typeinfo>

#include "aaf_library/model/GeneralCodes.h"
#include "aaf_library/model/NotImplemented.h"
#include "aaf_library/model/RefPtr.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "host_interfaces/aaf/AAFUnknown.h"

namespace aaf {

class Model;
class Object;

// Root of every object of the library: identity, reference count, and the link
// to the model that it belongs to.
//
// A model lives while anybody outside can reach one of its objects. So an
// object pins its model while it is free, or, when an owner keeps it, while
// someone besides that owner holds a reference. No reference ever points from a
// kept object to its owner, hence no cycles.
class Unknown : public IUnknown {
public:
    Unknown(const Unknown&) = delete;
    Unknown& operator=(const Unknown&) = delete;

    HRESULT QueryInterface(REFIID iid, void** out) override;
    ULONG AddRef() override { return AddReference(); }
    ULONG Release() override { return ReleaseReference(); }

    // The one pointer that stands for the object; it equals none of its other interfaces.
    IUnknown* Identity() { return this; }

    // Itself, where it is an object with values; else null. Asked far too often for a cast.
    virtual Object* AsObject() { return nullptr; }

    // Null for the few objects that live outside any model, such as enumerators.
    Model* model() const { return model_; }
    // Once, right after construction.
    void JoinModel(Model& model);

    // An owner calls Keep after it took its reference and Free before it gives it up.
    void Keep();
    void Free();
    bool IsKept() const { return kept_; }
    // Whether all references but one are given back.
    bool IsHeldOnce() const { return references_ == 1; }

protected:
    Unknown() = default;
    virtual ~Unknown();

    // The interface with that id as this class has it, or null.
    virtual void* FindInterface(const GUID& iid);

    HRESULT Query(const GUID& iid, void** out);
    ULONG AddReference();
    ULONG ReleaseReference();

private:
    Model* model_ = nullptr;
    ULONG references_ = 0;
    bool kept_ = false;
};

// Adds interfaces to a class, each operation not implemented until overridden:
//
//     class Filler : public Implements<Segment, IAAFFiller> { ... };
//
// QueryInterface goes through the list of types; ids come from aafIdOf.
template <class Base, class... Interfaces>
class Implements : public Base, public NotImplemented<Interfaces>... {
public:
    using Base::Base;

    HRESULT QueryInterface(REFIID iid, void** out) override { return Base::Query(iid, out); }
    ULONG AddRef() override { return Base::AddReference(); }
    ULONG Release() override { return Base::ReleaseReference(); }

protected:
    ~Implements() override = default;

    void* FindInterface(const GUID& iid) override {
        void* found = nullptr;
        static_cast<void>(((iid == aafIdOf(static_cast<const Interfaces*>(nullptr))
                                ? (found = static_cast<Interfaces*>(this), true)
                                : false) ||
                           ...));
        return found != nullptr ? found : Base::FindInterface(iid);
    }
};

// The library's own object behind an interface, or null when there is none or
// it is of another library. Nothing is added to its reference count.
Unknown* ImplementationOf(IUnknown* any);

template <class T, class Interface>
T* ImplementationAs(Interface* any) {
    Unknown* const object = ImplementationOf(any);
    if constexpr (std::is_same_v<T, Object>) {
        return object != nullptr ? object->AsObject() : nullptr;
    } else if constexpr (std::is_final_v<T>) {
        return object != nullptr && typeid(*object) == typeid(T) ? static_cast<T*>(object)
                                                                 : nullptr;
    } else {
        return dynamic_cast<T*>(object);
    }
}

// Gives an object out as interface I, with a reference for the caller. It is asked for the
// interface only where its class leaves open whether it has it.
template <class I, class T>
HRESULT GiveOut(T* object, I** out) {
    if constexpr (std::is_convertible_v<T*, I*>) {
        object->AddRef();
        *out = object;
        return AAFRESULT_SUCCESS;
    } else {
        return object->QueryInterface(aafIdOf(static_cast<const I*>(nullptr)),
                                      reinterpret_cast<void**>(out));
    }
}

// Booleans and other enumerated arguments are checked before anything else.
inline bool IsBoolean(aafBoolean_t value) {
    return value == kAAFFalse || value == kAAFTrue;
}

}  // namespace aaf
