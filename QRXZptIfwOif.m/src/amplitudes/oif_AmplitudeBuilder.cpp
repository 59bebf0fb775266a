#include "amplitudes/oif_AmplitudeBuilder.h"

#include "amplitudes/oif_Amplitude.h"
#include "store_interface/records/mdl_Repository.h"

#include <set>

void oif_AmplitudeBuilder::Build() {
    CreateAllAmplitudes();
}

void oif_AmplitudeBuilder::CreateAllAmplitudes() {
    for (const auto& [name, amplitude] : Model().Amplitudes()) {
        CreateAmplitude(amplitude, name);
    }
}

void oif_AmplitudeBuilder::CreateAmplitude(const kamC_Amplitude& amplitude, const cow_String& name) {
    const unsigned type = amplitude.DynTypeId();
    if (type == kamC_PsdDefinition::TypeId()) {
        AddModelDefinition(oif_PsdDefinition(name, amplitude));
    } else if (type == kamC_Spectrum::TypeId()) {
        AddModelDefinition(oif_Spectrum(name, amplitude));
    } else {
        AddModelDefinition(oif_Amplitude(name, amplitude));
    }

    mdl_ObjCow<kamC_BaselineCorrection> correction;
    if (type == kamC_Tabular::TypeId()) {
        correction = static_cast<const kamC_Tabular&>(amplitude).baselineCorrection;
    } else if (type == kamC_EquallySpaced::TypeId()) {
        correction = static_cast<const kamC_EquallySpaced&>(amplitude).baselineCorrection;
    }
    if (!correction.IsNull()) AddModelDefinition(oif_BaselineCorrection(correction.ConstGet()));
}

cow_List<cow_String> oif_AmplitudeBuilder::CollectRestartAmplitudes(const cow_List<cow_String>& base,
                                                                    const cow_List<cow_String>& current) {
    std::set<cow_String> known;
    for (int i = 0; i < base.Length(); ++i) known.insert(base[i]);
    cow_List<cow_String> added;
    for (int i = 0; i < current.Length(); ++i) {
        if (known.insert(current[i]).second) added.Append(current[i]);
    }
    return added;
}

bool oif_AmplitudeBuilder::IsNewEO(const cow_String& name) const {
    const auto& amplitudes = Model().Amplitudes();
    return amplitudes.IsMember(name) && amplitudes.ConstGet(name).stamp > 0;
}
