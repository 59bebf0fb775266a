#include "model_file/mdf_RecordReader.h"

#include "model_file/checks/mdf_RecordChecks.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

// Stands for a null in a list until all fields are read; no number of a model file is one.
constexpr double kNullItem = std::numeric_limits<double>::quiet_NaN();

std::string Text(const cow_String& text) {
    return std::string(text.View());
}

std::vector<std::string> FieldNames(const cls_FieldTable& table) {
    std::vector<std::string> names;
    for (const cls_Field& field : table.All()) {
        if (!field.notModelData) names.emplace_back(field.name);
    }
    return names;
}

} // namespace

std::string mdf_MeaningWord(const cls_IntMeaning& meaning) {
    std::string word(meaning.word);
    word.erase(std::min(word.find_first_of("(,:"), word.size()));
    while (!word.empty() && word.back() == ' ') word.pop_back();
    return word;
}

std::vector<std::string> mdf_Names(const cow_List<cow_String>& names) {
    std::vector<std::string> copies;
    copies.reserve(static_cast<std::size_t>(names.Length()));
    for (int i = 0; i < names.Length(); ++i) copies.push_back(Text(names[i]));
    return copies;
}

void mdf_RecordReader::CheckMembers(const mdf_Value& object, const std::vector<std::string>& known,
                                    const mdf_Path& path) {
    for (const mdf_Member& member : object.Members()) {
        if (std::find(known.begin(), known.end(), member.name) != known.end()) continue;
        diagnostics_.Error(mdf_Path(path, member.name),
                           "found an unknown member " + mdf_Quoted(member.name) +
                               (known.empty() ? ", expected none" : ", expected " + mdf_OneOf(known)) +
                               mdf_DidYouMean(member.name, known));
    }
}

void mdf_RecordReader::ReadRecord(cls_Record& record, const mdf_Value& object, const mdf_Path& path,
                                  const std::vector<std::string>& others) {
    if (!object.IsObject()) {
        diagnostics_.Expected(path, object, "an object");
        return;
    }
    const int errorsBefore = diagnostics_.NumErrors();
    const cls_FieldTable& table = record.DynFields();
    std::vector<const cls_Field*> refusedTables;
    std::vector<std::string> known = FieldNames(table);
    for (const std::string& other : others) {
        if (std::find(known.begin(), known.end(), other) == known.end()) known.push_back(other);
    }
    CheckMembers(object, known, path);
    for (const cls_Field& field : table.All()) {
        if (field.notModelData || std::find(others.begin(), others.end(), field.name) != others.end())
            continue;
        const mdf_Value* json = object.Find(field.name);
        const mdf_Path place(path, field.name);
        if (json != nullptr) {
            const bool mayBeUnset = cls_IsUnset(*field.type, field.In(record));
            if (!ReadValue(*field.type, field.In(record), *json, place, field, mayBeUnset)) {
                if (field.type->Kind() == cls_FieldKind::Table) refusedTables.push_back(&field);
                continue;
            }
        } else if (field.defaultItems != nullptr) {
            // The defaults may be others than those of a new record.
            static_cast<const cls_ListType&>(*field.type).Clear(field.In(record));
        }
        if (!field.required) continue;
        const bool isText = field.type->Kind() == cls_FieldKind::String;
        const bool missing =
            json == nullptr || json->IsNull() || (isText && json->IsString() && json->String().empty());
        if (missing) diagnostics_.Error(place, std::string("found nothing, expected ") + field.doc);
    }
    for (const cls_Field* field : refusedTables) {
        const std::string hint = mdf_RecordChecks::All().TableHint(record, field->name);
        if (!hint.empty()) diagnostics_.Error(mdf_Path(path, field->name), hint);
    }
    for (const cls_Field& field : table.All()) CompleteList(field, record, path);
    if (diagnostics_.NumErrors() != errorsBefore) return;
    mdf_RecordCheck check(diagnostics_, path);
    mdf_RecordChecks::All().Run(record, check);
}

