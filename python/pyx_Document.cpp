#include "python/pyx_Document.h"

#include "python/pyx_Mesh.h"

#include <cmath>
#include <limits>

std::string_view pyx_TextOf(py::handle text, const fnd_Path& path) {
    Py_ssize_t bytes = 0;
    const char* utf8 = PyUnicode_AsUTF8AndSize(text.ptr(), &bytes);
    if (utf8 != nullptr) return {utf8, static_cast<std::size_t>(bytes)};
    PyErr_Clear();
    pyx_RaiseWrong("wrong-value", path.Text(), "found a text with half a surrogate pair", "characters alone");
}

pyx_Document::pyx_Document(py::handle value) {
    Write(value, fnd_Path());
    out_.Finish();
    text_ = std::move(stream_).str();
}

void pyx_Document::Write(py::handle value, const fnd_Path& path) {
    if (WritePlain(value, path)) return;
    if (py::isinstance<pyx_Mesh>(value)) {
        const auto& mesh = value.cast<const pyx_Mesh&>();
        out_.Int(static_cast<int>(meshes_.size()));
        meshes_.push_back(mesh.Handle());
        if (mesh.Origin() != nullptr) origins_.push_back(*mesh.Origin());
    } else if (py::hasattr(value, "_document")) {
        Write(value.attr("_document")(), path);
    } else if (py::hasattr(value, "tolist")) {
        Write(value.attr("tolist")(), path);
    } else if (PyIndex_Check(value.ptr()) != 0) {
        WriteInteger(value, path);
    } else if (py::hasattr(value, "__float__")) {
        WriteReal(py::float_(py::reinterpret_borrow<py::object>(value)).cast<double>(), path);
    } else if (py::hasattr(value, "__fspath__")) {
        WriteString(value.attr("__fspath__")(), path);
    } else if (PySequence_Check(value.ptr()) != 0 || PyIter_Check(value.ptr()) != 0) {
        WriteArray(py::list(py::reinterpret_borrow<py::object>(value)), path);
    } else {
        pyx_RaiseWrong("wrong-value", path.Text(),
                       "found " + py::cast<std::string>(py::str(value.get_type().attr("__name__"))) +
                           ", which no model file can hold",
                       "numbers, texts, lists, dicts and records");
    }
}

bool pyx_Document::WritePlain(py::handle value, const fnd_Path& path) {
    PyObject* object = value.ptr();
    if (object == Py_None) {
        out_.Null();
    } else if (PyBool_Check(object)) {
        out_.Bool(object == Py_True);
    } else if (PyLong_Check(object)) {
        WriteInteger(value, path);
    } else if (PyFloat_Check(object)) {
        WriteReal(PyFloat_AS_DOUBLE(object), path);
    } else if (PyUnicode_Check(object)) {
        WriteString(value, path);
    } else if (PyDict_Check(object)) {
        WriteObject(value, path);
    } else if (PyList_Check(object) || PyTuple_CheckExact(object)) {
        WriteArray(value, path);
    } else if (PyComplex_Check(object)) {
        const Py_complex number = PyComplex_AsCComplex(object);
        out_.BeginArray(mdf_Layout::OneLine);
        WriteReal(number.real, path);
        WriteReal(number.imag, path);
        out_.EndArray();
    } else {
        return false;
    }
    return true;
}

void pyx_Document::WriteString(py::handle text, const fnd_Path& path) {
    out_.String(pyx_TextOf(text, path));
}

void pyx_Document::WriteInteger(py::handle value, const fnd_Path& path) {
    const auto number = py::reinterpret_steal<py::object>(PyNumber_Index(value.ptr()));
    int overflow = 0;
    const long long small = number ? PyLong_AsLongLongAndOverflow(number.ptr(), &overflow) : 0;
    if (!number || (small == -1 && PyErr_Occurred() != nullptr)) throw py::error_already_set();
    if (overflow == 0 && small >= std::numeric_limits<int>::min() && small <= std::numeric_limits<int>::max())
        return out_.Int(static_cast<int>(small));
    const double real = PyLong_AsDouble(number.ptr());
    if (PyErr_Occurred() != nullptr) {
        PyErr_Clear();
        pyx_RaiseWrong("wrong-value", path.Text(), "found an integer of many digits", "a number");
    }
    WriteReal(real, path);
}

void pyx_Document::WriteReal(double value, const fnd_Path& path) {
    if (!std::isfinite(value)) {
        pyx_RaiseWrong("wrong-value", path.Text(),
                       std::isnan(value) ? "found nan"
                       : value > 0       ? "found inf"
                                         : "found -inf",
                       "a finite number");
    }
    out_.Real(value);
}

void pyx_Document::WriteArray(py::handle items, const fnd_Path& path) {
    const auto sequence = py::reinterpret_steal<py::object>(PySequence_Fast(items.ptr(), "an array"));
    if (!sequence) throw py::error_already_set();
    out_.BeginArray();
    // The length is asked each time: what items are told by may be any code.
    for (Py_ssize_t i = 0; i < PySequence_Fast_GET_SIZE(sequence.ptr()); ++i) {
        const auto item = py::reinterpret_borrow<py::object>(PySequence_Fast_GET_ITEM(sequence.ptr(), i));
        Write(item, fnd_Path(path, static_cast<std::size_t>(i)));
    }
    out_.EndArray();
}

void pyx_Document::WriteObject(py::handle members, const fnd_Path& path) {
    out_.BeginObject();
    const py::list items(members.attr("items")());
    for (const py::handle item : items) {
        const py::object key = item[py::int_(0)];
        if (!PyUnicode_Check(key.ptr())) {
            pyx_RaiseWrong("wrong-value", path.Text(),
                           "found the key " + py::cast<std::string>(py::repr(key)), "a name");
        }
        const std::string_view name = pyx_TextOf(key, path);
        out_.Key(name);
        Write(item[py::int_(1)], fnd_Path(path, name));
    }
    out_.EndObject();
}
