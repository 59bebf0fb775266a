#include "model_file/mdf_ModelReader.h"

#include "model_file/checks/mdf_ConstraintChecks.h"
#include "model_file/checks/mdf_InteractionChecks.h"
#include "model_file/checks/mdf_MaterialChecks.h"
#include "model_file/mdf_Parser.h"

#include <algorithm>
#include <cmath>

namespace {

const char kFormat[] = "qrx-model/1";

// All members that a model can have.
const std::vector<std::string>& ModelMembers() {
    static const std::vector<std::string> members = {"description",
                                                     "topLevelSolverInput",
                                                     "solverInput",
                                                     "absoluteZero",
                                                     "stefanBoltzmann",
                                                     "waveFormulation",
                                                     "restartJob",
                                                     "restartStep",
                                                     "restartIncrement",
                                                     "endRestartStep",
                                                     "globalJob",
                                                     "shellToSolid",
                                                     "analysisProduct",
                                                     "datums",
                                                     "parts",
                                                     "assembly",
                                                     "materials",
                                                     "sections",
                                                     "beamProfiles",
                                                     "amplitudes",
                                                     "constraints",
                                                     "contactControls",
                                                     "contactInitializations",
                                                     "interactionProperties",
                                                     "timePoints",
                                                     "adaptiveMeshControls",
                                                     "steps",
                                                     "boundaryConditions",
                                                     "loads",
                                                     "fields",
                                                     "interactions",
                                                     "fieldOutputRequests",
                                                     "historyOutputRequests",
                                                     "adaptiveMeshConstraints",
                                                     "cyclicSymmetry"};
    return members;
}

bool IsOneOf(std::string_view word, std::initializer_list<const char*> words) {
    return std::any_of(words.begin(), words.end(),
                       [&](const char* known) { return omu_EqualInAnyCapitals(word, known); });
}

} // namespace

template <class Reader>
void mdf_ModelReader::WithMember(mdf_Value& json, const mdf_Path& path, const char* member,
                                 const Reader& read) {
    mdf_Value* value = json.Find(member);
    if (value != nullptr) read(*value, mdf_Path(path, std::string_view(member)));
}

bool mdf_ModelReader::CheckName(const std::string& name, const mdf_Path& path) {
    const std::string problem = mdf_NameProblem(name);
    if (!problem.empty()) diagnostics_.Error(path, "found " + problem);
    return problem.empty();
}

void mdf_ModelReader::Read(mdf_Value& json, const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    records_.CheckMembers(json, ModelMembers(), path);
    ReadScalars(json, path);
    WithMember(json, path, "datums", [&](mdf_Value& v, const mdf_Path& p) { ReadDatums(v, p); });
    WithMember(json, path, "parts", [&](mdf_Value& v, const mdf_Path& p) { ReadParts(v, p); });
    WithMember(json, path, "assembly", [&](mdf_Value& v, const mdf_Path& p) { ReadAssembly(v, p); });
    model_.SealInstances();
    ReadRepositories(json, path);
    WithMember(json, path, "cyclicSymmetry", [&](mdf_Value& v, const mdf_Path& p) {
        if (v.IsNull()) return;
        ddb_ModelSectorDefinition sector;
        records_.ReadRecord(sector, v, p);
        if (!v.IsObject()) return;
        model_.cyclicSymmetry = mdl_ObjCow<ddb_ModelSectorDefinition>(sector);
        const std::pair<const char*, g3d_Vector> points[] = {{"startPoint", sector.startPoint},
                                                             {"endPoint", sector.endPoint}};
        for (const auto& [member, point] : points) {
            const double xyz[3] = {point.x, point.y, point.z};
            const mdf_Path place(p, std::string_view(member));
            for (std::size_t i = 0; i < 3; ++i) {
                if (!std::isinf(static_cast<float>(xyz[i]))) continue;
                diagnostics_.Expected(mdf_Path(place, i), mdf_Value(xyz[i]), "a number of single precision");
            }
        }
        if (sector.symmetryType == calC_SymmetryTypeEnm::NONE) {
            diagnostics_.Warning(p, "the sector definition is idle, since symmetryType is NONE");
        }
    });
    records_.CheckReferences();
    mdf_CheckGasketOptions(model_, diagnostics_, path);
    mdf_CheckEquationSystems(model_, diagnostics_, path);
    mdf_CheckGeneralContact(model_, diagnostics_, path);
    CheckPartAttributes();
    Propagate(path);
    if (diagnostics_.NumErrors() > 0) return;

    mdf_StoreProblems problems(diagnostics_, path);
    model_.CompleteTree(problems);
    model_.SetComplete();
}

