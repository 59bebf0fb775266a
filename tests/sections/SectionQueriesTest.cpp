// What programs may ask a section; the deck writer asks the classes.
#include "sections/SectionTesting.h"
#include "store_interface/records/sections/kseC_BeamSection.h"
#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

namespace {

mdl_ObjCow<kseC_RebarLayers> RebarsWith(std::initializer_list<const char*> orientations) {
    kseC_RebarLayers rebars;
    for (const char* orientation : orientations) {
        kseC_RebarLayer layer;
        layer.orientationName = orientation;
        rebars.layers.Append(layer);
    }
    return mdl_ObjCow<kseC_RebarLayers>(rebars);
}

std::vector<std::string> OrientationsOf(const kseC_Section& section,
                                        std::initializer_list<const char*> before) {
    cow_List<cow_String> names;
    for (const char* name : before) names.Append(name);
    section.AddUserOrientations(names);
    std::vector<std::string> all;
    for (const cow_String& name : names) all.emplace_back(name.View());
    return all;
}

using Names = std::vector<std::string>;

TEST(SectionQueries, SectionsOfOneMaterial_NameIt) {
    kseC_BeamSection beam;
    beam.materialName = "Steel";
    EXPECT_EQ(static_cast<const kseC_Section&>(beam).MaterialName(), "Steel");
    kseC_HomogenousSolidSection solid;
    solid.materialName = "Concrete";
    EXPECT_EQ(static_cast<const kseC_Section&>(solid).MaterialName(), "Concrete");
    kseC_TrussSection truss;
    truss.materialName = "Wire";
    EXPECT_EQ(static_cast<const kseC_Section&>(truss).MaterialName(), "Wire");
    EXPECT_EQ(kseC_CompositeShellSection().MaterialName(), "");
}

TEST(SectionQueries, SectionsOfOtherElements_HaveNoRebarAndNoTemperaturePoints) {
    const kseC_HomogenousSolidSection solid;
    EXPECT_FALSE(solid.HasRebar());
    EXPECT_FALSE(solid.UsesRebarOrientation());
    EXPECT_EQ(solid.NumTempPoints(true), 0);
    EXPECT_EQ(OrientationsOf(solid, {"A"}), Names{"A"});
}

TEST(SectionQueries, Shell_HasRebarWhereALayerIsGiven) {
    kseC_HomogenousShellSection shell;
    EXPECT_FALSE(shell.HasRebar());
    EXPECT_FALSE(shell.UsesRebarOrientation());
    shell.rebars = RebarsWith({});
    EXPECT_FALSE(shell.HasRebar());
    EXPECT_FALSE(shell.UsesRebarOrientation());
    shell.rebars = RebarsWith({"A"});
    EXPECT_TRUE(shell.HasRebar());
    EXPECT_FALSE(shell.UsesRebarOrientation());
    shell.rebars = RebarsWith({"A", ""});
    EXPECT_TRUE(shell.UsesRebarOrientation());
}

TEST(SectionQueries, OrientationsOfLayers_AreAddedOnceEachAheadOfThoseOfRebars) {
    kseC_CompositeShellSection shell;
    for (const char* name : {"B", "", "A", "B"}) {
        kseC_CompositeShellLayer layer;
        layer.orientationName = name;
        shell.layers.Append(layer);
    }
    EXPECT_EQ(OrientationsOf(shell, {"A"}), (Names{"A", "B"}));
    shell.rebars = RebarsWith({"C", "", "B", "D"});
    EXPECT_EQ(OrientationsOf(shell, {"A"}), (Names{"A", "B", "C", "D"}));
}

TEST(SectionQueries, TemperaturePoints_CountWhereTheTemperatureIsGivenAtPoints) {
    kseC_HomogenousShellSection shell;
    shell.temperaturePoints = 7;
    EXPECT_EQ(shell.NumTempPoints(false), 0);
    shell.temperatureMode = kseC_GeometryShellSection::TemperatureModeEnm::POINTWISE;
    EXPECT_EQ(shell.NumTempPoints(false), 7);
    EXPECT_EQ(shell.NumTempPoints(true), 7);
}

} // namespace
