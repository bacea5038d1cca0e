// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// A document in memory, read once, as a tree of objects.
//
// Implemented by the host: the document as a component, the rest given out by it.
// The module creates a document for each XML text inside a movie's sample
// description and for each parameter document that its parameter model reads. One
// thread at a time for a document and all of its nodes. What comes out belongs to
// the caller, and a node keeps its document alive. One object stands for each node
// while a reference to it lives, so two roads to a node give equal IID_INCFUnknown
// pointers.

struct IXmlAttributeList;

// Kinds of a node; comments and the like have other values.
enum XmlNodeType : ncfUInt32 {
    kXmlElement = 1,
    kXmlAttribute = 2,
    kXmlText = 3,
    kXmlCDATA = 4,
    kXmlOther = 5,
};

// A node of any kind. 3, 4 and 7 return the value itself. Children and attributes
// are counted from zero.
struct IXmlNode : INCFUnknown {
    virtual ncfBool HasAttributes() = 0;                              // 3. not 0: yes
    virtual ncfUInt32 GetType() = 0;                                  // 4. an XmlNodeType
    virtual NCFRESULT GetName(INCFString** name) = 0;                 // 5
    virtual NCFRESULT GetValue(INCFString** value) = 0;               // 6
    virtual ncfUInt32 GetChildCount() = 0;                            // 7
    virtual NCFRESULT GetChild(ncfUInt32 index, IXmlNode** out) = 0;  // 8
    virtual NCFRESULT GetAttributes(IXmlAttributeList** out) = 0;     // 9

protected:
    ~IXmlNode() = default;
};

// The attributes of an element, in the order of the document.
struct IXmlAttributeList : INCFUnknown {
    virtual ncfUInt32 GetCount() = 0;                                // 3
    virtual NCFRESULT GetItem(ncfUInt32 index, IXmlNode** out) = 0;  // 4

protected:
    ~IXmlAttributeList() = default;
};

// Further interface of an element's node.
struct IXmlElement : INCFUnknown {
    virtual NCFRESULT GetTagName(INCFString** name) = 0;  // 3

protected:
    ~IXmlElement() = default;
};

// Further interface of an attribute's node.
struct IXmlAttribute : INCFUnknown {
    virtual NCFRESULT GetName(INCFString** name) = 0;    // 3
    virtual NCFRESULT GetValue(INCFString** value) = 0;  // 4

protected:
    ~IXmlAttribute() = default;
};

// The document itself: loaded once, then asked for its root.
struct IXmlDocument : INCFUnknown {
    // 3. Reads a file. Not well-formed, with a document type declaration, or
    // deeper than 256 levels: a failure, and the document stays empty.
    virtual NCFRESULT Load(INCFString* path) = 0;
    // 4. Reads the text itself, whatever encoding its declaration claims.
    virtual NCFRESULT LoadFromText(INCFString* text) = 0;
    // 5. The root element's node. NMA_E_NOTINITIALIZED before loading.
    virtual NCFRESULT GetRootNode(INCFUnknown** out) = 0;

protected:
    ~IXmlDocument() = default;
};

inline constexpr GUID kCLSID_XmlDocument = ncfGuid("56542293-7981-4D89-8347-22AD21542DB3");
inline constexpr GUID kIID_XmlDocument = ncfGuid("02BAE621-8A36-4C17-87DD-A57F43B0C503");
inline constexpr GUID kIID_XmlNode = ncfGuid("EE7F1BE7-CEF3-4EE9-B68A-ED96D484EEAB");
inline constexpr GUID kIID_XmlAttributeList = ncfGuid("3F0A7B6D-12C4-4E9B-8D55-90E1C6A2B705");
inline constexpr GUID kIID_XmlElement = ncfGuid("9A93A6D5-798D-43F5-ADA1-F18A6D07454E");
inline constexpr GUID kIID_XmlAttribute = ncfGuid("72AF0713-70D9-4992-B3C7-E83FFE18EBB7");
constexpr const GUID& ncfIdOf(const IXmlDocument*) {
    return kIID_XmlDocument;
}
constexpr const GUID& ncfIdOf(const IXmlNode*) {
    return kIID_XmlNode;
}
constexpr const GUID& ncfIdOf(const IXmlAttributeList*) {
    return kIID_XmlAttributeList;
}
constexpr const GUID& ncfIdOf(const IXmlElement*) {
    return kIID_XmlElement;
}
constexpr const GUID& ncfIdOf(const IXmlAttribute*) {
    return kIID_XmlAttribute;
}
