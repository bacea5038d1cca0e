// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Console.h"
#include "source/plugin/NCFSmartPtr.h"

struct AAFInfo;
class DescribedPicture;

// Steps of the rule whether the host may read essence by itself: 1 native, 0 not. A
// refusal tells its reason to the logger and the console. The order of the steps belongs
// to each kind of clip.
class SampleProviderRule {
public:
    explicit SampleProviderRule(NCFSmartPtr<INCFConsole> console) : console_(console) {}

    // For the answer of IsSelfContained: a failure to answer refuses nothing.
    NCFRESULT CommonSampleProviderCheck(NCFRESULT selfContained) const;
    NCFRESULT IsLPCMAudioByFormatID(ncfUInt32 formatID) const;
    NCFRESULT IsSupportedBitPerChannel(ncfUInt32 bits) const;
    // Whether the data files lead from the picture's code to a whole record. Refuses
    // without a reason.
    NCFRESULT IsInDataFiles(const DescribedPicture& picture, AAFInfo* aafInfo) const;

    // Tells why a track or picture is not native, to the logger under the
    // function's name and to the console, which may get a line of its own.
    void TellReason(const char* function, const char* reason) const {
        TellReason(function, reason, reason);
    }
    void TellReason(const char* function, const char* reason, const char* consoleLine) const;

private:
    NCFSmartPtr<INCFConsole> console_;
};
