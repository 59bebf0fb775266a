#ifndef QRX_OIF_MATERIALOPTION_H
#define QRX_OIF_MATERIALOPTION_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/materials/kmaC_Material.h"

/// Writes the keyword of an option, with its data lines and sub-options; what it looks like is told by the
/// row of the record's class. A class without a row raises.
void oif_WriteOption(utl_Stream& stream, const kmaC_MaterialOption& option);

template <class R>
void oif_WriteOption(utl_Stream& stream, const mdl_ObjCow<R>& option) {
    if (!option.IsNull()) oif_WriteOption(stream, option.ConstGet());
}
/// Writes those of the options that are there, in this order.
template <class... R>
void oif_WriteOptions([[maybe_unused]] utl_Stream& stream, const mdl_ObjCow<R>&... options) {
    (oif_WriteOption(stream, options), ...);
}

/// A material option: the keyword of records of class R.
template <class R>
class oif_MaterialOption final : public qkw_KeywordOf<oif_MaterialOption<R>> {
public:
    explicit oif_MaterialOption(const R& option) : option_(option) {}
    void Write(utl_Stream& stream) const override { oif_WriteOption(stream, option_); }

private:
    R option_;
};

using oif_AcousticBulkModulus = oif_MaterialOption<kmaC_AcousticBulkModulus>;
using oif_AcousticMedium = oif_MaterialOption<kmaC_AcousticMedium>;
using oif_AcousticVolumetricDrag = oif_MaterialOption<kmaC_AcousticVolumetricDrag>;
using oif_AnnealTemperature = oif_MaterialOption<kmaC_AnnealTemperature>;
using oif_BiaxialTestData = oif_MaterialOption<kmaC_BiaxialTestData>;
using oif_BrittleCracking = oif_MaterialOption<kmaC_BrittleCracking>;
using oif_BrittleShear = oif_MaterialOption<kmaC_BrittleShear>;
using oif_BulkFailure = oif_MaterialOption<kmaC_BulkFailure>;
using oif_CapCreepCohesion = oif_MaterialOption<kmaC_CapCreepCohesion>;
using oif_CapCreepConsolidation = oif_MaterialOption<kmaC_CapCreepConsolidation>;
using oif_CapHardening = oif_MaterialOption<kmaC_CapHardening>;
using oif_CapPlasticity = oif_MaterialOption<kmaC_CapPlasticity>;
using oif_CastIronCompHard = oif_MaterialOption<kmaC_CastIronCompHard>;
using oif_CastIronPlasticity = oif_MaterialOption<kmaC_CastIronPlasticity>;
using oif_CastIronTensHard = oif_MaterialOption<kmaC_CastIronTensHard>;
using oif_ClayHardening = oif_MaterialOption<kmaC_ClayHardening>;
using oif_ClayPlasticity = oif_MaterialOption<kmaC_ClayPlasticity>;
using oif_CombinedTestData = oif_MaterialOption<kmaC_CombinedTestData>;
using oif_Concrete = oif_MaterialOption<kmaC_Concrete>;
using oif_ConcreteCompressionDamage = oif_MaterialOption<kmaC_ConcreteCompressionDamage>;
using oif_ConcreteCompressionHardening = oif_MaterialOption<kmaC_ConcreteCompressionHardening>;
using oif_ConcreteDamagedPlasticity = oif_MaterialOption<kmaC_ConcreteDamagedPlasticity>;
using oif_ConcreteTensionDamage = oif_MaterialOption<kmaC_ConcreteTensionDamage>;
using oif_ConcreteTensionStiffening = oif_MaterialOption<kmaC_ConcreteTensionStiffening>;
using oif_Conductivity = oif_MaterialOption<kmaC_Conductivity>;
using oif_Creep = oif_MaterialOption<kmaC_Creep>;
using oif_CycledPlastic = oif_MaterialOption<kmaC_CycledPlastic>;
using oif_CyclicHardening = oif_MaterialOption<kmaC_CyclicHardening>;
using oif_Damping = oif_MaterialOption<kmaC_Damping>;
using oif_DeformationPlasticity = oif_MaterialOption<kmaC_DeformationPlasticity>;
using oif_Density = oif_MaterialOption<kmaC_Density>;
using oif_Depvar = oif_MaterialOption<kmaC_Depvar>;
using oif_DetonationPoint = oif_MaterialOption<kmaC_DetonationPoint>;
using oif_Dielectric = oif_MaterialOption<kmaC_Dielectric>;
using oif_Diffusivity = oif_MaterialOption<kmaC_Diffusivity>;
using oif_DruckerPrager = oif_MaterialOption<kmaC_DruckerPrager>;
using oif_DruckerPragerCreep = oif_MaterialOption<kmaC_DruckerPragerCreep>;
using oif_DruckerPragerHardening = oif_MaterialOption<kmaC_DruckerPragerHardening>;
using oif_ElectricalConductivity = oif_MaterialOption<kmaC_ElectricalConductivity>;
using oif_Eos = oif_MaterialOption<kmaC_Eos>;
using oif_Expansion = oif_MaterialOption<kmaC_Expansion>;
using oif_FailStrain = oif_MaterialOption<kmaC_FailStrain>;
using oif_FailStress = oif_MaterialOption<kmaC_FailStress>;
using oif_FailureRatios = oif_MaterialOption<kmaC_FailureRatios>;
using oif_FirstDirection = oif_MaterialOption<kmaC_FirstDirection>;
using oif_FluidBulkModulus = oif_MaterialOption<kmaC_FluidBulkModulus>;
using oif_FluidDensity = oif_MaterialOption<kmaC_FluidDensity>;
using oif_FluidExpansion = oif_MaterialOption<kmaC_FluidExpansion>;
using oif_Foam = oif_MaterialOption<kmaC_Foam>;
using oif_FoamHardening = oif_MaterialOption<kmaC_FoamHardening>;
using oif_GasketContactArea = oif_MaterialOption<kmaC_ContactArea>;
using oif_GasketThicknessBehavior = oif_MaterialOption<kmaC_ThicknessBehavior>;
using oif_Gel = oif_MaterialOption<kmaC_Gel>;
using oif_HeatGeneration = oif_MaterialOption<kmaC_HeatGeneration>;
using oif_Hypoelastic = oif_MaterialOption<kmaC_Hypoelastic>;
using oif_Hysteresis = oif_MaterialOption<kmaC_Hysteresis>;
using oif_InelasticHeatFraction = oif_MaterialOption<kmaC_InelasticHeatFraction>;
using oif_JointShearRetention = oif_MaterialOption<kmaC_JointShearRetention>;
using oif_JointedMaterial = oif_MaterialOption<kmaC_JointedMaterial>;
using oif_JouleHeatFraction = oif_MaterialOption<kmaC_JouleHeatFraction>;
using oif_LatentHeat = oif_MaterialOption<kmaC_LatentHeat>;
using oif_MohrCoulomb = oif_MaterialOption<kmaC_MohrCoulomb>;
using oif_MohrCoulombHardening = oif_MaterialOption<kmaC_MohrCoulombHardening>;
using oif_MoistureSwelling = oif_MaterialOption<kmaC_MoistureSwelling>;
using oif_Ornl = oif_MaterialOption<kmaC_Ornl>;
using oif_Permeability = oif_MaterialOption<kmaC_Permeability>;
using oif_Piezoelectric = oif_MaterialOption<kmaC_Piezoelectric>;
using oif_PlanarTestData = oif_MaterialOption<kmaC_PlanarTestData>;
using oif_Plastic = oif_MaterialOption<kmaC_Plastic>;
using oif_PoreFluidExpansion = oif_MaterialOption<kmaC_PoreFluidExpansion>;
using oif_PorousBulkModuli = oif_MaterialOption<kmaC_PorousBulkModuli>;
using oif_PorousElastic = oif_MaterialOption<kmaC_PorousElastic>;
using oif_PorousFailureCriteria = oif_MaterialOption<kmaC_PorousFailureCriteria>;
using oif_PorousMetalPlasticity = oif_MaterialOption<kmaC_PorousMetalPlasticity>;
using oif_Potential = oif_MaterialOption<kmaC_Potential>;
using oif_PressureEffect = oif_MaterialOption<kmaC_PressureEffect>;
using oif_RateDependent = oif_MaterialOption<kmaC_RateDependent>;
using oif_Ratios = oif_MaterialOption<kmaC_Ratios>;
using oif_SaturationDependence = oif_MaterialOption<kmaC_SaturationDependence>;
using oif_SecondDirection = oif_MaterialOption<kmaC_SecondDirection>;
using oif_ShearRetention = oif_MaterialOption<kmaC_ShearRetention>;
using oif_ShearTestData = oif_MaterialOption<kmaC_ShearTestData>;
using oif_SimpleShearTestData = oif_MaterialOption<kmaC_SimpleShearTestData>;
using oif_Solubility = oif_MaterialOption<kmaC_Solubility>;
using oif_SoretEffect = oif_MaterialOption<kmaC_SoretEffect>;
using oif_Sorption = oif_MaterialOption<kmaC_Sorption>;
using oif_SpecificHeat = oif_MaterialOption<kmaC_SpecificHeat>;
using oif_Swelling = oif_MaterialOption<kmaC_Swelling>;
using oif_TensionStiffening = oif_MaterialOption<kmaC_TensionStiffening>;
using oif_ThirdDirection = oif_MaterialOption<kmaC_ThirdDirection>;
using oif_TriaxialTestData = oif_MaterialOption<kmaC_TriaxialTestData>;
using oif_Trs = oif_MaterialOption<kmaC_Trs>;
using oif_UniaxialTestData = oif_MaterialOption<kmaC_UniaxialTestData>;
using oif_UserDefinedField = oif_MaterialOption<kmaC_UserDefinedField>;
using oif_UserMaterial = oif_MaterialOption<kmaC_UserMaterial>;
using oif_UserOutputVariables = oif_MaterialOption<kmaC_UserOutputVariables>;
using oif_VelocityDependence = oif_MaterialOption<kmaC_VelocityDependence>;
using oif_Viscoelastic = oif_MaterialOption<kmaC_Viscoelastic>;
using oif_Viscous = oif_MaterialOption<kmaC_Viscous>;
using oif_VoidNucleation = oif_MaterialOption<kmaC_VoidNucleation>;
using oif_VolumetricTestData = oif_MaterialOption<kmaC_VolumetricTestData>;

