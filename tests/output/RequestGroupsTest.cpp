#include "output/oif_OutputRequestBuilder.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/interactions/kinC_Contact.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/steps/kprC_DynamicSteps.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

namespace {

using Field = korC_FieldOutputState;
using History = korC_HistoryOutputState;
using Variables = korC_VariablesTypeEnm;

cls_xpListString Names(std::initializer_list<const char*> names) {
    cls_xpListString list;
    for (const char* name : names) list.Append(name);
    return list;
}

/// One step "A" behind the initial one, on an instance with a node set, an element set and a surface.
class RequestGroups : public testing::Test {
protected:
    RequestGroups() {
        odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
        part.mesh->AddElements("S4R", {1}, 4, {1, 2, 3, 4});
        part.mesh->AddNodeSet("N", {2});
        part.mesh->AddElementSet("E", {1});
        part.mesh->AddSurface("S", {{1, -1, "SPOS"}});
        store.model.AddInstance("I", "P");
        Steps().Append("Initial", kprC_InitialStep());
    }
    kprC_StepContainer& Steps() { return store.model.steps; }
    rgnC_Region Region(const char* set) { return store.model.Region("I", set); }

    korC_FieldOutput FieldOf(std::initializer_list<const char*> variables) {
        korC_FieldOutput request;
        if (variables.size() > 0) {
            mdl_StateEdit<Field>(request.Give("A")).Set<&Field::variables>(Names(variables));
        } else {
            request.Give("A");
        }
        return request;
    }
    korC_HistoryOutput HistoryOf(std::initializer_list<const char*> variables) {
        korC_HistoryOutput request;
        mdl_StateEdit<History>(request.Give("A")).Set<&History::variables>(Names(variables));
        return request;
    }
    void Add(const char* name, korC_FieldOutput request) {
        request.Propagate(Steps());
        store.model.fieldOutputRequests.Insert(name, request);
    }
    void Add(const char* name, korC_HistoryOutput request) {
        request.Propagate(Steps());
        store.model.historyOutputRequests.Insert(name, request);
    }
    /// What the step says behind its banner.
    std::string BodyOf(const cow_String& stepName = "A") {
        oif_OutputRequestBuilder builder(store.Info());
        builder.Build();
        const std::string body = WrittenAll(builder.StepDefinition(stepName));
        const std::string banner = "** \n** OUTPUT REQUESTS\n** \n";
        EXPECT_TRUE(body.empty() || body.starts_with(banner)) << body;
        return body.empty() ? body : body.substr(banner.size());
    }
    static std::string FieldComment(const std::string& name) {
        return "** \n** FIELD OUTPUT: " + name + "\n** \n";
    }
    static std::string HistoryComment(const std::string& name) {
        return "** \n** HISTORY OUTPUT: " + name + "\n** \n";
    }

    TestStore store;
};

} // namespace

TEST_F(RequestGroups, PreselectionOfTheWholeModel_IsTheOutputLineAlone) {
    Steps().Append("A", kprC_StaticStep());
    Add("F", FieldOf({}));
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, variable=PRESELECT\n");
}

TEST_F(RequestGroups, PreselectionWithoutDirections_MovesToTheSubKeywords) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({});
    request.directions = false;
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n"
                                            "*Node Output, variable=PRESELECT\n"
                                            "*Element Output, directions=NO, variable=PRESELECT\n"
                                            "*Energy Output, variable=PRESELECT\n"
                                            "*Contact Output, variable=PRESELECT\n");
}

TEST_F(RequestGroups, PreselectionAtSectionPoints_HasNodeAndElementOutput) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"PRESELECT"});
    request.sectionPoints = {1, 5};
    Add("F", request);
    // The other sub-keywords stay silent: for the whole model they'd say what the line says.
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n"
                                            "*Node Output, variable=PRESELECT\n"
                                            "*Element Output, directions=YES, variable=PRESELECT\n1, 5\n");
}

