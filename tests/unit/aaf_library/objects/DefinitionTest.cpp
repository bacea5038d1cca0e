// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <functional>

#include "aaf_library/model/PropertyKeys.h"
#include "tests/unit/aaf_library/objects/SavedFile.h"

// Definitions of plug-ins, codecs and KLV data, and the sets of ids in header and clips.
namespace aaf_test {

namespace {

constexpr aafUID_t kOne = ncfGuid("10000000-0000-0000-0000-000000000001");
constexpr aafUID_t kTwo = ncfGuid("20000000-0000-0000-0000-000000000002");
constexpr aafUID_t kThree = ncfGuid("30000000-0000-0000-0000-000000000003");

std::pair<int, int> Of(const aafVersionType_t& version) {
    return {version.major, version.minor};
}

using Versions = std::pair<std::pair<int, int>, std::pair<int, int>>;
using Range = HRESULT (IAAFPluginDef::*)(aafVersionType_t*, aafVersionType_t*);

Versions RangeOf(IAAFPluginDef* plugin, Range range) {
    aafVersionType_t low{};
    aafVersionType_t high{};
    EXPECT_EQ(AAFRESULT_SUCCESS, (plugin->*range)(&low, &high));
    return {Of(low), Of(high)};
}

using SetVersion = HRESULT (IAAFPluginDef::*)(aafVersionType_constref);
struct VersionRange {
    Range get;
    SetVersion setMinimum;
    SetVersion setMaximum;
};
constexpr VersionRange kRanges[] = {
    {&IAAFPluginDef::GetPlatformVersionRange, &IAAFPluginDef::SetPlatformMinimumVersion,
     &IAAFPluginDef::SetPlatformMaximumVersion},
    {&IAAFPluginDef::GetEngineVersionRange, &IAAFPluginDef::SetEngineMinimumVersion,
     &IAAFPluginDef::SetEngineMaximumVersion},
    {&IAAFPluginDef::GetPluginAPIVersionRange, &IAAFPluginDef::SetPluginAPIMinimumVersion,
     &IAAFPluginDef::SetPluginAPIMaximumVersion}};
using GetId = HRESULT (IAAFPluginDef::*)(aafUID_t*);
using SetId = HRESULT (IAAFPluginDef::*)(aafUID_constref);
constexpr GetId kGetIds[] = {&IAAFPluginDef::GetCategoryClass, &IAAFPluginDef::GetManufacturerID,
                             &IAAFPluginDef::GetHardwarePlatform, &IAAFPluginDef::GetEngine,
                             &IAAFPluginDef::GetPluginAPI};
constexpr SetId kSetIds[] = {&IAAFPluginDef::SetCategoryClass, &IAAFPluginDef::SetManufacturerID,
                             &IAAFPluginDef::SetHardwarePlatform, &IAAFPluginDef::SetEngine,
                             &IAAFPluginDef::SetPluginAPI};
using GetFlag = HRESULT (IAAFPluginDef::*)(aafBoolean_t*);
using SetFlag = HRESULT (IAAFPluginDef::*)(aafBoolean_t);
constexpr GetFlag kGetFlags[] = {&IAAFPluginDef::IsSoftwareOnly, &IAAFPluginDef::IsAccelerated,
                                 &IAAFPluginDef::SupportsAuthentication};
constexpr SetFlag kSetFlags[] = {&IAAFPluginDef::SetIsSoftwareOnly,
                                 &IAAFPluginDef::SetIsAccelerated,
                                 &IAAFPluginDef::SetSupportsAuthentication};

}  // namespace

class Definition : public SavedFile {
protected:
    Ptr<IAAFPluginDef> Plugin() {
        Ptr<IAAFPluginDef> made = Make<IAAFPluginDef>(AUID_AAFPluginDef);
        EXPECT_EQ(AAFRESULT_SUCCESS, made->Initialize(kOne, L"Codec", L"Codes"));
        return made;
    }
    // The plug-in that a copy on disk has. A file saves those that it has in place: nothing refers
    // to a plug-in.
    Ptr<IAAFPluginDef> InAFileOfItsOwn(const std::function<void(IAAFPluginDef*)>& fill) {
        const std::u32string name = (folder_ / "own.aaf").u32string();
        const std::wstring path{name.begin(), name.end()};
        Ptr<IAAFFile> file;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenNewModify(path.c_str(), 0, &product_.ident, file.Out()));
        Ptr<IAAFDictionary> dictionary = Get(file, &IAAFFile::GetDictionary);
        Ptr<IAAFPluginDef> made;
        EXPECT_EQ(AAFRESULT_SUCCESS, dictionary->CreateInstance(
                                         AUID_AAFPluginDef, IID_IAAFPluginDef, made.OutUnknown()));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->Initialize(kOne, L"Codec", L"Codes"));
        EXPECT_EQ(AAFRESULT_SUCCESS, dictionary->RegisterPluginDef(made));
        for (const aafUID_t& id : {AUID_AAFNetworkLocator, AUID_AAFTextLocator}) {
            Ptr<IAAFLocator> locator;
            EXPECT_EQ(AAFRESULT_SUCCESS,
                      dictionary->CreateInstance(id, IID_IAAFLocator, locator.OutUnknown()));
            locators_.push_back(locator);
        }
        Ptr<IAAFNetworkLocator> info;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  dictionary->CreateInstance(AUID_AAFNetworkLocator, IID_IAAFNetworkLocator,
                                             info.OutUnknown()));
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFLocator>(info)->SetPath(L"http://maker.example/codec"));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetManufacturerInfo(info));
        fill(made);
        locators_.clear();
        EXPECT_EQ(AAFRESULT_SUCCESS, file->Save());
        EXPECT_EQ(AAFRESULT_SUCCESS, file->Close());
        Ptr<IAAFFile> read;
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, read.Out()));
        return Get(Get(read, &IAAFFile::GetDictionary), &IAAFDictionary::LookupPluginDef, kOne);
    }

    std::vector<Ptr<IAAFLocator>> locators_;
};

