#include "conditions/LoadTesting.h"
#include "conditions/oif_LoadBuilder.h"

#include <chrono>

namespace {

const std::string kBanner = "** \n** LOADS\n** \n";

std::string Text(ConditionModel& model, const char* step, const char* loadCase = "") {
    return StepText<oif_LoadBuilder>(model, step, loadCase);
}

/// A concentrated force by name, of one component.
std::string Force(const std::string& name, const char* set, const std::string& states,
                  const std::string& fields = "") {
    return "\"" + name + R"(": {"class": "kloC_ConcentratedForce", "region": "A.)" + set + "\"" + fields +
           R"(, "states": {)" + states + "}}";
}

ConditionModel Loads(std::string_view steps, const std::string& loads, const std::string& others = "") {
    return {steps, R"("loads": {)" + loads + "}" + others};
}

std::string Comment(const char* name, const char* type = "Concentrated force") {
    return std::string("** Name: ") + name + "   Type: " + type + "\n";
}

} // namespace

TEST(LoadBuilder, LoadThatBegins_HasBannerCommentAndKeyword) {
    ConditionModel model = Loads("IGG", Force("L 1", "N", R"("S1": {"component1": 2})"));
    EXPECT_EQ(Text(model, "S0"), "");
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("L 1") + "*Cload\nA.N, 1, 2.\n");
}

TEST(LoadBuilder, LoadThatGoesOnWithoutAFlag_LeavesNothingBehind) {
    ConditionModel model = Loads("IGG", Force("L", "N", R"("S1": {"component1": 2})"));
    EXPECT_EQ(Text(model, "S2"), "");
}

TEST(LoadBuilder, LoadOfTheInitialStep_IsWrittenWhenItChanges) {
    ConditionModel model =
        Loads("IGG", Force("L", "N", R"("S0": {"component1": 2}, "S2": {"component1": 3})"));
    EXPECT_EQ(Text(model, "S0"), "");
    EXPECT_EQ(Text(model, "S1"), "");
    EXPECT_EQ(Text(model, "S2"), kBanner + Comment("L") + "*Cload\nA.N, 1, 3.\n");
}

TEST(LoadBuilder, EndOfOneLoad_WritesItsFamilyAnewInThatStep) {
    ConditionModel model = Loads(
        "IGGG",
        Force("a", "N", R"("S1": {"component1": 1}, "S2": {"deactivated": true})") + ", " +
            Force("b", "N2", R"("S1": {"component2": 2, "amplitude": "Ramp"})") +
            R"(, "p": {"class": "kloC_Pressure", "region": "A.F", "states": {"S1": {"magnitude": 3}}})");
    EXPECT_EQ(Text(model, "S2"), kBanner + Comment("a") + "*Cload, op=NEW\n" + Comment("b") +
                                     "*Cload, op=NEW, amplitude=Ramp\nA.N2, 2, 2.\n");
    EXPECT_EQ(Text(model, "S3"), "");
}

TEST(LoadBuilder, TwoLoadsOfAFamilyOnOneRegion_AreWrittenAnewInEveryStep) {
    ConditionModel model = Loads("IGG", Force("a", "N", R"("S1": {"component1": 1})") + ", " +
                                            Force("b", "N", R"("S1": {"component1": 2})"));
    const std::string text = kBanner + Comment("a") + "*Cload, op=NEW\nA.N, 1, 1.\n" + Comment("b") +
                             "*Cload, op=NEW\nA.N, 1, 2.\n";
    EXPECT_EQ(Text(model, "S1"), text);
    EXPECT_EQ(Text(model, "S2"), text);
}

TEST(LoadBuilder, SuppressedLoad_LeavesNoTrace) {
    ConditionModel model =
        Loads("IGG", Force("a", "N", R"("S1": {"component1": 1}, "S2": {"deactivated": true})",
                           R"(, "suppressed": true)") +
                         ", " + Force("b", "N", R"("S1": {"component1": 2})"));
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("b") + "*Cload\nA.N, 1, 2.\n");
    EXPECT_EQ(Text(model, "S2"), "");
}

