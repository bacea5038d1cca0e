// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Arbitrary text as the colour and the geometry text of a sample description.

#include <string>

#include "fuzz/support/RunLimits.h"
#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/framework/Host.h"
#include "reference_host/xml/RegisterXmlComponents.h"
#include "source/descriptor_data/QTAttributesXMLParser.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static host::Host* const host = [] {
        auto* made = new host::Host;
        host::RegisterXmlComponents(*made);
        NMAInitialize(&made->factory());
        return made;
    }();
    const fuzz::TimeLimit limit;
    const std::string text(reinterpret_cast<const char*>(data), size);
    NCFRESULT loaded = NCF_OK;
    ParseHelperFunctions::QTAttributesXMLParser parser(
        NCFSmartPtr<INCFComponentFactory>(&host->factory()), NMAString(text.c_str()), loaded);
    try {
        ColorSpaceDescriptor colour;
        parser.GetColorSpaceDescriptor(&colour);
    } catch (NCFRESULT) {
        // a label that is missing
    }
    for (const QTBoxKind kind : {kBoxFraming, kBoxValid, kBoxEssence, kBoxSource}) {
        BoundsBox box;
        parser.GetBox(kind, &box);
    }
    return 0;
}
