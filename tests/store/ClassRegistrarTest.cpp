#include "store_interface/records/cls_ClassRegistrar.h"

#include "store_interface/model/ddb_Assembly.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/output/korC_Output.h"

#include "store/StoreTesting.h"

#include <gtest/gtest.h>

#include <memory>
#include <set>

namespace {

class Animal : public cls_AbstractRecordOf<Animal> {
public:
    static constexpr cls_ClassInfo Class{"test_Animal", "root", 0x7770001};
};
class Bird : public cls_RecordOf<Bird, Animal> {
public:
    static constexpr cls_ClassInfo Class{"test_Bird", "flies", 0x7770002};
};
class Duck final : public cls_RecordOf<Duck, Bird> {
public:
    static constexpr cls_ClassInfo Class{"test_Duck", "swims", 0x7770003};
};
class Fish final : public cls_RecordOf<Fish, Animal> {
public:
    static constexpr cls_ClassInfo Class{"test_Fish", "swims"};
};
class SameNumber final : public cls_RecordOf<SameNumber> {
public:
    static constexpr cls_ClassInfo Class{"test_SameNumber", "a second one", 0x7770003};
};
class SameName final : public cls_RecordOf<SameName> {
public:
    static constexpr cls_ClassInfo Class{"test_Duck", "a second one", 0x7770009};
};

TEST(ClassInfo, NumberOfANamelessClass_IsTheHashOfItsNameWithTheHighestBit) {
    EXPECT_EQ((cls_ClassInfo{"foobar", ""}.Id()), 0xBF9CF968U);
    EXPECT_EQ((cls_ClassInfo{"ab", ""}.Id()), 0x4D2505CAU | 0x80000000U);
    EXPECT_EQ((cls_ClassInfo{"ab", "", 17}.Id()), 17U);
}

TEST(ClassRegistrar, Entries_AreFoundByNumberAndName) {
    cls_ClassRegistrar registrar;
    registrar.Add<Animal>();
    registrar.Add<Bird>();
    const cls_ClassEntry* bird = registrar.Find(0x7770002);
    ASSERT_NE(bird, nullptr);
    EXPECT_STREQ(bird->info.name, "test_Bird");
    EXPECT_STREQ(bird->info.doc, "flies");
    EXPECT_EQ(bird->baseId, 0x7770001U);
    EXPECT_FALSE(bird->abstract);
    const std::unique_ptr<cls_Record> made(bird->create());
    EXPECT_EQ(made->DynTypeId(), Bird::TypeId());
    EXPECT_EQ(&bird->fields(), &Bird::Fields());
    EXPECT_EQ(registrar.FindByName("test_Bird"), bird);
    const cls_ClassEntry* animal = registrar.FindByName("test_Animal");
    ASSERT_NE(animal, nullptr);
    EXPECT_TRUE(animal->abstract);
    EXPECT_EQ(animal->create, nullptr);
    EXPECT_EQ(registrar.Find(1), nullptr);
    EXPECT_EQ(registrar.FindByName("test_bird"), nullptr);
}

TEST(ClassRegistrar, SecondClassOfANumberOrName_Raises) {
    cls_ClassRegistrar registrar;
    registrar.Add<Duck>();
    EXPECT_EQ(Raised([&] { registrar.Add<Duck>(); }), "class registered twice: test_Duck");
    EXPECT_EQ(Raised([&] { registrar.Add<SameNumber>(); }), "class registered twice: test_SameNumber");
    EXPECT_EQ(Raised([&] { registrar.Add<SameName>(); }), "class registered twice: test_Duck");
    EXPECT_EQ(Raised([&] { registrar.AddView(cls_ClassInfo{"v", "", 5}, 5); }), "class registered twice: v");
}

TEST(ClassRegistrar, InheritanceCheck_WalksToTheRoot) {
    cls_ClassRegistrar registrar;
    registrar.Add<Animal>();
    registrar.Add<Bird>();
    registrar.Add<Duck>();
    registrar.Add<Fish>();
    EXPECT_TRUE(registrar.InheritanceCheck(Duck::TypeId(), Duck::TypeId()));
    EXPECT_TRUE(registrar.InheritanceCheck(Duck::TypeId(), Bird::TypeId()));
    EXPECT_TRUE(registrar.InheritanceCheck(Duck::TypeId(), Animal::TypeId()));
    EXPECT_TRUE(registrar.InheritanceCheck(Duck::TypeId(), cls_Record::TypeId()));
    EXPECT_FALSE(registrar.InheritanceCheck(Bird::TypeId(), Duck::TypeId()));
    EXPECT_FALSE(registrar.InheritanceCheck(Fish::TypeId(), Bird::TypeId()));
    EXPECT_FALSE(registrar.InheritanceCheck(4711, Animal::TypeId()));
    EXPECT_FALSE(registrar.InheritanceCheck(Duck::TypeId(), 4711));
}

TEST(ClassRegistrar, ConcreteClasses_AreThoseThatRecordsCanBeMadeOf) {
    cls_ClassRegistrar registrar;
    registrar.Add<Fish>();
    registrar.Add<Animal>();
    registrar.Add<Duck>();
    registrar.Add<Bird>();
    const auto names = [&](unsigned base) {
        Strings found;
        for (const cls_ClassEntry* entry : registrar.ConcreteClasses(base))
            found.emplace_back(entry->info.name);
        return found;
    };
    EXPECT_EQ(names(Animal::TypeId()), (Strings{"test_Fish", "test_Duck", "test_Bird"}));
    EXPECT_EQ(names(Bird::TypeId()), (Strings{"test_Duck", "test_Bird"}));
    EXPECT_EQ(names(Duck::TypeId()), (Strings{"test_Duck"}));
    EXPECT_EQ(names(4711), Strings());
}

TEST(ClassRegistrar, NameOfAnUnknownClass_IsItsNumber) {
    cls_ClassRegistrar registrar;
    registrar.Add<Duck>();
    EXPECT_EQ(registrar.NameOf(Duck::TypeId()), "test_Duck");
    EXPECT_EQ(registrar.NameOf(0x2A00ABC), "class 0x2A00ABC");
}

TEST(StoreClasses, FixedNumbers_AreThoseThatCodeComparesWith) {
    const std::pair<unsigned, const char*> numbers[] = {
        {0x23C002D, "kprC_Step"},
        {0x23C0064, "kprC_InitialStep"},
        {0x23C002E, "kprC_AnalysisStep"},
    };
    for (const auto& [number, name] : numbers) {
        const cls_ClassEntry* entry = cls_Classes().Find(number);
        ASSERT_NE(entry, nullptr) << name;
        EXPECT_STREQ(entry->info.name, name);
    }
}

TEST(StoreClasses, Families_DeriveFromTheirRoots) {
    const auto derives = [](const char* derived, const char* base) {
        const cls_ClassEntry* a = cls_Classes().FindByName(derived);
        const cls_ClassEntry* b = cls_Classes().FindByName(base);
        return a != nullptr && b != nullptr && cls_Classes().InheritanceCheck(a->info.Id(), b->info.Id());
    };
    EXPECT_TRUE(derives("kprC_InitialStep", "kprC_Step"));
    EXPECT_FALSE(derives("kprC_InitialStep", "kprC_AnalysisStep"));
    EXPECT_TRUE(derives("ptoC_SectionAssignment", "ptoC_PartAttribute"));
    EXPECT_TRUE(derives("kseC_ConnectorSection", "kseC_Section"));
    EXPECT_TRUE(derives("ddb_PartInstance", "ddb_BaseInstance"));
    for (const char* name : {"kbcC_BC", "kloC_Load", "kpfC_Field", "kinC_Interaction", "korC_FieldOutput",
                             "korC_HistoryOutput", "kprC_AdptMeshCons"}) {
        EXPECT_TRUE(derives(name, "kprC_PropagatingObject")) << name;
    }
    EXPECT_TRUE(derives("korC_FieldOutput", "korC_Output"));
    EXPECT_FALSE(derives("kloC_Load", "kbcC_BC"));
}

TEST(StoreClasses, EveryRecordClass_IsDescribedAndEqualsItsCopy) {
    const auto classes = cls_Classes().ConcreteClasses(cls_Record::TypeId());
    ASSERT_GE(classes.size(), 15U);
    std::set<unsigned> numbers;
    std::set<std::string> names;
    for (const cls_ClassEntry* entry : classes) {
        SCOPED_TRACE(entry->info.name);
        EXPECT_TRUE(numbers.insert(entry->info.Id()).second);
        EXPECT_TRUE(names.insert(entry->info.name).second);
        EXPECT_STRNE(entry->info.doc, "");
        const std::unique_ptr<cls_Record> record(entry->create());
        // A tie answers with the number of the store's class.
        const bool isTie = entry->info.Id() == kcoC_Tie::TypeId();
        EXPECT_EQ(record->DynTypeId(), isTie ? odiK_Tie::TypeId() : entry->info.Id());
        EXPECT_EQ(&record->DynFields(), &entry->fields());
        EXPECT_EQ(Raised([&] { record->AssertValid(); }), "nothing raised");
        const std::unique_ptr<cls_Record> copy(record->Copy());
        EXPECT_EQ(copy->DynTypeId(), record->DynTypeId());
        EXPECT_TRUE(cls_RecordsEqual(*record, *copy));

        std::set<std::string> fields;
        for (const cls_Field& field : record->DynFields().All()) {
            EXPECT_TRUE(fields.insert(field.name).second) << field.name;
            EXPECT_STRNE(field.doc, "") << field.name;
            const auto* place = static_cast<const char*>(field.In(*record));
            EXPECT_TRUE(field.type->Equal(place, field.In(*copy))) << field.name;
        }
        const cls_ClassEntry* base = cls_Classes().Find(entry->baseId);
        if (base == nullptr) continue;
        const auto& inherited = base->fields().All();
        ASSERT_LE(inherited.size(), record->DynFields().All().size());
        for (std::size_t i = 0; i < inherited.size(); ++i) {
            EXPECT_STREQ(record->DynFields().All()[i].name, inherited[i].name);
        }
    }
}

TEST(StoreClasses, EnumerationsOfFields_HaveUniqueNumbersAndNames) {
    for (const cls_ClassEntry* entry : cls_Classes().ConcreteClasses(cls_Record::TypeId())) {
        for (const cls_Field& field : entry->fields().All()) {
            if (field.type->Kind() != cls_FieldKind::Enum) continue;
            SCOPED_TRACE(std::string(entry->info.name) + "." + field.name);
            const auto& type = static_cast<const cls_EnumType&>(*field.type);
            std::set<int> numbers;
            std::set<std::string> names;
            for (const omu_EnumRow& row : type.Table().rows) {
                EXPECT_TRUE(numbers.insert(row.value).second) << row.name;
                EXPECT_TRUE(names.insert(row.name).second) << row.name;
            }
            const std::unique_ptr<cls_Record> record(entry->create());
            EXPECT_NE(type.Table().Row(type.Get(field.In(*record))), nullptr);
        }
    }
}

TEST(DynamicCast, ToTheClassOrItsBase_GivesTheObject) {
    const kprC_InitialStep step;
    const kprC_Step& base = step;
    EXPECT_EQ(&nex_canDynamicCastRef<kprC_InitialStep>(base, NEX_HERE), &step);
    EXPECT_EQ(&nex_canDynamicCastRef<kprC_Step>(step, NEX_HERE), &base);
    EXPECT_EQ(nex_canDynamicCastPtr<kprC_InitialStep>(&base), &step);
}

TEST(DynamicCast, ToAnotherClass_RaisesWithBothNamesAndThePosition) {
    const kprC_TimePoint record;
    const cls_Record& base = record;
    EXPECT_EQ(
        Raised([&] {
            nex_canDynamicCastRef<kadC_AdptMeshCtrl>(base, nex_Position{"/home/x/src/oif_Some.cpp", 42});
        }),
        "class check failed: found kprC_TimePoint, expected kadC_AdptMeshCtrl (oif_Some.cpp:42)");
    const int line = __LINE__ + 1;
    EXPECT_EQ(Raised([&] { nex_canDynamicCastRef<kprC_Step>(base, NEX_HERE); }),
              "class check failed: found kprC_TimePoint, expected kprC_Step (ClassRegistrarTest.cpp:" +
                  std::to_string(line) + ")");
}

TEST(DynamicCast, OfAClassThatIsNotRegistered_NamesItsNumber) {
    const Duck duck;
    EXPECT_EQ(Raised([&] {
                  nex_canDynamicCastRef<kprC_Step>(static_cast<const cls_Record&>(duck), {"a.cpp", 1});
              }),
              "class check failed: found class 0x7770003, expected kprC_Step (a.cpp:1)");
}

TEST(DynamicCast, OfAPointer_IsNullWhereItFails) {
    const kprC_TimePoint record;
    const cls_Record* base = &record;
    EXPECT_EQ(nex_canDynamicCastPtr<kprC_Step>(base), nullptr);
    EXPECT_EQ(nex_canDynamicCastPtr<kprC_Step>(static_cast<const cls_Record*>(nullptr)), nullptr);
}

} // namespace
