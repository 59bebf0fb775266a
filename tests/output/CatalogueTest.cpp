#include "store_interface/records/output/karC_RemeshingRule.h"
#include "store_interface/records/output/korC_Output.h"
#include "store_interface/records/output/korC_OutputCatalogue.h"
#include "support/DeckTest.h"

#include <set>

namespace {

using Channel = korC_OdbChannel::TypeEnm;
using Domain = korC_DomainTypeEnm;
using Print = korC_OdbRequestSpec::PrintEnm;

constexpr unsigned kExplicitStep = 0x23C0069;
constexpr unsigned kFrequencyStep = 0x23C006A;
constexpr unsigned kHeatStep = 0x23C006C;
constexpr unsigned kModalStep = 0x23C006F;
constexpr unsigned kStaticStep = 0x23C0073;

const korC_OdbRequestTable& Catalogue() {
    return korC_OdbRequestTable::Instance();
}

std::string Joined(const cls_xpListString& names) {
    std::string text;
    for (int i = 0; i < names.Length(); ++i) text += (i > 0 ? " " : "") + std::string(names[i].View());
    return text;
}
cls_xpListString Names(std::initializer_list<const char*> names) {
    cls_xpListString list;
    for (const char* name : names) list.Append(name);
    return list;
}
bool Holds(const cls_xpListString& names, const char* name) {
    for (int i = 0; i < names.Length(); ++i) {
        if (names[i] == name) return true;
    }
    return false;
}

template <class State>
std::string Rebuilt(std::initializer_list<const char*> names, unsigned stepType = kStaticStep) {
    State state;
    state.variables.Set(Names(names));
    state.ReconstructVariables(stepType);
    return Joined(state.variables.ConstGet());
}

} // namespace

TEST(Catalogue, NamesAreUniqueAndEveryRowCanBeAskedForSomewhere) {
    std::set<std::string> names;
    const auto& specs = Catalogue().Specs();
    EXPECT_EQ(specs.Length(), 352);
    for (int i = 0; i < specs.Length(); ++i) {
        const korC_OdbRequestSpec& spec = specs[i];
        SCOPED_TRACE(std::string(spec.name.View()));
        EXPECT_TRUE(names.insert(std::string(spec.name.View())).second);
        EXPECT_TRUE(spec.field || spec.history);
        EXPECT_NE(spec.procedures, 0U);
        EXPECT_NE(spec.domains, 0U);
        EXPECT_FALSE(spec.doc.IsEmpty());
        // What is preselected can be asked for.
        EXPECT_EQ(spec.preselectField & ~spec.procedures, 0U);
        EXPECT_EQ(spec.preselectHistory & ~spec.procedures, 0U);
        EXPECT_TRUE(spec.preselectField == 0 || spec.field);
        EXPECT_TRUE(spec.preselectHistory == 0 || spec.history);
    }
    for (int i = 0; i < specs.Length(); ++i) {
        if (!specs[i].parent.IsEmpty()) {
            EXPECT_EQ(names.count(std::string(specs[i].parent.View())), 1U);
        }
    }
}

TEST(Catalogue, Defaults_AreThoseOfTheProcedure) {
    const auto field = [](unsigned step) {
        return Joined(Catalogue().Defaults(Channel::FIELD, step, false, Domain::ALL_DOMAINS, 0));
    };
    EXPECT_EQ(field(kStaticStep), "U RF CF S LE PE PEEQ PEMAG CSTRESS CDISP");
    EXPECT_EQ(field(kExplicitStep), "U V A RF S LE PE PEEQ STATUS CSTRESS");
    EXPECT_EQ(field(kFrequencyStep), "U");
    EXPECT_EQ(field(kHeatStep), "NT RFL HFL");
    EXPECT_EQ(field(0), "");
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::HISTORY, kModalStep, false, Domain::ALL_DOMAINS, 0)),
              "ALLIE ALLKE ALLSE ALLVD ALLWK ETOTAL");
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::HISTORY, kStaticStep, false,
                                          Domain::INTEGRATED_SECTION, 0)),
              "SOF SOM");
    EXPECT_TRUE(Catalogue()
                    .DefaultRequests(Channel::HISTORY, kFrequencyStep, Domain::ALL_DOMAINS)
                    .IsEmpty());
    const auto requests = Catalogue().DefaultRequests(Channel::FIELD, kHeatStep, Domain::ALL_DOMAINS);
    ASSERT_EQ(requests.Length(), 3);
    EXPECT_EQ(requests[2].Name(), "HFL");
}

