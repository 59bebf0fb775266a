#include "model_file/mdf_RecordReader.h"

#include "model_file/mdf_ClassChoice.h"
#include "store_interface/findings/fnd_RecordRules.h"
#include "store_interface/findings/fnd_TextRules.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

// Stands for a null in a list until all fields are read; no number of a model file is one.
constexpr double kNullItem = std::numeric_limits<double>::quiet_NaN();

constexpr const char* kSinglePrecision = "a number of single precision";

std::vector<std::string> WordsOf(const cls_Field& enumField) {
    std::vector<std::string> words;
    for (const omu_EnumRow& row : static_cast<const cls_EnumType&>(*enumField.type).Table().rows)
        words.emplace_back(row.name);
    return words;
}

} // namespace

void mdf_RecordReader::ReadRecord(cls_Record& record, const mdf_Value& object, const fnd_Path& path,
                                  const std::vector<std::string>& others) {
    if (!object.IsObject()) {
        diagnostics_.Expected(path, object, "an object");
        return;
    }
    const int errorsBefore = diagnostics_.NumErrors();
    std::vector<const cls_Field*> refusedTables;
    mdf_CheckMembers(diagnostics_, object, mdf_MembersOf(record.DynFields(), others), path);
    for (const cls_Field& field : record.DynFields().All()) {
        if (field.notModelData || std::find(others.begin(), others.end(), field.name) != others.end())
            continue;
        const bool taken = ReadField(record, field, object.Find(field.name), fnd_Path(path, field.name));
        if (!taken && field.type->Kind() == cls_FieldKind::Table) refusedTables.push_back(&field);
    }
    for (const cls_Field* field : refusedTables) {
        const std::string hint = fnd_RecordRules::All().TableHint(record, field->name);
        if (!hint.empty()) diagnostics_.Add("table-columns", fnd_Path(path, field->name), hint);
    }
    for (const cls_Field& field : record.DynFields().All()) CompleteList(field, record, path);
    if (diagnostics_.NumErrors() != errorsBefore) return;
    fnd_RecordCheck check(diagnostics_, path);
    fnd_RecordRules::All().Run(record, check);
}

bool mdf_RecordReader::ReadField(cls_Record& record, const cls_Field& field, const mdf_Value* json,
                                 const fnd_Path& path) {
    if (json != nullptr) {
        const bool mayBeUnset = cls_IsUnset(*field.type, field.In(record));
        if (!ReadValue(*field.type, field.In(record), *json, path, field, mayBeUnset)) return false;
    } else if (field.defaultItems != nullptr) {
        // The defaults may be others than those of a new record.
        static_cast<const cls_ListType&>(*field.type).Clear(field.In(record));
    }
    if (!field.required) return true;
    const bool isText = field.type->Kind() == cls_FieldKind::String;
    const bool missing =
        json == nullptr || json->IsNull() || (isText && json->IsString() && json->String().empty());
    if (missing) {
        diagnostics_.Add("missing-field", path, "found nothing",
                         (field.wordsOnly ? fnd_OneOf(WordsOf(field)) : std::string(field.doc)));
    }
    return true;
}

std::unique_ptr<cls_Record> mdf_RecordReader::NewVariant(unsigned base, const mdf_Value& object,
                                                         const fnd_Path& path) {
    if (!object.IsObject()) {
        diagnostics_.Expected(path, object, "an object");
        return nullptr;
    }
    const mdf_ClassChoice& choice = mdf_ClassChoice::Of(base);
    const std::vector<std::string>& names = choice.Names();
    const mdf_Value* name = object.Find("class");
    const fnd_Path place(path, "class");
    if (name == nullptr) {
        if (choice.Classes().size() == 1) {
            return std::unique_ptr<cls_Record>(choice.Classes().front()->create());
        }
        diagnostics_.Add("missing-field", place, "found nothing",
                         (names.empty() ? std::string("no object here") : fnd_OneOf(names)));
        return nullptr;
    }
    if (!name->IsString()) {
        diagnostics_.Expected(place, *name, "the name of a class");
        return nullptr;
    }
    if (const cls_ClassEntry* entry = choice.Find(name->String()))
        return std::unique_ptr<cls_Record>(entry->create());
    diagnostics_.Expected(place, *name, (names.empty() ? "no object here" : fnd_OneOf(names, name->String())),
                          diagnostics_.WantsHint() ? choice.DidYouMean(name->String()) : std::string());
    return nullptr;
}

