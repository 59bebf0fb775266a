#include "interactions/InteractionTesting.h"
#include "interactions/oif_FilmAndRadiation.h"
#include "sections/SectionTesting.h"
#include "store_interface/records/interactions/kinC_ContactProperty.h"

namespace {

const std::string kNames =
    R"("amplitudes": {"A 1": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]},
                      "B": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]}},
       "interactionProperties": {"F 1": {"class": "kinC_FilmConditionProp"}}, )";

/// The keyword of the interaction C in Step-1, or in Step-2, where it ends.
template <class Keyword>
std::string Step(const std::string& className, const std::string& members, const std::string& state,
                 oif_Op op = oif_Op::MODIFY, const std::string& procedure = "HeatTransfer",
                 const cow_String& step = "Step-1") {
    InteractionModel model(kNames + StepsOf({procedure, procedure}) + ", " +
                           Interactions(className, R"("surface": "I.MASTER", )" + members +
                                                       R"("states": {"Step-1": {)" + state +
                                                       R"(}, "Step-2": {"deactivated": true}})"));
    return Written(Keyword(model.Interaction(), step, op, "I.SET"));
}

std::string Sfilm(const std::string& members, const std::string& state, oif_Op op = oif_Op::MODIFY,
                  const cow_String& step = "Step-1") {
    return Step<oif_Sfilm>("FilmCondition", members, state, op, "HeatTransfer", step);
}

std::string Cfilm(const std::string& members, const std::string& state, oif_Op op = oif_Op::MODIFY,
                  const std::string& procedure = "HeatTransfer", const cow_String& step = "Step-1") {
    return Step<oif_Cfilm>("ConcFilmCondition", members, state, op, procedure, step);
}

const std::string kFilm = R"("sinkTemperature": 20, "filmCoeff": 0.5, "filmProperty": "F 1")";
const std::string kAmplitudes = R"(, "amplitude": "A 1", "filmAmplitude": "B")";

kinC_FilmConditionProp Film(const cow_2DArray<double>& table, bool temperatureDependency = false,
                            int dependencies = 0) {
    kinC_FilmConditionProp film;
    film.table = table;
    film.temperatureDependency = temperatureDependency;
    film.dependencies = dependencies;
    return film;
}

} // namespace

TEST(Sfilm, Definition_DecidesTheLine) {
    EXPECT_EQ(Sfilm(R"("definition": 0, )", kFilm), "*Sfilm\nI.SET, F, 20., 0.5\n");
    EXPECT_EQ(Sfilm(R"("definition": 1, )", kFilm), "*Sfilm\nI.SET, F, 20., \"F 1\"\n");
    EXPECT_EQ(Sfilm(R"("definition": 2, )", kFilm), "*Sfilm\nI.SET, FNU, 20., 0.5\n");
    EXPECT_EQ(Sfilm(R"("definition": 7, )", kFilm), "*Sfilm\nI.SET, \n");
}

TEST(Sfilm, Amplitudes_DependOnTheDefinition) {
    EXPECT_EQ(Sfilm(R"("definition": 0, )", kFilm + kAmplitudes),
              "*Sfilm, amplitude=\"A 1\", film amplitude=B\nI.SET, F, 20., 0.5\n");
    EXPECT_EQ(Sfilm(R"("definition": 1, )", kFilm + kAmplitudes),
              "*Sfilm, amplitude=\"A 1\"\nI.SET, F, 20., \"F 1\"\n");
}

TEST(Sfilm, OfTheUsersCode_HasNoAmplitude) {
    EXPECT_EQ(Sfilm(R"("definition": 2, )", kFilm + kAmplitudes), "*Sfilm\nI.SET, FNU, 20., 0.5\n");
}

TEST(Sfilm, New_HasItsParameterLast) {
    EXPECT_EQ(Sfilm("", kFilm + R"(, "amplitude": "B")", oif_Op::NEW),
              "*Sfilm, amplitude=B, op=NEW\nI.SET, F, 20., 0.5\n");
}

TEST(Sfilm, Ended_IsTheKeywordLineAlone) {
    EXPECT_EQ(Sfilm("", kFilm + kAmplitudes, oif_Op::NEW, "Step-2"), "*Sfilm, op=NEW\n");
    EXPECT_EQ(Sfilm("", kFilm + kAmplitudes, oif_Op::MODIFY, "Step-2"), "*Sfilm\n");
}

TEST(Cfilm, LineBelowItsLimit_DoesNotBreak) {
    const std::string a(80, 'a');
    const std::string b(80, 'b');
    const std::string table = R"(": {"class": "kamC_Tabular", "table": [[0, 0], [1, 1]]})";
    InteractionModel model(
        R"("amplitudes": {")" + a + table + ", \"" + b + table + "}, " + StepsOf({"HeatTransfer"}) + ", " +
        Interactions("ConcFilmCondition", R"("surface": "I.NODES", "states": {"Step-1": {"amplitude": ")" +
                                              a + R"(", "filmAmplitude": ")" + b + R"("}})"));
    // 98 bytes ahead of the second parameter, so it stays on the line.
    EXPECT_EQ(Written(oif_Cfilm(model.Interaction(), "Step-1", oif_Op::MODIFY, "I.NODES")),
              "*Cfilm, amplitude=" + a + ", film amplitude=" + b + "\nI.NODES, 1., 0., 0.\n");
}

