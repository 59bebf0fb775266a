#include "store_interface/records/output/korC_OdbRequest.h"
#include "support/DeckTest.h"

namespace {

using Type = korC_OdbRequest::TypeEnm;
using Domain = korC_DomainTypeEnm;
using Variables = korC_VariablesTypeEnm;

korC_OdbRequest Every(int frequency, const char* name = "") {
    korC_OdbRequest request;
    request.frequency = frequency;
    request.name = name;
    return request;
}
korC_OdbRequest Of(Type type) {
    korC_OdbRequest request;
    request.frequencyType = type;
    return request;
}
korC_OdbRequest Modes(std::initializer_list<int> modes) {
    korC_OdbRequest request = Of(Type::MODE_LIST);
    for (const int mode : modes) request.modeList.Append(mode);
    return request;
}
void ExpectBefore(const korC_OdbRequest& a, const korC_OdbRequest& b) {
    EXPECT_TRUE(a < b);
    EXPECT_FALSE(b < a);
}

} // namespace

TEST(OdbRequest, DomainIsThatOfTheFirstFieldThatHoldsSomething) {
    TestStore store;
    odiK_Part& part = store.AddPart("P", {1, 2, 3, 4});
    part.mesh->AddElements("S4R", {1}, 4, {1, 2, 3, 4});
    part.mesh->AddNodeSet("N", {1});
    part.mesh->AddSurface("S", {{1, -1, "SPOS"}});
    store.model.AddInstance("I", "P");
    korC_OdbRequest request;
    EXPECT_EQ(request.DomainType(), Domain::WHOLE_MODEL);
    request.region = store.model.Region("I", "N");
    EXPECT_EQ(request.DomainType(), Domain::SET);
    request.region = store.model.Region("I", "S");
    EXPECT_EQ(request.DomainType(), Domain::CONTACT_SURFACE);
    request.boltLoad = "bolt";
    EXPECT_EQ(request.DomainType(), Domain::BOLT_LOAD);
    request.interactions.Append("pair");
    EXPECT_EQ(request.DomainType(), Domain::INTERACTION);
    request.springs.Append("spring");
    EXPECT_EQ(request.DomainType(), Domain::SPRINGS);
    request.section = "cut";
    EXPECT_EQ(request.DomainType(), Domain::INTEGRATED_SECTION);
}

TEST(OdbRequest, EqualityLooksAtEverythingButTheName) {
    const korC_OdbRequest plain = Every(1, "a");
    EXPECT_TRUE(plain == Every(1, "b"));
    EXPECT_FALSE(plain == Every(2, "a"));
    // Values that the kind of frequency doesn't use count too.
    korC_OdbRequest other = Every(1);
    other.numberInterval = 3;
    EXPECT_FALSE(plain == other);
    other = Every(1);
    other.directions = false;
    EXPECT_FALSE(plain == other);
    other = Every(1);
    other.variables.Append("U");
    EXPECT_FALSE(plain == other);
    other = Every(1);
    other.filter = "F";
    EXPECT_FALSE(plain == other);
    other = Every(1);
    other.rebar = korC_RebarEnm::ONLY;
    EXPECT_FALSE(plain == other);
    other = Every(1);
    other.sectionPoints.Append(1);
    EXPECT_FALSE(plain == other);
}

TEST(OdbRequest, EqualFrequencyLooksOnlyAtWhatTheKindUses) {
    korC_OdbRequest other = Every(1);
    other.timeMarks = true;
    other.numberInterval = 3;
    other.filter = "F";
    EXPECT_TRUE(Every(1).EqualFrequency(other));
    EXPECT_FALSE(Every(1).EqualFrequency(Every(2)));
    EXPECT_FALSE(Every(0).EqualFrequency(Of(Type::NUMBER_INTERVAL)));
    for (const Type type : {Type::NUMBER_INTERVAL, Type::TIME_INTERVAL, Type::TIME_POINTS}) {
        korC_OdbRequest marked = Of(type);
        marked.timeMarks = true;
        EXPECT_TRUE(marked.EqualFrequency(marked));
        EXPECT_FALSE(Of(type).EqualFrequency(marked));
    }
    korC_OdbRequest marked = Modes({1, 2});
    marked.timeMarks = true;
    EXPECT_TRUE(Modes({1, 2}).EqualFrequency(marked));
    EXPECT_FALSE(Modes({1, 2}).EqualFrequency(Modes({2, 1})));
    korC_OdbRequest points = Of(Type::TIME_POINTS);
    points.timePoints = "P";
    EXPECT_FALSE(points.EqualFrequency(Of(Type::TIME_POINTS)));
    korC_OdbRequest interval = Of(Type::TIME_INTERVAL);
    interval.timeInterval = 0.5;
    EXPECT_FALSE(interval.EqualFrequency(Of(Type::TIME_INTERVAL)));
}

TEST(OdbRequest, SymbolsOfTheWholeModelStandFirstThenOtherSymbolsThenLists) {
    korC_OdbRequest whole = Every(9, "z");
    whole.variablesType = Variables::ALL;
    korC_OdbRequest bolt = Every(5, "y");
    bolt.variablesType = Variables::PRESELECT;
    bolt.boltLoad = "bolt";
    ExpectBefore(whole, bolt);
    ExpectBefore(bolt, Every(1, "a"));
}

TEST(OdbRequest, OfOneRankTheFrequencyDecidesThenFilterThenName) {
    ExpectBefore(Every(2), Every(10));
    ExpectBefore(Every(99), Of(Type::NUMBER_INTERVAL));
    ExpectBefore(Of(Type::MODE_LIST), Of(Type::TIME_POINTS));
    ExpectBefore(Modes({1}), Modes({1, 2}));
    ExpectBefore(Modes({1, 2}), Modes({2}));
    ExpectBefore(Modes({2}), Modes({10}));
    korC_OdbRequest interval = Of(Type::TIME_INTERVAL);
    korC_OdbRequest longer = interval;
    longer.timeInterval = 0.5;
    interval.timeMarks = true;
    ExpectBefore(interval, longer); // the value ahead of the marks
    korC_OdbRequest marked = longer;
    marked.timeMarks = true;
    ExpectBefore(longer, marked);
    korC_OdbRequest points = Of(Type::TIME_POINTS);
    points.timePoints = "B";
    korC_OdbRequest others = points;
    others.timePoints = "a";
    ExpectBefore(points, others); // by bytes
    korC_OdbRequest filtered = Every(1, "a");
    filtered.filter = "F";
    ExpectBefore(Every(1, "b"), filtered);
    ExpectBefore(Every(1, "a"), Every(1, "b"));
    EXPECT_FALSE(Every(1, "a") < Every(1, "a"));
}

TEST(OdbChannel, IsOneOfTwo) {
    EXPECT_EQ(korC_OdbChannel(true).Type(), korC_OdbChannel::TypeEnm::FIELD);
    EXPECT_EQ(korC_OdbChannel(false).Type(), korC_OdbChannel::TypeEnm::HISTORY);
    EXPECT_TRUE(korC_OdbChannel(true).IsField());
    EXPECT_FALSE(korC_OdbChannel(false).IsField());
}