TEST(Catalogue, ModeBasedStepsBehindReducedModes_PreselectNodesOnly) {
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::FIELD, kModalStep, false, Domain::ALL_DOMAINS, 0)),
              "U V A RF CF S E");
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::FIELD, kModalStep, true, Domain::ALL_DOMAINS, 0)),
              "U V A RF CF");
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::FIELD, kStaticStep, true, Domain::ALL_DOMAINS, 0)),
              "U RF CF S LE PE PEEQ PEMAG CSTRESS CDISP");
    EXPECT_EQ(Joined(Catalogue().Defaults(Channel::HISTORY, kModalStep, true, Domain::ALL_DOMAINS, 0)),
              "ALLIE ALLKE ALLSE ALLVD ALLWK ETOTAL");
}

TEST(Catalogue, All_AreThoseOfTheDomain) {
    const cls_xpListString bolts = Catalogue().All(Channel::FIELD, kStaticStep, Domain::BOLT_LOAD, 0);
    EXPECT_TRUE(Holds(bolts, "U"));
    EXPECT_FALSE(Holds(bolts, "S"));
    const cls_xpListString sets = Catalogue().All(Channel::FIELD, kStaticStep, Domain::SET, 0);
    EXPECT_TRUE(Holds(sets, "S"));
    EXPECT_FALSE(Holds(sets, "ALLKE")); // of history only
    // Layups, springs and fasteners are sets.
    for (const Domain domain : {Domain::LAYUP, Domain::SPRINGS, Domain::FASTENER}) {
        EXPECT_EQ(Joined(Catalogue().All(Channel::FIELD, kStaticStep, domain, 0)), Joined(sets));
    }
    EXPECT_TRUE(Holds(Catalogue().All(Channel::FIELD, kStaticStep, Domain::INTERACTION, 0), "CSTRESS"));
    EXPECT_TRUE(Catalogue().All(Channel::FIELD, 0, Domain::SET, 0).IsEmpty());
}

TEST(Catalogue, NamesOfVariablesAndComponents) {
    EXPECT_TRUE(Catalogue().IsParentRequest("U", kStaticStep));
    EXPECT_FALSE(Catalogue().IsParentRequest("U", kHeatStep));
    EXPECT_FALSE(Catalogue().IsParentRequest("u", kStaticStep));
    EXPECT_FALSE(Catalogue().IsParentRequest("U1", kStaticStep));
    EXPECT_TRUE(Catalogue().IsComponentRequest("U1", kStaticStep));
    EXPECT_FALSE(Catalogue().IsComponentRequest("U1", kHeatStep));
    // The first variable that has it, not the narrower UT.
    EXPECT_EQ(Catalogue().RequestFromComponent("U1", kStaticStep), "U");
    EXPECT_EQ(Catalogue().RequestFromComponent("U9", kStaticStep), "");
    // A variable of its own and a component.
    EXPECT_TRUE(Catalogue().IsParentRequest("MISES", kStaticStep));
    EXPECT_TRUE(Catalogue().IsComponentRequest("MISES", kStaticStep));
    EXPECT_EQ(Catalogue().Request("U", kStaticStep).Print(), Print::NODE);
    EXPECT_EQ(Catalogue().Request("U", kHeatStep).Print(), Print::NONE);
    EXPECT_EQ(Catalogue().Request("U1", kStaticStep).Name(), "");
}

TEST(Catalogue, Identifiers) {
    const korC_OdbRequestSpec& stress = Catalogue().Request("CSTRESS", kStaticStep);
    EXPECT_TRUE(stress.HasIdentifiers());
    EXPECT_EQ(stress.InputFileIdentifier("CPRESS"), "CSTRESS");
    EXPECT_EQ(stress.InputFileIdentifier("CSTRESS"), "CSTRESS");
    EXPECT_FALSE(Catalogue().Request("U", kStaticStep).HasIdentifiers());
    EXPECT_EQ(Catalogue().Request("U", kStaticStep).InputFileIdentifier("U1"), "U1");
    korC_OdbRequestSpec other;
    other.name = "A";
    other.deckId = "B";
    EXPECT_TRUE(other.HasIdentifiers());
    EXPECT_EQ(other.InputFileIdentifier("A"), "B");
    EXPECT_EQ(other.InputFileIdentifier("A1"), "A1");
}

