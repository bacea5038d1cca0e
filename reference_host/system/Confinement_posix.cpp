// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/Confinement.h"

#include <fcntl.h>
#include <linux/landlock.h>
#include <sched.h>
#include <seccomp.h>
#include <sys/ioctl.h>
#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <memory>
#include <system_error>

namespace host::system {
namespace {

std::string SystemText(int error) {
    return std::generic_category().message(error);
}

// Calls that are refused whatever their arguments are.
constexpr int kRefused[] = {
    // The network, and sockets of this machine.
    SCMP_SYS(socket), SCMP_SYS(socketpair), SCMP_SYS(connect), SCMP_SYS(bind), SCMP_SYS(listen),
    SCMP_SYS(accept), SCMP_SYS(accept4), SCMP_SYS(sendto), SCMP_SYS(sendmsg), SCMP_SYS(sendmmsg),
    // Programs and processes.
    SCMP_SYS(execve), SCMP_SYS(execveat), SCMP_SYS(fork), SCMP_SYS(vfork), SCMP_SYS(ptrace),
    SCMP_SYS(process_vm_readv), SCMP_SYS(process_vm_writev), SCMP_SYS(pidfd_open),
    SCMP_SYS(pidfd_getfd), SCMP_SYS(pidfd_send_signal), SCMP_SYS(kill), SCMP_SYS(tkill),
    SCMP_SYS(rt_sigqueueinfo), SCMP_SYS(rt_tgsigqueueinfo), SCMP_SYS(setpgid), SCMP_SYS(setsid),
    // What stands beside a file's bytes.
    SCMP_SYS(chmod), SCMP_SYS(fchmod), SCMP_SYS(fchmodat), SCMP_SYS(chown), SCMP_SYS(fchown),
    SCMP_SYS(lchown), SCMP_SYS(fchownat), SCMP_SYS(setxattr), SCMP_SYS(lsetxattr),
    SCMP_SYS(fsetxattr), SCMP_SYS(removexattr), SCMP_SYS(lremovexattr), SCMP_SYS(fremovexattr),
    SCMP_SYS(utime), SCMP_SYS(utimes), SCMP_SYS(utimensat), SCMP_SYS(futimesat),
    // Files that are no plain files.
    SCMP_SYS(link), SCMP_SYS(linkat), SCMP_SYS(symlink), SCMP_SYS(symlinkat), SCMP_SYS(mknod),
    SCMP_SYS(mknodat), SCMP_SYS(memfd_create), SCMP_SYS(open_by_handle_at),
    // The system.
    SCMP_SYS(mount), SCMP_SYS(umount2), SCMP_SYS(pivot_root), SCMP_SYS(chroot), SCMP_SYS(unshare),
    SCMP_SYS(setns), SCMP_SYS(move_mount), SCMP_SYS(open_tree), SCMP_SYS(fsopen), SCMP_SYS(fsmount),
    SCMP_SYS(bpf), SCMP_SYS(perf_event_open), SCMP_SYS(userfaultfd), SCMP_SYS(io_uring_setup),
    SCMP_SYS(io_uring_enter), SCMP_SYS(io_uring_register), SCMP_SYS(keyctl), SCMP_SYS(add_key),
    SCMP_SYS(request_key), SCMP_SYS(init_module), SCMP_SYS(finit_module), SCMP_SYS(delete_module),
    SCMP_SYS(kexec_load), SCMP_SYS(kexec_file_load), SCMP_SYS(reboot), SCMP_SYS(swapon),
    SCMP_SYS(swapoff), SCMP_SYS(settimeofday), SCMP_SYS(clock_settime), SCMP_SYS(clock_adjtime),
    SCMP_SYS(adjtimex), SCMP_SYS(sethostname), SCMP_SYS(setdomainname), SCMP_SYS(iopl),
    SCMP_SYS(ioperm), SCMP_SYS(acct), SCMP_SYS(quotactl), SCMP_SYS(syslog), SCMP_SYS(personality),
    SCMP_SYS(setrlimit), SCMP_SYS(setpriority)};

// Calls that change the tree of files.
constexpr int kRefusedWithoutFolder[] = {
    SCMP_SYS(creat),    SCMP_SYS(truncate), SCMP_SYS(ftruncate), SCMP_SYS(unlink),
    SCMP_SYS(unlinkat), SCMP_SYS(rename),   SCMP_SYS(renameat),  SCMP_SYS(renameat2),
    SCMP_SYS(mkdir),    SCMP_SYS(mkdirat),  SCMP_SYS(rmdir),     SCMP_SYS(fallocate)};

// Calls for which libraries have an older one that can be looked into.
constexpr int kNotThere[] = {SCMP_SYS(clone3), SCMP_SYS(openat2)};

// The kernel's filter of system calls.
class CallFilter {
public:
    CallFilter() : filter_(seccomp_init(SCMP_ACT_ALLOW), seccomp_release) {
        // Threads that a library has started already.
        Note(filter_ ? seccomp_attr_set(filter_.get(), SCMP_FLTATR_CTL_TSYNC, 1) : -ENOMEM);
        // The kernel finds a call in the list in a few steps.
        Note(filter_ ? seccomp_attr_set(filter_.get(), SCMP_FLTATR_CTL_OPTIMIZE, 2) : -ENOMEM);
    }

