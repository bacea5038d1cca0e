// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What `catalog` keeps of movies, what an update and a merge make of it, and what `find` prints.

#include "reference_host/catalog/Catalog.h"

#include <signal.h>

#include <fstream>
#include <nlohmann/json.hpp>
#include <regex>
#include <sstream>

#include "reference_host/catalog/FindQuery.h"
#include "reference_host/catalog/Schema.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using catalog::Database;
using Json = nlohmann::ordered_json;
using Rows = std::vector<std::string>;

std::string TextOf(const std::filesystem::path& file) {
    std::ostringstream text;
    text << std::ifstream(file, std::ios::binary).rdbuf();
    return text.str();
}

class Catalogs : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    void Copy(const std::string& made, const std::string& name) {
        std::filesystem::create_directories((folder() / name).parent_path());
        std::filesystem::copy_file(MadeMovie(made), folder() / name,
                                   std::filesystem::copy_options::overwrite_existing);
    }
    // The program in the test's folder; both streams.
    CommandResult Run(const std::string& arguments) {
        return RunCommand("cd " + Quoted(folder()) + " && " + Quoted(ProgramFolder() / "cliphost") +
                          " " + arguments + " 2>&1");
    }
    // Rows of an answer, their cells with bars between.
    Rows Ask(const std::string& sql, const std::string& name = "c.sqlite") {
        Database database(folder() / name, Database::Access::Read);
        Rows rows;
        for (catalog::Statement select = database.Prepare(sql); select.Step();) {
            std::string row;
            for (int column = 0; column < select.Columns(); ++column) {
                row += (column == 0 ? "" : "|") + select.Text(column);
            }
            rows.push_back(row);
        }
        return rows;
    }
    // Of the movies, from the test's folder on.
    Rows Names(const std::string& name = "c.sqlite") {
        Rows paths = Ask("SELECT path FROM movies ORDER BY path", name);
        for (std::string& path : paths) {
            path = std::filesystem::path(path).lexically_relative(folder()).native();
        }
        return paths;
    }
    // All rows of all tables in their order, but for what tells when they were made.
    Rows Content(const std::string& name = "c.sqlite") {
        Rows all;
        for (std::size_t i = 0; i < catalog::kTableCount; ++i) {
            std::string columns =
                std::string(catalog::kTables[i].key) + ", " + catalog::kTables[i].columns;
            if (const std::size_t at = columns.find("looked, "); at != std::string::npos) {
                columns.erase(at, 8);
            }
            for (const std::string& row :
                 Ask("SELECT " + columns + " FROM " + catalog::kTables[i].name, name)) {
                all.push_back(catalog::kTables[i].name + row);
            }
        }
        for (const std::string& row :
             Ask("SELECT rowid, name, path, codec, sound, columns FROM texts ORDER BY rowid",
                 name)) {
            all.push_back("texts" + row);
        }
        EXPECT_EQ(Ask("SELECT * FROM pragma_integrity_check", name), Rows{"ok"});
        return all;
    }
    // Whatever is in the folder besides what the test put there.
    std::size_t FilesNamed(const std::string& part) {
        std::size_t count = 0;
        for (const auto& entry : std::filesystem::directory_iterator(folder())) {
            count += entry.path().filename().native().find(part) != std::string::npos ? 1 : 0;
        }
        return count;
    }
};

// Values as ffprobe tells them of the same files.
TEST_F(Catalogs, KeepWhatMoviesAre) {
    ExpectSays(Run("catalog " + Quoted(MadeMoviesFolder()) + " -o c.sqlite"), 0,
               " catalogued, 0 not\n");
    const auto of = [&](const std::string& columns, const std::string& name) {
        const Rows rows = Ask("SELECT " + columns + " FROM movies WHERE name = '" + name + "'");
        return rows.size() == 1 ? rows[0] : std::to_string(rows.size()) + " rows";
    };
    constexpr char kPicture[] =
        "codec, codec_name, width, height, alpha, rate_numerator, rate_denominator, length, start";
    EXPECT_EQ(of(kPicture, "dv_ntsc"), "dvc |DV25 NTSC|720|480|0|30000|1001|2|00:00:00:00");
    EXPECT_EQ(of(kPicture, "prores_4444_alpha"),
              "ap4h|Apple ProRes 4444|1280|720|1|25|1|2|00:00:00:00");
    EXPECT_EQ(of(kPicture, "xdcam_ex_1080i50"), "xdvc|XDCAM EX|1920|1080|0|25|1|2|00:00:00:00");
    EXPECT_EQ(of("start", "timecode_24"), "01:02:03:04");
    EXPECT_EQ(of("start", "timecode_2997_drop"), "01:00:00;00");
    EXPECT_EQ(of("start", "timecode_2997_nondrop"), "01:00:00:00");
    EXPECT_EQ(of("route, sound_codec, sound_name, sound_rate, channels, failed", "h264_with_aac"),
              "header|mp4a|AAC|48000|2|0");
    EXPECT_EQ(of("sound_name, channels, codec", "pcm_u8"), "Linear PCM|2|");
    EXPECT_EQ(Ask("SELECT number, kind, tracks.channels FROM tracks JOIN movies ON id = movie "
                  "WHERE name = "
                  "'three_sounds' ORDER BY number"),
              (Rows{"0|picture|", "1|sound|1", "2|sound|2", "3|sound|6"}));
    EXPECT_EQ(Ask("SELECT class, properties ->> 'StoredWidth' FROM descriptors JOIN movies ON id = "
                  "movie WHERE name = 'dv_pal'"),
              Rows{"CDCIDescriptor|720"});
    EXPECT_EQ(Ask("SELECT columns.name, value FROM columns JOIN movies ON id = movie WHERE "
                  "movies.name = 'mjpeg' AND columns.name IN ('Video', 'Image Aspect Ratio')"),
              (Rows{"Video|Photo - JPEG", "Image Aspect Ratio|4:3"}));
    EXPECT_EQ(Ask("SELECT count(*) FROM thumbnails"), Rows{"0"});
    // The ids are those of the description.
    const Json described =
        Json::parse(Run("describe " + Quoted(MadeMovie("mjpeg.mov")) + " --json").out);
    EXPECT_EQ(of("master_mob", "mjpeg"), described[0]["description"]["Mobs"][0]["MobID"]);
}

