// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/GenericXMLDataContainer.h"

#include <gtest/gtest.h>

#include <sstream>

#include "tests/unit/descriptor_data/DataHost.h"

namespace {

// Entry
//   Info
//     Key
//   Size
//     N
//     D
//   Rate
//     N
//     D
//   Leaf
class ContainerTest : public DataHost {
protected:
    ContainerTest() {
        XMLDataPropertyValue* const entry = Node("Entry", DCF_ENTRY_ELEMENT, nullptr);
        XMLDataPropertyValue* const info = Node("Info", DCF_COMPLEX_ELEMENT, entry);
        Node("Key", DCF_KEY_ELEMENT, info);
        for (const char* name : {"Size", "Rate"}) {
            XMLDataPropertyValue* const pair = Node(name, DCF_COMPLEX_ELEMENT, entry);
            Node("N", DCF_ELEMENT, pair);
            Node("D", DCF_ELEMENT, pair);
        }
        Node("Leaf", DCF_ELEMENT, entry);
        EXPECT_EQ(container_.SetContainerDescription(entry), NCF_OK);
    }

    XMLDataPropertyValue* Node(const char* name, ncfUInt32 kind, XMLDataPropertyValue* parent) {
        XMLDataPropertyValue* node = nullptr;
        EXPECT_EQ(container_.CreateDescriptionNode(name, kind, &node), NCF_OK);
        if (parent) {
            EXPECT_EQ(parent->AddChild(node), NCF_OK);
        }
        return node;
    }
    void Open(const char* tag) { container_.Element(NMAString(tag)); }
    void Put(const char* text) { container_.Text(NMAString(text)); }
    void Leaf(const char* tag, const char* text) {
        Open(tag);
        Put(text);
    }
    void Entry(const char* key) {
        Open("Entry");
        Open("Info");
        Leaf("Key", key);
    }
    std::vector<XMLDataPropertyValue*> Entries(const char* key) {
        std::vector<XMLDataPropertyValue*> entries;
        container_.GetEntries(key, &entries);
        return entries;
    }
    static XMLDataPropertyValue* Child(XMLDataPropertyValue* node, const char* name) {
        XMLDataPropertyValue* child = nullptr;
        node->FindPropertyInChildren(name, &child);
        return child;
    }
    NCFRESULT Thrown(const char* tag) {
        try {
            Open(tag);
            return NCF_OK;
        } catch (NCFRESULT result) {
            return result;
        }
    }

