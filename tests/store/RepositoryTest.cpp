#include "store/PropagationRecords.h"
#include "store/StoreTesting.h"
#include "store_interface/model/odiK_Repositories.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {

using namespace sample;

klcC_LoadCase CaseWith(float factor) {
    klcC_LoadCase loadCase;
    loadCase.loads.Insert("L", factor);
    return loadCase;
}

float Factor(const klcC_LoadCase& loadCase) {
    return loadCase.loads.ConstGet("L");
}

using Map = mdl_MapString2ObjCow<klcC_LoadCase>;
using MapIT = mdl_MapString2ObjCowIT<klcC_LoadCase>;

TEST(NamedRecords, KeysAndIterator_RunInAscendingOrderOfBytes) {
    Map map;
    const Strings sorted = {"", "10", "2", "A", "B", "a", "aa", "\xc3\xa4"};
    for (const char* key : {"aa", "\xc3\xa4", "B", "2", "", "a", "10", "A"}) map.Insert(key, CaseWith(1.0F));
    EXPECT_EQ(Texts(map.Keys()), sorted);
    MapIT it(map);
    for (int round = 0; round < 2; ++round) {
        Strings walked;
        for (it.First(); !it.IsDone(); it.Next()) walked.emplace_back(it.CurrentKey().View());
        EXPECT_EQ(walked, sorted);
    }
    EXPECT_EQ(map.Size(), 8);
}

TEST(NamedRecords, EmptyMap_HasNothingToWalk) {
    const Map map;
    EXPECT_TRUE(map.IsEmpty());
    EXPECT_EQ(map.Size(), 0);
    EXPECT_EQ(map.Keys().Length(), 0);
    EXPECT_TRUE(MapIT(map).IsDone());
    EXPECT_EQ(map.FindRecord("A"), nullptr);
    EXPECT_EQ(map.ItemTypeId(), klcC_LoadCase::TypeId());
}

TEST(NamedRecords, RangeLoop_RunsInAscendingOrder) {
    Map map;
    for (const auto& [name, loadCase] : map) ADD_FAILURE() << name.CStr() << Factor(loadCase);
    map.Insert("B", CaseWith(2.0F));
    map.Insert("A", CaseWith(1.0F));
    std::string walked;
    for (const auto& [name, loadCase] : map) walked += name.CStr() + std::to_string(Factor(loadCase)) + " ";
    EXPECT_EQ(walked, "A1.000000 B2.000000 ");
    walked.clear();
    for (const auto& [name, record] : static_cast<const mdl_Repository&>(map)) {
        walked += name.CStr();
        EXPECT_EQ(record.DynTypeId(), klcC_LoadCase::TypeId());
    }
    EXPECT_EQ(walked, "AB");
}

TEST(NamedRecords, AbsentName_RaisesWithTheContainersName) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    EXPECT_FALSE(map.IsMember("a"));
    EXPECT_EQ(Raised([&] { map.ConstGet("a"); }), "klcC_LoadCase: no entry named 'a'");
    EXPECT_EQ(Raised([&] { map.Get("B"); }), "klcC_LoadCase: no entry named 'B'");
}

TEST(NamedRecords, InsertUnderATakenName_ReplacesTheRecord) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    map.Insert("A", CaseWith(2.0F));
    EXPECT_EQ(map.Size(), 1);
    EXPECT_EQ(Factor(map.ConstGet("A")), 2.0F);
}

TEST(NamedRecords, Insert_StoresACopy) {
    Map map;
    klcC_LoadCase loadCase = CaseWith(1.0F);
    map.Insert("A", loadCase);
    loadCase.loads.Insert("L", 9.0F);
    EXPECT_EQ(Factor(map.ConstGet("A")), 1.0F);
    map.Insert("B", map.ConstGet("A"));
    EXPECT_NE(&map.ConstGet("A"), &map.ConstGet("B"));
}

TEST(NamedRecords, CopiesShareRecords_UntilOneIsWritten) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    map.Insert("B", CaseWith(2.0F));
    Map copy(map);
    EXPECT_EQ(&copy.ConstGet("A"), &map.ConstGet("A"));
    copy.Get("A").loads.Insert("L", 9.0F);
    EXPECT_EQ(Factor(map.ConstGet("A")), 1.0F);
    EXPECT_EQ(Factor(copy.ConstGet("A")), 9.0F);
    EXPECT_EQ(&copy.ConstGet("B"), &map.ConstGet("B"));
    copy.Insert("C", CaseWith(3.0F));
    EXPECT_FALSE(map.IsMember("C"));
}

