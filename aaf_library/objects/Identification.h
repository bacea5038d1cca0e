// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Fresh.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

// A program that wrote the file, with the time and a generation id of its own.
// Owned by the header's list. Its getters need Initialize.
class Identification : public Implements<Object, IAAFIdentification> {
public:
    // All that a caller of the open functions tells. Company and product name
    // are needed.
    HRESULT SetProduct(const aafProductIdentification_t& product);

    HRESULT Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                       aafCharacter_constptr productVersionString,
                       aafUID_constref productID) override;
    HRESULT GetCompanyName(aafCharacter* companyName, aafUInt32 bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadString(prop::Identification_CompanyName, companyName, bufSize);
        });
    }
    HRESULT GetCompanyNameBufLen(aafUInt32* bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStringLength(prop::Identification_CompanyName, bufSize);
        });
    }
    HRESULT GetProductName(aafCharacter* productName, aafUInt32 bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadString(prop::Identification_ProductName, productName, bufSize);
        });
    }
    HRESULT GetProductNameBufLen(aafUInt32* bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStringLength(prop::Identification_ProductName, bufSize);
        });
    }
    HRESULT GetProductVersionString(aafCharacter* productVersionString,
                                    aafUInt32 bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadString(prop::Identification_ProductVersionString, productVersionString,
                              bufSize);
        });
    }
    HRESULT GetProductVersionStringBufLen(aafUInt32* bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStringLength(prop::Identification_ProductVersionString, bufSize);
        });
    }
    HRESULT GetProductVersion(aafProductVersion_t* version) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStruct(prop::Identification_ProductVersion, version);
        });
    }
    HRESULT SetProductVersion(aafProductVersion_constref version) override {
        return PutStruct(prop::Identification_ProductVersion, version);
    }
    HRESULT GetProductID(aafUID_t* productID) override {
        return OnceInitialized(
            IsInitialized(), [&] { return ReadStruct(prop::Identification_ProductID, productID); });
    }
    HRESULT GetDate(aafTimeStamp_t* timestamp) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return ReadStruct(prop::Identification_Date, timestamp); });
    }
    HRESULT GetRefImplVersion(aafProductVersion_t* version) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStruct(prop::Identification_ToolkitVersion, version);
        });
    }
    HRESULT GetPlatform(aafCharacter* platform, aafUInt32 bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadString(prop::Identification_Platform, platform, bufSize);
        });
    }
    HRESULT GetPlatformBufLen(aafUInt32* bufSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStringLength(prop::Identification_Platform, bufSize);
        });
    }
    HRESULT GetGenerationID(aafUID_t* generation) override;

private:
    // Files may lack one of these.
    bool IsInitialized() const {
        return IsPresent(prop::Identification_GenerationAUID) ||
               IsPresent(prop::Identification_CompanyName);
    }
};

}  // namespace aaf
