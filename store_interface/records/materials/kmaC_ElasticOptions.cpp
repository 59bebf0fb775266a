#include "store_interface/records/materials/kmaC_ElasticOptions.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_FailStrain::Fields() {
    using R = kmaC_FailStrain;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable("columns: tensile and compressive strain limit in direction 1, the "
                                      "same in direction 2, shear strain limit"))
            .Example(R"({"table": [[0.01, 0.008, 0.006, 0.01, 0.02]]})");
    return fields;
}

const cls_FieldTable& kmaC_FailStress::Fields() {
    using R = kmaC_FailStress;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .With(kmaC_DependentTable(
                "columns: tensile and compressive stress limit in direction 1, the same in direction 2, "
                "shear strength (stress), cross product term, biaxial stress limit (stress)"))
            .Example(R"({"table": [[1500, 1200, 50, 200, 70, 0, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_Elastic::TypeEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "ISOTROPIC", "ISOTROPIC"},
                                           {1, "ORTHOTROPIC", "ORTHOTROPIC"},
                                           {2, "ANISOTROPIC", "ANISOTROPIC"},
                                           {3, "ENGINEERING_CONSTANTS", "ENGINEERING_CONSTANTS"},
                                           {4, "LAMINA", "LAMINA"},
                                           {5, "TRACTION", "TRACTION"},
                                           {6, "COUPLED_TRACTION", "COUPLED TRACTION"},
                                           {7, "SHEAR", "SHEAR"}};
    static constexpr omu_EnumTable table{"kmaC_Elastic::TypeEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_Elastic::Fields() {
    using R = kmaC_Elastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::type>("type", "form of the constants; ISOTROPIC is not written")
            .Field<&R::noCompression>("noCompression",
                                      "true: no compressive stress, '*No Compression' follows")
            .Field<&R::noTension>("noTension", "true: no tensile stress, '*No Tension' follows")
            .With(kmaC_Dependence())
            .Field<&R::longTermModuli>("longTermModuli",
                                       "with viscoelastic: true: the constants are long-term ('moduli=LONG "
                                       "TERM'), false: instantaneous; ignored without viscoelastic")
            .Field<&R::table>(
                "table",
                "columns: ISOTROPIC: Young's modulus (stress), Poisson's ratio; ORTHOTROPIC: D1111, D1122, "
                "D2222, D1133, D2233, D3333, D1212, D1313, D2323 (stress); ANISOTROPIC: the 21 stiffnesses "
                "D1111, D1122, D2222, D1133, D2233, D3333, D1112, D2212, D3312, D1212, D1113, D2213, D3313, "
                "D1213, D1313, D1123, D2223, D3323, D1223, D1323, D2323; ENGINEERING_CONSTANTS: E1, E2, E3, "
                "nu12, nu13, nu23, G12, G13, G23; LAMINA: E1, E2, nu12, G12, G13, G23; TRACTION: normal and "
                "two shear stiffnesses; COUPLED_TRACTION: Knn, Kss, Ktt, Kns, Knt, Kst; SHEAR: shear modulus")
            .Field<&R::failStrain>("failStrain", "strain limits")
            .Field<&R::failStress>("failStress", "stress limits")
            .Example(R"({"table": [[210000, 0.3]]})");
    return fields;
}

const cls_FieldTable& kmaC_Hypoelastic::Fields() {
    using R = kmaC_Hypoelastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::user>("user", "true: moduli come from a user subroutine, the word 'user' is written")
            .Field<&R::table>("table", "columns: Young's modulus (stress), Poisson's ratio, then the three "
                                       "strain invariants; empty with user")
            .Example(R"({"table": [[200, 0.4, 0, 0, 0]]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kmaC_PorousElastic::ShearEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "G", "G"}, {1, "POISSON", "POISSON"}};
    static constexpr omu_EnumTable table{"kmaC_PorousElastic::ShearEnm", rows};
    return table;
}

const cls_FieldTable& kmaC_PorousElastic::Fields() {
    using R = kmaC_PorousElastic;
    static const cls_FieldTable fields =
        cls_Describe<R>(kmaC_MaterialOption::Fields())
            .Field<&R::shear>("shear", "what gives the shear behaviour; POISSON is not written")
            .With(kmaC_DependentTable("columns: logarithmic bulk modulus, shear modulus (shear 0, stress) or "
                                      "Poisson's ratio (shear 1), elastic tensile limit (stress)"))
            .Example(R"({"table": [[0.05, 0.3, 0.01]]})");
    return fields;
}

void cls_RegisterElasticOptionRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_FailStrain>();
    registrar.Add<kmaC_FailStress>();
    registrar.Add<kmaC_Elastic>();
    registrar.Add<kmaC_Hypoelastic>();
    registrar.Add<kmaC_PorousElastic>();
}
