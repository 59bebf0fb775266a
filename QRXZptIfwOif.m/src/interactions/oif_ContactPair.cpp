#include "interactions/oif_ContactPair.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/constraints/kcoC_Constraints.h"
#include "store_interface/records/interactions/kinC_CyclicSymmetry.h"

#include <limits>

namespace {

const char* MechanicalConstraintWord(int constraint) {
    // Any other number leaves the parameter without a value.
    return constraint == 0 ? "KINEMATIC" : constraint == 1 ? "PENALTY" : "";
}

/// ", interaction=" and ", mechanical constraint=".
template <class Contact>
void WriteExplicitPair(utl_Stream& stream, const Contact& contact, const kinC_ContactPairState& state) {
    stream << ", interaction=" << qkw_QuorixName(state.InteractionProperty.ConstGet(), false)
           << ", mechanical constraint=" << MechanicalConstraintWord(contact.mechanicalConstraint);
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
    switch (interaction.DynTypeId()) {
    case kinC_SurfaceToSurfaceContactStd::Class.Id():
        WriteStandard(stream, static_cast<const kinC_SurfaceToSurfaceContactStd&>(interaction));
        break;
    case kinC_SurfaceToSurfaceContactXpl::Class.Id():
        WriteExplicit(stream, static_cast<const kinC_SurfaceToSurfaceContactXpl&>(interaction));
        break;
    case kinC_SelfContactStd::Class.Id():
        WriteStandardSelf(stream, static_cast<const kinC_SelfContactStd&>(interaction));
        break;
    case kinC_SelfContactXpl::Class.Id():
        WriteExplicitSelf(stream, static_cast<const kinC_SelfContactXpl&>(interaction));
        break;
    case kinC_ElasticFoundation::Class.Id(): break;
    default: nex_Raise("Unimplemented interaction print");
    }
}

void oif_ContactPair::WriteTied(utl_Stream& stream) const {
    stream << "*Contact Pair, tied";
    if (adjust_) stream << ", adjust=" << *adjust_;
    // The name of the interaction goes out bare.
    stream << ", interaction=_" << name_;
    WriteCpset(stream);
    stream << endl << slave_ << ", " << master_ << endl;
}

void oif_ContactPair::WriteStandard(utl_Stream& stream,
                                    const kinC_SurfaceToSurfaceContactStd& contact) const {
    using Contact = kinC_SurfaceToSurfaceContactStd;
    const bool smallSliding = contact.sliding == 0;
    const bool surfaceToSurface = contact.formulation == 1;
    oif_KeywordLine line(stream, "*Contact Pair, interaction=");
    line.Text(qkw_QuorixName(contact.ConstGetState(step_).InteractionProperty.ConstGet(), false))
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

void oif_ContactPair::WriteExplicit(utl_Stream& stream,
                                    const kinC_SurfaceToSurfaceContactXpl& contact) const {
    const auto& state = contact.ConstGetState(step_);
    stream << "*Contact Pair";
    if (state.opDelete) {
        stream << ", op=DELETE";
    } else {
        WriteExplicitPair(stream, contact, state);
        if (contact.weightingChoice == 1) stream << ", weight=" << contact.weight;
        if (contact.sliding == 0) stream << ", small sliding";
    }
    WriteCpset(stream);
    stream << endl << slave_ << ", " << master_ << endl;
}

void oif_ContactPair::WriteStandardSelf(utl_Stream& stream, const kinC_SelfContactStd& contact) const {
    stream << "*Contact Pair, interaction="
           << qkw_QuorixName(contact.ConstGetState(step_).InteractionProperty.ConstGet(), false);
    WriteCpset(stream);
    // Lines break behind a parameter here, not behind the comma ahead of it.
    if (contact.smooth != kinC_SelfContactStd::smoothDef()) {
        stream << ", smooth=" << contact.smooth;
        stream.OptionalLineBreak();
    }
    if (contact.formulation == 1) {
        stream << ", type=SURFACE TO SURFACE";
        stream.OptionalLineBreak();
        if (!contact.thickness) {
            stream << ", no thickness";
            stream.OptionalLineBreak();
        }
    }
    stream << endl << slave_ << "," << endl;
}

void oif_ContactPair::WriteExplicitSelf(utl_Stream& stream, const kinC_SelfContactXpl& contact) const {
    const auto& state = contact.ConstGetState(step_);
    stream << "*Contact Pair";
    if (state.opDelete) {
        // Unlike a pair of two surfaces, without the set of contact pairs.
        stream << ", op=DELETE";
    } else {
        WriteExplicitPair(stream, contact, state);
        WriteCpset(stream);
    }
    stream << endl << slave_ << "," << endl;
}

void oif_ContactPair::WriteCpset(utl_Stream& stream) const {
    if (cpset_) stream << ", cpset=" << qkw_QuorixName(name_, false);
}

oif_ModelChange::oif_ModelChange(const cow_String&, const mdl_ObjCow<kinC_Interaction>& interaction,
                                 const cow_String& step, const qkw_ModelInfo& modelInfo, bool remove)
    : qkw_KeywordOf(interaction, step, modelInfo), remove_(remove) {}

void oif_ModelChange::Write(utl_Stream& stream) const {
    const kinC_Interaction& interaction = interaction_.ConstGet();
    stream << "*Model Change, type=CONTACT PAIR";
    const unsigned type = interaction.DynTypeId();
    const bool isSelf = type == kinC_SelfContactStd::TypeId();
    if (!isSelf && type != kinC_SurfaceToSurfaceContactStd::TypeId()) {
        nex_Raise("No *Model Change for this interaction.");
    }
    const bool remove = remove_ || interaction.GetPropStatus(step_) == mdl_PropagationStatusEnm::DEACTIVATED;
    stream << (remove ? ", remove" : ", add") << endl;
    // A surface with itself: the comma and the blank stay.
    stream << slave_ << ", " << (isSelf ? cow_String() : master_) << endl;
}

const kinC_SurfaceToSurfaceContactStdState* oif_ContactInterference::State() const {
    const auto* contact = nex_canDynamicCastPtr<kinC_SurfaceToSurfaceContactStd>(interaction_.Referent());
    return contact == nullptr ? nullptr : &contact->ConstGetState(step_);
}

bool oif_ContactInterference::IsEmpty() const {
    const auto* state = State();
    return state != nullptr && state->interferenceType.ConstGet() == kinC_InterferenceTypeEnm::NONE;
}

void oif_ContactInterference::Write(utl_Stream& stream) const {
    const auto* state = State();
    if (state == nullptr || IsEmpty()) return;
    const kinC_InterferenceTypeEnm type = state->interferenceType.ConstGet();
    const bool shrink = type == kinC_InterferenceTypeEnm::SHRINK_FIT;
    const cow_String& amplitude = state->amplitude.ConstGet();
    stream << "*Contact Interference";
    if (type == kinC_InterferenceTypeEnm::UNIFORM_FIT && !amplitude.IsEmpty()) {
        stream << ", amplitude=" << qkw_QuorixName(amplitude, false);
    }
    if (shrink) stream << ", shrink";
    stream << endl << slave_ << ", " << master_;
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
    stream << "*Clearance";
    if (contact.DynTypeId() == kinC_SurfaceToSurfaceContactStd::TypeId()) {
        stream << ", master=" << master_ << ", slave=" << slave_;
    } else if (contact.DynTypeId() == kinC_SurfaceToSurfaceContactXpl::TypeId()) {
        stream << ", cpset=" << qkw_QuorixName(cpset_, false);
    }
    if (contact.ClearanceType() == kinC_ClearanceTypeEnm::SINGLE_VALUE) {
        stream << ", value=" << contact.initialClearance << endl;
    } else {
        WriteBolt(stream, contact);
    }
}

void oif_Clearance::WriteBolt(utl_Stream& stream, const kinC_SurfaceToSurfaceContact& contact) const {
    stream << ", bolt, tabular" << endl << contact.halfThreadAngle << ", " << contact.pitch;
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
