// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Tables of columns, in and out of descriptions.

#include <fstream>
#include <map>
#include <set>
#include <sstream>

#include "reference_host/cliphost/CsvTable.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

constexpr char kPinned[] = " --pin-time 2026-01-31T12:00:00Z ";

class Columns : public SystemTest {
protected:
    std::string In(const std::string& name) { return Quoted(folder() / name); }
    std::string Table(const std::string& text) {
        std::ofstream(folder() / "in.csv", std::ios::binary) << text;
        return " --columns " + In("in.csv") + " ";
    }
    std::string Copy(const std::string& movie, const std::string& name) {
        std::filesystem::create_directories((folder() / name).parent_path());
        std::filesystem::copy_file(MadeMovie(movie), folder() / name);
        return In(name) + " ";
    }
    std::string Text(const std::string& name) {
        std::ostringstream text;
        text << std::ifstream(folder() / name, std::ios::binary).rdbuf();
        return text.str();
    }
    std::string Dump(const std::string& name) { return RunCliphost("dump " + In(name)).out; }
    // The cells of a written table, by the movie's name and the column's.
    std::map<std::string, std::map<std::string, std::string>> Written(const std::string& name) {
        std::map<std::string, std::map<std::string, std::string>> cells;
        const cliphost::CsvTable table = cliphost::ReadCsvFile(folder() / name);
        for (const auto& row : table.rows) {
            for (std::size_t i = 0; i < row.cells.size(); ++i) {
                cells[std::filesystem::path(row.cells[0]).filename()][table.header[i]] =
                    row.cells[i];
            }
        }
        return cells;
    }
};

bool Holds(const std::string& text, const std::string& words) {
    return text.find(words) != std::string::npos;
}

TEST_F(Columns, GoIntoMobsAndComments) {
    const std::string table = Table(
        "\xEF\xBB\xBFPath;Name;Tape;Start TC;Comments;Video\r\n"
        "png.mov;Clip é;\"Reel;7\";10:00:00:05;\"two\nlines\";mine\r\n");
    const std::string movie = Copy("png.mov", "png.mov");
    for (const std::string jobs : {"", " --limit-seconds 60"}) {
        ExpectSays(RunCliphost("describe -q " + movie + table + "--aaf " + In("a.aaf") + jobs), 0,
                   "png.mov");
        const std::string dump = Dump("a.aaf");
        EXPECT_TRUE(Holds(dump, "Name = \"Clip é\"")) << dump;
        EXPECT_FALSE(Holds(dump, "Name = \"png\""));
        EXPECT_TRUE(Holds(dump, "Name = \"Reel;7\"\n  EssenceDescription: TapeDescriptor"));
        EXPECT_TRUE(Holds(dump, "StartTime = 900005"));
        EXPECT_TRUE(Holds(dump, "Name = \"Comments\"\n      Value = \"two\\nlines\""));
        EXPECT_TRUE(Holds(dump, "Name = \"Video\"\n      Value = \"mine\""));
        EXPECT_FALSE(Holds(dump, "Value = \"PNG\""));
    }
    ExpectSays(RunCliphost("verify " + In("a.aaf")), 0, "1 clip: 1 same");
}

// The source's pictures and sounds lead to the tracks of one tape.
TEST_F(Columns, MakeOneTapeForMoviesOfAReel) {
    const std::string movies = Copy("png.mov", "a.mov") + Copy("dv_pal.mov", "b.mov");
    ASSERT_EQ(RunCliphost("describe -q --bin " + In("b.aaf") + " " + movies +
                          Table("name,reel\na,R1\nb,R1\n"))
                  .status,
              0);
    int tapes = 0;
    const std::string dump = Dump("b.aaf");
    for (std::size_t at = 0; (at = dump.find("TapeDescriptor", at)) != std::string::npos; ++at) {
        ++tapes;
    }
    EXPECT_EQ(tapes, 1) << dump;
    // A timecode and a picture of the tape, and nothing of the two clips behind it.
    EXPECT_EQ(dump.find("SourceID = nil"), dump.rfind("SourceID = nil"));
}

