// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Files as other programs write them: our own, saved and changed.

#include <algorithm>
#include <cstring>
#include <functional>

#include "aaf_library/model/PropertyKeys.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/StoredFile.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/objects/ClipDescription.h"
#include "tests/unit/aaf_library/objects/Sentences.h"

namespace aaf_test {

using aaf::stored::Bytes;
using aaf::stored::StoredForm;
using aaf::stored::StoredObject;
using aaf::stored::StoredProperty;
namespace prop = aaf::prop;

namespace {

StoredProperty& PropertyIn(StoredObject& object, aaf::PropertyId pid) {
    for (StoredProperty& property : object.properties) {
        if (property.pid == pid) {
            return property;
        }
    }
    throw std::logic_error("no such property");
}

Bytes StoredIdOf(const aafUID_t& id) {
    Bytes bytes(sizeof id);
    std::memcpy(bytes.data(), &id, sizeof id);
    return bytes;
}

StoredProperty& Mobs(StoredObject& root) {
    StoredObject& header = root.properties.at(1).objects.at(0);
    StoredObject& content = PropertyIn(header, prop::Header_Content.pid).objects.at(0);
    return PropertyIn(content, prop::ContentStorage_Mobs.pid);
}

}  // namespace

class ForeignFile : public ClipDescription {
protected:
    void SetUp() override {
        ClipDescription::SetUp();
        DescribeClip();
        SaveAs(file_, "ours.aaf");
    }

    std::wstring Path(const char* name) const {
        const std::u32string path = (folder_ / name).u32string();
        return {path.begin(), path.end()};
    }
    Ptr<IAAFFile> NewFile(const char* name) {
        Ptr<IAAFFile> made;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenNewModifyEx(Path(name).c_str(), &kAAFFileKind_Aaf512Binary, 0,
                                         &product_.ident, made.Out()));
        return made;
    }
    void SaveAs(IAAFFile* source, const char* name) {
        Ptr<IAAFFile> target = NewFile(name);
        ASSERT_EQ(AAFRESULT_SUCCESS, source->SaveCopyAs(target));
        ASSERT_EQ(AAFRESULT_SUCCESS, target->Close());
    }
    // The first mob and those that it refers to.
    void Clone(IAAFFile* source, const char* name) {
        Ptr<IAAFFile> target = NewFile(name);
        Ptr<IAAFHeader> header;
        ASSERT_EQ(AAFRESULT_SUCCESS, source->GetHeader(header.Out()));
        Ptr<IAAFMob> mob = Get(header, &IAAFHeader::LookupMob, MobId(0x01));
        Ptr<IAAFMob> clone;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  mob->CloneExternal(kAAFFollowDepend, kAAFIncludeMedia, target, clone.Out()));
        ASSERT_EQ(AAFRESULT_SUCCESS, target->Save());
    }
    StoredObject Tree(const char* name) {
        StoredObject root;
        const aaf::stored::FileResult result = aaf::stored::LoadTree(folder_ / name, root);
        EXPECT_TRUE(result) << result.message;
        return root;
    }
    void WriteTree(const StoredObject& root, const char* name) {
        const aaf::stored::FileResult result =
            aaf::stored::SaveTree(root, folder_ / name, aaf::stored::SectorSize::Bytes512);
        ASSERT_TRUE(result) << result.message;
    }
    Ptr<IAAFFile> Open(const char* name) {
        Ptr<IAAFFile> read;
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(Path(name).c_str(), 0, read.Out()));
        return read;
    }

    const TestFolder folder_;
};

