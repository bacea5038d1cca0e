// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The host checks data files by rules of its own. They have to be the module's.

#include <gtest/gtest.h>

#include <cstring>
#include <map>
#include <set>

#include "reference_host/data_check/BuiltInRasters.h"
#include "reference_host/data_check/Lookups.h"
#include "reference_host/xml/PlacedDocument.h"
#include "source/descriptor_data/AAFInfoDataContainerReader2.h"
#include "source/descriptor_data/FourCharDataContainerReader.h"
#include "source/descriptor_data/ParseAAFInfoXML.h"
#include "source/plugin/Rational.h"
#include "tests/unit/descriptor_data/DataHost.h"

namespace {

using data_check::MapperRow;
using data_check::Record;

constexpr std::size_t kLargest = 1u << 20;

ncfUInt32 WordOf(const std::string& code) {
    ncfUInt32 word = 0;
    std::memcpy(&word, code.data(), std::min(code.size(), sizeof word));
    return word;
}

class HostChecks : public DataHost {
protected:
    host::PlacedElement Load(const std::string& file) {
        host::DocumentProblem problem;
        host::PlacedElement root =
            host::ReadPlacedDocument(std::filesystem::u8path(file), kLargest, problem);
        EXPECT_EQ(problem.text, "");
        return root;
    }
};

TEST_F(HostChecks, KnowTheModulesTableOfRasters) {
    const FourCharDataContainerReader module(host.factory(),
                                             NMAString(Write("map.xml", "<Map/>").c_str()));
    std::size_t rasters = 0;
    for (const std::string_view code : data_check::CodesWithBuiltInRasters()) {
        auto row = module.Formats().equal_range(WordOf(std::string(code))).first;
        for (const data_check::BuiltInRaster& raster : data_check::BuiltInRastersOf(code)) {
            ASSERT_NE(row, module.Formats().end());
            EXPECT_EQ(row->first, WordOf(std::string(code)));
            EXPECT_EQ(row->second.width, raster.width);
            EXPECT_EQ(row->second.height, raster.height);
            EXPECT_EQ(row->second.layout, raster.layout);
            EXPECT_EQ(row->second.vcid, raster.id);
            ++row;
            ++rasters;
        }
    }
    EXPECT_EQ(rasters, module.Formats().size());
    EXPECT_TRUE(data_check::BuiltInRastersOf("dvc ").empty());
}

TEST_F(HostChecks, FindTheRecordsThatTheModuleFinds) {
    const std::string file = SHIPPED_DATA_FOLDER "/AAFInfo.xml";
    GenericXMLDataContainer module;
    ParseAAFInfoXML(host.factory(), &module, NMAString(file.c_str()));
    data_check::Findings findings;
    const data_check::Records all = data_check::ReadRecords(Load(file), findings);
    EXPECT_EQ(findings.count(), 0u);
    EXPECT_TRUE(all.isWhole);
    EXPECT_EQ(all.records.size(), module.AllEntries().size());

    std::map<ncfUInt32, std::vector<const Record*>> ids;
    std::set<ncfUInt32> widths = {0, 641};
    std::set<ncfUInt32> heights = {0, 1, 500};
    for (const Record& record : all.records) {
        ids[record.id].push_back(&record);
        widths.insert({record.storedWidth, record.sampledWidth});
        const ncfUInt32 height = record.displayHeight;
        heights.insert({height, height * 2, height * 2 + 1, height / 2, height + 3, height + 6,
                        height - 3, height - 6, height + 1});
    }
    std::size_t found = 0;
    for (const auto& [id, records] : ids) {
        for (const ncfUInt32 width : widths) {
            for (const ncfUInt32 height : heights) {
                const auto place = data_check::FindRecord(records, width, height);
                AAFInfoDataContainerReader2 reader(&module, id, Rational{25, 1}, width, height);
                Record there;
                const bool isThere = reader.GetStoredWidthFromVCID(&there.storedWidth) == NCF_OK;
                ASSERT_EQ(place.has_value(), isThere) << id << " " << width << " " << height;
                if (isThere) {
                    reader.GetStoredHeightFromVCID(&there.storedHeight);
                    reader.GetFrameLayoutFromVCID(&there.layout);
                    EXPECT_EQ(records[*place]->storedWidth, there.storedWidth);
                    EXPECT_EQ(records[*place]->storedHeight, there.storedHeight);
                    EXPECT_EQ(records[*place]->layout, there.layout);
                    ++found;
                }
            }
        }
    }
    EXPECT_GT(found, 1000u);
}

TEST_F(HostChecks, FindRowsWhereTheModuleFindsThem) {
    const std::string path =
        Write("map.xml",
              "<Map><DV><More><FourCharMapping FourChar='dvc ' vcid='7'/></More></DV>"
              "<Other/><FourCharMapping FourChar='dvcp' vcid='8'>"
              "<FourCharMapping FourChar='dvpp' vcid='9'/></FourCharMapping></Map>");
    const FourCharDataContainerReader module(host.factory(), NMAString(path.c_str()));
    data_check::Findings findings;
    const data_check::MapperRows read = data_check::ReadMapperRows(Load(path), findings);
    ASSERT_EQ(read.rows.size(), module.AllEntries().size());
    for (const MapperRow& row : read.rows) {
        ncfUInt32 id = 0;
        EXPECT_EQ(module.GetVCIDByFourChar(WordOf(row.code), &id), NCF_OK);
        EXPECT_EQ(id, row.id);
    }
    EXPECT_EQ(findings.count(), 2u) << "the element that holds nothing, and the row inside another";
}

// A value that an attribute of its element replaces is told, and no id is read there.
TEST_F(HostChecks, TellAttributesThatTheModuleTakesForValues) {
    const std::string path = Write("map.xml",
                                   "<Map><FourCharMapping FourChar='dvc '><vcid note='8'>7</vcid>"
                                   "</FourCharMapping></Map>");
    const FourCharDataContainerReader module(host.factory(), NMAString(path.c_str()));
    ncfUInt32 id = 0;
    EXPECT_EQ(module.GetVCIDByFourChar(WordOf("dvc "), &id), NCF_OK);
    EXPECT_EQ(id, 8u);
    data_check::Findings findings;
    EXPECT_TRUE(data_check::ReadMapperRows(Load(path), findings).rows.empty());
    EXPECT_EQ(findings.count(), 1u);
}

// All files of up to three rows of a code, with and without vendors and ids.
TEST_F(HostChecks, GiveTheIdsThatTheModuleGives) {
    constexpr const char* kVendors[] = {"", "AAAA", "BBBB"};
    constexpr int kForms = 6;  // of a row: a vendor, and an id or none
    const Rational rate{25, 1};
    const ncfUInt8 layout = 0;
    for (const std::string code : {"v210", "apch"}) {
        for (int files = 1, rows = 1; rows <= 3; ++rows) {
            files *= kForms;
            for (int file = 0; file < files; ++file) {
                std::string text = "<Map>";
                for (int row = 0, rest = file; row < rows; ++row, rest /= kForms) {
                    const std::string vendor = kVendors[rest % kForms / 2];
                    text += "<FourCharMapping FourChar='" + code + "'" +
                            (vendor.empty() ? "" : " Vendor='" + vendor + "'") +
                            (rest % 2 ? " vcid='" + std::to_string(100 + row) + "'" : "") + "/>";
                }
                SCOPED_TRACE(text);
                const std::string path = Write("map.xml", text + "</Map>");
                const FourCharDataContainerReader module(host.factory(), NMAString(path.c_str()));
                std::set<ncfUInt32> byModule;
                for (const char* const vendor : {"", "AAAA", "BBBB", "CCCC"}) {
                    ncfUInt32 id = 0;
                    module.GetVCID(WordOf(code), 1, 1, &rate, &layout, WordOf(vendor), &id);
                    byModule.insert(id);
                }
                byModule.erase(0);

                data_check::Findings findings;
                const data_check::MapperRows read =
                    data_check::ReadMapperRows(Load(path), findings);
                ASSERT_EQ(findings.count(), 0u);
                std::vector<const MapperRow*> all;
                for (const MapperRow& row : read.rows) {
                    all.push_back(&row);
                }
                std::set<ncfUInt32> byHost;
                const std::vector<bool> given = data_check::GivenIds(all);
                for (std::size_t i = 0; i < all.size(); ++i) {
                    if (given[i]) {
                        byHost.insert(all[i]->id);
                    }
                }
                EXPECT_EQ(byHost, byModule);
            }
        }
    }
}

}  // namespace
