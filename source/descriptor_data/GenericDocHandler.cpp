// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/GenericDocHandler.h"

#include "source/descriptor_data/DataRecord.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {

namespace {

constexpr char kSource[] = "GenericDocHandler";

NCFRESULT TellResult(const char* where, NCFRESULT result, int line) {
    DataRecord(kDataFailure, where) << "Received an NCFRESULT exception, err=0x"
                                    << HexResult{result} << ", " << kSource << ":" << line;
    return result;
}

// Runs a body that throws its failures, and tells them.
template <class Body>
NCFRESULT Told(const char* where, int line, Body body) {
    try {
        body();
        return NCF_OK;
    } catch (NCFRESULT result) {
        return TellResult(where, result, line);
    } catch (...) {
        DataRecord(kDataFailure, where)
            << "Received an unknown exception, " << kSource << ":" << line;
        return NCF_E_UNEXPECTED;
    }
}

NMAString Utf8(INCFString* text) {
    if (!text) {
        throw NCF_E_POINTER;
    }
    return NMAString(text, kNCFUTF8);
}

// The message is the handler's to release.
NCFRESULT TellMessage(ncfUInt32 severity, const char* where, INCFString* message) {
    DataRecord(severity, where) << NMAString(message, kNCFUTF8).GetUTF8String();
    if (message) {
        message->Release();
    }
    return NCF_OK;
}

}  // namespace

NCFRESULT GenericDocHandler::InitializeInstance(INCFUnknown* host) {
    return host ? NCF_OK : NCF_E_POINTER;
}

NCFRESULT GenericDocHandler::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<UTIL::INCFSaxDocumentHandler, UTIL::INCFSaxErrorHandler,
                                 IGenericDocHandler>(this, iid, out);
}

XMLDataContainer& GenericDocHandler::Container() const {
    if (!container_) {
        throw NCF_E_FAIL;
    }
    return *container_;
}

NCFRESULT GenericDocHandler::Start() {
    return container_ ? NCF_OK : NCF_E_FAIL;
}

NCFRESULT GenericDocHandler::End() {
    return Told("NMA::Impl::GenericDocHandler::End", 73, [&] { Container().End(); });
}

NCFRESULT GenericDocHandler::Element(INCFString* tag) {
    return Told("NMA::Impl::GenericDocHandler::Element", 110,
                [&] { Container().Element(Utf8(tag)); });
}

NCFRESULT GenericDocHandler::Attribute(INCFString* name, INCFString* value) {
    try {
        Container().Attribute(Utf8(name), Utf8(value));
        return NCF_OK;
    } catch (NCFRESULT result) {
        return TellResult("NMA::Impl::GenericDocHandler::Attribute", result, 149);
    }
}

NCFRESULT GenericDocHandler::Text(INCFString* text) {
    return Told("NMA::Impl::GenericDocHandler::Text", 184, [&] { Container().Text(Utf8(text)); });
}

NCFRESULT GenericDocHandler::Warning(INCFString* message) {
    return TellMessage(kDataNotice, "NMA::Impl::GenericDocHandler::Warning", message);
}

NCFRESULT GenericDocHandler::Error(INCFString* message) {
    return TellMessage(kDataFailure, "NMA::Impl::GenericDocHandler::Error", message);
}

NCFRESULT GenericDocHandler::FatalError(INCFString* message) {
    return TellMessage(kDataFailure, "NMA::Impl::GenericDocHandler::FatalError", message);
}

NCFRESULT GenericDocHandler::SetDataContainer(XMLDataContainer* container) {
    NCF_FUNCTION("NMA::Impl::GenericDocHandler::SetDataContainer");
    CHK_INARG(container);
    container_ = container;
    return NCF_OK;
}

}  // namespace NMA::Impl
