// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// `cliphost validate`: it finds each thing that a module can be wrong in, and nothing in modules
// that are right.

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>

#include "reference_host/validate/Check.h"
#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

using nlohmann::json;

std::filesystem::path Faulty(const std::string& name) {
    return std::filesystem::path(CLIPHOST_FAULTY_MODULES) / (name + ".nvx");
}

const std::filesystem::path kOurs = ProgramFolder() / "plugins" / "QuickTimePlugin.nvx";
const std::filesystem::path kMinimal =
    std::filesystem::path(CLIPHOST_EXAMPLES) / "MinimalModule.nvx";

struct Answer {
    int status = -1;
    json value;

    // The check's own part of the answer; null where it was not done.
    json Of(const std::string& id) const {
        for (const json& check : value.value("checks", json::array())) {
            if (check["id"] == id) {
                return check;
            }
        }
        return {};
    }
};

Answer Validate(const std::filesystem::path& module, const std::string& options = "") {
    const CommandResult ran = RunCommand(Quoted(ProgramFolder() / "cliphost") + " validate " +
                                         Quoted(module) + " --seed 1 --json " + options);
    Answer answer{ran.status, json::parse(ran.out, nullptr, false)};
    EXPECT_FALSE(answer.value.is_discarded()) << ran.out;
    return answer;
}

// How a module that is wrong in what a check looks for is found out.
struct Row {
    const char* id;
    const char* verdict = "failed";
    const char* module = "FaultyModule";  // else another file
};

// One for each check. The module is wrong in what the check is called after.
constexpr Row kRows[] = {
    {"file-loads", "failed", "text"},
    {"file-exports-six-functions", "failed", "tiny_file_no_shutdown"},
    {"file-exports-nothing-else", "warning", "tiny_file_further_export"},
    {"file-starts-nothing"},
    {"file-loads-again", "crashed"},
    {"order-unload-question-first"},
    {"order-shutdown-without-start"},
    {"order-registration-after-start"},
    {"order-start-without-registration"},
    {"order-factory-not-started", "crashed"},
    {"order-creation-not-started", "crashed"},
    {"order-start-twice"},
    {"order-shutdown-twice", "crashed"},
    {"order-start-again"},
    {"order-shutdown-with-objects", "crashed"},
    {"order-other-thread"},
    {"order-registration-on-two-threads"},
    {"order-plugin-registration-on-two-threads"},
    {"order-unload-question-on-two-threads"},
    {"order-creation-on-threads"},
    {"order-no-thread"},
    {"plugin-definition"},
    {"plugin-names"},
    {"plugin-id"},
    {"plugin-versions", "warning"},
    {"plugin-component-count"},
    {"component-definitions"},
    {"component-index-beyond"},
    {"component-ids"},
    {"component-class-ids"},
    {"component-types"},
    {"component-names"},
    {"definition-attributes"},
    {"definition-once", "warning"},
    {"registration-twice"},
    {"register-plugin-null"},
    {"register-component-null"},
    {"registration-keeps-nothing"},
    {"refusal-plugin-registration"},
    {"refusal-component-registration"},
    {"refusal-definition-calls"},
    {"refusal-start"},
    {"refusal-creation"},
    {"refusal-query", "crashed"},
    {"factory-offered"},
    {"factory-unknown-class"},
    {"factory-null-arguments"},
    {"factory-unknown-interface"},
    {"factory-interfaces"},
    {"factory-kept"},
    {"factory-refuses-unloading"},
    {"factory-counted-each"},
    {"factory-released-first"},
    {"create-null-host", "crashed"},
    {"create-null-output"},
    {"create-unknown-interface"},
    {"create-aggregated-interface"},
    {"create-aggregated-root"},
    {"create-aggregated-interfaces"},
    {"create-by-class-id"},
    {"create-by-component-id"},
    {"query-root"},
    {"query-unknown-interface"},
    {"query-reflexive"},
    {"query-symmetric"},
    {"query-transitive"},
    {"query-stable"},
    {"counts-right"},
    {"counts-end"},
    {"counts-on-threads"},
    {"objects-many"},
    {"objects-locks"},
    {"unload-null-host"},
    {"unload-refused"},
    {"unload-allowed"},
    {"unload-refused-goes-on"},
    {"unload-question-only"},
    {"shutdown-succeeds"},
    {"shutdown-gives-back"},
    {"unload-and-load-again"},
    {"volume-claims"},
    {"volume-claims-again"},
    {"volume-other-folders"},
    {"volume-null-arguments"},
    {"volume-info"},
    {"volume-format"},
    {"volume-clip-paths"},
    {"volume-clip-index"},
    {"volume-clip-descriptions"},
    {"volume-container-id"},
    {"volume-bad-files", "crashed"},
    {"volume-creations-refused", "crashed"},
    {"volume-queries-refused", "crashed"},
    {"volume-released-first"},
    {"container-file-types", "crashed"},
    {"container-capabilities"},
    {"container-takes-path"},
    {"container-describes"},
    {"container-path-once"},
    {"container-path-copied"},
    {"container-without-path"},
    {"container-null-arguments"},
    {"container-locks"},
    {"container-missing-file"},
    {"container-supports"},
    {"container-describes-again"},
    {"container-closes-file"},
    {"container-leaves-nothing"},
    {"container-leaves-file"},
    {"container-threads"},
    {"container-odd-names"},
    {"container-creations-refused", "crashed"},
    {"container-queries-refused", "crashed"},
    {"description-is-aaf"},
    {"description-master-mob"},
    {"description-ids"},
    {"description-ids-stable"},
    {"description-ids-differ"},
    {"description-slots"},
    {"description-outlives"},
    {"description-index"},
    {"mapping-tracks"},
    {"mapping-samples"},
    {"mapping-in-file"},
    {"mapping-other-tracks"},
    {"mapping-other-samples"},
    {"mapping-null-outputs"},
    {"mapping-creations-refused"},
    {"mapping-queries-refused"},
    {"mapping-outlives"},
    {"files-broken", "crashed"},
    {"files-hostile", "timedOut"},
    {"files-huge"},
    {"files-good-after-bad"},
    {"files-that-change", "crashed"},
    {"leaks-registration"},
    {"leaks-start"},
    {"leaks-objects"},
    {"leaks-refused-creation"},
    {"leaks-descriptions"},
    {"leaks-mappings"},
    {"leaks-volumes"},
    {"leaks-broken-files"},
    {"fuzz-calls", "crashed"},
    {"fuzz-movies", "crashed"},
};

