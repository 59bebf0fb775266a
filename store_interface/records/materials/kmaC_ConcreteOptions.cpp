#include "store_interface/records/materials/kmaC_ConcreteOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

constexpr omu_EnumRow kCrackingRows[] = {
    {0, "STRAIN", "STRAIN"}, {1, "DISPLACEMENT", "DISPLACEMENT"}, {2, "GFI", "GFI"}};

} // namespace

const cls_FieldTable& kmaC_FailureRatios::Fields() {
    using R = kmaC_FailureRatios;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: ratio of biaxial to uniaxial compressive strength, ratio of uniaxial tensile to "
                "compressive strength, ratio of plastic strains at biaxial and uniaxial ultimate stress, "
                "ratio of tensile cracking stresses in plane stress"))
            .Example(R"({"table": [[1.16, 0.09, 1.28, 0.33]]})");
    return fields;
}

const cls_FieldTable& kmaC_ShearRetention::Fields() {
    using R = kmaC_ShearRetention;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: factor for closed cracks, strain at which open cracks have no shear stiffness"))
            .Example(R"({"table": [[0.5, 0.001]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_TensionStiffening::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DISPLACEMENT", "DISPLACEMENT"}, {1, "STRAIN", "STRAIN"}};
    static constexpr omu_EnumTable table{"kmaC_TensionStiffening::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_TensionStiffening::Fields() {
    using R = kmaC_TensionStiffening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "how the post-cracking behaviour is given; STRAIN is not written")
            .With(kmaC_DependentTable(
                "columns: STRAIN: fraction of the cracking stress that remains, strain beyond cracking; "
                "DISPLACEMENT: displacement at which no stress remains (length)"))
            .Example(R"({"table": [[1, 0], [0, 0.001]]})");
    return fields;
}

const cls_FieldTable& kmaC_Concrete::Fields() {
    using R = kmaC_Concrete;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: compressive stress (stress, absolute value), plastic strain (absolute value)"))
            .Field<&R::failureRatios>("failureRatios", "shape of the failure surface")
            .Field<&R::shearRetention>("shearRetention", "shear of cracked concrete")
            .Field<&R::tensionStiffening>("tensionStiffening", "post-cracking behaviour")
            .Example(
                R"({"table": [[20, 0], [35, 0.0015]], "tensionStiffening": {"table": [[1, 0], [0, 0.001]]}})");
    return fields;
}

const cls_FieldTable& kmaC_ConcreteCompressionHardening::Fields() {
    using R = kmaC_ConcreteCompressionHardening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::rateGiven>(
                "rateGiven", "true: the table has a strain rate column (1/time) behind its two data columns. "
                             "False with temperatureDependency: the deck gets a blank rate column")
            .With(kmaC_DependentTable(
                "columns: yield stress (stress), inelastic strain, inelastic strain rate if rateGiven"))
            .Example(R"({"table": [[20, 0], [38, 0.001], [5, 0.01]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ConcreteTensionStiffening::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_ConcreteTensionStiffening::TypeEnm", kCrackingRows};
    return table;
}

const cls_FieldTable& kmaC_ConcreteTensionStiffening::Fields() {
    using R = kmaC_ConcreteTensionStiffening;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "how the post-cracking behaviour is given; STRAIN is not written")
            .Field<&R::rateGiven>(
                "rateGiven", "true: the table has a strain rate column (1/time) behind its two data columns. "
                             "False with temperatureDependency: the deck gets a blank rate column")
            .With(kmaC_DependentTable(
                "columns: STRAIN: remaining stress (stress), cracking strain; DISPLACEMENT: remaining "
                "stress, cracking displacement (length); GFI: failure stress, fracture energy (energy/area); "
                "then the rate if rateGiven"))
            .Example(R"({"table": [[3, 0], [0.1, 0.002]]})");
    return fields;
}

