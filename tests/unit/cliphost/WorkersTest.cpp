// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Processes that answer, and such that do anything else. A shell stands in for the program:
// descriptor 3 is its channel.

#include "reference_host/cliphost/Workers.h"

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>
#include <chrono>
#include <thread>

#include <map>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Fields.h"

namespace {

using namespace cliphost;

// Bytes as the shell's printf takes them.
std::string Octal(const std::string& bytes) {
    std::string text;
    for (const char c : bytes) {
        const auto value = static_cast<unsigned char>(c);
        text += {'\\', '0', static_cast<char>('0' + (value >> 6)),
                 static_cast<char>('0' + (value >> 3 & 7)), static_cast<char>('0' + (value & 7))};
    }
    return "printf %b '" + text + "' >&3\n";
}

std::string Ready() {
    return Octal(FieldWriter().Add("").Message());
}

std::string Answer(const std::string& text) {
    return Octal(FieldWriter().Add(text).Message());
}

// Waits for the next request: 8 bytes of length, 8 of number, 8 of length and the text "x".
std::string Request() {
    return "head -c 25 <&3 >/dev/null || exit\n";
}

class Client : public WorkerClient {
public:
    bool Read(std::size_t number, const std::string& answer) override {
        FieldReader fields(answer);
        answers[number] = fields.Text();
        return fields.IsWhole();
    }
    bool Take(std::size_t number, const WorkerResult& result) override {
        taken.push_back(number);
        results.push_back(result);
        return result.failure.empty() || !endsAtFailure;
    }

    bool endsAtFailure = false;