std::unique_ptr<cls_Record> mdf_RecordReader::NewVariant(unsigned base, const mdf_Value& object,
                                                         const mdf_Path& path) {
    if (!object.IsObject()) {
        diagnostics_.Expected(path, object, "an object");
        return nullptr;
    }
    const auto classes = cls_Classes().ConcreteClasses(base);
    std::vector<std::string> names;
    names.reserve(classes.size());
    for (const cls_ClassEntry* entry : classes) names.emplace_back(entry->info.name);
    const mdf_Value* name = object.Find("class");
    const mdf_Path place(path, "class");
    if (name == nullptr) {
        if (classes.size() == 1) return std::unique_ptr<cls_Record>(classes.front()->create());
        diagnostics_.Error(place, "found nothing, expected " +
                                      (names.empty() ? std::string("no object here") : mdf_OneOf(names)));
        return nullptr;
    }
    if (!name->IsString()) {
        diagnostics_.Expected(place, *name, "the name of a class");
        return nullptr;
    }
    for (const cls_ClassEntry* entry : classes) {
        if (name->String() == entry->info.name) return std::unique_ptr<cls_Record>(entry->create());
    }
    diagnostics_.Expected(place, *name,
                          (names.empty() ? "no object here" : mdf_OneOf(names)) +
                              mdf_DidYouMean(name->String(), names));
    return nullptr;
}

std::unique_ptr<cls_Record> mdf_RecordReader::ReadVariant(unsigned base, const mdf_Value& object,
                                                          const mdf_Path& path,
                                                          const std::vector<std::string>& others) {
    std::unique_ptr<cls_Record> record = NewVariant(base, object, path);
    if (record == nullptr) return nullptr;
    std::vector<std::string> passed(others);
    passed.emplace_back("class");
    ReadRecord(*record, object, path, passed);
    return record;
}

bool mdf_RecordReader::ReadText(cow_String& text, const mdf_Value& value, const mdf_Path& path) {
    if (value.IsString()) {
        text = cow_String(value.String());
        return true;
    }
    if (!value.IsArray()) {
        diagnostics_.Expected(path, value, "a string or an array of strings");
        return false;
    }
    std::string joined;
    for (std::size_t i = 0; i < value.Size(); ++i) {
        const mdf_Value line = value.Item(i);
        if (!line.IsString()) {
            diagnostics_.Expected(mdf_Path(path, i), line, "a string");
            return false;
        }
        joined.append(line.String()).append("\n");
    }
    text = cow_String(joined);
    return true;
}

