// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Identification.h"

#include "aaf_library/objects/Fresh.h"
#include "aaf_library/objects/Header.h"

namespace aaf {

namespace {

#ifdef _WIN32
constexpr wchar_t kPlatform[] = L"Cliphost AAF library (Windows)";
#else
constexpr wchar_t kPlatform[] = L"Cliphost AAF library (POSIX)";
#endif

}  // namespace

HRESULT Identification::SetProduct(const aafProductIdentification_t& product) {
    const HRESULT result = Initialize(
        product.companyName, product.productName,
        product.productVersionString == nullptr ? L"Unknown version" : product.productVersionString,
        product.productID);
    if (result < 0) {
        return result;
    }
    if (product.platform != nullptr) {
        PutString(prop::Identification_Platform, product.platform);
    }
    return product.productVersion == nullptr ? result : SetProductVersion(*product.productVersion);
}

HRESULT Identification::Initialize(aafCharacter_constptr companyName,
                                   aafCharacter_constptr productName,
                                   aafCharacter_constptr productVersionString,
                                   aafUID_constref productID) {
    if (companyName == nullptr || productName == nullptr || productVersionString == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsPresent(prop::Identification_GenerationAUID)) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    PutString(prop::Identification_CompanyName, companyName);
    PutString(prop::Identification_ProductName, productName);
    PutString(prop::Identification_ProductVersionString, productVersionString);
    PutStruct(prop::Identification_ProductID, productID);
    PutStruct(prop::Identification_Date, CurrentTime());
    PutStruct(prop::Identification_ToolkitVersion, LibraryVersion());
    PutString(prop::Identification_Platform, kPlatform);
    return PutStruct(prop::Identification_GenerationAUID, NewGenerationId());
}

HRESULT Identification::GetCompanyName(aafCharacter* companyName, aafUInt32 bufSize) {
    return ReadString(prop::Identification_CompanyName, companyName, bufSize);
}

HRESULT Identification::GetCompanyNameBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Identification_CompanyName, bufSize);
}

HRESULT Identification::GetProductName(aafCharacter* productName, aafUInt32 bufSize) {
    return ReadString(prop::Identification_ProductName, productName, bufSize);
}

HRESULT Identification::GetProductNameBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Identification_ProductName, bufSize);
}

HRESULT Identification::GetProductVersionString(aafCharacter* productVersionString,
                                                aafUInt32 bufSize) {
    return ReadString(prop::Identification_ProductVersionString, productVersionString, bufSize);
}

HRESULT Identification::GetProductVersionStringBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Identification_ProductVersionString, bufSize);
}

HRESULT Identification::GetProductVersion(aafProductVersion_t* version) {
    return ReadStruct(prop::Identification_ProductVersion, version);
}

HRESULT Identification::SetProductVersion(aafProductVersion_constref version) {
    return PutStruct(prop::Identification_ProductVersion, version);
}

HRESULT Identification::GetProductID(aafUID_t* productID) {
    return ReadStruct(prop::Identification_ProductID, productID);
}

HRESULT Identification::GetDate(aafTimeStamp_t* timestamp) {
    return ReadStruct(prop::Identification_Date, timestamp);
}

HRESULT Identification::GetRefImplVersion(aafProductVersion_t* version) {
    return ReadStruct(prop::Identification_ToolkitVersion, version);
}

HRESULT Identification::GetPlatform(aafCharacter* platform, aafUInt32 bufSize) {
    return ReadString(prop::Identification_Platform, platform, bufSize);
}

HRESULT Identification::GetPlatformBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Identification_Platform, bufSize);
}

HRESULT Identification::GetGenerationID(aafUID_t* generation) {
    return ReadStruct(prop::Identification_GenerationAUID, generation);
}

}  // namespace aaf
