#include "store_interface/records/sections/kseC_SolidSections.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_HomogenousSolidSection::Fields() {
    using R = kseC_HomogenousSolidSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_SolidSection::Fields())
            .Field<&R::thickness>("thickness",
                                  "length; plane or cross-section thickness of two-dimensional and "
                                  "one-dimensional elements; always written on the data line")
            .Field<&R::materialName>("materialName", "material of the elements")
            .Required()
            .RefersTo("material");
    return fields;
}

const cls_FieldTable& kseC_CompositeSolidLayer::Fields() {
    using R = kseC_CompositeSolidLayer;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::thickness>("thickness", "relative thickness of the layer (no unit)")
            .Field<&R::integrationPoints>("integrationPoints",
                                          "number of integration points of the layer (odd)")
            .Field<&R::materialName>("materialName",
                                     "material of the layer; stands in the deck without quotes")
            .Required()
            .RefersTo("material")
            .Field<&R::orientationAngle>("orientationAngle", "angle in degrees to the section's orientation");
    return fields;
}

const cls_FieldTable& kseC_CompositeSolidSection::Fields() {
    using R = kseC_CompositeSolidSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_SolidSection::Fields())
            .Field<&R::symmetric>(
                "symmetric",
                "true: with at least 2 layers the whole list is written once more in reverse order")
            .Field<&R::layers>("layers", "layers in stacking order; at least one for a usable deck");
    return fields;
}

const cls_FieldTable& kseC_TrussSection::Fields() {
    using R = kseC_TrussSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::area>("area", "area of the cross-section (length squared)")
            .Field<&R::materialName>("materialName", "material")
            .Required()
            .RefersTo("material");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kseC_MembraneSection::PoissonDefinitionEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"}, {1, "VALUE", "VALUE"}};
    static constexpr omu_EnumTable table{"kseC_MembraneSection::PoissonDefinitionEnm", rows};
    return table;
}

const cls_FieldTable& kseC_MembraneSection::Fields() {
    using R = kseC_MembraneSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::thickness>("thickness", "length; membrane thickness")
            .Field<&R::poissonDefinition>("poissonDefinition",
                                          "0 the solver's own change of thickness, else `poisson` is written")
            .Field<&R::poisson>("poisson",
                                "section Poisson's ratio (no unit), read only if poissonDefinition isn't 0")
            .Field<&R::materialName>("materialName", "material")
            .Required()
            .RefersTo("material");
    return fields;
}

const cls_FieldTable& kseC_GasketSection::Fields() {
    using R = kseC_GasketSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::crossSection>("crossSection",
                                     "cross-section area, width or out-of-plane thickness, by element type")
            .Field<&R::initialGap>("initialGap", "length; initial gap")
            .Field<&R::initialThickness>("initialThickness", "length; initial gasket thickness; unset: taken "
                                                             "from the nodes, the data line starts with ', '")
            .Field<&R::initialVoid>("initialVoid", "length; initial void")
            .Field<&R::stabilizationStiffness>("stabilizationStiffness",
                                               "stress; unset: no 'stabilization stiffness='")
            .Field<&R::materialName>("materialName",
                                     "material, or gasket behaviour if that material has gasket options")
            .Required()
            .RefersTo("material");
    return fields;
}

void cls_RegisterSolidSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_SolidSection>();
    registrar.Add<kseC_HomogenousSolidSection>();
    registrar.Add<kseC_CompositeSolidLayer>();
    registrar.Add<kseC_CompositeSolidSection>();
    registrar.Add<kseC_TrussSection>();
    registrar.Add<kseC_MembraneSection>();
    registrar.Add<kseC_GasketSection>();
}