void mdf_ModelReader::ReadScalars(const mdf_Value& json, const mdf_Path& path) {
    const auto text = [&](const char* member, cow_String& target, bool verbatim) {
        const mdf_Value* value = json.Find(member);
        if (value == nullptr) return;
        const mdf_Path place(path, std::string_view(member));
        if (verbatim) {
            records_.ReadText(target, *value, place);
        } else if (value->IsString()) {
            target = cow_String(value->String());
        } else {
            diagnostics_.Expected(place, *value, "a string");
        }
    };
    const auto number = [&](const char* member, double& target) {
        const mdf_Value* value = json.Find(member);
        if (value == nullptr) return;
        if (value->IsNumber()) {
            target = value->Real();
        } else {
            diagnostics_.Expected(mdf_Path(path, std::string_view(member)), *value, "a number");
        }
    };
    const auto flag = [&](const char* member, bool& target) {
        const mdf_Value* value = json.Find(member);
        if (value == nullptr) return;
        if (value->IsBool()) {
            target = value->Bool();
        } else {
            diagnostics_.Expected(mdf_Path(path, std::string_view(member)), *value, "true or false");
        }
    };
    text("description", model_.description, false);
    text("topLevelSolverInput", model_.topLevelSolverInput, true);
    text("solverInput", model_.solverInput, true);
    number("absoluteZero", model_.absoluteZero);
    number("stefanBoltzmann", model_.stefanBoltzmann);
    text("restartJob", model_.restartJob, false);
    text("restartStep", model_.restartStep, false);
    text("globalJob", model_.globalJob, false);
    flag("endRestartStep", model_.endRestartStep);
    flag("shellToSolid", model_.shellToSolid);
    if (const mdf_Value* value = json.Find("restartIncrement")) {
        if (value->IsInt()) {
            model_.restartIncrement = value->Int();
        } else {
            diagnostics_.Expected(mdf_Path(path, "restartIncrement"), *value, "an integer of 32 bits");
        }
    }
    if (const mdf_Value* value = json.Find("waveFormulation")) {
        const std::string word = value->IsString() ? value->String() : std::string();
        for (const char* known : {"NOT_SET", "SCATTERED", "TOTAL"}) {
            if (omu_EqualInAnyCapitals(word, known)) model_.waveFormulation = known;
        }
        if (!IsOneOf(word, {"NOT_SET", "SCATTERED", "TOTAL"})) {
            diagnostics_.Expected(mdf_Path(path, "waveFormulation"), *value,
                                  "one of NOT_SET, SCATTERED, TOTAL");
        }
    }
    if (const mdf_Value* value = json.Find("analysisProduct")) {
        if (value->IsInt()) {
            model_.analysisProduct = value->Int();
        } else if (value->IsString() && IsOneOf(value->String(), {"STANDARD", "IMPLICIT"})) {
            model_.analysisProduct = static_cast<int>(kprC_AnalysisProductEnm::IMPLICIT);
        } else if (value->IsString() && IsOneOf(value->String(), {"EXPLICIT"})) {
            model_.analysisProduct = static_cast<int>(kprC_AnalysisProductEnm::EXPLICIT);
        } else {
            diagnostics_.Expected(mdf_Path(path, "analysisProduct"), *value,
                                  "one of STANDARD, IMPLICIT, EXPLICIT, or an integer");
        }
    }
}

void mdf_ModelReader::ReadDatums(const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of datums");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (std::size_t i = 0; i < json.Size(); ++i) ReadDatum(json.Item(i), mdf_Path(path, i), capitals);
}

