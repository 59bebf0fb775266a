#include "store_interface/records/conditions/uti_TranslationMap.h"

namespace {

constexpr uti_TranslationMap::Row kConditionLabels[] = {
    {0x2980005, "Displacement/Rotation"},
    {0x2980007, "Velocity/Angular velocity"},
    {0x2980009, "Acceleration/Angular acceleration"},
    {0x298000C, "Symmetry/Antisymmetry/Encastre"},
    {0x298000E, "Symmetry"},
    {0x2980010, "Temperature"},
    {0x2980014, "Pore pressure"},
    {0x2980016, "Acoustic pressure"},
    {0x2980018, "Fluid pressure"},
    {0x298001A, "Electric potential"},
    {0x298001C, "Mass concentration"},
    {0x2980022, "Submodel"},
    {0x2980024, "Connector displacement"},
    {0x2980026, "Connector velocity"},
    {0x2980028, "Connector acceleration"},
    {0x2980031, "Fluid cavity pressure"},
};

constexpr uti_TranslationMap::Row kLoadLabels[] = {
    {0x2880008, "Pressure"},
    {0x288000E, "Connector force"},
    {0x2880012, "Unwritten load"},
    {0x2880014, "Rotational body force"},
    {0x2880018, "Moment"},
    {0x288001A, "Line load"},
    {0x288001C, "Pipe pressure"},
    {0x288001E, "Body force"},
    {0x2880020, "Gravity"},
    {0x2880022, "Generalized plane strain"},
    {0x2880024, "Bolt load"},
    {0x2880026, "Concentrated heat flux"},
    {0x2880028, "Body heat flux"},
    {0x288002A, "Concentrated pore fluid flow"},
    {0x288002C, "Surface pore fluid flow"},
    {0x288002E, "Fluid flux"},
    {0x2880030, "Concentrated charge"},
    {0x2880032, "Concentrated current"},
    {0x2880034, "Surface charge"},
    {0x2880036, "Surface current"},
    {0x2880038, "Body charge"},
    {0x288003A, "Body current"},
    {0x288003C, "Concentrated concentration flux"},
    {0x288003E, "Surface concentration flux"},
    {0x2880040, "Body concentration flux"},
    {0x2880042, "Inward volume acceleration"},
    {0x2880045, "Surface heat flux"},
    {0x2880047, "Concentrated force"},
    {0x2880049, "Connector moment"},
    {0x288004B, "Inertia relief"},
    {0x2880055, "Surface traction"},
    {0x2880057, "Shell edge load"},
    {0x288005C, "Submodel stress"},
};

constexpr uti_TranslationMap::Row kFieldLabels[] = {
    {0x2EC0008, "Temperature"}, {0x2EC000A, "Pressure stress"}, {0x2EC0013, "Mass flow rate"},
    {0x2EC0015, "Field"},       {0x2EC0016, "Velocity"},        {0x2EC001A, "Stress"},
    {0x2EC001F, "Hardening"},
};

} // namespace

cow_String uti_TranslationMap::LabelString(unsigned typeId, int) const {
    for (const Row& row : rows_) {
        if (row.typeId == typeId) return row.label;
    }
    return {};
}

kbcC_BCTypeLabelMap::kbcC_BCTypeLabelMap() : uti_TranslationMap(kConditionLabels) {}

kloC_LoadTypeLabelMap::kloC_LoadTypeLabelMap() : uti_TranslationMap(kLoadLabels) {}

kpfC_FieldTypeLabelMap::kpfC_FieldTypeLabelMap() : uti_TranslationMap(kFieldLabels) {}
