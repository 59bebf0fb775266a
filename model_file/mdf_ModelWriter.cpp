#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Writer.h"

#include <ostream>

namespace {

/// Writes a store as a model file. What has its default is left out.
class ModelWriter {
public:
    explicit ModelWriter(std::ostream& out) : out_(out) {}

    bool Write(const odb_Odb& odb) {
        out_.BeginObject();
        out_.Key("format");
        out_.String("qrx-model/1");
        out_.Key("models");
        out_.BeginObject();
        for (const auto& [name, model] : odb.Models()) {
            out_.Key(name.View());
            WriteModel(*model);
        }
        out_.EndObject();
        out_.EndObject();
        return out_.Finish();
    }

private:
    void Text(const char* key, const cow_String& text, const char* byDefault = "") {
        if (text == byDefault) return;
        out_.Key(key);
        out_.String(text.View());
    }
    void Number(const char* key, double value) {
        if (value == 0.0) return;
        out_.Key(key);
        out_.Real(value);
    }
    void Flag(const char* key, bool value, bool byDefault = false) {
        if (value == byDefault) return;
        out_.Key(key);
        out_.Bool(value);
    }

    void WriteModel(const odiK_Model& model) {
        out_.BeginObject();
        Text("description", model.description);
        Text("topLevelSolverInput", model.topLevelSolverInput);
        Text("solverInput", model.solverInput);
        Number("absoluteZero", model.absoluteZero);
        Number("stefanBoltzmann", model.stefanBoltzmann);
        Text("waveFormulation", model.waveFormulation, "NOT_SET");
        Text("restartJob", model.restartJob);
        Text("restartStep", model.restartStep);
        if (model.restartIncrement != 0) {
            out_.Key("restartIncrement");
            out_.Int(model.restartIncrement);
        }
        Flag("endRestartStep", model.endRestartStep);
        Text("globalJob", model.globalJob);
        Flag("shellToSolid", model.shellToSolid);
        if (model.analysisProduct != cls_UnsetInt) {
            out_.Key("analysisProduct");
            out_.Int(model.analysisProduct);
        }
        WriteDatums(model);
        WriteParts(model);
        WriteAssembly(model);
        WriteRepository("materials", model, model.materials);
        WriteRepository("sections", model, model.sections);
        WriteRepository("beamProfiles", model, model.beamProfiles);
        WriteRepository("amplitudes", model, model.amplitudes);
        WriteRepository("constraints", model, model.constraints);
        WriteRepository("contactControls", model, model.contactControls);
        WriteRepository("contactInitializations", model, model.contactInitializations);
        WriteRepository("interactionProperties", model, model.interactionProperties);
        WriteRepository("timePoints", model, model.timePoints);
        WriteRepository("adaptiveMeshControls", model, model.adaptiveMeshControls);
        WriteSteps(model);
        WriteRepository("boundaryConditions", model, model.boundaryConditions);
        WriteRepository("loads", model, model.loads);
        WriteRepository("fields", model, model.fields);
        WriteRepository("interactions", model, model.interactions);
        WriteRepository("fieldOutputRequests", model, model.fieldOutputRequests);
        WriteRepository("historyOutputRequests", model, model.historyOutputRequests);
        WriteRepository("adaptiveMeshConstraints", model, model.adaptiveMeshConstraints);
        if (!model.cyclicSymmetry.IsNull()) {
            out_.Key("cyclicSymmetry");
            WriteRecord(model.cyclicSymmetry.ConstGet(), model, {});
        }
        out_.EndObject();
    }

    void Triple(const char* key, double x, double y, double z) {
        out_.Key(key);
        const double xyz[3] = {x, y, z};
        out_.Row(std::span<const double>(xyz));
    }
    void Vector(const char* key, const gsl_Vector& v) { Triple(key, v.X(), v.Y(), v.Z()); }

