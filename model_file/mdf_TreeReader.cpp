#include "model_file/mdf_TreeReader.h"

#include "model_file/mdf_Parser.h"
#include "store_interface/findings/fnd_TextRules.h"
#include "store_interface/records/cls_ClassRegistrar.h"

void mdf_TreeReader::ReadFields(cls_Record& frame, mdf_Value& json, const fnd_Path& path) {
    for (const cls_Field& field : frame.DynFields().All()) {
        mdf_Value* value = json.Find(field.name);
        const fnd_Path place(path, std::string_view(field.name));
        if (field.type->Kind() != cls_FieldKind::Tree) {
            records_.ReadField(frame, field, value, place);
        } else if (value != nullptr) {
            ReadTree(field, field.In(frame), *value, place);
        }
    }
}

void mdf_TreeReader::ReadFrame(cls_Record& frame, mdf_Value& json, const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    mdf_CheckMembers(diagnostics_, json, mdf_MembersOf(frame.DynFields()), path);
    ReadFields(frame, json, path);
}

void mdf_TreeReader::ReadTree(const cls_Field& field, void* place, mdf_Value& json, const fnd_Path& path) {
    const auto read = [&](auto reader) {
        return [this, reader](const cow_String& name, mdf_Value& object, const fnd_Path& where) {
            (this->*reader)(name, object, where);
        };
    };
    switch (static_cast<const cls_TreeType&>(*field.type).Part()) {
    case cls_TreeEnm::Datums: datums_.ReadDatums(json, path); break;
    case cls_TreeEnm::Parts: ForEachNamed(json, path, "part", read(&mdf_TreeReader::ReadPart)); break;
    case cls_TreeEnm::Assembly: ReadFrame(model_.AssemblyObject(), json, path); break;
    case cls_TreeEnm::Instances:
        ForEachNamed(json, path, "instance", read(&mdf_TreeReader::ReadInstance));
        break;
    case cls_TreeEnm::Mesh:
        *static_cast<cow_CountedHld<odiK_Mesh>*>(place) = meshes_.ReadMesh(json, path);
        break;
    case cls_TreeEnm::AssemblyMesh:
        model_.SealInstances();
        meshes_.ReadAssemblyMesh(json, path);
        break;
    case cls_TreeEnm::AssemblySets:
        model_.SealInstances();
        meshes_.ReadAssemblySets(json, path);
        break;
    case cls_TreeEnm::Attributes:
        ReadAttributeInputs(*static_cast<std::vector<odiK_AttributeInput>*>(place), field.refersToClass->Id(),
                            json, path);
        break;
    case cls_TreeEnm::OwnAttributes:
        ReadAttributeInputs(static_cast<odiK_Instance::OwnInputs*>(place)->emplace(),
                            field.refersToClass->Id(), json, path);
        break;
    case cls_TreeEnm::AssemblyAttributes:
        ReadAttributes(*static_cast<ptoC_PartAttributeList*>(place), field.refersToClass->Id(), json, path);
        break;
    }
}

template <class Reader>
void mdf_TreeReader::ForEachNamed(mdf_Value& json, const fnd_Path& path, const char* thing,
                                  const Reader& read) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, std::string("an object of ") + thing + "s");
        return;
    }
    mdf_CapitalsCheck capitals;
    for (mdf_Member& member : json.Members()) {
        const fnd_Path place(path, member.name);
        if (!fnd_CheckName(member.name, place, diagnostics_)) continue;
        capitals.Enter(member.name, place, thing, diagnostics_);
        read(cow_String(member.name), member.value, place);
    }
}

void mdf_TreeReader::ReadPart(const cow_String& name, mdf_Value& json, const fnd_Path& path) {
    // A part that is wrong inside is there all the same, so that its instances are not reported too.
    ReadFrame(model_.AddPart(name), json, path);
}

void mdf_TreeReader::ReadInstance(const cow_String& name, mdf_Value& json, const fnd_Path& path) {
    odiK_Instance instance;
    instance.name = name;
    ReadFrame(instance, json, path);
    if (!json.IsObject()) {
        records_.References().NoteWrong(name.View());
        return;
    }
    CheckPart(instance, json, path);
    model_.AddEntry(std::move(instance));
}

void mdf_TreeReader::CheckPart(odiK_Instance& instance, const mdf_Value& json, const fnd_Path& path) {
    const fnd_Path place(path, "part");
    if (instance.partName.IsEmpty()) {
        // One that is given was refused as a name.
        if (instance.isPartInstance && json.Find("part") == nullptr)
            diagnostics_.Add("missing-field", place, "found nothing", "the name of a part");
        return;
    }
    if (model_.Parts().count(instance.partName) != 0) return;
    const std::string given(instance.partName.View());
    diagnostics_.Add("no-such-name", place, "found " + mdf_Shown(mdf_Value(given)), "the name of a part",
                     fnd_DidYouMean(diagnostics_, given, [this](fnd_Nearest& nearest) {
                         for (const auto& [name, part] : model_.Parts()) nearest.Try(name.View());
                     }));
    instance.partName = cow_String();
}

