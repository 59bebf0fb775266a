#include "deck_checks/FindingsTest.h"

namespace {

/// A part with five nodes, these elements and sets, and one instance.
Texts Found(const std::string& elements, const std::string& sets = "") {
    return FindingsOf<dck_CheckElements>(R"("parts": {"P": {"mesh": {
        "nodes": {"labels": {"from": 1, "to": 5},
                  "coordinates": [[0, 0, 0], [1, 0, 0], [1, 1, 0], [0, 1, 0], [0, 0, 1]]},
        "elements": [)" + elements + R"(], "sets": [)" +
                                         sets + R"(]}}}, "assembly": {"instances": {"I": {"part": "P"}}})");
}

std::string Elements(const std::string& type, const std::string& row) {
    return R"({"type": ")" + type + R"(", "labels": [7], "connectivity": [[)" + row + "]]}";
}

} // namespace

TEST(ElementChecks, TypeThatItsFamilyDoesNotHave_ListsThoseThatThereAre) {
    EXPECT_EQ(Found(Elements("CPS4Q", "1, 2, 3, 4")),
              Texts{"/parts/P/mesh/elements/0/type: found 'CPS4Q'; there are CPS4, CPS4I, CPS4R, CPS4T, "
                    "CPS4RT, CPS4E"});
}

TEST(ElementChecks, NodeCountOfAnotherType_IsTold) {
    EXPECT_EQ(Found(Elements("C3D8R", "1, 2, 3, 4")),
              Texts{"/parts/P/mesh/elements/0/connectivity: found 4 nodes in each element of type 'C3D8R', "
                    "expected 8"});
    EXPECT_EQ(Found(Elements("B31", "1, 2, 3, 4")),
              Texts{"/parts/P/mesh/elements/0/connectivity: found 4 nodes in each element of type 'B31', "
                    "expected 2 to 3"});
}

TEST(ElementChecks, RightTypes_HaveNothingToSay) {
    EXPECT_EQ(Found(Elements("C3D4", "1, 2, 3, 5")), Texts{});
    EXPECT_EQ(Found(Elements("b31", "1, 2, 3")), Texts{});
    EXPECT_EQ(Found(Elements("SPRINGA", "1, 2")), Texts{});
    EXPECT_EQ(Found(Elements("U7", "1, 2, 3, 4, 5")), Texts{});
}

TEST(ElementChecks, FaceThatTheElementLacks_IsNamedWithTheElement) {
    const std::string quad = Elements("CPS4", "1, 2, 3, 4");
    EXPECT_EQ(Found(quad, R"({"name": "F", "kind": "surface", "facets": [[7, "S4"]]})"), Texts{});
    EXPECT_EQ(Found(quad, R"({"name": "F", "kind": "surface", "facets": [[7, "S1"], [7, "S6"], [7, "S5"]]})"),
              Texts{"/parts/P/mesh/sets/0: found face S6 on element 7 of type 'CPS4' and 1 more, expected S1 "
                    "to S4"});
    EXPECT_EQ(
        Found(Elements("C3D4", "1, 2, 3, 5"), R"({"name": "F", "kind": "surface", "facets": [[7, "S5"]]})"),
        Texts{"/parts/P/mesh/sets/0: found face S5 on element 7 of type 'C3D4', expected S1 to S4"});
}

TEST(ElementChecks, SetNameWithADot_IsWarnedOf) {
    EXPECT_EQ(Found(Elements("C3D4", "1, 2, 3, 5"), R"({"name": "A.B", "kind": "node", "labels": [1]})"),
              Texts{"/parts/P/mesh/sets/0/name: found 'A.B'; a solver reads it as the set of an instance: "
                    "leave out the dot"});
}