const cls_FieldTable& kmaC_ConcreteCompressionDamage::Fields() {
    using R = kmaC_ConcreteCompressionDamage;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::tensionRecovery>("tensionRecovery",
                                        "part of the stiffness that is recovered when the load turns to "
                                        "tension, from 0 to 1; written when not 0.0")
            .Unit("no unit")
            .With(kmaC_DependentTable("columns: damage variable (0 to 1), inelastic strain"))
            .Example(R"({"table": [[0, 0], [0.8, 0.01]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_ConcreteTensionDamage::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "STRAIN", "STRAIN"}, {1, "DISPLACEMENT", "DISPLACEMENT"}};
    static constexpr omu_EnumTable table{"kmaC_ConcreteTensionDamage::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_ConcreteTensionDamage::Fields() {
    using R = kmaC_ConcreteTensionDamage;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "what the second column is; STRAIN is not written")
            .Field<&R::compressionRecovery>("compressionRecovery",
                                            "part of the stiffness that is recovered when the load turns to "
                                            "compression, from 0 to 1; written when not 1.0")
            .Unit("no unit")
            .With(kmaC_DependentTable("columns: damage variable (0 to 1), cracking strain (STRAIN) or "
                                      "cracking displacement (DISPLACEMENT, length)"))
            .Example(R"({"table": [[0, 0], [0.9, 0.002]]})");
    return fields;
}

const cls_FieldTable& kmaC_ConcreteDamagedPlasticity::Fields() {
    using R = kmaC_ConcreteDamagedPlasticity;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: dilation angle (degrees), eccentricity of the flow potential, ratio of biaxial to "
                "uniaxial compressive strength, ratio of the second stress invariants K, viscosity (time)"))
            .Field<&R::concreteCompressionHardening>("concreteCompressionHardening",
                                                     "hardening in compression")
            .Field<&R::concreteTensionStiffening>("concreteTensionStiffening",
                                                  "post-cracking behaviour in tension")
            .Field<&R::concreteCompressionDamage>("concreteCompressionDamage", "damage in compression")
            .Field<&R::concreteTensionDamage>("concreteTensionDamage", "damage in tension")
            .Example(
                R"({"table": [[36, 0.1, 1.16, 0.667, 0]], "concreteCompressionHardening": {"table": [[20, 0], [38, 0.001]]}, "concreteTensionStiffening": {"table": [[3, 0], [0.1, 0.002]]}})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_BrittleShear::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "RETENTION_FACTOR", "RETENTION_FACTOR"},
                                           {1, "POWER_LAW", "POWER_LAW"}};
    static constexpr omu_EnumTable table{"kmaC_BrittleShear::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_BrittleShear::Fields() {
    using R = kmaC_BrittleShear;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "form of the post-cracking shear; RETENTION_FACTOR is not written")
            .With(kmaC_DependentTable(
                "columns: RETENTION_FACTOR: shear retention factor, crack opening strain; POWER_LAW: crack "
                "opening strain at which shear stiffness is lost, exponent"))
            .Example(R"({"table": [[1, 0], [0, 0.01]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_BrittleCracking::TypeEnm) {
    static constexpr omu_EnumTable table{"kmaC_BrittleCracking::TypeEnm", kCrackingRows};
    return table;
}

const cls_FieldTable& kmaC_BrittleCracking::Fields() {
    using R = kmaC_BrittleCracking;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "how the post-cracking behaviour is given; STRAIN is not written")
            .With(kmaC_DependentTable("columns: STRAIN: stress after cracking (stress), cracking strain; "
                                      "DISPLACEMENT: stress after cracking, cracking displacement (length); "
                                      "GFI: failure stress, fracture energy (energy/area)"))
            .Field<&R::brittleShear>("brittleShear", "shear of cracked material")
            .Example(R"({"table": [[3, 0], [0, 0.001]], "brittleShear": {"table": [[1, 0], [0, 0.01]]}})");
    return fields;
}

void cls_RegisterConcreteOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_FailureRatios>();
    registrar.Add<kmaC_ShearRetention>();
    registrar.Add<kmaC_TensionStiffening>();
    registrar.Add<kmaC_Concrete>();
    registrar.Add<kmaC_ConcreteCompressionHardening>();
    registrar.Add<kmaC_ConcreteTensionStiffening>();
    registrar.Add<kmaC_ConcreteCompressionDamage>();
    registrar.Add<kmaC_ConcreteTensionDamage>();
    registrar.Add<kmaC_ConcreteDamagedPlasticity>();
    registrar.Add<kmaC_BrittleShear>();
    registrar.Add<kmaC_BrittleCracking>();
}