bool mdf_RecordReader::ReadValue(const cls_FieldType& type, void* value, const mdf_Value& json,
                                 const mdf_Path& path, const cls_Field& field, bool mayBeUnset) {
    switch (type.Kind()) {
    case cls_FieldKind::Bool:
        if (!json.IsBool()) {
            diagnostics_.Expected(path, json, "true or false");
            return false;
        }
        *static_cast<bool*>(value) = json.Bool();
        return true;
    case cls_FieldKind::Int: return ReadInt(*static_cast<int*>(value), json, path, field, mayBeUnset);
    case cls_FieldKind::Double:
        if (json.IsNull() && mayBeUnset) {
            *static_cast<double*>(value) = cls_UnsetDouble;
            return true;
        }
        if (!json.IsNumber()) {
            diagnostics_.Expected(path, json, mayBeUnset ? "a number or null" : "a number");
            return false;
        }
        *static_cast<double*>(value) = json.Real();
        return true;
    case cls_FieldKind::Float:
        if (!json.IsNumber() || std::isinf(static_cast<float>(json.Real()))) {
            diagnostics_.Expected(path, json, "a number of single precision");
            return false;
        }
        *static_cast<float*>(value) = static_cast<float>(json.Real());
        return true;
    case cls_FieldKind::String:
        if (field.verbatim) return ReadText(*static_cast<cow_String*>(value), json, path);
        if (!json.IsString()) {
            diagnostics_.Expected(path, json, "a string");
            return false;
        }
        *static_cast<cow_String*>(value) = cow_String(json.String());
        Refer(field, json.String(), path);
        return true;
    case cls_FieldKind::Enum: return ReadEnum(static_cast<const cls_EnumType&>(type), value, json, path);
    case cls_FieldKind::Triple: {
        double xyz[3];
        if (!ReadTriple(xyz, json, path)) return false;
        static_cast<const cls_TripleType&>(type).Set(value, xyz);
        return true;
    }
    case cls_FieldKind::Segment: {
        double start[3];
        double end[3];
        if (!json.IsArray() || json.Size() != 2) {
            diagnostics_.Expected(path, json, "two points");
            return false;
        }
        if (!ReadTriple(start, json.Item(0), mdf_Path(path, std::size_t{0})) ||
            !ReadTriple(end, json.Item(1), mdf_Path(path, std::size_t{1}))) {
            return false;
        }
        *static_cast<gsl_ModelSegment*>(value) =
            gsl_ModelSegment({start[0], start[1], start[2]}, {end[0], end[1], end[2]});
        return true;
    }
    case cls_FieldKind::Complex: return ReadComplex(*static_cast<omi_complex*>(value), json, path);
    case cls_FieldKind::Table: return ReadTable(static_cast<const cls_TableType&>(type), value, json, path);
    case cls_FieldKind::List:
        return ReadList(static_cast<const cls_ListType&>(type), value, json, path, field);
    case cls_FieldKind::Map: return ReadMap(static_cast<const cls_MapType&>(type), value, json, path, field);
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant:
        return ReadHolder(static_cast<const cls_HolderType&>(type), value, json, path);
    case cls_FieldKind::Region: *static_cast<rgnC_Region*>(value) = ReadRegion(json, path); return true;
    case cls_FieldKind::Datum: return ReadDatum(*static_cast<dtmC_DatumRef*>(value), json, path);
    case cls_FieldKind::Attribute:
        return ReadAttribute(static_cast<const cls_AttributeType&>(type), value, json, path, field) !=
               mdl_GivenEnm::ABSENT;
    }
    return false;
}

bool mdf_RecordReader::ReadInt(int& value, const mdf_Value& json, const mdf_Path& path,
                               const cls_Field& field, bool mayBeUnset) {
    if (json.IsNull() && mayBeUnset) {
        value = cls_UnsetInt;
        return true;
    }
    if (json.IsInt()) {
        value = json.Int();
        const bool listed =
            std::any_of(field.meanings.begin(), field.meanings.end(),
                        [&](const cls_IntMeaning& meaning) { return meaning.value == value; });
        if (!field.meanings.empty() && !listed) {
            diagnostics_.Warning(path, "found " + std::to_string(value) + ", which has no meaning here");
        }
        return true;
    }
    std::vector<std::string> words;
    for (const cls_IntMeaning& meaning : field.meanings) {
        words.push_back(mdf_MeaningWord(meaning));
        if (json.IsString() && omu_EqualInAnyCapitals(json.String(), words.back())) {
            value = meaning.value;
            return true;
        }
    }
    std::string expected = mayBeUnset ? "an integer of 32 bits or null" : "an integer of 32 bits";
    if (!words.empty()) {
        expected += ", or " + mdf_OneOf(words);
        if (json.IsString()) expected += mdf_DidYouMean(json.String(), words);
    }
    diagnostics_.Expected(path, json, expected);
    return false;
}

