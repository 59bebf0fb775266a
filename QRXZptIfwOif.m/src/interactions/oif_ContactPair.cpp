#include "interactions/oif_ContactPair.h"

#include "base/oif_KeywordLine.h"
#include "interactions/oif_InteractionRow.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"

#include <limits>

namespace {

const char* MechanicalConstraintWord(int constraint) {
    // Any other number leaves the parameter without a value.
    return constraint == 0 ? "KINEMATIC" : constraint == 1 ? "PENALTY" : "";
}

qkw_QuorixName PropertyName(const kinC_ContactPairState& state) {
    return {state.InteractionProperty.ConstGet(), false};
}

template <class Contact>
oif_KeywordLine& AddExplicitPair(oif_KeywordLine& line, const Contact& contact,
                                 const kinC_ContactPairState& state) {
    return line.Fixed(", interaction=", PropertyName(state))
        .Fixed(", mechanical constraint=", MechanicalConstraintWord(contact.mechanicalConstraint));
}

} // namespace

oif_ContactKeyword::oif_ContactKeyword(const mdl_ObjCow<kinC_Interaction>& interaction,
                                       const cow_String& step, const qkw_ModelInfo& modelInfo)
    : interaction_(interaction), step_(step) {
    const auto* pair = nex_canDynamicCastPtr<kinC_ContactPair>(interaction_.Referent());
    if (pair == nullptr) return;
    master_ = oif_SurfaceName(pair->MasterSurface(), modelInfo);
    slave_ = oif_SurfaceName(pair->SlaveSurface(), modelInfo);
}

oif_ContactPair::oif_ContactPair(const cow_String& name, const mdl_ObjCow<kinC_Interaction>& interaction,
                                 const cow_String& step, const qkw_ModelInfo& modelInfo, bool cpset)
    : qkw_KeywordOf(interaction, step, modelInfo), name_(name), cpset_(cpset) {
    const auto* contact = nex_canDynamicCastPtr<kinC_SurfaceToSurfaceContactStd>(interaction_.Referent());
    if (contact != nullptr) adjustSetName_ = oif_RegionName(contact->adjustRegion, modelInfo);
}

oif_ContactPair::oif_ContactPair(const cow_String& name, const rgnC_Region& second, const rgnC_Region& first,
                                 double adjust, const qkw_ModelInfo& modelInfo)
    : name_(name), adjust_(adjust) {
    slave_ = oif_SurfaceName(first, modelInfo);
    master_ = oif_SurfaceName(second, modelInfo);
}

oif_ContactPair::oif_ContactPair(const cow_String& name, const kcoC_Tie& tie, const cow_String&,
                                 const qkw_ModelInfo& modelInfo, bool cpset)
    : name_(name), cpset_(cpset) {
    slave_ = oif_SurfaceName(tie.slave, modelInfo);
    master_ = oif_SurfaceName(tie.master, modelInfo);
    if (tie.positionToleranceMethod == 1) adjust_ = tie.positionTolerance;
}

void oif_ContactPair::Write(utl_Stream& stream) const {
    if (interaction_.IsNull()) {
        WriteTied(stream);
        return;
    }
    const kinC_Interaction& interaction = interaction_.ConstGet();
    const oif_InteractionRow* row = oif_FindInteractionRow(interaction.DynTypeId());
    if (row == nullptr || row->pair == nullptr) nex_Raise("Unimplemented interaction print");
    row->pair(stream, *this, interaction);
}

void oif_ContactPair::WriteTied(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Contact Pair, tied");
    if (adjust_) line.Fixed(", adjust=", *adjust_);
    // The name of the interaction goes out bare.
    line.Fixed(", interaction=_", name_);
    AddCpset(line).End();
    stream << slave_ << ", " << master_ << endl;
}

