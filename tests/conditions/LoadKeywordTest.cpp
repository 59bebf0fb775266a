#include "conditions/LoadTesting.h"
#include "conditions/oif_MechanicalLoads.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

namespace {

class PointLoad : public OneLoad {
public:
    using OneLoad::OneLoad;
    std::string Cload(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0) {
        return Text(Card(step, op, scale));
    }
};

class ConnectorLoad : public OneLoad {
public:
    ConnectorLoad(std::string_view steps, const char* className, const std::string& states,
                  const std::string& fields = "")
        : OneLoad(steps, className, states, fields, "A.two words") {}
    std::string Motion(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0) {
        return Text(Card(step, op, scale, "A.\"two words\""));
    }
};

class BodyLoad : public OneLoad {
public:
    BodyLoad(std::string_view steps, const char* className, const std::string& states,
             const std::string& fields = "")
        : OneLoad(steps, className, states, fields, "A.E") {}
    /// The cyclic mode reaches no line.
    std::string Dload(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0, int space = 1) {
        return Text(Card(step, op, scale, "A.E"), 2, space);
    }
};

class SurfaceLoad : public OneLoad {
public:
    SurfaceLoad(std::string_view steps, const char* className, const std::string& states,
                const std::string& fields = "")
        : OneLoad(steps, className, states, fields, "A.F") {}
    std::string Dsload(const char* step, oif_Op op = oif_Op::MODIFY, double scale = 1.0,
                       std::optional<int> cyclicMode = {}) {
        return Text(Card(step, op, scale, "A.F"), cyclicMode);
    }
};

const std::string kComplexVector =
    R"("complex": true, "complexComponent1": [1, 0], "complexComponent2": [0, 2], "complexComponent3": [3, 0])";

std::string ComplexMagnitude(const char* value) {
    return std::string(R"("complex": true, "complexMagnitude": )") + value;
}

} // namespace

TEST(Cload, RealForce_WritesAComponentOfZeroThatWasSet) {
    PointLoad load("IG", "ConcentratedForce", R"("S1": {"component1": 10, "component2": 0})");
    EXPECT_EQ(load.Cload("S1"), "*Cload\nA.N, 1, 10.\nA.N, 2, 0.\n");
}

TEST(Cload, Line_HasOpFollowerAndAmplitudeInThisOrder) {
    PointLoad load("IG", "ConcentratedForce", R"("S1": {"component3": 1.5, "amplitude": "my amp"})",
                   R"("follower": true)");
    EXPECT_EQ(load.Cload("S1", oif_Op::NEW, 2.0),
              "*Cload, op=NEW, follower, amplitude=\"my amp\"\nA.N, 3, 3.\n");
}

TEST(Cload, LoadThatAddsAndChanges_WritesWhatWasSetInTheStep) {
    PointLoad load("IGG", "ConcentratedForce",
                   R"("S1": {"component1": 1, "component2": 2}, "S2": {"component2": 3})");
    EXPECT_EQ(load.Cload("S2"), "*Cload\nA.N, 2, 3.\n");
    EXPECT_EQ(load.Cload("S2", oif_Op::NEW), "*Cload, op=NEW\nA.N, 1, 1.\nA.N, 2, 3.\n");
}

TEST(Cload, StateThatChangesNothing_LeavesTheBareLineOnPurpose) {
    PointLoad load("IGG", "ConcentratedForce", R"("S1": {"component1": 1}, "S2": {})");
    EXPECT_EQ(load.Cload("S2"), "*Cload\n");
}

TEST(Cload, ChangedAmplitude_WritesEverythingAnew) {
    PointLoad load("IGG", "ConcentratedForce", R"("S1": {"component1": 1}, "S2": {"amplitude": "Ramp"})");
    EXPECT_EQ(load.Cload("S2"), "*Cload, amplitude=Ramp\nA.N, 1, 1.\n");
}

TEST(Cload, ClearedAmplitude_WritesEverythingAnew) {
    PointLoad load("IGG", "ConcentratedForce",
                   R"("S1": {"component1": 1, "amplitude": "Ramp"}, "S2": {"amplitude": null})");
    EXPECT_EQ(load.Cload("S2"), "*Cload\nA.N, 1, 1.\n");
}