void mdf_ModelReader::ReadDatum(const mdf_Value& json, const mdf_Path& path, mdf_CapitalsCheck& capitals) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    records_.CheckMembers(json, {"name", "type", "system", "origin", "xAxis", "yAxis", "zAxis"}, path);
    odiK_Datum datum;
    datum.zAxis = gsl_Vector();
    const mdf_Value* name = json.Find("name");
    if (name == nullptr || !name->IsString()) {
        diagnostics_.Error(mdf_Path(path, "name"),
                           "found " + (name == nullptr ? std::string("nothing") : mdf_Shown(*name)) +
                               ", expected the name of the datum");
        return;
    }
    if (!CheckName(name->String(), mdf_Path(path, "name"))) return;
    datum.name = cow_String(name->String());
    capitals.Enter(name->String(), mdf_Path(path, "name"), "datum", diagnostics_);
    bool good = true;
    if (!model_.FindDatum(datum.name).IsNullRef()) {
        diagnostics_.Error(mdf_Path(path, "name"), "found a second datum named " +
                                                       mdf_Quoted(name->String()) +
                                                       ", expected names that are unique");
        good = false;
    }
    const auto word = [&](const char* member, std::initializer_list<const char*> words, int& index) {
        const mdf_Value* value = json.Find(member);
        if (value == nullptr) return;
        std::vector<std::string> known(words.begin(), words.end());
        const auto place =
            std::find(known.begin(), known.end(), value->IsString() ? value->String() : std::string());
        if (place == known.end()) {
            diagnostics_.Expected(mdf_Path(path, std::string_view(member)), *value, mdf_OneOf(known));
            good = false;
        } else {
            index = static_cast<int>(place - known.begin()) + 1;
        }
    };
    int type = static_cast<int>(dtu_DatumType::CSYS);
    int system = static_cast<int>(dtu_DatumCsysType::RECTANGULAR);
    word("type", {"point", "axis", "plane", "csys"}, type);
    word("system", {"rectangular", "cylindrical", "spherical"}, system);
    datum.type = static_cast<dtu_DatumType>(type);
    datum.csysType = static_cast<dtu_DatumCsysType>(system);
    gsl_Vector origin;
    const auto direction = [&](const char* member, gsl_Vector& target) {
        const mdf_Value* value = json.Find(member);
        if (value != nullptr && !ReadDirection(target, *value, mdf_Path(path, std::string_view(member))))
            good = false;
    };
    direction("origin", origin);
    direction("xAxis", datum.xAxis);
    direction("yAxis", datum.yAxis);
    direction("zAxis", datum.zAxis);
    if (!good) {
        records_.NoteWrong(name->String());
        return;
    }
    const bool zGiven = json.Find("zAxis") != nullptr;
    if (!zGiven && datum.type == dtu_DatumType::PLANE) datum.zAxis = gsl_Vector(0.0, 0.0, 1.0);
    datum.origin = gsl_Point(origin.X(), origin.Y(), origin.Z());
    if (CheckAxes(datum, zGiven, path)) {
        model_.AddDatum(datum);
    } else {
        records_.NoteWrong(name->String());
    }
}

bool mdf_ModelReader::CheckAxes(const odiK_Datum& datum, bool zGiven, const mdf_Path& path) {
    const bool csys = datum.type == dtu_DatumType::CSYS;
    const auto check = [&](bool used, const char* member, gsl_Vector& axis) {
        const double length = axis.ComputeMagnitude();
        const bool good = length > 0.0 && std::isfinite(length);
        if (used && !good) {
            diagnostics_.Error(
                mdf_Path(path, std::string_view(member)),
                std::string("found a direction ") +
                    (length > 0.0 ? "whose length is beyond double precision" : "of no length") +
                    ", expected one with a length");
        }
        axis.Normalize();
        return good || !used;
    };
    gsl_Vector x = datum.xAxis;
    gsl_Vector y = datum.yAxis;
    gsl_Vector z = datum.zAxis;
    bool good = check(csys || datum.type == dtu_DatumType::AXIS, "xAxis", x);
    good = check(csys, "yAxis", y) && good;
    good = check(zGiven && (csys || datum.type == dtu_DatumType::PLANE), "zAxis", z) && good;
    if (good && csys && !(gsl_Cross(x, y).ComputeMagnitude() > gsl_Util::Instance().AngleTolerance())) {
        diagnostics_.Error(mdf_Path(path, "yAxis"),
                           "found a direction parallel to xAxis, expected one that is not");
        good = false;
    }
    return good;
}

bool mdf_ModelReader::ReadDirection(gsl_Vector& vector, const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsArray() || json.Size() != 3) {
        diagnostics_.Expected(path, json, "three numbers");
        return false;
    }
    double xyz[3];
    for (std::size_t i = 0; i < 3; ++i) {
        const mdf_Value item = json.Item(i);
        if (!item.IsNumber()) {
            diagnostics_.Expected(mdf_Path(path, i), item, "a number");
            return false;
        }
        xyz[i] = item.Real();
    }
    vector = gsl_Vector(xyz[0], xyz[1], xyz[2]);
    return true;
}