bool mdf_RecordReader::ReadEnum(const cls_EnumType& type, void* value, const mdf_Value& json,
                                const mdf_Path& path) {
    const omu_EnumTable& table = type.Table();
    const omu_EnumRow* row = nullptr;
    if (json.IsInt()) row = table.Row(json.Int());
    if (json.IsString()) row = table.RowOfWord(json.String());
    if (row != nullptr) {
        type.Set(value, row->value);
        return true;
    }
    std::vector<std::string> words;
    std::vector<std::string> shown;
    for (const omu_EnumRow& listed : table.rows) {
        words.emplace_back(listed.name);
        shown.push_back(std::string(listed.name) + " (" + std::to_string(listed.value) + ")");
    }
    diagnostics_.Expected(path, json,
                          mdf_OneOf(shown) +
                              (json.IsString() ? mdf_DidYouMean(json.String(), words) : std::string()));
    return false;
}

bool mdf_RecordReader::ReadTriple(double (&xyz)[3], const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsArray() || json.Size() != 3) {
        diagnostics_.Expected(path, json, "three numbers");
        return false;
    }
    for (std::size_t i = 0; i < 3; ++i) {
        const mdf_Value item = json.Item(i);
        if (!item.IsNumber()) {
            diagnostics_.Expected(mdf_Path(path, i), item, "a number");
            return false;
        }
        xyz[i] = item.Real();
    }
    return true;
}

bool mdf_RecordReader::ReadComplex(omi_complex& value, const mdf_Value& json, const mdf_Path& path) {
    const auto readPart = [&](double& part, const mdf_Value& number, const mdf_Path& place) {
        if (number.IsNumber()) {
            part = number.Real();
        } else {
            diagnostics_.Expected(place, number, "a number");
        }
        return number.IsNumber();
    };
    value = {};
    if (json.IsArray() && json.Size() == 2) {
        const bool isRead = readPart(value.real, json.Item(0), mdf_Path(path, std::size_t{0}));
        return readPart(value.imag, json.Item(1), mdf_Path(path, std::size_t{1})) && isRead;
    }
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "two numbers, or an object of \"form\", \"real\" and \"imag\"");
        return false;
    }
    CheckMembers(json, {"form", "real", "imag"}, path);
    bool isRead = true;
    if (const mdf_Value* form = json.Find("form")) {
        const auto& type = static_cast<const cls_EnumType&>(cls_TypeOf<omi_complex::FormEnm>::Instance());
        isRead = ReadEnum(type, &value.form, *form, mdf_Path(path, "form"));
    }
    for (const auto& [name, part] : {std::pair("real", &value.real), std::pair("imag", &value.imag)}) {
        const mdf_Value* number = json.Find(name);
        if (number != nullptr)
            isRead = readPart(*part, *number, mdf_Path(path, std::string_view(name))) && isRead;
    }
    return isRead;
}

bool mdf_RecordReader::ReadTable(const cls_TableType& type, void* value, const mdf_Value& json,
                                 const mdf_Path& path) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array of rows of numbers");
        return false;
    }
    if (json.Empty()) {
        type.Set(value, {});
        return true;
    }
    const std::size_t columns = json.Item(0).IsArray() ? json.Item(0).Size() : 0;
    // All rows before any memory: a long first row with many others would ask for the product.
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Value row = json.Item(i);
        if (row.IsArray() && row.Size() == columns) continue;
        diagnostics_.Expected(mdf_Path(path, i), row,
                              i == 0 ? "a row of numbers"
                                     : "a row of " + std::to_string(columns) + " numbers, as the first one");
        return false;
    }
    cow_2DArray<double> cells(static_cast<int>(json.Size()), static_cast<int>(columns));
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const mdf_Path rowPath(path, i);
        const mdf_Value row = json.Item(i);
        for (std::size_t j = 0; j < columns; ++j) {
            const mdf_Value cell = row.Item(j);
            if (!cell.IsNumber()) {
                diagnostics_.Expected(mdf_Path(rowPath, j), cell, "a number");
                return false;
            }
            cells.Put(static_cast<int>(i), static_cast<int>(j), cell.Real());
        }
    }
    type.Set(value, columns == 0 ? cow_2DArray<double>() : cells);
    return true;
}

