#include "model_file/mdf_Schema.h"

#include "model_file/mdf_ClassChoice.h"
#include "model_file/mdf_Example.h"
#include "model_file/mdf_MeshFile.h"
#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_RecordReader.h"
#include "model_file/mdf_SchemaFrame.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"

#include <cctype>
#include <cstring>
#include <ostream>
#include <set>

namespace {

using Json = nlohmann::ordered_json;

Json Reference(const std::string& definition) {
    return {{"$ref", "#/$defs/" + definition}};
}

Json Nullable(const Json& type) {
    return {{"anyOf", {type, {{"type", "null"}}}}};
}

Json ArrayOf(const Json& item) {
    return {{"type", "array"}, {"items", item}};
}

/// An object whose members are named by whoever writes the file.
Json MapOf(const Json& item) {
    return {{"type", "object"}, {"propertyNames", Reference("NAME")}, {"additionalProperties", item}};
}

/// A pattern for one of the words in any capitals.
std::string PatternOf(const std::vector<std::string>& words) {
    std::string pattern = "^(?:";
    const char* separator = "";
    for (const std::string& word : words) {
        pattern += std::exchange(separator, "|");
        for (const char c : word) {
            const auto letter = static_cast<unsigned char>(c);
            if (std::isalpha(letter) != 0) {
                pattern += {'[', static_cast<char>(std::toupper(letter)),
                            static_cast<char>(std::tolower(letter)), ']'};
            } else {
                if (std::strchr(".^$*+?()[]{}|\\/", c) != nullptr) pattern += '\\';
                pattern += c;
            }
        }
    }
    return pattern + ")$";
}

/// The words, which editors offer, in any capitals.
Json WordsOf(const std::vector<std::string>& words, const std::vector<std::string>& others = {}) {
    std::vector<std::string> all(words);
    for (const std::string& other : others) {
        const auto same = [&](const std::string& word) { return omu_EqualInAnyCapitals(word, other); };
        if (!other.empty() && std::ranges::none_of(all, same)) all.push_back(other);
    }
    return {{{"enum", words}}, {{"type", "string"}, {"pattern", PatternOf(all)}}};
}

bool RefersToRepository(const cls_Field& field) {
    if (field.refersTo == nullptr) return false;
    return std::ranges::any_of(odiK_Repositories(), [&](const odiK_Repository& repository) {
        return repository.kind != nullptr && std::string_view(repository.kind) == field.refersTo;
    });
}

// Arrays of one are said as such: braces around a single value are an array for g++ and that value for clang.

/// What a value in a model file looks like. Whatever several places have is a definition that they share.
class SchemaMaker {
public:
    Json Make() {
        Json schema = Json::parse(mdf_kSchemaFrame);
        definitions_ = std::move(schema["$defs"]);
        definitions_["MESH"]["properties"]["surfaceElements"]["enum"] = mdf_SurfaceFamilies();
        EnumOf(omu_EnumTableOf(omi_complex::FormEnm()), false);
        Define("DATUM", FrameOf<odiK_Datum>());
        Define("SET", FrameOf<odiK_SetHead>());
        Define("ASSEMBLY_SET", FrameOf<odiK_SetHead>());
        Define("PART", FrameOf<odiK_Part>());
        Define("INSTANCE", FrameOf<odiK_Instance>());
        Define("ASSEMBLY", FrameOf<odiK_Assembly>());
        AddMembersOfSets();
        Json model = FrameOf<odiK_ModelData>();
        for (const odiK_Repository& repository : odiK_Repositories())
            model["properties"][repository.member] = RepositoryOf(repository);
        Define("MODEL", std::move(model));
        FindStates();
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.create == nullptr) continue;
            Define(entry.info.name, states_.count(entry.info.Id()) != 0 ? StateOf(entry) : RecordOf(entry));
        }
        // Only now is it known where a class has to be said.
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.create != nullptr && !IsChosen(entry.info.Id()))
                definitions_[entry.info.name]["examples"][0].erase("class");
        }
        schema["$defs"] = std::move(definitions_);
        return schema;
    }