    void WriteDatums(const odiK_Model& model) {
        if (model.Datums().empty()) return;
        static const char* const types[] = {"", "point", "axis", "plane", "csys"};
        static const char* const systems[] = {"", "rectangular", "cylindrical", "spherical"};
        out_.Key("datums");
        out_.BeginArray();
        for (const odiK_Datum& datum : model.Datums()) {
            const bool csys = datum.type == dtu_DatumType::CSYS;
            out_.BeginObject();
            Text("name", datum.name);
            Text("type", types[static_cast<int>(datum.type)], "csys");
            Text("system", systems[static_cast<int>(datum.csysType)], "rectangular");
            Triple("origin", datum.origin.X(), datum.origin.Y(), datum.origin.Z());
            if (csys || datum.type == dtu_DatumType::AXIS) Vector("xAxis", datum.givenAxes[0]);
            if (csys) Vector("yAxis", datum.givenAxes[1]);
            // A z axis that was left out follows from the others again.
            const bool zGiven = !(datum.givenAxes[2] == gsl_Vector());
            if (zGiven && (csys || datum.type == dtu_DatumType::PLANE)) Vector("zAxis", datum.givenAxes[2]);
            out_.EndObject();
        }
        out_.EndArray();
    }

    void WriteParts(const odiK_Model& model) {
        if (model.Parts().empty()) return;
        out_.Key("parts");
        out_.BeginObject();
        for (const auto& [name, part] : model.Parts()) {
            out_.Key(name.View());
            out_.BeginObject();
            Text("solverInput", part->solverInput);
            if (!part->mesh.IsNull()) WriteMesh(*part->mesh, false);
            const odiK_AttributeInputs& attributes = part->attributes;
            WriteInputs("sectionAssignments", model, attributes.sectionAssignments, false);
            WriteInputs("materialOrientations", model, attributes.materialOrientations, false);
            WriteInputs("beamOrientations", model, attributes.beamOrientations, false);
            out_.EndObject();
        }
        out_.EndObject();
    }

    void WriteInputs(const char* key, const odiK_Model& model, const std::vector<odiK_AttributeInput>& inputs,
                     bool alsoEmpty) {
        if (inputs.empty() && !alsoEmpty) return;
        out_.Key(key);
        out_.BeginArray();
        for (const odiK_AttributeInput& input : inputs) {
            out_.BeginObject();
            Text("region", input.setName);
            WriteFields(input.record.ConstGet(), model, "region");
            out_.EndObject();
        }
        out_.EndArray();
    }

    void WriteAssembly(const odiK_Model& model) {
        out_.Key("assembly");
        out_.BeginObject();
        Text("name", model.assemblyName, "Assembly");
        Text("solverInput", model.assemblySolverInput);
        if (!model.Instances().empty()) {
            out_.Key("instances");
            out_.BeginObject();
            for (const auto& [name, instance] : model.Instances()) {
                out_.Key(name.View());
                WriteInstance(model, *instance);
            }
            out_.EndObject();
        }
        if (!model.ConstAssemblyMesh().IsNull()) WriteMesh(*model.ConstAssemblyMesh(), true);
        WriteAssemblySets(model);
        WriteAttributes("sectionAssignments", model, model.AssemblyObject().sectionAssignments);
        WriteConnectorOrientations(model);
        out_.EndObject();
    }

    void Floats(const char* key, const float (&values)[3]) {
        if (values[0] != 0.0F || values[1] != 0.0F || values[2] != 0.0F)
            Triple(key, values[0], values[1], values[2]);
    }

    void WriteInstance(const odiK_Model& model, const odiK_Instance& instance) {
        out_.BeginObject();
        Text("part", instance.partName);
        Flag("partInstance", instance.isPartInstance, true);
        Floats("translation", instance.translation);
        Floats("rotation", instance.rotation);
        Text("solverInput", instance.solverInput);
        if (!instance.ownMesh.IsNull()) WriteMesh(*instance.ownMesh, false);
        const auto own = [&](const char* key,
                             const std::unique_ptr<std::vector<odiK_AttributeInput>>& inputs) {
            if (inputs != nullptr) WriteInputs(key, model, *inputs, true);
        };
        own("sectionAssignments", instance.ownSectionAssignments);
        own("materialOrientations", instance.ownMaterialOrientations);
        own("beamOrientations", instance.ownBeamOrientations);
        out_.EndObject();
    }

