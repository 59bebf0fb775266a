#include "deck_checks/dck_Check.h"

#include "store_interface/model/odb_Odb.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"
#include "store_interface/records/sections/kseC_ConnectorSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "store_interface/records/steps/klcC_LoadCase.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"

#include <limits>

namespace {

using Texts = std::vector<std::string>;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

/// "place: text" of the findings of one code.
Texts Told(const odb_Odb& odb, std::string_view code) {
    Texts told;
    const std::string root = "/models/Default Model";
    for (const fnd_Finding& finding : dck_Check(odb)) {
        if (finding.code->name == code)
            told.push_back(finding.place.substr(root.size()) + ": " + finding.Text());
    }
    return told;
}

} // namespace

// What no model file can say, a program can put into a store.

TEST(StoreChecks, NumbersThatAreNotFinite_AreTold) {
    TestStore store;
    kseC_GasketSection gasket;
    gasket.initialGap = kInfinity;
    store.model.sections.Insert("Gasket", gasket);
    kamC_Tabular amplitude;
    amplitude.table = cow_2DArray<double>(2, 2);
    amplitude.table.Put(1, 0, 1.0);
    amplitude.table.Put(1, 1, std::numeric_limits<double>::quiet_NaN());
    store.model.amplitudes.Insert("Ramp", amplitude);
    EXPECT_EQ(Told(store.odb, "wrong-value"),
              (Texts{"/sections/Gasket/initialGap: found a number that isn't finite, expected a number",
                     "/amplitudes/Ramp/table/1/1: found a number that isn't finite, expected a number"}));
}

TEST(StoreChecks, LoadCase_NamesLoadsThatAreThere_WithFiniteFactors) {
    TestStore store;
    store.model.steps.Append("Initial", kprC_InitialStep());
    kprC_StaticLinearPerturbationStep step;
    klcC_LoadCase loadCase;
    loadCase.loads.Insert("Pull", std::numeric_limits<float>::infinity());
    step.loadCases.Insert("Case", loadCase);
    store.model.steps.Append("Step-1", step);
    EXPECT_EQ(
        Told(store.odb, "wrong-value"),
        Texts{"/steps/1/loadCases/Case/loads/Pull: found a number that isn't finite, expected a number"});
    EXPECT_EQ(Told(store.odb, "no-such-name"),
              Texts{"/steps/1/loadCases/Case/loads/Pull: found 'Pull', expected the name of a load; there is "
                    "none"});
}

TEST(StoreChecks, ValueThatIsNoneOfItsEnumeration_IsTold) {
    TestStore store;
    kamC_Tabular amplitude;
    amplitude.timeSpan = static_cast<kamC_Amplitude::TimeSpanEnm>(7);
    store.model.amplitudes.Insert("Ramp", amplitude);
    EXPECT_EQ(Told(store.odb, "wrong-value"),
              Texts{"/amplitudes/Ramp/timeSpan: found 7, expected one of STEP, TOTAL"});
}

TEST(StoreChecks, ListOfAnotherLength_IsTold) {
    TestStore store;
    kseC_ConnectorSection section;
    section.constitutiveReference = cow_List<double>();
    for (int i = 0; i < 5; ++i) section.constitutiveReference.Append(1.0);
    store.model.sections.Insert("Joint", section);
    EXPECT_EQ(Told(store.odb, "wrong-value"),
              Texts{"/sections/Joint/constitutiveReference: found 5 items, expected an array of 6 items"});
}

TEST(StoreChecks, EmptyNameThatIsNeeded_IsMissing) {
    TestStore store;
    store.model.sections.Insert("Shell", kseC_HomogenousShellSection());
    EXPECT_EQ(Told(store.odb, "missing-field"),
              Texts{"/sections/Shell/materialName: found nothing, expected material"});
}

TEST(StoreChecks, FindingToIgnoreThatIsNone_IsToldWithTheNearest) {
    TestStore store;
    odiK_IgnoredFinding entry;
    entry.code = "unusd";
    entry.reason = "our library";
    store.model.ignore.Append(entry);
    EXPECT_EQ(Told(store.odb, "no-such-name"),
              Texts{"/ignore/0/code: found 'unusd', expected the code of a warning or a note; did you mean "
                    "'unused'?"});
}