TEST(LoadBuilder, LoadCases_TakeTheLoadsThatTheyNameWithTheirFactors) {
    ConditionModel model = Loads(
        "IL{\"loadCases\": {\"c1\": {\"loads\": {\"a\": 0.5}}, \"c2\": {\"loads\": {\"a\": -2, \"f\": 3}}}}",
        Force("a", "N", R"("S1": {"component1": 1})") + ", " +
            Force("b", "N2", R"("S1": {"component1": 1})") +
            R"(, "f": {"class": "kloC_ConcentratedHeatFlux", "region": "A.N", "states": {"S1": {"magnitude": 7}}})");
    EXPECT_EQ(Text(model, "S1"), "");
    EXPECT_EQ(Text(model, "S1", "c1"),
              "** Name: a   Type: Concentrated force   Scale factor: 0.5\n*Cload\nA.N, 1, 0.5\n");
    // A flux is not scaled.
    EXPECT_EQ(Text(model, "S1", "c2"),
              "** Name: a   Type: Concentrated force   Scale factor: -2\n*Cload\nA.N, 1, -2.\n"
              "** Name: f   Type: Concentrated heat flux   Scale factor: 3\n*Cflux\nA.N, 11, 7.\n");
}

TEST(LoadBuilder, ScaleFactorOfSinglePrecision_HasSixDigitsInTheCommentAndInTheLine) {
    ConditionModel model = Loads("IL{\"loadCases\": {\"c\": {\"loads\": {\"a\": 1e-7}}}}",
                                 Force("a", "N", R"("S1": {"component1": 1})"));
    EXPECT_EQ(Text(model, "S1", "c"),
              "** Name: a   Type: Concentrated force   Scale factor: 1e-07\n*Cload\nA.N, 1, 1e-07\n");
}

TEST(LoadBuilder, LoadCasesThatTakeStepLoadsOnly_LeaveTheLoadInTheStepUnscaled) {
    ConditionModel model =
        Loads("IL{\"loadCases\": {\"c\": {\"loads\": {\"a\": 0.5}, \"loadsAreStepLoads\": true}}}",
              Force("a", "N", R"("S1": {"component1": 1})"));
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("a") + "*Cload\nA.N, 1, 1.\n");
    EXPECT_EQ(Text(model, "S1", "c"), "");
}

TEST(LoadBuilder, OneLoadCaseWithLoadsOfItsOwn_LeavesNothingToTheStep) {
    ConditionModel model =
        Loads("IL{\"loadCases\": {\"c1\": {\"loadsAreStepLoads\": true}, \"c2\": {\"loads\": {\"b\": 1}}}}",
              Force("a", "N", R"("S1": {"component1": 1})") + ", " + Force("b", "N2", ""));
    for (const char* loadCase : {"", "c1", "c2"}) EXPECT_EQ(Text(model, "S1", loadCase), "") << loadCase;
}

TEST(LoadBuilder, PressureFromAField_IsItsCommentAlone) {
    ConditionModel model = Loads(
        "IG",
        R"("p": {"class": "kloC_Pressure", "region": "A.F", "distributionType": "FIELD", "fieldName": "f",
                       "states": {"S1": {"magnitude": 3}}},
                 "t": {"class": "kloC_ShellEdgeLoad", "region": "A.F", "distributionType": "FIELD",
                       "states": {"S1": {"magnitude": 3}}})");
    // They lie on one surface, so even that is said under op=NEW: the comments show nothing of it.
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("p", "Pressure") + Comment("t", "Shell edge load"));
}

TEST(LoadBuilder, Pressure_NamesTheSetOfItsReferenceNode) {
    ConditionModel model = Loads(
        "IG",
        R"("p": {"class": "kloC_Pressure", "region": "A.F", "distributionRegion": "A.N2", "states": {"S1": {"magnitude": 3}}})");
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("p", "Pressure") + "*Dsload, ref node=A.N2\nA.F, P, 3.\n");
}

TEST(LoadBuilder, PressureWithoutARegion_Raises) {
    ConditionModel model =
        Loads("IG", R"("p": {"class": "kloC_Pressure", "states": {"S1": {"magnitude": 3}}})");
    EXPECT_EQ(Raised([&] { Text(model, "S1"); }), "! setName.Empty()");
}

TEST(LoadBuilder, CyclicMode_IsOfTheModalHarmonicStepOnly) {
    const std::string cyclic =
        R"(, "interactions": {"a": {"class": "kinC_CyclicSymmetry", "suppressed": true, "states": {"S0": {"cyclicMode": 9}}},
                              "b": {"class": "kinC_CyclicSymmetry", "states": {"S0": {"cyclicMode": 2}}},
                              "c": {"class": "kinC_CyclicSymmetry", "states": {"S0": {"cyclicMode": 8}}}})";
    const char pressure[] =
        R"("p": {"class": "kloC_Pressure", "region": "A.F", "states": {"S1": {"magnitude": 3}, "S3": {"magnitude": 4}}})";
    ConditionModel model = Loads("IDFS", pressure, cyclic);
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("p", "Pressure") + "*Dsload\nA.F, P, 3.\n");
    EXPECT_EQ(Text(model, "S3"), kBanner + Comment("p", "Pressure") + "*Dsload, cyclic mode=2\nA.F, P, 4.\n");
    ConditionModel without = Loads("IDFS", pressure);
    EXPECT_EQ(Text(without, "S3"), kBanner + Comment("p", "Pressure") + "*Dsload\nA.F, P, 4.\n");
}

