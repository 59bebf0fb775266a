// What model files know, for people to read: classes by the place where they stand, and one class as a table.
// The table is drawn from the schema, so that both say the same.
#include "model_file/mdf_ClassChoice.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/findings/fnd_Nearest.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odiK_Repositories.h"
#include "tools/Commands.h"
#include "tools/Terminal.h"
#include "tools/WrappedTable.h"

#include <sstream>

using nlohmann::ordered_json;

namespace {

/// Classes that may stand at one place.
struct Family {
    std::string name;
    std::string title;
    /// Names as files say them, and what they are for.
    std::vector<std::pair<std::string, std::string>> entries;
};

Family FamilyOf(const std::string& name, const std::string& title, unsigned base) {
    Family family{name, title, {}};
    for (const cls_ClassEntry* entry : mdf_ClassChoice::Of(base).Classes()) {
        if (!mdf_ClassChoice::IsTwin(*entry))
            family.entries.emplace_back(entry->info.Word(), entry->info.doc);
    }
    return family;
}

/// The options of a material are known by the names of its fields.
Family MaterialOptions() {
    Family family{"materials", "options of a material, by the member that holds each", {}};
    for (const cls_Field& field : kmaC_Material::Fields().All())
        family.entries.emplace_back(field.name, field.doc);
    return family;
}

const cls_HolderType* HolderIn(const cls_FieldType& type) {
    switch (type.Kind()) {
    case cls_FieldKind::Variant: return static_cast<const cls_HolderType*>(&type);
    case cls_FieldKind::List: return HolderIn(static_cast<const cls_ListType&>(type).ItemType());
    default: return nullptr;
    }
}

std::vector<Family> Families() {
    std::vector<Family> families;
    const auto add = [&families](Family family) {
        const auto same = [&](const Family& other) { return other.name == family.name; };
        if (std::ranges::none_of(families, same)) families.push_back(std::move(family));
    };
    for (const odiK_Repository& repository : odiK_Repositories()) {
        if (repository.ItemTypeId() == kmaC_Material::TypeId()) {
            add(MaterialOptions());
        } else {
            add(FamilyOf(repository.member, repository.plural, repository.ItemTypeId()));
        }
    }
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.create == nullptr) continue;
        for (const cls_Field& field : entry.fields().All()) {
            const cls_HolderType* holder = HolderIn(*field.type);
            if (holder == nullptr || mdf_ClassChoice::Of(holder->ClassId()).Classes().size() < 2) continue;
            add(FamilyOf(field.name, field.doc, holder->ClassId()));
        }
    }
    return families;
}

std::string TextOf(const Family& family, bool colours) {
    std::string text = Emphasis(family.name, colours) + ": " + family.title + "\n";
    WrappedTable table;
    for (const auto& [name, doc] : family.entries) table.Row({name, doc});
    return text + table.Text(colours);
}

ordered_json SchemaOfFiles() {
    std::ostringstream text;
    mdf_WriteSchema(text);
    return ordered_json::parse(text.str());
}

/// What a schema calls a definition that it refers to; empty when it is no reference.
std::string TargetOf(const ordered_json& schema) {
    constexpr std::size_t kLead = std::string_view("#/$defs/").size();
    return schema.contains("$ref") ? schema["$ref"].get<std::string>().substr(kLead) : std::string();
}

/// JSON as people write it: what fits a line stands in one.
std::string LaidOut(const ordered_json& value, const std::string& indent) {
    if (!value.is_structured() || value.empty()) return value.dump();
    const auto joined = [&](const char* separator, const std::string& inner) {
        std::string text;
        for (const auto& [name, item] : value.items()) {
            text += (text.empty() ? "" : separator) +
                    (value.is_object() ? ordered_json(name).dump() + ": " : std::string()) +
                    LaidOut(item, inner);
        }
        return text;
    };
    const char* ends = value.is_object() ? "{}" : "[]";
    std::string line = ends[0] + joined(", ", indent) + ends[1];
    if (line.find('\n') == std::string::npos && indent.size() + line.size() < TextWidth() - 20) return line;
    const std::string inner = indent + "  ";
    return ends[0] + ("\n" + inner) + joined((",\n" + inner).c_str(), inner) + "\n" + indent + ends[1];
}

/// One class, or one part of the frame, out of the schema.
class ClassTable {
public:
    ClassTable(const ordered_json& definitions, const std::string& name, bool colours)
        : definitions_(definitions), definition_(definitions[name]), colours_(colours) {}

