// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A whole description, with its n-th call to the host refused for every n: component
// creation, query for an interface, file read. The answer must be the failure's code
// or a complete description, nothing may be left behind, and the next description
// must work. The AAF operations have such a sweep in
// tests/unit/aaf, where a library that fails can stand in.

#include <algorithm>
#include <functional>
#include <map>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/framework/QueryRule.h"
#include "tests/system/Facts.h"
#include "tests/system/ReadFaults.h"
#include "tests/system/SystemTest.h"

namespace {

constexpr int kMostCalls = 5000;

class FaultSweep : public SystemTest, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        movie_ = MadeMovie(GetParam());
        options.host.ignoreAlpha = false;
        Start();
        whole_ = TextNow();
        ASSERT_FALSE(whole_.empty());
    }
    void TearDown() override {
        host::SetQueryRule({});
        read_faults::Disarm();
        SystemTest::TearDown();
    }

    std::string TextNow() {
        const auto description = cliphost::DescribeMovie(session(), movie_);
        return description.file ? cliphost::ToText(cliphost::ReadTree(description.file.get())) : "";
    }

    // Refuses the 1st, 2nd ... call until none is left to refuse. `arm` makes
    // the n-th fail, `disarm` says how many calls there were.
    void Sweep(const std::function<void(int)>& arm, const std::function<int()>& disarm,
               bool freshModule) {
        int refused = 0;
        for (int n = 1; n <= kMostCalls; ++n) {
            SCOPED_TRACE("call " + std::to_string(n));
            if (freshModule) {
                Start();  // the module forgets its data files
            }
            arm(n);
            const auto description = cliphost::DescribeMovie(session(), movie_);
            const int calls = disarm();
            Check(description);
            if (calls < n) {
                EXPECT_GT(refused, 0) << "nothing was ever refused";
                EXPECT_TRUE(description.file) << LineOf(description.problem);
                Report();
                return;
            }
            ++refused;
            ++results_[description.result];
            // Its objects end before those of the module are counted.
        }
        FAIL() << "no end of calls";
    }

    void Check(const cliphost::Description& description) {
        ASSERT_EQ(description.result >= 0, static_cast<bool>(description.file));
        if (!description.file) {
            EXPECT_EQ(kDocumented.count(description.result), 1u) << LineOf(description.problem);
            EXPECT_TRUE(ModuleIsIdle());
            EXPECT_NE(LineOf(description.problem).find(movie_.string()), std::string::npos);
        } else {
            // What was refused was not needed: three whole mobs all the same.
            EXPECT_EQ(Parts(cliphost::ReadTree(description.file.get()), "Mobs").size(), 3u);
        }
        EXPECT_EQ(OpenMovies(), 0) << "the movie is still open";
        EXPECT_EQ(TextNow(), whole_) << "the road does not work again";
    }

    int OpenMovies() const {
        int count = 0;
        for (const std::string& file : OpenFiles()) {
            count += file.find(movie_.filename().string()) != std::string::npos;
        }
        return count;
    }

    void Report() {
        for (const auto& [result, count] : results_) {
            RecordProperty("result " + std::to_string(result), count);
        }
        const bool isFelt = std::any_of(results_.begin(), results_.end(),
                                        [](const auto& each) { return each.first < 0; });
        EXPECT_EQ(isFelt, refusalsAreFelt_) << (isFelt ? "a failure" : "no refusal was ever felt");
    }

    // The refusal itself where the road carries it, else what a clip that can't
    // be loaded or built is told by.
    static const std::set<NCFRESULT> kDocumented;

    std::filesystem::path movie_;
    std::string whole_;
    std::map<NCFRESULT, int> results_;
    bool refusalsAreFelt_ = true;
};

const std::set<NCFRESULT> FaultSweep::kDocumented = {
    NCF_E_OUTOFMEMORY, NMA_E_NOTINITIALIZED, NCF_E_UNEXPECTED, NCF_E_FAIL, NCF_E_POINTER,
    // Of reading: what can't be read, and bytes that are not there.
    NCF_E_HANDLE, NMA_E_NODATA};

TEST_P(FaultSweep, OverComponentCreations) {
    for (const bool fresh : {true, false}) {
        int calls = 0;
        Sweep(
            [&](int n) {
                calls = 0;
                session().host().factory().SetRule([&calls, n](const host::CreationCall& call) {
                    calls = static_cast<int>(call.number);
                    return calls == n ? NCF_E_OUTOFMEMORY : NCF_OK;
                });
            },
            [&] {
                session().host().factory().SetRule({});
                return calls;
            },
            fresh);
    }
}

TEST_P(FaultSweep, OverInterfaceQueries) {
    for (const bool fresh : {true, false}) {
        int calls = 0;
        Sweep(
            [&calls](int n) {
                calls = 0;
                host::SetQueryRule([&calls, n](const GUID&, ncfUInt32 number) {
                    calls = static_cast<int>(number);
                    return calls == n ? NCF_E_OUTOFMEMORY : NCF_OK;
                });
            },
            [&calls] {
                host::SetQueryRule({});
                return calls;
            },
            fresh);
    }
}

TEST_P(FaultSweep, OverFileReads) {
    using read_faults::Fault;
    for (const Fault fault : {Fault::kReadFails, Fault::kReadEnds, Fault::kReadShort,
                              Fault::kSeekFails, Fault::kOpenFails}) {
        SCOPED_TRACE("fault " + std::to_string(static_cast<int>(fault)));
        results_.clear();
        // Fewer bytes than asked for are no failure: the rest is read next.
        refusalsAreFelt_ = fault != Fault::kReadShort;
        Sweep([&](int n) { read_faults::Arm(movie_, fault, n); },
              [] {
                  read_faults::Disarm();
                  return read_faults::Calls();
              },
              false);
    }
}

INSTANTIATE_TEST_SUITE_P(Movies, FaultSweep,
                         testing::Values("prores_with_pcm.mov", "h264_with_aac.mov",
                                         "png_alpha.mov", "pcm_s16be.mov",
                                         "timecode_2997_drop.mov"),
                         [](const auto& test) {
                             return std::filesystem::path(test.param).stem().string();
                         });

}  // namespace
