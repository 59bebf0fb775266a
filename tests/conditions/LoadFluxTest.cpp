#include "conditions/LoadTesting.h"
#include "conditions/oif_FluxLoads.h"

namespace {

template <class Keyword>
std::string Text(const OneLoad& load, const char* step, oif_Op op = oif_Op::MODIFY) {
    return Written(Keyword(load.Card(step, op)));
}

struct FluxCase {
    const char* className;
    std::string (*write)(const OneLoad&, const char*, oif_Op);
    const char* keyword;
    const char* label;
    const char* userLabel; // null: it has no distribution
};

void PrintTo(const FluxCase& c, std::ostream* out) {
    *out << c.className;
}

const FluxCase kFluxes[] = {
    {"ConcentratedHeatFlux", Text<oif_Cflux>, "*Cflux", ", 11, ", nullptr},
    {"ConcentratedConcentrationFlux", Text<oif_Cflux>, "*Cflux", ", 11, ", nullptr},
    {"BodyHeatFlux", Text<oif_Dflux>, "*Dflux", ", BF, ", ", BFNU, "},
    {"BodyConcentrationFlux", Text<oif_Dflux>, "*Dflux", ", BF, ", ", BFNU, "},
    {"SurfaceHeatFlux", Text<oif_Dsflux>, "*Dsflux", ", S, ", ", SNU, "},
    {"SurfaceConcentrationFlux", Text<oif_Dsflux>, "*Dsflux", ", S, ", ", SNU, "},
    {"SurfacePoreFluid", Text<oif_Dsflow>, "*Dsflow", ", S, ", ", SNU, "},
    {"HydroFluidFlow", Text<oif_FluidFlux>, "*Fluid Flux", ", ", nullptr},
};

const FluxCase kElectrical[] = {
    {"ConcentratedCharge", Text<oif_Cecharge>, "*Cecharge", ", ,", nullptr},
    {"ConcentratedCurrent", Text<oif_Cecurrent>, "*Cecurrent", ", ,", nullptr},
    {"BodyCharge", Text<oif_Decharge>, "*Decharge", ",EBF,", nullptr},
    {"BodyCurrent", Text<oif_Decurrent>, "*Decurrent", ",CBF,", nullptr},
    {"SurfaceCharge", Text<oif_Dsecharge>, "*Dsecharge", ",ES,", nullptr},
    {"SurfaceCurrent", Text<oif_Dsecurrent>, "*Dsecurrent", ",CS,", nullptr},
};

std::string CaseName(const testing::TestParamInfo<FluxCase>& param) {
    return param.param.className;
}

class Flux : public testing::TestWithParam<FluxCase> {};
class Electrical : public testing::TestWithParam<FluxCase> {};

} // namespace

TEST_P(Flux, Line_HasTheLabelOfItsKeyword) {
    const FluxCase& c = GetParam();
    const OneLoad load("IG", c.className, R"("S1": {"magnitude": 5, "amplitude": "my amp"})");
    EXPECT_EQ(c.write(load, "S1", oif_Op::MODIFY),
              std::string(c.keyword) + ", amplitude=\"my amp\"\nA.N" + c.label + "5.\n");
}

TEST_P(Flux, MagnitudeThatDidNotChange_IsWrittenAllTheSame) {
    const FluxCase& c = GetParam();
    const OneLoad load("IGGG", c.className,
                       R"("S1": {"magnitude": 5}, "S2": {}, "S3": {"magnitude": null, "amplitude": "Ramp"})");
    const std::string line = std::string("A.N") + c.label;
    EXPECT_EQ(c.write(load, "S2", oif_Op::MODIFY), std::string(c.keyword) + "\n" + line + "5.\n");
    EXPECT_EQ(c.write(load, "S2", oif_Op::NEW), std::string(c.keyword) + ", op=NEW\n" + line + "5.\n");
    EXPECT_EQ(c.write(load, "S3", oif_Op::MODIFY),
              std::string(c.keyword) + ", amplitude=Ramp\n" + line + "0.\n");
}

TEST_P(Flux, LoadThatEnds_IsItsLineAloneWithOpNewAlways) {
    const FluxCase& c = GetParam();
    const OneLoad load("IGG", c.className,
                       R"("S1": {"magnitude": 5, "amplitude": "Ramp"}, "S2": {"deactivated": true})");
    EXPECT_EQ(c.write(load, "S2", oif_Op::MODIFY), std::string(c.keyword) + ", op=NEW\n");
}

INSTANTIATE_TEST_SUITE_P(All, Flux, testing::ValuesIn(kFluxes), CaseName);

