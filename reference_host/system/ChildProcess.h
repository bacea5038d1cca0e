// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <chrono>
#include <cstddef>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace host::system {

// Logical processors that this process may use; at least 1.
unsigned UsableProcessors();

// How a process ended.
struct ProcessEnd {
    int signal = 0;  // that ended it; 0: it ended of itself
    int status = 0;  // its exit status then
};

// A process that we started, and our ends of what connects us: a channel for bytes in
// both directions, and the child's standard error. Its standard input and output lead
// nowhere. It ends with this object.
class ChildProcess {
public:
    ChildProcess();
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    // 0, or the system's error number.
    int Start(const std::filesystem::path& program, const std::vector<std::string>& arguments);
    bool IsRunning() const { return ends_ != nullptr; }

    // Neither waits: what finds no room in the channel is kept, and sent with the rest.
    // False when the child takes nothing more.
    bool Send(const std::string& bytes);
    bool SendRest();
    // Appends what has arrived, without waiting. False once the child has closed its end.
    bool Receive(std::string& bytes);
    // Whether the last call of Receive may have left something.
    bool HasMore() const { return hasMore_; }
    // The same of its standard error, up to a length of the text; what comes then is lost.
    void ReceiveErrors(std::string& text, std::size_t most);
    // The most memory that it held resident so far; 0 where the system can't tell.
    std::size_t PeakMemory() const;

    // Ends it if it still runs, and takes it off the system's list.
    ProcessEnd End();

    // Sleeps until one of these has sent something, has room for what is kept or has ended, or
    // until a time has passed or a signal came.
    static void WaitForAny(const std::vector<const ChildProcess*>& children,
                           std::chrono::milliseconds most);

private:
    struct Ends;  // the process, and our ends, as the system knows them

    std::unique_ptr<Ends> ends_;
    std::string unsent_;
    bool hasMore_ = false;
};

// The other end, inside a child process.
class ParentChannel {
public:
    // Whether this process was started as a child. It then ends when its parent does.
    static bool Join();
    // Waits for bytes and appends those that are there. False when the parent has gone.
    static bool Receive(std::string& bytes);
    // Sends all of the bytes. False when the parent has gone.
    static bool Write(const std::string& bytes);
};

}  // namespace host::system
