#include "conditions/oif_MechanicalLoads.h"

#include "base/oif_DataLines.h"
#include "base/oif_Utils.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"

#include <algorithm>
#include <initializer_list>

using AttributeState = mdl_PropAttributeStateEnm;
using LoadDistribution = kloC_Load::DistribTypeEnm;

namespace {

constexpr const char* kForceLabels[] = {"1", "2", "3"};
constexpr const char* kMomentLabels[] = {"4", "5", "6"};
constexpr const char* kPlaneStrainLabels[] = {"3", "4", "5"};
constexpr const char* kGlobalLineLabels[] = {"PX", "PY", "PZ"};
constexpr const char* kLocalLineLabels[] = {"P1", "P2"};
constexpr const char* kBodyLabels[] = {"BX", "BY", "BZ"};
constexpr const char* kAxisymmetricBodyLabels[] = {"BR", "BZ"};
constexpr const char* kBoltLabels[] = {"1"};
constexpr const char* kPressureLabels[] = {"8"};
constexpr const char* kEdgeLabels[] = {"EDNOR", "EDTRA", "EDSHR", "EDMOM", "EDLD"};

constexpr int kThreeDimensional = 1;
constexpr int kAxisymmetric = 4;

/// Of unit length; a zero vector gives zeros, whatever their signs were.
gsl_Vector Unit(gsl_Vector vector) {
    if (vector.ComputeMagnitude() == 0.0) return {};
    vector.Normalize();
    return vector;
}

/// The imaginary part for part 2, else the real one.
double Part(const kloC_LoadValue& value, int part) {
    return part == 2 ? value.imag : value.real;
}

const char* UserSuffix(LoadDistribution distribution) {
    return distribution == LoadDistribution::USER_DEFINED ? "NU" : "";
}

} // namespace

oif_MechanicalLoad::oif_MechanicalLoad(const oif_LoadCard& card, ClearedAmplitude clearedAmplitude)
    : setName_(card.setName), op_(card.op), scale_(card.Factor()), modifiedOnly_(card.op == oif_Op::MODIFY),
      complex_(card.Object().IsComplex()), values_(card.Object().Values(card.step)) {
    const auto& quad = card.Quad();
    oif_Utils::SetDeactivateOpFlags(quad.status, deactivated_, modifiedOnly_);
    if (deactivated_) return;
    const auto& amplitude = quad.state.ConstGet().amplitude;
    amplitude_ = amplitude.ConstGet();
    if (Passes(amplitude.State()) ||
        (clearedAmplitude == ClearedAmplitude::COUNTS && amplitude.State() == AttributeState::CLEARED)) {
        modifiedOnly_ = false;
    }
}

bool oif_MechanicalLoad::Passes(AttributeState state) const {
    return oif_Utils::CheckDataState(state, modifiedOnly_);
}

void oif_MechanicalLoad::WriteCard(utl_Stream& stream, const char* keyword, int loadCase,
                                   bool follower) const {
    oif_KeywordLine(stream, keyword)
        .Op(op_)
        .FixedIf(follower, ", follower")
        .Amplitude(amplitude_)
        .FixedIf(loadCase != 0, ", load case=", loadCase)
        .End();
}

void oif_MechanicalLoad::BeginLine(utl_Stream& stream, const cow_String& label, const char* separator) const {
    stream << setName_ << separator << label << separator;
}

void oif_MechanicalLoad::WriteLine(utl_Stream& stream, const cow_String& label, double value) const {
    BeginLine(stream, label);
    stream << value << endl;
}

template <class Card>
void oif_MechanicalLoad::WriteComponents(utl_Stream& stream, oif_Labels labels, const char* suffix,
                                         const Card& card) const {
    const auto line = [&](std::size_t i, double value) {
        WriteLine(stream, cow_String(labels[i]) + suffix, value);
    };
    if (!complex_) {
        card(0);
        // A value of 0 is written: it may take the place of another.
        for (std::size_t i = 0; i < labels.size(); ++i) {
            if (Passes(values_[i].state)) line(i, values_[i].real * scale_);
        }
        return;
    }
    for (const int part : {1, 2}) {
        const auto looked = std::span(values_).first(labels.size());
        if (std::all_of(looked.begin(), looked.end(), [&](const auto& v) { return Part(v, part) == 0.0; }))
            continue;
        card(part);
        for (std::size_t i = 0; i < labels.size(); ++i) {
            const double value = Part(values_[i], part) * scale_;
            if (value != 0.0) line(i, value);
        }
    }
}

