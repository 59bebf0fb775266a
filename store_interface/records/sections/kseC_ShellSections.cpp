#include "store_interface/records/sections/kseC_ShellSections.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_RebarLayer::Fields() {
    using R = kseC_RebarLayer;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::area>("area", "area of one bar")
            .Unit("length^2")
            .Field<&R::orientationName>("orientationName",
                                        "name of the layer's own orientation; non-empty: the layer gets a "
                                        "'*Rebar Layer' of its own and no angle")
            .RefersTo("orientation")
            .Field<&R::orientationAngle>("orientationAngle", "angle of the bars")
            .Unit("degrees")
            .Field<&R::spacing>("spacing", "distance of the bars, of a CONSTANT spacing")
            .Unit("length")
            .Field<&R::position>("position", "distance of the layer from the mid-surface")
            .Unit("length")
            .Field<&R::angularSpacing>("angularSpacing", "angle between the bars, of an ANGULAR spacing")
            .Unit("degrees")
            .Field<&R::name>("name", "name of the layer, first item of its data line")
            .Required()
            .Field<&R::materialName>("materialName", "material of the bars")
            .Required()
            .RefersTo("material")
            .Example(
                R"({"name": "BARS", "materialName": "Steel", "area": 50, "spacing": 150, "position": 40})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kseC_RebarLayers::SpacingTypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "CONSTANT", "CONSTANT"}, {1, "ANGULAR", "ANGULAR"}};
    static constexpr omu_EnumTable table{"kseC_RebarLayers::SpacingTypeEnm", rows};
    return table;
}

const cls_FieldTable& kseC_RebarLayers::Fields() {
    using R = kseC_RebarLayers;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::spacingType>("spacingType", "whether bars have a distance or an angle between them")
            .Field<&R::layers>("layers", "the layers; empty: nothing is written")
            .Example(
                R"({"layers": [{"name": "BARS", "materialName": "Steel", "area": 50, "spacing": 150}]})");
    return fields;
}

const cls_FieldTable& kseC_TransverseShearShell::Fields() {
    using R = kseC_TransverseShearShell;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::k11>("k11", "stiffness in the 1-direction; at zero that of k22")
            .Unit("force/length")
            .Field<&R::k22>("k22", "stiffness in the 2-direction; at zero that of k11")
            .Unit("force/length")
            .Field<&R::k12>("k12", "coupling stiffness; always written")
            .Unit("force/length")
            .Example(R"({"k11": 8000, "k22": 8000})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::PoissonDefinitionEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DEFAULT", "DEFAULT"}, {1, "VALUE", "VALUE"}};
    static constexpr omu_EnumTable table{"kseC_GeometryShellSection::PoissonDefinitionEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::IntegrationRuleEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "SIMPSON", "SIMPSON"}, {1, "GAUSS", "GAUSS"}};
    static constexpr omu_EnumTable table{"kseC_GeometryShellSection::IntegrationRuleEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_GeometryShellSection::TemperatureModeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "GRADIENT", "GRADIENT"}, {1, "POINTWISE", "POINTWISE"}};
    static constexpr omu_EnumTable table{"kseC_GeometryShellSection::TemperatureModeEnm", rows};
    return table;
}

namespace {

template <class Layer>
void AddOrientationsOf(const cow_List<Layer>& layers, cow_List<cow_String>& names) {
    for (int i = 0; i < layers.Length(); ++i) {
        const cow_String& name = layers[i].orientationName;
        bool known = name.IsEmpty();
        for (int j = 0; j < names.Length(); ++j) known = known || names[j] == name;
        if (!known) names.Append(name);
    }
}

} // namespace

bool kseC_GeometryShellSection::HasRebar() const {
    return !rebars.IsNull() && rebars.ConstGet().layers.Length() > 0;
}

bool kseC_GeometryShellSection::UsesRebarOrientation() const {
    if (!HasRebar()) return false;
    const auto& layers = rebars.ConstGet().layers;
    for (int i = 0; i < layers.Length(); ++i) {
        if (layers[i].orientationName.IsEmpty()) return true;
    }
    return false;
}

void kseC_GeometryShellSection::AddUserOrientations(cow_List<cow_String>& names) const {
    if (HasRebar()) AddOrientationsOf(rebars.ConstGet().layers, names);
}

int kseC_GeometryShellSection::NumTempPoints(bool) const {
    return temperatureMode == TemperatureModeEnm::POINTWISE ? temperaturePoints : 0;
}

void kseC_CompositeShellSection::AddUserOrientations(cow_List<cow_String>& names) const {
    AddOrientationsOf(layers, names);
    kseC_GeometryShellSection::AddUserOrientations(names);
}

const cls_FieldTable& kseC_GeometryShellSection::Fields() {
    using R = kseC_GeometryShellSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_ShellSection::Fields())
            .Field<&R::useGeneralKeyword>(
                "useGeneralKeyword",
                "true: '*Shell General Section' (properties computed before the analysis, no integration "
                "points on the data lines); false: '*Shell Section'")
            .Field<&R::poissonDefinition>(
                "poissonDefinition",
                "whether the solver's own change of thickness holds or `poisson`, which is then written")
            .Field<&R::poisson>("poisson", "section Poisson's ratio, read only if poissonDefinition is VALUE")
            .Unit("no unit")
            .Field<&R::integrationRule>("integrationRule",
                                        "rule of integration through the thickness; SIMPSON is not written")
            .Field<&R::temperatureMode>("temperatureMode",
                                        "how temperatures are given through the thickness; POINTWISE writes "
                                        "'temperature=' with temperaturePoints")
            .Field<&R::temperaturePoints>(
                "temperaturePoints",
                "number of temperature points through the thickness, read only with POINTWISE")
            .Field<&R::thicknessModulus>(
                "thicknessModulus",
                "effective modulus in thickness direction; unset: no 'thickness modulus=' and no 'stack "
                "direction='; set but not positive: only 'stack direction=' can be written")
            .Unit("stress")
            .Field<&R::rebars>("rebars", "rebar layers of the shell")
            .Field<&R::transverseShear>(
                "transverseShear",
                "given transverse shear stiffness; present: '*Transverse Shear' follows the section");
    return fields;
}

