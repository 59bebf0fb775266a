#include "model_file/mdf_ClassChoice.h"
#include "model_file/mdf_ModelFile.h"
#include "store_interface/findings/fnd_Text.h"
#include "store_interface/model/odiK_Repositories.h"

#include <gtest/gtest.h>

#include <set>
#include <sstream>

namespace {

void CollectPlaces(const cls_FieldType& type, std::set<unsigned>& places) {
    switch (type.Kind()) {
    case cls_FieldKind::List: CollectPlaces(static_cast<const cls_ListType&>(type).ItemType(), places); break;
    case cls_FieldKind::Map: CollectPlaces(static_cast<const cls_MapType&>(type).ItemType(), places); break;
    case cls_FieldKind::Attribute:
        CollectPlaces(static_cast<const cls_AttributeType&>(type).ValueType(), places);
        break;
    case cls_FieldKind::Record:
    case cls_FieldKind::Optional:
    case cls_FieldKind::Variant: places.insert(static_cast<const cls_HolderType&>(type).ClassId()); break;
    default: break;
    }
}

/// The class that records must derive from, of each place where a model file has one.
std::set<unsigned> Places() {
    std::set<unsigned> places;
    for (const odiK_Repository& repository : odiK_Repositories()) places.insert(repository.ItemTypeId());
    const auto collect = [&places](const cls_FieldTable& fields) {
        for (const cls_Field& field : fields.All()) {
            CollectPlaces(*field.type, places);
            if (field.type->Kind() == cls_FieldKind::Tree && field.refersToClass != nullptr)
                places.insert(field.refersToClass->Id());
        }
    };
    for (const cls_ClassEntry& entry : cls_Classes().All()) {
        if (entry.fields != nullptr) collect(entry.fields());
    }
    for (const cls_FieldTable* frame : {&odiK_ModelData::Fields(), &odiK_Part::Fields(),
                                        &odiK_Instance::Fields(), &odiK_Assembly::Fields()})
        collect(*frame);
    return places;
}

std::string ModelOf(const std::string& members) {
    return R"({"format": "qrx-model/1", "models": {"Default Model": {)" + members + "}}}";
}

/// The canonical form; empty after errors.
std::string Canonical(const std::string& members) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(ModelOf(members), "m.json", report);
    if (odb == nullptr) return {};
    std::ostringstream out;
    mdf_WriteModelFile(*odb, out);
    return out.str();
}

std::string FirstError(const std::string& members) {
    mdf_Report report;
    mdf_ReadModelText(ModelOf(members), "m.json", report);
    for (const fnd_Finding& finding : report.findings) {
        if (finding.IsError()) return finding.Text();
    }
    return {};
}

} // namespace

TEST(ClassNames, WordsOfOnePlace_EachMeanOneClassInAnyCapitals) {
    int words = 0;
    for (const unsigned place : Places()) {
        const mdf_ClassChoice& choice = mdf_ClassChoice::Of(place);
        std::set<std::string> known;
        for (const cls_ClassEntry* entry : choice.Classes()) {
            for (const std::string& word : mdf_ClassChoice::WordsOf(*entry)) {
                SCOPED_TRACE(std::string(cls_Classes().NameOf(place).View()) + ": " + word);
                // The word of a twin is its base's.
                if (mdf_ClassChoice::IsTwin(*entry) && word == entry->info.Word()) continue;
                EXPECT_TRUE(known.insert(fnd_LowerCase(word)).second);
                EXPECT_EQ(choice.Find(word), entry);
                EXPECT_EQ(choice.Find(fnd_LowerCase(word)), entry);
                ++words;
            }
        }
    }
    EXPECT_GT(words, 500);
}

TEST(ClassNames, ShortNamesAndAliases_AreTakenForWholeNames) {
    const std::pair<const char*, const char*> same[] = {
        {R"("sections": {"S": {"class": "kseC_HomogenousSolidSection", "materialName": "M"}})",
         R"("sections": {"S": {"class": "SolidSection", "materialName": "M"}})"},
        {R"("sections": {"S": {"class": "kseC_HomogenousShellSection", "materialName": "M"}})",
         R"("sections": {"S": {"class": "shellsection", "materialName": "M"}})"},
        {R"("boundaryConditions": {"B": {"class": "kbcC_DisplacementBC", "states": {"Initial": {}}}})",
         R"("boundaryConditions": {"B": {"class": "Displacement", "states": {"Initial": {}}}})"},
        {R"("interactions": {"F": {"class": "kinC_FilmCondition", "states": {"S": {}}}})",
         R"("interactions": {"F": {"class": "FILM", "states": {"S": {}}}})"},
        {R"("loads": {"F": {"class": "KLOC_pressure", "states": {"S": {}}}})",
         R"("loads": {"F": {"class": "Pressure", "states": {"S": {}}}})"},
    };
    const std::string steps = R"("materials": {"M": {}}, "steps": [{"name": "Initial", "class": "Initial"},
        {"name": "S", "class": "Static"}], )";
    for (const auto& [whole, shortly] : same) {
        SCOPED_TRACE(shortly);
        const std::string expected = Canonical(steps + whole);
        EXPECT_FALSE(expected.empty());
        EXPECT_EQ(Canonical(steps + shortly), expected);
        EXPECT_EQ(expected.find("C_"), std::string::npos) << expected;
    }
}