template <class Block>
void oif_MechanicalLoad::WriteMagnitude(bool passes, const Block& block) const {
    const kloC_LoadValue& value = values_.front();
    if (!complex_) {
        if (passes) block(0, value.real * scale_);
        return;
    }
    for (const int part : {1, 2}) {
        if (Part(value, part) != 0.0) block(part, Part(value, part) * scale_);
    }
}

oif_Cload::oif_Cload(const oif_LoadCard& card, oif_Labels labels, bool follower)
    : qkw_KeywordOf(card, ClearedAmplitude::COUNTS), labels_(labels), follower_(follower) {}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_ConcentratedForce& force)
    : oif_Cload(card, kForceLabels, force.follower) {}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_Moment& moment)
    : oif_Cload(card, kMomentLabels, moment.follower) {}

// The lines of bolts and of plane strain loads begin with an empty name.
oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_PEGLoad&) : oif_Cload(card, kPlaneStrainLabels) {
    setName_ = {};
}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_BoltLoad& bolt) : oif_Cload(card, kBoltLabels) {
    const kloC_BoltLoadState& state = bolt.BoltState(card.step);
    setName_ = {};
    bolted_ = !bolt.IsByForce(card.step);
    values_ = {{state.magnitude.ConstGet(), 0.0, state.magnitude.State()}};
}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_ConcentratedPoreFluid& flow)
    : oif_Cload(card, kPressureLabels) {
    if (IsComplexPoreFluid(flow)) failure_ = ComplexPoreFluid;
}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_InwardVolAccel&)
    : oif_Cload(card, kPressureLabels) {}

oif_Cload::oif_Cload(const oif_LoadCard& card, const kloC_Load&) : oif_Cload(card, oif_Labels()) {
    failure_ = "\"Invalid load type for *Cload\" == 0";
}

bool oif_Cload::IsComplexPoreFluid(const kloC_Load& load) {
    return load.DynTypeId() == kloC_ConcentratedPoreFluid::TypeId() && load.IsComplex();
}

void oif_Cload::WriteCloadCard(utl_Stream& stream, int loadCase, bool follower) const {
    WriteCard(stream, "*Cload", loadCase, follower);
}

void oif_Cload::WriteSingle(utl_Stream& stream, const char* label) const {
    WriteMagnitude(Passes(values_.front().state), [&](int part, double value) {
        WriteCloadCard(stream, part, false);
        WriteLine(stream, label, value);
    });
}

void oif_Cload::Write(utl_Stream& stream) const {
    // A load that ends has its line alone, and never ", follower".
    if (deactivated_) return WriteCloadCard(stream, 0, false);
    if (failure_ != nullptr) nex_Raise(failure_);
    if (bolted_) return WriteCloadCard(stream, 0, false);
    if (labels_.size() == 1) return WriteSingle(stream, labels_.front());
    WriteComponents(stream, labels_, "", [&](int part) { WriteCloadCard(stream, part, follower_); });
}

oif_ConnectorLoad::oif_ConnectorLoad(const oif_LoadCard& card, oif_Labels labels)
    : qkw_KeywordOf(card, ClearedAmplitude::IGNORED), labels_(labels) {
    setName_ = oif_Utils::GetConnectorSetName(card.setName);
}

oif_ConnectorLoad::oif_ConnectorLoad(const oif_LoadCard& card, const kloC_ConnectorForce&)
    : oif_ConnectorLoad(card, kForceLabels) {}

oif_ConnectorLoad::oif_ConnectorLoad(const oif_LoadCard& card, const kloC_ConnectorMoment&)
    : oif_ConnectorLoad(card, kMomentLabels) {}