TEST_F(RequestGroups, AllVariablesOfASet_StandOnItsSubKeywords) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"ALL"});
    request.region = Region("E");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n"
                                            "*Element Output, elset=I.E, directions=YES, variable=ALL\n"
                                            "*Modal Output, variable=ALL\n"
                                            "*Energy Output, elset=I.E, variable=ALL\n"
                                            "*Radiation Output, elset=I.E, variable=ALL\n");
}

TEST_F(RequestGroups, RequestsThatDifferInTheirRegion_ShareAnOutputLine) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput nodes = FieldOf({"U"});
    nodes.region = Region("N");
    Add("F-2", nodes);
    Add("F-1", FieldOf({"U", "S"}));
    EXPECT_EQ(BodyOf(), FieldComment("F-1") +
                            "*Output, field\n*Node Output\nU, \n"
                            "*Element Output, directions=YES\nS, \n" +
                            FieldComment("F-2") + "*Node Output, nset=I.N\nU, \n");
}

TEST_F(RequestGroups, OtherFrequencyOrFilter_OpensANewGroup) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput rare = FieldOf({"U"});
    mdl_StateEdit<Field>(rare.Give("A")).Set<&Field::frequency>(5);
    Add("a rare", rare);
    korC_FieldOutput filtered = FieldOf({"U"});
    filtered.filter = "FLT";
    Add("b filtered", filtered);
    Add("c plain", FieldOf({"RF"}));
    EXPECT_EQ(BodyOf(), FieldComment("c plain") + "*Output, field\n*Node Output\nRF, \n" +
                            FieldComment("b filtered") + "*Output, field, filter=FLT\n*Node Output\nU, \n" +
                            FieldComment("a rare") + "*Output, field, frequency=5\n*Node Output\nU, \n");
}

TEST_F(RequestGroups, EqualRequests_AreOneUnderBothNames) {
    Steps().Append("A", kprC_StaticStep());
    Add("one", FieldOf({"U", "NOSUCH"}));
    Add("two", FieldOf({"U"}));
    EXPECT_EQ(BodyOf(), FieldComment("one, two") + "*Output, field\n*Node Output\nU, \n");
}

TEST_F(RequestGroups, SymbolsAmongLists_HaveAnOutputLineEach) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput set = FieldOf({});
    set.region = Region("N");
    Add("set", set);
    Add("list", FieldOf({"U"}));
    Add("whole", FieldOf({}));
    EXPECT_EQ(BodyOf(), FieldComment("whole") + "*Output, field, variable=PRESELECT\n" + FieldComment("set") +
                            "*Output, field\n*Node Output, nset=I.N, variable=PRESELECT\n"
                            "*Contact Output, nset=I.N, variable=PRESELECT\n" +
                            FieldComment("list") + "*Output, field\n*Node Output\nU, \n");
}

TEST_F(RequestGroups, NodeVariablesOnElements_GiveNoOutputAtAll) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"U", "RF"});
    request.region = Region("E");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, frequency=0\n");
}

TEST_F(RequestGroups, ElementVariablesOnASurface_GiveNoOutputAtAll) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"S"});
    request.region = Region("S");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, frequency=0\n");
}

TEST_F(RequestGroups, ScreenedRequest_StillOpensTheGroupOfTheNextOne) {
    Steps().Append("A", kprC_StaticStep());
    Add("a", FieldOf({"U"}));
    korC_FieldOutput nodesOnElements = FieldOf({"U"});
    nodesOnElements.region = Region("E");
    mdl_StateEdit<Field>(nodesOnElements.Give("A")).Set<&Field::frequency>(2);
    Add("b", nodesOnElements);
    korC_FieldOutput same = FieldOf({"RF"});
    mdl_StateEdit<Field>(same.Give("A")).Set<&Field::frequency>(2);
    Add("c", same);
    // "c" goes on in the group that "b" would have opened, so its frequency is lost.
    EXPECT_EQ(BodyOf(), FieldComment("a") + "*Output, field\n*Node Output\nU, \n" + FieldComment("b") +
                            FieldComment("c") + "*Node Output\nRF, \n");
}