bool mdf_ModelReader::ReadFloats(float (&values)[3], const mdf_Value& json, const mdf_Path& path) {
    gsl_Vector vector;
    if (!ReadDirection(vector, json, path)) return false;
    const double xyz[3] = {vector.X(), vector.Y(), vector.Z()};
    for (std::size_t i = 0; i < 3; ++i) {
        values[i] = static_cast<float>(xyz[i]);
        if (!std::isinf(values[i])) continue;
        diagnostics_.Expected(mdf_Path(path, i), mdf_Value(xyz[i]), "a number of single precision");
        return false;
    }
    return true;
}

void mdf_ModelReader::ReadParts(mdf_Value& json, const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object of parts");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (mdf_Member& member : json.Members()) {
        const mdf_Path place(path, member.name);
        if (!CheckName(member.name, place)) continue;
        capitals.Enter(member.name, place, "part", diagnostics_);
        // A part that is wrong inside is there all the same, so that its instances are not reported too.
        odiK_Part& part = model_.AddPart(cow_String(member.name));
        if (!member.value.IsObject()) {
            diagnostics_.Expected(place, member.value, "an object");
            continue;
        }
        records_.CheckMembers(
            member.value,
            {"solverInput", "mesh", "sectionAssignments", "materialOrientations", "beamOrientations"}, place);
        WithMember(member.value, place, "solverInput",
                   [&](mdf_Value& v, const mdf_Path& p) { records_.ReadText(part.solverInput, v, p); });
        WithMember(member.value, place, "mesh",
                   [&](mdf_Value& v, const mdf_Path& p) { part.mesh = meshes_.ReadMesh(v, p); });
        WithMember(member.value, place, "sectionAssignments", [&](mdf_Value& v, const mdf_Path& p) {
            ReadAttributeInputs(part.attributes.sectionAssignments, ptoC_SectionAssignment::TypeId(), v, p);
        });
        WithMember(member.value, place, "materialOrientations", [&](mdf_Value& v, const mdf_Path& p) {
            ReadAttributeInputs(part.attributes.materialOrientations, ptoC_MaterialOrientation::TypeId(), v,
                                p);
        });
        WithMember(member.value, place, "beamOrientations", [&](mdf_Value& v, const mdf_Path& p) {
            ReadAttributeInputs(part.attributes.beamOrientations, ptoC_BeamOrientation::TypeId(), v, p);
        });
    }
}

void mdf_ModelReader::ReadAttributeInputs(std::vector<odiK_AttributeInput>& inputs, unsigned type,
                                          const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array");
        return;
    }
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value item = json.Item(i);
        const mdf_Path place(path, i);
        const std::unique_ptr<cls_Record> record = records_.ReadVariant(type, item, place, {"region"});
        const mdf_Value* region = item.IsObject() ? item.Find("region") : nullptr;
        if (record == nullptr || region == nullptr || !region->IsString()) {
            if (record != nullptr) {
                diagnostics_.Error(mdf_Path(place, "region"),
                                   "found " +
                                       (region == nullptr ? std::string("nothing") : mdf_Shown(*region)) +
                                       ", expected the name of an element set of the mesh");
            }
            // Keeps the places of the others.
            inputs.emplace_back();
            continue;
        }
        inputs.push_back({cow_String(region->String()),
                          mdl_ObjCow<ptoC_PartAttribute>(static_cast<const ptoC_PartAttribute&>(*record))});
    }
}

void mdf_ModelReader::CheckAttributeInputs(const std::vector<odiK_AttributeInput>& inputs,
                                           const odiK_Mesh* mesh, const std::string& pointer) {
    for (std::size_t i = 0; i < inputs.size(); ++i) {
        if (inputs[i].record.IsNull()) continue;
        const std::string place = pointer + "/" + std::to_string(i) + "/region";
        const std::string name(inputs[i].setName.View());
        const int id = mesh == nullptr ? -1 : mesh->FindSet(inputs[i].setName);
        if (id < 0 && records_.IsWrong(name)) continue;
        if (id < 0) {
            std::vector<std::string> names;
            if (mesh != nullptr) {
                for (const auto& set : mesh->Sets()) names.emplace_back(set->name.View());
            }
            diagnostics_.Error(place, "found " + mdf_Quoted(name) +
                                          ", expected the name of a set of the mesh" +
                                          mdf_DidYouMean(name, names));
        } else if (mesh->Sets()[static_cast<std::size_t>(id)]->type != res_SetTypeEnm::ELEMENTS) {
            diagnostics_.Error(place, "found " + mdf_Quoted(name) +
                                          ", which is no element set, expected an element "
                                          "set");
        }
    }
}