TEST(ClassNames, TwinsOfConstraints_KeepTheirClass) {
    const std::string text = Canonical(
        R"("constraints": {"A": {"class": "kcoC_Tie"}, "B": {"class": "odiK_Tie"}, "C": {"class": "Tie"},
                     "D": {"class": "Coupling"}, "E": {"class": "odiK_Coupling"}})");
    std::vector<std::string> classes;
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        const std::size_t place = line.find("\"class\": \"");
        if (place != std::string::npos)
            classes.push_back(line.substr(place + 10, line.rfind('"') - place - 10));
    }
    EXPECT_EQ(classes, (std::vector<std::string>{"Tie", "Tie", "Tie", "Coupling", "odiK_Coupling"}));
    const std::vector<std::string>& names = mdf_ClassChoice::Of(kcoC_Constraint::TypeId()).Names();
    EXPECT_EQ(names, (std::vector<std::string>{"Tie", "Coupling", "RigidBody", "EmbeddedRegion", "Equation",
                                               "ShellSolidCoupling"}));
}

TEST(ClassNames, WrongNames_GetTheNearestShortName) {
    const auto hint = [](const std::string& name) {
        return mdf_ClassChoice::Of(kprC_Step::TypeId()).DidYouMean(name);
    };
    EXPECT_EQ(hint("StaticStp"), "did you mean 'StaticStep'?");
    EXPECT_EQ(hint("kprC_StaticStp"), "did you mean 'StaticStep'?");
    EXPECT_EQ(hint("Buckl"), "did you mean 'Buckle'?");
    EXPECT_EQ(hint("Xyzzy"), "");
    EXPECT_EQ(FirstError(R"("contactControls": {"C": {"class": "Contols"}})"),
              "found 'Contols', expected one of StdContactControls, ExpContactControls");
}

TEST(ClassNames, NamesOfOtherPlaces_AreNotTaken) {
    EXPECT_NE(FirstError(R"("loads": {"L": {"class": "Displacement"}})"), "");
    EXPECT_NE(FirstError(R"("steps": [{"name": "I", "class": "AnalysisStep"}])"), "");
    EXPECT_NE(FirstError(R"("loads": {"L": {"class": "kloC_"}})"), "");
    EXPECT_NE(FirstError(R"("loads": {"L": {"class": ""}})"), "");
}

TEST(ModelChoice, OnlyModel_IsTheOneThatDecksAreWrittenFrom) {
    const auto deckModel = [](const std::string& models, const mdf_ModelChoice& choice) -> std::string {
        mdf_Report report;
        const auto odb = mdf_ReadModelText(R"({"format": "qrx-model/1", "models": {)" + models + "}}",
                                           "m.json", report, {}, choice);
        return odb == nullptr ? "error" : std::string(odb->DeckModelName().View());
    };
    EXPECT_EQ(deckModel(R"("A": {})", {}), "A");
    EXPECT_EQ(deckModel(R"("A": {}, "Default Model": {})", {}), "Default Model");
    EXPECT_EQ(deckModel(R"("A": {}, "Default Model": {})", {"A"}), "A");
    EXPECT_EQ(deckModel(R"("A": {}, "B": {})", {"B"}), "B");
    EXPECT_EQ(deckModel(R"("A": {}, "B": {})", {}), "error");
    EXPECT_EQ(deckModel(R"("A": {})", {"B"}), "error");
    EXPECT_EQ(deckModel(R"("A": {}, "B": {})", {{}, false}), "Default Model");
}

TEST(SchemaMember, OfAFile_IsKeptForWritingItAgain) {
    mdf_Report report;
    const auto odb = mdf_ReadModelText(
        R"({"$schema": "s.json", "format": "qrx-model/1", "models": {"A": {}}})", "m.json", report);
    ASSERT_NE(odb, nullptr);
    std::ostringstream out;
    mdf_WriteModelFile(*odb, out, {}, "", {}, report.schema);
    EXPECT_TRUE(out.str().starts_with("{\n  \"$schema\": \"s.json\",\n  \"format\": ")) << out.str();
    report = {};
    EXPECT_EQ(mdf_ReadModelText(R"({"$schema": 1, "format": "qrx-model/1", "models": {"A": {}}})", "m.json",
                                report),
              nullptr);
    EXPECT_EQ(report.findings.front().place, "/$schema");
}