TEST_F(Definition, OfAPluginKeepsWhatItSays) {
    const Ptr<IAAFPluginDef> plugin = InAFileOfItsOwn([&](IAAFPluginDef* made) {
        aafVersionType_t version{3, 4};
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetPluginVersion(&version));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetPluginVersionString(L"3.4"));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetPluginManufacturerName(L"Maker"));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->SetDefinitionObjectID(kThree));
        for (const SetId set : kSetIds) {
            EXPECT_EQ(AAFRESULT_SUCCESS, (made->*set)(kTwo));
        }
        aafInt8 number = 0;
        for (const VersionRange& range : kRanges) {
            EXPECT_EQ(AAFRESULT_SUCCESS, (made->*range.setMinimum)({number, 1}));
            EXPECT_EQ(AAFRESULT_SUCCESS, (made->*range.setMaximum)({number, 2}));
            ++number;
        }
        for (const SetFlag set : kSetFlags) {
            EXPECT_EQ(AAFRESULT_SUCCESS, (made->*set)(kAAFTrue));
        }
        EXPECT_EQ(AAFRESULT_SUCCESS, made->AppendLocator(locators_[0]));
        EXPECT_EQ(AAFRESULT_SUCCESS, made->PrependLocator(locators_[1]));
    });
    EXPECT_EQ((std::pair<int, int>{3, 4}), Of(Get(plugin, &IAAFPluginDef::GetPluginVersion)));
    EXPECT_EQ(L"3.4", TextOf<IAAFPluginDef>(plugin, &IAAFPluginDef::GetPluginVersionStringBufLen,
                                            &IAAFPluginDef::GetPluginVersionString));
    EXPECT_EQ(L"Maker",
              TextOf<IAAFPluginDef>(plugin, &IAAFPluginDef::GetPluginManufacturerNameBufLen,
                                    &IAAFPluginDef::GetPluginManufacturerName));
    EXPECT_EQ(kThree, Get(plugin, &IAAFPluginDef::GetDefinitionObjectID));
    for (const GetId get : kGetIds) {
        EXPECT_EQ(kTwo, Get(plugin, get));
    }
    int number = 0;
    for (const VersionRange& range : kRanges) {
        EXPECT_EQ((Versions{{number, 1}, {number, 2}}), RangeOf(plugin, range.get));
        ++number;
    }
    for (const GetFlag get : kGetFlags) {
        EXPECT_EQ(kAAFTrue, Get(plugin, get));
    }
    Ptr<IAAFLocator> info = As<IAAFLocator>(Get(plugin, &IAAFPluginDef::GetManufacturerInfo));
    EXPECT_EQ(L"http://maker.example/codec",
              TextOf<IAAFLocator>(info, &IAAFLocator::GetPathBufLen, &IAAFLocator::GetPath));
    EXPECT_EQ(2u, Get(plugin, &IAAFPluginDef::CountLocators));
    As<IAAFTextLocator>(Get(plugin, &IAAFPluginDef::GetLocatorAt, aafUInt32{0}));
    Ptr<IEnumAAFPluginLocators> all = Get(plugin, &IAAFPluginDef::GetLocators);
    Ptr<IAAFLocator> first = Get(all, &IEnumAAFPluginLocators::NextOne);
    EXPECT_EQ(Get(plugin, &IAAFPluginDef::GetLocatorAt, aafUInt32{0}).get(), first.get());
}

