#include "store_interface/records/materials/kmaC_PlasticOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kmaC_RateDependent::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "POWER_LAW", "POWER_LAW"},
                                           {1, "YIELD_RATIO", "YIELD_RATIO"},
                                           {2, "JOHNSON_COOK", "JOHNSON_COOK"}};
    static constexpr omu_EnumTable table{"kmaC_RateDependent::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_RateDependent::Fields() {
    using R = kmaC_RateDependent;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "form of the law; POWER_LAW is not written")
            .With(kmaC_DependentTable(
                "columns: POWER_LAW: multiplier (1/time), exponent; YIELD_RATIO: yield stress ratio, "
                "equivalent plastic strain rate (1/time); JOHNSON_COOK: C, reference strain rate (1/time)"))
            .Example(R"({"table": [[40, 5]]})");
    return fields;
}

const cls_FieldTable& kmaC_Potential::Fields() {
    using R = kmaC_Potential;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: stress ratios R11, R22, R33, R12, R13, R23"))
            .Example(R"({"table": [[1, 1, 1.1, 1, 1, 1]]})");
    return fields;
}

const cls_FieldTable& kmaC_Ornl::Fields() {
    using R = kmaC_Ornl;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::a>("a",
                          "saturation rate of the kinematic shift with creep strain; written when not 0.3")
            .Unit("no unit")
            .Field<&R::h>("h", "rate of the kinematic shift with creep strain; unset: no 'h='")
            .Unit("stress")
            .Field<&R::reset>("reset", "true: the optional reset procedure, the word 'reset'")
            .Example(R"({"a": 0.3})");
    return fields;
}

const cls_FieldTable& kmaC_CyclicHardening::Fields() {
    using R = kmaC_CyclicHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::parameters>(
                "parameters", "true: the row holds material parameters and the word 'parameters' is written")
            .With(kmaC_DependentTable(
                "columns: parameters false: yield surface size (stress), equivalent plastic strain; "
                "parameters true: size at zero plastic strain (stress), largest change Q (stress), rate b"))
            .Example(R"({"table": [[300, 0], [350, 0.1]]})");
    return fields;
}

const cls_FieldTable& kmaC_CycledPlastic::Fields() {
    using R = kmaC_CycledPlastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>(
                "table",
                "columns: yield stress (stress), plastic strain; further columns (temperature, field "
                "variables) may follow and go out as they stand, the keyword has no parameter for them")
            .Example(R"({"table": [[350, 0], [450, 0.2]]})");
    return fields;
}

