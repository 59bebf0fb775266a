#include "steps/oif_StaticProcedures.h"

namespace {

constexpr double kMaxArcIncDefault = 1e36;

/// "*Static" with the parameters that plain and arc length steps have in common.
template <class Step>
oif_KeywordLine StaticLine(utl_Stream& stream, const Step& step) {
    oif_KeywordLine line(stream, "*Static");
    line.FixedIf(step.adiabatic, ", adiabatic")
        .FixedIf(step.timeIncrementationMethod == Step::TimeIncrementationEnm::DIRECT, ", ",
                 oif_DirectText(step));
    if (!step.fullyPlastic.IsEmpty()) line.MayBreak().Fixed(", fully plastic=", step.fullyPlastic);
    return line;
}

} // namespace

void oif_Static::Write(utl_Stream& stream) const {
    oif_KeywordLine line = StaticLine(stream, step_);
    oif_AddStabilization(line, step_);
    line.End();
    oif_WriteIncrements(stream, step_);
    stream << endl;
}

void oif_StaticRiks::Write(utl_Stream& stream) const {
    oif_KeywordLine line = StaticLine(stream, step_);
    if (step_.longTerm) line.MayBreak().Fixed(", long term");
    line.MayBreak().Fixed(", riks").End();
    stream << step_.initialArcInc << ", " << step_.totalArc << ", ";
    if (oif_IsAutomatic(step_)) {
        stream << step_.minArcInc << ", ";
        oif_WriteUnless(stream, step_.maxArcInc, kMaxArcIncDefault);
    } else {
        stream << ", ";
    }
    // Both separators stand whether or not anything follows.
    stream << ", ";
    oif_WriteWhenSet(stream, step_.maxLPF);
    stream << ", ";
    if (step_.nodeMonitored) stream << setName_ << ", " << step_.dof << ", " << step_.dofValue;
    stream << endl;
}

void oif_StaticLinearPerturbation::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Static").End();
}

void oif_Geostatic::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Geostatic").End();
}

void oif_Soils::Write(utl_Stream& stream) const {
    const bool automatic = oif_IsAutomatic(step_);
    oif_KeywordLine line(stream, "*Soils");
    if (step_.response == kprC_SoilsStep::ResponseEnm::TRANSIENT) {
        line.Fixed(", consolidation").Fixed(step_.end == cls_UnsetDouble ? ", end=PERIOD" : ", end=SS");
    }
    if (automatic) {
        line.MayBreak();
        if (step_.utol > 0.0) {
            line.Fixed(", utol=", step_.utol);
        } else {
            // The solver wants a tolerance; this one is a text, not a real.
            line.Fixed(", utol=1.0");
        }
        if (step_.creep && step_.cetol > 0.0) line.MayBreak().Fixed(", cetol=", step_.cetol);
    }
    if (!step_.creep) line.MayBreak().Fixed(", creep=none");
    oif_AddStabilization(line, step_);
    line.End();
    oif_WriteIncrements(stream, step_);
    stream << (automatic ? ", " : ", ,");
    oif_WriteWhenSet(stream, step_.end);
    stream << endl;
}

void oif_Visco::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Visco");
    line.FixedIf(oif_IsAutomatic(step_), ", cetol=", step_.cetol)
        .FixedIf(step_.creepIntegration == kprC_ViscoStep::CreepIntegrationEnm::EXPLICIT,
                 v6Format_ ? ", creep=explicit" : ", explicit");
    oif_AddStabilization(line, step_);
    line.End();
    oif_WriteIncrements(stream, step_);
    stream << endl;
}

void oif_Anneal::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Anneal").FixedUnless(", temperature=", step_.refTemp, cls_UnsetDouble).End();
}

void oif_Buckle::Write(utl_Stream& stream) const {
    const bool lanczos = step_.eigensolver == kprC_BuckleStep::EigensolverEnm::LANCZOS;
    // In lower case, unlike *Frequency.
    oif_KeywordLine(stream, "*Buckle").FixedIf(lanczos, ", eigensolver=lanczos").End();
    stream << step_.numEigen << ", ";
    if (lanczos) {
        oif_WriteWhenSet(stream, step_.minEigen);
        stream << ", ";
    }
    oif_WriteWhenSet(stream, step_.maxEigen);
    if (lanczos) {
        // No separator between the upper bound and the block size.
        oif_WriteItems(stream, step_.blockSize, step_.maxBlocks);
    } else {
        stream << ", " << step_.vectors << ", " << step_.maxIterations;
    }
    stream << endl;
}
