#include "model_file/mdf_ModelFile.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

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
        EXPECT_TRUE(Schema().at("$defs").contains(reference.substr(8))) << reference;
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
