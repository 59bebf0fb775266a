#ifndef QRX_TESTS_FAULTS_FAILINGALLOCATIONS_H
#define QRX_TESTS_FAULTS_FAILINGALLOCATIONS_H

/// Makes the n-th call of the global operator new in this thread, counted from 1, raise std::bad_alloc; the
/// calls before and after it succeed. Ends with its life.
class FailingAllocation {
public:
    explicit FailingAllocation(long long n);
    FailingAllocation(const FailingAllocation&) = delete;
    FailingAllocation& operator=(const FailingAllocation&) = delete;
    ~FailingAllocation();
    /// Whether the n-th call has come.
    bool Happened() const;
};

#endif