private:
    void Define(const std::string& name, Json definition) { definitions_[name] = std::move(definition); }

    void AddMembersOfSets() {
        const Json members = definitions_["MEMBERS"]["properties"];
        for (const char* member : {"labels", "facets"})
            definitions_["SET"]["properties"][member] = members[member];
        definitions_["SET"]["examples"] =
            Json::array({{{"name", "FIXED"}, {"kind", "node"}, {"labels", {1, 2, 3}}}});
        Json& set = definitions_["ASSEMBLY_SET"];
        set["properties"]["members"] = ArrayOf(Reference("MEMBERS"));
        set["properties"]["members"]["description"] = "its members, instance by instance";
        set["required"].push_back("members");
        set["examples"] =
            Json::array({{{"name", "FIXED"},
                          {"kind", "node"},
                          {"members", Json::array({{{"instance", "PART-1"}, {"labels", {1, 2, 3}}}})}}});
    }

    /// The states of objects, and what these derive from.
    void FindStates() {
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.create == nullptr) continue;
            const std::unique_ptr<cls_Record> record(entry.create());
            const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(record.get());
            if (object == nullptr) continue;
            const std::unique_ptr<cls_Record> state(object->NewState(0));
            for (unsigned id = state->DynTypeId(); cls_Classes().Find(id) != nullptr;
                 id = cls_Classes().Find(id)->baseId)
                states_.insert(id);
        }
    }

    bool IsChosen(unsigned classId) const { return chosen_.count(classId) != 0; }

    Json RepositoryOf(const odiK_Repository& repository) {
        const Json item = VariantOf(repository.ItemTypeId());
        Json schema = repository.IsInOrder() ? ArrayOf(item) : MapOf(item);
        std::string description = repository.IsInOrder()
                                      ? "steps in their order; the first is the InitialStep, no other is one"
                                      : std::string(repository.plural) + " by name";
        if (!repository.ReachesDeck()) description.append("; in no deck: ").append(repository.whyNotInDeck);
        schema["description"] = description;
        return schema;
    }

    /// An object of the frame, whose class is known by its place.
    template <class T>
    Json FrameOf() {
        const T byDefault;
        Json object = ObjectOf(T::Class.doc, T::Fields(), byDefault, Json::object(), Json::array());
        object["examples"] = Json::array({Json::parse(T::Fields().Example())});
        return object;
    }

    Json ObjectOf(const char* doc, const cls_FieldTable& fields, const cls_Record& byDefault, Json properties,
                  Json required) {
        for (const cls_Field& field : fields.All()) {
            if (field.notModelData) continue;
            properties[field.name] = FieldOf(field, byDefault);
            if (field.required) required.push_back(field.name);
        }
        Json object = {{"description", doc}, {"type", "object"}, {"additionalProperties", false}};
        if (!required.empty()) object["required"] = required;
        object["properties"] = properties;
        return object;
    }

    /// A record of the class or of one derived from it: its "class" decides what else it has.
    Json VariantOf(unsigned base) {
        const mdf_ClassChoice& choice = mdf_ClassChoice::Of(base);
        if (choice.Classes().empty()) return Json(false);
        if (choice.Classes().size() == 1) return Reference(choice.Classes().front()->info.name);
        const std::string name = std::string("ANY_") + cls_Classes().Find(base)->info.name;
        if (definitions_.contains(name)) return Reference(name);
        Json words = Json::array({Json{{"enum", choice.Names()}}});
        Json branches = Json::array();
        for (const cls_ClassEntry* entry : choice.Classes()) {
            chosen_.insert(entry->info.Id());
            const std::string className = entry->info.name;
            words.push_back(Reference(className + "/properties/class"));
            branches.push_back({{"if",
                                 {{"required", {"class"}},
                                  {"properties", {{"class", Reference(className + "/properties/class")}}}}},
                                {"then", Reference(className)}});
        }
        Define(name, {{"description", cls_Classes().Find(base)->info.doc},
                      {"type", "object"},
                      {"required", {"class"}},
                      {"properties", {{"class", {{"description", "which class it is"}, {"anyOf", words}}}}},
                      {"allOf", branches}});
        return Reference(name);
    }

    static Json ClassOf(const cls_ClassEntry& entry) {
        const bool isTwin = mdf_ClassChoice::IsTwin(entry);
        std::vector<std::string> words = mdf_ClassChoice::WordsOf(entry);
        if (isTwin) words.erase(words.begin());
        return {{"description", "the class of the record"}, {"anyOf", WordsOf({words.front()}, words)}};
    }

    Json RecordOf(const cls_ClassEntry& entry) {
        const std::unique_ptr<cls_Record> byDefault(entry.create());
        Json properties = Json::object();
        Json required = Json::array();
        // "class" may be left out where only one class is possible.
        properties["class"] = ClassOf(entry);
        if (cls_Classes().InheritanceCheck(entry.info.Id(), kprC_Step::TypeId())) {
            properties["name"] = Reference("NAME");
            properties["name"]["description"] = "the name of the step";
            required = {"name", "class"};
        }
        Json record = ObjectOf(entry.info.doc, entry.fields(), *byDefault, properties, required);
        if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(byDefault.get())) {
            const std::unique_ptr<cls_Record> state(object->NewState(0));
            record["properties"]["states"] =
                MapOf(Reference(cls_Classes().Find(state->DynTypeId())->info.name));
            record["properties"]["states"]["description"] = "what it is from a step on, by the step's name";
        }
        record["examples"] = Json::array({mdf_ExampleOf(entry)});
        return record;
    }

    Json StateOf(const cls_ClassEntry& entry) {
        const std::unique_ptr<cls_Record> byDefault(entry.create());
        Json state = ObjectOf(entry.info.doc, entry.fields(), *byDefault, Json::object(), Json::array());
        Json& properties = state["properties"];
        properties["deactivated"] = {
            {"description", "true ends the object in this step"}, {"type", "boolean"}, {"default", false}};
        properties["status"] = EnumOf(omu_EnumTableOf(mdl_PropagationStatusEnm()), false);
        properties["status"]["description"] = "takes the place of the status that follows from the states";
        state["examples"] = Json::array({Json::parse(entry.fields().Example())});
        return state;
    }

    static std::string DescriptionOf(const cls_Field& field) {
        std::string text = field.Documentation();
        if (field.refersTo != nullptr) {
            const bool hasVowel = std::strchr("aeiou", *field.refersTo) != nullptr;
            text.append(hasVowel ? "; the name of an " : "; the name of a ").append(field.refersTo);
        }
        if (field.notInDeck != nullptr) text.append("; in no deck: ").append(field.notInDeck);
        return text;
    }

    Json FieldOf(const cls_Field& field, const cls_Record& byDefault) {
        Json schema = {{"description", DescriptionOf(field)}};
        if (field.unit != nullptr) schema["x-unit"] = field.unit;
        Json type = TypeOf(*field.type, &field);
        if (cls_IsUnset(*field.type, field.In(byDefault))) {
            type = Nullable(type);
            schema["default"] = nullptr;
        } else {
            const Json value = DefaultOf(field, field.In(byDefault));
            if (!value.is_null() && !field.required) schema["default"] = value;
        }
        schema.update(type);
        return schema;
    }

    static Json DefaultOf(const cls_Field& field, const void* value) {
        switch (field.type->Kind()) {
        case cls_FieldKind::Bool: return *static_cast<const bool*>(value);
        case cls_FieldKind::Int: {
            const int number = *static_cast<const int*>(value);
            const std::string word = mdf_WordOfNumber(field, number);
            return word.empty() ? Json(number) : Json(word);
        }
        case cls_FieldKind::Double: return *static_cast<const double*>(value);
        case cls_FieldKind::Float: return *static_cast<const float*>(value);
        case cls_FieldKind::Enum: {
            const auto& enumeration = static_cast<const cls_EnumType&>(*field.type);
            const omu_EnumRow* row = enumeration.Table().Row(enumeration.Get(value));
            return row == nullptr ? Json() : Json(row->name);
        }
        case cls_FieldKind::Triple: {
            double xyz[3];
            static_cast<const cls_TripleType&>(*field.type).Get(value, xyz);
            return {xyz[0], xyz[1], xyz[2]};
        }
        case cls_FieldKind::String: {
            const auto& text = *static_cast<const cow_String*>(value);
            return text.IsEmpty() ? Json() : Json(text.View());
        }
        default: return {};
        }
    }

    Json TypeOf(const cls_FieldType& type, const cls_Field* field) {
        switch (type.Kind()) {
        case cls_FieldKind::Bool: return {{"type", "boolean"}};
        case cls_FieldKind::Int: return IntOf(field);
        case cls_FieldKind::Double:
        case cls_FieldKind::Float: return {{"type", "number"}};
        case cls_FieldKind::String: return StringOf(field);
        case cls_FieldKind::Enum:
            return EnumOf(static_cast<const cls_EnumType&>(type).Table(),
                          field != nullptr && field->wordsOnly);
        case cls_FieldKind::Triple: return Reference("TRIPLE");
        case cls_FieldKind::Segment:
            return {{"type", "array"}, {"items", Reference("TRIPLE")}, {"minItems", 2}, {"maxItems", 2}};
        case cls_FieldKind::Complex: return Reference("COMPLEX");
        case cls_FieldKind::Table: return Reference("TABLE");
        case cls_FieldKind::List: return ListOf(static_cast<const cls_ListType&>(type), field);
        case cls_FieldKind::Map:
            return MapOf(TypeOf(static_cast<const cls_MapType&>(type).ItemType(), nullptr));
        case cls_FieldKind::Record: return VariantOf(static_cast<const cls_HolderType&>(type).ClassId());
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant:
            return Nullable(VariantOf(static_cast<const cls_HolderType&>(type).ClassId()));
        case cls_FieldKind::Region:
            return Reference(field != nullptr && field->mayBeSeveral ? "REGIONS" : "REGION");
        case cls_FieldKind::Datum: return {{"type", {"string", "null"}}};
        case cls_FieldKind::Attribute: return AttributeOf(static_cast<const cls_AttributeType&>(type), field);
        case cls_FieldKind::Tree:
            // Only fields are trees, never items of others.
            return field == nullptr ? Json() : TreeOf(type, *field);
        }
        return {};
    }

    /// Words in any capitals, the texts that decks have for them, and the numbers: nothing else is taken.
    Json EnumOf(const omu_EnumTable& table, bool wordsOnly) {
        const std::string name = table.typeName + std::string(wordsOnly ? ".BY_WORD" : "");
        if (!definitions_.contains(name)) {
            std::vector<std::string> words;
            std::vector<std::string> texts;
            std::vector<int> numbers;
            for (const omu_EnumRow& row : table.rows) {
                words.emplace_back(row.name);
                texts.emplace_back(row.text);
                if (row.deck != nullptr) texts.emplace_back(row.deck);
                numbers.push_back(row.value);
            }
            Json choices = WordsOf(words, texts);
            if (!wordsOnly) choices.push_back({{"enum", numbers}});
            Define(name, {{"anyOf", choices}});
        }
        return Reference(name);
    }

    static Json IntOf(const cls_Field* field) {
        if (field == nullptr || field->meanings.empty()) return Reference("INT");
        std::vector<std::string> words;
        for (const cls_IntMeaning& meaning : field->meanings) words.push_back(mdf_MeaningWord(meaning));
        Json choices = WordsOf(words);
        choices.push_back(Reference("INT"));
        return {{"anyOf", choices}};
    }

    Json ListOf(const cls_ListType& type, const cls_Field* field) {
        const bool isOfAttributes = type.ItemType().Kind() == cls_FieldKind::Attribute;
        Json item = TypeOf(type.ItemType(), isOfAttributes ? field : nullptr);
        // A null item is the default of its place.
        if (field != nullptr && field->defaultItems != nullptr) item = Nullable(item);
        if (const mdf_PairList* pairs = field == nullptr ? nullptr : mdf_PairListOf(*field))
            item = {{"anyOf", {item, PairOf(*pairs, *field)}}};
        Json list = ArrayOf(item);
        if (field != nullptr && field->length > 0) list["minItems"] = list["maxItems"] = field->length;
        // Of a state: null ends what was set before.
        return isOfAttributes ? Nullable(list) : list;
    }

    /// A pair with what belongs to it.
    Json PairOf(const mdf_PairList& pairs, const cls_Field& field) {
        const kinC_SurfacePair byDefault;
        const auto& list = static_cast<const cls_ListType&>(*field.type);
        const auto& value = static_cast<const cls_AttributeType&>(list.ItemType()).ValueType();
        Json properties = Json::object();
        Json required = Json::array();
        if (pairs.value != nullptr && *pairs.value != '\0') {
            properties[pairs.value] = TypeOf(value, &field);
            properties[pairs.value]["description"] = field.doc;
            required.push_back(pairs.value);
        } else if (pairs.value != nullptr) {
            const cls_ClassEntry& entry =
                *cls_Classes().Find(static_cast<const cls_HolderType&>(value).ClassId());
            const std::unique_ptr<cls_Record> record(entry.create());
            properties = ObjectOf("", entry.fields(), *record, properties, required)["properties"];
        }
        return ObjectOf("a pair of surfaces, and what holds for it", kinC_SurfacePair::Fields(), byDefault,
                        properties, required);
    }

    Json AttributeOf(const cls_AttributeType& type, const cls_Field* field) {
        const Json value = TypeOf(type.ValueType(), field);
        const std::string ofValue =
            value.size() != 1 ? ""
            : value.contains("$ref")
                ? value["$ref"].get<std::string>().substr(std::strlen("#/$defs/"))
                : (value.contains("type") && value["type"].is_string() ? value["type"].get<std::string>()
                                                                       : "");
        const std::string name = ofValue.empty() ? "" : "SET_OR_CLEARED." + ofValue;
        if (!name.empty() && definitions_.contains(name)) return Reference(name);
        Json whole = {
            {"description", "with its attribute state, which otherwise follows from the steps"},
            {"type", "object"},
            {"additionalProperties", false},
            {"required", {"state"}},
            {"properties",
             {{"value", value}, {"state", EnumOf(omu_EnumTableOf(mdl_PropAttributeStateEnm()), false)}}}};
        whole["properties"]["value"]["description"] = "the value";
        whole["properties"]["state"]["description"] = "the state that the attribute has in this step";
        Json attribute = {
            {"anyOf", {value, {{"description", "cleared in this step"}, {"type", "null"}}, whole}}};
        if (name.empty()) return attribute;
        Define(name, std::move(attribute));
        return Reference(name);
    }

    static Json StringOf(const cls_Field* field) {
        if (field == nullptr) return Reference("LINE");
        if (field->verbatim) return Reference("TEXT");
        if (field->nameOf != nullptr) return Reference("NAME");
        if (!field->words.empty()) return {{"anyOf", WordsOf({field->words.begin(), field->words.end()})}};
        if (field->freeText) return {{"type", "string"}};
        return Reference(RefersToRepository(*field) ? "REFERENCE" : "LINE");
    }

    static Json TreeOf(const cls_FieldType& type, const cls_Field& field) {
        switch (static_cast<const cls_TreeType&>(type).Part()) {
        case cls_TreeEnm::Datums: return ArrayOf(Reference("DATUM"));
        case cls_TreeEnm::Parts: return MapOf(Reference("PART"));
        case cls_TreeEnm::Assembly: return Reference("ASSEMBLY");
        case cls_TreeEnm::Instances: return MapOf(Reference("INSTANCE"));
        case cls_TreeEnm::Mesh:
        case cls_TreeEnm::AssemblyMesh: return Reference("MESH");
        case cls_TreeEnm::AssemblySets: return ArrayOf(Reference("ASSEMBLY_SET"));
        case cls_TreeEnm::Attributes:
        case cls_TreeEnm::OwnAttributes:
        case cls_TreeEnm::AssemblyAttributes: return ArrayOf(Reference(field.refersToClass->name));
        }
        return {};
    }

    Json definitions_;
    /// Classes of states, and those of places where several may stand.
    std::set<unsigned> states_;
    std::set<unsigned> chosen_;
};

} // namespace

Json mdf_Schema() {
    return SchemaMaker().Make();
}

bool mdf_WriteSchema(std::ostream& out) {
    out << mdf_Schema().dump(1) << '\n';
    return static_cast<bool>(out.flush());
}
