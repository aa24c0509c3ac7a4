// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <functional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <cstring>

#include <cstddef>
#include <linux/filter.h>
#include <linux/seccomp.h>
#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace HostTests {

/// What `body` returns in a process of its own, to which things may be done that last; what it throws comes
/// as its text. Nothing but memory is needed for the answer.
inline std::string inChild(const std::function<std::string()>& body)
{
    constexpr std::size_t longest = 4096;
    void* const shared = mmap(nullptr, longest, PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    if (shared == MAP_FAILED) {
        throw std::runtime_error("there is no shared memory");
    }
    const pid_t child = fork();
    if (child == 0) {
        std::string answer;
        try {
            answer = body();
        } catch (const std::exception& error) {
            answer = error.what();
        }
        std::strncpy(static_cast<char*>(shared), answer.c_str(), longest - 1);
        _exit(0);
    }
    int status = -1;
    const bool hasEnded = child > 0 && waitpid(child, &status, 0) == child;
    const std::string answer = static_cast<const char*>(shared);
    munmap(shared, longest);
    if (!hasEnded || status != 0) {
        throw std::runtime_error("the child did not end by itself");
    }
    return answer;
}

/// Not every processor has the older ones of the calls that do the same.
const std::vector<unsigned> openingCalls = {
#ifdef SYS_open
    SYS_open,
#endif
    SYS_openat};
const std::vector<unsigned> linkingCalls = {
#ifdef SYS_link
    SYS_link,
#endif
    SYS_linkat};
const std::vector<unsigned> renamingCalls = {
#ifdef SYS_rename
    SYS_rename,
#endif
#ifdef SYS_renameat
    SYS_renameat,
#endif
    SYS_renameat2};

inline void filterCalls(std::vector<sock_filter> steps)
{
    const sock_fprog program{static_cast<unsigned short>(steps.size()), steps.data()};
    if (prctl(PR_SET_NO_NEW_PRIVS, 1, 0, 0, 0) != 0 ||
        prctl(PR_SET_SECCOMP, SECCOMP_MODE_FILTER, &program) != 0) {
        throw std::runtime_error("calls cannot be refused");
    }
}

/// From now on these system calls of the process end in this error. There is no way back.
inline void refuseCalls(const std::vector<unsigned>& calls, unsigned error)
{
    std::vector<sock_filter> steps = {BPF_STMT(BPF_LD | BPF_W | BPF_ABS, offsetof(seccomp_data, nr))};
    for (const unsigned call : calls) {
        steps.push_back(BPF_JUMP(BPF_JMP | BPF_JEQ | BPF_K, call, 0, 1));
        steps.push_back(BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ERRNO | error));
    }
    steps.push_back(BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ALLOW));
    filterCalls(std::move(steps));
}

/// The same for writing, but of a few bytes: the checks of a sanitizer write them to a pipe to see whether
/// memory can be read.
inline void refuseWriting(unsigned error)
{
    constexpr unsigned few = 64;
    filterCalls({BPF_STMT(BPF_LD | BPF_W | BPF_ABS, offsetof(seccomp_data, nr)),
                 BPF_JUMP(BPF_JMP | BPF_JEQ | BPF_K, SYS_write, 0, 2),
                 // Of this processor's two halves of the length the lower one.
                 BPF_STMT(BPF_LD | BPF_W | BPF_ABS, offsetof(seccomp_data, args[2])),
                 BPF_JUMP(BPF_JMP | BPF_JGE | BPF_K, few, 1, 0), BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ALLOW),
                 BPF_STMT(BPF_RET | BPF_K, SECCOMP_RET_ERRNO | error)});
}

} // namespace HostTests
