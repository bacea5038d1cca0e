// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ValueList.h"

#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class ValueLists : public ModelFixture {
protected:
    aaf::RefPtr<aaf::PropertyValue> Value() {
        return model->NewValue(*model->FindType(kAAFTypeID_Int32));
    }
    std::vector<int> Numbers() const {
        std::vector<int> numbers;
        for (const auto& entry : list) {
            numbers.push_back(entry.first);
        }
        return numbers;
    }
    aaf::ValueList list;
};

TEST_F(ValueLists, AreOrderedByNumberHoweverTheyCome) {
    for (const aaf::PropertyId pid : {7, 0xFFFF, 3, 5, 4}) {
        EXPECT_FALSE(list.Put(pid, Value()));
    }
    EXPECT_EQ(Numbers(), (std::vector<int>{3, 4, 5, 7, 0xFFFF}));
    EXPECT_EQ(list.size(), 5u);
    EXPECT_EQ(list.At(3).first, 7);
    EXPECT_EQ(list.At(3).second.get(), list.Find(7));
}

TEST_F(ValueLists, GiveBackWhatIsReplacedAndWhatIsTaken) {
    const auto first = Value();
    const auto second = Value();
    list.Put(2, Value());
    EXPECT_FALSE(list.Put(4, first));
    EXPECT_EQ(list.Put(4, second).get(), first.get());
    EXPECT_EQ(list.Find(4), second.get());
    EXPECT_EQ(list.Take(4).get(), second.get());
    EXPECT_FALSE(list.Take(4));
    EXPECT_EQ(list.Find(4), nullptr);
    EXPECT_EQ(Numbers(), std::vector<int>{2});
}

TEST_F(ValueLists, FindNothingBetweenAndBeyondTheirNumbers) {
    EXPECT_EQ(list.Find(1), nullptr);
    list.Put(2, Value());
    list.Put(6, Value());
    for (const aaf::PropertyId pid : {1, 3, 7}) {
        EXPECT_EQ(list.Find(pid), nullptr) << pid;
        EXPECT_FALSE(list.Take(pid)) << pid;
    }
}

}  // namespace