    void WriteConnectorOrientations(const odiK_Model& model) {
        const ptoC_PartAttributeList& stored = model.AssemblyObject().connectorOrientations;
        ptoC_PartAttributeList list;
        for (int i = 0; i < stored.Size(); ++i) {
            ptoC_ConnectorOrientation orientation =
                nex_canDynamicCastRef<ptoC_ConnectorOrientation>(stored.ConstGet(i), NEX_HERE);
            // The name of its place comes back by itself.
            if (orientation.name == odiK_Assembly::ConnectorOrientationName(i)) orientation.name = {};
            list.Append(orientation);
        }
        WriteAttributes("connectorOrientations", model, list);
    }

    void WriteAttributes(const char* key, const odiK_Model& model, const ptoC_PartAttributeList& list) {
        if (list.Size() == 0) return;
        out_.Key(key);
        out_.BeginArray();
        for (int i = 0; i < list.Size(); ++i) WriteRecord(list.ConstGet(i), model, {});
        out_.EndArray();
    }

    void Labels(const std::vector<int>& labels) {
        out_.Key("labels");
        out_.BeginArray(mdf_Layout::Wrapped);
        for (const int label : labels) out_.Int(label);
        out_.EndArray();
    }

    void WriteMesh(const odiK_Mesh& mesh, bool ofAssembly) {
        out_.Key("mesh");
        out_.BeginObject();
        const odiK_NodeData& nodes = mesh.Nodes();
        if (nodes.NumNodes() > 0) {
            out_.Key("nodes");
            out_.BeginObject();
            out_.Key("labels");
            out_.BeginArray(mdf_Layout::Wrapped);
            for (int i = 0; i < nodes.NumNodes(); ++i) out_.Int(nodes.labels.UncheckedConstGet(i));
            out_.EndArray();
            out_.Key("coordinates");
            out_.BeginArray();
            for (std::size_t i = 0; i < nodes.coordinates.size(); i += 3) {
                const double xyz[3] = {nodes.coordinates[i], nodes.coordinates[i + 1],
                                       nodes.coordinates[i + 2]};
                out_.Row(std::span<const double>(xyz));
            }
            out_.EndArray();
            out_.EndObject();
        }
        if (!mesh.Classes().empty()) {
            out_.Key("elements");
            out_.BeginArray();
            for (const odiK_ElementClass& elements : mesh.Classes()) WriteElements(mesh, elements);
            out_.EndArray();
        }
        if (!ofAssembly && !mesh.Sets().empty()) {
            out_.Key("sets");
            out_.BeginArray();
            for (const auto& set : mesh.Sets()) {
                BeginSet(*set);
                WriteMembers(mesh, *set, set->subsets);
                out_.EndObject();
            }
            out_.EndArray();
        }
        out_.EndObject();
    }

    void WriteElements(const odiK_Mesh& mesh, const odiK_ElementClass& elements) {
        out_.BeginObject();
        out_.Key("type");
        out_.String(elements.type.View());
        Labels(elements.labels);
        out_.Key("connectivity");
        out_.BeginArray();
        const odiK_NodeData& nodes = mesh.Nodes();
        for (std::size_t i = 0; i < elements.connectivity.size();) {
            out_.BeginArray(mdf_Layout::OneLine);
            for (int j = 0; j < elements.nodesPerElement; ++j, ++i) {
                const int node = elements.connectivity[i];
                if (node < nodes.NumNodes()) {
                    out_.Int(nodes.Label(node));
                } else {
                    const odiK_ForeignNode& end =
                        nodes.foreign[static_cast<std::size_t>(node - nodes.NumNodes())];
                    out_.String(std::string(end.instanceName.View()) + "." + std::to_string(end.label));
                }
            }
            out_.EndArray();
        }
        out_.EndArray();
        if (elements.controls != bme_ElemCtrlParams()) {
            out_.Key("controls");
            out_.BeginObject();
            WriteFields(elements.controls, odiK_Model(""), nullptr);
            out_.EndObject();
        }
        out_.EndObject();
    }

    void BeginSet(const odiK_Set& set) {
        static const char* const kinds[] = {"node", "element", "surface"};
        out_.BeginObject();
        Text("name", set.name);
        Text("kind", kinds[static_cast<int>(set.type)]);
        Flag("internal", set.internal);
    }

