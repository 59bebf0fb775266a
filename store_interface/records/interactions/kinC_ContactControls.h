#ifndef QRX_STORE_KINC_CONTACTCONTROLS_H
#define QRX_STORE_KINC_CONTACTCONTROLS_H

#include "store_interface/records/interactions/kinC_Interaction.h"

class cls_ClassRegistrar;

class kinC_StdContactControls final : public cls_RecordOf<kinC_StdContactControls, kinC_ContactControls> {
public:
    static constexpr cls_ClassInfo Class{"kinC_StdContactControls", "contact controls of the implicit solver",
                                         0x2A00051, "StandardContactControls"};

    static constexpr double relativePenetrationToleranceDef() { return 0.001; }
    static constexpr int maxchpDef() { return 0; }
    static constexpr double perrmxDef() { return 0.0; }
    static constexpr double stiffnessScaleFactorDef() { return 1.0; }
    static constexpr double uerrmxDef() { return 0.0; }
    static constexpr double dampCoefDef() { return 0.0; }
    static constexpr double eosFractionDef() { return 0.0; }
    static constexpr double tangFractionDef() { return 1.0; }
    int relativeTolerance = 1;
    double absolutePenetrationTolerance = 0.0;
    double relativePenetrationTolerance = relativePenetrationToleranceDef();
    bool automaticTolerances = false;
    int delayedFrictionOnset = 0;
    int maxchp = maxchpDef();
    double perrmx = perrmxDef();
    bool limitSlideDistance = false;
    double slideDistance = 0.0;
    double stiffnessScaleFactor = stiffnessScaleFactorDef();
    double uerrmx = uerrmxDef();
    int stabilization = 0;
    double dampCoef = dampCoefDef();
    double eosFraction = eosFractionDef();
    double tangFraction = tangFractionDef();
    double zeroDampingClearance = 0.0;
    int zeroDampingChoice = 0;
    double zeroDamping = 0.0;

    static const cls_FieldTable& Fields();
};

class kinC_ExpContactControls final : public cls_RecordOf<kinC_ExpContactControls, kinC_ContactControls> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ExpContactControls", "contact controls of the explicit solver",
                                         0x2A00052, "ExplicitContactControls"};

    static constexpr bool fastLocalTrkDef() { return true; }
    static constexpr double scalePenaltyDef() { return 1.0; }
    static constexpr int warpCheckPeriodDef() { return 20; }
    static constexpr double warpCutoffDef() { return 20.0; }
    int globTrkChoice = 0;
    int globTrkInc = 100;
    bool fastLocalTrk = fastLocalTrkDef();
    double scalePenalty = scalePenaltyDef();
    int warpCheckPeriod = warpCheckPeriodDef();
    double warpCutoff = warpCutoffDef();

    static const cls_FieldTable& Fields();
};

void cls_RegisterContactControlsRecords(cls_ClassRegistrar& registrar);

#endif
