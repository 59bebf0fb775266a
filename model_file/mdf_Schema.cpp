#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_RecordReader.h"

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
    "format": {"const": "qrx-model/1"},
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
    "TEXT": {
      "description": "Deck text: a string as it stands, or an array of strings, each of which becomes a line.",
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
            "form": {"anyOf": [{"enum": ["RECTANGULAR", "POLAR"]}, {"type": "string"}, {"type": "integer"}], "default": "RECTANGULAR"},
            "real": {"type": "number", "default": 0},
            "imag": {"type": "number", "default": 0}
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
            "from": {"type": "integer", "minimum": 1},
            "to": {"type": "integer", "minimum": 1},
            "by": {"type": "integer", "minimum": 1, "default": 1}
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
          "properties": {"instance": {"$ref": "#/$defs/NAME"}, "set": {"$ref": "#/$defs/NAME"}}
        }
      ]
    },
    "DATUM": {
      "description": "A coordinate system, point, axis or plane. A csys takes origin and axes, a point its origin, an axis origin and xAxis (its direction), a plane origin and zAxis (its normal).",
      "type": "object",
      "additionalProperties": false,
      "required": ["name"],
      "properties": {
        "name": {"$ref": "#/$defs/NAME"},
        "type": {"enum": ["csys", "point", "axis", "plane"], "default": "csys"},
        "system": {"enum": ["rectangular", "cylindrical", "spherical"], "default": "rectangular"},
        "origin": {"$ref": "#/$defs/TRIPLE"},
        "xAxis": {"$ref": "#/$defs/TRIPLE"},
        "yAxis": {"$ref": "#/$defs/TRIPLE"},
        "zAxis": {"$ref": "#/$defs/TRIPLE"}
      }
    },
    "NODES": {
      "description": "User labels, and for each three coordinates (single precision).",
      "type": "object",
      "additionalProperties": false,
      "required": ["labels", "coordinates"],
      "properties": {
        "labels": {"$ref": "#/$defs/LABELS"},
        "coordinates": {"type": "array", "items": {"$ref": "#/$defs/TRIPLE"}}
      }
    },
    "ELEMENTS": {
      "description": "Elements of one type, each with a row of node labels. In the assembly's mesh an end may be a text: instance, dot, label.",
      "type": "object",
      "additionalProperties": false,
      "required": ["type", "labels", "connectivity"],
      "properties": {
        "type": {"$ref": "#/$defs/NAME"},
        "labels": {"$ref": "#/$defs/LABELS"},
        "connectivity": {
          "type": "array",
          "items": {"type": "array", "items": {"type": ["integer", "string"]}, "minItems": 1}
        },
        "controls": {"$ref": "#/$defs/bme_ElemCtrlParams"}
      }
    },
    "SET": {
      "description": "A named set of a mesh.",
      "type": "object",
      "additionalProperties": false,
      "required": ["name", "kind"],
      "properties": {
        "name": {"$ref": "#/$defs/NAME"},
        "kind": {"enum": ["node", "element", "surface"]},
        "internal": {"type": "boolean", "default": false},
        "labels": {"$ref": "#/$defs/LABELS"},
        "facets": {"$ref": "#/$defs/FACETS"}
      }
    },
    "ASSEMBLY_SET": {
      "description": "A named set of the assembly; a member without an instance lies in the assembly's own mesh.",
      "type": "object",
      "additionalProperties": false,
      "required": ["name", "kind", "members"],
      "properties": {
        "name": {"$ref": "#/$defs/NAME"},
        "kind": {"enum": ["node", "element", "surface"]},
        "internal": {"type": "boolean", "default": false},
        "members": {
          "type": "array",
          "items": {
            "type": "object",
            "additionalProperties": false,
            "properties": {
              "instance": {"$ref": "#/$defs/NAME"},
              "labels": {"$ref": "#/$defs/LABELS"},
              "facets": {"$ref": "#/$defs/FACETS"}
            }
          }
        }
      }
    },
    "MESH": {
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "nodes": {"$ref": "#/$defs/NODES"},
        "elements": {"type": "array", "items": {"$ref": "#/$defs/ELEMENTS"}},
        "sets": {"type": "array", "items": {"$ref": "#/$defs/SET"}}
      }
    },
    "PART": {
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "solverInput": {"$ref": "#/$defs/TEXT"},
        "mesh": {"$ref": "#/$defs/MESH"},
        "sectionAssignments": {"type": "array", "items": {"$ref": "#/$defs/ptoC_SectionAssignment"}},
        "materialOrientations": {"type": "array", "items": {"$ref": "#/$defs/ptoC_MaterialOrientation"}},
        "beamOrientations": {"type": "array", "items": {"$ref": "#/$defs/ptoC_BeamOrientation"}}
      }
    },
    "INSTANCE": {
      "description": "An instance of a part. What it gives of its own takes the place of the part's.",
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "part": {"$ref": "#/$defs/NAME"},
        "partInstance": {"description": "false for an entry that is no part instance", "type": "boolean", "default": true},
        "translation": {"description": "length, single precision", "$ref": "#/$defs/TRIPLE"},
        "rotation": {"description": "rotation vector through the origin: its direction is the axis, its length the angle in radians; applied before the translation", "$ref": "#/$defs/TRIPLE"},
        "solverInput": {"$ref": "#/$defs/TEXT"},
        "mesh": {"$ref": "#/$defs/MESH"},
        "sectionAssignments": {"type": "array", "items": {"$ref": "#/$defs/ptoC_SectionAssignment"}},
        "materialOrientations": {"type": "array", "items": {"$ref": "#/$defs/ptoC_MaterialOrientation"}},
        "beamOrientations": {"type": "array", "items": {"$ref": "#/$defs/ptoC_BeamOrientation"}}
      }
    },
    "ASSEMBLY": {
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "name": {"$ref": "#/$defs/NAME", "default": "Assembly"},
        "solverInput": {"$ref": "#/$defs/TEXT"},
        "instances": {"type": "object", "additionalProperties": {"$ref": "#/$defs/INSTANCE"}},
        "mesh": {"$ref": "#/$defs/MESH"},
        "sets": {"type": "array", "items": {"$ref": "#/$defs/ASSEMBLY_SET"}},
        "sectionAssignments": {"type": "array", "items": {"$ref": "#/$defs/ptoC_SectionAssignment"}},
        "connectorOrientations": {"type": "array", "items": {"$ref": "#/$defs/ptoC_ConnectorOrientation"}}
      }
    },
    "MODEL": {
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "description": {"description": "for people; never in the deck", "type": "string"},
        "topLevelSolverInput": {"description": "opening text of the deck", "$ref": "#/$defs/TEXT"},
        "solverInput": {"description": "text that closes the model section", "$ref": "#/$defs/TEXT"},
        "absoluteZero": {"description": "absolute zero on the temperature scale in use", "type": "number", "default": 0},
        "stefanBoltzmann": {"type": "number", "default": 0},
        "waveFormulation": {"enum": ["NOT_SET", "SCATTERED", "TOTAL"], "default": "NOT_SET"},
        "restartJob": {"type": "string"},
        "restartStep": {"type": "string"},
        "restartIncrement": {"$ref": "#/$defs/INT"},
        "endRestartStep": {"type": "boolean"},
        "globalJob": {"type": "string"},
        "shellToSolid": {"type": "boolean"},
        "analysisProduct": {"description": "without it EXPLICIT when an analysis step is explicit, else STANDARD", "anyOf": [{"enum": ["STANDARD", "IMPLICIT", "EXPLICIT"]}, {"type": "integer"}]},
        "datums": {"type": "array", "items": {"$ref": "#/$defs/DATUM"}},
        "parts": {"type": "object", "additionalProperties": {"$ref": "#/$defs/PART"}},
        "assembly": {"$ref": "#/$defs/ASSEMBLY"},
        "cyclicSymmetry": {"$ref": "#/$defs/ddb_ModelSectorDefinition"}
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
        Json& model = definitions["MODEL"]["properties"];
        const std::pair<const char*, unsigned> containers[] = {
            {"materials", kmaC_Material::TypeId()},
            {"sections", kseC_Section::TypeId()},
            {"beamProfiles", kbpC_BeamProfile::TypeId()},
            {"amplitudes", kamC_Amplitude::TypeId()},
            {"constraints", kcoC_Constraint::TypeId()},
            {"contactControls", kinC_ContactControls::TypeId()},
            {"contactInitializations", kinC_ContactInitialization::TypeId()},
            {"interactionProperties", kinC_InteractionProperty::TypeId()},
            {"timePoints", kprC_TimePoint::TypeId()},
            {"adaptiveMeshControls", kadC_AdptMeshCtrl::TypeId()},
            {"boundaryConditions", kbcC_BC::TypeId()},
            {"loads", kloC_Load::TypeId()},
            {"fields", kpfC_Field::TypeId()},
            {"interactions", kinC_Interaction::TypeId()},
            {"fieldOutputRequests", korC_FieldOutput::TypeId()},
            {"historyOutputRequests", korC_HistoryOutput::TypeId()},
            {"adaptiveMeshConstraints", kprC_AdptMeshCons::TypeId()},
        };
        for (const auto& [member, base] : containers) {
            model[member] = {{"type", "object"}, {"additionalProperties", VariantOf(base)}};
        }
        Json step = VariantOf(kprC_Step::TypeId());
        model["steps"] = {{"description", "the first is the kprC_InitialStep, no other is one"},
                          {"type", "array"},
                          {"items", step}};
        for (const cls_ClassEntry& entry : cls_Classes().All()) {
            if (entry.create != nullptr) definitions[entry.info.name] = RecordOf(entry);
        }
        return schema;
    }