    void WriteMembers(const odiK_Mesh& mesh, const odiK_Set& set, std::span<const rgnC_SubsetData> subsets) {
        const bool facets = set.type == res_SetTypeEnm::FACETS;
        out_.Key(facets ? "facets" : "labels");
        out_.BeginArray(facets ? mdf_Layout::Lines : mdf_Layout::Wrapped);
        for (const rgnC_SubsetData& subset : subsets) {
            for (int i = 0; i < subset.subset.Length(); ++i) {
                const int entry = subset.subset[i];
                if (set.type == res_SetTypeEnm::NODES) {
                    out_.Int(mesh.Nodes().Label(entry));
                    continue;
                }
                const auto& elements = mesh.Classes()[static_cast<std::size_t>(subset.classIndex)];
                const int label = elements.labels[static_cast<std::size_t>(entry)];
                if (facets) {
                    const int facet[2] = {label, subset.facetIds[i]};
                    out_.Row(std::span<const int>(facet));
                } else {
                    out_.Int(label);
                }
            }
        }
        out_.EndArray();
    }

    void WriteAssemblySets(const odiK_Model& model) {
        if (model.AssemblySets().empty()) return;
        out_.Key("sets");
        out_.BeginArray();
        for (const auto& set : model.AssemblySets()) {
            BeginSet(*set);
            out_.Key("members");
            out_.BeginArray();
            for (const rgnC_SubsetData& subset : set->subsets) {
                const odiK_Instance* owner = InstanceOf(model, subset.meshIndex);
                out_.BeginObject();
                if (owner != nullptr) Text("instance", owner->name);
                const auto mesh = owner == nullptr ? model.ConstAssemblyMesh() : owner->Mesh();
                WriteMembers(*mesh, *set, std::span<const rgnC_SubsetData>(&subset, 1));
                out_.EndObject();
            }
            out_.EndArray();
            out_.EndObject();
        }
        out_.EndArray();
    }

    // Entries that are no part instances have negative indices; null is the assembly.
    static const odiK_Instance* InstanceOf(const odiK_Model& model, int meshIndex) {
        if (meshIndex > 0) return model.InstanceOfMesh(meshIndex).Referent();
        for (const auto& [name, instance] : model.Instances()) {
            if (meshIndex < 0 && instance->meshIndex == meshIndex) return instance.Referent();
        }
        return nullptr;
    }

    void WriteSteps(const odiK_Model& model) {
        if (model.steps.Size() == 0) return;
        out_.Key("steps");
        out_.BeginArray();
        for (kprC_StepContainerIT it(model.steps); !it.IsDone(); it.Next()) {
            out_.BeginObject();
            out_.Key("name");
            out_.String(it.CurrentKey().View());
            Class(it.CurrentValue());
            WriteFields(it.CurrentValue(), model, nullptr);
            out_.EndObject();
        }
        out_.EndArray();
    }

    void Class(const cls_Record& record) {
        out_.Key("class");
        out_.String(cls_Classes().NameOf(record.DynTypeId()).View());
    }

    void WriteRepository(const char* key, const odiK_Model& model, const mdl_Repository& repository) {
        if (repository.IsEmpty()) return;
        out_.Key(key);
        out_.BeginObject();
        for (mdl_RepositoryIT it(repository); !it.IsDone(); it.Next()) {
            const cls_Record& record = it.CurrentRecord();
            out_.Key(it.CurrentKey().View());
            out_.BeginObject();
            if (record.DynTypeId() != repository.ItemTypeId()) Class(record);
            WriteFields(record, model, nullptr);
            if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(&record)) {
                WriteStates(*object, model);
            }
            out_.EndObject();
        }
        out_.EndObject();
    }

