// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// check_data MAPPER INFO: the checks on two files, for whoever adds a codec.
// Status 0 when nothing was found, 1 when something was, 2 for misuse.

#include <cstdio>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/framework/Host.h"
#include "reference_host/xml/RegisterXmlComponents.h"
#include "source/descriptor_data/GenericDocHandler.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "tests/unit/descriptor_data/DataCheck.h"

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fprintf(stderr, "usage: %s FourCharMapper.xml AAFInfo.xml\n", argv[0]);
        return 2;
    }
    host::Host host;
    host::RegisterXmlComponents(host);
    host.RegisterComponent(kCLSID_GenericDocHandler,
                           CreateInstanceOf<NMA::Impl::GenericDocHandler>);
    NMAInitialize(&host.factory());
    const std::vector<std::string> findings = CheckData(&host.factory(), argv[1], argv[2]);
    NMATerminate();
    for (const std::string& finding : findings) {
        std::printf("%s\n", finding.c_str());
    }
    std::printf("%zu findings\n", findings.size());
    return findings.empty() ? 0 : 1;
}
