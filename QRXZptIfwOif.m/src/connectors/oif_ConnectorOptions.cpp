#include "connectors/oif_ConnectorOptions.h"

#include "base/oif_DataLines.h"
#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialTable.h"

#include <algorithm>
#include <initializer_list>

namespace {

constexpr int kComponents = 6;

bool Contains(const cow_List<int>& list, int item) {
    return std::find(list.begin(), list.end(), item) != list.end();
}

void WriteIntegers(utl_Stream& stream, const cow_List<int>& values) {
    for (int i = 0; i < values.Length(); ++i) {
        if (i > 0) stream << ", ";
        stream << values[i];
    }
    stream.LineBreak();
}

void AddDependencies(oif_KeywordLine& line, int count) {
    line.FixedUnless(", dependencies=", count, 0);
}

using Options = mdl_ObjCow<kbeC_ConnectorOptions>;

void WriteRegularization(oif_KeywordLine& line, const Options& group) {
    if (group.IsNull()) return;
    const kbeC_ConnectorOptions& options = group.ConstGet();
    if (!options.useBehaviorRegularization) {
        if (options.regularize) {
            line.Breaking("regularize=ON")
                .Breaking("rtol=", options.useBehaviorRtol ? kbeC_ConnectorOptions::regularizationDef()
                                                           : options.regularization);
        } else {
            line.Breaking("regularize=OFF");
        }
    }
    if (!options.useBehaviorExtrapolation) {
        const bool isLinear = options.extrapolation == kbeC_ConnectorOptions::ExtrapolationEnm::LINEAR;
        line.Breaking(isLinear ? "extrapolation=LINEAR" : "extrapolation=CONSTANT");
    }
}

void WriteOptions(oif_KeywordLine& line, const Options& group) {
    if (group.IsNull()) return;
    WriteRegularization(line, group);
    const kbeC_ConnectorOptions& options = group.ConstGet();
    if (!options.useBehaviorRateFactor) {
        line.BreakingUnless("rate filter factor=", options.rateFactor,
                            kbeC_ConnectorOptions::rateFactorDef());
    }
    line.BreakingIf(options.interpolation == kbeC_ConnectorOptions::InterpolationEnm::LOGARITHMIC,
                    "rate interpolation=LOGARITHMIC");
}

template <class R>
struct SpringTexts;
template <>
struct SpringTexts<kbeC_ConnectorElasticity> {
    static constexpr const char* keyword = "*Connector Elasticity";
    static constexpr bool skipsMotions = false;
};
template <>
struct SpringTexts<kbeC_ConnectorDamping> {
    static constexpr const char* keyword = "*Connector Damping";
    // Its tables have a second block of columns, one for each component.
    static constexpr bool skipsMotions = true;
};

/// The symmetric matrix of all six components, row by row up to the diagonal, with blanks for those that the
/// option doesn't couple. At the end of a table blanks are never added.
void WidenToMatrix(oif_MaterialTable& table, const cow_List<int>& components) {
    int column = 0;
    for (int i = 1; i <= kComponents; ++i) {
        for (int j = 1; j <= i; ++j, ++column) {
            if (!Contains(components, i) || !Contains(components, j)) table.InsertEmptyColumn(column);
        }
    }
}

cow_List<int> ColumnsOfOthers(int component, int count, bool alsoMotions) {
    cow_List<int> columns;
    for (int i = 0; i < count; ++i) {
        if (i == component) continue;
        columns.Append(i);
        if (alsoMotions) columns.Append(i + count);
    }
    return columns;
}

template <class R>
void WriteSpring(utl_Stream& stream, const R& option) {
    using Texts = SpringTexts<R>;
    using Behavior = typename R::BehaviorEnm;
    using Coupling = typename R::CouplingEnm;
    const bool isLinear = option.behavior == Behavior::LINEAR;
    const bool isUncoupled = option.coupling == Coupling::UNCOUPLED;
    oif_MaterialTable table = oif_DependentTable(option);

    if (isLinear && !isUncoupled) {
        // The coupling on positions has no linear form.
        if (option.coupling != Coupling::COUPLED) return;
        oif_KeywordLine line(stream, Texts::keyword);
        AddDependencies(line, option.dependencies);
        WriteOptions(line, option.options);
        line.End();
        WidenToMatrix(table, option.components);
        stream << table;
        if (option.temperatureDependency || option.dependencies != 0) return;
        // Empty lines stand for the rest of the matrix.
        int largest = 0;
        for (const int component : option.components) largest = std::max(largest, component);
        if (largest < 6) stream.LineBreak();
        if (largest < 4) stream.LineBreak();
        return;
    }

    if (isLinear && !option.frequencyDependency) oif_KeepDependentColumns(table, option);
    const int count = option.components.Length();
    for (int i = 0; i < count; ++i) {
        oif_KeywordLine line(stream, Texts::keyword);
        line.FixedIf(!isLinear, ", nonlinear").Fixed(", component=", option.components[i]);
        AddDependencies(line, option.dependencies);
        line.FixedIf(!isUncoupled, ", independent components=",
                     option.coupling == Coupling::COUPLED_POSITION ? "POSITION" : "CONSTITUTIVE MOTION");
        WriteOptions(line, option.options);
        line.End();
        if (!isUncoupled) WriteIntegers(stream, option.independentComponents);
        if (isLinear || !isUncoupled) {
            table.SkipColumns(ColumnsOfOthers(i, count, !isLinear && Texts::skipsMotions));
        }
        stream << table;
    }
}

/// The keyword with its data line, values joined by ", " and unset ones blank, for each component; nothing
/// when all values are unset. `other` is a component that the option leads to, with its parameter.
void WriteBounds(utl_Stream& stream, const char* keyword, const cow_List<int>& components,
                 std::initializer_list<double> values, const char* parameter = "", int other = cls_UnsetInt) {
    if (std::all_of(values.begin(), values.end(), [](double v) { return v == cls_UnsetDouble; })) return;
    for (const int component : components) {
        oif_KeywordLine(stream, keyword)
            .Fixed(", component=", component)
            .FixedUnless(parameter, other, cls_UnsetInt)
            .End();
        const char* separator = "";
        for (const double value : values) {
            stream << separator;
            if (value != cls_UnsetDouble) stream << value;
            separator = ", ";
        }
        stream.LineBreak();
    }
}

using Potentials = cow_List<kbeC_ConnectorPotential>;

/// "BO-", the option's place, a mark and the place of a term: names of derived components.
class GeneratedNames {
public:
    GeneratedNames(int option, const char* mark)
        : prefix_(cow_String("BO-") + cow_String(option) + "-" + mark) {}
    const cow_String& Plain() const { return prefix_; }
    cow_String OfTerm(int term) const { return prefix_ + "-" + cow_String(term); }

private:
    cow_String prefix_;
};
constexpr const char* kContactForce = "DC";
constexpr const char* kForcePotential = "CP"; // of friction and plasticity
constexpr const char* kInitiationPotential = "IP";
constexpr const char* kEvolutionPotential = "EP";

void Add(oif_DerivedComponents& components, const cow_String& name,
         const mdl_ObjCow<kbeC_DerivedComponent>& component) {
    if (!component.IsNull() && !components.IsMember(name)) components.Insert(name, component.ConstGet());
}

void AddOfPotential(oif_DerivedComponents& components, const Potentials& terms, const GeneratedNames& names) {
    for (int i = 0; i < terms.Length(); ++i) {
        if (terms[i].useDerived != 0) Add(components, names.OfTerm(i), terms[i].derivedComponent);
    }
}

template <class OperatorEnm>
void WritePotential(utl_Stream& stream, const Potentials& terms, OperatorEnm operatorType, double exponent,
                    const GeneratedNames& names) {
    if (terms.Length() == 0) return;
    const bool isMaximum = operatorType == OperatorEnm::MAXIMUM;
    oif_KeywordLine(stream, "*Connector Potential")
        .FixedIf(isMaximum, ", operator=MAX")
        .FixedIf(!isMaximum && exponent != 2.0, ", exponent=", exponent)
        .End();
    for (int i = 0; i < terms.Length(); ++i) {
        const kbeC_ConnectorPotential& term = terms[i];
        if (term.useDerived != 0) {
            stream << names.OfTerm(i);
        } else {
            stream << term.component;
        }
        stream << ", " << term.scaleFactor << ", ";
        if (!isMaximum) stream << term.radius;
        switch (term.sign) {
        case kbeC_ConnectorPotential::SignEnm::ABS: stream << ", ABS"; break;
        case kbeC_ConnectorPotential::SignEnm::MACAULEY: stream << ", MACAULEY"; break;
        case kbeC_ConnectorPotential::SignEnm::NONE: stream << ", NONE"; break;
        }
        stream << ", " << term.exponentFactor << (term.negative != 0 ? ", -1.0" : ", 1.0") << endl;
    }
}

/// Calls `write(line)` for each component with a line that names it; once, without any, when a potential
/// couples them or there is none.
template <class Writer>
void ForEachComponent(utl_Stream& stream, const char* keyword, const cow_List<int>& components,
                      const Potentials& potential, const Writer& write) {
    if (potential.IsEmpty()) {
        for (const int component : components) {
            write(oif_KeywordLine(stream, keyword).Fixed(", component=", component));
        }
    }
    if (!potential.IsEmpty() || components.IsEmpty()) write(oif_KeywordLine(stream, keyword));
}

} // namespace

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorElasticity& option) {
    if (option.behavior == kbeC_ConnectorElasticity::BehaviorEnm::RIGID) {
        oif_KeywordLine(stream, "*Connector Elasticity").Fixed(", rigid").End();
        WriteIntegers(stream, option.components);
        return;
    }
    WriteSpring(stream, option);
}

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorDamping& option) {
    WriteSpring(stream, option);
}

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorStop& option) {
    WriteBounds(stream, "*Connector Stop", option.components, {option.minMotion, option.maxMotion});
}

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorLock& option) {
    WriteBounds(stream, "*Connector Lock", option.components,
                {option.minMotion, option.maxMotion, option.minForce, option.maxForce},
                ", lock=", option.lockingComponent);
}

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorFailure& option) {
    WriteBounds(stream, "*Connector Failure", option.components,
                {option.minMotion, option.maxMotion, option.minForce, option.maxForce},
                ", release=", option.releaseComponent);
}