void mdf_ModelReader::CheckPartAttributes() {
    std::string models("/models");
    mdf_AppendPointer(models, model_.Name().View());
    const auto check = [&](const odiK_AttributeInputs& inputs, const odiK_Mesh* mesh,
                           const std::string& pointer) {
        CheckAttributeInputs(inputs.sectionAssignments, mesh, pointer + "/sectionAssignments");
        CheckAttributeInputs(inputs.materialOrientations, mesh, pointer + "/materialOrientations");
        CheckAttributeInputs(inputs.beamOrientations, mesh, pointer + "/beamOrientations");
    };
    for (const auto& [name, part] : model_.Parts()) {
        std::string pointer = models + "/parts";
        mdf_AppendPointer(pointer, name.View());
        check(part->attributes, part->mesh.Referent(), pointer);
    }
    for (const auto& [name, instance] : model_.Instances()) {
        std::string pointer = models + "/assembly/instances";
        mdf_AppendPointer(pointer, name.View());
        const auto mesh = instance->Mesh();
        // What it takes from its part was checked there, unless it has a mesh of its own.
        const bool other = !instance->ownMesh.IsNull() && !instance->part.IsNull();
        const auto own = [&](const std::unique_ptr<std::vector<odiK_AttributeInput>>& inputs,
                             const std::vector<odiK_AttributeInput>* inherited, const char* member) {
            const auto* list = inputs != nullptr ? inputs.get() : inherited;
            if (list != nullptr) CheckAttributeInputs(*list, mesh.Referent(), pointer + "/" + member);
        };
        own(instance->ownSectionAssignments, other ? &instance->part->attributes.sectionAssignments : nullptr,
            "sectionAssignments");
        own(instance->ownMaterialOrientations,
            other ? &instance->part->attributes.materialOrientations : nullptr, "materialOrientations");
        own(instance->ownBeamOrientations, other ? &instance->part->attributes.beamOrientations : nullptr,
            "beamOrientations");
    }
}

void mdf_ModelReader::ReadAssembly(mdf_Value& json, const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    records_.CheckMembers(
        json,
        {"name", "solverInput", "instances", "mesh", "sets", "sectionAssignments", "connectorOrientations"},
        path);
    WithMember(json, path, "name", [&](mdf_Value& v, const mdf_Path& p) {
        if (!v.IsString()) {
            diagnostics_.Expected(p, v, "a name");
        } else if (CheckName(v.String(), p)) {
            model_.assemblyName = cow_String(v.String());
        }
    });
    WithMember(json, path, "solverInput",
               [&](mdf_Value& v, const mdf_Path& p) { records_.ReadText(model_.assemblySolverInput, v, p); });
    WithMember(json, path, "instances", [&](mdf_Value& v, const mdf_Path& p) { ReadInstances(v, p); });
    model_.SealInstances();
    WithMember(json, path, "mesh", [&](mdf_Value& v, const mdf_Path& p) { meshes_.ReadAssemblyMesh(v, p); });
    WithMember(json, path, "sets", [&](mdf_Value& v, const mdf_Path& p) { meshes_.ReadAssemblySets(v, p); });
    ReadAssemblyAttributes(json, path);
}

void mdf_ModelReader::ReadInstances(mdf_Value& json, const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object of instances");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (mdf_Member& member : json.Members()) {
        const mdf_Path place(path, member.name);
        if (!CheckName(member.name, place)) continue;
        capitals.Enter(member.name, place, "instance", diagnostics_);
        if (!member.value.IsObject()) {
            records_.NoteWrong(member.name);
            diagnostics_.Expected(place, member.value, "an object");
            continue;
        }
        ReadInstance(cow_String(member.name), member.value, place);
    }
}

