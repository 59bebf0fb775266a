#include "store_interface/records/sections/kseC_SolidSections.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_HomogenousSolidSection::Fields() {
    using R = kseC_HomogenousSolidSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_SolidSection::Fields())
            .Field<&R::thickness>("thickness", "plane or cross-section thickness of two-dimensional and "
                                               "one-dimensional elements; always written on the data line")
            .Unit("length")
            .Field<&R::materialName>("materialName", "material of the elements")
            .Required()
            .RefersTo("material")
            .Example(R"({"materialName": "Steel"})");
    return fields;
}

const cls_FieldTable& kseC_CompositeSolidLayer::Fields() {
    using R = kseC_CompositeSolidLayer;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::thickness>("thickness", "relative thickness of the layer")
            .Unit("no unit")
            .Field<&R::integrationPoints>("integrationPoints",
                                          "number of integration points of the layer (odd)")
            .Field<&R::materialName>("materialName",
                                     "material of the layer; stands in the deck without quotes")
            .Required()
            .RefersTo("material")
            .Field<&R::orientationAngle>("orientationAngle", "angle to the section's orientation")
            .Unit("degrees")
            .Example(R"({"materialName": "Ply", "thickness": 1})");
    return fields;
}

const cls_FieldTable& kseC_CompositeSolidSection::Fields() {
    using R = kseC_CompositeSolidSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_SolidSection::Fields())
            .Field<&R::symmetric>(
                "symmetric",
                "true: with at least 2 layers the whole list is written once more in reverse order")
            .Field<&R::layers>("layers", "layers in stacking order; at least one for a usable deck")
            .Example(R"({"layers": [{"materialName": "Ply", "thickness": 1}]})");
    return fields;
}

const cls_FieldTable& kseC_TrussSection::Fields() {
    using R = kseC_TrussSection;
    static const cls_FieldTable fields = cls_Describe<R>(kseC_Section::Fields())
                                             .Field<&R::area>("area", "area of the cross-section")
                                             .Unit("length^2")
                                             .Field<&R::materialName>("materialName", "material")
                                             .Required()
                                             .RefersTo("material")
                                             .Example(R"({"materialName": "Steel", "area": 100})");
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
            .Field<&R::thickness>("thickness", "membrane thickness")
            .Unit("length")
            .Field<&R::poissonDefinition>(
                "poissonDefinition",
                "whether the solver's own change of thickness holds or `poisson`, which is then written")
            .Field<&R::poisson>("poisson", "section Poisson's ratio, read only if poissonDefinition is VALUE")
            .Unit("no unit")
            .Field<&R::materialName>("materialName", "material")
            .Required()
            .RefersTo("material")
            .Example(R"({"materialName": "Film", "thickness": 0.1})");
    return fields;
}

const cls_FieldTable& kseC_GasketSection::Fields() {
    using R = kseC_GasketSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::crossSection>("crossSection",
                                     "cross-section area, width or out-of-plane thickness, by element type")
            .Unit("length^2 or length")
            .Field<&R::initialGap>("initialGap", "initial gap")
            .Unit("length")
            .Field<&R::initialThickness>(
                "initialThickness",
                "initial gasket thickness; unset: taken from the nodes, the data line starts with ', '")
            .Unit("length")
            .Field<&R::initialVoid>("initialVoid", "initial void")
            .Unit("length")
            .Field<&R::stabilizationStiffness>(
                "stabilizationStiffness",
                "stiffness that stabilises the gasket; unset: no 'stabilization stiffness='")
            .Unit("stress")
            .Field<&R::materialName>("materialName",
                                     "material, or gasket behaviour if that material has gasket options")
            .Required()
            .RefersTo("material")
            .Example(R"({"materialName": "Gasket"})");
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
