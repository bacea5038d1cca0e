// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/xml/ in their tables.

#include "host_interfaces/xml/SaxParser.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "tests/support/Slots.h"

namespace {

const SlotRow kXmlSlots[] = {
    {"INCFSaxDocumentHandler::Start", 3, SlotOf(&UTIL::INCFSaxDocumentHandler::Start)},
    {"INCFSaxDocumentHandler::End", 4, SlotOf(&UTIL::INCFSaxDocumentHandler::End)},
    {"INCFSaxDocumentHandler::Element", 5, SlotOf(&UTIL::INCFSaxDocumentHandler::Element)},
    {"INCFSaxDocumentHandler::Attribute", 6, SlotOf(&UTIL::INCFSaxDocumentHandler::Attribute)},
    {"INCFSaxDocumentHandler::Text", 7, SlotOf(&UTIL::INCFSaxDocumentHandler::Text)},
    {"INCFSaxErrorHandler::Warning", 3, SlotOf(&UTIL::INCFSaxErrorHandler::Warning)},
    {"INCFSaxErrorHandler::Error", 4, SlotOf(&UTIL::INCFSaxErrorHandler::Error)},
    {"INCFSaxErrorHandler::FatalError", 5, SlotOf(&UTIL::INCFSaxErrorHandler::FatalError)},
    {"INCFSaxParser::SetDocumentHandler", 3, SlotOf(&INCFSaxParser::SetDocumentHandler)},
    {"INCFSaxParser::SetErrorHandler", 4, SlotOf(&INCFSaxParser::SetErrorHandler)},
    {"INCFSaxParser::Parse", 5, SlotOf(&INCFSaxParser::Parse)},
    {"INCFSaxParser::GetLastMessage", 6, SlotOf(&INCFSaxParser::GetLastMessage)},
    {"IXmlNode::HasAttributes", 3, SlotOf(&IXmlNode::HasAttributes)},
    {"IXmlNode::GetType", 4, SlotOf(&IXmlNode::GetType)},
    {"IXmlNode::GetName", 5, SlotOf(&IXmlNode::GetName)},
    {"IXmlNode::GetValue", 6, SlotOf(&IXmlNode::GetValue)},
    {"IXmlNode::GetChildCount", 7, SlotOf(&IXmlNode::GetChildCount)},
    {"IXmlNode::GetChild", 8, SlotOf(&IXmlNode::GetChild)},
    {"IXmlNode::GetAttributes", 9, SlotOf(&IXmlNode::GetAttributes)},
    {"IXmlAttributeList::GetCount", 3, SlotOf(&IXmlAttributeList::GetCount)},
    {"IXmlAttributeList::GetItem", 4, SlotOf(&IXmlAttributeList::GetItem)},
    {"IXmlElement::GetTagName", 3, SlotOf(&IXmlElement::GetTagName)},
    {"IXmlAttribute::GetName", 3, SlotOf(&IXmlAttribute::GetName)},
    {"IXmlAttribute::GetValue", 4, SlotOf(&IXmlAttribute::GetValue)},
    {"IXmlDocument::Load", 3, SlotOf(&IXmlDocument::Load)},
    {"IXmlDocument::LoadFromText", 4, SlotOf(&IXmlDocument::LoadFromText)},
    {"IXmlDocument::GetRootNode", 5, SlotOf(&IXmlDocument::GetRootNode)},
    {"IXmlWriter::Open", 3, SlotOf(&IXmlWriter::Open)},
    {"IXmlWriter::Close", 4, SlotOf(&IXmlWriter::Close)},
    {"IXmlWriter::GetText", 5, SlotOf(&IXmlWriter::GetText)},
    {"IXmlWriter::Attribute", 6, SlotOf(&IXmlWriter::Attribute)},
    {"IXmlWriter::Element", 7, SlotOf(&IXmlWriter::Element)},
    {"IXmlWriter::Text", 8, SlotOf(&IXmlWriter::Text)},
};

TEST(XmlInterfaces, HaveTheirOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kXmlSlots);
}

}  // namespace
