#ifndef QRX_TESTS_STREAM_COUNTEDALLOCATIONS_H
#define QRX_TESTS_STREAM_COUNTEDALLOCATIONS_H

/// Calls of the global operator new in this test program so far.
long long AllocationCount();

#endif
