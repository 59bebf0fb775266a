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
            .Field<&R::directionality>("directionality", "2 means two coefficients per row")
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
                "formulation 1 and 4: friction coefficient (two of them for directionality 2), then "
                "temperature, contact pressure, slip rate as far as flagged, in this order, then field "
                "variables. Formulation 2, read row by row: static coefficient, kinetic coefficient, decay "
                "coefficient (time per length); or, for test data, static coefficient, second coefficient, "
                "its slip rate, kinetic coefficient. Formulation 5: one property per row, first column")
            .Field<&R::shearStressLimit>("shearStressLimit", "limit of the shear stress (stress)")
            .Field<&R::maximumElasticSlip>("maximumElasticSlip", "how the allowed elastic slip is given")
            .Meanings(maximumElasticSlipMeanings)
            .Field<&R::slipTolerance>("slipTolerance",
                                      "elastic slip as a fraction of the contact surface's size (no unit)")
            .Field<&R::elasticSlip>("elasticSlip", "elastic slip (length)")
            .Field<&R::elasticSlipStiffness>(
                "elasticSlipStiffness",
                "slope of shear traction against elastic slip (stress per length), explicit solver")
            .Field<&R::nStateDependentVars>("nStateDependentVars",
                                            "number of solution-dependent variables of a user friction")
            .Field<&R::useProperties>("useProperties", "a user friction has properties, in the table");
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
            .Field<&R::maxStiffness>(
                "maxStiffness",
                "limit of the stiffness of exponential contact (stress per length), explicit solver")
            .Field<&R::contactStiffness>(
                "contactStiffness",
                "stiffness (stress per length): penalty or linear contact; 0 means the solver's")
            .Field<&R::table>("table",
                              "columns contact pressure (stress), overclosure or clearance (length). "
                              "Exponential: two rows, the first (pressure at zero clearance, 0), the second "
                              "(0, clearance at zero pressure). Tabular: printed as it stands")
            .Field<&R::constraintEnforcementMethod>("constraintEnforcementMethod",
                                                    "how hard contact is enforced")
            .Meanings(constraintEnforcementMethodMeanings)
            .Field<&R::overclosureFactor>("overclosureFactor",
                                          "scale factor contact: overclosure as a fraction of the element "
                                          "size (no unit); written if above 0")
            .Field<&R::overclosureMeasure>("overclosureMeasure",
                                           "scale factor contact: overclosure (length); written if above 0")
            .Field<&R::contactStiffnessScaleFactor>("contactStiffnessScaleFactor",
                                                    "factor on the contact stiffness (no unit)")
            .Field<&R::initialStiffnessScaleFactor>("initialStiffnessScaleFactor",
                                                    "factor on the initial contact stiffness (no unit)")
            .Field<&R::clearanceAtZeroContactPressure>(
                "clearanceAtZeroContactPressure", "clearance at which the contact pressure is zero (length)");
    return fields;
}

const cls_FieldTable& kinC_Damping::Fields() {
    using R = kinC_Damping;
    static constexpr cls_IntMeaning definitionMeanings[] = {
        {0, "step: row 1"}, {1, "linear: rows 1 and 2"}, {2, "bilinear: rows 1 to 3"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::definition>("definition",
                                   "shape of damping against clearance; how many rows of the table count")
            .Meanings(definitionMeanings)
            .Field<&R::tangentFraction>(
                "tangentFraction",
                "tangential damping as a fraction of the normal one (no unit), explicit solver")
            .Field<&R::table>(
                "table", "two columns: damping coefficient or critical damping fraction; clearance (length). "
                         "Row 1 first column: the damping at zero clearance; definition 1: row 2 second "
                         "column is the clearance of zero damping; definition 2: row 2 second column is the "
                         "clearance where damping starts to fall, row 3 second column that of zero damping");
    return fields;
}

const cls_FieldTable& kinC_ThermalConductance::Fields() {
    using R = kinC_ThermalConductance;
    static constexpr cls_IntMeaning definitionMeanings[] = {{0, "tabular"}, {1, "user"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::definition>("definition",
                                   "where the conductance comes from; any other value writes nothing")
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
                                 "temperature if flagged, mass flow rate if flagged, then field variables");
    return fields;
}

const cls_FieldTable& kinC_HeatGeneration::Fields() {
    using R = kinC_HeatGeneration;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::heatFraction>("heatFraction",
                                     "fraction of the dissipated work that becomes heat (no unit)")
            .Field<&R::distributionFraction>("distributionFraction",
                                             "fraction of the heat that goes to the slave surface (no unit)");
    return fields;
}

const cls_FieldTable& kinC_Radiation::Fields() {
    using R = kinC_Radiation;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::firstEmissivity>("firstEmissivity",
                                        "emissivity of the master surface (no unit); written second")
            .Field<&R::secondEmissivity>("secondEmissivity",
                                         "emissivity of the slave surface (no unit); written first")
            .Field<&R::table>("table", "effective view factor (no unit), gap (length)");
    return fields;
}

const cls_FieldTable& kinC_GeometricProperties::Fields() {
    using R = kinC_GeometricProperties;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::contactArea>(
                "contactArea",
                "contact area of a node or out-of-plane thickness (area or length), implicit solver")
            .Field<&R::padThickness>("padThickness",
                                     "thickness of a layer between the surfaces (length), explicit solver");
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
            .Field<&R::geometricProperties>("geometricProperties", "contact area and pad thickness");
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
