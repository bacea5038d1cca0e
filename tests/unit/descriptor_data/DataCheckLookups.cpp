// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Checks of the two files together, by the module's own readers.

#include <algorithm>
#include <cstring>
#include <map>
#include <memory>
#include <set>

#include "source/descriptor_data/AAFInfoDataContainerReader2.h"
#include "source/descriptor_data/FourCharDataContainerReader.h"
#include "source/descriptor_data/ParseAAFInfoXML.h"
#include "source/plugin/Rational.h"
#include "tests/unit/descriptor_data/DataCheck.h"

namespace data_check {

namespace {

// Families whose codes fix the picture's size, so that an id may do with one
// entry, which takes any height.
const char* const kFixedRasters[] = {"dv", "mx", "xd", "hdv", "ai"};

constexpr ncfUInt32 kNoVendor = 0;

ncfUInt32 NumberOf(const XMLDataPropertyValue* parent, const char* name, ncfUInt32 absent) {
    XMLDataPropertyValue* node = nullptr;
    return parent->FindPropertyInChildren(name, &node) == NCF_OK
               ? static_cast<ncfUInt32>(std::strtoul(node->ValueText(), nullptr, 10))
               : absent;
}

// What tells one entry of an id from another.
struct Picture {
    ncfUInt32 storedWidth = 0, sampledWidth = 0, storedHeight = 0, displayHeight = 0, layout = 0;

    explicit Picture(const XMLDataPropertyValue* entry) {
        for (const XMLDataPropertyValue* descriptor : entry->Children()) {
            storedWidth = NumberOf(descriptor, "rp210:StoredWidth", storedWidth);
            storedHeight = NumberOf(descriptor, "rp210:StoredHeight", storedHeight);
            sampledWidth = NumberOf(descriptor, "rp210:SampledWidth", storedWidth);
            displayHeight = NumberOf(descriptor, "rp210:DisplayHeight", storedHeight);
            layout = NumberOf(descriptor, "rp210:FrameLayout", layout);
        }
    }
    bool IsFoundBy(AAFInfoDataContainerReader2& reader) const {
        ncfUInt32 width = 0, sampled = 0, height = 0, display = 0, found = 0;
        reader.GetStoredWidthFromVCID(&width);
        reader.GetStoredHeightFromVCID(&height);
        reader.GetFrameLayoutFromVCID(&found);
        if (reader.GetSampledWidthFromVCID(&sampled) != NCF_OK) {
            sampled = width;
        }
        if (reader.GetDisplayHeightFromVCID(&display) != NCF_OK) {
            display = height;
        }
        return width == storedWidth && height == storedHeight && found == layout &&
               sampled == sampledWidth && display == displayHeight;
    }
};

class Lookups {
public:
    Lookups(INCFComponentFactory* factory, const std::string& mapperFile,
            const std::string& infoFile, Findings& findings)
        : mapper_(factory, NMAString(mapperFile.c_str())), findings_(findings) {
        ParseAAFInfoXML(factory, &infos_, NMAString(infoFile.c_str()));
    }

    void CheckAll() {
        CollectEntries();
        CheckCodes();
        CheckIds();
    }

private:
    using Entries = std::vector<XMLDataPropertyValue*>;

    void Tell(const std::string& what) { findings_.push_back(what); }

    void CollectEntries() {
        for (const auto& [key, entry] : infos_.AllEntries()) {
            ids_[static_cast<ncfUInt32>(std::strtoul(key->ValueText(), nullptr, 10))].push_back(
                entry);
        }
        for (const auto& [key, entry] : mapper_.AllEntries()) {
            codes_[key->ValueText()].push_back(entry);
        }
    }

    // Every id that a code can lead to must have entries.
    void CheckCodes() {
        for (const auto& [code, entries] : codes_) {
            std::set<ncfUInt32> ids;
            for (const XMLDataPropertyValue* entry : entries) {
                XMLDataPropertyValue* vendor = nullptr;
                const bool byVendor = entry->FindPropertyInChildren("Vendor", &vendor) == NCF_OK;
                if (byVendor || entries.size() == 1) {
                    ids.insert(mapper_.GetEntryVCID(entry));
                }
            }
            AddIdsWithoutVendor(code, entries, ids);
            ids.erase(0);
            if (ids.empty()) {
                Tell("code \"" + code + "\" leads to no id");
            }
            for (const ncfUInt32 id : ids) {
                Reach(id, code);
            }
        }
    }