TEST(Catalogue, InvalidPrintIdentifiers_AreThoseOfOtherKinds) {
    const cls_xpListString names = Names({"U1", "S", "HFL", "NOSUCH"});
    const auto invalid = [&](Print print) {
        return Joined(Catalogue().GetInvalidPrintIdentifiers(names, kStaticStep, print, Channel::FIELD,
                                                             Domain::ALL_DOMAINS));
    };
    EXPECT_EQ(invalid(Print::NODE), "S HFL NOSUCH");
    EXPECT_EQ(invalid(Print::ELEMENT), "U1 HFL NOSUCH");
    EXPECT_EQ(Joined(Catalogue().GetInvalidPrintIdentifiers(Names({"HFL", "NT"}), kHeatStep, Print::ELEMENT,
                                                            Print::ELEMENT_OR_CONTACT, Channel::FIELD,
                                                            Domain::ALL_DOMAINS)),
              "NT");
    EXPECT_EQ(invalid(Print::ENERGY), "U1 S HFL NOSUCH");
}

TEST(Catalogue, UsualNumbers) {
    using Table = korC_OdbRequestTable;
    EXPECT_EQ(Table::fieldFrequencyDef(), 1);
    EXPECT_EQ(Table::historyFrequencyDef(), 1);
    EXPECT_EQ(Table::fieldNumberIntervalDef(), 20);
    EXPECT_EQ(Table::historyNumberIntervalDef(), 200);
    EXPECT_EQ(Table::implicitFrequencyDef(), 10);
    EXPECT_EQ(Table::lastIncrementDef(), 99999);
}

TEST(OutputState, StartsWithWhatTheProcedureGives) {
    const korC_FieldOutputState field(kModalStep);
    EXPECT_EQ(field.frequency.ConstGet(), 10);
    EXPECT_EQ(field.numberInterval.ConstGet(), 20);
    EXPECT_TRUE(field.timeMarks.ConstGet());
    EXPECT_EQ(field.frequencyType.ConstGet(), korC_TypeEnm::FREQUENCY);
    EXPECT_EQ(field.variablesType.ConstGet(), korC_VariablesTypeEnm::PRESELECT);
    EXPECT_EQ(field.frequency.State(), mdl_PropAttributeStateEnm::SET);
    const korC_HistoryOutputState history(kExplicitStep);
    EXPECT_EQ(history.frequency.ConstGet(), 1);
    EXPECT_EQ(history.numberInterval.ConstGet(), 200);
    EXPECT_FALSE(history.timeMarks.ConstGet());
    EXPECT_EQ(history.frequencyType.ConstGet(), korC_TypeEnm::NUMBER_INTERVAL);
    EXPECT_EQ(korC_FieldOutputState(kFrequencyStep).frequencyType.ConstGet(), korC_TypeEnm::MODE_LIST);
    EXPECT_EQ(korC_FieldOutputState().frequency.ConstGet(), 1);
}

TEST(OutputState, AnUntouchedOne_HasTheSameValuesAndNoneOfThemSet) {
    const std::unique_ptr<cls_Record> record(korC_FieldOutput().NewState(kModalStep));
    const auto& state = static_cast<const korC_FieldOutputState&>(*record);
    EXPECT_EQ(state.frequency.ConstGet(), 10);
    EXPECT_EQ(state.frequency.State(), mdl_PropAttributeStateEnm::NEVER_SET);
    EXPECT_EQ(state.variables.State(), mdl_PropAttributeStateEnm::NEVER_SET);
}

TEST(OutputState, ReconstructVariables_DropsWhatTheProcedureOrChannelDoesNotKnow) {
    EXPECT_EQ(Rebuilt<korC_FieldOutputState>({" U ", "", "NOSUCH", "NT", "ALLKE", "u", "RF"}), "U RF");
    EXPECT_EQ(Rebuilt<korC_HistoryOutputState>({"U", "ALLKE"}), "U ALLKE");
    EXPECT_EQ(Rebuilt<korC_FieldOutputState>({"NT", "U"}, kHeatStep), "NT");
}

