#include "sections/oif_PartAttributesBuilder.h"

#include "store_interface/records/sections/kseC_ShellSections.h"
#include "store_interface/records/sections/kseC_SolidSections.h"
#include "support/DeckTest.h"

namespace {

class OtherFormatInfo : public oif_ModelInfo {
public:
    explicit OtherFormatInfo(const ddb_Model& model) : oif_ModelInfo(model) { SetV6Format(false); }
};

/// A part P with elements 1 to 4 and the sets ALL, LEFT (1, 2) and RIGHT (3, 4), in an instance "I 1".
class PartAttributesBuilder : public ::testing::Test {
protected:
    PartAttributesBuilder() : part_(store_.AddPart("P", {1, 2})) {
        part_.mesh->AddElements("C3D2", {1, 2, 3, 4}, 2, {1, 2, 1, 2, 1, 2, 1, 2});
        part_.mesh->AddElementSet("ALL", {1, 2, 3, 4});
        part_.mesh->AddElementSet("LEFT", {1, 2});
        part_.mesh->AddElementSet("RIGHT", {3, 4});
        kseC_HomogenousSolidSection section;
        section.materialName = "Steel";
        store_.model.sections.Insert("S", section);
        store_.model.AddInstance("I 1", "P");
    }

    void Assign(const char* set, const char* section) {
        ptoC_SectionAssignment assignment;
        assignment.sectionName = section;
        part_.attributes.sectionAssignments.push_back({set, mdl_ObjCow<ptoC_PartAttribute>(assignment)});
    }
    void Orient(const char* set, int datumId) {
        ptoC_MaterialOrientation orientation;
        orientation.datum = dtmC_DatumRef(datumId);
        part_.attributes.materialOrientations.push_back({set, mdl_ObjCow<ptoC_PartAttribute>(orientation)});
    }
    std::string InstanceText(oif_ModelInfo& info) {
        oif_PartAttributesBuilder builder(info);
        builder.Build();
        modelText_ = TextOf(builder.ModelDefinition());
        return TextOf(builder.InstanceDefinition("I 1"));
    }
    std::string InstanceText() {
        store_.model.Complete();
        return InstanceText(store_.Info());
    }
    static std::string TextOf(const qkw_KeywordList& keywords) {
        std::string text;
        for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
        return text;
    }

    TestStore store_;
    odiK_Part& part_;
    std::string modelText_;
};

} // namespace

TEST_F(PartAttributesBuilder, NoAssignment_WritesNothing) {
    EXPECT_EQ(InstanceText(), "");
    EXPECT_EQ(modelText_, "");
}

TEST_F(PartAttributesBuilder, OneAssignment_RefersToTheRegionsOwnSet) {
    Assign("ALL", "S");
    EXPECT_EQ(InstanceText(), "** Region: (S:ALL)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=ALL, material=Steel\n"
                              "1.,\n");
    EXPECT_EQ(modelText_, "") << "without controls there is no banner of theirs";
}

TEST_F(PartAttributesBuilder, AssignmentThatALaterOneTakesElementsFrom_IsPartial) {
    Assign("ALL", "S");
    Assign("LEFT", "S");
    EXPECT_EQ(InstanceText(), "** Region: (S:LEFT)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=LEFT, material=Steel\n"
                              "1.,\n"
                              "** Region: (S:ALL)\n"
                              "*Elset, elset=ALL_I2, internal\n"
                              "3,4\n"
                              "** Section: S\n"
                              "*Solid Section, elset=ALL_I2, material=Steel\n"
                              "1.,\n");
}

TEST_F(PartAttributesBuilder, SectionThatIsNotThere_LeavesTheRegionsCommentAlone) {
    Assign("ALL", "Missing");
    EXPECT_EQ(InstanceText(), "** Region: (Missing:ALL)\n");
}

TEST_F(PartAttributesBuilder, ConnectorSection_HasItsCommentsOnly) {
    store_.model.sections.Insert("C", kseC_ConnectorSection());
    Assign("ALL", "C");
    EXPECT_EQ(InstanceText(), "** Region: (C:ALL)\n"
                              "** Section: C\n");
}

TEST_F(PartAttributesBuilder, OrientationWithoutASystem_IsNamedInTheCommentOnly) {
    Assign("ALL", "S");
    Orient("ALL", 0);
    EXPECT_EQ(InstanceText(), "** Region: (S:ALL), (Material Orientation:ALL)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=ALL, material=Steel\n"
                              "1.,\n");
}

