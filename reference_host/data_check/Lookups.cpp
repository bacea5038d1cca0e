// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Lookups.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <set>

#include "reference_host/data_check/BuiltInRasters.h"

namespace data_check {
namespace {

// Ids that no file needs to name: a movie may carry one of them itself.
constexpr std::uint32_t kFirstMovieId = 10900;
constexpr std::uint32_t kLastMovieId = 10999;

bool IsMovieId(std::uint32_t id) {
    return id >= kFirstMovieId && id <= kLastMovieId;
}

// How codes begin that fix the size of a picture, so that their ids may do with one record.
constexpr std::string_view kFixedRasters[] = {"dv", "mx", "xd", "hdv", "ai"};

bool FixesRaster(const std::string& code) {
    return std::any_of(
        std::begin(kFixedRasters), std::end(kFixedRasters),
        [&](std::string_view start) { return code.compare(0, start.size(), start) == 0; });
}

// A record may describe fields where the movie has frames or the reverse, and pictures whose few
// topmost lines are cut.
bool HeightFits(std::uint32_t height, std::uint32_t ofRecord) {
    return height == ofRecord || height * 2 == ofRecord || height / 2 == ofRecord ||
           height - 3 == ofRecord || height - 6 == ofRecord;
}

bool HasSamePicture(const Record& a, const Record& b) {
    return a.storedWidth == b.storedWidth && a.sampledWidth == b.sampledWidth &&
           a.storedHeight == b.storedHeight && a.displayHeight == b.displayHeight &&
           a.layout == b.layout;
}

class Lookups {
public:
    Lookups(const MapperRows& mapper, const Records& infos, Findings& findings)
        : mapperIsWhole_(mapper.isWhole), infosAreWhole_(infos.isWhole), findings_(findings) {
        for (const MapperRow& row : mapper.rows) {
            codes_[row.code].push_back(&row);
        }
        for (const Record& record : infos.records) {
            ids_[record.id].push_back(&record);
        }
    }

    void CheckAll() {
        for (const auto& [code, rows] : codes_) {
            CheckCode(code, rows);
        }
        for (const auto& [id, records] : ids_) {
            CheckId(id, records);
        }
    }

private:
    using Rows = std::vector<const MapperRow*>;
    using RecordsOfId = std::vector<const Record*>;

    void TellRow(const MapperRow& row, std::string what, std::string hint) {
        findings_.Tell(DataFile::Mapper, row.place, std::move(what), std::move(hint));
    }
    void TellRecord(const Record& record, std::string what, std::string hint) {
        findings_.Tell(DataFile::Info, record.place, std::move(what), std::move(hint));
    }

    void CheckCode(const std::string& code, const Rows& rows) {
        const std::vector<BuiltInRaster> rasters = BuiltInRastersOf(code);
        const std::vector<bool> given = GivenIds(rows);
        bool leadsSomewhere = rows.size() > 1 && !rasters.empty();
        for (std::size_t i = 0; i < rows.size(); ++i) {
            if (given[i]) {
                leadsSomewhere = true;
                Reach(*rows[i], rows[i]->id, FixesRaster(code));
            } else if (rows[i]->id != 0) {
                TellUnreached(*rows[i], rasters.empty());
            }
        }
        for (std::size_t i = 0; rows.size() > 1 && i < rasters.size(); ++i) {
            CheckRaster(*rows.back(), rasters[i]);
        }
        if (!leadsSomewhere && !rasters.empty()) {
            TellRow(*rows.front(), fmt::format("code \"{}\" leads to no id", code),
                    "give the code a second row, so that the module's own table of its rasters is "
                    "asked");
        } else if (!leadsSomewhere && !HasMovieIds()) {
            TellRow(*rows.front(), fmt::format("code \"{}\" leads to no id", code),
                    fmt::format("give it a vcid, or AAFInfo.xml a record with an id of those that "
                                "movies name themselves, {} to {}",
                                kFirstMovieId, kLastMovieId));
        }
        CheckRepeats(rows, !rasters.empty());
    }

    // Whether a movie that names its id itself finds a record; of a file with mistakes nobody
    // knows.
    bool HasMovieIds() const {
        const auto first = ids_.lower_bound(kFirstMovieId);
        return !infosAreWhole_ || (first != ids_.end() && IsMovieId(first->first));
    }

    // Of rows without an id. A code of the module's table needs two of them.
    void CheckRepeats(const Rows& rows, bool hasTable) {
        std::set<std::optional<std::string>> vendors;
        for (std::size_t i = 0; i < rows.size(); ++i) {
            const MapperRow& row = *rows[i];
            const bool counts = row.id == 0 || row.vendor;
            const bool isRepeat = counts && !vendors.insert(row.vendor).second && row.id == 0;
            if (isRepeat && !(hasTable && i == 1)) {
                TellRow(row, fmt::format("this row of \"{}\" serves no movie", row.code),
                        "take it out: one before it counts");
            }
        }
    }

    void TellUnreached(const MapperRow& row, bool isByOrder) {
        const std::string what =
            fmt::format("no movie gets id {} by this row of \"{}\"", row.id, row.code);
        if (row.vendor) {
            TellRow(row, what, "take it out: a row before it has the same Vendor, and counts");
        } else if (isByOrder) {
            TellRow(row, what, "take it out: of rows without Vendor the last counts");
        } else {
            TellRow(row, what,
                    "take the vcid out: the module's own table has the ids of this code's rasters");
        }
    }

