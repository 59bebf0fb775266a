#include "interactions/oif_FilmAndRadiation.h"

#include "base/oif_DataLines.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"

namespace {

// Where a film coefficient comes from.
enum Definition { EMBEDDED = 0, PROPERTY = 1, USER = 2 };

/// The range that stands for none.
constexpr double kNoRange = 3.4028234663852886e38;

cow_List<cow_String> SurfaceNames(const cow_List<rgnC_Region>& regions, const qkw_ModelInfo& modelInfo) {
    cow_List<cow_String> names;
    for (int i = 0; i < regions.Length(); ++i) names.Append(oif_SurfaceName(regions[i], modelInfo));
    return names;
}

void WriteSurfaces(utl_Stream& stream, const cow_List<cow_String>& names) {
    for (int i = 0; i < names.Length(); ++i) stream << names[i] << endl;
}

} // namespace

void oif_FilmInteraction::WriteFilmAmplitudes(utl_Stream& stream) const {
    const auto& film = Record<kinC_FilmCondition>();
    const auto& state = film.ConstGetState(Step());
    // A film of the user's code has neither.
    if (film.definition != USER) WriteNamed(stream, ", amplitude=", state.amplitude.ConstGet());
    if (film.definition == EMBEDDED) {
        WriteNamed(stream, ", film amplitude=", state.filmAmplitude.ConstGet());
    }
}

void oif_Sfilm::WriteParameters(utl_Stream& stream) const {
    WriteFilmAmplitudes(stream);
}

void oif_Sfilm::WriteData(utl_Stream& stream) const {
    const auto& film = Record<kinC_FilmCondition>();
    const auto& state = film.ConstGetState(Step());
    stream << SetName() << ", ";
    switch (film.definition) {
    case EMBEDDED:
        stream << "F, " << state.sinkTemperature.ConstGet() << ", " << state.filmCoeff.ConstGet();
        break;
    case PROPERTY:
        stream << "F, " << state.sinkTemperature.ConstGet() << ", "
               << qkw_QuorixName(state.filmProperty.ConstGet(), false);
        break;
    case USER:
        stream << "FNU, " << state.sinkTemperature.ConstGet() << ", " << state.filmCoeff.ConstGet();
        break;
    default: break;
    }
}

void oif_Cfilm::WriteParameters(utl_Stream& stream) const {
    const auto& film = Record<kinC_ConcFilmCondition>();
    WriteFilmAmplitudes(stream);
    WriteRegionType(stream, film.regionType);
    if (film.definition == USER) {
        stream.OptionalLineBreak();
        stream << ", user";
    }
}

void oif_Cfilm::WriteData(utl_Stream& stream) const {
    const auto& film = Record<kinC_ConcFilmCondition>();
    const auto& state = film.ConstGetState(Step());
    stream << SetName() << ", " << state.nodalArea.ConstGet() << ", " << state.sinkTemperature.ConstGet()
           << ", ";
    if (film.definition == PROPERTY) {
        stream << qkw_QuorixName(state.filmProperty.ConstGet(), false);
    } else {
        stream << state.filmCoeff.ConstGet();
    }
}

void oif_Sradiate::WriteParameters(utl_Stream& stream) const {
    WriteNamed(stream,
               ", amplitude=", Record<kinC_RadiationToAmbient>().ConstGetState(Step()).amplitude.ConstGet());
}

void oif_Sradiate::WriteData(utl_Stream& stream) const {
    const auto& state = Record<kinC_RadiationToAmbient>().ConstGetState(Step());
    stream << SetName() << ", R, " << state.ambientTemperature.ConstGet() << ", "
           << state.emissivity.ConstGet();
}

void oif_Cradiate::WriteParameters(utl_Stream& stream) const {
    const auto& radiation = Record<kinC_ConcRadiationToAmbient>();
    WriteNamed(stream, ", amplitude=", radiation.ConstGetState(Step()).amplitude.ConstGet());
    WriteRegionType(stream, radiation.regionType);
}

void oif_Cradiate::WriteData(utl_Stream& stream) const {
    const auto& state = Record<kinC_ConcRadiationToAmbient>().ConstGetState(Step());
    stream << SetName() << ", " << state.nodalArea.ConstGet() << ", " << state.ambientTemperature.ConstGet()
           << ", " << state.emissivity.ConstGet();
}

oif_FilmProperty::oif_FilmProperty(const cow_String& name, const kinC_InteractionProperty& property)
    : name_(name), property_(nex_canDynamicCastRef<kinC_FilmConditionProp>(property, NEX_HERE)) {}

void oif_FilmProperty::Write(utl_Stream& stream) const {
    stream << "*Film Property, name=" << qkw_QuorixName(name_, false);
    stream.OptionalLineBreak();
    if (property_.dependencies != 0) stream << ", dependencies=" << property_.dependencies;
    stream << endl;
    const cow_2DArray<double>& table = property_.table;
    for (int row = 0; row < table.NumRows(); ++row) {
        oif_DataLines line(stream, 8);
        for (int column = 0; column < table.NumColumns(); ++column) {
            // The temperature's place stays empty, and doesn't count among the eight.
            if (column == 1 && !property_.temperatureDependency) stream << ", ";
            line.Add(table.ConstGet(row, column));
        }
        line.End();
    }
}

oif_CavityDefinition::oif_CavityDefinition(const cow_String& name, const kinC_Interaction& interaction,
                                           const qkw_ModelInfo& modelInfo)
    : name_(name) {
    const auto& cavity = nex_canDynamicCastRef<kinC_CavityRadiation>(interaction, NEX_HERE);
    ambientTemp_ = cavity.ambientTemp;
    surfaces_ = SurfaceNames(cavity.surfaces, modelInfo);
}

void oif_CavityDefinition::Write(utl_Stream& stream) const {
    stream << "*Cavity Definition, name=" << qkw_QuorixName(name_, false);
    if (ambientTemp_ != kinC_CavityRadiation::ambientTempDef()) stream << ", ambient temp=" << ambientTemp_;
    stream << endl;
    WriteSurfaces(stream, surfaces_);
}

oif_RadiationViewfactor::oif_RadiationViewfactor(const cow_String& name, const kinC_CavityRadiation& cavity,
                                                 const cow_String& step, const qkw_ModelInfo& modelInfo)
    : name_(name), state_(cavity.ConstGetState(step)),
      blockingSurfaces_(SurfaceNames(state_.blockingSurfaces.ConstGet(), modelInfo)) {}

void oif_RadiationViewfactor::Write(utl_Stream& stream) const {
    stream << "*Radiation Viewfactor, cavity=" << qkw_QuorixName(name_, false);
    if (off_) {
        stream << ", off" << endl;
        return;
    }
    const kinC_CavityRadiationBlockingEnm blocking = state_.blocking.ConstGet();
    stream << ", blocking=";
    switch (blocking) {
    case kinC_CavityRadiationBlockingEnm::ALL: stream << "ALL"; break;
    case kinC_CavityRadiationBlockingEnm::NONE: stream << "NO"; break;
    // With its blank.
    case kinC_CavityRadiationBlockingEnm::PARTIAL: stream << "PARTIAL "; break;
    }
    if (state_.range.ConstGet() != kNoRange) stream << ", range=" << state_.range.ConstGet();
    stream << ", reflection=" << (state_.reflection.ConstGet() ? "YES" : "NO")
           << ", vtol=" << state_.vtol.ConstGet() << endl;
    if (blocking == kinC_CavityRadiationBlockingEnm::PARTIAL) WriteSurfaces(stream, blockingSurfaces_);
}
