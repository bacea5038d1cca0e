// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ChildProcess.h"

#include <algorithm>
#include <array>
#include <bitset>
#include <csignal>

#include "reference_host/system/Paths.h"
#include "reference_host/system/WindowsCalls.h"
#include "reference_host/util/text/CommandLine.h"
#include "text/Encodings.h"

// It needs what stands above.
#include <psapi.h>

namespace host::system {
namespace {

// Tells the child which of its handles is the channel.
constexpr wchar_t kChannelVariable[] = L"CLIPHOST_CHANNEL";
constexpr DWORD kPiece = 65536;
constexpr int kKilled = 9;  // as signals are counted elsewhere
constexpr UINT kEndedByParent = 0xCF000000u | kKilled;
// An ending process closes its handles shortly before it has ended.
constexpr DWORD kLongestEnd = 1000;

std::wstring Wide(const std::string& utf8) {
    return encodings::ToWideLossy(encodings::FromUtf8(utf8));
}

// What ends a process here, by the number of the signal that does elsewhere.
int SignalOf(DWORD status) {
    struct Row {
        DWORD status;
        int signal;
    };
    static constexpr Row kRows[] = {
        {kEndedByParent, kKilled},
        {3, SIGABRT_COMPAT},  // what abort() leaves
        {static_cast<DWORD>(STATUS_ACCESS_VIOLATION), SIGSEGV},
        {static_cast<DWORD>(STATUS_STACK_OVERFLOW), SIGSEGV},
        {static_cast<DWORD>(STATUS_PRIVILEGED_INSTRUCTION), SIGSEGV},
        {static_cast<DWORD>(STATUS_ILLEGAL_INSTRUCTION), SIGILL},
        {static_cast<DWORD>(STATUS_INTEGER_DIVIDE_BY_ZERO), SIGFPE},
        {static_cast<DWORD>(STATUS_FLOAT_DIVIDE_BY_ZERO), SIGFPE},
        {static_cast<DWORD>(STATUS_FLOAT_INVALID_OPERATION), SIGFPE},
        {static_cast<DWORD>(STATUS_STACK_BUFFER_OVERRUN), SIGABRT_COMPAT},
        {0xC0000374u, SIGABRT_COMPAT},  // the heap is damaged
        {static_cast<DWORD>(STATUS_CONTROL_C_EXIT), SIGINT},
    };
    for (const Row& row : kRows) {
        if (row.status == status) {
            return row.signal;
        }
    }
    return 0;
}

// Set whenever a call that goes on by itself has ended; who waits looks which it was.
HANDLE CallEvent() {
    static const HANDLE event = CreateEventW(nullptr, TRUE, FALSE, nullptr);
    return event;
}

}  // namespace

// A read or write that goes on by itself, and its memory.
class PipeCall {
public:
    PipeCall() = default;
    PipeCall(const PipeCall&) = delete;
    PipeCall& operator=(const PipeCall&) = delete;

    bool IsUnderWay() const { return isUnderWay_; }
    bool HasEnded() const { return isUnderWay_ && HasOverlappedIoCompleted(&overlapped_); }

    // False when the other end has gone.
    bool StartRead(HANDLE pipe) {
        Begin();
        return Note(ReadFile(pipe, bytes_.data(), kPiece, nullptr, &overlapped_));
    }
    bool StartWrite(HANDLE pipe, const std::string& from) {
        Begin();
        const std::size_t size = std::min<std::size_t>(from.size(), kPiece);
        std::copy_n(from.data(), size, bytes_.data());
        return Note(
            WriteFile(pipe, bytes_.data(), static_cast<DWORD>(size), nullptr, &overlapped_));
    }
    // Of a call that has ended: what was read or written. False when the other end has gone.
    bool Take(HANDLE pipe, std::string_view& done) {
        DWORD size = 0;
        isUnderWay_ = false;
        const BOOL isFine = GetOverlappedResult(pipe, &overlapped_, &size, FALSE);
        done = {bytes_.data(), size};
        return isFine;
    }
    void End(HANDLE pipe) {
        if (isUnderWay_) {
            EndCall(pipe, overlapped_);
        }
        isUnderWay_ = false;
    }

private:
    void Begin() {
        overlapped_ = {};
        overlapped_.hEvent = CallEvent();
    }
    bool Note(BOOL isDone) {
        isUnderWay_ = isDone || GetLastError() == ERROR_IO_PENDING;
        return isUnderWay_;
    }