    std::map<std::size_t, std::string> answers;
    std::vector<std::size_t> taken;
    std::vector<WorkerResult> results;
};

// Gives so many requests to so many shells.
Client RunShells(const std::string& script, std::size_t requests = 1, unsigned jobs = 1,
                 const WorkerLimits& limits = {}) {
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", script};
    call.jobs = jobs;
    call.limits = limits;
    Client client;
    RunInWorkers(call, std::vector<std::string>(requests, "x"), client);
    return client;
}

std::string FailureOf(const std::string& afterRequest, const WorkerLimits& limits = {}) {
    const Client client = RunShells(Ready() + Request() + afterRequest, 1, 1, limits);
    return client.results.size() == 1 ? client.results[0].failure : "no result";
}

TEST(Workers, GiveResultsInTheOrderOfTheRequests) {
    const std::string loop = Ready() + "while true\ndo\n" + Request() + Answer("fine") + "done\n";
    for (const unsigned jobs : {1u, 2u, 5u, 20u}) {
        const Client client = RunShells(loop, 12, jobs);
        ASSERT_EQ(client.taken.size(), 12u) << jobs;
        for (std::size_t i = 0; i < 12; ++i) {
            EXPECT_EQ(client.taken[i], i);
            EXPECT_EQ(client.answers.at(i), "fine");
            EXPECT_EQ(client.results[i].failure, "");
        }
    }
}

TEST(Workers, TellHowAProcessEnded) {
    EXPECT_EQ(FailureOf("kill -SEGV $$"), "the process that read it was ended by signal 11");
    EXPECT_EQ(FailureOf("exit 7"),
              "the process that read it ended with status 7 and without an answer");
    EXPECT_EQ(FailureOf("exit 0"),
              "the process that read it ended with status 0 and without an answer");
    // It would stay without anything to say.
    EXPECT_EQ(FailureOf("exec 3>&-; sleep 1000"), "the process that read it was ended by signal 9");
}

TEST(Workers, KeepWhatAProcessWroteBeforeItEnded) {
    const Client client = RunShells(Ready() + Request() + "echo half a line >&2; kill -SEGV $$");
    ASSERT_EQ(client.results.size(), 1u);
    EXPECT_EQ(client.results[0].told, "half a line\n");
}

TEST(Workers, EndAProcessThatGivesNoAnswer) {
    const std::string none = "the process that read it gave an answer that is none";
    EXPECT_EQ(FailureOf(Octal(FieldWriter().Add(~std::uint64_t{0}).bytes()) + "sleep 1000"), none);
    EXPECT_EQ(FailureOf(Octal(FieldWriter().Add(kLongestMessage + 1).bytes()) + "sleep 1000"),
              none);
    EXPECT_EQ(FailureOf(Octal(FieldWriter().Message()) + "sleep 1000"), none);
    EXPECT_EQ(FailureOf(Octal(FieldWriter().Add("a").Add("b").Message()) + "sleep 1000"), none);
}

TEST(Workers, TryARequestOnceMoreThatMayHaveMetAnothersHarm) {
    // Each process answers one request and ends at the second one.
    const Client client =
        RunShells(Ready() + Request() + Answer("fine") + Request() + "kill -SEGV $$", 6, 2);
    EXPECT_EQ(client.answers.size(), 6u);
    for (const WorkerResult& result : client.results) {
        EXPECT_EQ(result.failure, "");
    }
}

TEST(Workers, LoseTheRequestAloneThatEndsEveryProcess) {
    // The first byte of the number.
    const std::string request = "n=$(head -c 25 <&3 | od -An -tu1 -j8 -N1)\n[ $n ] || exit\n";
    const std::string crash = "[ $n = 3 ] && kill -SEGV $$\n";
    for (const unsigned jobs : {1u, 2u}) {
        const Client client = RunShells(
            Ready() + "while true\ndo\n" + request + crash + Answer("fine") + "done\n", 8, jobs);
        ASSERT_EQ(client.results.size(), 8u);
        for (std::size_t i = 0; i < 8; ++i) {
            EXPECT_EQ(client.results[i].failure.empty(), i != 3) << i;
        }
        EXPECT_EQ(client.results[3].failure, "the process that read it was ended by signal 11");
    }
}

// Shells that note each start, and how often that was.
class WorkersInOrder : public testing::Test {
protected:
    void TearDown() override { std::filesystem::remove(starts_); }
    Client Run(const std::string& script, bool leanOnEachOther, const WorkerLimits& limits = {}) {
        std::filesystem::remove(starts_);
        WorkerCall call;
        call.program = "/bin/sh";
        call.arguments = {"-c", "echo >>'" + starts_.u8string() + "'\n" + script};
        call.jobs = 2;
        call.limits = limits;
        call.leanOnEachOther = leanOnEachOther;
        Client client;
        client.endsAtFailure = true;
        RunInWorkers(call, std::vector<std::string>(5, "x"), client);
        return client;
    }
    std::uintmax_t Starts() const { return std::filesystem::file_size(starts_); }

private:
    const std::filesystem::path starts_ =
        std::filesystem::path(testing::TempDir()) / ("starts-" + std::to_string(getpid()));
};

TEST_F(WorkersInOrder, AreOneProcessWhateverItHolds) {
    // 40 MB stay with it from the start.
    const std::string script = "x=$(head -c 40000000 /dev/zero | tr '\\0' x)\n" + Ready() +
                               "while true\ndo\n" + Request() + Answer("fine") + "done\n";
    EXPECT_EQ(Run(script, true, {0, 120}).answers.size(), 5u);
    EXPECT_EQ(Starts(), 1u);
    EXPECT_EQ(Run(script, false, {0, 120}).answers.size(), 5u);
    EXPECT_GE(Starts(), 5u) << "the script doesn't hold enough";
}

TEST_F(WorkersInOrder, TryNothingTwiceAndNothingBehindALoss) {
    const std::string script =
        Ready() + Request() + Answer("fine") + Request() + Answer("fine") + Request() + "exit 7";
    const Client client = Run(script, true);
    EXPECT_EQ(Starts(), 1u);
    EXPECT_EQ(client.taken, (std::vector<std::size_t>{0, 1, 2}));
    EXPECT_EQ(client.results.back().failure,
              "the process that read it ended with status 7 and without an answer");
}

TEST_F(WorkersInOrder, HaveTheTimeLimitForEachRequest) {
    const std::string script =
        Ready() + "while true\ndo\n" + Request() + "sleep 0.7\n" + Answer("fine") + "done\n";
    EXPECT_EQ(Run(script, true, {2, 0}).answers.size(), 5u);
    EXPECT_EQ(Starts(), 1u);
}

TEST(Workers, AreAskedForNoMoreThanTheirClientWants) {
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", Ready() + Request() + "kill -SEGV $$"};
    Client client;
    client.endsAtFailure = true;
    RunInWorkers(call, std::vector<std::string>(6, "x"), client);
    EXPECT_EQ(client.taken.size(), 1u);
}

TEST(Workers, GetRequestsThatAChannelDoesNotHold) {
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", Ready() + "while true\ndo\nsleep 0.1\n" +
                                "test $(head -c 1000024 <&3 | wc -c) = 1000024 || exit\n" +
                                Answer("fine") + "done\n"};
    Client client;
    RunInWorkers(call, std::vector<std::string>(3, std::string(1000000, 'x')), client);
    EXPECT_EQ(client.answers.size(), 3u);
    EXPECT_EQ(client.answers[2], "fine");
}

