#include "mesh/oif_Region.h"
#include "mesh/oif_RegionBuilder.h"
#include "mesh/oif_Set.h"
#include "mesh/oif_SetName.h"
#include "mesh/oif_Surface.h"
#include "support/DeckTest.h"

#include <functional>
#include <numeric>

namespace {

using Context = oif_SetName::regionContext;

std::string SetOf(std::initializer_list<int> labels, const char* name = "S") {
    cow_List<int> list;
    for (const int label : labels) list.Append(label);
    return Written(oif_Elset(list, name, "", false));
}

std::string Named(const char* name, Context context) {
    return std::string(oif_SetName(name, false).UniqueSetName(context).View());
}

/// A store with one instance "I" of a part with nodes 1 to 8 and elements 1 to 40 of a type on them.
class Faces {
public:
    Faces(const char* type, const std::vector<odiK_FacetInput>& facets, bool internal = false) {
        odiK_Part& part = store.AddPart("P", {1, 2, 3, 4, 5, 6, 7, 8});
        std::vector<int> labels(40);
        std::iota(labels.begin(), labels.end(), 1);
        part.mesh->AddElements(type, labels, 1, std::vector<int>(40, 1));
        part.mesh->AddSurface("SF", facets, internal);
        store.model.AddInstance("I", "P");
    }
    std::string Text() {
        const ddb_PartInstance instance = store.Instance("I");
        return Written(oif_Surface(instance.set(0).set(), instance));
    }
    TestStore store;
};

/// A constraint that names node sets as surfaces.
class Users final : public cls_RecordOf<Users, kcoC_Constraint> {
public:
    static constexpr cls_ClassInfo Class{"TestUsersOfNodeSets", "a constraint on node sets"};
    cow_List<rgnC_Region> regions;
    cow_List<rgnC_Region> ConstGetContactNodeSets() const override { return regions; }
};

} // namespace

TEST(Set, RegularLabels_Generate) {
    EXPECT_EQ(SetOf({1, 2, 3}), "*Elset, elset=S, generate\n1, 3, 1\n");
}

TEST(Set, UnsortedRegularLabels_AreSortedAndGenerate) {
    EXPECT_EQ(SetOf({5, 3, 1}), "*Elset, elset=S, generate\n1, 5, 2\n");
}

TEST(Set, TwoLabels_NeverGenerate) {
    EXPECT_EQ(SetOf({1, 2}), "*Elset, elset=S\n1,2\n");
}

TEST(Set, OneLabel_HasACommaAndABlankBehindItOnPurpose) {
    EXPECT_EQ(SetOf({7}), "*Elset, elset=S\n7, \n");
}

TEST(Set, RepeatedLabels_LoseTheRepetition) {
    EXPECT_EQ(SetOf({3, 1, 3, 7}), "*Elset, elset=S\n1,3,7\n");
    EXPECT_EQ(SetOf({3, 3, 3}), "*Elset, elset=S\n3, \n");
}

TEST(Set, SixteenIrregularLabels_FillOneLineWithoutComma) {
    EXPECT_EQ(SetOf({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 17}),
              "*Elset, elset=S\n1,2,3,4,5,6,7,8,9,10,11,12,13,14,15,17\n");
}

TEST(Set, SeventeenIrregularLabels_TheLastStandsAloneWithComma) {
    EXPECT_EQ(SetOf({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 18}),
              "*Elset, elset=S\n1,2,3,4,5,6,7,8,9,10,11,12,13,14,15,16\n18, \n");
}

TEST(Set, EighteenIrregularLabels_EndWithoutComma) {
    EXPECT_EQ(SetOf({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 18, 19}),
              "*Elset, elset=S\n1,2,3,4,5,6,7,8,9,10,11,12,13,14,15,16\n18,19\n");
}

TEST(Set, NoLabelsAndNoMembers_WriteNothing) {
    EXPECT_EQ(SetOf({}), "");
    EXPECT_EQ(Written(oif_Nset("S", cow_List<cow_String>())), "");
}

TEST(Set, MemberSets_AreInternalAsElementSetsAndNeverAsNodeSetsOnPurpose) {
    const cow_List<cow_String> members("A", "I.b c");
    EXPECT_EQ(Written(oif_Elset("S 1", members)), "*Elset, elset=\"S 1\", internal\nA, \n\"I.b c\", \n");
    EXPECT_EQ(Written(oif_Nset("S 1", members)), "*Nset, nset=\"S 1\"\nA, \n\"I.b c\", \n");
}