    OVERLAPPED overlapped_{};
    std::vector<char> bytes_ = std::vector<char>(kPiece);
    bool isUnderWay_ = false;
};

// Our end of a connection.
struct PipeEnd {
    OwnedHandle pipe;
    PipeCall reading;
    PipeCall writing;

    ~PipeEnd() { Close(); }
    void Close() {
        reading.End(pipe.get());
        writing.End(pipe.get());
        pipe.Close();
    }

    // Appends what has arrived, about a piece of it at once. False once the other end is closed.
    bool ReadSome(std::string& bytes, bool& hasMore) {
        hasMore = false;
        for (std::size_t got = 0; pipe.IsOpen();) {
            if (!reading.IsUnderWay() && !reading.StartRead(pipe.get())) {
                return false;
            }
            if (!reading.HasEnded()) {
                return true;
            }
            if (got >= kPiece) {
                hasMore = true;
                return true;  // others want to be heard, too
            }
            std::string_view arrived;
            const bool isOpen = reading.Take(pipe.get(), arrived);
            bytes += arrived;
            got += arrived.size();
            if (!isOpen) {
                return false;
            }
        }
        return false;
    }

    // Sends of the bytes what finds room, and takes that away.
    bool WriteSome(std::string& bytes) {
        for (;;) {
            std::string_view sent;
            if (writing.IsUnderWay()) {
                if (!writing.HasEnded()) {
                    return true;
                }
                if (!writing.Take(pipe.get(), sent)) {
                    return false;
                }
                bytes.erase(0, sent.size());
            }
            if (bytes.empty()) {
                return true;
            }
            if (!writing.StartWrite(pipe.get(), bytes)) {
                return false;
            }
        }
    }
};

namespace {

// Connects our end with one that a child can inherit. 0, or the system's error.
DWORD Connect(OwnedHandle& own, OwnedHandle& others, bool isBothWays) {
    static unsigned number = 0;
    const std::wstring name = L"\\\\.\\pipe\\cliphost-" + std::to_wstring(GetCurrentProcessId()) +
                              L"-" + std::to_wstring(number++);
    own = OwnedHandle(CreateNamedPipeW(name.c_str(),
                                       (isBothWays ? PIPE_ACCESS_DUPLEX : PIPE_ACCESS_INBOUND) |
                                           FILE_FLAG_OVERLAPPED | FILE_FLAG_FIRST_PIPE_INSTANCE,
                                       PIPE_TYPE_BYTE | PIPE_REJECT_REMOTE_CLIENTS, 1, kPiece,
                                       kPiece, 0, nullptr));
    if (!own.IsOpen()) {
        return GetLastError();
    }
    SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
    others = OwnedHandle(CreateFileW(name.c_str(), (isBothWays ? GENERIC_READ : 0) | GENERIC_WRITE,
                                     0, &inherited, OPEN_EXISTING, 0, nullptr));
    return others.IsOpen() ? 0 : GetLastError();
}

// The handles that a child gets, and no others.
class Inherited {
public:
    explicit Inherited(std::vector<HANDLE> handles) : handles_(std::move(handles)) {
        SIZE_T size = 0;
        InitializeProcThreadAttributeList(nullptr, 1, 0, &size);
        memory_.resize(size);
        isReady_ =
            InitializeProcThreadAttributeList(list(), 1, 0, &size) &&
            UpdateProcThreadAttribute(list(), 0, PROC_THREAD_ATTRIBUTE_HANDLE_LIST, handles_.data(),
                                      handles_.size() * sizeof(HANDLE), nullptr, nullptr);
    }
    ~Inherited() { DeleteProcThreadAttributeList(list()); }
    Inherited(const Inherited&) = delete;
    Inherited& operator=(const Inherited&) = delete;