TEST(Workers, AreNotChargedWithTimeInWhichNobodyListens) {
    class SlowClient : public Client {
    public:
        bool Take(std::size_t number, const WorkerResult& result) override {
            std::this_thread::sleep_for(std::chrono::milliseconds(1500));
            return Client::Take(number, result);
        }
    };
    const std::string answer = FieldWriter().Add(std::string(300000, '\0')).Message();
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", Ready() + "while true\ndo\n" + Request() +
                                Octal(answer.substr(0, answer.size() - 300000)) +
                                "head -c 300000 /dev/zero >&3\ndone\n"};
    call.jobs = 2;
    call.limits = {1, 0};
    SlowClient client;
    RunInWorkers(call, std::vector<std::string>(4, "x"), client);
    ASSERT_EQ(client.results.size(), 4u);
    for (const WorkerResult& result : client.results) {
        EXPECT_EQ(result.failure, "");
    }
}

TEST(Workers, GoOnWithTheOthersWhereOneDoesNotStartAnew) {
    // The first to come makes the folder and serves; the others end at once.
    const std::filesystem::path folder =
        std::filesystem::path(testing::TempDir()) / ("first-" + std::to_string(getpid()));
    const Client client =
        RunShells("mkdir '" + folder.u8string() + "' 2>/dev/null || exit 1\n" + Ready() +
                      "while true\ndo\n" + Request() + Answer("fine") + "done\n",
                  6, 3);
    std::filesystem::remove(folder);
    EXPECT_EQ(client.answers.size(), 6u);
}

TEST(Workers, HeedNoAnswerThatNobodyAskedFor) {
    const Client client = RunShells(
        Ready() + Request() + Answer("one") + Answer("two") + Answer("three") + "sleep 1000", 1);
    ASSERT_EQ(client.results.size(), 1u);
    EXPECT_EQ(client.answers.at(0), "one");
}

TEST(Workers, EndAProcessThatTakesTooLong) {
    EXPECT_EQ(FailureOf("sleep 1000", {1, 0}), "took longer than 1 second");
    EXPECT_EQ(FailureOf("while true; do :; done", {2, 0}), "took longer than 2 seconds");
}

TEST(Workers, EndAProcessThatNeedsTooMuch) {
    EXPECT_EQ(FailureOf("x=xxxxxxxxxxxxxxxx; while true; do x=$x$x; done", {0, 64}),
              "needed more than 64 MiB");
}

TEST(Workers, FailWhereNoProcessStarts) {
    EXPECT_THROW(RunShells("exit 1"), Failure);
    WorkerCall call;
    call.program = "/no/such/program";
    Client client;
    EXPECT_THROW(RunInWorkers(call, {"x"}, client), Failure);
}

