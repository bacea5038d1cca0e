// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/xml/ in their tables, written
// down once more and called by number: modules that are built call by place.

#include "host_interfaces/xml/SaxParser.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesINCFSaxDocumentHandler : PlaceFake<UTIL::INCFSaxDocumentHandler> {
    NCFRESULT Start() override { return Ran<NCFRESULT>("Start"); }
    NCFRESULT End() override { return Ran<NCFRESULT>("End"); }
    NCFRESULT Element(INCFString*) override { return Ran<NCFRESULT>("Element"); }
    NCFRESULT Attribute(INCFString*, INCFString*) override { return Ran<NCFRESULT>("Attribute"); }
    NCFRESULT Text(INCFString*) override { return Ran<NCFRESULT>("Text"); }
};

TEST(Places, OfINCFSaxDocumentHandler) {
    ExpectPlaces<PlacesINCFSaxDocumentHandler>({
        {3, "Start"}, {4, "End"}, {5, "Element"}, {6, "Attribute"}, {7, "Text"},
    });
}

struct PlacesINCFSaxErrorHandler : PlaceFake<UTIL::INCFSaxErrorHandler> {
    NCFRESULT Warning(INCFString*) override { return Ran<NCFRESULT>("Warning"); }
    NCFRESULT Error(INCFString*) override { return Ran<NCFRESULT>("Error"); }
    NCFRESULT FatalError(INCFString*) override { return Ran<NCFRESULT>("FatalError"); }
};

TEST(Places, OfINCFSaxErrorHandler) {
    ExpectPlaces<PlacesINCFSaxErrorHandler>({
        {3, "Warning"}, {4, "Error"}, {5, "FatalError"},
    });
}

struct PlacesINCFSaxParser : PlaceFake<INCFSaxParser> {
    NCFRESULT SetDocumentHandler(UTIL::INCFSaxDocumentHandler*) override { return Ran<NCFRESULT>("SetDocumentHandler"); }
    NCFRESULT SetErrorHandler(UTIL::INCFSaxErrorHandler*) override { return Ran<NCFRESULT>("SetErrorHandler"); }
    NCFRESULT Parse(ncfUInt32, INCFString*) override { return Ran<NCFRESULT>("Parse"); }
    NCFRESULT GetLastMessage(INCFString**) override { return Ran<NCFRESULT>("GetLastMessage"); }
};

TEST(Places, OfINCFSaxParser) {
    ExpectPlaces<PlacesINCFSaxParser>({
        {3, "SetDocumentHandler"}, {4, "SetErrorHandler"}, {5, "Parse"}, {6, "GetLastMessage"},
    });
}

struct PlacesIXmlNode : PlaceFake<IXmlNode> {
    ncfBool HasAttributes() override { return Ran<ncfBool>("HasAttributes"); }
    ncfUInt32 GetType() override { return Ran<ncfUInt32>("GetType"); }
    NCFRESULT GetName(INCFString**) override { return Ran<NCFRESULT>("GetName"); }
    NCFRESULT GetValue(INCFString**) override { return Ran<NCFRESULT>("GetValue"); }
    ncfUInt32 GetChildCount() override { return Ran<ncfUInt32>("GetChildCount"); }
    NCFRESULT GetChild(ncfUInt32, IXmlNode**) override { return Ran<NCFRESULT>("GetChild"); }
    NCFRESULT GetAttributes(IXmlAttributeList**) override { return Ran<NCFRESULT>("GetAttributes"); }
};

TEST(Places, OfIXmlNode) {
    ExpectPlaces<PlacesIXmlNode>({
        {3, "HasAttributes"}, {4, "GetType"}, {5, "GetName"}, {6, "GetValue"},
        {7, "GetChildCount"}, {8, "GetChild"}, {9, "GetAttributes"},
    });
}

struct PlacesIXmlAttributeList : PlaceFake<IXmlAttributeList> {
    ncfUInt32 GetCount() override { return Ran<ncfUInt32>("GetCount"); }
    NCFRESULT GetItem(ncfUInt32, IXmlNode**) override { return Ran<NCFRESULT>("GetItem"); }
};

TEST(Places, OfIXmlAttributeList) {
    ExpectPlaces<PlacesIXmlAttributeList>({
        {3, "GetCount"}, {4, "GetItem"},
    });
}

struct PlacesIXmlElement : PlaceFake<IXmlElement> {
    NCFRESULT GetTagName(INCFString**) override { return Ran<NCFRESULT>("GetTagName"); }
};

TEST(Places, OfIXmlElement) {
    ExpectPlaces<PlacesIXmlElement>({
        {3, "GetTagName"},
    });
}

struct PlacesIXmlAttribute : PlaceFake<IXmlAttribute> {
    NCFRESULT GetName(INCFString**) override { return Ran<NCFRESULT>("GetName"); }
    NCFRESULT GetValue(INCFString**) override { return Ran<NCFRESULT>("GetValue"); }
};

TEST(Places, OfIXmlAttribute) {
    ExpectPlaces<PlacesIXmlAttribute>({
        {3, "GetName"}, {4, "GetValue"},
    });
}

struct PlacesIXmlDocument : PlaceFake<IXmlDocument> {
    NCFRESULT Load(INCFString*) override { return Ran<NCFRESULT>("Load"); }
    NCFRESULT LoadFromText(INCFString*) override { return Ran<NCFRESULT>("LoadFromText"); }
    NCFRESULT GetRootNode(INCFUnknown**) override { return Ran<NCFRESULT>("GetRootNode"); }
};

TEST(Places, OfIXmlDocument) {
    ExpectPlaces<PlacesIXmlDocument>({
        {3, "Load"}, {4, "LoadFromText"}, {5, "GetRootNode"},
    });
}

struct PlacesIXmlWriter : PlaceFake<IXmlWriter> {
    NCFRESULT Open(INCFString*) override { return Ran<NCFRESULT>("Open"); }
    NCFRESULT Close() override { return Ran<NCFRESULT>("Close"); }
    NCFRESULT GetText(INCFString**) override { return Ran<NCFRESULT>("GetText"); }
    NCFRESULT Attribute(INCFString*, INCFString*, INCFString*) override { return Ran<NCFRESULT>("Attribute"); }
    NCFRESULT Element(INCFString*, INCFString*) override { return Ran<NCFRESULT>("Element"); }
    NCFRESULT Text(INCFString*, INCFString*) override { return Ran<NCFRESULT>("Text"); }
};

TEST(Places, OfIXmlWriter) {
    ExpectPlaces<PlacesIXmlWriter>({
        {3, "Open"}, {4, "Close"}, {5, "GetText"}, {6, "Attribute"}, {7, "Element"}, {8, "Text"},
    });
}

}  // namespace
// clang-format on
