#include "ProcedureCases.h"
#include "steps/oif_DynamicProcedures.h"

namespace {

using Increments = kprC_Step::TimeIncrementationEnm;
using Implicit = kprC_ImplicitDynamicsStep;
using Explicit = kprC_ExplicitDynamicsStep;
using ExplicitIncrements = Explicit::TimeIncrementationEnm;
using TempDisplacement = kprC_TempDisplacementDynamicsStep;
using Subspace = kprC_SubspaceDynamicsStep;

oif_DynamicTempDisplacement Keyword(const TempDisplacement& record) {
    static TestStore store;
    return {record, store.Info()};
}

/// The cases that the two explicit procedures share; `Name` is the keyword's text.
template <class Step, class Make>
void ExpectExplicitTexts(const std::string& name, const Make& make) {
    const std::vector<ProcedureCase<Step>> cases = {
        {"automatic", [](Step&) {}, "\n, 1.\n"},
        {"automatic with a bound", [](Step& s) { s.maxIncrement = 1e-6; }, "\n, 1.,, 1e-06\n"},
        {"automatic with a scale factor",
         [](Step& s) {
             s.scaleFactor = 0.5;
             s.initialInc = 1e-7;
         },
         ", scale factor=0.5\n, 1.\n"},
        {"user control",
         [](Step& s) {
             s.timeIncrementationMethod = ExplicitIncrements::DIRECT_USER_CONTROL;
             s.initialInc = 1e-7;
             s.maxIncrement = 1e-6;
             s.scaleFactor = 0.5;
         },
         ", direct user control\n1e-07, 1.\n"},
        {"element by element",
         [](Step& s) { s.timeIncrementationMethod = ExplicitIncrements::ELEMENT_BY_ELEMENT; },
         ", element by element\n, 1.\n"},
        {"element by element with all",
         [](Step& s) {
             s.timeIncrementationMethod = ExplicitIncrements::ELEMENT_BY_ELEMENT;
             s.timePeriod = 0.25;
             s.maxIncrement = 0.0;
             s.scaleFactor = 2.0;
         },
         ", element by element, scale factor=2.\n, 0.25,, 0.\n"},
        {"fixed",
         [](Step& s) {
             s.timeIncrementationMethod = ExplicitIncrements::FIXED;
             s.initialInc = 1e-7;
             s.maxIncrement = 1e-6;
         },
         ", fixed time incrementation\n, 1.\n"},
        {"fixed with a scale factor",
         [](Step& s) {
             s.timeIncrementationMethod = ExplicitIncrements::FIXED;
             s.scaleFactor = 0.9;
         },
         ", fixed time incrementation, scale factor=0.9\n, 1.\n"},
    };
    for (const auto& each : cases) {
        Step record;
        each.change(record);
        EXPECT_EQ(Written(make(record)), name + each.expected) << each.situation;
    }
}

} // namespace

TEST(ImplicitDynamics, Parameters_FollowTheRecordWithoutBlanksOnPurpose) {
    ExpectTexts<oif_ImplicitDynamics, Implicit>({
        {"damping", [](Implicit& s) { s.alpha = -0.05; }, "*Dynamic,alpha=-0.05,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"damping of zero", [](Implicit& s) { s.alpha = 0.0; },
         "*Dynamic,alpha=0.,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"adiabatic", [](Implicit& s) { s.adiabatic = true; },
         "*Dynamic,adiabatic,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"no initial accelerations",
         [](Implicit& s) { s.initialConditions = Implicit::InitialConditionsEnm::NONE; },
         "*Dynamic,haftol=0.,initial=NO\n1.,1.,1e-05,1.\n"},
        {"initial accelerations",
         [](Implicit& s) { s.initialConditions = Implicit::InitialConditionsEnm::COMPUTE; },
         "*Dynamic,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"no half-step residual, automatic", [](Implicit& s) { s.nohaf = true; },
         "*Dynamic,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"everything, direct",
         [](Implicit& s) {
             s.alpha = -0.1;
             s.adiabatic = true;
             s.timeIncrementationMethod = Increments::DIRECT;
             s.noStop = true;
             s.nohaf = true;
             s.initialConditions = Implicit::InitialConditionsEnm::NONE;
             s.initialInc = 0.01;
             s.timePeriod = 0.5;
         },
         "*Dynamic,alpha=-0.1,adiabatic,direct=NO STOP,nohaf,initial=NO\n0.01,0.5,\n"},
        {"automatic increments",
         [](Implicit& s) {
             s.initialInc = 0.01;
             s.timePeriod = 0.5;
             s.minInc = 5e-7;
             s.maxInc = 0.02;
         },
         "*Dynamic,haftol=0.\n0.01,0.5,5e-07,0.02\n"},
    });
}

