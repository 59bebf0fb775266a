#include "store_interface/records/materials/kmaC_SoilOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr omu_EnumRow kCreepLawRows[] = {
    {0, "STRAIN", "STRAIN"}, {1, "TIME", "TIME"}, {2, "SINGHM", "SINGHM"}, {3, "USER", "USER"}};

} // namespace

const omu_EnumTable& omu_EnumTableOf(kmaC_CapCreepCohesion::LawEnm) {
    static constexpr omu_EnumTable table{"kmaC_CapCreepCohesion::LawEnm", kCreepLawRows};
    return table;
}

const cls_FieldTable& kmaC_CapCreepCohesion::Fields() {
    using R = kmaC_CapCreepCohesion;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "creep law; STRAIN is not written")
            .With(kmaC_DependentTable("columns: STRAIN and TIME: A, n, m; SINGHM: A, alpha, m, t1; USER: "
                                      "none (units by the law: stress and time)"))
            .Example(R"({"table": [[1e-10, 2, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_CapCreepConsolidation::LawEnm) {
    static constexpr omu_EnumTable table{"kmaC_CapCreepConsolidation::LawEnm", kCreepLawRows};
    return table;
}

const cls_FieldTable& kmaC_CapCreepConsolidation::Fields() {
    using R = kmaC_CapCreepConsolidation;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "creep law; STRAIN is not written")
            .With(kmaC_DependentTable("columns: STRAIN and TIME: A, n, m; SINGHM: A, alpha, m, t1; USER: "
                                      "none (units by the law: stress and time)"))
            .Example(R"({"table": [[1e-10, 2, 0]]})");
    return fields;
}

const cls_FieldTable& kmaC_CapHardening::Fields() {
    using R = kmaC_CapHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: hydrostatic compression yield stress (stress), volumetric inelastic strain"))
            .Example(R"({"table": [[0.1, 0], [1, 0.05]]})");
    return fields;
}

const cls_FieldTable& kmaC_CapPlasticity::Fields() {
    using R = kmaC_CapPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: cohesion (stress), friction angle (degrees), cap eccentricity, initial volumetric "
                "inelastic strain, transition surface radius, flow stress ratio"))
            .Field<&R::capCreepCohesion>("capCreepCohesion", "cohesion creep")
            .Field<&R::capCreepConsolidation>("capCreepConsolidation", "consolidation creep")
            .Field<&R::capHardening>("capHardening", "cap hardening")
            .Example(
                R"({"table": [[0.2, 35, 0.4, 0, 0.05, 1]], "capHardening": {"table": [[0.1, 0], [1, 0.05]]}})");
    return fields;
}

