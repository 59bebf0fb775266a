#include "model_file/mdf_ModelFile.h"
#include "model_file/mdf_Parser.h"
#include "model_file/mdf_RecordReader.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/interactions/kinC_ContactExp.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <regex>
#include <set>
#include <sstream>

namespace {

using Json = nlohmann::json;

const Json& Schema() {
    static const Json schema = [] {
        std::ostringstream out;
        EXPECT_TRUE(mdf_WriteSchema(out));
        return Json::parse(out.str());
    }();
    return schema;
}

/// Calls `visit(name, property)` for all members that objects of the schema may have.
template <class Visit>
void ForEachProperty(const Json& place, const std::string& path, const Visit& visit) {
    if (place.is_array()) {
        for (const Json& item : place) ForEachProperty(item, path, visit);
    }
    if (!place.is_object()) return;
    for (const auto& [name, member] : place.items()) {
        if (name == "examples" || name == "default" || name == "if") continue;
        // A class may have a field of the name.
        if (name == "properties" && !path.ends_with("/properties")) {
            for (const auto& [field, schema] : member.items()) {
                visit(path + "/" + field, schema);
                ForEachProperty(schema, path + "/" + field, visit);
            }
        } else {
            ForEachProperty(member, path + "/" + name, visit);
        }
    }
}

bool IsNumber(const cls_FieldType& type) {
    switch (type.Kind()) {
    case cls_FieldKind::Double:
    case cls_FieldKind::Float:
    case cls_FieldKind::Complex: return true;
    case cls_FieldKind::List: return IsNumber(static_cast<const cls_ListType&>(type).ItemType());
    case cls_FieldKind::Attribute: return IsNumber(static_cast<const cls_AttributeType&>(type).ValueType());
    default: return false;
    }
}

/// The targets of all references below a place.
void CollectReferences(const Json& place, std::vector<std::string>& references) {
    if (place.is_object()) {
        for (const auto& [name, member] : place.items()) {
            if (name == "$ref" && member.is_string()) references.push_back(member.get<std::string>());
            CollectReferences(member, references);
        }
    } else if (place.is_array()) {
        for (const Json& item : place) CollectReferences(item, references);
    }
}

} // namespace

TEST(ModelFileSchema, Text_IsJsonOfTheNewestDraft) {
    EXPECT_EQ(Schema().at("$schema"), "https://json-schema.org/draft/2020-12/schema");
    EXPECT_EQ(Schema().at("type"), "object");
}

TEST(ModelFileSchema, EveryConcreteClass_HasADocumentedDefinition) {
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.create == nullptr) continue;
        ASSERT_TRUE(Schema().at("$defs").contains(entry.info.name)) << entry.info.name;
        const Json& definition = Schema().at("$defs").at(entry.info.name);
        EXPECT_EQ(definition.at("description"), entry.info.doc);
        EXPECT_EQ(definition.at("additionalProperties"), false);
    }
}

TEST(ModelFileSchema, EveryField_IsThereWithItsDocumentation) {
    int fields = 0;
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.create == nullptr) continue;
        const Json& properties = Schema().at("$defs").at(entry.info.name).at("properties");
        for (const cls_Field& field : entry.fields().All()) {
            SCOPED_TRACE(std::string(entry.info.name) + "::" + field.name);
            EXPECT_EQ(properties.contains(field.name), !field.notModelData);
            if (field.notModelData) continue;
            ++fields;
            const std::string description = properties.at(field.name).value("description", "");
            EXPECT_FALSE(description.empty());
            EXPECT_TRUE(description.starts_with(field.doc)) << description;
        }
    }
    EXPECT_GT(fields, 40);
}

TEST(ModelFileSchema, ListsWithDefaults_TakeNullItemsAndOthersDoNot) {
    const auto items = [](const char* className, const char* field) {
        return Schema().at("$defs").at(className).at("properties").at(field).at("items");
    };
    const Json number = {{"type", "number"}};
    EXPECT_EQ(items("kprC_TypicalControls", "lineSearch"), (Json{{"anyOf", {number, {{"type", "null"}}}}}));
    EXPECT_EQ(items("kprC_FrequencyStep", "residualModeSets"), (Json{{"$ref", "#/$defs/LINE"}}));
}

TEST(ModelFileSchema, EveryReference_HasItsDefinition) {
    std::vector<std::string> references;
    CollectReferences(Schema(), references);
    ASSERT_FALSE(references.empty());
    for (const std::string& reference : references) {
        ASSERT_TRUE(reference.starts_with("#/$defs/")) << reference;
        EXPECT_TRUE(Schema().contains(Json::json_pointer(reference.substr(1)))) << reference;
        EXPECT_EQ(reference.find(' '), std::string::npos) << reference;
    }
}

