// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ChildProcess.h"

#include <fcntl.h>
#include <poll.h>
#include <sched.h>
#include <spawn.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <fstream>
#include <utility>

#include "reference_host/util/text/Number.h"

extern char** environ;

namespace host::system {
namespace {

// Where the child finds the channel; it inherits no descriptor above.
constexpr int kChannel = STDERR_FILENO + 1;

void CloseIfOpen(int& descriptor) {
    if (descriptor >= 0) {
        close(std::exchange(descriptor, -1));
    }
}

// The two ends of a connection, for as long as it takes to start a process.
struct Pair {
    int ends[2] = {-1, -1};
    ~Pair() {
        CloseIfOpen(ends[0]);
        CloseIfOpen(ends[1]);
    }
    int Take(std::size_t end) { return std::exchange(ends[end], -1); }
};

class SpawnActions {
public:
    SpawnActions() { posix_spawn_file_actions_init(&actions_); }
    ~SpawnActions() { posix_spawn_file_actions_destroy(&actions_); }
    SpawnActions(const SpawnActions&) = delete;
    SpawnActions& operator=(const SpawnActions&) = delete;

    void Open(int descriptor, const char* file, int flags) {
        posix_spawn_file_actions_addopen(&actions_, descriptor, file, flags, 0);
    }
    void Copy(int from, int to) { posix_spawn_file_actions_adddup2(&actions_, from, to); }
    void CloseFrom(int first) { posix_spawn_file_actions_addclosefrom_np(&actions_, first); }
    const posix_spawn_file_actions_t* get() const { return &actions_; }

private:
    posix_spawn_file_actions_t actions_;
};

constexpr std::size_t kPiece = 65536;

// Reads what is there; false at the end. The descriptor does not wait.
bool ReadSome(int descriptor, std::string& bytes) {
    char piece[kPiece];
    for (;;) {
        const ssize_t got = read(descriptor, piece, sizeof piece);
        if (got > 0) {
            bytes.append(piece, static_cast<std::size_t>(got));
        } else if (got == 0 || (errno != EINTR && errno != EAGAIN)) {
            return false;
        } else if (errno == EAGAIN) {
            return true;
        }
        if (got == static_cast<ssize_t>(sizeof piece)) {
            return true;  // others want to be heard, too
        }
    }
}

}  // namespace

struct ChildProcess::Ends {
    pid_t process;
    int channel;
    int errors;

    ~Ends() {
        CloseIfOpen(channel);
        CloseIfOpen(errors);
    }
};

ChildProcess::ChildProcess() = default;

ChildProcess::~ChildProcess() {
    End();
}

unsigned UsableProcessors() {
    cpu_set_t processors;
    if (sched_getaffinity(0, sizeof processors, &processors) != 0) {
        return static_cast<unsigned>(std::max(1L, sysconf(_SC_NPROCESSORS_ONLN)));
    }
    return static_cast<unsigned>(std::max(1, CPU_COUNT(&processors)));
}

int ChildProcess::Start(const std::filesystem::path& program,
                        const std::vector<std::string>& arguments) {
    End();
    Pair channel;
    Pair errors;
    if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, channel.ends) != 0 ||
        pipe2(errors.ends, O_CLOEXEC) != 0 || fcntl(channel.ends[0], F_SETFL, O_NONBLOCK) != 0 ||
        fcntl(errors.ends[0], F_SETFL, O_NONBLOCK) != 0) {
        return errno;
    }
    SpawnActions actions;
    actions.Open(STDIN_FILENO, "/dev/null", O_RDONLY);
    actions.Open(STDOUT_FILENO, "/dev/null", O_WRONLY);
    actions.Copy(errors.ends[1], STDERR_FILENO);
    actions.Copy(channel.ends[1], kChannel);
    actions.CloseFrom(kChannel + 1);
    std::string name = program;
    std::vector<std::string> texts = arguments;
    std::vector<char*> line = {name.data()};
    for (std::string& text : texts) {
        line.push_back(text.data());
    }
    line.push_back(nullptr);
    pid_t process = 0;
    if (const int error =
            posix_spawn(&process, name.c_str(), actions.get(), nullptr, line.data(), environ)) {
        return error;
    }
    ends_.reset(new Ends{process, channel.Take(0), errors.Take(0)});
    return 0;
}