const cls_FieldTable& kmaC_ClayHardening::Fields() {
    using R = kmaC_ClayHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: hydrostatic yield pressure (stress), volumetric plastic strain"))
            .Example(R"({"table": [[0.1, 0], [1, 0.05]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ClayPlasticity::HardeningEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "EXPONENTIAL", "EXPONENTIAL"}, {1, "TABULAR", "TABULAR"}};
    static constexpr omu_EnumTable table{"kmaC_ClayPlasticity::HardeningEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_ClayPlasticity::Fields() {
    using R = kmaC_ClayPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::hardening>("hardening", "hardening form; EXPONENTIAL is not written")
            .Field<&R::intercept>(
                "intercept",
                "void ratio at the intercept of the virgin consolidation line; unset: no 'intercept='")
            .Unit("no unit")
            .With(kmaC_DependentTable(
                "columns: EXPONENTIAL: logarithmic plastic bulk modulus, critical state slope M, initial "
                "yield surface size (stress), wet yield surface size, flow stress ratio; TABULAR: the same "
                "without the first, whose place the deck leaves blank in the first row"))
            .Field<&R::clayHardening>("clayHardening", "hardening curve, with hardening TABULAR")
            .Example(R"({"table": [[0.2, 1, 0.1, 1, 1]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPragerCreep::LawEnm) {
    static constexpr omu_EnumTable table{"kmaC_DruckerPragerCreep::LawEnm", kCreepLawRows};
    return table;
}

const cls_FieldTable& kmaC_DruckerPragerCreep::Fields() {
    using R = kmaC_DruckerPragerCreep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::law>("law", "creep law; STRAIN is not written")
            .With(kmaC_DependentTable("columns: STRAIN and TIME: A, n, m; SINGHM: A, alpha, m, t1; USER: "
                                      "none (units by the law: stress and time)"))
            .Example(R"({"table": [[1e-10, 2, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPragerHardening::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "COMPRESSION", "COMPRESSION"}, {1, "TENSION", "TENSION"}, {2, "SHEAR", "SHEAR"}};
    static constexpr omu_EnumTable table{"kmaC_DruckerPragerHardening::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_DruckerPragerHardening::Fields() {
    using R = kmaC_DruckerPragerHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "stress state of the hardening data; COMPRESSION is not written")
            .Field<&R::rateDependentTable>(
                "rateDependentTable",
                "true: the third column of the table is the plastic strain rate, and each run of rows with "
                "one rate makes a block, in the order of the rows")
            .With(kmaC_DependentTable("columns: yield stress (stress), plastic strain, plastic strain rate "
                                      "(1/time) if rateDependentTable"))
            .Example(R"({"table": [[2, 0], [3, 0.02]]})");
    return fields;
}

const cls_FieldTable& kmaC_TriaxialTestData::Fields() {
    using R = kmaC_TriaxialTestData;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::a>("a", "material constant a, if known; unset: no 'a='")
            .Unit("stress^(1-b)")
            .Field<&R::b>("b", "material constant b (exponent), if known; unset: no 'b='")
            .Unit("no unit")
            .Field<&R::pt>("pt", "material constant pt, if known; unset: no 'pt='")
            .Unit("stress")
            .Field<&R::table>("table", "columns: confining stress (stress), stress in the loading direction "
                                       "(stress), with their signs")
            .Example(R"({"table": [[-10, -30], [-20, -50]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_DruckerPrager::ShearCriterionEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "LINEAR", "LINEAR"}, {1, "HYPERBOLIC", "HYPERBOLIC"}, {2, "EXPONENTIAL", "EXPONENTIAL"}};
    static constexpr omu_EnumTable table{"kmaC_DruckerPrager::ShearCriterionEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_DruckerPrager::Fields() {
    using R = kmaC_DruckerPrager;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shearCriterion>("shearCriterion", "form of the yield surface in the meridional plane")
            .Field<&R::eccentricity>("eccentricity",
                                     "eccentricity of the flow potential; written when not 0.1")
            .Unit("no unit")
            .Field<&R::testData>("testData", "true: the constants of the criterion EXPONENTIAL come from "
                                             "triaxialTestData; 'testdata' is written for any criterion")
            .With(kmaC_DependentTable(
                "columns: LINEAR: friction angle (degrees), flow stress ratio, dilation angle (degrees); "
                "HYPERBOLIC: friction angle (degrees), initial hydrostatic tension strength (stress), "
                "dilation angle (degrees); EXPONENTIAL: a, b, dilation angle (degrees), or with testData the "
                "dilation angle alone, and the deck gets the blank columns that stand before it"))
            .Field<&R::druckerPragerCreep>("druckerPragerCreep", "creep")
            .Field<&R::druckerPragerHardening>("druckerPragerHardening", "hardening")
            .Field<&R::rateDependent>("rateDependent", "strain rate dependence")
            .Field<&R::triaxialTestData>("triaxialTestData", "triaxial test")
            .Example(
                R"({"table": [[30, 0.8, 20]], "druckerPragerHardening": {"table": [[2, 0], [3, 0.02]]}})");
    return fields;
}

const cls_FieldTable& kmaC_MohrCoulombHardening::Fields() {
    using R = kmaC_MohrCoulombHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: cohesion (stress), plastic strain"))
            .Example(R"({"table": [[0.05, 0], [0.08, 0.02]]})");
    return fields;
}

const cls_FieldTable& kmaC_MohrCoulomb::Fields() {
    using R = kmaC_MohrCoulomb;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::deviatoricEccentricity>(
                "deviatoricEccentricity",
                "deviatoric eccentricity of the flow potential; unset: no 'deviatoric Eccentricity ='")
            .Unit("no unit")
            .Field<&R::meridionalEccentricity>(
                "meridionalEccentricity",
                "meridional eccentricity of the flow potential; written as 'eccentricity =' when not 0.1")
            .Unit("no unit")
            .With(kmaC_DependentTable("columns: friction angle (degrees), dilation angle (degrees)"))
            .Field<&R::mohrCoulombHardening>("mohrCoulombHardening", "cohesion")
            .Example(R"({"table": [[30, 5]], "mohrCoulombHardening": {"table": [[0.05, 0]]}})");
    return fields;
}

const cls_FieldTable& kmaC_FoamHardening::Fields() {
    using R = kmaC_FoamHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: uniaxial compressive yield stress (stress), plastic strain"))
            .Example(R"({"table": [[1, 0], [2, 0.5]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Foam::HardeningEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "VOLUMETRIC", "VOLUMETRIC"}, {1, "ISOTROPIC", "ISOTROPIC"}};
    static constexpr omu_EnumTable table{"kmaC_Foam::HardeningEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Foam::Fields() {
    using R = kmaC_Foam;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::hardening>("hardening", "hardening model; VOLUMETRIC is not written")
            .With(kmaC_DependentTable(
                "columns: VOLUMETRIC: yield stress ratio for compression, yield stress ratio for hydrostatic "
                "tension; ISOTROPIC: yield stress ratio, plastic Poisson's ratio"))
            .Field<&R::foamHardening>("foamHardening", "hardening curve")
            .Field<&R::rateDependent>("rateDependent", "strain rate dependence")
            .Example(R"({"table": [[1.1, 0.1]], "foamHardening": {"table": [[1, 0], [2, 0.5]]}})");
    return fields;
}

const cls_FieldTable& kmaC_BulkFailure::Fields() {
    using R = kmaC_BulkFailure;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: friction angle (degrees), dilation angle (degrees), cohesion (stress)"))
            .Example(R"({"table": [[30, 20, 0.5]]})");
    return fields;
}

const cls_FieldTable& kmaC_FirstDirection::Fields() {
    using R = kmaC_FirstDirection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: friction angle (degrees), dilation angle (degrees), cohesion (stress)"))
            .Example(R"({"table": [[30, 20, 0.5]]})");
    return fields;
}

const cls_FieldTable& kmaC_SecondDirection::Fields() {
    using R = kmaC_SecondDirection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: friction angle (degrees), dilation angle (degrees), cohesion (stress)"))
            .Example(R"({"table": [[30, 20, 0.5]]})");
    return fields;
}

const cls_FieldTable& kmaC_ThirdDirection::Fields() {
    using R = kmaC_ThirdDirection;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: friction angle (degrees), dilation angle (degrees), cohesion (stress)"))
            .Example(R"({"table": [[30, 20, 0.5]]})");
    return fields;
}

const cls_FieldTable& kmaC_JointShearRetention::Fields() {
    using R = kmaC_JointShearRetention;
    static const cls_FieldTable fields = cls_Describe<R>(kmaC_MaterialOption::Fields())
                                             .With(kmaC_DependentTable("columns: shear retention factor"))
                                             .Example(R"({"table": [[0.5]]})");
    return fields;
}

const cls_FieldTable& kmaC_JointedMaterial::Fields() {
    using R = kmaC_JointedMaterial;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::bulkFailure>("bulkFailure", "failure of the bulk")
            .Field<&R::firstDirection>("firstDirection", "first joint system")
            .Field<&R::secondDirection>("secondDirection", "second joint system")
            .Field<&R::thirdDirection>("thirdDirection", "third joint system")
            .Field<&R::jointShearRetention>("jointShearRetention", "shear of open joints")
            .Example(R"({"bulkFailure": {"table": [[30, 20, 0.5]]}})");
    return fields;
}

void cls_RegisterSoilOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_CapCreepCohesion>();
    registrar.Add<kmaC_CapCreepConsolidation>();
    registrar.Add<kmaC_CapHardening>();
    registrar.Add<kmaC_CapPlasticity>();
    registrar.Add<kmaC_ClayHardening>();
    registrar.Add<kmaC_ClayPlasticity>();
    registrar.Add<kmaC_DruckerPragerCreep>();
    registrar.Add<kmaC_DruckerPragerHardening>();
    registrar.Add<kmaC_TriaxialTestData>();
    registrar.Add<kmaC_DruckerPrager>();
    registrar.Add<kmaC_MohrCoulombHardening>();
    registrar.Add<kmaC_MohrCoulomb>();
    registrar.Add<kmaC_FoamHardening>();
    registrar.Add<kmaC_Foam>();
    registrar.Add<kmaC_BulkFailure>();
    registrar.Add<kmaC_FirstDirection>();
    registrar.Add<kmaC_SecondDirection>();
    registrar.Add<kmaC_ThirdDirection>();
    registrar.Add<kmaC_JointShearRetention>();
    registrar.Add<kmaC_JointedMaterial>();
}