TEST(ImplicitDynamics, HalfStepResidual_IsWrittenUnlessDirectWhateverItsValue) {
    ExpectTexts<oif_ImplicitDynamics, Implicit>({
        {"automatic", [](Implicit& s) { s.haftol = 1000.0; }, "*Dynamic,haftol=1000.\n1.,1.,1e-05,1.\n"},
        {"automatic, zero", [](Implicit&) {}, "*Dynamic,haftol=0.\n1.,1.,1e-05,1.\n"},
        {"direct",
         [](Implicit& s) {
             s.timeIncrementationMethod = Increments::DIRECT;
             s.haftol = 1000.0;
         },
         "*Dynamic,direct\n1.,1.,\n"},
        {"of no known kind",
         [](Implicit& s) {
             s.timeIncrementationMethod = Increments{2};
             s.haftol = 1000.0;
         },
         "*Dynamic,haftol=1000.\n1.,1.,\n"},
    });
}

TEST(ExplicitDynamics, Parameters_FollowTheKindOfIncrements) {
    ExpectExplicitTexts<Explicit>("*Dynamic, Explicit",
                                  [](const Explicit& record) { return oif_ExplicitDynamics(record); });
}

TEST(ExplicitDynamics, Adiabatic_StandsBeforeTheKindOfIncrements) {
    Explicit record;
    record.adiabatic = true;
    record.timeIncrementationMethod = ExplicitIncrements::FIXED;
    EXPECT_EQ(Written(oif_ExplicitDynamics(record)),
              "*Dynamic, Explicit, adiabatic, fixed time incrementation\n, 1.\n");
}

TEST(ExplicitDynamics, UnknownKindOfIncrements_RaisesBehindTheFirstParameters) {
    Explicit record;
    record.adiabatic = true;
    record.timeIncrementationMethod = ExplicitIncrements{4};
    const auto [text, raised] = WrittenUntilRaised(oif_ExplicitDynamics(record));
    EXPECT_EQ(text, "*Dynamic, Explicit, adiabatic");
    EXPECT_EQ(raised, "Corrupted Explicit Dynamics procedure");
}

TEST(DynamicTempDisplacement, Parameters_FollowTheKindOfIncrements) {
    ExpectExplicitTexts<TempDisplacement>("*Dynamic Temperature-displacement, Explicit", Keyword);
}

TEST(DynamicTempDisplacement, UnknownKindOfIncrements_RaisesItsOwnText) {
    TempDisplacement record;
    record.timeIncrementationMethod = ExplicitIncrements{-1};
    const auto [text, raised] = WrittenUntilRaised(Keyword(record));
    EXPECT_EQ(text, "*Dynamic Temperature-displacement, Explicit");
    EXPECT_EQ(raised, "Corrupted Dynamic, Temp-displacement procedure");
}

TEST(BulkViscosity, ExplicitSteps_WriteBothCoefficients) {
    Explicit record;
    EXPECT_EQ(Written(oif_BulkViscosity(record)), "*Bulk Viscosity\n0.06, 1.2\n");
    TempDisplacement other;
    other.linearBulkViscosity = 0.0;
    other.quadraticBulkViscosity = 2.0;
    EXPECT_EQ(Written(oif_BulkViscosity(other)), "*Bulk Viscosity\n0., 2.\n");
}

TEST(BulkViscosity, OtherSteps_WriteNothing) {
    const Implicit record;
    EXPECT_EQ(Written(oif_BulkViscosity(record)), "");
}

TEST(SubspaceDynamics, Vectors_AreWrittenAboveZero) {
    ExpectTexts<oif_SubspaceDynamics, Subspace>({
        {"none", [](Subspace&) {}, "*Dynamic, subspace\n1., 1., \n"},
        {"ten",
         [](Subspace& s) {
             s.vectors = 10;
             s.initialInc = 0.001;
             s.timePeriod = 0.5;
         },
         "*Dynamic, subspace, vectors=10\n0.001, 0.5, \n"},
        {"below zero", [](Subspace& s) { s.vectors = -1; }, "*Dynamic, subspace\n1., 1., \n"},
    });
}
