#ifndef QRX_PYTHON_PYX_MESH_H
#define QRX_PYTHON_PYX_MESH_H

#include "model_file/mdf_ModelFile.h"
#include "python/pyx_Errors.h"

#include <optional>

#include <pybind11/numpy.h>

/// A mesh that Python's meshes and the stores of its models share. Arrays that are seen from outside keep it
/// alive; nothing that stands in it changes, sets may be added.
class pyx_Mesh {
public:
    template <class T>
    using Array = py::array_t<T, py::array::c_style | py::array::forcecast>;

    explicit pyx_Mesh(const cow_CountedHld<odiK_Mesh>& mesh) : mesh_(mesh) {}
    pyx_Mesh(const cow_CountedHld<odiK_Mesh>& mesh, const mdf_MeshOrigin& origin)
        : mesh_(mesh), origin_(origin), notes_(origin.notes) {}

    const cow_CountedHld<odiK_Mesh>& Handle() const { return mesh_; }
    /// Null when it is no mesher's file, or no longer what is in one.
    const mdf_MeshOrigin* Origin() const { return origin_ ? &*origin_ : nullptr; }

    /// `points`: N rows of three. `blocks`: (type, rows of places, labels or None, controls or None).
    static pyx_Mesh OfArrays(const Array<float>& points, const py::object& labels, const py::list& blocks);
    /// A mesher's file; `request` is what a model file would say of it.
    static pyx_Mesh OfFile(py::handle request);
    /// A grid with groups, as meshers' files have them: the number of each cell's kind as VTK has it, the
    /// nodes of all cells and where those of each end; `groups` are (name, of points, places), `arrays`
    /// (name, one integer for each cell).
    static pyx_Mesh OfGrid(const Array<double>& points, const Array<std::uint8_t>& types,
                           const Array<std::int64_t>& connectivity, const Array<std::int64_t>& offsets,
                           const py::list& groups, const py::list& arrays, py::handle request);

    /// `members`: labels, or for surfaces pairs of labels and names of faces.
    void AddSet(const std::string& name, const std::string& kind, const py::object& members, bool internal);

    static void Add(py::module_& module);

private:
    odiK_Set& Set(const std::string& name) const;
    py::list SetHeads() const;
    py::object Labels(const std::string& name) const;
    py::object Places(const std::string& name) const;
    py::tuple Facets(const std::string& name) const;
    py::dict Quality() const;

    cow_CountedHld<odiK_Mesh> mesh_;
    std::optional<mdf_MeshOrigin> origin_;
    std::vector<std::string> notes_;
};

#endif