// By the same table as `describe`, with the same rules.
TEST_F(Catalogs, TakeColumnsOfATable) {
    for (const char* const name : {"in/a.mov", "in/b.mov", "in/c.mov"}) {
        Copy("png.mov", name);
    }
    const auto table = [&](const std::string& text) {
        std::ofstream(folder() / "list.csv", std::ios::binary) << text;
    };
    table("name,reel,start timecode,Scene\na,A001,10:00:00:05,\"12 \"\"x\"\"\"\nb,B001,,7\nz,,,\n");
    for (const char* const jobs : {"1", "2"}) {
        const CommandResult ran =
            Run("catalog in -o c.sqlite --columns list.csv --jobs " + std::string(jobs));
        ExpectSays(ran, 0, "3 catalogued, 0 not\n");
        ExpectSays(ran, 0, "list.csv: row 4: no movie is z\n");
        EXPECT_EQ(Ask("SELECT movies.name, columns.name, value FROM columns JOIN movies ON id = "
                      "movie WHERE columns.name IN ('Reel', 'Scene') ORDER BY 1, 2"),
                  (Rows{"a|Reel|A001", "a|Scene|12 \"x\"", "b|Reel|B001", "b|Scene|7"}));
        EXPECT_EQ(Ask("SELECT name, start FROM movies ORDER BY name"),
                  (Rows{"a|10:00:00:05", "b|00:00:00:00", "c|00:00:00:00"}));
    }
    EXPECT_EQ(Run("find c.sqlite 'reel:A0*' -0").out,
              (folder() / "in/a.mov").native() + std::string(1, '\0'));
    EXPECT_EQ(Run("find c.sqlite tape:B001").status, 0);
    EXPECT_EQ(Run("find c.sqlite A001").status, 0);
    // Ids, tracks and descriptors are those without a table.
    Run("catalog in -o plain.sqlite");
    constexpr char kSame[] =
        "SELECT path, master_mob, file_mob, source_mob, codec, length, class, properties FROM "
        "movies JOIN descriptors ON id = movie ORDER BY path";
    EXPECT_EQ(Ask(kSame), Ask(kSame, "plain.sqlite"));
    // Another table makes other rows.
    const std::string update = "catalog in -o c.sqlite --columns list.csv --update";
    ExpectSays(Run(update), 0, "0 catalogued, 0 not, 3 as before");
    table("name,reel,start\na,A002,\nc,,01:00:00:25\n");
    const CommandResult ran = Run(update);
    ExpectSays(ran, 2, "list.csv: row 3, column start: '01:00:00:25' is no timecode at 25 frames");
    ExpectSays(ran, 2, "2 catalogued, 1 not");
    EXPECT_EQ(Ask("SELECT value FROM columns WHERE name = 'Reel'"), Rows{"A002"});
    EXPECT_EQ(Ask("SELECT name FROM movies WHERE failed"), Rows{"c"});
    // What a row may mean is known before anything is read.
    Copy("png.mov", "in/sub/a.mov");
    const Rows content = Content();
    ExpectSays(Run(update + " --recursive"), 2, "list.csv: row 2: a may be ");
    EXPECT_EQ(Content(), content);
    ExpectSays(Run("catalog --merge c.sqlite -o d.sqlite --columns list.csv"), 2, "excludes");
    ExpectSays(Run("catalog in -o list.csv --columns list.csv"), 2, "list.csv: is no SQLite file");
}

TEST_F(Catalogs, OfTheSecondRouteKnowCodecsToo) {
    Make(
        "-f lavfi -i testsrc2=s=64x48:r=25:d=1 -f lavfi -i sine=d=1:r=48000 -c:v mpeg2video -c:a "
        "pcm_s16le",
        "a.mxf");
    ExpectSays(Run("catalog a.mxf -o c.sqlite"), 0, "1 catalogued, 0 not\n");
    EXPECT_EQ(Ask("SELECT route, width, height, codec_name, sound_name, channels FROM movies"),
              Rows{"library|64|48|MPEG-2 Video|Linear PCM|1"});
    EXPECT_NE(Ask("SELECT route_reason FROM movies"), Rows{""});
}

TEST_F(Catalogs, NameWhatCantBeDescribedAsWhatCan) {
    const std::string name = "caf\xE9\xFF x.mov";  // no UTF-8
    Copy("png.mov", "in/" + name);
    std::filesystem::create_directory(folder() / "other");
    Write(movies::Bytes(100, 'x'), "other/" + name);
    Run("catalog in other -o c.sqlite");
    RunCommand("cd / && " + Quoted(ProgramFolder() / "cliphost") + " catalog " + In("in") + " " +
               In("other") + " -o " + In("d.sqlite") + " 2>&1");
    const std::string shown = "caf\xEF\xBF\xBD\xEF\xBF\xBD x";
    for (const char* const catalog : {"c.sqlite", "d.sqlite"}) {
        EXPECT_EQ(Ask("SELECT name, failed FROM movies ORDER BY failed", catalog),
                  (Rows{shown + "|0", shown + "|1"}));
    }
}

TEST_F(Catalogs, KnowWhereAPathBehindALinkLeads) {
    Copy("png.mov", "real/a.mov");
    std::filesystem::create_directory(folder() / "real/sub");
    std::filesystem::create_directory_symlink("real/sub", folder() / "link");
    const Rows real{"real/a.mov"};
    ExpectSays(Run("catalog link/.. --extensions mov -o c.sqlite"), 0, "1 catalogued");
    EXPECT_EQ(Names(), real);
    ExpectSays(Run("catalog link/.. --extensions mov -o c.sqlite --update"), 0,
               "0 catalogued, 0 not, 1 as before, 0 gone\n");
    for (const char* const call : {"link/../a.mov", "link/..", "real/../link/../a.mov"}) {
        ExpectSays(Run(std::string("catalog ") + call + " -o other.sqlite"), 0,
                   "1 catalogued, 0 not\n");
        EXPECT_EQ(Content("other.sqlite"), Content()) << call;
    }
}

TEST_F(Catalogs, AreTheSameOfOneProcessAndOfSeveral) {
    for (const char* const name : {"png.mov", "aac.mov", "timecode_25.mov"}) {
        Copy(name, std::string("in/") + name);
    }
    Write(movies::Bytes(100, 'x'), "in/bad.mov");
    ExpectSays(Run("catalog in -o one.sqlite --thumbnails --jobs 1"), 1, "3 catalogued, 1 not\n");
    ExpectSays(Run("catalog in -o two.sqlite --thumbnails --jobs 2"), 1, "3 catalogued, 1 not\n");
    EXPECT_EQ(Content("one.sqlite"), Content("two.sqlite"));
    EXPECT_EQ(Ask("SELECT name, kind FROM warnings JOIN movies ON id = movie", "two.sqlite"),
              Rows{"bad|failure"});
    EXPECT_EQ(Ask("SELECT name, type, thumbnails.width, thumbnails.height, hex(substr(picture, 1, "
                  "4)) FROM thumbnails JOIN movies ON id = movie ORDER BY name",
                  "two.sqlite"),
              (Rows{"png|image/png|160|120|89504E47", "timecode_25|image/png|160|120|89504E47"}));
}