// One tape can't count both with drops and without.
TEST_F(Columns, MakeATapeForEachCountOfAReel) {
    const std::string movies =
        Copy("timecode_2997_drop.mov", "d.mov") + Copy("timecode_2997_nondrop.mov", "n.mov");
    ASSERT_EQ(RunCliphost("describe -q --bin " + In("b.aaf") + " " + movies +
                          Table("name,reel\nd,R1\nn,R1\n"))
                  .status,
              0);
    const std::string dump = Dump("b.aaf");
    std::set<std::string> drops;
    int tapes = 0;
    for (std::size_t at = 0; (at = dump.find("TapeDescriptor", at)) != std::string::npos; ++tapes) {
        at = dump.find("Drop = ", at);
        ASSERT_NE(at, std::string::npos) << dump;
        drops.insert(dump.substr(at, dump.find('\n', at) - at));
    }
    EXPECT_EQ(tapes, 2) << dump;
    EXPECT_EQ(drops.size(), 2u) << dump;
}

TEST_F(Columns, CountDroppedFrames) {
    const std::string movie = Copy("timecode_2997_nondrop.mov", "n.mov");
    ASSERT_EQ(RunCliphost("describe -q " + movie + Table("name,start\nn,01:00:00;02\n") + "--aaf " +
                          In("a.aaf"))
                  .status,
              0);
    EXPECT_TRUE(Holds(Dump("a.aaf"), "StartTime = 107894"));
    EXPECT_TRUE(Holds(Dump("a.aaf"), "Drop = True (1)"));
}

TEST_F(Columns, ComeBackAsTheyWereWritten) {
    const std::string movies = Copy("timecode_2997_drop.mov", "t.mov") + Copy("png.mov", "p.mov") +
                               Copy("three_sounds.mov", "s.mov") + Copy("aac.m4a", "m.m4a");
    const std::string table = Table(
        "name,reel,start timecode,Scene,Take\nt,R1,02:00:00;04,\"1,\"\"x\"\"\",3\n"
        "p,,01:00:00:24,,\ns,R2,,9,\n");
    ASSERT_EQ(RunCliphost("describe -q " + movies + table + kPinned + "--out-dir " + In("one") +
                          " --columns-out " + In("out.csv"))
                  .status,
              0);
    auto cells = Written("out.csv");
    ASSERT_EQ(cells.size(), 4u);
    EXPECT_EQ(cells["t.mov"]["reel"], "R1");
    EXPECT_EQ(cells["t.mov"]["start timecode"], "02:00:00;04");
    EXPECT_EQ(cells["t.mov"]["Scene"], "1,\"x\"");
    EXPECT_EQ(cells["t.mov"]["rate"], "30000/1001");
    EXPECT_EQ(cells["p.mov"]["start timecode"], "01:00:00:24");
    EXPECT_EQ(cells["p.mov"]["path"], (folder() / "p.mov").string());
    EXPECT_EQ(cells["p.mov"]["name"], "p");
    EXPECT_EQ(cells["p.mov"]["length"], "3");
    EXPECT_EQ(cells["p.mov"]["rate"], "25");
    EXPECT_EQ(cells["p.mov"]["codec"], "PNG");
    EXPECT_EQ(cells["t.mov"]["codec"], "Photo - JPEG");
    EXPECT_EQ(cells["m.m4a"]["codec"], "AAC");
    EXPECT_EQ(cells["s.mov"]["start timecode"], "");
    EXPECT_EQ(cells["s.mov"]["tracks"], "1 picture, 9 sounds");
    EXPECT_EQ(cells["s.mov"]["Audio Format"], "LPCM | LPCM | LPCM");

    ASSERT_EQ(RunCliphost("describe -q " + movies + kPinned + "--jobs 2 --out-dir " + In("two") +
                          " --columns " + In("out.csv") + " --columns-out " + In("again.csv"))
                  .status,
              0);
    EXPECT_EQ(Text("out.csv"), Text("again.csv"));
    for (const char* const name : {"t.aaf", "p.aaf", "s.aaf", "m.aaf"}) {
        EXPECT_EQ(Text(std::string("one/") + name), Text(std::string("two/") + name)) << name;
    }
}

TEST_F(Columns, KeepTheNamesThatAreThere) {
    const std::string movie = Copy("png.mov", "png.mov");
    ASSERT_EQ(RunCliphost("describe -q " + movie + Table("name,VIDEO\npng,mine\n") + "--aaf " +
                          In("a.aaf") + " --columns-out " + In("out.csv"))
                  .status,
              0);
    const std::string dump = Dump("a.aaf");
    EXPECT_TRUE(Holds(dump, "Name = \"Video\"\n      Value = \"mine\"")) << dump;
    EXPECT_FALSE(Holds(dump, "VIDEO")) << dump;
    ExpectSays(RunCliphost("describe -q " + movie + "--columns " + In("out.csv")), 0, "png.mov");
}