// Faults that other checks find, too, since they look at the same thing from another side or rely
// on it.
struct Also {
    const char* id;
    const char* others;
};
constexpr Also kAlso[] = {
    {"order-unload-question-first",
     "order-creation-not-started order-start-twice "
     "order-shutdown-with-objects"},
    {"order-shutdown-twice", "shutdown-succeeds"},
    {"order-start-again", "order-shutdown-without-start refusal-start"},
    {"order-shutdown-with-objects", "order-factory-not-started"},
    {"order-other-thread", "order-creation-on-threads"},
    {"order-creation-on-threads", "order-other-thread"},
    {"plugin-component-count", "component-index-beyond"},
    {"component-definitions",
     "order-registration-after-start definition-once "
     "refusal-component-registration"},
    {"component-ids", "create-by-component-id volume-container-id"},
    {"definition-once", "refusal-definition-calls"},
    {"registration-twice", "order-plugin-registration-on-two-threads"},
    {"registration-keeps-nothing", "shutdown-gives-back"},
    {"refusal-creation", "refusal-query"},
    {"refusal-query", "refusal-creation"},
    {"factory-offered", "order-start-without-registration"},
    {"factory-unknown-interface", "fuzz-calls"},
    {"factory-interfaces", "query-unknown-interface"},
    {"factory-kept",
     "order-other-thread create-unknown-interface objects-many "
     "unload-refused-goes-on"},
    {"factory-refuses-unloading", "factory-counted-each"},
    {"factory-counted-each",
     "create-by-component-id counts-end unload-refused mapping-outlives "
     "fuzz-calls"},
    {"factory-released-first",
     "order-start-without-registration order-creation-on-threads "
     "factory-offered factory-counted-each create-by-component-id "
     "leaks-objects"},
    {"create-unknown-interface",
     "container-leaves-nothing files-broken files-hostile files-huge "
     "leaks-refused-creation fuzz-calls fuzz-movies"},
    {"create-by-class-id", "create-by-component-id"},
    {"create-by-component-id", "order-creation-on-threads volume-container-id leaks-objects"},
    {"query-root", "create-aggregated-interfaces"},
    {"query-unknown-interface", "factory-interfaces"},
    {"query-reflexive", "query-transitive"},
    {"query-symmetric", "query-transitive"},
    {"query-transitive", "query-symmetric"},
    {"query-stable", "query-symmetric"},
    {"counts-on-threads", "order-other-thread order-creation-on-threads"},
    {"objects-locks", "container-locks"},
    {"unload-refused",
     "order-unload-question-on-two-threads factory-refuses-unloading "
     "factory-counted-each create-aggregated-root mapping-outlives "
     "fuzz-calls"},
    {"shutdown-succeeds",
     "order-shutdown-without-start order-shutdown-twice order-start-again "
     "refusal-start"},
    {"shutdown-gives-back", "refusal-start"},
    {"unload-and-load-again", "order-start-twice order-start-again refusal-start"},
    {"volume-claims-again", "volume-creations-refused volume-queries-refused"},
    {"volume-other-folders", "volume-format volume-released-first"},
    {"volume-format", "volume-released-first"},
    {"volume-clip-descriptions", "volume-bad-files"},
    {"volume-creations-refused", "volume-queries-refused"},
    {"volume-queries-refused", "volume-creations-refused"},
    {"container-missing-file", "container-without-path"},
    {"container-closes-file", "leaks-descriptions"},
    {"container-creations-refused", "container-queries-refused"},
    {"description-is-aaf",
     "description-master-mob description-ids description-ids-stable "
     "description-ids-differ description-slots description-outlives"},
    {"mapping-tracks",
     "mapping-samples mapping-in-file mapping-other-tracks "
     "mapping-other-samples mapping-null-outputs"},
    {"mapping-creations-refused", "mapping-queries-refused"},
    {"mapping-queries-refused", "mapping-creations-refused"},
    {"files-broken",
     "container-without-path container-locks container-missing-file "
     "files-good-after-bad files-that-change"},
    {"leaks-objects", "leaks-refused-creation"},
    {"fuzz-calls", "objects-many"},
    {"fuzz-movies",
     "container-locks files-broken files-hostile files-good-after-bad "
     "leaks-broken-files"},
};

