#include "interactions/oif_ContactControls.h"

#include "base/oif_KeywordLine.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

namespace {

void WriteStabilization(utl_Stream& stream, oif_KeywordLine& line, const kinC_StdContactControls& controls) {
    if (controls.stabilization == 0) return;
    line.Breaking("stabilize");
    if (controls.stabilization == 1) line.Text("=").Text(controls.dampCoef);
    line.BreakingUnless("tangent fraction=", controls.tangFraction,
                        kinC_StdContactControls::tangFractionDef());
    const bool hasZeroDamping = controls.zeroDampingChoice == 1;
    if (controls.stabilization != 2 && controls.zeroDampingClearance == 0.0 && !hasZeroDamping) return;
    stream << endl;
    if (controls.eosFraction == 0.0) {
        stream << " , ";
    } else {
        stream << controls.eosFraction << ", ";
    }
    stream << controls.zeroDampingClearance;
    if (hasZeroDamping) stream << ", " << controls.zeroDamping;
}

} // namespace

void oif_ContactControls::Write(utl_Stream& stream) const {
    if (isNew_ && reset_) return;
    const kinC_ContactControls& controls = controls_.ConstGet();
    if (const auto* explicitControls = nex_canDynamicCastPtr<kinC_ExpContactControls>(&controls)) {
        WriteExplicit(stream, *explicitControls);
    } else {
        WriteStandard(stream, nex_canDynamicCastRef<kinC_StdContactControls>(controls, NEX_HERE));
    }
}

void oif_ContactControls::WriteExplicit(utl_Stream& stream, const kinC_ExpContactControls& controls) const {
    using Controls = kinC_ExpContactControls;
    oif_KeywordLine line(stream, "*Contact Controls");
    line.Fixed(", cpset=", qkw_QuorixName(name_, false));
    if (reset_) {
        line.Fixed(", reset").End();
        return;
    }
    const bool given[] = {controls.fastLocalTrk != Controls::fastLocalTrkDef(), controls.globTrkChoice != 0,
                          controls.scalePenalty != Controls::scalePenaltyDef(),
                          controls.warpCheckPeriod != Controls::warpCheckPeriodDef(),
                          controls.warpCutoff != Controls::warpCutoffDef()};
    // The line may not break ahead of the first one.
    line.FixedIf(given[0], ", fastlocaltrk=", controls.fastLocalTrk ? "YES" : "NO")
        .BreakingIf(given[1], "globtrkinc=", controls.globTrkInc)
        .BreakingIf(given[2], "scale penalty=", controls.scalePenalty)
        .BreakingIf(given[3], "warp check period=", controls.warpCheckPeriod)
        .BreakingIf(given[4], "warp cut off=", controls.warpCutoff);
    // What isn't given goes back to its default.
    const bool all = given[0] && given[1] && given[2] && given[3] && given[4];
    line.BreakingIf(!all, "reset").End();
}

void oif_ContactControls::WriteStandard(utl_Stream& stream, const kinC_StdContactControls& controls) const {
    using Controls = kinC_StdContactControls;
    const auto begun = [&] {
        return oif_KeywordLine(stream, "*Contact Controls")
            .Fixed(", master=", master_)
            .Fixed(", slave=", slave_);
    };
    // Former controls end on a line of their own before others begin.
    if (!isNew_) begun().Fixed(", reset").End();
    if (reset_ || controls.IsDefault()) return;
    oif_KeywordLine line = begun();
    if (controls.relativeTolerance == 0) {
        line.Fixed(", absolutePenetrationTolerance=", controls.absolutePenetrationTolerance);
    } else {
        line.FixedUnless(", relativePenetrationTolerance=", controls.relativePenetrationTolerance,
                         Controls::relativePenetrationToleranceDef());
    }
    line.BreakingUnless("stiffnessScaleFactor=", controls.stiffnessScaleFactor,
                        Controls::stiffnessScaleFactorDef())
        .BreakingIf(controls.limitSlideDistance, "slideDistance=", controls.slideDistance)
        .BreakingIf(controls.delayedFrictionOnset != 0, "frictionOnset=DELAYED");
    if (controls.automaticTolerances) {
        line.Breaking("automaticTolerances");
    } else {
        line.BreakingUnless("maxchp=", controls.maxchp, Controls::maxchpDef())
            .BreakingUnless("perrmx=", controls.perrmx, Controls::perrmxDef())
            .BreakingUnless("uerrmx=", controls.uerrmx, Controls::uerrmxDef());
    }
    WriteStabilization(stream, line, controls);
    line.End();
}