std::unique_ptr<cls_Record> mdf_RecordReader::ReadVariant(unsigned base, const mdf_Value& object,
                                                          const fnd_Path& path,
                                                          const std::vector<std::string>& others) {
    std::unique_ptr<cls_Record> record = NewVariant(base, object, path);
    if (record == nullptr) return nullptr;
    std::vector<std::string> passed(others);
    passed.emplace_back("class");
    ReadRecord(*record, object, path, passed);
    return record;
}

bool mdf_RecordReader::ReadText(cow_String& text, const mdf_Value& value, const fnd_Path& path) {
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
            diagnostics_.Expected(fnd_Path(path, i), line, "a string");
            return false;
        }
        joined.append(line.String()).append("\n");
    }
    text = cow_String(joined);
    return true;
}

bool mdf_RecordReader::ReadValue(const cls_FieldType& type, void* value, const mdf_Value& json,
                                 const fnd_Path& path, const cls_Field& field, bool mayBeUnset) {
    switch (type.Kind()) {
    case cls_FieldKind::Bool: return ReadBool(*static_cast<bool*>(value), json, path);
    case cls_FieldKind::Int: return ReadInt(*static_cast<int*>(value), json, path, field, mayBeUnset);
    case cls_FieldKind::Double: return ReadDouble(*static_cast<double*>(value), json, path, mayBeUnset);
    case cls_FieldKind::Float:
        if (!json.IsNumber() || std::isinf(static_cast<float>(json.Real()))) {
            diagnostics_.Expected(path, json, kSinglePrecision);
            return false;
        }
        *static_cast<float*>(value) = static_cast<float>(json.Real());
        return true;
    case cls_FieldKind::String: return ReadString(*static_cast<cow_String*>(value), json, path, field);
    case cls_FieldKind::Enum:
        return ReadEnum(static_cast<const cls_EnumType&>(type), value, json, path, field.wordsOnly);
    case cls_FieldKind::Triple: {
        const auto& triple = static_cast<const cls_TripleType&>(type);
        double xyz[3];
        if (!ReadTriple(xyz, json, path, field.singlePrecision || triple.IsSingle())) return false;
        triple.Set(value, xyz);
        return true;
    }
    case cls_FieldKind::Segment: return ReadSegment(*static_cast<gsl_ModelSegment*>(value), json, path);
    case cls_FieldKind::Complex: return ReadComplex(*static_cast<omi_complex*>(value), json, path);
    case cls_FieldKind::Table: return ReadTable(static_cast<const cls_TableType&>(type), value, json, path);
    case cls_FieldKind::List:
        return ReadList(static_cast<const cls_ListType&>(type), value, json, path, field);
    case cls_FieldKind::Map: return ReadMap(static_cast<const cls_MapType&>(type), value, json, path, field);
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant:
        return ReadHolder(static_cast<const cls_HolderType&>(type), value, json, path);
    case cls_FieldKind::Region:
        *static_cast<rgnC_Region*>(value) = field.mayBeSeveral && json.IsArray()
                                                ? places_.ReadRegions(json, path)
                                                : places_.ReadRegion(json, path);
        return true;
    case cls_FieldKind::Datum: return places_.ReadDatum(*static_cast<dtmC_DatumRef*>(value), json, path);
    case cls_FieldKind::Attribute:
        return ReadAttribute(static_cast<const cls_AttributeType&>(type), value, json, path, field) !=
               mdl_GivenEnm::ABSENT;
    case cls_FieldKind::Tree: break;
    }
    return false;
}

bool mdf_RecordReader::ReadBool(bool& value, const mdf_Value& json, const fnd_Path& path) {
    if (json.IsBool()) {
        value = json.Bool();
    } else {
        diagnostics_.Expected(path, json, "true or false");
    }
    return json.IsBool();
}

bool mdf_RecordReader::ReadDouble(double& value, const mdf_Value& json, const fnd_Path& path,
                                  bool mayBeUnset) {
    if (json.IsNumber()) {
        value = json.Real();
        return true;
    }
    if (json.IsNull() && mayBeUnset) {
        value = cls_UnsetDouble;
        return true;
    }
    diagnostics_.Expected(path, json, mayBeUnset ? "a number or null" : "a number");
    return false;
}

