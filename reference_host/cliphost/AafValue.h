// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <unordered_map>

#include "host_interfaces/aaf/AAFObjects.h"
#include "reference_host/cliphost/AafQuery.h"

namespace cliphost {

// Forms in which values of AAF objects are shown.
std::string ToText(const aafUID_t& id);
std::string ToText(const aafMobID_t& id);
std::string ToText(const aafTimeStamp_t& time);
std::string ToText(const aafRational_t& rational);
std::string ToText(const aafVersionType_t& version);

// Stands for a value that can't be read.
inline constexpr char kUnreadable[] = "?";

// What values of one type have in common.
class ValueType {
public:
    ValueType() = default;
    virtual ~ValueType() = default;
    ValueType(const ValueType&) = delete;
    ValueType& operator=(const ValueType&) = delete;

    // A value as text: numbers, names of enumerations, texts in quotes, records by their
    // members, references to definitions by name; what is no value of its property as raw bytes.
    // Anything that can't be read is "?".
    virtual std::string Text(IAAFPropertyValue* value) = 0;
    // Hands over the objects that a value owns, one after the other; false for a value of a
    // type that owns none.
    virtual bool TakeObjects(IAAFPropertyValue*, const std::function<void(IAAFObject*)>&) {
        return false;
    }
    // Whether the order of what a value holds means nothing.
    virtual bool IsSet() const { return false; }
};

// How values are shown that are too long for a line.
enum class LongValues {
    Cut,       // by their first elements, and how many there are
    Digested,  // with a digest of the rest, so that two texts are alike where the values are
};

// Reads the property values of one file. What definitions tell, which many values share, is
// asked of the library once.
class ValueReader {
public:
    explicit ValueReader(LongValues longValues = LongValues::Cut);
    ~ValueReader();
    ValueReader(const ValueReader&) = delete;
    ValueReader& operator=(const ValueReader&) = delete;

    // Lives as long as the reader.
    ValueType& TypeOf(IAAFPropertyValue* value);
    bool DigestsLongValues() const { return longValues_ == LongValues::Digested; }

private:
    LongValues longValues_;
    std::unordered_map<IAAFTypeDef*, std::unique_ptr<ValueType>> types_{64};
    std::unique_ptr<ValueType> raw_;
};

}  // namespace cliphost
