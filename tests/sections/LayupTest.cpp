#include "keyword_layer/qkw_DiscreteField.h"
#include "keyword_layer/qkw_Layup2SecPtMap.h"
#include "sections/SectionTesting.h"

#include <map>
#include <vector>

namespace {

using Map = qkw_Layup2SecPtMap;
using Points = std::map<std::string, std::vector<int>>;

std::vector<int> Items(const cow_List<int>& list) {
    std::vector<int> items;
    for (int i = 0; i < list.Length(); ++i) items.push_back(list[i]);
    return items;
}

std::vector<int> SectionPoints(int flags, std::initializer_list<int> plies) {
    return Items(Map::SectionPoints(flags, ListOf(plies)));
}

Points Asked(const Map& map, const char* name, const char* layup, int flags = Map::BOTTOM) {
    Points points;
    const auto found = map.ElsetsAndSectionPoints(name, layup, flags);
    for (cow_ConstMapIterator<cow_String, cow_List<int>> it(found); !it.IsDone(); it.Next()) {
        points[it.CurrentKey().CStr()] = Items(it.CurrentValue());
    }
    return points;
}

/// The sets "S1" and "S2" in the layup "L" of part "P" with instance "I", and "S3" in the layup "M".
Map Filled(std::initializer_list<cow_String> requested) {
    Map map;
    map.AddSection("P", "I", "L", "S1", ListOf({3, 3}));
    map.AddSection("P", "I", "L", "S2", ListOf({1}));
    map.AddSection("P", "I", "M", "S3", ListOf({5}));
    map.SetRequestedSets(ListOf(requested));
    return map;
}

TEST(SectionPoints, EachPlace_CountsThroughThePlies) {
    EXPECT_EQ(SectionPoints(Map::ALL, {3, 2}), (std::vector<int>{1, 2, 3, 4, 5}));
    EXPECT_EQ(SectionPoints(Map::BOTTOM, {3, 4, 1}), (std::vector<int>{1, 4, 8}));
    EXPECT_EQ(SectionPoints(Map::TOP, {3, 4, 1}), (std::vector<int>{3, 7, 8}));
    EXPECT_EQ(SectionPoints(Map::MIDDLE, {3}), (std::vector<int>{2}));
    EXPECT_EQ(SectionPoints(Map::MIDDLE, {4}), (std::vector<int>{3}));
    EXPECT_EQ(SectionPoints(Map::MIDDLE, {3, 4, 1}), (std::vector<int>{2, 6, 8}));
}

TEST(SectionPoints, SeveralPlaces_AreSortedAndKeepWhatStandsTwice) {
    EXPECT_EQ(SectionPoints(Map::BOTTOM | Map::TOP, {3, 3}), (std::vector<int>{1, 3, 4, 6}));
    EXPECT_EQ(SectionPoints(Map::BOTTOM | Map::TOP | Map::MIDDLE, {1, 3}),
              (std::vector<int>{1, 1, 1, 2, 3, 4}));
    EXPECT_EQ(SectionPoints(Map::BOTTOM | Map::ALL, {2, 1}), (std::vector<int>{1, 1, 2, 3, 3}));
}

TEST(SectionPoints, NoPlaceOrNoPly_GivesNone) {
    EXPECT_EQ(SectionPoints(0, {3, 4}), std::vector<int>());
    EXPECT_EQ(SectionPoints(Map::ALL | Map::BOTTOM | Map::MIDDLE | Map::TOP, {}), std::vector<int>());
}

TEST(Layup2SecPtMap, Concat_PutsADotBetween) {
    EXPECT_EQ(Map::Concat("a b", "c.d"), "a b.c.d");
    EXPECT_EQ(Map::Concat("", ""), ".");
}

TEST(Layup2SecPtMap, UnknownLayup_GivesAnEmptyMap) {
    const Map map = Filled({"S1", "S2", "S3"});
    EXPECT_EQ(Asked(map, "P", "N"), Points());
    EXPECT_EQ(Asked(map, "Q", "L"), Points());
    // An instance answers for its owner only when it is a clone.
    EXPECT_EQ(Asked(map, "I", "L"), Points());
}

TEST(Layup2SecPtMap, RequestedSets_AreFoundInTheirLayup) {
    const Map map = Filled({"S1", "S2", "S3"});
    EXPECT_EQ(Asked(map, "P", "L"), (Points{{"P.S1", {1, 4}}, {"P.S2", {1}}}));
    EXPECT_EQ(Asked(map, "P", "L", Map::TOP), (Points{{"P.S1", {3, 6}}, {"P.S2", {1}}}));
    EXPECT_EQ(Asked(map, "P", "M", Map::MIDDLE), (Points{{"P.S3", {3}}}));
    EXPECT_EQ(Asked(map, "P", "M", 0), (Points{{"P.S3", {}}}));
}

TEST(Layup2SecPtMap, SetsThatNobodyRequests_AreLeftOut) {
    EXPECT_EQ(Asked(Filled({"S2"}), "P", "L"), (Points{{"P.S2", {1}}}));
    EXPECT_EQ(Asked(Filled({}), "P", "L"), Points());
}

TEST(Layup2SecPtMap, RequestedName_MayHaveAnyOfFiveForms) {
    const auto found = [](const char* requested) {
        Map map;
        map.AddSection("My P", "I", "L", "My S", ListOf({1}));
        map.SetRequestedSets(ListOf<cow_String>({requested}));
        return Asked(map, "My P", "L").size() == 1;
    };
    EXPECT_TRUE(found("My P.My S"));
    EXPECT_TRUE(found("My S"));
    EXPECT_TRUE(found("\"My P.My S\""));
    EXPECT_TRUE(found("\"My S\""));
    EXPECT_TRUE(found("My P_My S"));
    EXPECT_FALSE(found("\"My P_My S\""));
    EXPECT_FALSE(found("My P"));
    EXPECT_FALSE(found("my s"));
}

TEST(Layup2SecPtMap, ClonedInstance_AnswersForTheOwnersData) {
    Map map = Filled({"S2"});
    map.CloneLayupData("I-2", "I");
    EXPECT_EQ(Asked(map, "I-2", "L"), (Points{{"P.S2", {1}}}));
    map.CloneLayupData("I-3", "nowhere");
    EXPECT_EQ(Asked(map, "I-3", "L"), Points());
}

TEST(Layup2SecPtMap, InstanceAddedTwice_KeepsItsFirstOwner) {
    Map map = Filled({"S2"});
    map.AddSection("Q", "I", "L", "S2", ListOf({7}));
    map.CloneLayupData("I-2", "I");
    EXPECT_EQ(Asked(map, "I-2", "L"), (Points{{"P.S2", {1}}}));
}

TEST(Layup2SecPtMap, SetAddedTwice_HasItsLastPoints) {
    Map map = Filled({"S2"});
    map.AddSection("P", "I", "L", "S2", ListOf({2, 2}));
    EXPECT_EQ(Asked(map, "P", "L"), (Points{{"P.S2", {1, 3}}}));
}

TEST(Layup2SecPtMap, RewiredSet_IsReplacedByAllOfItsNewOnes) {
    Map map = Filled({"S1", "S2", "A", "B"});
    map.RewireSet("P", "S1", "A");
    map.RewireSet("P", "S1", "B");
    EXPECT_EQ(Asked(map, "P", "L"), (Points{{"P.A", {1, 4}}, {"P.B", {1, 4}}, {"P.S2", {1}}}));
}

TEST(Layup2SecPtMap, SetRewiredBeforeItIsAdded_HasNoPointsUnderItsNewName) {
    Map map;
    map.RewireSet("P", "S", "A");
    map.AddSection("P", "I", "L", "S", ListOf({1}));
    map.SetRequestedSets(ListOf<cow_String>({"S", "A"}));
    EXPECT_EQ(Asked(map, "P", "L"), Points());
}

qkw_DiscreteField Field() {
    qkw_DiscreteField field;
    field.name = "F";
    field.location = 1;
    field.labels = ListOf({1, 2});
    return field;
}

TEST(DiscreteField, Default_IsEmpty) {
    const qkw_DiscreteField field;
    EXPECT_TRUE(field.name.IsEmpty());
    EXPECT_TRUE(field.description.IsEmpty());
    EXPECT_TRUE(field.instanceNames.IsEmpty());
    EXPECT_TRUE(field.labels.IsEmpty());
    EXPECT_EQ(field.location, 0);
    EXPECT_EQ(field.dataWidth, 0);
}

TEST(DiscreteField, Equality_LooksAtLocationNameAndLabels) {
    const qkw_DiscreteField field = Field();
    EXPECT_TRUE(field == field);
    EXPECT_TRUE(field == Field());
    EXPECT_FALSE(field != Field());
    qkw_DiscreteField other = Field();
    other.location = 2;
    EXPECT_TRUE(field != other);
    other = Field();
    other.name = "f";
    EXPECT_TRUE(field != other);
    other = Field();
    other.labels.Append(3);
    EXPECT_TRUE(field != other);
}

TEST(DiscreteField, EqualityIsBlindForTheOtherMembersAsWanted) {
    qkw_DiscreteField other = Field();
    other.description = "another";
    other.instanceNames.Append("I");
    other.dataWidth = 6;
    EXPECT_TRUE(Field() == other);
}

} // namespace