TEST(FluxLabels, UserDefined_HasItsOwnAndANamedFieldThePlainOne) {
    for (const FluxCase& c : kFluxes) {
        if (c.userLabel == nullptr) continue;
        const OneLoad user("IG", c.className, R"("S1": {"magnitude": 5})",
                           R"("distributionType": "USER_DEFINED")");
        EXPECT_EQ(c.write(user, "S1", oif_Op::MODIFY),
                  std::string(c.keyword) + "\nA.N" + c.userLabel + "5.\n");
        const OneLoad field("IG", c.className, R"("S1": {"magnitude": 5})", R"("distributionType": "FIELD")");
        EXPECT_EQ(c.write(field, "S1", oif_Op::MODIFY), std::string(c.keyword) + "\nA.N" + c.label + "5.\n");
    }
}

TEST(Cflux, DegreeOfFreedom_IsThatOfTheLoad) {
    const OneLoad load("IG", "ConcentratedHeatFlux", R"("S1": {"magnitude": 0.5})", R"("dof": 13)");
    EXPECT_EQ(Text<oif_Cflux>(load, "S1"), "*Cflux\nA.N, 13, 0.5\n");
}

TEST_P(Electrical, RealLoad_IsOneBlockWithoutALoadCase) {
    const FluxCase& c = GetParam();
    const OneLoad load("IGG", c.className, R"("S1": {"magnitude": 5, "amplitude": "my amp"}, "S2": {})");
    const std::string line = std::string("A.N") + c.label + "5.\n";
    EXPECT_EQ(c.write(load, "S1", oif_Op::MODIFY),
              std::string(c.keyword) + ", amplitude=\"my amp\"\n" + line);
    // A magnitude that is carried over is written under op=NEW only.
    EXPECT_EQ(c.write(load, "S2", oif_Op::MODIFY), std::string(c.keyword) + ", amplitude=\"my amp\"\n");
    EXPECT_EQ(c.write(load, "S2", oif_Op::NEW),
              std::string(c.keyword) + ", op=NEW, amplitude=\"my amp\"\n" + line);
}

TEST_P(Electrical, RealMagnitudeOfZero_IsWrittenWhereItWasSet) {
    const FluxCase& c = GetParam();
    const OneLoad load("IGG", c.className, R"("S1": {"magnitude": 0}, "S2": {"magnitude": null})");
    EXPECT_EQ(c.write(load, "S1", oif_Op::MODIFY), std::string(c.keyword) + "\nA.N" + c.label + "0.\n");
    EXPECT_EQ(c.write(load, "S2", oif_Op::NEW), std::string(c.keyword) + ", op=NEW\n");
}

TEST_P(Electrical, ChangedAmplitude_DoesNotWriteTheMagnitudeAnew) {
    const FluxCase& c = GetParam();
    const OneLoad load("IGG", c.className, R"("S1": {"magnitude": 5}, "S2": {"amplitude": "Ramp"})");
    EXPECT_EQ(c.write(load, "S2", oif_Op::MODIFY), std::string(c.keyword) + ", amplitude=Ramp\n");
}

TEST_P(Electrical, ComplexLoad_HasTwoCardsWhateverItsParts) {
    const FluxCase& c = GetParam();
    const std::string card = std::string(c.keyword) + ", load case=";
    const std::string line = std::string("A.N") + c.label;
    const auto text = [&](const char* value) {
        return c.write(OneLoad("ID", c.className, R"("S1": {"magnitude": 9})",
                               std::string(R"("complex": true, "complexMagnitude": )") + value),
                       "S1", oif_Op::MODIFY);
    };
    EXPECT_EQ(text("[1, 2]"), card + "1\n" + line + "1.\n" + card + "2\n" + line + "2.\n");
    // A real part of 0 is written, an imaginary one is not.
    EXPECT_EQ(text("[0, 0]"), card + "1\n" + line + "0.\n" + card + "2\n");
}

TEST_P(Electrical, LoadThatEnds_KeepsAmplitudeAndLoadCaseOnPurpose) {
    const FluxCase& c = GetParam();
    const char states[] = R"("S1": {"magnitude": 5, "amplitude": "Ramp"}, "S2": {"deactivated": true})";
    const OneLoad real("IGG", c.className, states);
    EXPECT_EQ(c.write(real, "S2", oif_Op::MODIFY), std::string(c.keyword) + ", op=NEW, amplitude=Ramp\n");
    const OneLoad complex("IGG", c.className, states, R"("complex": true)");
    EXPECT_EQ(c.write(complex, "S2", oif_Op::MODIFY),
              std::string(c.keyword) + ", op=NEW, amplitude=Ramp, load case=0\n");
}

INSTANTIATE_TEST_SUITE_P(All, Electrical, testing::ValuesIn(kElectrical), CaseName);
