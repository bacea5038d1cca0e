// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFDefs.h"

#include "host_interfaces/aaf/AAFDefinitionIds.h"

namespace NMA::Impl {
namespace {

void RequireFound(HRESULT hr) {
    if (hr < 0) {
        throw "AAFRESULT_SUCCEEDED (hr)";
    }
}

}  // namespace

AAFDefs::AAFDefs(IAAFSmartPointer<IAAFDictionary> pDict) : dictionary_(pDict) {
    if (!pDict) {
        throw "pDict";
    }
}

const AAFDefs::ClassDef& AAFDefs::LookupClass(ClassDef& kept, const aafUID_t& id) {
    if (!kept) {
        RequireFound(dictionary_->LookupClassDef(id, &kept));
    }
    return kept;
}

const AAFDefs::TypeDef& AAFDefs::LookupType(TypeDef& kept, const aafUID_t& id) {
    if (!kept) {
        RequireFound(dictionary_->LookupTypeDef(id, &kept));
    }
    return kept;
}

const AAFDefs::DataDef& AAFDefs::ddTimecode() {
    if (!timecodeData_) {
        RequireFound(dictionary_->LookupDataDef(kAAFDataDef_LegacyTimecode, &timecodeData_));
    }
    return timecodeData_;
}

}  // namespace NMA::Impl
