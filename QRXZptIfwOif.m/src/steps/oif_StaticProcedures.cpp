#include "steps/oif_StaticProcedures.h"

namespace {

constexpr double kMaxArcIncDefault = 1e36;

/// "*Static" with the parameters that plain and arc length steps have in common.
template <class Step>
void WriteStatic(utl_Stream& stream, const Step& step) {
    stream << "*Static";
    if (step.adiabatic) stream << ", adiabatic";
    if (step.timeIncrementationMethod == Step::TimeIncrementationEnm::DIRECT)
        stream << ", " << oif_DirectText(step);
    if (!step.fullyPlastic.IsEmpty()) {
        stream.OptionalLineBreak();
        stream << ", fully plastic=" << step.fullyPlastic;
    }
}

} // namespace

void oif_Static::Write(utl_Stream& stream) const {
    WriteStatic(stream, step_);
    oif_WriteStabilization(stream, step_);
    stream.LineBreak();
    oif_WriteIncrements(stream, step_);
    stream << endl;
}

void oif_StaticRiks::Write(utl_Stream& stream) const {
    WriteStatic(stream, step_);
    if (step_.longTerm) {
        stream.OptionalLineBreak();
        stream << ", long term";
    }
    stream.OptionalLineBreak();
    stream << ", riks";
    stream.LineBreak();
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
    stream << "*Static" << endl;
}

void oif_Geostatic::Write(utl_Stream& stream) const {
    stream << "*Geostatic" << endl;
}

void oif_Soils::Write(utl_Stream& stream) const {
    const bool automatic = oif_IsAutomatic(step_);
    stream << "*Soils";
    if (step_.response == kprC_SoilsStep::ResponseEnm::TRANSIENT) {
        stream << ", consolidation" << (step_.end == cls_UnsetDouble ? ", end=PERIOD" : ", end=SS");
    }
    if (automatic) {
        stream.OptionalLineBreak();
        if (step_.utol > 0.0) {
            stream << ", utol=" << step_.utol;
        } else {
            // The solver wants a tolerance; this one is a text, not a real.
            stream << ", utol=1.0";
        }
        if (step_.creep && step_.cetol > 0.0) {
            stream.OptionalLineBreak();
            stream << ", cetol=" << step_.cetol;
        }
    }
    if (!step_.creep) {
        stream.OptionalLineBreak();
        stream << ", creep=none";
    }
    oif_WriteStabilization(stream, step_);
    stream.LineBreak();
    oif_WriteIncrements(stream, step_);
    stream << (automatic ? ", " : ", ,");
    oif_WriteWhenSet(stream, step_.end);
    stream << endl;
}

void oif_Visco::Write(utl_Stream& stream) const {
    stream << "*Visco";
    if (oif_IsAutomatic(step_)) stream << ", cetol=" << step_.cetol;
    if (step_.creepIntegration == kprC_ViscoStep::CreepIntegrationEnm::EXPLICIT)
        stream << (v6Format_ ? ", creep=explicit" : ", explicit");
    oif_WriteStabilization(stream, step_);
    stream << endl;
    oif_WriteIncrements(stream, step_);
    stream << endl;
}

void oif_Anneal::Write(utl_Stream& stream) const {
    stream << "*Anneal";
    if (step_.refTemp != cls_UnsetDouble) stream << ", temperature=" << step_.refTemp;
    stream << endl;
}

void oif_Buckle::Write(utl_Stream& stream) const {
    const bool lanczos = step_.eigensolver == kprC_BuckleStep::EigensolverEnm::LANCZOS;
    stream << "*Buckle";
    // In lower case, unlike *Frequency.
    if (lanczos) stream << ", eigensolver=lanczos";
    stream << endl << step_.numEigen << ", ";
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
