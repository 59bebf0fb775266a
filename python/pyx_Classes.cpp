#include "python/pyx_Classes.h"

#include "model_file/mdf_Members.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_RecordReader.h"
#include "python/pyx_Document.h"
#include "python/pyx_Hooks.h"
#include "python/pyx_Values.h"
#include "store_interface/model/odb_Odb.h"
#include "store_interface/model/odiK_Repositories.h"

#include <cmath>
#include <limits>
#include <map>

namespace {

template <class T>
cls_ClassEntry FrameEntry() {
    return {T::Class, 0, false, [] { return static_cast<cls_Record*>(new T()); },
            []() -> const cls_FieldTable& { return T::Fields(); }};
}

/// A model's own data, and what stands in its tree.
std::vector<cls_ClassEntry> FrameEntries() {
    return {FrameEntry<odiK_ModelData>(), FrameEntry<odiK_Datum>(), FrameEntry<odiK_Part>(),
            FrameEntry<odiK_Instance>(), FrameEntry<odiK_Assembly>()};
}

const char* KindName(cls_FieldKind kind) {
    switch (kind) {
    case cls_FieldKind::Bool: return "Bool";
    case cls_FieldKind::Int: return "Int";
    case cls_FieldKind::Double: return "Double";
    case cls_FieldKind::Float: return "Float";
    case cls_FieldKind::String: return "String";
    case cls_FieldKind::Enum: return "Enum";
    case cls_FieldKind::Triple: return "Triple";
    case cls_FieldKind::Segment: return "Segment";
    case cls_FieldKind::Complex: return "Complex";
    case cls_FieldKind::Table: return "Table";
    case cls_FieldKind::List: return "List";
    case cls_FieldKind::Map: return "Map";
    case cls_FieldKind::Record: return "Record";
    case cls_FieldKind::Optional: return "Optional";
    case cls_FieldKind::Variant: return "Variant";
    case cls_FieldKind::Region: return "Region";
    case cls_FieldKind::Datum: return "Datum";
    case cls_FieldKind::Attribute: return "Attribute";
    case cls_FieldKind::Tree: return "Tree";
    }
    return "";
}

py::dict TypeOf(const cls_FieldType& type) {
    py::dict told;
    told["kind"] = KindName(type.Kind());
    switch (type.Kind()) {
    case cls_FieldKind::Enum: told["enum"] = static_cast<const cls_EnumType&>(type).Table().typeName; break;
    case cls_FieldKind::List: told["item"] = TypeOf(static_cast<const cls_ListType&>(type).ItemType()); break;
    case cls_FieldKind::Map: told["item"] = TypeOf(static_cast<const cls_MapType&>(type).ItemType()); break;
    case cls_FieldKind::Attribute:
        told["value"] = TypeOf(static_cast<const cls_AttributeType&>(type).ValueType());
        break;
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant:
        told["class"] =
            std::string(cls_Classes().NameOf(static_cast<const cls_HolderType&>(type).ClassId()).View());
        break;
    default: break;
    }
    return told;
}

using EnumTables = std::map<std::string, const omu_EnumTable*>;

void CollectEnums(const cls_FieldType& type, EnumTables& tables) {
    switch (type.Kind()) {
    case cls_FieldKind::Enum: {
        const omu_EnumTable& table = static_cast<const cls_EnumType&>(type).Table();
        tables.emplace(table.typeName, &table);
        break;
    }
    case cls_FieldKind::List: CollectEnums(static_cast<const cls_ListType&>(type).ItemType(), tables); break;
    case cls_FieldKind::Map: CollectEnums(static_cast<const cls_MapType&>(type).ItemType(), tables); break;
    case cls_FieldKind::Attribute:
        CollectEnums(static_cast<const cls_AttributeType&>(type).ValueType(), tables);
        break;
    default: break;
    }
}

const EnumTables& AllEnums() {
    static const EnumTables tables = [] {
        EnumTables all;
        for (const pyx_Class& each : pyx_Class::All()) {
            for (const cls_Field& field : each.Fields()) CollectEnums(*field.type, all);
        }
        for (const omu_EnumTable* table :
             {&omu_EnumTableOf(mdl_PropagationStatusEnm()), &omu_EnumTableOf(mdl_PropAttributeStateEnm()),
              &omu_EnumTableOf(res_SetTypeEnm())})
            all.emplace(table->typeName, table);
        return all;
    }();
    return tables;
}

/// [(name, number, text, word of the deck or None)].
py::list RowsOfEnum(const std::string& name) {
    const auto table = AllEnums().find(name);
    if (table == AllEnums().end()) throw py::key_error(name);
    py::list rows;
    for (const omu_EnumRow& row : table->second->rows)
        rows.append(py::make_tuple(row.name, row.value, row.text,
                                   row.deck == nullptr ? py::object(py::none()) : py::str(row.deck)));
    return rows;
}

py::list Meanings(const cls_Field& field) {
    py::list all;
    for (const cls_IntMeaning& meaning : field.meanings)
        all.append(py::make_tuple(meaning.value, meaning.word, mdf_MeaningWord(meaning)));
    return all;
}

/// Whether the value is one of the field's type as it stands.
bool IsPlain(const cls_Field& field, PyObject* value) {
    switch (field.type->Kind()) {
    case cls_FieldKind::Bool: return PyBool_Check(value) != 0;
    case cls_FieldKind::Double:
        return PyFloat_CheckExact(value) != 0 && std::isfinite(PyFloat_AS_DOUBLE(value));
    default: return false;
    }
}

bool IsLongForm(py::handle value) {
    return PyDict_Check(value.ptr()) && PyDict_GetItemString(value.ptr(), "state") != nullptr;
}

/// Truth for what is "ON" or "OFF".
py::object AsWord(const cls_Field& field, py::handle value) {
    if (field.type->Kind() == cls_FieldKind::Enum && PyBool_Check(value.ptr())) {
        const omu_EnumTable& table = static_cast<const cls_EnumType&>(*field.type).Table();
        const char* word = value.ptr() == Py_True ? "ON" : "OFF";
        if (table.RowOfWord(word) != nullptr) return py::str(word);
    }
    return py::reinterpret_borrow<py::object>(value);
}

} // namespace

