#include "interactions/oif_FilmAndRadiation.h"

#include "base/oif_DataLines.h"
#include "keyword_layer/qkw_QuorixName.h"
#include "mesh/oif_SetName.h"

namespace {

// Where a film coefficient comes from.
enum FilmDefinition { FILM_EMBEDDED = 0, FILM_PROPERTY = 1, FILM_USER = 2 };

/// The range that stands for none.
constexpr double kNoRange = 3.4028234663852886e38;

cow_List<cow_String> SurfaceNames(const cow_List<rgnC_Region>& regions, const qkw_ModelInfo& modelInfo) {
    cow_List<cow_String> names;
    for (const rgnC_Region& region : regions) names.Append(oif_SurfaceName(region, modelInfo));
    return names;
}

void WriteSurfaces(utl_Stream& stream, const cow_List<cow_String>& names) {
    for (const cow_String& name : names) stream << name << endl;
}

const char* BlockingWord(kinC_CavityRadiationBlockingEnm blocking) {
    switch (blocking) {
    case kinC_CavityRadiationBlockingEnm::ALL: return "ALL";
    case kinC_CavityRadiationBlockingEnm::NONE: return "NO";
    // With its blank.
    case kinC_CavityRadiationBlockingEnm::PARTIAL: return "PARTIAL ";
    }
    return "";
}

} // namespace

void oif_FilmInteraction::AddFilmAmplitudes(oif_KeywordLine& line) const {
    const auto& film = Record<kinC_FilmCondition>();
    const auto& state = film.ConstGetState(Step());
    // A film of the user's code has neither.
    if (film.definition != FILM_USER) AddNamed(line, ", amplitude=", state.amplitude.ConstGet());
    if (film.definition == FILM_EMBEDDED) {
        AddNamed(line, ", film amplitude=", state.filmAmplitude.ConstGet());
    }
}

void oif_Sfilm::AddParameters(oif_KeywordLine& line) const {
    AddFilmAmplitudes(line);
}

void oif_Sfilm::WriteData(utl_Stream& stream) const {
    const auto& film = Record<kinC_FilmCondition>();
    const auto& state = film.ConstGetState(Step());
    stream << SetName() << ", ";
    switch (film.definition) {
    case FILM_EMBEDDED:
        stream << "F, " << state.sinkTemperature.ConstGet() << ", " << state.filmCoeff.ConstGet();
        break;
    case FILM_PROPERTY:
        stream << "F, " << state.sinkTemperature.ConstGet() << ", "
               << qkw_QuorixName(state.filmProperty.ConstGet(), false);
        break;
    case FILM_USER:
        stream << "FNU, " << state.sinkTemperature.ConstGet() << ", " << state.filmCoeff.ConstGet();
        break;
    default: break;
    }
}

void oif_Cfilm::AddParameters(oif_KeywordLine& line) const {
    const auto& film = Record<kinC_ConcFilmCondition>();
    AddFilmAmplitudes(line);
    AddRegionType(line, film.regionType);
    if (film.definition == FILM_USER) line.MayBreak().Fixed(", user");
}

void oif_Cfilm::WriteData(utl_Stream& stream) const {
    const auto& film = Record<kinC_ConcFilmCondition>();
    const auto& state = film.ConstGetState(Step());
    stream << SetName() << ", " << state.nodalArea.ConstGet() << ", " << state.sinkTemperature.ConstGet()
           << ", ";
    if (film.definition == FILM_PROPERTY) {
        stream << qkw_QuorixName(state.filmProperty.ConstGet(), false);
    } else {
        stream << state.filmCoeff.ConstGet();
    }
}

void oif_Sradiate::AddParameters(oif_KeywordLine& line) const {
    AddNamed(line,
             ", amplitude=", Record<kinC_RadiationToAmbient>().ConstGetState(Step()).amplitude.ConstGet());
}

void oif_Sradiate::WriteData(utl_Stream& stream) const {
    const auto& state = Record<kinC_RadiationToAmbient>().ConstGetState(Step());
    stream << SetName() << ", R, " << state.ambientTemperature.ConstGet() << ", "
           << state.emissivity.ConstGet();
}

void oif_Cradiate::AddParameters(oif_KeywordLine& line) const {
    const auto& radiation = Record<kinC_ConcRadiationToAmbient>();
    AddNamed(line, ", amplitude=", radiation.ConstGetState(Step()).amplitude.ConstGet());
    AddRegionType(line, radiation.regionType);
}

void oif_Cradiate::WriteData(utl_Stream& stream) const {
    const auto& state = Record<kinC_ConcRadiationToAmbient>().ConstGetState(Step());
    stream << SetName() << ", " << state.nodalArea.ConstGet() << ", " << state.ambientTemperature.ConstGet()
           << ", " << state.emissivity.ConstGet();
}

oif_FilmProperty::oif_FilmProperty(const cow_String& name, const kinC_InteractionProperty& property)
    : name_(name), property_(nex_canDynamicCastRef<kinC_FilmConditionProp>(property, NEX_HERE)) {}

void oif_FilmProperty::Write(utl_Stream& stream) const {
    oif_KeywordLine(stream, "*Film Property")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .MayBreak()
        .FixedUnless(", dependencies=", property_.dependencies, 0)
        .End();
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
    oif_KeywordLine(stream, "*Cavity Definition")
        .Fixed(", name=", qkw_QuorixName(name_, false))
        .FixedUnless(", ambient temp=", ambientTemp_, kinC_CavityRadiation::ambientTempDef())
        .End();
    WriteSurfaces(stream, surfaces_);
}

oif_RadiationViewfactor::oif_RadiationViewfactor(const cow_String& name, const kinC_CavityRadiation& cavity,
                                                 const cow_String& step, const qkw_ModelInfo& modelInfo)
    : name_(name), state_(cavity.ConstGetState(step)),
      blockingSurfaces_(SurfaceNames(state_.blockingSurfaces.ConstGet(), modelInfo)) {}

void oif_RadiationViewfactor::Write(utl_Stream& stream) const {
    oif_KeywordLine line(stream, "*Radiation Viewfactor");
    line.Fixed(", cavity=", qkw_QuorixName(name_, false));
    if (off_) {
        line.Fixed(", off").End();
        return;
    }
    const kinC_CavityRadiationBlockingEnm blocking = state_.blocking.ConstGet();
    line.Fixed(", blocking=", BlockingWord(blocking))
        .FixedUnless(", range=", state_.range.ConstGet(), kNoRange)
        .Fixed(", reflection=", state_.reflection.ConstGet() ? "YES" : "NO")
        .Fixed(", vtol=", state_.vtol.ConstGet())
        .End();
    if (blocking == kinC_CavityRadiationBlockingEnm::PARTIAL) WriteSurfaces(stream, blockingSurfaces_);
}