TEST_F(Definition, OfAPluginChecksItsArguments) {
    Ptr<IAAFPluginDef> plugin = Plugin();
    aafUID_t id{};
    aafVersionType_t version{1, 2};
    aafBoolean_t flag = kAAFFalse;
    aafUInt32 bytes = 0;
    aafCharacter text[8];
    for (const GetId get : kGetIds) {
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, (plugin->*get)(&id));
        EXPECT_EQ(AAFRESULT_NULL_PARAM, (plugin->*get)(nullptr));
    }
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, plugin->GetDefinitionObjectID(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, plugin->GetPluginVersion(&version));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->GetPluginVersion(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->SetPluginVersion(nullptr));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, plugin->GetPluginVersionString(text, sizeof text));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, plugin->GetPluginManufacturerNameBufLen(&bytes));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->SetPluginVersionString(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->SetPluginManufacturerName(nullptr));
    for (const VersionRange& range : kRanges) {
        EXPECT_EQ(AAFRESULT_NULL_PARAM, (plugin->*range.get)(nullptr, &version));
        EXPECT_EQ(AAFRESULT_NULL_PARAM, (plugin->*range.get)(&version, nullptr));
        // A range has both ends.
        EXPECT_EQ(AAFRESULT_SUCCESS, (plugin->*range.setMinimum)(version));
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, (plugin->*range.get)(&version, &version));
    }
    for (const GetFlag get : kGetFlags) {
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, (plugin->*get)(&flag));
        EXPECT_EQ(AAFRESULT_NULL_PARAM, (plugin->*get)(nullptr));
    }
    for (const SetFlag set : kSetFlags) {
        EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, (plugin->*set)(2));
    }
    Ptr<IAAFNetworkLocator> info;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, plugin->GetManufacturerInfo(info.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->SetManufacturerInfo(nullptr));
    Ptr<IAAFLocator> locator = Make<IAAFLocator>(AUID_AAFTextLocator);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, plugin->AppendLocator(nullptr));
    EXPECT_EQ(AAFRESULT_BADINDEX, plugin->InsertLocatorAt(1, locator));
    EXPECT_EQ(AAFRESULT_SUCCESS, plugin->InsertLocatorAt(0, locator));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, plugin->AppendLocator(locator));
    EXPECT_EQ(AAFRESULT_BADINDEX, plugin->GetLocatorAt(1, locator.Out()));
    EXPECT_EQ(AAFRESULT_BADINDEX, plugin->RemoveLocatorAt(1));
    EXPECT_EQ(AAFRESULT_SUCCESS, plugin->RemoveLocatorAt(0));
    EXPECT_EQ(0u, Get(plugin, &IAAFPluginDef::CountLocators));
}

