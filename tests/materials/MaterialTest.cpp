#include "materials/oif_Material.h"

#include "materials/Materials.h"
#include "materials/oif_MaterialBuilder.h"
#include "store_interface/records/sections/kseC_Section.h"

namespace {

const std::string kBanner = "** \n** MATERIALS\n** \n";

kmaC_Material Gasket() {
    kmaC_Material material;
    material.membraneElastic = kmaC_MembraneElastic();
    material.density = kmaC_Density();
    return material;
}

/// What the builder makes of the store.
std::string Built(TestStore& store) {
    oif_MaterialBuilder builder(store.Info());
    builder.Build();
    std::string text;
    const qkw_KeywordList keywords = builder.ModelDefinition();
    for (int i = 0; i < keywords.Length(); ++i) text += Written(keywords[i].ConstGet());
    return text;
}

void AddGasketSection(TestStore& store, const char* name, const char* material) {
    kseC_GasketSection section;
    section.materialName = material;
    store.model.sections.Insert(name, section);
}

} // namespace

TEST(Material, WithoutOptions_IsItsLineAlone) {
    EXPECT_EQ(Written(oif_Material("STEEL", kmaC_Material())), "*Material, name=STEEL\n");
}

TEST(Material, NameWithABlank_IsQuoted) {
    EXPECT_EQ(Written(oif_Material("Steel, mild", kmaC_Material())), "*Material, name=\"Steel, mild\"\n");
}

TEST(Material, RegularizationOfDefaults_AddsNothing) {
    kmaC_Material material;
    material.regularization = kmaC_Regularization();
    EXPECT_EQ(Written(oif_Material("M", material)), "*Material, name=M\n");
}

TEST(Material, Regularization_AddsItsTwoParameters) {
    kmaC_Material material;
    kmaC_Regularization regularization;
    regularization.rtol = 0.01;
    material.regularization = regularization;
    EXPECT_EQ(Written(oif_Material("M", material)), "*Material, name=M, rtol=0.01\n");
    Number(regularization.strainRateRegularization, 1);
    material.regularization = regularization;
    EXPECT_EQ(Written(oif_Material("M", material)),
              "*Material, name=M, rtol=0.01, strain rate regularization=LINEAR\n");
    regularization.rtol = 0.03;
    material.regularization = regularization;
    EXPECT_EQ(Written(oif_Material("M", material)), "*Material, name=M, strain rate regularization=LINEAR\n");
}

TEST(Material, RegularizationBehindALongName_DoesNotBreakTheLineOnPurpose) {
    kmaC_Material material;
    kmaC_Regularization regularization;
    regularization.rtol = 0.5;
    material.regularization = regularization;
    const std::string name(200, 'N');
    EXPECT_EQ(Written(oif_Material(name, material)), "*Material, name=" + name + ", rtol=0.5\n");
}

