#include "conditions/oif_Boundary.h"

#include "base/oif_KeywordLine.h"
#include "base/oif_Utils.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kbcC_MotionBCs.h"
#include "store_interface/records/conditions/kbcC_ScalarBCs.h"
#include "store_interface/records/conditions/kbcC_SupportBCs.h"

using Distribution = kbcC_BC::DistribTypeEnum;
using Method = kloC_BoltLoad::MethodEnm;

namespace {

constexpr unsigned kBuckling = 0x23C0066;
constexpr std::string_view kBaseNamePrefix = "__basename__";

} // namespace

oif_ConditionKeyword::oif_ConditionKeyword(const Style& style, const mdl_ObjCow<kbcC_BC>& bc,
                                           const cow_String& stepName, bool opMod, const cow_String& setName,
                                           const cow_String& initialStepName, double scale)
    : style_(style), opNew_(!opMod), bc_(bc), stepName_(stepName), setName_(setName), modifiedOnly_(opMod),
      initialStepName_(initialStepName), scale_(scale) {
    const auto& quad = Quad();
    oif_Utils::SetDeactivateOpFlags(quad.status, deactivated_, modifiedOnly_);
    if (deactivated_) return;
    const auto& amplitude = quad.state.ConstGet().amplitude;
    amplitude_ = amplitude.ConstGet();
    const bool cleared = amplitude.State() == mdl_PropAttributeStateEnm::CLEARED;
    // A card speaks for all its lines, so a new amplitude calls for all components.
    if (IsSaid(amplitude.State()) || (cleared && style.clearedAmplitudeIsNew)) modifiedOnly_ = false;
}

void oif_ConditionKeyword::Write(utl_Stream& stream) const {
    if (deactivated_) {
        WriteBoundaryCard(stream, Distribution::UNIFORM, false, IsBuckling() ? 1 : 0, true);
    } else {
        WriteForms(stream);
    }
}

bool oif_ConditionKeyword::IsSaid(mdl_PropAttributeStateEnm state) const {
    return oif_Utils::CheckDataState(state, modifiedOnly_);
}

unsigned oif_ConditionKeyword::Procedure() const {
    return stepName_ == initialStepName_ ? 0 : Quad().procedureType;
}

bool oif_ConditionKeyword::IsBuckling() const {
    return Procedure() == kBuckling;
}

void oif_ConditionKeyword::WriteBoundaryCard(utl_Stream& stream, Distribution distributionType, bool fixed,
                                             int loadCase, bool lineBreak) const {
    oif_KeywordLine line(stream, style_.keyword);
    if (opNew_) line.Text(", op=NEW");
    if (!amplitude_.IsEmpty()) line.Text(", amplitude=").Text(qkw_QuorixName(amplitude_, false));
    line.BreakingIf(loadCase == 1 || loadCase == 2, "load case=", loadCase)
        .BreakingIf(fixed, "fixed")
        .BreakingIf(distributionType == Distribution::USER_DEFINED, "user");
    WriteLastParameters(stream);
    if (lineBreak) stream.LineBreak();
}

template <class Block>
void oif_ConditionKeyword::ForEachLoadCase(const Block& block) const {
    if (!IsBuckling()) {
        block(0);
        return;
    }
    const int entered = Quad().state.ConstGet().BuckleCase();
    for (const int loadCase : {1, 2}) {
        if (entered == 0 || entered == 3 || entered == loadCase) block(loadCase);
    }
}

void oif_ConditionKeyword::WriteDisplacements(utl_Stream& stream, bool fixed) const {
    const Distribution distribution = bc_.ConstGet().distributionType;
    if (UsesComplex()) {
        for (const int loadCase : {1, 2}) {
            WriteBoundaryCard(stream, distribution, fixed, loadCase, true);
            WriteComponents(stream, fixed, loadCase == 2);
        }
        return;
    }
    ForEachLoadCase([&](int loadCase) {
        WriteBoundaryCard(stream, distribution, fixed, loadCase, true);
        WriteComponents(stream, fixed, false);
    });
}

void oif_ConditionKeyword::WriteRates(utl_Stream& stream, const char* type, bool held) const {
    // Of a complex value only the real part is ever written.
    WriteBoundaryCard(stream, bc_.ConstGet().distributionType, false, UsesComplex() || IsBuckling() ? 1 : 0,
                      false);
    stream << ", ";
    stream.OptionalLineBreak();
    stream << type;
    stream.LineBreak();
    WriteComponents(stream, held, false);
}

void oif_ConditionKeyword::WriteComponents(utl_Stream& stream, bool held, bool imaginary) const {
    const kbcC_BCState& state = Quad().state.ConstGet();
    for (int i = 0; i < 6; ++i) {
        const kbcC_Component component = state.Component(i);
        if (!IsSaid(component.state)) continue;
        WriteLine(stream, Dof(i + 1), held ? 0.0 : (imaginary ? component.imag : component.real) * scale_);
    }
}

void oif_ConditionKeyword::WriteLine(utl_Stream& stream, const cow_String& dofs, double value) const {
    stream << setName_ << dofs;
    if (value != 0.0) stream << ", " << value;
    stream.LineBreak();
}

