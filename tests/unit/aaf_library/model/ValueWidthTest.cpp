// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ValueWidth.h"

#include <gtest/gtest.h>

#include <optional>

#include "aaf_library/model/Model.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

namespace aaf {

namespace {

class ValueWidth : public ::testing::Test {
protected:
    TypeDefinition& Type(const GUID& id) { return *model_->FindType(id); }
    // Those bytes as the other type has them; "none" when it can't.
    std::optional<Bytes> Widened(const GUID& from, Bytes bytes, const GUID& to) {
        Bytes widened;
        const RefPtr<PropertyValue> value = model_->NewValue(Type(from), std::move(bytes));
        return Widen(*value, Type(to), widened) ? std::optional<Bytes>(widened) : std::nullopt;
    }

    ClassRegistry registry_;
    RefPtr<Model> model_ = Model::Create(registry_);
};

TEST_F(ValueWidth, IsThatOfNumbersAndOfWhatIsMadeOfThem) {
    EXPECT_TRUE(HasWidthOf(Type(kAAFTypeID_Int32), Type(kAAFTypeID_UInt32)));
    EXPECT_TRUE(HasWidthOf(Type(kAAFTypeID_LengthType), Type(kAAFTypeID_Int64)));
    EXPECT_FALSE(HasWidthOf(Type(kAAFTypeID_LengthType), Type(kAAFTypeID_Int32)));
    EXPECT_FALSE(HasWidthOf(Type(kAAFTypeID_Int32), Type(kAAFTypeID_String)));
    EXPECT_TRUE(HasWidthOf(Type(kAAFTypeID_UInt8Array), Type(kAAFTypeID_UInt8Array)));
    EXPECT_FALSE(HasWidthOf(Type(kAAFTypeID_UInt8Array), Type(kAAFTypeID_Int32Array)));
    EXPECT_TRUE(HasWidthOf(Type(kAAFTypeID_Stream), Type(kAAFTypeID_Stream)));
}

TEST_F(ValueWidth, ChangesOfNumbersKeepTheirSign) {
    EXPECT_EQ((Bytes{0xFE, 0xFF, 0xFF, 0xFF}),
              Widened(kAAFTypeID_Int16, {0xFE, 0xFF}, kAAFTypeID_Int32));
    EXPECT_EQ((Bytes{0xFE, 0xFF, 0, 0}),
              Widened(kAAFTypeID_UInt16, {0xFE, 0xFF}, kAAFTypeID_Int32));
    EXPECT_EQ((Bytes{0xFE}), Widened(kAAFTypeID_Int16, {0xFE, 0xFF}, kAAFTypeID_Int8));
    EXPECT_EQ((Bytes{7, 0, 0, 0}), Widened(kAAFTypeID_ColorSitingType, {7}, kAAFTypeID_UInt32));
}

TEST_F(ValueWidth, ChangesOfEachElementOfAnArray) {
    EXPECT_EQ((Bytes{1, 0, 0, 0, 0xFF, 0, 0, 0}),
              Widened(kAAFTypeID_UInt8Array, {1, 0xFF}, kAAFTypeID_Int32Array));
    EXPECT_EQ((Bytes{1, 0xFF}),
              Widened(kAAFTypeID_Int32Array, {1, 0, 0, 0, 0xFF, 0, 0, 0}, kAAFTypeID_UInt8Array));
    EXPECT_EQ(Bytes{}, Widened(kAAFTypeID_UInt8Array, {}, kAAFTypeID_Int32Array));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_Int32Array, {0x2C, 1, 0, 0}, kAAFTypeID_UInt8Array));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_Int32Array, {1, 0, 0}, kAAFTypeID_UInt8Array));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_UInt8Array, {1}, kAAFTypeID_Int32));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_UInt8, {1}, kAAFTypeID_Int32Array));
}

TEST_F(ValueWidth, DoesNotChangeWhereAValueWouldNotFit) {
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_UInt16, {0x2C, 0x01}, kAAFTypeID_UInt8));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_UInt8, {0xFF}, kAAFTypeID_Int8));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_Int16, {0xFF, 0xFF}, kAAFTypeID_UInt32));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_String, {'a', 0, 0, 0}, kAAFTypeID_Int16));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_Int16, {1, 0}, kAAFTypeID_Rational));
    EXPECT_EQ(std::nullopt, Widened(kAAFTypeID_Int16, {1}, kAAFTypeID_Int32));
}

}  // namespace

}  // namespace aaf