TEST_F(RequestGroups, ScreenedRequestAmongOthers_LeavesItsCommentOnly) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput nodesOnElements = FieldOf({"U"});
    nodesOnElements.region = Region("E");
    Add("a", nodesOnElements);
    Add("b", FieldOf({"RF"}));
    EXPECT_EQ(BodyOf(), FieldComment("a") + FieldComment("b") + "*Output, field\n*Node Output\nRF, \n");
}

TEST_F(RequestGroups, ScreenedRequestBehindOthers_LeavesItsCommentOnly) {
    Steps().Append("A", kprC_StaticStep());
    Add("a", FieldOf({"RF"}));
    korC_FieldOutput nodesOnElements = FieldOf({"U"});
    nodesOnElements.region = Region("E");
    mdl_StateEdit<Field>(nodesOnElements.Give("A")).Set<&Field::frequency>(2);
    Add("b", nodesOnElements);
    EXPECT_EQ(BodyOf(), FieldComment("a") + "*Output, field\n*Node Output\nRF, \n" + FieldComment("b"));
}

TEST_F(RequestGroups, NamesThatTheProcedureDoesNotKnow_LeaveThePreselection) {
    Steps().Append("A", kprC_StaticStep());
    Add("F", FieldOf({"NT"}));
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, variable=PRESELECT\n");
}

TEST_F(RequestGroups, EmptyListOfVariables_GivesNoOutput) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"NT"});
    mdl_StateEdit<Field>(request.Give("A")).Set<&Field::variablesType>(Variables::LISTED);
    Add("F", request);
    EXPECT_EQ(BodyOf(), "*Output, field, frequency=0\n");
}

TEST_F(RequestGroups, DeactivatedRequest_StopsTheOutputOfTheStepBefore) {
    Steps().Append("A", kprC_StaticStep());
    Steps().Append("B", kprC_StaticStep());
    Steps().Append("C", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"U"});
    request.Give("B").deactivated = true;
    Add("F", request);
    EXPECT_EQ(BodyOf("B"), "*Output, field, frequency=0\n");
    EXPECT_EQ(BodyOf("C"), "");
}

TEST_F(RequestGroups, SuppressedRequest_CountsAndGivesNone) {
    Steps().Append("A", kprC_StaticStep());
    korC_HistoryOutput request = HistoryOf({"U"});
    request.suppressed = true;
    Add("H", request);
    EXPECT_EQ(BodyOf(), "*Output, history, frequency=0\n");
}

TEST_F(RequestGroups, NoOutputOfExplicitSteps_IsNoInterval) {
    Steps().Append("A", kprC_ExplicitDynamicsStep());
    korC_FieldOutput field = FieldOf({"U"});
    field.suppressed = true;
    Add("F", field);
    korC_HistoryOutput history = HistoryOf({"U"});
    history.suppressed = true;
    Add("H", history);
    EXPECT_EQ(BodyOf(), "*Output, field, number interval=0\n*Output, history, frequency=0\n");
}

TEST_F(RequestGroups, NoOutputOfEigenvalueSteps_IsABareNodeOutput) {
    Steps().Append("A", kprC_FrequencyStep());
    korC_FieldOutput field = FieldOf({"U"});
    field.suppressed = true;
    Add("F", field);
    korC_HistoryOutput history = HistoryOf({"U"});
    history.suppressed = true;
    Add("H", history);
    EXPECT_EQ(BodyOf(), "*Output, field\n*Node Output\n");
}