TEST_F(Catalogs, OfSharesMergeToThatOfASingleRun) {
    for (int i = 0; i < 12; ++i) {
        Copy(i % 2 == 0 ? "png.mov" : "aac.mov", "in/" + std::to_string(i) + ".mov");
    }
    std::string shares;
    for (const char* const share : {"1", "2", "3"}) {
        Run("catalog in -o " + std::string(share) + ".sqlite --shard " + share + "/3");
        shares = std::string(share) + ".sqlite " + shares;
    }
    ExpectSays(Run("catalog --merge " + shares + "-o merged.sqlite"), 0,
               "12 movies of 3 catalogs\n");
    Run("catalog in -o c.sqlite");
    EXPECT_EQ(Content("merged.sqlite"), Content());
    EXPECT_EQ(Names().size(), 12u);
    // It may be one of those that it is made of.
    ExpectSays(Run("catalog --merge 1.sqlite merged.sqlite -o merged.sqlite"), 0, "12 movies");
    EXPECT_EQ(Content("merged.sqlite"), Content());
    ExpectSays(Run("catalog --merge 1.sqlite missing.sqlite -o merged.sqlite"), 2,
               "missing.sqlite: there is no such file or folder");
    EXPECT_EQ(Names("merged.sqlite").size(), 12u);
    for (const char* const option : {"--jobs 2", "--limit-seconds 5", "--limit-memory 500",
                                     "--thumbnails", "--shard 1/2", "--recursive"}) {
        ExpectSays(Run("catalog --merge 1.sqlite -o other.sqlite " + std::string(option)), 2,
                   "--merge excludes --");
    }
    EXPECT_EQ(FilesNamed("other.sqlite"), 0u);
    // What can't be read doesn't keep the rest from being merged.
    Write(movies::Bytes(4096, 'x'), "bad.sqlite");
    std::string damaged = TextOf(folder() / "2.sqlite");
    std::fill(damaged.begin() + 4096, damaged.end(), '\x55');
    std::ofstream(folder() / "damaged.sqlite", std::ios::binary) << damaged;
    const CommandResult rest =
        Run("catalog --merge 1.sqlite bad.sqlite damaged.sqlite 2.sqlite 3.sqlite -o rest.sqlite");
    ExpectSays(rest, 2, "12 movies of 3 catalogs\n");
    ExpectSays(rest, 2, "bad.sqlite: is no SQLite file, so it is no catalog\n");
    ExpectSays(rest, 2, "damaged.sqlite: the catalog is damaged: ");
    EXPECT_EQ(Content("rest.sqlite"), Content());
    ExpectSays(Run("catalog --merge 1.sqlite bad.sqlite -o rest.sqlite"), 2,
               "rest.sqlite: the catalog is left as it was\n");
    EXPECT_EQ(Content("rest.sqlite"), Content());
    ExpectSays(Run("catalog --merge bad.sqlite -o none.sqlite"), 2, "none.sqlite: not written\n");
    EXPECT_EQ(FilesNamed("none.sqlite"), 0u);
}

TEST_F(Catalogs, AreUpdatedWhereSomethingHasChanged) {
    for (const char* const name :
         {"in/a.mov", "in/b.mov", "in/c.mov", "other/x.mov", "in/sub/s.mov"}) {
        Copy("png.mov", name);
    }
    Write(movies::Bytes(100, 'x'), "in/bad.mov");
    ExpectSays(Run("catalog in other --recursive -o c.sqlite --update"), 1,
               "5 catalogued, 1 not, 0 as before, 0 gone\n");
    EXPECT_EQ(FilesNamed("c.sqlite"), 1u);
    const Rows before =
        Ask("SELECT path, looked FROM movies WHERE name IN ('a', 'x') ORDER BY path");
    Copy("aac.mov", "in/b.mov");
    Copy("png.mov", "in/d.mov");
    std::filesystem::remove(folder() / "in/c.mov");
    std::filesystem::remove(folder() / "other/x.mov");
    const CommandResult second = Run("catalog in -o c.sqlite --update");
    ExpectSays(second, 1, "2 catalogued, 1 not, 1 as before, 1 gone\n");
    ExpectSays(second, 1, "in/c.mov: is gone, and is removed from the catalog\n");
    EXPECT_EQ(Names(), (Rows{"in/a.mov", "in/b.mov", "in/bad.mov", "in/d.mov", "in/sub/s.mov",
                             "other/x.mov"}));
    EXPECT_EQ(Ask("SELECT path, looked FROM movies WHERE name IN ('a', 'x') ORDER BY path"),
              before);
    EXPECT_EQ(Ask("SELECT sound_codec FROM movies WHERE name = 'b'"), Rows{"mp4a"});
    EXPECT_EQ(Ask("SELECT count(*) FROM texts WHERE texts MATCH 'c'"), Rows{"0"});
    // The same call, once more: a failure is tried again, all else is left alone.
    ExpectSays(Run("catalog in -o c.sqlite --update"), 1,
               "0 catalogued, 1 not, 3 as before, 0 gone\n");
    // Other options make other rows.
    ExpectSays(Run("--editor-rate 24 catalog in -o c.sqlite --update"), 1,
               "3 catalogued, 1 not, 0 as before, 0 gone\n");
    // What an update leaves is what a run from nothing writes.
    Run("--editor-rate 24 catalog in other --recursive -o c.sqlite --update");
    Copy("png.mov", "other/y.mov");
    Run("--editor-rate 24 catalog in other --recursive -o c.sqlite --update");
    Run("--editor-rate 24 catalog in other --recursive -o fresh.sqlite");
    EXPECT_EQ(Content(), Content("fresh.sqlite"));
}