    void AddIdsWithoutVendor(const std::string& code, const Entries& entries,
                             std::set<ncfUInt32>& ids) {
        if (entries.size() == 1) {
            return;
        }
        ncfUInt32 word = 0;
        std::memcpy(&word, code.data(), std::min(code.size(), sizeof word));
        const auto rows = mapper_.Formats().equal_range(word);
        if (rows.first == rows.second) {
            ncfUInt32 id = 0;
            mapper_.GetVCIDWithoutVendor(entries, &id);
            ids.insert(id);
            return;
        }
        for (auto row = rows.first; row != rows.second; ++row) {
            CheckRow(code, row->first, row->second);
            ids.insert(row->second.vcid);
            fixed_.insert(row->second.vcid);
        }
    }

    // A row of the built-in table leads to an entry of its own size.
    void CheckRow(const std::string& code, ncfUInt32 word, const FourCharFormat& row) {
        const Rational rate{static_cast<ncfSInt32>(row.rateNumerator),
                            static_cast<ncfSInt32>(row.rateDenominator)};
        ncfUInt32 id = 0;
        mapper_.GetVCID(word, row.width, row.height, &rate, &row.layout, kNoVendor, &id);
        AAFInfoDataContainerReader2 reader(&infos_, row.vcid, rate, row.width, row.height);
        ncfUInt32 layout = 99;
        if (id != row.vcid || reader.GetFrameLayoutFromVCID(&layout) != NCF_OK ||
            layout != row.layout) {
            Tell("code \"" + code + "\" has no entry for " + std::to_string(row.width) + "x" +
                 std::to_string(row.height) + " (id " + std::to_string(row.vcid) + ")");
        }
    }

    void Reach(ncfUInt32 id, const std::string& code) {
        reached_.insert(id);
        if (ids_.count(id) == 0) {
            Tell("code \"" + code + "\" leads to id " + std::to_string(id) +
                 ", which has no entry");
        }
        for (const char* family : kFixedRasters) {
            if (code.compare(0, std::strlen(family), family) == 0) {
                fixed_.insert(id);
            }
        }
    }

    void CheckIds() {
        for (const auto& [id, entries] : ids_) {
            const std::string name = "id " + std::to_string(id);
            const bool byMovie = id >= kFirstMovieId && id <= kLastMovieId;
            if (reached_.count(id) == 0 && !byMovie) {
                Tell(name + " is reached by no code");
            }
            if (entries.size() == 1 && fixed_.count(id) == 0) {
                Tell(name +
                     " has one entry, which takes any height; repeat it if the code does "
                     "not fix the picture's size");
            }
            CheckShadows(id, entries);
        }
    }

    // An entry is found by its own size, by either width.
    void CheckShadows(ncfUInt32 id, const Entries& entries) {
        for (std::size_t i = 0; i < entries.size(); ++i) {
            const Picture picture(entries[i]);
            for (const ncfUInt32 width : {picture.sampledWidth, picture.storedWidth}) {
                AAFInfoDataContainerReader2 reader(&infos_, id, Rational{}, width,
                                                   picture.displayHeight);
                if (!picture.IsFoundBy(reader)) {
                    Tell("id " + std::to_string(id) + ", entry " + std::to_string(i + 1) + ": " +
                         std::to_string(width) + "x" + std::to_string(picture.displayHeight) +
                         " is found at an entry before it");
                }
            }
        }
    }

    FourCharDataContainerReader mapper_;
    GenericXMLDataContainer infos_;
    Findings& findings_;
    std::map<ncfUInt32, Entries> ids_;
    std::map<std::string, Entries> codes_;
    std::set<ncfUInt32> reached_;
    std::set<ncfUInt32> fixed_;  // reached by a code or row that fixes the size
};

}  // namespace

void CheckLookups(INCFComponentFactory* factory, const std::string& mapperFile,
                  const std::string& infoFile, Findings& findings) {
    try {
        Lookups(factory, mapperFile, infoFile, findings).CheckAll();
    } catch (NCFRESULT) {
        findings.push_back("the readers can't load the files");
    }
}

}  // namespace data_check
