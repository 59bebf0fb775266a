#include "python/pyx_Tree.h"

#include <pybind11/stl.h>

#include "python/pyx_Hooks.h"
#include "python/pyx_Mesh.h"
#include "python/pyx_Values.h"
#include "store_interface/model/odiK_Repositories.h"

namespace {

class Tree {
public:
    Tree(const odiK_Model& model, const std::list<mdf_MeshOrigin>& origins)
        : model_(model), origins_(origins), values_(&model) {}

    py::dict All() {
        static const odiK_ModelData* const byDefault = new odiK_ModelData();
        py::dict tree = values_.FieldsOf(model_, *byDefault);
        tree["datums"] = Datums();
        py::dict parts;
        for (const auto& [name, part] : model_.Parts()) parts[py::str(Text(name))] = Frame(*part);
        tree["parts"] = parts;
        tree["assembly"] = Assembly();
        for (const odiK_Repository& repository : odiK_Repositories())
            tree[repository.member] =
                repository.IsInOrder() ? py::object(Steps()) : Repository(repository.In(model_));
        return tree;
    }

private:
    static std::string Text(const cow_String& text) { return std::string(text.View()); }

    template <class F>
    py::dict Frame(const F& frame) {
        static const F* const byDefault = new F();
        py::dict told = values_.FieldsOf(frame, *byDefault);
        for (const cls_Field& field : F::Fields().All()) {
            if (field.type->Kind() == cls_FieldKind::Tree) AddTree(told, field, field.In(frame));
        }
        return told;
    }

    void AddTree(py::dict& told, const cls_Field& field, const void* place) {
        switch (static_cast<const cls_TreeType&>(*field.type).Part()) {
        case cls_TreeEnm::Mesh: {
            const auto& mesh = *static_cast<const cow_CountedHld<odiK_Mesh>*>(place);
            if (!mesh.IsNull()) told[field.name] = Mesh(mesh);
            break;
        }
        case cls_TreeEnm::Attributes:
            told[field.name] = Inputs(*static_cast<const std::vector<odiK_AttributeInput>*>(place));
            break;
        case cls_TreeEnm::OwnAttributes: {
            const auto& inputs = *static_cast<const odiK_Instance::OwnInputs*>(place);
            if (inputs) told[field.name] = Inputs(*inputs);
            break;
        }
        case cls_TreeEnm::AssemblyAttributes:
            told[field.name] = Attributes(*static_cast<const ptoC_PartAttributeList*>(place));
            break;
        default: break;
        }
    }

    /// One object for a mesh that several show.
    py::object Mesh(const cow_CountedHld<odiK_Mesh>& mesh) {
        const auto [known, isNew] = meshes_.try_emplace(mesh.Referent());
        if (!isNew) return known->second;
        const auto origin = std::ranges::find(origins_, mesh.Referent(), &mdf_MeshOrigin::mesh);
        known->second =
            origin == origins_.end() ? py::cast(pyx_Mesh(mesh)) : py::cast(pyx_Mesh(mesh, *origin));
        return known->second;
    }

    py::list Inputs(const std::vector<odiK_AttributeInput>& inputs) {
        py::list all;
        for (const odiK_AttributeInput& input : inputs) {
            const py::object record = values_.Record(input.record.ConstGet());
            record.attr("region") = py::str(Text(input.setName));
            all.append(record);
        }
        return all;
    }

    py::list Attributes(const ptoC_PartAttributeList& list) {
        py::list all;
        for (int i = 0; i < list.Size(); ++i) {
            mdl_ObjCow<cls_Record> attribute(list.ConstGet(i));
            if (attribute.ConstGet().DynTypeId() == ptoC_ConnectorOrientation::TypeId()) {
                // The name of its place comes back by itself.
                auto& orientation = static_cast<ptoC_ConnectorOrientation&>(attribute.Get());
                if (orientation.name == odiK_Assembly::ConnectorOrientationName(i)) orientation.name = {};
            }
            all.append(values_.Record(attribute.ConstGet()));
        }
        return all;
    }

    py::list Datums() {
        static const odiK_Datum* const byDefault = new odiK_Datum();
        py::list all;
        for (const odiK_Datum& datum : model_.Datums()) {
            odiK_Datum given(datum);
            given.xAxis = datum.givenAxes[0];
            given.yAxis = datum.givenAxes[1];
            given.zAxis = datum.givenAxes[2];
            py::dict fields = values_.FieldsOf(given, *byDefault);
            // The third axis of a coordinate system that was left out follows from the others again.
            if (given.type == dtu_DatumType::CSYS) {
                fields.attr("pop")("zAxis", py::none());
                if (!(given.zAxis == gsl_Vector()))
                    fields["zAxis"] = values_.Of(cls_TypeOf<gsl_Vector>::Instance(), &given.zAxis);
            }
            all.append(pyx_Hooks::Get().record(odiK_Datum::Class.name, fields));
        }
        return all;
    }

