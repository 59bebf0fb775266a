#include "store_interface/records/sections/kseC_ConnectorSection.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kseC_ConnectorSection::AssembledTypeEnm) {
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

namespace {

cow_List<double> UnsetReference(const cls_Record&) {
    return kseC_ConnectorSection::constitutiveReferenceDef();
}

} // namespace

cow_List<double> kseC_ConnectorSection::constitutiveReferenceDef() {
    cow_List<double> items;
    for (int i = 0; i < 6; ++i) items.Append(-cls_UnsetDouble);
    return items;
}

cow_String kseC_ConnectorSection::GetConnectionTypeAsString() const {
    const cow_String assembled = omu_PrimEnum<AssembledTypeEnm, 1>(assembledType).GetString();
    if (!assembled.IsEmpty()) return assembled;
    const cow_String translations = omu_PrimEnum<TranslationalTypeEnm, 1>(translationalType).GetString();
    const cow_String rotations = omu_PrimEnum<RotationalTypeEnm, 1>(rotationalType).GetString();
    if (translations.IsEmpty() || rotations.IsEmpty()) return translations + rotations;
    return translations + " + " + rotations;
}

bool kseC_Utils::IsConnectorSectionEmpty(const kseC_ConnectorSection& section) {
    if (section.options.Length() > 0) return false;
    for (int i = 0; i < section.constitutiveReference.Length(); ++i) {
        if (section.constitutiveReference[i] != -cls_UnsetDouble) return false;
    }
    return true;
}

const cls_FieldTable& kseC_ConnectorSection::Fields() {
    using R = kseC_ConnectorSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::assembledType>(
                "assembledType",
                "first of the three connection types; a connection is of this one or of the two basic ones")
            .Field<&R::translationalType>("translationalType",
                                          "second of the three connection types, of translations")
            .Field<&R::rotationalType>("rotationalType", "third of the three connection types, of rotations")
            .Field<&R::regularize>("regularize", "tables of the behaviour are regularized")
            .Field<&R::useBehaviorRegularization>("useBehaviorRegularization",
                                                  "the tolerance of the analysis holds, not regularization")
            .Field<&R::regularization>("regularization", "tolerance of regularized tables, as a fraction")
            .Unit("no unit")
            .Field<&R::extrapolationLinear>("extrapolationLinear", "tables are extrapolated linearly")
            .Field<&R::integrationExplicit>("integrationExplicit", "the behaviour is integrated explicitly")
            .Field<&R::contactAngle>("contactAngle",
                                     "angle of contact around the ring of a slipring, passed unchanged")
            .Unit("radians")
            .Field<&R::materialFlowFactor>("materialFlowFactor",
                                           "factor that turns material flow into rotation")
            .Unit("no unit")
            .Field<&R::massPerLength>("massPerLength", "mass per reference length of the belt of a slipring")
            .Unit("mass/length")
            .Field<&R::constitutiveReference>(
                "constitutiveReference", "exactly six: reference lengths of components 1 to 3, reference "
                                         "angles of components 4 to 6; null for one that is unset")
            .Unit("length or degrees")
            .Length(6)
            .DefaultItems<UnsetReference>()
            .Field<&R::options>("options", "options of the behaviour, in the user's order")
            .Example(R"({"assembledType": "HINGE"})");
    return fields;
}

void cls_RegisterConnectorSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_ConnectorSection>();
}