TEST(Set, InternalAndInstance_StandBehindTheName) {
    cow_List<int> labels(4, 6, 9);
    EXPECT_EQ(Written(oif_Elset(labels, "_I1", "my inst", true)),
              "*Elset, elset=_I1, instance=\"my inst\", internal\n4,6,9\n");
}

TEST(Set, NodeSetOfAnInstance_KeepsInternal) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {10, 20, 30});
    part.mesh->AddNodeSet("N", {30, 10}, true);
    store.model.AddInstance("I", "P");
    const ddb_PartInstance instance = store.Instance("I");
    EXPECT_EQ(Written(oif_Nset(instance.set(0).set(), instance)), "*Nset, nset=N, internal\n10,30\n");
    EXPECT_EQ(Written(oif_Nset(instance.set(0).set(), instance, "I")),
              "*Nset, nset=N, instance=I, internal\n10,30\n");
}

TEST(Set, NodeEntryOutsideTheMesh_IsDroppedSilently) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {10, 20});
    part.mesh->AddNodeSet("N", {10});
    part.mesh->Sets()[0]->subsets[0].subset.Append(99);
    store.model.AddInstance("I", "P");
    const ddb_PartInstance instance = store.Instance("I");
    EXPECT_EQ(Written(oif_Nset(instance.set(0).set(), instance)), "*Nset, nset=N\n10, \n");
}

TEST(Set, ShareOfTheAssembly_IsEmptyWithoutAMesh) {
    TestStore store;
    store.AddPart("P", {1, 2});
    store.model.AddInstance("I", "P");
    const int labels[] = {1, 2};
    const odiK_MemberInput members[] = {{"I", labels, {}}};
    store.model.AddAssemblySet("N", res_SetTypeEnm::NODES, members);
    const ddb_Assembly assembly = store.View().rootAssembly();
    EXPECT_TRUE(oif_Set(assembly.set(0).set(), assembly).Labels().IsEmpty());
    EXPECT_EQ(Written(oif_Nset(assembly.set(0).set(), assembly)), "");
}

TEST(SetName, ScopedNames_GiveSetAndInstance) {
    EXPECT_EQ(Named("S", Context::ASSEMBLY), "S");
    EXPECT_EQ(Named("I.S", Context::ASSEMBLY), "I.S");
    EXPECT_EQ(Named("I.S", Context::INSTANCE), "S");
    EXPECT_EQ(Named("A.I.S", Context::ASSEMBLY), "I.S");
}

TEST(SetName, FourParts_GiveEmptyNames) {
    const oif_SetName name("A.B.C.D", false);
    EXPECT_EQ(name.InstanceName(), "");
    EXPECT_EQ(name.UniqueSetName(Context::ASSEMBLY), "");
}

TEST(SetName, DotsInQuotes_DoNotSplit) {
    const oif_SetName name("\"I.1\".S", false);
    EXPECT_EQ(name.InstanceName(), "\"I.1\"");
}

TEST(SetName, BlanksInBothParts_AreQuotedPartByPart) {
    EXPECT_EQ(Named("my inst.my set", Context::ASSEMBLY), "\"my inst\".\"my set\"");
}

TEST(SetName, OtherName_IsKeptFromThenOn) {
    oif_SetName name("I.S", false);
    EXPECT_EQ(name.UniqueSetName("_I1", Context::ASSEMBLY), "I._I1");
    EXPECT_EQ(name.UniqueSetName(Context::INSTANCE), "_I1");
}

TEST(LabelPieces, SpansAndSingleLabels_KeepTheirOrder) {
    std::vector<int> labels;
    std::vector<std::size_t> sizes;
    const oif_LabelSource::Take take = [&](std::span<const int> piece) {
        labels.insert(labels.end(), piece.begin(), piece.end());
        sizes.push_back(piece.size());
    };
    std::vector<int> all(3000);
    std::iota(all.begin(), all.end(), 1);
    oif_LabelPieces pieces(take);
    const std::span<const int> whole(all);
    pieces.Add(whole[0]);
    pieces.Add(whole.subspan(1, 100));
    // Large ones go on as they are, behind what was gathered.
    pieces.Add(whole.subspan(101, 2000));
    pieces.Add(whole.subspan(2101, 100));
    for (std::size_t i = 2201; i < whole.size(); ++i) pieces.Add(whole[i]);
    pieces.HandOn();
    EXPECT_EQ(labels, all);
    EXPECT_EQ(sizes, (std::vector<std::size_t>{101, 2000, 899}));
}

