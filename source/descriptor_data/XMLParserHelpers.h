// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/util/NMAString.h"
#include "host_interfaces/xml/SaxParser.h"
#include "source/descriptor_data/XMLDataContainer.h"
#include "source/plugin/NCFSmartPtr.h"

// How the module runs the host's XML parser.
namespace ParseHelperFunctions {

// A parser with its two handlers set. Throws every result other than 0.
void GetSaxParser(NCFSmartPtr<INCFSaxParser>& parser, INCFComponentFactory* factory,
                  UTIL::INCFSaxDocumentHandler* documentHandler,
                  UTIL::INCFSaxErrorHandler* errorHandler);

// Parses the file into `documentHandler`, which takes messages too. Throws
// nothing; a failure of the parser is logged with its message.
NCFRESULT ParseXML(const NMAString& filePath, UTIL::INCFSaxDocumentHandler* documentHandler,
                   INCFComponentFactory* factory);

// A document handler that feeds `container`, made through the factory. Gives
// the first negative result of the steps.
NCFRESULT MakeDocHandler(INCFComponentFactory* factory, XMLDataContainer* container,
                         NCFSmartPtr<UTIL::INCFSaxDocumentHandler>& handler);

}  // namespace ParseHelperFunctions
