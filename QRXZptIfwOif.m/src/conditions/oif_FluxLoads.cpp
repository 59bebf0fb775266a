#include "conditions/oif_FluxLoads.h"

#include "base/oif_KeywordLine.h"

using AttributeState = mdl_PropAttributeStateEnm;

namespace {

bool Ends(const oif_LoadCard& card) {
    return card.Quad().status == mdl_PropagationStatusEnm::DEACTIVATED;
}

/// A load that ends begins its family anew.
oif_Op OpOf(const oif_LoadCard& card) {
    return Ends(card) ? oif_Op::NEW : card.op;
}

cow_String AmplitudeOf(const oif_LoadCard& card) {
    return card.Quad().state.ConstGet().amplitude.ConstGet();
}

} // namespace

oif_FluxLoad::oif_FluxLoad(const oif_LoadCard& card)
    : op_(OpOf(card)), setName_(card.setName), amplitude_(AmplitudeOf(card)),
      selector_(card.Object().Selector()), deactivated_(Ends(card)) {
    const auto values = card.Object().Values(card.step);
    if (!values.empty()) magnitude_ = values.front().real;
}

void oif_FluxLoad::WriteAs(const oif_FluxText& text, utl_Stream& stream) const {
    oif_KeywordLine line(stream, text.keyword);
    line.Op(op_);
    if (deactivated_) return line.End();
    if (!amplitude_.IsEmpty()) line.MayBreak().Amplitude(amplitude_);
    line.End();
    stream << setName_;
    if (text.label == nullptr) {
        stream << ", " << selector_ << ", ";
    } else {
        const bool isUserDefined = selector_ == static_cast<int>(kloC_Load::DistribTypeEnm::USER_DEFINED);
        stream << (isUserDefined ? text.userLabel : text.label);
    }
    stream << magnitude_ << endl;
}

oif_ElectricalLoad::oif_ElectricalLoad(const oif_LoadCard& card)
    : amplitude_(AmplitudeOf(card)), setName_(card.setName), complex_(card.Object().IsComplex()),
      op_(OpOf(card)), deactivated_(Ends(card)), writeAlways_(complex_) {
    const auto values = card.Object().Values(card.step);
    if (values.empty()) return;
    real_ = values.front().real;
    imag_ = values.front().imag;
    magnitudeState_ = values.front().state;
}

void oif_ElectricalLoad::WriteCard(utl_Stream& stream, const oif_ElectricalText& text, int loadCase) const {
    // The amplitude stands also on the line of a load that ends, when it carries one. A complex load that
    // ends says load case 0.
    oif_KeywordLine(stream, text.keyword)
        .Op(op_)
        .Amplitude(amplitude_)
        .FixedIf(complex_, ", load case=", loadCase)
        .End();
}

void oif_ElectricalLoad::WriteAs(const oif_ElectricalText& text, utl_Stream& stream) const {
    if (deactivated_) return WriteCard(stream, text, 0);
    const auto line = [&](double value) { stream << setName_ << text.label << value << endl; };
    WriteCard(stream, text, 1);
    // The real part of a complex load is written also when it is 0.
    if (writeAlways_ || magnitudeState_ == AttributeState::SET ||
        (magnitudeState_ == AttributeState::CARRIED && op_ == oif_Op::NEW)) {
        line(real_);
    }
    if (!complex_) return;
    WriteCard(stream, text, 2);
    if (imag_ != 0.0) line(imag_);
}