// Written back as it came, a table changes nothing.
TEST_F(Columns, OfADescriptionChangeNoByteOfIt) {
    const std::string movies = Copy("timecode_25.mov", "t.mov") + Copy("three_sounds.mov", "s.mov");
    ASSERT_EQ(RunCliphost("describe -q " + movies + kPinned + "--out-dir " + In("plain") +
                          " --columns-out " + In("out.csv"))
                  .status,
              0);
    ASSERT_EQ(RunCliphost("describe -q " + movies + kPinned + "--out-dir " + In("with") +
                          " --columns " + In("out.csv"))
                  .status,
              0);
    EXPECT_EQ(Text("plain/t.aaf"), Text("with/t.aaf"));
    EXPECT_EQ(Text("plain/s.aaf"), Text("with/s.aaf"));
}

TEST_F(Columns, TellRowsWithoutMoviesAndMoviesWithoutRows) {
    const std::string movie = Copy("png.mov", "png.mov");
    const std::string table = Table("name,Scene\npng.mov,1\nother.mov,2\n");
    CommandResult ran = RunCliphost("describe -q " + movie + table);
    ExpectSays(ran, 0, "in.csv: row 3: no movie is other.mov\n");
    ran = RunCliphost("describe -q " + movie + Table("name,Scene\n"));
    EXPECT_FALSE(Holds(ran.out, "in.csv")) << ran.out;
    ran = RunCliphost("describe -q -v " + movie + Table("name,Scene\n"));
    EXPECT_TRUE(Holds(ran.out, "in.csv has no row for it")) << ran.out;
    std::string many = "name,Scene\n";
    for (int i = 0; i < 30; ++i) {
        many += "none" + std::to_string(i) + ",1\n";
    }
    ExpectSays(RunCliphost("describe -q " + movie + Table(many)), 0, "10 rows more are for none");
}

TEST_F(Columns, NameNoTwoMovies) {
    const std::string movies = Copy("png.mov", "a/x.mov") + Copy("mjpeg.mov", "b/x.mov");
    const std::string out = "--out-dir " + In("out") + " -q ";
    ExpectSays(RunCliphost("describe " + out + movies + Table("name,Scene\nx,1\n")), 2,
               "in.csv: row 2: x may be ");
    EXPECT_FALSE(std::filesystem::exists(folder() / "out" / "x.aaf"));
    const std::string cells =
        "path,Scene\r\n" + cliphost::CsvLine({(folder() / "a/x.mov").string(), "1"});
    ExpectSays(RunCliphost("describe " + out + movies + Table(cells)), 0, "2 described");
    EXPECT_TRUE(Holds(Dump("out/x.aaf"), "\"Scene\""));
    EXPECT_FALSE(Holds(Dump("out/x-2.aaf"), "\"Scene\""));
}