bool mdf_RecordReader::ReadList(const cls_ListType& type, void* value, const mdf_Value& json,
                                const mdf_Path& path, const cls_Field& field) {
    if (!json.IsArray()) {
        diagnostics_.Expected(path, json, "an array");
        return false;
    }
    if (field.length != 0 && json.Size() != static_cast<std::size_t>(field.length)) {
        diagnostics_.Expected(path, json, "an array of " + std::to_string(field.length) + " items");
        return false;
    }
    type.Clear(value);
    for (std::size_t i = 0; i < json.Size(); ++i) {
        void* item = type.Append(value);
        if (field.defaultItems != nullptr && json.Item(i).IsNull()) {
            *static_cast<double*>(item) = kNullItem;
            continue;
        }
        ReadValue(type.ItemType(), item, json.Item(i), mdf_Path(path, i), field, false);
    }
    return true;
}

// Runs when all fields are read, since the default items may depend on some of them.
void mdf_RecordReader::CompleteList(const cls_Field& field, cls_Record& record, const mdf_Path& path) {
    if (field.defaultItems == nullptr) return;
    const cow_List<double> defaults = field.defaultItems(record);
    auto& items = *static_cast<cow_List<double>*>(field.In(record));
    for (int i = 0; i < defaults.Length(); ++i) {
        if (i >= items.Length()) {
            items.Append(defaults[i]);
        } else if (std::isnan(items.ConstGet(i))) {
            items.Get(i) = defaults[i];
        }
    }
    for (int i = defaults.Length(); i < items.Length(); ++i) {
        if (!std::isnan(items.ConstGet(i))) continue;
        const mdf_Path listPath(path, std::string_view(field.name));
        diagnostics_.Error(mdf_Path(listPath, static_cast<std::size_t>(i)),
                           "found null, expected a number: the list has defaults for the first " +
                               std::to_string(defaults.Length()) + " items only");
    }
}

bool mdf_RecordReader::ReadMap(const cls_MapType& type, void* value, const mdf_Value& json,
                               const mdf_Path& path, const cls_Field& field) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return false;
    }
    type.Clear(value);
    mdf_CapitalsCheck capitals;
    for (const mdf_Member& member : json.Members()) {
        const mdf_Path place(path, member.name);
        if (field.refersTo == nullptr) {
            const std::string problem = mdf_NameProblem(member.name);
            if (!problem.empty()) {
                diagnostics_.Error(place, "found " + problem);
                continue;
            }
            capitals.Enter(member.name, place, "name", diagnostics_);
        } else {
            Refer(field, member.name, place);
        }
        ReadValue(type.ItemType(), type.Insert(value, cow_String(member.name)), member.value, place, field,
                  false);
    }
    return true;
}

bool mdf_RecordReader::ReadHolder(const cls_HolderType& type, void* value, const mdf_Value& json,
                                  const mdf_Path& path) {
    if (json.IsNull() && type.Kind() != cls_FieldKind::Record) {
        type.Set(value, nullptr);
        return true;
    }
    if (type.Kind() == cls_FieldKind::Record) {
        ReadRecord(*type.Writable(value), json, path, {"class"});
        return true;
    }
    const std::unique_ptr<cls_Record> record = ReadVariant(type.ClassId(), json, path);
    if (record == nullptr) return false;
    type.Set(value, record.get());
    return true;
}

bool mdf_RecordReader::ReadDatum(dtmC_DatumRef& datum, const mdf_Value& json, const mdf_Path& path) {
    if (json.IsNull()) {
        datum = {};
        return true;
    }
    std::vector<std::string> names;
    for (const odiK_Datum& known : model_.Datums()) names.push_back(Text(known.name));
    if (json.IsString()) datum = model_.FindDatum(cow_String(json.String()));
    if (json.IsString() && (!datum.IsNullRef() || IsWrong(json.String()))) return true;
    diagnostics_.Expected(path, json,
                          "the name of a datum, or null" +
                              (json.IsString() ? mdf_DidYouMean(json.String(), names) : std::string()));
    return false;
}

