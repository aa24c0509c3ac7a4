// SPDX-License-Identifier: Apache-2.0
#include "Ratio.h"

#include <spawn.h>
#include <sys/resource.h>
#include <sys/wait.h>

#include <filesystem>
#include <string>

// What the library adds to the start of a program, from the linker's work to the static objects: two programs
// that only begin and end, one that loads the library and one that loads nothing but Qt, which the library
// needs.

extern char** environ;

namespace {

double seconds(const timeval& time)
{
    return double(time.tv_sec) + double(time.tv_usec) * 1e-6;
}

/// What a program used that ran to its end with success; false if it did not.
bool runProgram(const char* file, rusage& usage)
{
    std::string path = file;
    char* arguments[] = {path.data(), nullptr};
    pid_t child = 0;
    if (posix_spawn(&child, file, nullptr, nullptr, arguments, environ) != 0) {
        return false;
    }
    int status = 0;
    return wait4(child, &status, 0, &usage) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

/// The time is that of the processor in the child, so other programs disturb it little.
void load(benchmark::State& state, const char* file)
{
    long peak = 0;
    for (auto _ : state) {
        rusage usage = {};
        if (!runProgram(file, usage)) {
            state.SkipWithError((std::string("cannot run ") + file).c_str());
            return;
        }
        state.SetIterationTime(seconds(usage.ru_utime) + seconds(usage.ru_stime));
        peak = usage.ru_maxrss;
    }
    state.counters["peak_kB"] = double(peak);
}

BENCHMARK_CAPTURE(load, library, MODEL_PROGRAM)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(load, qt, QT_PROGRAM)->UseManualTime()->Unit(benchmark::kMillisecond);
const bool compared = Ratios::compare("start of a program with the library : with Qt alone",
                                      "load/library/manual_time", "load/qt/manual_time");

} // namespace

int main(int argc, char** argv)
{
    const int failure = Ratios::run(argc, argv);
    std::printf("The library has %.2f MB.\n", double(std::filesystem::file_size(MODEL_LIBRARY)) * 1e-6);
    return failure;
}