cow_String oif_ConditionKeyword::Dof(int number) const {
    const cow_String one = cow_String(", ") + cow_String(number);
    return style_.dofRange ? one + one : one;
}

oif_Boundary::oif_Boundary(const mdl_ObjCow<kbcC_BC>& bc, const cow_String& name, const cow_String& stepName,
                           bool opMod, const cow_String& setName, bool shellToSolid,
                           const cow_String& initialStepName, double scale)
    : qkw_KeywordOf({"*Boundary", true, true}, bc, stepName, opMod, setName, initialStepName, scale),
      name_(name), shellToSolid_(shellToSolid) {
    CheckForSubmodelBC();
}

void oif_Boundary::CheckForSubmodelBC() {
    const kbcC_BC& bc = bc_.ConstGet();
    if (bc.DynTypeId() != kbcC_SubmodelBC::TypeId()) return;
    const auto& state = State<kbcC_SubmodelBCState>();
    bool held = false;
    if (!bc.suppressed && kbcC_SubmodelBC::IsSubmodelActive(Quad().status)) {
        held = state.centerZone.ConstGet();
        isBCSubmodel_ = !held;
    }
    submodelKeyword_ = style_.keyword;
    if (opNew_) submodelKeyword_ += ", op=NEW";
    if (held) submodelKeyword_ += ", fixed";
    if (!isBCSubmodel_) return;
    submodelKeyword_ += cow_String(", submodel, step=") + state.stepName;
    if (state.increment > 0) submodelKeyword_ += cow_String(", inc=") + cow_String(state.increment);
    if (state.timeScale) submodelKeyword_ += ", timescale";
}

cow_String oif_Boundary::FixBCNameHack(const cow_String& name) {
    const std::string_view text = name.View();
    return text.starts_with(kBaseNamePrefix) ? cow_String(text.substr(kBaseNamePrefix.size())) : name;
}

void oif_Boundary::WriteLastParameters(utl_Stream& stream) const {
    const cow_String fixedName = FixBCNameHack(name_);
    if (fixedName == name_) return;
    stream << ", "
           << "base name=" << qkw_QuorixName(fixedName, false);
}

void oif_Boundary::WriteForms(utl_Stream& stream) const {
    const kbcC_BC& bc = bc_.ConstGet();
    switch (bc.DynTypeId()) {
    case kbcC_DisplacementBC::Class.Id():
        WriteDisplacements(stream, static_cast<const kbcC_DisplacementBC&>(bc).fixed);
        return;
    case kbcC_VelocityBC::Class.Id(): WriteRates(stream, "type=VELOCITY", false); return;
    case kbcC_AccelerationBC::Class.Id(): WriteRates(stream, "type=ACCELERATION", false); return;
    case kbcC_TypeBC::Class.Id(): WriteType(stream); return;
    case kbcC_SymmetryBC::Class.Id():
        // No keyword: the text goes out with its four stars and its last blank.
        stream << "**** symm BC output ";
        stream.LineBreak();
        return;
    case kbcC_TemperatureBC::Class.Id(): WriteTemperature(stream); return;
    case kbcC_ConcentrationBC::Class.Id(): WriteDistributed(stream, 11); return;
    case kbcC_PorePressureBC::Class.Id():
    case kbcC_FluidPressureBC::Class.Id():
    case kbcC_FluidCavityPressureBC::Class.Id(): WriteDistributed(stream, 8); return;
    case kbcC_AcousticPressureBC::Class.Id(): WriteComplexDistributed(stream, 8); return;
    case kbcC_ElectricPotentialBC::Class.Id(): WriteComplexDistributed(stream, 9); return;
    case kbcC_SubmodelBC::Class.Id(): WriteSubmodel(stream); return;
    default:
        QRXBasException::Throw(
            nex_PrimException<atr_String, 1>("Unimplemented boundary condition in input file."));
    }
}

void oif_Boundary::WriteType(utl_Stream& stream) const {
    const auto& typeName = State<kbcC_TypeBCState>().typeName;
    if (!IsSaid(typeName.State())) return;
    const cow_String support =
        cow_String(", ") + omu_PrimEnum<kbcC_TypeBC::TypeNameEnm, 1>(typeName.ConstGet()).GetString();
    ForEachLoadCase([&](int loadCase) {
        WriteBoundaryCard(stream, bc_.ConstGet().distributionType, false, loadCase, true);
        WriteLine(stream, support, 0.0);
    });
}

void oif_Boundary::WriteTemperature(utl_Stream& stream) const {
    const auto& bc = static_cast<const kbcC_TemperatureBC&>(bc_.ConstGet());
    const auto& dofs = State<kbcC_TemperatureBCState>().dofs;
    const double value = bc.Magnitude(stepName_) * scale_;
    const bool valueIsSaid = IsSaid(bc.MagnitudeState(stepName_));
    WriteBoundaryCard(stream, bc.distributionType, false, 0, true);
    if (!bc.dofsGiven) {
        if (valueIsSaid) WriteLine(stream, Dof(11), value);
    } else if (valueIsSaid || IsSaid(dofs.State())) {
        const cow_List<int>& numbers = dofs.ConstGet();
        for (int i = 0; i < numbers.Length(); ++i) WriteLine(stream, Dof(numbers[i]), value);
    }
}

