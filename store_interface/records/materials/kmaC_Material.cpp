#include "store_interface/records/materials/kmaC_Material.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kmaC_Material::Fields() {
    using R = kmaC_Material;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::acousticMedium>("acousticMedium", "acoustic fluid: bulk modulus and volumetric drag")
            .Field<&R::capPlasticity>("capPlasticity", "modified cap plasticity of soils")
            .Field<&R::castIronPlasticity>("castIronPlasticity", "plasticity of gray cast iron")
            .Field<&R::clayPlasticity>("clayPlasticity", "critical state plasticity of clay")
            .Field<&R::concrete>("concrete", "smeared crack concrete")
            .Field<&R::concreteDamagedPlasticity>("concreteDamagedPlasticity",
                                                  "damaged plasticity of concrete")
            .Field<&R::conductivity>("conductivity", "thermal conductivity")
            .Field<&R::creep>("creep", "creep law; also written for a gasket")
            .Field<&R::foam>("foam", "crushable foam plasticity")
            .Field<&R::damping>("damping", "material damping")
            .Field<&R::deformationPlasticity>("deformationPlasticity", "deformation theory plasticity")
            .Field<&R::density>("density", "mass density")
            .Field<&R::depvar>("depvar", "solution-dependent state variables; also written for a gasket")
            .Field<&R::dielectric>("dielectric", "dielectric constants")
            .Field<&R::diffusivity>("diffusivity", "mass diffusivity")
            .Field<&R::druckerPrager>("druckerPrager", "extended pressure-dependent plasticity")
            .Field<&R::elastic>("elastic", "linear elasticity")
            .Field<&R::electricalConductivity>("electricalConductivity", "electrical conductivity")
            .Field<&R::eos>("eos", "equation of state")
            .Field<&R::expansion>("expansion", "thermal expansion; also written for a gasket")
            .Field<&R::thicknessBehavior>(
                "thicknessBehavior", "gasket: behaviour through the thickness; makes the material a gasket "
                                     "behaviour when a gasket section uses it, else left out of the deck")
            .Field<&R::transShearElastic>(
                "transShearElastic", "gasket: transverse shear stiffness; makes the material a gasket "
                                     "behaviour when a gasket section uses it, else left out of the deck")
            .Field<&R::membraneElastic>("membraneElastic",
                                        "gasket: membrane stiffness; makes the material a gasket behaviour "
                                        "when a gasket section uses it, else left out of the deck")
            .Field<&R::gel>("gel", "swelling gel in a porous medium")
            .Field<&R::heatGeneration>("heatGeneration", "volumetric heat from a user subroutine")
            .Field<&R::hyperelastic>("hyperelastic", "elasticity of rubber")
            .Field<&R::hyperfoam>("hyperfoam", "elasticity of compressible foam")
            .Field<&R::hypoelastic>("hypoelastic", "rate form elasticity")
            .Field<&R::inelasticHeatFraction>("inelasticHeatFraction",
                                              "part of the inelastic work that becomes heat")
            .Field<&R::jouleHeatFraction>("jouleHeatFraction",
                                          "part of the electrical energy that becomes heat")
            .Field<&R::latentHeat>("latentHeat", "latent heat of phase changes")
            .Field<&R::mohrCoulomb>("mohrCoulomb", "plasticity with a friction and a dilation angle")
            .Field<&R::moistureSwelling>("moistureSwelling", "swelling by moisture")
            .Field<&R::permeability>("permeability", "permeability to a pore fluid")
            .Field<&R::piezoelectric>("piezoelectric", "piezoelectric coupling")
            .Field<&R::plastic>("plastic", "metal plasticity")
            .Field<&R::poreFluidExpansion>("poreFluidExpansion", "thermal expansion of the pore fluid")
            .Field<&R::porousBulkModuli>("porousBulkModuli", "bulk moduli of grains and pore fluid")
            .Field<&R::porousElastic>("porousElastic", "porous elasticity")
            .Field<&R::porousMetalPlasticity>("porousMetalPlasticity", "plasticity of metal with voids")
            .Field<&R::regularization>(
                "regularization",
                "regularization of tabular data; parameters of the '*Material' line, ignored for a gasket")
            .Field<&R::solubility>("solubility", "solubility of a diffusing substance")
            .Field<&R::sorption>("sorption", "absorption and exsorption of a wetting liquid")
            .Field<&R::specificHeat>("specificHeat", "specific heat")
            .Field<&R::swelling>("swelling", "volumetric swelling rate")
            .Field<&R::userDefinedField>("userDefinedField", "field variables from a user subroutine")
            .Field<&R::userMaterial>("userMaterial", "constants of a user-written material model")
            .Field<&R::userOutputVariables>(
                "userOutputVariables", "number of user-defined output variables; also written for a gasket")
            .Field<&R::viscoelastic>(
                "viscoelastic",
                "linear viscoelasticity; adds 'moduli=' to elastic, hyperelastic and hyperfoam")
            .Field<&R::viscous>("viscous", "viscous part of a two-layer model")
            .Example(R"({"density": {"table": [[7.85e-9]]}, "elastic": {"table": [[210000, 0.3]]}})");
    return fields;
}

void cls_RegisterMaterialRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kmaC_MaterialOption>();
    cls_RegisterGeneralOptionRecords(registrar);
    cls_RegisterElasticOptionRecords(registrar);
    cls_RegisterHyperelasticOptionRecords(registrar);
    cls_RegisterPlasticOptionRecords(registrar);
    cls_RegisterSoilOptionRecords(registrar);
    cls_RegisterConcreteOptionRecords(registrar);
    cls_RegisterThermalOptionRecords(registrar);
    cls_RegisterPorousOptionRecords(registrar);
    cls_RegisterFluidOptionRecords(registrar);
    cls_RegisterGasketOptionRecords(registrar);
    registrar.Add<kmaC_Material>();
}