oif_ConnectorLoad::oif_ConnectorLoad(const oif_LoadCard& card, const kloC_Load&)
    : oif_ConnectorLoad(card, oif_Labels()) {}

void oif_ConnectorLoad::Write(utl_Stream& stream) const {
    const auto card = [&](int part) { WriteCard(stream, "*Connector Load", part); };
    if (deactivated_) return card(0);
    if (labels_.empty()) nex_Raise("Invalid load type for *Connector Load");
    WriteComponents(stream, labels_, "", card);
}

oif_Dload::oif_Dload(const oif_LoadCard& card, const oif_LoadSetting& setting, Form form)
    : qkw_KeywordOf(card, ClearedAmplitude::IGNORED), form_(form), space_(setting.space) {}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_RotationalBodyForce& rotation,
                     const oif_LoadSetting& setting)
    : oif_Dload(card, setting, &oif_Dload::WriteRotation) {
    label_ = rotation.centrifugal ? "CENTRIF" : rotation.rotaryAcceleration ? "ROTA" : "";
    axis_ = gsl_ModelSegment(rotation.point1, rotation.point2);
}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_LineLoad& load, const oif_LoadSetting& setting)
    : oif_Dload(card, setting, &oif_Dload::WriteVector) {
    suffix_ = UserSuffix(load.distributionType);
    // Along the axes of the section there are two.
    labels_ = load.system == kloC_LineLoad::SystemEnm::LOCAL ? oif_Labels(kLocalLineLabels)
                                                             : oif_Labels(kGlobalLineLabels);
}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_PipePressure& pipe, const oif_LoadSetting& setting)
    : oif_Dload(card, setting, &oif_Dload::WritePipePressure) {
    const kloC_HydrostaticHeights& heights = pipe.StateIn(card.step);
    suffix_ = UserSuffix(pipe.distributionType);
    hydrostatic_ = pipe.distributionType == LoadDistribution::HYDROSTATIC;
    label_ = cow_String(hydrostatic_ ? "H" : "") + (pipe.external ? "PE" : "PI") + suffix_;
    diameter_ = pipe.effectiveDiameter;
    heights_[0] = heights.zeroPressureHeight.ConstGet();
    heights_[1] = heights.referencePressureHeight.ConstGet();
    heightsPass_ =
        Passes(heights.zeroPressureHeight.State()) || Passes(heights.referencePressureHeight.State());
}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_BodyForce& force, const oif_LoadSetting& setting)
    : oif_Dload(card, setting, &oif_Dload::WriteVector) {
    suffix_ = UserSuffix(force.distributionType);
    labels_ = space_ == kAxisymmetric ? oif_Labels(kAxisymmetricBodyLabels) : oif_Labels(kBodyLabels);
    if (space_ != kThreeDimensional) labels_ = labels_.first(2);
}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_Gravity&, const oif_LoadSetting& setting)
    : oif_Dload(card, setting, &oif_Dload::WriteGravity) {}

oif_Dload::oif_Dload(const oif_LoadCard& card, const kloC_Load&, const oif_LoadSetting& setting)
    : oif_Dload(card, setting, nullptr) {}

void oif_Dload::WriteDloadCard(utl_Stream& stream, int loadCase) const {
    WriteCard(stream, "*Dload", loadCase);
}

void oif_Dload::WriteVector(utl_Stream& stream) const {
    WriteComponents(stream, labels_, suffix_, [&](int part) { WriteDloadCard(stream, part); });
}

void oif_Dload::WriteGravity(utl_Stream& stream) const {
    const auto block = [&](int part, const gsl_Vector& vector) {
        WriteDloadCard(stream, part);
        BeginLine(stream, "GRAV");
        stream << vector.ComputeMagnitude() * scale_;
        const gsl_Vector cosines = Unit(vector);
        if (space_ == kAxisymmetric) {
            stream << ", ";
        } else {
            oif_AddNumbers(stream, {cosines.X()});
        }
        oif_AddNumbers(stream, {cosines.Y()});
        if (space_ == kThreeDimensional) oif_AddNumbers(stream, {cosines.Z()});
        stream.LineBreak();
    };
    const auto vectorOf = [&](int part) {
        return gsl_Vector(Part(values_[0], part), Part(values_[1], part), Part(values_[2], part));
    };
    if (!complex_) {
        const bool passes = std::any_of(values_.begin(), values_.end(),
                                        [&](const auto& value) { return Passes(value.state); });
        if (passes) block(0, vectorOf(0));
        return;
    }
    for (const int part : {1, 2}) {
        if (vectorOf(part).ComputeMagnitude() != 0.0) block(part, vectorOf(part));
    }
}

