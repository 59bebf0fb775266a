#include "connectors/oif_ConnectorOptions.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialTable.h"

#include <algorithm>
#include <initializer_list>

namespace {

constexpr int kComponents = 6;

bool Contains(const cow_List<int>& list, int item) {
    for (int i = 0; i < list.Length(); ++i) {
        if (list[i] == item) return true;
    }
    return false;
}

void WriteIntegers(utl_Stream& stream, const cow_List<int>& values) {
    for (int i = 0; i < values.Length(); ++i) {
        if (i > 0) stream << ", ";
        stream << values[i];
    }
    stream.LineBreak();
}

/// Parameters that bring their comma and never break the line.
void WriteDependencies(utl_Stream& stream, int count) {
    if (count != 0) stream << ", dependencies=" << count;
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

void WriteOptionsAndEnd(utl_Stream& stream, const Options& group) {
    oif_KeywordLine line(stream, "");
    WriteOptions(line, group);
    line.End();
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
        stream << Texts::keyword;
        WriteDependencies(stream, option.dependencies);
        WriteOptionsAndEnd(stream, option.options);
        WidenToMatrix(table, option.components);
        stream << table;
        if (option.temperatureDependency || option.dependencies != 0) return;
        // Empty lines stand for the rest of the matrix.
        int largest = 0;
        for (int i = 0; i < option.components.Length(); ++i) {
            largest = std::max(largest, option.components[i]);
        }
        if (largest < 6) stream.LineBreak();
        if (largest < 4) stream.LineBreak();
        return;
    }

    if (isLinear && !option.frequencyDependency) oif_KeepDependentColumns(table, option);
    const int count = option.components.Length();
    for (int i = 0; i < count; ++i) {
        stream << Texts::keyword << (isLinear ? ", component=" : ", nonlinear, component=")
               << option.components[i];
        WriteDependencies(stream, option.dependencies);
        if (!isUncoupled) {
            stream << (option.coupling == Coupling::COUPLED_POSITION
                           ? ", independent components=POSITION"
                           : ", independent components=CONSTITUTIVE MOTION");
        }
        WriteOptionsAndEnd(stream, option.options);
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
    for (int i = 0; i < components.Length(); ++i) {
        stream << keyword << ", component=" << components[i];
        if (other != cls_UnsetInt) stream << parameter << other;
        stream.LineBreak();
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
    stream << "*Connector Potential";
    if (isMaximum) {
        stream << ", operator=MAX";
    } else if (exponent != 2.0) {
        stream << ", exponent=" << exponent;
    }
    stream << endl;
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

/// Calls `write(component)` for each component with its parameter; once, without any, when a potential
/// couples them or there is none.
template <class Writer>
void ForEachComponent(const cow_List<int>& components, const Potentials& potential, const Writer& write) {
    const int passes = potential.Length() > 0 ? 0 : components.Length();
    for (int i = 0; i < passes; ++i) write(cow_String(", component=") + cow_String(components[i]));
    if (passes == 0) write(cow_String());
}

} // namespace

void oif_WriteConnectorOption(utl_Stream& stream, const kbeC_ConnectorElasticity& option) {
    if (option.behavior == kbeC_ConnectorElasticity::BehaviorEnm::RIGID) {
        stream << "*Connector Elasticity, rigid";
        stream.LineBreak();
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
    stream << "*Connector Friction";
    if (isUserDefined) {
        if (option_.component != cls_UnsetInt && option_.component > 0) {
            stream << ", component=" << option_.component;
        }
        if (option_.contactForceType == Friction::ContactForceTypeEnm::DERIVED_COMPONENT) {
            stream << ", contact force=" << GeneratedNames(index_, kContactForce).Plain();
        } else if (option_.contactForceComponent != cls_UnsetInt) {
            stream << ", contact force=" << option_.contactForceComponent;
        }
    } else {
        stream << ", predefined";
    }
    oif_KeywordLine line(stream, "");
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
    stream << "*Friction";
    if (product_ == kprC_AnalysisProductEnm::IMPLICIT) {
        if (tangential.slipToleranceType == Tangential::SlipToleranceTypeEnm::ABSOLUTE) {
            stream << ", elastic slip=" << tangential.elasticSlip;
        } else if (tangential.fraction != Tangential::fractionDef()) {
            stream << ", slip tolerance=" << tangential.fraction;
        }
    }
    if (tangential.formulation == Tangential::FormulationEnm::TABLE) {
        if (tangential.dependencies > 0) stream << ", dependencies=" << tangential.dependencies;
        if (tangential.shearStressLimit != Tangential::shearStressLimitDef()) {
            stream << ", taumax=" << tangential.shearStressLimit;
        }
        stream << endl;
        oif_MaterialTable table(tangential.table, tangential.dependencies, tangential.temperatureDependency);
        if (!tangential.slipRateDependency) table.InsertEmptyColumn(1);
        if (!tangential.pressureDependency) table.InsertEmptyColumn(2);
        if (!tangential.temperatureDependency) table.InsertEmptyColumn(3);
        stream << table;
        return;
    }
    const bool hasTestData = tangential.testData == 1;
    stream << ", exponential decay" << (hasTestData ? ", test data" : "") << endl;
    const int columns = tangential.table.NumColumns();
    const int count = columns * tangential.table.NumRows();
    int next = 0;
    const auto line = [&](int length) {
        if (next >= count) return;
        for (int i = 0; i < length && next < count; ++i, ++next) {
            if (i > 0) stream << ", ";
            stream << tangential.table.ConstGet(next / columns, next % columns);
        }
        stream << endl;
    };
    if (hasTestData) {
        line(1);
        line(2);
        line(1);
    } else {
        line(3);
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
    ForEachComponent(option_.components, option_.potentials, [&](const cow_String& component) {
        stream << "*Connector Plasticity" << component;
        stream.LineBreak();
        if (option_.isotropicHardening) {
            const bool isLaw = option_.isotropicType == Plasticity::IsotropicTypeEnm::EXPONENTIAL_LAW;
            stream << "*Connector Hardening, definition=" << (isLaw ? "Exponential Law" : "Tabular");
            WriteDependencies(stream, option_.isotropicDependencies);
            WriteOptionsAndEnd(stream, option_.isotropicOptions);
            stream << oif_DependentTable(option_.isotropicTable, option_.isotropicDependencies,
                                         option_.isotropicTemperatureDependency);
        }
        if (option_.kinematicHardening) {
            const char* definition = "Stabilized";
            if (option_.kinematicType == Plasticity::KinematicTypeEnm::HALF_CYCLE) definition = "Half Cycle";
            if (option_.kinematicType == Plasticity::KinematicTypeEnm::PARAMETERS) definition = "Parameters";
            stream << "*Connector Hardening, type=Kinematic, definition=" << definition;
            WriteDependencies(stream, option_.kinematicDependencies);
            WriteOptionsAndEnd(stream, option_.kinematicOptions);
            stream << oif_DependentTable(option_.kinematicTable, option_.kinematicDependencies,
                                         option_.kinematicTemperatureDependency);
        }
    });
    WritePotential(stream, option_.potentials, option_.potentialOperator, option_.forcePotentialExponent,
                   {index_, kForcePotential});
}

void oif_ConnectorPlasticity::GetDerivedComponents(oif_DerivedComponents& components) const {
    AddOfPotential(components, option_.potentials, {index_, kForcePotential});
}

void oif_ConnectorDamage::Write(utl_Stream& stream) const {
    using Criterion = kbeC_ConnectorDamage::CriterionEnm;
    ForEachComponent(option_.components, option_.initiationPotentials, [&](const cow_String& component) {
        stream << "*Connector Damage Initiation" << component;
        oif_KeywordLine line(stream, "");
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
    });
}

void oif_ConnectorDamage::WriteEvolution(utl_Stream& stream) const {
    using Damage = kbeC_ConnectorDamage;
    const bool isEnergy = option_.evolutionType == Damage::EvolutionTypeEnm::ENERGY;
    const bool softens = !isEnergy && option_.softening != Damage::SofteningEnm::LINEAR;
    const bool hasMix =
        option_.criterion == Damage::CriterionEnm::PLASTIC_MOTION && option_.modeMixDependency;
    stream << "*Connector Damage Evolution, type=" << (isEnergy ? "Energy" : "Motion");
    oif_KeywordLine line(stream, "");
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
    for (int i = 0; i < component_.terms.Length(); ++i) {
        const Term& term = component_.terms[i];
        stream << "*Connector Derived Component, name=" << qkw_QuorixName(name_, false);
        stream.OptionalLineBreak();
        // Unlike elsewhere the line may break ahead of the comma of what follows.
        const auto parameter = [&](bool isThere, const char* text) {
            if (!isThere) return;
            stream << text;
            stream.OptionalLineBreak();
        };
        parameter(term.sign == Term::SignEnm::NEGATIVE, ", sign=NEGATIVE");
        parameter(term.operatorType == Term::OperatorEnm::SUM, ", operator=SUM");
        parameter(term.operatorType == Term::OperatorEnm::MACAULEY_SUM, ", operator=MACAULEY SUM");
        if (term.dependencies > 0) {
            stream << ", dependencies=" << term.dependencies;
            stream.OptionalLineBreak();
        }
        if (term.independentGiven) {
            parameter(term.independentKind == Term::IndependentKindEnm::POSITION, ", independent components");
            parameter(term.independentKind == Term::IndependentKindEnm::CONSTITUTIVE_MOTION,
                      ", independent components=CONSTITUTIVE MOTION");
        }
        WriteOptionsAndEnd(stream, term.options);
        WriteIntegers(stream, term.components);
        stream << oif_DependentTable(term);
    }
}