    std::string Text(const std::string& heading) const {
        std::string text = heading + Wrapped(definition_["description"]) + "\n";
        const ordered_json& properties = definition_["properties"];
        text += "\n" + FieldsText(definition_);
        if (properties.contains("states")) {
            const std::string state = TargetOf(properties["states"]["additionalProperties"]);
            text +=
                "\n" + Emphasis("In each of the states", colours_) + "\n" + FieldsText(definitions_[state]);
        }
        const ordered_json& examples = definition_.value("examples", ordered_json::array());
        if (!examples.empty())
            text += "\n" + Emphasis("Example", colours_) + "\n  " + LaidOut(examples[0], "  ") + "\n";
        return text;
    }

private:
    std::string FieldsText(const ordered_json& object) const {
        WrappedTable table;
        table.Heading({"member", "value", "default", "meaning"});
        const ordered_json required = object.value("required", ordered_json::array());
        for (const auto& [name, field] : object["properties"].items()) {
            const bool isNeeded = std::find(required.begin(), required.end(), name) != required.end();
            const std::string byDefault = isNeeded                    ? "(needed)"
                                          : field.contains("default") ? field["default"].dump()
                                                                      : "";
            std::string meaning = field.value("description", "");
            const std::string words = WordsOf(field);
            if (!words.empty()) meaning += (meaning.empty() ? "" : ": ") + words;
            table.Row({name, TypeOf(field), byDefault, meaning});
        }
        return table.Text(colours_);
    }

    /// The words of an enumeration.
    std::string WordsOf(const ordered_json& schema) const {
        const std::string target = TargetOf(schema);
        if (!target.empty()) {
            const bool isObject = definitions_[target].contains("properties");
            return isObject || target == "COMPLEX" ? std::string() : WordsOf(definitions_[target]);
        }
        std::string words;
        const ordered_json alone = ordered_json::array({schema});
        for (const ordered_json& choice : schema.contains("anyOf") ? schema["anyOf"] : alone) {
            if (choice.contains("enum") && choice["enum"][0].is_string()) {
                for (const ordered_json& word : choice["enum"]) {
                    words += (words.empty() ? "" : ", ") + word.get<std::string>();
                }
                return words;
            }
            if (choice.contains("$ref")) words = WordsOf(choice);
            if (!words.empty()) return words;
        }
        return words;
    }

    /// "number", "list of regions", "number or null": a few words.
    std::string TypeOf(const ordered_json& schema) const {
        const std::string target = TargetOf(schema);
        if (!target.empty()) return TypeOfDefinition(target);
        if (schema.contains("anyOf")) return TypeOfChoice(schema["anyOf"]);
        if (schema.contains("enum") || schema.contains("const")) return "word";
        if (!schema.contains("type")) return "";
        if (schema["type"].is_array()) return "name or null";
        std::string type = schema["type"];
        if (type == "array") return "list of " + TypeOf(schema["items"]);
        if (type == "boolean") return "true, false";
        if (type == "string") return "text";
        if (type == "object" && schema.contains("additionalProperties") &&
            schema["additionalProperties"].is_object())
            return TypeOf(WithoutNull(schema["additionalProperties"])) + " by name";
        return type;
    }

    static const ordered_json& WithoutNull(const ordered_json& schema) {
        return schema.contains("anyOf") ? schema["anyOf"][0] : schema;
    }

    std::string TypeOfChoice(const ordered_json& choices) const {
        const std::string first = TypeOf(choices[0]);
        const bool mayBeNull = std::any_of(choices.begin(), choices.end(), [](const ordered_json& choice) {
            return choice.contains("type") && choice["type"] == "null";
        });
        return mayBeNull && !first.ends_with(" or null") ? first + " or null" : first;
    }

    std::string TypeOfDefinition(const std::string& target) const {
        static const std::pair<const char*, const char*> kWords[] = {
            {"NAME", "name"},          {"LINE", "text"},      {"TEXT", "deck text"},
            {"INT", "whole number"},   {"TRIPLE", "x, y, z"}, {"TABLE", "table"},
            {"LABELS", "labels"},      {"FACETS", "facets"},  {"REGION", "region"},
            {"REGIONS", "region"},     {"REFERENCE", "name"}, {"COMPLEX", "complex number"},
            {"POINTERS", "pointer(s)"}};
        for (const auto& [name, words] : kWords) {
            if (target == name) return words;
        }
        const ordered_json& definition = definitions_[target];
        if (definition.contains("anyOf")) return TypeOfChoice(definition["anyOf"]);
        if (target.starts_with("ANY_")) return ShortName(target.substr(4));
        return ShortName(target);
    }