void oif_Dload::WritePipePressureData(utl_Stream& stream) const {
    if (hydrostatic_) oif_AddNumbers(stream, {heights_[0], heights_[1]});
    oif_AddNumbers(stream, {diameter_});
    stream.LineBreak();
}

void oif_Dload::WriteRotBodyForceData(utl_Stream& stream, double magnitude) const {
    BeginLine(stream, label_, ",");
    stream << magnitude;
    oif_AddNumbers(stream, {axis_.Start().X(), axis_.Start().Y(), axis_.Start().Z()}, ",");
    const gsl_Vector direction = Unit(axis_.Direction());
    if (space_ < 3) oif_AddNumbers(stream, {direction.X(), direction.Y(), direction.Z()}, ",");
    if (space_ == kAxisymmetric) stream << ",0.0,1.0,0.0";
    stream.LineBreak();
}

void oif_Dload::WritePipePressure(utl_Stream& stream) const {
    WriteMagnitude(Passes(values_.front().state) || (hydrostatic_ && heightsPass_),
                   [&](int part, double value) {
                       WriteDloadCard(stream, part);
                       BeginLine(stream, label_);
                       stream << value;
                       WritePipePressureData(stream);
                   });
}

void oif_Dload::WriteRotation(utl_Stream& stream) const {
    WriteMagnitude(Passes(values_.front().state), [&](int part, double value) {
        WriteDloadCard(stream, part);
        WriteRotBodyForceData(stream, value);
    });
}

void oif_Dload::Write(utl_Stream& stream) const {
    if (deactivated_) return WriteDloadCard(stream, 0);
    if (form_ == nullptr) nex_Raise("\"Invalid load type for *Dload\" == 0");
    (this->*form_)(stream);
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const oif_LoadSetting& setting, Form form)
    : qkw_KeywordOf(card, ClearedAmplitude::IGNORED), form_(form), cyclicMode_(setting.cyclicMode) {
    if (card.setName.IsEmpty()) nex_Raise(EmptySetName);
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const kloC_Pressure& pressure,
                       const oif_LoadSetting& setting)
    : oif_Dsload(card, setting, &oif_Dsload::WritePressure) {
    const kloC_HydrostaticHeights& heights = pressure.StateIn(card.step);
    const LoadDistribution distribution = pressure.distributionType;
    refNode_ = oif_RegionName(pressure.distributionRegion, setting.modelInfo);
    hydrostatic_ = distribution == LoadDistribution::HYDROSTATIC;
    if (hydrostatic_) {
        label_ = "HP";
    } else if (distribution == LoadDistribution::UNIFORM || distribution == LoadDistribution::USER_DEFINED) {
        label_ = cow_String("P") + UserSuffix(distribution);
    }
    heights_[0] = heights.zeroPressureHeight.ConstGet();
    heights_[1] = heights.referencePressureHeight.ConstGet();
    heightsPass_ =
        Passes(heights.zeroPressureHeight.State()) || Passes(heights.referencePressureHeight.State());
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const kloC_SurfaceTraction& traction,
                       const oif_LoadSetting& setting)
    : oif_Dsload(card, setting, &oif_Dsload::WriteTraction) {
    label_ = traction.kind == kloC_Traction::KindEnm::SHEAR ? "TRSHR" : "TRVEC";
    TakeTraction(traction, card.name, setting);
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const kloC_ShellEdgeLoad& load,
                       const oif_LoadSetting& setting)
    : oif_Dsload(card, setting, &oif_Dsload::WriteTraction) {
    const auto kind = static_cast<std::size_t>(load.kind);
    if (kind < std::size(kEdgeLabels)) label_ = kEdgeLabels[kind];
    TakeTraction(load, card.name, setting);
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const kloC_SubmodelStressBased& load,
                       const oif_LoadSetting& setting)
    : oif_Dsload(card, setting, nullptr) {
    const auto& state = load.StateIn(card.step);
    isSubmodel_ = true;
    submodelStep_ = state.stepName;
    scaleParameter_ = state.scaleParameter.ConstGet();
}