TEST(Cload, CarriedAmplitude_ChangesNothing) {
    PointLoad load("IGG", "ConcentratedForce", R"("S1": {"component1": 1, "amplitude": "Ramp"}, "S2": {})");
    EXPECT_EQ(load.Cload("S2"), "*Cload, amplitude=Ramp\n");
}

TEST(Cload, LoadThatEnds_IsItsLineWithoutFollowerAndAmplitude) {
    PointLoad load("IGG", "ConcentratedForce",
                   R"("S1": {"component1": 1, "amplitude": "Ramp"}, "S2": {"deactivated": true})",
                   R"("follower": true)");
    EXPECT_EQ(load.Cload("S2", oif_Op::NEW), "*Cload, op=NEW\n");
    EXPECT_EQ(load.Cload("S2", oif_Op::MODIFY), "*Cload\n");
}

TEST(Cload, Moment_HasTheDegreesOfFreedomOfRotation) {
    PointLoad load("IG", "Moment", R"("S1": {"component1": 1, "component2": 2, "component3": 3})",
                   R"("follower": true)");
    EXPECT_EQ(load.Cload("S1"), "*Cload, follower\nA.N, 4, 1.\nA.N, 5, 2.\nA.N, 6, 3.\n");
}

TEST(Cload, PlaneStrainLoad_HasNoSetNameOnPurpose) {
    PointLoad load("IG", "PEGLoad", R"("S1": {"component1": 1, "component2": 2, "component3": 3})");
    EXPECT_EQ(load.Cload("S1"), "*Cload\n, 3, 1.\n, 4, 2.\n, 5, 3.\n");
}

TEST(Cload, ComplexForce_HasABlockForEachPartWithoutItsZeros) {
    PointLoad load("ID", "ConcentratedForce", R"("S1": {"amplitude": "Ramp"})",
                   kComplexVector + R"(, "follower": true)");
    EXPECT_EQ(load.Cload("S1", oif_Op::MODIFY, 2.0), "*Cload, follower, amplitude=Ramp, load case=1\n"
                                                     "A.N, 1, 2.\nA.N, 3, 6.\n"
                                                     "*Cload, follower, amplitude=Ramp, load case=2\n"
                                                     "A.N, 2, 4.\n");
}

TEST(Cload, ComplexForceWithoutOnePart_LeavesItsBlockOut) {
    PointLoad load("ID", "ConcentratedForce", R"("S1": {})",
                   R"("complex": true, "complexComponent1": {"form": "POLAR", "real": 2, "imag": 90})");
    EXPECT_EQ(load.Cload("S1"), "*Cload, load case=2\nA.N, 1, 2.\n");
}

TEST(Cload, ComplexForceScaledToNothing_KeepsItsLines) {
    PointLoad load("ID", "ConcentratedForce", R"("S1": {})", kComplexVector);
    EXPECT_EQ(load.Cload("S1", oif_Op::NEW, 0.0),
              "*Cload, op=NEW, load case=1\n*Cload, op=NEW, load case=2\n");
}

TEST(Cload, ComplexForce_TakesNothingFromItsStates) {
    PointLoad load("ID", "Moment", R"("S1": {"component1": 7})", R"("complex": true)");
    EXPECT_EQ(load.Cload("S1"), "");
}

TEST(Cload, BoltForce_HasNoSetNameOnPurpose) {
    PointLoad load("IGG", "BoltLoad", R"("S1": {"magnitude": 100}, "S2": {})");
    EXPECT_EQ(load.Cload("S1", oif_Op::MODIFY, 0.5), "*Cload\n, 1, 50.\n");
    EXPECT_EQ(load.Cload("S2", oif_Op::NEW), "*Cload, op=NEW\n, 1, 100.\n");
    EXPECT_EQ(load.Cload("S2"), "");
}

TEST(Cload, BoltHeldByItsLength_IsTheLineAlone) {
    PointLoad load("IGGG", "BoltLoad",
                   R"("S1": {"boltMethod": "ADJUST_LENGTH", "adjustment": 0.1},
                      "S2": {"boltMethod": "APPLY_FORCE", "magnitude": 5},
                      "S3": {"boltMethod": "FIX_LENGTH"})");
    EXPECT_EQ(load.Cload("S1"), "*Cload\n");
    EXPECT_EQ(load.Cload("S2", oif_Op::NEW), "*Cload, op=NEW\n, 1, 5.\n");
    EXPECT_EQ(load.Cload("S3", oif_Op::NEW), "*Cload, op=NEW\n");
}

