// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <fstream>
#include <initializer_list>
#include <iterator>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/PropertyKeys.h"
#include "aaf_library/objects/File.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "not_implemented/AAF.h"
#include "not_implemented/Operations.h"

// Which published operations answer AAFRESULT_NOT_IMPLEMENTED is read from the tables of operations
// themselves: a slot that still leads to the body of NotImplemented<Interface>. docs/aaf_library.md
// lists them.
namespace aaf {

namespace {

// For each interface, the operations that are not implemented in some object that answers it.
struct Found {
    std::set<std::string> answered;
    std::map<std::string, std::set<std::string>> missing;
};

template <class Interface>
class Bare final : public NotImplemented<Interface> {
public:
    HRESULT QueryInterface(REFIID, void**) override { return AAF_E_NOINTERFACE; }
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 1; }
};

template <class Interface>
const void* const* OperationsOf(Interface* object) {
    return *reinterpret_cast<const void* const* const*>(object);
}

template <class Interface>
void CompareAs(IUnknown* object, Found& found) {
    Interface* view = nullptr;
    if (object->QueryInterface(aafIdOf(static_cast<const Interface*>(nullptr)),
                               reinterpret_cast<void**>(&view)) < 0) {
        return;
    }
    Bare<Interface> bare;
    const void* const* const has = OperationsOf(view);
    const void* const* const lacks = OperationsOf<Interface>(&bare);
    constexpr auto& names = Published<Interface>::kNames;
    found.answered.insert(names[0]);
    for (std::size_t at = 1; at < std::size(names); ++at) {
        if (has[at + 2] == lacks[at + 2]) {
            found.missing[names[0]].insert(names[at]);
        }
    }
    view->Release();
}

template <class... Interfaces>
void CompareAll(IUnknown* object, Found& found, ListOf<Interfaces...>) {
    (CompareAs<Interfaces>(object, found), ...);
}

void Compare(IUnknown* object, Found& found) {
    CompareAll(object, found, PublishedInterfaces());
}

template <class... Interfaces>
std::map<std::string, std::size_t> CountOperations(ListOf<Interfaces...>) {
    return {{Published<Interfaces>::kNames[0], std::size(Published<Interfaces>::kNames) - 1}...};
}

// Everything that objects of a new file answer.
Found OfAllObjects() {
    Found found;
    std::wstring text = L"Tests";
    aafProductIdentification_t product{};
    product.companyName = text.data();
    product.productName = text.data();
    IAAFFile* file = nullptr;
    EXPECT_EQ(AAFRESULT_SUCCESS, File::OpenTransient(&product, &file));
    IAAFHeader* header = nullptr;
    IAAFDictionary* dictionary = nullptr;
    IAAFContentStorage* content = nullptr;
    IAAFClassDef* headerClass = nullptr;
    IAAFPropertyDef* property = nullptr;
    IAAFPropertyValue* value = nullptr;
    IEnumAAFProperties* properties = nullptr;
    IAAFProperty* named = nullptr;
    EXPECT_EQ(AAFRESULT_SUCCESS, file->GetHeader(&header));
    EXPECT_EQ(AAFRESULT_SUCCESS, file->GetDictionary(&dictionary));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->GetContentStorage(&content));
    EXPECT_EQ(AAFRESULT_SUCCESS, dictionary->LookupClassDef(AUID_AAFHeader, &headerClass));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              headerClass->LookupPropertyDef(prop::Header_ByteOrder.id, &property));
    IAAFObject* object = nullptr;
    header->QueryInterface(IID_IAAFObject, reinterpret_cast<void**>(&object));
    EXPECT_EQ(AAFRESULT_SUCCESS, object->GetPropertyValue(property, &value));
    EXPECT_EQ(AAFRESULT_SUCCESS, object->GetProperties(&properties));
    EXPECT_EQ(AAFRESULT_SUCCESS, properties->NextOne(&named));
    for (IUnknown* known :
         std::initializer_list<IUnknown*>{named, properties, value, object, property, headerClass,
                                          content, dictionary, header, file}) {
        Compare(known, found);
    }
    for (const BuiltInClass& entry : BuiltInClasses()) {
        IUnknown* made = nullptr;
        if (dictionary->CreateInstance(entry.id, IID_IUnknown, &made) >= 0 ||
            dictionary->CreateMetaInstance(entry.id, IID_IUnknown, &made) >= 0) {
            Compare(made, found);
            made->Release();
        }
    }
    for (IUnknown* known :
         std::initializer_list<IUnknown*>{named, properties, value, object, property, headerClass,
                                          content, dictionary, header, file}) {
        known->Release();
    }
    return found;
}