const cls_FieldTable& kseC_HomogenousShellSection::Fields() {
    using R = kseC_HomogenousShellSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_GeometryShellSection::Fields())
            .Field<&R::thickness>("thickness", "shell thickness")
            .Unit("length")
            .Field<&R::integrationPoints>(
                "integrationPoints",
                "number of integration points through the thickness; not written with useGeneralKeyword")
            .Field<&R::materialName>("materialName", "material")
            .Required()
            .RefersTo("material")
            .Example(R"({"materialName": "Steel", "thickness": 2})");
    return fields;
}

const cls_FieldTable& kseC_CompositeShellLayer::Fields() {
    using R = kseC_CompositeShellLayer;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::thickness>("thickness", "thickness of the layer")
            .Unit("length")
            .Field<&R::integrationPoints>(
                "integrationPoints",
                "number of integration points of the layer; not written with useGeneralKeyword")
            .Field<&R::materialName>("materialName", "material of the layer")
            .Required()
            .RefersTo("material")
            .Field<&R::orientationName>(
                "orientationName",
                "name of an orientation of the layer; non-empty: it stands in place of the angle")
            .RefersTo("orientation")
            .Field<&R::orientationAngle>(
                "orientationAngle",
                "angle to the section's orientation; written when orientationName is empty")
            .Unit("degrees")
            .Example(R"({"materialName": "Ply", "thickness": 0.25, "orientationAngle": 45})");
    return fields;
}

const cls_FieldTable& kseC_CompositeShellSection::Fields() {
    using R = kseC_CompositeShellSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_GeometryShellSection::Fields())
            .Field<&R::layers>("layers", "layers in stacking order, from the bottom side up")
            .Example(
                R"({"layers": [{"materialName": "Ply", "thickness": 0.25}, {"materialName": "Ply", "thickness": 0.25, "orientationAngle": 90}]})");
    return fields;
}

const cls_FieldTable& kseC_UserShellSection::Fields() {
    using R = kseC_UserShellSection;
    static const cls_FieldTable fields = cls_Describe<R>(kseC_ShellSection::Fields())
                                             .Field<&R::symmetric>("symmetric", "false writes 'unsymm'");
    return fields;
}

void cls_RegisterShellSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_ShellSection>();
    registrar.Add<kseC_RebarLayer>();
    registrar.Add<kseC_RebarLayers>();
    registrar.Add<kseC_TransverseShearShell>();
    registrar.Add<kseC_GeometryShellSection>();
    registrar.Add<kseC_HomogenousShellSection>();
    registrar.Add<kseC_CompositeShellLayer>();
    registrar.Add<kseC_CompositeShellSection>();
    registrar.Add<kseC_GeneralShellSection>();
    registrar.Add<kseC_UserShellSection>();
}