bool mdf_RecordReader::ReadString(cow_String& value, const mdf_Value& json, const fnd_Path& path,
                                  const cls_Field& field) {
    if (field.verbatim) return ReadText(value, json, path);
    if (!field.words.empty()) return ReadWord(value, json, path, field);
    if (!json.IsString()) {
        const std::string kind = field.nameOf == nullptr ? "" : field.nameOf;
        diagnostics_.Expected(path, json,
                              field.nameOf == nullptr ? "a string"
                              : kind.empty()          ? "a name"
                                                      : "the name of a " + kind);
        return false;
    }
    if (!fnd_CheckText(field, json.String(), path, diagnostics_)) return false;
    value = cow_String(json.String());
    references_.Note(field, json.String(), path);
    return true;
}

bool mdf_RecordReader::ReadWord(cow_String& value, const mdf_Value& json, const fnd_Path& path,
                                const cls_Field& field) {
    for (const char* word : field.words) {
        if (!json.IsString() || !omu_EqualInAnyCapitals(json.String(), word)) continue;
        value = word;
        return true;
    }
    const std::vector<std::string> words(field.words.begin(), field.words.end());
    diagnostics_.Expected(path, json, fnd_OneOf(words, mdf_GivenWord(json)),
                          json.IsString() ? fnd_DidYouMean(json.String(), words) : std::string());
    return false;
}

bool mdf_RecordReader::ReadInt(int& value, const mdf_Value& json, const fnd_Path& path,
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
            diagnostics_.Add("no-such-meaning", path,
                             "found " + std::to_string(value) + ", which has no meaning here");
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
    if (!words.empty()) expected += ", or " + fnd_OneOf(words, mdf_GivenWord(json));
    diagnostics_.Expected(path, json, expected,
                          json.IsString() ? fnd_DidYouMean(json.String(), words) : std::string());
    return false;
}

bool mdf_RecordReader::ReadEnum(const cls_EnumType& type, void* value, const mdf_Value& json,
                                const fnd_Path& path, bool wordsOnly) {
    const omu_EnumTable& table = type.Table();
    const omu_EnumRow* row = nullptr;
    if (json.IsInt() && !wordsOnly) row = table.Row(json.Int());
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
    diagnostics_.Expected(path, json, fnd_OneOf(wordsOnly ? words : shown, mdf_GivenWord(json)),
                          json.IsString() ? fnd_DidYouMean(json.String(), words) : std::string());
    return false;
}

bool mdf_RecordReader::ReadTriple(double (&xyz)[3], const mdf_Value& json, const fnd_Path& path,
                                  bool singlePrecision) {
    if (!json.IsArray() || json.Size() != 3) {
        diagnostics_.Expected(path, json, "three numbers");
        return false;
    }
    for (std::size_t i = 0; i < 3; ++i) {
        const mdf_Value item = json.Item(i);
        const bool tooLarge =
            singlePrecision && item.IsNumber() && std::isinf(static_cast<float>(item.Real()));
        if (!item.IsNumber() || tooLarge) {
            diagnostics_.Expected(fnd_Path(path, i), item, tooLarge ? kSinglePrecision : "a number");
            return false;
        }
        xyz[i] = item.Real();
    }
    return true;
}

bool mdf_RecordReader::ReadSegment(gsl_ModelSegment& segment, const mdf_Value& json, const fnd_Path& path) {
    if (!json.IsArray() || json.Size() != 2) {
        diagnostics_.Expected(path, json, "two points");
        return false;
    }
    double start[3];
    double end[3];
    if (!ReadTriple(start, json.Item(0), fnd_Path(path, std::size_t{0}), false) ||
        !ReadTriple(end, json.Item(1), fnd_Path(path, std::size_t{1}), false)) {
        return false;
    }
    segment = gsl_ModelSegment({start[0], start[1], start[2]}, {end[0], end[1], end[2]});
    return true;
}

bool mdf_RecordReader::ReadComplex(omi_complex& value, const mdf_Value& json, const fnd_Path& path) {
    const auto readPart = [&](double& part, const mdf_Value& number, const fnd_Path& place) {
        if (number.IsNumber()) {
            part = number.Real();
        } else {
            diagnostics_.Expected(place, number, "a number");
        }
        return number.IsNumber();
    };
    value = {};
    if (json.IsArray() && json.Size() == 2) {
        const bool isRead = readPart(value.real, json.Item(0), fnd_Path(path, std::size_t{0}));
        return readPart(value.imag, json.Item(1), fnd_Path(path, std::size_t{1})) && isRead;
    }
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "two numbers, or an object of \"form\", \"real\" and \"imag\"");
        return false;
    }
    mdf_CheckMembers(diagnostics_, json, {"form", "real", "imag"}, path);
    bool isRead = true;
    if (const mdf_Value* form = json.Find("form")) {
        const auto& type = static_cast<const cls_EnumType&>(cls_TypeOf<omi_complex::FormEnm>::Instance());
        isRead = ReadEnum(type, &value.form, *form, fnd_Path(path, "form"), false);
    }
    for (const auto& [name, part] : {std::pair("real", &value.real), std::pair("imag", &value.imag)}) {
        const mdf_Value* number = json.Find(name);
        if (number != nullptr)
            isRead = readPart(*part, *number, fnd_Path(path, std::string_view(name))) && isRead;
    }
    return isRead;
}

