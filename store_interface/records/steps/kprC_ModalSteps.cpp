#include "store_interface/records/steps/kprC_ModalSteps.h"

#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/steps/kprC_StepFields.h"

const cls_FieldTable& kprC_RandomResponseFrequency::Fields() {
    using R = kprC_RandomResponseFrequency;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .With(kprC_FrequencyRangeFields)
                                             .Example(R"({"lower": 1, "upper": 100})");
    return fields;
}

const cls_FieldTable& kprC_SteadyStateDirectFrequency::Fields() {
    using R = kprC_SteadyStateDirectFrequency;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .With(kprC_FrequencyRangeFields)
                                             .Example(R"({"lower": 1, "upper": 100})");
    return fields;
}

const cls_FieldTable& kprC_SteadyStateModalFrequency::Fields() {
    using R = kprC_SteadyStateModalFrequency;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .With(kprC_FrequencyRangeFields)
                                             .Example(R"({"lower": 1, "upper": 100})");
    return fields;
}

const cls_FieldTable& kprC_SteadyStateSubspaceFrequency::Fields() {
    using R = kprC_SteadyStateSubspaceFrequency;
    static const cls_FieldTable fields = cls_Describe<R>(cls_Record::Fields())
                                             .With(kprC_FrequencyRangeFields)
                                             .Example(R"({"lower": 1, "upper": 100})");
    return fields;
}

