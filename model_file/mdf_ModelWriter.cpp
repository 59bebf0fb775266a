#include "model_file/mdf_MeshWriter.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Repositories.h"

namespace {

/// Writes one model as an object: the frame by its tables, then the repositories. What has its default is
/// left out.
class ModelWriter {
public:
    ModelWriter(mdf_Writer& out, const odiK_Model& model, const std::list<mdf_MeshOrigin>& origins,
                const std::string& folder)
        : out_(out), model_(model), records_(out, model), meshes_(out, records_, model, origins, folder) {}

    void Write() {
        static const odiK_ModelData byDefault;
        out_.BeginObject();
        WriteFields(model_, byDefault);
        for (const odiK_Repository& repository : odiK_Repositories()) {
            if (repository.IsInOrder()) {
                WriteSteps(repository);
            } else {
                WriteRepository(repository);
            }
        }
        out_.EndObject();
    }

private:
    template <class Frame>
    void WriteFrame(const Frame& frame) {
        static const Frame byDefault;
        out_.BeginObject();
        WriteFields(frame, byDefault);
        out_.EndObject();
    }

    void WriteFields(const cls_Record& frame, const cls_Record& byDefault) {
        for (const cls_Field& field : frame.DynFields().All()) {
            if (field.type->Kind() == cls_FieldKind::Tree) {
                WriteTree(field, field.In(frame));
            } else {
                records_.WriteField(field, frame, byDefault);
            }
        }
    }

    void WriteTree(const cls_Field& field, const void* place) {
        switch (static_cast<const cls_TreeType&>(*field.type).Part()) {
        case cls_TreeEnm::Datums: WriteDatums(field); break;
        case cls_TreeEnm::Parts: WriteNamed(field, model_.Parts()); break;
        case cls_TreeEnm::Assembly:
            out_.Key(field.name);
            WriteFrame(model_.AssemblyObject());
            break;
        case cls_TreeEnm::Instances: WriteNamed(field, model_.Instances()); break;
        case cls_TreeEnm::Mesh:
            WriteMesh(field, *static_cast<const cow_CountedHld<odiK_Mesh>*>(place));
            break;
        case cls_TreeEnm::AssemblyMesh: WriteMesh(field, model_.ConstAssemblyMesh()); break;
        case cls_TreeEnm::AssemblySets:
            if (model_.AssemblySets().empty()) break;
            out_.Key(field.name);
            meshes_.WriteAssemblySets();
            break;
        case cls_TreeEnm::Attributes: {
            const auto& inputs = *static_cast<const std::vector<odiK_AttributeInput>*>(place);
            if (!inputs.empty()) WriteInputs(field, inputs);
            break;
        }
        case cls_TreeEnm::OwnAttributes: {
            const auto& inputs = *static_cast<const odiK_Instance::OwnInputs*>(place);
            if (inputs) WriteInputs(field, *inputs);
            break;
        }
        case cls_TreeEnm::AssemblyAttributes:
            WriteAttributes(field, *static_cast<const ptoC_PartAttributeList*>(place));
            break;
        }
    }

    template <class Entry>
    void WriteNamed(const cls_Field& field, const std::map<cow_String, cow_CountedHld<Entry>>& entries) {
        if (entries.empty()) return;
        out_.Key(field.name);
        out_.BeginObject();
        for (const auto& [name, entry] : entries) {
            out_.Key(name.View());
            WriteFrame(*entry);
        }
        out_.EndObject();
    }

    void WriteMesh(const cls_Field& field, const cow_CountedHld<odiK_Mesh>& mesh) {
        if (mesh.IsNull()) return;
        out_.Key(field.name);
        meshes_.WriteMesh(*mesh);
    }

    void WriteDatums(const cls_Field& field) {
        if (model_.Datums().empty()) return;
        out_.Key(field.name);
        out_.BeginArray();
        for (const odiK_Datum& datum : model_.Datums()) WriteDatum(datum);
        out_.EndArray();
    }

