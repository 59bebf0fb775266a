#include "store_interface/propagation/mdl_PropAttr.h"

#include "store/StoreTesting.h"

#include <gtest/gtest.h>

namespace {

using State = mdl_PropAttributeStateEnm;

TEST(PropAttr, Default_HasNoValueAndTheDefaultOfItsType) {
    const mdl_PropAttr<double> number;
    EXPECT_EQ(number.ConstGet(), 0.0);
    EXPECT_EQ(number.State(), State::NEVER_SET);
    EXPECT_TRUE(mdl_PropAttr<cow_String>().ConstGet().IsEmpty());
    EXPECT_FALSE(mdl_PropAttr<bool>().ConstGet());
}

TEST(PropAttr, States_DecideActiveAndModified) {
    struct Row {
        State state;
        bool active;
        bool modified;
    };
    for (const Row& row : {Row{State::NEVER_SET, false, false}, Row{State::SET, true, true},
                           Row{State::CARRIED, true, false}, Row{State::CLEARED, false, true}}) {
        const mdl_PropAttr<int> attribute(5, row.state);
        EXPECT_EQ(attribute.IsActive(), row.active);
        EXPECT_EQ(attribute.IsModified(), row.modified);
        EXPECT_EQ(attribute.ConstGet(), 5);
    }
}

TEST(PropAttr, MadeFromAValue_IsSet) {
    EXPECT_EQ(mdl_PropAttr<int>(5).State(), State::SET);
}

TEST(PropAttr, Comparison_IsWithTheStateOrWithTheValue) {
    const mdl_PropAttr<double> attribute(2.5, State::CARRIED);
    EXPECT_TRUE(attribute == State::CARRIED);
    EXPECT_TRUE(attribute != State::SET);
    EXPECT_TRUE(attribute == 2.5);
    EXPECT_TRUE(attribute != 2.0);
    EXPECT_TRUE(mdl_PropAttr<cow_String>("A") == cow_String("A"));
}

TEST(PropAttr, Set_TakesTheValueAndSetsTheState) {
    mdl_PropAttr<cow_String> attribute("old", State::CLEARED);
    attribute.Set("new");
    EXPECT_EQ(attribute.ConstGet(), "new");
    EXPECT_EQ(attribute.State(), State::SET);
    attribute.SetState(State::CARRIED);
    attribute.WritableValue() = "newer";
    EXPECT_EQ(attribute.ConstGet(), "newer");
    EXPECT_EQ(attribute.State(), State::CARRIED);
}

TEST(PropAttr, FieldType_ReachesStateAndValue) {
    const auto& type = static_cast<const cls_AttributeType&>(cls_TypeOf<mdl_PropAttr<int>>::Instance());
    EXPECT_EQ(type.Kind(), cls_FieldKind::Attribute);
    EXPECT_EQ(type.ValueType().Kind(), cls_FieldKind::Int);
    mdl_PropAttr<int> attribute(5);
    const mdl_PropAttr<int> other(5, State::CARRIED);
    EXPECT_FALSE(type.Equal(&attribute, &other));
    type.SetState(&attribute, 2);
    EXPECT_EQ(type.State(&attribute), 2);
    EXPECT_TRUE(type.Equal(&attribute, &other));
    *static_cast<int*>(type.WritableValue(&attribute)) = 6;
    EXPECT_EQ(*static_cast<const int*>(type.Value(&attribute)), 6);
    EXPECT_FALSE(type.Equal(&attribute, &other));
    type.Assign(&attribute, &other);
    EXPECT_TRUE(type.Equal(&attribute, &other));
}

} // namespace
