// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <new>

#include "host_interfaces/framework/Unknown.h"

// Base of every object that the host can create: reference counting,
// aggregation and the interface query. A component lists its interfaces first
// and this class last; see CNCFComponent.
//
// The count starts at 0. The controlling unknown is where the public root
// operations of all interfaces go: the aggregating object, or the object's own
// private unknown. It is never counted, so no cycle arises.
class CNCFUnknown {
public:
    virtual ~CNCFUnknown();
    // Second-phase construction: takes the services that the object needs.
    virtual NCFRESULT InitializeInstance(INCFUnknown* host);
    // Runs once when the count reaches zero, just before deletion.
    virtual void FinalRelease();
    virtual void DeleteThis();
    // The query that does not delegate. Components answer their interfaces and
    // pass the rest on to this class, which knows IID_INCFUnknown.
    virtual NCFRESULT InternalQueryInterface(const GUID& iid, void** out);
    virtual ncfUInt32 InternalAddRef();
    virtual ncfUInt32 InternalRelease();

    CNCFUnknown(const CNCFUnknown&) = delete;
    CNCFUnknown& operator=(const CNCFUnknown&) = delete;

    INCFUnknown* ControllingUnknown() const { return controllingUnknown_; }

protected:
    CNCFUnknown();
    explicit CNCFUnknown(INCFUnknown* outer);

private:
    // The object's identity.
    struct PrivateUnknown final : INCFUnknown {
        explicit PrivateUnknown(CNCFUnknown* owner) : owner_(owner) {}
        NCFRESULT QueryInterface(const GUID& iid, void** out) override {
            return owner_->InternalQueryInterface(iid, out);
        }
        ncfUInt32 AddRef() override { return owner_->InternalAddRef(); }
        ncfUInt32 Release() override { return owner_->InternalRelease(); }

        CNCFUnknown* owner_;
    };

    std::atomic<ncfUInt32> referenceCount_{0};
    INCFUnknown* controllingUnknown_;
    PrivateUnknown privateUnknown_;
};

// Number of live components and class factories of the process.
ncfUInt32 GetObjectCount();

// Root operations of all interfaces of a component, sent to its controlling
// unknown. `Interfaces` are the bases in the order of their tables.
template <class... Interfaces>
class CNCFComponent : public Interfaces..., public CNCFUnknown {
public:
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        return ControllingUnknown()->QueryInterface(iid, out);
    }
    ncfUInt32 AddRef() override { return ControllingUnknown()->AddRef(); }
    ncfUInt32 Release() override { return ControllingUnknown()->Release(); }

protected:
    explicit CNCFComponent(INCFUnknown* outer) : CNCFUnknown(outer) {}
};

namespace ncf_detail {

template <class Interface, class Component>
bool AnswerInterface(Component* component, const GUID& iid, void** out) {
    if (!(iid == ncfIdOf(static_cast<Interface*>(nullptr)))) {
        return false;
    }
    Interface* const found = component;
    *out = found;
    found->AddRef();
    return true;
}

}  // namespace ncf_detail

// Answers `iid` from a list of interface types, or passes it on to the base:
// the body of a component's InternalQueryInterface.
template <class... Interfaces, class Component>
NCFRESULT QueryListedInterfaces(Component* component, const GUID& iid, void** out) {
    if (!out) {
        return NCF_E_INVALIDARG;
    }
    if ((ncf_detail::AnswerInterface<Interfaces>(component, iid, out) || ...)) {
        return NCF_OK;
    }
    return component->CNCFUnknown::InternalQueryInterface(iid, out);
}

// Makes an object of one class; what a class factory calls.
using CreationFunction = NCFRESULT (*)(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                       void** out);

// The creation function of every component: they differ only in the class.
template <class Component>
NCFRESULT CreateInstanceOf(INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out) {
    *out = nullptr;
    Component* const object = new (std::nothrow) Component(outer);
    if (!object) {
        return NCF_E_OUTOFMEMORY;
    }
    object->InternalAddRef();
    const NCFRESULT initialized = object->InitializeInstance(host);
    if (initialized < 0) {
        delete static_cast<CNCFUnknown*>(object);
        return initialized;
    }
    const NCFRESULT answered = object->InternalQueryInterface(iid, out);
    object->InternalRelease();
    return answered;
}
