#include "interactions/oif_WaveInteractions.h"

#include "base/oif_DataLines.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "materials/oif_MaterialTable.h"
#include "mesh/oif_SetName.h"

namespace {

constexpr const char* kBoundaryTypes[] = {"PLANAR",    "IMPROVED",   "CIRCULAR",
                                          "SPHERICAL", "ELLIPTICAL", "PROLATE SPHEROIDAL"};
enum BoundaryType { CIRCULAR = 2, SPHERICAL = 3, ELLIPTICAL = 4, PROLATE_SPHEROIDAL = 5 };
enum BubbleModel { CHARGE = 1, DECAY = 2 };

} // namespace

void oif_AcousticImpedance::AddParameters(oif_KeywordLine& line) const {
    const auto& impedance = Record<kinC_AcousticImpedance>();
    if (impedance.nonreflecting != 0) {
        const int type = impedance.boundaryType;
        const bool isKnown = type >= 0 && type < static_cast<int>(std::size(kBoundaryTypes));
        line.Fixed(", nonreflecting=", isKnown ? kBoundaryTypes[type] : "");
    } else {
        line.Fixed(", property=", qkw_QuorixName(impedance.ConstGetState(Step()).property.ConstGet(), false));
    }
    line.MayBreak();
}

void oif_AcousticImpedance::WriteData(utl_Stream& stream) const {
    const auto& impedance = Record<kinC_AcousticImpedance>();
    stream << SetName();
    if (impedance.nonreflecting != 1) return;
    switch (impedance.boundaryType) {
    case CIRCULAR:
    case SPHERICAL: stream << ", " << impedance.radius; break;
    case ELLIPTICAL:
    case PROLATE_SPHEROIDAL: {
        const gsl_Point& center = impedance.center;
        const gsl_Vector axis = impedance.axis.Direction();
        oif_AddNumbers(stream, {impedance.semiAxisA, impedance.semiAxisB, center.X(), center.Y(), center.Z(),
                                axis.X(), axis.Y(), axis.Z()});
        break;
    }
    default: break;
    }
}

oif_AcousticImpedanceProp::oif_AcousticImpedanceProp(const cow_String& name,
                                                     const kinC_InteractionProperty& property)
    : name_(name), property_(nex_canDynamicCastRef<kinC_AcousticImpedanceProp>(property, NEX_HERE)) {}

void oif_AcousticImpedanceProp::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Impedance Property")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .MayBreak()
        .FixedIf(!property_.admittance, ", data=IMPEDANCE")
        .End();
    stream << oif_MaterialTable(property_.table, 0, property_.dependencies != 0);
}

oif_IncidentWave::oif_IncidentWave(const kinC_Interaction& interaction, const cow_String& step,
                                   const cow_String& sourceName, const cow_String& standoffName,
                                   const cow_String& surfaceName)
    : wave_(nex_canDynamicCastRef<kinC_IncidentWave>(interaction, NEX_HERE)), step_(step),
      sourceName_(sourceName), standoffName_(standoffName), surfaceName_(surfaceName) {}

void oif_IncidentWave::Write(utl_Stream& stream) const {
    if (wave_.GetPropStatus(step_) != mdl_PropagationStatusEnm::CREATED) return;
    oif_KeywordLine line(stream, "*Incident wave interaction");
    switch (wave_.waveType) {
    case 0: line.Fixed(", pressure amplitude=", qkw_QuorixName(wave_.amplitude, false)); break;
    case 1: line.Fixed(", acceleration amplitude=", qkw_QuorixName(wave_.amplitude, false)); break;
    default: line.Fixed(", UNDEX"); break;
    }
    line.MayBreak().Fixed(", property=", qkw_QuorixName(wave_.property, false)).End();
    stream << surfaceName_ << ", " << sourceName_ << ", " << standoffName_ << ", " << wave_.magnitude << endl;
}

oif_IncidentWaveProperty::oif_IncidentWaveProperty(const cow_String& name,
                                                   const kinC_InteractionProperty& property)
    : name_(name), property_(nex_canDynamicCastRef<kinC_IncidentWaveProperty>(property, NEX_HERE)),
      depth_(property_.initialDepth) {}

void oif_IncidentWaveProperty::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Incident Wave Interaction Property")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .MayBreak()
        .FixedIf(property_.shape == 1, ", type=SPHERE")
        .End();
    stream << property_.speed << ", " << property_.density;
    if (property_.bubbleModel == DECAY) {
        oif_AddNumbers(stream, {property_.decayA, property_.decayB, property_.decayC});
    }
    stream << endl;
    if (property_.bubbleModel == CHARGE) WriteCharge(stream);
}

void oif_IncidentWaveProperty::WriteCharge(utl_Stream& stream) const {
    const kinC_IncidentWaveProperty& p = property_;
    stream << "*UNDEX Charge Property" << endl << p.pressureConstant;
    oif_AddNumbers(stream, {p.timeConstant, p.pressureExponent, p.timeExponent, p.adiabaticConstant,
                            p.specificHeatRatio, p.chargeDensity, p.chargeMass});
    stream << endl << p.fluidDensity;
    oif_AddNumbers(stream, {p.fluidSoundSpeed, p.gravity, p.atmosphericPressure});
    // The flag stands as a real.
    stream << ", " << (p.waveEffects ? "1.0, " : "0.0, ") << p.dragCoefficient << ", " << p.dragExponent
           << endl
           << p.maximumTime << ", " << p.maximumSteps;
    oif_AddNumbers(stream, {p.relativeStepControl, p.absoluteStepControl, p.stepControlExponent});
    const gsl_Vector normal = normal_.Direction();
    stream << endl << depth_;
    oif_AddNumbers(stream, {normal.X(), normal.Y(), normal.Z()});
    stream << endl;
}