TEST_F(Catalogs, KeepWhatTheCallWouldNotHaveFound) {
    for (const char* const name : {"in/a.mov", "in/b.mov", "in/m.mp4", "in/sub/s.mov", "sole/z.mov",
                                   "sole/zz.mov", "named/n.mov", "named/o.mov"}) {
        Copy("png.mov", name);
    }
    Run("catalog in sole named --recursive --extensions mov,mp4 -o c.sqlite");
    const Rows all = Names();
    ASSERT_EQ(all.size(), 8u);
    for (const char* const name : {"in/b.mov", "in/m.mp4", "in/sub/s.mov"}) {
        std::filesystem::remove(folder() / name);
    }
    Write(movies::Bytes(1, 'x'), "in/sub/notes");
    std::filesystem::remove_all(folder() / "sole");
    std::filesystem::create_directory(folder() / "sole");  // as where nothing is mounted
    // Neither endings nor folders within nor other shares are meant.
    ExpectSays(Run("catalog in -o c.sqlite --update --extensions mxf,mov --shard 1/1"), 0,
               "1 gone\n");
    EXPECT_EQ(Names().size(), 7u);
    EXPECT_EQ(Run("catalog sole -o c.sqlite --update").status, 1);
    EXPECT_EQ(Names().size(), 7u);
    std::filesystem::remove(folder() / "named/n.mov");
    ExpectSays(Run("catalog named/n.mov -o c.sqlite --update"), 2, "1 gone\n");
    std::filesystem::remove_all(folder() / "named");
    ExpectSays(Run("catalog named/o.mov -o c.sqlite --update"), 2, "0 gone\n");
    EXPECT_EQ(Names(), (Rows{"in/a.mov", "in/m.mp4", "in/sub/s.mov", "named/o.mov", "sole/z.mov",
                             "sole/zz.mov"}));
    // A share removes its own alone.
    int gone = 0;
    for (const char* const share : {"1/2", "2/2"}) {
        const CommandResult ran =
            Run("catalog in -o c.sqlite --update --recursive --extensions mov,mp4 "
                "--shard " +
                std::string(share));
        std::smatch count;
        ASSERT_TRUE(std::regex_search(ran.out, count, std::regex("(\\d) gone\n"))) << ran.out;
        gone += std::stoi(count[1]);
    }
    EXPECT_EQ(gone, 2);
}

// As where nothing is mounted.
TEST_F(Catalogs, StayWhereNoMovieIsFound) {
    Copy("png.mov", "in/a.mov");
    std::filesystem::create_directory(folder() / "empty");
    std::ofstream(folder() / "list") << "gone.mov\nin/gone.mov\n";
    Run("catalog in -o c.sqlite");
    const std::string before = TextOf(folder() / "c.sqlite");
    for (const char* const call : {"empty", "empty --recursive", "gone.mov", "gone",
                                   "--files-from list", "empty --extensions mov --shard 1/4"}) {
        const CommandResult ran = Run(std::string("catalog -o c.sqlite ") + call);
        EXPECT_GE(ran.status, 1) << call;
        EXPECT_NE(ran.out.find("c.sqlite: no movie was found; the catalog is left as it was\n"),
                  std::string::npos)
            << ran.out;
        EXPECT_TRUE(TextOf(folder() / "c.sqlite") == before) << call;
        EXPECT_EQ(FilesNamed("c.sqlite"), 1u) << call;
    }
    ExpectSays(Run("catalog -o c.sqlite empty --jsonl"), 1,
               "\"reason\":\"no movie was found; the catalog is left as it was\"");
    // One that can't be described was found.
    Write(movies::Bytes(100, 'x'), "bad.mov");
    Run("catalog bad.mov -o c.sqlite");
    EXPECT_EQ(Names(), Rows{"bad.mov"});
    // There is none to keep.
    EXPECT_EQ(Run("catalog empty -o new.sqlite").status, 1);
    EXPECT_EQ(Names("new.sqlite"), Rows{});
}

// A catalog without pictures gets those of movies that stayed as they were, too.
TEST_F(Catalogs, GetThumbnailsLater) {
    Copy("png.mov", "in/a.mov");
    Copy("aac.mov", "in/sound.mov");
    Run("catalog in -o c.sqlite");
    for (const char* const summary : {"2 catalogued, 0 not, 0 as before, 0 gone\n",
                                      "0 catalogued, 0 not, 2 as before, 0 gone\n"}) {
        ExpectSays(Run("catalog in -o c.sqlite --update --thumbnails"), 0, summary);
        EXPECT_EQ(Ask("SELECT name FROM thumbnails JOIN movies ON id = movie"), Rows{"a"});
    }
}

// As where a disk goes away in the midst of a run.
TEST_F(Catalogs, KeepAFolderThatGoesAwayDuringTheRun) {
    for (const char* const name : {"in/a.mov", "in/b.mov", "in/sub/c.mov"}) {
        Copy("png.mov", name);
    }
    Run("catalog in --recursive -o c.sqlite");
    Copy("png.mov", "in/new.mov");
    std::filesystem::remove(folder() / "in/b.mov");
    for (const char* const left : {"", "notes"}) {
        {
            // The run waits where it would write what it has read.
            Database other(folder() / "c.sqlite", Database::Access::Change);
            other.Run("BEGIN IMMEDIATE");
            RunCommand("cd " + Quoted(folder()) + "; rm -f told ended; { " +
                       Quoted(ProgramFolder() / "cliphost") +
                       " catalog in --recursive --update -o c.sqlite; echo >ended; } >told 2>&1 & "
                       "sleep 2");
            std::filesystem::rename(folder() / "in", folder() / "away");
            std::filesystem::create_directory(folder() / "in");
            if (*left) {
                Write(movies::Bytes(1, 'x'), std::string("in/") + left);
            }
            other.Run("ROLLBACK");
        }
        RunCommand("cd " + Quoted(folder()) +
                   "; for i in $(seq 600); do [ -e ended ] && break; sleep 0.1; done");
        const std::string told = TextOf(folder() / "told");
        EXPECT_NE(told.find("1 catalogued, 0 not, 2 as before, 0 gone\n"), std::string::npos)
            << told;
        EXPECT_EQ(Names(), (Rows{"in/a.mov", "in/b.mov", "in/new.mov", "in/sub/c.mov"}));
        std::filesystem::remove_all(folder() / "in");
        std::filesystem::rename(folder() / "away", folder() / "in");
        Copy("aac.mov", "in/new.mov");  // to be read again
    }
}

TEST_F(Catalogs, KeepFoldersWithinThatMayNotBeMounted) {
    for (const char* const name : {"in/a.mov", "in/disk/b.mov", "in/other/c.mov", "in/d/e.mov"}) {
        Copy("png.mov", name);
    }
    Run("catalog in --recursive -o c.sqlite");
    for (const char* const name : {"in/disk", "in/other", "in/d/e.mov"}) {
        std::filesystem::remove_all(folder() / name);
    }
    std::filesystem::create_directory(folder() / "in/disk");
    Copy("png.mov", "in/d/f.mov");
    ExpectSays(Run("catalog in --recursive -o c.sqlite --update"), 0, "1 as before, 1 gone\n");
    EXPECT_EQ(Names(), (Rows{"in/a.mov", "in/d/f.mov", "in/disk/b.mov", "in/other/c.mov"}));
}