void mdf_ModelReader::ReadInstance(const cow_String& name, mdf_Value& json, const mdf_Path& path) {
    records_.CheckMembers(json,
                          {"part", "translation", "rotation", "solverInput", "partInstance", "mesh",
                           "sectionAssignments", "materialOrientations", "beamOrientations"},
                          path);
    bool isPartInstance = true;
    if (const mdf_Value* value = json.Find("partInstance")) {
        if (value->IsBool()) {
            isPartInstance = value->Bool();
        } else {
            diagnostics_.Expected(mdf_Path(path, "partInstance"), *value, "true or false");
        }
    }
    const mdf_Value* part = json.Find("part");
    const mdf_Path partPath(path, "part");
    if (part != nullptr && !part->IsString()) {
        diagnostics_.Expected(partPath, *part, "the name of a part");
        part = nullptr;
    } else if (part == nullptr && isPartInstance) {
        diagnostics_.Error(partPath, "found nothing, expected the name of a part");
    }
    cow_String partName;
    if (part != nullptr) {
        partName = cow_String(part->String());
        if (model_.Parts().count(partName) == 0) {
            std::vector<std::string> names;
            for (const auto& [known, entry] : model_.Parts()) names.emplace_back(known.View());
            diagnostics_.Error(partPath, "found " + mdf_Shown(*part) + ", expected the name of a part" +
                                             mdf_DidYouMean(part->String(), names));
            partName = cow_String();
        }
    }
    odiK_Instance& instance = model_.AddOtherEntry(name, partName);
    instance.isPartInstance = isPartInstance;
    WithMember(json, path, "translation",
               [&](mdf_Value& v, const mdf_Path& p) { ReadFloats(instance.translation, v, p); });
    WithMember(json, path, "rotation",
               [&](mdf_Value& v, const mdf_Path& p) { ReadFloats(instance.rotation, v, p); });
    WithMember(json, path, "solverInput",
               [&](mdf_Value& v, const mdf_Path& p) { records_.ReadText(instance.solverInput, v, p); });
    WithMember(json, path, "mesh",
               [&](mdf_Value& v, const mdf_Path& p) { instance.ownMesh = meshes_.ReadMesh(v, p); });
    const auto own = [&](const char* member, unsigned type,
                         std::unique_ptr<std::vector<odiK_AttributeInput>>& inputs) {
        WithMember(json, path, member, [&](mdf_Value& v, const mdf_Path& p) {
            inputs = std::make_unique<std::vector<odiK_AttributeInput>>();
            ReadAttributeInputs(*inputs, type, v, p);
        });
    };
    own("sectionAssignments", ptoC_SectionAssignment::TypeId(), instance.ownSectionAssignments);
    own("materialOrientations", ptoC_MaterialOrientation::TypeId(), instance.ownMaterialOrientations);
    own("beamOrientations", ptoC_BeamOrientation::TypeId(), instance.ownBeamOrientations);
}

void mdf_ModelReader::ReadAssemblyAttributes(mdf_Value& json, const mdf_Path& path) {
    const auto read = [&](const char* member, unsigned type, const auto& append) {
        WithMember(json, path, member, [&](mdf_Value& v, const mdf_Path& p) {
            if (!v.IsArray()) {
                diagnostics_.Expected(p, v, "an array");
                return;
            }
            for (std::size_t i = 0; i < v.Size(); ++i) {
                const mdf_Path place(p, i);
                const std::unique_ptr<cls_Record> record = records_.ReadVariant(type, v.Item(i), place);
                if (record == nullptr) continue;
                const auto& attribute = static_cast<const ptoC_PartAttribute&>(*record);
                if (attribute.region.HasValue() && attribute.region.FlagWord() != 2) {
                    diagnostics_.Error(mdf_Path(place, "region"),
                                       "found " + mdf_Quoted(attribute.region.SetName().View()) +
                                           ", which is no element set, expected an element set");
                }
                append(*record);
            }
        });
    };
    odiK_Assembly& assembly = model_.AssemblyObject();
    read("sectionAssignments", ptoC_SectionAssignment::TypeId(), [&](const cls_Record& record) {
        assembly.sectionAssignments.Append(static_cast<const ptoC_PartAttribute&>(record));
    });
    read("connectorOrientations", ptoC_ConnectorOrientation::TypeId(), [&](const cls_Record& record) {
        assembly.AppendConnectorOrientation(static_cast<const ptoC_ConnectorOrientation&>(record));
    });
}

void mdf_ModelReader::ReadRepository(mdl_Repository& repository, const char* kind, const mdf_Value& json,
                                     const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, std::string("an object, each member ") + kind);
        return;
    }
    mdf_CapitalsCheck capitals;
    for (const mdf_Member& member : json.Members()) {
        const mdf_Path place(path, member.name);
        if (!CheckName(member.name, place)) continue;
        capitals.Enter(member.name, place, "name", diagnostics_);
        const bool propagating =
            cls_Classes().InheritanceCheck(repository.ItemTypeId(), kprC_PropagatingObject::TypeId());
        const std::vector<std::string> others =
            propagating ? std::vector<std::string>{"states"} : std::vector<std::string>{};
        const std::unique_ptr<cls_Record> record =
            records_.ReadVariant(repository.ItemTypeId(), member.value, place, others);
        if (record == nullptr) {
            records_.NoteWrong(member.name);
            continue;
        }
        if (propagating) {
            if (const mdf_Value* states = member.value.Find("states")) {
                records_.ReadStates(static_cast<kprC_PropagatingObject&>(*record), *states,
                                    mdf_Path(place, "states"));
            }
        }
        repository.InsertRecord(cow_String(member.name), *record);
    }
}