bool mdf_RecordReader::ReadTable(const cls_TableType& type, void* value, const mdf_Value& json,
                                 const fnd_Path& path) {
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
        diagnostics_.Expected(fnd_Path(path, i), row,
                              i == 0 ? "a row of numbers"
                                     : "a row of " + std::to_string(columns) + " numbers, as the first one");
        return false;
    }
    cow_2DArray<double> cells(static_cast<int>(json.Size()), static_cast<int>(columns));
    for (std::size_t i = 0; i < json.Size(); ++i) {
        const fnd_Path rowPath(path, i);
        const mdf_Value row = json.Item(i);
        for (std::size_t j = 0; j < columns; ++j) {
            const mdf_Value cell = row.Item(j);
            if (!cell.IsNumber()) {
                diagnostics_.Expected(fnd_Path(rowPath, j), cell, "a number");
                return false;
            }
            cells.Put(static_cast<int>(i), static_cast<int>(j), cell.Real());
        }
    }
    type.Set(value, columns == 0 ? cow_2DArray<double>() : cells);
    return true;
}

bool mdf_RecordReader::ReadList(const cls_ListType& type, void* value, const mdf_Value& json,
                                const fnd_Path& path, const cls_Field& field) {
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
        ReadValue(type.ItemType(), item, json.Item(i), fnd_Path(path, i), field, false);
    }
    return true;
}

// Runs when all fields are read, since the default items may depend on some of them.
void mdf_RecordReader::CompleteList(const cls_Field& field, cls_Record& record, const fnd_Path& path) {
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
        const fnd_Path listPath(path, std::string_view(field.name));
        diagnostics_.Add("wrong-value", fnd_Path(listPath, static_cast<std::size_t>(i)), "found null",
                         "a number: the list has defaults for the first " +
                             std::to_string(defaults.Length()) + " items only");
    }
}

bool mdf_RecordReader::ReadMap(const cls_MapType& type, void* value, const mdf_Value& json,
                               const fnd_Path& path, const cls_Field& field) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return false;
    }
    type.Clear(value);
    mdf_CapitalsCheck capitals;
    for (const mdf_Member& member : json.Members()) {
        const fnd_Path place(path, member.name);
        if (field.refersTo == nullptr) {
            if (!fnd_CheckName(member.name, place, diagnostics_)) continue;
            capitals.Enter(member.name, place, "name", diagnostics_);
        } else {
            references_.Note(field, member.name, place);
        }
        ReadValue(type.ItemType(), type.Insert(value, cow_String(member.name)), member.value, place, field,
                  false);
    }
    return true;
}

