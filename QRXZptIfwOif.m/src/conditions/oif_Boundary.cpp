#include "conditions/oif_Boundary.h"

#include "base/oif_Utils.h"
#include "foundation/nex_Exception.h"
#include "store_interface/records/steps/kprC_StaticSteps.h"

using BoundaryDistribution = kbcC_BC::DistribTypeEnum;
using Method = kloC_BoltLoad::MethodEnm;

namespace {

constexpr std::string_view kBaseNamePrefix = "__basename__";

} // namespace

oif_ConditionKeyword::oif_ConditionKeyword(const Style& style, const oif_BCCard& card,
                                           const cow_String& initialStepName)
    : style_(&style), card_(card), modifiedOnly_(card.op == oif_Op::MODIFY),
      initialStepName_(initialStepName) {
    const auto& quad = card_.Quad();
    oif_Utils::SetDeactivateOpFlags(quad.status, deactivated_, modifiedOnly_);
    if (deactivated_) return;
    const auto& amplitude = quad.state.ConstGet().amplitude;
    amplitude_ = amplitude.ConstGet();
    const bool cleared = amplitude.State() == mdl_PropAttributeStateEnm::CLEARED;
    // A card speaks for all its lines, so a new amplitude calls for all components.
    if (IsSaid(amplitude.State()) || (cleared && style.clearedAmplitudeIsNew)) modifiedOnly_ = false;
}

void oif_ConditionKeyword::Write(utl_Stream& stream) const {
    if (deactivated_)
        return WriteBoundaryCard(stream, BoundaryDistribution::UNIFORM, false, IsBuckling() ? 1 : 0);
    const oif_BCRow* row = oif_FindBCRow(Condition().DynTypeId());
    if (row == nullptr || row->family != style_->family) nex_Raise(style_->failure);
    row->write(*this, stream);
}

bool oif_ConditionKeyword::IsSaid(mdl_PropAttributeStateEnm state) const {
    return oif_Utils::CheckDataState(state, modifiedOnly_);
}

unsigned oif_ConditionKeyword::Procedure() const {
    return card_.step == initialStepName_ ? 0 : card_.Quad().procedureType;
}

bool oif_ConditionKeyword::IsBuckling() const {
    return Procedure() == kprC_BuckleStep::TypeId();
}

void oif_ConditionKeyword::WriteBoundaryCard(utl_Stream& stream, BoundaryDistribution distributionType,
                                             bool fixed, int loadCase, const char* type) const {
    oif_KeywordLine line(stream, style_->keyword);
    line.Op(card_.op)
        .Amplitude(amplitude_)
        .BreakingIf(loadCase == 1 || loadCase == 2, "load case=", loadCase)
        .BreakingIf(fixed, "fixed")
        .BreakingIf(distributionType == BoundaryDistribution::USER_DEFINED, "user");
    WriteBaseName(line);
    line.BreakingIf(type != nullptr, type).End();
}

template <class Block>
void oif_ConditionKeyword::ForEachLoadCase(const Block& block) const {
    if (!IsBuckling()) {
        block(0);
        return;
    }
    const int entered = card_.Quad().state.ConstGet().BuckleCase();
    for (const int loadCase : {1, 2}) {
        if (entered == 0 || entered == 3 || entered == loadCase) block(loadCase);
    }
}

void oif_ConditionKeyword::WriteDisplacements(utl_Stream& stream, bool fixed) const {
    const BoundaryDistribution distribution = Condition().distributionType;
    if (UsesComplex()) {
        for (const int loadCase : {1, 2}) {
            WriteBoundaryCard(stream, distribution, fixed, loadCase);
            WriteComponents(stream, fixed, loadCase == 2);
        }
        return;
    }
    ForEachLoadCase([&](int loadCase) {
        WriteBoundaryCard(stream, distribution, fixed, loadCase);
        WriteComponents(stream, fixed, false);
    });
}

void oif_ConditionKeyword::WriteRates(utl_Stream& stream, const char* type, bool held) const {
    // Of a complex value only the real part is ever written.
    WriteBoundaryCard(stream, Condition().distributionType, false, UsesComplex() || IsBuckling() ? 1 : 0,
                      type);
    WriteComponents(stream, held, false);
}

void oif_ConditionKeyword::WriteComponents(utl_Stream& stream, bool held, bool imaginary) const {
    const kbcC_BCState& state = card_.Quad().state.ConstGet();
    for (int i = 0; i < 6; ++i) {
        const kbcC_Component component = state.Component(i);
        if (!IsSaid(component.state)) continue;
        WriteLine(stream, Dof(i + 1),
                  held ? 0.0 : (imaginary ? component.imag : component.real) * card_.Factor());
    }
}

void oif_ConditionKeyword::WriteLine(utl_Stream& stream, const cow_String& dofs, double value) const {
    stream << card_.setName << dofs;
    if (value != 0.0) stream << ", " << value;
    stream.LineBreak();
}

cow_String oif_ConditionKeyword::Dof(int number) const {
    const cow_String one = cow_String(", ") + cow_String(number);
    return style_->dofRange ? one + one : one;
}

oif_Boundary::oif_Boundary(const oif_BCCard& card, bool shellToSolid, const cow_String& initialStepName)
    : qkw_KeywordOf(kStyle, card, initialStepName), shellToSolid_(shellToSolid) {
    CheckForSubmodelBC();
}