TEST_F(Definition, OfACodecForgetsAKind) {
    Ptr<IAAFCodecDef> codec = Make<IAAFCodecDef>(AUID_AAFCodecDef);
    ASSERT_EQ(AAFRESULT_SUCCESS, codec->Initialize(kOne, L"Codec", L""));
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    Ptr<IAAFDataDef> sound = DataDef(kAAFDataDef_LegacySound);
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, codec->RemoveEssenceKind(picture));
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->AddEssenceKind(picture));
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->AddEssenceKind(sound));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, codec->RemoveEssenceKind(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->RemoveEssenceKind(picture));
    EXPECT_EQ(1u, Get(codec, &IAAFCodecDef::CountEssenceKinds));
    Ptr<IAAFDataDef> left =
        Get(Get(codec, &IAAFCodecDef::GetEssenceKinds), &IEnumAAFDataDefs::NextOne);
    EXPECT_EQ(sound.get(), left.get());
    // One of another file that has the same id is the same kind.
    Ptr<IAAFFile> other;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, other.Out()));
    Ptr<IAAFDataDef> theirs = Get(Get(other, &IAAFFile::GetDictionary),
                                  &IAAFDictionary::LookupDataDef, kAAFDataDef_LegacySound);
    aafBoolean_t isSupported = kAAFFalse;
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->IsEssenceKindSupported(theirs, &isSupported));
    EXPECT_EQ(kAAFTrue, isSupported);
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->RemoveEssenceKind(theirs));
    EXPECT_EQ(0u, Get(codec, &IAAFCodecDef::CountEssenceKinds));
    EXPECT_EQ(AAFRESULT_SUCCESS, codec->IsEssenceKindSupported(theirs, &isSupported));
    EXPECT_EQ(kAAFFalse, isSupported);
}

TEST_F(Definition, OfKLVDataHasAType) {
    Ptr<IAAFKLVDataDefinition> data = Make<IAAFKLVDataDefinition>(AUID_AAFKLVDataDefinition);
    ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(kOne, L"Data", L""));
    Ptr<IAAFTypeDef> type;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, data->GetKLVDataType(type.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, data->GetKLVDataType(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, data->SetKLVDataType(nullptr));
    Ptr<IAAFTypeDef> bytes = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_UInt8);
    EXPECT_EQ(AAFRESULT_SUCCESS, data->SetKLVDataType(bytes));
    EXPECT_EQ(bytes.get(), Get(data, &IAAFKLVDataDefinition::GetKLVDataType).get());
}

// Definitions that nothing refers to stay in a file that is saved in place.
TEST_F(Definition, OfACodecAndOfKLVDataAreStored) {
    const std::u32string name = (folder_ / "own.aaf").u32string();
    const std::wstring path{name.begin(), name.end()};
    Ptr<IAAFFile> file;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              AAFFileOpenNewModify(path.c_str(), 0, &product_.ident, file.Out()));
    {
        Ptr<IAAFDictionary> dictionary = Get(file, &IAAFFile::GetDictionary);
        Ptr<IAAFCodecDef> codec;
        ASSERT_EQ(AAFRESULT_SUCCESS, dictionary->CreateInstance(AUID_AAFCodecDef, IID_IAAFCodecDef,
                                                                codec.OutUnknown()));
        ASSERT_EQ(AAFRESULT_SUCCESS, codec->Initialize(kOne, L"Codec", L""));
        for (const aafUID_t& id : {kAAFDataDef_LegacyPicture, kAAFDataDef_LegacySound}) {
            EXPECT_EQ(AAFRESULT_SUCCESS,
                      codec->AddEssenceKind(Get(dictionary, &IAAFDictionary::LookupDataDef, id)));
        }
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  codec->RemoveEssenceKind(
                      Get(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_LegacyPicture)));
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  codec->SetFileDescriptorClass(
                      Get(dictionary, &IAAFDictionary::LookupClassDef, AUID_AAFCDCIDescriptor)));
        ASSERT_EQ(AAFRESULT_SUCCESS, dictionary->RegisterCodecDef(codec));
        Ptr<IAAFKLVDataDefinition> data;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  dictionary->CreateInstance(AUID_AAFKLVDataDefinition, IID_IAAFKLVDataDefinition,
                                             data.OutUnknown()));
        ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(kTwo, L"Data", L""));
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  data->SetKLVDataType(
                      Get(dictionary, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Rational)));
        ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFDictionary2>(dictionary)->RegisterKLVDataDef(data));
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, file->Save());
    ASSERT_EQ(AAFRESULT_SUCCESS, file->Close());
    Ptr<IAAFFile> read;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, read.Out()));
    Ptr<IAAFDictionary> dictionary = Get(read, &IAAFFile::GetDictionary);
    Ptr<IAAFCodecDef> codec = Get(dictionary, &IAAFDictionary::LookupCodecDef, kOne);
    ASSERT_EQ(1u, Get(codec, &IAAFCodecDef::CountEssenceKinds));
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_LegacySound).get(),
              Get(Get(codec, &IAAFCodecDef::GetEssenceKinds), &IEnumAAFDataDefs::NextOne).get());
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::LookupClassDef, AUID_AAFCDCIDescriptor).get(),
              Get(codec, &IAAFCodecDef::GetFileDescriptorClass).get());
    Ptr<IAAFKLVDataDefinition> data =
        Get(As<IAAFDictionary2>(dictionary), &IAAFDictionary2::LookupKLVDataDef, kTwo);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Rational).get(),
              Get(data, &IAAFKLVDataDefinition::GetKLVDataType).get());
}