TEST_F(ForeignFile, KeepsOddPropertiesTellsThemAndWritesThemBack) {
    StoredObject root = Tree("ours.aaf");
    // A value of the wrong size, an unknown form, a reference to nothing, and objects of classes
    // with numbers of the file's own where a text should be.
    StoredObject& slot = PropertyIn(Mobs(root).objects.at(0), prop::Mob_Slots.pid).objects.at(0);
    PropertyIn(slot, prop::TimelineMobSlot_EditRate.pid).bytes.pop_back();
    PropertyIn(slot, prop::TimelineMobSlot_Origin.pid).form = StoredForm(0x40);
    std::size_t references = 0;
    StoredProperty descriptors;
    const std::function<void(StoredObject&)> search = [&](StoredObject& object) {
        for (StoredProperty& property : object.properties) {
            if (property.pid == prop::Component_DataDefinition.pid && references++ == 0) {
                property.keys.at(0)[3] ^= 0xFF;
            }
            if (property.pid == prop::MultipleDescriptor_FileDescriptors.pid) {
                descriptors = property;
            }
            for (StoredObject& contained : property.objects) {
                search(contained);
            }
        }
    };
    for (StoredObject& mob : Mobs(root).objects) {
        search(mob);
    }
    ASSERT_FALSE(descriptors.objects.empty());
    descriptors.pid = prop::MobSlot_SlotName.pid;
    descriptors.name = u"SlotName";
    PropertyIn(slot, prop::MobSlot_SlotName.pid) = descriptors;
    WriteTree(root, "odd.aaf");
    const StoredProperty odd = Mobs(root = Tree("odd.aaf"));

    Ptr<IAAFFile> read;
    {
        const Sentences told;
        read = Open("odd.aaf");
        ASSERT_EQ(4u, told.all.size());
        for (const std::wstring& sentence : told.all) {
            EXPECT_EQ(0u, sentence.find(L"Content: Mobs: Slots: ")) << sentence.size();
            EXPECT_NE(std::wstring::npos, sentence.find(L"; it is kept as it stands"));
        }
    }
    SaveAs(read, "copy.aaf");
    StoredObject copied = Tree("copy.aaf");
    EXPECT_EQ(odd, Mobs(copied));

    // The same by way of copies of the mobs.
    Ptr<IAAFFile> target = NewFile("cloned.aaf");
    Ptr<IEnumAAFMobs> mobs;
    Get(read, &IAAFFile::GetHeader)->GetMobs(nullptr, mobs.Out());
    Ptr<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) == AAFRESULT_SUCCESS) {
        Ptr<IAAFMob> clone;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  mob->CloneExternal(kAAFNoFollowDepend, kAAFIncludeMedia, target, clone.Out()));
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, target->Save());
    StoredObject cloned = Tree("cloned.aaf");
    EXPECT_EQ(odd.objects.size(), Mobs(cloned).objects.size());
    EXPECT_EQ(PropertyIn(PropertyIn(Mobs(copied).objects[0], prop::Mob_Slots.pid).objects[0],
                         prop::TimelineMobSlot_EditRate.pid),
              PropertyIn(PropertyIn(Mobs(cloned).objects[0], prop::Mob_Slots.pid).objects[0],
                         prop::TimelineMobSlot_EditRate.pid));
}

// In the copy the type has its usual width again, and so have the values.
TEST_F(ForeignFile, MayHaveShorterLengths) {
    namespace meta = aaf::stored::meta;
    StoredObject root = Tree("ours.aaf");
    const auto longer = StoredIdOf(kAAFTypeID_Int64);
    const auto shorter = StoredIdOf(kAAFTypeID_Int32);
    StoredObject& definitions = root.properties.at(0).objects.at(0);
    const auto own = StoredIdOf(kAAFTypeID_LengthType);
    const auto renamed = [&](StoredObject& dictionary) -> Bytes& {
        StoredProperty& types = PropertyIn(dictionary, meta::kTypeDefinitions);
        const auto at = std::find(types.keys.begin(), types.keys.end(), own);
        StoredObject& type = types.objects.at(static_cast<std::size_t>(at - types.keys.begin()));
        return PropertyIn(type, meta::kRenamedType).keys.at(0);
    };
    renamed(definitions) = shorter;
    std::size_t shortened = 0;
    const std::function<void(StoredObject&)> shorten = [&](StoredObject& object) {
        for (StoredProperty& property : object.properties) {
            if (property.pid == prop::Component_Length.pid ||
                property.pid == prop::FileDescriptor_Length.pid) {
                property.bytes.resize(4);
                ++shortened;
            }
            std::for_each(property.objects.begin(), property.objects.end(), shorten);
        }
    };
    StoredProperty& mobs = Mobs(root);
    std::for_each(mobs.objects.begin(), mobs.objects.end(), shorten);
    EXPECT_LT(3u, shortened);
    WriteTree(root, "short.aaf");
    const Sentences told;
    Ptr<IAAFFile> read = Open("short.aaf");
    EXPECT_EQ(std::vector<std::wstring>(), told.all);
    Ptr<IAAFFile> whole = Open("ours.aaf");
    SaveAs(read, "copy.aaf");
    SaveAs(whole, "whole copy.aaf");
    StoredObject copied = Tree("copy.aaf");
    StoredObject expected = Tree("whole copy.aaf");
    EXPECT_EQ(longer, renamed(copied.properties.at(0).objects.at(0)));
    EXPECT_EQ(Mobs(expected), Mobs(copied));
    // The same by way of copies in memory.
    Clone(read, "clone.aaf");
    Clone(whole, "whole clone.aaf");
    StoredObject cloned = Tree("clone.aaf");
    expected = Tree("whole clone.aaf");
    EXPECT_EQ(Mobs(expected), Mobs(cloned));
}