bool ChildProcess::Send(const std::string& bytes) {
    unsent_ += bytes;
    return SendRest();
}

bool ChildProcess::SendRest() {
    while (!unsent_.empty()) {
        const ssize_t now = send(ends_->channel, unsent_.data(), unsent_.size(), MSG_NOSIGNAL);
        if (now >= 0) {
            unsent_.erase(0, static_cast<std::size_t>(now));
        } else if (errno == EAGAIN) {
            return true;
        } else if (errno != EINTR) {
            unsent_.clear();
            return false;
        }
    }
    return true;
}

bool ChildProcess::Receive(std::string& bytes) {
    const std::size_t before = bytes.size();
    const bool isOpen = ReadSome(ends_->channel, bytes);
    hasMore_ = isOpen && bytes.size() - before >= kPiece;
    return isOpen;
}

void ChildProcess::ReceiveErrors(std::string& text, std::size_t most) {
    if (ends_->errors >= 0 && !ReadSome(ends_->errors, text)) {
        CloseIfOpen(ends_->errors);
    }
    text.resize(std::min(text.size(), most));
}

std::size_t ChildProcess::PeakMemory() const {
    constexpr char kName[] = "VmHWM:";
    std::ifstream status("/proc/" + std::to_string(ends_->process) + "/status");
    for (std::string line; std::getline(status, line);) {
        if (line.compare(0, sizeof kName - 1, kName) == 0) {
            const std::size_t first = line.find_first_of("0123456789");
            const std::size_t end = line.find(' ', first);
            std::size_t kilobytes = 0;
            return first != std::string::npos && end != std::string::npos &&
                           text::ReadNumber(line.substr(first, end - first), kilobytes)
                       ? kilobytes * 1024
                       : 0;
        }
    }
    return 0;
}

ProcessEnd ChildProcess::End() {
    ProcessEnd end;
    if (ends_) {
        kill(ends_->process, SIGKILL);  // one that is ending already keeps the cause that it has
        int status = 0;
        while (waitpid(ends_->process, &status, 0) < 0 && errno == EINTR) {
        }
        end.signal = WIFSIGNALED(status) ? WTERMSIG(status) : 0;
        end.status = WIFEXITED(status) ? WEXITSTATUS(status) : 0;
    }
    ends_.reset();
    unsent_.clear();
    hasMore_ = false;
    return end;
}

void ChildProcess::WaitForAny(const std::vector<const ChildProcess*>& children,
                              std::chrono::milliseconds most) {
    std::vector<pollfd> ends;
    for (const ChildProcess* const child : children) {
        const int room = child->unsent_.empty() ? 0 : POLLOUT;
        ends.push_back({child->ends_->channel, static_cast<short>(POLLIN | room), 0});
        ends.push_back({child->ends_->errors, POLLIN, 0});
    }
    poll(ends.data(), ends.size(), static_cast<int>(most.count()));
}

bool ParentChannel::Join() {
    struct stat channel {};
    if (fstat(kChannel, &channel) != 0 || !S_ISSOCK(channel.st_mode)) {
        return false;
    }
    prctl(PR_SET_PDEATHSIG, SIGKILL);  // a parent that ended before closes the channel
    return true;
}

bool ParentChannel::Receive(std::string& bytes) {
    std::array<char, 4096> arrived;
    for (;;) {
        const ssize_t got = read(kChannel, arrived.data(), arrived.size());
        if (got < 0 && errno == EINTR) {
            continue;
        }
        bytes.append(arrived.data(), static_cast<std::size_t>(std::max<ssize_t>(got, 0)));
        return got > 0;
    }
}

bool ParentChannel::Write(const std::string& bytes) {
    for (std::size_t sent = 0; sent < bytes.size();) {
        const ssize_t now = write(kChannel, bytes.data() + sent, bytes.size() - sent);
        if (now < 0 && errno != EINTR) {
            return false;
        }
        sent += static_cast<std::size_t>(std::max<ssize_t>(now, 0));
    }
    return true;
}

}  // namespace host::system
