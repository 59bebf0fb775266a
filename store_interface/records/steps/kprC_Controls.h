#ifndef QRX_STORE_KPRC_CONTROLS_H
#define QRX_STORE_KPRC_CONTROLS_H

#include "store_interface/records/cls_FieldTable.h"

class cls_ClassRegistrar;

class kprC_Controls : public cls_AbstractRecordOf<kprC_Controls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_Controls", "base of the solution controls of a step"};

    virtual bool HasDefaultValue() const = 0;
};

class kprC_PrimaryControls : public cls_AbstractRecordOf<kprC_PrimaryControls, kprC_Controls> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_PrimaryControls",
        "Controls that every procedure shares: time incrementation, constraint tolerances, line search."};

    // Entries that equal their defaults leave their places in the deck empty.
    static cow_List<double> timeIncrementationDef(bool discontinuous);
    static cow_List<double> constraintsDef();
    static cow_List<double> lineSearchDef();
    /// For the displacement field, or for any other.
    static cow_List<double> fieldDef(bool displacement);
    static constexpr int quasiNewtonMaxIterationsDef() { return 5; }

    bool useDefault = false;
    bool resetOnly = false;
    bool discontinuous = false;
    cow_List<double> timeIncrementation = timeIncrementationDef(false);
    cow_List<double> constraints = constraintsDef();
    cow_List<double> lineSearch = lineSearchDef();
    int quasiNewtonMaxIterations = quasiNewtonMaxIterationsDef();

    bool HasDefaultValue() const override { return useDefault; }

    static const cls_FieldTable& Fields();
};

class kprC_TypicalControls : public cls_RecordOf<kprC_TypicalControls, kprC_PrimaryControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_TypicalControls",
                                         "Controls of stress/displacement procedures.", 0, "StressControls"};

    cow_List<double> displacement = fieldDef(true);
    cow_List<double> hydrostaticFluidPressure = fieldDef(false);
    cow_List<double> rotation = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_HeatTransferControls : public cls_RecordOf<kprC_HeatTransferControls, kprC_PrimaryControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_HeatTransferControls", "Controls of heat transfer."};

    cow_List<double> temperature = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_MassDiffusionControls final
    : public cls_RecordOf<kprC_MassDiffusionControls, kprC_PrimaryControls> {
public:
    static constexpr cls_ClassInfo Class{
        "kprC_MassDiffusionControls",
        "Controls of mass diffusion. The primary lists are stored and never written."};

    cow_List<double> concentration = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_CTDControls final : public cls_RecordOf<kprC_CTDControls, kprC_TypicalControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CTDControls", "Controls of coupled temperature-displacement.",
                                         0, "CoupledTempDisplacementControls"};

    cow_List<double> temperature = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_PoreControls final : public cls_RecordOf<kprC_PoreControls, kprC_TypicalControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_PoreControls",
                                         "Controls of coupled pore fluid flow and stress."};

    cow_List<double> poreFluidPressure = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_ElectricalControls final : public cls_RecordOf<kprC_ElectricalControls, kprC_TypicalControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_ElectricalControls",
                                         "Controls of stress procedures with electrical potential."};

    cow_List<double> electricalPotential = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_CTEControls final : public cls_RecordOf<kprC_CTEControls, kprC_HeatTransferControls> {
public:
    static constexpr cls_ClassInfo Class{"kprC_CTEControls",
                                         "Controls of coupled thermal-electrical conduction.", 0,
                                         "CoupledThermalElectricControls"};

    cow_List<double> electricalPotential = fieldDef(false);

    static const cls_FieldTable& Fields();
};

class kprC_LinearCtrl final : public cls_RecordOf<kprC_LinearCtrl> {
public:
    static constexpr cls_ClassInfo Class{"kprC_LinearCtrl",
                                         "Controls of the iterative linear equation solver."};

    static constexpr int maxIterationsDef() { return 0; }
    static constexpr double relativeToleranceDef() { return 0.0; }

    bool useDefault = false;
    bool resetOnly = false;
    double relativeTolerance = relativeToleranceDef();
    int maxIterations = maxIterationsDef();

    static const cls_FieldTable& Fields();
};

void cls_RegisterStepControlRecords(cls_ClassRegistrar& registrar);

#endif