    GenericXMLDataContainer container_;
};

TEST_F(ContainerTest, RefusesMissingNodesUnderTheirNames) {
    EXPECT_EQ(container_.CreateDescriptionNode("x", DCF_ELEMENT, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(container_.SetContainerDescription(nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.once("CHK_INARG(node)GenericXMLDataContainer::CreateDescriptionNode"));
    EXPECT_TRUE(log.once("CHK_INARG(parent)GenericXMLDataContainer::SetContainerDescription"));
}

TEST_F(ContainerTest, OperationsStandInTheirPlaces) {
    // A destructor takes two places, so the first operation is at 2.
    struct Calls : XMLDataContainer {
        std::string made;
        void Start() override { made += "start "; }
        void End() override { made += "end "; }
        void Element(const NMAString&) override { made += "element "; }
        void Text(const NMAString&) override { made += "text "; }
        void Attribute(const NMAString&, const NMAString&) override { made += "attribute "; }
    } calls;
    void** const table = *reinterpret_cast<void***>(static_cast<XMLDataContainer*>(&calls));
    using NoArgument = void (*)(void*);
    using OneArgument = void (*)(void*, const NMAString&);
    using TwoArguments = void (*)(void*, const NMAString&, const NMAString&);
    const NMAString text;
    reinterpret_cast<NoArgument>(table[2])(&calls);
    reinterpret_cast<NoArgument>(table[3])(&calls);
    reinterpret_cast<OneArgument>(table[4])(&calls, text);
    reinterpret_cast<OneArgument>(table[5])(&calls, text);
    reinterpret_cast<TwoArguments>(table[6])(&calls, text, text);
    EXPECT_EQ(calls.made, "start end element text attribute ");
}

TEST_F(ContainerTest, FilesEachEntryUnderItsKey) {
    container_.Start();
    Entry("1");
    Leaf("Leaf", "one");
    Entry("2");
    Leaf("Leaf", "two");
    container_.End();
    ASSERT_EQ(Entries("1").size(), 1u);
    EXPECT_STREQ(Child(Entries("1")[0], "Leaf")->ValueText(), "one");
    ASSERT_EQ(Entries("2").size(), 1u);
    EXPECT_STREQ(Child(Entries("2")[0], "Leaf")->ValueText(), "two");
}

TEST_F(ContainerTest, EntriesOfOneKeyKeepTheirOrder) {
    for (const char* value : {"first", "second", "third"}) {
        Entry("7");
        Leaf("Leaf", value);
    }
    container_.End();
    ASSERT_EQ(Entries("7").size(), 3u);
    EXPECT_STREQ(Child(Entries("7")[0], "Leaf")->ValueText(), "first");
    EXPECT_STREQ(Child(Entries("7")[1], "Leaf")->ValueText(), "second");
    EXPECT_STREQ(Child(Entries("7")[2], "Leaf")->ValueText(), "third");
}

TEST_F(ContainerTest, AnUnknownKeyLeavesTheListAsItWas) {
    Entry("1");
    container_.End();
    std::vector<XMLDataPropertyValue*> entries(2, nullptr);
    container_.GetEntries("10", &entries);
    EXPECT_EQ(entries.size(), 2u);
    container_.GetEntries("1", &entries);
    EXPECT_EQ(entries.size(), 3u);
}

TEST_F(ContainerTest, KeysAreComparedAsWholeBytes) {
    Entry("b");
    Entry("\xC3\xA9");
    Entry("a");
    container_.End();
    std::vector<std::string> order;
    for (const auto& entry : container_.AllEntries()) {
        order.push_back(entry.first->ValueText());
    }
    EXPECT_EQ(order, (std::vector<std::string>{"a", "b", "\xC3\xA9"}));
    EXPECT_TRUE(Entries("A").empty());
}

TEST_F(ContainerTest, TheKeyIsNoChildButKnowsItsParent) {
    Entry("1");
    container_.End();
    XMLDataPropertyValue* const info = Child(Entries("1")[0], "Info");
    ASSERT_NE(info, nullptr);
    EXPECT_EQ(Child(info, "Key"), nullptr);
    XMLDataPropertyValue* parent = nullptr;
    container_.AllEntries().begin()->first->GetParent(&parent);
    EXPECT_EQ(parent, info);
}

TEST_F(ContainerTest, AnEntryWithoutKeyGoesUnderTheKeyBeforeIt) {
    Entry("1");
    Open("Entry");
    Leaf("Leaf", "keyless");
    container_.End();
    ASSERT_EQ(Entries("1").size(), 2u);
    EXPECT_STREQ(Child(Entries("1")[1], "Leaf")->ValueText(), "keyless");
}

TEST_F(ContainerTest, AnEntryBeforeAnyKeyIsDropped) {
    Open("Entry");
    Leaf("Leaf", "keyless");
    Entry("1");
    container_.End();
    EXPECT_EQ(container_.AllEntries().size(), 1u);
    EXPECT_EQ(Entries("1").size(), 1u);
}

TEST_F(ContainerTest, WithoutEndTheLastEntryIsLost) {
    Entry("1");
    Entry("2");
    EXPECT_EQ(container_.AllEntries().size(), 1u);
    container_.End();
    EXPECT_EQ(container_.AllEntries().size(), 2u);
}

TEST_F(ContainerTest, ADocumentWithoutEntriesGivesNone) {
    container_.Start();
    Open("Wrapper");
    Put("text");
    container_.End();
    EXPECT_TRUE(container_.AllEntries().empty());
}

TEST_F(ContainerTest, UnknownElementsMoveNothing) {
    Open("Document");
    Entry("1");
    Open("Size");
    Leaf("N", "4");
    Open("Unknown");
    Put("ignored");
    Leaf("D", "3");
    container_.End();
    XMLDataPropertyValue* const size = Child(Entries("1")[0], "Size");
    EXPECT_STREQ(Child(size, "N")->ValueText(), "4");
    EXPECT_STREQ(Child(size, "D")->ValueText(), "3");
}

TEST_F(ContainerTest, ANameDeclaredTwiceGoesToTheNearestParent) {
    Entry("1");
    Open("Size");
    Leaf("N", "16");
    Leaf("D", "9");
    Open("Rate");
    Leaf("N", "25");
    Leaf("D", "1");
    container_.End();
    XMLDataPropertyValue* const entry = Entries("1")[0];
    EXPECT_STREQ(Child(Child(entry, "Size"), "N")->ValueText(), "16");
    EXPECT_STREQ(Child(Child(entry, "Size"), "D")->ValueText(), "9");
    EXPECT_STREQ(Child(Child(entry, "Rate"), "N")->ValueText(), "25");
    EXPECT_STREQ(Child(Child(entry, "Rate"), "D")->ValueText(), "1");
}

TEST_F(ContainerTest, RepeatedElementsAreAllKeptAndTheFirstIsFound) {
    Entry("1");
    Leaf("Leaf", "one");
    Leaf("Leaf", "two");
    container_.End();
    XMLDataPropertyValue* const entry = Entries("1")[0];
    std::vector<XMLDataPropertyValue*> leaves;
    EXPECT_EQ(entry->FindPropertyInChildren("Leaf", &leaves), NCF_OK);
    EXPECT_EQ(leaves.size(), 2u);
    EXPECT_STREQ(Child(entry, "Leaf")->ValueText(), "one");
}

TEST_F(ContainerTest, OnlyTheFirstTextAfterALeafCounts) {
    Entry("1");
    Put("after the key");
    Leaf("Leaf", "4");
    Put("2");
    container_.End();
    ASSERT_EQ(Entries("1").size(), 1u);
    EXPECT_STREQ(Child(Entries("1")[0], "Leaf")->ValueText(), "4");
}

TEST_F(ContainerTest, TextAfterAComplexElementIsDropped) {
    Entry("1");
    Open("Size");
    Put("  ");
    Leaf("N", "4");
    container_.End();
    XMLDataPropertyValue* const size = Child(Entries("1")[0], "Size");
    EXPECT_STREQ(size->ValueText(), "");
    EXPECT_STREQ(Child(size, "N")->ValueText(), "4");
}

TEST_F(ContainerTest, AnEmptyLeafTakesTheNextText) {
    Entry("1");
    Open("Leaf");
    Put("\n  ");
    container_.End();
    EXPECT_STREQ(Child(Entries("1")[0], "Leaf")->ValueText(), "\n  ");
}

TEST_F(ContainerTest, AnEmptyLeafWaitsNoLongerThanItsEntry) {
    Entry("1");
    Open("Leaf");
    Entry("2");
    Open("Leaf");
    container_.End();
    Put("behind the end");
    EXPECT_STREQ(Child(Entries("2")[0], "Leaf")->ValueText(), "");

    Open("Entry");
    Open("Leaf");
    Open("Entry");
    Put("\n  ");
    container_.End();
    EXPECT_STREQ(Entries("2").back()->ValueText(), "") << "an entry has no value";
}

TEST_F(ContainerTest, AnAttributeIsAChildElement) {
    Open("Entry");
    Open("Info");
    container_.Attribute(NMAString("Key"), NMAString("5"));
    container_.Attribute(NMAString("Leaf"), NMAString("value"));
    container_.Attribute(NMAString("Unknown"), NMAString("ignored"));
    container_.End();
    ASSERT_EQ(Entries("5").size(), 1u);
    EXPECT_STREQ(Child(Entries("5")[0], "Leaf")->ValueText(), "value");
}

TEST_F(ContainerTest, AnAttributeGoesThroughTheVirtualTable) {
    struct Counting : GenericXMLDataContainer {
        int elements = 0;
        int texts = 0;
        void Element(const NMAString&) override { ++elements; }
        void Text(const NMAString&) override { ++texts; }
    } counting;
    counting.Attribute(NMAString("a"), NMAString("b"));
    EXPECT_EQ(counting.elements, 1);
    EXPECT_EQ(counting.texts, 1);
}

TEST_F(ContainerTest, ALeafOfTheTreeBeforeTheFirstEntryIsInvalid) {
    EXPECT_EQ(Thrown("Leaf"), ncf_detail::Code(0x80000003));
}

TEST_F(ContainerTest, AComplexElementBeforeTheFirstEntryIsInvalid) {
    EXPECT_EQ(Thrown("Info"), ncf_detail::Code(0x80000003));
}

TEST_F(ContainerTest, AKeyBeforeTheFirstEntryIsInvalid) {
    GenericXMLDataContainer flat;
    XMLDataPropertyValue* entry = nullptr;
    XMLDataPropertyValue* key = nullptr;
    flat.CreateDescriptionNode("Entry", DCF_ENTRY_ELEMENT, &entry);
    flat.CreateDescriptionNode("Key", DCF_KEY_ELEMENT, &key);
    entry->AddChild(key);
    flat.SetContainerDescription(entry);
    EXPECT_THROW(flat.Element(NMAString("Key")), NCFRESULT);
}

TEST_F(ContainerTest, WhatLiesDeeperInTheTreeIsIgnoredBeforeTheFirstEntry) {
    EXPECT_EQ(Thrown("N"), NCF_OK);
    EXPECT_EQ(Thrown("Key"), NCF_OK);
    Entry("1");
    container_.End();
    EXPECT_EQ(Entries("1").size(), 1u);
}

TEST_F(ContainerTest, AParseThatGoesOnAfterAThrowStaysSafe) {
    EXPECT_NE(Thrown("Leaf"), NCF_OK);
    EXPECT_EQ(Thrown("Leaf"), NCF_OK);  // no value to look from
    Put("text");
    Entry("1");
    container_.End();
    EXPECT_EQ(Entries("1").size(), 1u);
}

TEST_F(ContainerTest, ADeclaredElementWithoutItsParentInTheEntryIsPassedOver) {
    Open("Entry");
    // "Key" can be found from "Info" only, and then "N" not from "Key".
    Open("Info");
    Leaf("Key", "1");
    Open("N");
    Leaf("Leaf", "value");
    container_.End();
    EXPECT_STREQ(Child(Entries("1")[0], "Leaf")->ValueText(), "value");
    EXPECT_EQ(Child(Entries("1")[0], "N"), nullptr);
}

TEST_F(ContainerTest, WithoutADeclaredTreeEverythingIsIgnored) {
    GenericXMLDataContainer bare;
    bare.Element(NMAString("Entry"));
    bare.Text(NMAString("text"));
    bare.End();
    EXPECT_TRUE(bare.AllEntries().empty());
}

TEST_F(ContainerTest, DumpShowsKeyThenTreeWithSixSpacesALevel) {
    Entry("12");
    Open("Size");
    Leaf("N", "4");
    container_.End();
    std::ostringstream stream;
    container_.Dump(stream);
    EXPECT_EQ(stream.str(),
              "\n\nData Item\n---------------------------------------------\n"
              "Description Property:    Key\n"
              "Data Entry:              12\n\n"
              "\n"
              "Description Property:    Entry\n"
              "Data Entry:              \n\n"
              "      Description Property:    Info\n"
              "      Data Entry:              \n\n"
              "      Description Property:    Size\n"
              "      Data Entry:              \n\n"
              "            Description Property:    N\n"
              "            Data Entry:              4\n\n");
}

TEST_F(ContainerTest, DumpFollowsTheOrderOfKeys) {
    Entry("b");
    Entry("a");
    container_.End();
    std::ostringstream stream;
    container_.Dump(stream);
    EXPECT_LT(stream.str().find("Data Entry:              a"),
              stream.str().find("Data Entry:              b"));
}

}  // namespace