TEST(Material, AllOptions_StandInTheirOrder) {
    kmaC_Material m;
    m.acousticMedium = kmaC_AcousticMedium();
    m.capPlasticity = kmaC_CapPlasticity();
    m.castIronPlasticity = kmaC_CastIronPlasticity();
    m.clayPlasticity = kmaC_ClayPlasticity();
    m.concrete = kmaC_Concrete();
    m.concreteDamagedPlasticity = kmaC_ConcreteDamagedPlasticity();
    m.conductivity = kmaC_Conductivity();
    m.creep = kmaC_Creep();
    m.foam = kmaC_Foam();
    m.damping = kmaC_Damping();
    m.deformationPlasticity = kmaC_DeformationPlasticity();
    m.density = kmaC_Density();
    m.depvar = kmaC_Depvar();
    m.dielectric = kmaC_Dielectric();
    m.diffusivity = kmaC_Diffusivity();
    m.druckerPrager = kmaC_DruckerPrager();
    m.elastic = kmaC_Elastic();
    m.electricalConductivity = kmaC_ElectricalConductivity();
    m.eos = kmaC_Eos();
    m.expansion = kmaC_Expansion();
    m.thicknessBehavior = kmaC_ThicknessBehavior();
    m.transShearElastic = kmaC_TransShearElastic();
    m.membraneElastic = kmaC_MembraneElastic();
    m.gel = kmaC_Gel();
    m.heatGeneration = kmaC_HeatGeneration();
    m.hyperelastic = kmaC_Hyperelastic();
    m.hyperfoam = kmaC_Hyperfoam();
    m.hypoelastic = kmaC_Hypoelastic();
    m.inelasticHeatFraction = kmaC_InelasticHeatFraction();
    m.jouleHeatFraction = kmaC_JouleHeatFraction();
    m.latentHeat = kmaC_LatentHeat();
    m.mohrCoulomb = kmaC_MohrCoulomb();
    m.moistureSwelling = kmaC_MoistureSwelling();
    m.permeability = kmaC_Permeability();
    m.piezoelectric = kmaC_Piezoelectric();
    m.plastic = kmaC_Plastic();
    m.poreFluidExpansion = kmaC_PoreFluidExpansion();
    m.porousBulkModuli = kmaC_PorousBulkModuli();
    m.porousElastic = kmaC_PorousElastic();
    m.porousMetalPlasticity = kmaC_PorousMetalPlasticity();
    m.regularization = kmaC_Regularization();
    m.solubility = kmaC_Solubility();
    m.sorption = kmaC_Sorption();
    m.specificHeat = kmaC_SpecificHeat();
    m.swelling = kmaC_Swelling();
    m.userDefinedField = kmaC_UserDefinedField();
    m.userMaterial = kmaC_UserMaterial();
    m.userOutputVariables = kmaC_UserOutputVariables();
    m.viscoelastic = kmaC_Viscoelastic();
    m.viscous = kmaC_Viscous();
    EXPECT_EQ(Written(oif_Material("M", m)), "*Material, name=M\n"
                                             "*Acoustic Medium\n"
                                             "*Cap Plasticity\n"
                                             "*Clay Plasticity\n"
                                             "*Concrete\n"
                                             "*Conductivity\n"
                                             "*Creep\n"
                                             "*Damping\n"
                                             "*Deformation Plasticity\n"
                                             "*Density\n"
                                             "*Depvar\n      0,\n"
                                             "*Dielectric\n"
                                             "*Diffusivity\n"
                                             "*Drucker Prager\n"
                                             "*Elastic, moduli=LONG TERM\n"
                                             "*Electrical Conductivity\n"
                                             "*Eos, type=USUP\n"
                                             "*Expansion\n"
                                             "*Crushable Foam\n"
                                             "*Gel\n"
                                             "*Heat Generation\n"
                                             "*Hyperelastic, moduli=LONG TERM\n"
                                             "*Hyperfoam, moduli=LONG TERM\n"
                                             "*Hypoelastic\n"
                                             "*Inelastic Heat Fraction\n         0.9,\n"
                                             "*Joule Heat Fraction\n          1.,\n"
                                             "*Latent Heat\n"
                                             "*Moisture Swelling\n"
                                             "*Permeability, specific=0.\n"
                                             "*Piezoelectric\n"
                                             "*Plastic\n"
                                             "*Expansion, Pore Fluid\n"
                                             "*Porous Bulk Moduli\n"
                                             "*Porous Elastic\n"
                                             "*Porous Metal Plasticity\n"
                                             "*Solubility\n"
                                             "*Sorption\n"
                                             "*Specific Heat\n"
                                             "*Swelling\n"
                                             "*User Defined Field\n"
                                             "*User Material, constants=0\n"
                                             "*User Output Variables\n      0,\n"
                                             "*Viscoelastic, time=PRONY\n"
                                             "*Cast Iron Plasticity\n"
                                             "*Viscous\n"
                                             "*Mohr Coulomb\n"
                                             "*Concrete Damaged Plasticity\n");
    // A gasket behaviour holds seven of them, and knows no regularization.
    EXPECT_EQ(Written(oif_GasketBehavior("M", m)), "*Gasket behavior, name=M\n"
                                                   "*Creep\n"
                                                   "*Depvar\n      0,\n"
                                                   "*Expansion\n"
                                                   "*Gasket elasticity, component=MEMBRANE\n"
                                                   "*Gasket Thickness Behavior\n"
                                                   "*Gasket elasticity\n"
                                                   "*User Output Variables\n      0,\n");
}