TEST_F(RequestGroups, FrequencyThatTheProcedureDoesNotAllow_BecomesItsUsualOne) {
    kprC_ExplicitDynamicsStep step;
    step.timePeriod = 0.5;
    Steps().Append("A", step);
    korC_FieldOutput field = FieldOf({"U"});
    mdl_StateEdit<Field>(field.Give("A"))
        .Set<&Field::frequencyType>(korC_TypeEnm::FREQUENCY)
        .Set<&Field::frequency>(7)
        .Set<&Field::numberInterval>(3);
    Add("F", field);
    korC_HistoryOutput history = HistoryOf({"ALLKE"});
    mdl_StateEdit<History>(history.Give("A"))
        .Set<&History::frequencyType>(korC_TypeEnm::NUMBER_INTERVAL)
        .Set<&History::numberInterval>(5);
    Add("H", history);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Node Output\nU, \n" + HistoryComment("H") +
                            "*Output, history, time interval=0.1\n*Energy Output\nALLKE, \n");
}

TEST_F(RequestGroups, ModesInAGeneralStep_BecomeAFrequency) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({"U"});
    mdl_StateEdit<Field>(field.Give("A"))
        .Set<&Field::frequencyType>(korC_TypeEnm::MODE_LIST)
        .Set<&Field::frequency>(7);
    Add("F", field);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Node Output\nU, \n");
}

TEST_F(RequestGroups, TimePoints) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({"U"});
    mdl_StateEdit<Field>(field.Give("A"))
        .Set<&Field::frequencyType>(korC_TypeEnm::TIME_POINTS)
        .Set<&Field::timePoints>("marks")
        .Set<&Field::timeMarks>(false);
    Add("F", field);
    EXPECT_EQ(BodyOf(),
              FieldComment("F") + "*Output, field, time points=marks, time marks=NO\n*Node Output\nU, \n");
}

TEST_F(RequestGroups, Rebar_HasAKeywordOfItsOwn) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({"S", "U"});
    field.rebar = korC_RebarEnm::INCLUDE;
    Add("F", field);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Node Output\nU, \n"
                                            "*Element Output, directions=YES\nS, \n"
                                            "*Element Output, rebar, directions=YES\nS, \n");
}

TEST_F(RequestGroups, RebarOnly_LeavesOnlyElementOutput) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({"S", "U"});
    field.rebar = korC_RebarEnm::ONLY;
    Add("F", field);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Element Output, rebar, directions=YES\nS, \n");
}

TEST_F(RequestGroups, RebarOnlyAtSectionPoints_LeavesOnlyElementOutputToo) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({"S", "U"});
    field.rebar = korC_RebarEnm::ONLY;
    field.sectionPoints = {1, 5};
    Add("F", field);
    EXPECT_EQ(BodyOf(),
              FieldComment("F") + "*Output, field\n*Element Output, rebar, directions=YES\n1, 5\nS, \n");
}

TEST_F(RequestGroups, PreselectionWithRebar_WritesItsKeywordBesideTheLine) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({});
    field.rebar = korC_RebarEnm::INCLUDE;
    Add("F", field);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, variable=PRESELECT\n"
                                            "*Element Output, rebar, directions=YES, variable=PRESELECT\n");
}

TEST_F(RequestGroups, PreselectionWithRebarAndWithoutDirections_WritesTheRebarKeywordTwiceWanted) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput field = FieldOf({});
    field.rebar = korC_RebarEnm::ONLY;
    field.directions = false;
    Add("F", field);
    const std::string rebar = "*Element Output, rebar, directions=NO, variable=PRESELECT\n";
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n" + rebar + rebar);
}

TEST_F(RequestGroups, Springs_AreNoReasonForOutput) {
    Steps().Append("A", kprC_StaticStep());
    korC_HistoryOutput request = HistoryOf({"U"});
    request.springs.Append("spring");
    Add("H", request);
    EXPECT_EQ(BodyOf(), "");
}

TEST_F(RequestGroups, IntegratedSection_HasItsKeywordAlone) {
    Steps().Append("A", kprC_StaticStep());
    korC_HistoryOutput request = HistoryOf({"SOF", "U"});
    request.section = "cut";
    Add("H", request);
    EXPECT_EQ(BodyOf(), HistoryComment("H") + "*Output, history\n*Integrated Output, section=cut\nSOF, \n");
}

