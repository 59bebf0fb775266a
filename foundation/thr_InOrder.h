#ifndef QRX_FOUNDATION_THR_INORDER_H
#define QRX_FOUNDATION_THR_INORDER_H

#include <cstddef>
#include <functional>

/// The threads that a task may use when it is asked to use `wanted`; 0 stands for the process's usual number.
int thr_NumThreads(int wanted);
/// Changes the process's usual number of threads, which is one a core at first and again with 0.
void thr_SetUsualThreads(int threads);

/// Calls `task(i)` for each i below `count`, in several threads at once, and returns when all are done; in
/// the calling thread alone where no further one can be had. After a task that raises no further ones are
/// begun, and the first failure is raised here.
void thr_ForEach(int threads, std::size_t count, const std::function<void(std::size_t)>& task);

/// Makes the texts of the blocks 0 to `count` - 1 in several threads, and hands them on in order.
struct thr_TextBlocks {
    /// Makes the text of a block at `out`, where `bytes` are free, and gives its end. Several threads call it
    /// at once.
    using Make = std::function<char*(std::size_t block, char* out)>;
    /// Only the thread that called Run() calls it.
    using Take = std::function<void(const char* text, std::size_t bytes)>;

    std::size_t count = 0;
    std::size_t bytes = 0;

    /// The calling thread makes blocks too. Where no further thread can be had, it makes all of them. An
    /// exception of `make` is raised when it is the block's turn, one of `take` at once; either way all
    /// threads have ended by then. Room for two blocks a thread is taken.
    void Run(int threads, const Make& make, const Take& take) const;
};

#endif