TEST(SetName, Quotes_NeedMoreThanTwoCharacters) {
    EXPECT_FALSE(oif_SetName::IsQuoted("\"\""));
    EXPECT_TRUE(oif_SetName::IsQuoted("\"a\""));
    EXPECT_EQ(oif_SetName::Unquote("\"a\""), "a");
    EXPECT_EQ(oif_SetName::Unquote("\"\""), "\"\"");
    EXPECT_EQ(oif_SetName::Unquote("a"), "a");
}

TEST(SetName, QuoteIfNeeded_SplitsInsideQuotesOnPurpose) {
    // "a.b" in quotes is split into two odd tokens, each of which needs quotes.
    EXPECT_EQ(oif_SetName::QuoteIfNeeded("\"a b\".c"), "\"a b\".c");
    EXPECT_EQ(oif_SetName::QuoteIfNeeded("2.x"), "\"2\".x");
    EXPECT_EQ(oif_SetName::QuoteIfNeeded(""), "");
}

TEST(SetName, NodeSetAsSurface_HasNoDotLeft) {
    TestStore store;
    store.AddPart("P", {1}).mesh->AddNodeSet("S", {1});
    store.model.AddInstance("I", "P");
    const rgnC_Region region = store.model.Region("I", "S");
    const oif_SetName name(region, store.Info());
    EXPECT_EQ(name.InstanceName(), "I");
    EXPECT_EQ(name.UniqueSetName(Context::ASSEMBLY), "I.S");
    EXPECT_EQ(name.UniqueSurfaceName(Context::ASSEMBLY), "I_S_CNS_");
    EXPECT_EQ(name.UniqueSurfaceName(Context::INSTANCE), "S_CNS_");
}

TEST(SetName, SurfaceRegion_KeepsItsName) {
    Faces faces("C3D8", {{1, 0, {}}});
    const oif_SetName name(faces.store.model.Region("I", "SF"), faces.store.Info());
    EXPECT_EQ(name.UniqueSurfaceName(Context::ASSEMBLY), "I.SF");
}

TEST(SetName, AssemblySet_HasNoInstance) {
    TestStore store;
    store.AddPart("P", {1});
    store.model.AddInstance("I", "P");
    const int labels[] = {1};
    const odiK_MemberInput members[] = {{"I", labels, {}}};
    store.model.AddAssemblySet("my set", res_SetTypeEnm::NODES, members);
    const oif_SetName name(store.model.Region("", "my set"), store.Info());
    EXPECT_EQ(name.InstanceName(), "");
    EXPECT_EQ(name.UniqueSetName(Context::ASSEMBLY), "\"my set\"");
    EXPECT_EQ(name.UniqueSurfaceName(Context::ASSEMBLY), "\"my set_CNS_\"");
}

TEST(SetName, RegionWithoutValueOrOfNoPartInstance_HasEmptyNames) {
    TestStore store;
    store.AddPart("P", {1}).mesh->AddNodeSet("S", {1});
    store.model.AddOtherEntry("I", "P");
    EXPECT_EQ(oif_SetName(rgnC_Region(), store.Info()).UniqueSetName(Context::ASSEMBLY), "");
    const oif_SetName name(store.model.Region("I", "S"), store.Info());
    EXPECT_EQ(name.InstanceName(), "");
    EXPECT_EQ(name.UniqueSetName(Context::ASSEMBLY), "");
}

TEST(Surface, FacesOfSolids_HaveOneInternalSetEach) {
    Faces faces("C3D8", {{1, 0, {}}, {2, 1, {}}, {3, 0, {}}});
    EXPECT_EQ(faces.Text(), "*Elset, elset=_SF_S1, internal\n1,3\n"
                            "*Elset, elset=_SF_S2, internal\n2, \n"
                            "*Surface, type=ELEMENT, name=SF\n"
                            "_SF_S1, S1\n"
                            "_SF_S2, S2\n");
}

TEST(Surface, FaceThatIsMetFirst_ComesFirst) {
    Faces faces("C3D8", {{1, 1, {}}, {2, 0, {}}});
    EXPECT_EQ(faces.Text().substr(0, 27), "*Elset, elset=_SF_S2, inter");
}