TEST_F(Catalogs, KeepLinksThatLeadNowhere) {
    for (const char* const name : {"in/a.mov", "disk/b.mov"}) {
        Copy("png.mov", name);
    }
    std::filesystem::create_symlink(folder() / "disk/b.mov", folder() / "in/b.mov");
    ExpectSays(Run("catalog in -o c.sqlite --extensions mov"), 0, "2 catalogued");
    std::filesystem::remove_all(folder() / "disk");
    for (const char* const call : {"in", "in/b.mov"}) {
        Run("catalog " + std::string(call) + " -o c.sqlite --update --extensions mov");
        EXPECT_EQ(Names(), (Rows{"in/a.mov", "in/b.mov"})) << call;
    }
    std::filesystem::remove(folder() / "in/b.mov");
    ExpectSays(Run("catalog in -o c.sqlite --update --extensions mov"), 0, "1 gone\n");
}

TEST_F(Catalogs, TakeThePlaceOfCatalogsAlone) {
    Copy("png.mov", "in/a.mov");
    for (const std::string& content :
         {std::string(), std::string("text"), std::string(4096, 'x')}) {
        std::ofstream(folder() / "other", std::ios::binary) << content;
        for (const char* const update : {"", " --update"}) {
            EXPECT_EQ(Run(std::string("catalog in -o other") + update).status, 2);
            EXPECT_EQ(TextOf(folder() / "other"), content);
        }
    }
    std::ofstream(folder() / "empty").close();
    ExpectSays(Run("catalog in -o empty --update"), 2,
               "empty: the file is empty; remove it, and make it anew\n");
    ExpectSays(Run("find in"), 2, "in: this is a folder; name a catalog in it\n");
    ExpectSays(Run("catalog in -o other"), 2, "other: is no SQLite file, so it is no catalog");
    Database(folder() / "foreign", Database::Access::Make).Run("CREATE TABLE movies (a)");
    ExpectSays(Run("catalog in -o foreign"), 2, "foreign: is no catalog of this program");
    ExpectSays(Run("find foreign"), 2, "foreign: is no catalog of this program");
    for (const char* const place : {"in", "-", "/dev/null", "in/a.mov"}) {
        EXPECT_EQ(Run(std::string("catalog in -o ") + place).status, 2) << place;
    }
    EXPECT_EQ(TextOf(folder() / "in/a.mov"), TextOf(MadeMovie("png.mov")));
    Run("catalog in -o c.sqlite");
    Database(folder() / "c.sqlite", Database::Access::Change).Run("PRAGMA user_version = 99");
    for (const char* const call : {"find c.sqlite", "catalog in -o c.sqlite --update",
                                   "catalog --merge c.sqlite -o d.sqlite"}) {
        ExpectSays(Run(call), 2, "c.sqlite: is a catalog of version 99, and this program knows");
    }
    ExpectSays(Run("catalog in -o c.sqlite"), 2, "c.sqlite: is a catalog of version 99");
    EXPECT_EQ(FilesNamed("d.sqlite"), 0u);
}

// All begin at once, where no catalog is yet.
TEST_F(Catalogs, AreMadeBySeveralUpdatesTogether) {
    for (int i = 0; i < 8; ++i) {
        Copy("png.mov", "in/" + std::to_string(i) + ".mov");
    }
    for (int round = 0; round < 4; ++round) {
        const CommandResult ran = RunCommand(
            "cd " + Quoted(folder()) + "; for i in 1 2 3 4; do " +
            Quoted(ProgramFolder() / "cliphost") +
            " catalog in -o c.sqlite --update --jobs 1 --shard $i/4 2>&1 || echo failed & done; "
            "wait");
        EXPECT_EQ(ran.out.find("failed"), std::string::npos) << ran.out;
        EXPECT_EQ(Names().size(), 8u) << ran.out;
        EXPECT_EQ(FilesNamed("c.sqlite"), 1u);
        std::filesystem::remove(folder() / "c.sqlite");
    }
}

// As a program leaves it that is killed while it writes.
TEST_F(Catalogs, TakeNothingOfWhatLiesBesideAnOlderOne) {
    for (const char* const name : {"in/a.mov", "other/b.mov"}) {
        Copy("png.mov", name);
    }
    Run("catalog in -o c.sqlite");
    {
        Database killed(folder() / "c.sqlite", Database::Access::Change);
        killed.Run("PRAGMA cache_size = 1; BEGIN; UPDATE movies SET name = 'half written'");
        killed.Run(
            "CREATE TABLE big (a); WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n "
            "WHERE i < 200) INSERT INTO big SELECT zeroblob(2000) FROM n");
        std::filesystem::copy_file(folder() / "c.sqlite", folder() / "d.sqlite");
        std::filesystem::copy_file(folder() / "c.sqlite-journal", folder() / "left");
    }
    std::filesystem::copy_file(folder() / "left", folder() / "d.sqlite-journal");
    // What is half written is taken back by whoever reads first.
    ExpectSays(Run("find d.sqlite name:a"), 0, "in/a.mov: ");
    for (const char* const file : {"c.sqlite", "new.sqlite"}) {
        for (const char* const ending : {"-journal", "-wal", "-shm"}) {
            std::filesystem::copy_file(folder() / "left", folder() / (file + std::string(ending)));
        }
        ExpectSays(Run("catalog other -o " + std::string(file)), 0, "1 catalogued");
        EXPECT_EQ(FilesNamed(file), 1u);
        EXPECT_EQ(Names(file), Rows{"other/b.mov"});
        EXPECT_EQ(Ask("SELECT * FROM pragma_integrity_check", file), Rows{"ok"});
    }
}

TEST_F(Catalogs, WaitForALockAndThenSaySo) {
    Copy("png.mov", "in/a.mov");
    Run("catalog in -o c.sqlite");
    {
        Database other(folder() / "c.sqlite", Database::Access::Change);
        other.Run("BEGIN EXCLUSIVE");
        ExpectSays(Run("find c.sqlite"), 2, "another program has kept it locked for 5 seconds");
        ExpectSays(Run("catalog in -o c.sqlite --update"), 2, "another program has kept it locked");
    }
    {
        // Who only prepares to write stops no reader.
        Database other(folder() / "c.sqlite", Database::Access::Change);
        other.Run("BEGIN IMMEDIATE");
        EXPECT_EQ(Run("find c.sqlite").status, 0);
        // Nor an update that has nothing to write.
        ExpectSays(Run("catalog in -o c.sqlite --update"), 0, "0 catalogued, 0 not, 1 as before");
        Copy("png.mov", "in/b.mov");
        ExpectSays(Run("catalog in -o c.sqlite --update"), 2, "another program has kept it locked");
    }
    ExpectSays(Run("catalog in -o c.sqlite --update"), 0, "1 catalogued, 0 not, 1 as before");
}

