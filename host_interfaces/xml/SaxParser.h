// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

namespace UTIL {

// Receives the events of a document in order.
//
// Implemented by the module (GenericDocHandler); the host's parser calls it during
// INCFSaxParser::Parse, on the same thread. Strings are borrowed and valid for the
// call only. A negative result ends the parse and is its result.
struct INCFSaxDocumentHandler : INCFUnknown {
    virtual NCFRESULT Start() = 0;                   // 3
    virtual NCFRESULT End() = 0;                     // 4, after success only
    virtual NCFRESULT Element(INCFString* tag) = 0;  // 5. It begins.
    // 6. Of that element. The module's handler lets through what is thrown and is no
    // NCFRESULT, so a parser has to catch.
    virtual NCFRESULT Attribute(INCFString* name, INCFString* value) = 0;
    // 7. One event for each run of text between markup, never trimmed.
    virtual NCFRESULT Text(INCFString* text) = 0;

protected:
    ~INCFSaxDocumentHandler() = default;
};

// Receives messages about a document. Implemented and called as the handler above.
// Here a string is not borrowed: the parser gives its reference away, and the
// handler releases it. Results are ignored.
struct INCFSaxErrorHandler : INCFUnknown {
    virtual NCFRESULT Warning(INCFString* message) = 0;     // 3
    virtual NCFRESULT Error(INCFString* message) = 0;       // 4
    virtual NCFRESULT FatalError(INCFString* message) = 0;  // 5. The parse ends.

protected:
    ~INCFSaxErrorHandler() = default;
};

}  // namespace UTIL

// Reads an XML file and tells a handler what it meets. Names are delivered
// with their prefixes as written; attributes follow the Element of their
// element. A document type declaration or more than 256 levels are refused.
//
// Implemented by the host as a component; the module creates one for each of its
// data files, when the first clip with a picture is described. One thread at a time.
struct INCFSaxParser : INCFUnknown {
    // 3, 4. The parser keeps a reference until the next handler or its own end; null
    // sets none.
    virtual NCFRESULT SetDocumentHandler(UTIL::INCFSaxDocumentHandler* handler) = 0;
    virtual NCFRESULT SetErrorHandler(UTIL::INCFSaxErrorHandler* handler) = 0;
    // 5. Reads the file at `path`; `zero` is 0. All events come during the call.
    virtual NCFRESULT Parse(ncfUInt32 zero, INCFString* path) = 0;
    // 6. Text of the last failure, empty when there was none; a new reference.
    virtual NCFRESULT GetLastMessage(INCFString** text) = 0;

protected:
    ~INCFSaxParser() = default;
};

inline constexpr GUID kIID_SaxDocumentHandler = ncfGuid("76573EBA-0E3A-4EBA-B9B5-C8A594ACD9E1");
inline constexpr GUID kIID_SaxErrorHandler = ncfGuid("66A7051E-3559-41B9-94F5-5BD4541BA366");
inline constexpr GUID kCLSID_SaxParser = ncfGuid("0D3A449D-DDB3-4AE0-97D2-A3611EE0DEAC");
inline constexpr GUID kIID_SaxParser = ncfGuid("FE52EACA-428B-4045-81C4-D6A86AE0090D");

namespace UTIL {
constexpr const GUID& ncfIdOf(const INCFSaxDocumentHandler*) {
    return kIID_SaxDocumentHandler;
}
constexpr const GUID& ncfIdOf(const INCFSaxErrorHandler*) {
    return kIID_SaxErrorHandler;
}
}  // namespace UTIL
constexpr const GUID& ncfIdOf(const INCFSaxParser*) {
    return kIID_SaxParser;
}