// The class of descriptors that a codec serves may be one that only its file knows.
TEST_F(Definition, OfACodecIsClonedWithItsClass) {
    Ptr<IAAFClassDef> own;
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->CreateMetaInstance(AUID_AAFClassDef, IID_IAAFClassDef,
                                                                 own.OutUnknown()));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              own->Initialize(
                  kTwo, Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFCDCIDescriptor),
                  L"OwnDescriptor", kAAFTrue));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterClassDef(own));
    Ptr<IAAFCodecDef> codec = Make<IAAFCodecDef>(AUID_AAFCodecDef);
    ASSERT_EQ(AAFRESULT_SUCCESS, codec->Initialize(kOne, L"Codec", L""));
    ASSERT_EQ(AAFRESULT_SUCCESS, codec->SetFileDescriptorClass(own));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterCodecDef(codec));
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFFileDescriptor>(Get(As<IAAFSourceMob>(mob),
                                                            &IAAFSourceMob::GetEssenceDescriptor))
                                     ->SetCodecDef(codec));

    Ptr<IAAFFile> target;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, target.Out()));
    Ptr<IAAFMob> clone;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              mob->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, target, clone.Out()));
    Ptr<IAAFDictionary> there = Get(target, &IAAFFile::GetDictionary);
    Ptr<IAAFCodecDef> found = Get(there, &IAAFDictionary::LookupCodecDef, kOne);
    EXPECT_EQ(Get(there, &IAAFDictionary::LookupClassDef, kTwo).get(),
              Get(found, &IAAFCodecDef::GetFileDescriptorClass).get());
}

// A codec and an operation may have one id: each stands in a set of its own.
TEST_F(Definition, OfOneKindMayHaveTheIdOfAnother) {
    Ptr<IAAFOperationDef> effect = Make<IAAFOperationDef>(AUID_AAFOperationDef);
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->Initialize(kOne, L"Effect", L""));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterOperationDef(effect));
    Ptr<IAAFParameterDef> parameter = Make<IAAFParameterDef>(AUID_AAFParameterDef);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              parameter->Initialize(
                  kOne, L"Parameter", L"",
                  Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Rational)));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterParameterDef(parameter));
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->AddParameterDef(parameter));
    Ptr<IAAFOperationGroup> group = Make<IAAFOperationGroup>(AUID_AAFOperationGroup);
    ASSERT_EQ(AAFRESULT_SUCCESS, group->Initialize(DataDef(kAAFDataDef_LegacyPicture), 10, effect));
    AddComposition(group);
    Ptr<IAAFOperationGroup> read = ReopenedSegment<IAAFOperationGroup>();
    Ptr<IAAFOperationDef> found = Get(read, &IAAFOperationGroup::GetOperationDefinition);
    EXPECT_EQ(L"Parameter",
              TextOf<IAAFDefObject>(
                  As<IAAFDefObject>(Get(found, &IAAFOperationDef::LookupParameterDef, kOne)).get(),
                  &IAAFDefObject::GetNameBufLen, &IAAFDefObject::GetName));
}