void oif_ContactPair::WritePair(utl_Stream& stream, const kinC_SurfaceToSurfaceContactStd& contact) const {
    using Contact = kinC_SurfaceToSurfaceContactStd;
    const bool smallSliding = contact.sliding == 0;
    const bool surfaceToSurface = contact.formulation == 1;
    oif_KeywordLine line(stream, "*Contact Pair");
    line.Fixed(", interaction=", PropertyName(contact.ConstGetState(step_)))
        .BreakingIf(smallSliding, "small sliding")
        .BreakingIf(!smallSliding && contact.limitSlideDistance, "slide distance=", contact.slideDistance)
        .BreakingIf(surfaceToSurface, "type=SURFACE TO SURFACE")
        .BreakingIf(!contact.thickness && (surfaceToSurface || smallSliding), "no thickness")
        .BreakingIf(!contact.autoHcrit, "hcrit=", contact.hcrit)
        .BreakingUnless("smooth=", contact.smooth, Contact::smoothDef())
        .BreakingUnless("extension zone=", contact.extensionZone, Contact::extensionZoneDef())
        .BreakingIf(!contact.geometricCorrection.IsEmpty(),
                    "geometric correction=", oif_SetName::QuoteIfNeeded(contact.geometricCorrection));
    switch (contact.adjust) {
    case kinC_StdAdjustEnm::NONE: break;
    case kinC_StdAdjustEnm::ZERO: line.Breaking("adjust=0.0"); break;
    case kinC_StdAdjustEnm::TOLERANCE: line.Breaking("adjust=", contact.adjustTolerance); break;
    case kinC_StdAdjustEnm::SET: line.Breaking("adjust=", adjustSetName_); break;
    }
    line.BreakingIf(contact.tied, "tied").BreakingIf(cpset_, "cpset=", qkw_QuorixName(name_, false)).End();
    stream << slave_ << ", " << master_ << endl;
}

void oif_ContactPair::WritePair(utl_Stream& stream, const kinC_SurfaceToSurfaceContactXpl& contact) const {
    const auto& state = contact.ConstGetState(step_);
    oif_KeywordLine line(stream, "*Contact Pair");
    if (state.opDelete) {
        line.Fixed(", op=DELETE");
    } else {
        AddExplicitPair(line, contact, state)
            .FixedIf(contact.weightingChoice == 1, ", weight=", contact.weight)
            .FixedIf(contact.sliding == 0, ", small sliding");
    }
    AddCpset(line).End();
    stream << slave_ << ", " << master_ << endl;
}

void oif_ContactPair::WritePair(utl_Stream& stream, const kinC_SelfContactStd& contact) const {
    oif_KeywordLine line(stream, "*Contact Pair");
    line.Fixed(", interaction=", PropertyName(contact.ConstGetState(step_)));
    AddCpset(line);
    // Lines break behind a parameter here, not behind the comma ahead of it.
    if (contact.smooth != kinC_SelfContactStd::smoothDef()) {
        line.Fixed(", smooth=", contact.smooth).MayBreak();
    }
    if (contact.formulation == 1) {
        line.Fixed(", type=SURFACE TO SURFACE").MayBreak();
        if (!contact.thickness) line.Fixed(", no thickness").MayBreak();
    }
    line.End();
    stream << slave_ << "," << endl;
}

void oif_ContactPair::WritePair(utl_Stream& stream, const kinC_SelfContactXpl& contact) const {
    const auto& state = contact.ConstGetState(step_);
    oif_KeywordLine line(stream, "*Contact Pair");
    if (state.opDelete) {
        // Unlike a pair of two surfaces, without the set of contact pairs.
        line.Fixed(", op=DELETE");
    } else {
        AddCpset(AddExplicitPair(line, contact, state));
    }
    line.End();
    stream << slave_ << "," << endl;
}

oif_KeywordLine& oif_ContactPair::AddCpset(oif_KeywordLine& line) const {
    return line.FixedIf(cpset_, ", cpset=", qkw_QuorixName(name_, false));
}

oif_ModelChange::oif_ModelChange(const cow_String&, const mdl_ObjCow<kinC_Interaction>& interaction,
                                 const cow_String& step, const qkw_ModelInfo& modelInfo, bool remove)
    : qkw_KeywordOf(interaction, step, modelInfo), remove_(remove) {}