TEST(Cload, PoreFluid_IsOfDegreeOfFreedomEight) {
    PointLoad load("IGG", "ConcentratedPoreFluid", R"("S1": {"magnitude": 5}, "S2": {})");
    EXPECT_EQ(load.Cload("S1", oif_Op::MODIFY, 3.0), "*Cload\nA.N, 8, 15.\n");
    EXPECT_EQ(load.Cload("S2"), "");
}

TEST(Cload, ComplexPoreFluid_RaisesUnlessItEnds) {
    PointLoad load("IGG", "ConcentratedPoreFluid", R"("S1": {"magnitude": 5}, "S2": {"deactivated": true})",
                   R"("complex": true)");
    EXPECT_EQ(Raised([&] { load.Cload("S1"); }), "\"Concentrated pore fluid load cannot be complex\" == 0");
    EXPECT_EQ(load.Cload("S2", oif_Op::NEW), "*Cload, op=NEW\n");
}

TEST(Cload, InwardVolumeAcceleration_HasABlockForEachPartThatIsNotZero) {
    PointLoad real("IG", "InwardVolAccel", R"("S1": {"magnitude": 5})");
    EXPECT_EQ(real.Cload("S1"), "*Cload\nA.N, 8, 5.\n");
    PointLoad both("ID", "InwardVolAccel", R"("S1": {})", ComplexMagnitude("[1, -2]"));
    EXPECT_EQ(both.Cload("S1", oif_Op::MODIFY, 2.0),
              "*Cload, load case=1\nA.N, 8, 2.\n*Cload, load case=2\nA.N, 8, -4.\n");
    PointLoad one("ID", "InwardVolAccel", R"("S1": {})", ComplexMagnitude("[1, 0]"));
    EXPECT_EQ(one.Cload("S1"), "*Cload, load case=1\nA.N, 8, 1.\n");
}

TEST(Cload, OtherLoad_RaisesTheTextOfAnAssertion) {
    PointLoad load("IG", "Gravity", R"("S1": {"component1": 5})");
    EXPECT_EQ(Raised([&] { Written(oif_Cload(load.Card("S1"), load.Record())); }),
              "\"Invalid load type for *Cload\" == 0");
}

TEST(ConnectorLoad, Force_KeepsANameInQuotes) {
    ConnectorLoad load("IG", "ConnectorForce",
                       R"("S1": {"component1": 0, "component3": 2, "amplitude": "Ramp"})");
    EXPECT_EQ(load.Motion("S1", oif_Op::NEW, 2.0), "*Connector Load, op=NEW, amplitude=Ramp\n"
                                                   "A.\"two words\", 1, 0.\nA.\"two words\", 3, 4.\n");
}

TEST(ConnectorLoad, NameThatNeedsQuotes_GetsThem) {
    OneLoad load("IG", "ConnectorForce", R"("S1": {"component1": 1})");
    EXPECT_EQ(load.Text(load.Card("S1", oif_Op::MODIFY, 1.0, "a b")), "*Connector Load\n\"a b\", 1, 1.\n");
}

TEST(ConnectorLoad, ComplexMoment_HasABlockForEachPart) {
    ConnectorLoad load("ID", "ConnectorMoment", R"("S1": {})", kComplexVector);
    EXPECT_EQ(load.Motion("S1"),
              "*Connector Load, load case=1\nA.\"two words\", 4, 1.\nA.\"two words\", 6, 3.\n"
              "*Connector Load, load case=2\nA.\"two words\", 5, 2.\n");
}

TEST(ConnectorLoad, ClearedAmplitude_DoesNotWriteTheValuesAnewOnPurpose) {
    ConnectorLoad load("IGG", "ConnectorMoment",
                       R"("S1": {"component1": 1, "amplitude": "Ramp"}, "S2": {"amplitude": null})");
    EXPECT_EQ(load.Motion("S2"), "*Connector Load\n");
}

TEST(ConnectorLoad, LoadThatEnds_IsItsLineAlone) {
    ConnectorLoad load("IGG", "ConnectorMoment", R"("S1": {"component1": 1}, "S2": {"deactivated": true})");
    EXPECT_EQ(load.Motion("S2", oif_Op::NEW), "*Connector Load, op=NEW\n");
}