class SetOfIds : public SavedFile {};

TEST_F(SetOfIds, OfDescriptiveSchemesIsStoredInOrder) {
    Ptr<IAAFHeader2> header = As<IAAFHeader2>(header_);
    aafUInt32 count = 0;
    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, header->CountDescriptiveSchemes(&count));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, header->IsDescriptiveSchemePresent(kOne, &present));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, header->RemoveDescriptiveScheme(kOne));
    for (const aafUID_t& id : {kThree, kOne, kTwo}) {
        EXPECT_EQ(AAFRESULT_SUCCESS, header->AddDescriptiveScheme(id));
    }
    EXPECT_EQ(AAFRESULT_INVALID_PARAM, header->AddDescriptiveScheme(kOne));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->RemoveDescriptiveScheme(kThree));
    EXPECT_EQ(AAFRESULT_ELEMENT_NOT_PRESENT, header->RemoveDescriptiveScheme(kThree));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->CountDescriptiveSchemes(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->GetDescriptiveSchemes(3, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->IsDescriptiveSchemePresent(kOne, nullptr));

    const std::u32string name = (folder_ / "own.aaf").u32string();
    const std::wstring path{name.begin(), name.end()};
    Ptr<IAAFFile> own;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenNewModify(path.c_str(), 0, &product_.ident, own.Out()));
    {
        Ptr<IAAFHeader2> ours = As<IAAFHeader2>(Get(own, &IAAFFile::GetHeader));
        EXPECT_EQ(AAFRESULT_SUCCESS, ours->AddDescriptiveScheme(kTwo));
        EXPECT_EQ(AAFRESULT_SUCCESS, ours->AddDescriptiveScheme(kOne));
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, own->Save());
    ASSERT_EQ(AAFRESULT_SUCCESS, own->Close());
    Ptr<IAAFFile> file;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, file.Out()));
    Ptr<IAAFHeader2> read = As<IAAFHeader2>(Get(file, &IAAFFile::GetHeader));
    EXPECT_EQ(2u, Get(read, &IAAFHeader2::CountDescriptiveSchemes));
    aafUID_t ids[3] = {};
    EXPECT_EQ(AAFRESULT_SMALLBUF, read->GetDescriptiveSchemes(1, ids));
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetDescriptiveSchemes(3, ids));
    EXPECT_EQ(kOne, ids[0]);
    EXPECT_EQ(kTwo, ids[1]);
    EXPECT_EQ(AAFRESULT_SUCCESS, read->IsDescriptiveSchemePresent(kTwo, &present));
    EXPECT_EQ(kAAFTrue, present);
    EXPECT_EQ(AAFRESULT_SUCCESS, read->IsDescriptiveSchemePresent(kThree, &present));
    EXPECT_EQ(kAAFFalse, present);
}