// Faults with which next to nothing works, one whose thread may crash any check, and those of which
// the leak sanitizer tells in others, too.
constexpr const char* kWide[] = {
    "file-loads-again",         "plugin-definition",          "counts-end",
    "unload-allowed",           "container-file-types",       "order-no-thread",
    "container-leaves-nothing", "registration-keeps-nothing", "leaks-registration",
    "leaks-refused-creation"};

void PrintTo(const Row& row, std::ostream* out) {
    *out << row.id;
}

class Validates : public SystemTest {
protected:
    void TearDown() override {
        unsetenv("CLIPHOST_FAULT");
        SystemTest::TearDown();
    }
    std::filesystem::path Text() {
        const std::filesystem::path file = folder() / "text.nvx";
        std::ofstream(file) << "this is no module\n";
        return file;
    }
};

class ValidatesWrongModule : public Validates, public testing::WithParamInterface<Row> {};

TEST_P(ValidatesWrongModule, AndFindsTheFault) {
    const Row row = GetParam();
    setenv("CLIPHOST_FAULT", row.id, 1);
    const auto module = std::string(row.module) == "text" ? Text() : Faulty(row.module);
    // A module that hangs does so for ever; any limit finds it.
    const std::string limit = std::string(row.verdict) == "timedOut" ? " --limit-seconds 1" : "";
    const Answer answer = Validate(module, std::string("--only ") + row.id + limit);
    EXPECT_EQ(answer.status, std::string(row.verdict) == "warning" ? 0 : 1);
    const json check = answer.Of(row.id);
    ASSERT_TRUE(check.is_object()) << answer.value.dump(2);
    EXPECT_EQ(check["verdict"], row.verdict) << check.dump(2);
    EXPECT_EQ(answer.value["counts"][row.verdict], 1);
    for (const char* const told : {"done", "expected", "found", "cause"}) {
        EXPECT_TRUE(check[told].is_string()) << told << " is missing: " << check.dump(2);
    }
    EXPECT_NE(check["again"].get<std::string>().find(std::string("--only ") + row.id),
              std::string::npos);
}

