// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <string>
#include <vector>

namespace cliphost {

// Many movies at once: child processes of this program read one after the other, each with
// a host of its own. What a movie does to its process, it does to itself alone: a request whose
// process ends after others were answered there is tried once more, in a process of its own.

struct WorkerLimits {
    unsigned seconds = 0;    // for one movie; 0: none
    unsigned mebibytes = 0;  // of resident memory; 0: none

    bool AreSet() const { return seconds != 0 || mebibytes != 0; }
};

struct WorkerCall {
    std::filesystem::path program;
    std::vector<std::string> arguments;
    unsigned jobs = 1;
    WorkerLimits limits;
    // Processes that write files get a folder each beneath this one, or beneath the folder
    // for temporary files where it can't be written; --folder tells them. Empty: they write
    // nothing.
    std::filesystem::path writeNear;
    int verbosity = 0;
    // Results that wait for one before them; no more requests are begun than that.
    std::size_t mostWaiting = 256;
    // All are of one movie, and the process needs what it read for those before: one process is
    // given them in order, none twice, and what memory it holds is theirs.
    bool leanOnEachOther = false;

    unsigned Processes() const { return leanOnEachOther ? 1 : jobs; }
};

// Throws a Failure where limits are set for a movie that no other process can open.
void RefuseDescriptor(const WorkerCall& call, const std::filesystem::path& movie);

// What became of one request.
struct WorkerResult {
    std::string told;              // what the process wrote on standard error
    std::string failure;           // what became of the process, where it gave no answer
    std::filesystem::path folder;  // that it could write
};

// Whoever has requests, each known by its number from 0.
class WorkerClient {
public:
    virtual ~WorkerClient() = default;
    // Keeps an answer, which may be anything: the process has met the movie. False for what is
    // none; the process then ends. Answers come in any order.
    virtual bool Read(std::size_t number, const std::string& answer) = 0;
    // The result, in the order of the requests. False where those behind it are wanted no more.
    virtual bool Take(std::size_t number, const WorkerResult& result) = 0;
};

// Requests that are put together when they are sent.
struct WorkerRequests {
    std::size_t count;
    std::function<std::string(std::size_t number)> text;
};

// Gives requests to processes. Throws a Failure when none can be started.
void RunInWorkers(const WorkerCall& call, const WorkerRequests& requests, WorkerClient& client);
void RunInWorkers(const WorkerCall& call, const std::vector<std::string>& requests,
                  WorkerClient& client);

// The other side, in the child: gives up all rights but to write in a folder, which may be
// empty, and answers requests, which come with their number, until the parent has no more.
// False when nobody started this process as a child.
bool ServeAsWorker(const std::filesystem::path& folder,
                   const std::function<std::string(std::uint64_t, const std::string&)>& answer);

}  // namespace cliphost