bool mdf_RecordReader::ReadHolder(const cls_HolderType& type, void* value, const mdf_Value& json,
                                  const fnd_Path& path) {
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

mdl_GivenEnm mdf_RecordReader::ReadAttribute(const cls_AttributeType& type, void* attribute,
                                             const mdf_Value& json, const fnd_Path& path,
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
    mdf_CheckMembers(diagnostics_, json, {"value", "state"}, path);
    mdl_PropAttributeStateEnm state = mdl_PropAttributeStateEnm::NEVER_SET;
    const auto& stateType =
        static_cast<const cls_EnumType&>(cls_TypeOf<mdl_PropAttributeStateEnm>::Instance());
    if (!ReadEnum(stateType, &state, *json.Find("state"), fnd_Path(path, "state"), false))
        return mdl_GivenEnm::ABSENT;
    type.SetState(attribute, static_cast<int>(state));
    const mdf_Value* value = json.Find("value");
    if (value == nullptr) return mdl_GivenEnm::STATE_ONLY;
    return ReadValue(type.ValueType(), type.WritableValue(attribute), *value, fnd_Path(path, "value"), field,
                     false)
               ? mdl_GivenEnm::AS_IT_STANDS
               : mdl_GivenEnm::ABSENT;
}

/// The pairs of a contact mustn't depend on the order of members; names of no step come first.
std::vector<const mdf_Member*> mdf_RecordReader::InOrder(const kprC_PropagatingObject& object,
                                                         const mdf_Value& states) const {
    std::vector<const mdf_Member*> members;
    for (const mdf_Member& member : states.Members()) members.push_back(&member);
    if (!mdf_UsesPairs(object, states)) return members;
    std::ranges::stable_sort(members, {}, [this](const mdf_Member* member) {
        return model_.steps.IndexOf(cow_String(member->name));
    });
    return members;
}

void mdf_RecordReader::ReadStates(kprC_PropagatingObject& object, const mdf_Value& states,
                                  const fnd_Path& path) {
    if (!states.IsObject()) {
        diagnostics_.Expected(path, states, "an object of states by step");
        return;
    }
    for (const mdf_Member* const each : InOrder(object, states)) {
        const mdf_Member& member = *each;
        const fnd_Path place(path, member.name);
        if (references_.IsWrong(member.name)) continue;
        if (!model_.steps.IsMember(cow_String(member.name))) {
            diagnostics_.Add("no-such-name", place, "found " + fnd_Quoted(member.name), "the name of a step",
                             fnd_DidYouMean(diagnostics_, member.name, [this](fnd_Nearest& nearest) {
                                 for (const auto& [name, step] : model_.steps) nearest.Try(name.View());
                             }));
            continue;
        }
        ReadState(object, member.name, member.value, place);
    }
}

void mdf_RecordReader::ReadState(kprC_PropagatingObject& object, const std::string& stepName,
                                 const mdf_Value& json, const fnd_Path& path) {
    if (!json.IsObject()) {
        diagnostics_.Expected(path, json, "an object");
        return;
    }
    const int errorsBefore = diagnostics_.NumErrors();
    mdl_GivenState& given = object.Give(cow_String(stepName));
    cls_Record& record = given.record.Get();
    const auto& fields = record.DynFields().All();
    mdf_CheckMembers(diagnostics_, json, mdf_MembersOf(record.DynFields(), {"deactivated", "status"}), path);
    if (const mdf_Value* deactivated = json.Find("deactivated"))
        ReadBool(given.deactivated, *deactivated, fnd_Path(path, "deactivated"));
    if (const mdf_Value* status = json.Find("status")) {
        mdl_PropagationStatusEnm value = mdl_PropagationStatusEnm::NOT_YET_ACTIVE;
        const auto& type = static_cast<const cls_EnumType&>(cls_TypeOf<mdl_PropagationStatusEnm>::Instance());
        if (ReadEnum(type, &value, *status, fnd_Path(path, "status"), false)) given.status = value;
    }
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const cls_Field& field = fields[i];
        const mdf_Value* member = field.notModelData ? nullptr : json.Find(field.name);
        if (member == nullptr) continue;
        ReadStateField(object, given.marks[i], field, field.In(record), *member, fnd_Path(path, field.name));
    }
    if (diagnostics_.NumErrors() != errorsBefore) return;
    fnd_RecordCheck check(diagnostics_, path);
    fnd_RecordRules::All().Run(record, check);
}

void mdf_RecordReader::ReadStateField(kprC_PropagatingObject& object, mdl_GivenEnm& mark,
                                      const cls_Field& field, void* value, const mdf_Value& json,
                                      const fnd_Path& path) {
    if (field.type->Kind() == cls_FieldKind::Attribute) {
        mark = ReadAttribute(static_cast<const cls_AttributeType&>(*field.type), value, json, path, field);
        return;
    }
    const bool isList = field.type->Kind() == cls_FieldKind::List;
    if (isList && json.IsNull() &&
        static_cast<const cls_ListType&>(*field.type).ItemType().Kind() == cls_FieldKind::Attribute) {
        static_cast<const cls_ListType&>(*field.type).Clear(value);
        mark = mdl_GivenEnm::VALUE;
        return;
    }
    const mdf_PairList* pairs = isList ? mdf_PairListOf(field) : nullptr;
    const bool isRead =
        pairs != nullptr && mdf_IsOfPairs(*pairs, json)
            ? ReadPairs(object, *pairs, field, value, json, path)
            : ReadValue(*field.type, value, json, path, field, cls_IsUnset(*field.type, value));
    if (isRead) mark = mdl_GivenEnm::VALUE;
}