TEST(NamedRecords, Remove_TellsWhetherTheNameWasThere) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    const Map copy(map);
    EXPECT_FALSE(map.Remove("B"));
    EXPECT_TRUE(map.Remove("A"));
    EXPECT_FALSE(map.Remove("A"));
    EXPECT_TRUE(map.IsEmpty());
    EXPECT_TRUE(copy.IsMember("A"));
    map.Insert("A", CaseWith(1.0F));
    map.Clear();
    EXPECT_TRUE(map.IsEmpty());
}

TEST(NamedRecords, Iterator_KeepsTheRecordsOfItsBeginning) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    map.Insert("B", CaseWith(2.0F));
    MapIT it(map);
    map.Get("A").loads.Insert("L", 9.0F);
    map.Insert("AA", CaseWith(3.0F));
    EXPECT_EQ(Factor(it.CurrentValue()), 1.0F);
    it.Next();
    EXPECT_EQ(it.CurrentKey(), "B");
    it.Next();
    EXPECT_TRUE(it.IsDone());
}

TEST(NamedRecords, EachWayToReadThem_IsNoted) {
    Map map;
    map.Insert("A", CaseWith(1.0F));
    const auto isNoted = [&](const auto& read) {
        const mdl_ReadNotes notes;
        read();
        return notes.HasRead(klcC_LoadCase::TypeId()) && !notes.HasRead(kprC_Step::TypeId());
    };
    EXPECT_TRUE(isNoted([&] { (void)map.Size(); }));
    EXPECT_TRUE(isNoted([&] { (void)map.Keys(); }));
    EXPECT_TRUE(isNoted([&] { (void)map.FindRecord("B"); }));
    EXPECT_TRUE(isNoted([&] { (void)map.ConstGet("A"); }));
    EXPECT_TRUE(isNoted([&] { (void)map.begin(); }));
    EXPECT_TRUE(isNoted([&] { (void)map.end(); }));
    EXPECT_TRUE(isNoted([&] { (void)MapIT(map).IsDone(); }));
    EXPECT_TRUE(isNoted([&] { (void)Map().IsEmpty(); }));
    EXPECT_FALSE(isNoted([&] { const Map copy = map; }));
    EXPECT_FALSE(isNoted([&] { (void)map.IsSharedWith(map); }));
}

TEST(ReadNotes, WhatIsReadWithinOthers_CountsForBoth) {
    const Map map;
    const mdl_ReadNotes outer;
    {
        const mdl_ReadNotes inner;
        EXPECT_FALSE(inner.HasRead(map.ItemTypeId()));
        (void)map.Size();
        EXPECT_TRUE(inner.HasRead(map.ItemTypeId()));
        EXPECT_FALSE(outer.HasRead(map.ItemTypeId()));
    }
    EXPECT_TRUE(outer.HasRead(map.ItemTypeId()));
    { const mdl_ReadNotes other; }
    EXPECT_FALSE(outer.HasRead(kprC_Step::TypeId()));
    {
        const mdl_ReadNotes inner;
        mdl_ReadNotes::NoteUntold();
    }
    EXPECT_TRUE(outer.HasRead(kprC_Step::TypeId())); // whatever it was
}

TEST(PropagatingContainer, DeepCopy_SharesNothing) {
    kprC_PropagatingContainer<kloC_Load> loads;
    Force force;
    Give<ForceState>(force, "S0").Set<&ForceState::magnitude>(3.0);
    loads.Insert("B", force);
    loads.Insert("A", Force());
    loads.Propagate(StepsOf("IG"));
    auto copy = loads.DeepCopy();
    EXPECT_EQ(Texts(copy.Keys()), (Strings{"A", "B"}));
    EXPECT_NE(&copy.ConstGet("B"), &loads.ConstGet("B"));
    EXPECT_EQ(Statuses(copy.ConstGet("B"), StepsOf("IG")), (Ints{1, 2}));
    Give<ForceState>(copy.Get("B"), "S1").Deactivate();
    copy.Propagate(StepsOf("IG"));
    EXPECT_EQ(Statuses(copy.ConstGet("B"), StepsOf("IG")), (Ints{1, 4}));
    EXPECT_EQ(Statuses(loads.ConstGet("B"), StepsOf("IG")), (Ints{1, 2}));
}