TEST_F(SetOfIds, OfEssenceContainersIsThatOfTheDescriptors) {
    Ptr<IAAFHeader2> header = As<IAAFHeader2>(header_);
    aafUInt32 count = 0;
    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, header->CountEssenceContainers(&count));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, header->IsEssenceContainerPresent(kOne, &present));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->UpdateEssenceContainers());
    EXPECT_EQ(0u, Get(header, &IAAFHeader2::CountEssenceContainers));

    Ptr<IEnumAAFContainerDefs> all = Get(dictionary_, &IAAFDictionary::GetContainerDefs);
    std::vector<aafUID_t> ids;
    for (aafUInt8 number : {1, 2, 3}) {
        Ptr<IAAFMob> mob = FileMob(number);
        Ptr<IAAFEssenceDescriptor> whole =
            Get(As<IAAFSourceMob>(mob), &IAAFSourceMob::GetEssenceDescriptor);
        Ptr<IAAFFileDescriptor> part = As<IAAFFileDescriptor>(whole);
        if (number == 3) {  // the part of a multiple descriptor counts too
            Ptr<IAAFMultipleDescriptor> multiple =
                Make<IAAFMultipleDescriptor>(AUID_AAFMultipleDescriptor);
            part = Make<IAAFFileDescriptor>(AUID_AAFCDCIDescriptor);
            EXPECT_EQ(AAFRESULT_SUCCESS, multiple->AppendFileDescriptor(part));
            EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->SetEssenceDescriptor(
                                             As<IAAFEssenceDescriptor>(multiple)));
        }
        // The first two share a container.
        Ptr<IAAFContainerDef> container;
        if (number != 2) {
            container = Get(all, &IEnumAAFContainerDefs::NextOne);
            ids.push_back(Get(As<IAAFDefObject>(container), &IAAFDefObject::GetAUID));
        } else {
            container = Get(dictionary_, &IAAFDictionary::LookupContainerDef, ids.front());
        }
        EXPECT_EQ(AAFRESULT_SUCCESS, part->SetContainerFormat(container));
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    }
    EXPECT_EQ(AAFRESULT_SUCCESS, header->UpdateEssenceContainers());
    EXPECT_EQ(2u, Get(header, &IAAFHeader2::CountEssenceContainers));
    aafUID_t found[2] = {};
    EXPECT_EQ(AAFRESULT_SMALLBUF, header->GetEssenceContainers(1, found));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->GetEssenceContainers(2, found));
    for (const aafUID_t& id : ids) {
        EXPECT_EQ(AAFRESULT_SUCCESS, header->IsEssenceContainerPresent(id, &present));
        EXPECT_EQ(kAAFTrue, present);
        EXPECT_TRUE(found[0] == id || found[1] == id);
    }
    EXPECT_EQ(AAFRESULT_SUCCESS, header->IsEssenceContainerPresent(kOne, &present));
    EXPECT_EQ(kAAFFalse, present);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->GetEssenceContainers(1, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->CountEssenceContainers(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header->IsEssenceContainerPresent(kOne, nullptr));
}

TEST_F(SetOfIds, OfDescribedSlotsIsStoredInOrder) {
    Ptr<IAAFDescriptiveClip> clip = Make<IAAFDescriptiveClip>(AUID_AAFDescriptiveClip);
    ASSERT_EQ(AAFRESULT_SUCCESS, clip->Initialize(DataDef(kAAFDataDef_DescriptiveMetadata), 5, {}));
    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, clip->IsDescribedSlotIDPresent(1, &present));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, clip->RemoveDescribedSlotID(1));
    for (aafUInt32 id : {300u, 2u, 7u}) {
        EXPECT_EQ(AAFRESULT_SUCCESS, clip->AddDescribedSlotID(id));
    }
    EXPECT_EQ(AAFRESULT_INVALID_PARAM, clip->AddDescribedSlotID(7));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->RemoveDescribedSlotID(7));
    EXPECT_EQ(AAFRESULT_ELEMENT_NOT_PRESENT, clip->RemoveDescribedSlotID(7));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->IsDescribedSlotIDPresent(2, nullptr));
    AddComposition(clip);
    Ptr<IAAFDescriptiveClip> read = ReopenedSegment<IAAFDescriptiveClip>();
    EXPECT_EQ(2u, Get(read, &IAAFDescriptiveClip::CountDescribedSlotIDs));
    aafUInt32 ids[2] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, read->GetDescribedSlotIDs(2, ids));
    EXPECT_EQ(2u, ids[0]);
    EXPECT_EQ(300u, ids[1]);
    EXPECT_EQ(AAFRESULT_SUCCESS, read->IsDescribedSlotIDPresent(300, &present));
    EXPECT_EQ(kAAFTrue, present);
    // The last one may go; what is left is a set without elements.
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->RemoveDescribedSlotID(2));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->RemoveDescribedSlotID(300));
    EXPECT_EQ(0u, Get(clip, &IAAFDescriptiveClip::CountDescribedSlotIDs));
}