void oif_ConnectorFriction::Write(utl_Stream& stream) const {
    using Friction = kbeC_ConnectorFriction;
    const bool isUserDefined = option_.formulation == Friction::FormulationEnm::USER_DEFINED;
    oif_KeywordLine line(stream, "*Connector Friction");
    if (isUserDefined) {
        line.FixedIf(option_.component != cls_UnsetInt && option_.component > 0,
                     ", component=", option_.component);
        if (option_.contactForceType == Friction::ContactForceTypeEnm::DERIVED_COMPONENT) {
            line.Fixed(", contact force=", GeneratedNames(index_, kContactForce).Plain());
        } else {
            line.FixedUnless(", contact force=", option_.contactForceComponent, cls_UnsetInt);
        }
    } else {
        line.Fixed(", predefined");
    }
    line.Dependencies(option_.dependencies)
        .BreakingIf(option_.independentKind == Friction::IndependentKindEnm::POSITION,
                    "independent components=POSITION")
        .BreakingIf(option_.independentKind == Friction::IndependentKindEnm::CONSTITUTIVE_MOTION,
                    "independent components=CONSTITUTIVE MOTION")
        .BreakingUnless("stick stiffness=", option_.stickStiffness, Friction::stickStiffnessDef());
    WriteRegularization(line, option_.options);
    line.End();
    if (isUserDefined && option_.independentKind != Friction::IndependentKindEnm::NONE) {
        WriteIntegers(stream, option_.independentComponents);
    }
    if (isUserDefined) {
        oif_MaterialTable table = oif_DependentTable(option_);
        if (!option_.contactArea) oif_KeepDependentColumns(table, option_);
        stream << table;
    } else {
        stream << oif_MaterialTable(option_.table, option_.dependencies, option_.temperatureDependency);
    }
    if (!option_.tangentialBehavior.IsNull()) WriteTangentialBehavior(stream);
    WritePotential(stream, option_.potentials, option_.potentialOperator, option_.forcePotentialExponent,
                   {index_, kForcePotential});
}