TEST(Surface, BothSidesOfShells_AreNamed) {
    // "SPOS" is the root; at depth 0 the bit of 'S' puts "SNEG" to its right.
    Faces faces("S4R", {{1, 0, {}}, {2, 1, {}}, {3, 0, {}}, {4, 0, {}}, {5, 0, {}}}, true);
    EXPECT_EQ(faces.Text(), "*Elset, elset=_SF_SPOS, internal\n1,3,4,5\n"
                            "*Elset, elset=_SF_SNEG, internal\n2, \n"
                            "*Surface, type=ELEMENT, name=SF, internal\n"
                            "_SF_SPOS, SPOS\n"
                            "_SF_SNEG, SNEG\n");
}

TEST(Surface, DoubleSideOfAShell_HasNoFaceNameOnPurpose) {
    Faces faces("S4R", {{1, 6, {}}, {2, 6, {}}, {3, 6, {}}});
    EXPECT_EQ(faces.Text(), "*Elset, elset=_SF_, internal, generate\n1, 3, 1\n"
                            "*Surface, type=ELEMENT, name=SF\n"
                            "_SF_, \n");
}

TEST(Surface, EndsOfLinesAndEdgesOfPlaneElements_AreNumbered) {
    EXPECT_EQ(Faces("B31", {{1, 1, {}}}).Text(), "*Elset, elset=_SF_END2, internal\n1, \n"
                                                 "*Surface, type=ELEMENT, name=SF\n_SF_END2, END2\n");
    EXPECT_EQ(Faces("CPS4", {{1, 3, {}}}).Text(), "*Elset, elset=_SF_S4, internal\n1, \n"
                                                  "*Surface, type=ELEMENT, name=SF\n_SF_S4, S4\n");
    EXPECT_EQ(Faces("MASS", {{1, 2, {}}}).Text(), "*Elset, elset=_SF_3, internal\n1, \n"
                                                  "*Surface, type=ELEMENT, name=SF\n_SF_3, 3\n");
}

TEST(Surface, ShellFacetWithoutFace_MakesTheListsLoseStepOnPurpose) {
    Faces faces("S4R", {{1, 0, {}}, {2, 1, {}}});
    // No model file has such a facet; a store can.
    faces.store.model.Parts().at("P")->mesh->Sets()[0]->subsets[0].facetIds.Put(0, 3);
    EXPECT_EQ(Raised([&] { faces.Text(); }), "cow_List: index 1 is out of range, expected 0 to 0");
}

TEST(Surface, EmptySet_WritesNothing) {
    EXPECT_EQ(Faces("C3D8", {}).Text(), "");
}

TEST(Surface, NodeBased_WritesTheNameAsItStands) {
    TestStore store;
    EXPECT_EQ(Written(oif_Surface(store.Info(), "I_S_CNS_", "I.\"my set\"")),
              "*Surface, type=NODE, name=I_S_CNS_\nI.\"my set\", 1.\n");
}

TEST(Surface, OfTheAssembly_HasAllSetsBeforeItsOneKeyword) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 2, 3, 4, 5, 6, 7, 8});
    part.mesh->AddElements("C3D8", {1, 2}, 8, {1, 2, 3, 4, 5, 6, 7, 8, 1, 2, 3, 4, 5, 6, 7, 8});
    store.model.AddInstance("b", "P");
    store.model.AddInstance("a", "P");
    const odiK_FacetInput one[] = {{1, 0, {}}};
    const odiK_FacetInput two[] = {{2, 4, {}}};
    const odiK_MemberInput members[] = {{"b", {}, one}, {"a", {}, two}, {"b", {}, two}};
    store.model.AddAssemblySet("my surf", res_SetTypeEnm::FACETS, members);
    const ddb_Assembly assembly = store.View().rootAssembly();
    EXPECT_EQ(Written(oif_Surface(assembly.set(0).set(), assembly)),
              "*Elset, elset=\"_my surf_S1\", instance=b, internal\n1, \n"
              "*Elset, elset=\"_my surf_S5\", instance=b, internal\n2, \n"
              "*Elset, elset=\"_my surf_S5\", instance=a, internal\n2, \n"
              "*Surface, type=ELEMENT, name=\"my surf\"\n"
              "\"_my surf_S1\", S1\n"
              "\"_my surf_S5\", S5\n"
              "\"_my surf_S5\", S5\n");
}