TEST(ConnectorLoad, OtherLoad_Raises) {
    ConnectorLoad load("IG", "Moment", R"("S1": {"component1": 5})");
    EXPECT_EQ(Raised([&] { Written(oif_ConnectorLoad(load.Card("S1"), load.Record())); }),
              "Invalid load type for *Connector Load");
}

TEST(Dload, BodyForce_HasALabelForEachComponent) {
    BodyLoad load("IG", "BodyForce", R"("S1": {"component1": 1, "component2": 0, "component3": 3})");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 2.0), "*Dload\nA.E, BX, 2.\nA.E, BY, 0.\nA.E, BZ, 6.\n");
}

TEST(Dload, UserDefinedBodyForce_HasItsLabels) {
    BodyLoad load("IG", "BodyForce", R"("S1": {"component2": 4})", R"("distributionType": "USER_DEFINED")");
    EXPECT_EQ(load.Dload("S1", oif_Op::NEW), "*Dload, op=NEW\nA.E, BYNU, 4.\n");
}

TEST(Dload, BodyForceOfAnAxisymmetricModel_HasTwoComponents) {
    BodyLoad load("IG", "BodyForce", R"("S1": {"component1": 1, "component2": 2, "component3": 3})");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 1.0, 4), "*Dload\nA.E, BR, 1.\nA.E, BZ, 2.\n");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 1.0, 2), "*Dload\nA.E, BX, 1.\nA.E, BY, 2.\n");
}

TEST(Dload, ComplexBodyForce_HasABlockForEachPart) {
    BodyLoad load("ID", "BodyForce", R"("S1": {"amplitude": "Ramp"})", kComplexVector);
    EXPECT_EQ(load.Dload("S1"), "*Dload, amplitude=Ramp, load case=1\nA.E, BX, 1.\nA.E, BZ, 3.\n"
                                "*Dload, amplitude=Ramp, load case=2\nA.E, BY, 2.\n");
}

TEST(Dload, LineLoad_IsAlongTheAxesOfTheModelOrOfTheSection) {
    const char states[] = R"("S1": {"component1": 1, "component2": 2, "component3": 3})";
    BodyLoad global("IG", "LineLoad", states);
    EXPECT_EQ(global.Dload("S1"), "*Dload\nA.E, PX, 1.\nA.E, PY, 2.\nA.E, PZ, 3.\n");
    BodyLoad local("IG", "LineLoad", states, R"("system": "LOCAL", "distributionType": "USER_DEFINED")");
    EXPECT_EQ(local.Dload("S1"), "*Dload\nA.E, P1NU, 1.\nA.E, P2NU, 2.\n");
}

TEST(Dload, ComplexLineLoadAlongTheSection_DoesNotLookAtTheThirdComponent) {
    BodyLoad load(
        "ID", "LineLoad", R"("S1": {})",
        R"("system": "LOCAL", "complex": true, "complexComponent2": [0, 5], "complexComponent3": [3, 0])");
    EXPECT_EQ(load.Dload("S1"), "*Dload, load case=2\nA.E, P2, 5.\n");
}

TEST(Dload, Gravity_IsLengthAndDirection) {
    BodyLoad load("IG", "Gravity", R"("S1": {"component1": 3, "component2": 4})");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 2.0), "*Dload\nA.E, GRAV, 10., 0.6, 0.8, 0.\n");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 1.0, 4), "*Dload\nA.E, GRAV, 5., , 0.8\n");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 1.0, 2), "*Dload\nA.E, GRAV, 5., 0.6, 0.8\n");
}

TEST(Dload, GravityWithOneChangedComponent_IsWrittenWhole) {
    BodyLoad load("IGGG", "Gravity",
                  R"("S1": {"component1": 3, "component2": 4}, "S2": {"component3": 12}, "S3": {})");
    EXPECT_EQ(load.Dload("S2"), "*Dload\nA.E, GRAV, 13., 0.230769, 0.307692, 0.923077\n");
    EXPECT_EQ(load.Dload("S3"), "");
}

TEST(Dload, GravityOfZero_HasADirectionOfZerosWhateverTheSigns) {
    BodyLoad load("IG", "Gravity", R"("S1": {"component1": 0, "component3": -0.0})");
    EXPECT_EQ(load.Dload("S1"), "*Dload\nA.E, GRAV, 0., 0., 0., 0.\n");
}