    void WriteStates(const kprC_PropagatingObject& object, const odiK_Model& model) {
        if (object.GivenStates().empty()) return;
        out_.Key("states");
        out_.BeginObject();
        for (const mdl_GivenState& given : object.GivenStates()) {
            out_.Key(given.stepName.View());
            out_.BeginObject();
            Flag("deactivated", given.deactivated);
            if (given.status) {
                out_.Key("status");
                out_.Int(static_cast<int>(*given.status));
            }
            const cls_Record& record = given.record.ConstGet();
            const auto& fields = record.DynFields().All();
            for (std::size_t i = 0; i < fields.size(); ++i) {
                if (given.marks[i] == mdl_GivenEnm::ABSENT) continue;
                out_.Key(fields[i].name);
                if (given.marks[i] == mdl_GivenEnm::CLEARED) {
                    out_.Null();
                } else {
                    WriteGiven(*fields[i].type, fields[i].In(record), given.marks[i], model);
                }
            }
            out_.EndObject();
        }
        out_.EndObject();
    }

    void WriteGiven(const cls_FieldType& type, const void* value, mdl_GivenEnm mark,
                    const odiK_Model& model) {
        if (type.Kind() != cls_FieldKind::Attribute) {
            WriteValue(type, value, model);
            return;
        }
        const auto& attribute = static_cast<const cls_AttributeType&>(type);
        if (mark == mdl_GivenEnm::VALUE) {
            WriteValue(attribute.ValueType(), attribute.Value(value), model);
            return;
        }
        out_.BeginObject();
        if (mark != mdl_GivenEnm::STATE_ONLY) {
            out_.Key("value");
            WriteValue(attribute.ValueType(), attribute.Value(value), model);
        }
        out_.Key("state");
        out_.Int(attribute.State(value));
        out_.EndObject();
    }

    void WriteRecord(const cls_Record& record, const odiK_Model& model, std::string_view className) {
        out_.BeginObject();
        if (!className.empty()) Class(record);
        WriteFields(record, model, nullptr);
        out_.EndObject();
    }

    /// What a file gets that says nothing of the field.
    static bool IsDefault(const cls_Field& field, const cls_Record& record, const cls_Record& byDefault) {
        if (field.defaultItems == nullptr) return field.type->Equal(field.In(record), field.In(byDefault));
        return *static_cast<const cow_List<double>*>(field.In(record)) == field.defaultItems(record);
    }

    // Fields that have their defaults are left out.
    void WriteFields(const cls_Record& record, const odiK_Model& model, const char* passedOver) {
        const std::unique_ptr<cls_Record> byDefault(cls_Classes().Find(record.DynTypeId())->create());
        for (const cls_Field& field : record.DynFields().All()) {
            if (field.notModelData || (passedOver != nullptr && std::string_view(passedOver) == field.name))
                continue;
            const void* value = field.In(record);
            if (!field.required && IsDefault(field, record, *byDefault)) continue;
            out_.Key(field.name);
            WriteValue(*field.type, value, model);
        }
    }

