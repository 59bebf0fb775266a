#include "interactions/oif_CavityHistory.h"

#include "interactions/oif_FilmAndRadiation.h"
#include "interactions/oif_InteractionBuilder.h"

using Status = mdl_PropagationStatusEnm;

bool oif_RaisesForCavity(Status status) {
    return status > Status::INSTANCE_NOT_APPLICABLE;
}

void oif_CavityRadiationHistory(oif_InteractionBuilder& builder, const cow_String& name,
                                const kinC_CavityRadiation& cavity) {
    // No banner and no comment, here and in the steps.
    builder.AddStepDefinition(builder.Model().InitialStepName(),
                              oif_CavityDefinition(name, cavity, builder.ModelInfo()));
    builder.ForEachAnalysisStep([&](const cow_String& step) {
        const Status status = cavity.GetPropStatus(step);
        if (oif_RaisesForCavity(status)) nex_Raise(oif_kCavityStatusError);
        oif_RadiationViewfactor viewfactor(name, cavity, step, builder.ModelInfo());
        switch (status) {
        case Status::CREATED:
        case Status::MODIFIED: break;
        case Status::PROPAGATED:
            if (step == builder.Model().FirstAnalysisStepName()) break;
            return;
        default: viewfactor.SwitchOff(); break;
        }
        builder.AddStepDefinition(step, viewfactor);
    });
}
