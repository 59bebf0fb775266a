#include "model_file/mdf_Members.h"
#include "model_file/mdf_MeshFile.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <nlohmann/json.hpp>

#include <cctype>
#include <cstring>
#include <ostream>

namespace {

using Json = nlohmann::ordered_json;

// The frame of a model file; members that hold records are added from the classes.
constexpr char kFrame[] = R"({
  "$schema": "https://json-schema.org/draft/2020-12/schema",
  "title": "QRX model file",
  "description": "A model store on disk: everything that a keyword deck is written from. Comments are allowed.",
  "type": "object",
  "additionalProperties": false,
  "required": ["format", "models"],
  "properties": {
    "format": {"description": "what this file is", "const": "qrx-model/1"},
    "parameters": {
      "description": "Short names for what a study varies; a column of its table is one of them, or a pointer.",
      "type": "object",
      "propertyNames": {"minLength": 1, "pattern": "^[^/]", "not": {"const": "name"}},
      "additionalProperties": {
        "anyOf": [
          {"$ref": "#/$defs/POINTERS"},
          {
            "type": "object",
            "additionalProperties": false,
            "required": ["pointers"],
            "properties": {
              "pointers": {"description": "what it stands for", "$ref": "#/$defs/POINTERS"},
              "unit": {"description": "for people", "type": "string"},
              "limits": {"description": "what its numbers may be: \"> 0, <= 20\", or \"0.5 .. 20\" with both ends", "type": "string"},
              "description": {"description": "for people", "type": "string"}
            }
          }
        ]
      }
    },
    "models": {
      "description": "Models by name; decks are written from \"Default Model\".",
      "type": "object",
      "required": ["Default Model"],
      "additionalProperties": {"$ref": "#/$defs/MODEL"}
    }
  },
  "$defs": {
    "NAME": {
      "description": "A name that can stand in a deck.",
      "type": "string", "minLength": 1, "maxLength": 80, "pattern": "^[^\"\\u0000-\\u001f\\u007f]*$"
    },
    "POINTER": {
      "description": "A JSON pointer to a value of this file.",
      "type": "string", "pattern": "^/models/"
    },
    "POINTERS": {
      "description": "One place, or several that get the same value.",
      "anyOf": [{"$ref": "#/$defs/POINTER"}, {"type": "array", "items": {"$ref": "#/$defs/POINTER"}, "minItems": 1}]
    },
    "LINE": {
      "description": "A text that can stand on one line of a deck.",
      "type": "string", "pattern": "^[^\\u0000-\\u001f\\u007f]*$"
    },
    "TEXT": {
      "description": "Deck text, with whatever keywords are in it: a string as it stands, or an array of strings, each of which becomes a line.",
      "anyOf": [{"type": "string"}, {"type": "array", "items": {"type": "string"}}]
    },
    "INT": {"type": "integer", "minimum": -2147483648, "maximum": 2147483647},
    "TRIPLE": {"type": "array", "items": {"type": "number"}, "minItems": 3, "maxItems": 3},
    "COMPLEX": {
      "description": "A complex number: real and imaginary part, or an object. In the form POLAR real is the magnitude and imag the phase in degrees.",
      "anyOf": [
        {"type": "array", "items": {"type": "number"}, "minItems": 2, "maxItems": 2},
        {
          "type": "object",
          "additionalProperties": false,
          "properties": {
            "form": {"description": "how the two numbers are to be read", "anyOf": [{"enum": ["RECTANGULAR", "POLAR"]}, {"type": "string"}, {"type": "integer"}], "default": "RECTANGULAR"},
            "real": {"description": "real part, or magnitude", "type": "number", "default": 0},
            "imag": {"description": "imaginary part, or phase", "type": "number", "default": 0}
          }
        }
      ]
    },
    "TABLE": {
      "description": "Rows of numbers, all of one length.",
      "type": "array", "items": {"type": "array", "items": {"type": "number"}}
    },
    "LABELS": {
      "description": "User labels in order, or a range of them.",
      "anyOf": [
        {"type": "array", "items": {"type": "integer", "minimum": 1, "maximum": 2147483647}},
        {
          "type": "object",
          "additionalProperties": false,
          "required": ["from", "to"],
          "properties": {
            "from": {"description": "first label", "type": "integer", "minimum": 1},
            "to": {"description": "no label is above it", "type": "integer", "minimum": 1},
            "by": {"description": "from one label to the next", "type": "integer", "minimum": 1, "default": 1}
          }
        }
      ]
    },
    "FACETS": {
      "description": "Element label and face: S1 to S6 on solids and plane elements, SPOS and SNEG on shells, END1 and END2 on lines, or the facet's id from 0 (6 is the double side of a shell).",
      "type": "array",
      "items": {
        "type": "array", "minItems": 2, "maxItems": 2,
        "prefixItems": [{"type": "integer", "minimum": 1}, {"type": ["string", "integer"]}]
      }
    },
    "REGION": {
      "description": "A set of the assembly (\"SET\") or of an instance (\"INSTANCE.SET\"), as an object where a name has a dot; null for none.",
      "anyOf": [
        {"type": ["string", "null"]},
        {
          "type": "object",
          "additionalProperties": false,
          "required": ["set"],
          "properties": {
            "instance": {"description": "the instance that has the set", "$ref": "#/$defs/NAME"},
            "set": {"description": "the set", "$ref": "#/$defs/NAME"}
          }
        }
      ]
    },
    "NODES": {
      "description": "User labels, and for each three coordinates (single precision).",
      "type": "object",
      "additionalProperties": false,
      "required": ["labels", "coordinates"],
      "properties": {
        "labels": {"description": "labels that differ", "$ref": "#/$defs/LABELS"},
        "coordinates": {"description": "x, y and z of each node: lengths", "type": "array", "items": {"$ref": "#/$defs/TRIPLE"}}
      }
    },
    "ELEMENTS": {
      "description": "Elements of one type, each with a row of node labels. In the assembly's mesh an end may be a text: instance, dot, label.",
      "type": "object",
      "additionalProperties": false,
      "required": ["type", "labels", "connectivity"],
      "properties": {
        "type": {"description": "the element type, as the deck says it", "$ref": "#/$defs/NAME"},
        "labels": {"description": "labels that differ in the whole mesh", "$ref": "#/$defs/LABELS"},
        "connectivity": {
          "description": "the nodes of each element",
          "type": "array",
          "items": {"type": "array", "items": {"type": ["integer", "string"]}, "minItems": 1}
        },
        "controls": {"description": "element controls", "$ref": "#/$defs/bme_ElemCtrlParams"}
      }
    },
    "MESH": {
      "description": "Nodes, elements and sets. Elements find their nodes by label, sets their members. Or a mesher's file, whose cells and groups they are.",
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "file": {"description": "a mesher's file (MSH, UNV, MED, VTU, VTK, STL), relative to the model file; it takes the place of nodes and elements", "type": "string", "minLength": 1},
        "part": {"description": "the mesh to take of a file with several", "type": "string"},
        "scale": {"description": "coordinates of the file are multiplied by it", "type": "number", "exclusiveMinimum": 0, "default": 1},
        "elementTypes": {"description": "element types by kind of cell, such as tetra10; null: such cells make no elements", "type": "object", "additionalProperties": {"anyOf": [{"$ref": "#/$defs/NAME"}, {"type": "null"}]}},
        "surfaceElements": {"description": "what surface cells become; shells where there are no solids", "type": "string"},
        "groups": {"description": "names of sets by group, or by group, '@' and dimension; null leaves the group out", "type": "object", "additionalProperties": {"anyOf": [{"$ref": "#/$defs/NAME"}, {"type": "null"}]}},
        "groupArrays": {"description": "integer arrays of cells whose values become groups NAME_VALUE, in formats without groups", "type": "array", "items": {"type": "string"}},
        "controls": {"description": "element controls by element type, for a file's elements", "type": "object", "additionalProperties": {"$ref": "#/$defs/bme_ElemCtrlParams"}},
        "nodes": {"description": "the nodes in the order of the deck", "$ref": "#/$defs/NODES"},
        "elements": {"description": "the elements type by type, in the order of the deck", "type": "array", "items": {"$ref": "#/$defs/ELEMENTS"}},
        "sets": {"description": "node sets, element sets and surfaces", "type": "array", "items": {"$ref": "#/$defs/SET"}}
      }
    },
    "MEMBERS": {
      "description": "Members of a set of the assembly in one instance; without an instance, in the assembly's own mesh.",
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "instance": {"description": "the instance that they lie in", "$ref": "#/$defs/NAME"},
        "labels": {"description": "nodes or elements", "$ref": "#/$defs/LABELS"},
        "facets": {"description": "faces of elements", "$ref": "#/$defs/FACETS"}
      }
    }
  }
})";

