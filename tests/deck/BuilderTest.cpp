#include "base/oif_Comment.h"
#include "deck/QRXZptInputFileWriter.h"
#include "deck/oif_Builder.h"
#include "deck/oif_Writer.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"
#include "support/DeckTest.h"
#include "support/TestFolder.h"

namespace {

/// Files keywords in all sections.
class Filer final : public oif_ComponentOf<Filer> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override {
        AddModelDefinition(oif_RawKeyword("model"));
        AddAssemblyDefinition(oif_RawKeyword("assembly"));
        AddPartDefinition("P", oif_RawKeyword("part"));
        AddInstanceDefinition("I", oif_RawKeyword("instance"));
        AddStepDefinition("S", oif_RawKeyword("body"));
        AddStepDefinition("S", oif_RawKeyword("case"), "A");
        AddAtomOptionDefinition(oif_RawKeyword("atom"));
        AddSingleTermDefinition(oif_RawKeyword("single"));
        AddCombinedTermDefinition(oif_RawKeyword("combined"));
        AddDesignAreaDefinition(oif_RawKeyword("area"));
    }
};

class OtherFormatInfo : public oif_ModelInfo {
public:
    explicit OtherFormatInfo(const ddb_Model& model) : oif_ModelInfo(model) { SetV6Format(false); }
};

std::string TextOf(const qkw_KeywordList& keywords) {
    std::string text;
    for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    return text;
}

std::string WrittenDeck(TestStore& store) {
    const TestFolder folder;
    oif_Writer(store.odb).WriteInputFile(folder.Path("job").c_str());
    EXPECT_TRUE(qio_LastReport().opened);
    EXPECT_EQ(qio_LastReport().error, 0);
    std::string text = folder.Text("job.inp");
    EXPECT_EQ(qio_LastReport().bytes, static_cast<long long>(text.size()));
    return text;
}

} // namespace

TEST(BuilderComponent, Keywords_AreFiledBySection) {
    TestStore store;
    Filer filer(store.Info());
    filer.Build();
    EXPECT_EQ(TextOf(filer.ModelDefinition()), "model\n");
    EXPECT_EQ(TextOf(filer.AssemblyDefinition()), "assembly\n");
    EXPECT_EQ(TextOf(filer.PartDefinition("P")), "part\n");
    EXPECT_EQ(TextOf(filer.InstanceDefinition("I")), "instance\n");
    EXPECT_EQ(TextOf(filer.StepDefinition("S")), "body\n");
    EXPECT_EQ(TextOf(filer.StepDefinition("S", "")), "body\n");
    EXPECT_EQ(TextOf(filer.StepDefinition("S", "A")), "case\n");
    EXPECT_EQ(TextOf(filer.AtomOptionDefinition()), "atom\n");
    EXPECT_EQ(TextOf(filer.SingleTermDefinition()), "single\n");
    EXPECT_EQ(TextOf(filer.CombinedTermDefinition()), "combined\n");
    EXPECT_EQ(TextOf(filer.DesignAreaDefinition()), "area\n");
}

TEST(BuilderComponent, UnknownKeys_GiveEmptyListsAndMakeNoEntry) {
    TestStore store;
    Filer filer(store.Info());
    filer.Build();
    EXPECT_TRUE(filer.PartDefinition("Q").IsEmpty());
    EXPECT_TRUE(filer.PartDefinition("Q").IsEmpty());
    EXPECT_TRUE(filer.InstanceDefinition("Q").IsEmpty());
    EXPECT_TRUE(filer.StepDefinition("Q").IsEmpty());
    EXPECT_TRUE(filer.StepDefinition("S", "Q").IsEmpty());
}

TEST(BuilderComponent, Copy_SharesListsUntilOneIsWritten) {
    TestStore store;
    Filer filer(store.Info());
    filer.Build();
    const std::unique_ptr<qkw_BuilderComponent> copy(filer.Copy());
    filer.Build();
    EXPECT_EQ(TextOf(copy->ModelDefinition()), "model\n");
    EXPECT_EQ(TextOf(filer.ModelDefinition()), "model\nmodel\n");
    EXPECT_EQ(TextOf(copy->StepDefinition("S", "A")), "case\n");
}

TEST(Builder, ModelWithoutParts_HasBothBanners) {
    TestStore store;
    EXPECT_EQ(WrittenDeck(store), "**\n** PARTS\n**\n"
                                  "**\n** ASSEMBLY\n**\n"
                                  "*Assembly, name=Assembly\n"
                                  "*End Assembly\n");
}

TEST(Builder, OpeningTextWithoutLineEnd_RunsIntoTheBannerOnPurpose) {
    TestStore store;
    store.model.topLevelSolverInput = "*Heading";
    EXPECT_EQ(WrittenDeck(store).substr(0, 20), "*Heading**\n** PARTS\n");
}

