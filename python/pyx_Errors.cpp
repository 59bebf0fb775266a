#include "python/pyx_Errors.h"

#include "foundation/nex_Exception.h"
#include "platform/plt_Files.h"
#include "python/pyx_Hooks.h"
#include "whole_file/whf_File.h"

#include <cerrno>
#include <cstdio>

void pyx_RaiseWrong(fnd_CodeName code, std::string place, std::string found, std::string expected,
                    std::string hint) {
    throw pyx_Wrong{
        {fnd_Make(code, std::move(place), std::move(found), std::move(expected), std::move(hint))}};
}

void pyx_RaiseErrors(const std::vector<fnd_Finding>& findings) {
    for (const fnd_Finding& finding : findings) {
        if (finding.IsError()) throw pyx_Wrong{findings};
    }
}

void pyx_RaiseUnreadable(const std::vector<fnd_Finding>& findings) {
    std::string text;
    for (const fnd_Finding& finding : findings) {
        if (finding.code->name == "unreadable-file") text = finding.found;
    }
    for (const char* reason : {": the file can't be read", ": there is no such file", ": found a folder"}) {
        const std::size_t end = text.rfind(reason);
        if (end == std::string::npos) continue;
        const std::string path = text.substr(0, end);
        // The system says its number again.
        errno = 0;
        std::FILE* file = plt_OpenStream(path.c_str(), "rb");
        const int error = file == nullptr ? errno : 0;
        if (file != nullptr) std::fclose(file);
        throw pyx_FileRefused{error, text.substr(end + 2), path};
    }
    throw pyx_FileRefused{0, text, ""};
}

py::list pyx_TuplesOf(const std::vector<fnd_Finding>& findings) {
    py::list all;
    for (const fnd_Finding& finding : findings) {
        all.append(py::make_tuple(finding.place, finding.found, finding.expected, finding.hint,
                                  fnd_SeverityWord(finding.code->severity), finding.code->name,
                                  finding.Text(), finding.line, finding.column));
    }
    return all;
}

namespace {

void SetOsError(int error, const std::string& text, const std::string& path) {
    // OSError chooses its class by the number.
    const py::object file = path.empty() ? py::object(py::none()) : py::str(path);
    const py::object raised = py::handle(PyExc_OSError)(error == 0 ? EIO : error, text, file);
    PyErr_SetObject(reinterpret_cast<PyObject*>(Py_TYPE(raised.ptr())), raised.ptr());
}

void SetError(const py::object& raised) {
    PyErr_SetObject(reinterpret_cast<PyObject*>(Py_TYPE(raised.ptr())), raised.ptr());
}

void Translate(std::exception_ptr raised) {
    try {
        if (raised) std::rethrow_exception(raised);
    } catch (const pyx_Wrong& wrong) {
        SetError(pyx_Hooks::Get().modelError(pyx_TuplesOf(wrong.findings)));
    } catch (const pyx_FileRefused& refused) {
        SetOsError(refused.error, refused.text, refused.path);
    } catch (const whf_Error& refused) {
        SetOsError(refused.Error(), refused.what(), "");
    } catch (const QRXBasException& failure) {
        SetError(pyx_Hooks::Get().deckError(failure.what(), failure.Context()));
    }
}

} // namespace

void pyx_TranslateErrors() {
    py::register_exception_translator(Translate);
}