Json Reference(const std::string& definition) {
    return {{"$ref", "#/$defs/" + definition}};
}

Json Nullable(const Json& type) {
    return {{"anyOf", {type, {{"type", "null"}}}}};
}

// What a value in a model file looks like; `base` decides whether a variant needs "class".
class SchemaMaker {
public:
    Json Make() {
        Json schema = Json::parse(kFrame);
        Json& definitions = schema["$defs"];
        definitions["MESH"]["properties"]["surfaceElements"]["enum"] = mdf_SurfaceFamilies();
        definitions["DATUM"] = FrameOf<odiK_Datum>();
        definitions["SET"] = FrameOf<odiK_SetHead>();
        definitions["ASSEMBLY_SET"] = FrameOf<odiK_SetHead>();
        definitions["PART"] = FrameOf<odiK_Part>();
        definitions["INSTANCE"] = FrameOf<odiK_Instance>();
        definitions["ASSEMBLY"] = FrameOf<odiK_Assembly>();
        definitions["MODEL"] = FrameOf<odiK_ModelData>();
        AddMembersOfSets(definitions);
        for (const odiK_Repository& repository : odiK_Repositories()) {
            definitions["MODEL"]["properties"][repository.member] = RepositoryOf(repository);
        }
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.create != nullptr) definitions[entry.info.name] = RecordOf(entry);
        }
        return schema;
    }