    void Refuse(int call, int error = EPERM) {
        Note(seccomp_rule_add_array(filter_.get(), SCMP_ACT_ERRNO(error), call, 0, nullptr));
    }
    // Where an argument has a value in the bits of a mask.
    void RefuseWhere(int call, unsigned argument, std::uint64_t mask, std::uint64_t value) {
        const scmp_arg_cmp compare{argument, SCMP_CMP_MASKED_EQ, mask, value};
        Note(seccomp_rule_add_array(filter_.get(), SCMP_ACT_ERRNO(EPERM), call, 1, &compare));
    }
    // Where an argument is anything else.
    void RefuseOther(int call, unsigned argument, std::uint64_t value) {
        const scmp_arg_cmp compare{argument, SCMP_CMP_NE, value, 0};
        Note(seccomp_rule_add_array(filter_.get(), SCMP_ACT_ERRNO(EPERM), call, 1, &compare));
    }
    void Load() { Note(error_ == 0 ? seccomp_load(filter_.get()) : 0); }
    int error() const { return error_; }

private:
    void Note(int result) {
        // A call that this processor does not have can't be made.
        if (result < 0 && result != -EDOM && error_ == 0) {
            error_ = -result;
        }
    }

    std::unique_ptr<void, void (*)(scmp_filter_ctx)> filter_;
    int error_ = 0;
};

void RefuseWriting(CallFilter& filter) {
    constexpr std::uint64_t kWays[][2] = {
        {O_ACCMODE, O_WRONLY}, {O_ACCMODE, O_RDWR}, {O_CREAT, O_CREAT}, {O_TRUNC, O_TRUNC}};
    for (const auto& way : kWays) {
        filter.RefuseWhere(SCMP_SYS(open), 1, way[0], way[1]);
        filter.RefuseWhere(SCMP_SYS(openat), 2, way[0], way[1]);
    }
    for (const int call : kRefusedWithoutFolder) {
        filter.Refuse(call);
    }
}

std::string FilterCalls(bool mayWrite) {
    CallFilter filter;
    if (filter.error() != 0) {
        return SystemText(filter.error());
    }
    for (const int call : kRefused) {
        filter.Refuse(call);
    }
    for (const int call : kNotThere) {
        filter.Refuse(call, ENOSYS);
    }
    filter.RefuseWhere(SCMP_SYS(clone), 0, CLONE_THREAD, 0);  // threads stay
    filter.RefuseOther(SCMP_SYS(tgkill), 0, static_cast<std::uint64_t>(getpid()));
    filter.RefuseOther(SCMP_SYS(prlimit64), 2, 0);  // limits may be asked for
    filter.RefuseWhere(SCMP_SYS(ioctl), 1, 0xFFFFFFFF, TIOCSTI);
    filter.RefuseWhere(SCMP_SYS(mmap), 2, PROT_EXEC, PROT_EXEC);
    filter.RefuseWhere(SCMP_SYS(mprotect), 2, PROT_EXEC, PROT_EXEC);
    filter.RefuseWhere(SCMP_SYS(pkey_mprotect), 2, PROT_EXEC, PROT_EXEC);
    if (!mayWrite) {
        RefuseWriting(filter);
    }
    filter.Load();
    return filter.error() == 0 ? std::string() : SystemText(filter.error());
}

// The C library has no functions for these calls, and its headers may be older than the
// kernel: a right is asked for from that version of the interface on that knows it.
constexpr std::uint64_t kPlainFiles =
    LANDLOCK_ACCESS_FS_WRITE_FILE | LANDLOCK_ACCESS_FS_REMOVE_FILE | LANDLOCK_ACCESS_FS_MAKE_REG;
constexpr std::uint64_t kOtherChanges =
    LANDLOCK_ACCESS_FS_EXECUTE | LANDLOCK_ACCESS_FS_REMOVE_DIR | LANDLOCK_ACCESS_FS_MAKE_CHAR |
    LANDLOCK_ACCESS_FS_MAKE_DIR | LANDLOCK_ACCESS_FS_MAKE_SOCK | LANDLOCK_ACCESS_FS_MAKE_FIFO |
    LANDLOCK_ACCESS_FS_MAKE_BLOCK | LANDLOCK_ACCESS_FS_MAKE_SYM;
constexpr std::uint64_t kMoveToOtherFolder = 1u << 13;  // from version 2
constexpr std::uint64_t kTruncate = 1u << 14;           // from version 3

struct Descriptor {
    int number;
    ~Descriptor() {
        if (number >= 0) {
            close(number);
        }
    }
};

std::string HoldToFolder(const std::filesystem::path& folder) {
    const long version =
        syscall(SYS_landlock_create_ruleset, nullptr, 0, LANDLOCK_CREATE_RULESET_VERSION);
    if (version < 1) {
        return SystemText(errno);
    }
    const std::uint64_t truncate = version >= 3 ? kTruncate : 0;
    landlock_ruleset_attr handled{};
    handled.handled_access_fs =
        kPlainFiles | kOtherChanges | truncate | (version >= 2 ? kMoveToOtherFolder : 0);
    const Descriptor rules{
        static_cast<int>(syscall(SYS_landlock_create_ruleset, &handled, sizeof handled, 0))};
    if (rules.number < 0) {
        return SystemText(errno);
    }
    if (!folder.empty()) {
        const Descriptor place{open(folder.c_str(), O_PATH | O_CLOEXEC)};
        landlock_path_beneath_attr beneath{};
        beneath.allowed_access = kPlainFiles | truncate;
        beneath.parent_fd = place.number;
        if (place.number < 0 || syscall(SYS_landlock_add_rule, rules.number,
                                        LANDLOCK_RULE_PATH_BENEATH, &beneath, 0) != 0) {
            return SystemText(errno);
        }
    }
    return syscall(SYS_landlock_restrict_self, rules.number, 0) == 0 ? std::string()
                                                                     : SystemText(errno);
}

}  // namespace

std::string GiveUpRights(const std::filesystem::path& folder) {
    if (prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) != 0) {
        return "the rights of started programs: " + SystemText(errno);
    }
    std::string missing;
    if (const std::string problem = HoldToFolder(folder); !problem.empty()) {
        missing = "the folder that may be written (Landlock): " + problem;
    }
    if (const std::string problem = FilterCalls(!folder.empty()); !problem.empty()) {
        missing += (missing.empty() ? "" : "; ") + ("the filter of system calls: " + problem);
    }
    return missing;
}

}  // namespace host::system