TEST(LoadBuilder, InertiaRelief_IsACommentAlone) {
    ConditionModel model = Loads(
        "IGG", R"("r": {"class": "kloC_InertiaRelief", "states": {"S1": {}, "S2": {"deactivated": true}}})");
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("r", "Inertia relief"));
    EXPECT_EQ(Text(model, "S2"), kBanner + Comment("r", "Inertia relief"));
}

TEST(LoadBuilder, EndOfOneOfTwoInertiaReliefs_IsTheBannerAloneOnPurpose) {
    const auto reliefs = [](const char* other) {
        return std::string(
                   R"("r": {"class": "kloC_InertiaRelief", "region": "A.N", "states": {"S1": {}, "S2": {"deactivated": true}}},
                              "s": {"class": "kloC_InertiaRelief", "region": "A.N2", )") +
               other + "}";
    };
    // One that ends in the same step counts, for both.
    ConditionModel both = Loads("IGG", reliefs(R"("states": {"S1": {}, "S2": {"deactivated": true}})"));
    EXPECT_EQ(Text(both, "S2"), kBanner);
    // One that goes on is said anew and doesn't count.
    ConditionModel goesOn = Loads("IGG", reliefs(R"("states": {"S1": {}})"));
    EXPECT_EQ(Text(goesOn, "S2"), kBanner + Comment("r", "Inertia relief") + Comment("s", "Inertia relief"));
    ConditionModel begins = Loads("IGG", reliefs(R"("states": {"S2": {}})"));
    EXPECT_EQ(Text(begins, "S2"), kBanner + Comment("s", "Inertia relief"));
    ConditionModel suppressed =
        Loads("IGG", reliefs(R"("suppressed": true, "states": {"S1": {}, "S2": {"deactivated": true}})"));
    EXPECT_EQ(Text(suppressed, "S2"), kBanner + Comment("r", "Inertia relief"));
}

TEST(LoadBuilder, BoltForce_IsALoadInItsFirstMethodOnly) {
    ConditionModel model = Loads("IGGG",
                                 R"("b": {"class": "kloC_BoltLoad", "region": "A.F",
                 "states": {"S1": {"magnitude": 10}, "S2": {"boltMethod": "FIX_LENGTH"}}},
           "c": {"class": "kloC_BoltLoad", "region": "A.N", "states": {"S1": {"boltMethod": "ADJUST_LENGTH"}}})");
    EXPECT_EQ(Text(model, "S1"), kBanner + Comment("b", "Bolt load") + "*Cload\n, 1, 10.\n");
    EXPECT_EQ(Text(model, "S2"), kBanner + Comment("b", "Bolt load") + "*Cload, op=NEW\n");
    EXPECT_EQ(Text(model, "S3"), "");
}

TEST(LoadBuilder, LoadsWithoutAKeyword_Raise) {
    ConditionModel unwritten = Loads("IG", R"("u": {"class": "kloC_UnwrittenLoad", "states": {"S1": {}}})");
    EXPECT_EQ(Raised([&] { Text(unwritten, "S1"); }), "Unimplemented load type conversion");
    ConditionModel idle = Loads("IG", R"("u": {"class": "kloC_UnwrittenLoad"})");
    EXPECT_EQ(Text(idle, "S1"), "");
    ConditionModel submodel = Loads("IG", R"("u": {"class": "kloC_SubmodelStressBased"})");
    EXPECT_EQ(Raised([&] { Text(submodel, "S1"); }), "Unimplemented load->statusKey conversion");
    ConditionModel suppressed =
        Loads("IG", R"("u": {"class": "kloC_SubmodelStressBased", "suppressed": true})");
    EXPECT_EQ(Text(suppressed, "S1"), "");
}

TEST(LoadBuilder, Failure_TellsItsStepAndLoad) {
    ConditionModel model = Loads("IG", R"("u": {"class": "kloC_UnwrittenLoad", "states": {"S1": {}}})");
    std::string context;
    try {
        Text(model, "S1");
    } catch (const QRXBasException& failure) {
        context = failure.Context();
    }
    EXPECT_EQ(context, "step 'S1', load 'u'");
}

