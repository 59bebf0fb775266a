#include "conditions/oif_FluxLoads.h"

#include "keyword_layer/qkw_QuorixName.h"

using AttributeState = mdl_PropAttributeStateEnm;

namespace {

bool Ends(const kloC_Load& load, const cow_String& stepName) {
    return load.Status(stepName) == mdl_PropagationStatusEnm::DEACTIVATED;
}

cow_String AmplitudeOf(const kloC_Load& load, const cow_String& stepName) {
    return load.ConstGetStateQuad(stepName).state.ConstGet().amplitude.ConstGet();
}

} // namespace

oif_FluxLoad::oif_FluxLoad(const kloC_Load& load, const cow_String& stepName, bool opMod,
                           const cow_String& setName)
    : opMod_(opMod), setName_(setName), amplitude_(AmplitudeOf(load, stepName)), selector_(load.Selector()),
      deactivated_(Ends(load, stepName)) {
    if (deactivated_) opMod_ = false;
    const auto values = load.Values(stepName);
    if (!values.empty()) magnitude_ = values.front().real;
}

void oif_FluxLoad::WriteAs(const oif_FluxText& text, utl_Stream& stream) const {
    stream << text.keyword;
    if (!opMod_) stream << ", op=NEW";
    if (deactivated_) return stream.LineBreak();
    if (!amplitude_.IsEmpty()) {
        stream.OptionalLineBreak();
        stream << ", amplitude=" << qkw_QuorixName(amplitude_, false);
    }
    stream.LineBreak();
    stream << setName_;
    if (text.label == nullptr) {
        stream << ", " << selector_ << ", ";
    } else {
        const bool isUserDefined = selector_ == static_cast<int>(kloC_Load::DistribTypeEnm::USER_DEFINED);
        stream << (isUserDefined ? text.userLabel : text.label);
    }
    stream << magnitude_ << endl;
}

oif_ElectricalLoad::oif_ElectricalLoad(const kloC_Load& load, const cow_String& stepName, bool opMod,
                                       const cow_String& setName)
    : amplitude_(AmplitudeOf(load, stepName)), setName_(setName), complex_(load.IsComplex()), opMod_(opMod),
      deactivated_(Ends(load, stepName)), writeAlways_(complex_) {
    if (deactivated_) opMod_ = false;
    const auto values = load.Values(stepName);
    if (values.empty()) return;
    real_ = values.front().real;
    imag_ = values.front().imag;
    magnitudeState_ = values.front().state;
}

void oif_ElectricalLoad::WriteCard(utl_Stream& stream, const oif_ElectricalText& text, int loadCase) const {
    stream << text.keyword;
    if (!opMod_) stream << ", op=NEW";
    // Also on the line of a load that ends, when it carries one.
    if (!amplitude_.IsEmpty()) stream << ", amplitude=" << qkw_QuorixName(amplitude_, false);
    // A complex load that ends says load case 0.
    if (complex_) stream << ", load case=" << loadCase;
    stream.LineBreak();
}

void oif_ElectricalLoad::WriteAs(const oif_ElectricalText& text, utl_Stream& stream) const {
    if (deactivated_) return WriteCard(stream, text, 0);
    const auto line = [&](double value) { stream << setName_ << text.label << value << endl; };
    WriteCard(stream, text, 1);
    // The real part of a complex load is written also when it is 0.
    if (writeAlways_ || magnitudeState_ == AttributeState::SET ||
        (magnitudeState_ == AttributeState::CARRIED && !opMod_)) {
        line(real_);
    }
    if (!complex_) return;
    WriteCard(stream, text, 2);
    if (imag_ != 0.0) line(imag_);
}