void mdf_TreeReader::ReadAttributeInputs(std::vector<odiK_AttributeInput>& inputs, unsigned type,
                                         const mdf_Value& json, const fnd_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array");
        return;
    }
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value item = json.Item(i);
        const fnd_Path place(path, i);
        const std::unique_ptr<cls_Record> record = records_.ReadVariant(type, item, place, {"region"});
        const mdf_Value* region = item.IsObject() ? item.Find("region") : nullptr;
        if (record == nullptr || region == nullptr || !region->IsString()) {
            if (record != nullptr) {
                diagnostics_.Add("missing-field", fnd_Path(place, "region"),
                                 "found " + (region == nullptr ? std::string("nothing") : mdf_Shown(*region)),
                                 "the name of an element set of the mesh");
            }
            // Keeps the places of the others.
            inputs.emplace_back();
            continue;
        }
        inputs.push_back({cow_String(region->String()),
                          mdl_ObjCow<ptoC_PartAttribute>(static_cast<const ptoC_PartAttribute&>(*record))});
    }
}

void mdf_TreeReader::CheckAttributeInputs(const std::vector<odiK_AttributeInput>& inputs,
                                          const odiK_Mesh* mesh, const std::string& pointer) {
    for (std::size_t i = 0; i < inputs.size(); ++i) {
        if (inputs[i].record.IsNull()) continue;
        const std::string place = pointer + "/" + std::to_string(i) + "/region";
        const std::string name(inputs[i].setName.View());
        const int id = mesh == nullptr ? -1 : mesh->FindSet(inputs[i].setName);
        if (id < 0 && records_.References().IsWrong(name)) continue;
        if (id < 0) {
            diagnostics_.Add("no-such-set", place, "found " + fnd_Quoted(name),
                             "the name of a set of the mesh",
                             fnd_DidYouMean(diagnostics_, name, [mesh](fnd_Nearest& nearest) {
                                 if (mesh == nullptr) return;
                                 for (const auto& set : mesh->Sets()) nearest.Try(set->name.View());
                             }));
        } else if (mesh->Sets()[static_cast<std::size_t>(id)]->type != res_SetTypeEnm::ELEMENTS) {
            diagnostics_.Add("wrong-set-kind", place,
                             "found " + fnd_Quoted(name) + ", which is no element set", "an element set");
        }
    }
}

void mdf_TreeReader::CheckInstanceAttributes(odiK_Instance& instance, const std::string& pointer) {
    const auto mesh = instance.Mesh();
    // What it takes from its part was checked there, unless it has a mesh of its own.
    const bool other = !instance.ownMesh.IsNull() && !instance.part.IsNull();
    for (const cls_Field& field : odiK_Instance::Fields().All()) {
        if (field.type != &cls_TreeType::Instance<cls_TreeEnm::OwnAttributes>()) continue;
        const auto& own = *static_cast<const odiK_Instance::OwnInputs*>(field.In(instance));
        const std::string place = pointer + "/" + field.name;
        if (own) {
            CheckAttributeInputs(*own, mesh.Referent(), place);
        } else if (other) {
            const void* inherited = odiK_Part::Fields().Find(field.name)->In(*instance.part);
            CheckAttributeInputs(*static_cast<const std::vector<odiK_AttributeInput>*>(inherited),
                                 mesh.Referent(), place);
        }
    }
}

void mdf_TreeReader::CheckAttributes() {
    std::string model("/models");
    fnd_AppendPointer(model, model_.Name().View());
    for (const auto& [name, part] : model_.Parts()) {
        std::string pointer = model + "/parts";
        fnd_AppendPointer(pointer, name.View());
        for (const cls_Field& field : odiK_Part::Fields().All()) {
            if (field.type != &cls_TreeType::Instance<cls_TreeEnm::Attributes>()) continue;
            CheckAttributeInputs(*static_cast<const std::vector<odiK_AttributeInput>*>(field.In(*part)),
                                 part->mesh.Referent(), pointer + "/" + field.name);
        }
    }
    for (const auto& [name, instance] : model_.Instances()) {
        std::string pointer = model + "/assembly/instances";
        fnd_AppendPointer(pointer, name.View());
        CheckInstanceAttributes(*instance, pointer);
    }
}

void mdf_TreeReader::ReadAttributes(ptoC_PartAttributeList& list, unsigned type, const mdf_Value& json,
                                    const fnd_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array");
        return;
    }
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const fnd_Path place(path, i);
        const std::unique_ptr<cls_Record> record = records_.ReadVariant(type, json.Item(i), place);
        if (record == nullptr) continue;
        const auto& attribute = static_cast<const ptoC_PartAttribute&>(*record);
        if (attribute.region.HasValue() && attribute.region.FlagWord() != 2) {
            diagnostics_.Add("wrong-set-kind", fnd_Path(place, "region"),
                             "found " + fnd_Quoted(attribute.region.SetName().View()) +
                                 ", which is no element set",
                             "an element set");
        }
        // Orientations of connectors get names.
        if (const auto* orientation = nex_canDynamicCastPtr<ptoC_ConnectorOrientation>(record.get())) {
            model_.AssemblyObject().AppendConnectorOrientation(*orientation);
        } else {
            list.Append(attribute);
        }
    }
}