TEST(Dload, ComplexGravity_HasALengthAndADirectionForEachPart) {
    BodyLoad load("ID", "Gravity", R"("S1": {})",
                  R"("complex": true, "complexComponent1": [3, 0], "complexComponent2": [4, 2])");
    EXPECT_EQ(load.Dload("S1"), "*Dload, load case=1\nA.E, GRAV, 5., 0.6, 0.8, 0.\n"
                                "*Dload, load case=2\nA.E, GRAV, 2., 0., 1., 0.\n");
    BodyLoad real("ID", "Gravity", R"("S1": {})", R"("complex": true, "complexComponent3": [-1, 0])");
    EXPECT_EQ(real.Dload("S1"), "*Dload, load case=1\nA.E, GRAV, 1., 0., 0., -1.\n");
}

TEST(Dload, PipePressure_HasItsLabelAndDiameter) {
    const std::string diameter = R"("effectiveDiameter": 0.5, )";
    const auto text = [&](const char* fields) {
        return BodyLoad("IG", "PipePressure",
                        R"("S1": {"magnitude": 10, "zeroPressureHeight": 1, "referencePressureHeight": 2})",
                        diameter + fields)
            .Dload("S1", oif_Op::MODIFY, 2.0);
    };
    EXPECT_EQ(text(R"("external": false)"), "*Dload\nA.E, PI, 20., 0.5\n");
    EXPECT_EQ(text(R"("external": true)"), "*Dload\nA.E, PE, 20., 0.5\n");
    EXPECT_EQ(text(R"("distributionType": "USER_DEFINED")"), "*Dload\nA.E, PINU, 20., 0.5\n");
    EXPECT_EQ(text(R"("external": true, "distributionType": "USER_DEFINED")"),
              "*Dload\nA.E, PENU, 20., 0.5\n");
    EXPECT_EQ(text(R"("distributionType": "FIELD")"), "*Dload\nA.E, PI, 20., 0.5\n");
    // Heights and diameter are not scaled.
    EXPECT_EQ(text(R"("distributionType": "HYDROSTATIC")"), "*Dload\nA.E, HPI, 20., 1., 2., 0.5\n");
    EXPECT_EQ(text(R"("external": true, "distributionType": "HYDROSTATIC")"),
              "*Dload\nA.E, HPE, 20., 1., 2., 0.5\n");
}

TEST(Dload, ChangedHeight_CountsForHydrostaticPipePressureOnly) {
    const char states[] = R"("S1": {"magnitude": 10, "zeroPressureHeight": 1, "referencePressureHeight": 2},
                             "S2": {"referencePressureHeight": 3})";
    BodyLoad hydrostatic("IGG", "PipePressure", states, R"("distributionType": "HYDROSTATIC")");
    EXPECT_EQ(hydrostatic.Dload("S2"), "*Dload\nA.E, HPI, 10., 1., 3., 0.\n");
    BodyLoad uniform("IGG", "PipePressure", states);
    EXPECT_EQ(uniform.Dload("S2"), "");
}

TEST(Dload, ComplexPipePressure_HasABlockForEachPart) {
    BodyLoad load("ID", "PipePressure", R"("S1": {})",
                  ComplexMagnitude("[1, 2]") + R"(, "effectiveDiameter": 3)");
    EXPECT_EQ(load.Dload("S1", oif_Op::MODIFY, 2.0),
              "*Dload, load case=1\nA.E, PI, 2., 3.\n*Dload, load case=2\nA.E, PI, 4., 3.\n");
}

