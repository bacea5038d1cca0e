// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/MobIds.h"

#include "host_interfaces/util/NMAUtil.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {

aafMobID_t MobIdTemplate(aafUInt8 instanceHigh) {
    return {{0x06, 0x0A, 0x2B, 0x34, 0x01, 0x01, 0x01, 0x01, 0x01, 0x01, 0x0F, 0x00},
            0x13,
            instanceHigh,
            0,
            0,
            {}};
}

NCFRESULT GenerateUID(std::tr1::shared_ptr<BaseClip> /*media*/, const void* pContent,
                      ncfUInt32 contentSize, aafUID_t& uid) {
    NCF_FUNCTION("NMA::Impl::GenerateUID");
    void* UMIDGenState = nullptr;
    NCF_RETURN(GenerateUMIDFromData_Begin(&UMIDGenState));
    const NCFRESULT added =
        GenerateUMIDFromData_AddData(&UMIDGenState, contentSize, (unsigned char*)pContent);
    if (added < 0) {
        aafUID_t dropped{};
        GenerateUMIDFromData_Finish(&UMIDGenState, &dropped);  // frees the state
    }
    NCF_RETURN_TEXT(
        "GenerateUMIDFromData_AddData(&UMIDGenState, contentSize, (unsigned char*)pContent)",
        added);
    NCF_RETURN(GenerateUMIDFromData_Finish(&UMIDGenState, &uid));
    return NCF_OK;
}

}  // namespace NMA::Impl