const cls_FieldTable& kmaC_AnnealTemperature::Fields() {
    using R = kmaC_AnnealTemperature;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::dependencies>("dependencies",
                                     "number of field variables: the last columns of the table.")
            .Field<&R::table>("table", "columns: annealing temperature")
            .Example(R"({"table": [[700]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Plastic::HardeningEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "ISOTROPIC", "ISOTROPIC"},
                                           {1, "KINEMATIC", "KINEMATIC"},
                                           {2, "MULTILINEAR_KINEMATIC", "MULTILINEAR KINEMATIC"},
                                           {3, "COMBINED", "COMBINED"},
                                           {4, "JOHNSON_COOK", "JOHNSON_COOK"},
                                           {5, "USER", "USER"}};
    static constexpr omu_EnumTable table{"kmaC_Plastic::HardeningEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Plastic::DataTypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "HALF_CYCLE", "HALF CYCLE"}, {1, "PARAMETERS", "PARAMETERS"}, {2, "STABILIZED", "STABILIZED"}};
    static constexpr omu_EnumTable table{"kmaC_Plastic::DataTypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Plastic::Fields() {
    using R = kmaC_Plastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::hardening>("hardening",
                                  "hardening law; ISOTROPIC is not written, and none with rateDependentTable")
            .Field<&R::rateDependentTable>(
                "rateDependentTable", "true: the third column of the table is the plastic strain rate, and "
                                      "the deck gets one block per rate, in ascending order; nothing of "
                                      "hardening, dataType and numBackstresses is written then")
            .Field<&R::dataType>("dataType", "form of the data of combined hardening; HALF_CYCLE is not "
                                             "written, and none with rateDependentTable")
            .Field<&R::strainRangeDependency>(
                "strainRangeDependency",
                "combined hardening with stabilized data: true: the third column of the table is the strain "
                "range. False with a temperature or field column: the deck gets a blank third column")
            .Field<&R::numBackstresses>("numBackstresses",
                                        "number of backstresses, from 1; written when dataType is PARAMETERS")
            .With(kmaC_DependentTable(
                "columns: ISOTROPIC and both KINEMATIC: yield stress (stress), plastic strain, plastic "
                "strain rate (1/time) if rateDependentTable; COMBINED by HALF_CYCLE: yield stress, plastic "
                "strain; by PARAMETERS: stress at zero plastic strain, then C (stress) and gamma of each "
                "backstress; by STABILIZED: yield stress, plastic strain, strain range if "
                "strainRangeDependency; JOHNSON_COOK: A, B (stress), n, m, melting temperature, transition "
                "temperature; USER: one property per row, only the first column is read"))
            .Field<&R::rateDependent>("rateDependent", "strain rate dependence of the yield stress")
            .Field<&R::potential>("potential", "anisotropic yield")
            .Field<&R::cyclicHardening>("cyclicHardening",
                                        "growth of the yield surface; with hardening COMBINED")
            .Field<&R::ornl>("ornl", "constitutive model for cyclic loading and creep of stainless steel")
            .Field<&R::cycledPlastic>("cycledPlastic", "yield surface after cycling")
            .Field<&R::annealTemperature>("annealTemperature", "annealing temperature")
            .Example(R"({"table": [[235, 0], [360, 0.2]]})");
    return fields;
}

const cls_FieldTable& kmaC_DeformationPlasticity::Fields() {
    using R = kmaC_DeformationPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::table>("table",
                              "columns: Young's modulus (stress), Poisson's ratio, yield stress (stress), "
                              "exponent, yield offset; further columns (temperature, field variables) may "
                              "follow and go out as they stand, the keyword has no parameter for them")
            .Example(R"({"table": [[210000, 0.3, 235, 8, 0.4]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Creep::LawEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STRAIN", "STRAIN"},
                                           {1, "TIME", "TIME"},
                                           {2, "HYPERBOLIC_SINE", "HYPERBOLIC_SINE"},
                                           {3, "USER", "USER"}};
    static constexpr omu_EnumTable table{"kmaC_Creep::LawEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Creep::Fields() {
    using R = kmaC_Creep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "creep law; STRAIN is not written")
            .With(
                kmaC_DependentTable("columns: STRAIN and TIME: A, n, m; HYPERBOLIC_SINE: A, B, n, activation "
                                    "energy, gas constant; USER: none (units by the law: stress and time)"))
            .Field<&R::ornl>("ornl", "model for stainless steel")
            .Field<&R::potential>("potential", "anisotropic creep")
            .Example(R"({"table": [[1e-16, 5, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Viscous::LawEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STRAIN", "STRAIN"}, {1, "TIME", "TIME"}, {2, "USER", "USER"}};
    static constexpr omu_EnumTable table{"kmaC_Viscous::LawEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Viscous::Fields() {
    using R = kmaC_Viscous;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "viscous law; STRAIN is not written")
            .With(kmaC_DependentTable("columns: A, n, m (units by the law: stress and time), fraction of the "
                                      "elastic-viscous network; with USER the fraction alone"))
            .Example(R"({"table": [[1e-10, 3, 0, 0.2]]})");
    return fields;
}