    py::dict Assembly() {
        py::dict told = Frame(model_.AssemblyObject());
        py::dict instances;
        for (const auto& [name, instance] : model_.Instances())
            instances[py::str(Text(name))] = Frame(*instance);
        told["instances"] = instances;
        if (!model_.ConstAssemblyMesh().IsNull()) told["mesh"] = AssemblyMesh(*model_.ConstAssemblyMesh());
        py::list sets;
        for (const auto& set : model_.AssemblySets()) sets.append(AssemblySet(*set));
        told["sets"] = sets;
        return told;
    }

    /// As a model file has it: its elements may end in instances.
    py::dict AssemblyMesh(const odiK_Mesh& mesh) {
        const odiK_NodeData& nodes = mesh.Nodes();
        py::dict told;
        py::list labels;
        for (const int label : nodes.labels) labels.append(label);
        py::list points;
        for (std::size_t i = 0; i + 2 < nodes.coordinates.size(); i += 3) {
            const float xyz[3] = {nodes.coordinates[i], nodes.coordinates[i + 1], nodes.coordinates[i + 2]};
            points.append(values_.Of(cls_TypeOf<float[3]>::Instance(), &xyz));
        }
        told["labels"] = labels;
        told["points"] = points;
        py::list blocks;
        for (const odiK_ElementClass& elements : mesh.Classes()) {
            py::list rows;
            for (std::size_t i = 0; i < elements.connectivity.size();) {
                py::list row;
                for (int j = 0; j < elements.nodesPerElement; ++j)
                    row.append(End(nodes, elements.connectivity[i++]));
                rows.append(row);
            }
            blocks.append(py::make_tuple(Text(elements.type), rows, py::cast(elements.labels),
                                         values_.Record(elements.controls)));
        }
        told["blocks"] = blocks;
        return told;
    }

    static py::object End(const odiK_NodeData& nodes, int node) {
        if (node < nodes.NumNodes()) return py::int_(nodes.Label(node));
        const odiK_ForeignNode& end = nodes.foreign[static_cast<std::size_t>(node - nodes.NumNodes())];
        return py::str(Text(end.instanceName) + "." + std::to_string(end.label));
    }

    /// (name, kind, internal, [(instance or None, labels, facets or None)]).
    py::tuple AssemblySet(const odiK_Set& set) {
        py::list members;
        for (const rgnC_SubsetData& subset : set.subsets) {
            const odiK_Instance* owner = InstanceOf(subset.meshIndex);
            const auto mesh = owner == nullptr ? model_.ConstAssemblyMesh() : owner->Mesh();
            py::list labels;
            for (int i = 0; i < subset.subset.Length(); ++i) {
                const int entry = subset.subset[i];
                labels.append(set.type == res_SetTypeEnm::NODES
                                  ? mesh->Nodes().Label(entry)
                                  : mesh->Classes()[static_cast<std::size_t>(subset.classIndex)]
                                        .labels[static_cast<std::size_t>(entry)]);
            }
            py::object facets = py::none();
            if (set.type == res_SetTypeEnm::FACETS)
                facets = values_.Of(cls_TypeOf<cow_List<int>>::Instance(), &subset.facetIds);
            members.append(py::make_tuple(
                owner == nullptr ? py::object(py::none()) : py::str(Text(owner->name)), labels, facets));
        }
        return py::make_tuple(Text(set.name), omu_EnumTableOf(set.type).Row(static_cast<int>(set.type))->name,
                              set.internal, members);
    }

    /// Entries that are no part instances have negative indices; null is the assembly.
    const odiK_Instance* InstanceOf(int meshIndex) const {
        if (meshIndex > 0) return model_.InstanceOfMesh(meshIndex).Referent();
        for (const auto& [name, instance] : model_.Instances()) {
            if (meshIndex < 0 && instance->meshIndex == meshIndex) return instance.Referent();
        }
        return nullptr;
    }

    py::list Steps() {
        py::list all;
        for (const auto& [name, step] : model_.steps) {
            const py::object record = values_.Record(step);
            record.attr("name") = py::str(Text(name));
            all.append(record);
        }
        return all;
    }

    py::dict Repository(const mdl_Repository& repository) {
        py::dict all;
        for (const auto& [name, record] : repository) all[py::str(Text(name))] = values_.Record(record);
        return all;
    }

    const odiK_Model& model_;
    const std::list<mdf_MeshOrigin>& origins_;
    pyx_Values values_;
    std::map<const odiK_Mesh*, py::object> meshes_;
};

} // namespace

py::dict pyx_TreeOf(const odiK_Model& model, const std::list<mdf_MeshOrigin>& origins) {
    return Tree(model, origins).All();
}