TEST_F(Catalogs, LoseNothingOnAFullDisk) {
    std::filesystem::create_directory(folder() / "disk");
    if (RunCommand("mount -t tmpfs -o size=160k tmpfs " + In("disk") + " 2>&1").status != 0) {
        GTEST_SKIP() << "no file system can be mounted here";
    }
    ExpectSays(Run("catalog " + Quoted(MadeMoviesFolder()) + " -o disk/c.sqlite"), 2,
               "disk/c.sqlite: not written: No space left on device");
    EXPECT_TRUE(std::filesystem::is_empty(folder() / "disk"));
    Copy("png.mov", "in/a.mov");
    ExpectSays(Run("catalog in -o disk/c.sqlite --update"), 0, "1 catalogued");
    for (const char* const update : {" --update", ""}) {
        ExpectSays(Run("catalog " + Quoted(MadeMoviesFolder()) + " -o disk/c.sqlite" + update), 2,
                   "disk/c.sqlite: not written: No space left on device");
        EXPECT_EQ(Names("disk/c.sqlite"), Rows{"in/a.mov"});
    }
    // A merge blames what is full, and not what it reads.
    Run("catalog " + Quoted(MadeMoviesFolder()) + " -o all.sqlite");
    ExpectSays(Run("catalog --merge all.sqlite -o disk/c.sqlite"), 2,
               "cliphost: disk/c.sqlite: not written: No space left on device");
    EXPECT_EQ(Names("disk/c.sqlite"), Rows{"in/a.mov"});
    RunCommand("umount " + In("disk"));
}

TEST_F(Catalogs, OfAReadOnlyDiskAreRead) {
    Copy("png.mov", "in/a.mov");
    std::filesystem::create_directory(folder() / "disk");
    if (RunCommand("mount -t tmpfs tmpfs " + In("disk") + " 2>&1").status != 0) {
        GTEST_SKIP() << "no file system can be mounted here";
    }
    Run("catalog in -o disk/c.sqlite");
    RunCommand("mount -o remount,ro " + In("disk"));
    ExpectSays(Run("find disk/c.sqlite"), 0, "in/a.mov: ");
    Copy("png.mov", "in/b.mov");
    for (const char* const update : {" --update", ""}) {
        ExpectSays(Run(std::string("catalog in -o disk/c.sqlite") + update), 2,
                   "disk/c.sqlite: not written: ");
    }
    std::filesystem::remove(folder() / "in/b.mov");
    ExpectSays(Run("catalog in -o disk/c.sqlite --update"), 0, "0 catalogued, 0 not, 1 as before");
    EXPECT_EQ(Names("disk/c.sqlite"), Rows{"in/a.mov"});
    RunCommand("umount " + In("disk"));
}

TEST_F(Catalogs, OfDamagedFilesSaySo) {
    for (int i = 0; i < 30; ++i) {
        Copy("png.mov", "in/" + std::to_string(i) + ".mov");
    }
    Run("catalog in -o c.sqlite");
    std::string bytes = TextOf(folder() / "c.sqlite");
    std::fill(bytes.begin() + 4096, bytes.end(), '\x55');
    std::ofstream(folder() / "c.sqlite", std::ios::binary) << bytes;
    ExpectSays(Run("find c.sqlite png"), 2, "c.sqlite: the catalog is damaged: ");
    ExpectSays(Run("catalog in -o c.sqlite --update"), 2, "make it anew, without --update\n");
    ExpectSays(Run("catalog in -o c.sqlite"), 0, "30 catalogued");
    EXPECT_EQ(Names().size(), 30u);
    for (const std::uintmax_t size : {5000, 4096, 1000, 100}) {
        std::filesystem::resize_file(folder() / "c.sqlite", size);
        EXPECT_EQ(Run("catalog in -o c.sqlite --update").status, 2) << size;
        ExpectSays(Run("catalog in -o c.sqlite"), 0, "30 catalogued");
        EXPECT_EQ(Names().size(), 30u) << size;
    }
}

// A run over many movies that a signal ends in the midst, once `begun` says so.
class StoppedCatalogs : public Catalogs {
protected:
    static constexpr int kMovies = 250;

    void SetUp() override {
        Catalogs::SetUp();
        for (int i = 0; i < kMovies; ++i) {
            Copy("png.mov", "in/" + std::to_string(1000 + i) + ".mov");
        }
    }
    // With `begun`, a command that succeeds as soon as the signal may come.
    std::string Stop(const std::string& arguments, const std::string& signal,
                     const std::string& begun) {
        return RunCommand("cd " + Quoted(folder()) + "; env --default-signal=INT,TERM " +
                          Quoted(ProgramFolder() / "cliphost") + " " + arguments +
                          " >told 2>&1 & for i in $(seq 3000); do " + begun +
                          " && break; sleep 0.002; done; kill -" + signal +
                          " $!; { wait $!; } 2>/dev/null; echo $?")
            .out;
    }
    std::string Told() { return TextOf(folder() / "told"); }
};

TEST_F(StoppedCatalogs, AreWholeAndGoOn) {
    for (const char* const jobs : {"1", "2"}) {
        const std::string ended =
            Stop("catalog in -o c.sqlite --update --limit-memory 2000 --jobs " + std::string(jobs),
                 "TERM", "[ -e c.sqlite ] && sleep 0.15");
        EXPECT_EQ(ended, "143\n");
        EXPECT_NE(Told().find("; the same call with --update goes on\n"), std::string::npos)
            << Told();
        EXPECT_EQ(FilesNamed("c.sqlite"), 1u);
        const std::size_t done = Names().size();
        EXPECT_LT(done, static_cast<std::size_t>(kMovies));
        EXPECT_NE(Told().find(": " + std::to_string(done) + " of " + std::to_string(kMovies) +
                              " movies done, 0 failed"),
                  std::string::npos)
            << Told();
        ExpectSays(Run("catalog in -o c.sqlite --update --limit-memory 2000"), 0,
                   std::to_string(kMovies - done) + " catalogued, 0 not, " + std::to_string(done) +
                       " as before, 0 gone\n");
        EXPECT_EQ(Names().size(), static_cast<std::size_t>(kMovies));
        std::filesystem::remove(folder() / "c.sqlite");
    }
}

