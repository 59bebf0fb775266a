#ifndef QRX_OIF_AMPLITUDEBUILDER_H
#define QRX_OIF_AMPLITUDEBUILDER_H

#include "base/oif_Component.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"

/// Amplitudes of the model: curves, power spectral densities and response spectra.
class oif_AmplitudeBuilder final : public oif_ComponentOf<oif_AmplitudeBuilder> {
public:
    using oif_ComponentOf::oif_ComponentOf;
    void Build() override;

    // For restarts; no deck needs them.

    /// The names in `current` that `base` doesn't hold, each once, in the order of `current`.
    static cow_List<cow_String> CollectRestartAmplitudes(const cow_List<cow_String>& base,
                                                         const cow_List<cow_String>& current);
    /// Whether the amplitude came to be after the base of a restart; false for an unknown name.
    bool IsNewEO(const cow_String& name) const;

private:
    void CreateAllAmplitudes();
    void CreateAmplitude(const kamC_Amplitude& amplitude, const cow_String& name);

    cow_List<cow_String> names_; // of a restart; none for a whole deck
};

#endif
