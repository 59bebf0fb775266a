#include "conditions/oif_MechanicalLoads.h"

#include "base/oif_Utils.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"
#include "store_interface/records/cls_ClassRegistrar.h"
#include "store_interface/records/conditions/kloC_BoltLoad.h"
#include "store_interface/records/conditions/kloC_Loads.h"

#include <algorithm>
#include <initializer_list>

using AttributeState = mdl_PropAttributeStateEnm;
using Distribution = kloC_Load::DistribTypeEnm;

namespace {

constexpr const char* kForceLabels[] = {"1", "2", "3"};
constexpr const char* kMomentLabels[] = {"4", "5", "6"};
constexpr const char* kPlaneStrainLabels[] = {"3", "4", "5"};
constexpr const char* kGlobalLineLabels[] = {"PX", "PY", "PZ"};
constexpr const char* kLocalLineLabels[] = {"P1", "P2"};
constexpr const char* kBodyLabels[] = {"BX", "BY", "BZ"};
constexpr const char* kAxisymmetricBodyLabels[] = {"BR", "BZ"};
constexpr const char* kEdgeLabels[] = {"EDNOR", "EDTRA", "EDSHR", "EDMOM", "EDLD"};

constexpr int kThreeDimensional = 1;
constexpr int kAxisymmetric = 4;

void WriteNumbers(utl_Stream& stream, std::initializer_list<double> numbers, const char* separator = ", ") {
    for (const double number : numbers) stream << separator << number;
}

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

const char* UserSuffix(Distribution distribution) {
    return distribution == Distribution::USER_DEFINED ? "NU" : "";
}

} // namespace