TEST(Cfilm, Line_HasAreaSinkAndCoefficientOrProperty) {
    EXPECT_EQ(Cfilm("", kFilm), "*Cfilm\nI.SET, 1., 20., 0.5\n");
    EXPECT_EQ(Cfilm(R"("definition": 1, )", kFilm + R"(, "nodalArea": 0.25)"),
              "*Cfilm\nI.SET, 0.25, 20., \"F 1\"\n");
}

TEST(Cfilm, OfTheUsersCode_SaysSo) {
    EXPECT_EQ(Cfilm(R"("definition": 2, )", kFilm + kAmplitudes, oif_Op::NEW),
              "*Cfilm, user, op=NEW\nI.SET, 1., 20., 0.5\n");
}

TEST(Cfilm, RegionType_IsOfExplicitProcedures) {
    EXPECT_EQ(Cfilm(R"("regionType": 1, )", kFilm, oif_Op::MODIFY, "TempDisplacementDynamics"),
              "*Cfilm, region type=SLIDING\nI.SET, 1., 20., 0.5\n");
    EXPECT_EQ(Cfilm(R"("regionType": 2, )", kFilm + R"(, "amplitude": "B")", oif_Op::MODIFY,
                    "TempDisplacementDynamics"),
              "*Cfilm, amplitude=B, region type=EULERIAN\nI.SET, 1., 20., 0.5\n");
    EXPECT_EQ(Cfilm(R"("regionType": 5, )", kFilm, oif_Op::MODIFY, "TempDisplacementDynamics"),
              "*Cfilm\nI.SET, 1., 20., 0.5\n");
    EXPECT_EQ(Cfilm(R"("regionType": 2, )", kFilm), "*Cfilm\nI.SET, 1., 20., 0.5\n");
}

TEST(Cfilm, Ended_IsTheKeywordLineAlone) {
    EXPECT_EQ(Cfilm(R"("definition": 2, )", kFilm, oif_Op::NEW, "TempDisplacementDynamics", "Step-2"),
              "*Cfilm, op=NEW\n");
}

TEST(Sradiate, Line_HasTemperatureAndEmissivity) {
    const auto text = [](const std::string& state, oif_Op op, const cow_String& step) {
        return Step<oif_Sradiate>("RadiationToAmbient", "", state, op, "HeatTransfer", step);
    };
    EXPECT_EQ(text(R"("ambientTemperature": 20, "emissivity": 0.75)", oif_Op::MODIFY, "Step-1"),
              "*Sradiate\nI.SET, R, 20., 0.75\n");
    EXPECT_EQ(text(R"("amplitude": "A 1")", oif_Op::NEW, "Step-1"),
              "*Sradiate, amplitude=\"A 1\", op=NEW\nI.SET, R, 0., 0.\n");
    EXPECT_EQ(text(R"("amplitude": "A 1")", oif_Op::NEW, "Step-2"), "*Sradiate, op=NEW\n");
}

TEST(Cradiate, Line_HasTheAreaFirst) {
    const auto text = [](const std::string& members, oif_Op op, const std::string& procedure,
                         const cow_String& step) {
        return Step<oif_Cradiate>("ConcRadiationToAmbient", members,
                                  R"("ambientTemperature": 20, "emissivity": 0.75, "nodalArea": 2)", op,
                                  procedure, step);
    };
    EXPECT_EQ(text("", oif_Op::MODIFY, "HeatTransfer", "Step-1"), "*Cradiate\nI.SET, 2., 20., 0.75\n");
    EXPECT_EQ(text(R"("regionType": 2, )", oif_Op::NEW, "TempDisplacementDynamics", "Step-1"),
              "*Cradiate, region type=EULERIAN, op=NEW\nI.SET, 2., 20., 0.75\n");
    EXPECT_EQ(text(R"("regionType": 2, )", oif_Op::NEW, "TempDisplacementDynamics", "Step-2"),
              "*Cradiate, op=NEW\n");
}

TEST(FilmProperty, WithTemperatures_HasItsColumns) {
    EXPECT_EQ(Written(oif_FilmProperty("F 1", Film(TableOf(2, {0.5, 20.0, 0.75, 40.0}), true))),
              "*Film Property, name=\"F 1\"\n0.5, 20.\n0.75, 40.\n");
}