pyx_Class::pyx_Class(const cls_ClassEntry& entry) : entry_(entry) {
    if (entry.create == nullptr) return;
    byDefault_.reset(entry.create());
    scratch_.reset(entry.create());
}

std::string pyx_Class::BaseName() const {
    const cls_ClassEntry* base = cls_Classes().Find(entry_.baseId);
    return base == nullptr ? std::string() : base->info.name;
}

std::string pyx_Class::StateClassName() const {
    const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(byDefault_.get());
    if (object == nullptr) return {};
    const std::unique_ptr<cls_Record> state(object->NewState(0));
    return std::string(cls_Classes().NameOf(state->DynTypeId()).View());
}

py::object pyx_Class::Checked(const cls_Field& field, py::handle value) const {
    if (IsPlain(field, value.ptr())) return py::reinterpret_borrow<py::object>(value);
    const bool isAttribute = field.type->Kind() == cls_FieldKind::Attribute;
    if (isAttribute && value.is_none()) return py::none();
    py::object read = Read(field, AsWord(field, value));
    return isAttribute && IsLongForm(value) ? py::reinterpret_borrow<py::object>(value) : read;
}

py::object pyx_Class::Read(const cls_Field& field, py::handle value) const {
    // The empty model has nothing that a name could mean; names are looked up when a model is put together.
    static odiK_Model* const empty = new odiK_Model(odb_Odb::DefaultModelName());
    const fnd_Path top;
    const fnd_Path place(top, std::string_view(field.name));
    mdf_Report report;
    mdf_Value json;
    try {
        const pyx_Document document(value);
        std::vector<fnd_Finding> errors;
        mdf_Parse(document.Text(), json, errors);
        pyx_RaiseErrors(errors);
    } catch (pyx_Wrong& wrong) {
        for (fnd_Finding& finding : wrong.findings) finding.place = place.Text() + finding.place;
        throw;
    }
    mdf_Diagnostics diagnostics(report);
    // Not before: what tells the value may be any code of Python's, and put values into fields too.
    field.type->Assign(field.In(*scratch_), field.In(*byDefault_));
    mdf_RecordReader(*empty, diagnostics).ReadField(*scratch_, field, &json, place);
    pyx_RaiseErrors(report.findings);
    const void* read = field.In(*scratch_);
    if (cls_IsUnset(*field.type, read) && cls_IsUnset(*field.type, field.In(*byDefault_))) return py::none();
    if (field.type->Kind() != cls_FieldKind::Attribute) return pyx_Values().Of(*field.type, read);
    const auto& type = static_cast<const cls_AttributeType&>(*field.type);
    return pyx_Values().Of(type.ValueType(), type.Value(read));
}

