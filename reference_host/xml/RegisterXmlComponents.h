// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace host {

class Host;

// Makes the SAX parser, the document and the writer known to a host.
void RegisterXmlComponents(Host& host);

}  // namespace host