TEST_F(StoppedCatalogs, WithoutUpdateKeepTheOneThatWasThere) {
    // A run that is stopped before its first movie makes no catalog.
    for (const char* const pause : {"0.05", "0.15", "0.5", "1.5", "5"}) {
        const std::string wait =
            "[ $(ls | grep -c 'c.sqlite') -gt 0 ] && sleep " + std::string(pause);
        EXPECT_EQ(Stop("catalog in -o c.sqlite --jobs 2", "TERM", wait), "143\n");
        if (std::filesystem::exists(folder() / "c.sqlite")) {
            break;
        }
    }
    EXPECT_NE(Told().find("; the same call with --update goes on\n"), std::string::npos) << Told();
    const Rows first = Content();
    EXPECT_LT(Names().size(), static_cast<std::size_t>(kMovies));
    EXPECT_EQ(FilesNamed("c.sqlite"), 1u);
    // Before its first movie it leaves no word of the catalog, and after its last one nothing as it
    // was.
    const std::string left = "; the catalog is left as it was\n";
    for (const char* const pause : {"0", "0.02", "0.05", "0.1", "0.2", "0.5", "1.5", "5"}) {
        EXPECT_EQ(Stop("catalog in -o c.sqlite --jobs 2", "INT",
                       "[ $(ls | grep -c 'c.sqlite') -gt 1 ] && sleep " + std::string(pause)),
                  "130\n");
        if (Told().find(left) != std::string::npos) {
            break;
        }
    }
    EXPECT_NE(Told().find(left), std::string::npos) << Told();
    EXPECT_EQ(Content(), first);
    EXPECT_EQ(FilesNamed("c.sqlite"), 1u);
}

TEST_F(StoppedCatalogs, AreWholeWhereTheProgramIsKilled) {
    Run("catalog in/1000.mov in/1001.mov -o c.sqlite --update");
    for (const char* const pause : {"0.05", "0.15", "0.3"}) {
        Stop("catalog in -o c.sqlite --update --jobs 2", "KILL", "sleep " + std::string(pause));
        EXPECT_GE(Names().size(), 2u);
        EXPECT_EQ(Ask("SELECT * FROM pragma_integrity_check"), Rows{"ok"});
    }
    ExpectSays(Run("catalog in -o c.sqlite --update"), 0, "catalogued, 0 not");
    Run("catalog in -o fresh.sqlite");
    EXPECT_EQ(Content(), Content("fresh.sqlite"));
}

class FindVerb : public Catalogs {
protected:
    void SetUp() override {
        Catalogs::SetUp();
        Copy("prores_4444_alpha.mov", "in/a b.mov");
        Copy("prores_4444_alpha.mov", "in/copy.mov");
        Copy("timecode_25.mov", "in/tape.mov");
        Copy("png.mov", "in/caf\xE9.mov");  // no UTF-8
        Write(movies::Bytes(100, 'x'), "in/bad.mov");
        Run("catalog in -o c.sqlite");
    }
};

TEST_F(FindVerb, PrintsAMovieInEachLine) {
    const std::string in = (folder() / "in").string();
    EXPECT_EQ(Run("find c.sqlite 'codec:prores rate:25 alpha:yes' copy:yes name:copy").out,
              in + "/copy.mov: 1280 x 720, Apple ProRes 4444, alpha, 25 a second, 0.08 s, from "
                   "00:00:00:00\n");
    EXPECT_EQ(Run("find c.sqlite tc:10:00").out,
              in + "/tape.mov: 320 x 240, Photo - JPEG, 25 a second, 0.16 s, from 10:00:00:00\n");
    EXPECT_EQ(Run("find c.sqlite failed:yes").out, in + "/bad.mov: not described\n");
    const CommandResult all = Run("find c.sqlite");
    EXPECT_EQ(std::count(all.out.begin(), all.out.end(), '\n'), 5);
    EXPECT_NE(all.out.find("caf\\xE9.mov"), std::string::npos) << all.out;
}

TEST_F(FindVerb, KeepsNobodyFromWritingWhileItsReaderRests) {
    Database database(folder() / "c.sqlite", Database::Access::Change);
    database.Run(
        "WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n WHERE i < 5000) INSERT "
        "INTO movies (id, path, name, size, date, looked, settings, failed) SELECT i, '/' || i || "
        "hex(zeroblob(50)), '', 1, 1, 1, '', 0 FROM n");
    const std::string call =
        "exec " + Quoted(ProgramFolder() / "cliphost") + " find " + Quoted(folder() / "c.sqlite");
    std::FILE* const reader = popen(call.c_str(), "r");
    ASSERT_TRUE(reader);
    int c = std::fgetc(reader);  // from here on the pipe is full
    // One that was printed, and one that wasn't.
    EXPECT_NO_THROW(database.Run("DELETE FROM movies WHERE id IN (1, 999)"));
    int lines = 0;
    for (; c != EOF; c = std::fgetc(reader)) {
        lines += c == '\n' ? 1 : 0;
    }
    EXPECT_EQ(pclose(reader), 0);
    EXPECT_EQ(lines, 5004);
}

