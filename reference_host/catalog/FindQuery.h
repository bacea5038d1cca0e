// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <stdexcept>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace catalog {

// What people ask a catalog: words, and fields with values, as in
//     codec:prores rate:25 -alpha:yes "second take"
// A movie has to fit all of them. Nothing of a query becomes a part of the statement: its values
// are bound.

// A query that says nothing, or something else than its writer thinks.
class QueryError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

struct Term {
    bool isNegated = false;
    std::string field;  // empty: a word of any text
    std::string value;
};

// Throws a QueryError.
std::vector<Term> TermsOf(std::string_view query);

// A condition on a row of the table of movies, with a question mark for each value.
struct Condition {
    std::string sql;
    std::vector<std::variant<std::string, double>> values;
};

// Throws a QueryError for a field that there isn't, or a value that the field can't have.
Condition ConditionOf(const std::vector<Term>& terms);

// What a field is asked for, for the help and the documents.
struct FieldHelp {
    const char* name;
    const char* example;
    const char* meaning;
};
std::vector<FieldHelp> AllFields();

}  // namespace catalog