TEST_F(ForeignFile, ShowsAnOddPropertyAsBytesOfNoDefinedType) {
    StoredObject root = Tree("ours.aaf");
    PropertyIn(Mobs(root).objects.at(0), prop::Mob_Name.pid).bytes = {'a', 0, 'b'};
    WriteTree(root, "odd.aaf");
    Ptr<IAAFFile> read = Open("odd.aaf");
    Ptr<IEnumAAFMobs> mobs;
    Get(read, &IAAFFile::GetHeader)->GetMobs(nullptr, mobs.Out());
    Ptr<IAAFMob> mob;
    ASSERT_EQ(AAFRESULT_SUCCESS, mobs->NextOne(mob.Out()));
    aafCharacter text[8] = {};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, mob->GetName(text, sizeof text));
    Ptr<IAAFObject> object = As<IAAFObject>(mob);
    Ptr<IAAFClassDef> definition = Get(object, &IAAFObject::GetDefinition);
    Ptr<IAAFPropertyDef> name;
    ASSERT_EQ(AAFRESULT_SUCCESS, definition->LookupPropertyDef(prop::Mob_Name.id, name.Out()));
    aafBoolean_t isPresent = kAAFFalse;
    EXPECT_EQ(AAFRESULT_SUCCESS, object->IsPropertyPresent(name, &isPresent));
    EXPECT_EQ(kAAFTrue, isPresent);
    Ptr<IAAFPropertyValue> value = Get(object, &IAAFObject::GetPropertyValue, name);
    EXPECT_EQ(kAAFFalse, Get(value, &IAAFPropertyValue::IsDefinedType));
    Ptr<IAAFTypeDef> type = Get(value, &IAAFPropertyValue::GetType);
    Ptr<IAAFTypeDefVariableArray> bytes = As<IAAFTypeDefVariableArray>(type);
    aafUInt32 count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, bytes->GetCount(value, &count));
    EXPECT_EQ(3u, count);
    aafUInt8 shown[3] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, bytes->GetCArray(value, shown, sizeof shown));
    EXPECT_EQ('b', shown[2]);
    // Given to another object, it is as odd there.
    Ptr<IAAFMob> next;
    ASSERT_EQ(AAFRESULT_SUCCESS, mobs->NextOne(next.Out()));
    Ptr<IAAFObject> other = As<IAAFObject>(next);
    ASSERT_EQ(AAFRESULT_SUCCESS, other->SetPropertyValue(name, value));
    EXPECT_EQ(kAAFFalse, Get(Get(other, &IAAFObject::GetPropertyValue, name),
                             &IAAFPropertyValue::IsDefinedType));
    // Set anew it is a property like others.
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"new"));
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetName(text, sizeof text));
    value = Get(object, &IAAFObject::GetPropertyValue, name);
    EXPECT_EQ(kAAFTrue, Get(value, &IAAFPropertyValue::IsDefinedType));
}

// Looking at essence that can't be read doesn't lose it.
TEST_F(ForeignFile, KeepsEssenceOfAnOddFormThatIsLookedAt) {
    Ptr<IAAFMob> described = Get(header_, &IAAFHeader::LookupMob, MobId(0xB1));
    Ptr<IAAFEssenceData> made = Make<IAAFEssenceData>(AUID_AAFEssenceData);
    ASSERT_EQ(AAFRESULT_SUCCESS, made->Initialize(As<IAAFSourceMob>(described)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(made));
    aafUInt8 byte = 1;
    aafUInt32 count = 0;
    ASSERT_EQ(AAFRESULT_SUCCESS, made->Write(1, &byte, &count));
    SaveAs(file_, "essence.aaf");
    const auto dataIn = [](StoredObject& root) -> StoredProperty& {
        StoredObject& header = root.properties.at(1).objects.at(0);
        StoredObject& content = PropertyIn(header, prop::Header_Content.pid).objects.at(0);
        StoredProperty& all = PropertyIn(content, prop::ContentStorage_EssenceData.pid);
        return PropertyIn(all.objects.at(0), prop::EssenceData_Data.pid);
    };
    StoredObject root = Tree("essence.aaf");
    StoredProperty odd;
    odd.pid = prop::EssenceData_Data.pid;
    odd.form = StoredForm(0x40);
    odd.bytes = {1, 2, 3};
    dataIn(root) = odd;
    WriteTree(root, "odd.aaf");
    const Sentences told;
    Ptr<IAAFFile> read = Open("odd.aaf");
    Ptr<IAAFEssenceData> data =
        Get(Get(read, &IAAFFile::GetHeader), &IAAFHeader::LookupEssenceData, MobId(0xB1));
    aafLength_t size = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, data->GetSize(&size));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, data->GetPosition(&size));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, data->SetPosition(0));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, data->Read(1, &byte, &count));
    SaveAs(read, "copy.aaf");
    StoredObject copied = Tree("copy.aaf");
    EXPECT_EQ(odd.bytes, dataIn(copied).bytes);
    // What is written takes its place.
    EXPECT_EQ(AAFRESULT_SUCCESS, data->Write(1, &byte, &count));
    EXPECT_EQ(1, Get(data, &IAAFEssenceData::GetSize));
}

}  // namespace aaf_test