// What a movie takes is printed before others are read.
TEST_F(FindVerb, HoldsNoMoreOfManyMoviesThanOfFew) {
    const auto memory = [&](int movies, const std::string& form) {
        Database(folder() / "c.sqlite", Database::Access::Change)
            .Run(
                ("DELETE FROM movies; WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM "
                 "n WHERE i < " +
                 std::to_string(movies) +
                 ") INSERT INTO movies (id, path, name, size, date, looked, settings, failed) "
                 "SELECT i, '/' || i || hex(zeroblob(200)), '', 1, 1, 1, '', 0 FROM n")
                    .c_str());
        // At the first byte, in kilobytes.
        const CommandResult ran = RunCommand(
            "cd " + Quoted(folder()) + "; sh -c 'echo $$ >pid; exec \"$0\" find c.sqlite " + form +
            "' " + Quoted(ProgramFolder() / "cliphost") +
            " | { head -c 1 >/dev/null; grep VmHWM /proc/$(cat pid)/status | tr -cd 0-9; }");
        return std::stol(ran.out);
    };
    for (const char* const form : {"", "--json"}) {
        const long few = memory(1000, form);
        EXPECT_LT(memory(60'000, form), few + 15'000) << form;  // of 25 MB and more
    }
}

// All of it, where it takes several readings.
TEST_F(FindVerb, GivesWholeJsonOfManyMovies) {
    Database(folder() / "c.sqlite", Database::Access::Change)
        .Run(
            "DELETE FROM movies; WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n "
            "WHERE i < 1500) INSERT INTO movies (id, path, name, size, date, looked, settings, "
            "failed) SELECT i, printf('/%06d', 1500 - i), '', 1, 1, 1, '', 0 FROM n");
    const std::string printed = Run("find c.sqlite --json").out;
    const Json answer = Json::parse(printed);
    ASSERT_EQ(answer["movies"].size(), 1500u);
    for (std::size_t i = 1; i < 1500; ++i) {
        EXPECT_LT(answer["movies"][i - 1]["path"], answer["movies"][i]["path"]);
    }
    EXPECT_EQ(printed, answer.dump(2) + "\n");
    const std::string none = Run("find c.sqlite nowhere --json").out;
    EXPECT_EQ(none, Json::parse(none).dump(2) + "\n");
}

// What was printed of a catalog that can't be read to its end is no whole answer.
TEST_F(FindVerb, LeavesJsonOpenWhereTheCatalogIsDamaged) {
    Database(folder() / "c.sqlite", Database::Access::Change)
        .Run(
            "DELETE FROM movies; WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n "
            "WHERE i < 5000) INSERT INTO movies (id, path, name, size, date, looked, settings, "
            "failed) SELECT i, printf('/%06d', i), hex(zeroblob(200)), 1, 1, 1, 'last' || i, 0 "
            "FROM n");
    std::string bytes = TextOf(folder() / "c.sqlite");
    const std::size_t page = bytes.find("last4900") / 4096 * 4096;
    std::fill_n(bytes.begin() + static_cast<std::ptrdiff_t>(page), 4096, '\x55');
    std::ofstream(folder() / "c.sqlite", std::ios::binary) << bytes;
    const CommandResult ran =
        RunCommand("cd " + Quoted(folder()) + "; " + Quoted(ProgramFolder() / "cliphost") +
                   " find c.sqlite --json 2>told");
    EXPECT_EQ(ran.status, 2);
    EXPECT_NE(ran.out.find("\"path\": \"/000001\""), std::string::npos);
    EXPECT_TRUE(Json::parse(ran.out, nullptr, false).is_discarded());
    EXPECT_NE(TextOf(folder() / "told").find("c.sqlite: the catalog is damaged: "),
              std::string::npos);
}

TEST_F(FindVerb, EndsWithAStatusThatTells) {
    EXPECT_EQ(Run("find c.sqlite prores").status, 0);
    const CommandResult none = Run("find c.sqlite nowhere");
    EXPECT_EQ(none.status, 1);
    EXPECT_EQ(none.out, "");
    ExpectSays(Run("find c.sqlite colour:red"), 2,
               "there is no field 'colour'; the fields are name, ");
    ExpectSays(Run("find c.sqlite '\"open'"), 2, "a quote is opened and not closed");
    ExpectSays(Run("find missing.sqlite prores"), 2,
               "missing.sqlite: there is no such file or folder");
    ExpectSays(Run("find in prores"), 2, "in: ");
    ExpectSays(Run("find c.sqlite -- -failed:yes -codec:prores"), 0, "tape.mov");
}

TEST_F(FindVerb, GivesJsonAndPathsForPrograms) {
    const Json answer = Json::parse(Run("find c.sqlite failed:yes --json").out);
    EXPECT_EQ(answer["movies"].size(), 1u);
    EXPECT_EQ(answer["movies"][0]["path"], (folder() / "in/bad.mov").string());
    EXPECT_EQ(answer["movies"][0]["failed"], true);
    EXPECT_TRUE(answer["movies"][0]["rate"].is_null());
    const Json prores = Json::parse(Run("find c.sqlite name:copy --json").out)["movies"][0];
    EXPECT_EQ(prores["rate"], "25/1");
    EXPECT_EQ(prores["width"], 1280);
    EXPECT_EQ(prores["alpha"], true);
    EXPECT_EQ(Json::parse(Run("find c.sqlite nowhere --json").out)["movies"], Json::array());
    ExpectSays(Run("find c.sqlite a:b --json 2>/dev/null"), 2, "\"reason\"");
    // Paths for other programs, also those that are no UTF-8.
    EXPECT_EQ(Run("find c.sqlite codec:png -0").out,
              (folder() / "in/caf\xE9.mov").native() + std::string(1, '\0'));
    ExpectSays(Run("find c.sqlite codec:png -0 | " + Quoted(ProgramFolder() / "cliphost") +
                   " describe --files-from - -0 -q"),
               0, "caf\\xE9.mov\n");
}

// The page's queries, on a catalog of which each finds something.
TEST_F(Catalogs, AnswerTheQueriesOfTheirPage) {
    const std::string page = TextOf(CLIPHOST_CATALOG_PAGE);
    for (const char* const name :
         {"prores_hq_1080i.mov", "mjpeg.mov", "three_sounds.mov", "timecode_25.mov"}) {
        Copy(name, std::string("in/") + name);
    }
    Copy("mjpeg.mov", "in/copy.mov");
    Write(movies::Bytes(100, 'x'), "in/bad.mov");
    Write(movies::Bytes(100, 'x'), "in/worse.mov");
    Make("-f lavfi -i testsrc2=s=64x48:r=25:d=1 -c:v mpeg2video", "a.mxf");
    Run("catalog in a.mxf -o c.sqlite");
    int queries = 0;
    for (std::size_t at = page.find("```sql\n"); at != std::string::npos;
         at = page.find("```sql\n", at)) {
        at += 7;
        const std::string sql = page.substr(at, page.find("```", at) - at);
        EXPECT_FALSE(Ask(sql).empty()) << sql;
        if (sql.find("AS files") != std::string::npos) {  // what find calls copies
            const Json copies = Json::parse(Run("find c.sqlite copy:yes --json").out)["movies"];
            ASSERT_EQ(copies.size(), 2u);
            EXPECT_EQ(Ask("SELECT files FROM (" + sql.substr(0, sql.find(';')) + ")"), Rows{"2"});
        }
        ++queries;
    }
    EXPECT_EQ(queries, 10);
    for (const catalog::FieldHelp& field : catalog::AllFields()) {
        EXPECT_NE(page.find("| `" + std::string(field.example) + "` | " + field.meaning + " |\n"),
                  std::string::npos)
            << field.example;
    }
    // Each column of each table is told.
    for (const std::string& column :
         Ask("SELECT info.name FROM sqlite_schema AS s, pragma_table_xinfo(s.name) AS info "
             "WHERE s.type = 'table' AND s.name NOT LIKE 'texts_%' AND info.name NOT IN ('texts', "
             "'rank')")) {
        EXPECT_NE(page.find("`" + column + "`"), std::string::npos) << column;
    }
    EXPECT_NE(page.find("## Tables: version " + std::to_string(catalog::kSteps.count) + "\n"),
              std::string::npos);
    EXPECT_NE(page.find("`PRAGMA application_id` is " + std::to_string(catalog::kApplicationId)),
              std::string::npos);
}

}  // namespace