TEST_F(SetOfIds, OfAMarkersSlotsHasEachOnceAndInOrder) {
    Ptr<IAAFDescriptiveMarker> marker = Make<IAAFDescriptiveMarker>(AUID_AAFDescriptiveMarker);
    aafUInt32 slots[] = {300, 2, 300, 7};
    EXPECT_EQ(AAFRESULT_NULL_PARAM, marker->SetDescribedSlotIDs(4, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, marker->SetDescribedSlotIDs(4, slots));
    ASSERT_EQ(3u, Get(marker, &IAAFDescriptiveMarker::GetDescribedSlotIDsSize));
    aafUInt32 found[3] = {};
    EXPECT_EQ(AAFRESULT_SMALLBUF, marker->GetDescribedSlotIDs(2, found));
    EXPECT_EQ(0u, found[0]);
    EXPECT_EQ(AAFRESULT_SUCCESS, marker->GetDescribedSlotIDs(3, found));
    EXPECT_EQ((std::vector<aafUInt32>{2, 7, 300}), std::vector<aafUInt32>(found, found + 3));
}

TEST_F(SetOfIds, OfEssenceContainersNeedsAContent) {
    Ptr<IAAFObject> header = As<IAAFObject>(header_);
    Ptr<IAAFPropertyDef> content =
        Get(Get(header, &IAAFObject::GetDefinition), &IAAFClassDef::LookupPropertyDef,
            aaf::prop::Header_Content.id);
    ASSERT_EQ(AAFRESULT_SUCCESS, header->RemoveOptionalProperty(content));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, As<IAAFHeader2>(header_)->UpdateEssenceContainers());
}

// What the header tells of the content goes where the content goes.
TEST_F(SetOfIds, GoAlongWithACopyOfTheFile) {
    const auto fill = [](IAAFHeader* header, const aafUID_t& scheme) {
        Ptr<IAAFHeader2> filled = As<IAAFHeader2>(header);
        EXPECT_EQ(AAFRESULT_SUCCESS, filled->AddDescriptiveScheme(scheme));
        EXPECT_EQ(AAFRESULT_SUCCESS, filled->SetOperationalPattern(kTwo));
    };
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(
        AAFRESULT_SUCCESS,
        As<IAAFFileDescriptor>(Get(As<IAAFSourceMob>(mob), &IAAFSourceMob::GetEssenceDescriptor))
            ->SetContainerFormat(Get(Get(dictionary_, &IAAFDictionary::GetContainerDefs),
                                     &IEnumAAFContainerDefs::NextOne)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFHeader2>(header_)->UpdateEssenceContainers());
    fill(header_, kThree);
    Ptr<IAAFHeader2> written = As<IAAFHeader2>(Reopen());
    // Into a file that its caller has begun to fill.
    Ptr<IAAFFile> begun;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, begun.Out()));
    fill(Get(begun, &IAAFFile::GetHeader), kOne);
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(begun));
    Ptr<IAAFHeader2> copied = As<IAAFHeader2>(Get(begun, &IAAFFile::GetHeader));
    for (const Ptr<IAAFHeader2>& header : {written, copied}) {
        EXPECT_EQ(kTwo, Get(header, &IAAFHeader2::GetOperationalPattern));
        EXPECT_EQ(1u, Get(header, &IAAFHeader2::CountEssenceContainers));
        aafBoolean_t present = kAAFFalse;
        EXPECT_EQ(AAFRESULT_SUCCESS, header->IsDescriptiveSchemePresent(kThree, &present));
        EXPECT_EQ(kAAFTrue, present);
    }
    EXPECT_EQ(1u, Get(written, &IAAFHeader2::CountDescriptiveSchemes));
    EXPECT_EQ(2u, Get(copied, &IAAFHeader2::CountDescriptiveSchemes));
}

}  // namespace aaf_test