TEST(RegionBuilder, AssemblySetOverTwoInstances_GivesTwoKeywordsOfOneName) {
    TestStore store;
    store.AddPart("P", {1, 2, 3});
    store.model.AddInstance("a", "P");
    store.model.AddInstance("b", "P");
    store.model.AssemblyMesh().SetNodes({7}, {0, 0, 0});
    const int two[] = {1, 3};
    const int own[] = {7};
    const odiK_MemberInput members[] = {
        {"b", two, {}}, {"", own, {}}, {"a", two, {}}, {"b", std::span(two).first(1), {}}};
    store.model.AddAssemblySet("N", res_SetTypeEnm::NODES, members);
    oif_RegionBuilder builder(store.Info());
    builder.Build();
    std::string text;
    for (int i = 0; i < builder.AssemblyDefinition().Length(); ++i) {
        text += Written(builder.AssemblyDefinition()[i].ConstGet());
    }
    EXPECT_EQ(text, "*Nset, nset=N, instance=b\n1,3\n"
                    "*Nset, nset=N\n7, \n"
                    "*Nset, nset=N, instance=a\n1,3\n");
}

TEST(RegionBuilder, Surfaces_StandBehindAllSetsOfTheAssembly) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
    part.mesh->AddElements("S4", {1}, 4, {1, 2, 3, 4});
    part.mesh->AddSurface("INNER", {{1, 0, {}}});
    store.model.AddInstance("a", "P");
    const odiK_FacetInput facets[] = {{1, 0, {}}};
    const int labels[] = {1};
    const odiK_MemberInput surface[] = {{"a", {}, facets}};
    const odiK_MemberInput elements[] = {{"a", labels, {}}};
    store.model.AddAssemblySet("SF", res_SetTypeEnm::FACETS, surface);
    store.model.AddAssemblySet("E", res_SetTypeEnm::ELEMENTS, elements);
    oif_RegionBuilder builder(store.Info());
    builder.Build();
    ASSERT_EQ(builder.AssemblyDefinition().Length(), 2);
    EXPECT_EQ(Written(builder.AssemblyDefinition()[0].ConstGet()), "*Elset, elset=E, instance=a\n1, \n");
    ASSERT_EQ(builder.InstanceDefinition("a").Length(), 1);
    EXPECT_EQ(Written(builder.InstanceDefinition("a")[0].ConstGet()).substr(0, 30),
              "*Elset, elset=_INNER_SPOS, int");
}

TEST(RegionBuilder, NodeSetsThatConstraintsUseAsSurfaces_GetOneSurfaceEach) {
    TestStore store;
    store.AddPart("P", {1, 2}).mesh->AddNodeSet("S", {1});
    store.model.AddInstance("I", "P");
    Users users;
    users.regions.Append(store.model.Region("I", "S"));
    users.regions.Append(store.model.Region("I", "S"));
    store.model.constraints.Insert("A", users);
    store.model.constraints.Insert("B", users);
    oif_RegionBuilder builder(store.Info());
    builder.Build();
    ASSERT_EQ(builder.AssemblyDefinition().Length(), 1);
    EXPECT_EQ(Written(builder.AssemblyDefinition()[0].ConstGet()),
              "*Surface, type=NODE, name=I_S_CNS_\nI.S, 1.\n");
}

TEST(Region, Names_AreFoundThroughTheStore) {
    TestStore store;
    store.AddPart("P", {1}).mesh->AddNodeSet("S", {1});
    store.model.AddInstance("I", "P");
    const int labels[] = {1};
    const odiK_MemberInput members[] = {{"I", labels, {}}};
    store.model.AddAssemblySet("A", res_SetTypeEnm::NODES, members);
    const qkw_Model& model = store.Info().Model();
    EXPECT_EQ(oif_Region(model, store.model.Region("I", "S")).FullName(), "I.S");
    EXPECT_EQ(oif_Region(model, store.model.Region("", "A")).FullName(), "A");
    EXPECT_EQ(oif_Region(model, rgnC_Region()).FullName(), "");
    const rgnC_Region elsewhere(ddr_Shortcut("rootAssembly.setData[99]", "X"), "", rgnC_Set());
    EXPECT_EQ(oif_Region(model, elsewhere).FullName(), "");
}