std::string NameOfRow(const testing::TestParamInfo<Row>& test) {
    std::string name = test.param.id;
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}

INSTANTIATE_TEST_SUITE_P(OfEachKind, ValidatesWrongModule, testing::ValuesIn(kRows), NameOfRow);

std::vector<Row> NarrowRows() {
    std::vector<Row> rows;
    std::copy_if(std::begin(kRows), std::end(kRows), std::back_inserter(rows), [](const Row& row) {
        return std::none_of(std::begin(kWide), std::end(kWide),
                            [&](const char* id) { return std::string_view(row.id) == id; });
    });
    return rows;
}

// "container-": what checks of one group are called.
std::string GroupOf(const std::string& id) {
    return id.substr(0, id.find('-') + 1);
}

std::set<std::string> OthersThatFind(const std::string& fault) {
    for (const Also& also : kAlso) {
        if (also.id == fault) {
            std::istringstream words(also.others);
            return {std::istream_iterator<std::string>(words), {}};
        }
    }
    return {};
}

class ValidatesOneFault : public ValidatesWrongModule {
protected:
    // Holds a wrong module against all other checks whose names begin so: those of the table find
    // its fault, too, and no others find anything.
    void ExpectOthers(const std::string& beginning) {
        const Row row = GetParam();
        setenv("CLIPHOST_FAULT", row.id, 1);
        const auto module = std::string(row.module) == "text" ? Text() : Faulty(row.module);
        std::string options = "--limit-seconds 100000";  // however slow the machine is
        std::set<std::string> expected;
        const std::set<std::string> others = OthersThatFind(row.id);
        for (const Row& other : kRows) {
            const std::string id = other.id;
            if (id != row.id && id.rfind(beginning, 0) == 0) {
                options += " --only " + id;
                if (others.count(id) != 0) {
                    expected.insert(id);
                }
            }
        }
        const Answer answer = Validate(module, options);
        std::set<std::string> found;
        for (const json& check : answer.value["checks"]) {
            if (check["verdict"] != "passed" && check["verdict"] != "skipped") {
                found.insert(check["id"]);
            }
        }
        EXPECT_EQ(found, expected);
    }
};

TEST_P(ValidatesOneFault, AndNoOtherCheckOfItsGroupFindsOneButThoseOfTheTable) {
    ExpectOthers(GroupOf(GetParam().id));
}

INSTANTIATE_TEST_SUITE_P(OfEachKind, ValidatesOneFault, testing::ValuesIn(NarrowRows()), NameOfRow);

class ValidatesAllOfOneFault : public ValidatesOneFault {};

TEST_P(ValidatesAllOfOneFault, AndNoOtherCheckFindsOneButThoseOfTheTable) {
    ExpectOthers("");
}

INSTANTIATE_TEST_SUITE_P(Thorough, ValidatesAllOfOneFault, testing::ValuesIn(NarrowRows()),
                         NameOfRow);

TEST_F(Validates, TheTableOfOthersNamesChecks) {
    for (const Also& also : kAlso) {
        EXPECT_NE(validate::FindCheck(also.id), nullptr) << also.id;
        for (const std::string& other : OthersThatFind(also.id)) {
            EXPECT_NE(validate::FindCheck(other.c_str()), nullptr) << other;
        }
    }
}

TEST_F(Validates, EachCheckHasAModuleThatIsWrongInIt) {
    std::set<std::string> checks;
    for (const validate::Check& check : validate::AllChecks()) {
        EXPECT_TRUE(checks.insert(check.id).second) << check.id << " stands there twice";
    }
    std::set<std::string> rows;
    for (const Row& row : kRows) {
        rows.insert(row.id);
    }
    EXPECT_EQ(checks, rows);
    EXPECT_GE(checks.size(), 60u);
}

TEST_F(Validates, EachCheckSaysWhatItIsAbout) {
    for (const validate::Check& check : validate::AllChecks()) {
        SCOPED_TRACE(check.id);
        EXPECT_EQ(std::string(check.id).find_first_not_of("abcdefghijklmnopqrstuvwxyz-"),
                  std::string::npos);
        EXPECT_EQ(std::string(check.text).back(), '.');
        EXPECT_NE(std::string(check.cause), "");
    }
}

