#ifndef QRX_STORE_KMAC_MATERIAL_H
#define QRX_STORE_KMAC_MATERIAL_H

#include "store_interface/records/materials/kmaC_ConcreteOptions.h"
#include "store_interface/records/materials/kmaC_ElasticOptions.h"
#include "store_interface/records/materials/kmaC_FluidOptions.h"
#include "store_interface/records/materials/kmaC_GasketOptions.h"
#include "store_interface/records/materials/kmaC_GeneralOptions.h"
#include "store_interface/records/materials/kmaC_HyperelasticOptions.h"
#include "store_interface/records/materials/kmaC_PlasticOptions.h"
#include "store_interface/records/materials/kmaC_PorousOptions.h"
#include "store_interface/records/materials/kmaC_SoilOptions.h"
#include "store_interface/records/materials/kmaC_ThermalOptions.h"

class cls_ClassRegistrar;

/// One material of the model, held by name.
class kmaC_Material final : public cls_RecordOf<kmaC_Material> {
public:
    static constexpr cls_ClassInfo Class{
        "kmaC_Material",
        "One material of the model, held by name. Each option is there or absent; the order in the deck is "
        "not the order of these members. An option without fields is written {}."};

    mdl_ObjCow<kmaC_AcousticMedium> acousticMedium;
    mdl_ObjCow<kmaC_CapPlasticity> capPlasticity;
    mdl_ObjCow<kmaC_CastIronPlasticity> castIronPlasticity;
    mdl_ObjCow<kmaC_ClayPlasticity> clayPlasticity;
    mdl_ObjCow<kmaC_Concrete> concrete;
    mdl_ObjCow<kmaC_ConcreteDamagedPlasticity> concreteDamagedPlasticity;
    mdl_ObjCow<kmaC_Conductivity> conductivity;
    mdl_ObjCow<kmaC_Creep> creep;
    mdl_ObjCow<kmaC_Foam> foam;
    mdl_ObjCow<kmaC_Damping> damping;
    mdl_ObjCow<kmaC_DeformationPlasticity> deformationPlasticity;
    mdl_ObjCow<kmaC_Density> density;
    mdl_ObjCow<kmaC_Depvar> depvar;
    mdl_ObjCow<kmaC_Dielectric> dielectric;
    mdl_ObjCow<kmaC_Diffusivity> diffusivity;
    mdl_ObjCow<kmaC_DruckerPrager> druckerPrager;
    mdl_ObjCow<kmaC_Elastic> elastic;
    mdl_ObjCow<kmaC_ElectricalConductivity> electricalConductivity;
    mdl_ObjCow<kmaC_Eos> eos;
    mdl_ObjCow<kmaC_Expansion> expansion;
    mdl_ObjCow<kmaC_ThicknessBehavior> thicknessBehavior;
    mdl_ObjCow<kmaC_TransShearElastic> transShearElastic;
    mdl_ObjCow<kmaC_MembraneElastic> membraneElastic;
    mdl_ObjCow<kmaC_Gel> gel;
    mdl_ObjCow<kmaC_HeatGeneration> heatGeneration;
    mdl_ObjCow<kmaC_Hyperelastic> hyperelastic;
    mdl_ObjCow<kmaC_Hyperfoam> hyperfoam;
    mdl_ObjCow<kmaC_Hypoelastic> hypoelastic;
    mdl_ObjCow<kmaC_InelasticHeatFraction> inelasticHeatFraction;
    mdl_ObjCow<kmaC_JouleHeatFraction> jouleHeatFraction;
    mdl_ObjCow<kmaC_LatentHeat> latentHeat;
    mdl_ObjCow<kmaC_MohrCoulomb> mohrCoulomb;
    mdl_ObjCow<kmaC_MoistureSwelling> moistureSwelling;
    mdl_ObjCow<kmaC_Permeability> permeability;
    mdl_ObjCow<kmaC_Piezoelectric> piezoelectric;
    mdl_ObjCow<kmaC_Plastic> plastic;
    mdl_ObjCow<kmaC_PoreFluidExpansion> poreFluidExpansion;
    mdl_ObjCow<kmaC_PorousBulkModuli> porousBulkModuli;
    mdl_ObjCow<kmaC_PorousElastic> porousElastic;
    mdl_ObjCow<kmaC_PorousMetalPlasticity> porousMetalPlasticity;
    mdl_ObjCow<kmaC_Regularization> regularization;
    mdl_ObjCow<kmaC_Solubility> solubility;
    mdl_ObjCow<kmaC_Sorption> sorption;
    mdl_ObjCow<kmaC_SpecificHeat> specificHeat;
    mdl_ObjCow<kmaC_Swelling> swelling;
    mdl_ObjCow<kmaC_UserDefinedField> userDefinedField;
    mdl_ObjCow<kmaC_UserMaterial> userMaterial;
    mdl_ObjCow<kmaC_UserOutputVariables> userOutputVariables;
    mdl_ObjCow<kmaC_Viscoelastic> viscoelastic;
    mdl_ObjCow<kmaC_Viscous> viscous;

    static const cls_FieldTable& Fields();
};

void cls_RegisterMaterialRecords(cls_ClassRegistrar& registrar);

#endif