std::string Join(const std::vector<std::string>& words) {
    std::string joined;
    for (const std::string& word : words) {
        joined += (joined.empty() ? "" : ", ") + word;
    }
    return joined;
}

// The row of an interface in docs/aaf_library.md.
std::string RowOf(const std::string& interface, const std::vector<std::string>& operations) {
    return "| `" + interface + "` | " + std::to_string(operations.size()) + " | " +
           Join(operations) + " |";
}

std::vector<std::string> LinesOf(const std::string& path) {
    std::ifstream stream(path);
    std::vector<std::string> lines;
    for (std::string line; std::getline(stream, line);) {
        lines.push_back(line);
    }
    return lines;
}

TEST(NotImplementedList, IsThatOfTheDocument) {
    const Found found = OfAllObjects();
    std::vector<std::string> rows;
    std::size_t count = 0;
    for (const auto& [interface, operations] : found.missing) {
        rows.push_back(RowOf(interface, {operations.begin(), operations.end()}));
        count += operations.size();
    }
    std::vector<std::string> listed;
    bool isCountTold = false;
    for (const std::string& line : LinesOf(DOCS_FOLDER "/aaf_library.md")) {
        if (line.rfind("| `IAAF", 0) == 0) {
            listed.push_back(line);
        }
        isCountTold =
            isCountTold || line.find(" " + std::to_string(count) + " operations") != line.npos;
    }
    EXPECT_EQ(rows, listed) << "write these rows into docs/aaf_library.md";
    EXPECT_TRUE(isCountTold) << "docs/aaf_library.md doesn't tell that there are " << count;
}

// Interfaces that no object of a file answers: those of essence, plug-ins and raw storage, those
// that callers answer, enumerators, and the two that have no operations.
TEST(NotImplementedList, LeavesNoInterfaceOfAFileOut) {
    const std::set<std::string> others = {
        // Essence.
        "IAAFEssenceAccess", "IAAFEssenceFormat", "IAAFEssenceMultiAccess",
        "IAAFKLVEssenceDataParameters", "IAAFKLVStreamParameters", "IAAFPlainEssenceData",
        "IAAFPlainStreamData",
        // Plug-ins and storage.
        "IAAFCachePageAllocator", "IAAFGetFileBits", "IAAFPluginManager", "IAAFRandomFile",
        "IAAFRandomRawStorage", "IAAFRawStorage", "IAAFSetFileBits",
        // Answered by callers, by the exports, and by what a search gives.
        "IAAFDiagnosticOutput", "IAAFProgress", "IAAFStreamAccess", "IAAFFileEncoding",
        "IAAFFindSourceInfo",
        // Of abstract classes.
        "IAAFDescriptiveFramework", "IAAFDescriptiveObject"};
    const Found found = OfAllObjects();
    for (const auto& [interface, count] : CountOperations(PublishedInterfaces())) {
        const bool isEnumerator = interface.rfind("IEnumAAF", 0) == 0;
        EXPECT_EQ(isEnumerator ? 5u : count, count) << interface;
        if (!isEnumerator || interface == "IEnumAAFProperties") {
            EXPECT_EQ(others.count(interface) == 0, found.answered.count(interface) != 0)
                << interface;
        }
    }
}

}  // namespace

}  // namespace aaf
