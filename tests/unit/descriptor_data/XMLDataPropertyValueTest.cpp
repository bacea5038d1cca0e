// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/XMLDataPropertyValue.h"

#include <gtest/gtest.h>

#include "tests/unit/descriptor_data/DataHost.h"

namespace {

class XMLDataPropertyValueTest : public DataHost {
protected:
    XMLDataPropertyDescription description_{NMAString("name"), DCF_ELEMENT};
    XMLDataPropertyDescription otherDescription_{NMAString("other"), DCF_COMPLEX_ELEMENT};
};

TEST_F(XMLDataPropertyValueTest, DescriptionKeepsNameAndKind) {
    EXPECT_STREQ(otherDescription_.GetName().GetUTF8String(), "other");
    EXPECT_EQ(otherDescription_.NameText(), "other");
    EXPECT_EQ(otherDescription_.GetKind(), 2u);
}

TEST_F(XMLDataPropertyValueTest, KindsHaveTheNumbersOfTheDataFiles) {
    EXPECT_EQ(DCF_KEY_ELEMENT, 0u);
    EXPECT_EQ(DCF_ENTRY_ELEMENT, 1u);
    EXPECT_EQ(DCF_COMPLEX_ELEMENT, 2u);
    EXPECT_EQ(DCF_ELEMENT, 3u);
}

TEST_F(XMLDataPropertyValueTest, ThrowsATypedResultWithoutDescription) {
    try {
        XMLDataPropertyValue value(nullptr);
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT result) {
        EXPECT_EQ(result, ncf_detail::Code(0x80000006));
    }
}

TEST_F(XMLDataPropertyValueTest, StartsEmptyWithoutParentOrChildren) {
    XMLDataPropertyValue value(&description_);
    NMAString text("before");
    EXPECT_EQ(value.GetValue(&text), NCF_OK);
    EXPECT_TRUE(text.IsEmpty());
    XMLDataPropertyValue* parent = &value;
    EXPECT_EQ(value.GetParent(&parent), NCF_OK);
    EXPECT_EQ(parent, nullptr);
    EXPECT_TRUE(value.Children().empty());
    const XMLDataPropertyDescription* description = nullptr;
    EXPECT_EQ(value.GetDesc(&description), NCF_OK);
    EXPECT_EQ(description, &description_);
}

TEST_F(XMLDataPropertyValueTest, HandsOutACopyOfItsValue) {
    XMLDataPropertyValue value(&description_);
    EXPECT_EQ(value.SetValue(NMAString("one")), NCF_OK);
    NMAString copy;
    EXPECT_EQ(value.GetValue(&copy), NCF_OK);
    value.SetValue(NMAString("two"));
    EXPECT_STREQ(copy.GetUTF8String(), "one");
    EXPECT_STREQ(value.ValueText(), "two");
}

TEST_F(XMLDataPropertyValueTest, AddingAChildLinksBothWays) {
    XMLDataPropertyValue parent(&otherDescription_);
    XMLDataPropertyValue child(&description_);
    EXPECT_EQ(parent.AddChild(&child), NCF_OK);
    XMLDataPropertyValue* found = nullptr;
    child.GetParent(&found);
    EXPECT_EQ(found, &parent);
    ASSERT_EQ(parent.Children().size(), 1u);
    EXPECT_EQ(parent.Children()[0], &child);
}

TEST_F(XMLDataPropertyValueTest, EveryMissingOutputIsRefusedAndNamed) {
    XMLDataPropertyValue value(&description_);
    XMLDataPropertyValue** const noNode = nullptr;
    std::vector<XMLDataPropertyValue*>* const noList = nullptr;
    EXPECT_EQ(value.GetDesc(nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.GetValue(nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.SetParent(nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.GetParent(nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.AddChild(nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.FindNextProperty("x", nullptr), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.FindPropertyInChildren("x", noList), ncf_detail::Code(0x80000003));
    EXPECT_EQ(value.FindPropertyInChildren("x", noNode), ncf_detail::Code(0x80000003));
    std::vector<std::string> texts;
    for (const LoggedRecord& record : log.records()) {
        texts.push_back(record.text);
        EXPECT_EQ(record.kind, slog::kInformation);
    }
    EXPECT_EQ(texts, (std::vector<std::string>{
                         "CHK_INARG(outDesc)XMLDataPropertyValue::GetDesc",
                         "CHK_INARG(outValue)XMLDataPropertyValue::GetValue",
                         "CHK_INARG(parent)XMLDataPropertyValue::SetParent",
                         "CHK_INARG(outPropertyValue)XMLDataPropertyValue::GetParent",
                         "CHK_INARG(child)XMLDataPropertyValue::AddChild",
                         "CHK_INARG(dataPropertyValue)XMLDataPropertyValue::FindNextProperty",
                         "CHK_INARG(dataPropertyValueVect)XMLDataPropertyValue::"
                         "FindPropertyInChildren",
                         "CHK_INARG(dataPropertyValue)XMLDataPropertyValue::"
                         "FindPropertyInChildren",
                     }));
}

// root
//   a
//     twin
//   b
//     twin
//     leaf
class PropertySearch : public XMLDataPropertyValueTest {
protected:
    PropertySearch() {
        root_.AddChild(&a_);
        root_.AddChild(&b_);
        a_.AddChild(&twinOfA_);
        b_.AddChild(&twinOfB_);
        b_.AddChild(&leaf_);
    }
    XMLDataPropertyDescription rootName_{NMAString("root"), DCF_ENTRY_ELEMENT};
    XMLDataPropertyDescription aName_{NMAString("a"), DCF_COMPLEX_ELEMENT};
    XMLDataPropertyDescription bName_{NMAString("b"), DCF_COMPLEX_ELEMENT};
    XMLDataPropertyDescription twinName_{NMAString("twin"), DCF_ELEMENT};
    XMLDataPropertyDescription leafName_{NMAString("leaf"), DCF_ELEMENT};
    XMLDataPropertyValue root_{&rootName_};
    XMLDataPropertyValue a_{&aName_};
    XMLDataPropertyValue b_{&bName_};
    XMLDataPropertyValue twinOfA_{&twinName_};
    XMLDataPropertyValue twinOfB_{&twinName_};
    XMLDataPropertyValue leaf_{&leafName_};
    XMLDataPropertyValue* found_ = nullptr;
};

TEST_F(PropertySearch, FindsTheNodeItself) {
    EXPECT_EQ(leaf_.FindNextProperty("leaf", &found_), NCF_OK);
    EXPECT_EQ(found_, &leaf_);
}

TEST_F(PropertySearch, FindsAChild) {
    EXPECT_EQ(b_.FindNextProperty("leaf", &found_), NCF_OK);
    EXPECT_EQ(found_, &leaf_);
}

TEST_F(PropertySearch, GoesOutwardToSiblingAndParent) {
    EXPECT_EQ(leaf_.FindNextProperty("b", &found_), NCF_OK);
    EXPECT_EQ(found_, &b_);
    EXPECT_EQ(leaf_.FindNextProperty("a", &found_), NCF_OK);
    EXPECT_EQ(found_, &a_);
    EXPECT_EQ(leaf_.FindNextProperty("root", &found_), NCF_OK);
    EXPECT_EQ(found_, &root_);
}

TEST_F(PropertySearch, ANameThatOccursTwiceIsTheNearestOne) {
    EXPECT_EQ(leaf_.FindNextProperty("twin", &found_), NCF_OK);
    EXPECT_EQ(found_, &twinOfB_);
    EXPECT_EQ(a_.FindNextProperty("twin", &found_), NCF_OK);
    EXPECT_EQ(found_, &twinOfA_);
}

TEST_F(PropertySearch, ANodeComesBeforeAChildOfItsName) {
    XMLDataPropertyValue inner(&bName_);
    b_.AddChild(&inner);
    EXPECT_EQ(b_.FindNextProperty("b", &found_), NCF_OK);
    EXPECT_EQ(found_, &b_);
    EXPECT_EQ(leaf_.FindNextProperty("b", &found_), NCF_OK);
    EXPECT_EQ(found_, &b_);
}

TEST_F(PropertySearch, AParentComesBeforeItsSiblingsOfTheSameName) {
    XMLDataPropertyValue secondB(&bName_);
    XMLDataPropertyValue secondLeaf(&leafName_);
    root_.AddChild(&secondB);
    secondB.AddChild(&secondLeaf);
    EXPECT_EQ(secondLeaf.FindNextProperty("b", &found_), NCF_OK);
    EXPECT_EQ(found_, &secondB);
    EXPECT_EQ(a_.FindNextProperty("b", &found_), NCF_OK);
    EXPECT_EQ(found_, &b_) << "of several children the first";
}

TEST_F(PropertySearch, NeverLooksIntoChildrenOfASibling) {
    EXPECT_EQ(a_.FindNextProperty("leaf", &found_), 1);
    EXPECT_EQ(root_.FindNextProperty("twin", &found_), 1);
    EXPECT_EQ(root_.FindNextProperty("absent", &found_), 1);
}

TEST_F(PropertySearch, InChildrenGivesEveryMatchInOrderAndAppends) {
    XMLDataPropertyValue second(&twinName_);
    b_.AddChild(&second);
    std::vector<XMLDataPropertyValue*> all{&root_};
    EXPECT_EQ(b_.FindPropertyInChildren("twin", &all), NCF_OK);
    EXPECT_EQ(all, (std::vector<XMLDataPropertyValue*>{&root_, &twinOfB_, &second}));
    EXPECT_EQ(b_.FindPropertyInChildren("absent", &all), 1);
    EXPECT_EQ(all.size(), 3u);
}

TEST_F(PropertySearch, InChildrenIsNotRecursive) {
    std::vector<XMLDataPropertyValue*> all;
    EXPECT_EQ(root_.FindPropertyInChildren("leaf", &all), 1);
    EXPECT_TRUE(all.empty());
}

TEST_F(PropertySearch, TheSingleFormGivesTheFirstOrNull) {
    XMLDataPropertyValue second(&twinName_);
    b_.AddChild(&second);
    EXPECT_EQ(b_.FindPropertyInChildren("twin", &found_), NCF_OK);
    EXPECT_EQ(found_, &twinOfB_);
    EXPECT_EQ(b_.FindPropertyInChildren("absent", &found_), 1);
    EXPECT_EQ(found_, nullptr);
}

}  // namespace