void mdf_RecordReader::ReportNoInstance(const std::string& name, const mdf_Path& path) {
    if (IsWrong(name)) return;
    std::vector<std::string> names;
    for (const auto& [known, entry] : model_.Instances()) names.push_back(Text(known));
    diagnostics_.Error(path, "found instance " + mdf_Quoted(name) + ", expected the name of an instance" +
                                 mdf_DidYouMean(name, names));
}

rgnC_Region mdf_RecordReader::ReadRegion(const mdf_Value& value, const mdf_Path& path) {
    if (value.IsNull()) return {};
    std::string instance;
    std::string set;
    if (value.IsString()) {
        const std::string& text = value.String();
        const std::size_t dot = text.find('.');
        if (dot != std::string::npos && text.find('.', dot + 1) != std::string::npos) {
            diagnostics_.Expected(path, value, "{\"instance\": ..., \"set\": ...} for names with dots");
            return {};
        }
        set = dot == std::string::npos ? text : text.substr(dot + 1);
        if (dot != std::string::npos) instance = text.substr(0, dot);
        if (dot == 0) {
            diagnostics_.Expected(path, value, "{\"instance\": ..., \"set\": ...} for names with dots");
            return {};
        }
    } else if (value.IsObject()) {
        CheckMembers(value, {"instance", "set"}, path);
        for (const char* member : {"instance", "set"}) {
            const mdf_Value* name = value.Find(member);
            if (name == nullptr) continue;
            if (!name->IsString()) {
                diagnostics_.Expected(mdf_Path(path, std::string_view(member)), *name, "a name");
                return {};
            }
            (std::string_view(member) == "set" ? set : instance) = name->String();
        }
        if (value.Find("set") == nullptr) {
            diagnostics_.Error(mdf_Path(path, "set"), "found nothing, expected the name of a set");
            return {};
        }
    } else {
        diagnostics_.Expected(path, value, "\"SET\", \"INSTANCE.SET\", an object of both names, or null");
        return {};
    }
    rgnC_Region region = model_.FindRegion(cow_String(instance), cow_String(set));
    if (region.HasValue()) return region;

    const odiK_Instance* owner = model_.FindInstance(cow_String(instance));
    std::vector<std::string> names;
    if (!instance.empty() && owner == nullptr) {
        ReportNoInstance(instance, path);
        return {};
    }
    if (IsWrong(set)) return {};
    static const std::vector<cow_CountedHld<odiK_Set>> none;
    const auto mesh = owner == nullptr ? cow_CountedHld<odiK_Mesh>() : owner->Mesh();
    for (const auto& known : owner == nullptr ? model_.AssemblySets() : mesh.IsNull() ? none : mesh->Sets()) {
        names.push_back(Text(known->name));
    }
    diagnostics_.Error(path, "found set " + mdf_Quoted(set) + ", expected the name of a set of " +
                                 (owner == nullptr ? "the assembly" : "instance " + mdf_Quoted(instance)) +
                                 mdf_DidYouMean(set, names));
    return {};
}

