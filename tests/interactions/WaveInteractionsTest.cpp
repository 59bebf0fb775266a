#include "interactions/InteractionTesting.h"
#include "interactions/oif_WaveInteractions.h"
#include "sections/SectionTesting.h"

namespace {

const std::string kNames =
    R"("amplitudes": {"A 1": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}},
       "interactionProperties": {"Z 1": {"class": "kinC_AcousticImpedanceProp"},
                                 "W": {"class": "kinC_IncidentWaveProperty"}}, )";

std::string Impedance(const std::string& members, oif_Op op = oif_Op::MODIFY,
                      const cow_String& step = "Step-1") {
    InteractionModel model(kNames + StaticSteps(2) + ", " +
                           Interactions("AcousticImpedance", R"("surface": "I.MASTER", )" + members +
                                                                 R"("states": {"Step-1": {"property": "Z 1"},
                                                          "Step-2": {"deactivated": true}})"));
    return Written(oif_AcousticImpedance(model.Interaction(), step, op, "I.SET"));
}

std::string Wave(const std::string& members, const cow_String& step = "Step-1") {
    InteractionModel model(
        kNames + StaticSteps(3) + ", " +
        Interactions("IncidentWave", R"("property": "W", "amplitude": "A 1", "magnitude": 2.5, )" + members +
                                         R"("states": {"Step-1": {}, "Step-2": {}})"));
    return Written(oif_IncidentWave(model.Interaction(), step, "I.SRC", "I.OFF", "I.SURF"));
}

kinC_AcousticImpedanceProp ImpedanceTable(bool admittance) {
    kinC_AcousticImpedanceProp property;
    property.admittance = admittance;
    property.dependencies = 1;
    property.table = TableOf(4, {1.0, 0.5, 10.0, 3.0});
    return property;
}

const std::string kEllipse = R"("nonreflecting": 1, "semiAxisA": 4, "semiAxisB": 0.5, "center": [1, 2, 3],
                                "axis": [[1, 1, 1], [1, 1, 6]], )";

} // namespace

TEST(AcousticImpedance, ByAProperty_NamesIt) {
    EXPECT_EQ(Impedance(""), "*Simpedance, property=\"Z 1\"\nI.SET\n");
    EXPECT_EQ(Impedance("", oif_Op::NEW), "*Simpedance, property=\"Z 1\", op=NEW\nI.SET\n");
}

TEST(AcousticImpedance, Nonreflecting_HasItsShapeAndFigures) {
    EXPECT_EQ(Impedance(R"("nonreflecting": 1, "boundaryType": 0, "radius": 5, )"),
              "*Simpedance, nonreflecting=PLANAR\nI.SET\n");
    EXPECT_EQ(Impedance(R"("nonreflecting": 1, "boundaryType": 1, "radius": 5, )"),
              "*Simpedance, nonreflecting=IMPROVED\nI.SET\n");
    EXPECT_EQ(Impedance(R"("nonreflecting": 1, "boundaryType": 2, "radius": 5, )"),
              "*Simpedance, nonreflecting=CIRCULAR\nI.SET, 5.\n");
    EXPECT_EQ(Impedance(R"("nonreflecting": 1, "boundaryType": 3, "radius": 5, )"),
              "*Simpedance, nonreflecting=SPHERICAL\nI.SET, 5.\n");
}

TEST(AcousticImpedance, Ellipse_HasAxesCentreAndDirectionOfItsLength) {
    EXPECT_EQ(Impedance(kEllipse + R"("boundaryType": 4, )"),
              "*Simpedance, nonreflecting=ELLIPTICAL\nI.SET, 4., 0.5, 1., 2., 3., 0., 0., 5.\n");
    EXPECT_EQ(Impedance(kEllipse + R"("boundaryType": 5, )", oif_Op::NEW),
              "*Simpedance, nonreflecting=PROLATE SPHEROIDAL, op=NEW\n"
              "I.SET, 4., 0.5, 1., 2., 3., 0., 0., 5.\n");
}

TEST(AcousticImpedance, UnknownShape_HasNoName_Wanted) {
    EXPECT_EQ(Impedance(R"("nonreflecting": 1, "boundaryType": 6, "radius": 5, )"),
              "*Simpedance, nonreflecting=\nI.SET\n");
}

TEST(AcousticImpedance, NonreflectingOtherThanOne_NamesTheShapeWithoutFigures_Wanted) {
    EXPECT_EQ(Impedance(R"("nonreflecting": 2, "boundaryType": 3, "radius": 5, )"),
              "*Simpedance, nonreflecting=SPHERICAL\nI.SET\n");
}

TEST(AcousticImpedance, Ended_IsTheKeywordLineAlone) {
    EXPECT_EQ(Impedance("", oif_Op::NEW, "Step-2"), "*Simpedance, op=NEW\n");
    EXPECT_EQ(Impedance("", oif_Op::MODIFY, "Step-2"), "*Simpedance\n");
}

