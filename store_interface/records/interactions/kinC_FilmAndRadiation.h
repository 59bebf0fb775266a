#ifndef QRX_STORE_KINC_FILMANDRADIATION_H
#define QRX_STORE_KINC_FILMANDRADIATION_H

#include "store_interface/records/interactions/kinC_Interaction.h"

/// Which surfaces of a cavity block the view.
enum class kinC_CavityRadiationBlockingEnm : int { ALL = 0, NONE = 1, PARTIAL = 2 };
const omu_EnumTable& omu_EnumTableOf(kinC_CavityRadiationBlockingEnm);

class cls_ClassRegistrar;

class kinC_FilmConditionState : public cls_RecordOf<kinC_FilmConditionState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_FilmConditionState", "state of a film condition in one step",
                                         0x2A00020};

    mdl_PropAttr<cow_String> filmProperty;
    mdl_PropAttr<double> sinkTemperature;
    mdl_PropAttr<cow_String> amplitude;
    mdl_PropAttr<double> filmCoeff;
    mdl_PropAttr<cow_String> filmAmplitude;

    static const cls_FieldTable& Fields();
};

class kinC_FilmCondition : public kinC_InteractionOf<kinC_FilmCondition, kinC_FilmConditionState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_FilmCondition", "convection between a surface and a surrounding fluid", 0x2A0001F, "Film"};

    rgnC_Region surface;
    int definition = 0;

    static const cls_FieldTable& Fields();
};

class kinC_ConcFilmConditionState final
    : public cls_RecordOf<kinC_ConcFilmConditionState, kinC_FilmConditionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ConcFilmConditionState",
                                         "state of a concentrated film condition in one step", 0x2A0006F};

    mdl_PropAttr<double> nodalArea{1.0, mdl_PropAttributeStateEnm::NEVER_SET};

    static const cls_FieldTable& Fields();
};

class kinC_ConcFilmCondition final
    : public kinC_InteractionOf<kinC_ConcFilmCondition, kinC_ConcFilmConditionState, kinC_FilmCondition> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ConcFilmCondition", "convection at single nodes", 0x2A0006E,
                                         "ConcentratedFilm ConcFilm"};

    int regionType = 1;

    static const cls_FieldTable& Fields();
};

class kinC_RadiationToAmbientState
    : public cls_RecordOf<kinC_RadiationToAmbientState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_RadiationToAmbientState",
                                         "state of a radiation to ambient in one step", 0x2A00024};

    mdl_PropAttr<double> ambientTemperature;
    mdl_PropAttr<cow_String> amplitude;
    mdl_PropAttr<double> emissivity;

    static const cls_FieldTable& Fields();
};

class kinC_RadiationToAmbient
    : public kinC_InteractionOf<kinC_RadiationToAmbient, kinC_RadiationToAmbientState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_RadiationToAmbient", "radiation from a surface to its surroundings", 0x2A00023, "Radiation"};

    rgnC_Region surface;

    static const cls_FieldTable& Fields();
};

class kinC_ConcRadiationToAmbientState final
    : public cls_RecordOf<kinC_ConcRadiationToAmbientState, kinC_RadiationToAmbientState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ConcRadiationToAmbientState",
                                         "state of a concentrated radiation to ambient in one step",
                                         0x2A00071};

    mdl_PropAttr<double> nodalArea{1.0, mdl_PropAttributeStateEnm::NEVER_SET};

    static const cls_FieldTable& Fields();
};

class kinC_ConcRadiationToAmbient final
    : public kinC_InteractionOf<kinC_ConcRadiationToAmbient, kinC_ConcRadiationToAmbientState,
                                kinC_RadiationToAmbient> {
public:
    static constexpr cls_ClassInfo Class{"kinC_ConcRadiationToAmbient",
                                         "radiation from single nodes to their surroundings", 0x2A00070,
                                         "ConcentratedRadiation ConcRadiation"};

    int regionType = 1;

    static const cls_FieldTable& Fields();
};

class kinC_CavityRadiationState final
    : public cls_RecordOf<kinC_CavityRadiationState, kinC_InteractionState> {
public:
    static constexpr cls_ClassInfo Class{
        "kinC_CavityRadiationState",
        "state of a cavity radiation in one step: how its view factors are computed", 0x2A00029};

    mdl_PropAttr<kinC_CavityRadiationBlockingEnm> blocking;
    mdl_PropAttr<cow_List<rgnC_Region>> blockingSurfaces;
    mdl_PropAttr<double> range{3.4028234663852886e+38, mdl_PropAttributeStateEnm::NEVER_SET};
    mdl_PropAttr<bool> reflection{true, mdl_PropAttributeStateEnm::NEVER_SET};
    mdl_PropAttr<double> vtol{0.05, mdl_PropAttributeStateEnm::NEVER_SET};

    static const cls_FieldTable& Fields();
};

class kinC_CavityRadiation final
    : public kinC_InteractionOf<kinC_CavityRadiation, kinC_CavityRadiationState> {
public:
    static constexpr cls_ClassInfo Class{"kinC_CavityRadiation", "radiation among the surfaces of a cavity",
                                         0x2A00028};

    static constexpr double ambientTempDef() { return cls_UnsetDouble; }
    double ambientTemp = ambientTempDef();
    cow_List<rgnC_Region> surfaces;

    static const cls_FieldTable& Fields();
};

class kinC_FilmConditionProp final : public cls_RecordOf<kinC_FilmConditionProp, kinC_InteractionProperty> {
public:
    static constexpr cls_ClassInfo Class{"kinC_FilmConditionProp", "film coefficient as a table", 0x2A00042,
                                         "FilmConditionProperty FilmProperty"};

    bool temperatureDependency = false;
    int dependencies = 0;
    cow_2DArray<double> table;

    static const cls_FieldTable& Fields();
};

void cls_RegisterFilmAndRadiationRecords(cls_ClassRegistrar& registrar);

#endif
