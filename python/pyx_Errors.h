#ifndef QRX_PYTHON_PYX_ERRORS_H
#define QRX_PYTHON_PYX_ERRORS_H

#include "store_interface/findings/fnd_Finding.h"

#include <pybind11/pybind11.h>

#include <string>
#include <vector>

namespace py = pybind11;

/// A model, a mesh or a value is wrong: qrx.ModelError.
struct pyx_Wrong {
    std::vector<fnd_Finding> findings;
};
[[noreturn]] void pyx_RaiseWrong(fnd_CodeName code, std::string place, std::string found,
                                 std::string expected, std::string hint = {});
/// Raises when there is an error among the findings.
void pyx_RaiseErrors(const std::vector<fnd_Finding>& findings);

/// A file can't be read or written: OSError with its number, or EIO.
struct pyx_FileRefused {
    int error = 0;
    std::string text;
    std::string path;
};

/// Raises it for what a reader said of a file that the system doesn't hand out, "path: why".
[[noreturn]] void pyx_RaiseUnreadable(const std::vector<fnd_Finding>& findings);

/// A list of the findings' tuples, as qrx.Finding takes them.
py::list pyx_TuplesOf(const std::vector<fnd_Finding>& findings);

/// Python's classes of errors take the place of these in whatever Python calls.
void pyx_TranslateErrors();

#endif