TEST(AcousticImpedanceProp, Impedance_SaysSoAndNeverTellsItsDependencies_Wanted) {
    EXPECT_EQ(Written(oif_AcousticImpedanceProp("Z 1", ImpedanceTable(false))),
              "*Impedance Property, name=\"Z 1\", data=IMPEDANCE\n1., 0.5, 10.,  3.\n");
}

TEST(AcousticImpedanceProp, Admittance_SaysNothing) {
    EXPECT_EQ(Written(oif_AcousticImpedanceProp("Z", ImpedanceTable(true))),
              "*Impedance Property, name=Z\n1., 0.5, 10.,  3.\n");
    EXPECT_NE(Raised([] { oif_AcousticImpedanceProp("Z", kinC_IncidentWaveProperty()); }), "nothing raised");
}

TEST(IncidentWave, Type_DecidesTheAmplitude) {
    const std::string line = ", property=W\nI.SURF, I.SRC, I.OFF, 2.5\n";
    EXPECT_EQ(Wave(R"("waveType": 0, )"), "*Incident wave interaction, pressure amplitude=\"A 1\"" + line);
    EXPECT_EQ(Wave(R"("waveType": 1, )"),
              "*Incident wave interaction, acceleration amplitude=\"A 1\"" + line);
    EXPECT_EQ(Wave(R"("waveType": 2, )"), "*Incident wave interaction, UNDEX" + line);
}

TEST(IncidentWave, BehindItsFirstStep_WritesNothing) {
    EXPECT_EQ(Wave("", "Initial"), "");
    EXPECT_EQ(Wave("", "Step-2"), "");
    EXPECT_EQ(Wave("", "Step-3"), "");
}

namespace {

kinC_IncidentWaveProperty Water(int bubbleModel) {
    kinC_IncidentWaveProperty wave;
    wave.speed = 1500.0;
    wave.density = 1000.0;
    wave.bubbleModel = bubbleModel;
    wave.decayA = 0.5;
    wave.decayB = 0.25;
    wave.decayC = 0.125;
    wave.initialDepth = 21.0;
    return wave;
}

} // namespace

TEST(IncidentWaveProperty, PlaneWave_HasSpeedAndDensity) {
    EXPECT_EQ(Written(oif_IncidentWaveProperty("W 1", Water(0))),
              "*Incident Wave Interaction Property, name=\"W 1\"\n1500., 1000.\n");
    EXPECT_NE(Raised([] { oif_IncidentWaveProperty("W", kinC_AcousticImpedanceProp()); }), "nothing raised");
}

TEST(IncidentWaveProperty, Decay_HasThreeNumbersMore) {
    kinC_IncidentWaveProperty wave = Water(2);
    wave.shape = 1;
    EXPECT_EQ(Written(oif_IncidentWaveProperty("W", wave)),
              "*Incident Wave Interaction Property, name=W, type=SPHERE\n1500., 1000., 0.5, 0.25, 0.125\n");
}

TEST(IncidentWaveProperty, Charge_HasTwentyOneNumbersInOrder) {
    kinC_IncidentWaveProperty wave = Water(1);
    double number = 0.0;
    for (double* member :
         {&wave.pressureConstant, &wave.timeConstant, &wave.pressureExponent, &wave.timeExponent,
          &wave.adiabaticConstant, &wave.specificHeatRatio, &wave.chargeDensity, &wave.chargeMass,
          &wave.fluidDensity, &wave.fluidSoundSpeed, &wave.gravity, &wave.atmosphericPressure}) {
        *member = ++number;
    }
    wave.dragCoefficient = 14.0;
    wave.dragExponent = 15.0;
    wave.maximumTime = 16.0;
    wave.maximumSteps = 17;
    wave.relativeStepControl = 18.0;
    wave.absoluteStepControl = 19.0;
    wave.stepControlExponent = 20.0;
    const std::string head =
        "*Incident Wave Interaction Property, name=W\n1500., 1000.\n*UNDEX Charge Property\n"
        "1., 2., 3., 4., 5., 6., 7., 8.\n9., 10., 11., 12., ";
    const std::string middle = "14., 15.\n16., 17, 18., 19., 20.\n";
    oif_IncidentWaveProperty keyword("W", wave);
    EXPECT_EQ(Written(keyword), head + "1.0, " + middle + "21., 0., 0., 0.\n");
    keyword.setDepthNormal(30.0, gsl_ModelSegment({1.0, 1.0, 1.0}, {1.0, 3.0, 1.5}));
    EXPECT_EQ(Written(keyword), head + "1.0, " + middle + "30., 0., 2., 0.5\n");
    wave.waveEffects = false;
    EXPECT_EQ(Written(oif_IncidentWaveProperty("W", wave)), head + "0.0, " + middle + "21., 0., 0., 0.\n");
}
