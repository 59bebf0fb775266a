#ifndef QRX_PYTHON_PYX_RUN_H
#define QRX_PYTHON_PYX_RUN_H

#include "foundation/thr_Poll.h"

#include <pybind11/pybind11.h>

#include <chrono>

namespace py = pybind11;

/// A signal's handler of Python raised, and what it raised is set.
struct pyx_Interrupted {};

/// Lets Python handle its signals now and then during a run that holds no lock of Python's.
class pyx_Signals {
public:
    void Poll() {
        const auto now = std::chrono::steady_clock::now();
        if (now - last_ < std::chrono::milliseconds(50)) return;
        last_ = now;
        const py::gil_scoped_acquire held;
        if (PyErr_CheckSignals() != 0) throw pyx_Interrupted();
    }

private:
    std::chrono::steady_clock::time_point last_ = std::chrono::steady_clock::now();
};

/// Runs without Python's lock, so that other threads go on, and can be broken off by signals.
template <class Run>
void pyx_Released(const Run& run) {
    try {
        const py::gil_scoped_release released;
        pyx_Signals signals;
        const thr_Poll poll([&signals] { signals.Poll(); });
        run();
    } catch (const pyx_Interrupted&) {
        throw py::error_already_set();
    }
}

#endif