    static std::string ShortName(const std::string& whole) {
        const cls_ClassEntry* entry = cls_Classes().FindByName(whole);
        return entry == nullptr ? whole : std::string(entry->info.Word());
    }

    const ordered_json& definitions_;
    const ordered_json& definition_;
    bool colours_;
};

/// The definitions that a word means: of the frame, or of classes by short name, whole name, or alias.
std::vector<std::string> DefinitionsOf(const std::string& word, const ordered_json& definitions) {
    constexpr const char* kFrame[] = {"MODEL", "PART",     "INSTANCE", "ASSEMBLY",     "DATUM",  "MESH",
                                      "NODES", "ELEMENTS", "SET",      "ASSEMBLY_SET", "REGION", "LABELS"};
    for (const char* name : kFrame) {
        if (omu_EqualInAnyCapitals(name, word) && definitions[name].contains("properties")) return {name};
    }
    std::vector<std::string> byName;
    std::vector<std::string> byAlias;
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.create == nullptr) continue;
        const std::vector<std::string> words = mdf_ClassChoice::WordsOf(entry);
        for (std::size_t i = 0; i < words.size(); ++i) {
            if (!omu_EqualInAnyCapitals(words[i], word)) continue;
            (i < 2 ? byName : byAlias).emplace_back(entry.info.name);
            break;
        }
    }
    return byName.empty() ? byAlias : byName;
}

std::string HeadingOf(const std::string& name, bool colours) {
    const cls_ClassEntry* entry = cls_Classes().FindByName(name);
    if (entry == nullptr) return Emphasis(fnd_LowerCase(name), colours) + "\n";
    const std::vector<std::string> words = mdf_ClassChoice::WordsOf(*entry);
    std::string others;
    for (std::size_t i = 1; i < words.size(); ++i) others += (i == 1 ? "also " : ", ") + words[i];
    return Emphasis(words.front(), colours) + " (" + others + ")\n";
}

} // namespace

std::vector<std::string> ClassFamilies() {
    std::vector<std::string> names;
    for (const Family& family : Families()) names.push_back(family.name);
    return names;
}

std::vector<std::string> ClassNames() {
    return mdf_ClassChoice::Of(cls_Record::TypeId()).Names();
}

ExitCode RunClasses(const std::string& family, RunReport& report) {
    std::vector<std::string> known;
    bool isFound = family.empty();
    std::string text;
    ordered_json& all = report.Member("classes") = ordered_json::object();
    for (const Family& each : Families()) {
        known.push_back(each.name);
        if (!family.empty() && !omu_EqualInAnyCapitals(each.name, family)) continue;
        isFound = true;
        text += (text.empty() ? "" : "\n") + TextOf(each, report.OutputHasColours());
        for (const auto& [name, doc] : each.entries) all[each.name][name] = doc;
    }
    if (!isFound) {
        const std::string nearest = fnd_DidYouMean(family, known);
        std::string names;
        for (const std::string& name : known) names += (names.empty() ? "" : ", ") + name;
        report.Error("qrxdeck", "there is no family " + fnd_Quoted(family) + "; " +
                                    (nearest.empty() ? "" : nearest + " ") + "The families are " + names);
        return ExitCode::WRONG_USAGE;
    }
    report.Print(text);
    return ExitCode::DONE;
}

ExitCode RunSchemaOf(const std::string& className, RunReport& report) {
    const ordered_json schema = SchemaOfFiles();
    const ordered_json& definitions = schema["$defs"];
    const std::vector<std::string> names = DefinitionsOf(className, definitions);
    if (names.empty()) {
        const mdf_ClassChoice& choice = mdf_ClassChoice::Of(cls_Record::TypeId());
        const std::string nearest = choice.DidYouMean(className);
        report.Error("qrxdeck",
                     "there is no class " + fnd_Quoted(className) + "; " +
                         (nearest.empty() ? std::string("\"qrxdeck classes\" lists them") : nearest));
        return ExitCode::WRONG_USAGE;
    }
    const bool colours = report.OutputHasColours();
    std::string text;
    ordered_json& told = report.Member("classes") = ordered_json::object();
    for (const std::string& name : names) {
        told[name] = definitions[name];
        text += (text.empty() ? "" : "\n") +
                ClassTable(definitions, name, colours).Text(HeadingOf(name, colours));
    }
    report.Print(text);
    return ExitCode::DONE;
}
