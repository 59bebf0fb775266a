#ifndef QRX_BENCHMARKS_INCHILD_H
#define QRX_BENCHMARKS_INCHILD_H

#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <type_traits>

/// What a task gives in a process of its own. Every run then gets its memory anew from the system, as a run
/// of the program does; in one process, the memory of a small task is used again from run to run, that of a
/// large one is not.
template <class Task>
auto InChild(const Task& task) {
    using Result = decltype(task());
    static_assert(std::is_trivially_copyable_v<Result>);
    int ends[2];
    if (pipe(ends) != 0) std::abort();
    const pid_t child = fork();
    if (child == 0) {
        const Result result = task();
        _exit(write(ends[1], &result, sizeof result) == sizeof result ? 0 : 1);
    }
    close(ends[1]);
    Result result{};
    const bool isWhole = read(ends[0], &result, sizeof result) == sizeof result;
    close(ends[0]);
    int status = 0;
    if (waitpid(child, &status, 0) != child || !isWhole || status != 0) {
        std::fprintf(stderr, "a child failed\n");
        std::exit(2);
    }
    return result;
}

#endif