// The counts of a whole run; what did not pass is told.
json CountsOf(const std::filesystem::path& module) {
    const Answer answer =
        Validate(module, "--limit-seconds 100000");  // however slow the machine is
    for (const json& check : answer.value.value("checks", json::array())) {
        EXPECT_TRUE(check["verdict"] == "passed" || check["verdict"] == "skipped") << check.dump(2);
    }
    EXPECT_EQ(answer.status, 0);
    return answer.value.value("counts", json::object());
}

TEST_F(Validates, AndPassesTheModuleThatHasNoFault) {
    EXPECT_EQ(CountsOf(Faulty("FaultyModule"))["passed"], std::size(kRows));
}

TEST_F(Validates, AndPassesThePlugin) {
    EXPECT_EQ(CountsOf(kOurs)["passed"], std::size(kRows));
}

// Modules of objects that can't be aggregated, and without media.
void ExpectMediaAreSkipped(const std::filesystem::path& module) {
    const json counts = CountsOf(module);
    std::size_t media = 2;  // it makes objects that can't be aggregated
    for (const Row& row : kRows) {
        const std::string id = row.id;
        for (const char* const group :
             {"volume-", "container-", "description-", "mapping-", "files-"}) {
            media += id.rfind(group, 0) == 0 ? 1 : 0;
        }
    }
    media += 5;  // leaks-descriptions, -mappings, -volumes, -broken-files, fuzz-movies
    EXPECT_EQ(counts["skipped"], media);
    EXPECT_EQ(counts["passed"], std::size(kRows) - media);
}

TEST_F(Validates, AndSkipsTheMediaOfAModuleThatHasNone) {
    ExpectMediaAreSkipped(kMinimal);
}

TEST_F(Validates, AndPassesTheTinyModuleOfTheUnitTests) {
    ExpectMediaAreSkipped(Faulty("tiny_file_none"));
}

TEST_F(Validates, AFileThatIsNoModuleByOneCheckAndSkipsTheRest) {
    const Answer answer = Validate(Text());
    EXPECT_EQ(answer.status, 1);
    EXPECT_EQ(answer.Of("file-loads")["verdict"], "failed");
    EXPECT_EQ(answer.value["counts"]["failed"], 1);
    EXPECT_EQ(answer.value["counts"]["skipped"], std::size(kRows) - 1);
}

TEST_F(Validates, AndTellsWhatTheCallerDidWrong) {
    const CommandResult absent = RunCliphost("validate " + Quoted(folder() / "absent.nvx"));
    ExpectSays(absent, 2, "absent.nvx");
    ExpectSays(RunCliphost("validate " + Quoted(folder())), 2, "folder");
    ExpectSays(RunCliphost("validate " + Quoted(kMinimal) + " --only no-such-check"), 2,
               "there is no such check; cliphost validate --list names all of them");
    ExpectSays(RunCliphost("validate"), 2, "no module is given");
    ExpectSays(RunCliphost("validate " + Quoted(kMinimal) + " --seed many"), 2, "--seed");
}

TEST_F(Validates, AndListsItsChecks) {
    const CommandResult listed = RunCliphost("validate --list");
    for (const Row& row : kRows) {
        ExpectSays(listed, 0, std::string(row.id) + "\n    ");
    }
    ExpectSays(listed, 0, std::to_string(std::size(kRows)) + " checks\n");
    ExpectSays(RunCliphost("validate --list --only plugin-id"), 0, "plugin-id\n    ");
    ExpectSays(RunCliphost("validate --list --only plugin-id"), 0, "1 check\n");
}

TEST_F(Validates, AndItsLastLineCounts) {
    setenv("CLIPHOST_FAULT", "plugin-names", 1);
    const CommandResult ran = RunCliphost("validate " + Quoted(Faulty("FaultyModule")) +
                                          " --only plugin-names --only plugin-id");
    ExpectSays(ran, 1,
               "2 checks: 1 passed, 1 failed, 0 crashed, 0 timed out, 0 warning, 0 skipped\n");
    ExpectSays(ran, 1, "failed     plugin-names\n");
    ExpectSays(ran, 1, "found     the name is empty\n");
    ExpectSays(ran, 1, "--only plugin-names\n");
}