TEST(Workers, AreAsManyAsTheSystemHasRoomFor) {
    rlimit before{};
    ASSERT_EQ(getrlimit(RLIMIT_NOFILE, &before), 0);
    const rlimit few{40, before.rlim_max};
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &few), 0);
    const Client client =
        RunShells(Ready() + "while true\ndo\n" + Request() + Answer("fine") + "done\n", 100, 100);
    ASSERT_EQ(setrlimit(RLIMIT_NOFILE, &before), 0);
    EXPECT_EQ(client.answers.size(), 100u);
}

TEST(Workers, FailWhereTheLastCanNotBeStartedAnew) {
    // Of two the first alone serves, once, and takes the program away.
    const std::filesystem::path folder =
        std::filesystem::path(testing::TempDir()) / ("last-" + std::to_string(getpid()));
    std::filesystem::create_directory(folder);
    WorkerCall call;
    call.program = folder / "sh";
    std::filesystem::copy_file("/bin/sh", call.program);
    call.arguments = {
        "-c", "mkdir '" + (folder / "first").u8string() + "' 2>/dev/null || exit 1\n" + Ready() +
                  Request() + "sleep 0.3; rm '" + call.program.u8string() + "'\n" + Answer("fine")};
    call.jobs = 2;
    Client client;
    EXPECT_THROW(RunInWorkers(call, std::vector<std::string>(4, "x"), client), Failure);
    std::filesystem::remove_all(folder);
}

TEST(Workers, HaveNothingToDoWithoutRequests) {
    EXPECT_TRUE(RunShells("exit 1", 0).taken.empty());
}

TEST(Workers, GetAFolderEach) {
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", Ready() + Request() + "echo \"$0\" >&2; test -d \"${0#*=}\" && " +
                                Answer("there") + "sleep 1000"};
    call.jobs = 1;
    call.writeNear = testing::TempDir();
    Client client;
    RunInWorkers(call, {"x"}, client);
    ASSERT_EQ(client.results.size(), 1u);
    EXPECT_EQ(client.results[0].failure, "");
    const std::filesystem::path folder = client.results[0].folder;
    EXPECT_EQ(folder.parent_path().parent_path(),
              std::filesystem::path(testing::TempDir() + "/").lexically_normal().parent_path());
    EXPECT_FALSE(std::filesystem::exists(folder.parent_path()));
}

TEST(Workers, LeaveNothingOfWhatTheyWereAt) {
    // The first process ends while it writes; the next one looks for what is left.
    WorkerCall call;
    call.program = "/bin/sh";
    call.arguments = {"-c", Ready() + "n=$(head -c 25 <&3 | od -An -tu1 -j8 -N1)\n" +
                                "own=${0#*=}\n" +
                                "[ $n = 0 ] && { echo >\"$own/0_7.part\"; kill -SEGV $$; }\n" +
                                "ls \"$own\"/../* >&2\n" + Answer("fine")};
    call.writeNear = testing::TempDir();
    Client client;
    RunInWorkers(call, std::vector<std::string>(2, "x"), client);
    ASSERT_EQ(client.results.size(), 2u);
    EXPECT_NE(client.results[0].failure, "");
    EXPECT_NE(client.results[1].told.find("/0"), std::string::npos) << "its folder";
    EXPECT_EQ(client.results[1].told.find("0_7"), std::string::npos) << client.results[1].told;
}

TEST(Workers, AdviseOneJobOnlyWhereThereAreMore) {
    for (const unsigned jobs : {1u, 2u}) {
        WorkerCall call;
        call.program = "/no/such/program";
        call.jobs = jobs;
        Client client;
        try {
            RunInWorkers(call, {"x", "x"}, client);
            ADD_FAILURE() << "nothing was thrown";
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.problem().hint.empty(), jobs == 1);
        }
    }
}

TEST(Workers, AreStartedByAParent) {
    EXPECT_FALSE(ServeAsWorker({}, [](std::uint64_t, const std::string&) { return ""; }));
}

}  // namespace
