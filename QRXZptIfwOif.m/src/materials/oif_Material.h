#ifndef QRX_OIF_MATERIAL_H
#define QRX_OIF_MATERIAL_H

#include "keyword_layer/qkw_Keyword.h"
#include "store_interface/records/materials/kmaC_Material.h"
#include "store_interface/records/mdl_Repository.h"
#include "store_interface/records/sections/kseC_Section.h"

#include <set>

/// The options, by their fields, that only gasket behaviours have, and those that they share with materials.
inline constexpr std::string_view oif_kGasketOptions[] = {"membraneElastic", "thicknessBehavior",
                                                          "transShearElastic"};
inline constexpr std::string_view oif_kOptionsBesideGaskets[] = {"creep", "depvar", "expansion",
                                                                 "userOutputVariables"};
bool oif_HasGasketOptions(const kmaC_Material& material);
/// The materials that gasket sections name. Of these, those with gasket options are gasket behaviours; gasket
/// options of others are left out of the deck without a word.
std::set<cow_String> oif_MaterialsOfGaskets(const mdl_MapString2ObjCow<kseC_Section>& sections);

/// "*Material, name=STEEL" and all options of the material, in a fixed order that keeps what a solver reads
/// as a sub-option behind its keyword. Options of gaskets are left out.
class oif_Material final : public qkw_KeywordOf<oif_Material> {
public:
    oif_Material(const cow_String& name, const kmaC_Material& material) : name_(name), material_(material) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kmaC_Material material_;
};

/// "*Gasket behavior, name=RING" and the options that a gasket can have; all others are left out.
class oif_GasketBehavior final : public qkw_KeywordOf<oif_GasketBehavior> {
public:
    oif_GasketBehavior(const cow_String& name, const kmaC_Material& material)
        : name_(name), material_(material) {}
    void Write(utl_Stream& stream) const override;

private:
    cow_String name_;
    kmaC_Material material_;
};

#endif
