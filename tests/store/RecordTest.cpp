#include "store_interface/propagation/mdl_PropAttr.h"
#include "store_interface/records/mdl_Repository.h"
#include "store_interface/regions/rgnC_Region.h"

#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>

namespace {

enum class ColourEnm : int { RED = 1, GREEN = 5 };
const omu_EnumTable& omu_EnumTableOf(ColourEnm) {
    static constexpr omu_EnumRow rows[] = {{1, "RED", "red"}, {5, "GREEN", "green"}};
    static constexpr omu_EnumTable table{"ColourEnm", rows};
    return table;
}

class Leaf final : public cls_RecordOf<Leaf> {
public:
    static constexpr cls_ClassInfo Class{"test_Leaf", "a small record"};
    int number = 0;
    static const cls_FieldTable& Fields() {
        static const cls_FieldTable fields =
            cls_Describe<Leaf>(cls_Record::Fields()).Field<&Leaf::number>("number", "its number");
        return fields;
    }
};

Leaf LeafOf(int number) {
    Leaf leaf;
    leaf.number = number;
    return leaf;
}

class Figure : public cls_AbstractRecordOf<Figure> {
public:
    static constexpr cls_ClassInfo Class{"test_Figure", "root of figures"};
};
class Disc final : public cls_RecordOf<Disc, Figure> {
public:
    static constexpr cls_ClassInfo Class{"test_Disc", "round"};
};
class Box final : public cls_RecordOf<Box, Figure> {
public:
    static constexpr cls_ClassInfo Class{"test_Box", "square"};
};

class Base : public cls_AbstractRecordOf<Base> {
public:
    static constexpr cls_ClassInfo Class{"test_Base", "root of the test's records"};
    int inherited = 0;
    static const cls_FieldTable& Fields() {
        static const cls_FieldTable fields =
            cls_Describe<Base>(cls_Record::Fields()).Field<&Base::inherited>("inherited", "of the base");
        return fields;
    }
};

class Every final : public cls_RecordOf<Every, Base> {
public:
    static constexpr cls_ClassInfo Class{"test_Every", "a field of every kind"};

    bool flag = false;
    int count = cls_UnsetInt;
    double real = cls_UnsetDouble;
    float single = 0.0F;
    cow_String text;
    ColourEnm colour = ColourEnm::RED;
    gsl_Point point;
    gsl_Vector vector;
    g3d_Vector triple;
    gsl_ModelSegment segment;
    cow_2DArray<double> table;
    cow_List<int> numbers;
    cow_List<Leaf> leaves;
    cow_Map<cow_String, float> factors;
    mdl_MapString2ObjCow<Leaf> named;
    Leaf leaf;
    mdl_ObjCow<Leaf> maybe;
    mdl_ObjCow<Figure> figure;
    rgnC_Region region;
    dtmC_DatumRef datum;
    mdl_PropAttr<double> attribute;
    cow_List<mdl_PropAttr<int>> attributes;