TEST_F(RequestGroups, BoltLoad_HasToBeThere) {
    Steps().Append("A", kprC_StaticStep());
    korC_HistoryOutput request = HistoryOf({"U1"});
    request.boltLoad = "bolt";
    Add("H", request);
    EXPECT_EQ(BodyOf(), "");
    kloC_BoltLoad bolt;
    bolt.suppressed = true;
    bolt.Propagate(Steps());
    store.model.loads.Insert("bolt", bolt);
    EXPECT_EQ(BodyOf(), "");
    bolt.suppressed = false;
    store.model.loads.Insert("bolt", bolt);
    EXPECT_EQ(BodyOf(), HistoryComment("H") + "*Output, history\n*Node Output\nU1, \n");
}

TEST_F(RequestGroups, Interaction_HasToBeThereAndNamesItsSurfaces) {
    Steps().Append("A", kprC_StaticStep());
    Steps().Append("B", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"CSTRESS"});
    request.interactions.Append("pair");
    Add("F", request);
    EXPECT_EQ(BodyOf(), "");
    kinC_SurfaceToSurfaceContactStd pair;
    pair.master = Region("S");
    pair.slave = Region("N");
    pair.Give("B");
    pair.Propagate(Steps());
    store.model.interactions.Insert("pair", pair);
    // The pair is there, but not yet in force.
    EXPECT_EQ(BodyOf("A"), FieldComment("F") + "*Output, field\n*Contact Output\nCSTRESS, \n");
    EXPECT_EQ(BodyOf("B"), FieldComment("F") + "*Output, field\n*Contact Output, master=I.S, "
                                               "slave=I_N_CNS_\nCSTRESS, \n");
}

TEST_F(RequestGroups, SelfContact_NamesOneSurfaceAndExplicitPairsTheirName) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"CSTRESS"});
    request.interactions.Append("self");
    Add("F", request);
    kinC_SelfContactStd self;
    self.surface = Region("S");
    self.Give("A");
    self.Propagate(Steps());
    store.model.interactions.Insert("self", self);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Contact Output, master=I.S\nCSTRESS, \n");
    kinC_SurfaceToSurfaceContactXpl pair;
    pair.master = pair.slave = Region("S");
    pair.Give("A");
    pair.Propagate(Steps());
    store.model.interactions.Insert("self", pair);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Contact Output, cpset=self\nCSTRESS, \n");
}

TEST_F(RequestGroups, ContactSurface_HasContactOutputOnly) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"CSTRESS", "U"});
    request.region = Region("S");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Contact Output, surface=S\nCSTRESS, \n");
}

TEST_F(RequestGroups, PreselectionOfNodesInAnExplicitStep_HasNoContactOutput) {
    Steps().Append("A", kprC_ExplicitDynamicsStep());
    korC_FieldOutput request = FieldOf({});
    request.region = Region("N");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Node Output, nset=I.N, variable=PRESELECT\n"
                                            "*Incrementation Output, variable=PRESELECT\n");
}

TEST_F(RequestGroups, AllVariablesOfNodesInAnExplicitStep_HaveContactOutputWithoutThem) {
    Steps().Append("A", kprC_ExplicitDynamicsStep());
    korC_FieldOutput request = FieldOf({"ALL"});
    request.region = Region("N");
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n*Node Output, nset=I.N, variable=ALL\n"
                                            "*Incrementation Output, variable=ALL\n"
                                            "*Contact Output, variable=ALL\n");
}

TEST_F(RequestGroups, AllVariablesWithoutDirections_HaveEveryKeywordOfAnImplicitStep) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"ALL"});
    request.directions = false;
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n"
                                            "*Node Output, variable=ALL\n"
                                            "*Element Output, directions=NO, variable=ALL\n"
                                            "*Modal Output, variable=ALL\n"
                                            "*Energy Output, variable=ALL\n"
                                            "*Contact Output, variable=ALL\n"
                                            "*Radiation Output, variable=ALL\n");
}