TEST(OutputState, ComponentsInAField_BecomeTheirVariable) {
    EXPECT_EQ(Rebuilt<korC_FieldOutputState>({"U1", "S", "U2", "U"}), "U S");
    EXPECT_EQ(Rebuilt<korC_HistoryOutputState>({"U1", "S", "U2", "U1"}), "U1 S U2");
    // Of some variables fields hold single components.
    EXPECT_EQ(Rebuilt<korC_FieldOutputState>({"FV1"}), "FV1");
}

TEST(OutputState, Symbols_AreKeptAndThenConverted) {
    EXPECT_EQ(Rebuilt<korC_FieldOutputState>({"PRESELECT", "ALL", "U"}), "PRESELECT ALL U");
    korC_FieldOutputState state;
    state.variablesType.Set(korC_VariablesTypeEnm::LISTED);
    state.variables.Set(Names({"PRESELECT", "U", "ALL"}));
    state.ConvertVariablesToVariablesSymbol(kStaticStep, false);
    EXPECT_EQ(Joined(state.variables.ConstGet()), "U");
    EXPECT_EQ(state.variablesType.ConstGet(), korC_VariablesTypeEnm::LISTED);
    state.variables.Set(Names({"ALL"}));
    state.ConvertVariablesToVariablesSymbol(kStaticStep, false);
    EXPECT_TRUE(state.variables.ConstGet().IsEmpty());
    EXPECT_EQ(state.variablesType.ConstGet(), korC_VariablesTypeEnm::ALL);
    state.variables.Set(Names({"PRESELECT"}));
    state.ConvertVariablesToVariablesSymbol(kStaticStep, false);
    EXPECT_EQ(state.variablesType.ConstGet(), korC_VariablesTypeEnm::PRESELECT);
}

TEST(OutputState, AListOfThePreselection_BecomesItsSymbolOnlyWhenCompared) {
    korC_FieldOutputState state;
    state.variablesType.Set(korC_VariablesTypeEnm::LISTED);
    state.variables.Set(Names({"HFL", "NT", "RFL"}));
    state.ConvertVariablesToVariablesSymbol(kHeatStep, false);
    EXPECT_EQ(Joined(state.variables.ConstGet()), "HFL NT RFL");
    state.ConvertVariablesToVariablesSymbol(kHeatStep, true);
    EXPECT_TRUE(state.variables.ConstGet().IsEmpty());
    EXPECT_EQ(state.variablesType.ConstGet(), korC_VariablesTypeEnm::PRESELECT);
    state.variables.Set(Catalogue().All(Channel::FIELD, kHeatStep, Domain::ALL_DOMAINS, 0));
    state.ConvertVariablesToVariablesSymbol(kHeatStep, true);
    EXPECT_EQ(state.variablesType.ConstGet(), korC_VariablesTypeEnm::ALL);
}

TEST(RemeshingRule, Indicators_StandBehindWhatTheyRestOn) {
    karC_RemeshingRule rule;
    rule.variables = Names({"MISESERI", "OTHER", "ENDENERI", "MISESERI"});
    EXPECT_EQ(Joined(rule.GetFullVariableList()), "MISESAVG MISESERI OTHER ENDEN ENDENERI");
    EXPECT_FALSE(rule.EveryIncrement());
    rule.outputFrequency = karC_RemeshingRule::OutputFrequencyEnm::ALL_INCREMENTS;
    EXPECT_TRUE(rule.EveryIncrement());
}

TEST(DefaultOutputType, IsTheProceduresForBothChannels) {
    for (const bool isField : {true, false}) {
        EXPECT_EQ(korC_DefaultOutputType(kExplicitStep, isField), korC_TypeEnm::NUMBER_INTERVAL);
        EXPECT_EQ(korC_DefaultOutputType(kFrequencyStep, isField), korC_TypeEnm::MODE_LIST);
        EXPECT_EQ(korC_DefaultOutputType(kStaticStep, isField), korC_TypeEnm::FREQUENCY);
        EXPECT_EQ(korC_DefaultOutputType(0, isField), korC_TypeEnm::FREQUENCY);
    }
}