void mdf_ModelReader::ReadRepositories(const mdf_Value& json, const mdf_Path& path) {
    const auto read = [&](const char* member, const char* kind, mdl_Repository& repository) {
        if (const mdf_Value* value = json.Find(member)) {
            ReadRepository(repository, kind, *value, mdf_Path(path, std::string_view(member)));
        }
    };
    read("materials", "a material", model_.materials);
    read("sections", "a section", model_.sections);
    read("beamProfiles", "a beam profile", model_.beamProfiles);
    read("amplitudes", "an amplitude", model_.amplitudes);
    read("constraints", "a constraint", model_.constraints);
    read("contactControls", "contact controls", model_.contactControls);
    read("contactInitializations", "a contact initialization", model_.contactInitializations);
    read("interactionProperties", "an interaction property", model_.interactionProperties);
    read("timePoints", "time points", model_.timePoints);
    read("adaptiveMeshControls", "adaptive mesh controls", model_.adaptiveMeshControls);
    // States refer to steps.
    if (const mdf_Value* steps = json.Find("steps")) ReadSteps(*steps, mdf_Path(path, "steps"));
    read("boundaryConditions", "a boundary condition", model_.boundaryConditions);
    read("loads", "a load", model_.loads);
    read("fields", "a predefined field", model_.fields);
    read("interactions", "an interaction", model_.interactions);
    read("fieldOutputRequests", "a field output request", model_.fieldOutputRequests);
    read("historyOutputRequests", "a history output request", model_.historyOutputRequests);
    read("adaptiveMeshConstraints", "an adaptive mesh constraint", model_.adaptiveMeshConstraints);
}

void mdf_ModelReader::ReadSteps(const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of steps");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value item = json.Item(i);
        const mdf_Path place(path, i);
        std::unique_ptr<cls_Record> record;
        if (item.IsObject() && item.Find("class") == nullptr) {
            diagnostics_.Error(mdf_Path(place, "class"), "found nothing, expected the class of the step");
        } else {
            record = records_.NewVariant(kprC_Step::TypeId(), item, place);
        }
        const mdf_Value* nameJson = item.IsObject() ? item.Find("name") : nullptr;
        const mdf_Path namePath(place, "name");
        if (item.IsObject() && (nameJson == nullptr || !nameJson->IsString())) {
            diagnostics_.Error(
                namePath, "found " + (nameJson == nullptr ? std::string("nothing") : mdf_Shown(*nameJson)) +
                              ", expected the name of the step");
        }
        if (nameJson == nullptr || !nameJson->IsString()) continue;
        if (record == nullptr) {
            records_.NoteWrong(nameJson->String());
            continue;
        }
        records_.ReadRecord(*record, item, place, {"name", "class"});
        const std::string& name = nameJson->String();
        if (!CheckName(name, namePath)) continue;
        capitals.Enter(name, namePath, "step", diagnostics_);
        if (model_.steps.IsMember(cow_String(name))) {
            diagnostics_.Error(namePath, "found a second step named " + mdf_Quoted(name) +
                                             ", expected names that are unique");
            continue;
        }
        const bool isInitial = record->DynTypeId() == kprC_InitialStep::TypeId();
        if (isInitial != (i == 0)) {
            diagnostics_.Error(mdf_Path(place, "class"),
                               isInitial
                                   ? "found a second kprC_InitialStep, expected it in the first place alone"
                                   : "found " + mdf_Quoted(cls_Classes().NameOf(record->DynTypeId()).View()) +
                                         ", expected kprC_InitialStep as the first step");
        }
        model_.steps.Append(cow_String(name), static_cast<const kprC_Step&>(*record));
    }
}