TEST(PropagatingContainer, Iterator_RunsInAscendingOrder) {
    kprC_PropagatingContainer<kloC_Load> loads;
    for (const char* name : {"b", "a", "B"}) loads.Insert(name, Force());
    Strings walked;
    for (kprC_PropagatingContainerIT<kloC_Load> it(loads); !it.IsDone(); it.Next()) {
        walked.emplace_back(it.CurrentKey().View());
        EXPECT_EQ(it.CurrentValue().DynTypeId(), Force::TypeId());
    }
    EXPECT_EQ(walked, (Strings{"B", "a", "b"}));
    EXPECT_EQ(loads.Size(), 3);
    EXPECT_EQ(Raised([&] { loads.ConstGet("c"); }), "kloC_Load: no entry named 'c'");
}

TEST(StepContainer, Steps_RunInTheOrderOfTheAnalysis) {
    kprC_StepContainer steps;
    steps.Append("Z", kprC_InitialStep());
    steps.Append("M", Step<kStatic>());
    steps.Append("A", Step<kFrequency>());
    EXPECT_EQ(Texts(steps.Keys()), (Strings{"Z", "M", "A"}));
    kprC_StepContainerIT it(steps);
    for (int round = 0; round < 2; ++round) {
        Strings walked;
        for (it.First(); !it.IsDone(); it.Next()) walked.emplace_back(it.CurrentKey().View());
        EXPECT_EQ(walked, (Strings{"Z", "M", "A"}));
    }
    EXPECT_EQ(steps.Size(), 3);
    EXPECT_EQ(steps.IndexOf("A"), 2);
    EXPECT_EQ(steps.IndexOf("a"), -1);
    EXPECT_TRUE(steps.IsMember("M"));
    EXPECT_EQ(steps.ConstGet("A").DynTypeId(), kFrequency);
    it.First();
    it.Next();
    EXPECT_EQ(&it.CurrentValue(), &steps.ConstGet("M"));
}

TEST(StepContainer, Place_IsFoundInWhateverOrderItIsAskedFor) {
    const kprC_StepContainer steps = StepsOf("IGGGG");
    for (const int place : {0, 1, 2, 2, 4, 4, 3, 0, 4, 1, 3}) {
        EXPECT_EQ(steps.IndexOf(StepName(place)), place);
        EXPECT_EQ(steps.IndexOf("no step"), -1);
    }
}

TEST(StepContainer, Copies_ShareTheStepsUntilOneIsWrittenTo) {
    kprC_StepContainer steps;
    steps.Append("A", kprC_InitialStep());
    const kprC_StepContainer copy = steps;
    EXPECT_EQ(&copy.StepAt(0), &steps.StepAt(0));
    steps.Get("A").description = "changed";
    steps.Append("B", kprC_InitialStep());
    EXPECT_EQ(copy.ConstGet("A").description, "");
    EXPECT_EQ(copy.Size(), 1);
    EXPECT_EQ(copy.IndexOf("B"), -1);
    EXPECT_EQ(steps.IndexOf("B"), 1);
}

TEST(StepContainer, NameThatIsTakenOrUnknown_Raises) {
    kprC_StepContainer steps;
    steps.Append("A", kprC_InitialStep());
    EXPECT_EQ(Raised([&] { steps.Append("A", Step<kStatic>()); }),
              "kprC_StepContainer: a step named 'A' is there already");
    EXPECT_EQ(steps.Size(), 1);
    EXPECT_EQ(Raised([&] { steps.ConstGet("B"); }), "kprC_StepContainer: no entry named 'B'");
    EXPECT_EQ(Raised([&] { steps.Get("B"); }), "kprC_StepContainer: no entry named 'B'");
}

TEST(StepContainer, PlaceOutsideTheSteps_Raises) {
    const kprC_StepContainer steps = StepsOf("IG");
    EXPECT_EQ(Raised([&] { steps.NameAt(2); }), "cow_List: index 2 is out of range, expected 0 to 1");
    EXPECT_EQ(Raised([&] { steps.StepAt(-1); }), "cow_List: index -1 is out of range, expected 0 to 1");
}

TEST(StepContainer, Copy_OutlivesTheOriginalAndIsApartFromIt) {
    kprC_StepContainer copy;
    {
        kprC_StepContainer steps;
        steps.Append("a rather long name of a step, to be sure", kprC_InitialStep());
        copy = steps;
        steps.Get("a rather long name of a step, to be sure").description = "changed";
    }
    EXPECT_EQ(copy.IndexOf("a rather long name of a step, to be sure"), 0);
    EXPECT_TRUE(copy.StepAt(0).description.IsEmpty());
    copy.Append("B", Step<kStatic>());
    EXPECT_EQ(copy.IndexOf("B"), 1);
}

