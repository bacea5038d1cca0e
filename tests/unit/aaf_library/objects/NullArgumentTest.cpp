// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <set>
#include <tuple>
#include <type_traits>

#include "tests/unit/aaf_library/objects/TransientFile.h"

// Each pointer that an operation takes is needed: without it there is AAFRESULT_NULL_PARAM, and
// nothing is looked at.
namespace aaf_test {

namespace {

// Zeros that any pointer may lead to. They are no object: whoever uses one before the rest of the
// arguments is checked ends the test.
alignas(16) char zeros[256];

template <class Argument>
Argument SomeArgument() {
    if constexpr (std::is_pointer_v<Argument>) {
        return reinterpret_cast<Argument>(zeros);
    } else {
        return Argument{};
    }
}

template <class Argument>
bool TakeAway(Argument& argument) {
    if constexpr (std::is_pointer_v<Argument>) {
        argument = nullptr;
    }
    return std::is_pointer_v<Argument>;
}

template <class Interface, class... Parameters, std::size_t... At>
void ExpectNeeded(Interface* object, HRESULT (Interface::*operation)(Parameters...),
                  const std::set<std::size_t>& unneeded, std::index_sequence<At...>) {
    const auto without = [&](std::size_t missing) {
        std::tuple<std::decay_t<Parameters>...> arguments{
            SomeArgument<std::decay_t<Parameters>>()...};
        if (unneeded.count(missing) == 0 &&
            ((At == missing && TakeAway(std::get<At>(arguments))) || ...)) {
            EXPECT_EQ(AAFRESULT_NULL_PARAM, (object->*operation)(std::get<At>(arguments)...))
                << "argument " << missing;
        }
    };
    (without(At), ...);
}

template <class Interface, class... Parameters>
void ExpectNeededBut(const std::set<std::size_t>& unneeded, Interface* object,
                     HRESULT (Interface::*operation)(Parameters...)) {
    ExpectNeeded(object, operation, unneeded, std::index_sequence_for<Parameters...>());
}

// The operations are told apart by their place in the list.
template <class Interface, class... Operations>
void ExpectAllNeeded(const Ptr<Interface>& object, Operations... operations) {
    int place = 0;
    const auto check = [&](auto operation) {
        SCOPED_TRACE(place++);
        ExpectNeededBut({}, object.get(), operation);
    };
    (check(operations), ...);
}

}  // namespace

class NullArgument : public TransientFile {};

TEST_F(NullArgument, OfAnOperationDefinition) {
    using I = IAAFOperationDef;
    ExpectAllNeeded(Make<I>(AUID_AAFOperationDef), &I::GetDataDef, &I::SetDataDef, &I::IsTimeWarp,
                    &I::GetCategory, &I::GetNumberInputs, &I::GetBypass,
                    &I::PrependDegradeToOperation, &I::AppendDegradeToOperation,
                    &I::InsertDegradeToOperationAt, &I::GetDegradeToOperations,
                    &I::CountDegradeToOperations, &I::AddParameterDef, &I::GetParameterDefs,
                    &I::CountParameterDefs, &I::LookupParameterDef);
}

TEST_F(NullArgument, OfAPluginDefinition) {
    using I = IAAFPluginDef;
    ExpectAllNeeded(Make<I>(AUID_AAFPluginDef), &I::GetCategoryClass, &I::GetPluginVersion,
                    &I::SetPluginVersion, &I::SetPluginVersionString, &I::GetPluginVersionString,
                    &I::GetPluginVersionStringBufLen, &I::SetPluginManufacturerName,
                    &I::GetPluginManufacturerName, &I::GetPluginManufacturerNameBufLen,
                    &I::GetManufacturerInfo, &I::SetManufacturerInfo, &I::GetManufacturerID,
                    &I::GetHardwarePlatform, &I::GetPlatformVersionRange, &I::GetEngine,
                    &I::GetEngineVersionRange, &I::GetPluginAPI, &I::GetPluginAPIVersionRange,
                    &I::IsSoftwareOnly, &I::IsAccelerated, &I::SupportsAuthentication,
                    &I::CountLocators, &I::AppendLocator, &I::PrependLocator, &I::InsertLocatorAt,
                    &I::GetLocatorAt, &I::GetLocators, &I::GetDefinitionObjectID);
}

TEST_F(NullArgument, OfACodecAndOfKLVData) {
    using Codec = IAAFCodecDef;
    ExpectAllNeeded(Make<Codec>(AUID_AAFCodecDef), &Codec::IsEssenceKindSupported,
                    &Codec::AddEssenceKind, &Codec::RemoveEssenceKind, &Codec::CountEssenceKinds,
                    &Codec::GetEssenceKinds);
    using Data = IAAFKLVDataDefinition;
    ExpectAllNeeded(Make<Data>(AUID_AAFKLVDataDefinition), &Data::GetKLVDataType,
                    &Data::SetKLVDataType);
}

TEST_F(NullArgument, OfTheSetsOfAHeader) {
    using I = IAAFHeader2;
    ExpectAllNeeded(As<I>(header_), &I::CountEssenceContainers, &I::GetEssenceContainers,
                    &I::IsEssenceContainerPresent, &I::CountDescriptiveSchemes,
                    &I::GetDescriptiveSchemes, &I::IsDescriptiveSchemePresent);
}

TEST_F(NullArgument, OfDescribedSlots) {
    using Marker = IAAFDescriptiveMarker;
    ExpectAllNeeded(Make<Marker>(AUID_AAFDescriptiveMarker), &Marker::SetDescribedSlotIDs,
                    &Marker::GetDescribedSlotIDs, &Marker::GetDescribedSlotIDsSize);
    using Clip = IAAFDescriptiveClip;
    ExpectAllNeeded(Make<Clip>(AUID_AAFDescriptiveClip), &Clip::CountDescribedSlotIDs,
                    &Clip::GetDescribedSlotIDs, &Clip::IsDescribedSlotIDPresent);
}

TEST_F(NullArgument, OfASampleIndex) {
    using I = IAAFEssenceDataEx;
    ExpectAllNeeded(Make<I>(AUID_AAFEssenceData), &I::WriteSampleIndex, &I::ReadSampleIndex,
                    &I::GetSampleIndexPosition, &I::GetSampleIndexSize);
}

TEST_F(NullArgument, OfSound) {
    using I = IAAFPCMDescriptor;
    Ptr<I> sound = Make<I>(AUID_AAFPCMDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS, sound->Initialize());
    ExpectAllNeeded(sound, &I::AreAllPeakEnvelopePropertiesPresent, &I::WritePeakEnvelopeData,
                    &I::ReadPeakEnvelopeData, &I::GetPeakEnvelopeDataPosition,
                    &I::GetPeakEnvelopeDataSize);
    using Channels = IAAFAES3PCMDescriptor2;
    ExpectAllNeeded(Make<Channels>(AUID_AAFAES3PCMDescriptor), &Channels::GetChannelStatusModeAt,
                    &Channels::GetUserDataModeAt, &Channels::GetFixedChannelStatusDataAt,
                    &Channels::SetFixedChannelStatusDataAt, &Channels::GetFixedUserDataAt,
                    &Channels::SetFixedUserDataAt);
    using Chunk = IAAFRIFFChunk;
    ExpectAllNeeded(Make<Chunk>(AUID_AAFRIFFChunk), &Chunk::GetChunkID, &Chunk::Read, &Chunk::Write,
                    &Chunk::GetPosition, &Chunk::GetLength);
}

TEST_F(NullArgument, OfTimecode) {
    using I = IAAFSegment;
    for (const aafUID_t& id :
         {AUID_AAFTimecode, AUID_AAFSequence, AUID_AAFSourceClip, AUID_AAFTimecodeStream12M}) {
        ExpectAllNeeded(Make<I>(id), &I::SegmentOffsetToTC, &I::SegmentTCToOffset);
    }
    // Without a segment it is that of the mob.
    ExpectNeededBut({0}, Make<IAAFMob>(AUID_AAFCompositionMob).get(),
                    &IAAFMob::OffsetToMobTimecode);
    using Stream = IAAFTimecodeStream;
    ExpectAllNeeded(Make<Stream>(AUID_AAFTimecodeStream12M), &Stream::GetSampleSize,
                    &Stream::GetSource, &Stream::GetSourceBufLen, &Stream::SetSource,
                    &Stream::GetPositionTimecode, &Stream::GetUserDataLength,
                    &Stream::GetUserDataAtPosition, &Stream::SetUserDataAtPosition);
}

TEST_F(NullArgument, OfMobs) {
    using Master = IAAFMasterMob3;
    ExpectAllNeeded(Make<Master>(AUID_AAFMasterMob), &Master::AddMasterSlot, &Master::GetTapeName,
                    &Master::GetTapeNameBufLen, &Master::GetNumRepresentations,
                    &Master::GetRepresentation, &Master::AddMasterSlotWithSequence);
    using Source = IAAFSourceMob;
    ExpectAllNeeded(Make<Source>(AUID_AAFSourceMob), &Source::AddPulldownRef,
                    &Source::SpecifyValidCodeRange, &Source::AppendEdgecodeSlot);
    // A search needs neither a criterion nor a choice.
    for (const aafUID_t& id : {AUID_AAFMasterMob, AUID_AAFSourceMob}) {
        ExpectNeededBut({3, 4}, Make<IAAFSearchSource>(id).get(), &IAAFSearchSource::SearchSource);
    }
    // Nor does what it finds leave an argument out.
    Ptr<IAAFMob> file = FileMob(1);
    Ptr<IAAFMob> master = Make<IAAFMob>(AUID_AAFMasterMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(file));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(master));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              As<IAAFMasterMob>(master)->AddMasterSlot(DataDef(kAAFDataDef_LegacyPicture), 1,
                                                       As<IAAFSourceMob>(file), 1, L"V1"));
    using Found = IAAFFindSourceInfo;
    Ptr<Found> found;
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFSearchSource>(master)->SearchSource(
                                     1, 0, kAAFFileMob, nullptr, nullptr, found.Out()));
    ExpectAllNeeded(found, &Found::GetMob, &Found::GetSourceReference, &Found::GetLength,
                    &Found::GetEditRate);
}