const std::vector<pyx_Class>& pyx_Class::All() {
    // Never freed: records may be asked for until the process ends.
    static const auto* const all = [] {
        auto* classes = new std::vector<pyx_Class>();
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.fields != nullptr) classes->emplace_back(entry);
        }
        for (const cls_ClassEntry& entry : FrameEntries()) classes->emplace_back(entry);
        return classes;
    }();
    return *all;
}

const pyx_Class& pyx_Class::Get(const std::string& name) {
    static const auto* const byName = [] {
        auto* names = new std::unordered_map<std::string_view, const pyx_Class*>();
        for (const pyx_Class& each : All()) names->emplace(each.Name(), &each);
        return names;
    }();
    const auto found = byName->find(name);
    if (found == byName->end()) throw py::key_error(name);
    return *found->second;
}

py::object pyx_Field::Default() const {
    if (owner->ByDefault() == nullptr) return py::none();
    const void* value = field->In(*owner->ByDefault());
    if (field->type->Kind() == cls_FieldKind::Attribute || value == nullptr) return py::none();
    return cls_IsUnset(*field->type, value) ? py::none() : pyx_Values().Of(*field->type, value);
}

py::dict pyx_Field::Type() const {
    return TypeOf(*field->type);
}

void pyx_AddClasses(py::module_& module) {
    const auto text = [](const char* words) {
        return words == nullptr ? py::object(py::none()) : py::str(words);
    };
    py::class_<pyx_Field>(module, "Field")
        .def_property_readonly("name", [](const pyx_Field& f) { return f.field->name; })
        .def_property_readonly("doc", [](const pyx_Field& f) { return f.field->Documentation(); })
        .def_property_readonly("type", &pyx_Field::Type)
        .def_property_readonly("required", [](const pyx_Field& f) { return f.field->required; })
        .def_property_readonly("model_data", [](const pyx_Field& f) { return !f.field->notModelData; })
        .def_property_readonly("refers_to", [text](const pyx_Field& f) { return text(f.field->refersTo); })
        .def_property_readonly("not_in_deck", [text](const pyx_Field& f) { return text(f.field->notInDeck); })
        .def_property_readonly("default_items",
                               [](const pyx_Field& f) { return f.field->defaultItems != nullptr; })
        .def_property_readonly("length", [](const pyx_Field& f) { return f.field->length; })
        .def_property_readonly("verbatim", [](const pyx_Field& f) { return f.field->verbatim; })
        .def_property_readonly("words",
                               [](const pyx_Field& f) {
                                   py::list words;
                                   for (const char* word : f.field->words) words.append(word);
                                   return words;
                               })
        .def_property_readonly("meanings", [](const pyx_Field& f) { return Meanings(*f.field); })
        .def("default", &pyx_Field::Default)
        .def("checked", &pyx_Field::Checked);
    py::class_<pyx_Class, std::unique_ptr<pyx_Class, py::nodelete>>(module, "Class")
        .def_property_readonly("name", &pyx_Class::Name)
        .def_property_readonly("doc", &pyx_Class::Doc)
        .def_property_readonly("abstract", &pyx_Class::IsAbstract)
        .def_property_readonly("base", &pyx_Class::BaseName)
        .def_property_readonly("state_class", &pyx_Class::StateClassName)
        .def_property_readonly("fields", [](const pyx_Class& each) {
            py::list fields;
            for (const cls_Field& field : each.Fields()) fields.append(pyx_Field{&each, &field});
            return fields;
        });
    module.def("class_names", [] {
        py::list names;
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.fields != nullptr) names.append(entry.info.name);
        }
        for (const cls_ClassEntry& entry : FrameEntries()) names.append(entry.info.name);
        return names;
    });
    module.def("class_of", &pyx_Class::Get, py::return_value_policy::reference);
    module.def("enum_names", [] {
        py::list names;
        for (const auto& [name, table] : AllEnums()) names.append(name);
        return names;
    });
    module.def("enum_rows", &RowsOfEnum);
    module.def("repositories", [] {
        py::list rows;
        for (const odiK_Repository& row : odiK_Repositories()) {
            rows.append(py::make_tuple(row.member, std::string(cls_Classes().NameOf(row.ItemTypeId()).View()),
                                       row.plural, row.IsPropagating()));
        }
        return rows;
    });
}