private:
    static Json ArrayOf(const Json& item) { return {{"type", "array"}, {"items", item}}; }
    static Json MapOf(const Json& item) { return {{"type", "object"}, {"additionalProperties", item}}; }

    static void AddMembersOfSets(Json& definitions) {
        const Json& members = definitions["MEMBERS"]["properties"];
        for (const char* member : {"labels", "facets"})
            definitions["SET"]["properties"][member] = members[member];
        Json& set = definitions["ASSEMBLY_SET"];
        set["properties"]["members"] = ArrayOf(Reference("MEMBERS"));
        set["properties"]["members"]["description"] = "its members, instance by instance";
        set["required"].push_back("members");
    }

    static Json RepositoryOf(const odiK_Repository& repository) {
        const Json item = VariantOf(repository.ItemTypeId());
        Json schema = repository.IsInOrder() ? ArrayOf(item) : MapOf(item);
        schema["description"] = repository.IsInOrder() ? "the first is the kprC_InitialStep, no other is one"
                                                       : std::string(repository.plural) + " by name";
        if (!repository.ReachesDeck())
            schema["description"] =
                schema["description"].get<std::string>() + "; in no deck: " + repository.whyNotInDeck;
        return schema;
    }

    /// An object of the frame, whose class is known by its place.
    template <class T>
    static Json FrameOf() {
        const T byDefault;
        return ObjectOf(T::Class.doc, T::Fields(), byDefault, Json::object(), Json::array());
    }

    static Json ObjectOf(const char* doc, const cls_FieldTable& fields, const cls_Record& byDefault,
                         Json properties, Json required) {
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

    static Json VariantOf(unsigned base) {
        Json choices = Json::array();
        for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(base)) {
            choices.push_back(Reference(entry->info.name));
        }
        if (choices.size() == 1) return choices.front();
        for (Json& choice : choices) choice["required"] = {"class"};
        return choices.empty() ? Json(false) : Json{{"oneOf", choices}};
    }

    /// The whole name for those who complete it; the short one is taken too.
    static Json ClassOf(const cls_ClassEntry& entry) {
        const std::string shortName = PatternOf(std::string(mdf_ShortClassName(entry)));
        const std::string whole = PatternOf(entry.info.name);
        return {{"description", "the class of the record"},
                {"anyOf",
                 {{{"const", entry.info.name}},
                  {{"type", "string"}, {"pattern", "^(" + whole + "|" + shortName + ")$"}}}}};
    }

    static Json RecordOf(const cls_ClassEntry& entry) {
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
            record["properties"]["states"] = MapOf(StateOf(*object));
            record["properties"]["states"]["description"] = "states by the name of their step";
        }
        return record;
    }

    static Json StateOf(const kprC_PropagatingObject& object) {
        const std::unique_ptr<cls_Record> state(object.NewState(0));
        Json properties = Json::object();
        for (const cls_Field& field : state->DynFields().All()) {
            if (!field.notModelData) properties[field.name] = FieldOf(field, *state);
        }
        properties["deactivated"] = {
            {"description", "true ends the object in this step"}, {"type", "boolean"}, {"default", false}};
        properties["status"] = TypeOf(cls_TypeOf<mdl_PropagationStatusEnm>::Instance(), nullptr);
        properties["status"]["description"] = "takes the place of the status that follows from the states";
        return {{"type", "object"}, {"additionalProperties", false}, {"properties", properties}};
    }

    static Json FieldOf(const cls_Field& field, const cls_Record& byDefault) {
        Json schema = {{"description", field.doc}};
        Json type = TypeOf(*field.type, &field);
        if (cls_IsUnset(*field.type, field.In(byDefault))) {
            type = Nullable(type);
            schema["default"] = nullptr;
        } else {
            const Json value = DefaultOf(*field.type, field.In(byDefault));
            if (!value.is_null() && !field.required) schema["default"] = value;
        }
        if (field.refersTo != nullptr) {
            schema["description"] = std::string(field.doc) + " (name of a " + field.refersTo + ")";
        }
        schema.update(type);
        return schema;
    }

    /// A pattern for the word in any capitals.
    static std::string PatternOf(const std::string& word) {
        std::string pattern;
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
        return pattern;
    }

    static Json DefaultOf(const cls_FieldType& type, const void* value) {
        switch (type.Kind()) {
        case cls_FieldKind::Bool: return *static_cast<const bool*>(value);
        case cls_FieldKind::Int: return *static_cast<const int*>(value);
        case cls_FieldKind::Double: return *static_cast<const double*>(value);
        case cls_FieldKind::Float: return *static_cast<const float*>(value);
        case cls_FieldKind::Enum: {
            const auto& enumeration = static_cast<const cls_EnumType&>(type);
            const omu_EnumRow* row = enumeration.Table().Row(enumeration.Get(value));
            return row == nullptr ? Json() : Json(row->name);
        }
        case cls_FieldKind::String: {
            const auto& text = *static_cast<const cow_String*>(value);
            return text.IsEmpty() ? Json() : Json(text.View());
        }
        default: return {};
        }
    }

    static Json TypeOf(const cls_FieldType& type, const cls_Field* field) {
        switch (type.Kind()) {
        case cls_FieldKind::Bool: return {{"type", "boolean"}};
        case cls_FieldKind::Int: return IntOf(field);
        case cls_FieldKind::Double:
        case cls_FieldKind::Float: return {{"type", "number"}};
        case cls_FieldKind::String: return StringOf(field);
        case cls_FieldKind::Enum: {
            Json values = Json::array();
            for (const omu_EnumRow& row : static_cast<const cls_EnumType&>(type).Table().rows) {
                values.push_back(row.name);
            }
            if (field != nullptr && field->wordsOnly) return {{"enum", values}};
            // Any capitals, the texts and the numbers are taken too.
            return {{"anyOf", {{{"enum", values}}, {{"type", "string"}}, {{"type", "integer"}}}}};
        }
        case cls_FieldKind::Triple: return Reference("TRIPLE");
        case cls_FieldKind::Segment:
            return {{"type", "array"}, {"items", Reference("TRIPLE")}, {"minItems", 2}, {"maxItems", 2}};
        case cls_FieldKind::Complex: return Reference("COMPLEX");
        case cls_FieldKind::Table: return Reference("TABLE");
        case cls_FieldKind::List: {
            Json item = TypeOf(static_cast<const cls_ListType&>(type).ItemType(), nullptr);
            // A null item is the default of its place.
            if (field != nullptr && field->defaultItems != nullptr) item = Nullable(item);
            Json list = {{"type", "array"}, {"items", item}};
            if (field != nullptr && field->length > 0) list["minItems"] = list["maxItems"] = field->length;
            return list;
        }
        case cls_FieldKind::Map:
            return {
                {"type", "object"},
                {"additionalProperties", TypeOf(static_cast<const cls_MapType&>(type).ItemType(), nullptr)}};
        case cls_FieldKind::Record: return VariantOf(static_cast<const cls_HolderType&>(type).ClassId());
        case cls_FieldKind::Optional:
        case cls_FieldKind::Variant:
            return Nullable(VariantOf(static_cast<const cls_HolderType&>(type).ClassId()));
        case cls_FieldKind::Region: return Reference("REGION");
        case cls_FieldKind::Datum: return {{"type", {"string", "null"}}};
        case cls_FieldKind::Attribute: return AttributeOf(static_cast<const cls_AttributeType&>(type), field);
        case cls_FieldKind::Tree: return TreeOf(type, *field);
        }
        return {};
    }

    static Json IntOf(const cls_Field* field) {
        if (field == nullptr || field->meanings.empty()) return Reference("INT");
        Json words = Json::array();
        std::string inAnyCapitals;
        for (const cls_IntMeaning& meaning : field->meanings) {
            const std::string word = mdf_MeaningWord(meaning);
            words.push_back(word);
            inAnyCapitals += (inAnyCapitals.empty() ? "" : "|") + PatternOf(word);
        }
        return {{"anyOf",
                 {Reference("INT"),
                  {{"enum", words}},
                  {{"type", "string"}, {"pattern", "^(" + inAnyCapitals + ")$"}}}}};
    }

    static Json AttributeOf(const cls_AttributeType& type, const cls_Field* field) {
        const Json value = TypeOf(type.ValueType(), field);
        const Json state = TypeOf(cls_TypeOf<mdl_PropAttributeStateEnm>::Instance(), nullptr);
        return {{"anyOf",
                 {value,
                  {{"type", "null"}},
                  {{"type", "object"},
                   {"additionalProperties", false},
                   {"required", {"state"}},
                   {"properties", {{"value", value}, {"state", state}}}}}}};
    }

    static Json StringOf(const cls_Field* field) {
        if (field != nullptr && field->verbatim) return Reference("TEXT");
        if (field != nullptr && field->nameOf != nullptr) return Reference("NAME");
        if (field != nullptr && !field->words.empty()) return {{"enum", field->words}};
        if (field != nullptr && field->freeText) return {{"type", "string"}};
        return Reference("LINE");
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
};

} // namespace

bool mdf_WriteSchema(std::ostream& out) {
    out << SchemaMaker().Make().dump(2) << '\n';
    return static_cast<bool>(out.flush());
}
