#include "store_interface/records/sections/kseC_BeamSection.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_TransverseShearBeam::Fields() {
    using R = kseC_TransverseShearBeam;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .Field<&R::k11>("k11", "force; 0 takes the value of k22")
                                             .Field<&R::k22>("k22", "force; 0 then takes the value of k11");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::IntegrationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "BEFORE_ANALYSIS", "BEFORE ANALYSIS"},
                                           {1, "DURING_ANALYSIS", "DURING ANALYSIS"}};
    static constexpr omu_EnumTable table{"kseC_BeamSection::IntegrationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::TemperatureVarEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "GRADIENTS", "GRADIENTS"}, {1, "VALUES", "VALUES"}};
    static constexpr omu_EnumTable table{"kseC_BeamSection::TemperatureVarEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kseC_BeamSection::FluidInertiaEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "FULL", "FULL"}, {1, "HALF", "HALF"}};
    static constexpr omu_EnumTable table{"kseC_BeamSection::FluidInertiaEnm", rows};
    return table;
}

const cls_FieldTable& kseC_BeamSection::Fields() {
    using R = kseC_BeamSection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kseC_Section::Fields())
            .Field<&R::integration>("integration", "1: '*Beam Section'; 0: '*Beam General Section'")
            .Field<&R::poisson>("poisson", "section Poisson's ratio (no unit); unset or 0.0: not written")
            .Field<&R::temperatureDependency>(
                "temperatureDependency",
                "materialTable has the cell of column 2 (0-based); false: a blank column is put there")
            .Field<&R::useFieldColumn>(
                "useFieldColumn",
                "materialTable has the cell of column 3 (0-based); false: a blank column is put there")
            .Field<&R::dependencies>("dependencies", "number of field variables of materialTable, its last "
                                                     "columns; written by a general section if positive")
            .Field<&R::density>("density", "mass per volume, general section only; unset or 0.0: not written")
            .Field<&R::referenceTemperature>("referenceTemperature",
                                             "temperature of zero thermal expansion, general section only, "
                                             "'zero='; unset or 0.0: not written")
            .Field<&R::temperatureVar>("temperatureVar",
                                       "how temperatures are given, integrated section only")
            .Field<&R::alphaDamping>("alphaDamping",
                                     "mass-proportional damping (1/time), general section only")
            .Field<&R::betaDamping>("betaDamping",
                                    "stiffness-proportional damping (time), general section only")
            .Field<&R::compositeDamping>("compositeDamping",
                                         "fraction of critical damping (no unit), general section only")
            .Field<&R::useFluidInertia>("useFluidInertia", "true: '*Beam Fluid Inertia' is written")
            .Field<&R::fluidInertiaHalf>("fluidInertiaHalf", "1 writes ', half'")
            .Field<&R::fluidValue1>("fluidValue1", "mass per volume of the fluid; first item of the line")
            .Field<&R::fluidValue2>("fluidValue2", "length; radius of the wetted cross-section; fourth item")
            .Field<&R::fluidValue3>(
                "fluidValue3", "coefficient of lateral added mass (no unit); fifth item, 1.0 is left out")
            .Field<&R::fluidValue4>(
                "fluidValue4", "coefficient of added mass at the ends (no unit); sixth item, 0.0 is left out")
            .Field<&R::fluidValue5>(
                "fluidValue5",
                "length; local 1-coordinate of the cross-section's centre; second item, 0.0 leaves it blank")
            .Field<&R::fluidValue6>(
                "fluidValue6",
                "length; local 2-coordinate of the cross-section's centre; third item, 0.0 leaves it blank")
            .Field<&R::profileName>("profileName", "key in the model's profile map")
            .Required()
            .RefersTo("profile")
            .Field<&R::materialName>("materialName", "material, integrated section only")
            .RefersTo("material")
            .Field<&R::materialTable>("materialTable",
                                      "general section only: Young's modulus, torsional shear modulus, then "
                                      "the cell of column 2 if temperatureDependency, the cell of column 3 "
                                      "if useFieldColumn, then one column per field variable")
            .Field<&R::sectionPoints>(
                "sectionPoints",
                "rows (x, y) in the local axes of the profile, lengths; general section only")
            .Field<&R::centroid>(
                "centroid", "x, y (lengths): centroid; general section only; empty or zeros: nothing written")
            .Field<&R::shearCenter>(
                "shearCenter",
                "x, y (lengths): shear centre; general section only; empty or zeros: nothing written");
    return fields;
}

void cls_RegisterBeamSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_TransverseShearBeam>();
    registrar.Add<kseC_BeamSection>();
}
