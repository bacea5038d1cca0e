// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/MapperRows.h"

#include <fmt/format.h>

#include "reference_host/util/text/Cut.h"

namespace data_check {
namespace {

constexpr std::size_t kLengthOfCode = 4;
constexpr char kHintForCode[] =
    "write the four characters of the code, each of one byte; blanks count";
constexpr NumberRule kVcid = {"vcid", IsId, "a whole number from 1 to 2147483647, or leave it out",
                              false};

std::optional<MapperRow> ReadRow(const host::PlacedElement& entry, EntryReader& reader,
                                 Findings& findings) {
    reader.CheckNames(entry, {"FourChar", "Vendor", "vcid"});  // the module passes over others
    const std::size_t before = findings.count();
    MapperRow row;
    row.place = entry.place;
    const std::optional<Item> code = reader.One(entry, "FourChar", kHintForCode);
    if (code && code->value.size() != kLengthOfCode) {
        reader.Tell(
            code->place,
            fmt::format("FourChar must have four characters, not \"{}\"", Shown(code->value)),
            kHintForCode);
    }
    row.code = code ? code->value : "";
    if (!ItemsOf(entry, "Vendor").empty()) {
        const std::optional<Item> vendor = reader.One(entry, "Vendor", "");
        if (vendor && vendor->value.size() > kLengthOfCode) {
            reader.Tell(vendor->place,
                        fmt::format("of Vendor only \"{}\" counts",
                                    host::text::StartOf(vendor->value, kLengthOfCode)),
                        "write the four characters that movies have");
        }
        row.vendor = vendor ? vendor->value.substr(0, kLengthOfCode) : "";
    }
    row.id = reader.Number(entry, kVcid).value_or(0);
    return code && findings.count() == before ? std::optional<MapperRow>(row) : std::nullopt;
}

}  // namespace

MapperRows ReadMapperRows(const host::PlacedElement& root, Findings& findings) {
    EntryReader reader(DataFile::Mapper, findings);
    MapperRows all;
    for (const host::PlacedElement* const entry : EntriesOf(root, "FourCharMapping", reader)) {
        if (std::optional<MapperRow> row = ReadRow(*entry, reader, findings)) {
            all.rows.push_back(std::move(*row));
        } else {
            all.isWhole = false;
        }
    }
    return all;
}

}  // namespace data_check