void oif_ConnectorFriction::WriteTangentialBehavior(utl_Stream& stream) const {
    using Tangential = kbeC_TangentialBehavior;
    const Tangential& tangential = option_.tangentialBehavior.ConstGet();
    oif_KeywordLine line(stream, "*Friction");
    if (product_ == kprC_AnalysisProductEnm::IMPLICIT) {
        if (tangential.slipToleranceType == Tangential::SlipToleranceTypeEnm::ABSOLUTE) {
            line.Fixed(", elastic slip=", tangential.elasticSlip);
        } else {
            line.FixedUnless(", slip tolerance=", tangential.fraction, Tangential::fractionDef());
        }
    }
    if (tangential.formulation == Tangential::FormulationEnm::TABLE) {
        line.FixedIf(tangential.dependencies > 0, ", dependencies=", tangential.dependencies)
            .FixedUnless(", taumax=", tangential.shearStressLimit, Tangential::shearStressLimitDef())
            .End();
        oif_MaterialTable table(tangential.table, tangential.dependencies, tangential.temperatureDependency);
        if (!tangential.slipRateDependency) table.InsertEmptyColumn(1);
        if (!tangential.pressureDependency) table.InsertEmptyColumn(2);
        if (!tangential.temperatureDependency) table.InsertEmptyColumn(3);
        stream << table;
        return;
    }
    const bool hasTestData = tangential.testData == 1;
    line.Fixed(", exponential decay").FixedIf(hasTestData, ", test data").End();
    if (hasTestData) {
        oif_PrintCells(stream, tangential.table, {1, 2, 1});
    } else {
        oif_PrintCells(stream, tangential.table, {3});
    }
}