TEST_F(RequestGroups, AllVariablesOfABolt_HaveNoRadiationOutputAndNameNoNodesWanted) {
    Steps().Append("A", kprC_StaticStep());
    kloC_BoltLoad bolt;
    bolt.Propagate(Steps());
    store.model.loads.Insert("bolt", bolt);
    korC_FieldOutput request = FieldOf({"ALL"});
    request.boltLoad = "bolt";
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field\n"
                                            "*Node Output, variable=ALL\n"
                                            "*Element Output, directions=YES, variable=ALL\n"
                                            "*Modal Output, variable=ALL\n"
                                            "*Energy Output, variable=ALL\n"
                                            "*Contact Output, variable=ALL\n");
}

TEST_F(RequestGroups, PreselectionOfABoltsHistory_IsEmptyAndGivesNoOutput) {
    Steps().Append("A", kprC_StaticStep());
    kloC_BoltLoad bolt;
    bolt.Propagate(Steps());
    store.model.loads.Insert("bolt", bolt);
    korC_HistoryOutput request = HistoryOf({});
    request.boltLoad = "bolt";
    Add("H", request);
    EXPECT_EQ(BodyOf(), "*Output, history, frequency=0\n");
}

TEST_F(RequestGroups, BoltLoadThatIsSuppressed_IsAskedForWhereAnotherRequestCallsForOutputWanted) {
    Steps().Append("A", kprC_StaticStep());
    kloC_BoltLoad bolt;
    bolt.suppressed = true;
    bolt.Propagate(Steps());
    store.model.loads.Insert("bolt", bolt);
    korC_HistoryOutput request = HistoryOf({"U1"});
    request.boltLoad = "bolt";
    Add("H", request);
    Add("other", HistoryOf({"ALLKE"}));
    EXPECT_EQ(BodyOf(), HistoryComment("H") + "*Output, history\n*Node Output\nU1, \n" +
                            HistoryComment("other") + "*Energy Output\nALLKE, \n");
}

TEST_F(RequestGroups, LoadThatIsNoBolt_IsNoReasonForOutput) {
    Steps().Append("A", kprC_StaticStep());
    kloC_Pressure pressure;
    pressure.Propagate(Steps());
    store.model.loads.Insert("bolt", pressure);
    korC_HistoryOutput request = HistoryOf({"U1"});
    request.boltLoad = "bolt";
    Add("H", request);
    EXPECT_EQ(BodyOf(), "");
}

TEST_F(RequestGroups, SymbolsOfAnIntegratedSection_StandOnItsKeyword) {
    Steps().Append("A", kprC_StaticStep());
    korC_HistoryOutput preselect = HistoryOf({"PRESELECT"});
    preselect.section = "cut";
    Add("a", preselect);
    korC_HistoryOutput all = HistoryOf({"ALL"});
    all.section = "cut";
    Add("b", all);
    EXPECT_EQ(BodyOf(), HistoryComment("a") +
                            "*Output, history\n*Integrated Output, section=cut, variable=PRESELECT\n" +
                            HistoryComment("b") +
                            "*Output, history\n*Integrated Output, section=cut, variable=ALL\n");
}

TEST_F(RequestGroups, NamesThatTheProcedureDoesNotKnow_LeaveAllVariablesWhereTheTypeSaysSo) {
    Steps().Append("A", kprC_StaticStep());
    korC_FieldOutput request = FieldOf({"NT"});
    mdl_StateEdit<Field>(request.Give("A")).Set<&Field::variablesType>(Variables::ALL);
    Add("F", request);
    EXPECT_EQ(BodyOf(), FieldComment("F") + "*Output, field, variable=ALL\n");
}

TEST_F(RequestGroups, AnnealingWithoutPreselection_AsksForThePreselectionOfNoOutputWanted) {
    Steps().Append("A", kprC_AnnealStep());
    Add("F", FieldOf({"U"}));
    Add("H", HistoryOf({"ALLKE"}));
    EXPECT_EQ(BodyOf(), "*Output, field, variable=PRESELECT, number interval=0\n"
                        "*Output, history, frequency=0\n");
}