void oif_ModelChange::Write(utl_Stream& stream) const {
    const kinC_Interaction& interaction = interaction_.ConstGet();
    oif_KeywordLine line(stream, "*Model Change, type=CONTACT PAIR");
    if (oif_SolverOf(interaction) != oif_ContactSolver::IMPLICIT) {
        nex_Raise("No *Model Change for this interaction.");
    }
    const bool isSelf = nex_canDynamicCastPtr<kinC_SelfContact>(&interaction) != nullptr;
    const bool remove = remove_ || interaction.GetPropStatus(step_) == mdl_PropagationStatusEnm::DEACTIVATED;
    line.Fixed(remove ? ", remove" : ", add").End();
    // A surface with itself: the comma and the blank stay.
    stream << slave_ << ", " << (isSelf ? cow_String() : master_) << endl;
}

const kinC_SurfaceToSurfaceContactStdState*
oif_ContactInterference::State(const mdl_ObjCow<kinC_Interaction>& interaction, const cow_String& step) {
    const auto* contact = nex_canDynamicCastPtr<kinC_SurfaceToSurfaceContactStd>(interaction.Referent());
    return contact == nullptr ? nullptr : &contact->ConstGetState(step);
}

bool oif_ContactInterference::HasNone(const mdl_ObjCow<kinC_Interaction>& interaction,
                                      const cow_String& step) {
    const auto* state = State(interaction, step);
    return state != nullptr && state->interferenceType.ConstGet() == kinC_InterferenceTypeEnm::NONE;
}

void oif_ContactInterference::Write(utl_Stream& stream) const {
    const auto* state = State(interaction_, step_);
    if (state == nullptr || IsEmpty()) return;
    const kinC_InterferenceTypeEnm type = state->interferenceType.ConstGet();
    const bool shrink = type == kinC_InterferenceTypeEnm::SHRINK_FIT;
    oif_KeywordLine line(stream, "*Contact Interference");
    if (type == kinC_InterferenceTypeEnm::UNIFORM_FIT) line.Amplitude(state->amplitude.ConstGet());
    line.FixedIf(shrink, ", shrink").End();
    stream << slave_ << ", " << master_;
    if (!shrink) {
        // The comma and the blank stand without a direction too.
        stream << ", " << state->interferenceValue.ConstGet() << ", ";
        if (state->directionType.ConstGet() == kinC_InterferenceDirectionTypeEnm::SPECIFIED) {
            const cow_List<float>& direction = state->direction.ConstGet();
            stream << direction[0] << ", " << direction[1] << ", " << direction[2];
        }
    }
    stream << endl;
}

void oif_Clearance::Write(utl_Stream& stream) const {
    if (contact_.IsNull()) return;
    const kinC_SurfaceToSurfaceContact& contact = contact_.ConstGet();
    if (contact.ClearanceType() == kinC_ClearanceTypeEnm::NONE) return;
    oif_KeywordLine line(stream, "*Clearance");
    switch (oif_SolverOf(contact)) {
    case oif_ContactSolver::NONE: break;
    case oif_ContactSolver::IMPLICIT: line.Fixed(", master=", master_).Fixed(", slave=", slave_); break;
    case oif_ContactSolver::EXPLICIT: line.Fixed(", cpset=", qkw_QuorixName(cpset_, false)); break;
    }
    if (contact.ClearanceType() == kinC_ClearanceTypeEnm::SINGLE_VALUE) {
        line.Fixed(", value=", contact.initialClearance).End();
    } else {
        line.Fixed(", bolt").Fixed(", tabular").End();
        WriteBolt(stream, contact);
    }
}

void oif_Clearance::WriteBolt(utl_Stream& stream, const kinC_SurfaceToSurfaceContact& contact) const {
    stream << contact.halfThreadAngle << ", " << contact.pitch;
    for (const double diameter : {contact.majorBoltDiameter, contact.meanBoltDiameter}) {
        stream << ", ";
        if (diameter != cls_UnsetDouble) stream << diameter;
    }
    stream << endl << setName_ << ", ";
    if (contact.initialClearance != cls_UnsetDouble &&
        contact.initialClearance != std::numeric_limits<double>::min()) {
        stream << contact.initialClearance;
    }
    stream << endl;
}
