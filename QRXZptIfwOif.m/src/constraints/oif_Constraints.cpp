#include "constraints/oif_Constraints.h"

#include "base/oif_KeywordLine.h"
#include "mesh/oif_SetName.h"

namespace {

void WriteDegreesOfFreedom(utl_Stream& stream, const kcoC_Coupling& coupling) {
    const bool isTied[] = {coupling.u1, coupling.u2, coupling.u3, coupling.ur1, coupling.ur2, coupling.ur3};
    // No line at all stands for all of them.
    bool all = true;
    for (const bool tied : isTied) all = all && tied;
    if (all) return;
    int dof = 0;
    for (const bool tied : isTied) {
        ++dof;
        if (!tied) continue;
        stream << dof << ", " << dof;
        stream.LineBreak();
    }
}

void WritePoint(utl_Stream& stream, const g3d_Vector& point) {
    stream << static_cast<float>(point.x) << ", " << static_cast<float>(point.y) << ", "
           << static_cast<float>(point.z);
}

} // namespace

oif_Tie::oif_Tie(const cow_String& name, const kcoC_Tie& tie, const qkw_ModelInfo& modelInfo, bool cyclic)
    : name_(name), master_(oif_SurfaceName(tie.master, modelInfo)),
      slave_(oif_SurfaceName(tie.slave, modelInfo)), record_(tie), cyclic_(cyclic) {}

void oif_Tie::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Tie");
    line.Fixed(", name=", qkw_QuorixName(name_, false));
    if (record_.IsNull()) {
        line.FixedIf(tolerance_ > 0.0, ", position tolerance=", tolerance_);
    } else {
        // Unlike elsewhere, the line may break behind a parameter: the next one's comma opens a new line.
        const kcoC_Tie& tie = record_.ConstGet();
        line.Fixed(tie.adjust ? ", adjust=yes" : ", adjust=no");
        if (tie.positionToleranceMethod == 1) {
            line.Fixed(", position tolerance=", tie.positionTolerance).MayBreak();
        }
        if (!tie.tieRotations) line.Fixed(", no rotation").MayBreak();
        if (tie.constraintRatioMethod == 1) line.Fixed(", constraint ratio=", tie.constraintRatio).MayBreak();
        if (cyclic_) line.Fixed(", cyclic symmetry").MayBreak();
        line.FixedIf(tie.type == 1, ", type=NODE TO SURFACE");
        line.FixedIf(tie.type == 2, ", type=SURFACE TO SURFACE");
        if (!tie.thickness) line.Fixed(", no thickness").MayBreak();
    }
    line.End();
    stream << slave_ << ", " << master_;
    stream.LineBreak();
}

oif_Coupling::oif_Coupling(const cow_String& name, const kcoC_Coupling& coupling,
                           const qkw_ModelInfo& modelInfo)
    : name_(name), refNode_(oif_RegionName(coupling.refNode, modelInfo)),
      surface_(oif_SurfaceName(coupling.surface, modelInfo)), influenceRadius_(coupling.influenceRadius) {
    if (coupling.orientation.IsNullRef()) return;
    orientation_ = modelInfo.GetOrientationName(coupling.orientation, 0.0, cow_String());
}

void oif_Coupling::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Coupling");
    line.Fixed(", constraint name=", qkw_QuorixName(name_, false));
    if (!hasRecord_) return;
    line.Fixed(", ref node=", qkw_QuorixName(refNode_, false))
        .Fixed(", surface=", qkw_QuorixName(surface_, false))
        .FixedUnless(", influence radius=", influenceRadius_, kcoC_Coupling::influenceRadiusDef())
        .FixedUnless(", orientation=", orientation_, cow_String())
        .End();
}

void oif_Kinematic::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Kinematic").End();
    WriteDegreesOfFreedom(stream, coupling_);
}

void oif_Distributing::Write(utl_Stream& stream) const {
    static constexpr const char* methods[] = {"UNIFORM", "LINEAR", "QUADRATIC", "CUBIC"};
    const int method = coupling_.weightingMethod;
    oif_KeywordLine(stream, "*Distributing")
        .Fixed(", weighting method=", method >= 0 && method < 4 ? methods[method] : "")
        .End();
    WriteDegreesOfFreedom(stream, coupling_);
}

void oif_RigidBody::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Rigid Body")
        .Fixed(", ref node=", refNode_)
        .FixedUnless(", elset=", elset_, cow_String())
        .BreakingUnless("pin nset=", pinNset_, cow_String())
        .BreakingUnless("tie nset=", tieNset_, cow_String())
        .BreakingUnless("analytical surface=", analyticalSurface_, cow_String())
        .BreakingIf(centerOfMass_, "position=CENTER OF MASS")
        .BreakingIf(isothermal_, "isothermal=YES")
        .End();
}

oif_EmbeddedRegion::oif_EmbeddedRegion(const cow_String& name, const kcoC_EmbeddedRegion& region,
                                       const qkw_ModelInfo& modelInfo)
    : oif_EmbeddedRegion(name, oif_RegionName(region.host, modelInfo),
                         oif_RegionName(region.embedded, modelInfo), region.fractionalTolerance,
                         region.absoluteTolerance, region.weightFactorTolerance, modelInfo) {}

void oif_EmbeddedRegion::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Embedded Element")
        .Fixed(", host elset=", host_)
        .FixedUnless(", absolute exterior tolerance=", absoluteTolerance_, 0.0)
        .FixedUnless(", exterior tolerance=", fractionalTolerance_,
                     kcoC_EmbeddedRegion::fractionalToleranceDef())
        .FixedUnless(", roundoff tolerance=", weightFactorTolerance_,
                     kcoC_EmbeddedRegion::weightFactorToleranceDef())
        .End();
    stream << embedded_;
    stream.LineBreak();
}

oif_Equation::oif_Equation(const cow_String& name, const kcoC_Constraint& constraint)
    : name_(name), terms_(nex_canDynamicCastRef<kcoC_Equation>(constraint, NEX_HERE).terms) {}

void oif_Equation::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Equation").End();
    stream << terms_.Length();
    stream.LineBreak();
    for (const kcoC_EquationTerm& term : terms_) {
        stream << qkw_QuorixName(term.setName, false) << ", " << term.dof << ", " << term.coefficient;
        stream.LineBreak();
    }
}

oif_ShellSolidCoupling::oif_ShellSolidCoupling(const cow_String& name,
                                               const kcoC_ShellSolidCoupling& coupling,
                                               const qkw_ModelInfo& modelInfo)
    : name_(name), shellEdge_(oif_SurfaceName(coupling.shellEdge, modelInfo)),
      solidFace_(oif_SurfaceName(coupling.solidFace, modelInfo)), record_(coupling) {}

void oif_ShellSolidCoupling::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Shell to Solid Coupling");
    line.Fixed(", constraint name=", qkw_QuorixName(name_, false));
    if (record_.positionToleranceMethod == 1) {
        line.Fixed(", position tolerance=", record_.positionTolerance).MayBreak();
    }
    if (record_.influenceDistanceMethod == 1) {
        line.Fixed(", influence distance=", record_.influenceDistance).MayBreak();
    }
    line.End();
    stream << shellEdge_ << ", " << solidFace_;
    stream.LineBreak();
}

void oif_CyclicSymmetryModel::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Cyclic Symmetry Model").Fixed(", n=", numberOfSectors_).End();
    WritePoint(stream, start_);
    stream << ", ";
    WritePoint(stream, end_);
    stream.LineBreak();
}
