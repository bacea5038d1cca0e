// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "host_interfaces/xml/SaxParser.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "source/plugin/CNCFUnknown.h"

namespace NMA::Impl {

// Passes the events of the host's parser to a data container. What the container
// throws becomes a result; only Attribute lets through what is no result. Made
// through the component factory for one parse and released after it.
class GenericDocHandler final
    : public CNCFComponent<UTIL::INCFSaxDocumentHandler, UTIL::INCFSaxErrorHandler,
                           IGenericDocHandler> {
public:
    explicit GenericDocHandler(INCFUnknown* outer) : CNCFComponent(outer) {}

    // NCF_E_POINTER without a host.
    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    // Document events. NCF_E_FAIL from Start when no container was set.
    NCFRESULT Start() override;
    NCFRESULT End() override;
    NCFRESULT Element(INCFString* tag) override;
    // A thrown result is answered; anything else passes to the parser.
    NCFRESULT Attribute(INCFString* name, INCFString* value) override;
    NCFRESULT Text(INCFString* text) override;

    // Messages go to the log and never stop a parse.
    NCFRESULT Warning(INCFString* message) override;
    NCFRESULT Error(INCFString* message) override;
    NCFRESULT FatalError(INCFString* message) override;

    NCFRESULT SetDataContainer(XMLDataContainer* container) override;

private:
    XMLDataContainer& Container() const;

    XMLDataContainer* container_ = nullptr;  // borrowed
};

}  // namespace NMA::Impl