TEST_F(Validates, AndTheSeedDoesTheSameAgain) {
    setenv("CLIPHOST_FAULT", "fuzz-calls", 1);
    const std::string call =
        "validate " + Quoted(Faulty("FaultyModule")) + " --only fuzz-calls --seed 7";
    const CommandResult first = RunCliphost(call);
    ExpectSays(first, 1, "seed 7\n");
    ExpectSays(first, 1, "--only fuzz-calls --seed 7\n");
    EXPECT_EQ(RunCliphost(call).out, first.out);
}

TEST_F(Validates, AndTheLineToRunACheckAgainDoesThat) {
    setenv("CLIPHOST_FAULT", "plugin-names", 1);
    const std::filesystem::path module = folder() / "it's a \xFF module.nvx";
    std::filesystem::copy_file(Faulty("FaultyModule"), module);
    const json check = Validate(module, "--only plugin-names").Of("plugin-names");
    const std::string again = check.value("again", "");
    ASSERT_EQ(again.rfind("cliphost ", 0), 0u) << again;
    ExpectSays(RunCliphost(again.substr(9)), 1, "failed     plugin-names\n");
    EXPECT_EQ(check["found"], "the name is empty");
}

TEST_F(Validates, AndACrashCostsOneCheckAlone) {
    setenv("CLIPHOST_FAULT", "order-shutdown-twice", 1);
    const Answer answer = Validate(
        Faulty("FaultyModule"), "--only plugin-id --only order-shutdown-twice --only plugin-names");
    EXPECT_EQ(answer.Of("plugin-id")["verdict"], "passed");
    EXPECT_EQ(answer.Of("order-shutdown-twice")["verdict"], "crashed");
    EXPECT_EQ(answer.Of("order-shutdown-twice")["done"], "calling NCFShutdown a second time");
    EXPECT_EQ(answer.Of("plugin-names")["verdict"], "passed");
}

TEST_F(Validates, AndABadEndAfterAPassIsACrash) {
    const struct {
        const char* fault;
        const char* found;
        const char* cause;
    } rows[] = {{"end-crashes", "ended by signal 11", "a pointer is used that is null"},
                {"end-has-status", "ended with status 3", "ends the whole process (exit)"}};
    for (const auto& [fault, found, cause] : rows) {
        setenv("CLIPHOST_FAULT", fault, 1);
        const Answer answer = Validate(Faulty("FaultyModule"), "--only plugin-names");
        EXPECT_EQ(answer.status, 1);
        const json check = answer.Of("plugin-names");
        EXPECT_EQ(check["verdict"], "crashed");
        EXPECT_EQ(check["done"], "ending the process after the check");
        EXPECT_NE(check.value("found", "").find(found), std::string::npos) << check.dump(2);
        EXPECT_NE(check.value("cause", "").find(cause), std::string::npos) << check.dump(2);
        EXPECT_NE(check.value("cause", "").find("a global object's destructor"), std::string::npos);
    }
}

TEST_F(Validates, AndTellsWhatACrashIsDueToBeforeWhatTheCheckLooksFor) {
    setenv("CLIPHOST_FAULT", "order-shutdown-twice", 1);
    const std::string cause = Validate(Faulty("FaultyModule"), "--only order-shutdown-twice")
                                  .Of("order-shutdown-twice")
                                  .value("cause", "");
    EXPECT_EQ(cause,
              "a pointer is used that is null, or that leads to something that is gone; behind it "
              "may be what this check looks for: what was released is released again");
}

TEST_F(Validates, AndABadEndDoesNotHideAFault) {
    for (const char* const faults : {"plugin-names end-crashes", "plugin-names end-has-status"}) {
        setenv("CLIPHOST_FAULT", faults, 1);
        const Answer answer = Validate(Faulty("FaultyModule"), "--only plugin-names");
        EXPECT_EQ(answer.status, 1);
        EXPECT_EQ(answer.Of("plugin-names")["verdict"], "failed");
        EXPECT_EQ(answer.Of("plugin-names")["found"], "the name is empty");
    }
}

TEST_F(Validates, EachComponentOfTheModule) {
    setenv("CLIPHOST_FAULT", "second-component-goes-on", 1);
    const json check = Validate(Faulty("FaultyModule"), "--only refusal-definition-calls")
                           .Of("refusal-definition-calls");
    EXPECT_EQ(check["verdict"], "failed");
    EXPECT_NE(check.value("done", "").find("component 1 "), std::string::npos) << check.dump(2);
}