TEST(Dload, RotationalLoad_HasNoBlanksOnItsLine) {
    const std::string axis = R"("point1": [1, 2, 3], "point2": [1, 2, 8], )";
    const auto text = [&](const char* flags, int space = 1) {
        return BodyLoad("IGG", "RotationalBodyForce", R"("S1": {"magnitude": 25}, "S2": {})", axis + flags)
            .Dload("S1", oif_Op::MODIFY, 2.0, space);
    };
    EXPECT_EQ(text(R"("centrifugal": true)"), "*Dload\nA.E,CENTRIF,50.,1.,2.,3.,0.,0.,1.\n");
    EXPECT_EQ(text(R"("centrifugal": true, "rotaryAcceleration": true)"),
              "*Dload\nA.E,CENTRIF,50.,1.,2.,3.,0.,0.,1.\n");
    EXPECT_EQ(text(R"("centrifugal": false, "rotaryAcceleration": true)"),
              "*Dload\nA.E,ROTA,50.,1.,2.,3.,0.,0.,1.\n");
    EXPECT_EQ(text(R"("centrifugal": false)"), "*Dload\nA.E,,50.,1.,2.,3.,0.,0.,1.\n");
    EXPECT_EQ(text(R"("centrifugal": true)", 2), "*Dload\nA.E,CENTRIF,50.,1.,2.,3.,0.,0.,1.\n");
    EXPECT_EQ(text(R"("centrifugal": true)", 3), "*Dload\nA.E,CENTRIF,50.,1.,2.,3.\n");
    EXPECT_EQ(text(R"("centrifugal": true)", 4), "*Dload\nA.E,CENTRIF,50.,1.,2.,3.,0.0,1.0,0.0\n");
}

TEST(Dload, RotationalLoadWithoutAnAxis_HasADirectionOfZeros) {
    BodyLoad load("IGG", "RotationalBodyForce", R"("S1": {"magnitude": 4}, "S2": {})");
    EXPECT_EQ(load.Dload("S1"), "*Dload\nA.E,CENTRIF,4.,0.,0.,0.,0.,0.,0.\n");
    EXPECT_EQ(load.Dload("S2"), "");
}

TEST(Dload, LoadThatEnds_IsItsLineAlone) {
    BodyLoad load("IGG", "Gravity", R"("S1": {"component1": 1}, "S2": {"deactivated": true})");
    EXPECT_EQ(load.Dload("S2", oif_Op::NEW), "*Dload, op=NEW\n");
}

TEST(Dload, OtherLoad_RaisesTheTextOfAnAssertion) {
    BodyLoad load("IG", "Moment", R"("S1": {"component1": 5})");
    EXPECT_EQ(Raised([&] { Written(oif_Dload(load.Card("S1"), load.Record(), {load.Info()})); }),
              "\"Invalid load type for *Dload\" == 0");
}

TEST(Dsload, Pressure_HasTheLabelOfItsDistribution) {
    const auto text = [](const char* distribution) {
        return SurfaceLoad("IG", "Pressure", R"("S1": {"magnitude": 5, "referencePressureHeight": 9})",
                           std::string(R"("distributionType": )") + distribution)
            .Dsload("S1", oif_Op::MODIFY, 2.0);
    };
    EXPECT_EQ(text("0"), "*Dsload\nA.F, P, 10.\n");
    EXPECT_EQ(text("1"), "*Dsload\nA.F, PNU, 10.\n");
    EXPECT_EQ(text("4"), "*Dsload\nA.F, HP, 10., 0., 9.\n");
    EXPECT_EQ(text("3"), "*Dsload\nA.F, , 10.\n");
}

TEST(Dsload, Line_HasItsParametersInOrder) {
    SurfaceLoad load("IG", "Pressure", R"("S1": {"magnitude": 5, "amplitude": "my amp"})",
                     R"("distributionRegion": "A.N")");
    EXPECT_EQ(load.Dsload("S1", oif_Op::NEW, 1.0, 3),
              "*Dsload, op=NEW, amplitude=\"my amp\", cyclic mode=3, ref node=A.N\nA.F, P, 5.\n");
}

TEST(Dsload, ChangedHeight_CountsForHydrostaticPressureOnly) {
    const char states[] = R"("S1": {"magnitude": 5}, "S2": {"zeroPressureHeight": 3})";
    SurfaceLoad hydrostatic("IGG", "Pressure", states, R"("distributionType": "HYDROSTATIC")");
    EXPECT_EQ(hydrostatic.Dsload("S2"), "*Dsload\nA.F, HP, 5., 3., 0.\n");
    SurfaceLoad uniform("IGG", "Pressure", states);
    EXPECT_EQ(uniform.Dsload("S2"), "");
}