oif_MechanicalLoad::oif_MechanicalLoad(const kloC_Load& load, const cow_String& stepName, bool opMod,
                                       const cow_String& setName, double scale,
                                       ClearedAmplitude clearedAmplitude)
    : typeId_(load.DynTypeId()), setName_(setName), opNew_(!opMod), scale_(scale), modifiedOnly_(opMod),
      complex_(load.IsComplex()), values_(load.Values(stepName)) {
    const auto& quad = load.ConstGetStateQuad(stepName);
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

void oif_MechanicalLoad::WriteOpNew(utl_Stream& stream) const {
    if (opNew_) stream << ", op=NEW";
}

void oif_MechanicalLoad::WriteAmplitude(utl_Stream& stream) const {
    if (!amplitude_.IsEmpty()) stream << ", amplitude=" << qkw_QuorixName(amplitude_, false);
}

void oif_MechanicalLoad::WriteLoadCase(utl_Stream& stream, int loadCase) {
    if (loadCase != 0) stream << ", load case=" << loadCase;
}

void oif_MechanicalLoad::WriteCard(utl_Stream& stream, const char* keyword, int loadCase,
                                   bool follower) const {
    stream << keyword;
    WriteOpNew(stream);
    if (follower) stream << ", follower";
    WriteAmplitude(stream);
    WriteLoadCase(stream, loadCase);
    stream.LineBreak();
}

void oif_MechanicalLoad::BeginLine(utl_Stream& stream, const cow_String& label, const char* separator) const {
    stream << setName_ << separator << label << separator;
}

void oif_MechanicalLoad::WriteLine(utl_Stream& stream, const cow_String& label, double value) const {
    BeginLine(stream, label);
    stream << value << endl;
}

template <class Card>
void oif_MechanicalLoad::WriteComponents(utl_Stream& stream, std::span<const char* const> labels,
                                         const char* suffix, const Card& card) const {
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

oif_Cload::oif_Cload(const kloC_Load& load, const cow_String& stepName, bool opMod,
                     const qkw_ModelInfo& modelInfo, const cow_String&, double scale)
    : oif_Cload(load, stepName, opMod, oif_RegionName(load.region, modelInfo), scale) {}

oif_Cload::oif_Cload(const kloC_Load& load, const cow_String& stepName, bool opMod,
                     const cow_String& regionName, double scale)
    : qkw_KeywordOf(load, stepName, opMod, cow_String(), scale, ClearedAmplitude::COUNTS) {
    // The lines of bolts and of plane strain loads begin with an empty name.
    if (typeId_ != kloC_BoltLoad::TypeId() && typeId_ != kloC_PEGLoad::TypeId()) setName_ = regionName;
    if (typeId_ == kloC_ConcentratedForce::TypeId()) {
        follower_ = static_cast<const kloC_ConcentratedForce&>(load).follower;
    } else if (typeId_ == kloC_Moment::TypeId()) {
        follower_ = static_cast<const kloC_Moment&>(load).follower;
    } else if (typeId_ == kloC_BoltLoad::TypeId()) {
        const kloC_BoltLoadState& state = static_cast<const kloC_BoltLoad&>(load).BoltState(stepName);
        bolted_ = state.boltMethod.ConstGet() != kloC_BoltLoad::MethodEnm::APPLY_FORCE;
        values_ = {{state.magnitude.ConstGet(), 0.0, state.magnitude.State()}};
    }
}

void oif_Cload::WriteCloadCard(utl_Stream& stream, int loadCase, bool follower) const {
    WriteCard(stream, "*Cload", loadCase, follower);
}

void oif_Cload::WriteSingle(utl_Stream& stream, const cow_String& label) const {
    WriteMagnitude(Passes(values_.front().state), [&](int part, double value) {
        WriteCloadCard(stream, part, false);
        WriteLine(stream, label, value);
    });
}

void oif_Cload::Write(utl_Stream& stream) const {
    // A load that ends has its line alone, and never ", follower".
    if (deactivated_) return WriteCloadCard(stream, 0, false);
    const auto writeVector = [&](std::span<const char* const> labels) {
        WriteComponents(stream, labels, "", [&](int part) { WriteCloadCard(stream, part, follower_); });
    };
    switch (typeId_) {
    case kloC_ConcentratedForce::Class.Id(): return writeVector(kForceLabels);
    case kloC_Moment::Class.Id(): return writeVector(kMomentLabels);
    case kloC_PEGLoad::Class.Id(): return writeVector(kPlaneStrainLabels);
    case kloC_BoltLoad::Class.Id():
        return bolted_ ? WriteCloadCard(stream, 0, false) : WriteSingle(stream, "1");
    case kloC_ConcentratedPoreFluid::Class.Id():
        if (complex_) nex_Raise("\"Concentrated pore fluid load cannot be complex\" == 0");
        return WriteSingle(stream, "8");
    case kloC_InwardVolAccel::Class.Id(): return WriteSingle(stream, "8");
    default: nex_Raise("\"Invalid load type for *Cload\" == 0");
    }
}

oif_ConnectorLoad::oif_ConnectorLoad(const kloC_Load& load, const cow_String& setName,
                                     const cow_String& stepName, bool opMod, double scale)
    : qkw_KeywordOf(load, stepName, opMod, oif_Utils::GetConnectorSetName(setName), scale,
                    ClearedAmplitude::IGNORED) {}

void oif_ConnectorLoad::Write(utl_Stream& stream) const {
    const auto card = [&](int part) { WriteCard(stream, "*Connector Load", part); };
    if (deactivated_) return card(0);
    switch (typeId_) {
    case kloC_ConnectorForce::Class.Id(): return WriteComponents(stream, kForceLabels, "", card);
    case kloC_ConnectorMoment::Class.Id(): return WriteComponents(stream, kMomentLabels, "", card);
    default: nex_Raise("Invalid load type for *Connector Load");
    }
}

oif_Dload::oif_Dload(const kloC_Load& load, const cow_String& stepName, bool opMod, const cow_String& setName,
                     int space, const qkw_ModelInfo&, bool, int, double scale, const cow_String&)
    : qkw_KeywordOf(load, stepName, opMod, setName, scale, ClearedAmplitude::IGNORED), space_(space) {
    if (const auto* distributed = nex_canDynamicCastPtr<kloC_DistributedLoad>(&load)) {
        suffix_ = UserSuffix(distributed->distributionType);
        hydrostatic_ = distributed->distributionType == Distribution::HYDROSTATIC;
    }
    switch (typeId_) {
    case kloC_LineLoad::Class.Id():
        local_ = static_cast<const kloC_LineLoad&>(load).system == kloC_LineLoad::SystemEnm::LOCAL;
        break;
    case kloC_PipePressure::Class.Id(): {
        const auto& pipe = static_cast<const kloC_PipePressure&>(load);
        const kloC_HydrostaticHeights& heights = pipe.StateIn(stepName);
        label_ = cow_String(hydrostatic_ ? "H" : "") + (pipe.external ? "PE" : "PI") + suffix_;
        diameter_ = pipe.effectiveDiameter;
        heights_[0] = heights.zeroPressureHeight.ConstGet();
        heights_[1] = heights.referencePressureHeight.ConstGet();
        heightsPass_ =
            Passes(heights.zeroPressureHeight.State()) || Passes(heights.referencePressureHeight.State());
        break;
    }
    case kloC_RotationalBodyForce::Class.Id(): {
        const auto& rotation = static_cast<const kloC_RotationalBodyForce&>(load);
        label_ = rotation.centrifugal ? "CENTRIF" : rotation.rotaryAcceleration ? "ROTA" : "";
        axis_ = gsl_ModelSegment(rotation.point1, rotation.point2);
        break;
    }
    default: break;
    }
}

void oif_Dload::WriteDloadCard(utl_Stream& stream, int loadCase) const {
    WriteCard(stream, "*Dload", loadCase);
}

void oif_Dload::WriteLineLoad(utl_Stream& stream) const {
    const auto labels = local_ ? std::span<const char* const>(kLocalLineLabels)
                               : std::span<const char* const>(kGlobalLineLabels);
    WriteComponents(stream, labels, suffix_, [&](int part) { WriteDloadCard(stream, part); });
}

void oif_Dload::WriteBodyForce(utl_Stream& stream) const {
    auto labels = space_ == kAxisymmetric ? std::span<const char* const>(kAxisymmetricBodyLabels)
                                          : std::span<const char* const>(kBodyLabels);
    if (space_ != kThreeDimensional) labels = labels.first(2);
    WriteComponents(stream, labels, suffix_, [&](int part) { WriteDloadCard(stream, part); });
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
            WriteNumbers(stream, {cosines.X()});
        }
        WriteNumbers(stream, {cosines.Y()});
        if (space_ == kThreeDimensional) WriteNumbers(stream, {cosines.Z()});
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
    if (hydrostatic_) WriteNumbers(stream, {heights_[0], heights_[1]});
    WriteNumbers(stream, {diameter_});
    stream.LineBreak();
}

void oif_Dload::WriteRotBodyForceData(utl_Stream& stream, double magnitude) const {
    BeginLine(stream, label_, ",");
    stream << magnitude;
    WriteNumbers(stream, {axis_.Start().X(), axis_.Start().Y(), axis_.Start().Z()}, ",");
    const gsl_Vector direction = Unit(axis_.Direction());
    if (space_ < 3) WriteNumbers(stream, {direction.X(), direction.Y(), direction.Z()}, ",");
    if (space_ == kAxisymmetric) stream << ",0.0,1.0,0.0";
    stream.LineBreak();
}

void oif_Dload::Write(utl_Stream& stream) const {
    if (deactivated_) return WriteDloadCard(stream, 0);
    switch (typeId_) {
    case kloC_RotationalBodyForce::Class.Id():
        return WriteMagnitude(Passes(values_.front().state), [&](int part, double value) {
            WriteDloadCard(stream, part);
            WriteRotBodyForceData(stream, value);
        });
    case kloC_LineLoad::Class.Id(): return WriteLineLoad(stream);
    case kloC_PipePressure::Class.Id():
        return WriteMagnitude(Passes(values_.front().state) || (hydrostatic_ && heightsPass_),
                              [&](int part, double value) {
                                  WriteDloadCard(stream, part);
                                  BeginLine(stream, label_);
                                  stream << value;
                                  WritePipePressureData(stream);
                              });
    case kloC_BodyForce::Class.Id(): return WriteBodyForce(stream);
    case kloC_Gravity::Class.Id(): return WriteGravity(stream);
    default: nex_Raise("\"Invalid load type for *Dload\" == 0");
    }
}

oif_Dsload::oif_Dsload(const kloC_Load& load, const cow_String& stepName, bool opMod,
                       const cow_String& setName, const qkw_ModelInfo& modelInfo, bool cyclicApplies,
                       int cyclicMode, double scale, const cow_String& refNode, const cow_String& name)
    : qkw_KeywordOf(load, stepName, opMod, setName, scale, ClearedAmplitude::IGNORED), refNode_(refNode),
      cyclicApplies_(cyclicApplies), cyclicMode_(cyclicMode) {
    // The text of an assertion is the message.
    if (setName.IsEmpty()) nex_Raise("! setName.Empty()");
    switch (typeId_) {
    case kloC_Pressure::Class.Id(): {
        const auto& pressure = static_cast<const kloC_Pressure&>(load);
        const kloC_HydrostaticHeights& heights = pressure.StateIn(stepName);
        const Distribution distribution = pressure.distributionType;
        hydrostatic_ = distribution == Distribution::HYDROSTATIC;
        if (hydrostatic_) {
            label_ = "HP";
        } else if (distribution == Distribution::UNIFORM || distribution == Distribution::USER_DEFINED) {
            label_ = cow_String("P") + UserSuffix(distribution);
        }
        heights_[0] = heights.zeroPressureHeight.ConstGet();
        heights_[1] = heights.referencePressureHeight.ConstGet();
        heightsPass_ =
            Passes(heights.zeroPressureHeight.State()) || Passes(heights.referencePressureHeight.State());
        break;
    }
    case kloC_SurfaceTraction::Class.Id():
    case kloC_ShellEdgeLoad::Class.Id(): {
        const auto& traction = static_cast<const kloC_Traction&>(load);
        if (typeId_ == kloC_SurfaceTraction::TypeId()) {
            label_ = traction.kind == kloC_Traction::KindEnm::SHEAR ? "TRSHR" : "TRVEC";
        } else if (const auto kind = static_cast<std::size_t>(traction.kind); kind < std::size(kEdgeLabels)) {
            label_ = kEdgeLabels[kind];
        }
        label_.Append(UserSuffix(traction.distributionType));
        vectorGiven_ = traction.vectorGiven;
        followerNo_ = vectorGiven_ && !traction.follower;
        constantResultant_ = vectorGiven_ && traction.resultant;
        direction_ = Unit(traction.direction.Direction());
        // The system stands on the line also when no direction is given in it.
        orientation_ = traction.orientation;
        if (orientation_.IsEmpty() && !traction.datum.IsNullRef()) {
            orientation_ = modelInfo.GetOrientationName(traction.datum, traction.angle, name);
        }
        break;
    }
    case kloC_SubmodelStressBased::Class.Id(): {
        const auto& state = static_cast<const kloC_SubmodelStressBased&>(load).StateIn(stepName);
        isSubmodel_ = true;
        submodelStep_ = state.stepName;
        scaleParameter_ = state.scaleParameter.ConstGet();
        break;
    }
    default: break;
    }
}

void oif_Dsload::WriteDsloadCard(utl_Stream& stream, int loadCase, bool followerNo, bool constantResultant,
                                 const cow_String& orientation) const {
    stream << "*Dsload";
    if (isSubmodel_) stream << ", submodel";
    if (!submodelStep_.IsEmpty()) stream << ", step=" << submodelStep_;
    if (scaleParameter_ != 1.0) stream << ", scale=" << scaleParameter_;
    WriteOpNew(stream);
    WriteAmplitude(stream);
    if (cyclicApplies_) stream << ", cyclic mode=" << cyclicMode_;
    WriteLoadCase(stream, loadCase);
    if (followerNo) stream << ", follower=NO";
    if (!orientation.IsEmpty()) stream << ", orientation=" << orientation;
    if (constantResultant) stream << ", constant resultant=YES";
    if (!refNode_.IsEmpty()) stream << ", ref node=" << refNode_;
    stream.LineBreak();
}

void oif_Dsload::WriteHydrostaticData(utl_Stream& stream) const {
    WriteNumbers(stream, {heights_[0], heights_[1]});
}

void oif_Dsload::WriteDirectionVectorData(utl_Stream& stream) const {
    WriteNumbers(stream, {direction_.X(), direction_.Y(), direction_.Z()});
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
    switch (typeId_) {
    case kloC_Pressure::Class.Id(): return WritePressure(stream);
    case kloC_SurfaceTraction::Class.Id():
    case kloC_ShellEdgeLoad::Class.Id(): return WriteTraction(stream);
    default: nex_Raise("\"Invalid load type for *Dsload\" == 0");
    }
}
