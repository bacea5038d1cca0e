// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/aaf/support/FakeAAFObject.h"

#include <cstdio>

FakeAAFObject::~FakeAAFObject() {
    for (FakeAAFObject* object : kept_) {
        object->release();
    }
    --library_.live_;
}

ULONG FakeAAFObject::release() {
    const ULONG left = --references_;
    if (left == 0) {
        delete this;
    }
    return left;
}

FakeAAFObject* FakeAAFObject::of(IUnknown* face) {
    auto* const base = dynamic_cast<FakeAAFFaceBase*>(face);
    return base ? &base->self() : nullptr;
}

void* FakeAAFObject::face(const GUID& iid) {
    for (auto& [id, holder] : faces_) {
        if (id == iid) {
            addRef();
            return holder.get();
        }
    }
    FakeAAFFaceMaker maker = FindModelFace(iid);
    maker = maker ? maker : FindMobFace(iid);
    maker = maker ? maker : FindDescriptorFace(iid);
    if (!maker) {
        return nullptr;
    }
    auto [holder, pointer] = maker(*this);
    // Held under the interface's own pointer, which the caller casts back to.
    faces_.emplace_back(iid, std::shared_ptr<void>(holder, pointer));
    addRef();
    return pointer;
}

HRESULT FakeAAFObject::query(const GUID& iid, void** out) {
    *out = nullptr;
    const HRESULT refused = note("QueryInterface", {Shown(iid)});
    if (refused != 0) {
        return refused;
    }
    *out = face(iid);
    return *out ? AAFRESULT_SUCCESS : static_cast<HRESULT>(0x80004002u);
}

FakeAAFObject* FakeAAFObject::make(const std::string& className) {
    return new FakeAAFObject(library_, library_.nextName(className));
}

HRESULT FakeAAFObject::create(const std::string& className, const GUID& iid, void** out) {
    FakeAAFObject* const object = make(className);
    *out = object->face(iid);
    object->release();
    return *out ? AAFRESULT_SUCCESS : static_cast<HRESULT>(0x80004002u);
}

HRESULT FakeAAFObject::note(const std::string& operation,
                            const std::vector<std::string>& arguments) {
    std::string line = name_ + "." + operation;
    for (const std::string& argument : arguments) {
        line += " " + argument;
    }
    return library_.note(line);
}

FakeAAFObject* FakeAAFObject::definition(const GUID& id) const {
    for (const auto& [known, object] : definitions) {
        if (known == id) {
            return object;
        }
    }
    return nullptr;
}

std::string Shown(const GUID& id) {
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return text;
}

std::string Shown(const aafMobID_t& id) {
    std::string text;
    const auto* const bytes = reinterpret_cast<const unsigned char*>(&id);
    for (std::size_t i = 0; i < 16; ++i) {
        char pair[4];
        std::snprintf(pair, sizeof pair, "%02X", bytes[i]);
        text += pair;
    }
    return text + ":" + Shown(id.material);
}

std::string Shown(const aafRational_t& ratio) {
    return Shown(ratio.numerator) + "/" + Shown(ratio.denominator);
}

std::string Shown(const aafSourceRef_t& reference) {
    char instance[4];
    std::snprintf(instance, sizeof instance, "%02X", reference.sourceID.instanceHigh);
    return std::string("{") + instance + " slot " + Shown(reference.sourceSlotID) + " at " +
           Shown(reference.startTime) + "}";
}

std::string Shown(const aafTimecode_t& timecode) {
    return "{" + Shown(timecode.startFrame) + " drop " + Shown(timecode.drop) + " fps " +
           Shown(timecode.fps) + "}";
}

std::string Shown(aafCharacter_constptr text) {
    std::string shown = "'";
    for (; *text; ++text) {
        char code[12];
        std::snprintf(code, sizeof code, "<%04X>", static_cast<unsigned>(*text));
        shown += *text < 0x80 ? std::string(1, static_cast<char>(*text)) : code;
    }
    return shown + "'";
}

std::string Shown(IUnknown* object) {
    return object ? FakeAAFObject::of(object)->name() : "null";
}
