#include "interactions/oif_ContactProperty.h"

#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialTable.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

// The numbers of the records' int fields.
enum Formulation { FRICTIONLESS = 0, PENALTY = 1, EXPONENTIAL_DECAY = 2, ROUGH = 3, LAGRANGE = 4, USER = 5 };
enum Overclosure { HARD = 0, EXPONENTIAL = 1, LINEAR = 2, TABULAR = 3, SCALE_FACTOR = 4 };

using Table = cow_2DArray<double>;

bool HasCell(const Table& table, int row, int column) {
    return row < table.NumRows() && column < table.NumColumns();
}

double CellOrZero(const Table& table, int row, int column) {
    return HasCell(table, row, column) ? table.ConstGet(row, column) : 0.0;
}

oif_MaterialTable Columns(const Table& table) {
    return {table, 0, false};
}

} // namespace

void oif_SurfaceInteraction::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Surface Interaction")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .FixedIf(product_ == kprC_AnalysisProductEnm::EXPLICIT && padThickness_ != cls_UnsetDouble,
                 ", pad thickness=", padThickness_)
        .End();
    if (product_ == kprC_AnalysisProductEnm::IMPLICIT) stream << contactArea_ << "," << endl;
}

const kinC_ContactProperty* oif_ContactPropertyKeyword::ContactProperty() const {
    return nex_canDynamicCastPtr<kinC_ContactProperty>(property_.Referent());
}

void oif_Friction::Write(utl_Stream& stream) const {
    if (ContactProperty() == nullptr) nex_Raise("Unimplemented *Friction print");
    const auto* friction = Behavior<&kinC_ContactProperty::tangentialBehavior>();
    oif_KeywordLine line(stream, "*Friction");
    if (friction == nullptr || friction->formulation == FRICTIONLESS) {
        line.End();
        stream << 0.0 << "," << endl;
        return;
    }
    AddParameters(line, *friction);
    line.End();
    WriteData(stream, *friction);
}

void oif_Friction::AddParameters(oif_KeywordLine& line, const kinC_TangentialBehavior& friction) const {
    const bool penalty = friction.formulation == PENALTY;
    const bool decay = friction.formulation == EXPONENTIAL_DECAY;
    const bool lagrange = friction.formulation == LAGRANGE;
    const bool user = friction.formulation == USER;
    const bool limitsSlip = penalty || decay;
    line.FixedIf(IsImplicit() && limitsSlip && friction.maximumElasticSlip == 1,
                 ", elastic slip=", friction.elasticSlip)
        .FixedIf(IsImplicit() && lagrange, ", lagrange")
        .FixedIf(friction.formulation == ROUGH, ", rough")
        .FixedIf(IsImplicit() && limitsSlip && friction.maximumElasticSlip == 0,
                 ", slip tolerance=", friction.slipTolerance)
        .FixedIf(user, ", user")
        .FixedIf(IsImplicit() && (penalty || lagrange) && friction.directionality == 2, ", anisotropic")
        .FixedIf((penalty || (IsImplicit() && lagrange)) && friction.dependencies > 0,
                 ", dependencies=", friction.dependencies)
        .FixedIf(user, ", depvar=", friction.nStateDependentVars)
        .FixedIf(decay, ", exponential decay")
        .FixedIf(user && friction.useProperties, ", properties=", friction.table.NumRows())
        .FixedIf(IsExplicit() && limitsSlip && friction.elasticSlipStiffness != cls_UnsetDouble,
                 ", shear traction slope=", friction.elasticSlipStiffness)
        .FixedIf((penalty || lagrange) && friction.shearStressLimit != cls_UnsetDouble,
                 ", taumax=", friction.shearStressLimit)
        .FixedIf(decay && friction.exponentialDecayDefinition == 1, ", test data");
}

void oif_Friction::WriteData(utl_Stream& stream, const kinC_TangentialBehavior& friction) const {
    const Table& table = friction.table;
    if (friction.formulation == PENALTY || (IsImplicit() && friction.formulation == LAGRANGE)) {
        oif_MaterialTable columns = Columns(table);
        int column = friction.directionality == 2 ? 2 : 1;
        for (const bool given :
             {friction.temperatureDependency, friction.pressureDependency, friction.slipRateDependency}) {
            if (!given) columns.InsertEmptyColumn(column);
            ++column;
        }
        stream << columns;
    } else if (friction.formulation == EXPONENTIAL_DECAY) {
        if (friction.exponentialDecayDefinition == 1) {
            oif_PrintCells(stream, table, {1, 2, 1});
        } else if (friction.exponentialDecayDefinition == 0) {
            oif_PrintCells(stream, table, {3});
        }
    } else if (friction.formulation == USER && friction.useProperties) {
        Table row(table.IsEmpty() ? 0 : 1, table.NumRows());
        for (int i = 0; i < table.NumRows() && !table.IsEmpty(); ++i) row.Put(0, i, table.ConstGet(i, 0));
        stream << Columns(row);
    }
}

void oif_ChangeFriction::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Change Friction")
        .Fixed(", interaction=", qkw_QuorixName(propertyName_, false))
        .End();
}