mdl_GivenEnm mdf_RecordReader::ReadAttribute(const cls_AttributeType& type, void* attribute,
                                             const mdf_Value& json, const mdf_Path& path,
                                             const cls_Field& field) {
    if (json.IsNull()) {
        type.SetState(attribute, static_cast<int>(mdl_PropAttributeStateEnm::CLEARED));
        return mdl_GivenEnm::CLEARED;
    }
    // The long form is known by its key "state".
    if (!json.IsObject() || json.Find("state") == nullptr) {
        type.SetState(attribute, static_cast<int>(mdl_PropAttributeStateEnm::SET));
        return ReadValue(type.ValueType(), type.WritableValue(attribute), json, path, field, false)
                   ? mdl_GivenEnm::VALUE
                   : mdl_GivenEnm::ABSENT;
    }
    CheckMembers(json, {"value", "state"}, path);
    mdl_PropAttributeStateEnm state = mdl_PropAttributeStateEnm::NEVER_SET;
    const auto& stateType =
        static_cast<const cls_EnumType&>(cls_TypeOf<mdl_PropAttributeStateEnm>::Instance());
    if (!ReadEnum(stateType, &state, *json.Find("state"), mdf_Path(path, "state")))
        return mdl_GivenEnm::ABSENT;
    type.SetState(attribute, static_cast<int>(state));
    const mdf_Value* value = json.Find("value");
    if (value == nullptr) return mdl_GivenEnm::STATE_ONLY;
    return ReadValue(type.ValueType(), type.WritableValue(attribute), *value, mdf_Path(path, "value"), field,
                     false)
               ? mdl_GivenEnm::AS_IT_STANDS
               : mdl_GivenEnm::ABSENT;
}

void mdf_RecordReader::ReadStates(kprC_PropagatingObject& object, const mdf_Value& states,
                                  const mdf_Path& path) {
    if (!states.IsObject()) {
        diagnostics_.Expected(path, states, "an object of states by step");
        return;
    }
    const std::vector<std::string> steps = mdf_Names(model_.steps.Keys());
    for (const mdf_Member& member : states.Members()) {
        const mdf_Path place(path, member.name);
        if (IsWrong(member.name)) continue;
        if (!model_.steps.IsMember(cow_String(member.name))) {
            diagnostics_.Error(place, "found " + mdf_Quoted(member.name) + ", expected the name of a step" +
                                          mdf_DidYouMean(member.name, steps));
            continue;
        }
        ReadState(object, member.name, member.value, place);
    }
}

void mdf_RecordReader::ReadState(kprC_PropagatingObject& object, const std::string& stepName,
                                 const mdf_Value& json, const mdf_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    const int errorsBefore = diagnostics_.NumErrors();
    mdl_GivenState& given = object.Give(cow_String(stepName));
    cls_Record& record = given.record.Get();
    const auto& fields = record.DynFields().All();
    std::vector<std::string> known = FieldNames(record.DynFields());
    known.insert(known.end(), {"deactivated", "status"});
    CheckMembers(json, known, path);
    if (const mdf_Value* deactivated = json.Find("deactivated")) {
        if (deactivated->IsBool()) {
            given.deactivated = deactivated->Bool();
        } else {
            diagnostics_.Expected(mdf_Path(path, "deactivated"), *deactivated, "true or false");
        }
    }
    if (const mdf_Value* status = json.Find("status")) {
        mdl_PropagationStatusEnm value = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
        const auto& type = static_cast<const cls_EnumType&>(cls_TypeOf<mdl_PropagationStatusEnm>::Instance());
        if (ReadEnum(type, &value, *status, mdf_Path(path, "status"))) given.status = value;
    }
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const cls_Field& field = fields[i];
        const mdf_Value* member = field.notModelData ? nullptr : json.Find(field.name);
        if (member == nullptr) continue;
        const mdf_Path place(path, field.name);
        void* value = field.In(record);
        if (field.type->Kind() == cls_FieldKind::Attribute) {
            given.marks[i] = ReadAttribute(static_cast<const cls_AttributeType&>(*field.type), value, *member,
                                           place, field);
            continue;
        }
        const bool isList = field.type->Kind() == cls_FieldKind::List;
        if (isList && member->IsNull() &&
            static_cast<const cls_ListType&>(*field.type).ItemType().Kind() == cls_FieldKind::Attribute) {
            static_cast<const cls_ListType&>(*field.type).Clear(value);
            given.marks[i] = mdl_GivenEnm::VALUE;
            continue;
        }
        const bool mayBeUnset = cls_IsUnset(*field.type, value);
        if (ReadValue(*field.type, value, *member, place, field, mayBeUnset))
            given.marks[i] = mdl_GivenEnm::VALUE;
    }
    if (diagnostics_.NumErrors() != errorsBefore) return;
    mdf_RecordCheck check(diagnostics_, path);
    mdf_RecordChecks::All().Run(record, check);
}