    static const cls_FieldTable& Fields() {
        static constexpr cls_IntMeaning meanings[] = {{0, "none"}, {1, "some"}};
        static const cls_FieldTable fields = cls_Describe<Every>(Base::Fields())
                                                 .Field<&Every::flag>("flag", "d")
                                                 .Field<&Every::count>("count", "d")
                                                 .Meanings(meanings)
                                                 .Field<&Every::real>("real", "d")
                                                 .Field<&Every::single>("single", "d")
                                                 .Field<&Every::text>("text", "d")
                                                 .RefersTo("amplitude")
                                                 .Required()
                                                 .Field<&Every::colour>("colour", "d")
                                                 .Field<&Every::point>("point", "d")
                                                 .Field<&Every::vector>("vector", "d")
                                                 .Field<&Every::triple>("triple", "d")
                                                 .Field<&Every::segment>("segment", "d")
                                                 .Field<&Every::table>("table", "d")
                                                 .Field<&Every::numbers>("numbers", "d")
                                                 .Length(3)
                                                 .Field<&Every::leaves>("leaves", "d")
                                                 .Field<&Every::factors>("factors", "d")
                                                 .Field<&Every::named>("named", "d")
                                                 .Field<&Every::leaf>("leaf", "d")
                                                 .Field<&Every::maybe>("maybe", "d")
                                                 .Field<&Every::figure>("figure", "d")
                                                 .Field<&Every::region>("region", "d")
                                                 .NotModelData()
                                                 .Field<&Every::datum>("datum", "d")
                                                 .Field<&Every::attribute>("attribute", "d")
                                                 .InBaseState(cls_BaseStateRule::ZeroValue)
                                                 .Field<&Every::attributes>("attributes", "d");
        return fields;
    }
};

struct Change {
    const char* field;
    std::function<void(Every&)> make;
};

cow_2DArray<double> TableOf(double cell) {
    cow_2DArray<double> table(1, 2);
    table.Put(0, 1, cell);
    return table;
}

/// Each changes one field of a default record.
const std::vector<Change>& Changes() {
    static const std::vector<Change> changes = {
        {"inherited", [](Every& e) { e.inherited = 1; }},
        {"flag", [](Every& e) { e.flag = true; }},
        {"count", [](Every& e) { e.count = 3; }},
        {"real", [](Every& e) { e.real = 0.1; }},
        {"single", [](Every& e) { e.single = 0.1F; }},
        {"text", [](Every& e) { e.text = "A"; }},
        {"colour", [](Every& e) { e.colour = ColourEnm::GREEN; }},
        {"point", [](Every& e) { e.point = gsl_Point(0, 0, 1); }},
        {"vector", [](Every& e) { e.vector = gsl_Vector(0, 1, 0); }},
        {"triple",
         [](Every& e) {
             e.triple = {1, 0, 0};
         }},
        {"segment", [](Every& e) { e.segment = gsl_ModelSegment(gsl_Point(), gsl_Point(1, 0, 0)); }},
        {"table", [](Every& e) { e.table = TableOf(2.0); }},
        {"numbers", [](Every& e) { e.numbers.Append(4); }},
        {"leaves", [](Every& e) { e.leaves.Append(LeafOf(4)); }},
        {"factors", [](Every& e) { e.factors.Insert("A", 0.5F); }},
        {"named", [](Every& e) { e.named.Insert("A", LeafOf(1)); }},
        {"leaf", [](Every& e) { e.leaf.number = 7; }},
        {"maybe", [](Every& e) { e.maybe = LeafOf(0); }},
        {"figure", [](Every& e) { e.figure = mdl_ObjCow<Figure>(Disc()); }},
        {"region", [](Every& e) { e.region = rgnC_Region(ddr_Shortcut("p", "n"), "", rgnC_Set()); }},
        {"datum", [](Every& e) { e.datum = dtmC_DatumRef(1); }},
        {"attribute", [](Every& e) { e.attribute.Set(0.0); }},
        {"attributes", [](Every& e) { e.attributes.Append(mdl_PropAttr<int>(2)); }},
    };
    return changes;
}

template <class Type>
const Type& TypeOf(const char* field) {
    return static_cast<const Type&>(*Every::Fields().Find(field)->type);
}

TEST(Record, EveryField_IsInTheListOfChanges) {
    const auto& fields = Every::Fields().All();
    ASSERT_EQ(fields.size(), Changes().size());
    for (std::size_t i = 0; i < fields.size(); ++i) EXPECT_STREQ(fields[i].name, Changes()[i].field);
}

TEST(Record, ChangeOfAnyField_MakesItUnequalToItsCopy) {
    for (const Change& change : Changes()) {
        SCOPED_TRACE(change.field);
        Every original;
        const std::unique_ptr<cls_Record> copy(original.Copy());
        EXPECT_TRUE(cls_RecordsEqual(original, *copy));
        change.make(original);
        EXPECT_FALSE(cls_RecordsEqual(original, *copy));
        const std::unique_ptr<cls_Record> changed(original.Copy());
        EXPECT_TRUE(cls_RecordsEqual(original, *changed));
        EXPECT_TRUE(cls_RecordsEqual(Every(), *copy));
    }
}

TEST(Record, AssignOfTheChangedField_MakesThemEqualAgain) {
    for (const Change& change : Changes()) {
        SCOPED_TRACE(change.field);
        Every from;
        change.make(from);
        Every to;
        const cls_Field& field = *Every::Fields().Find(change.field);
        EXPECT_FALSE(field.type->Equal(field.In(from), field.In(to)));
        field.type->Assign(field.In(to), field.In(from));
        EXPECT_TRUE(field.type->Equal(field.In(from), field.In(to)));
        EXPECT_TRUE(cls_RecordsEqual(from, to));
    }
}

TEST(Record, CopyThatIsChanged_LeavesTheOriginalAlone) {
    Every original;
    for (const Change& change : Changes()) change.make(original);
    const Every reference(original);
    Every copy(original);
    copy.leaves.Get(0).number = 99;
    copy.named.Get("A").number = 99;
    copy.maybe.Get().number = 99;
    copy.factors.Get("A") = 9.0F;
    copy.table.Put(0, 0, 9.0);
    copy.attributes.Get(0).Set(9);
    EXPECT_TRUE(cls_RecordsEqual(original, reference));
    EXPECT_EQ(original.leaves[0].number, 4);
    EXPECT_EQ(original.named.ConstGet("A").number, 1);
    EXPECT_EQ(original.maybe.ConstGet().number, 0);
}

TEST(Record, RecordsOfTwoClasses_AreNeverEqual) {
    EXPECT_FALSE(cls_RecordsEqual(Disc(), Box()));
    EXPECT_TRUE(cls_RecordsEqual(Disc(), Disc()));
    Every a;
    Every b;
    a.figure = mdl_ObjCow<Figure>(Disc());
    b.figure = mdl_ObjCow<Figure>(Box());
    EXPECT_FALSE(cls_RecordsEqual(a, b));
    EXPECT_EQ(a.figure.ConstGet().DynTypeId(), Disc::TypeId());
}

TEST(Record, CopyOfAVariant_KeepsTheClass) {
    Every a;
    a.figure = mdl_ObjCow<Figure>(Box());
    const std::unique_ptr<cls_Record> copy(a.Copy());
    EXPECT_EQ(copy->DynTypeId(), Every::TypeId());
    EXPECT_EQ(static_cast<const Every&>(*copy).figure.ConstGet().DynTypeId(), Box::TypeId());
}

TEST(Record, DBWrite_ShowsInheritedFieldsFirstThenItsOwnInOrder) {
    class Visitor : public cls_WriteVisitor {
    public:
        explicit Visitor(const cls_Record& record) : record_(record) {}
        void Visit(const cls_Field& field, const cls_FieldType& type, const void* value) override {
            names.emplace_back(field.name);
            EXPECT_EQ(&type, field.type);
            EXPECT_EQ(value, field.In(record_));
        }
        Strings names;

    private:
        const cls_Record& record_;
    };
    const Every record;
    Visitor visitor(record);
    record.DBWrite(visitor);
    EXPECT_EQ(visitor.names, (Strings{"inherited", "flag",   "count",   "real",      "single",    "text",
                                      "colour",    "point",  "vector",  "triple",    "segment",   "table",
                                      "numbers",   "leaves", "factors", "named",     "leaf",      "maybe",
                                      "figure",    "region", "datum",   "attribute", "attributes"}));
    const Leaf leaf;
    Visitor second(leaf);
    leaf.DBWrite(second);
    EXPECT_EQ(second.names, Strings{"number"});
}

TEST(Record, KindsOfFields_FollowTheMembersTypes) {
    using K = cls_FieldKind;
    const std::pair<const char*, K> kinds[] = {
        {"flag", K::Bool},           {"count", K::Int},       {"real", K::Double},   {"single", K::Float},
        {"text", K::String},         {"colour", K::Enum},     {"point", K::Triple},  {"vector", K::Triple},
        {"triple", K::Triple},       {"segment", K::Segment}, {"table", K::Table},   {"numbers", K::List},
        {"leaves", K::List},         {"factors", K::Map},     {"named", K::Map},     {"leaf", K::Record},
        {"maybe", K::Optional},      {"figure", K::Variant},  {"region", K::Region}, {"datum", K::Datum},
        {"attribute", K::Attribute}, {"attributes", K::List},
    };
    for (const auto& [name, kind] : kinds) EXPECT_EQ(Every::Fields().Find(name)->type->Kind(), kind) << name;
    EXPECT_EQ(TypeOf<cls_ListType>("numbers").ItemType().Kind(), K::Int);
    EXPECT_EQ(TypeOf<cls_ListType>("leaves").ItemType().Kind(), K::Record);
    EXPECT_EQ(TypeOf<cls_ListType>("attributes").ItemType().Kind(), K::Attribute);
    EXPECT_EQ(TypeOf<cls_MapType>("factors").ItemType().Kind(), K::Float);
    EXPECT_EQ(TypeOf<cls_MapType>("named").ItemType().Kind(), K::Optional);
    EXPECT_EQ(TypeOf<cls_AttributeType>("attribute").ValueType().Kind(), K::Double);
    EXPECT_EQ(Every::Fields().Find("nothing of this name"), nullptr);
}

TEST(Record, OptionsOfFields_BelongToTheFieldDeclaredLast) {
    const cls_FieldTable& fields = Every::Fields();
    for (const cls_Field& field : fields.All()) {
        SCOPED_TRACE(field.name);
        const std::string name = field.name;
        EXPECT_STREQ(field.refersTo == nullptr ? "" : field.refersTo, name == "text" ? "amplitude" : "");
        EXPECT_EQ(field.required, name == "text");
        EXPECT_EQ(field.meanings.size(), name == "count" ? 2U : 0U);
        EXPECT_EQ(field.length, name == "numbers" ? 3 : 0);
        EXPECT_EQ(field.notModelData, name == "region");
        EXPECT_EQ(field.baseState,
                  name == "attribute" ? cls_BaseStateRule::ZeroValue : cls_BaseStateRule::Carried);
    }
}

TEST(Record, UnsetMarkers_AreTheLargestNumbers) {
    EXPECT_EQ(cls_UnsetDouble, 1.7976931348623157e+308);
    EXPECT_EQ(cls_UnsetInt, 2147483647);
    Every record;
    const auto unset = [&](const char* name) {
        const cls_Field& field = *Every::Fields().Find(name);
        return cls_IsUnset(*field.type, field.In(std::as_const(record)));
    };
    EXPECT_TRUE(unset("count"));
    EXPECT_TRUE(unset("real"));
    EXPECT_FALSE(unset("single"));
    EXPECT_FALSE(unset("text"));
    record.count = 0;
    record.real = 1e308;
    EXPECT_FALSE(unset("count"));
    EXPECT_FALSE(unset("real"));
}

TEST(FieldType, Enum_ReadsAndWritesNumbers) {
    const auto& type = TypeOf<cls_EnumType>("colour");
    EXPECT_STREQ(type.Table().typeName, "ColourEnm");
    ColourEnm colour = ColourEnm::RED;
    EXPECT_EQ(type.Get(&colour), 1);
    type.Set(&colour, 5);
    EXPECT_EQ(colour, ColourEnm::GREEN);
}

TEST(FieldType, Triples_ReadAndWriteThreeNumbers) {
    double xyz[3] = {};
    Every record;
    for (const char* name : {"point", "vector", "triple"}) {
        SCOPED_TRACE(name);
        void* value = Every::Fields().Find(name)->In(record);
        TypeOf<cls_TripleType>(name).Set(value, {1.0, 2.0, 3.0});
        TypeOf<cls_TripleType>(name).Get(value, xyz);
        EXPECT_EQ(xyz[0], 1.0);
        EXPECT_EQ(xyz[1], 2.0);
        EXPECT_EQ(xyz[2], 3.0);
    }
    EXPECT_EQ(record.point, gsl_Point(1, 2, 3));
    EXPECT_EQ(record.triple, (g3d_Vector{1, 2, 3}));
}

TEST(FieldType, Table_ReadsAndWritesCells) {
    Every record;
    TypeOf<cls_TableType>("table").Set(&record.table, TableOf(6.0));
    EXPECT_EQ(TypeOf<cls_TableType>("table").Get(&record.table).ConstGet(0, 1), 6.0);
}

TEST(FieldType, List_GrowsClearsAndGivesItsItems) {
    const auto& type = TypeOf<cls_ListType>("leaves");
    Every record;
    static_cast<Leaf*>(type.Append(&record.leaves))->number = 1;
    static_cast<Leaf*>(type.Append(&record.leaves))->number = 2;
    EXPECT_EQ(type.Length(&record.leaves), 2);
    EXPECT_EQ(static_cast<const Leaf*>(type.Item(&record.leaves, 1))->number, 2);
    static_cast<Leaf*>(type.WritableItem(&record.leaves, 0))->number = 9;
    EXPECT_EQ(record.leaves[0].number, 9);
    EXPECT_EQ(Raised([&] { type.Item(&record.leaves, 2); }),
              "cow_List: index 2 is out of range, expected 0 to 1");
    type.Clear(&record.leaves);
    EXPECT_EQ(type.Length(&record.leaves), 0);
}

TEST(FieldType, MapOfNumbers_GivesKeysInByteOrder) {
    const auto& type = TypeOf<cls_MapType>("factors");
    Every record;
    for (const char* key : {"b", "a", "B", "\xc3\xa4", ""}) type.Insert(&record.factors, key);
    *static_cast<float*>(type.Insert(&record.factors, "b")) = 2.0F;
    EXPECT_EQ(Texts(type.Keys(&record.factors)), (Strings{"", "B", "a", "b", "\xc3\xa4"}));
    EXPECT_EQ(*static_cast<const float*>(type.Item(&record.factors, "b")), 2.0F);
    EXPECT_EQ(*static_cast<const float*>(type.Item(&record.factors, "a")), 0.0F);
    EXPECT_EQ(Raised([&] { type.Item(&record.factors, "c"); }), "cow_Map: no entry named 'c'");
    type.Clear(&record.factors);
    EXPECT_EQ(record.factors.Count(), 0);
}

TEST(FieldType, MapsOfNumbers_AreEqualWhateverTheOrderOfInsertion) {
    Every a;
    Every b;
    for (const char* key : {"x", "y", "z"}) a.factors.Insert(key, 1.0F);
    for (const char* key : {"z", "y", "x"}) b.factors.Insert(key, 1.0F);
    EXPECT_TRUE(cls_RecordsEqual(a, b));
    b.factors.Insert("y", 2.0F);
    EXPECT_FALSE(cls_RecordsEqual(a, b));
}

TEST(FieldType, MapOfRecords_HoldsRecordsUnderNames) {
    const auto& type = TypeOf<cls_MapType>("named");
    const auto& item = static_cast<const cls_HolderType&>(type.ItemType());
    EXPECT_EQ(item.ClassId(), Leaf::TypeId());
    Every record;
    void* holder = type.Insert(&record.named, "B");
    EXPECT_EQ(item.Get(holder), nullptr);
    EXPECT_EQ(item.Writable(holder), nullptr);
    const Leaf leaf = LeafOf(3);
    item.Set(holder, &leaf);
    item.Set(type.Insert(&record.named, "A"), &leaf);
    static_cast<Leaf*>(item.Writable(holder))->number = 8;
    EXPECT_EQ(Texts(type.Keys(&record.named)), (Strings{"A", "B"}));
    EXPECT_EQ(record.named.ConstGet("A").number, 3);
    EXPECT_EQ(record.named.ConstGet("B").number, 8);
    EXPECT_EQ(leaf.number, 3);
    EXPECT_EQ(static_cast<const Leaf*>(item.Get(type.Item(&record.named, "B")))->number, 8);
    EXPECT_EQ(Raised([&] { type.Item(&record.named, "C"); }), "test_Leaf: no entry named 'C'");
    type.Clear(&record.named);
    EXPECT_TRUE(record.named.IsEmpty());
}

TEST(FieldType, Holders_TakeCopiesAndGiveThemBack) {
    Every record;
    const Leaf leaf = LeafOf(3);
    for (const char* name : {"leaf", "maybe"}) {
        SCOPED_TRACE(name);
        const auto& type = TypeOf<cls_HolderType>(name);
        void* value = Every::Fields().Find(name)->In(record);
        EXPECT_EQ(type.ClassId(), Leaf::TypeId());
        type.Set(value, &leaf);
        EXPECT_NE(type.Get(value), &leaf);
        EXPECT_EQ(static_cast<const Leaf*>(type.Get(value))->number, 3);
        static_cast<Leaf*>(type.Writable(value))->number = 4;
        EXPECT_EQ(leaf.number, 3);
        type.Set(value, nullptr);
    }
    EXPECT_EQ(record.leaf.number, 0);
    EXPECT_TRUE(record.maybe.IsNull());
    EXPECT_EQ(TypeOf<cls_HolderType>("maybe").Writable(&record.maybe), nullptr);

    const auto& variant = TypeOf<cls_HolderType>("figure");
    EXPECT_EQ(variant.ClassId(), Figure::TypeId());
    EXPECT_NE(Base::TypeId(), Every::TypeId());
    const Box box;
    variant.Set(&record.figure, &box);
    EXPECT_EQ(variant.Get(&record.figure)->DynTypeId(), Box::TypeId());
}

TEST(FieldType, Attribute_HasValueAndState) {
    const auto& type = TypeOf<cls_AttributeType>("attribute");
    Every record;
    type.SetState(&record.attribute, 2);
    *static_cast<double*>(type.WritableValue(&record.attribute)) = 2.5;
    EXPECT_EQ(record.attribute, mdl_PropAttributeStateEnm::CARRIED);
    EXPECT_EQ(*static_cast<const double*>(type.Value(&record.attribute)), 2.5);
}

TEST(FieldType, OneCppType_HasOneTypeObject) {
    EXPECT_EQ(&cls_TypeOf<double>::Instance(), Every::Fields().Find("real")->type);
    EXPECT_EQ(&cls_TypeOf<cow_List<Leaf>>::Instance(), Every::Fields().Find("leaves")->type);
}

} // namespace
