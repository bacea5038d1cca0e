// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/XMLParserHelpers.h"

#include "source/descriptor_data/DataRecord.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "source/plugin/ResultChecks.h"

namespace ParseHelperFunctions {

namespace {

constexpr char kSource[] = "XMLParserHelpers";

void ThrowUnlessZero(NCFRESULT result, const char* step, int line) {
    if (result == NCF_OK) {
        return;
    }
    DataRecord(kDataFailure, "ParseHelperFunctions::GetSaxParser")
        << step << HexResult{result} << ", " << kSource << ":" << line;
    throw result;
}

void TellParserMessage(const NCFSmartPtr<INCFSaxParser>& parser, const NMAString& filePath) {
    if (parser.isNull()) {
        return;
    }
    NCFSmartPtr<INCFString> message;
    if (parser->GetLastMessage(message.outArg()) != NCF_OK || message.isNull() ||
        message->IsEmpty()) {
        return;
    }
    DataRecord(kDataFailure, "ParseHelperFunctions::ParseXML")
        << "filePath: " << filePath.GetUTF8String()
        << "; error: " << NMAString(message.inArg(), kNCFUTF8).GetUTF8String();
}

}  // namespace

void GetSaxParser(NCFSmartPtr<INCFSaxParser>& parser, INCFComponentFactory* factory,
                  UTIL::INCFSaxDocumentHandler* documentHandler,
                  UTIL::INCFSaxErrorHandler* errorHandler) {
    ThrowUnlessZero(ncfCreate(factory, kCLSID_SaxParser, kIID_SaxParser, parser),
                    "Unable to create XML Sax parser component, result=0x", 53);
    ThrowUnlessZero(parser->SetDocumentHandler(documentHandler),
                    "Unable to set document handler, result=0x", 61);
    ThrowUnlessZero(parser->SetErrorHandler(errorHandler), "Unable to set error handler, result=0x",
                    68);
}

NCFRESULT ParseXML(const NMAString& filePath, UTIL::INCFSaxDocumentHandler* documentHandler,
                   INCFComponentFactory* factory) {
    NCFSmartPtr<INCFSaxParser> parser;
    try {
        NCFSmartPtr<UTIL::INCFSaxErrorHandler> errorHandler;
        ThrowIfFailed(ncfQuery(documentHandler, errorHandler));
        GetSaxParser(parser, factory, documentHandler, errorHandler.inArg());
        ThrowIfFailed(parser->Parse(0, filePath.InArg()));
        return NCF_OK;
    } catch (NCFRESULT result) {
        TellParserMessage(parser, filePath);
        return result;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

NCFRESULT MakeDocHandler(INCFComponentFactory* factory, XMLDataContainer* container,
                         NCFSmartPtr<UTIL::INCFSaxDocumentHandler>& handler) {
    const NCFRESULT created =
        ncfCreate(factory, kCLSID_GenericDocHandler, kIID_SaxDocumentHandler, handler);
    if (created < 0) {
        return created;
    }
    NCFSmartPtr<NMA::Impl::IGenericDocHandler> feeder;
    const NCFRESULT found = ncfQuery(handler.inArg(), feeder);
    return found < 0 ? found : feeder->SetDataContainer(container);
}

}  // namespace ParseHelperFunctions
