// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <malloc.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <stdexcept>

/// How much memory a piece of work takes at most.
namespace PeakMemory {

/// The peak of the process's resident memory so far, in bytes.
inline long peak()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss * 1024;
}

/// Runs `work` in a process of its own and gives by how many bytes its peak exceeds what was there at the
/// start: a new process begins with the pages that its parent has now, and with no peak behind it. Free
/// memory goes back to the system first, or the work could take that unseen. Right to some hundred
/// kilobytes.
template <class Work>
long growth(Work work)
{
    malloc_trim(0);
    int ends[2];
    if (pipe(ends) != 0)
        throw std::runtime_error("there is no pipe");
    const pid_t child = fork();
    if (child < 0)
        throw std::runtime_error("there is no process");
    if (child == 0) {
        const long before = peak();
        work();
        const long grown = peak() - before;
        const bool told = write(ends[1], &grown, sizeof grown) == sizeof grown;
        _exit(told ? 0 : 1);
    }
    close(ends[1]);
    long grown = 0;
    const bool heard = read(ends[0], &grown, sizeof grown) == sizeof grown;
    close(ends[0]);
    int status = 0;
    if (waitpid(child, &status, 0) != child || status != 0 || !heard)
        throw std::runtime_error("the work failed");
    return grown;
}

} // namespace PeakMemory