TEST(Dsload, ComplexPressure_HasABlockForEachPartThatIsNotZero) {
    SurfaceLoad both("ID", "Pressure", R"("S1": {})", ComplexMagnitude("[1, 2]"));
    EXPECT_EQ(both.Dsload("S1", oif_Op::MODIFY, 3.0),
              "*Dsload, load case=1\nA.F, P, 3.\n*Dsload, load case=2\nA.F, P, 6.\n");
    SurfaceLoad one("ID", "Pressure", R"("S1": {})", ComplexMagnitude("[0, 2]"));
    EXPECT_EQ(one.Dsload("S1"), "*Dsload, load case=2\nA.F, P, 2.\n");
}

TEST(Dsload, ComplexHydrostaticPressure_HasItsHeightsOnALineOfTheirOwnOnPurpose) {
    SurfaceLoad load("ID", "Pressure", R"("S1": {"zeroPressureHeight": 1, "referencePressureHeight": 2})",
                     ComplexMagnitude("[5, 0]") + R"(, "distributionType": "HYDROSTATIC")");
    EXPECT_EQ(load.Dsload("S1", oif_Op::MODIFY, 2.0), "*Dsload, load case=1\nA.F, HP, 10.\n, 1., 2.\n");
}

TEST(Dsload, SurfaceTraction_IsShearOrGeneral) {
    const auto text = [](const char* fields) {
        return SurfaceLoad("IG", "SurfaceTraction", R"("S1": {"magnitude": 5})", fields)
            .Dsload("S1", oif_Op::MODIFY, 2.0);
    };
    EXPECT_EQ(text(R"("kind": "SHEAR")"), "*Dsload\nA.F, TRSHR, 10.\n");
    EXPECT_EQ(text(R"("kind": "NORMAL")"), "*Dsload\nA.F, TRVEC, 10.\n");
    EXPECT_EQ(text(R"("kind": "GENERAL", "distributionType": 1)"), "*Dsload\nA.F, TRVECNU, 10.\n");
}

TEST(Dsload, ShellEdgeLoad_HasALabelForEachKind) {
    const char* const labels[] = {"EDNOR", "EDTRA", "EDSHR", "EDMOM", "EDLD"};
    for (int kind = 0; kind < 5; ++kind) {
        const std::string fields = "\"kind\": " + std::to_string(kind);
        SurfaceLoad plain("IG", "ShellEdgeLoad", R"("S1": {"magnitude": 5})", fields);
        EXPECT_EQ(plain.Dsload("S1"), std::string("*Dsload\nA.F, ") + labels[kind] + ", 5.\n");
        SurfaceLoad user("IG", "ShellEdgeLoad", R"("S1": {"magnitude": 5})",
                         fields + R"(, "distributionType": 1)");
        EXPECT_EQ(user.Dsload("S1"), std::string("*Dsload\nA.F, ") + labels[kind] + "NU, 5.\n");
    }
}

TEST(Dsload, TractionWithADirection_HasItOnItsLineAndItsFlags) {
    SurfaceLoad load(
        "IG", "SurfaceTraction", R"("S1": {"magnitude": 5})",
        R"("vectorGiven": true, "direction": [[1, 1, 1], [1, 4, 5]], "follower": false, "resultant": true)");
    EXPECT_EQ(load.Dsload("S1", oif_Op::MODIFY, 2.0),
              "*Dsload, follower=NO, constant resultant=YES\nA.F, TRVEC, 10., 0., 0.6, 0.8\n");
}

TEST(Dsload, TractionWithoutADirection_HasNoFlags) {
    SurfaceLoad load("IG", "SurfaceTraction", R"("S1": {"magnitude": 5})",
                     R"("direction": [[1, 1, 1], [1, 4, 5]], "follower": false, "resultant": true)");
    EXPECT_EQ(load.Dsload("S1"), "*Dsload\nA.F, TRVEC, 5.\n");
}

TEST(Dsload, DirectionOfLengthZero_IsZeros) {
    SurfaceLoad load("IG", "SurfaceTraction", R"("S1": {"magnitude": 5})",
                     R"("vectorGiven": true, "direction": [[1, 1, 1], [1, 1, 1]])");
    EXPECT_EQ(load.Dsload("S1"), "*Dsload\nA.F, TRVEC, 5., 0., 0., 0.\n");
}

TEST(Dsload, ComplexTraction_HasABlockForEachPart) {
    SurfaceLoad load("ID", "ShellEdgeLoad", R"("S1": {})",
                     ComplexMagnitude("[1, 2]") +
                         R"(, "vectorGiven": true, "direction": [[0, 0, 0], [2, 0, 0]], "follower": false)");
    EXPECT_EQ(load.Dsload("S1", oif_Op::MODIFY, 2.0),
              "*Dsload, load case=1, follower=NO\nA.F, EDLD, 2., 1., 0., 0.\n"
              "*Dsload, load case=2, follower=NO\nA.F, EDLD, 4., 1., 0., 0.\n");
}

