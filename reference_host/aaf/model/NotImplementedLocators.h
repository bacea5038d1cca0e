// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFLocators.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFLocator> : public IAAFLocator {
public:
    HRESULT SetPath(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPath(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPathBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFNetworkLocator> : public IAAFNetworkLocator {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTextLocator> : public IAAFTextLocator {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFLocators> : public IEnumAAFLocators {
public:
    HRESULT NextOne(IAAFLocator**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFLocator**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFLocators**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