const cls_FieldTable& kmaC_Ratios::Fields() {
    using R = kmaC_Ratios;
    static const cls_FieldTable fields = cls_Describe<R>(kmaC_MaterialOption::Fields())
                                             .With(kmaC_DependentTable("columns: ratios r11, r22, r33"))
                                             .Example(R"({"table": [[1, 1, 2]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Swelling::LawEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "INPUT", "INPUT"}, {1, "USER", "USER"}};
    static constexpr omu_EnumTable table{"kmaC_Swelling::LawEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Swelling::Fields() {
    using R = kmaC_Swelling;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "where the rate comes from; INPUT is not written")
            .With(kmaC_DependentTable("columns: volumetric swelling strain rate (1/time)"))
            .Field<&R::ratios>("ratios", "anisotropy")
            .Example(R"({"table": [[1e-6]]})");
    return fields;
}

const cls_FieldTable& kmaC_CastIronCompHard::Fields() {
    using R = kmaC_CastIronCompHard;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: yield stress in compression (stress), plastic strain"))
            .Example(R"({"table": [[400, 0], [600, 0.02]]})");
    return fields;
}

const cls_FieldTable& kmaC_CastIronTensHard::Fields() {
    using R = kmaC_CastIronTensHard;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: yield stress in tension (stress), plastic strain"))
            .Example(R"({"table": [[150, 0], [250, 0.01]]})");
    return fields;
}

const cls_FieldTable& kmaC_CastIronPlasticity::Fields() {
    using R = kmaC_CastIronPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: plastic Poisson's ratio"))
            .Field<&R::castIronCompHard>("castIronCompHard", "hardening in compression")
            .Field<&R::castIronTensHard>("castIronTensHard", "hardening in tension")
            .Example(
                R"({"table": [[0.04]], "castIronCompHard": {"table": [[400, 0], [600, 0.02]]}, "castIronTensHard": {"table": [[150, 0], [250, 0.01]]}})");
    return fields;
}

const cls_FieldTable& kmaC_PorousFailureCriteria::Fields() {
    using R = kmaC_PorousFailureCriteria;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::failureFraction>("failureFraction",
                                        "void volume fraction at total failure; always written")
            .Unit("no unit")
            .Field<&R::criticalFraction>(
                "criticalFraction",
                "void volume fraction at which the stress capacity begins to drop; always written")
            .Unit("no unit")
            .Example(R"({"failureFraction": 0.25, "criticalFraction": 0.15})");
    return fields;
}

const cls_FieldTable& kmaC_VoidNucleation::Fields() {
    using R = kmaC_VoidNucleation;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: mean nucleation strain, standard deviation, volume fraction of nucleating voids"))
            .Example(R"({"table": [[0.3, 0.1, 0.04]]})");
    return fields;
}

const cls_FieldTable& kmaC_PorousMetalPlasticity::Fields() {
    using R = kmaC_PorousMetalPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::relativeDensity>("relativeDensity",
                                        "initial relative density; unset: no 'relative density='")
            .Unit("no unit")
            .With(kmaC_DependentTable("columns: q1, q2, q3 (no units)"))
            .Field<&R::porousFailureCriteria>("porousFailureCriteria", "void fractions at failure")
            .Field<&R::voidNucleation>("voidNucleation", "nucleation of voids")
            .Example(R"({"relativeDensity": 0.95, "table": [[1.5, 1, 2.25]]})");
    return fields;
}

void cls_RegisterPlasticOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_RateDependent>();
    registrar.Add<kmaC_Potential>();
    registrar.Add<kmaC_Ornl>();
    registrar.Add<kmaC_CyclicHardening>();
    registrar.Add<kmaC_CycledPlastic>();
    registrar.Add<kmaC_AnnealTemperature>();
    registrar.Add<kmaC_Plastic>();
    registrar.Add<kmaC_DeformationPlasticity>();
    registrar.Add<kmaC_Creep>();
    registrar.Add<kmaC_Viscous>();
    registrar.Add<kmaC_Ratios>();
    registrar.Add<kmaC_Swelling>();
    registrar.Add<kmaC_CastIronCompHard>();
    registrar.Add<kmaC_CastIronTensHard>();
    registrar.Add<kmaC_CastIronPlasticity>();
    registrar.Add<kmaC_PorousFailureCriteria>();
    registrar.Add<kmaC_VoidNucleation>();
    registrar.Add<kmaC_PorousMetalPlasticity>();
}
