#include "sections/SectionTesting.h"
#include "sections/oif_PointInertia.h"
#include "sections/oif_UserElement.h"

namespace {

template <class Record>
Record Inertia() {
    Record record;
    record.mass = 5.0;
    record.i11 = 1.0;
    record.i12 = 12.0;
    record.i13 = 13.0;
    record.i22 = 2.0;
    record.i23 = 23.0;
    record.i33 = 3.0;
    return record;
}

TEST(Mass, DataLine_EndsInItsCommaAsWanted) {
    EXPECT_EQ(Written(oif_Mass("SET", Inertia<kseC_PointSection>())), "*Mass, elset=SET\n5., \n");
    EXPECT_EQ(Written(oif_Mass("SET", Inertia<kefC_PointMassInertia>())), "*Mass, elset=SET\n5., \n");
}

TEST(Mass, Damping_IsThatOfTheMass) {
    auto section = Inertia<kseC_PointSection>();
    section.massAlphaDamping = 0.1;
    section.massCompositeDamping = 0.2;
    section.rotaryAlphaDamping = 0.3;
    section.rotaryCompositeDamping = 0.4;
    EXPECT_EQ(Written(oif_Mass("SET", section)), "*Mass, elset=SET, alpha=0.1, composite=0.2\n5., \n");
    section.massAlphaDamping = 0.0;
    EXPECT_EQ(Written(oif_Mass("SET", section)), "*Mass, elset=SET, composite=0.2\n5., \n");
}

TEST(Mass, WithoutMass_IsEmptyAndWritesNothing) {
    auto section = Inertia<kseC_PointSection>();
    EXPECT_FALSE(oif_Mass("SET", section).IsEmpty());
    section.mass = 0.0;
    section.massAlphaDamping = 0.1;
    EXPECT_TRUE(oif_Mass("SET", section).IsEmpty());
    EXPECT_EQ(Written(oif_Mass("SET", section)), "");
}

TEST(Mass, LongLine_BreaksBeforeTheCommaOfAParameter) {
    auto section = Inertia<kseC_PointSection>();
    section.massAlphaDamping = 0.1;
    section.massCompositeDamping = 0.2;
    // "*Mass, elset=" has 13 bytes, ", alpha=0.1" 11.
    const std::string set(119, 's');
    EXPECT_EQ(Written(oif_Mass(cow_String(set), section)),
              "*Mass, elset=" + set + "\n, alpha=0.1, composite=0.2\n5., \n");
    const std::string shorter(108, 's');
    EXPECT_EQ(Written(oif_Mass(cow_String(shorter), section)),
              "*Mass, elset=" + shorter + ", alpha=0.1\n, composite=0.2\n5., \n");
}

TEST(RotaryI, DataLine_HasThePrincipalInertiasFirst) {
    const std::string line = "1., 2., 3., 12., 13., 23.\n";
    EXPECT_EQ(Written(oif_RotaryI("SET", Inertia<kseC_PointSection>(), "")), "*RotaryI, elset=SET\n" + line);
    EXPECT_EQ(Written(oif_RotaryI("SET", Inertia<kefC_PointMassInertia>(), "Ori-1")),
              "*RotaryI, elset=SET, orientation=Ori-1\n" + line);
}

TEST(RotaryI, Damping_IsThatOfTheRotaryInertia) {
    auto section = Inertia<kseC_PointSection>();
    section.massAlphaDamping = 0.1;
    section.massCompositeDamping = 0.2;
    section.rotaryAlphaDamping = 0.3;
    section.rotaryCompositeDamping = 0.4;
    EXPECT_EQ(Written(oif_RotaryI("SET", section, "My Ori")),
              "*RotaryI, elset=SET, alpha=0.3, composite=0.4, orientation=My Ori\n"
              "1., 2., 3., 12., 13., 23.\n");
}

TEST(RotaryI, AnyInertia_IsEnough) {
    double kseC_PointSection::*const members[] = {&kseC_PointSection::i11, &kseC_PointSection::i12,
                                                  &kseC_PointSection::i13, &kseC_PointSection::i22,
                                                  &kseC_PointSection::i23, &kseC_PointSection::i33};
    for (const auto member : members) {
        kseC_PointSection section;
        section.*member = -1.0;
        EXPECT_FALSE(oif_RotaryI("SET", section, "").IsEmpty());
    }
    kseC_PointSection none;
    none.mass = 5.0;
    none.rotaryAlphaDamping = 1.0;
    EXPECT_TRUE(oif_RotaryI("SET", none, "Ori-1").IsEmpty());
    EXPECT_EQ(Written(oif_RotaryI("SET", none, "Ori-1")), "");
}

TEST(RotaryI, LongLine_BreaksBeforeTheCommaOfTheOrientation) {
    // "*RotaryI, elset=" has 16 bytes.
    const std::string set(116, 's');
    EXPECT_EQ(Written(oif_RotaryI(cow_String(set), Inertia<kseC_PointSection>(), "Ori-1")),
              "*RotaryI, elset=" + set + "\n, orientation=Ori-1\n1., 2., 3., 12., 13., 23.\n");
}

kinC_ActuatorSensor Sensor() {
    kinC_ActuatorSensor sensor;
    sensor.elementType = "U1";
    sensor.nodeSetText = "1, 2, 3";
    return sensor;
}

TEST(UserElement, WithoutProperties_TellsZeroOfBoth) {
    EXPECT_EQ(Written(oif_UserElement(mdl_ObjCow<kinC_Interaction>(Sensor()))),
              "*User Element, type=U1, nodes=1, properties=0, i properties=0, variables=0\n1, 2, 3\n");
}

TEST(UserElement, WithEverything_StandsInOrder) {
    kinC_ActuatorSensor sensor = Sensor();
    sensor.coordinates = 3;
    sensor.unsymm = true;
    sensor.variables = 4;
    kinC_ActuatorSensorProp property;
    property.realProperties = ListOf({0.5, 1.0});
    property.intProperties = ListOf({7});
    EXPECT_EQ(Written(oif_UserElement(mdl_ObjCow<kinC_Interaction>(sensor), property)),
              "*User Element, type=U1, nodes=1, coordinates=3, properties=2, i properties=1, unsymm, "
              "variables=4\n1, 2, 3\n");
}

TEST(UserElement, LongLine_BreaksBeforeTheCommaOfTheIntegerProperties) {
    kinC_ActuatorSensor sensor = Sensor();
    // Behind the type of 20 bytes stand ", nodes=1" and ", properties=0" of 9 and 14.
    const std::string type(89, 'U');
    sensor.elementType = cow_String(type);
    EXPECT_EQ(Written(oif_UserElement(mdl_ObjCow<kinC_Interaction>(sensor))),
              "*User Element, type=" + type +
                  ", nodes=1, properties=0\n, i properties=0, variables=0\n1, 2, 3\n");
}

/// Neither an actuator nor a sensor.
class OtherInteraction final : public cls_RecordOf<OtherInteraction, kinC_Interaction> {
public:
    static constexpr cls_ClassInfo Class{"OtherInteraction", "an interaction of the tests"};
    cls_Record* NewState(unsigned) const override { return new kinC_InteractionState(); }
};

TEST(UserElement, InteractionOfAnotherKind_WritesNothing) {
    EXPECT_EQ(Written(oif_UserElement(mdl_ObjCow<kinC_Interaction>(OtherInteraction()))), "");
}

std::string UelProperty(const kinC_ActuatorSensorProp& property) {
    return Written(oif_UelProperty(mdl_ObjCow<kinC_InteractionProperty>(property), ", elset=SET"));
}

/// Neither an actuator's nor a sensor's.
class OtherProperty final : public cls_RecordOf<OtherProperty, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{"OtherProperty", "a property of the tests"};
};