// Unlike a displacement's, the value stands beside "fixed" too.
void oif_Boundary::WriteDistributed(utl_Stream& stream, int dof) const {
    const auto& bc = static_cast<const kbcC_DistributedBC&>(bc_.ConstGet());
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 0, true);
    if (IsSaid(bc.MagnitudeState(stepName_))) {
        WriteLine(stream, Dof(dof), bc.Magnitude(stepName_) * scale_);
    }
}

void oif_Boundary::WriteComplexDistributed(utl_Stream& stream, int dof) const {
    if (!UsesComplex()) {
        WriteDistributed(stream, dof);
        return;
    }
    // Both parts are always written, changed or not.
    const auto& bc = static_cast<const kbcC_DistributedBC&>(bc_.ConstGet());
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 1, true);
    WriteLine(stream, Dof(dof), bc.Magnitude(stepName_) * scale_);
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 2, true);
    WriteLine(stream, Dof(dof), bc.ImaginaryMagnitude(stepName_) * scale_);
}

void oif_Boundary::WriteSubmodel(utl_Stream& stream) const {
    // A boundary that is held gets its data lines all the same.
    if (!isBCSubmodel_) {
        stream << submodelKeyword_;
        stream.LineBreak();
    }
    const auto& state = State<kbcC_SubmodelBCState>();
    if (shellToSolid_) {
        const double zone = state.shellThicknessValue.ConstGet();
        const double value =
            zone > 0.0 ? zone : static_cast<const kbcC_SubmodelBC&>(bc_.ConstGet()).shellThickness * 0.1;
        // The thickness stands in the place of the degree of freedom, as a name's text would.
        WriteLine(stream, cow_String(", ") + cow_String(value), 0.0);
        return;
    }
    const cow_List<int>& dofs = state.dofs.ConstGet();
    for (int i = 0; i < dofs.Length(); ++i) WriteLine(stream, Dof(dofs[i]), 0.0);
}

oif_ConnectorMotion::oif_ConnectorMotion(const mdl_ObjCow<kbcC_BC>& bc, const cow_String& setName,
                                         const cow_String& stepName, bool opMod,
                                         const cow_String& initialStepName, double scale)
    : qkw_KeywordOf({"*Connector Motion", false, false}, bc, stepName, opMod, setName, initialStepName,
                    scale) {}

void oif_ConnectorMotion::WriteForms(utl_Stream& stream) const {
    const kbcC_BC& bc = bc_.ConstGet();
    const auto fixed = [&bc] { return static_cast<const kbcC_ConnectorBC&>(bc).fixed; };
    switch (bc.DynTypeId()) {
    case kbcC_ConnDisplacementBC::Class.Id(): WriteDisplacements(stream, fixed()); return;
    case kbcC_ConnVelocityBC::Class.Id(): WriteRates(stream, "type=VELOCITY", fixed()); return;
    case kbcC_ConnAccelerationBC::Class.Id(): WriteRates(stream, "type=ACCELERATION", fixed()); return;
    default:
        QRXBasException::Throw(
            nex_PrimException<atr_String, 1>("Unimplemented ConnectorMotion condition in input file."));
    }
}

oif_BoundaryForBoltLoad::oif_BoundaryForBoltLoad(const kloC_BoltLoad& boltLoad, const cow_String& stepName,
                                                 bool opMod, const cow_String& setName, double scale)
    : boltLoad_(boltLoad), stepName_(stepName), setName_(setName), opMod_(opMod),
      clear_(boltLoad.Status(stepName) == mdl_PropagationStatusEnm::DEACTIVATED ||
             boltLoad.BoltState(stepName).boltMethod.ConstGet() == Method::APPLY_FORCE),
      scale_(scale) {
    if (clear_) opMod_ = false;
}

void oif_BoundaryForBoltLoad::Write(utl_Stream& stream) const {
    if (clear_) {
        WriteBCCard(stream, false);
        return;
    }
    const kloC_BoltLoadState& state = boltLoad_.ConstGet().BoltState(stepName_);
    const Method method = state.boltMethod.ConstGet();
    WriteBCCard(stream, method == Method::FIX_LENGTH);
    WriteBCData(stream, method == Method::ADJUST_LENGTH ? state.adjustment.ConstGet() : 0.0);
}

void oif_BoundaryForBoltLoad::WriteBCCard(utl_Stream& stream, bool fixed) const {
    stream << "*Boundary";
    if (!opMod_) stream << ", op=NEW";
    if (fixed) stream << ", fixed";
    stream.LineBreak();
}

void oif_BoundaryForBoltLoad::WriteBCData(utl_Stream& stream, double value) const {
    stream << setName_ << ", 1, 1";
    if (value * scale_ != 0.0) stream << ", " << value * scale_;
    stream.LineBreak();
}
