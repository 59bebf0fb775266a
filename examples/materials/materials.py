"""Thirty materials in N, mm, t, s, degrees Celsius, each with the options that are usual for it.

usage: materials.py [DECK.inp]
"""

import sys

import qrx


def model() -> qrx.Model:
    m = qrx.Model(heading=None)


    m.materials["ABS"] = qrx.Material(
        density=1.05e-09,
        elastic=qrx.Elastic(temperature_dependency=True, table=[[2300, 0.37, 23], [1900, 0.38, 60]]),
        plastic=[[35, 0], [42, 0.05], [44.5, 0.2]],
    )
    m.materials["Adhesive-EP"] = qrx.Material(
        density=1.2e-09, elastic=qrx.Elastic(type="TRACTION", table=[[2500, 900, 900]]),
    )
    m.materials["Air"] = qrx.Material(
        acoustic_medium=qrx.AcousticMedium(
            table=[[0.142]], volumetric_drag=True, volumetric_drag_table=[[1e-12, 100]],
        ),
        density=1.204e-12,
    )
    m.materials["Al-6061-T6"] = qrx.Material(
        conductivity=qrx.Conductivity(temperature_dependency=True, table=[[167, 25], [177, 200]]),
        density=2.7e-09,
        elastic=qrx.Elastic(temperature_dependency=True, table=[[68900, 0.33, 25], [63000, 0.33, 200]]),
        expansion=qrx.Expansion(
            zero=20, temperature_dependency=True, table=[[2.36e-05, 25], [2.52e-05, 200]],
        ),
        plastic=qrx.Plastic(
            hardening="JOHNSON_COOK", table=[[324, 114, 0.42, 1.34, 652, 25]],
            rate_dependent=qrx.RateDependent(type="JOHNSON_COOK", table=[[0.002, 1]]),
        ),
        specific_heat=896000000.0,
    )
    m.materials["Balsa"] = qrx.Material(
        density=1.5e-10,
        elastic=qrx.Elastic(
            type="ENGINEERING_CONSTANTS", table=[[3400, 160, 51, 0.23, 0.49, 0.66, 180, 125, 17]],
        ),
    )
    m.materials["Brake-lining"] = qrx.Material(
        conductivity=0.9, density=1.95e-09, elastic=qrx.Elastic(no_tension=True, table=[[1200, 0.25]]),
        specific_heat=1200000000.0,
    )
    m.materials["CFRP-UD"] = qrx.Material(
        conductivity=qrx.Conductivity(type="ORTHOTROPIC", table=[[6.5, 0.72, 0.72]]), density=1.58e-09,
        elastic=qrx.Elastic(
            type="LAMINA", table=[[138000, 9000, 0.3, 5100, 5100, 3200]],
            fail_stress=[[2280, -1440, 57, -228, 71, 0, 0]],
        ),
        expansion=qrx.Expansion(type="ORTHOTROPIC", table=[[-9e-07, 2.7e-05, 2.7e-05]]),
    )
    m.materials["Clay-soft"] = qrx.Material(
        clay_plasticity=qrx.ClayPlasticity(intercept=1.92, table=[[0.174, 1, 0.058, 1, 1]]), density=1.7e-09,
        permeability=qrx.Permeability(specific_weight=9.81e-06, table=[[2e-06, 1.1]]),
        porous_elastic=[[0.026, 0.3, 0]],
    )
    m.materials["Concrete-C30"] = qrx.Material(
        concrete_damaged_plasticity=qrx.ConcreteDamagedPlasticity(
            table=[[36, 0.1, 1.16, 0.667, 0.0001]],
            concrete_compression_hardening=[[15.2, 0], [38, 0.0013], [20, 0.0042]],
            concrete_tension_stiffening=[[2.9, 0], [0.6, 0.001]],
            concrete_compression_damage=[[0, 0], [0.45, 0.0042]],
            concrete_tension_damage=qrx.ConcreteTensionDamage(
                compression_recovery=0.9, table=[[0, 0], [0.8, 0.001]],
            ),
        ),
        density=2.4e-09, elastic=[[33000, 0.2]],
    )
    m.materials["Copper-OF"] = qrx.Material(
        conductivity=391, density=8.94e-09, elastic=[[117000, 0.34]],
        electrical_conductivity=qrx.ElectricalConductivity(
            temperature_dependency=True, table=[[58000, 20], [44000, 100]],
        ),
        joule_heat_fraction=qrx.JouleHeatFraction(), specific_heat=385000000.0,
    )
    m.materials["Cork"] = qrx.Material(
        density=1.8e-10, hyperfoam=qrx.Hyperfoam(n=2, table=[[0.6, 7.4, 0.02, -4.6, 0, 0]]),
    )
    m.materials["Foam-PU60"] = qrx.Material(
        foam=qrx.Foam(
            table=[[1.1, 0.1]], foam_hardening=[[0.42, 0], [0.46, 0.4], [1.1, 1.2]],
            rate_dependent=qrx.RateDependent(type="YIELD_RATIO", table=[[1, 0], [1.25, 100]]),
        ),
        density=6e-11, elastic=[[16, 0]],
    )
    m.materials["GG-25"] = qrx.Material(
        cast_iron_plasticity=qrx.CastIronPlasticity(
            table=[[0.04]], cast_iron_comp_hard=[[340, 0], [600, 0.01]],
            cast_iron_tens_hard=[[105, 0], [210, 0.005]],
        ),
        density=7.2e-09, elastic=[[113000, 0.26]],
    )
    m.materials["Gasket-MLS"] = qrx.Material(
        thickness_behavior=qrx.ThicknessBehavior(
            type="DAMAGE", yield_onset=0.2, table=[[0, 0], [80, 0.08], [220, 0.15]],
            unloading_table=[[0, 0.03, 0.08], [80, 0.08, 0.08], [0, 0.07, 0.15], [220, 0.15, 0.15]],
        ),
        trans_shear_elastic=35, membrane_elastic=[[190000, 0.3]],
    )
    m.materials["Glass-float"] = qrx.Material(
        conductivity=1, density=2.5e-09, elastic=[[70000, 0.23]], expansion=9e-06,
    )
    m.materials["Granite"] = qrx.Material(
        density=2.65e-09, elastic=[[52000, 0.25]],
        mohr_coulomb=qrx.MohrCoulomb(table=[[50, 12]], mohr_coulomb_hardening=[[18, 0], [9, 0.02]]),
    )
    m.materials["Inconel-718"] = qrx.Material(
        creep=qrx.Creep(law="HYPERBOLIC_SINE", table=[[32000000000.0, 0.002, 5.5, 460000, 8.314]]),
        density=8.19e-09,
        elastic=qrx.Elastic(temperature_dependency=True, table=[[200000, 0.29, 20], [163000, 0.31, 700]]),
        plastic=qrx.Plastic(
            temperature_dependency=True, table=[[1030, 0, 20], [1240, 0.1, 20], [860, 0, 700]],
        ),
    )
    m.materials["NBR-70"] = qrx.Material(
        density=1.3e-09,
        hyperelastic=qrx.Hyperelastic(
            type="MARLOW", test_data=True, volumetric_response="POISSON_RATIO", poisson=0.495,
            uniaxial_test_data=[[-3.6, -0.3], [0, 0], [2.15, 0.3], [4.8, 1]],
        ),
        viscoelastic=[[0.2, 0, 0.05], [0.15, 0, 2]],
    )
    m.materials["NR-50"] = qrx.Material(
        density=1.1e-09, hyperelastic=qrx.Hyperelastic(type="MOONEY_RIVLIN", table=[[0.32, 0.08, 0.001]]),
    )
    m.materials["PA66-GF30"] = qrx.Material(
        density=1.37e-09, elastic=qrx.Elastic(dependencies=1, table=[[9800, 0.35, 0], [7200, 0.38, 2.5]]),
        moisture_swelling=[[0, 0], [0.012, 2.5]],
    )
    m.materials["PZT-5H"] = qrx.Material(
        density=7.5e-09,
        dielectric=qrx.Dielectric(type="ORTHOTROPIC", table=[[1.505e-11, 1.505e-11, 1.301e-11]]),
        elastic=qrx.Elastic(
            type="ORTHOTROPIC", table=[[127205, 80212, 127205, 84670, 84670, 117436, 23474, 22988, 22988]],
        ),
        piezoelectric=[
            [0, 0, 0, 0, 1.7e-05, 0, 0, 0, 0, 0, 0, 1.7e-05, -6.6e-06, -6.6e-06, 2.3e-05, 0, 0, 0],
        ],
    )
    m.materials["S235"] = qrx.Material(
        conductivity=qrx.Conductivity(temperature_dependency=True, table=[[54, 20], [40, 500]]),
        density=7.85e-09, elastic=[[210000, 0.3]], expansion=qrx.Expansion(zero=20, table=[[1.2e-05]]),
        inelastic_heat_fraction=qrx.InelasticHeatFraction(), latent_heat=[[247000000000.0, 1450, 1520]],
        plastic=qrx.Plastic(
            rate_dependent_table=True,
            table=[[235, 0, 0], [360, 0.2, 0], [265, 0, 0.1], [390, 0.2, 0.1], [310, 0, 10], [430, 0.2, 10]],
        ),
        specific_heat=461000000.0,
    )
    m.materials["S355-cyclic"] = qrx.Material(
        density=7.85e-09, elastic=[[206000, 0.3]],
        plastic=qrx.Plastic(
            hardening="COMBINED", data_type="PARAMETERS", num_backstresses=2,
            table=[[290, 36000, 300, 4200, 25]],
            cyclic_hardening=qrx.CyclicHardening(parameters=True, table=[[290, 45, 5]]),
        ),
    )
    m.materials["Sand-dense"] = qrx.Material(
        density=1.9e-09,
        drucker_prager=qrx.DruckerPrager(
            table=[[51.7, 0.78, 22]], drucker_prager_hardening=[[0.02, 0], [0.05, 0.04]],
        ),
        elastic=[[80, 0.3]],
    )
    m.materials["Silicone"] = qrx.Material(
        density=1.15e-09,
        hyperelastic=qrx.Hyperelastic(
            type="OGDEN", n=2, test_data=True, biaxial_test_data=[[0.3, 0.2], [0.62, 0.5]],
            uniaxial_test_data=qrx.UniaxialTestData(smoothing=3, table=[[0.2, 0.2], [0.45, 0.5]]),
        ),
    )
    m.materials["Sintered-Fe"] = qrx.Material(
        density=7e-09, elastic=[[150000, 0.28]], plastic=[[280, 0], [420, 0.1]],
        porous_metal_plasticity=qrx.PorousMetalPlasticity(
            relative_density=0.92, table=[[1.5, 1, 2.25]],
            porous_failure_criteria=qrx.PorousFailureCriteria(failure_fraction=0.25, critical_fraction=0.2),
            void_nucleation=[[0.3, 0.1, 0.04]],
        ),
    )
    m.materials["TNT"] = qrx.Material(
        density=1.63e-09,
        eos=qrx.Eos(
            type="JWL", table=[[6930000.0, 373800, 3747, 0.35, 4.15, 0.9, 0]],
            detonation_point=[[0, 0, 250, 0]],
        ),
    )
    m.materials["Ti-6Al-4V"] = qrx.Material(
        damping=qrx.Damping(beta=1e-06), density=4.43e-09, elastic=[[113800, 0.342]],
        plastic=qrx.Plastic(table=[[880, 0], [950, 0.05]], potential=[[1, 1, 1.05, 1, 1, 1]]),
    )
    m.materials["User steel"] = qrx.Material(
        density=7.85e-09, depvar=qrx.Depvar(num_variables=13),
        user_material=qrx.UserMaterial(
            mechanical_constants=[210000, 0.3, 235, 1200, 0.12, 8.8, 250, 1400, 0.9, 3],
        ),
        user_output_variables=qrx.UserOutputVariables(num_variables=3),
    )
    m.materials["Water"] = qrx.Material(
        density=9.98e-10, eos=[[1483000.0, 0, 0]], regularization=qrx.Regularization(rtol=0.05),
    )

    m.sections["Head gasket"] = qrx.GasketSection(material="Gasket-MLS")

    return m


if __name__ == "__main__":
    model().write(sys.argv[1] if len(sys.argv) > 1 else "materials.inp")