TEST(UelProperty, Values_StandInOneLineRealsFirst) {
    kinC_ActuatorSensorProp property;
    EXPECT_EQ(UelProperty(property), "*Uel Property, elset=SET\n");
    property.intProperties = ListOf({1, 2});
    EXPECT_EQ(UelProperty(property), "*Uel Property, elset=SET\n1, 2\n");
    property.realProperties = ListOf({0.5, 3.0});
    EXPECT_EQ(UelProperty(property), "*Uel Property, elset=SET\n0.5, 3., 1, 2\n");
    property.intProperties = {};
    EXPECT_EQ(UelProperty(property), "*Uel Property, elset=SET\n0.5, 3.\n");
}

TEST(UelProperty, ManyValues_StayInOneLine) {
    kinC_ActuatorSensorProp property;
    std::string line;
    for (int i = 0; i < 60; ++i) {
        property.intProperties.Append(100 + i);
        line += (i == 0 ? "" : ", ") + std::to_string(100 + i);
    }
    EXPECT_EQ(UelProperty(property), "*Uel Property, elset=SET\n" + line + "\n");
}

TEST(UelProperty, PropertyOfAnotherKind_WritesNothing) {
    EXPECT_EQ(Written(oif_UelProperty(mdl_ObjCow<kinC_InteractionProperty>(OtherProperty()), ", elset=SET")),
              "");
}

} // namespace
