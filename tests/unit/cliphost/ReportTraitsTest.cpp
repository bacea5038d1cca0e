// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportTraits.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>

using cliphost::MediaServed;

namespace {

std::string TraitsOf(const std::vector<std::string>& notices) {
    nlohmann::ordered_json facts = nlohmann::ordered_json::object();
    cliphost::AddServedMedia(MediaServed(notices), facts);
    std::string text;
    for (const auto& trait : facts.value("traits", nlohmann::ordered_json::array())) {
        text += (text.empty() ? "" : "; ") + trait["words"].get<std::string>();
    }
    return text;
}

TEST(ServedMediaOfMovies, AreToldWithTheReasonBeforeThem) {
    EXPECT_EQ(TraitsOf({"The movie contains alpha.", "Forcing sample provider mode for video.",
                        "An audio bit rate of 8 was found.",
                        "Forcing sample provider mode for audio track 2."}),
              "video: The movie contains alpha.; audio track 2: An audio bit rate of 8 was found.");
}

TEST(ServedMediaOfMovies, AreForTheirCodecWhereNoReasonIsTold) {
    EXPECT_EQ(TraitsOf({"Forcing sample provider mode for video.", "Color primaries unavailable",
                        "Forcing sample provider mode for audio track 2."}),
              "video: the data files have no whole record of its codec; audio track 2: it is no "
              "linear PCM");
}

TEST(ServedMediaOfMovies, AreNoneWhereTheModuleTellsNothing) {
    EXPECT_EQ(TraitsOf({}), "");
    EXPECT_EQ(TraitsOf({"Something else"}), "");
}

}  // namespace