oif_Dsload::oif_Dsload(const oif_LoadCard& card, const kloC_Load&, const oif_LoadSetting& setting)
    : oif_Dsload(card, setting, nullptr) {}

void oif_Dsload::TakeTraction(const kloC_Traction& traction, const cow_String& name,
                              const oif_LoadSetting& setting) {
    label_.Append(UserSuffix(traction.distributionType));
    vectorGiven_ = traction.vectorGiven;
    followerNo_ = vectorGiven_ && !traction.follower;
    constantResultant_ = vectorGiven_ && traction.resultant;
    direction_ = Unit(traction.direction.Direction());
    // The system stands on the line also when no direction is given in it.
    orientation_ = traction.orientation;
    if (orientation_.IsEmpty() && !traction.datum.IsNullRef()) {
        orientation_ = setting.modelInfo.GetOrientationName(traction.datum, traction.angle, name);
    }
}

void oif_Dsload::WriteDsloadCard(utl_Stream& stream, int loadCase, bool followerNo, bool constantResultant,
                                 const cow_String& orientation) const {
    oif_KeywordLine(stream, "*Dsload")
        .FixedIf(isSubmodel_, ", submodel")
        .FixedIf(!submodelStep_.IsEmpty(), ", step=", submodelStep_)
        .FixedUnless(", scale=", scaleParameter_, 1.0)
        .Op(op_)
        .Amplitude(amplitude_)
        .FixedIf(cyclicMode_.has_value(), ", cyclic mode=", cyclicMode_.value_or(0))
        .FixedIf(loadCase != 0, ", load case=", loadCase)
        .FixedIf(followerNo, ", follower=NO")
        .FixedIf(!orientation.IsEmpty(), ", orientation=", orientation)
        .FixedIf(constantResultant, ", constant resultant=YES")
        .FixedIf(!refNode_.IsEmpty(), ", ref node=", refNode_)
        .End();
}

void oif_Dsload::WriteHydrostaticData(utl_Stream& stream) const {
    oif_AddNumbers(stream, {heights_[0], heights_[1]});
}

void oif_Dsload::WriteDirectionVectorData(utl_Stream& stream) const {
    oif_AddNumbers(stream, {direction_.X(), direction_.Y(), direction_.Z()});
}

void oif_Dsload::WritePressure(utl_Stream& stream) const {
    const bool passes = Passes(values_.front().state) || (hydrostatic_ && heightsPass_);
    WriteMagnitude(passes, [&](int part, double value) {
        WriteDsloadCard(stream, part, false, false, {});
        BeginLine(stream, label_);
        stream << value;
        // The heights of a complex pressure have a line of their own, which begins with the separator.
        if (hydrostatic_ && complex_) stream.LineBreak();
        if (hydrostatic_) WriteHydrostaticData(stream);
        stream.LineBreak();
    });
}

void oif_Dsload::WriteTraction(utl_Stream& stream) const {
    WriteMagnitude(Passes(values_.front().state), [&](int part, double value) {
        WriteDsloadCard(stream, part, followerNo_, constantResultant_, orientation_);
        BeginLine(stream, label_);
        stream << value;
        if (vectorGiven_) WriteDirectionVectorData(stream);
        stream.LineBreak();
    });
}

void oif_Dsload::Write(utl_Stream& stream) const {
    if (deactivated_) return WriteDsloadCard(stream, 0, false, false, {});
    if (form_ == nullptr) nex_Raise("\"Invalid load type for *Dsload\" == 0");
    (this->*form_)(stream);
}