TEST(Dsload, TractionInASystem_NamesItAlsoWithoutADirection) {
    TestStore store;
    odiK_Datum datum;
    datum.name = "Csys 1";
    kloC_SurfaceTraction load;
    load.datum = store.model.AddDatum(datum);
    store.model.steps.Append("I", kprC_InitialStep());
    store.model.steps.Append("S", kprC_StaticStep());
    mdl_StateEdit<kloC_DistributedState>(load.Give("S")).Set<&kloC_DistributedState::magnitude>(1.0);
    load.Propagate(store.model.steps);
    const auto text = [&] { return Written(oif_Dsload({"my load", load, "F", "S"}, load, {store.Info()})); };
    EXPECT_EQ(text(), "*Dsload, orientation=\"Csys 1\"\nF, TRVEC, 1.\n");
    // An angle makes a system of the load's own.
    load.angle = 30.0;
    EXPECT_EQ(text(), "*Dsload, orientation=\"Csys 1_my load_\"\nF, TRVEC, 1.\n");
    // A name that the user gave goes before, as it stands.
    load.orientation = "their own";
    EXPECT_EQ(text(), "*Dsload, orientation=their own\nF, TRVEC, 1.\n");
}

TEST(Dsload, LoadThatEnds_KeepsCyclicModeAndReferenceNode) {
    const char states[] = R"("S1": {"magnitude": 5, "amplitude": "Ramp"}, "S2": {"deactivated": true})";
    SurfaceLoad traction("IGG", "SurfaceTraction", states,
                         R"("vectorGiven": true, "follower": false, "orientation": "O")");
    EXPECT_EQ(traction.Dsload("S2", oif_Op::NEW, 1.0, 3), "*Dsload, op=NEW, cyclic mode=3\n");
    SurfaceLoad pressure("IGG", "Pressure", states, R"("distributionRegion": "A.N")");
    EXPECT_EQ(pressure.Dsload("S2", oif_Op::NEW, 1.0, 3), "*Dsload, op=NEW, cyclic mode=3, ref node=A.N\n");
}

TEST(Dsload, EmptySetName_RaisesTheTextOfAnAssertion) {
    SurfaceLoad load("IG", "Pressure", R"("S1": {"magnitude": 5})");
    EXPECT_EQ(Raised([&] { load.Text(load.Card("S1", oif_Op::MODIFY, 1.0, "")); }), "! setName.Empty()");
}

TEST(Dsload, OtherLoad_RaisesTheTextOfAnAssertion) {
    SurfaceLoad load("IG", "Moment", R"("S1": {"component1": 5})");
    EXPECT_EQ(
        Raised([&] { Written(oif_Dsload(load.Card("S1", {}, 1.0, "A.F"), load.Record(), {load.Info()})); }),
        "\"Invalid load type for *Dsload\" == 0");
}

TEST(Dsload, SubmodelLoad_CanBeWrittenWhereItEndsOnly) {
    SurfaceLoad load("IGG", "SubmodelStressBased",
                     R"("S1": {"stepName": "Global 1", "scaleParameter": 0.5}, "S2": {"deactivated": true})");
    const auto text = [](SurfaceLoad& of, const char* step, oif_Op op) {
        const auto& record = static_cast<const kloC_SubmodelStressBased&>(of.Record());
        return Written(oif_Dsload(of.Card(step, op, 1.0, "A.F"), record, {of.Info()}));
    };
    EXPECT_EQ(Raised([&] { text(load, "S1", oif_Op::MODIFY); }), "\"Invalid load type for *Dsload\" == 0");
    EXPECT_EQ(text(load, "S2", oif_Op::NEW), "*Dsload, submodel, step=Global 1, scale=0.5, op=NEW\n");
    SurfaceLoad unscaled("IGG", "SubmodelStressBased", R"("S1": {}, "S2": {"deactivated": true})");
    EXPECT_EQ(text(unscaled, "S2", oif_Op::NEW), "*Dsload, submodel, op=NEW\n");
}
