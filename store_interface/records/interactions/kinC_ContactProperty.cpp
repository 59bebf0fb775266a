#include "store_interface/records/interactions/kinC_ContactProperty.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const cls_FieldTable& kinC_TangentialBehavior::Fields() {
    using R = kinC_TangentialBehavior;
    static constexpr cls_IntMeaning formulationMeanings[] = {{0, "frictionless"},      {1, "penalty"},
                                                             {2, "exponential decay"}, {3, "rough"},
                                                             {4, "Lagrange"},          {5, "user"}};
    static constexpr cls_IntMeaning directionalityMeanings[] = {{1, "isotropic (any value but 2)"},
                                                                {2, "anisotropic"}};
    static constexpr cls_IntMeaning exponentialDecayDefinitionMeanings[] = {{0, "coefficients"},
                                                                            {1, "test data"}};
    static constexpr cls_IntMeaning maximumElasticSlipMeanings[] = {{0, "slip tolerance"},
                                                                    {1, "absolute elastic slip"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::formulation>("formulation", "friction law")
            .Meanings(formulationMeanings)
            .Field<&R::directionality>("directionality",
                                       "whether a row has one coefficient or, anisotropic, two")
            .Meanings(directionalityMeanings)
            .Field<&R::temperatureDependency>("temperatureDependency", "the table has a temperature column")
            .Field<&R::pressureDependency>("pressureDependency", "the table has a contact pressure column")
            .Field<&R::slipRateDependency>("slipRateDependency", "the table has a slip rate column")
            .Field<&R::dependencies>("dependencies", "number of field variable columns")
            .Field<&R::exponentialDecayDefinition>("exponentialDecayDefinition",
                                                   "form of the exponential decay data")
            .Meanings(exponentialDecayDefinitionMeanings)
            .Field<&R::table>(
                "table",
                "columns: penalty and Lagrange: friction coefficient (two of them where anisotropic), then "
                "temperature, contact pressure, slip rate as far as flagged, in this order, then field "
                "variables; exponential decay, read row by row: static coefficient, kinetic coefficient, "
                "decay coefficient (time/length), or, for test data, static coefficient, second coefficient, "
                "its slip rate, kinetic coefficient; user: one property per row, first column")
            .Field<&R::shearStressLimit>("shearStressLimit", "limit of the shear stress")
            .Unit("stress")
            .Field<&R::maximumElasticSlip>("maximumElasticSlip", "how the allowed elastic slip is given")
            .Meanings(maximumElasticSlipMeanings)
            .Field<&R::slipTolerance>("slipTolerance",
                                      "elastic slip as a fraction of the contact surface's size")
            .Unit("no unit")
            .Field<&R::elasticSlip>("elasticSlip", "elastic slip")
            .Unit("length")
            .Field<&R::elasticSlipStiffness>("elasticSlipStiffness",
                                             "slope of shear traction against elastic slip, explicit solver")
            .Unit("stress/length")
            .Field<&R::nStateDependentVars>("nStateDependentVars",
                                            "number of solution-dependent variables of a user friction")
            .Field<&R::useProperties>("useProperties", "a user friction has properties, in the table")
            .Example(R"({"formulation": "penalty", "table": [[0.2]]})");
    return fields;
}

const cls_FieldTable& kinC_NormalBehavior::Fields() {
    using R = kinC_NormalBehavior;
    static constexpr cls_IntMeaning pressureOverclosureMeanings[] = {
        {0, "HARD"}, {1, "EXPONENTIAL"}, {2, "LINEAR"}, {3, "TABULAR"}, {4, "SCALE FACTOR"}};
    static constexpr cls_IntMeaning allowSeparationMeanings[] = {
        {0, "no separation (with pressureOverclosure 0)"}, {1, "separation allowed (any value but 0)"}};
    static constexpr cls_IntMeaning constraintEnforcementMethodMeanings[] = {
        {0, "default"}, {1, "augmented Lagrange"}, {2, "penalty"}, {3, "direct"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::pressureOverclosure>("pressureOverclosure", "kind of relation")
            .Meanings(pressureOverclosureMeanings)
            .Field<&R::allowSeparation>("allowSeparation", "whether surfaces may part again")
            .Meanings(allowSeparationMeanings)
            .Field<&R::maxStiffness>("maxStiffness",
                                     "limit of the stiffness of exponential contact, explicit solver")
            .Unit("stress/length")
            .Field<&R::contactStiffness>("contactStiffness",
                                         "stiffness of penalty or linear contact; zero means the solver's")
            .Unit("stress/length")
            .Field<&R::table>("table",
                              "columns contact pressure (stress), overclosure or clearance (length). "
                              "Exponential: two rows, the first (pressure at zero clearance, 0), the second "
                              "(0, clearance at zero pressure). Tabular: printed as it stands")
            .Field<&R::constraintEnforcementMethod>("constraintEnforcementMethod",
                                                    "how hard contact is enforced")
            .Meanings(constraintEnforcementMethodMeanings)
            .Field<&R::overclosureFactor>(
                "overclosureFactor",
                "scale factor contact: overclosure as a fraction of the element size; written if above 0")
            .Unit("no unit")
            .Field<&R::overclosureMeasure>("overclosureMeasure",
                                           "scale factor contact: overclosure; written if above 0")
            .Unit("length")
            .Field<&R::contactStiffnessScaleFactor>("contactStiffnessScaleFactor",
                                                    "factor on the contact stiffness")
            .Unit("no unit")
            .Field<&R::initialStiffnessScaleFactor>("initialStiffnessScaleFactor",
                                                    "factor on the initial contact stiffness")
            .Unit("no unit")
            .Field<&R::clearanceAtZeroContactPressure>("clearanceAtZeroContactPressure",
                                                       "clearance at which the contact pressure is zero")
            .Unit("length")
            .Example(R"({"pressureOverclosure": "HARD"})");
    return fields;
}

const cls_FieldTable& kinC_Damping::Fields() {
    using R = kinC_Damping;
    static constexpr cls_IntMeaning definitionMeanings[] = {
        {0, "step: row 1"}, {1, "linear: rows 1 and 2"}, {2, "bilinear: rows 1 to 3"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::definition>(
                "definition", "shape of damping against clearance, and so how many rows of the table count")
            .Meanings(definitionMeanings)
            .Field<&R::tangentFraction>("tangentFraction",
                                        "tangential damping as a fraction of the normal one, explicit solver")
            .Unit("no unit")
            .Field<&R::table>("table",
                              "columns: damping coefficient or critical damping fraction, clearance "
                              "(length); the first row has the damping at zero clearance; linear: the second "
                              "the clearance of zero damping; bilinear: the second the clearance where "
                              "damping starts to fall, the third that of zero damping")
            .Example(R"({"table": [[0.1, 0]]})");
    return fields;
}

const cls_FieldTable& kinC_ThermalConductance::Fields() {
    using R = kinC_ThermalConductance;
    static constexpr cls_IntMeaning definitionMeanings[] = {{0, "tabular"}, {1, "user"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::definition>("definition", "where the conductance comes from")
            .Meanings(definitionMeanings)
            .Field<&R::clearanceDependency>("clearanceDependency", "the clearance table is used")
            .Field<&R::pressureDependency>("pressureDependency", "the pressure table is used")
            .Field<&R::temperatureDependency>("temperatureDependency",
                                              "clearance table: it has a temperature column")
            .Field<&R::massFlowRateDependency>("massFlowRateDependency",
                                               "clearance table: it has a mass flow rate column")
            .Field<&R::dependencies>("dependencies", "clearance table: number of field variable columns")
            .Field<&R::clearanceTable>(
                "clearanceTable", "conductance (power per area and temperature), clearance (length), "
                                  "temperature if flagged, mass flow rate if flagged, then field variables")
            .Field<&R::pressureTableTemperatureDependency>("pressureTableTemperatureDependency",
                                                           "pressure table: it has a temperature column")
            .Field<&R::pressureTableMassFlowRateDependency>("pressureTableMassFlowRateDependency",
                                                            "pressure table: it has a mass flow rate column")
            .Field<&R::pressureTableDependencies>("pressureTableDependencies",
                                                  "pressure table: number of field variable columns")
            .Field<&R::pressureTable>(
                "pressureTable", "conductance (power per area and temperature), contact pressure (stress), "
                                 "temperature if flagged, mass flow rate if flagged, then field variables")
            .Example(R"({"clearanceDependency": true, "clearanceTable": [[10, 0], [0, 0.1]]})");
    return fields;
}

const cls_FieldTable& kinC_HeatGeneration::Fields() {
    using R = kinC_HeatGeneration;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::heatFraction>("heatFraction", "fraction of the dissipated work that becomes heat")
            .Unit("no unit")
            .Field<&R::distributionFraction>("distributionFraction",
                                             "fraction of the heat that goes to the slave surface")
            .Unit("no unit")
            .Example(R"({"heatFraction": 1, "distributionFraction": 0.5})");
    return fields;
}

const cls_FieldTable& kinC_Radiation::Fields() {
    using R = kinC_Radiation;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::firstEmissivity>("firstEmissivity", "emissivity of the master surface; written second")
            .Unit("no unit")
            .Field<&R::secondEmissivity>("secondEmissivity", "emissivity of the slave surface; written first")
            .Unit("no unit")
            .Field<&R::table>("table", "effective view factor (no unit), gap (length)")
            .Example(R"({"firstEmissivity": 0.8, "secondEmissivity": 0.8, "table": [[1, 0], [0, 10]]})");
    return fields;
}

const cls_FieldTable& kinC_GeometricProperties::Fields() {
    using R = kinC_GeometricProperties;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::contactArea>(
                "contactArea", "contact area of a node or out-of-plane thickness, of the implicit solver")
            .Unit("length^2 or length")
            .Field<&R::padThickness>("padThickness",
                                     "thickness of a layer between the surfaces, explicit solver")
            .Unit("length")
            .Example(R"({"contactArea": 1})");
    return fields;
}

const cls_FieldTable& kinC_ContactProperty::Fields() {
    using R = kinC_ContactProperty;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::tangentialBehavior>("tangentialBehavior", "friction")
            .Field<&R::normalBehavior>("normalBehavior", "pressure against overclosure")
            .Field<&R::damping>("damping", "damping of the approach")
            .Field<&R::thermalConductance>("thermalConductance", "heat conduction across the gap")
            .Field<&R::heatGeneration>("heatGeneration", "share of dissipated work that becomes heat")
            .Field<&R::radiation>("radiation", "radiation across the gap")
            .Field<&R::geometricProperties>("geometricProperties", "contact area and pad thickness")
            .Example(R"({"tangentialBehavior": {"formulation": "penalty", "table": [[0.2]]}})");
    return fields;
}

void cls_RegisterContactPropertyRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_TangentialBehavior>();
    registrar.Add<kinC_NormalBehavior>();
    registrar.Add<kinC_Damping>();
    registrar.Add<kinC_ThermalConductance>();
    registrar.Add<kinC_HeatGeneration>();
    registrar.Add<kinC_Radiation>();
    registrar.Add<kinC_GeometricProperties>();
    registrar.Add<kinC_ContactProperty>();
}