    void WriteDatum(const odiK_Datum& datum) {
        static const odiK_Datum byDefault;
        odiK_Datum given(datum);
        given.xAxis = datum.givenAxes[0];
        given.yAxis = datum.givenAxes[1];
        given.zAxis = datum.givenAxes[2];
        // The third axis of a coordinate system that was left out follows from the others again.
        const bool csys = given.type == dtu_DatumType::CSYS;
        const bool zGiven = !(given.zAxis == gsl_Vector());
        out_.BeginObject();
        for (const cls_Field& field : odiK_Datum::Fields().All()) {
            if (!csys || field.In(given) != &given.zAxis) {
                records_.WriteField(field, given, byDefault);
            } else if (zGiven) {
                records_.WriteMember(field, given);
            }
        }
        out_.EndObject();
    }

    void WriteInputs(const cls_Field& field, const std::vector<odiK_AttributeInput>& inputs) {
        out_.Key(field.name);
        out_.BeginArray();
        for (const odiK_AttributeInput& input : inputs) {
            out_.BeginObject();
            out_.Key("region");
            out_.String(input.setName.View());
            records_.WriteFields(input.record.ConstGet(), "region");
            out_.EndObject();
        }
        out_.EndArray();
    }

    void WriteAttributes(const cls_Field& field, const ptoC_PartAttributeList& list) {
        if (list.Size() == 0) return;
        out_.Key(field.name);
        out_.BeginArray();
        for (int i = 0; i < list.Size(); ++i) {
            mdl_ObjCow<cls_Record> attribute(list.ConstGet(i));
            const unsigned type = attribute.ConstGet().DynTypeId();
            if (type == ptoC_ConnectorOrientation::TypeId()) {
                // The name of its place comes back by itself.
                auto& orientation = static_cast<ptoC_ConnectorOrientation&>(attribute.Get());
                if (orientation.name == odiK_Assembly::ConnectorOrientationName(i)) orientation.name = {};
            }
            records_.WriteRecord(attribute.ConstGet(), type);
        }
        out_.EndArray();
    }

    void WriteSteps(const odiK_Repository& info) {
        if (model_.steps.Size() == 0) return;
        out_.Key(info.member);
        out_.BeginArray();
        for (const auto& [name, step] : model_.steps) {
            out_.BeginObject();
            out_.Key("name");
            out_.String(name.View());
            records_.WriteClass(step);
            records_.WriteFields(step);
            out_.EndObject();
        }
        out_.EndArray();
    }

    void WriteRepository(const odiK_Repository& info) {
        const mdl_Repository& repository = info.In(model_);
        if (repository.IsEmpty()) return;
        out_.Key(info.member);
        out_.BeginObject();
        for (const auto& [name, record] : repository) {
            out_.Key(name.View());
            records_.WriteRecord(record, info.ItemTypeId());
        }
        out_.EndObject();
    }

    mdf_Writer& out_;
    const odiK_Model& model_;
    mdf_RecordWriter records_;
    mdf_MeshWriter meshes_;
};

} // namespace

bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& stream) {
    return mdf_WriteModelFile(odb, stream, {}, "");
}

bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& stream, const std::list<mdf_MeshOrigin>& origins,
                        const std::string& folder, const std::vector<mdf_Parameter>& parameters,
                        const std::string& schema) {
    mdf_Writer out(stream);
    out.BeginObject();
    if (!schema.empty()) {
        out.Key("$schema");
        out.String(schema);
    }
    out.Key("format");
    out.String(mdf_kFormat);
    mdf_WriteParameters(out, parameters);
    out.Key("models");
    out.BeginObject();
    for (const auto& [name, model] : odb.Models()) {
        out.Key(name.View());
        ModelWriter(out, *model, origins, folder).Write();
    }
    out.EndObject();
    out.EndObject();
    return out.Finish();
}