void oif_ConnectorFriction::GetDerivedComponents(oif_DerivedComponents& components) const {
    if (option_.formulation == kbeC_ConnectorFriction::FormulationEnm::USER_DEFINED &&
        option_.contactForceType == kbeC_ConnectorFriction::ContactForceTypeEnm::DERIVED_COMPONENT) {
        Add(components, GeneratedNames(index_, kContactForce).Plain(), option_.contactForceDerived);
    }
    AddOfPotential(components, option_.potentials, {index_, kForcePotential});
}

void oif_ConnectorPlasticity::Write(utl_Stream& stream) const {
    using Plasticity = kbeC_ConnectorPlasticity;
    const auto write = [&](oif_KeywordLine line) {
        line.End();
        if (option_.isotropicHardening) {
            const bool isLaw = option_.isotropicType == Plasticity::IsotropicTypeEnm::EXPONENTIAL_LAW;
            oif_KeywordLine hardening(stream, "*Connector Hardening");
            hardening.Fixed(", definition=", isLaw ? "Exponential Law" : "Tabular");
            AddDependencies(hardening, option_.isotropicDependencies);
            WriteOptions(hardening, option_.isotropicOptions);
            hardening.End();
            stream << oif_DependentTable(option_.isotropicTable, option_.isotropicDependencies,
                                         option_.isotropicTemperatureDependency);
        }
        if (option_.kinematicHardening) {
            const char* definition = "Stabilized";
            if (option_.kinematicType == Plasticity::KinematicTypeEnm::HALF_CYCLE) definition = "Half Cycle";
            if (option_.kinematicType == Plasticity::KinematicTypeEnm::PARAMETERS) definition = "Parameters";
            oif_KeywordLine hardening(stream, "*Connector Hardening");
            hardening.Fixed(", type=Kinematic").Fixed(", definition=", definition);
            AddDependencies(hardening, option_.kinematicDependencies);
            WriteOptions(hardening, option_.kinematicOptions);
            hardening.End();
            stream << oif_DependentTable(option_.kinematicTable, option_.kinematicDependencies,
                                         option_.kinematicTemperatureDependency);
        }
    };
    ForEachComponent(stream, "*Connector Plasticity", option_.components, option_.potentials, write);
    WritePotential(stream, option_.potentials, option_.potentialOperator, option_.forcePotentialExponent,
                   {index_, kForcePotential});
}

void oif_ConnectorPlasticity::GetDerivedComponents(oif_DerivedComponents& components) const {
    AddOfPotential(components, option_.potentials, {index_, kForcePotential});
}