TEST(Builder, StepsWithAndWithoutLoadCases_CloseInTheRightPlace) {
    TestStore store;
    kprC_InitialStep initial;
    initial.solverInput = "initial text";
    // Load cases of the initial step can't be; it has none.
    store.model.steps.Append("Initial", initial);
    kprC_StaticStep plain;
    plain.solverInput = "plain text\n";
    store.model.steps.Append("Plain", plain);
    kprC_SteadyStateModalStep cases;
    cases.solverInput = "body text";
    cases.loadCases.Insert("B", klcC_LoadCase());
    cases.loadCases.Insert("A", klcC_LoadCase());
    store.model.steps.Append("Cases", cases);
    const std::string banner = "** ----------------------------------------------------------------\n** \n";
    EXPECT_EQ(WrittenDeck(store), "**\n** PARTS\n**\n"
                                  "**\n** ASSEMBLY\n**\n"
                                  "*Assembly, name=Assembly\n"
                                  "*End Assembly\n"
                                  "initial text\n" +
                                      banner +
                                      "** STEP: Plain\n** \n"
                                      "*Step, name=Plain\n"
                                      "*Static\n"
                                      "1., 1., 1e-05, 1.\n"
                                      "plain text\n"
                                      "*End Step\n" +
                                      banner +
                                      "** STEP: Cases\n** \n"
                                      "*Step, name=Cases, perturbation\n"
                                      "*Steady State Dynamics\n"
                                      "body text\n"
                                      "** \n** LOAD CASES\n** \n"
                                      "*Load Case, name=A\n"
                                      "*End Load Case\n"
                                      "*Load Case, name=B\n"
                                      "*End Load Case\n"
                                      "*End Step\n");
}

TEST(Builder, TwoInstancesOfOnePart_CloseThePartOnce) {
    TestStore store;
    store.AddPart("P", {}).solverInput = "part text";
    store.model.AddInstance("I2", "P").solverInput = "two";
    store.model.AddInstance("I1", "P").solverInput = "one\n";
    store.model.AssemblyObject().name = "the assembly";
    store.model.AssemblyObject().solverInput = "assembly text";
    store.model.solverInput = "model text";
    EXPECT_EQ(WrittenDeck(store), "**\n** PARTS\n**\n"
                                  "*Part, name=P\n"
                                  "part text\n"
                                  "*End Part\n"
                                  "**\n** ASSEMBLY\n**\n"
                                  "*Assembly, name=the assembly\n"
                                  "*Instance, name=I1, part=P\n"
                                  "one\n"
                                  "*End Instance\n"
                                  "*Instance, name=I2, part=P\n"
                                  "two\n"
                                  "*End Instance\n"
                                  "assembly text\n"
                                  "*End Assembly\n"
                                  "model text\n");
}

TEST(Builder, OtherFormat_HasNoBannersAndNoOpeningOrClosingLinesOfInstances) {
    TestStore store;
    store.AddPart("P", {}).solverInput = "part text";
    store.model.AddInstance("I", "P").solverInput = "instance text";
    store.model.AssemblyObject().solverInput = "assembly text";
    OtherFormatInfo info(store.View());
    oif_Builder builder(info);
    const TestFolder folder;
    EXPECT_TRUE(builder.WriteInputFile(folder.Path("other.inp")));
    EXPECT_EQ(folder.Text("other.inp"), "part text\n*End Part\ninstance text\nassembly text\n");
}

TEST(Builder, PathThatCannotBeOpened_GivesFalseAndNoException) {
    TestStore store;
    oif_Builder builder(store.Info());
    const TestFolder folder;
    EXPECT_FALSE(builder.WriteInputFile(folder.Path("no/such/folder/deck.inp")));
    EXPECT_FALSE(qio_LastReport().opened);
    EXPECT_NE(qio_LastReport().error, 0);
}

TEST(Writer, JobNameWithExtension_KeepsItAndGetsAnother) {
    TestStore store;
    const TestFolder folder;
    oif_Writer(store.odb).WriteInputFile(folder.Path("job.v2.inp").c_str());
    EXPECT_EQ(folder.Entries(), std::vector<std::string>{"job.v2.inp.inp"});
    EXPECT_FALSE(folder.Text("job.v2.inp.inp").empty());
}

TEST(Writer, OldDeck_IsReplacedWhole) {
    TestStore store;
    const TestFolder folder;
    folder.Put("old.inp", std::string(100000, 'x'));
    oif_Writer(store.odb).WriteInputFile(folder.Path("old").c_str());
    EXPECT_FALSE(folder.Text("old.inp").empty());
    EXPECT_EQ(folder.Text("old.inp").find('x'), std::string::npos);
}

TEST(Writer, StoreWithoutDefaultModel_Raises) {
    odb_Odb odb;
    odb.AddModel("Other");
    EXPECT_EQ(Raised([&] { oif_Writer(odb).WriteInputFile("unused"); }),
              "ddb_Ddb: no entry named 'Default Model'");
}

TEST(Writer, Twice_WritesTheSame) {
    TestStore store;
    store.AddPart("P", {1, 2});
    store.model.AddInstance("I", "P");
    EXPECT_EQ(WrittenDeck(store), WrittenDeck(store));
}

TEST(Module, StartAndStop_CountEachModuleOnce) {
    int count = 0;
    QRXZptInputFileWriter_initialize(count);
    // Twelve libraries, two layers and the writer itself.
    EXPECT_EQ(count, 15);
    QRXZptInputFileWriter_initialize(count);
    EXPECT_EQ(count, 15);
    QRXZptInputFileWriter_finalize(count);
    EXPECT_EQ(count, 15);
    QRXZptInputFileWriter_finalize(count);
    EXPECT_EQ(count, 0);
    QRXZptInputFileWriter_finalize(count);
    EXPECT_EQ(count, 0);
}

TEST(Module, LayerInUseByAnother_StaysUp) {
    int layer = 0;
    QRXZptIfwOif_initialize(layer);
    EXPECT_EQ(layer, 1);
    int count = 0;
    QRXZptInputFileWriter_initialize(count);
    EXPECT_EQ(count, 14);
    QRXZptInputFileWriter_finalize(count);
    EXPECT_EQ(count, 0);
    QRXZptIfwOif_finalize(layer);
    EXPECT_EQ(layer, 0);
}
