#include "store_interface/records/part_attributes/ptoC_PartAttribute.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(ptoC_MaterialOrientation::axisEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "AXIS_1", "1"}, {1, "AXIS_2", "2"}, {2, "AXIS_3", "3"}};
    static constexpr omu_EnumTable table{"ptoC_MaterialOrientation::axisEnm", rows};
    return table;
}

const cls_FieldTable& ptoC_PartAttribute::Fields() {
    static const cls_FieldTable fields =
        cls_Describe<ptoC_PartAttribute>(cls_Record::Fields())
            .Field<&ptoC_PartAttribute::region>("region", "the set that the attribute is assigned to")
            .Required();
    return fields;
}

const cls_FieldTable& ptoC_SectionAssignment::Fields() {
    using R = ptoC_SectionAssignment;
    static const cls_FieldTable fields =
        cls_Describe<R>(ptoC_PartAttribute::Fields())
            .Field<&R::sectionName>("sectionName", "name of the section")
            .RefersTo("section")
            .Required()
            .Field<&R::offset>("offset", "distance of a shell's reference surface from its mid-surface, as a "
                                         "fraction of the thickness: 0.5 is the top, -0.5 the bottom")
            .Unit("no unit")
            .Example(R"({"region": "ALL", "sectionName": "Plate"})");
    return fields;
}

const cls_FieldTable& ptoC_MaterialOrientation::Fields() {
    using R = ptoC_MaterialOrientation;
    static const cls_FieldTable fields =
        cls_Describe<R>(ptoC_PartAttribute::Fields())
            .Field<&R::datum>("datum",
                              "coordinate system; without one the elements keep the default orientation")
            .Field<&R::axis>("axis", "axis of the additional rotation")
            .Field<&R::angle>("angle", "angle of the additional rotation")
            .Unit("degrees")
            .Example(R"({"region": "ALL", "datum": "Cylinder"})");
    return fields;
}

const cls_FieldTable& ptoC_BeamOrientation::Fields() {
    using R = ptoC_BeamOrientation;
    static const cls_FieldTable fields =
        cls_Describe<R>(ptoC_PartAttribute::Fields())
            .Field<&R::vector>("vector", "direction of the local 1-axis, written as it stands")
            .Example(R"({"region": "ALL", "vector": [0, 0, -1]})");
    return fields;
}

const cls_FieldTable& ptoC_ConnectorOrientation::Fields() {
    using R = ptoC_ConnectorOrientation;
    static const cls_FieldTable fields =
        cls_Describe<R>(ptoC_PartAttribute::Fields())
            .Field<&R::name>("name",
                             "by which connector sections name the orientation; empty: 'ConnOri-' and "
                             "the place in the assembly's list, counted from 0")
            .Field<&R::csys1>("csys1", "coordinate system of the first end")
            .Field<&R::axis1>("axis1", "axis of the additional rotation at the first end")
            .Field<&R::angle1>("angle1", "angle of the additional rotation at the first end")
            .Unit("degrees")
            .Field<&R::orient2sameAs1>("orient2sameAs1", "the second end has the orientation of the first")
            .Field<&R::csys2>("csys2", "coordinate system of the second end")
            .Field<&R::axis2>("axis2", "axis of the additional rotation at the second end")
            .Field<&R::angle2>("angle2", "angle of the additional rotation at the second end")
            .Unit("degrees")
            .Example(R"({"region": "CONNECTORS", "csys1": "Cylinder"})");
    return fields;
}

void cls_RegisterPartAttributeRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<ptoC_PartAttribute>();
    registrar.Add<ptoC_SectionAssignment>();
    registrar.Add<ptoC_MaterialOrientation>();
    registrar.Add<ptoC_BeamOrientation>();
    registrar.Add<ptoC_ConnectorOrientation>();
}
