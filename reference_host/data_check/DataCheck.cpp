// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/DataCheck.h"

#include <set>

#include "reference_host/data_check/Lookups.h"

namespace data_check {
namespace {

// Real ones have a hundredth of it.
constexpr std::size_t kLargestFile = std::size_t{8} << 20;

std::optional<host::PlacedElement> Load(const std::filesystem::path& folder, DataFile which,
                                        Findings& findings, CheckedData& checked) {
    const auto number = static_cast<std::size_t>(which);
    host::DocumentProblem problem;
    host::PlacedElement root =
        host::ReadPlacedDocument(folder / kDataFileNames[number], kLargestFile, problem);
    if (problem.isOfFile) {
        checked.unreadable[number] = problem.text;
        return std::nullopt;
    }
    if (!problem.text.empty()) {
        findings.Tell(which, problem.place, "this is no well-formed XML: " + problem.text,
                      "correct it; the module reads nothing of a file that is broken");
        return std::nullopt;
    }
    return root;
}

}  // namespace

CheckedData CheckData(const std::filesystem::path& folder) {
    CheckedData checked;
    Findings findings;
    MapperRows mapper;
    Records infos;
    const auto mapperRoot = Load(folder, DataFile::Mapper, findings, checked);
    if (mapperRoot) {
        mapper = ReadMapperRows(*mapperRoot, findings);
    }
    const auto infoRoot = Load(folder, DataFile::Info, findings, checked);
    if (infoRoot) {
        infos = ReadRecords(*infoRoot, findings);
    }
    // One file alone leads nowhere.
    if (mapperRoot && infoRoot) {
        CheckLookups(mapper, infos, findings);
    }
    std::set<std::string> codes;
    for (const MapperRow& row : mapper.rows) {
        codes.insert(row.code);
    }
    std::set<std::uint32_t> ids;
    for (const Record& record : infos.records) {
        ids.insert(record.id);
    }
    checked.counts = {mapper.rows.size(), codes.size(), infos.records.size(), ids.size(),
                      findings.count()};
    checked.findings = findings.TakeInOrder();
    return checked;
}

}  // namespace data_check
