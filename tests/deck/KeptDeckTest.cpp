#include "deck/oif_KeptDeck.h"
#include "deck/oif_Writer.h"
#include "store_interface/records/conditions/kloC_Loads.h"
#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"
#include "store_interface/records/sections/kseC_PointSection.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"
#include "tests/support/KeptTexts.h"

namespace {

std::string DeckOf(const odb_Odb& odb) {
    qio_StringDevice device;
    oif_Writer(odb).WriteInput(device);
    return device.Text();
}

/// A mass that is pushed.
class PushedStore : public TestStore {
public:
    PushedStore() {
        AddPart("P", {1});
        model.Parts().begin()->second->mesh->AddNodeSet("N", {1});
        model.AddInstance("I", "P");
        model.steps.Append("Initial", kprC_InitialStep());
        model.steps.Append("Push", kprC_StaticStep());
        kloC_ConcentratedForce force;
        force.region = model.Region("I", "N");
        mdl_StateEdit<kloC_VectorState>(force.Give("Push")).Set<&kloC_VectorState::component1>(1.0);
        model.loads.Insert("F", force);
        kseC_PointSection section;
        model.sections.Insert("Heavy", section);
    }
};

/// A store of the same model, to be changed.
class Variant {
public:
    explicit Variant(const TestStore& base) : model(odb.AddModel(odb_Odb::DefaultModelName())) {
        model.Share(base.model);
    }
    odb_Odb odb;
    odiK_Model& model;
};

/// Its deck by the kept one; `device` tells what was asked for meanwhile.
std::string DeckBy(const oif_KeptDeck& kept, const odb_Odb& odb, KeptTexts& device) {
    device.deck.clear();
    device.asked = 0;
    oif_Writer(odb).WriteInput(device, kept);
    return device.deck;
}

} // namespace

TEST(MeshTexts, NodesElementsAndSetsAreKept_WhatElseAnInstanceHasIsNot) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1});
    part.mesh->AddElements("MASS", {1}, 1, {1});
    part.mesh->AddElementSet("A", {1});
    ptoC_SectionAssignment assignment;
    assignment.sectionName = "Heavy";
    part.attributes.sectionAssignments.push_back({"A", mdl_ObjCow<ptoC_PartAttribute>(assignment)});
    store.model.AddInstance("I", "P");
    kseC_PointSection section;
    section.mass = 5.0;
    store.model.sections.Insert("Heavy", section);

    const odiK_Mesh* mesh = part.mesh.Referent();
    KeptTexts device;
    oif_Writer(store.odb).WriteInput(device);
    EXPECT_EQ(device.kept, 3);
    EXPECT_EQ((*device.texts[{mesh, oif_MeshBlockEnm::NODES}]),
              "*Node\n      1,           1.,           0.,           0.");
    EXPECT_EQ((*device.texts[{mesh, oif_MeshBlockEnm::ELEMENTS}]), "*Element, type=MASS\n1, 1");
    EXPECT_EQ((*device.texts[{mesh, oif_MeshBlockEnm::SETS}]), "*Elset, elset=A\n1, ");
    EXPECT_EQ(device.deck, DeckOf(store.odb));

    section.mass = 6.0;
    store.model.sections.Insert("Heavy", section);
    device.deck.clear();
    oif_Writer(store.odb).WriteInput(device);
    EXPECT_EQ(device.kept, 3);
    EXPECT_NE(device.deck.find("*Mass, elset=A\n6., \n"), std::string::npos);
    EXPECT_EQ(device.deck, DeckOf(store.odb));
}

TEST(KeptDeck, OfAVariant_OnlyWhatHasReadTheDifferenceIsMadeAgain) {
    PushedStore store;
    KeptTexts device;
    const auto kept = oif_Writer(store.odb).Keep(device);
    EXPECT_EQ(device.deck, DeckOf(store.odb));
    EXPECT_GT(device.asked, 0);

    Variant variant(store);
    variant.model.loads.Remove("F");
    const std::string deck = DeckOf(variant.odb);
    EXPECT_EQ(deck.find("*Cload"), std::string::npos);
    EXPECT_EQ(DeckBy(*kept, variant.odb, device), deck);
    EXPECT_EQ(device.asked, 0); // nobody has looked at the instance
}

TEST(KeptDeck, OfAnotherModel_IsNoneOfIts) {
    PushedStore store;
    KeptTexts device;
    const auto kept = oif_Writer(store.odb).Keep(device);
    const PushedStore other;
    EXPECT_EQ(DeckBy(*kept, other.odb, device), DeckOf(other.odb));
    EXPECT_GT(device.asked, 0);
}

TEST(KeptDeck, WhatChangesInTheModelLater_IsADifference) {
    PushedStore store;
    KeptTexts device;
    const auto kept = oif_Writer(store.odb).Keep(device);
    store.model.loads.Remove("F");
    EXPECT_EQ(DeckBy(*kept, store.odb, device), DeckOf(store.odb));
    EXPECT_EQ(device.asked, 0);
}

TEST(KeptDeck, WithAHeadingWhoseLineGoesOn_IsMadeAgain) {
    PushedStore store;
    store.model.topLevelSolverInput = "** no end of the line";
    KeptTexts device;
    const auto kept = oif_Writer(store.odb).Keep(device);
    Variant variant(store);
    variant.model.loads.Remove("F");
    EXPECT_EQ(DeckBy(*kept, variant.odb, device), DeckOf(variant.odb));
    EXPECT_GT(device.asked, 0);
}

TEST(KeptDeck, OfAModelThatCantBeWritten_RaisesWhatWritingDoes) {
    PushedStore store;
    kloC_Pressure pressure; // without a surface
    pressure.Give("Push");
    store.model.loads.Insert("G", pressure);
    KeptTexts device;
    EXPECT_THROW(oif_Writer(store.odb).Keep(device), QRXBasException);
}
