// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/ResultText.h"

#include <fmt/format.h>

namespace cliphost {
namespace {

struct NamedResult {
    NCFRESULT code;
    const char* name;
    const char* sentence;
};

constexpr NamedResult kNamedResults[] = {
    {NCF_OK, "NCF_OK", "success"},
    {NCF_E_NOTIMPL, "NCF_E_NOTIMPL", "the component does not do this"},
    {NCF_E_OUTOFMEMORY, "NCF_E_OUTOFMEMORY", "memory ran out"},
    {NCF_E_INVALIDARG, "NCF_E_INVALIDARG", "an argument is not valid"},
    {NCF_E_NOINTERFACE, "NCF_E_NOINTERFACE", "the object lacks the interface"},
    {NCF_E_POINTER, "NCF_E_POINTER", "a pointer is null"},
    {NCF_E_HANDLE, "NCF_E_HANDLE", "the file can't be opened or read"},
    {NCF_E_ABORT, "NCF_E_ABORT", "the operation was given up"},
    {NCF_E_FAIL, "NCF_E_FAIL", "the operation failed"},
    {NCF_E_ACCESSDENIED, "NCF_E_ACCESSDENIED", "access is denied"},
    {NCF_E_NOTFOUND, "NCF_E_NOTFOUND", "there is no such thing"},
    {NCF_E_NOTSUPPORTED, "NCF_E_NOTSUPPORTED", "this is not supported"},
    {NCF_E_UNEXPECTED, "NCF_E_UNEXPECTED", "something unexpected happened"},
    {QT_E_MOREDATA, "QT_E_MOREDATA", "more bytes are wanted"},
    {NCF_CLASS_E_NOAGGREGATION, "NCF_CLASS_E_NOAGGREGATION", "the class can't be aggregated"},
    {NCF_CLASS_E_CLASSNOTAVAILABLE, "NCF_CLASS_E_CLASSNOTAVAILABLE", "nothing makes this class"},
    {NMA_E_AAF_ADD, "NMA_E_AAF_ADD", "a part could not be added to the description"},
    {NMA_E_AAF_QUERY, "NMA_E_AAF_QUERY", "an object of the description lacks an interface"},
    {NMA_E_AAF_CREATE, "NMA_E_AAF_CREATE", "an object of the description could not be made"},
    {NMA_E_NOTSET, "NMA_E_NOTSET", "the property is not known"},
    {NMA_E_ALREADYSET, "NMA_E_ALREADYSET", "it is set already"},
    {NMA_E_NOTINITIALIZED, "NMA_E_NOTINITIALIZED", "the clip could not be loaded"},
    {NMA_E_FIELDS, "NMA_E_FIELDS", "the movie does not tell its fields"},
    {NCF_E_PARAMETERNOTAVAILABLE, "NCF_E_PARAMETERNOTAVAILABLE", "the datum is not there"},
    {NMA_E_ROOTEXISTS, "NMA_E_ROOTEXISTS", "the document has a root already"},
    {NMA_E_NODATA, "NMA_E_NODATA", "there is no data"},
};

const NamedResult* Find(NCFRESULT result) {
    for (const NamedResult& row : kNamedResults) {
        if (row.code == result) {
            return &row;
        }
    }
    return nullptr;
}

}  // namespace

std::string ResultName(NCFRESULT result) {
    const NamedResult* const row = Find(result);
    return row ? row->name : fmt::format("0x{:08X}", static_cast<ncfUInt32>(result));
}

std::string ResultText(NCFRESULT result) {
    const auto number = static_cast<ncfUInt32>(result);
    if (const NamedResult* const row = Find(result)) {
        return fmt::format("{} (0x{:08X}): {}", row->name, number, row->sentence);
    }
    if ((number & 0xFFFF0000u) == 0x80120000u) {
        return fmt::format("0x{:08X}: the AAF library refused", number);
    }
    return fmt::format("0x{:08X}", number);
}

}  // namespace cliphost