TEST_F(Columns, NameWhatIsWrong) {
    const std::string movie = Copy("png.mov", "png.mov") + Copy("mjpeg.mov", "m.mov") + "-q ";
    // No timecode at all: nothing is read.
    CommandResult ran = RunCliphost("describe " + movie + Table("name,start\npng,1\n"));
    ExpectSays(ran, 2, "in.csv: row 2, column start: '1' is no timecode");
    EXPECT_FALSE(Holds(ran.out, "png.mov\n"));
    // None at the movie's rate: the others are described.
    for (const std::string jobs : {"1", "2"}) {
        ran = RunCliphost("describe --jobs " + jobs + " --out-dir " + In("o" + jobs) + " " + movie +
                          Table("name,start\npng,01:00:00:25\n"));
        ExpectSays(ran, 2, "row 2, column start: '01:00:00:25' is no timecode at 25 frames");
        ExpectSays(ran, 2, "1 described, 1 not");
        EXPECT_FALSE(std::filesystem::exists(folder() / ("o" + jobs) / "png.aaf"));
    }
    ExpectSays(RunCliphost("describe " + movie + "--columns " + In("none.csv")), 2,
               "none.csv: the table can't be read: No such file");
    ExpectSays(RunCliphost("describe " + movie + "--columns " + Quoted(folder())), 2,
               "is no regular file");
    ExpectSays(RunCliphost("describe " + movie + "--columns " + Quoted(MadeMovie("png.mov"))), 2,
               "png.mov: ");
    ExpectSays(RunCliphost("describe " + movie + "--columns-out /dev/full"), 2, "/dev/full");
    ExpectSays(RunCliphost("describe " + movie + "--columns-out /nowhere/o.csv"), 2, "/nowhere");
    ExpectSays(RunCliphost("describe " + movie + "--columns-out " + In("png.mov")), 2,
               "this is the movie itself");
    ExpectSays(RunCliphost("describe --json --columns-out - " + movie), 2,
               "standard output takes the JSON");
    ExpectSays(RunCliphost("describe --columns-out - " + movie), 2,
               "--columns-out: standard output takes what is told of movies; name a file");
    ran = RunCommand(Quoted(ProgramFolder() / "cliphost") + " describe --columns-out /dev/fd/3 " +
                     movie + "3>&1 >" + In("told"));
    ExpectSays(ran, 0, "path,name,reel");
    ran = RunCommand("mkfifo " + In("pipe") + "; cat " + In("pipe") + " & timeout 60 " +
                     Quoted(ProgramFolder() / "cliphost") + " describe --columns-out " +
                     In("pipe") + " " + movie + ">/dev/null; echo $?; wait");
    ExpectSays(ran, 0, "path,name,reel");
    ExpectSays(ran, 0, "0\n");
    ExpectSays(RunCliphost("describe --skip-done --out-dir " + In("x") + " --columns-out " +
                           In("y") + " " + movie),
               2, "excludes");
}

TEST_F(Columns, TakeTheirPlaceFromNoOtherFile) {
    const std::string movie = "describe -q " + Copy("png.mov", "png.mov");
    const std::string table = Table("name,Scene\npng,1\n");
    std::ofstream(folder() / "list") << (folder() / "png.mov").string() << "\n";
    std::ofstream(folder() / "own.toml") << "v = 0\n";
    std::filesystem::create_symlink("in.csv", folder() / "link.csv");
    std::filesystem::create_directory(folder() / "out");
    const auto expectKept = [&](const std::string& call, const std::string& words) {
        const std::string before = Text("in.csv") + Text("list") + Text("own.toml");
        ExpectSays(RunCliphost(call), 2, words);
        EXPECT_EQ(Text("in.csv") + Text("list") + Text("own.toml"), before) << call;
    };
    const std::string to = "--columns-out ";
    const std::string onto = folder().string() + "/./in.csv";
    expectKept(movie + table + to + Quoted(onto), "this is the table of --columns");
    expectKept(movie + table + to + In("link.csv"), "this is the table of --columns");
    expectKept(movie + table + "--bin " + In("in.csv"), "this is the table of --columns");
    expectKept(movie + table + "--aaf " + In("in.csv"), "this is the table of --columns");
    const std::string list = "describe -q --files-from " + In("list") + " ";
    expectKept(list + to + In("list"), "this is the list of movies");
    expectKept(list + "--bin " + In("list"), "this is the list of movies");
    const std::string own = "--config " + In("own.toml") + " ";
    expectKept(movie + own + to + In("own.toml"), "this is the settings file");
    expectKept(movie + "--aaf " + In("x") + " " + to + In("x"), "this is the file of --aaf");
    expectKept(movie + "--bin " + In("x") + " " + to + In("out/../x"), "this is the bin");
    EXPECT_FALSE(std::filesystem::exists(folder() / "x"));
    expectKept(movie + "--out-dir " + In("out") + " " + to + In("out/png.AAF"),
               "a movie's output may have this name");
    ExpectSays(RunCliphost(movie + "--out-dir " + In("out") + " " + to + In("out/png.csv")), 0,
               "png.aaf");
}

// Another table makes other outputs.
TEST_F(Columns, CountForSkipDone) {
    const std::string call =
        "describe -q --skip-done --out-dir " + In("out") + " " + Copy("png.mov", "png.mov");
    ExpectSays(RunCliphost(call + Table("name,Scene\npng,1\n")), 0, "png.mov");
    ExpectSays(RunCliphost(call + Table("name,Scene\npng,1\n")), 0, "1 done already");
    ExpectSays(RunCliphost(call + Table("name,Scene\npng,2\n")), 0, "png.aaf");
    EXPECT_TRUE(Holds(Dump("out/png.aaf"), "Value = \"2\""));
}

}  // namespace
