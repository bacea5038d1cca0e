// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Confinement.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

// What a process can't give up by itself: the system takes it from new ones, by accounts and
// containers that somebody has to set up.
constexpr char kKept[] = "the network; writing to any folder that its user may write to";

template <class Policy>
std::string Settle(PROCESS_MITIGATION_POLICY which, Policy policy, const char* right) {
    return SetProcessMitigationPolicy(which, &policy, sizeof policy)
               ? std::string()
               : std::string("; ") + right + ": " + ErrorWords(GetLastError());
}

}  // namespace

std::string GiveUpRights(const std::filesystem::path&) {
    PROCESS_MITIGATION_CHILD_PROCESS_POLICY programs{};
    programs.NoChildProcessCreation = 1;
    PROCESS_MITIGATION_DYNAMIC_CODE_POLICY code{};
    code.ProhibitDynamicCode = 1;
    return kKept + Settle(ProcessChildProcessPolicy, programs, "starting programs") +
           Settle(ProcessDynamicCodePolicy, code, "making new code");
}

}  // namespace host::system