TEST(Material, WithoutViscoelasticity_ElasticitiesTellNoModuli) {
    kmaC_Material m;
    m.elastic = kmaC_Elastic();
    m.hyperfoam = kmaC_Hyperfoam();
    EXPECT_EQ(Written(oif_Material("M", m)), "*Material, name=M\n*Elastic\n*Hyperfoam\n");
}

TEST(GasketBehavior, NameWithABlank_StaysBareOnPurpose) {
    EXPECT_EQ(Written(oif_GasketBehavior("Gasket, flat", kmaC_Material())),
              "*Gasket behavior, name=Gasket, flat\n");
}

TEST(MaterialBuilder, ModelWithoutMaterials_HasNoBanner) {
    TestStore store;
    EXPECT_EQ(Built(store), "");
}

TEST(MaterialBuilder, Materials_StandInByteOrderBelowOneBanner) {
    TestStore store;
    for (const char* name : {"b", "a", "B", "A10", "A2"}) store.model.materials.Insert(name, kmaC_Material());
    EXPECT_EQ(Built(store), kBanner + "*Material, name=A10\n*Material, name=A2\n*Material, name=B\n"
                                      "*Material, name=a\n*Material, name=b\n");
}

TEST(MaterialBuilder, GasketOptionsNamedByAGasketSection_MakeAGasketBehavior) {
    TestStore store;
    store.model.materials.Insert("RING", Gasket());
    AddGasketSection(store, "S", "RING");
    EXPECT_EQ(Built(store),
              kBanner + "*Gasket behavior, name=RING\n*Gasket elasticity, component=MEMBRANE\n");
}

TEST(MaterialBuilder, EachGasketOption_IsEnough) {
    for (const int option : {0, 1, 2}) {
        TestStore store;
        kmaC_Material material;
        if (option == 0) material.membraneElastic = kmaC_MembraneElastic();
        if (option == 1) material.thicknessBehavior = kmaC_ThicknessBehavior();
        if (option == 2) material.transShearElastic = kmaC_TransShearElastic();
        store.model.materials.Insert("RING", material);
        AddGasketSection(store, "S", "RING");
        EXPECT_EQ(Built(store).find(kBanner + "*Gasket behavior, name=RING\n"), 0u) << option;
    }
}

TEST(MaterialBuilder, GasketOptionsThatNoGasketSectionNames_AreDroppedOnPurpose) {
    TestStore store;
    store.model.materials.Insert("RING", Gasket());
    AddGasketSection(store, "S", "ring");
    EXPECT_EQ(Built(store), kBanner + "*Material, name=RING\n*Density\n");
}

TEST(MaterialBuilder, MaterialOfAGasketSectionWithoutGasketOptions_StaysAMaterial) {
    TestStore store;
    store.model.materials.Insert("RING", kmaC_Material());
    AddGasketSection(store, "S", "RING");
    EXPECT_EQ(Built(store), kBanner + "*Material, name=RING\n");
}

TEST(MaterialBuilder, GasketMaterialOfTwoSections_IsWrittenOnce) {
    TestStore store;
    store.model.materials.Insert("RING", Gasket());
    AddGasketSection(store, "S1", "OTHER");
    AddGasketSection(store, "S2", "RING");
    AddGasketSection(store, "S3", "RING");
    store.model.sections.Insert("S0", kseC_ConnectorSection());
    EXPECT_EQ(Built(store),
              kBanner + "*Gasket behavior, name=RING\n*Gasket elasticity, component=MEMBRANE\n");
}

TEST(MaterialBuilder, Keywords_OutliveChangesOfTheModel) {
    TestStore store;
    kmaC_Material material;
    material.density = kmaC_Density();
    store.model.materials.Insert("M", material);
    oif_MaterialBuilder builder(store.Info());
    builder.Build();
    store.model.materials.Get("M").density = mdl_ObjCow<kmaC_Density>();
    EXPECT_EQ(Written(builder.ModelDefinition()[1].ConstGet()), "*Material, name=M\n*Density\n");
}