void mdf_ModelReader::Propagate(const mdf_Path& path) {
    const auto propagate = [&](const char* member, mdl_Repository& repository) {
        const cow_List<cow_String> keys = repository.Keys();
        for (int i = 0; i < keys.Length(); ++i) {
            auto& object = static_cast<kprC_PropagatingObject&>(repository.WritableRecord(keys[i]));
            const mdf_Path container(path, std::string_view(member));
            const mdf_Path place(container, keys[i].View());
            for (const mdl_PropagationProblem& problem : object.Propagate(model_.steps)) {
                const mdf_Path states(place, "states");
                diagnostics_.Error(mdf_Path(states, problem.stepName.View()),
                                   "found " + std::string(problem.text.View()));
            }
        }
    };
    propagate("boundaryConditions", model_.boundaryConditions);
    propagate("loads", model_.loads);
    propagate("fields", model_.fields);
    propagate("interactions", model_.interactions);
    propagate("fieldOutputRequests", model_.fieldOutputRequests);
    propagate("historyOutputRequests", model_.historyOutputRequests);
    propagate("adaptiveMeshConstraints", model_.adaptiveMeshConstraints);
}

namespace {

std::unique_ptr<odb_Odb> ReadDocument(mdf_Value& root, const std::vector<mdf_Error>& errors,
                                      mdf_Report& report) {
    mdf_Diagnostics diagnostics(report);
    bool syntax = false;
    for (const mdf_Error& error : errors) {
        syntax = syntax || error.line > 0;
        if (error.line > 0) {
            report.messages.push_back({true, error.pointer, error.line, error.column, error.text});
        } else {
            diagnostics.Error(error.pointer, error.text);
        }
    }
    if (syntax) return nullptr;

    const mdf_Path top;
    auto odb = std::make_unique<odb_Odb>();
    if (!root.IsObject()) {
        diagnostics.Expected(top, root, "an object with the members \"format\" and \"models\"");
        return nullptr;
    }
    for (const mdf_Member& member : root.Members()) {
        if (member.name == "format" || member.name == "models") continue;
        diagnostics.Error(mdf_Path(top, member.name), "found an unknown member " + mdf_Quoted(member.name) +
                                                          ", expected one of format, models" +
                                                          mdf_DidYouMean(member.name, {"format", "models"}));
    }
    const mdf_Value* format = root.Find("format");
    if (format == nullptr || !format->IsString() || format->String() != kFormat) {
        diagnostics.Error(mdf_Path(top, "format"),
                          "found " + (format == nullptr ? std::string("nothing") : mdf_Shown(*format)) +
                              ", expected " + mdf_Quoted(kFormat));
    }
    mdf_Value* models = root.Find("models");
    const mdf_Path modelsPath(top, "models");
    if (models == nullptr || !models->IsObject()) {
        diagnostics.Error(modelsPath, "found " +
                                          (models == nullptr ? std::string("nothing") : mdf_Shown(*models)) +
                                          ", expected an object of models");
        return nullptr;
    }
    std::vector<std::string> names;
    for (mdf_Member& member : models->Members()) {
        const mdf_Path place(modelsPath, member.name);
        const std::string problem = mdf_NameProblem(member.name);
        if (!problem.empty()) {
            diagnostics.Error(place, "found " + problem);
            continue;
        }
        names.push_back(member.name);
        odiK_Model& model = odb->AddModel(cow_String(member.name));
        mdf_ModelReader(model, diagnostics).Read(member.value, place);
    }
    if (odb->FindModel(odb_Odb::DefaultModelName()) == nullptr) {
        diagnostics.Error(modelsPath, "found no model named " + mdf_Quoted(odb_Odb::DefaultModelName()) +
                                          ", expected one, since decks are written from it" +
                                          mdf_DidYouMean(odb_Odb::DefaultModelName(), names));
    }
    return diagnostics.NumErrors() > 0 ? nullptr : std::move(odb);
}

} // namespace

std::unique_ptr<odb_Odb> mdf_ReadModelFile(const std::string& path, mdf_Report& report) {
    report.fileName = path;
    std::string text;
    mdf_Error error;
    if (!mdf_ReadFile(path, text, error)) {
        report.unreadable = true;
        report.messages.push_back({true, {}, 0, 0, error.text});
        return nullptr;
    }
    mdf_Value root;
    std::vector<mdf_Error> errors;
    mdf_Parse(text, root, errors);
    // The text has gone into the document; of a large file there is no room for both beside the store.
    std::string().swap(text);
    return ReadDocument(root, errors, report);
}

std::unique_ptr<odb_Odb> mdf_ReadModelText(std::string_view text, const std::string& fileName,
                                           mdf_Report& report) {
    report.fileName = fileName;
    mdf_Value root;
    std::vector<mdf_Error> errors;
    mdf_Parse(text, root, errors);
    return ReadDocument(root, errors, report);
}