    void WriteValue(const cls_FieldType& type, const void* value, const odiK_Model& model) {
        switch (type.Kind()) {
        case cls_FieldKind::Bool: out_.Bool(*static_cast<const bool*>(value)); break;
        case cls_FieldKind::Int:
            if (cls_IsUnset(type, value)) {
                out_.Null();
            } else {
                out_.Int(*static_cast<const int*>(value));
            }
            break;
        case cls_FieldKind::Double:
            if (cls_IsUnset(type, value)) {
                out_.Null();
            } else {
                out_.Real(*static_cast<const double*>(value));
            }
            break;
        case cls_FieldKind::Float: out_.Real(*static_cast<const float*>(value)); break;
        case cls_FieldKind::String: out_.String(static_cast<const cow_String*>(value)->View()); break;
        case cls_FieldKind::Enum: {
            const auto& enumeration = static_cast<const cls_EnumType&>(type);
            const omu_EnumRow* row = enumeration.Table().Row(enumeration.Get(value));
            if (row == nullptr) {
                out_.Int(enumeration.Get(value));
            } else {
                out_.String(row->name);
            }
            break;
        }
        case cls_FieldKind::Triple: {
            double xyz[3];
            static_cast<const cls_TripleType&>(type).Get(value, xyz);
            out_.Row(std::span<const double>(xyz));
            break;
        }
        case cls_FieldKind::Segment: {
            const auto& segment = *static_cast<const gsl_ModelSegment*>(value);
            const double start[3] = {segment.Start().X(), segment.Start().Y(), segment.Start().Z()};
            const double end[3] = {segment.End().X(), segment.End().Y(), segment.End().Z()};
            out_.BeginArray();
            out_.Row(std::span<const double>(start));
            out_.Row(std::span<const double>(end));
            out_.EndArray();
            break;
        }
        case cls_FieldKind::Complex: {
            const auto& number = *static_cast<const omi_complex*>(value);
            const double parts[2] = {number.real, number.imag};
            if (number.form == omi_complex::FormEnm::RECTANGULAR) {
                out_.Row(std::span<const double>(parts));
                break;
            }
            out_.BeginObject(mdf_Layout::OneLine);
            out_.Key("form");
            WriteValue(cls_TypeOf<omi_complex::FormEnm>::Instance(), &number.form, model);
            out_.Key("real");
            out_.Real(number.real);
            out_.Key("imag");
            out_.Real(number.imag);
            out_.EndObject();
            break;
        }
        case cls_FieldKind::Table: {
            const cow_2DArray<double>& cells = static_cast<const cls_TableType&>(type).Get(value);
            out_.BeginArray();
            for (int row = 0; row < cells.NumRows(); ++row) {
                out_.Row(std::span<const double>(cells.ConstRow(row),
                                                 static_cast<std::size_t>(cells.NumColumns())));
            }
            out_.EndArray();
            break;
        }
        case cls_FieldKind::List: {
            const auto& list = static_cast<const cls_ListType&>(type);
            out_.BeginArray();
            for (int i = 0; i < list.Length(value); ++i)
                WriteValue(list.ItemType(), list.Item(value, i), model);
            out_.EndArray();
            break;
        }
        case cls_FieldKind::Map: {
            const auto& map = static_cast<const cls_MapType&>(type);
            out_.BeginObject();
            const cow_List<cow_String> keys = map.Keys(value);
            for (int i = 0; i < keys.Length(); ++i) {
                out_.Key(keys[i].View());
                WriteValue(map.ItemType(), map.Item(value, keys[i]), model);
            }
            out_.EndObject();
            break;
        }
        case cls_FieldKind::Record:
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant: {
            const cls_Record* record = static_cast<const cls_HolderType&>(type).Get(value);
            if (record == nullptr) {
                out_.Null();
            } else {
                WriteRecord(*record, model, type.Kind() == cls_FieldKind::Variant ? "class" : "");
            }
            break;
        }
        case cls_FieldKind::Region: WriteRegion(*static_cast<const rgnC_Region*>(value)); break;
        case cls_FieldKind::Datum: {
            const auto& datum = *static_cast<const dtmC_DatumRef*>(value);
            if (datum.IsNullRef()) {
                out_.Null();
            } else {
                out_.String(model.Datums().at(static_cast<std::size_t>(datum.Id()) - 1).name.View());
            }
            break;
        }
        case cls_FieldKind::Attribute: {
            // An item of a list of attributes: its state says whether it was set.
            const auto& attribute = static_cast<const cls_AttributeType&>(type);
            const bool plain = attribute.State(value) == static_cast<int>(mdl_PropAttributeStateEnm::SET);
            WriteGiven(type, value, plain ? mdl_GivenEnm::VALUE : mdl_GivenEnm::AS_IT_STANDS, model);
            break;
        }
        }
    }

    void WriteRegion(const rgnC_Region& region) {
        const std::string instance(region.InstanceName().View());
        const std::string set(region.SetName().View());
        if (!region.HasValue()) {
            out_.Null();
        } else if (instance.find('.') == std::string::npos && set.find('.') == std::string::npos) {
            out_.String(instance.empty() ? set : instance + "." + set);
        } else {
            out_.BeginObject(mdf_Layout::OneLine);
            if (!instance.empty()) {
                out_.Key("instance");
                out_.String(instance);
            }
            out_.Key("set");
            out_.String(set);
            out_.EndObject();
        }
    }

    mdf_Writer out_;
};

} // namespace

bool mdf_WriteModelFile(const odb_Odb& odb, std::ostream& out) {
    return ModelWriter(out).Write(odb);
}