    bool IsReady() const { return isReady_; }
    LPPROC_THREAD_ATTRIBUTE_LIST list() {
        return reinterpret_cast<LPPROC_THREAD_ATTRIBUTE_LIST>(memory_.data());
    }

private:
    std::vector<HANDLE> handles_;
    std::vector<char> memory_;
    bool isReady_ = false;
};

// For as long as it lives, new processes find the channel.
class NamedChannel {
public:
    explicit NamedChannel(HANDLE channel) {
        SetEnvironmentVariableW(kChannelVariable,
                                std::to_wstring(reinterpret_cast<std::uintptr_t>(channel)).c_str());
    }
    ~NamedChannel() { SetEnvironmentVariableW(kChannelVariable, nullptr); }
    NamedChannel(const NamedChannel&) = delete;
    NamedChannel& operator=(const NamedChannel&) = delete;
};

// What ends its processes when we end, however we do. 0, or the system's error.
DWORD MakeJob(OwnedHandle& job) {
    JOBOBJECT_EXTENDED_LIMIT_INFORMATION limits{};
    limits.BasicLimitInformation.LimitFlags =
        JOB_OBJECT_LIMIT_KILL_ON_JOB_CLOSE | JOB_OBJECT_LIMIT_DIE_ON_UNHANDLED_EXCEPTION;
    job = OwnedHandle(CreateJobObjectW(nullptr, nullptr));
    const bool isMade =
        job.IsOpen() && SetInformationJobObject(job.get(), JobObjectExtendedLimitInformation,
                                                &limits, sizeof limits);
    return isMade ? 0 : GetLastError();
}

HANDLE channelToParent = INVALID_HANDLE_VALUE;

}  // namespace

struct ChildProcess::Ends {
    OwnedHandle process;
    OwnedHandle job;
    PipeEnd channel;
    PipeEnd errors;
    bool isClosed = false;  // the channel, by the child
};

ChildProcess::ChildProcess() = default;

ChildProcess::~ChildProcess() {
    End();
}

unsigned UsableProcessors() {
    DWORD_PTR own = 0;
    DWORD_PTR all = 0;
    if (!GetProcessAffinityMask(GetCurrentProcess(), &own, &all) || own == 0) {
        return std::max<DWORD>(1, GetActiveProcessorCount(ALL_PROCESSOR_GROUPS));
    }
    return static_cast<unsigned>(std::bitset<sizeof own * 8>(own).count());
}

int ChildProcess::Start(const std::filesystem::path& program,
                        const std::vector<std::string>& arguments) {
    End();
    auto ends = std::make_unique<Ends>();
    OwnedHandle channel;
    OwnedHandle errors;
    if (const DWORD error = Connect(ends->channel.pipe, channel, true)) {
        return ErrorNumber(error);
    }
    if (const DWORD error = Connect(ends->errors.pipe, errors, false)) {
        return ErrorNumber(error);
    }
    SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
    const OwnedHandle nowhere(CreateFileW(L"NUL", GENERIC_READ | GENERIC_WRITE,
                                          FILE_SHARE_READ | FILE_SHARE_WRITE, &inherited,
                                          OPEN_EXISTING, 0, nullptr));
    if (!nowhere.IsOpen()) {
        return LastErrorNumber();
    }
    if (const DWORD error = MakeJob(ends->job)) {
        return ErrorNumber(error);
    }
    Inherited handles({nowhere.get(), errors.get(), channel.get()});
    if (!handles.IsReady()) {
        return LastErrorNumber();
    }
    STARTUPINFOEXW start{};
    start.StartupInfo.cb = sizeof start;
    start.StartupInfo.dwFlags = STARTF_USESTDHANDLES;
    start.StartupInfo.hStdInput = nowhere.get();
    start.StartupInfo.hStdOutput = nowhere.get();
    start.StartupInfo.hStdError = errors.get();
    start.lpAttributeList = handles.list();
    std::vector<std::string> words = arguments;
    words.insert(words.begin(), PathText(program));
    std::wstring line = Wide(text::CommandLine(words));
    PROCESS_INFORMATION process{};
    const NamedChannel named(channel.get());
    // It runs once it can't outlive us.
    if (!CreateProcessW(program.c_str(), line.data(), nullptr, nullptr, TRUE,
                        CREATE_SUSPENDED | CREATE_NO_WINDOW | EXTENDED_STARTUPINFO_PRESENT |
                            CREATE_UNICODE_ENVIRONMENT,
                        nullptr, nullptr, &start.StartupInfo, &process)) {
        return LastErrorNumber();
    }
    ends->process = OwnedHandle(process.hProcess);
    const OwnedHandle thread(process.hThread);
    if (!AssignProcessToJobObject(ends->job.get(), process.hProcess)) {
        const DWORD error = GetLastError();
        TerminateProcess(process.hProcess, kEndedByParent);
        return ErrorNumber(error);
    }
    ResumeThread(thread.get());
    ends_ = std::move(ends);
    return 0;
}

bool ChildProcess::Send(const std::string& bytes) {
    unsent_ += bytes;
    return SendRest();
}

bool ChildProcess::SendRest() {
    if (ends_->channel.WriteSome(unsent_)) {
        return true;
    }
    unsent_.clear();
    return false;
}

bool ChildProcess::Receive(std::string& bytes) {
    const bool isOpen = ends_->channel.ReadSome(bytes, hasMore_);
    ends_->isClosed = !isOpen;
    return isOpen;
}

void ChildProcess::ReceiveErrors(std::string& text, std::size_t most) {
    bool ignored = false;
    if (ends_->errors.pipe.IsOpen() && !ends_->errors.ReadSome(text, ignored)) {
        ends_->errors.Close();
    }
    text.resize(std::min(text.size(), most));
}

std::size_t ChildProcess::PeakMemory() const {
    PROCESS_MEMORY_COUNTERS memory{};
    memory.cb = sizeof memory;
    return K32GetProcessMemoryInfo(ends_->process.get(), &memory, sizeof memory)
               ? memory.PeakWorkingSetSize
               : 0;
}

ProcessEnd ChildProcess::End() {
    ProcessEnd end;
    if (ends_) {
        const HANDLE process = ends_->process.get();
        if (WaitForSingleObject(process, ends_->isClosed ? kLongestEnd : 0) != WAIT_OBJECT_0) {
            TerminateJobObject(ends_->job.get(), kEndedByParent);
            WaitForSingleObject(process, INFINITE);
        }
        DWORD status = 0;
        GetExitCodeProcess(process, &status);
        end.signal = SignalOf(status);
        end.status = end.signal != 0 ? 0 : static_cast<int>(status);
    }
    ends_.reset();
    unsent_.clear();
    hasMore_ = false;
    return end;
}

void ChildProcess::WaitForAny(const std::vector<const ChildProcess*>& children,
                              std::chrono::milliseconds most) {
    // A read that starts takes the event back, so what has ended is asked behind the last start.
    std::vector<PipeEnd*> ends;
    for (const ChildProcess* const child : children) {
        ends.insert(ends.end(), {&child->ends_->channel, &child->ends_->errors});
    }
    for (PipeEnd* const end : ends) {
        const bool isRead = end->pipe.IsOpen() && !end->reading.IsUnderWay();
        if (isRead && !end->reading.StartRead(end->pipe.get())) {
            return;
        }
    }
    ResetEvent(CallEvent());
    for (const PipeEnd* const end : ends) {
        if (end->reading.HasEnded() || end->writing.HasEnded()) {
            return;
        }
    }
    const HANDLE events[] = {CallEvent(), SignalEvent()};
    WaitForMultipleObjects(2, events, FALSE, static_cast<DWORD>(most.count()));
}

bool ParentChannel::Join() {
    const std::wstring name = TextOf([](wchar_t* text, DWORD size) {
        return GetEnvironmentVariableW(kChannelVariable, text, size);
    });
    SetEnvironmentVariableW(kChannelVariable, nullptr);
    const auto channel = reinterpret_cast<HANDLE>(
        static_cast<std::uintptr_t>(std::wcstoull(name.c_str(), nullptr, 10)));
    if (name.empty() || GetFileType(channel) != FILE_TYPE_PIPE) {
        return false;
    }
    channelToParent = channel;
    return true;
}

bool ParentChannel::Receive(std::string& bytes) {
    std::array<char, 4096> arrived;
    DWORD got = 0;
    const BOOL isThere = ReadFile(channelToParent, arrived.data(),
                                  static_cast<DWORD>(arrived.size()), &got, nullptr);
    bytes.append(arrived.data(), got);
    return isThere && got > 0;
}

bool ParentChannel::Write(const std::string& bytes) {
    for (std::size_t sent = 0; sent < bytes.size();) {
        DWORD now = 0;
        const auto size = static_cast<DWORD>(std::min<std::size_t>(bytes.size() - sent, kPiece));
        if (!WriteFile(channelToParent, bytes.data() + sent, size, &now, nullptr)) {
            return false;
        }
        sent += now;
    }
    return true;
}

}  // namespace host::system