// What stands beside viscoelasticity tells whether its constants are long-term or instantaneous.
void oif_WriteElasticity(utl_Stream& stream, const kmaC_Elastic& option, bool hasViscoelastic);
void oif_WriteElasticity(utl_Stream& stream, const kmaC_Hyperelastic& option, bool hasViscoelastic);
void oif_WriteElasticity(utl_Stream& stream, const kmaC_Hyperfoam& option, bool hasViscoelastic);

/// The elasticity of a material that may be viscoelastic as well.
template <class R>
class oif_ElasticityOption final : public qkw_KeywordOf<oif_ElasticityOption<R>> {
public:
    oif_ElasticityOption(const R& option, bool hasViscoelastic)
        : option_(option), hasViscoelastic_(hasViscoelastic) {}
    void Write(utl_Stream& stream) const override { oif_WriteElasticity(stream, option_, hasViscoelastic_); }

private:
    R option_;
    bool hasViscoelastic_;
};

using oif_Elastic = oif_ElasticityOption<kmaC_Elastic>;
using oif_Hyperelastic = oif_ElasticityOption<kmaC_Hyperelastic>;
using oif_Hyperfoam = oif_ElasticityOption<kmaC_Hyperfoam>;

/// The membrane or the transverse shear stiffness of a gasket.
class oif_GasketElasticity final : public qkw_KeywordOf<oif_GasketElasticity> {
public:
    explicit oif_GasketElasticity(const kmaC_MembraneElastic& option) : option_(option) {}
    explicit oif_GasketElasticity(const kmaC_TransShearElastic& option) : option_(option) {}
    void Write(utl_Stream& stream) const override { oif_WriteOption(stream, option_.ConstGet()); }

private:
    mdl_ObjCow<kmaC_MaterialOption> option_;
};

#endif