TEST(LoadBuilder, EveryClass_HasItsKeywordAndLabel) {
    const struct {
        const char* className;
        const char* label;
        const char* keyword;
    } classes[] = {
        {"BodyForce", "Body force", "*Dload"},
        {"Gravity", "Gravity", "*Dload"},
        {"LineLoad", "Line load", "*Dload"},
        {"PipePressure", "Pipe pressure", "*Dload"},
        {"RotationalBodyForce", "Rotational body force", "*Dload"},
        {"ConnectorForce", "Connector force", "*Connector Load"},
        {"ConnectorMoment", "Connector moment", "*Connector Load"},
        {"Pressure", "Pressure", "*Dsload"},
        {"SurfaceTraction", "Surface traction", "*Dsload"},
        {"ShellEdgeLoad", "Shell edge load", "*Dsload"},
        {"ConcentratedForce", "Concentrated force", "*Cload"},
        {"Moment", "Moment", "*Cload"},
        {"PEGLoad", "Generalized plane strain", "*Cload"},
        {"ConcentratedPoreFluid", "Concentrated pore fluid flow", "*Cload"},
        {"InwardVolAccel", "Inward volume acceleration", "*Cload"},
        {"ConcentratedHeatFlux", "Concentrated heat flux", "*Cflux"},
        {"ConcentratedConcentrationFlux", "Concentrated concentration flux", "*Cflux"},
        {"BodyHeatFlux", "Body heat flux", "*Dflux"},
        {"BodyConcentrationFlux", "Body concentration flux", "*Dflux"},
        {"SurfaceHeatFlux", "Surface heat flux", "*Dsflux"},
        {"SurfaceConcentrationFlux", "Surface concentration flux", "*Dsflux"},
        {"SurfacePoreFluid", "Surface pore fluid flow", "*Dsflow"},
        {"HydroFluidFlow", "Fluid flux", "*Fluid Flux"},
        {"ConcentratedCharge", "Concentrated charge", "*Cecharge"},
        {"ConcentratedCurrent", "Concentrated current", "*Cecurrent"},
        {"SurfaceCharge", "Surface charge", "*Dsecharge"},
        {"SurfaceCurrent", "Surface current", "*Dsecurrent"},
        {"BodyCharge", "Body charge", "*Decharge"},
        {"BodyCurrent", "Body current", "*Decurrent"},
    };
    for (const auto& c : classes) {
        OneLoad model("IGG", c.className, R"("S1": {}, "S2": {"deactivated": true})");
        EXPECT_EQ(Text(model, "S2"), kBanner + Comment("L", c.label) + c.keyword + ", op=NEW\n");
    }
}

TEST(LoadBuilder, ManyLoadsOverManySteps_TakeTimeThatGrowsWithThem) {
    const auto seconds = [](int count) {
        std::string loads;
        for (int i = 0; i < count; ++i) {
            loads += (i == 0 ? "" : ", ") +
                     Force("L" + std::to_string(i), "N", R"("S1": {"component1": 1})",
                           R"(, "suppressed": )" + std::string(i % 2 == 0 ? "false" : "true"));
        }
        ConditionModel model = Loads("I" + std::string(static_cast<std::size_t>(count / 40), 'G'), loads);
        const auto begin = std::chrono::steady_clock::now();
        oif_LoadBuilder builder(model.Info());
        builder.Build();
        return std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count();
    };
    // Both lists grow four times: a product of loads and steps takes 16 times as long, not 64.
    const double few = seconds(500) + 1e-3;
    EXPECT_LT(seconds(2000), 40 * few);
}

// A goes on while the others end, so that it is said again.
TEST(LoadBuilder, StepsThatSayALoadAgain_ShareItsKeyword) {
    ConditionModel model = Loads(
        "IGGGG", Force("A", "N", R"("S1": {"component1": 1}, "S4": {"component1": 2})") + ", " +
                     Force("B", "N2", R"("S1": {"component1": 1}, "S2": {"deactivated": true})") + ", " +
                     Force("C", "N3", R"("S1": {"component1": 1}, "S3": {"deactivated": true})"));
    oif_LoadBuilder builder(model.Info());
    builder.Build();
    // The banner, then the comment and the keyword of A.
    const auto keyword = [&](const char* step) {
        return static_cast<qkw_BuilderComponent&>(builder).StepDefinition(step)[2];
    };
    EXPECT_EQ(Written(keyword("S2").ConstGet()), "*Cload, op=NEW\nA.N, 1, 1.\n");
    EXPECT_EQ(keyword("S2"), keyword("S3"));
    EXPECT_EQ(Written(keyword("S1").ConstGet()), "*Cload\nA.N, 1, 1.\n");
    EXPECT_EQ(Written(keyword("S4").ConstGet()), "*Cload\nA.N, 1, 2.\n");
}
