#include "store_interface/records/sections/kseC_Section.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::AssembledTypeEnm) {
    // The texts are the words of the deck language; "CVJ Joint" and "SlipR Ring" are no misprints.
    static constexpr omu_EnumRow rows[] = {{0, "NONE", ""},
                                           {1, "BEAM", "Beam"},
                                           {2, "BUSHING", "Bushing"},
                                           {3, "CVJOINT", "CVJ Joint", "CVJoint"},
                                           {4, "CYLINDRICAL", "Cylindrical"},
                                           {5, "HINGE", "Hinge"},
                                           {6, "PLANAR", "Planar"},
                                           {7, "RETRACTOR", "Retractor"},
                                           {8, "SLIPRING", "SlipR Ring", "SlipRing"},
                                           {9, "TRANSLATOR", "Translator"},
                                           {10, "UJOINT", "UJ Joint", "UJoint"},
                                           {11, "WELD", "Weld"}};
    static constexpr omu_EnumTable table{"kseC_ConnectorSection::AssembledTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::TranslationalTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", ""},
        {1, "ACCELEROMETER", "Accelerometer"},
        {2, "AXIAL", "Axial"},
        {3, "CARTESIAN", "Cartesian"},
        {4, "JOIN", "Join"},
        {5, "LINK", "Link"},
        {6, "PROJECTION_CARTESIAN", "Proj Cartesian", "Projection Cartesian"},
        {7, "RADIAL_THRUST", "Radial-Thrust"},
        {8, "SLIDE_PLANE", "Slide-Plane"},
        {9, "SLOT", "Slot"}};
    static constexpr omu_EnumTable table{"kseC_ConnectorSection::TranslationalTypeEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::RotationalTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "NONE", ""},
        {1, "ALIGN", "Align"},
        {2, "CARDAN", "Cardan"},
        {3, "CONSTANT_VELOCITY", "Constant Velocity"},
        {4, "EULER", "Euler"},
        {5, "FLEXION_TORSION", "Flexion-Torsion"},
        {6, "FLOW_CONVERTER", "Flow-Converter"},
        {7, "PROJECTION_FLEXION_TORSION", "Proj Flex-Tors", "Projection Flexion-Torsion"},
        {8, "REVOLUTE", "Revolute"},
        {9, "ROTATION", "Rotation"},
        {10, "ROTATION_ACCELEROMETER", "Rotation-Accelerometer"},
        {11, "UNIVERSAL", "Universal"}};
    static constexpr omu_EnumTable table{"kseC_ConnectorSection::RotationalTypeEnm", rows};
    return table;
}

const cls_FieldTable& kseC_GasketSection::Fields() {
    using R = kseC_GasketSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::crossSection>("crossSection",
                                     "cross-section area, width or out-of-plane thickness, by element type")
            .Field<&R::initialGap>("initialGap", "initial gap (length)")
            .Field<&R::initialThickness>("initialThickness",
                                         "initial thickness (length); unset: taken from the nodes")
            .Field<&R::initialVoid>("initialVoid", "initial void (length)")
            .Field<&R::stabilizationStiffness>("stabilizationStiffness",
                                               "stabilization stiffness (stress); unset: none is written")
            .Field<&R::materialName>("materialName",
                                     "material, or gasket behaviour if that material has gasket options")
            .RefersTo("material")
            .Required();
    return fields;
}

const cls_FieldTable& kseC_ConnectorSection::Fields() {
    using R = kseC_ConnectorSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::assembledType>("assembledType",
                                      "assembled connection type; excludes the two basic types")
            .Field<&R::translationalType>("translationalType", "basic connection type of the translations")
            .Field<&R::rotationalType>("rotationalType", "basic connection type of the rotations");
    return fields;
}

void cls_RegisterSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_Section>();
    registrar.Add<kbpC_BeamProfile>();
    registrar.Add<kseC_GasketSection>();
    registrar.Add<kseC_ConnectorSection>();
}
