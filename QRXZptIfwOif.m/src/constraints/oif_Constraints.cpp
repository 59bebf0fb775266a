#include "constraints/oif_Constraints.h"

#include "base/oif_KeywordLine.h"
#include "mesh/oif_SetName.h"

namespace {

/// Parameters behind which, unlike elsewhere, the line may break: the next one's comma opens a new line.
class BrokenBehind {
public:
    explicit BrokenBehind(utl_Stream& stream) : stream_(stream) {}
    BrokenBehind& Word(bool given, const char* word) {
        if (given) stream_ << word;
        if (given) stream_.OptionalLineBreak();
        return *this;
    }
    BrokenBehind& Value(bool given, const char* parameter, double value) {
        if (given) stream_ << parameter << value;
        if (given) stream_.OptionalLineBreak();
        return *this;
    }

private:
    utl_Stream& stream_;
};

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
    stream << "*Tie, name=" << qkw_QuorixName(name_, false);
    if (record_.IsNull()) {
        if (tolerance_ > 0.0) stream << ", position tolerance=" << tolerance_;
    } else {
        const kcoC_Tie& tie = record_.ConstGet();
        stream << (tie.adjust ? ", adjust=yes" : ", adjust=no");
        BrokenBehind(stream)
            .Value(tie.positionToleranceMethod == 1, ", position tolerance=", tie.positionTolerance)
            .Word(!tie.tieRotations, ", no rotation")
            .Value(tie.constraintRatioMethod == 1, ", constraint ratio=", tie.constraintRatio)
            .Word(cyclic_, ", cyclic symmetry");
        if (tie.type == 1) stream << ", type=NODE TO SURFACE";
        if (tie.type == 2) stream << ", type=SURFACE TO SURFACE";
        BrokenBehind(stream).Word(!tie.thickness, ", no thickness");
    }
    stream.LineBreak();
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
    stream << "*Coupling, constraint name=" << qkw_QuorixName(name_, false);
    if (!hasRecord_) return;
    stream << ", ref node=" << qkw_QuorixName(refNode_, false)
           << ", surface=" << qkw_QuorixName(surface_, false);
    if (influenceRadius_ != kcoC_Coupling::influenceRadiusDef()) {
        stream << ", influence radius=" << influenceRadius_;
    }
    if (!orientation_.IsEmpty()) stream << ", orientation=" << orientation_;
    stream.LineBreak();
}

void oif_Kinematic::Write(utl_Stream& stream) const {
    stream << "*Kinematic";
    stream.LineBreak();
    WriteDegreesOfFreedom(stream, coupling_);
}

void oif_Distributing::Write(utl_Stream& stream) const {
    static constexpr const char* methods[] = {"UNIFORM", "LINEAR", "QUADRATIC", "CUBIC"};
    const int method = coupling_.weightingMethod;
    stream << "*Distributing, weighting method=" << (method >= 0 && method < 4 ? methods[method] : "");
    stream.LineBreak();
    WriteDegreesOfFreedom(stream, coupling_);
}

void oif_RigidBody::Write(utl_Stream& stream) const {
    stream << "*Rigid Body, ref node=" << refNode_;
    if (!elset_.IsEmpty()) stream << ", elset=" << elset_;
    oif_KeywordLine(stream, "")
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
    stream << "*Embedded Element, host elset=" << host_;
    if (absoluteTolerance_ != 0.0) stream << ", absolute exterior tolerance=" << absoluteTolerance_;
    if (fractionalTolerance_ != kcoC_EmbeddedRegion::fractionalToleranceDef()) {
        stream << ", exterior tolerance=" << fractionalTolerance_;
    }
    if (weightFactorTolerance_ != kcoC_EmbeddedRegion::weightFactorToleranceDef()) {
        stream << ", roundoff tolerance=" << weightFactorTolerance_;
    }
    stream.LineBreak();
    stream << embedded_;
    stream.LineBreak();
}

oif_Equation::oif_Equation(const cow_String& name, const kcoC_Constraint& constraint)
    : name_(name), terms_(nex_canDynamicCastRef<kcoC_Equation>(constraint, NEX_HERE).terms) {}

void oif_Equation::Write(utl_Stream& stream) const {
    stream << "*Equation";
    stream.LineBreak();
    stream << terms_.Length();
    stream.LineBreak();
    for (int i = 0; i < terms_.Length(); ++i) {
        const kcoC_EquationTerm& term = terms_[i];
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
    stream << "*Shell to Solid Coupling, constraint name=" << qkw_QuorixName(name_, false);
    BrokenBehind(stream)
        .Value(record_.positionToleranceMethod == 1, ", position tolerance=", record_.positionTolerance)
        .Value(record_.influenceDistanceMethod == 1, ", influence distance=", record_.influenceDistance);
    stream.LineBreak();
    stream << shellEdge_ << ", " << solidFace_;
    stream.LineBreak();
}

void oif_CyclicSymmetryModel::Write(utl_Stream& stream) const {
    stream << "*Cyclic Symmetry Model, n=" << numberOfSectors_;
    stream.LineBreak();
    WritePoint(stream, start_);
    stream << ", ";
    WritePoint(stream, end_);
    stream.LineBreak();
}
