#include "store_interface/records/sections/kseC_BeamSection.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kseC_TransverseShearBeam::Fields() {
    using R = kseC_TransverseShearBeam;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::k11>("k11", "stiffness in the 1-direction; at zero that of k22")
            .Unit("force")
            .Field<&R::k22>("k22", "stiffness in the 2-direction; at zero that of k11")
            .Unit("force")
            .Example(R"({"k11": 50000, "k22": 50000})");
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
            .Field<&R::integration>("integration", "whether the section is integrated during the analysis "
                                                   "('*Beam Section') or before it ('*Beam General Section')")
            .Field<&R::poisson>("poisson", "section Poisson's ratio; unset or 0.0: not written")
            .Unit("no unit")
            .Field<&R::temperatureDependency>(
                "temperatureDependency",
                "materialTable has the cell of column 2 (0-based); false: a blank column is put there")
            .Field<&R::useFieldColumn>(
                "useFieldColumn",
                "materialTable has the cell of column 3 (0-based); false: a blank column is put there")
            .Field<&R::dependencies>("dependencies", "number of field variables of materialTable, its last "
                                                     "columns; written by a general section if positive")
            .Field<&R::density>("density", "density, of a general section only; unset or 0.0: not written")
            .Unit("mass/volume")
            .Field<&R::referenceTemperature>(
                "referenceTemperature",
                "temperature of zero thermal expansion, of a general section only; unset or 0.0: not written")
            .Unit("temperature")
            .Field<&R::temperatureVar>("temperatureVar",
                                       "how temperatures are given, integrated section only")
            .Field<&R::alphaDamping>("alphaDamping", "mass-proportional damping, general section only")
            .Unit("1/time")
            .Field<&R::betaDamping>("betaDamping", "stiffness-proportional damping, general section only")
            .Unit("time")
            .Field<&R::compositeDamping>("compositeDamping",
                                         "fraction of critical damping, general section only")
            .Unit("no unit")
            .Field<&R::useFluidInertia>("useFluidInertia", "true: '*Beam Fluid Inertia' is written")
            .Field<&R::fluidInertiaHalf>(
                "fluidInertiaHalf", "whether the beam is immersed in full or half, which writes ', half'")
            .Field<&R::fluidValue1>("fluidValue1", "density of the fluid")
            .Unit("mass/volume")
            .Field<&R::fluidValue2>("fluidValue2", "radius of the wetted cross-section")
            .Unit("length")
            .Field<&R::fluidValue3>("fluidValue3", "coefficient of lateral added mass; 1.0 is left out")
            .Unit("no unit")
            .Field<&R::fluidValue4>("fluidValue4", "coefficient of added mass at the ends; 0.0 is left out")
            .Unit("no unit")
            .Field<&R::fluidValue5>("fluidValue5",
                                    "local 1-coordinate of the cross-section's centre; 0.0 leaves it blank")
            .Unit("length")
            .Field<&R::fluidValue6>("fluidValue6",
                                    "local 2-coordinate of the cross-section's centre; 0.0 leaves it blank")
            .Unit("length")
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
                "centroid", "centroid (x, y), of a general section only; empty or zeros: nothing written")
            .Unit("length")
            .Field<&R::shearCenter>(
                "shearCenter",
                "shear centre (x, y), of a general section only; empty or zeros: nothing written")
            .Unit("length")
            .Example(
                R"({"profileName": "Round", "materialName": "Steel", "integration": "DURING_ANALYSIS"})");
    return fields;
}

void cls_RegisterBeamSectionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kseC_TransverseShearBeam>();
    registrar.Add<kseC_BeamSection>();
}