TEST(FilmProperty, WithoutTemperatures_LeavesTheirPlaceEmpty) {
    EXPECT_EQ(Written(oif_FilmProperty("F", Film(TableOf(1, {0.5})))), "*Film Property, name=F\n0.5\n");
    EXPECT_EQ(Written(oif_FilmProperty("F", Film(TableOf(2, {0.5, 3.0}), false, 1))),
              "*Film Property, name=F, dependencies=1\n0.5, , 3.\n");
}

TEST(FilmProperty, NineValues_TakeTwoLines) {
    EXPECT_EQ(Written(oif_FilmProperty(
                  "F", Film(TableOf(9, {1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0, 9.0}), true, 7))),
              "*Film Property, name=F, dependencies=7\n1., 2., 3., 4., 5., 6., 7., 8.\n9.\n");
}

TEST(FilmProperty, EightValuesAndABlank_StayOnOneLine_Wanted) {
    EXPECT_EQ(
        Written(oif_FilmProperty("F", Film(TableOf(8, {1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0}), false, 7))),
        "*Film Property, name=F, dependencies=7\n1., , 2., 3., 4., 5., 6., 7., 8.\n");
}

TEST(FilmProperty, OfAnotherClass_Raises) {
    EXPECT_NE(Raised([] { oif_FilmProperty("F", kinC_ContactProperty()); }), "nothing raised");
}

namespace {

const std::string kCavity = R"("surfaces": ["I.MASTER", "I.NODES"], )";

std::string Viewfactor(const std::string& state, bool off = false) {
    InteractionModel model(
        StaticSteps(1) + ", " +
        Interactions("CavityRadiation", kCavity + R"("states": {"Step-1": {)" + state + "}}"));
    oif_RadiationViewfactor keyword("C 1", model.As<kinC_CavityRadiation>(), "Step-1", model.Info());
    if (off) keyword.SwitchOff();
    return Written(keyword);
}

const std::string kViewfactor = "*Radiation Viewfactor, cavity=\"C 1\"";

} // namespace

TEST(CavityDefinition, OpenCavity_HasItsTemperature) {
    for (const bool isOpen : {false, true}) {
        InteractionModel model(
            StaticSteps(1) + ", " +
            Interactions("CavityRadiation",
                         kCavity + (isOpen ? R"("ambientTemp": 20, )" : "") + R"("states": {})"));
        EXPECT_EQ(Written(oif_CavityDefinition("C 1", model.Interaction(), model.Info())),
                  std::string("*Cavity Definition, name=\"C 1\"") + (isOpen ? ", ambient temp=20." : "") +
                      "\nI.MASTER\nI_NODES_CNS_\n");
    }
}

TEST(CavityDefinition, OfAnotherClass_Raises) {
    InteractionModel model(StaticSteps(1) + ", " + Interactions("CyclicSymmetry", R"("states": {})"));
    EXPECT_NE(Raised([&] { oif_CavityDefinition("C", model.Interaction(), model.Info()); }),
              "nothing raised");
}

TEST(RadiationViewfactor, Default_BlocksAllAndReflects) {
    EXPECT_EQ(Viewfactor(""), kViewfactor + ", blocking=ALL, reflection=YES, vtol=0.05\n");
}

TEST(RadiationViewfactor, WithAll_HasItsRange) {
    EXPECT_EQ(Viewfactor(R"("blocking": "NONE", "range": 5, "reflection": false, "vtol": 0.1)"),
              kViewfactor + ", blocking=NO, range=5., reflection=NO, vtol=0.1\n");
}

TEST(RadiationViewfactor, LargestDoubleAsRange_IsARangeLikeAnyOther_Wanted) {
    EXPECT_EQ(Viewfactor(R"("range": 1.7976931348623157e308)"),
              kViewfactor + ", blocking=ALL, range=1.79769e+308, reflection=YES, vtol=0.05\n");
}

TEST(RadiationViewfactor, Partial_HasABlankAndItsSurfaces_Wanted) {
    EXPECT_EQ(Viewfactor(R"("blocking": 2, "blockingSurfaces": ["I.SLAVE", "I.MASTER"])"),
              kViewfactor + ", blocking=PARTIAL , reflection=YES, vtol=0.05\nI.SLAVE\nI.MASTER\n");
}

TEST(RadiationViewfactor, PartialWithoutSurfaces_HasNoDataLine) {
    EXPECT_EQ(Viewfactor(R"("blocking": 2)"),
              kViewfactor + ", blocking=PARTIAL , reflection=YES, vtol=0.05\n");
}

TEST(RadiationViewfactor, SurfacesWithAnotherBlocking_AreNotWritten) {
    EXPECT_EQ(Viewfactor(R"("blocking": 0, "blockingSurfaces": ["I.SLAVE"])"),
              kViewfactor + ", blocking=ALL, reflection=YES, vtol=0.05\n");
}

TEST(RadiationViewfactor, Off_HasNoParameterOfItsState) {
    EXPECT_EQ(Viewfactor(R"("blocking": 2, "blockingSurfaces": ["I.SLAVE"])", true), kViewfactor + ", off\n");
}
