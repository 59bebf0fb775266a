#ifndef QRX_OIF_MODALPROCEDURES_H
#define QRX_OIF_MODALPROCEDURES_H

#include "keyword_layer/qkw_ModelInfo.h"
#include "steps/oif_Procedure.h"
#include "store_interface/records/steps/kprC_ModalSteps.h"

/// *Frequency, eigensolver=Lanczos, sim, damping projection=off, acoustic coupling=on, normalization=mass
/// eigenvalues, min, max, shift, block size, blocks
/// or, by subspace iteration:
/// eigenvalues, max, shift, vectors, iterations
/// or, with ", eigensolver=AMS":
/// eigenvalues, min, max, three cut-off multipliers, range factor
/// and then a line "set, dof" for each residual mode.
class oif_Frequency final : public oif_ProcedureOf<oif_Frequency, kprC_FrequencyStep> {
public:
    /// The model information must outlive the keyword.
    oif_Frequency(const kprC_AnalysisStep& step, const qkw_ModelInfo& modelInfo)
        : oif_ProcedureOf(step), modelInfo_(&modelInfo) {}
    void Write(utl_Stream& stream) const override;

private:
    const char* EigensolverText() const;
    void AddAmsParameters(oif_KeywordLine& line) const;
    void WriteData(utl_Stream& stream) const;
    void WriteAmsData(utl_Stream& stream) const;

    const qkw_ModelInfo* modelInfo_;
};

/// *Complex Frequency, friction damping=NO
/// eigenvalues, min, max, shift
class oif_ComplexFrequency final : public oif_ProcedureOf<oif_ComplexFrequency, kprC_ComplexFrequencyStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Modal dynamic, continue=NO
/// increment, period
class oif_ModalDynamics final : public oif_ProcedureOf<oif_ModalDynamics, kprC_ModalDynamicsStep> {
public:
    /// `previousProcedure` is the class number of the step before; only a static linear perturbation and a
    /// modal dynamics step can be continued.
    oif_ModalDynamics(const kprC_AnalysisStep& step, unsigned previousProcedure)
        : oif_ProcedureOf(step), previousProcedure_(previousProcedure) {}
    void Write(utl_Stream& stream) const override;

private:
    unsigned previousProcedure_;
};

/// *Random Response
/// lower, upper, points, bias, 1
/// a line for each frequency range.
class oif_RandomResponse final : public oif_ProcedureOf<oif_RandomResponse, kprC_RandomResponseStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Response spectrum, comp=SRSS, sum=ABS
/// spectrum,x, y, z, scale
/// a line for each direction. Raises for a summation that there isn't.
class oif_ResponseSpectrum final : public oif_ProcedureOf<oif_ResponseSpectrum, kprC_ResponseSpectrumStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Steady State Dynamics, direct, interval=EIGENFREQUENCY
/// lower, upper, points, bias, 1
class oif_SteadyStateDirect final
    : public oif_ProcedureOf<oif_SteadyStateDirect, kprC_SteadyStateDirectStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Steady State Dynamics, frequency scale=LINEAR, interval=RANGE
/// lower, upper, points, bias
class oif_SteadyStateModal final : public oif_ProcedureOf<oif_SteadyStateModal, kprC_SteadyStateModalStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

/// *Steady State Dynamics, subspace projection=CONSTANT, real only, frequency scale=LINEAR, interval=RANGE,
///     friction damping=NO
/// lower, upper, points, bias
class oif_SteadyStateSubspace final
    : public oif_ProcedureOf<oif_SteadyStateSubspace, kprC_SteadyStateSubspaceStep> {
public:
    using oif_ProcedureOf::oif_ProcedureOf;
    void Write(utl_Stream& stream) const override;
};

#endif
