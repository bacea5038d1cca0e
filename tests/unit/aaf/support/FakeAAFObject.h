// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/aaf/AAF.h"
#include "not_implemented/AAF.h"
#include "tests/unit/aaf/support/FakeAAF.h"

// One object of the fake library. Its interfaces are faces that count into it.
class FakeAAFObject {
public:
    FakeAAFObject(FakeAAF& library, std::string name) : library_(library), name_(std::move(name)) {
        ++library_.live_;
    }
    FakeAAFObject(const FakeAAFObject&) = delete;
    FakeAAFObject& operator=(const FakeAAFObject&) = delete;

    ULONG addRef() { return ++references_; }
    ULONG release();

    // The object behind any face.
    static FakeAAFObject* of(IUnknown* face);

    // A face with a new reference; null for an id that no face has.
    void* face(const GUID& iid);
    HRESULT query(const GUID& iid, void** out);

    FakeAAFObject* make(const std::string& className);  // a reference for the caller
    HRESULT create(const std::string& className, const GUID& iid, void** out);
    // Keeps a reference to another object for as long as this one lives.
    void keep(FakeAAFObject* other) {
        other->addRef();
        kept_.push_back(other);
    }

    const std::string& name() const { return name_; }
    FakeAAF& library() { return library_; }

    // Writes the call and gives its refusal, if any.
    HRESULT note(const std::string& operation, const std::vector<std::string>& arguments);

    // State that a description reads back.
    aafMobID_t mobID{};
    aafRational_t sampleRate{0, 0};
    aafSourceRef_t reference{};
    FakeAAFObject* segment = nullptr;                             // of a slot, kept
    std::vector<std::pair<aafSlotID_t, FakeAAFObject*>> slots{};  // of a mob, kept
    std::size_t nextSlot = 0;                                     // of an enumerator
    std::vector<std::pair<GUID, FakeAAFObject*>> definitions{};   // of dictionary and class, kept

    FakeAAFObject* definition(const GUID& id) const;

private:
    ~FakeAAFObject();

    FakeAAF& library_;
    std::string name_;
    ULONG references_ = 1;
    std::vector<FakeAAFObject*> kept_;
    std::vector<std::pair<GUID, std::shared_ptr<void>>> faces_;
};

// Arguments as the journal shows them.
std::string Shown(const GUID& id);
std::string Shown(const aafMobID_t& id);
std::string Shown(const aafRational_t& ratio);
std::string Shown(const aafSourceRef_t& reference);
std::string Shown(const aafTimecode_t& timecode);
std::string Shown(aafCharacter_constptr text);
std::string Shown(IUnknown* object);
template <class Number, std::enable_if_t<std::is_integral_v<Number>, int> = 0>
std::string Shown(Number value) {
    return std::to_string(value);
}

// What all faces have in common, whatever their interface.
class FakeAAFFaceBase {
public:
    explicit FakeAAFFaceBase(FakeAAFObject& self) : self_(self) {}
    FakeAAFObject& self() const { return self_; }

protected:
    virtual ~FakeAAFFaceBase() = default;

    template <class... Arguments>
    HRESULT note(const char* operation, const Arguments&... arguments) {
        return self_.note(operation, {Shown(arguments)...});
    }

    FakeAAFObject& self_;
};

template <class Interface>
class FakeAAFFace : public aaf::NotImplemented<Interface>, public FakeAAFFaceBase {
public:
    using FakeAAFFaceBase::FakeAAFFaceBase;
    HRESULT QueryInterface(REFIID iid, void** out) override { return self_.query(iid, out); }
    ULONG AddRef() override { return self_.addRef(); }
    ULONG Release() override { return self_.release(); }
};

// The root alone has no operations to leave out.
template <>
class FakeAAFFace<IUnknown> : public IUnknown, public FakeAAFFaceBase {
public:
    using FakeAAFFaceBase::FakeAAFFaceBase;
    HRESULT QueryInterface(REFIID iid, void** out) override { return self_.query(iid, out); }
    ULONG AddRef() override { return self_.addRef(); }
    ULONG Release() override { return self_.release(); }
};

// Makes the face for an interface id, as that interface's pointer; null when
// there is none. The parts are defined beside the faces.
using FakeAAFFaceMaker = std::pair<std::shared_ptr<void>, void*> (*)(FakeAAFObject& self);
FakeAAFFaceMaker FindModelFace(const GUID& iid);       // file, dictionary, definitions, types
FakeAAFFaceMaker FindMobFace(const GUID& iid);         // mobs, slots, components
FakeAAFFaceMaker FindDescriptorFace(const GUID& iid);  // descriptors, locators

template <class Face, class Interface>
std::pair<std::shared_ptr<void>, void*> MakeFakeAAFFace(FakeAAFObject& self) {
    auto face = std::make_shared<Face>(self);
    return {face, static_cast<Interface*>(face.get())};
}

struct FakeAAFFaceEntry {
    GUID iid;
    FakeAAFFaceMaker make;
};
template <std::size_t Count>
FakeAAFFaceMaker FindFace(const FakeAAFFaceEntry (&entries)[Count], const GUID& iid) {
    for (const FakeAAFFaceEntry& entry : entries) {
        if (entry.iid == iid) {
            return entry.make;
        }
    }
    return nullptr;
}