TEST(Step, Procedure_IsTheClassNumberAndZeroForTheInitialStep) {
    EXPECT_EQ(kprC_InitialStep().ProcedureType(), 0U);
    EXPECT_EQ(Step<kStatic>().ProcedureType(), kStatic);
    EXPECT_FALSE(kprC_InitialStep().Perturbation());
    EXPECT_FALSE(Step<kStatic>().Perturbation());
    EXPECT_TRUE(Step<kFrequency>().Perturbation());
    EXPECT_TRUE(Step<0x23C0069>().Explicit());
    EXPECT_FALSE(Step<kStatic>().Explicit());
}

TEST(Step, Predicates_HoldForTheirProceduresOnly) {
    for (unsigned number = 0x23C0060; number < 0x23C0082; ++number) {
        SCOPED_TRACE(number);
        const unsigned last = number & 0xFFU;
        EXPECT_EQ(kprC_IsExplicit(number), last == 0x65 || last == 0x69 || last == 0x7B);
        EXPECT_EQ(kprC_IsPerturbation(number), last == 0x66 || last == 0x6A || last == 0x6F || last == 0x70 ||
                                                   last == 0x71 || last == 0x75 || last == 0x76 ||
                                                   last == 0x77 || last == 0x7D || last == 0x7E);
        EXPECT_EQ(kprC_IsNonmechanical(number), last == 0x68 || last == 0x6C || last == 0x6E);
        EXPECT_EQ(kprC_AdaptiveMeshDomainsAreAllowed(number),
                  last == 0x67 || last == 0x69 || last == 0x72 || last == 0x73 || last == 0x7B);
    }
    EXPECT_FALSE(kprC_IsExplicit(0));
    EXPECT_FALSE(kprC_IsPerturbation(0));
    EXPECT_FALSE(kprC_IsNonmechanical(0));
    EXPECT_FALSE(kprC_AdaptiveMeshDomainsAreAllowed(0));
}

TEST(Step, SuppressAndResume_SetTheFlag) {
    kprC_InitialStep step;
    step.Suppress();
    EXPECT_TRUE(step.suppressed);
    step.Resume();
    EXPECT_FALSE(step.suppressed);
}

} // namespace

TEST(Repositories, Rows_HaveNamesOfTheirOwnAndLeadToTheirMembers) {
    odiK_Model model("m");
    std::set<std::string> members;
    std::set<const mdl_Repository*> repositories;
    for (const odiK_Repository& row : odiK_Repositories()) {
        EXPECT_TRUE(members.insert(row.member).second) << row.member;
        EXPECT_EQ(row.IsPropagating(),
                  cls_Classes().InheritanceCheck(row.ItemTypeId(), kprC_PropagatingObject::TypeId()));
        if (row.IsInOrder()) continue;
        EXPECT_TRUE(repositories.insert(&row.In(model)).second) << row.member;
        EXPECT_EQ(row.In(model).ItemTypeId(), row.ItemTypeId()) << row.member;
    }
    EXPECT_EQ(repositories.count(&model.loads), 1u);
    EXPECT_EQ(members.count("steps"), 1u);
}

TEST(Repositories, Steps_StandInFrontOfWhatLivesAcrossThem) {
    bool stepsSeen = false;
    for (const odiK_Repository& row : odiK_Repositories()) {
        stepsSeen = stepsSeen || row.IsInOrder();
        EXPECT_TRUE(stepsSeen || !row.IsPropagating()) << row.member;
    }
}

TEST(Repositories, Differences_AreThoseOfSharedModels) {
    odiK_Model model("m");
    model.Complete();
    odiK_Model variant("m");
    variant.Share(model);
    EXPECT_TRUE(odiK_Differences(model, variant).none());
    {
        const mdl_ReadNotes notes;
        EXPECT_EQ(odiK_ReadOf(notes).count(), 1u); // what is no repository
        (void)variant.loads.Size();
        EXPECT_EQ(odiK_ReadOf(notes).count(), 2u);
    }
    kmaC_Material material;
    variant.materials.Insert("Steel", material);
    const odiK_Extent differences = odiK_Differences(model, variant);
    EXPECT_EQ(differences.count(), 1u);
    const mdl_ReadNotes notes;
    (void)variant.loads.Size();
    EXPECT_TRUE((odiK_ReadOf(notes) & differences).none());
    (void)variant.materials.Size();
    EXPECT_TRUE((odiK_ReadOf(notes) & differences).any());
    // Another model may be any other one.
    const mdl_ReadNotes nothing;
    EXPECT_TRUE((odiK_ReadOf(nothing) & odiK_Differences(model, odiK_Model("m"))).any());
}
