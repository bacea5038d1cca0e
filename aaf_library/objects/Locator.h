// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "not_implemented/AAFLocators.h"

namespace aaf {

// Where essence lies: a path or text that the subclass keeps. Owned by an
// essence descriptor.
class Locator : public Implements<Object, IAAFLocator> {};

class NetworkLocator : public Implements<Locator, IAAFNetworkLocator> {
public:
    void SetDefaults() override {
        Locator::SetDefaults();
        PutString(prop::NetworkLocator_URLString, L"");
    }

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetPath(aafCharacter_constptr path) override {
        return PutString(prop::NetworkLocator_URLString, path);
    }
    HRESULT GetPath(aafCharacter* path, aafUInt32 bufSize) override {
        return ReadString(prop::NetworkLocator_URLString, path, bufSize);
    }
    HRESULT GetPathBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::NetworkLocator_URLString, bufSize);
    }
};

// A hint for a person; its path is its name.
class TextLocator : public Implements<Locator, IAAFTextLocator> {
public:
    void SetDefaults() override {
        Locator::SetDefaults();
        PutString(prop::TextLocator_Name, L"");
    }

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetName(aafCharacter_constptr name) override {
        return PutString(prop::TextLocator_Name, name);
    }
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override {
        return ReadString(prop::TextLocator_Name, name, bufSize);
    }
    HRESULT GetNameBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::TextLocator_Name, bufSize);
    }
    HRESULT SetPath(aafCharacter_constptr path) override { return SetName(path); }
    HRESULT GetPath(aafCharacter* path, aafUInt32 bufSize) override {
        return GetName(path, bufSize);
    }
    HRESULT GetPathBufLen(aafUInt32* bufSize) override { return GetNameBufLen(bufSize); }
};

}  // namespace aaf
