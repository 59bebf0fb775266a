#ifndef QRX_PYTHON_PYX_HOOKS_H
#define QRX_PYTHON_PYX_HOOKS_H

#include <pybind11/pybind11.h>

namespace py = pybind11;

/// What the extension asks of the package's part in Python, which gives it once.
struct pyx_Hooks {
    /// (class, {field: value}): a record.
    py::object record;
    /// (enumeration, word): its member.
    py::object member;
    /// (magnitude, degrees): a complex number by magnitude and phase.
    py::object polar;
    /// (instance or None, set): a region whose names have dots.
    py::object region;
    /// (findings), (text, context): the errors to raise.
    py::object modelError;
    py::object deckError;

    /// Lives as long as the process: the interpreter may end first.
    static pyx_Hooks& Get();
};

#endif
