#include "materials/oif_Material.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialOption.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/sections/kseC_SolidSections.h"

#include <algorithm>

bool oif_HasGasketOptions(const kmaC_Material& material) {
    return std::ranges::any_of(oif_kGasketOptions, [&](std::string_view option) {
        const cls_Field& field = *material.DynFields().Find(option);
        return static_cast<const cls_HolderType&>(*field.type).Get(field.In(material)) != nullptr;
    });
}

std::set<cow_String> oif_MaterialsOfGaskets(const mdl_MapString2ObjCow<kseC_Section>& sections) {
    std::set<cow_String> names;
    for (const auto& [name, section] : sections) {
        const auto* gasket = nex_canDynamicCastPtr<kseC_GasketSection>(&section);
        if (gasket != nullptr) names.insert(gasket->materialName);
    }
    return names;
}

void oif_Material::Write(utl_Stream& stream) const {
    const kmaC_Material& m = material_;
    oif_KeywordLine line(stream, "*Material");
    line.Fixed(", name=", qkw_QuorixName(name_, false));
    if (!m.regularization.IsNull()) {
        const kmaC_Regularization& r = m.regularization.ConstGet();
        line.FixedUnless(", rtol=", r.rtol, r.rtolDef())
            .FixedUnless(", strain rate regularization=", r.strainRateRegularization,
                         r.strainRateRegularizationDef());
    }
    line.End();

    const bool hasViscoelastic = !m.viscoelastic.IsNull();
    oif_WriteOptions(stream, m.acousticMedium, m.capPlasticity, m.clayPlasticity, m.concrete, m.conductivity,
                     m.creep, m.damping, m.deformationPlasticity, m.density, m.depvar, m.dielectric,
                     m.diffusivity, m.druckerPrager);
    if (!m.elastic.IsNull()) oif_Elastic(m.elastic.ConstGet(), hasViscoelastic).Write(stream);
    oif_WriteOptions(stream, m.electricalConductivity, m.eos, m.expansion, m.foam, m.gel, m.heatGeneration);
    if (!m.hyperelastic.IsNull()) {
        oif_Hyperelastic(m.hyperelastic.ConstGet(), hasViscoelastic).Write(stream);
    }
    if (!m.hyperfoam.IsNull()) oif_Hyperfoam(m.hyperfoam.ConstGet(), hasViscoelastic).Write(stream);
    oif_WriteOptions(stream, m.hypoelastic, m.inelasticHeatFraction, m.jouleHeatFraction, m.latentHeat,
                     m.moistureSwelling, m.permeability, m.piezoelectric, m.plastic, m.poreFluidExpansion,
                     m.porousBulkModuli, m.porousElastic, m.porousMetalPlasticity, m.solubility, m.sorption,
                     m.specificHeat, m.swelling, m.userDefinedField, m.userMaterial, m.userOutputVariables);
    // Out of the alphabet from here on.
    oif_WriteOptions(stream, m.viscoelastic, m.castIronPlasticity, m.viscous, m.mohrCoulomb,
                     m.concreteDamagedPlasticity);
}

void oif_GasketBehavior::Write(utl_Stream& stream) const {
    const kmaC_Material& m = material_;
    // The name goes out bare here, whatever it holds.
    stream << "*Gasket behavior, name=" << name_ << endl;
    oif_WriteOptions(stream, m.creep, m.depvar, m.expansion, m.membraneElastic, m.thicknessBehavior,
                     m.transShearElastic, m.userOutputVariables);
}