TEST_F(Validates, EachContainerAndEachVolumeThatClaimsMovies) {
    struct Wrong {
        const char* fault;
        const char* id;
        const char* done;
    };
    for (const Wrong& wrong :
         {Wrong{"last-container", "container-describes",
                "component 6, Last container: describing a sound movie"},
          Wrong{"last-volume", "volume-format",
                "component 5, Last volume: listing the clips of a folder of movies"}}) {
        SCOPED_TRACE(wrong.fault);
        setenv("CLIPHOST_FAULT", wrong.fault, 1);
        const Answer answer = Validate(Faulty("FaultyModule"), std::string("--only ") + wrong.id);
        EXPECT_EQ(answer.status, 1);
        const json check = answer.Of(wrong.id);
        EXPECT_EQ(check["verdict"], "failed");
        EXPECT_EQ(check.value("done", "").rfind(wrong.done, 0), 0u) << check.dump(2);
    }
}

TEST_F(Validates, AContainerWhereAnotherOneSkipsTheCheck) {
    setenv("CLIPHOST_FAULT", "last-container", 1);  // it describes nothing, so it skips that
    const Answer answer = Validate(Faulty("FaultyModule"), "--only description-slots");
    EXPECT_EQ(answer.Of("description-slots")["verdict"], "passed");
    setenv("CLIPHOST_FAULT", "container-describes", 1);  // no other one claims movies
    const json skipped =
        Validate(Faulty("FaultyModule"), "--only description-slots").Of("description-slots");
    EXPECT_EQ(skipped["verdict"], "skipped");
    EXPECT_EQ(skipped.value("found", "").rfind("the module does not describe a sound movie", 0),
              0u);
}

TEST_F(Validates, AndWarnsWhereCallsHaveNoEnd) {
    setenv("CLIPHOST_FAULT", "attributes-without-end", 1);
    const Answer answer = Validate(Faulty("FaultyModule"), "--only refusal-definition-calls");
    EXPECT_EQ(answer.status, 0);
    const json check = answer.Of("refusal-definition-calls");
    EXPECT_EQ(check["verdict"], "warning") << check.dump(2);
    EXPECT_EQ(check["found"], "there are more, which were not refused");
}

TEST_F(Validates, AndWarnsWhereQueriesHaveNoEnd) {
    setenv("CLIPHOST_FAULT", "queries-without-end", 1);
    const Answer answer =
        Validate(Faulty("FaultyModule"), "--only refusal-query --limit-seconds 100000");
    EXPECT_EQ(answer.status, 0);
    const json check = answer.Of("refusal-query");
    EXPECT_EQ(check["verdict"], "warning") << check.dump(2);
    EXPECT_EQ(check["expected"], "no more than 5000 calls of the host");
    EXPECT_EQ(check["found"], "there are more, which were not refused");
}

TEST_F(Validates, AndAsksForNoMoreComponentsThanAModuleCanHave) {
    setenv("CLIPHOST_FAULT", "plugin-component-count", 1);
    for (const std::string id :
         {"component-definitions", "definition-once", "order-registration-after-start"}) {
        const json check = Validate(Faulty("FaultyModule"), "--only " + id).Of(id);
        EXPECT_EQ(check["verdict"], "skipped") << check.dump(2);
        EXPECT_EQ(check["found"], "it claims 4294967295 components");
    }
}

TEST_F(Validates, AMappingWhoseFirstTrackTellsNoSamples) {
    setenv("CLIPHOST_FAULT", "first-track-without-samples", 1);
    EXPECT_EQ(Validate(Faulty("FaultyModule"), "--only mapping-outlives")
                  .Of("mapping-outlives")["verdict"],
              "passed");
    setenv("CLIPHOST_FAULT", "first-track-without-samples mapping-outlives", 1);
    EXPECT_EQ(Validate(Faulty("FaultyModule"), "--only mapping-outlives")
                  .Of("mapping-outlives")["verdict"],
              "failed");
}