void oif_Boundary::CheckForSubmodelBC() {
    const kbcC_BC& bc = Condition();
    if (bc.DynTypeId() != kbcC_SubmodelBC::TypeId()) return;
    const auto& state = State<kbcC_SubmodelBCState>();
    bool held = false;
    if (!bc.suppressed && kbcC_SubmodelBC::IsSubmodelActive(card_.Quad().status)) {
        held = state.centerZone.ConstGet();
        isBCSubmodel_ = !held;
    }
    submodelKeyword_ = style_->keyword;
    if (card_.op == oif_Op::NEW) submodelKeyword_ += ", op=NEW";
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

void oif_Boundary::WriteBaseName(oif_KeywordLine& line) const {
    const cow_String fixedName = FixBCNameHack(card_.name);
    if (fixedName != card_.name) line.Fixed(", base name=", qkw_QuorixName(fixedName, false));
}

void oif_Boundary::WriteType(utl_Stream& stream) const {
    const auto& typeName = State<kbcC_TypeBCState>().typeName;
    if (!IsSaid(typeName.State())) return;
    const cow_String support =
        cow_String(", ") + omu_PrimEnum<kbcC_TypeBC::TypeNameEnm, 1>(typeName.ConstGet()).GetString();
    ForEachLoadCase([&](int loadCase) {
        WriteBoundaryCard(stream, Condition().distributionType, false, loadCase);
        WriteLine(stream, support, 0.0);
    });
}

void oif_Boundary::WriteTemperature(utl_Stream& stream, const kbcC_TemperatureBC& bc) const {
    const auto& dofs = State<kbcC_TemperatureBCState>().dofs;
    const double value = bc.Magnitude(card_.step) * card_.Factor();
    const bool valueIsSaid = IsSaid(bc.MagnitudeState(card_.step));
    WriteBoundaryCard(stream, bc.distributionType, false, 0);
    if (!bc.dofsGiven) {
        if (valueIsSaid) WriteLine(stream, Dof(11), value);
    } else if (valueIsSaid || IsSaid(dofs.State())) {
        const cow_List<int>& numbers = dofs.ConstGet();
        for (const int number : numbers) WriteLine(stream, Dof(number), value);
    }
}

// Unlike a displacement's, the value stands beside "fixed" too.
void oif_Boundary::WriteDistributed(utl_Stream& stream, const kbcC_DistributedBC& bc, int dof) const {
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 0);
    if (IsSaid(bc.MagnitudeState(card_.step))) {
        WriteLine(stream, Dof(dof), bc.Magnitude(card_.step) * card_.Factor());
    }
}

void oif_Boundary::WriteComplexDistributed(utl_Stream& stream, const kbcC_DistributedBC& bc, int dof) const {
    if (!UsesComplex()) {
        WriteDistributed(stream, bc, dof);
        return;
    }
    // Both parts are always written, changed or not.
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 1);
    WriteLine(stream, Dof(dof), bc.Magnitude(card_.step) * card_.Factor());
    WriteBoundaryCard(stream, bc.distributionType, bc.fixed, 2);
    WriteLine(stream, Dof(dof), bc.ImaginaryMagnitude(card_.step) * card_.Factor());
}

void oif_Boundary::WriteSubmodel(utl_Stream& stream, const kbcC_SubmodelBC& bc) const {
    // A boundary that is held gets its data lines all the same.
    if (!isBCSubmodel_) {
        stream << submodelKeyword_;
        stream.LineBreak();
    }
    const auto& state = State<kbcC_SubmodelBCState>();
    if (shellToSolid_) {
        const double zone = state.shellThicknessValue.ConstGet();
        const double value = zone > 0.0 ? zone : bc.shellThickness * 0.1;
        // The thickness stands in the place of the degree of freedom, as a name's text would.
        WriteLine(stream, cow_String(", ") + cow_String(value), 0.0);
        return;
    }
    for (const int number : state.dofs.ConstGet()) WriteLine(stream, Dof(number), 0.0);
}

oif_ConnectorMotion::oif_ConnectorMotion(const oif_BCCard& card, const cow_String& initialStepName)
    : qkw_KeywordOf(kStyle, card, initialStepName) {}

oif_BoundaryForBoltLoad::oif_BoundaryForBoltLoad(const oif_LoadCard& card, const kloC_BoltLoad& boltLoad)
    : boltLoad_(boltLoad), stepName_(card.step), setName_(card.setName), op_(card.op),
      clear_(card.Quad().status == mdl_PropagationStatusEnm::DEACTIVATED || boltLoad.IsByForce(card.step)),
      scale_(card.Factor()) {
    if (clear_) op_ = oif_Op::NEW;
}

void oif_BoundaryForBoltLoad::Write(utl_Stream& stream) const {
    if (clear_) return WriteBCCard(stream, false);
    const kloC_BoltLoadState& state = boltLoad_.ConstGet().BoltState(stepName_);
    const Method method = state.boltMethod.ConstGet();
    WriteBCCard(stream, method == Method::FIX_LENGTH);
    WriteBCData(stream, method == Method::ADJUST_LENGTH ? state.adjustment.ConstGet() : 0.0);
}

void oif_BoundaryForBoltLoad::WriteBCCard(utl_Stream& stream, bool fixed) const {
    oif_KeywordLine(stream, "*Boundary").Op(op_).FixedIf(fixed, ", fixed").End();
}

void oif_BoundaryForBoltLoad::WriteBCData(utl_Stream& stream, double value) const {
    stream << setName_ << ", 1, 1";
    if (value * scale_ != 0.0) stream << ", " << value * scale_;
    stream.LineBreak();
}
