#include "deck_checks/dck_Check.h"

#include "store_interface/model/odb_Odb.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

#include <algorithm>
#include <set>

namespace {

using Texts = std::vector<std::string>;

/// "code place: text" of each finding of a store.
Texts Found(const odb_Odb& odb) {
    Texts found;
    const std::string root = "/models/Default Model";
    for (const fnd_Finding& finding : dck_Check(odb)) {
        EXPECT_EQ(finding.place.substr(0, root.size()), root);
        found.push_back(std::string(finding.code->name) + " " + finding.place.substr(root.size()) + ": " +
                        finding.Text());
    }
    return found;
}

} // namespace

TEST(Check, EmptyStore_HasNothingToSay) {
    TestStore store;
    EXPECT_EQ(Found(store.odb), Texts{});
}

TEST(Check, WhatTheModelIgnores_IsNotTold_ErrorsAre) {
    TestStore store;
    store.model.materials.Insert("Steel", kmaC_Material());
    store.model.materials.Insert("Spare", kmaC_Material());
    EXPECT_EQ(Found(store.odb).size(), 3U);
    odiK_IgnoredFinding entry;
    entry.code = "unused";
    entry.reason = "our library";
    store.model.ignore.Append(entry);
    entry.code = "empty-material";
    entry.place = "/models/Default Model/materials/Spare";
    store.model.ignore.Append(entry);
    EXPECT_EQ(Found(store.odb),
              Texts{"empty-material /materials/Steel: found no option, expected one at least"});
    kseC_HomogenousSolidSection section;
    section.materialName = "Stell";
    store.model.sections.Insert("Solid", section);
    entry.code = "no-such-name";
    entry.place = cow_String();
    store.model.ignore.Append(entry);
    const Texts found = Found(store.odb);
    EXPECT_EQ(std::ranges::count_if(found,
                                    [](const std::string& text) { return text.starts_with("no-such-name"); }),
              1);
}

TEST(Check, WhatOneModelIgnores_IsToldOfAnother) {
    TestStore store;
    store.model.materials.Insert("Steel", kmaC_Material());
    odiK_IgnoredFinding entry;
    entry.code = "empty-material";
    entry.reason = "to come";
    store.odb.AddModel("Default").ignore.Append(entry);
    EXPECT_EQ(Found(store.odb).size(), 2U);
}

TEST(Check, StoreFilledInMemory_IsHeldAgainstTheRulesOfModelFiles) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    kprC_StaticStep step;
    step.initialInc = 2.0;
    step.maxInc = 5.0;
    store.model.steps.Append("Pull", step);
    kseC_HomogenousSolidSection section;
    section.materialName = "Stell";
    store.model.sections.Insert("Solid", section);
    store.model.materials.Insert("Steel", kmaC_Material());
    kamC_Tabular amplitude;
    amplitude.table = cow_2DArray<double>(1, 3);
    store.model.amplitudes.Insert("a \"name\"", amplitude);
    EXPECT_EQ(
        Found(store.odb),
        (Texts{
            "empty-material /materials/Steel: found no option, expected one at least",
            "no-such-name /sections/Solid/materialName: found 'Stell', expected the name of a material; did "
            "you mean 'Steel'?",
            "name-in-deck /amplitudes/a \"name\": found a name with a double quote, expected a name that can "
            "stand in a deck",
            "table-columns /amplitudes/a \"name\"/table: found rows of 3, expected rows of 2: time, value",
            "step-times /steps/1/initialInc: found 2.0, expected timePeriod (1.0) or less"}));
}

TEST(Check, NamesOfAStore_AreHeldAgainstTheRulesOfNames) {
    TestStore store;
    odiK_Part& part = store.model.AddPart("P\n*PART");
    part.mesh.Reset(new odiK_Mesh());
    part.mesh->SetNodes({1}, {0, 0, 0});
    part.mesh->AddElements("MASS\n*STEP", {1}, 1, {1});
    part.mesh->AddNodeSet("N\n*SET", {1});
    store.model.AddInstance("I\n*INSTANCE", "P\n*PART");
    const int labels[] = {1};
    const odiK_MemberInput members[] = {{"I\n*INSTANCE", labels, {}}};
    store.model.AddAssemblySet("A\n*SET", res_SetTypeEnm::NODES, members);
    store.model.AssemblyObject().name = "A\n*ASSEMBLY";
    odiK_Datum datum;
    datum.name = "D\n*DATUM";
    store.model.AddDatum(datum);
    Texts places;
    for (const std::string& found : Found(store.odb)) {
        if (found.starts_with("name-in-deck")) places.push_back(found.substr(0, found.find(": ")));
    }
    const Texts expected = {"name-in-deck /parts/P\n*PART",
                            "name-in-deck /parts/P\n*PART/mesh/elements/0/type",
                            "name-in-deck /parts/P\n*PART/mesh/sets/0/name",
                            "name-in-deck /assembly/instances/I\n*INSTANCE",
                            "name-in-deck /assembly/name",
                            "name-in-deck /assembly/sets/0/name",
                            "name-in-deck /datums/0/name"};
    EXPECT_EQ(places, expected);
}

TEST(Check, InitialStepInAnotherPlaceThanTheFirst_IsAnError) {
    TestStore store;
    store.model.steps.Append("Pull", kprC_StaticStep());
    store.model.steps.Append("Initial", kprC_InitialStep());
    EXPECT_EQ(Found(store.odb),
              (Texts{"initial-step /steps/0/class: found 'StaticStep', expected InitialStep as the "
                     "first step",
                     "initial-step /steps/1/class: found a second InitialStep, expected it in the first "
                     "place alone"}));
}

TEST(Check, StoreWithoutErrors_IsToldWhatItsDeckLeavesOut) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    store.model.materials.Insert("Steel", kmaC_Material());
    EXPECT_EQ(Found(store.odb),
              (Texts{"empty-material /materials/Steel: found no option, expected one at least",
                     "unused /materials: nothing uses 1 of the materials: Steel"}));
}

TEST(Check, Codes_EachNamedOnce_HaveAMeaning) {
    std::set<std::string_view> names;
    for (const fnd_Code& code : fnd_Codes) {
        EXPECT_TRUE(names.insert(code.name).second) << code.name;
        EXPECT_NE(code.meaning[0], '\0') << code.name;
    }
}