TEST_F(Validates, AndHoldsChecksToTheirMemory) {
    setenv("CLIPHOST_FAULT", "takes-memory files-hostile", 1);  // hangs until that is seen
    const json check = Validate(Faulty("FaultyModule"), "--only files-hostile --limit-memory 64")
                           .Of("files-hostile");
    EXPECT_EQ(check["verdict"], "failed");
    EXPECT_EQ(check["expected"], "no more than 64 MiB of memory");
    EXPECT_NE(check.value("cause", "").find("memory is claimed"), std::string::npos);
    EXPECT_NE(check.value("again", "").find(" --limit-memory 64"), std::string::npos);
}

TEST_F(Validates, AndTellsWhyACheckTookTooLong) {
    setenv("CLIPHOST_FAULT", "files-hostile", 1);
    const json check = Validate(Faulty("FaultyModule"), "--only files-hostile --limit-seconds 1")
                           .Of("files-hostile");
    EXPECT_NE(check.value("cause", "").find("a loop or a wait does not end"), std::string::npos);
    EXPECT_NE(check.value("again", "").find(" --limit-seconds 1"), std::string::npos);
}

TEST_F(Validates, AndDoesItInItsOwnProcessForADebugger) {
    const Answer answer =
        Validate(kMinimal, "--in-process --only plugin-id --only create-by-class-id");
    EXPECT_EQ(answer.status, 0);
    EXPECT_EQ(answer.value["counts"]["passed"], 2);
    setenv("CLIPHOST_FAULT", "order-shutdown-twice", 1);
    const CommandResult crashed = RunCliphost("validate " + Quoted(Faulty("FaultyModule")) +
                                              " --in-process --only order-shutdown-twice");
    EXPECT_NE(crashed.status, 0);
    EXPECT_NE(crashed.status, 1) << "the crash ends the program: " << crashed.out;
    EXPECT_NE(crashed.out.find("order-shutdown-twice: calling NCFShutdown a second time\n"),
              std::string::npos)
        << crashed.out;
}

TEST_F(Validates, AndBlamesNoModuleForFilesThatItCannotWriteItself) {
    for (const char* const given : {"", " --in-process"}) {
        SCOPED_TRACE(given);
        const CommandResult ran = RunCommand(
            "ulimit -f 2; " + Quoted(ProgramFolder() / "cliphost") + " validate " +
            Quoted(Faulty("FaultyModule")) +
            " --only files-broken --only volume-info --only container-path-once" + given);
        ExpectSays(ran, 2, "3 checks: 0 passed, 0 failed, 0 crashed, 0 timed out, 0 warning, 3");
        ExpectSays(ran, 2, "because   the checker can't write ");
        ExpectSays(ran, 2, "whole.mov: File too large; name another folder in TMPDIR\n");
    }
}

TEST_F(Validates, AndPassesNothingWhereAllIsSkipped) {
    const std::string call = "validate " + Quoted(kMinimal) + " --only volume-info";
    for (const char* const given : {"", " --in-process", " --json"}) {
        SCOPED_TRACE(given);
        ExpectSays(RunCliphost(call + given), 2,
                   "MinimalModule.nvx: nothing was checked: all checks were skipped, and say why");
    }
    ExpectSays(RunCliphost(call + " --only plugin-id"), 0, "2 checks: 1 passed");
}

TEST_F(Validates, AndTellsWhenItsAnswerCannotBeWritten) {
    const std::string call = Quoted(ProgramFolder() / "cliphost") + " validate " +
                             Quoted(Faulty("FaultyModule")) + " --only plugin-id";
    for (const char* const given : {"", " --json", " --in-process", " --list"}) {
        SCOPED_TRACE(given);
        ExpectSays(RunCommand(call + given + " 2>&1 >/dev/full"), 2, "standard output");
    }
}

TEST_F(Validates, AndLeavesNoFilesBehind) {
    const std::filesystem::path scratch = folder() / "scratch";
    std::filesystem::create_directory(scratch);
    const CommandResult ran =
        RunCommand("TMPDIR=" + Quoted(scratch) + " " + Quoted(ProgramFolder() / "cliphost") +
                   " validate " + Quoted(kOurs) + " --only files-huge --only container-odd-names");
    ExpectSays(ran, 0, "2 checks: 2 passed");
    EXPECT_TRUE(std::filesystem::is_empty(scratch));
}

}  // namespace