void oif_SurfaceBehavior::Write(utl_Stream& stream) const {
    const auto* behavior = Behavior<&kinC_ContactProperty::normalBehavior>();
    if (behavior == nullptr) return;
    static constexpr const char* methods[] = {", augmented Lagrange", ", penalty", ", direct"};
    static constexpr const char* relations[] = {"HARD", "EXPONENTIAL", "LINEAR", "TABULAR", "SCALE FACTOR"};
    const int relation = behavior->pressureOverclosure;
    const int method = behavior->constraintEnforcementMethod;
    oif_KeywordLine line(stream, "*Surface Behavior");
    line.FixedIf(relation == HARD && behavior->allowSeparation == 0, ", no separation");
    if (method >= 1 && method <= 3) {
        line.Fixed(methods[method - 1]);
    } else if (relation >= HARD && relation <= SCALE_FACTOR) {
        line.Fixed(", pressure-overclosure=", relations[relation]);
    }
    line.End();

    const double stiffness = behavior->contactStiffness;
    const double scale = behavior->contactStiffnessScaleFactor;
    if (relation == EXPONENTIAL) {
        stream << behavior->table.ConstGet(1, 1) << ", " << behavior->table.ConstGet(0, 0);
        if (IsExplicit() && behavior->maxStiffness != cls_UnsetDouble) {
            stream << ", " << behavior->maxStiffness;
        }
        stream << endl;
    }
    if (method == 1 || method == 2) {
        const double clearance = behavior->clearanceAtZeroContactPressure;
        const bool hasClearance = clearance != kinC_NormalBehavior::clearanceAtZeroContactPressureDef();
        const bool isScaled = scale != kinC_NormalBehavior::contactStiffnessScaleFactorDef();
        if (stiffness != 0.0 || hasClearance || isScaled) {
            if (stiffness != 0.0) stream << stiffness;
            // A stiffness alone has no comma behind it.
            if (hasClearance || isScaled) stream << ", ";
            if (hasClearance) stream << clearance;
            if (isScaled) stream << ", " << scale;
            stream << endl;
        }
    }
    if (relation == LINEAR) stream << stiffness << ", " << endl;
    if (relation == TABULAR) stream << Columns(behavior->table);
    if (relation == SCALE_FACTOR) {
        if (behavior->overclosureFactor > 0.0) stream << behavior->overclosureFactor;
        stream << ", ";
        if (behavior->overclosureMeasure > 0.0) stream << behavior->overclosureMeasure;
        stream << ", " << scale << ", ";
        if (behavior->initialStiffnessScaleFactor != kinC_NormalBehavior::initialStiffnessScaleFactorDef()) {
            stream << behavior->initialStiffnessScaleFactor;
        }
        stream << endl;
    }
}

void oif_ContactDamping::Write(utl_Stream& stream) const {
    const auto* damping = Behavior<&kinC_ContactProperty::damping>();
    if (damping == nullptr) return;
    const double atZero = CellOrZero(damping->table, 0, 0);
    const double second = CellOrZero(damping->table, 1, 1);
    if (atZero == 0.0 && (damping->definition == 0 || second == 0.0)) return;
    oif_KeywordLine(stream, "*Contact Damping")
        .Fixed(", definition=", IsImplicit() ? "DAMPING COEFFICIENT" : "CRITICAL DAMPING")
        .FixedIf(IsExplicit(), ", tangent fraction=", damping->tangentFraction)
        .End();
    stream << atZero << ", ";
    double clearance = 0.0;
    double start = 0.0;
    if (damping->definition == 1) {
        clearance = second;
    } else if (damping->definition == 2) {
        clearance = CellOrZero(damping->table, 2, 1);
        start = second;
    }
    if (IsImplicit() && clearance > 0.0) stream << clearance << ", " << start / clearance;
    stream << endl;
}

void oif_GapConductance::Write(utl_Stream& stream) const {
    const auto* conductance = Behavior<&kinC_ContactProperty::thermalConductance>();
    if (conductance == nullptr) return;
    if (conductance->definition == 1) stream << "*Gap Conductance, user" << endl;
    if (conductance->definition != 0) return;
    const auto write = [&](const char* keyword, const Table& values, int dependencies, bool byTemperature,
                           bool byMassFlowRate) {
        oif_KeywordLine(stream, keyword).FixedIf(dependencies > 0, ", dependencies=", dependencies).End();
        oif_MaterialTable table = Columns(values);
        if (!byTemperature) table.InsertEmptyColumn(2);
        if (!byMassFlowRate) table.InsertEmptyColumn(3);
        stream << table;
    };
    if (conductance->clearanceDependency) {
        write("*Gap Conductance", conductance->clearanceTable, conductance->dependencies,
              conductance->temperatureDependency, conductance->massFlowRateDependency);
    }
    if (conductance->pressureDependency) {
        write("*Gap Conductance, pressure", conductance->pressureTable,
              conductance->pressureTableDependencies, conductance->pressureTableTemperatureDependency,
              conductance->pressureTableMassFlowRateDependency);
    }
}

void oif_GapHeatGeneration::Write(utl_Stream& stream) const {
    const auto* heat = Behavior<&kinC_ContactProperty::heatGeneration>();
    if (heat == nullptr) return;
    stream << "*Gap Heat Generation" << endl
           << heat->heatFraction << ", " << heat->distributionFraction << endl;
}

void oif_GapRadiation::Write(utl_Stream& stream) const {
    const auto* radiation = Behavior<&kinC_ContactProperty::radiation>();
    if (radiation == nullptr) return;
    stream << "*Gap Radiation" << endl
           << radiation->secondEmissivity << ", " << radiation->firstEmissivity << endl
           << Columns(radiation->table);
}
