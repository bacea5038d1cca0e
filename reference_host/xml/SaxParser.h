// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/xml/SaxParser.h"
#include "reference_host/framework/Component.h"
#include "reference_host/util/Ref.h"

namespace host {

// The SAX component: reads a file and tells the handlers of it. What went wrong
// with the file or the document is kept as a message and given to the error
// handler; a stop by the document handler is kept, but that handler knows.
class SaxParser final : public Component<INCFSaxParser> {
public:
    NCFRESULT SetDocumentHandler(UTIL::INCFSaxDocumentHandler* handler) override;
    NCFRESULT SetErrorHandler(UTIL::INCFSaxErrorHandler* handler) override;
    NCFRESULT Parse(ncfUInt32 zero, INCFString* path) override;
    NCFRESULT GetLastMessage(INCFString** text) override;

private:
    NCFRESULT ParseFile(INCFString* path);
    NCFRESULT Fail(NCFRESULT code, const std::string& message, bool tellHandler);

    Ref<UTIL::INCFSaxDocumentHandler> documentHandler_;
    Ref<UTIL::INCFSaxErrorHandler> errorHandler_;
    std::string lastMessage_;
};

}  // namespace host