const cls_FieldTable& kprC_ResponseSpectrumComponent::Fields() {
    using R = kprC_ResponseSpectrumComponent;
    static const cls_FieldTable fields =
        cls_Describe<R>(cls_Record::Fields())
            .Field<&R::spectrumName>("spectrumName",
                                     "name of the spectrum, written as it stands, without quotes")
            .RefersTo("amplitude")
            .Field<&R::x>("x", "direction cosine with global axis X")
            .Unit("no unit")
            .Field<&R::y>("y", "direction cosine with global axis Y")
            .Unit("no unit")
            .Field<&R::z>("z", "direction cosine with global axis Z")
            .Unit("no unit")
            .Field<&R::scale>("scale", "factor on the spectrum")
            .Unit("no unit")
            .Example(R"({"spectrumName": "QUAKE", "x": 1})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::EigensolverEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "SUBSPACE", "SUBSPACE"}, {1, "LANCZOS", "LANCZOS"}, {2, "AMS", "AMS"}};
    static constexpr omu_EnumTable table{"kprC_FrequencyStep::EigensolverEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::NormalizationEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "DISPLACEMENT", "DISPLACEMENT"}, {1, "MASS", "MASS"}};
    static constexpr omu_EnumTable table{"kprC_FrequencyStep::NormalizationEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_FrequencyStep::AcousticCouplingEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "OFF", "OFF"}, {1, "ON", "ON"}, {2, "PROJECTION", "PROJECTION"}};
    static constexpr omu_EnumTable table{"kprC_FrequencyStep::AcousticCouplingEnm", rows};
    return table;
}

const cls_FieldTable& kprC_FrequencyStep::Fields() {
    using R = kprC_FrequencyStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::numEigen>("numEigen", "number of modes; unset = all in the range")
            .Field<&R::maxEigen>("maxEigen", "upper frequency bound")
            .Unit("cycles/time")
            .Field<&R::shift>("shift", "shift point")
            .Unit("(cycles/time)^2")
            .Field<&R::vectors>("vectors", "subspace: number of iteration vectors, always written")
            .Field<&R::maxIterations>("maxIterations",
                                      "subspace: largest number of iterations, always written")
            .Field<&R::eigensolver>("eigensolver", "solver of the eigenvalues")
            .Field<&R::dampingProjection>(
                "dampingProjection",
                "false: damping is not projected on the modes (AMS, and Lanczos with sim)")
            .Field<&R::minEigen>("minEigen", "lower frequency bound")
            .Unit("cycles/time")
            .Field<&R::blockSize>("blockSize", "Lanczos: block size")
            .Field<&R::maxBlocks>("maxBlocks", "Lanczos: largest number of blocks")
            .Field<&R::normalization>(
                "normalization",
                "what modes are normalised to: the largest DISPLACEMENT or the generalised MASS")
            .Field<&R::propertyEvaluationFrequency>(
                "propertyEvaluationFrequency", "frequency at which frequency-dependent properties are taken")
            .Unit("cycles/time")
            .Field<&R::acousticCoupling>(
                "acousticCoupling",
                "coupling of structure and acoustic fluid; not written with the subspace solver")
            .Field<&R::residualModes>("residualModes", "compute residual modes (Lanczos, AMS)")
            .Field<&R::sim>("sim", "Lanczos: modes kept in the linear dynamics data base")
            .Field<&R::substructureCutoffMultiplier>("substructureCutoffMultiplier",
                                                     "AMS: first cutoff factor; 5.0 is not written")
            .Unit("no unit")
            .Field<&R::firstCutoffMultiplier>("firstCutoffMultiplier",
                                              "AMS: second cutoff factor; 1.7 is not written")
            .Unit("no unit")
            .Field<&R::secondCutoffMultiplier>("secondCutoffMultiplier",
                                               "AMS: third cutoff factor; 1.1 is not written")
            .Unit("no unit")
            .Field<&R::acousticRangeFactor>("acousticRangeFactor",
                                            "AMS: factor on the acoustic frequency range; 1.0 is not written")
            .Unit("no unit")
            .Field<&R::residualModeSets>("residualModeSets",
                                         "AMS residual modes: node set names as [instance.]set, one per line")
            .RefersTo("set")
            .Field<&R::residualModeValues>("residualModeValues",
                                           "AMS residual modes: degree of freedom, parallel to "
                                           "residualModeSets; its length counts the lines")
            .Field<&R::nsetRegion>(
                "nsetRegion",
                "AMS: node set to which mode shapes are restricted; null or empty name = all nodes")
            .Example(R"({"numEigen": 10})");
    return fields;
}

const cls_FieldTable& kprC_ComplexFrequencyStep::Fields() {
    using R = kprC_ComplexFrequencyStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::numEigen>("numEigen", "number of complex modes; unset = all")
            .Field<&R::shift>("shift", "shift point; zero is not written")
            .Unit("cycles/time")
            .Field<&R::frictionDamping>("frictionDamping", "add friction-induced damping")
            .Field<&R::minEigen>("minEigen", "lower frequency bound")
            .Unit("cycles/time")
            .Field<&R::maxEigen>("maxEigen",
                                 "upper frequency bound; written when below 1e18 or when minEigen is set")
            .Unit("cycles/time")
            .Example(R"({"numEigen": 10})");
    return fields;
}

const cls_FieldTable& kprC_ModalDynamicsStep::Fields() {
    using R = kprC_ModalDynamicsStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::continueAnalysis>("continueAnalysis",
                                         "go on from the state of the step before, if that is a linear "
                                         "perturbation static or a modal dynamics step")
            .With(kprC_TimePeriodField)
            .Field<&R::timeIncrement>("timeIncrement", "fixed time increment")
            .Unit("time")
            .With(kprC_StepAmplitudeField)
            .With(kprC_ModalDampingFields)
            .Example(R"({"timePeriod": 1, "timeIncrement": 0.001})");
    return fields;
}

const cls_FieldTable& kprC_RandomResponseStep::Fields() {
    using R = kprC_RandomResponseStep;
    static const cls_FieldTable fields = cls_Describe<R>(kprC_AnalysisStep::Fields())
                                             .With(kprC_FrequenciesField)
                                             .With(kprC_FrequencyScaleField)
                                             .With(kprC_ModalDampingFields)
                                             .Example(R"({"frequencies": [{"lower": 1, "upper": 100}]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ResponseSpectrumStep::CompEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "SINGLE_DIRECTION", "SINGLE_DIRECTION"}, {1, "ALGEBRAIC", "ALGEBRAIC"}, {2, "SRSS", "SRSS"}};
    static constexpr omu_EnumTable table{"kprC_ResponseSpectrumStep::CompEnm", rows};
    return table;
}

const omu_EnumTable& omu_EnumTableOf(kprC_ResponseSpectrumStep::SumEnm) {
    static constexpr omu_EnumRow rows[] = {
        {0, "ABS", "ABS"}, {1, "CQC", "CQC"}, {2, "NRL", "NRL"}, {3, "SRSS", "SRSS"}, {4, "TENP", "TENP"}};
    static constexpr omu_EnumTable table{"kprC_ResponseSpectrumStep::SumEnm", rows};
    return table;
}

const cls_FieldTable& kprC_ResponseSpectrumStep::Fields() {
    using R = kprC_ResponseSpectrumStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .Field<&R::comp>("comp", "how directions are combined; only ALGEBRAIC and SRSS are written")
            .Field<&R::sum>("sum", "how the responses of the modes are summed")
            .Field<&R::components>("components", "directions of excitation, one data line each")
            .With(kprC_ModalDampingFields)
            .Example(R"({"components": [{"spectrumName": "QUAKE", "x": 1}]})");
    return fields;
}

const cls_FieldTable& kprC_SteadyStateDirectStep::Fields() {
    using R = kprC_SteadyStateDirectStep;
    static const cls_FieldTable fields = cls_Describe<R>(kprC_AnalysisStep::Fields())
                                             .With(kprC_ComplexField)
                                             .With(kprC_FrequenciesField)
                                             .With(kprC_FrequencyScaleField)
                                             .With(kprC_SubdivideField)
                                             .Example(R"({"frequencies": [{"lower": 1, "upper": 100}]})");
    return fields;
}

const cls_FieldTable& kprC_SteadyStateModalStep::Fields() {
    using R = kprC_SteadyStateModalStep;
    static const cls_FieldTable fields = cls_Describe<R>(kprC_AnalysisStep::Fields())
                                             .With(kprC_FrequenciesField)
                                             .With(kprC_FrequencyScaleField)
                                             .With(kprC_SubdivideField)
                                             .With(kprC_ModalDampingFields)
                                             .Example(R"({"frequencies": [{"lower": 1, "upper": 100}]})");
    return fields;
}

const omu_EnumTable& omu_EnumTableOf(kprC_SteadyStateSubspaceStep::ProjectionEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "NONE", "NONE"},
                                           {1, "CONSTANT", "CONSTANT"},
                                           {2, "EIGENFREQUENCY", "EIGENFREQUENCY"},
                                           {3, "PROPERTY_CHANGE", "PROPERTY_CHANGE"},
                                           {4, "RANGE", "RANGE"}};
    static constexpr omu_EnumTable table{"kprC_SteadyStateSubspaceStep::ProjectionEnm", rows};
    return table;
}

const cls_FieldTable& kprC_SteadyStateSubspaceStep::Fields() {
    using R = kprC_SteadyStateSubspaceStep;
    static const cls_FieldTable fields =
        cls_Describe<R>(kprC_AnalysisStep::Fields())
            .With(kprC_ComplexField)
            .With(kprC_FrequenciesField)
            .With(kprC_FrequencyScaleField)
            .Field<&R::frictionDamping>("frictionDamping", "add friction-induced damping")
            .With(kprC_SubdivideField)
            .Field<&R::projection>("projection", "when the modes' subspace is projected anew")
            .Field<&R::dampingChange>(
                "dampingChange",
                "with PROPERTY_CHANGE: relative change of damping that asks for a new projection")
            .Unit("no unit")
            .Field<&R::stiffnessChange>(
                "stiffnessChange",
                "with PROPERTY_CHANGE: relative change of stiffness that asks for a new projection")
            .Unit("no unit")
            .Example(R"({"frequencies": [{"lower": 1, "upper": 100}]})");
    return fields;
}

void cls_RegisterModalStepRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kprC_RandomResponseFrequency>();
    registrar.Add<kprC_SteadyStateDirectFrequency>();
    registrar.Add<kprC_SteadyStateModalFrequency>();
    registrar.Add<kprC_SteadyStateSubspaceFrequency>();
    registrar.Add<kprC_ResponseSpectrumComponent>();
    registrar.Add<kprC_FrequencyStep>();
    registrar.Add<kprC_ComplexFrequencyStep>();
    registrar.Add<kprC_ModalDynamicsStep>();
    registrar.Add<kprC_RandomResponseStep>();
    registrar.Add<kprC_ResponseSpectrumStep>();
    registrar.Add<kprC_SteadyStateDirectStep>();
    registrar.Add<kprC_SteadyStateModalStep>();
    registrar.Add<kprC_SteadyStateSubspaceStep>();
}
