// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

// A program that wrote the file, with the time and a generation id of its own.
// Owned by the header's list.
class Identification : public Implements<Object, IAAFIdentification> {
public:
    // All that a caller of the open functions tells. Company and product name
    // are needed.
    HRESULT SetProduct(const aafProductIdentification_t& product);

    HRESULT Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                       aafCharacter_constptr productVersionString,
                       aafUID_constref productID) override;
    HRESULT GetCompanyName(aafCharacter* companyName, aafUInt32 bufSize) override;
    HRESULT GetCompanyNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetProductName(aafCharacter* productName, aafUInt32 bufSize) override;
    HRESULT GetProductNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetProductVersionString(aafCharacter* productVersionString, aafUInt32 bufSize) override;
    HRESULT GetProductVersionStringBufLen(aafUInt32* bufSize) override;
    HRESULT GetProductVersion(aafProductVersion_t* version) override;
    HRESULT SetProductVersion(aafProductVersion_constref version) override;
    HRESULT GetProductID(aafUID_t* productID) override;
    HRESULT GetDate(aafTimeStamp_t* timestamp) override;
    HRESULT GetRefImplVersion(aafProductVersion_t* version) override;
    HRESULT GetPlatform(aafCharacter* platform, aafUInt32 bufSize) override;
    HRESULT GetPlatformBufLen(aafUInt32* bufSize) override;
    HRESULT GetGenerationID(aafUID_t* generation) override;
};

}  // namespace aaf