private:
    static Json VariantOf(unsigned base) {
        Json choices = Json::array();
        for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(base)) {
            choices.push_back(Reference(entry->info.name));
        }
        if (choices.size() == 1) return choices.front();
        for (Json& choice : choices) choice["required"] = {"class"};
        return choices.empty() ? Json(false) : Json{{"oneOf", choices}};
    }

    static Json RecordOf(const cls_ClassEntry& entry) {
        const std::unique_ptr<cls_Record> byDefault(entry.create());
        Json record = {{"description", entry.info.doc}, {"type", "object"}, {"additionalProperties", false}};
        Json properties = Json::object();
        Json required = Json::array();
        // "class" may be left out where only one class is possible.
        properties["class"] = {{"const", entry.info.name}};
        if (cls_Classes().InheritanceCheck(entry.info.Id(), kprC_Step::TypeId())) {
            properties["name"] = Reference("NAME");
            required = {"name", "class"};
        }
        for (const cls_Field& field : entry.fields().All()) {
            if (field.notModelData) continue;
            properties[field.name] = FieldOf(field, *byDefault);
            if (field.required) required.push_back(field.name);
        }
        if (const auto* object = nex_canDynamicCastPtr<kprC_PropagatingObject>(byDefault.get())) {
            properties["states"] = {{"description", "states by the name of their step"},
                                    {"type", "object"},
                                    {"additionalProperties", StateOf(*object)}};
        }
        if (!required.empty()) record["required"] = required;
        record["properties"] = properties;
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
            if (!value.is_null()) schema["default"] = value;
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
        default: return {};
        }
    }

    static Json TypeOf(const cls_FieldType& type, const cls_Field* field) {
        switch (type.Kind()) {
        case cls_FieldKind::Bool: return {{"type", "boolean"}};
        case cls_FieldKind::Int: {
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
        case cls_FieldKind::Double:
        case cls_FieldKind::Float: return {{"type", "number"}};
        case cls_FieldKind::String:
            return field != nullptr && field->verbatim ? Reference("TEXT") : Json{{"type", "string"}};
        case cls_FieldKind::Enum: {
            Json values = Json::array();
            for (const omu_EnumRow& row : static_cast<const cls_EnumType&>(type).Table().rows) {
                values.push_back(row.name);
            }
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
        case cls_FieldKind::Attribute: {
            const Json value = TypeOf(static_cast<const cls_AttributeType&>(type).ValueType(), field);
            const Json state = TypeOf(cls_TypeOf<mdl_PropAttributeStateEnm>::Instance(), nullptr);
            return {{"anyOf",
                     {value,
                      {{"type", "null"}},
                      {{"type", "object"},
                       {"additionalProperties", false},
                       {"required", {"state"}},
                       {"properties", {{"value", value}, {"state", state}}}}}}};
        }
        }
        return {};
    }
};

} // namespace

bool mdf_WriteSchema(std::ostream& out) {
    out << SchemaMaker().Make().dump(2) << '\n';
    return static_cast<bool>(out.flush());
}
