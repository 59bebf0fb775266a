#include "store_interface/records/interactions/kinC_FilmAndRadiation.h"

#include "store_interface/records/cls_ClassRegistrar.h"

const omu_EnumTable& omu_EnumTableOf(kinC_CavityRadiationBlockingEnm) {
    static constexpr omu_EnumRow rows[] = {{0, "ALL", "ALL"}, {1, "NONE", "NONE"}, {2, "PARTIAL", "PARTIAL"}};
    static constexpr omu_EnumTable table{"kinC_CavityRadiationBlockingEnm", rows};
    return table;
}

const cls_FieldTable& kinC_FilmConditionState::Fields() {
    using R = kinC_FilmConditionState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::filmProperty>("filmProperty",
                                     "the film condition property, where the definition refers to one")
            .RefersTo<kinC_FilmConditionProp>("interactionProperty")
            .Field<&R::sinkTemperature>("sinkTemperature", "temperature of the surroundings")
            .Unit("temperature")
            .Field<&R::amplitude>("amplitude", "amplitude of the sink temperature; empty: none")
            .RefersTo("amplitude")
            .Field<&R::filmCoeff>("filmCoeff", "film coefficient")
            .Unit("power/(area*temperature)")
            .Field<&R::filmAmplitude>("filmAmplitude", "amplitude of the film coefficient; empty: none")
            .RefersTo("amplitude")
            .Example(R"({"filmCoeff": 0.01, "sinkTemperature": 20})");
    return fields;
}

const cls_FieldTable& kinC_FilmCondition::Fields() {
    using R = kinC_FilmCondition;
    static constexpr cls_IntMeaning definitionMeanings[] = {{0, "embedded coefficient (filmCoeff)"},
                                                            {1, "property reference (filmProperty)"},
                                                            {2, "user subroutine"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::surface>("surface", "the surface, or the nodes of a concentrated film condition")
            .Field<&R::definition>("definition", "where the film coefficient comes from")
            .Meanings(definitionMeanings)
            .Example(R"({"surface": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kinC_ConcFilmConditionState::Fields() {
    using R = kinC_ConcFilmConditionState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_FilmConditionState::Fields())
            .Field<&R::nodalArea>("nodalArea", "area that belongs to each node")
            .Unit("length^2")
            .Example(R"({"filmCoeff": 0.01, "sinkTemperature": 20, "nodalArea": 25})");
    return fields;
}

const cls_FieldTable& kinC_ConcFilmCondition::Fields() {
    using R = kinC_ConcFilmCondition;
    static constexpr cls_IntMeaning regionTypeMeanings[] = {{1, "SLIDING"}, {2, "EULERIAN"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_FilmCondition::Fields())
            .Field<&R::regionType>("regionType",
                                   "explicit procedures: whether the nodes move with the material")
            .Meanings(regionTypeMeanings)
            .Example(R"({"surface": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kinC_RadiationToAmbientState::Fields() {
    using R = kinC_RadiationToAmbientState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::ambientTemperature>("ambientTemperature", "temperature of the surroundings")
            .Unit("temperature")
            .Field<&R::amplitude>("amplitude", "amplitude of the ambient temperature; empty: none")
            .RefersTo("amplitude")
            .Field<&R::emissivity>("emissivity", "emissivity")
            .Unit("no unit")
            .Example(R"({"emissivity": 0.8, "ambientTemperature": 20})");
    return fields;
}

const cls_FieldTable& kinC_RadiationToAmbient::Fields() {
    using R = kinC_RadiationToAmbient;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::surface>("surface", "the surface, or the nodes of a concentrated radiation")
            .Example(R"({"surface": "PART-1.TOP"})");
    return fields;
}

const cls_FieldTable& kinC_ConcRadiationToAmbientState::Fields() {
    using R = kinC_ConcRadiationToAmbientState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_RadiationToAmbientState::Fields())
            .Field<&R::nodalArea>("nodalArea", "area that belongs to each node")
            .Unit("length^2")
            .Example(R"({"emissivity": 0.8, "ambientTemperature": 20, "nodalArea": 25})");
    return fields;
}

const cls_FieldTable& kinC_ConcRadiationToAmbient::Fields() {
    using R = kinC_ConcRadiationToAmbient;
    static constexpr cls_IntMeaning regionTypeMeanings[] = {{1, "SLIDING"}, {2, "EULERIAN"}};
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_RadiationToAmbient::Fields())
            .Field<&R::regionType>("regionType",
                                   "explicit procedures: whether the nodes move with the material")
            .Meanings(regionTypeMeanings)
            .Example(R"({"surface": "PART-1.SET"})");
    return fields;
}

const cls_FieldTable& kinC_CavityRadiationState::Fields() {
    using R = kinC_CavityRadiationState;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionState::Fields())
            .Field<&R::blocking>("blocking", "which surfaces can stand between others")
            .Field<&R::blockingSurfaces>("blockingSurfaces", "the blocking surfaces, with PARTIAL")
            .Field<&R::range>("range", "largest distance of surfaces that see each other; the default, the "
                                       "largest number of single precision, means unset")
            .Unit("length")
            .Field<&R::reflection>("reflection", "reflection counts: YES or NO")
            .Field<&R::vtol>("vtol", "tolerance of the view factors; always written")
            .Unit("no unit")
            .Example(R"({"vtol": 0.05})");
    return fields;
}

const cls_FieldTable& kinC_CavityRadiation::Fields() {
    using R = kinC_CavityRadiation;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_Interaction::Fields())
            .Field<&R::ambientTemp>("ambientTemp",
                                    "temperature of the surroundings of an open cavity; unset: closed")
            .Unit("temperature")
            .Field<&R::surfaces>("surfaces", "the cavity's surfaces; one line each")
            .Example(R"({"surfaces": ["PART-1.INSIDE"]})");
    return fields;
}

const cls_FieldTable& kinC_FilmConditionProp::Fields() {
    using R = kinC_FilmConditionProp;
    static const cls_FieldTable fields =
        cls_Describe<R>(kinC_InteractionProperty::Fields())
            .Field<&R::temperatureDependency>("temperatureDependency",
                                              "the table has a temperature column behind the coefficient")
            .Field<&R::dependencies>("dependencies", "number of field variable columns")
            .Field<&R::table>("table", "film coefficient (power per area and temperature), temperature if "
                                       "temperatureDependency, then one column per field variable")
            .Example(R"({"table": [[0.01]]})");
    return fields;
}

void cls_RegisterFilmAndRadiationRecords(cls_ClassRegistrar& registrar) {
    registrar.Add<kinC_FilmConditionState>();
    registrar.Add<kinC_FilmCondition>();
    registrar.Add<kinC_ConcFilmConditionState>();
    registrar.Add<kinC_ConcFilmCondition>();
    registrar.Add<kinC_RadiationToAmbientState>();
    registrar.Add<kinC_RadiationToAmbient>();
    registrar.Add<kinC_ConcRadiationToAmbientState>();
    registrar.Add<kinC_ConcRadiationToAmbient>();
    registrar.Add<kinC_CavityRadiationState>();
    registrar.Add<kinC_CavityRadiation>();
    registrar.Add<kinC_FilmConditionProp>();
}