TEST_F(NullArgument, OfEffects) {
    using Group = IAAFOperationGroup;
    ExpectAllNeeded(Make<Group>(AUID_AAFOperationGroup), &Group::IsATimeWarp,
                    &Group::IsValidTranOperation);
    using I = IAAFParameter;
    for (const aafUID_t& id : {AUID_AAFConstantValue, AUID_AAFVaryingValue}) {
        ExpectAllNeeded(Make<I>(id), &I::GetParameterDefinition, &I::GetTypeDefinition);
    }
    using Constant = IAAFConstantValue;
    ExpectAllNeeded(Make<Constant>(AUID_AAFConstantValue), &Constant::Initialize,
                    &Constant::SetValue, &Constant::GetValue, &Constant::GetValueBufLen,
                    &Constant::GetTypeDefinition);
    using Varying = IAAFVaryingValue;
    ExpectAllNeeded(Make<Varying>(AUID_AAFVaryingValue), &Varying::Initialize,
                    &Varying::GetInterpolationDefinition, &Varying::GetValueBufLen);
    using Point = IAAFControlPoint;
    ExpectAllNeeded(Make<Point>(AUID_AAFControlPoint), &Point::Initialize, &Point::SetValue,
                    &Point::GetValue, &Point::GetValueBufLen, &Point::GetTypeDefinition);
}

TEST_F(NullArgument, OfTheElementsOfAStream) {
    using I = IAAFTypeDefStream;
    ExpectAllNeeded(As<I>(Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Stream)),
                    &I::ReadElements, &I::WriteElements, &I::AppendElements);
}

}  // namespace aaf_test