void mdf_RecordReader::Refer(const cls_Field& field, const std::string& name, const mdf_Path& path) {
    if (field.refersTo != nullptr && !name.empty())
        references_.push_back({field.refersTo, name, path.Text(), field.refersToClass});
}

const mdl_Repository* mdf_RecordReader::RepositoryOfKind(const std::string& kind) const {
    const std::pair<const char*, const mdl_Repository*> repositories[] = {
        {"material", &model_.materials},
        {"section", &model_.sections},
        {"profile", &model_.beamProfiles},
        {"amplitude", &model_.amplitudes},
        {"constraint", &model_.constraints},
        {"contactControls", &model_.contactControls},
        {"interactionProperty", &model_.interactionProperties},
        {"timePoints", &model_.timePoints},
        {"boundaryCondition", &model_.boundaryConditions},
        {"load", &model_.loads},
        {"field", &model_.fields},
        {"interaction", &model_.interactions},
    };
    for (const auto& [name, repository] : repositories) {
        if (kind == name) return repository;
    }
    return nullptr;
}

std::vector<std::string> mdf_RecordReader::NamesOfKind(const std::string& kind) const {
    if (const mdl_Repository* repository = RepositoryOfKind(kind)) return mdf_Names(repository->Keys());
    if (kind == "step") return mdf_Names(model_.steps.Keys());
    if (kind == "set") {
        std::vector<std::string> names;
        for (const auto& set : model_.AssemblySets()) names.push_back(Text(set->name));
        for (const auto& [instanceName, instance] : model_.Instances()) {
            const auto mesh = instance->Mesh();
            if (mesh.IsNull()) continue;
            for (const auto& set : mesh->Sets()) names.push_back(Text(instanceName) + "." + Text(set->name));
        }
        return names;
    }
    return {};
}

void mdf_RecordReader::CheckClass(const Reference& reference) {
    if (reference.expectedClass == nullptr) return;
    const mdl_Repository* repository = RepositoryOfKind(reference.kind);
    const cls_Record* record =
        repository == nullptr ? nullptr : repository->FindRecord(cow_String(reference.name));
    if (record == nullptr ||
        cls_Classes().InheritanceCheck(record->DynTypeId(), reference.expectedClass->Id())) {
        return;
    }
    diagnostics_.Error(reference.pointer, "found " + mdf_Quoted(reference.name) + ", a " +
                                              Text(cls_Classes().NameOf(record->DynTypeId())) +
                                              ", expected the name of a " + reference.expectedClass->name);
}

void mdf_RecordReader::CheckReferences() {
    std::map<std::string, std::pair<std::vector<std::string>, std::set<std::string>>> known;
    for (const Reference& reference : references_) {
        const auto [place, isNew] = known.try_emplace(reference.kind);
        auto& [names, lookup] = place->second;
        if (isNew) {
            names = NamesOfKind(reference.kind);
            lookup.insert(names.begin(), names.end());
        }
        if (IsWrong(reference.name)) continue;
        if (lookup.count(reference.name) != 0) {
            CheckClass(reference);
            continue;
        }
        // Orientations and filters may be defined elsewhere in the deck.
        if (reference.kind == "orientation" || reference.kind == "filter") {
            diagnostics_.Warning(reference.pointer, "found " + mdf_Quoted(reference.name) +
                                                        ", which the model doesn't "
                                                        "define");
            continue;
        }
        const bool startsWithVowel =
            std::string_view("aeiou").find(reference.kind.front()) != std::string_view::npos;
        diagnostics_.Error(reference.pointer, "found " + mdf_Quoted(reference.name) +
                                                  ", expected the name of " +
                                                  (startsWithVowel ? "an " : "a ") + reference.kind +
                                                  mdf_DidYouMean(reference.name, names));
    }
}