    void Reach(const MapperRow& row, std::uint32_t id, bool isFixed) {
        reached_.insert(id);
        if (isFixed) {
            fixed_.insert(id);
        }
        if (infosAreWhole_ && ids_.count(id) == 0) {
            TellRow(row,
                    fmt::format("code \"{}\" leads to id {}, which has no record", row.code, id),
                    fmt::format("add a record with ResolutionID {} to AAFInfo.xml, or correct the "
                                "vcid",
                                id));
        }
    }

    void CheckRaster(const MapperRow& row, const BuiltInRaster& raster) {
        reached_.insert(raster.id);
        fixed_.insert(raster.id);
        const auto records = ids_.find(raster.id);
        const std::optional<std::size_t> found =
            records == ids_.end() ? std::nullopt
                                  : FindRecord(records->second, raster.width, raster.height);
        if (infosAreWhole_ && (!found || records->second[*found]->layout != raster.layout)) {
            TellRow(row,
                    fmt::format("code \"{}\" has no record for {}x{} {}", row.code, raster.width,
                                raster.height, raster.layout == 1 ? "fields" : "frames"),
                    fmt::format("add one with ResolutionID {} and FrameLayout {} to AAFInfo.xml",
                                raster.id, raster.layout));
        }
    }

    void CheckId(std::uint32_t id, const RecordsOfId& records) {
        const bool isReached = reached_.count(id) > 0 || IsMovieId(id);
        if (!isReached && mapperIsWhole_) {
            TellRecord(*records.front(), fmt::format("no code leads to id {}", id),
                       fmt::format("add a row with vcid {} to FourCharMapper.xml, or take the "
                                   "record out",
                                   id));
        }
        if (records.size() == 1 && isReached && fixed_.count(id) == 0 && infosAreWhole_) {
            TellRecord(*records.front(),
                       fmt::format("id {} has one record, so a picture of any height gets it", id),
                       "repeat the record, unless the code fixes the size of its pictures");
        }
        for (std::size_t i = 1; i < records.size(); ++i) {
            CheckShadow(records, i);
        }
    }

    static const char* HintForShadow(const Record& before, const Record& record) {
        if (before.values == record.values) {
            return "take this one out, it is a repeat";
        }
        if (HasSamePicture(before, record)) {
            return "make the two alike, or take the wrong one out: they differ, and the first "
                   "counts";
        }
        return FindsFirst(record, before)
                   ? "give one of the two another id: each takes the other's pictures, in any order"
                   : "put this one before it: larger heights come first";
    }

    // Whether a picture of the second one would find the first one before it.
    static bool FindsFirst(const Record& first, const Record& second) {
        const RecordsOfId both = {&first, &second};
        return FindRecord(both, second.storedWidth, second.displayHeight) == 0u ||
               FindRecord(both, second.sampledWidth, second.displayHeight) == 0u;
    }

    // A record is to be found by a picture of its own size, by either width.
    void CheckShadow(const RecordsOfId& records, std::size_t at) {
        const Record& record = *records[at];
        for (const std::uint32_t width : {record.sampledWidth, record.storedWidth}) {
            const std::optional<std::size_t> found =
                FindRecord(records, width, record.displayHeight);
            // A repeat of the only record makes heights count.
            const bool isRepeat = records.size() == 2 && records[0]->values == record.values;
            if (found && *found != at && !isRepeat) {
                TellRecord(record,
                           fmt::format("a picture of {}x{} finds the record of id {} in line {} "
                                       "instead of this one",
                                       width, record.displayHeight, record.id,
                                       records[*found]->place.line),
                           HintForShadow(*records[*found], record));
                return;
            }
        }
    }

    std::map<std::string, Rows> codes_;
    std::map<std::uint32_t, RecordsOfId> ids_;
    bool mapperIsWhole_;
    bool infosAreWhole_;
    Findings& findings_;
    std::set<std::uint32_t> reached_;
    std::set<std::uint32_t> fixed_;  // by a code or raster that fixes the size
};

}  // namespace

std::optional<std::size_t> FindRecord(const std::vector<const Record*>& records,
                                      std::uint32_t width, std::uint32_t height) {
    for (std::size_t i = 0; i < records.size(); ++i) {
        const Record& record = *records[i];
        if ((records.size() == 1 || HeightFits(height, record.displayHeight)) &&
            (width == record.storedWidth || width == record.sampledWidth)) {
            return i;
        }
    }
    return std::nullopt;
}

std::vector<bool> GivenIds(const std::vector<const MapperRow*>& rows) {
    const bool isAlone = rows.size() == 1;
    const bool asksTable = !isAlone && !rows.empty() && !BuiltInRastersOf(rows[0]->code).empty();
    std::set<std::string> vendors;
    std::optional<std::size_t> last;  // without a vendor
    std::vector<bool> given(rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        const MapperRow& row = *rows[i];
        if (row.vendor || isAlone) {
            given[i] = row.id != 0 && (isAlone || vendors.count(*row.vendor) == 0);
            vendors.insert(row.vendor.value_or(""));
        } else if (row.id != 0 && !asksTable) {
            last = i;
        }
    }
    if (last) {
        given[*last] = true;
    }
    return given;
}

void CheckLookups(const MapperRows& mapper, const Records& infos, Findings& findings) {
    Lookups(mapper, infos, findings).CheckAll();
}

}  // namespace data_check