void oif_ConnectorDamage::Write(utl_Stream& stream) const {
    using Criterion = kbeC_ConnectorDamage::CriterionEnm;
    const auto write = [&](oif_KeywordLine line) {
        line.BreakingIf(option_.criterion == Criterion::MOTION, "criterion=Motion")
            .BreakingIf(option_.criterion == Criterion::PLASTIC_MOTION, "criterion=Plastic Motion")
            .BreakingUnless("dependencies=", option_.initiationDependencies, 0);
        WriteOptions(line, option_.initiationOptions);
        line.End();
        oif_MaterialTable table = oif_DependentTable(option_.initiationTable, option_.initiationDependencies,
                                                     option_.initiationTemperatureDependency);
        if (option_.criterion == Criterion::PLASTIC_MOTION && !option_.modeMixDependency) {
            table.InsertEmptyColumn(1);
        }
        // Bounds that are infinite go out as blanks.
        table.ReplaceColumnData(0, -1e36, "  ");
        table.ReplaceColumnData(1, 1e36, "  ");
        stream << table;
        WritePotential(stream, option_.initiationPotentials, option_.initiationPotentialOperator,
                       option_.initiationPotentialExponent, {index_, kInitiationPotential});
        if (option_.evolution) WriteEvolution(stream);
    };
    ForEachComponent(stream, "*Connector Damage Initiation", option_.components, option_.initiationPotentials,
                     write);
}

void oif_ConnectorDamage::WriteEvolution(utl_Stream& stream) const {
    using Damage = kbeC_ConnectorDamage;
    const bool isEnergy = option_.evolutionType == Damage::EvolutionTypeEnm::ENERGY;
    const bool softens = !isEnergy && option_.softening != Damage::SofteningEnm::LINEAR;
    const bool hasMix =
        option_.criterion == Damage::CriterionEnm::PLASTIC_MOTION && option_.modeMixDependency;
    oif_KeywordLine line(stream, "*Connector Damage Evolution");
    line.Fixed(", type=", isEnergy ? "Energy" : "Motion");
    if (softens) {
        const bool isExponential = option_.softening == Damage::SofteningEnm::EXPONENTIAL;
        line.Breaking("softening=").Text(isExponential ? "Exponential" : "Tabular");
    }
    line.BreakingIf(option_.useAffected, "affected components")
        .BreakingIf(option_.degradation == Damage::DegradationEnm::MULTIPLICATIVE,
                    "degradation=Multiplicative")
        .BreakingUnless("dependencies=", option_.evolutionDependencies, 0);
    WriteOptions(line, option_.evolutionOptions);
    line.End();
    if (option_.useAffected) WriteIntegers(stream, option_.affectedComponents);
    oif_MaterialTable table = oif_DependentTable(option_.evolutionTable, option_.evolutionDependencies,
                                                 option_.evolutionTemperatureDependency);
    if (!hasMix) table.InsertEmptyColumn(softens ? 2 : 1);
    stream << table;
    WritePotential(stream, option_.evolutionPotentials, option_.evolutionPotentialOperator,
                   option_.evolutionPotentialExponent, {index_, kEvolutionPotential});
}

void oif_ConnectorDamage::GetDerivedComponents(oif_DerivedComponents& components) const {
    AddOfPotential(components, option_.initiationPotentials, {index_, kInitiationPotential});
    if (option_.evolution) {
        AddOfPotential(components, option_.evolutionPotentials, {index_, kEvolutionPotential});
    }
}

void oif_DerivedComponent::Write(utl_Stream& stream) const {
    using Term = kbeC_CDCTerm;
    for (const Term& term : component_.terms) {
        // Unlike elsewhere the line may break ahead of the comma of what follows.
        oif_KeywordLine line(stream, "*Connector Derived Component");
        line.Fixed(", name=", qkw_QuorixName(name_, false)).MayBreak();
        if (term.sign == Term::SignEnm::NEGATIVE) line.Fixed(", sign=NEGATIVE").MayBreak();
        if (term.operatorType == Term::OperatorEnm::SUM) line.Fixed(", operator=SUM").MayBreak();
        if (term.operatorType == Term::OperatorEnm::MACAULEY_SUM) {
            line.Fixed(", operator=MACAULEY SUM").MayBreak();
        }
        if (term.dependencies > 0) line.Fixed(", dependencies=", term.dependencies).MayBreak();
        if (term.independentGiven && term.independentKind == Term::IndependentKindEnm::POSITION) {
            line.Fixed(", independent components").MayBreak();
        }
        if (term.independentGiven && term.independentKind == Term::IndependentKindEnm::CONSTITUTIVE_MOTION) {
            line.Fixed(", independent components=CONSTITUTIVE MOTION").MayBreak();
        }
        WriteOptions(line, term.options);
        line.End();
        WriteIntegers(stream, term.components);
        stream << oif_DependentTable(term);
    }
}