TEST(ModelFileSchema, EveryMemberOfTheFrame_HasADocumentation) {
    for (const char* name : {"MODEL", "DATUM", "PART", "INSTANCE", "ASSEMBLY", "MESH", "NODES", "ELEMENTS",
                             "SET", "ASSEMBLY_SET", "MEMBERS"}) {
        const Json& definition = Schema().at("$defs").at(name);
        EXPECT_FALSE(definition.value("description", "").empty()) << name;
        EXPECT_EQ(definition.at("additionalProperties"), false) << name;
        for (const auto& [member, schema] : definition.at("properties").items())
            EXPECT_FALSE(schema.value("description", "").empty()) << name << ": " << member;
    }
    const Json& step = Schema().at("$defs").at("kprC_InitialStep").at("properties");
    for (const char* member : {"name", "class", "description", "suppressed", "solverInput"})
        EXPECT_FALSE(step.at(member).value("description", "").empty()) << member;
}

TEST(ModelFileSchema, Repositories_OfAModel_AreMembersOfIt) {
    const Json& members = Schema().at("$defs").at("MODEL").at("properties");
    for (const odiK_Repository& repository : odiK_Repositories()) {
        ASSERT_TRUE(members.contains(repository.member)) << repository.member;
        EXPECT_EQ(members.at(repository.member).at("type"), repository.IsInOrder() ? "array" : "object");
    }
}

TEST(ModelFileSchema, EveryMemberOfEveryObject_IsDescribed) {
    int members = 0;
    ForEachProperty(Schema(), "", [&](const std::string& path, const Json& schema) {
        ++members;
        EXPECT_FALSE(schema.value("description", "").empty()) << path;
    });
    EXPECT_GT(members, 2000);
}

TEST(ModelFileSchema, Size_LeavesRoomForEditors) {
    std::ostringstream out;
    mdf_WriteSchema(out);
    EXPECT_LT(out.str().size(), 1'000'000U);
}

TEST(ModelFileSchema, EveryNumber_SaysItsUnit) {
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.fields == nullptr) continue;
        for (const cls_Field& field : entry.fields().All()) {
            if (field.notModelData || !IsNumber(*field.type)) continue;
            EXPECT_NE(field.unit, nullptr) << entry.info.name << "::" << field.name;
        }
    }
}

TEST(ModelFileSchema, Descriptions_SayWordsWhereFilesDo) {
    const std::regex number("(^|[ ,;:(])[0-9]:? (is|are|for|means|none|off|on|writes|nothing|=) ");
    const std::regex whole("\\bk[a-z]{2}C_");
    const std::regex notWritten("([A-Z][A-Z_0-9]+) (is not written|writes nothing)");
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.create == nullptr) continue;
        const std::unique_ptr<cls_Record> byDefault(entry.create());
        for (const cls_Field& field : entry.fields().All()) {
            SCOPED_TRACE(std::string(entry.info.name) + "::" + field.name);
            const std::string doc = field.doc;
            EXPECT_FALSE(std::regex_search(doc, whole)) << doc;
            const bool hasWords = field.type->Kind() == cls_FieldKind::Enum || !field.meanings.empty();
            EXPECT_FALSE(hasWords && std::regex_search(doc, number)) << doc;
            std::smatch found;
            if (field.type->Kind() != cls_FieldKind::Enum || !std::regex_search(doc, found, notWritten))
                continue;
            // What is left out of a deck is the default.
            const auto& type = static_cast<const cls_EnumType&>(*field.type);
            EXPECT_EQ(found[1], type.Table().Row(type.Get(field.In(*byDefault)))->name) << doc;
        }
    }
}

TEST(ModelFileSchema, ExamplesOfClasses_AreReadWithoutErrors) {
    // Of what an example refers to only the steps and a datum are there.
    const std::set<std::string> ofReferences = {"no-such-name", "no-such-set"};
    odiK_Model model("M");
    model.steps.Append("Initial", kprC_InitialStep());
    model.steps.Append("Step-1", kprC_StaticStep());
    odiK_Datum datum;
    datum.name = "Cylinder";
    model.AddDatum(datum);
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        // The pairs of this state are the object's, with whose example it is read.
        if (entry.create == nullptr || entry.info.Id() == kinC_ContactExpState::TypeId()) continue;
        SCOPED_TRACE(entry.info.name);
        const Json& definition = Schema().at("$defs").at(entry.info.name);
        ASSERT_EQ(definition.at("examples").size(), 1U);
        Json example = definition.at("examples").at(0);
        example.erase("class");
        example.erase("name");
        const bool hasStates = example.contains("states");
        mdf_Value json;
        std::vector<fnd_Finding> problems;
        mdf_Parse(example.dump(), json, problems);
        mdf_Report report;
        mdf_Diagnostics diagnostics(report);
        mdf_RecordReader reader(model, diagnostics);
        const std::unique_ptr<cls_Record> record(entry.create());
        const fnd_Path top;
        reader.ReadRecord(*record, json, top, {"name", "states"});
        if (hasStates)
            reader.ReadStates(static_cast<kprC_PropagatingObject&>(*record), *json.Find("states"), top);
        for (const fnd_Finding& finding : report.findings) {
            EXPECT_FALSE(finding.IsError() && ofReferences.count(std::string(finding.code->name)) == 0)
                << report.Line(finding);
        }
    }
}
