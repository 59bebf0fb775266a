#ifndef QRX_PYTHON_PYX_DOCUMENT_H
#define QRX_PYTHON_PYX_DOCUMENT_H

#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Writer.h"
#include "python/pyx_Errors.h"

#include <sstream>

/// Python's values as the text of a model file. Objects tell what they are by `_document()`; numbers and
/// arrays of numpy by `tolist()`; meshes go along as they are, and stand in the text by their place.
class pyx_Document {
public:
    explicit pyx_Document(py::handle value);

    const std::string& Text() const { return text_; }
    const mdf_GivenMeshes& Meshes() const { return meshes_; }
    /// Where those meshes came from that are a mesher's file.
    const std::list<mdf_MeshOrigin>& Origins() const { return origins_; }

private:
    void Write(py::handle value, const fnd_Path& path);
    bool WritePlain(py::handle value, const fnd_Path& path);
    void WriteString(py::handle text, const fnd_Path& path);
    void WriteInteger(py::handle value, const fnd_Path& path);
    void WriteReal(double value, const fnd_Path& path);
    void WriteArray(py::handle items, const fnd_Path& path);
    void WriteObject(py::handle members, const fnd_Path& path);

    std::ostringstream stream_;
    mdf_Writer out_{stream_};
    std::string text_;
    mdf_GivenMeshes meshes_;
    std::list<mdf_MeshOrigin> origins_;
};

/// A text in UTF-8; others are wrong at the place.
std::string_view pyx_TextOf(py::handle text, const fnd_Path& path);

#endif