TEST_F(PartAttributesBuilder, OrientationOfTwoGroups_IsWrittenOnceBeforeTheFirst) {
    odiK_Datum datum;
    datum.name = "cs";
    store_.model.AddDatum(datum);
    kseC_HomogenousSolidSection other;
    other.materialName = "Lead";
    store_.model.sections.Insert("T", other);
    Assign("LEFT", "S");
    Assign("RIGHT", "T");
    Orient("ALL", 1);
    EXPECT_EQ(InstanceText(),
              "*Orientation, name=Ori-1\n"
              "          1.,           0.,           0.,           0.,           1.,           0.\n"
              "1, 0.\n"
              "** Region: (S:LEFT), (Material Orientation:ALL)\n"
              "** Section: S\n"
              "*Solid Section, elset=LEFT, orientation=Ori-1, material=Steel\n"
              "1.,\n"
              "** Region: (T:RIGHT), (Material Orientation:ALL)\n"
              "** Section: T\n"
              "*Solid Section, elset=RIGHT, orientation=Ori-1, material=Lead\n"
              "1.,\n");
}

TEST_F(PartAttributesBuilder, OtherFormat_PutsTheInstanceBeforeAnOrientationsName) {
    odiK_Datum datum;
    datum.name = "cs";
    store_.model.AddDatum(datum);
    Assign("ALL", "S");
    Orient("ALL", 1);
    store_.model.Complete();
    OtherFormatInfo info(store_.View());
    EXPECT_EQ(InstanceText(info),
              "*Orientation, name=\"I 1\"_Ori-1\n"
              "          1.,           0.,           0.,           0.,           1.,           0.\n"
              "1, 0.\n"
              "** Region: (S:ALL), (Material Orientation:ALL)\n"
              "** Section: S\n"
              "*Solid Section, elset=ALL, orientation=\"I 1\"_Ori-1, material=Steel\n"
              "1.,\n");
}

TEST_F(PartAttributesBuilder, ExplicitJob_HasNoHourglassStiffness) {
    bme_ElemCtrlParams controls;
    controls.hourglass = bme_ElemCtrlParams::HourglassEnm::VISCOUS;
    controls.hourglassStiffness = 2.0;
    part_.mesh->AddElements("C3D3", {9}, 2, {1, 2}, controls);
    part_.mesh->AddElementSet("NINE", {9});
    Assign("NINE", "S");
    store_.model.analysisProduct = 1;
    EXPECT_EQ(InstanceText(), "** Region: (S:NINE), (Controls:EC-1)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=NINE, controls=EC-1, material=Steel\n"
                              "1.,\n");
    EXPECT_EQ(modelText_, "** \n"
                          "** ELEMENT CONTROLS\n"
                          "** \n"
                          "*Section Controls, name=EC-1, hourglass=VISCOUS\n"
                          "1., 1., 1.\n");
}

TEST_F(PartAttributesBuilder, HourglassStiffnessAlone_IsNoControlOfAnExplicitJob) {
    bme_ElemCtrlParams controls;
    controls.hourglassStiffness = 2.0;
    part_.mesh->AddElements("C3D3", {9}, 2, {1, 2}, controls);
    part_.mesh->AddElementSet("NINE", {9});
    Assign("NINE", "S");
    store_.model.analysisProduct = 1;
    EXPECT_EQ(InstanceText(), "** Region: (S:NINE)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=NINE, material=Steel\n"
                              "1.,\n");
}

TEST_F(PartAttributesBuilder, JobOfNeitherSolver_HasNoControls) {
    bme_ElemCtrlParams controls;
    controls.hourglass = bme_ElemCtrlParams::HourglassEnm::VISCOUS;
    part_.mesh->AddElements("C3D3", {9}, 2, {1, 2}, controls);
    part_.mesh->AddElementSet("NINE", {9});
    Assign("NINE", "S");
    store_.model.analysisProduct = 2;
    EXPECT_EQ(InstanceText(), "** Region: (S:NINE)\n"
                              "** Section: S\n"
                              "*Solid Section, elset=NINE, material=Steel\n"
                              "1.,\n");
    EXPECT_EQ(modelText_, "");
}

TEST_F(PartAttributesBuilder, UserShell_TakesTheGeneralKeywordWhichRaises) {
    store_.model.sections.Insert("U", kseC_UserShellSection());
    Assign("ALL", "U");
    EXPECT_EQ(Raised([&] { InstanceText(); }), "Shell general section unimplemented");
}

TEST_F(PartAttributesBuilder, InstanceWithoutElements_WritesNothing) {
    store_.AddPart("Empty", {1});
    store_.model.AddInstance("E", "Empty");
    store_.model.Complete();
    oif_PartAttributesBuilder builder(store_.Info());
    builder.Build();
    EXPECT_TRUE(builder.InstanceDefinition("E").IsEmpty());
}
