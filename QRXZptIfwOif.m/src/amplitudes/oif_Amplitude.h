#ifndef QRX_OIF_AMPLITUDE_H
#define QRX_OIF_AMPLITUDE_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/amplitudes/kamC_Amplitude.h"

/// A named amplitude on its way to the deck; the record is shared.
template <class T>
class oif_AmplitudeKeywordOf : public qkw_KeywordOf<T> {
public:
    oif_AmplitudeKeywordOf(const cow_String& name, const mdl_ObjCow<kamC_Amplitude>& amplitude)
        : name_(name), amplitude_(amplitude) {}

protected:
    const cow_String& Name() const { return name_; }
    const kamC_Amplitude& Record() const { return amplitude_.ConstGet(); }

private:
    cow_String name_;
    mdl_ObjCow<kamC_Amplitude> amplitude_;
};

/// "*Amplitude": a curve over time. A record of a class that is no curve raises "Unknown amplitude
/// definition" behind the name.
class oif_Amplitude final : public oif_AmplitudeKeywordOf<oif_Amplitude> {
public:
    using oif_AmplitudeKeywordOf::oif_AmplitudeKeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// "*Psd-Definition"; nothing for a record of another class.
class oif_PsdDefinition final : public oif_AmplitudeKeywordOf<oif_PsdDefinition> {
public:
    using oif_AmplitudeKeywordOf::oif_AmplitudeKeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// "*Spectrum"; nothing for a record of another class.
class oif_Spectrum final : public oif_AmplitudeKeywordOf<oif_Spectrum> {
public:
    using oif_AmplitudeKeywordOf::oif_AmplitudeKeywordOf;
    void Write(utl_Stream& stream) const override;
};

/// "*Baseline Correction", of the amplitude that it follows.
class oif_BaselineCorrection final : public qkw_KeywordOf<oif_BaselineCorrection> {
public:
    explicit oif_BaselineCorrection(const kamC_BaselineCorrection& correction) : correction_(correction) {}
    void Write(utl_Stream& stream) const override;

private:
    kamC_BaselineCorrection correction_;
};

#endif
