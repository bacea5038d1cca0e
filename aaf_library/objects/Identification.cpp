// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Identification.h"

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

HRESULT Identification::GetGenerationID(aafUID_t* generation) {
    return IsInitialized() ? ReadStruct(prop::Identification_GenerationAUID, generation)
                           : AAFRESULT_NOT_INITIALIZED;
}

}  // namespace aaf
