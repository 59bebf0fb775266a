#include "materials/oif_MaterialOption.h"

#include "foundation/nex_Exception.h"
#include "materials/oif_SpecialOptions.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <iterator>

namespace {

/// How the options of one record class are written.
struct Row {
    unsigned typeId;
    const char* keyword;
    void (*write)(utl_Stream& stream, const char* keyword, const kmaC_MaterialOption& option);
};

constexpr auto kNothing = [](auto&, const auto&) {};

/// The usual option: the keyword, "dependencies=" and further parameters, the data lines, sub-options in
/// order. `parameters` writes on an oif_OptionLine; `data` changes the table further, or writes the data
/// lines of an option that has no table.
template <class R, auto... SubOptions, class Parameters = decltype(kNothing), class Data = decltype(kNothing)>
constexpr Row Option(const char* keyword, Parameters = {}, Data = {}) {
    const auto write = [](utl_Stream& stream, const char* theKeyword, const kmaC_MaterialOption& record) {
        const R& option = static_cast<const R&>(record);
        oif_OptionLine line(stream, theKeyword);
        if constexpr (requires { option.dependencies; }) line.Dependencies(option.dependencies);
        Parameters()(line, option);
        line.End();
        if constexpr (requires { option.temperatureDependency; }) {
            oif_MaterialTable table = oif_DependentTable(option);
            Data()(table, option);
            stream << table;
        } else if constexpr (requires { option.table; }) {
            oif_MaterialTable table = oif_PlainTable(option.table);
            Data()(table, option);
            stream << table;
        } else {
            Data()(stream, option);
        }
        oif_WriteOptions(stream, option.*SubOptions...);
    };
    return {R::Class.Id(), keyword, write};
}

template <class R>
constexpr Row Special(const char* keyword) {
    return {R::Class.Id(), keyword,
            [](utl_Stream& stream, const char* theKeyword, const kmaC_MaterialOption& record) {
                oif_WriteSpecial(stream, theKeyword, static_cast<const R&>(record));
            }};
}

constexpr auto kDirection = [](auto& line, const auto& o) { line.Direction(o.type); };
constexpr auto kLaw = [](auto& line, const auto& o) { line.BreakingUnless("law=", o.law, o.lawDef()); };
constexpr auto kType = [](auto& line, const auto& o) { line.BreakingUnless("type=", o.type, o.typeDef()); };
constexpr auto kHardening = [](auto& line, const auto& o) {
    line.BreakingUnless("hardening=", o.hardening, o.hardeningDef());
};
constexpr auto kZero = [](auto& line, const auto& o) { line.BreakingUnless("zero=", o.zero, o.zeroDef()); };
/// Without rates, what follows keeps its place behind a blank column.
constexpr auto kRateColumn = [](auto& table, const auto& o) {
    if (!o.rateGiven) oif_KeepDependentColumns(table, o);
};
/// Of a table of two columns the third stays away, since none is ever added at the end.
constexpr auto kThirdColumnBlank = [](auto& table, const auto&) { table.InsertEmptyColumn(2); };
constexpr auto kCountLine = [](auto& stream, const auto& o) {
    stream.Print(o.numVariables, 7);
    stream << ",";
    stream.LineBreak();
};
constexpr auto kFractionLine = [](auto& stream, const auto& o) {
    stream.Print(o.fraction, 12, 6);
    stream << ",";
    stream.LineBreak();
};

// In some keywords words are run together or capitals are uneven, and two effects share "*Kappa": that is how
// the deck has them.
constexpr Row kMaterialRows[] = {
    Option<kmaC_AcousticBulkModulus>("*Acoustic Bulk Modulus"),
    Special<kmaC_AcousticMedium>("*Acoustic Medium"),
    Option<kmaC_AcousticVolumetricDrag>("*Acoustic Volumetric Drag"),
    Option<kmaC_AnnealTemperature>("*Anneal Temperature"),
    Special<kmaC_BiaxialTestData>("*Biaxial Test Data"),
    Option<kmaC_BrittleCracking, &kmaC_BrittleCracking::brittleShear>("*Brittle Cracking", kType),
    Option<kmaC_BrittleShear>("*Brittle Shear",
                              [](auto& line, const auto& o) {
                                  // For any other number the separator stands alone.
                                  if (o.type == o.typeDef()) return;
                                  line.Separator();
                                  if (static_cast<int>(o.type) == 1) line.Text("type=POWERLAW");
                              }),
    Option<kmaC_BulkFailure>("*Bulk Failure"),
    Option<kmaC_CapCreepCohesion>("*Cap Creep",
                                  [](auto& line, const auto& o) {
                                      kLaw(line, o);
                                      line.Breaking("mechanism=COHESION");
                                  }),
    Option<kmaC_CapCreepConsolidation>("*Cap Creep",
                                       [](auto& line, const auto& o) {
                                           kLaw(line, o);
                                           line.Breaking("mechanism=CONSOLIDATION");
                                       }),
    Option<kmaC_CapHardening>("*Cap Hardening"),
    Option<kmaC_CapPlasticity, &kmaC_CapPlasticity::capCreepCohesion,
           &kmaC_CapPlasticity::capCreepConsolidation, &kmaC_CapPlasticity::capHardening>("*Cap Plasticity"),
    Option<kmaC_CastIronCompHard>("*Cast Iron Compression Hardening", kNothing, kThirdColumnBlank),
    Option<kmaC_CastIronPlasticity, &kmaC_CastIronPlasticity::castIronCompHard,
           &kmaC_CastIronPlasticity::castIronTensHard>("*Cast Iron Plasticity"),
    Option<kmaC_CastIronTensHard>("*Cast Iron Tension Hardening", kNothing, kThirdColumnBlank),
    Option<kmaC_ClayHardening>("*Clay Hardening"),
    Special<kmaC_ClayPlasticity>("*Clay Plasticity"),
    Option<kmaC_CombinedTestData>("*Combined Test Data",
                                  [](auto& line, const auto& o) {
                                      line.BreakingUnless("shrinf=", o.shrinf, o.shrinfDef())
                                          .BreakingUnless("volinf=", o.volinf, o.volinfDef());
                                  }),
    Option<kmaC_Concrete, &kmaC_Concrete::failureRatios, &kmaC_Concrete::shearRetention,
           &kmaC_Concrete::tensionStiffening>("*Concrete"),
    Option<kmaC_ConcreteCompressionDamage>("*Concrete Compression Damage",
                                           [](auto& line, const auto& o) {
                                               line.BreakingUnless("tension recovery=", o.tensionRecovery,
                                                                   o.tensionRecoveryDef());
                                           }),
    Option<kmaC_ConcreteCompressionHardening>("*Concrete Compression Hardening", kNothing, kRateColumn),
    Option<kmaC_ConcreteDamagedPlasticity, &kmaC_ConcreteDamagedPlasticity::concreteCompressionHardening,
           &kmaC_ConcreteDamagedPlasticity::concreteTensionStiffening,
           &kmaC_ConcreteDamagedPlasticity::concreteCompressionDamage,
           &kmaC_ConcreteDamagedPlasticity::concreteTensionDamage>("*Concrete Damaged Plasticity"),
    Option<kmaC_ConcreteTensionDamage>("*Concrete Tension Damage",
                                       [](auto& line, const auto& o) {
                                           kType(line, o);
                                           line.BreakingUnless("compression recovery=", o.compressionRecovery,
                                                               o.compressionRecoveryDef());
                                       }),
    Option<kmaC_ConcreteTensionStiffening>("*Concrete Tension Stiffening", kType, kRateColumn),
    Option<kmaC_Conductivity>("*Conductivity", kDirection),
    Special<kmaC_ContactArea>("*Gasket contact area"),
    Option<kmaC_Creep, &kmaC_Creep::ornl, &kmaC_Creep::potential>(
        "*Creep",
        [](auto& line, const auto& o) {
            if (o.law == kmaC_Creep::LawEnm::HYPERBOLIC_SINE) {
                line.Breaking("law=HYPERB");
            } else {
                kLaw(line, o);
            }
        }),
    Option<kmaC_CycledPlastic>("*Cycled Plastic"),
    Option<kmaC_CyclicHardening>(
        "*Cyclic Hardening", [](auto& line, const auto& o) { line.BreakingIf(o.parameters, "parameters"); }),
    Option<kmaC_Damping>("*Damping",
                         [](auto& line, const auto& o) {
                             line.BreakingUnless("alpha=", o.alpha, o.alphaDef())
                                 .BreakingUnless("beta=", o.beta, o.betaDef())
                                 .BreakingUnless("composite=", o.composite, o.compositeDef());
                         }),
    Option<kmaC_DeformationPlasticity>("*Deformation Plasticity"),
    Option<kmaC_Density>("*Density"),
    Option<kmaC_Depvar>(
        "*Depvar",
        [](auto& line, const auto& o) { line.BreakingUnless("delete=", o.deleteVar, o.deleteVarDef()); },
        kCountLine),
    Option<kmaC_DetonationPoint>("*DetonationPoint"),
    Option<kmaC_Dielectric>("*Dielectric", kDirection),
    Option<kmaC_Diffusivity, &kmaC_Diffusivity::soretEffect, &kmaC_Diffusivity::pressureEffect>(
        "*Diffusivity",
        [](auto& line, const auto& o) {
            kLaw(line, o);
            kDirection(line, o);
        }),
    Special<kmaC_DruckerPrager>("*Drucker Prager"),
    Option<kmaC_DruckerPragerCreep>("*Drucker Prager Creep", kLaw),
    Special<kmaC_DruckerPragerHardening>("*Drucker Prager Hardening"),
    Option<kmaC_ElectricalConductivity>("*Electrical Conductivity", kDirection),
    Option<kmaC_Eos, &kmaC_Eos::detonationPoint>(
        "*Eos", [](auto& line, const auto& o) { line.Breaking("type=", o.type); },
        [](auto& table, const auto& o) {
            if (o.type == kmaC_Eos::TypeEnm::JWL) table.InsertEmptyColumn(o.table.NumColumns() - 1);
        }),
    Option<kmaC_Expansion>("*Expansion",
                           [](auto& line, const auto& o) {
                               kDirection(line, o);
                               if (o.user) line.Text(", user");
                               kZero(line, o);
                           }),
    Option<kmaC_FailStrain>("*Fail Strain"),
    Option<kmaC_FailStress>("*Fail Stress"),
    Option<kmaC_FailureRatios>("*Failure Ratios"),
    Option<kmaC_FirstDirection>("*First Direction"),
    Option<kmaC_FluidBulkModulus>("*Fluid Bulk Modulus"),
    Option<kmaC_FluidDensity>("*Fluid Density",
                              [](auto& line, const auto& o) {
                                  line.BreakingUnless("temperature=", o.temperature, o.temperatureDef())
                                      .BreakingUnless("pressure=", o.pressure, o.pressureDef());
                              }),
    Option<kmaC_FluidExpansion>("*Fluid Expansion", kZero),
    Option<kmaC_Foam, &kmaC_Foam::foamHardening, &kmaC_Foam::rateDependent>("*Crushable Foam", kHardening),
    Option<kmaC_FoamHardening>("*Crushable Foam Hardening"),
    Option<kmaC_Gel>("*Gel"),
    Option<kmaC_HeatGeneration>("*Heat Generation"),
    Option<kmaC_Hypoelastic>("*Hypoelastic",
                             [](auto& line, const auto& o) { line.BreakingIf(o.user, "user"); }),
    Option<kmaC_Hysteresis>("*Hysteresis"),
    Option<kmaC_InelasticHeatFraction>("*Inelastic Heat Fraction", kNothing, kFractionLine),
    Option<kmaC_JointShearRetention>("*ShearRetention"),
    Option<kmaC_JointedMaterial, &kmaC_JointedMaterial::bulkFailure, &kmaC_JointedMaterial::firstDirection,
           &kmaC_JointedMaterial::secondDirection, &kmaC_JointedMaterial::thirdDirection,
           &kmaC_JointedMaterial::jointShearRetention>("*Jointed Material"),
    Option<kmaC_JouleHeatFraction>("*Joule Heat Fraction", kNothing, kFractionLine),
    Option<kmaC_LatentHeat>("*Latent Heat"),
    Special<kmaC_MembraneElastic>("*Gasket elasticity"),
    Option<kmaC_MohrCoulomb,
           &kmaC_MohrCoulomb::mohrCoulombHardening>("*Mohr Coulomb",
                                                    [](auto& line, const auto& o) {
                                                        // The blank ahead of the equals sign belongs to both
                                                        // names.
                                                        line.BreakingUnless("deviatoric Eccentricity =",
                                                                            o.deviatoricEccentricity,
                                                                            o.deviatoricEccentricityDef())
                                                            .BreakingUnless(
                                                                "eccentricity =", o.meridionalEccentricity,
                                                                o.meridionalEccentricityDef());
                                                    }),
    Option<kmaC_MohrCoulombHardening>("*Mohr Coulomb Hardening"),
    Option<kmaC_MoistureSwelling, &kmaC_MoistureSwelling::ratios>("*Moisture Swelling"),
    Option<kmaC_Ornl>("*Ornl",
                      [](auto& line, const auto& o) {
                          line.BreakingUnless("a=", o.a, o.aDef())
                              .BreakingUnless("h=", o.h, o.hDef())
                              .BreakingIf(o.reset, "reset");
                      }),
    Option<kmaC_Permeability, &kmaC_Permeability::saturationDependence,
           &kmaC_Permeability::velocityDependence>("*Permeability",
                                                   [](auto& line, const auto& o) {
                                                       line.Breaking("specific=", o.specificWeight);
                                                       kType(line, o);
                                                   }),
    Option<kmaC_Piezoelectric>("*Piezoelectric",
                               [](auto& line, const auto& o) {
                                   if (o.type == o.typeDef()) return;
                                   // Any number but 0 leaves the parameter without a word.
                                   line.Breaking("type=");
                                   if (o.type == kmaC_Piezoelectric::TypeEnm::STRAIN) line.Text("E");
                               }),
    Special<kmaC_PlanarTestData>("*Planar Test Data"),
    Special<kmaC_Plastic>("*Plastic"),
    Option<kmaC_PoreFluidExpansion>("*Expansion, Pore Fluid", kZero),
    Option<kmaC_PorousBulkModuli>("*Porous Bulk Moduli"),
    Option<kmaC_PorousElastic>(
        "*Porous Elastic",
        [](auto& line, const auto& o) { line.BreakingUnless("shear=", o.shear, o.shearDef()); }),
    Option<kmaC_PorousFailureCriteria>("*Porous Failure Criteria", kNothing,
                                       [](auto& stream, const auto& o) {
                                           stream.Print(o.failureFraction, 12, 6);
                                           stream << ", ";
                                           stream.Print(o.criticalFraction, 12, 6);
                                           stream.LineBreak();
                                       }),
    Option<kmaC_PorousMetalPlasticity, &kmaC_PorousMetalPlasticity::porousFailureCriteria,
           &kmaC_PorousMetalPlasticity::voidNucleation>("*Porous Metal Plasticity",
                                                        [](auto& line, const auto& o) {
                                                            line.BreakingUnless(
                                                                "relative density=", o.relativeDensity,
                                                                o.relativeDensityDef());
                                                        }),
    Option<kmaC_Potential>("*Potential"),
    Option<kmaC_PressureEffect>("*Kappa", [](auto& line, const auto&) { line.Breaking("type=PRESS"); }),
    Option<kmaC_RateDependent>("*Rate Dependent",
                               [](auto& line, const auto& o) {
                                   using Type = kmaC_RateDependent::TypeEnm;
                                   line.BreakingIf(o.type == Type::YIELD_RATIO, "type=YIELD RATIO")
                                       .BreakingIf(o.type == Type::JOHNSON_COOK, "type=JOHNSON COOK");
                               }),
    Option<kmaC_Ratios>("*Ratios"),
    Option<kmaC_SaturationDependence>("*Permeability, Type=SATURATION"),
    Option<kmaC_SecondDirection>("*Second Direction"),
    Option<kmaC_ShearRetention>("*Shear Retention"),
    Option<kmaC_ShearTestData>(
        "*Shear Test Data",
        [](auto& line, const auto& o) { line.BreakingUnless("shrinf=", o.shrinf, o.shrinfDef()); }),
    Option<kmaC_SimpleShearTestData>("*Simple Shear Test Data"),
    Option<kmaC_Solubility>("*Solubility"),
    Option<kmaC_SoretEffect>("*Kappa"),
    Special<kmaC_Sorption>("*Sorption"),
    Option<kmaC_SpecificHeat>("*Specific Heat"),
    Option<kmaC_Swelling, &kmaC_Swelling::ratios>("*Swelling", kLaw),
    Option<kmaC_TensionStiffening>("*Tension Stiffening", kType),
    Special<kmaC_ThicknessBehavior>("*Gasket Thickness Behavior"),
    Option<kmaC_ThirdDirection>("*Third Direction"),
    Special<kmaC_TransShearElastic>("*Gasket elasticity"),
    Option<kmaC_TriaxialTestData>("*Triaxial Test Data",
                                  [](auto& line, const auto& o) {
                                      line.BreakingUnless("a=", o.a, o.aDef())
                                          .BreakingUnless("b=", o.b, o.bDef())
                                          .BreakingUnless("pt=", o.pt, o.ptDef());
                                  }),
    Option<kmaC_Trs>("*Trs",
                     [](auto& line, const auto& o) {
                         line.BreakingUnless("definition=", o.definition, o.definitionDef());
                     }),
    Special<kmaC_UniaxialTestData>("*Uniaxial Test Data"),
    Option<kmaC_UserDefinedField>("*User Defined Field"),
    Special<kmaC_UserMaterial>("*User Material"),
    Option<kmaC_UserOutputVariables>("*User Output Variables", kNothing, kCountLine),
    Option<kmaC_VelocityDependence>("*Permeability, Type=VELOCITY"),
    Special<kmaC_Viscoelastic>("*Viscoelastic"),
    Option<kmaC_Viscous>("*Viscous",
                         [](auto& line, const auto& o) {
                             using Law = kmaC_Viscous::LawEnm;
                             if (o.law == Law::STRAIN) return;
                             line.Breaking(o.law == Law::TIME ? "law=TIME" : "law=USER");
                         }),
    Option<kmaC_VoidNucleation>("*Void Nucleation"),
    Special<kmaC_VolumetricTestData>("*Volumetric Test Data"),
};

} // namespace

void oif_WriteOption(utl_Stream& stream, const kmaC_MaterialOption& option) {
    const unsigned typeId = option.DynTypeId();
    const Row* row = std::find_if(std::begin(kMaterialRows), std::end(kMaterialRows),
                                  [&](const Row& r) { return r.typeId == typeId; });
    if (row == std::end(kMaterialRows)) {
        const cow_String text = cow_String("oif_WriteOption: no keyword for ") + cls_Classes().NameOf(typeId);
        nex_Raise(atr_String(text.View()));
    }
    row->write(stream, row->keyword, option);
}
